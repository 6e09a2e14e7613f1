#include "goldens.h"

#include "commandline/commandline.h"
#include "commands/commands.h"

#include <QFile>
#include <QTest>

using namespace hmirules;

QStringList ToolRun::lines() const
{
    return (output + errors + QString("exit %1\n").arg(exitCode)).split('\n');
}

ToolRun runTool(const QStringList &arguments)
{
    std::vector<std::string> words;
    for (const QString &argument : arguments) {
        words.push_back(argument.toStdString());
    }
    const Parsed parsed = parse(words);
    if (!parsed.options) {
        return {QString(), QString::fromUtf8(parsed.text), parsed.exitCode};
    }
    const Outcome outcome = run(*parsed.options);
    return {QString::fromUtf8(outcome.output), QString::fromUtf8(outcome.errors), outcome.exitCode};
}

QString contentOf(const QString &path)
{
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly)) {
        QTest::qFail(qPrintable(path + ": " + file.errorString()), __FILE__, __LINE__);
    }
    return QString::fromUtf8(file.readAll());
}

QStringList argumentsIn(const QString &path)
{
    return QFile::exists(path) ? contentOf(path).split('\n', Qt::SkipEmptyParts) : QStringList();
}
