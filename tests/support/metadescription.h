#pragma once

#include <QMetaObject>
#include <QStringList>

class QMetaMethod;

/** "QString oldViewId, QString newViewId": types as they are written, and names. */
QString parameterList(const QMetaMethod &method);

/**
 * What a class itself adds to its meta-object, in order, one line an entry:
 *
 * "signal nameChanged(Identifier name)", "slot setName(Identifier name)",
 * "private slot sourceEntered()", "property Identifier name read write nameChanged(Identifier)",
 * "enum Operator". A property without a setter has no "write", one without a notify signal ends
 * there.
 */
QStringList metaDescription(const QMetaObject &meta);
