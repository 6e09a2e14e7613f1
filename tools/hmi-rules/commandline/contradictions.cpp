#include "commandline/contradictions.h"
#include "commandline/quoting.h"

#include <QDir>
#include <QFile>

namespace hmirules {

namespace {

QList<QByteArray> inputs(const Options &options)
{
    QList<QByteArray> files = options.base + options.files;
    files << options.inventory << options.popupList << options.domainList << options.viewList;
    files.removeAll(QByteArray());
    return files;
}

QString cleaned(const QByteArray &path)
{
    return QDir::cleanPath(QFile::decodeName(path));
}

} // namespace

QByteArray contradiction(const Options &options)
{
    const QList<QByteArray> files = inputs(options);
    if (files.count("-") > 1) {
        return "the standard input, \"-\", is named " + QByteArray::number(files.count("-"))
            + " times; it can be read once";
    }
    for (const QByteArray &file : files) {
        if (!options.output.isEmpty() && cleaned(file) == cleaned(options.output)) {
            return "the output " + quoted(options.output) + " would overwrite an input";
        }
    }
    if (options.blocking && options.format != Format::Csv) {
        return "option --blocking needs --format csv";
    }
    return QByteArray();
}

} // namespace hmirules
