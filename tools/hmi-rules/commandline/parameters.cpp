#include "commandline/parameters.h"

namespace hmirules {

namespace {

void keepFormat(Options &options, const QByteArray &value)
{
    static const QByteArrayList names({"text", "json", "sarif", "csv", "html", "markdown"});
    options.format = Format(names.indexOf(value));
}

void keepColor(Options &options, const QByteArray &value)
{
    static const QByteArrayList names({"auto", "always", "never"});
    options.color = Color(names.indexOf(value));
}

void keepOutput(Options &options, const QByteArray &value)
{
    options.output = value == "-" ? QByteArray() : value;
}

} // namespace

Parameter fileArgument(const QByteArray &placeholder, const QByteArray &text)
{
    Parameter argument = {placeholder, '\0',  ValueKind::File, placeholder,
                          text,        false, false,           nullptr};
    argument.store = add<&Options::files>;
    return argument;
}

Parameter nameArgument(const QByteArray &placeholder, const QByteArray &text, Store store)
{
    return {placeholder, '\0', ValueKind::Name, placeholder, text, false, false, store};
}

Parameter flag(const QByteArray &name, const QByteArray &text, Store store)
{
    return {name, '\0', ValueKind::None, QByteArray(), text, false, true, store};
}

Parameter fileOption(const QByteArray &name, const QByteArray &text, Store store)
{
    return {name, '\0', ValueKind::File, "FILE", text, false, true, store};
}

Parameter nameOption(const QByteArray &name, const QByteArray &placeholder, const QByteArray &text,
                     Store store)
{
    return {name, '\0', ValueKind::Name, placeholder, text, false, true, store};
}

Parameter choiceOption(const QByteArray &name, const QByteArray &words, const QByteArray &text,
                       Store store)
{
    return {name, '\0', ValueKind::Choice, words, text, false, true, store};
}

Parameter repeated(Parameter parameter)
{
    parameter.repeatable = true;
    return parameter;
}

QVector<Parameter> ruleOptions()
{
    return {
        repeated(fileOption("--base", "Load these rules before; may be given several times.",
                            add<&Options::base>)),
        fileOption("--inventory", "The popups, domains and views that the application has.",
                   keep<&Options::inventory>),
        fileOption("--popups", "A list of the application's popups, one name a line.",
                   keep<&Options::popupList>),
        fileOption("--domains", "A list of the application's domains, one name a line.",
                   keep<&Options::domainList>),
        fileOption("--views", "A list of the application's views, one name a line.",
                   keep<&Options::viewList>),
    };
}

Parameter formatOption(const QByteArray &words, const QByteArray &text)
{
    return choiceOption("--format", words, text, keepFormat);
}

Parameter outputOption()
{
    Parameter option =
        fileOption("--output", "Write there instead of to the standard output.", keepOutput);
    option.letter = 'o';
    return option;
}

Parameter colorOption()
{
    return choiceOption("--color", "auto|always|never",
                        "Colours in text; auto, the default, has them on a terminal.", keepColor);
}

QVector<Parameter> helpOptions()
{
    Parameter help = flag(helpName, "Print this help and exit.", nullptr);
    help.letter = 'h';
    return {help, flag(versionName, "Print the version and exit.", nullptr)};
}

} // namespace hmirules
