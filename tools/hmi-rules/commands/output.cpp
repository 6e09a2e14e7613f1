#include "output.h"

#include "input/fault.h"

#include <QFile>
#include <QFileInfo>
#include <QSaveFile>

#include <cstdio>

namespace hmirules {

namespace {

void writeError(const QByteArray &text)
{
    std::fwrite(text.constData(), 1, static_cast<std::size_t>(text.size()), stderr);
}

int fail(const QString &name, const QString &reason, const QString &remedy)
{
    Fault fault;
    fault.file = name;
    fault.message = "cannot be written: " + reason;
    fault.remedy = remedy;
    writeError(toText(fault).toUtf8());
    return exitUnusable;
}

bool writeAll(QFileDevice *file, const QByteArray &output)
{
    return file->open(QIODevice::WriteOnly) && file->write(output) == output.size()
        && file->flush();
}

int writeFile(const Outcome &outcome, const QString &path)
{
    const QFileInfo info(path);
    const bool isRegular = !info.exists() || info.isFile() || info.isDir();
    QSaveFile replaced(path);
    QFile device(path); // or a pipe: another file in its place would not be it
    QFileDevice *const file = isRegular ? static_cast<QFileDevice *>(&replaced) : &device;
    if (!writeAll(file, outcome.output) || (isRegular && !replaced.commit())) {
        return fail(path, file->errorString(),
                    "check the folder, its permissions and the space that is left.");
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
        return writeFile(outcome, QFile::decodeName(path));
    }
    QFile file;
    if (!file.open(stdout, QIODevice::WriteOnly)
        || file.write(outcome.output) != outcome.output.size() || !file.flush()) {
        return fail("<standard output>", file.errorString(),
                    "check where it leads, or name a file with --output.");
    }
    return outcome.exitCode;
}

} // namespace hmirules
