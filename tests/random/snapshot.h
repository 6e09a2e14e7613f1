#pragma once

#include <QList>
#include <QSet>
#include <QString>
#include <QVector>

namespace HmiStateMachine {
class PopupState;
}

/** What the machine and the view layer are in between two events. */
struct Snapshot
{
    QVector<HmiStateMachine::PopupState *> current; ///< of each layer
    QVector<HmiStateMachine::PopupState *> waiting; ///< will return, or is in front
    HmiStateMachine::PopupState *front = nullptr;
    QList<QString> stacked;
    QSet<QString> shown;

    bool operator==(const Snapshot &other) const;
};
