#pragma once

#include <QList>
#include <QMetaObject>

/** Those of all classes in the public headers of one library; listclasses.cmake writes the source.
 */
QList<const QMetaObject *> publicMetaObjects();
