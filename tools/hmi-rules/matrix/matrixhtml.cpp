#include "matrixtext.h"

#include "report/json.h"
#include "report/resource.h"
#include "report/sitetext.h"
#include "rules/libraryfacts.h"

namespace hmirules {

namespace {

void addPlace(const RuleBase &base, int site, OrderedJson *json)
{
    const Place &place = base.site(site).place;
    (*json)["file"] = place.file;
    (*json)["line"] = place.at.line;
    (*json)["column"] = place.at.column;
    (*json)["pointer"] = toJson(place.pointer);
}

OrderedJson filesAsJson(const RuleBase &base)
{
    OrderedJson files = OrderedJson::array();
    for (const RuleFile &file : base.files()) {
        files.push_back(toJson(file.name()));
    }
    return files;
}

OrderedJson popupsAsJson(const Matrix &matrix)
{
    OrderedJson popups = OrderedJson::array();
    for (const Individual &popup : matrix.popups) {
        const char *kind = popup.kind == Individual::Popup ? "popup"
            : popup.kind == Individual::Wildcard           ? "wildcard"
                                                           : "other";
        popups.push_back({{"name", toJson(popup.name)}, {"kind", kind}});
    }
    return popups;
}

OrderedJson reasonsAsJson(const RuleBase &base, const Matrix &matrix)
{
    OrderedJson reasons = OrderedJson::array();
    for (const Decision &decision : matrix.reasons) {
        OrderedJson reason = {{"behavior", toJson(behaviorText(decision.behavior))},
                              {"kind", "none"},
                              {"text", toJson(reasonText(base, decision))}};
        if (decision.site >= 0) {
            reason["kind"] = base.site(decision.site).kind == Site::Rule ? "rule" : "default";
            addPlace(base, decision.site, &reason);
        }
        reasons.push_back(reason);
    }
    return reasons;
}

// Neighbours often have the same reason: it is told once, with their number.
OrderedJson rowAsJson(const std::vector<int> &cells)
{
    OrderedJson row = OrderedJson::array();
    for (std::size_t begin = 0; begin < cells.size();) {
        std::size_t end = begin;
        while (end < cells.size() && cells[end] == cells[begin]) {
            ++end;
        }
        row.push_back(cells[begin]);
        row.push_back(end - begin);
        begin = end;
    }
    return row;
}

void addBlocked(const RuleBase &base, const BlockedIn &blocked, const char *names,
                const char *reason, OrderedJson *json)
{
    (*json)[names] = OrderedJson::array();
    for (const QString &name : blocked.names) {
        (*json)[names].push_back(toJson(name));
    }
    if (!blocked.names.isEmpty()) {
        OrderedJson why = {{"text", toJson(siteText(base.site(blocked.site)))}};
        addPlace(base, blocked.site, &why);
        (*json)[reason] = why;
    }
}

OrderedJson blockedAsJson(const RuleBase &base, const Matrix &matrix)
{
    OrderedJson list = OrderedJson::array();
    for (std::size_t i = 0; i < matrix.domains.size(); ++i) {
        OrderedJson popup = OrderedJson::object();
        addBlocked(base, matrix.domains[i], "domains", "domainReason", &popup);
        addBlocked(base, matrix.views[i], "views", "viewReason", &popup);
        list.push_back(popup);
    }
    return list;
}

QString joined(const QStringList &names)
{
    QStringList texts;
    for (const QString &name : names) {
        texts.append(resource(name));
    }
    return texts.join('\n');
}

// Within a script element only "<" could end the text early.
QString forScript(const OrderedJson &json)
{
    return QString::fromStdString(json.dump(-1, ' ', false, OrderedJson::error_handler_t::replace))
        .replace('<', "\\u003c");
}

} // namespace

QString matrixAsHtml(const RuleBase &base, const Matrix &matrix)
{
    OrderedJson rows = OrderedJson::array();
    for (const std::vector<int> &cells : matrix.cells) {
        rows.push_back(rowAsJson(cells));
    }
    const OrderedJson data = {{"title", toJson(base.files().back().name())},
                              {"files", filesAsJson(base)},
                              {"popups", popupsAsJson(matrix)},
                              {"reasons", reasonsAsJson(base, matrix)},
                              {"rows", rows},
                              {"blocked", blockedAsJson(base, matrix)}};
    // The data come last: they may contain anything, also a placeholder. The scripts stand in the
    // order in which they build on each other.
    return resource("matrix.html")
        .replace("@MATRIX_STYLE@", joined({"matrix.css", "grid.css"}))
        .replace("@MATRIX_SCRIPT@", joined({"model.js", "grid.js", "matrix.js"}))
        .replace("@MATRIX_DATA@", forScript(data));
}

} // namespace hmirules
