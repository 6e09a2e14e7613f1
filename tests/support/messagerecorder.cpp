#include "messagerecorder.h"

#include <QLoggingCategory>

namespace {

MessageRecorder *s_recorder = nullptr;

const QString libraryCategory = QStringLiteral("vosk.hmistatemachine");
const QString sceneCategory = QStringLiteral("hmistatemachine.quick");
const QString quiet = QStringLiteral("vosk.hmistatemachine.debug=false\nhmi.*.debug=false\n");

QString levelName(QtMsgType type)
{
    switch (type) {
    case QtDebugMsg:
        return QStringLiteral("debug");
    case QtInfoMsg:
        return QStringLiteral("info");
    case QtWarningMsg:
        return QStringLiteral("warning");
    case QtCriticalMsg:
        return QStringLiteral("critical");
    case QtFatalMsg:
        return QStringLiteral("fatal");
    }
    return QString();
}

} // namespace

QString Message::toString() const
{
    return levelName(type) + ' ' + function + ": " + text;
}

MessageRecorder::MessageRecorder() : m_previous(qInstallMessageHandler(&MessageRecorder::handle))
{
    s_recorder = this;
    QLoggingCategory::setFilterRules(quiet);
}

MessageRecorder::~MessageRecorder()
{
    qInstallMessageHandler(m_previous);
    QLoggingCategory::setFilterRules(QString());
    s_recorder = nullptr;
}

void MessageRecorder::enableDebug(const QStringList &categories)
{
    QString rules = quiet;
    for (const QString &category : categories) {
        rules += category + ".debug=true\n";
    }
    QLoggingCategory::setFilterRules(rules);
}

void MessageRecorder::disableWarnings()
{
    QLoggingCategory::setFilterRules(quiet + libraryCategory + ".warning=false\n");
}

QStringList MessageRecorder::take()
{
    QStringList result;
    const auto messages = takeMessages();
    for (const Message &message : messages) {
        result.append(message.toString());
    }
    return result;
}

QList<Message> MessageRecorder::takeMessages()
{
    QList<Message> result;
    result.swap(m_messages);
    return result;
}

void MessageRecorder::handle(QtMsgType type, const QMessageLogContext &context, const QString &text)
{
    const QString category = QString::fromLatin1(context.category);
    if (category == libraryCategory || category == sceneCategory || category.startsWith("hmi.")) {
        s_recorder->m_messages.append({type, category, QString::fromLatin1(context.file),
                                       context.line, QString::fromLatin1(context.function), text});
    } else if (s_recorder->m_previous) {
        s_recorder->m_previous(type, context, text);
    }
}
