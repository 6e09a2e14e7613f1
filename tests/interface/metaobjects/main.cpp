#include "changes.h"
#include "dump.h"
#include "publicmetaobjects.h"

#include <QFile>
#include <QTextStream>

namespace {

constexpr int exitDiffers = 1;
constexpr int exitTrouble = 2;

int trouble(const QString &message)
{
    QTextStream(stderr) << message << '\n';
    return exitTrouble;
}

int write(const QString &fileName)
{
    QFile file(fileName);
    const QByteArray dump = interfaceDump(publicMetaObjects()).toUtf8();
    if (!file.open(QIODevice::WriteOnly) || file.write(dump) != dump.size()) {
        return trouble(fileName + ": " + file.errorString());
    }
    return 0;
}

int compare(const QString &fileName)
{
    QFile file(fileName);
    if (!file.open(QIODevice::ReadOnly)) {
        return trouble(fileName + ": " + file.errorString());
    }
    const QString before = QString::fromUtf8(file.readAll());
    const QString after = interfaceDump(publicMetaObjects());
    if (before == after) {
        return 0;
    }
    const InterfaceChanges changes = interfaceChanges(before, after);
    if (changes.step == VersionStep::None) {
        return trouble(fileName + ": another text, but the same interface");
    }
    const char *step = changes.step == VersionStep::Major ? "major" : "minor";
    QTextStream err(stderr);
    err << "The meta-objects are not those of " << fileName << ":\n    "
        << changes.lines.join("\n    ") << "\nThis asks for a " << step
        << " step of the version; see "
        << "CONTRIBUTING.md. When it is meant, renew the file:\n"
        << "    cmake --build build/dev --target update-interface\n";
    return exitDiffers;
}

} // namespace

int main(int argc, char **argv)
{
    const QString task = argc == 3 ? argv[1] : "";
    if (task == "write") {
        return write(QFile::decodeName(argv[2]));
    }
    if (task == "compare") {
        return compare(QFile::decodeName(argv[2]));
    }
    return trouble("Usage: write FILE | compare FILE");
}
