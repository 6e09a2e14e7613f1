#pragma once

#include "requestlog.h"

#include <QHash>
#include <QObject>
#include <QStringList>

class QTimer;

namespace HmiStateMachine {
class HmiViewState;
class NamedState;
class PopupState;
} // namespace HmiStateMachine

namespace headunit {

class ViewLayer;

/**
 * Looks into the running flow, for those who develop it: which states are active, where back leads,
 * and what came of each request. It only listens. Made once the flow is built.
 */
class Inspector : public QObject
{
    Q_OBJECT
    Q_PROPERTY(QStringList activeStates READ activeStates NOTIFY activeStatesChanged)
    Q_PROPERTY(QStringList backStack READ backStack NOTIFY backStackChanged)
    Q_PROPERTY(headunit::RequestLog *requests READ requests CONSTANT)

public:
    explicit Inspector(ViewLayer *viewLayer, QObject *parent = nullptr);
    ~Inspector() override;

    /** By name, in the order of the tree. */
    QStringList activeStates() const;

    /** The back stack of the active view, its top first. */
    QStringList backStack() const;
    RequestLog *requests() const;

    /** What happens from now on comes of @p text. */
    void begin(const QString &text);

    /** Looks at the states now; otherwise that waits for the event loop. */
    void update();

Q_SIGNALS:
    void activeStatesChanged();
    void backStackChanged();

    /** Why the flow did not do what was asked for, to be shown to the driver. */
    void hintShown(const QString &text);

private:
    Q_DISABLE_COPY(Inspector)

    void followStates();
    void followRequests();
    void follow(HmiStateMachine::NamedState *state);
    void follow(HmiStateMachine::HmiViewState *view);
    void follow(HmiStateMachine::PopupState *popup);
    void note(const QString &outcome, bool accepted = true);

    ViewLayer *m_viewLayer;
    RequestLog *m_requests;
    QTimer *m_updateTimer;
    QStringList m_activeStates;
    QHash<QString, QStringList> m_backStacks;
    QStringList m_outcomes;
    bool m_accepted = true;
};

} // namespace headunit
