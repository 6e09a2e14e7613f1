#include <HmiStateMachine/named/keysignaltransition.h>

#include <HmiStateMachine/internal/siblinggroups.h>
#include <HmiStateMachine/named/parallelsiblingtransitiongroup.h>

#include <QMultiHash>
#include <QStateMachine>

namespace HmiStateMachine {

namespace {

using Transitions = QMultiHash<QString, KeySignalTransition *>;

Transitions &publishedTransitions()
{
    static Transitions transitions;
    return transitions;
}

QString transitionKey(const QObject *sender, const char *signal, const QList<int> &keys, int status)
{
    const QString address = QString::number(reinterpret_cast<quintptr>(sender), 16);
    QString result = QStringLiteral("%1::%2").arg(address, QString::fromLatin1(signal));
    for (int key : keys) {
        result += QStringLiteral("::%1").arg(key);
    }
    return result + QStringLiteral("::%1").arg(status);
}

// False for what is no number, such as a text that cannot be read as one.
bool readInt(const QVariant &argument, int *value)
{
    bool isNumber = false;
    *value = argument.toInt(&isNumber);
    return isNumber;
}

} // namespace

KeySignalTransition::KeySignalTransition(QObject *sender, const char *signal, int key, int status,
                                         QState *sourceState)
    : KeySignalTransition(sender, signal, QList<int>{key}, status, sourceState)
{
}

KeySignalTransition::KeySignalTransition(QObject *sender, const char *signal, QList<int> keys,
                                         int status, QState *sourceState)
    : GuardedSignalTransition(sender, signal, sourceState),
      m_transitionKey(transitionKey(sender, signal, keys, status)), m_keys(keys), m_status(status)
{
    setAllowTransitionDefault(true);
    connect(this, SIGNAL(triggered()), this, SLOT(onTransitionTriggered()));
}

KeySignalTransition::~KeySignalTransition()
{
    publishedTransitions().remove(m_transitionKey, this);
}

void KeySignalTransition::makeGloballyAvailable()
{
    publishedTransitions().insert(m_transitionKey, this);
}

QList<KeySignalTransition *> KeySignalTransition::keySignalTransitions(QObject *sender,
                                                                       const char *signal, int key,
                                                                       int status)
{
    return keySignalTransitions(sender, signal, QList<int>{key}, status);
}

QList<KeySignalTransition *> KeySignalTransition::keySignalTransitions(QObject *sender,
                                                                       const char *signal,
                                                                       QList<int> keys, int status)
{
    return publishedTransitions().values(transitionKey(sender, signal, keys, status));
}

bool KeySignalTransition::makeParallelExclusive(int priority)
{
    static SiblingGroups siblingGroups;
    return ensureGroup(siblingGroups[m_transitionKey])->addTransition(this, priority);
}

bool KeySignalTransition::internalEventTest(QEvent *event)
{
    return HmiSignalTransition::internalEventTest(event) && keyTest(event);
}

bool KeySignalTransition::keyTest(QEvent *event)
{
    const QVariantList arguments = static_cast<QStateMachine::SignalEvent *>(event)->arguments();
    int key = 0;
    int status = 0;
    if (arguments.size() < 2 || !readInt(arguments.at(0), &key)
        || !readInt(arguments.at(1), &status)) {
        return false;
    }
    m_lastKey = key;
    m_lastStatus = status;
    if (!m_keys.contains(m_lastKey) || (m_status >= 0 && m_status != m_lastStatus)) {
        return false;
    }
    return testTransition(event);
}

void KeySignalTransition::onTransitionTriggered()
{
    Q_EMIT keyTransitionTriggered(m_lastKey, m_lastStatus);
}

} // namespace HmiStateMachine
