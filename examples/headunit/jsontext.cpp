#include "jsontext.h"

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonParseError>

namespace headunit {

namespace {

QVariant withoutInvalid(const QVariant &value)
{
    if (value.type() != QVariant::Map) {
        return value;
    }
    QVariantMap map = value.toMap();
    for (auto it = map.begin(); it != map.end();) {
        it = it.value().isValid() ? it + 1 : map.erase(it);
    }
    return map;
}

} // namespace

QVariant fromJsonText(const QString &text, QString *error)
{
    // Qt reads whole documents only, which are objects or arrays: a single value is read in one.
    QJsonParseError parseError;
    const auto document = QJsonDocument::fromJson('[' + text.toUtf8() + ']', &parseError);
    if (parseError.error != QJsonParseError::NoError) {
        *error = parseError.errorString();
        return QVariant();
    }
    const QJsonArray values = document.array();
    if (values.size() != 1) {
        *error = "more than one value";
        return QVariant();
    }
    return values.first().toVariant();
}

QString toJsonText(const QVariant &value)
{
    const QJsonArray array{QJsonValue::fromVariant(withoutInvalid(value))};
    const QByteArray text = QJsonDocument(array).toJson(QJsonDocument::Compact);
    return QString::fromUtf8(text.mid(1, text.size() - 2));
}

} // namespace headunit
