#include "files.h"

#include <QFile>
#include <QSaveFile>

namespace {

QString notWritten(const QSaveFile &file)
{
    return QStringLiteral("%1 cannot be written: %2. Name a file in an existing folder.")
        .arg(file.fileName(), file.errorString());
}

} // namespace

bool readResults(const QString &fileName, Results *results, QString *error)
{
    QFile file(fileName);
    if (!file.open(QIODevice::ReadOnly)) {
        *error = QStringLiteral("%1 cannot be read: %2. Name a file that --json has written.")
                     .arg(fileName, file.errorString());
        return false;
    }
    QString fault;
    *results = fromJson(file.readAll(), &fault);
    if (results->isEmpty()) {
        *error = QStringLiteral("%1 holds no figures: %2. Name a file that --json has written.")
                     .arg(fileName, fault);
        return false;
    }
    return true;
}

bool isWritable(const QString &fileName, QString *error)
{
    QSaveFile file(fileName);
    if (!file.open(QIODevice::WriteOnly)) {
        *error = notWritten(file);
        return false;
    }
    return true;
}

bool writeFile(const QString &fileName, const QByteArray &content, QString *error)
{
    QSaveFile file(fileName);
    if (!file.open(QIODevice::WriteOnly) || file.write(content) != content.size()
        || !file.commit()) {
        *error = notWritten(file);
        return false;
    }
    return true;
}
