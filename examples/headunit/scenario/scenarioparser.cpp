#include "scenarioparser.h"

#include "arguments.h"
#include "vocabulary.h"

#include <algorithm>

namespace headunit {

namespace {

// A comment begins the line or follows a blank, outside of texts in double quotes.
QString withoutComment(const QString &line)
{
    bool inText = false;
    for (int i = 0; i < line.size(); ++i) {
        if (inText && line[i] == '\\') {
            ++i;
        } else if (line[i] == '"') {
            inText = !inText;
        } else if (!inText && line[i] == '#' && (i == 0 || line[i - 1].isSpace())) {
            return line.left(i).trimmed();
        }
    }
    return line;
}

// Narration is free text: a # in it is just a character.
QString commandText(const QString &line)
{
    const QString text = line.trimmed();
    if (text.startsWith("#!")) {
        return "say " + text.mid(2);
    }
    const bool isNarration = text.startsWith("say ") || text.startsWith("say\t");
    return isNarration ? text : withoutComment(text);
}

const CommandDefinition *definitionOf(const QString &name)
{
    const auto &all = commandDefinitions();
    const auto it =
        std::find_if(all.cbegin(), all.cend(), [&name](const CommandDefinition &definition) {
            return name == definition.name;
        });
    return it == all.cend() ? nullptr : &*it;
}

Fault unknownCommand(const QString &name)
{
    QStringList names;
    for (const CommandDefinition &definition : commandDefinitions()) {
        names.append(definition.name);
    }
    const QString nearest = nearestName(name, names);
    return {"a command", quoted(name),
            nearest.isEmpty() ? "the commands are " + names.join(", ")
                              : "did you mean " + quoted(nearest) + '?'};
}

std::optional<Fault> parseCommand(const QString &text, Command *command)
{
    const auto end = std::find_if(text.cbegin(), text.cend(),
                                  [](const QChar &character) { return character.isSpace(); });
    const QString name = text.left(static_cast<int>(end - text.cbegin()));
    const CommandDefinition *definition = definitionOf(name);
    if (!definition) {
        return unknownCommand(name);
    }
    Arguments arguments(name, text.mid(name.size()), definition->usage);
    command->kind = definition->kind;
    command->action = definition->parse(arguments);
    command->echo = arguments.echo();
    return arguments.fault();
}

} // namespace

std::optional<LocatedFault> parseScenario(const QStringList &lines, QVector<Command> *commands)
{
    for (int i = 0; i < lines.size(); ++i) {
        const QString text = commandText(lines[i]);
        if (text.isEmpty()) {
            continue;
        }
        Command command{i + 1, CommandKind::Step, QString(), Action()};
        if (const auto fault = parseCommand(text, &command)) {
            return LocatedFault{command.line, *fault};
        }
        commands->append(command);
    }
    if (commands->isEmpty()) {
        return LocatedFault{0, {"commands", "none", "write one command a line"}};
    }
    return std::nullopt;
}

} // namespace headunit
