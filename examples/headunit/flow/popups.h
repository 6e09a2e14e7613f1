#pragma once

namespace headunit {

struct Surroundings;
struct Timing;

/** What the view layer is told a popup is, so that it can place it. */
enum PopupKind { NotePopup = 2, QuestionPopup = 3, WarningPopup = 4, OverlayPopup = 5 };

/** Makes all popups of both layers; called once the states of the screens stand. */
void addPopups(const Surroundings &surroundings);

// What single popups do beyond being shown and dismissed. Each of these stands in a file of its
// own.

/** Waits while its domain is blocked; made here, because it is a state of another class. */
void addAdvertisement();

/** These go away by themselves, and the volume tells how long that takes. */
void setTimeouts(const Timing &timing);

/** Cannot be dismissed: it stays until the fault is repaired. */
void keepFaultOpen();

/** Comes above a speed and goes below it. */
void warnOfSpeed(const Surroundings &surroundings);

/** What takes time to read is closed when the car moves off. */
void restrictToStanding(const Surroundings &surroundings);

/** Refused popups are kept until the car is parked. */
void keepBlockedPopups(const Surroundings &surroundings);

} // namespace headunit
