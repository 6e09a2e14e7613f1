#pragma once

#include <QHash>
#include <QPointer>
#include <QString>

namespace HmiStateMachine {

class ParallelSiblingTransitionGroup;

/**
 * The sibling groups of one transition class by key. A group dies with the application object, and
 * its guarded pointer with it: a test program may make one application object after the other.
 */
using SiblingGroups = QHash<QString, QPointer<ParallelSiblingTransitionGroup>>;

/** @p group, made as a child of the application object when there is none yet. */
ParallelSiblingTransitionGroup *ensureGroup(QPointer<ParallelSiblingTransitionGroup> &group);

} // namespace HmiStateMachine
