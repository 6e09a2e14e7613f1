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
         "The rule is passed over with a warning in the log. What is left decides: a rule whose "
         "target is a wildcard, or the default.",
         "Write Prohibit, Allow, AllowStack or AllowNoReturn."},
        {"invalid-default", Severity::Error,
         "The default of an entry is none of the four behaviours",
         "It is stored as an invalid behaviour, which acts like Allow and also hides the "
         "default of a wildcard; nothing is logged.",
         "Write Prohibit, Allow, AllowStack or AllowNoReturn, or remove the key."},
        {"invalid-blacklist", Severity::Error, "A blacklist is no array of texts",
         "What is no text is left out, and nothing is logged: the popup is not blocked there.",
         "Write an array of names: [ \"Phone\", \"Media\" ]."},
        {"duplicate-key", Severity::Error, "A key stands twice in one object",
         "The last one counts, the others are lost, and nothing is logged.", "Keep one of them."},
        {"contradicting-files", Severity::Error,
         "A later file says something else than an earlier one",
         "Files are loaded one after another, and the last one counts; nothing is logged.",
         "Keep one of them. Where the later file is meant to replace what the earlier one says, "
         "name the earlier one as --base; where the two are never loaded together, use --each."},
        {"library-warning", Severity::Error, "The library warned about something else",
         "The log of the target has this warning.", "See what the warning says."},
        {"unknown-key", Severity::Warning, "A key means nothing to the library",
         "It is passed over, and nothing is logged. Small and capital letters make different keys.",
         "Correct or remove the key."},
        {"duplicate-entry", Severity::Warning, "A popup has a second entry",
         "The rules of both are joined; a default, a blacklist or a rule for the same target of "
         "the later one takes the place of the earlier one's; nothing is logged.",
         "Join the two entries into one."},
        {"duplicate-rule", Severity::Warning, "An entry has a second rule for the same target",
         "The last one counts, and nothing is logged.", "Keep one of them."},
        {"shadowed-wildcard", Severity::Warning, "An entry hides a rule of a wildcard's entry",
         "Of all entries that fit a popup, one alone is searched for rules. As this entry has "
         "rules, those of the wildcard are not asked, not even for targets that it says nothing "
         "about: there the default decides.",
         "Repeat the hidden rule in the entry, with the behaviour that is wanted."},
        {"never-matches", Severity::Warning, "A name with an asterisk matches no popup",
         "The entry or the rule never decides anything.",
         "Write a wildcard: */popup for that popup of any module, module/* for any popup of "
         "that module."},
        {"unreachable-rule", Severity::Warning, "A rule decides for no pair of popups",
         "Other rules decide for each pair of popups that it could be for.",
         "Remove the rule, or those that decide in its place."},
        {"mutual-allow", Severity::Warning, "Two popups interrupt each other by rules",
         "Whichever is requested comes up, and the other returns when it has gone. If the "
         "application requests each of them again as soon as it is hidden, they take turns "
         "without an end.",
         "Let one of the two win, with Prohibit or AllowNoReturn for one direction; or leave "
         "it, where the last request is meant to win."},
        {"refuses-own-return", Severity::Warning, "A stacked popup refuses its own return",
         "All stacked popups are asked about a popup that returns, and one that was interrupted "
         "with AllowStack is itself among them. When it answers Prohibit to itself it does not "
         "come back, nothing is logged, and unseen it goes on refusing what it prohibits.",
         "Add a rule with the popup itself as target and the behaviour Allow. Stacked popups "
         "are looked up by their popup view ids: where these differ, tell them in an inventory."},
        {"empty-blacklist", Severity::Warning, "A blacklist is empty",
         "An empty list stores nothing: it does not lift the list of a wildcard.",
         "Remove the list; to lift a wildcard's list, name a domain or view that does not matter."},
        {"unknown-popup", Severity::Warning, "A popup is not in the inventory",
         "No popup has just this name: the entry or the rule never decides anything.",
         "Correct the name, or the inventory."},
        {"unknown-domain", Severity::Warning, "A domain is not in the inventory",
         "The application turns names of domains into numbers. What it makes of a name that it "
         "does not know is its own affair: mostly the popup is not blocked, but it may be so "
         "elsewhere.",
         "Correct the name, or the inventory."},
        {"unknown-view", Severity::Warning, "A view is not in the inventory",
         "The popup is not blocked by it.", "Correct the name, or the inventory."},
        {"view-id-for-name", Severity::Warning, "Rules are given for a popup view id",
         "Popups in front and requested ones are looked up by their names: there this decides "
         "nothing. By popup view ids stacked popups alone are looked up, and what they prohibit "
         "is refused.",
         "Write the name of the popup, unless this is meant for the time while it is stacked."},
        {"name-for-view-id", Severity::Warning, "A blacklist is given for the name of a popup",
         "Blacklists are looked up by popup view ids: this one never blocks the popup.",
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
         "whatever their order in the file.",
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
