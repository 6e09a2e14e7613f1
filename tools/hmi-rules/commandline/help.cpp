#include "commandline/help.h"
#include "commandline/wrapping.h"

#include <algorithm>

namespace hmirules {

namespace {

constexpr int width = 80;
constexpr int leastGap = 2;
constexpr int widestHeading = 28; // a wider one has its text below

// A heading at the left and its text, which hangs at the column.
QByteArray row(const QByteArray &heading, const QByteArray &text, int column)
{
    QByteArray out = "  " + heading;
    if (out.size() + leastGap > column) {
        out += '\n' + QByteArray(column, ' ');
    } else {
        out = out.leftJustified(column, ' ');
    }
    return out + wrapped(text, width - column).join('\n' + QByteArray(column, ' ')) + '\n';
}

QByteArray section(const QByteArray &title, const QVector<Reference> &rows)
{
    if (rows.isEmpty()) {
        return QByteArray();
    }
    int column = 0;
    for (const Reference &each : rows) {
        column = std::max(column, std::min(widestHeading, int(each.name.size())));
    }
    QByteArray out = '\n' + title + ":\n";
    for (const Reference &each : rows) {
        out += row(each.name, each.text, 2 + column + leastGap);
    }
    return out;
}

QByteArray section(const QByteArray &title, const QVector<Parameter> &parameters)
{
    QVector<Reference> rows;
    for (const Parameter &parameter : parameters) {
        // Long names stand below one another, whether a letter is before them or not.
        const bool indented = parameter.name.startsWith("--") && parameter.letter == '\0';
        rows.append({(indented ? "    " : "") + headingOf(parameter), parameter.text});
    }
    return section(title, rows);
}

QByteArray section(const QVector<ExitStatus> &exitStatus)
{
    QVector<Reference> rows;
    for (const ExitStatus &each : exitStatus) {
        rows.append({QByteArray::number(each.code), each.text});
    }
    return section("Exit status", rows);
}

QByteArray section(const QVector<Example> &examples)
{
    QByteArray out = "\nExamples:\n";
    for (const Example &example : examples) {
        out += "  " + example.commandLine + '\n';
        out += "      " + wrapped(example.text, width - 6).join("\n      ") + '\n';
    }
    return out;
}

QByteArray prose(const QByteArray &text)
{
    QByteArray out;
    for (const QByteArray &paragraph : paragraphs(text)) {
        out += '\n' + wrapped(paragraph, width).join('\n') + '\n';
    }
    return out;
}

} // namespace

QByteArray usageOf(const CommandDefinition &command)
{
    QByteArray usage = "[OPTION...]";
    for (const Parameter &argument : command.arguments) {
        usage += ' ' + usageOf(argument);
    }
    return usage;
}

QByteArray headingOf(const Parameter &parameter)
{
    if (!parameter.name.startsWith("--")) {
        return usageOf(parameter);
    }
    QByteArray heading = parameter.letter == '\0' ? "" : QByteArray("-") + parameter.letter + ", ";
    heading += parameter.name;
    return parameter.placeholder.isEmpty() ? heading : heading + ' ' + parameter.placeholder;
}

QByteArray programHelp()
{
    QVector<Reference> commands;
    for (const CommandDefinition &command : program().commands) {
        commands.append({command.name, command.summary});
    }
    return "Usage: " + program().name + " COMMAND [OPTION...] [ARGUMENT...]\n"
        + prose(program().description) + section("Commands", commands)
        + section("Options", program().options) + section(program().exitStatus) + "\nTry \""
        + program().name + " COMMAND --help\" for the options of a command.\n";
}

QByteArray commandHelp(const CommandDefinition &command)
{
    return "Usage: " + program().name + ' ' + command.name + ' ' + usageOf(command) + '\n'
        + prose(command.description) + section("Arguments", command.arguments)
        + section("Options", command.options) + section(command.exitStatus)
        + section(command.examples);
}

} // namespace hmirules
