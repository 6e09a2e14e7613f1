#pragma once

#include <QStringList>

/** The names that a scenario may use; those of states and views are known once the flow is built.
 */
namespace headunit {

/** What may be requested: views by state or by view id, and domains, which open their first view.
 */
QStringList requestableNames();

/** The popups that may be requested, by state. */
QStringList popupNames();

/** The ids that the view layer may be told to show. */
QStringList viewIds();

/** The states that are views. */
QStringList viewStateNames();
QStringList stateNames();
QStringList keyNames();

/** Written with the object's name: "vehicle.speed". */
QStringList propertyNames();

/** The one of @p names that @p name was probably meant to be; empty when none is close. */
QString nearestName(const QString &name, const QStringList &names);

} // namespace headunit
