#pragma once

#include <QString>
#include <QStringList>

/** The part of the version that a change raises. */
enum class VersionStep {
    None,
    Minor, ///< what was there is still there, as it was
    Major, ///< a program or a scene that relied on the old interface may fail
};

struct InterfaceChanges
{
    VersionStep step = VersionStep::None;
    QStringList lines; ///< "HmiStateMachine::NamedState: added (minor): signal void left()"
};

/**
 * What has changed between two dumps of meta-objects. What is added is a minor step, all else a
 * major one. So is another order of what was there: connections by name go on working, but moc
 * numbers methods, properties and enumerators in this order, and numbers may be kept.
 */
InterfaceChanges interfaceChanges(const QString &before, const QString &after);
