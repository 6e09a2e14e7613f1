#pragma once

namespace HmiStateMachine {

/**
 * Makes the types of the library's signals known to the meta-type system, under the names that moc
 * records. Called while the library is loaded; calling it again changes nothing.
 */
void registerMetaTypes();

} // namespace HmiStateMachine
