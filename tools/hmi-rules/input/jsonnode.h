#pragma once

#include <QLatin1String>
#include <QString>

#include <vector>

namespace hmirules {

struct JsonMember;

/** A value of a JSON text with its place there: from the byte at begin to before that at end. */
struct JsonNode
{
    enum Type { Null, Bool, Number, String, Array, Object };

    Type type = Null;
    int begin = 0;
    int end = 0;
    QString text; ///< of a string
    std::vector<JsonNode> items; ///< of an array
    std::vector<JsonMember> members; ///< of an object, in their order, with repeated keys

    /**
     * The value of a key, null when there is none. Of a repeated key it is the last, as QJsonObject
     * has it.
     */
    const JsonNode *value(const char *key) const;

    /** The text of a key whose value is a string; empty otherwise. */
    QString string(const char *key) const;

    /** The items of a key whose value is an array; none otherwise. */
    const std::vector<JsonNode> &array(const char *key) const;
};

struct JsonMember
{
    QString key;
    int begin = 0; ///< of the key
    JsonNode value;
};

/** In words, for messages: "a number", "an object". */
QString typeText(JsonNode::Type type);

} // namespace hmirules
