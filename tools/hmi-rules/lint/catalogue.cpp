#include "catalogue.h"

#include <algorithm>

namespace hmirules {

const std::vector<FindingKind> &findingKinds()
{
    static const std::vector<FindingKind> kinds = {
        {"not-an-array", Severity::Error, "The top level of the file is no array",
         "Nothing of the file is loaded, and nothing is logged: each popup may interrupt any "
         "other.",
         "Put the entries into an array: [ { \"popup\": ... }, ... ]."},
        {"invalid-entry", Severity::Error, "An entry is no object",
         "The entry is passed over with a warning in the log.",
         "Write an object with the key \"popup\", or remove the entry."},
        {"missing-popup", Severity::Error, "An entry does not say which popup it is about",
         "The whole entry is passed over with a warning in the log.",
         "Give it the key \"popup\" with the name of a popup or a wildcard."},
        {"invalid-interruptions", Severity::Error, "The rules of an entry are no array",
         "The entry has no rules, and nothing is logged.",
         "Put the rules into an array: \"interruptions\": [ { ... } ]."},
        {"invalid-target", Severity::Error, "A rule does not say which requested popup it is for",
         "The rule is passed over with a warning in the log.",
         "Give it the key \"target\" with the name of a popup or a wildcard."},
        {"invalid-behavior", Severity::Error, "The behaviour of a rule is none of the four",
         "The rule is passed over with a warning in the log; the default decides in its place.",
         "Write Prohibit, Allow, AllowStack or AllowNoReturn."},
        {"invalid-default", Severity::Error,
         "The default of an entry is none of the four behaviours",
         "It is stored as an invalid behaviour, which acts like Allow and also hides the default "
         "of "
         "a wildcard; nothing is logged.",
         "Write Prohibit, Allow, AllowStack or AllowNoReturn, or remove the key."},
        {"invalid-blacklist", Severity::Error, "A blacklist is no array of texts",
         "What is no text is left out, and nothing is logged: the popup is not blocked there.",
         "Write an array of names: [ \"Phone\", \"Media\" ]."},
        {"duplicate-key", Severity::Error, "A key stands twice in one object",
         "The last one counts, the others are lost, and nothing is logged.", "Keep one of them."},
        {"contradicting-files", Severity::Error,
         "A later file says something else than an earlier one",
         "Files are loaded one after another, and the last one counts; nothing is logged.",
         "Keep one of them, or check the files by themselves with --each."},
        {"library-warning", Severity::Error, "The library warned about something else",
         "The log of the target has this warning.", "See what the warning says."},
        {"unknown-key", Severity::Warning, "A key means nothing to the library",
         "It is passed over, and nothing is logged. Keys are told apart by case.",
         "Correct or remove the key."},
        {"duplicate-entry", Severity::Warning, "A popup has a second entry",
         "The rules of both are joined; a default or a blacklist of the later one takes the place "
         "of "
         "the earlier one's; nothing is logged.",
         "Join the two entries into one."},
        {"duplicate-rule", Severity::Warning, "An entry has a second rule for the same target",
         "The last one counts, and nothing is logged.", "Keep one of them."},
        {"shadowed-wildcard", Severity::Warning, "An entry hides a rule of a wildcard's entry",
         "The rules of one entry alone are searched: its own rules make a popup lose all rules of "
         "its wildcards, also those for targets that its own entry says nothing about.",
         "Repeat the hidden rule in the entry, with the behaviour that is wanted."},
        {"never-matches", Severity::Warning, "A name with an asterisk matches no popup",
         "The entry or the rule never decides anything.",
         "Write a wildcard: */popup for that popup of any module, module/* for any popup of that "
         "module."},
        {"unreachable-rule", Severity::Warning, "A rule decides for no pair of popups",
         "Other rules decide for each pair that it could be for.",
         "Remove the rule, or those that hide it."},
        {"mutual-allow", Severity::Warning, "Two popups interrupt each other by rules",
         "Each makes the other go and return: as long as both are requested, they take turns for "
         "ever.",
         "Let one of the two win: Prohibit or AllowNoReturn for one direction."},
        {"refuses-own-return", Severity::Warning, "A stacked popup refuses its own return",
         "A popup that was interrupted with AllowStack is asked about its own return. When it "
         "answers Prohibit to itself, it does not come back, and nothing is logged.",
         "Add a rule with the popup itself as target and the behaviour Allow. Stacked popups are "
         "looked up by their popup view ids: where these differ, tell them in an inventory."},
        {"empty-blacklist", Severity::Warning, "A blacklist is empty",
         "An empty list stores nothing: it does not lift the list of a wildcard.",
         "Remove the list; to lift a wildcard's list, name a domain or view that does not matter."},
        {"unknown-popup", Severity::Warning, "A popup is not in the inventory",
         "The entry or the rule never decides anything.", "Correct the name, or the inventory."},
        {"unknown-domain", Severity::Warning, "A domain is not in the inventory",
         "Which number the application gives to an unknown name decides where the popup is "
         "blocked.",
         "Correct the name, or the inventory."},
        {"unknown-view", Severity::Warning, "A view is not in the inventory",
         "The popup is not blocked by it.", "Correct the name, or the inventory."},
        {"view-id-for-name", Severity::Warning, "Rules are given for a popup view id",
         "Rules and defaults are looked up by the names of popups. By view ids they are found only "
         "while the popup is stacked.",
         "Write the name of the popup."},
        {"name-for-view-id", Severity::Warning, "A blacklist is given for the name of a popup",
         "Blacklists are looked up by popup view ids: the popup is never blocked.",
         "Move the blacklist into an entry for the popup view id."},
        {"suspicious-name", Severity::Warning, "A name is odd",
         "Names are compared as they are, each character counts: it most likely matches nothing.",
         "Remove what should not be in the name."},
        {"shadowed-blacklist", Severity::Note, "A blacklist hides a wildcard's blacklist",
         "One list alone counts: where only the hidden one would block the popup, it is shown.",
         "Repeat the names of the hidden list, unless the popup is meant to be shown there."},
        {"overlapping-wildcards", Severity::Note,
         "A popup is under two wildcards that say different things",
         "That popup of any module (*/popup) goes before any popup of that module (module/*), "
         "whatever "
         "their order in the file.",
         "Name the popup itself, so that nobody has to know which wildcard goes first."},
        {"empty-interruptions", Severity::Note, "A list of rules is empty",
         "It has no effect: it does not hide the rules of a wildcard.", "Remove it."},
        {"empty-entry", Severity::Note, "An entry says nothing", "It has no effect.",
         "Remove it, or complete it."},
        {"popup-without-rule", Severity::Note, "Nothing in the file is about a popup",
         "It may be interrupted by any other popup, and is blocked nowhere.",
         "Add an entry, if only one with \"default\": \"Allow\", to show that this is meant."},
    };
    return kinds;
}

const FindingKind *findingKind(const QString &id)
{
    const auto &kinds = findingKinds();
    const auto found = std::find_if(kinds.cbegin(), kinds.cend(),
                                    [&id](const FindingKind &kind) { return kind.id == id; });
    return found == kinds.cend() ? nullptr : &*found;
}

QStringList findingIds()
{
    QStringList ids;
    for (const FindingKind &kind : findingKinds()) {
        ids.append(kind.id);
    }
    return ids;
}

QString severityText(Severity severity)
{
    switch (severity) {
    case Severity::Note:
        return "note";
    case Severity::Warning:
        return "warning";
    case Severity::Error:
        break;
    }
    return "error";
}

} // namespace hmirules
