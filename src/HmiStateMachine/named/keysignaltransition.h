#pragma once

#include <HmiStateMachine/hmistatemachine_export.h>
#include <HmiStateMachine/named/guardedsignaltransition.h>

#include <QList>
#include <QString>

namespace HmiStateMachine {

/**
 * Fires on a key signal: one whose first two arguments are a key code and a key status.
 *
 * Which codes and statuses there are is the application's matter; both are compared as integers. A
 * signal with fewer arguments, or with one that is no number, never matches. It allows by default.
 *
 * Published transitions can be found by what they react to, which key blocking rests on.
 */
class HMISTATEMACHINE_EXPORT KeySignalTransition : public GuardedSignalTransition
{
    Q_OBJECT

public:
    /** @p signal is written with SIGNAL(). A negative @p status accepts every status. */
    KeySignalTransition(QObject *sender, const char *signal, int key, int status,
                        QState *sourceState = nullptr);

    /** Fires on any of @p keys; on none when the list is empty. */
    KeySignalTransition(QObject *sender, const char *signal, QList<int> keys, int status,
                        QState *sourceState = nullptr);

    /** Withdraws the transition when it was published. */
    ~KeySignalTransition() override;

    /**
     * Publishes the transition, so that keySignalTransitions() finds it. Each call adds it once
     * more, so one will do.
     */
    void makeGloballyAvailable();

    /**
     * The published transitions that were made with just these arguments, the one published last
     * first. Not owned.
     */
    static QList<KeySignalTransition *> keySignalTransitions(QObject *sender, const char *signal,
                                                             int key, int status);

    /** The same for several keys, in the order in which the transition was given them. */
    static QList<KeySignalTransition *> keySignalTransitions(QObject *sender, const char *signal,
                                                             QList<int> keys, int status);

    /**
     * Joins the group of all transitions made with the same sender, signal, keys and status. False
     * when the priority is taken, or when this transition has another one already.
     */
    bool makeParallelExclusive(int priority);

    /** Sender and signal, key, status, and last the guard. */
    bool internalEventTest(QEvent *event) override;

Q_SIGNALS:
    /** Follows each firing, with the key and status that fired it. */
    void keyTransitionTriggered(int key, int status);

private Q_SLOTS:
    void onTransitionTriggered();

private:
    Q_DISABLE_COPY(KeySignalTransition)

    bool keyTest(QEvent *event);

    QString m_transitionKey;
    QList<int> m_keys;
    int m_status;
    int m_lastKey = 0;
    int m_lastStatus = 0;
};

} // namespace HmiStateMachine
