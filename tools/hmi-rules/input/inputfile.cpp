#include "inputfile.h"

#include <QFile>
#include <QFileInfo>

#include <cstdio>

namespace hmirules {

namespace {

constexpr char standardInput[] = "-";

bool open(const QByteArray &path, QFile *file)
{
    if (path == standardInput) {
        return file->open(stdin, QIODevice::ReadOnly);
    }
    file->setFileName(QFile::decodeName(path));
    return file->open(QIODevice::ReadOnly);
}

// A pipe hands over what it has, so that one call does not suffice.
bool readAll(QFile *file, QByteArray *content)
{
    constexpr int blockSize = 64 * 1024;
    while (content->size() <= maximumInputSize) {
        const QByteArray block = file->read(blockSize);
        if (block.isEmpty()) {
            return file->error() == QFileDevice::NoError;
        }
        content->append(block);
    }
    return true;
}

bool refuse(const QString &message, const QString &remedy, Fault *fault)
{
    fault->message = message;
    fault->remedy = remedy;
    return false;
}

} // namespace

QString displayName(const QByteArray &path)
{
    return path == standardInput ? QString("<standard input>") : QFile::decodeName(path);
}

bool readInput(const QByteArray &path, QByteArray *content, Fault *fault)
{
    *fault = Fault();
    fault->file = displayName(path);
    if (path != standardInput && QFileInfo(QFile::decodeName(path)).isDir()) {
        return refuse("this is a folder", "name a file in it.", fault);
    }
    QFile file;
    if (!open(path, &file)) {
        return refuse("cannot be opened: " + file.errorString(),
                      "check the name and the permissions.", fault);
    }
    content->clear();
    if (!readAll(&file, content)) {
        return refuse("cannot be read: " + file.errorString(),
                      "check where it comes from, or name another file.", fault);
    }
    if (content->size() > maximumInputSize) {
        return refuse(QString("longer than %1 MiB").arg(maximumInputSize / 1024 / 1024),
                      "name a file of rules; real ones have some kilobytes.", fault);
    }
    return true;
}

} // namespace hmirules
