// Writes the man page and the completion of hmi-rules while the project is built.

#include "docgen/bashcompletion.h"
#include "docgen/manpage.h"
#include "lint/catalogue.h"

#include <cstdio>
#include <QFile>

using namespace hmirules;

namespace {

bool write(const char *path, const QByteArray &text)
{
    QFile file(QFile::decodeName(path));
    return file.open(QFile::WriteOnly) && file.write(text) == text.size() && file.flush();
}

bool writeCompletion(const char *scriptTemplate, const char *path)
{
    QFile file(QFile::decodeName(scriptTemplate));
    return file.open(QFile::ReadOnly)
        && write(path, bashCompletion(program(), file.readAll(), findingIds()));
}

} // namespace

int main(int argc, char **argv)
{
    if (argc != 4) {
        std::fputs("usage: hmi_rules_docgen MAN-PAGE COMPLETION-TEMPLATE COMPLETION\n", stderr);
        return 2;
    }
    if (!write(argv[1], manPage(program())) || !writeCompletion(argv[2], argv[3])) {
        std::fputs("hmi_rules_docgen: a file cannot be read or written\n", stderr);
        return 1;
    }
    return 0;
}
