#include "docgen/manpage.h"
#include "commandline/wrapping.h"
#include "docgen/roff.h"

namespace hmirules {

namespace {

QByteArray prose(const QByteArray &text)
{
    QByteArrayList out;
    for (const QByteArray &paragraph : paragraphs(text)) {
        out.append(roff(paragraph) + '\n');
    }
    return out.join(".PP\n");
}

QByteArray entry(const QByteArray &heading, const QByteArray &text)
{
    return ".TP\n" + heading + '\n' + roff(text) + '\n';
}

QByteArray argumentUsage(const Parameter &argument)
{
    const QByteArray usage = italic(argument.placeholder) + (argument.repeatable ? "\\&..." : "");
    return argument.optional ? "[" + usage + "]" : usage;
}

QByteArray optionHeading(const Parameter &option)
{
    QByteArray heading;
    if (option.letter != '\0') {
        heading = bold(QByteArray("-") + option.letter) + ", ";
    }
    heading += bold(option.name);
    if (option.kind == ValueKind::Choice) {
        return heading + ' ' + roff(option.placeholder);
    }
    return option.kind == ValueKind::None ? heading : heading + ' ' + italic(option.placeholder);
}

QByteArray usage(const ProgramDefinition &program, const CommandDefinition &command)
{
    QByteArray out = bold(program.name + ' ' + command.name) + " [" + italic("OPTION") + "\\&...]";
    for (const Parameter &argument : command.arguments) {
        out += ' ' + argumentUsage(argument);
    }
    return out;
}

QByteArray synopsis(const ProgramDefinition &program)
{
    QByteArray out = ".SH SYNOPSIS\n.nf\n";
    for (const CommandDefinition &command : program.commands) {
        out += usage(program, command) + '\n';
    }
    for (const Parameter &option : program.options) {
        out += bold(program.name) + ' ' + bold(option.name) + '\n';
    }
    return out + ".fi\n";
}

QByteArray commands(const ProgramDefinition &program)
{
    QByteArray out = ".SH COMMANDS\n";
    for (const CommandDefinition &command : program.commands) {
        out += ".SS " + roff(command.name) + '\n' + usage(program, command) + '\n';
        out += ".PP\n" + prose(command.description);
        for (const Parameter &argument : command.arguments) {
            out += entry(argumentUsage(argument), argument.text);
        }
        for (const Parameter &option : command.options) {
            out += entry(optionHeading(option), option.text);
        }
    }
    return out;
}

QByteArray exitStatus(const ProgramDefinition &program)
{
    QByteArray out = ".SH EXIT STATUS\n";
    for (const ExitStatus &each : program.exitStatus) {
        out += entry(QByteArray::number(each.code), each.text);
    }
    return out;
}

QByteArray examples(const ProgramDefinition &program)
{
    QByteArray out = ".SH EXAMPLES\n";
    for (const CommandDefinition &command : program.commands) {
        for (const Example &example : command.examples) {
            out += entry(bold(example.commandLine), example.text);
        }
    }
    return out;
}

QByteArray files(const ProgramDefinition &program)
{
    QByteArray out = ".SH FILES\n";
    for (const Reference &file : program.files) {
        out += entry(roff(file.name), file.text);
    }
    return out;
}

} // namespace

QByteArray manPage(const ProgramDefinition &program)
{
    // Without a date: the same sources give the same page on every day.
    return ".TH " + roff(program.name.toUpper()) + " 1 \"\" \"HmiStateMachine "
        + roff(program.version) + "\" \"User Commands\"\n" + ".SH NAME\n" + roff(program.name)
        + " \\- " + roff(program.summary) + '\n' + synopsis(program) + ".SH DESCRIPTION\n"
        + prose(program.description) + commands(program) + exitStatus(program) + examples(program)
        + files(program) + ".SH SEE ALSO\n" + roff(program.seeAlso) + '\n';
}

} // namespace hmirules
