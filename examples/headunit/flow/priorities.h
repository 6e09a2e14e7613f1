#pragma once

/**
 * Who gets an event that several states react to at the same time: the larger number. Within one
 * event or key every number is unique, which is why they stand in one place.
 */
namespace headunit {

/** The driver's OK. The screen takes it, unless something more urgent asks for it. */
enum ConfirmPriority {
    ConfirmInBrowser = 1,
    ConfirmInContacts = 2,
    ConfirmInResults = 3,
    ConfirmOffer = 10,
    ConfirmIncomingCall = 20
};

/** Guidance reroutes; without guidance the alert is only read out. */
enum TrafficAlertPriority { AlertIsReadOut = 1, AlertReroutes = 2 };

/** The phone key opens the phone, unless there is a call to take or to end. */
enum PhoneKeyPriority { PhoneKeyOpens = 1, PhoneKeyTakesCall = 2, PhoneKeyEndsCall = 3 };

} // namespace headunit
