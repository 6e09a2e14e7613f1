#include "checks.h"

#include "report/visible.h"
#include "rules/libraryfacts.h"
#include "rules/names.h"

#include <algorithm>

namespace hmirules {

namespace {

// What is odd about a name; empty when nothing is.
QString oddity(const QString &name)
{
    if (std::any_of(name.cbegin(), name.cend(), isInvisible)) {
        return "has a character that cannot be seen";
    }
    const QStringList parts = name.split('/');
    const auto hasSpace = [](const QString &part) { return part != part.trimmed(); };
    if (std::any_of(parts.cbegin(), parts.cend(), hasSpace)) {
        return parts.size() == 1 ? "begins or ends with a space"
                                 : "has a space at an end or beside a slash";
    }
    if (name.startsWith('/') || name.endsWith('/') || name.contains("//")) {
        return "has an empty part beside a slash";
    }
    return QString();
}

} // namespace

void checkNames(Findings *findings)
{
    for (const int number : findings->files()) {
        for (const NameUse &use : namesIn(findings->file(number))) {
            const QString odd = oddity(use.name);
            if (!odd.isEmpty()) {
                findings->add("suspicious-name", use.place, '"' + use.name + "\" " + odd);
            }
            if (use.name.contains('*') && !isWildcard(use.name)) {
                findings->add("never-matches", use.place,
                              '"' + use.name
                                  + "\" is no wildcard, and no popup has an asterisk in its name");
            }
        }
    }
}

} // namespace hmirules
