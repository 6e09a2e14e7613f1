#pragma once

#include "commandline/options.h"

#include <QByteArrayList>
#include <QVector>

namespace hmirules {

/** What is written for a parameter, which says how it is checked and completed. */
enum class ValueKind {
    None, ///< nothing: a flag
    Choice, ///< one of some words
    File, ///< a path, in the bytes of the file system
    FindingId,
    Name ///< of a popup, a domain or a view, as it stands in the files: in UTF-8
};

/** An option, or an argument, which is told by its place. */
struct Parameter
{
    QByteArray name; ///< "--base"; of an argument the same as its placeholder
    char letter = '\0'; ///< the 'o' of "-o"
    ValueKind kind = ValueKind::None;
    QByteArray placeholder; ///< "FILE", "text|json"; empty for a flag
    QByteArray text;
    bool repeatable = false;
    bool optional = true; ///< arguments alone are ever missed
    void (*store)(Options &options, const QByteArray &value) = nullptr;
};

/** The words of a choice. */
QByteArrayList choices(const Parameter &parameter);

/** "FILE...", "[ID]": an argument as it stands in a line of usage. */
QByteArray usageOf(const Parameter &argument);

struct ExitStatus
{
    int code;
    QByteArray text;
};

struct Example
{
    QByteArray commandLine;
    QByteArray text;
};

struct CommandDefinition
{
    Command command;
    QByteArray name;
    QByteArray summary; ///< for the list of commands
    QByteArray description;
    QVector<Parameter> arguments;
    QVector<Parameter> options;
    QVector<ExitStatus> exitStatus;
    QVector<Example> examples;
};

/** A kind of file that the program reads, or another page to read. */
struct Reference
{
    QByteArray name;
    QByteArray text;
};

struct ProgramDefinition
{
    QByteArray name;
    QByteArray version;
    QByteArray summary;
    QByteArray description;
    QVector<Parameter> options; ///< without a command
    QVector<CommandDefinition> commands;
    QVector<ExitStatus> exitStatus;
    QVector<Reference> files;
    QByteArray seeAlso;
};

/**
 * The whole command line: help, man page, completion and parser are made from it alone. In the
 * texts two line breaks part paragraphs.
 */
const ProgramDefinition &program();

/** Of the program's commands; null when none has the name. */
const CommandDefinition *findCommand(const QByteArray &name);

} // namespace hmirules
