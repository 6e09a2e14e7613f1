#include "snapshot.h"

bool Snapshot::operator==(const Snapshot &other) const
{
    return current == other.current && waiting == other.waiting && front == other.front
        && stacked == other.stacked && shown == other.shown;
}
