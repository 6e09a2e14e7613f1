#pragma once

#include "commandline/options.h"
#include "fault.h"

#include <QStringList>

namespace hmirules {

/** The names that an application knows, as far as they were told. */
struct Inventory
{
    struct Popup
    {
        QString name; ///< of the state
        QString viewId; ///< the name where nothing else is told
        QString file; ///< where it is told
        TextPosition at;
    };

    QList<Popup> popups;
    QStringList domains;
    QStringList views;
    bool hasPopups = false; ///< whether it is told which there are
    bool hasDomains = false;
    bool hasViews = false;

    QStringList popupNames() const;
    QStringList popupViewIds() const;

    /** The view id of a popup; its name when it is not listed. */
    QString viewIdOf(const QString &name) const;
};

/** Reads the inventory and the lists that the options name. False with a fault. */
bool readInventory(const Options &options, Inventory *inventory, Fault *fault);

} // namespace hmirules
