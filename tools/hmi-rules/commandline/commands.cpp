#include "commandline/commands.h"
#include "commandline/parameters.h"

namespace hmirules {

namespace {

constexpr char unusable[] = "The command line is wrong, or a file cannot be used.";
constexpr char unwritable[] = "The command line is wrong, or the output cannot be written.";

void keepFailOn(Options &options, const QByteArray &value)
{
    static const QByteArrayList names({"note", "warning", "error"});
    options.failOn = Severity(names.indexOf(value));
}

Parameter ignoreOption()
{
    Parameter option =
        nameOption("--ignore", "ID", "Leave out this finding; may be given several times.",
                   addName<&Options::ignore>);
    option.kind = ValueKind::FindingId;
    return repeated(option);
}

} // namespace

CommandDefinition lintCommand()
{
    return {
        Command::Lint,
        "lint",
        "find faults and suspicions in interruption files",
        "Finds faults and suspicions in popup interruption files. The files are loaded one after "
        "another into one set of rules, as an application does that loads several.\n\n"
        "With an inventory or lists, names that the application does not have are findings too.",
        {repeated(fileArgument("FILE", "A popup interruption file."))},
        QVector<Parameter>({flag("--each", "Check each file by itself.", raise<&Options::each>)})
            + ruleOptions()
            + QVector<Parameter>(
                {formatOption("text|json|sarif", "How findings are written; text by default."),
                 outputOption(),
                 choiceOption("--fail-on", "note|warning|error",
                              "The least severity that counts as failure; warning by default.",
                              keepFailOn),
                 ignoreOption(), colorOption()})
            + helpOptions(),
        {{0, "No finding counts as failure."},
         {1, "There are findings that do, see --fail-on."},
         {2, unusable}},
        {{"hmi-rules lint popups.json", "Checks one file."},
         {"hmi-rules lint --inventory hmi.json base.json variant.json",
          "Checks two files that are loaded one after the other, and their names."},
         {"hmi-rules lint --each --format sarif -o findings.sarif *.json",
          "Checks many files, each by itself, for a tool that shows SARIF."}},
    };
}

CommandDefinition explainCommand()
{
    return {
        Command::Explain,
        "explain",
        "tell why a requested popup meets its behaviour",
        "Tells what happens when TARGET is requested while POPUP is in front: the behaviour, the "
        "rule or default that decided and its line, the keys that were tried, and the rules that "
        "were hidden.\n\n"
        "With --domain and --view it also tells whether TARGET is blocked there, and by what.",
        {fileArgument("FILE", "The popup interruption file."),
         nameArgument("POPUP", "The popup in front.", keepName<&Options::front>),
         nameArgument("TARGET", "The requested popup.", keepName<&Options::requested>)},
        QVector<Parameter>({repeated(nameOption("--domain", "DOMAIN",
                                                "Is TARGET blocked in this domain? May be given "
                                                "several times.",
                                                addName<&Options::domains>)),
                            repeated(nameOption("--view", "VIEW",
                                                "Is TARGET blocked on this view? May be given "
                                                "several times.",
                                                addName<&Options::views>))})
            + ruleOptions()
            + QVector<Parameter>(
                {formatOption("text|json", "How the explanation is written; text by default."),
                 outputOption(), colorOption()})
            + helpOptions(),
        {{0, "Explained."}, {2, unusable}},
        {{"hmi-rules explain popups.json phone/call media/volume",
          "The volume is requested while a call is in front."},
         {"hmi-rules explain popups.json phone/call media/volume --domain Media",
          "The same, and whether the volume is blocked in the domain Media."}},
    };
}

CommandDefinition matrixCommand()
{
    return {
        Command::Matrix,
        "matrix",
        "show all decisions, popup by popup",
        "Shows for each popup in front and each requested popup the behaviour and its reason.\n\n"
        "The popups are those of the inventory, or without one those that the file names.",
        {fileArgument("FILE", "The popup interruption file.")},
        QVector<Parameter>(
            {repeated(nameOption("--only", "POPUP",
                                 "Only this popup, or those of a wildcard as \"phone/*\"; may be "
                                 "given several times.",
                                 addName<&Options::only>)),
             flag("--blocking", "With --format csv: where popups are blocked, not how they behave.",
                  raise<&Options::blocking>)})
            + ruleOptions()
            + QVector<Parameter>(
                {formatOption("text|csv|html", "How the matrix is written; text by default."),
                 outputOption(), colorOption()})
            + helpOptions(),
        {{0, "Shown."}, {2, unusable}},
        {{"hmi-rules matrix popups.json --only 'phone/*'", "The popups of one module."},
         {"hmi-rules matrix popups.json --format html -o popups.html",
          "All decisions, as a page for a browser."},
         {"hmi-rules matrix popups.json --blocking --format csv -o blocked.csv",
          "Where popups are blocked, as a table for a spreadsheet."}},
    };
}

CommandDefinition diffCommand()
{
    return {
        Command::Diff,
        "diff",
        "show which decisions change between two files",
        "Shows which decisions differ between two popup interruption files. How the files are "
        "written does not matter: files that decide alike do not differ.",
        {fileArgument("OLD", "The popup interruption file before the change."),
         fileArgument("NEW", "The popup interruption file after it.")},
        ruleOptions()
            + QVector<Parameter>(
                {formatOption("text|json", "How the changes are written; text by default."),
                 outputOption(), colorOption()})
            + helpOptions(),
        {{0, "No decision changes."}, {1, "At least one decision changes."}, {2, unusable}},
        {{"hmi-rules diff old.json new.json", "Compares two files."},
         {"git show HEAD:popups.json | hmi-rules diff - popups.json",
          "Compares the committed file with the one at hand."}},
    };
}

CommandDefinition schemaCommand()
{
    return {
        Command::Schema,
        "schema",
        "print the JSON Schema of the file",
        "Prints the JSON Schema of the popup interruption file, with which editors complete and "
        "check it while it is written.",
        {},
        QVector<Parameter>({outputOption()}) + helpOptions(),
        {{0, "Printed."}, {2, unwritable}},
        {{"hmi-rules schema", "Prints the schema."},
         {"hmi-rules schema -o popups.schema.json", "Writes it to a file."}},
    };
}

CommandDefinition findingsCommand()
{
    Parameter id =
        nameArgument("ID", "The finding; all are listed without.", keepName<&Options::finding>);
    id.kind = ValueKind::FindingId;
    id.optional = true;
    return {
        Command::Findings,
        "findings",
        "explain a finding, or list them all",
        "Explains a finding of the command lint: what it means, why it matters and how it is "
        "mended. Without an ID all findings are listed.",
        {id},
        QVector<Parameter>(
            {formatOption("text|markdown", "How the text is written; text by default."),
             outputOption()})
            + helpOptions(),
        {{0, "Explained."}, {2, "The command line is wrong, or no finding has the ID."}},
        {{"hmi-rules findings shadowed-wildcard", "Explains one finding."},
         {"hmi-rules findings --format markdown -o findings.md",
          "Writes all of them as a page of documentation."}},
    };
}

} // namespace hmirules
