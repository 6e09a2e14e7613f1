#include <HmiStateMachine/popup/popupinterruptionstore.h>

#include <HmiStateMachine/internal/logging.h>
#include <HmiStateMachine/internal/rulename.h>
#include <HmiStateMachine/internal/viewlayer.h>
#include <HmiStateMachine/named/viewstatetarget.h>

#include <QCoreApplication>
#include <QDir>
#include <QFile>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QPointer>

namespace HmiStateMachine {

namespace {

constexpr auto invalidBehavior = static_cast<PopupState::InterruptionBehavior>(-1);
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
    RuleName parts(name);
    return parts.isDivided() ? QStringLiteral("*/") + parts.popup().toString() : QString();
}

QString extractModuleWildCard(const QString &name)
{
    RuleName parts(name);
    return parts.isDivided() ? parts.module().toString() + QStringLiteral("/*") : QString();
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
    QJsonParseError error{};
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
    m_interruptions[RuleName(popup)].insert(RuleName(target), behavior);
}

PopupState::InterruptionBehavior PopupInterruptionStore::getInterruptionBehavior(
    const QString &popup, const QString &target) const
{
    RuleName front(popup);
    // One table alone: an exact entry hides those with a wildcard, also where it has no rule.
    const auto table = findRule(m_interruptions, front);
    if (table != m_interruptions.constEnd()) {
        RuleName requested(target);
        const auto rule = findRule(table.value(), requested);
        if (rule != table.value().constEnd()) {
            return rule.value();
        }
    }
    const auto byDefault = findRule(m_defaults, front);
    return byDefault == m_defaults.constEnd() ? PopupState::Allow : byDefault.value();
}

PopupState::InterruptionBehavior PopupInterruptionStore::getInterruptionBehavior(
    const PopupState *popup, const PopupState *target) const
{
    return popup && target ? getInterruptionBehavior(popup->name(), target->name())
                           : PopupState::Allow;
}

bool PopupInterruptionStore::isBlockedByDomain(const QString &popup, int domain) const
{
    if (m_domainBlacklist.isEmpty()) {
        return false;
    }
    RuleName name(popup);
    const auto list = findRule(m_domainBlacklist, name);
    return list != m_domainBlacklist.constEnd() && list.value().contains(domain);
}

bool PopupInterruptionStore::isBlockedByDomain(const QString &popup) const
{
    const ViewStateTarget *target = viewLayer();
    return target && isBlockedByDomain(popup, target->activeDomain());
}

bool PopupInterruptionStore::isBlockedByDomain(const PopupState *popup, int domain) const
{
    return popup && isBlockedByDomain(popup->popupViewId(), domain);
}

bool PopupInterruptionStore::isBlockedByDomain(const PopupState *popup) const
{
    return popup && isBlockedByDomain(popup->popupViewId());
}

bool PopupInterruptionStore::isBlockedByView(const QString &popup, const QString &view) const
{
    if (m_viewBlacklist.isEmpty()) {
        return false;
    }
    RuleName name(popup);
    const auto list = findRule(m_viewBlacklist, name);
    return list != m_viewBlacklist.constEnd() && list.value().contains(view);
}

bool PopupInterruptionStore::isBlockedByView(const QString &popup) const
{
    const ViewStateTarget *target = viewLayer();
    return target && isBlockedByView(popup, target->activeView());
}

bool PopupInterruptionStore::isBlockedByView(const PopupState *popup, const QString &view) const
{
    return popup && isBlockedByView(popup->popupViewId(), view);
}

bool PopupInterruptionStore::isBlockedByView(const PopupState *popup) const
{
    return popup && isBlockedByView(popup->popupViewId());
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
        m_defaults.insert(RuleName(popup), behaviorFromString(readString(entry, "default")));
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
    if (ViewStateTarget *target = viewLayer()) {
        const QList<QString> names = readStrings(entry, "domainBlacklist");
        for (const QString &name : names) {
            domains.append(target->domainFromName(name));
        }
    }
    const QList<QString> views = readStrings(entry, "viewBlacklist");
    // An empty list stores nothing, so that a wildcard's list applies.
    if (!domains.isEmpty()) {
        m_domainBlacklist.insert(RuleName(popup), domains);
    }
    if (!views.isEmpty()) {
        m_viewBlacklist.insert(RuleName(popup), views);
    }
}

} // namespace HmiStateMachine
