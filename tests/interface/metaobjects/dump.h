#pragma once

#include <QList>
#include <QMetaObject>
#include <QString>

/**
 * The meta-objects as text, by the names of their classes: a line for the class and its superclass,
 * and below it, indented, a line for each entry that the class itself adds, in moc's order.
 *
 *     class HmiStateMachine::NamedState: QState
 *         signal void nameChanged(Identifier name)
 *         slot void setName(HmiStateMachine::Identifier name)
 *         property name: Identifier, read, write, notify nameChanged(Identifier)
 */
QString interfaceDump(QList<const QMetaObject *> classes);
