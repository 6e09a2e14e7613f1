#include "commands.h"

#include "loading.h"

#include "diff/differencetext.h"
#include "explain/explanationtext.h"
#include "input/inventory.h"
#include "lint/findinglist.h"
#include "lint/guess.h"
#include "matrix/matrixtext.h"
#include "report/resource.h"
#include "report/visible.h"

namespace hmirules {

namespace {

Outcome written(const QString &text, int exitCode = exitFine)
{
    return {exitCode, text.toUtf8(), QByteArray(), true};
}

Outcome refused(const Fault &fault)
{
    return {exitUnusable, QByteArray(), toText(fault).toUtf8(), false};
}

/** What explain and matrix answer from. */
struct Inputs
{
    std::unique_ptr<RuleBase> base;
    Inventory inventory;
};

bool readInputs(const Options &options, Inputs *inputs, Fault *fault)
{
    inputs->base = loadRules(options.base + options.files, fault);
    return inputs->base && readInventory(options, &inputs->inventory, fault);
}

// A mistyped name is explained like any other, which is worth a word.
QByteArray noteUnlisted(const Inventory &inventory, const QStringList &popups)
{
    QString notes;
    for (const QString &popup : popups) {
        if (inventory.hasPopups && !inventory.popupNames().contains(popup)) {
            notes += QString("hmi-rules: note: no popup \"%1\" is in the inventory%2\n")
                         .arg(visible(popup), didYouMean(popup, inventory.popupNames()));
        }
    }
    return notes.toUtf8();
}

} // namespace

Outcome runExplain(const Options &options)
{
    Fault fault;
    Inputs inputs;
    if (!readInputs(options, &inputs, &fault)) {
        return refused(fault);
    }
    const RuleBase &base = *inputs.base;
    const Explanation explanation =
        explain(base, inputs.inventory, options.front, options.requested);
    const QString viewId = inputs.inventory.viewIdOf(options.requested);
    std::vector<BlockingExplanation> blocking;
    for (const QString &domain : options.domains) {
        blocking.push_back(explainBlocking(base, viewId, domain, Site::DomainBlacklist));
    }
    for (const QString &view : options.views) {
        blocking.push_back(explainBlocking(base, viewId, view, Site::ViewBlacklist));
    }
    const Paint paint(isColored(options));
    Outcome outcome = written(options.format == Format::Json
                                  ? explanationAsJson(base, explanation, blocking)
                                  : explanationAsText(base, explanation, blocking, paint));
    outcome.errors = noteUnlisted(inputs.inventory, {options.front, options.requested});
    return outcome;
}

Outcome runMatrix(const Options &options)
{
    Fault fault;
    Inputs inputs;
    if (!readInputs(options, &inputs, &fault)) {
        return refused(fault);
    }
    const RuleBase &base = *inputs.base;
    auto population = populationOf(base, inputs.inventory);
    if (!restrictTo(options.only, &population, &fault) || !isListable(population, &fault)) {
        return refused(fault);
    }
    const Matrix matrix = makeMatrix(base, population);
    if (options.format == Format::Html) {
        return written(matrixAsHtml(base, matrix));
    }
    if (options.format == Format::Csv) {
        return written(options.blocking ? blockingAsCsv(base, matrix) : matrixAsCsv(base, matrix));
    }
    return written(matrixAsText(base, matrix, Paint(isColored(options))));
}

Outcome runDiff(const Options &options)
{
    Fault fault;
    Inventory inventory;
    const auto before = loadRules(options.base + options.files.mid(0, 1), &fault);
    const auto after = before ? loadRules(options.base + options.files.mid(1), &fault) : nullptr;
    if (!after || !readInventory(options, &inventory, &fault)) {
        return refused(fault);
    }
    const auto population = commonPopulation(*before, *after, inventory);
    if (!isListable(population, &fault)) {
        return refused(fault);
    }
    const Difference difference = compare(*before, *after, population);
    const bool isEmpty = difference.decisions.empty() && difference.blockings.empty();
    const QString text = options.format == Format::Json
        ? differenceAsJson(*before, *after, difference)
        : differenceAsText(*before, *after, difference, Paint(isColored(options)));
    return written(text, isEmpty ? exitFine : exitFound);
}

Outcome runSchema(const Options &options)
{
    Q_UNUSED(options)
    return written(resource("popup-interruptions.schema.json"));
}

Outcome runFindings(const Options &options)
{
    const FindingKind *kind = findingKind(options.finding);
    if (!options.finding.isEmpty() && !kind) {
        Fault fault;
        fault.message = "there is no finding \"" + options.finding + '"';
        fault.remedy = "\"hmi-rules findings\" lists all.";
        return refused(fault);
    }
    return written(options.format == Format::Markdown ? findingsAsMarkdown(kind)
                                                      : findingsAsText(kind));
}

Outcome run(const Options &options)
{
    switch (options.command) {
    case Command::Lint:
        return runLint(options);
    case Command::Explain:
        return runExplain(options);
    case Command::Matrix:
        return runMatrix(options);
    case Command::Diff:
        return runDiff(options);
    case Command::Schema:
        return runSchema(options);
    case Command::Findings:
        break;
    }
    return runFindings(options);
}

} // namespace hmirules
