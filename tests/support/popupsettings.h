#pragma once

#include "emitter.h"

#include <HmiStateMachine/popup/popupstate.h>

/** Refused popups are kept while this lives; the setting belongs to the whole process. */
struct StoringBlocked
{
    StoringBlocked() { HmiStateMachine::PopupState::setStoreBlockedPopups(true); }
    ~StoringBlocked() { HmiStateMachine::PopupState::setStoreBlockedPopups(false); }
};

/** Drivers are restricted while the value of @p emitter is 3; no property is named afterwards. */
struct DriverRestriction
{
    explicit DriverRestriction(Emitter &emitter)
    {
        HmiStateMachine::PopupState::setDriverRestrictionProperty(&emitter, "value", 3);
    }
    ~DriverRestriction()
    {
        HmiStateMachine::PopupState::setDriverRestrictionProperty(nullptr, QByteArray(),
                                                                  QVariant());
    }
};
