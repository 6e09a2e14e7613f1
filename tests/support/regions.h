#pragma once

#include <HmiStateMachine/named/namedstate.h>

#include <QStateMachine>
#include <QStringList>

/**
 * A machine in a parallel state with one region for each name. Region "Radio" has the states
 * "RadioHome", in which it begins, and "RadioAway".
 */
class Regions
{
public:
    explicit Regions(const QStringList &names);

    HmiStateMachine::NamedState *home(const QString &region) const;
    HmiStateMachine::NamedState *away(const QString &region) const;

    /** The region begins away from home; before start(). */
    void beginAway(const QString &region);
    void start();

    /** Moves one region past all transitions of the test. */
    void leave(const QString &region);
    void comeBack(const QString &region);

    /** Posts @p event, or an HmiEvent of that name without data, and settles. */
    void post(QEvent *event);
    void post(const QString &eventName);

    /** The active state of each region, in the order of the regions. */
    QStringList active() const;

private:
    Q_DISABLE_COPY(Regions)

    HmiStateMachine::NamedState *find(const QString &name) const;

    QStringList m_names;
    QStateMachine m_machine;
    HmiStateMachine::NamedState *m_root;
};
