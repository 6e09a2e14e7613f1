#include "json.h"

namespace hmirules {

QString dump(const OrderedJson &json)
{
    constexpr int indentation = 2;
    return QString::fromStdString(
               json.dump(indentation, ' ', false, OrderedJson::error_handler_t::replace))
        + '\n';
}

} // namespace hmirules
