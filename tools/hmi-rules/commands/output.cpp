#include "output.h"

#include "input/fault.h"

#include <QFile>
#include <QSaveFile>

#include <cstdio>

namespace hmirules {

namespace {

void writeError(const QByteArray &text)
{
    std::fwrite(text.constData(), 1, static_cast<std::size_t>(text.size()), stderr);
}

int fail(const QString &name, const QString &reason)
{
    Fault fault;
    fault.file = name;
    fault.message = "cannot be written: " + reason;
    fault.remedy = "check the folder, its permissions and the space that is left.";
    writeError(toText(fault).toUtf8());
    return exitUnusable;
}

int writeFile(const Outcome &outcome, const QByteArray &path)
{
    QSaveFile file(QFile::decodeName(path));
    if (!file.open(QIODevice::WriteOnly) || file.write(outcome.output) != outcome.output.size()
        || !file.commit()) {
        return fail(file.fileName(), file.errorString());
    }
    return outcome.exitCode;
}

} // namespace

int write(const Outcome &outcome, const QByteArray &path)
{
    writeError(outcome.errors);
    if (!outcome.hasOutput) {
        return outcome.exitCode;
    }
    if (!path.isEmpty()) {
        return writeFile(outcome, path);
    }
    QFile file;
    if (!file.open(stdout, QIODevice::WriteOnly)
        || file.write(outcome.output) != outcome.output.size() || !file.flush()) {
        return fail("<standard output>", file.errorString());
    }
    return outcome.exitCode;
}

} // namespace hmirules
