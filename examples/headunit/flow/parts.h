#pragma once

class QState;

namespace headunit {

struct Surroundings;

// Each part of the flow comes in two steps: all states are made first, so that transitions may
// name any of them. A domain makes its first view its initial one.

void addHomeViews(QState *domain, const Surroundings &surroundings);
void addHomeTransitions(const Surroundings &surroundings);

void addMediaViews(QState *domain, const Surroundings &surroundings);
void addMediaTransitions(const Surroundings &surroundings);

void addPhoneViews(QState *domain, const Surroundings &surroundings);
void addPhoneTransitions(const Surroundings &surroundings);

void addNavigationViews(QState *domain, const Surroundings &surroundings);
void addNavigationTransitions(const Surroundings &surroundings);

void addSettingsViews(QState *domain, const Surroundings &surroundings);
void addSettingsTransitions(const Surroundings &surroundings);

void addGuidanceStates(QState *region, const Surroundings &surroundings);
void addGuidanceTransitions(const Surroundings &surroundings);

void addAudioStates(QState *region, const Surroundings &surroundings);
void addAudioTransitions(const Surroundings &surroundings);

/** The region of the keys has no states within. */
void addKeyTransitions(const Surroundings &surroundings);

/** Voice requests lead from any screen to another one. */
void addVoiceTransitions(const Surroundings &surroundings);

} // namespace headunit
