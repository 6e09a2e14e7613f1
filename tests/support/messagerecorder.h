#pragma once

#include <QList>
#include <QString>
#include <QStringList>
#include <QtGlobal>

/** A message of the library as the application's message handler sees it. */
struct Message
{
    QtMsgType type;
    QString category;
    QString file;
    int line;
    QString function;
    QString text;

    /** "warning hash: <text>", the form in which tests compare messages. */
    QString toString() const;
};

/**
 * Keeps the messages of the library's, its scene's, the trace and the performance category while it
 * lives, and hands all others on to the handler that was there before.
 *
 * Debug output of these categories is off until it is asked for. One recorder at a time.
 */
class MessageRecorder
{
public:
    MessageRecorder();
    ~MessageRecorder();

    /** Switches debug output of the named categories on, "vosk.hmistatemachine" by default. */
    void enableDebug(const QStringList &categories = {QStringLiteral("vosk.hmistatemachine")});

    /** Switches warnings of the library's category off. */
    void disableWarnings();

    /** What was written so far, each as Message::toString(); the recorder is empty afterwards. */
    QStringList take();
    QList<Message> takeMessages();

private:
    Q_DISABLE_COPY(MessageRecorder)

    static void handle(QtMsgType type, const QMessageLogContext &context, const QString &text);

    QtMessageHandler m_previous;
    QList<Message> m_messages;
};
