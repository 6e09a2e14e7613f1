#include "commandline/splitting.h"

#include <algorithm>
#include <CLI/CLI.hpp>

namespace hmirules {

namespace {

using Arguments = std::vector<std::string>;
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

// A repeatable argument waits for more than can come. Were extra values allowed in place of that, a
// file named "[a]" would be taken apart as a list.
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

void addGiven(const Bound &bound, SplitArguments &result)
{
    for (const auto &[parameter, option] : bound) {
        QByteArrayList values;
        for (const std::string &value : option->results()) {
            values.append(QByteArray::fromStdString(value));
        }
        if (!values.isEmpty()) {
            result.given.append({parameter, values});
        }
    }
}

// Gives back what no parameter takes.
QByteArrayList splitPart(const Arguments &part, const QVector<Parameter> &options,
                         const QVector<Parameter> &arguments, SplitArguments &result)
{
    CLI::App app;
    Bound bound;
    app.set_help_flag();
    app.allow_extras();
    addOptions(app, options, bound);
    addArguments(app, arguments, bound);
    try {
        app.parse(Arguments(part.rbegin(), part.rend()));
    } catch (const CLI::ParseError &) {
        // As nothing else is refused, the last argument is an option whose value is missing.
        result.withoutValue = QByteArray::fromStdString(part.back());
    }
    addGiven(bound, result);

    QByteArrayList rest;
    for (const std::string &argument : app.remaining()) {
        rest.append(QByteArray::fromStdString(argument));
    }
    rest.removeOne("--"); // the one that ends the options; a further one is an argument
    return rest;
}

} // namespace

// Each side of the command is parsed by itself: parsed as a command within a program, an argument
// "++" would end it, and a later word could be another command.
SplitArguments split(const std::vector<std::string> &arguments)
{
    const auto word =
        std::find_if(arguments.cbegin(), arguments.cend(),
                     [](const std::string &each) { return each.compare(0, 1, "-") != 0; });
    SplitArguments result;
    result.outside = splitPart(Arguments(arguments.cbegin(), word), program().options, {}, result);
    if (word == arguments.cend()) {
        return result;
    }
    result.word = QByteArray::fromStdString(*word);
    result.command = findCommand(*result.word);
    if (result.command) {
        result.unknown = splitPart(Arguments(word + 1, arguments.cend()), result.command->options,
                                   result.command->arguments, result);
    }
    return result;
}

} // namespace hmirules
