#include "jsonnode.h"

#include <algorithm>

namespace hmirules {

const JsonNode *JsonNode::value(const char *key) const
{
    const auto found =
        std::find_if(members.crbegin(), members.crend(),
                     [key](const JsonMember &member) { return member.key == QLatin1String(key); });
    return found == members.crend() ? nullptr : &found->value;
}

QString JsonNode::string(const char *key) const
{
    const JsonNode *found = value(key);
    return found && found->type == String ? found->text : QString();
}

const std::vector<JsonNode> &JsonNode::array(const char *key) const
{
    static const std::vector<JsonNode> none;
    const JsonNode *found = value(key);
    return found ? found->items : none;
}

QString typeText(JsonNode::Type type)
{
    switch (type) {
    case JsonNode::Null:
        return "null";
    case JsonNode::Bool:
        return "true or false";
    case JsonNode::Number:
        return "a number";
    case JsonNode::String:
        return "a text";
    case JsonNode::Array:
        return "an array";
    case JsonNode::Object:
        break;
    }
    return "an object";
}

} // namespace hmirules
