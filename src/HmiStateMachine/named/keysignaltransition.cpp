#include <HmiStateMachine/named/keysignaltransition.h>

#include <HmiStateMachine/internal/siblinggroups.h>
#include <HmiStateMachine/internal/slotconnection.h>
#include <HmiStateMachine/named/parallelsiblingtransitiongroup.h>

#include <QMultiHash>
#include <QStateMachine>

#include <iterator>
#include <limits>

namespace HmiStateMachine {

namespace {

using Transitions = QMultiHash<QString, KeySignalTransition *>;

Transitions &publishedTransitions()
{
    static Transitions transitions;
    return transitions;
}

void append(QString &text, quintptr number, uint base)
{
    static const char digits[] = "0123456789abcdef";
    QChar written[std::numeric_limits<quintptr>::digits10 + 1];
    QChar *const end = std::end(written);
    QChar *begin = end;
    do {
        *--begin = QLatin1Char(digits[number % base]);
        number /= base;
    } while (number > 0);
    text.append(begin, static_cast<int>(end - begin));
}

void append(QString &text, int number)
{
    const bool negative = number < 0;
    text.append(negative ? QLatin1String("::-") : QLatin1String("::"));
    // Widened first: the smallest number has no positive counterpart of its own type.
    const auto wide = static_cast<qint64>(number);
    append(text, static_cast<quintptr>(negative ? -wide : wide), 10);
}

// Into one string that is large enough from the start: every key transition has such a key.
QString transitionKey(const QObject *sender, const char *signal, const QList<int> &keys, int status)
{
    constexpr int usualSize = 48;
    QString result;
    result.reserve(usualSize);
    append(result, reinterpret_cast<quintptr>(sender), 16);
    result.append(QLatin1String("::")).append(QLatin1String(signal));
    for (int key : keys) {
        append(result, key);
    }
    append(result, status);
    result.squeeze();
    return result;
}

const SlotConnection &triggeredConnection()
{
    static const SlotConnection connection(&QAbstractTransition::triggered,
                                           KeySignalTransition::staticMetaObject,
                                           "onTransitionTriggered()");
    return connection;
}

// False for what is no number, such as a text that cannot be read as one.
bool readInt(const QVariant &argument, int *value)
{
    // The usual type is read as it is: each key transition of an active state reads two numbers.
    if (argument.userType() == QMetaType::Int) {
        *value = *static_cast<const int *>(argument.constData());
        return true;
    }
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
    triggeredConnection().connect(this, this);
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
    // Past the test of GuardedSignalTransition, which asks the guard before the key is known.
    return HmiSignalTransition::internalEventTest(event) // clazy:exclude=skipped-base-method
        && keyTest(event);
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
