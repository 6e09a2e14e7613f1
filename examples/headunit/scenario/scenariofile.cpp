#include "scenariofile.h"

#include <QFile>
#include <QFileInfo>
#include <QTextCodec>

namespace headunit {

namespace {

constexpr qint64 maximumBytes = 1024 * 1024;

std::optional<LocatedFault> fileFault(const QString &found, const QString &remedy = QString())
{
    return LocatedFault{0, {"a readable scenario file", found, remedy}};
}

bool decodeLine(const QByteArray &bytes, QString *text)
{
    QTextCodec::ConverterState state;
    *text = QTextCodec::codecForName("UTF-8")->toUnicode(bytes.constData(), bytes.size(), &state);
    return state.invalidChars == 0 && state.remainingChars == 0;
}

bool hasControlCharacter(const QString &text)
{
    for (const QChar &character : text) {
        if (character.category() == QChar::Other_Control && character != '\t') {
            return true;
        }
    }
    return false;
}

std::optional<LocatedFault> splitLines(const QByteArray &bytes, QStringList *lines)
{
    const auto rawLines = bytes.split('\n');
    for (QByteArray raw : rawLines) {
        if (raw.endsWith('\r')) {
            raw.chop(1);
        }
        QString line;
        const int number = lines->size() + 1;
        if (!decodeLine(raw, &line)) {
            return LocatedFault{
                number,
                {"text in UTF-8", "bytes that are none", "save the file in the encoding UTF-8"}};
        }
        if (hasControlCharacter(line)) {
            return LocatedFault{number, {"text", "a control character", "remove it"}};
        }
        lines->append(line);
    }
    return std::nullopt;
}

} // namespace

std::optional<LocatedFault> readScenarioFile(const QString &path, QStringList *lines)
{
    const QFileInfo info(path);
    if (info.isDir()) {
        return fileFault("a directory", "name one of the *.scenario files in it");
    }
    if (!info.exists()) {
        return fileFault("no such file");
    }
    if (!info.isFile()) {
        return fileFault("something that is no regular file");
    }
    if (info.size() > maximumBytes) {
        return fileFault("a file larger than one megabyte", "split it into several scenarios");
    }
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly)) {
        return fileFault("an error: " + file.errorString());
    }
    return splitLines(file.readAll(), lines);
}

} // namespace headunit
