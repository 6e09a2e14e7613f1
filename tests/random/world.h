#pragma once

#include "emitter.h"
#include "journal.h"
#include "messagerecorder.h"
#include "screen.h"
#include "snapshot.h"
#include "steps.h"

#include <QStateMachine>
#include <QVector>

namespace HmiStateMachine {
class HmiLayeredState;
class HmiState;
class PopupRootState;
class PopupState;
} // namespace HmiStateMachine

class EventWatch;

/**
 * A running machine with two layers, 30 popups and the random rules of a seed.
 *
 * Popup i lives in layer i % 2. Which of them have a view id of their own, a timeout, an
 * interruption behaviour of their own and so on follows from i, so that it can be read from a
 * printed step. One world at a time.
 */
class World
{
public:
    World(quint32 seed, MessageRecorder &messages);
    ~World();

    /** Takes one step and lets the machine settle. */
    void apply(const Step &step);

    const QVector<HmiStateMachine::PopupState *> &popups() const { return m_popups; }
    const QVector<HmiStateMachine::PopupRootState *> &roots() const { return m_roots; }

    /** The popup of that name; null when there is none. */
    HmiStateMachine::PopupState *popup(const QString &name) const { return m_byName.value(name); }

    /** The entered popups in the order of their entry, by the states' own signals. */
    const QVector<HmiStateMachine::PopupState *> &entered() const { return m_entered; }

    /** The reaction of a popup that is neither left nor entered by it; null for most. */
    QAbstractTransition *reaction(HmiStateMachine::PopupState *popup) const
    {
        return m_reactions.value(popup);
    }

    Snapshot snapshot() const;
    int indexOf(const HmiStateMachine::PopupState *popup) const;

    /**
     * Whether it stays stacked for the view layer though it will not return: a clearing does not
     * take it back, a reset only under its name, a stacked popup may prohibit its return, and it
     * may have been given up before.
     */
    bool isForgotten(HmiStateMachine::PopupState *popup) const
    {
        return m_forgotten.contains(popup);
    }

    /** Whether a stacked popup stopped the returning of this layer, until the next popup comes. */
    bool isStalled(HmiStateMachine::PopupRootState *root) const { return m_stalled.contains(root); }

    /** A stacked popup prohibits the return of @p popup. */
    void returnPrevented(HmiStateMachine::PopupState *popup);

    /** A popup that was given up, and could not be left, is stacked as if it were to return. */
    void stackedAfterGivenUp(HmiStateMachine::PopupState *popup) { m_forgotten.insert(popup); }

    /** What went wrong while a step was taken. */
    void complain(const QString &rule) { m_complaints.append(rule); }
    const QStringList &complaints() const { return m_complaints; }

    Journal journal;
    QStateMachine machine;
    Screen screen{journal, machine};

private:
    Q_DISABLE_COPY(World)

    void buildLayers();
    void buildPopups();
    void follow(HmiStateMachine::PopupState *popup);

    QStringList targets(const Step &step) const;
    void change(const Step &step);
    void changeDomain(int domain);
    void changeView(const QString &view);
    void restrictDriver(int value);
    void leaveAndReturn();
    void timeOutFrom(int index);
    void reset(HmiStateMachine::PopupRootState *root);
    void clear(HmiStateMachine::PopupRootState *root);
    void forgetStacked(HmiStateMachine::PopupRootState *root, bool ownViewIdsOnly);
    void rememberForgotten();
    void expectEmpty(HmiStateMachine::PopupRootState *root);
    void storeBlocked(bool store);
    void expectGone(HmiStateMachine::PopupState *popup);
    void checkSuppression(const QString &viewId, bool before, bool now);
    void checkRetried();
    void checkHandedOver();
    void checkMessages();

    MessageRecorder &m_messages;
    QString m_prefix;
    Emitter m_driver;
    QVector<HmiStateMachine::HmiLayeredState *> m_layers;
    QVector<HmiStateMachine::PopupRootState *> m_roots;
    QVector<HmiStateMachine::PopupState *> m_popups;
    QHash<QString, HmiStateMachine::PopupState *> m_byName;
    QHash<HmiStateMachine::PopupState *, QAbstractTransition *> m_reactions;
    QVector<HmiStateMachine::PopupState *> m_entered;
    QSet<HmiStateMachine::PopupState *> m_refused;
    QSet<HmiStateMachine::PopupState *> m_awaitingDomain;
    QSet<HmiStateMachine::PopupState *> m_forgotten;
    QSet<HmiStateMachine::PopupRootState *> m_stalled;
    QStringList m_complaints;
    EventWatch *m_watch = nullptr;
    bool m_storing = false;
};
