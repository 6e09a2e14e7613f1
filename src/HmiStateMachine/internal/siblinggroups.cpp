#include <HmiStateMachine/internal/siblinggroups.h>

#include <HmiStateMachine/named/parallelsiblingtransitiongroup.h>

#include <QCoreApplication>

namespace HmiStateMachine {

ParallelSiblingTransitionGroup *ensureGroup(QPointer<ParallelSiblingTransitionGroup> &group)
{
    if (!group) {
        group = new ParallelSiblingTransitionGroup(QCoreApplication::instance());
    }
    return group.data();
}

} // namespace HmiStateMachine
