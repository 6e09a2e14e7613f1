#pragma once

class QState;

namespace headunit {

struct Surroundings;

/** Where the flow begins: it asks for the language at the first start, and else welcomes. */
void addStartUpStates(QState *domain);
void addStartUpTransitions(const Surroundings &surroundings);

} // namespace headunit
