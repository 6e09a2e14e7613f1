#pragma once

#include "fault.h"

#include <optional>

namespace headunit {

struct Command;

/** Who watches a scenario; a scene does. */
class Audience
{
public:
    virtual ~Audience() = default;

    virtual void commandBegins(const Command &command) = 0;

    /** The flow has come to rest; whoever follows it does so now. */
    virtual std::optional<Fault> settle() = 0;
    virtual std::optional<Fault> commandEnds(const Command &command) = 0;
};

} // namespace headunit
