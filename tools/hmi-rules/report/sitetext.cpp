#include "sitetext.h"

#include "visible.h"

#include <HmiStateMachine/popup/popupstate.h>

using HmiStateMachine::PopupState;

namespace hmirules {

QString effectText(int behavior)
{
    switch (behavior) {
    case PopupState::Prohibit:
        return "the request is refused";
    case PopupState::Allow:
        return "the popup in front goes and returns afterwards; one of another layer stays as it "
               "is";
    case PopupState::AllowStack:
        return "the popup in front goes behind the requested one, stacked, and returns afterwards";
    case PopupState::AllowNoReturn:
        return "the popup in front goes for good";
    default:
        return "an invalid default, which acts like Allow";
    }
}

QString siteText(const Site &site)
{
    switch (site.kind) {
    case Site::Rule:
        return QString(R"(rule for "%1" in the entry "%2")")
            .arg(visible(site.target), visible(site.popup));
    case Site::Default:
        return QString(R"(default of the entry "%1")").arg(visible(site.popup));
    case Site::DomainBlacklist:
        return QString(R"(domain blacklist of the entry "%1")").arg(visible(site.popup));
    case Site::ViewBlacklist:
        break;
    }
    return QString(R"(view blacklist of the entry "%1")").arg(visible(site.popup));
}

QString reasonText(const RuleBase &base, const Decision &decision)
{
    return decision.site < 0 ? QString("no rule and no default: Allow is built in")
                             : siteText(base.site(decision.site));
}

QString sitePlace(const RuleBase &base, const Site &site)
{
    return placeText(fileName(base, site.place), site.place.at);
}

QString fileName(const RuleBase &base, const Place &place)
{
    return base.files()[static_cast<std::size_t>(place.file)].name();
}

} // namespace hmirules
