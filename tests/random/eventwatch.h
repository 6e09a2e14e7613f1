#pragma once

#include "world.h"

#include <HmiStateMachine/popup/popupstate.h>

#include <QAbstractTransition>

#include <optional>

namespace HmiStateMachine {
class PopupEvent;
}

/**
 * Sees each event before the popup layers do, foretells what a PopupEvent has to lead to, and
 * complains to its world when it has led to something else by the time of the next event.
 */
class EventWatch : public QAbstractTransition
{
    Q_OBJECT

public:
    EventWatch(World &world, QState *state);

    /** No event is under way any more. */
    void settled();

protected:
    bool eventTest(QEvent *event) override;
    void onTransition(QEvent *event) override;

private:
    enum class Answer { Nothing, Refreshed, Refused, Prevented, Granted };

    struct Expectation
    {
        Snapshot before;
        HmiStateMachine::PopupState *popup = nullptr; ///< null when the event requests none
        HmiStateMachine::PopupState *front = nullptr;
        HmiStateMachine::PopupState::InterruptionBehavior behavior =
            HmiStateMachine::PopupState::Allow;
        Answer answer = Answer::Nothing;
        bool domainBlocked = false;
        bool reactivation = false; ///< as it is to be handed to the view layer
        QVector<HmiStateMachine::PopupState *> dismissed;
        bool returnsAnew = false; ///< a layer that shows no popup asks for the next to return
    };

    void finish();
    Expectation foretell(const HmiStateMachine::PopupEvent &event) const;
    void foretellRequest(Expectation &expected, bool reactivation) const;
    void foretellDismissal(Expectation &expected, const QString &target) const;

    void check(const Expectation &expected);
    void checkGranted(const Expectation &expected, const QStringList &lines);
    void checkInterrupted(const Expectation &expected, bool stacked);
    void checkDismissed(const Expectation &expected);

    World &m_world;
    std::optional<Expectation> m_expected;
    QStringList m_owed; ///< the dismiss events that are to come before the machine settles
};
