// What every step shares: a view layer that prints, and a way to ask the flow for something.
#pragma once

#include <HmiStateMachine/named/hmibackevent.h>
#include <HmiStateMachine/named/statemachine.h>
#include <HmiStateMachine/named/viewstatetarget.h>

#include <QCoreApplication>
#include <QDebug>
#include <QMap>
#include <QSet>
#include <QTime>

inline void say(const QString &text)
{
    qInfo().noquote() << text;
}

// Says what is asked for, posts it, and lets the machine carry it out.
inline void request(const QString &text, QEvent *event)
{
    say(text);
    HmiStateMachine::StateMachine::instance()->postEvent(event);
    QCoreApplication::sendPostedEvents();
}

class PrintingViewLayer : public HmiStateMachine::ViewStateTarget
{
public:
    PrintingViewLayer() { VIEW_STATE_TARGET_INSTANCE = this; }
    ~PrintingViewLayer() override { VIEW_STATE_TARGET_INSTANCE = nullptr; }

    void activateView(const QString &viewId, const QVariant &instanceData) override
    {
        m_activeView = viewId;
        tell("show " + viewId + dataIn(instanceData));
    }

    void deactivateView(const QString &viewId, const QVariant &) override
    {
        tell("leave " + viewId);
    }

    HmiStateMachine::Identifier activeView() const override { return m_activeView; }

    // A back request of several steps goes one view at a time: this posts the next step, if any.
    void postFollowOnBackEvent(quint8 depth, const QString &targetId, const QString &id) override
    {
        if (auto *next = HmiStateMachine::HmiBackEvent::followOnEvent(depth, targetId, id)) {
            HmiStateMachine::StateMachine::instance()->postEvent(next);
        }
    }

    void requestPopupShow(const QString &popupId, int, const QVariant &data) override
    {
        m_shownPopups.insert(popupId);
        tell("popup " + popupId + dataIn(data));
        Q_EMIT popupStatusChanged(popupId, true); // its time runs from now on
    }

    // May come twice, or for a popup that was never shown.
    void requestPopupHide(const QString &popupId, bool) override
    {
        if (m_shownPopups.remove(popupId)) {
            tell("popup " + popupId + " goes");
            Q_EMIT popupStatusChanged(popupId, false);
        }
    }

    void updatePopupData(const QString &popupId, const QVariant &data) override
    {
        tell("popup " + popupId + " is now" + dataIn(data));
    }

    // What this application has no use for.
    int activeDomain() const override { return 0; }
    int domainFromName(const QString &) override { return 0; }
    void preparePopup(const QString &, bool) override { }
    void retryBlockedPopup(HmiStateMachine::PopupState *) override { }
    void releaseBlockedPopups(const QMap<HmiStateMachine::PopupState *, QTime> &) override { }
    void setScreenPopupBehavior(bool) override { }
    void resetScreenPopupBehavior() override { }

protected:
    virtual void tell(const QString &line) { say("  " + line); }

private:
    static QString dataIn(const QVariant &instanceData)
    {
        const QVariant data = instanceData.toMap().value("eventData");
        return data.isValid() ? ": " + data.toString() : QString();
    }

    QString m_activeView;
    QSet<QString> m_shownPopups;
};
