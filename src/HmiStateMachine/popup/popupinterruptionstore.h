#pragma once

#include <HmiStateMachine/hmistatemachine_export.h>
#include <HmiStateMachine/popup/popupstate.h>

#include <QHash>
#include <QList>
#include <QObject>
#include <QString>

class QJsonArray;
class QJsonObject;

namespace HmiStateMachine {

class RuleName;

/**
 * The behaviour that @p text names, in any case: "Prohibit", "Allow", "AllowStack" or
 * "AllowNoReturn"; -1 for any other text.
 */
HMISTATEMACHINE_EXPORT PopupState::InterruptionBehavior behaviorFromString(const QString &text);

/** For "phone/call" it is "*" followed by "/call"; empty for a name without a slash. */
HMISTATEMACHINE_EXPORT QString extractPopupWildCard(const QString &name);

/** For "phone/call" it is "phone/" followed by "*"; empty for a name without a slash. */
HMISTATEMACHINE_EXPORT QString extractModuleWildCard(const QString &name);

/**
 * The rules of what happens when a popup is requested while another one is in front, and in which
 * domains and on which views a popup is not shown.
 *
 * Popups are named module, slash, popup. A rule names one popup exactly, one popup of any module,
 * or all popups of a module; the exact entry hides those with a wildcard, even where it has no rule
 * for the popup in question. Without a rule or a default a popup may interrupt any other.
 *
 * Interruption rules are looked up by the names of the states, blacklists by their popup view ids.
 * Belongs to the thread of the machine.
 */
class HMISTATEMACHINE_EXPORT PopupInterruptionStore : public QObject
{
    Q_OBJECT

public:
    /** An empty store. The library itself asks instance() alone. */
    explicit PopupInterruptionStore(QObject *parent = nullptr);
    ~PopupInterruptionStore() override;

    /** The store of the process, made by the first call as a child of the application object. */
    static PopupInterruptionStore *instance();

    /**
     * Adds the rules of a JSON file to those that are there; a later entry replaces an earlier one
     * for the same popup. Each fault is a warning with its indexes, and the rest is loaded; a file
     * that cannot be read or parsed loads nothing, with a warning. A default that is none of the
     * four behaviours is stored as -1, without one.
     *
     * Domain names are turned into numbers by the view layer, so publish that first; without it no
     * domain blacklist is loaded.
     */
    void loadInterruptionBehaviors(const QString &fileName);

    /**
     * Adds one rule, or replaces the one for the same two names, which may be wildcards: what
     * @p popup, being in front, answers to a request for @p target.
     */
    void insertInterruptionBehavior(PopupState::InterruptionBehavior behavior, const QString &popup,
                                    const QString &target);

    /**
     * What @p popup, being in front, answers to a request for @p target; Allow without a rule, -1
     * where the default that applies was not valid.
     */
    PopupState::InterruptionBehavior getInterruptionBehavior(const QString &popup,
                                                             const QString &target) const;

    /** By the names of the two states; Allow when either is null. */
    PopupState::InterruptionBehavior getInterruptionBehavior(const PopupState *popup,
                                                             const PopupState *target) const;

    /** Whether the domain blacklist that applies to a popup view id holds the number @p domain. */
    bool isBlockedByDomain(const QString &popup, int domain) const;

    /** By the active domain; false without a view layer. */
    bool isBlockedByDomain(const QString &popup) const;

    /** By its popup view id; false for null. */
    bool isBlockedByDomain(const PopupState *popup, int domain) const;

    /** By its popup view id and the active domain; false for null and without a view layer. */
    bool isBlockedByDomain(const PopupState *popup) const;

    /** Whether the view blacklist that applies to a popup view id holds @p view. */
    bool isBlockedByView(const QString &popup, const QString &view) const;

    /** By the active view; false without a view layer. */
    bool isBlockedByView(const QString &popup) const;

    /** By its popup view id; false for null. */
    bool isBlockedByView(const PopupState *popup, const QString &view) const;

    /** By its popup view id and the active view; false for null and without a view layer. */
    bool isBlockedByView(const PopupState *popup) const;

private:
    Q_DISABLE_COPY(PopupInterruptionStore)

    using Behaviors = QHash<RuleName, PopupState::InterruptionBehavior>;

    void loadEntry(const QJsonObject &entry, int index);
    void loadRules(const QString &popup, const QJsonArray &rules, int entryIndex);
    void loadBlacklists(const QString &popup, const QJsonObject &entry);

    QHash<RuleName, Behaviors> m_interruptions;
    Behaviors m_defaults;
    QHash<RuleName, QList<int>> m_domainBlacklist;
    QHash<RuleName, QList<QString>> m_viewBlacklist;
};

} // namespace HmiStateMachine
