#pragma once

#include <QString>

namespace headunit {

/** The popups, domains and views of the flow, as hmi-rules wants them; a flow has to be built. */
QString inventory();

} // namespace headunit
