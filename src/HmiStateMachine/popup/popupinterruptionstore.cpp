#include <HmiStateMachine/popup/popupinterruptionstore.h>

#include <HmiStateMachine/internal/logging.h>
#include <HmiStateMachine/named/viewstatetarget.h>

#include <QCoreApplication>
#include <QDir>
#include <QFile>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QPointer>
#include <QStringView>

namespace HmiStateMachine {

namespace {

constexpr auto invalidBehavior = static_cast<PopupState::InterruptionBehavior>(-1);
constexpr QChar separator = QLatin1Char('/');
constexpr QChar any = QLatin1Char('*');

/** The two parts of a name that wildcards leave open in turn. */
struct NameParts
{
    bool hasWildCards;
    QStringView module;
    QStringView popup;
};

// As if split at each slash: only the first two parts count.
NameParts split(const QString &name)
{
    const int first = name.indexOf(separator);
    if (first < 0) {
        return {false, QStringView(), QStringView()};
    }
    const int second = name.indexOf(separator, first + 1);
    const int end = second < 0 ? name.size() : second;
    const QStringView whole(name);
    return {true, whole.left(first), whole.mid(first + 1, end - first - 1)};
}

const QString *findWildCard(const QMultiHash<uint, QString> &index, QStringView part,
                            bool partComesFirst)
{
    if (index.isEmpty()) {
        return nullptr;
    }
    const uint hash = qHash(part);
    for (auto it = index.constFind(hash); it != index.constEnd() && it.key() == hash; ++it) {
        const QStringView key(it.value());
        if (partComesFirst ? key.chopped(2) == part : key.mid(2) == part) {
            return &it.value();
        }
    }
    return nullptr;
}

QString readString(const QJsonObject &object, const char *key)
{
    return object.value(QLatin1String(key)).toString();
}

QList<QString> readStrings(const QJsonObject &object, const char *key)
{
    QList<QString> result;
    const QJsonArray values = object.value(QLatin1String(key)).toArray();
    for (const QJsonValue &value : values) {
        if (value.isString()) {
            result.append(value.toString());
        }
    }
    return result;
}

} // namespace

PopupState::InterruptionBehavior behaviorFromString(const QString &text)
{
    static const char *const texts[] = {"Prohibit", "Allow", "AllowStack", "AllowNoReturn"};
    int value = 0;
    for (const char *candidate : texts) {
        if (text.compare(QLatin1String(candidate), Qt::CaseInsensitive) == 0) {
            return static_cast<PopupState::InterruptionBehavior>(value);
        }
        ++value;
    }
    return invalidBehavior;
}

QString extractPopupWildCard(const QString &name)
{
    const NameParts parts = split(name);
    return parts.hasWildCards ? QStringLiteral("*/") + parts.popup.toString() : QString();
}

QString extractModuleWildCard(const QString &name)
{
    const NameParts parts = split(name);
    return parts.hasWildCards ? parts.module.toString() + QStringLiteral("/*") : QString();
}

PopupInterruptionStore::PopupInterruptionStore(QObject *parent) : QObject(parent)
{
}

PopupInterruptionStore::~PopupInterruptionStore() = default;

PopupInterruptionStore *PopupInterruptionStore::instance()
{
    // Guarded, because the application object deletes the store with its other children.
    static QPointer<PopupInterruptionStore> store;
    if (!store) {
        store = new PopupInterruptionStore(QCoreApplication::instance());
    }
    return store;
}

void PopupInterruptionStore::loadInterruptionBehaviors(const QString &fileName)
{
    QFile file(QDir::toNativeSeparators(fileName));
    if (!file.exists() || !file.open(QIODevice::ReadOnly)) {
        HMI_WARNING(hmistatemachine()) << "Invalid popup interruption file." << fileName;
        return;
    }
    QJsonParseError error;
    const QJsonDocument document = QJsonDocument::fromJson(file.readAll(), &error);
    if (error.error != QJsonParseError::NoError) {
        HMI_WARNING(hmistatemachine())
            << "Popup interruption file json parse error:" << error.errorString();
        return;
    }
    int index = 0;
    const QJsonArray entries = document.array();
    for (const QJsonValue &entry : entries) {
        loadEntry(entry.toObject(), index++);
    }
}

void PopupInterruptionStore::insertInterruptionBehavior(PopupState::InterruptionBehavior behavior,
                                                        const QString &popup, const QString &target)
{
    m_interruptions[popup].insert(target, behavior);
    indexWildCard(popup);
    indexWildCard(target);
}

PopupState::InterruptionBehavior PopupInterruptionStore::getInterruptionBehavior(
    const QString &popup, const QString &target) const
{
    auto result = PopupState::Allow;
    const auto byDefault = find(m_defaults, popup);
    if (byDefault != m_defaults.constEnd()) {
        result = byDefault.value();
    }
    // One table alone: an exact entry hides those with a wildcard, also where it has no rule.
    const auto table = find(m_interruptions, popup);
    if (table == m_interruptions.constEnd()) {
        return result;
    }
    const auto rule = find(table.value(), target);
    return rule == table.value().constEnd() ? result : rule.value();
}

PopupState::InterruptionBehavior PopupInterruptionStore::getInterruptionBehavior(
    const PopupState *popup, const PopupState *target) const
{
    return getInterruptionBehavior(popup->name(), target->name());
}

bool PopupInterruptionStore::isBlockedByDomain(const QString &popup, int domain) const
{
    const auto list = find(m_domainBlacklist, popup);
    return list != m_domainBlacklist.constEnd() && list.value().contains(domain);
}

bool PopupInterruptionStore::isBlockedByDomain(const QString &popup) const
{
    const ViewStateTarget *target = ViewStateTarget::instance();
    return target && isBlockedByDomain(popup, target->activeDomain());
}

bool PopupInterruptionStore::isBlockedByDomain(const PopupState *popup, int domain) const
{
    return isBlockedByDomain(popup->popupViewId(), domain);
}

bool PopupInterruptionStore::isBlockedByDomain(const PopupState *popup) const
{
    return isBlockedByDomain(popup->popupViewId());
}

bool PopupInterruptionStore::isBlockedByView(const QString &popup, const QString &view) const
{
    const auto list = find(m_viewBlacklist, popup);
    return list != m_viewBlacklist.constEnd() && list.value().contains(view);
}

bool PopupInterruptionStore::isBlockedByView(const QString &popup) const
{
    const ViewStateTarget *target = ViewStateTarget::instance();
    return target && isBlockedByView(popup, target->activeView());
}

bool PopupInterruptionStore::isBlockedByView(const PopupState *popup, const QString &view) const
{
    return isBlockedByView(popup->popupViewId(), view);
}

bool PopupInterruptionStore::isBlockedByView(const PopupState *popup) const
{
    return isBlockedByView(popup->popupViewId());
}

void PopupInterruptionStore::loadEntry(const QJsonObject &entry, int index)
{
    const QString popup = readString(entry, "popup");
    if (popup.isEmpty()) {
        HMI_WARNING_FROM(hmistatemachine(), "loadInterruptionBehaviors")
            << "Popup interruption invalid source at index:" << index;
        return;
    }
    loadRules(popup, entry.value(QLatin1String("interruptions")).toArray(), index);
    if (entry.contains(QLatin1String("default"))) {
        // Stored as it is: an invalid text makes it -1, without a word.
        m_defaults.insert(popup, behaviorFromString(readString(entry, "default")));
        indexWildCard(popup);
    }
    loadBlacklists(popup, entry);
}

void PopupInterruptionStore::loadRules(const QString &popup, const QJsonArray &rules,
                                       int entryIndex)
{
    int index = 0;
    for (const QJsonValue &value : rules) {
        const QJsonObject rule = value.toObject();
        const QString target = readString(rule, "target");
        const auto behavior = behaviorFromString(readString(rule, "behavior"));
        if (target.isEmpty()) {
            HMI_WARNING_FROM(hmistatemachine(), "loadInterruptionBehaviors")
                << "Popup interruption invalid target at index:" << entryIndex << index;
        } else if (behavior == invalidBehavior) {
            HMI_WARNING_FROM(hmistatemachine(), "loadInterruptionBehaviors")
                << "Popup interruption invalid behavior at index:" << entryIndex << index;
        } else {
            insertInterruptionBehavior(behavior, popup, target);
        }
        ++index;
    }
}

void PopupInterruptionStore::loadBlacklists(const QString &popup, const QJsonObject &entry)
{
    QList<int> domains;
    if (ViewStateTarget *target = ViewStateTarget::instance()) {
        const QList<QString> names = readStrings(entry, "domainBlacklist");
        for (const QString &name : names) {
            domains.append(target->domainFromName(name));
        }
    }
    const QList<QString> views = readStrings(entry, "viewBlacklist");
    // An empty list stores nothing, so that a wildcard's list applies.
    if (!domains.isEmpty()) {
        m_domainBlacklist.insert(popup, domains);
        indexWildCard(popup);
    }
    if (!views.isEmpty()) {
        m_viewBlacklist.insert(popup, views);
        indexWildCard(popup);
    }
}

void PopupInterruptionStore::indexWildCard(const QString &key)
{
    const QStringView whole(key);
    if (whole.size() < 2) {
        return;
    }
    const auto insertOnce = [&key](QMultiHash<uint, QString> &index, QStringView part) {
        const uint hash = qHash(part);
        if (!index.contains(hash, key)) {
            index.insert(hash, key);
        }
    };
    if (whole.at(0) == any && whole.at(1) == separator) {
        insertOnce(m_popupWildCards, whole.mid(2));
    }
    if (whole.at(whole.size() - 1) == any && whole.at(whole.size() - 2) == separator) {
        insertOnce(m_moduleWildCards, whole.chopped(2));
    }
}

// The exact name comes first, then the same popup of any module, then any popup of the module.
template <typename Table>
typename Table::const_iterator PopupInterruptionStore::find(const Table &table,
                                                            const QString &name) const
{
    if (table.isEmpty()) {
        return table.constEnd();
    }
    const auto exact = table.constFind(name);
    if (exact != table.constEnd()) {
        return exact;
    }
    const NameParts parts = split(name);
    if (!parts.hasWildCards) {
        return table.constEnd();
    }
    if (const QString *key = findWildCard(m_popupWildCards, parts.popup, false)) {
        const auto popupWildCard = table.constFind(*key);
        if (popupWildCard != table.constEnd()) {
            return popupWildCard;
        }
    }
    const QString *key = findWildCard(m_moduleWildCards, parts.module, true);
    return key ? table.constFind(*key) : table.constEnd();
}

} // namespace HmiStateMachine
