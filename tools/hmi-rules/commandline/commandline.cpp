#include "commandline/commandline.h"
#include "commandline/contradictions.h"
#include "commandline/help.h"
#include "commandline/parameters.h"
#include "commandline/usageerrors.h"

#include <algorithm>

namespace hmirules {

namespace {

constexpr int wrongUsage = 2;

bool isGiven(const SplitArguments &arguments, const char *name)
{
    return std::any_of(arguments.given.cbegin(), arguments.given.cend(),
                       [name](const Given &given) { return given.parameter->name == name; });
}

Parsed refused(const QByteArray &error, const CommandDefinition *command)
{
    const QByteArray helped =
        program().name + (command ? ' ' + command->name : QByteArray()) + " --help";
    return {std::nullopt, program().name + ": " + error + "\nTry \"" + helped + "\".\n",
            wrongUsage};
}

Options stored(const SplitArguments &arguments)
{
    Options options;
    options.command = arguments.command->command;
    for (const Given &given : arguments.given) {
        for (const QByteArray &value : given.values) {
            given.parameter->store(options, value);
        }
    }
    return options;
}

} // namespace

Parsed parse(const std::vector<std::string> &arguments)
{
    const SplitArguments split = hmirules::split(arguments);
    QByteArray error = commandError(split);
    if (isGiven(split, helpName) && (split.command || split.outside.isEmpty())) {
        return {std::nullopt, split.command ? commandHelp(*split.command) : programHelp(), 0};
    }
    if (isGiven(split, versionName) && (split.command || split.outside.isEmpty())) {
        return {std::nullopt, program().name + ' ' + program().version + '\n', 0};
    }
    if (error.isEmpty()) {
        error = openEndError(arguments);
    }
    if (error.isEmpty()) {
        error = parameterError(split);
    }
    if (!error.isEmpty()) {
        return refused(error, split.command);
    }
    const Options options = stored(split);
    error = contradiction(options);
    return error.isEmpty() ? Parsed{options, QByteArray(), 0} : refused(error, split.command);
}

} // namespace hmirules
