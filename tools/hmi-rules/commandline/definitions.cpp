#include "commandline/definitions.h"
#include "commandline/commands.h"
#include "commandline/parameters.h"
#include "version.h"

#include <algorithm>

namespace hmirules {

namespace {

ProgramDefinition makeProgram()
{
    return {
        "hmi-rules",
        toolVersion,
        "check, explain and compare popup interruption files",
        "hmi-rules reads the popup interruption files of an application that uses HmiStateMachine. "
        "It finds their faults, tells which behaviour a requested popup meets and why, shows all "
        "decisions at once, and compares two files by what they decide.\n\n"
        "Files are loaded as the application loads them: a later entry replaces an earlier one "
        "for the same key. A file named \"-\" is the standard input, which can be read once.",
        helpOptions(),
        {lintCommand(), explainCommand(), matrixCommand(), diffCommand(), schemaCommand(),
         findingsCommand()},
        {{0, "Done; of lint and diff: nothing to report."},
         {1, "Of lint: findings that count as failure. Of diff: a decision changes."},
         {2, "The command line is wrong, or a file cannot be used."}},
        {{"Popup interruption file",
          "JSON in UTF-8: an array with one entry a popup or wildcard. The command schema prints "
          "its JSON Schema, for editors."},
         {"Inventory",
          "JSON in UTF-8: an object with lists of the popups, domains and views that the "
          "application "
          "has, each of which may be missing."},
         {"List of popups, domains or views", "Text in UTF-8 with one name a line."},
         {"share/HmiStateMachine/schema", "JSON Schemas of both kinds of JSON, for editors."}},
        "The documentation of HmiStateMachine, which loads these files.",
    };
}

} // namespace

QByteArrayList choices(const Parameter &parameter)
{
    return parameter.kind == ValueKind::Choice ? parameter.placeholder.split('|')
                                               : QByteArrayList();
}

QByteArray usageOf(const Parameter &argument)
{
    const QByteArray usage = argument.placeholder + (argument.repeatable ? "..." : "");
    return argument.optional ? "[" + usage + "]" : usage;
}

const ProgramDefinition &program()
{
    static const ProgramDefinition definition = makeProgram();
    return definition;
}

const CommandDefinition *findCommand(const QByteArray &name)
{
    const QVector<CommandDefinition> &commands = program().commands;
    const auto found =
        std::find_if(commands.cbegin(), commands.cend(),
                     [&name](const CommandDefinition &command) { return command.name == name; });
    return found == commands.cend() ? nullptr : &*found;
}

} // namespace hmirules
