#pragma once

#include "rulebase.h"

namespace hmirules {

/** Where a file names a popup. */
struct NameUse
{
    enum Role { Entry, Target };

    QString name;
    Role role = Entry;
    Place place;
    int entry = 0; ///< index in its file
};

/** The names of popups that a file gives, also those in entries that decide nothing. */
std::vector<NameUse> namesIn(const RuleFile &file);

/** Where an entry says which popup it is about. */
Place placeOfEntry(const RuleFile &file, int entry);

/**
 * The names in all files, without repetition: popups in alphabetical order, then wildcards. With
 * this list the whole of what the files decide is told, but for popups under two wildcards.
 */
QStringList namesIn(const RuleBase &base);

/** A name of which no file says anything, under any key. */
QString unnamedPopup(const RuleBase &base);

} // namespace hmirules
