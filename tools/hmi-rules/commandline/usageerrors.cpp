#include "commandline/usageerrors.h"
#include "commandline/quoting.h"
#include "lint/guess.h"

#include <algorithm>

namespace hmirules {

namespace {

bool isOption(const QByteArray &argument)
{
    return argument.size() > 1 && argument.startsWith('-');
}

QByteArray proposal(const QByteArray &word, const QByteArrayList &words)
{
    QStringList candidates;
    for (const QByteArray &candidate : words) {
        candidates.append(QString::fromUtf8(candidate));
    }
    return didYouMean(QString::fromUtf8(word), candidates).toUtf8();
}

// "option --output" or "argument FILE".
QByteArray described(const Parameter &parameter)
{
    return (isOption(parameter.name) ? "option " : "argument ") + parameter.name;
}

const Parameter *findOption(const QVector<Parameter> &options, const QByteArray &argument)
{
    const QByteArray name = argument.split('=').first();
    const auto found =
        std::find_if(options.cbegin(), options.cend(), [&name](const Parameter &option) {
            return option.name == name
                || (option.letter != '\0' && name == QByteArray("-") + option.letter);
        });
    return found == options.cend() ? nullptr : &*found;
}

QByteArray unknownOption(const QByteArray &argument, const QVector<Parameter> &options)
{
    QByteArrayList names;
    for (const Parameter &option : options) {
        names.append(option.name);
    }
    const QByteArray name = argument.split('=').first();
    return "unknown option " + quoted(name) + proposal(name, names);
}

QByteArray unknownError(const SplitArguments &arguments)
{
    if (arguments.unknown.isEmpty()) {
        return QByteArray();
    }
    const QByteArray unknown = arguments.unknown.first();
    return isOption(unknown) ? unknownOption(unknown, arguments.command->options)
                             : "unexpected argument " + quoted(unknown);
}

QByteArray outsideError(const SplitArguments &arguments)
{
    if (arguments.outside.isEmpty()) {
        return QByteArray();
    }
    const QByteArray outside = arguments.outside.first();
    const QVector<CommandDefinition> &commands = program().commands;
    const bool ofACommand =
        std::any_of(commands.cbegin(), commands.cend(), [&outside](const CommandDefinition &each) {
            return findOption(each.options, outside);
        });
    return ofACommand ? "option " + quoted(outside) + " belongs behind a command"
                      : unknownOption(outside, program().options);
}

QByteArray missingArgument(const SplitArguments &arguments)
{
    for (const Parameter &argument : arguments.command->arguments) {
        const bool given =
            std::any_of(arguments.given.cbegin(), arguments.given.cend(),
                        [&argument](const Given &each) { return each.parameter == &argument; });
        if (!given && !argument.optional) {
            return "argument " + argument.name + " is missing";
        }
    }
    return QByteArray();
}

QByteArray missingValue(const SplitArguments &arguments)
{
    if (arguments.withoutValue.isEmpty()) {
        return QByteArray();
    }
    const Parameter *option = findOption(arguments.command->options, arguments.withoutValue);
    return "option " + quoted(arguments.withoutValue) + " needs a value"
        + (option ? ": " + option->placeholder : QByteArray());
}

QByteArray valueError(const Parameter &parameter, const QByteArray &value)
{
    const QByteArrayList words = choices(parameter);
    if (parameter.kind == ValueKind::None) {
        return value == "true" ? QByteArray() : described(parameter) + " takes no value";
    }
    if (value.isEmpty()) {
        return described(parameter) + " is empty";
    }
    if (parameter.kind == ValueKind::Choice && !words.contains(value)) {
        return quoted(value) + " is no value of " + parameter.name + ", which takes "
            + enumerated(words, "or");
    }
    const bool isPath = parameter.kind == ValueKind::File;
    if (!isPath && QString::fromUtf8(value).toUtf8() != value) {
        return described(parameter) + " is not valid UTF-8";
    }
    return QByteArray();
}

QByteArray givenError(const Given &given)
{
    for (const QByteArray &value : given.values) {
        const QByteArray error = valueError(*given.parameter, value);
        if (!error.isEmpty()) {
            return error;
        }
    }
    // A flag may be repeated: it asks for the same again.
    if (!given.parameter->repeatable && given.parameter->kind != ValueKind::None
        && given.values.size() > 1) {
        return described(*given.parameter) + " is given " + QByteArray::number(given.values.size())
            + " times; it may be given once";
    }
    return QByteArray();
}

QByteArray commandError(const SplitArguments &arguments)
{
    if (arguments.command) {
        return QByteArray();
    }
    QByteArrayList names;
    for (const CommandDefinition &command : program().commands) {
        names.append(command.name);
    }
    const QByteArray all = "; the commands are " + enumerated(names, "and");
    if (!arguments.word) {
        return "a command is missing" + all;
    }
    const QByteArray meant = proposal(*arguments.word, names);
    return "unknown command " + quoted(*arguments.word) + (meant.isEmpty() ? all : meant);
}

QByteArray parameterError(const SplitArguments &arguments)
{
    for (const auto check : {unknownError, missingValue, missingArgument}) {
        const QByteArray error = check(arguments);
        if (!error.isEmpty()) {
            return error;
        }
    }
    for (const Given &given : arguments.given) {
        const QByteArray error = givenError(given);
        if (!error.isEmpty()) {
            return error;
        }
    }
    return QByteArray();
}

// An option that ends in "=" is no way to give an empty value.
QByteArray openEndError(const std::vector<std::string> &arguments)
{
    for (const std::string &each : arguments) {
        const QByteArray argument = QByteArray::fromStdString(each);
        if (argument == "--") {
            break;
        }
        if (argument.startsWith("--") && argument.indexOf('=') == argument.size() - 1) {
            return "option " + quoted(argument) + " needs a value";
        }
    }
    return QByteArray();
}

} // namespace

QByteArray usageError(const SplitArguments &split, const std::vector<std::string> &arguments)
{
    for (const auto check : {outsideError, commandError}) {
        const QByteArray error = check(split);
        if (!error.isEmpty()) {
            return error;
        }
    }
    const QByteArray error = openEndError(arguments);
    return error.isEmpty() ? parameterError(split) : error;
}

} // namespace hmirules
