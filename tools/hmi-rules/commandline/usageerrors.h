#pragma once

#include "commandline/splitting.h"

namespace hmirules {

/** What is wrong with the choice of a command; empty for nothing. */
QByteArray commandError(const SplitArguments &arguments);

/** What is wrong with the parameters of the command that is given; empty for nothing. */
QByteArray parameterError(const SplitArguments &arguments);

/** What an option says that ends in "=", which is no way to give an empty value; empty for none. */
QByteArray openEndError(const std::vector<std::string> &arguments);

} // namespace hmirules
