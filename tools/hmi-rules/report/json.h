#pragma once

#include <QString>

#include <nlohmann/json.hpp>

namespace hmirules {

/** Keeps keys in the order in which they are written, for people and for comparing. */
using OrderedJson = nlohmann::ordered_json;

inline std::string toJson(const QString &text)
{
    return text.toStdString();
}

QString dump(const OrderedJson &json);

} // namespace hmirules
