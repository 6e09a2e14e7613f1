#include "keypress.h"

#include "rawkey.h"
#include "sides.h"

#include <HmiStateMachine/named/keysignaltransition.h>

#include <QCoreApplication>

namespace {

using HmiStateMachine::KeySignalTransition;

// The two engines' names for one thing: a guard that has to be asked and says yes.
void guard(KeySignalTransition *transition)
{
    QObject::connect(transition, &KeySignalTransition::transitionTest, transition,
                     [transition] { transition->setAllowTransition(true); });
}

void guard(Raw::KeyTransition *transition)
{
    QObject::connect(transition, &Raw::KeyTransition::asked, transition,
                     [transition] { transition->setAllowed(true); });
}

/** One operation is one key, each time another one, that leads from one of two views to the other.
 */
template <typename Base, typename Transition> class KeyPress : public Base
{
public:
    explicit KeyPress(const FlowShape &shape) : Base(shape), m_keyCount(shape.keys)
    {
        const auto views = this->viewParent()->template findChildren<QState *>();
        for (QState *view : views) {
            QState *other = view == views.first() ? views.last() : views.first();
            const auto transitions = view->template findChildren<Transition *>();
            for (Transition *transition : transitions) {
                transition->setTargetState(other);
                guard(transition);
            }
        }
    }

    void run(int operations) override
    {
        for (int i = 0; i < operations; ++i) {
            m_key = nextIndex(m_key, m_keyCount);
            Q_EMIT this->keys().keyChanged(m_key, keyPressed);
            QCoreApplication::sendPostedEvents();
        }
    }

private:
    int m_keyCount;
    int m_key = 0;
};

Workload keyPress(int keys)
{
    FlowShape shape;
    shape.views = 2;
    shape.keys = keys;
    return {QStringLiteral("W4/%1").arg(keys),
            QStringLiteral("a guarded key transition among %1").arg(keys),
            200,
            50,
            2 * keys,
            1,
            {side<KeyPress<Library::ShapeFlow, KeySignalTransition>>(Engine::Library, shape),
             side<KeyPress<Raw::ShapeFlow, Raw::KeyTransition>>(Engine::Raw, shape)}};
}

} // namespace

QVector<Workload> keyPressWorkloads()
{
    return {keyPress(10), keyPress(100)};
}
