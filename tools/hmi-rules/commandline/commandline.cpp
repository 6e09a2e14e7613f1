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
    const SplitArguments told = split(arguments);
    // In spite of faults, though not for a command that does not exist.
    const bool helps = told.command || !told.word;
    if (helps && isGiven(told, helpName)) {
        return {std::nullopt, told.command ? commandHelp(*told.command) : programHelp(), 0};
    }
    if (helps && isGiven(told, versionName)) {
        return {std::nullopt, program().name + ' ' + program().version + '\n', 0};
    }
    const QByteArray wrong = usageError(told, arguments);
    if (!wrong.isEmpty()) {
        return refused(wrong, told.command);
    }
    const Options options = stored(told);
    const QByteArray contrary = contradiction(options);
    return contrary.isEmpty() ? Parsed{options, QByteArray(), 0} : refused(contrary, told.command);
}

} // namespace hmirules
