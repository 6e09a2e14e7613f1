#include "docgen/bashcompletion.h"

namespace hmirules {

namespace {

QByteArray shellWords(const QByteArrayList &words)
{
    QByteArrayList quotedWords;
    for (const QByteArray &word : words) {
        quotedWords.append(shellQuoted(word));
    }
    return quotedWords.join(' ');
}

QByteArrayList optionNames(const QVector<Parameter> &options)
{
    QByteArrayList names;
    for (const Parameter &option : options) {
        if (option.letter != '\0') {
            names.append(QByteArray("-") + option.letter);
        }
        names.append(option.name);
    }
    return names;
}

// What the script's variables become where a parameter's value is completed.
QByteArray assignment(const Parameter &parameter, const QByteArrayList &findingIds)
{
    switch (parameter.kind) {
    case ValueKind::Choice:
        return "kind=word words=(" + shellWords(choices(parameter)) + ")";
    case ValueKind::FindingId:
        return "kind=word words=(" + shellWords(findingIds) + ")";
    case ValueKind::File:
        return "kind=path";
    case ValueKind::Name:
        return "kind=name";
    case ValueKind::None:
        break;
    }
    return "kind=";
}

QByteArray patterns(const Parameter &option)
{
    const QByteArray name = shellQuoted(option.name);
    return option.letter == '\0' ? name : '-' + QByteArray(1, option.letter) + " | " + name;
}

QByteArray optionCases(const CommandDefinition &command, const QByteArrayList &findingIds)
{
    QByteArray out;
    for (const Parameter &option : command.options) {
        if (option.kind != ValueKind::None) {
            out += "                " + patterns(option) + ") " + assignment(option, findingIds)
                + " ;;\n";
        }
    }
    return out;
}

QByteArray argumentCases(const CommandDefinition &command, const QByteArrayList &findingIds)
{
    QByteArray out;
    for (int place = 0; place < command.arguments.size(); ++place) {
        const Parameter &argument = command.arguments.at(place);
        out += "                " + (argument.repeatable ? "*" : QByteArray::number(place)) + ") "
            + assignment(argument, findingIds) + " ;;\n";
    }
    return out;
}

using Cases = QByteArray (*)(const CommandDefinition &, const QByteArrayList &);

QByteArray byCommand(const ProgramDefinition &program, const QByteArrayList &findingIds,
                     Cases cases)
{
    QByteArray out;
    for (const CommandDefinition &command : program.commands) {
        const QByteArray inner = cases(command, findingIds);
        if (!inner.isEmpty()) {
            out += "        " + shellQuoted(command.name) + ")\n            case $2 in\n" + inner
                + "            esac ;;\n";
        }
    }
    return out;
}

QByteArray optionLists(const ProgramDefinition &program)
{
    QByteArray out;
    for (const CommandDefinition &command : program.commands) {
        out += "        " + shellQuoted(command.name) + ") words=("
            + shellWords(optionNames(command.options)) + ") ;;\n";
    }
    return out + "        *) words=(" + shellWords(optionNames(program.options)) + ") ;;\n";
}

QByteArray commandNames(const ProgramDefinition &program)
{
    QByteArrayList names;
    for (const CommandDefinition &command : program.commands) {
        names.append(command.name);
    }
    return shellWords(names);
}

} // namespace

QByteArray shellQuoted(const QByteArray &word)
{
    return '\'' + QByteArray(word).replace('\'', "'\\''") + '\'';
}

QByteArray bashCompletion(const ProgramDefinition &program, const QByteArray &scriptTemplate,
                          const QStringList &findingIds)
{
    QByteArrayList ids;
    for (const QString &id : findingIds) {
        ids.append(id.toUtf8());
    }
    QByteArray script = scriptTemplate;
    script.replace("@OPTION_VALUES@\n", byCommand(program, ids, optionCases));
    script.replace("@ARGUMENTS@\n", byCommand(program, ids, argumentCases));
    script.replace("@OPTIONS@\n", optionLists(program));
    script.replace("@COMMANDS@", commandNames(program));
    return script;
}

} // namespace hmirules
