#include "popups.h"

#include <HmiStateMachine/hmi/hmilayeredstate.h>
#include <HmiStateMachine/popup/domainblockedpopupstate.h>
#include <HmiStateMachine/popup/popupdismisstransition.h>

using namespace HmiStateMachine;

namespace {

constexpr int moduleCount = 5;

bool hasOwnViewId(int index)
{
    return index % 3 == 1;
}
bool hasTimeout(int index)
{
    return index % 3 == 0;
}
bool isDriverRestricted(int index)
{
    return index % 4 == 1;
}
bool hasOwnBehavior(int index)
{
    return index % 7 == 3;
}
bool isDomainBlocked(int index)
{
    return index % 5 == 2;
}
bool isDismissible(int index)
{
    return index % 10 != 9;
}

/** Decides by the numbers of the two popups, without the store. */
class WilfulPopup : public PopupState
{
public:
    WilfulPopup(const QString &name, HmiLayeredState *layer, int kind)
        : PopupState(name, layer, kind)
    {
        setHasOwnInterruptionBehavior(true);
    }

    InterruptionBehavior interruption(PopupState *requested) const override
    {
        const int digits = requested->property("index").toInt() + property("index").toInt();
        return static_cast<InterruptionBehavior>(digits / 2 % 4);
    }
};

/** Tells when it is given up. */
class PatientPopup : public DomainBlockedPopupState
{
public:
    PatientPopup(const QString &name, HmiLayeredState *layer, int kind,
                 QSet<PopupState *> &awaitingDomain)
        : DomainBlockedPopupState(name, layer, kind), m_awaitingDomain(awaitingDomain)
    {
    }

    void onDeactivated() override
    {
        DomainBlockedPopupState::onDeactivated();
        m_awaitingDomain.remove(this);
    }

private:
    QSet<PopupState *> &m_awaitingDomain;
};

PopupState *makeOfSort(int index, const QString &name, HmiLayeredState *layer,
                       QSet<PopupState *> &awaitingDomain)
{
    if (hasOwnBehavior(index)) {
        return new WilfulPopup(name, layer, index);
    }
    if (isDomainBlocked(index)) {
        return new PatientPopup(name, layer, index, awaitingDomain);
    }
    return new PopupState(name, layer, index);
}

} // namespace

PopupState *makePopup(int index, const QString &prefix, HmiLayeredState *layer,
                      QSet<PopupState *> &awaitingDomain)
{
    const QString module = prefix + 'm' + QString::number(index % moduleCount);
    const QString name = module + '/' + prefix + 'p' + QString::number(index / moduleCount);
    PopupState *popup = makeOfSort(index, name, layer, awaitingDomain);
    popup->setProperty("index", index);
    if (hasOwnViewId(index)) {
        popup->setPopupViewId(module + "/view" + QString::number(index));
    }
    popup->setAutoDismissTimeoutActive(hasTimeout(index));
    popup->setDriverRestricted(isDriverRestricted(index));
    popup->setReportsQmlPopupStatus(index % 2 == 0);
    if (!isDismissible(index)) {
        popup->dismissTransition()->setDismissTarget(QString());
    }
    return popup;
}

bool hasReaction(int index)
{
    return index % 6 == 2 || index % 6 == 5;
}
