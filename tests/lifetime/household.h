#pragma once

#include "emitter.h"
#include "journal.h"
#include "random/seeds.h"
#include "recordingviewstatetarget.h"

#include <HmiStateMachine/hmi/hmitargetfilter.h>

#include <QAbstractTransition>
#include <QMap>
#include <QPointer>
#include <QSharedPointer>
#include <QStateMachine>
#include <QVector>

#include <memory>
#include <utility>

namespace HmiStateMachine {
class HmiLayeredState;
class HmiState;
class HmiViewState;
class NamedState;
class ParallelSiblingTransitionGroup;
class PopupRootState;
class PopupState;
} // namespace HmiStateMachine

/**
 * A machine with two layers of views and popups, transitions of every kind between them, and all
 * that they go by: senders, groups, filters, monitors, a view layer. What can go, goes in an order
 * drawn by lot, as far as the documentation of each class lets it.
 */
class Household
{
public:
    /** With StateMachine::instance(), or with a machine of its own. */
    Household(quint32 seed, bool processWide);
    ~Household();

    /** An event, something new, or the end of something. */
    void step();

    /** Takes all down that is left. */
    void takeDown();

    /** How often each operation of the view layer was called. */
    const QMap<QString, int> &calls() const { return m_calls; }

private:
    Q_DISABLE_COPY(Household)

    using Deed = void (Household::*)();

    void build();
    void addLayer();
    void addView();
    HmiStateMachine::HmiViewState *makeView(const QString &name,
                                            HmiStateMachine::HmiLayeredState *layer);
    void addPopup();
    void letOthersDismiss(HmiStateMachine::PopupState *popup);
    void addTransition();
    QAbstractTransition *makeTransition(QState *source);
    void addFilter();
    void addMonitor();
    void addToGroup();

    void requestView();
    void pressBack();
    void requestPopup();
    void dismissPopup();
    void raiseEvent();
    void emitSignal();
    void runTimerOut();
    void changeSettings();

    void endView();
    void endPopup();
    void endTransition();
    void endSender();
    void endGroup();
    void endFilters();
    void endMonitor();
    void replaceViewLayer();
    void renameSomething();
    void startAnew();

    void chooseDeeds();
    void removeTree();
    void removeMachine();
    void removeTheRest();
    void settleAll();
    template <typename List> void shuffle(List &list)
    {
        for (int i = list.size() - 1; i > 0; --i) {
            std::swap(list[i], list[m_random.below(i + 1)]);
        }
    }
    QString newName(const QString &kind);
    QString anyName();
    Emitter *anySender();
    QState *anySource();
    /** One that is still there; null when there is none. */
    template <typename T> T *any(QVector<QPointer<T>> &list)
    {
        list.removeAll(nullptr);
        return list.isEmpty() ? nullptr : list.at(m_random.below(list.size())).data();
    }

    Random m_random;
    int m_count = 0;
    Journal m_journal;
    QMap<QString, int> m_calls;
    std::unique_ptr<RecordingViewStateTarget> m_target;
    std::unique_ptr<QStateMachine> m_ownMachine;
    QPointer<QStateMachine> m_machine;
    QPointer<HmiStateMachine::NamedState> m_house;
    QVector<QPointer<HmiStateMachine::HmiLayeredState>> m_layers;
    QVector<QPointer<HmiStateMachine::HmiViewState>> m_views;
    QVector<QPointer<HmiStateMachine::PopupState>> m_popups;
    QVector<QPointer<QAbstractTransition>> m_transitions;
    QVector<QPointer<QObject>> m_monitors;
    QVector<QPointer<Emitter>> m_senders;
    QVector<QPointer<HmiStateMachine::ParallelSiblingTransitionGroup>> m_groups;
    QVector<QSharedPointer<HmiStateMachine::HmiTargetFilter>> m_filters;
    QVector<Deed> m_deeds;
};
