#include "libraryfacts.h"

#include <HmiStateMachine/popup/popupinterruptionstore.h>

using namespace HmiStateMachine;

namespace hmirules {

QStringList keysOf(const QString &popup)
{
    QStringList keys = {popup};
    for (const QString &wildcard : {extractPopupWildCard(popup), extractModuleWildCard(popup)}) {
        if (!wildcard.isEmpty() && !keys.contains(wildcard)) {
            keys.append(wildcard);
        }
    }
    return keys;
}

bool isWildcard(const QString &name)
{
    // Tried out with the library on a name that fits; "*/*" only fits names that nobody gives.
    const QString anyModule = 'x' + name.mid(1);
    const QString anyPopup = name.chopped(name.isEmpty() ? 0 : 1) + 'x';
    return name != QLatin1String("*/*")
        && ((name.startsWith('*') && extractPopupWildCard(anyModule) == name)
            || (name.endsWith('*') && extractModuleWildCard(anyPopup) == name));
}

bool matches(const QString &pattern, const QString &popup)
{
    return keysOf(popup).contains(pattern);
}

QString behaviorText(int behavior)
{
    for (const char *text : {"Prohibit", "Allow", "AllowStack", "AllowNoReturn"}) {
        if (behaviorFromString(text) == behavior) {
            return text;
        }
    }
    return "invalid";
}

} // namespace hmirules
