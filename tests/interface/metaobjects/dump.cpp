#include "dump.h"

#include "metadescription.h"

#include <QMetaClassInfo>
#include <QMetaEnum>
#include <QMetaMethod>
#include <QMetaProperty>

#include <algorithm>

namespace {

QString kindOf(const QMetaMethod &method)
{
    switch (method.methodType()) {
    case QMetaMethod::Signal:
        return "signal ";
    case QMetaMethod::Slot:
        return "slot ";
    case QMetaMethod::Constructor:
        return "constructor ";
    case QMetaMethod::Method:
        break;
    }
    return "method ";
}

QString describe(const QMetaMethod &method)
{
    QString result;
    if (method.access() == QMetaMethod::Private) {
        result = "private ";
    } else if (method.access() == QMetaMethod::Protected) {
        result = "protected ";
    }
    result += kindOf(method);
    if (method.methodType() != QMetaMethod::Constructor) {
        result += method.typeName() + QString(' ');
    }
    result += method.name() + '(' + parameterList(method) + ')';
    if (method.attributes() & QMetaMethod::Cloned) {
        result += ", by default arguments";
    }
    if (method.revision() != 0) {
        result += QString(", revision %1").arg(method.revision());
    }
    return result;
}

QString describe(const QMetaProperty &property)
{
    QStringList parts = {QString("property %1: %2").arg(property.name(), property.typeName())};
    const QList<QPair<bool, QString>> traits = {
        {property.isReadable(), "read"},
        {property.isWritable(), "write"},
        {property.isResettable(), "reset"},
        {property.isConstant(), "constant"},
        {property.isFinal(), "final"},
        {property.isRequired(), "required"},
        {property.isUser(), "user"},
        {!property.isDesignable(), "not designable"},
        {!property.isScriptable(), "not scriptable"},
        {!property.isStored(), "not stored"},
    };
    for (const auto &trait : traits) {
        if (trait.first) {
            parts.append(trait.second);
        }
    }
    if (property.hasNotifySignal()) {
        parts.append("notify " + property.notifySignal().methodSignature());
    }
    if (property.revision() != 0) {
        parts.append(QString("revision %1").arg(property.revision()));
    }
    return parts.join(", ");
}

QStringList describe(const QMetaEnum &enumeration)
{
    QStringList result = {
        QString("enum %1: %2").arg(enumeration.name(), enumeration.isFlag() ? "flags" : "values")};
    if (enumeration.isScoped()) {
        result.last() += ", scoped";
    }
    for (int i = 0; i < enumeration.keyCount(); ++i) {
        result.append(QString("value %1::%2 = %3")
                          .arg(enumeration.name(), enumeration.key(i))
                          .arg(enumeration.value(i)));
    }
    return result;
}

QStringList entries(const QMetaObject &meta)
{
    QStringList result;
    for (int i = meta.classInfoOffset(); i < meta.classInfoCount(); ++i) {
        result.append(
            QString("info %1: %2").arg(meta.classInfo(i).name(), meta.classInfo(i).value()));
    }
    for (int i = 0; i < meta.constructorCount(); ++i) {
        result.append(describe(meta.constructor(i)));
    }
    for (int i = meta.methodOffset(); i < meta.methodCount(); ++i) {
        result.append(describe(meta.method(i)));
    }
    for (int i = meta.propertyOffset(); i < meta.propertyCount(); ++i) {
        result.append(describe(meta.property(i)));
    }
    for (int i = meta.enumeratorOffset(); i < meta.enumeratorCount(); ++i) {
        result.append(describe(meta.enumerator(i)));
    }
    return result;
}

QString superclassOf(const QMetaObject &meta)
{
    return meta.superClass() ? meta.superClass()->className() : "none";
}

} // namespace

QString interfaceDump(QList<const QMetaObject *> classes)
{
    std::sort(classes.begin(), classes.end(), [](const QMetaObject *a, const QMetaObject *b) {
        return qstrcmp(a->className(), b->className()) < 0;
    });
    QString result;
    for (const QMetaObject *meta : qAsConst(classes)) {
        result += QString("class %1: %2\n").arg(meta->className(), superclassOf(*meta));
        for (const QString &entry : entries(*meta)) {
            result += "    " + entry + '\n';
        }
    }
    return result;
}
