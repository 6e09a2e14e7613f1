#pragma once

#include <HmiStateMachineQuick/presenter.h>
#include <HmiStateMachineQuick/quickviewstatetarget.h>

#include <QStringList>

using HmiStateMachine::QuickViewStateTarget;

/** Shows views and popups as lines of a text. */
class TextPresenter : public HmiStateMachine::ViewPresenter, public HmiStateMachine::PopupPresenter
{
public:
    explicit TextPresenter(QuickViewStateTarget *target) : m_target(target)
    {
        target->setViewPresenter(this);
        target->setPopupPresenter(this);
    }

    ~TextPresenter() override
    {
        m_target->setViewPresenter(nullptr);
        m_target->setPopupPresenter(nullptr);
    }

    void presentView(const QString &viewId, bool back) override
    {
        lines.append((back ? "back at " : "show ") + viewId);
        m_target->reportViewShown(viewId);
    }

    void presentPopup(const QString &popupId) override
    {
        lines.append("show " + popupId);
        m_target->reportPopupShown(popupId);
    }

    void withdrawPopup(const QString &popupId) override
    {
        lines.append("hide " + popupId);
        m_target->reportPopupHidden(popupId);
    }

    bool isBusy() const override { return false; } // shows at once

    QStringList lines;

private:
    QuickViewStateTarget *m_target;
};
