#pragma once

#include <QString>

namespace HmiStateMachine {

/**
 * The name of a state, view or popup.
 *
 * Known to the meta-type system as "Identifier" and "HmiStateMachine::Identifier" once the library
 * is loaded, so that signal spies, queued connections and properties carry it.
 */
typedef QString Identifier;

} // namespace HmiStateMachine
