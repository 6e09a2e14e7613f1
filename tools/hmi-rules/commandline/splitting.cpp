#include "commandline/splitting.h"

#include <CLI/CLI.hpp>

namespace hmirules {

namespace {

using Bound = std::vector<std::pair<const Parameter *, CLI::Option *>>;

std::string names(const Parameter &option)
{
    const std::string name = option.name.toStdString();
    return option.letter == '\0' ? name : std::string("-") + option.letter + "," + name;
}

// Whatever is wrong with the values is told afterwards, in words that name it: nothing is required
// or refused here, and an option takes as many values as it is given, each behind its own name.
void addOptions(CLI::App &app, const QVector<Parameter> &options, Bound &bound)
{
    for (const Parameter &option : options) {
        CLI::Option *added = option.kind == ValueKind::None
            ? app.add_flag(names(option))
            : app.add_option(names(option))->expected(-1)->allow_extra_args(false);
        added->multi_option_policy(CLI::MultiOptionPolicy::TakeAll);
        bound.emplace_back(&option, added);
    }
}

// An argument that waits for more than can come takes files whatever they are called: "[a]" would
// be taken apart as a list where extra values are allowed, and "-b" behind "--" would be an option
// once the argument had enough.
void addArguments(CLI::App &app, const QVector<Parameter> &arguments, Bound &bound)
{
    constexpr int endless = CLI::detail::expected_max_vector_size - 1;
    for (const Parameter &argument : arguments) {
        CLI::Option *added = app.add_option(argument.name.toStdString());
        added->expected(argument.repeatable ? endless : 1);
        added->multi_option_policy(CLI::MultiOptionPolicy::TakeAll);
        bound.emplace_back(&argument, added);
    }
}

QVector<Given> valuesOf(const Bound &bound)
{
    QVector<Given> given;
    for (const auto &[parameter, option] : bound) {
        QByteArrayList values;
        for (const std::string &value : option->results()) {
            values.append(QByteArray::fromStdString(value));
        }
        if (!values.isEmpty()) {
            given.append({parameter, values});
        }
    }
    return given;
}

QByteArrayList remaining(const CLI::App &app)
{
    QByteArrayList rest;
    for (const std::string &argument : app.remaining()) {
        rest.append(QByteArray::fromStdString(argument));
    }
    return rest;
}

} // namespace

SplitArguments split(const std::vector<std::string> &arguments)
{
    CLI::App app;
    app.set_help_flag();
    app.allow_extras();
    app.require_subcommand(0, 1);
    std::vector<Bound> bound(1);
    addOptions(app, program().options, bound[0]);
    for (const CommandDefinition &definition : program().commands) {
        CLI::App *command = app.add_subcommand(definition.name.toStdString());
        bound.emplace_back();
        addOptions(*command, definition.options, bound.back());
        addArguments(*command, definition.arguments, bound.back());
    }

    SplitArguments result;
    try {
        app.parse(std::vector<std::string>(arguments.rbegin(), arguments.rend()));
    } catch (const CLI::ParseError &) {
        // As nothing else is refused, the last argument is an option whose value is missing.
        result.withoutValue = QByteArray::fromStdString(arguments.back());
    }

    result.outside = remaining(app);
    result.given = valuesOf(bound[0]);
    for (const CLI::App *command : app.get_subcommands()) {
        const QByteArray name = QByteArray::fromStdString(command->get_name());
        result.command = findCommand(name);
        result.given +=
            valuesOf(bound[size_t(result.command - program().commands.constData()) + 1]);
        result.unknown = remaining(*command);
        // Left over, too, where all that follows it went to the command.
        result.unknown.removeOne("--");
        result.outside.removeOne("--");
    }
    return result;
}

} // namespace hmirules
