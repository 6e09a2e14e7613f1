#include "metadescription.h"

#include <QMetaEnum>
#include <QMetaMethod>
#include <QMetaProperty>

namespace {

QString describe(const QMetaMethod &method)
{
    QString kind = "method ";
    if (method.methodType() == QMetaMethod::Signal) {
        kind = "signal ";
    } else if (method.methodType() == QMetaMethod::Slot) {
        kind = "slot ";
    }
    if (method.methodType() == QMetaMethod::Slot && method.access() == QMetaMethod::Private) {
        kind.prepend("private ");
    }
    return kind + method.name() + '(' + parameterList(method) + ')';
}

QString describe(const QMetaProperty &property)
{
    QStringList parts = {"property", property.typeName(), property.name()};
    if (property.isReadable()) {
        parts.append("read");
    }
    if (property.isWritable()) {
        parts.append("write");
    }
    if (property.hasNotifySignal()) {
        parts.append(property.notifySignal().methodSignature());
    }
    return parts.join(' ');
}

} // namespace

QString parameterList(const QMetaMethod &method)
{
    QStringList parameters;
    const auto types = method.parameterTypes();
    const auto names = method.parameterNames();
    for (int i = 0; i < types.size(); ++i) {
        parameters.append(QString::fromLatin1(types.at(i) + ' ' + names.at(i)).trimmed());
    }
    return parameters.join(", ");
}

QStringList metaDescription(const QMetaObject &meta)
{
    QStringList result;
    for (int i = meta.methodOffset(); i < meta.methodCount(); ++i) {
        result.append(describe(meta.method(i)));
    }
    for (int i = meta.propertyOffset(); i < meta.propertyCount(); ++i) {
        result.append(describe(meta.property(i)));
    }
    for (int i = meta.enumeratorOffset(); i < meta.enumeratorCount(); ++i) {
        result.append(QStringLiteral("enum ") + meta.enumerator(i).name());
    }
    return result;
}
