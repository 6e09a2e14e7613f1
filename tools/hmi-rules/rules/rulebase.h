#pragma once

#include "rulefile.h"
#include "store.h"

#include <vector>

namespace hmirules {

/** What the popup in front answers to a request, and why. */
struct Decision
{
    int behavior = 0; ///< the library's number, -1 for none that is valid
    int site = -1; ///< the rule or default that decided; -1 for none: Allow is built in
};

/** Whether a popup is blocked, and the list that said so. */
struct Blocking
{
    bool isBlocked = false;
    int site = -1; ///< the list that was asked; -1 for none
};

/**
 * Files of rules loaded one after another, as an application does it.
 *
 * Each answer is the library's own: the files are loaded into its store. Which rule decided comes
 * from the store as well: into further stores the same files are loaded with the behaviours
 * replaced by digits of the number of each rule, so that what they answer spells out the one that
 * decides.
 */
class RuleBase
{
public:
    explicit RuleBase(std::vector<RuleFile> files);

    const std::vector<RuleFile> &files() const { return m_files; }
    const std::vector<Site> &sites() const { return m_sites; }
    const Site &site(int number) const { return m_sites[static_cast<std::size_t>(number)]; }

    /** What the library logged when it loaded each file. */
    const QList<QStringList> &warnings() const { return m_warnings; }

    Decision decision(const QString &front, const QString &requested) const;
    int behavior(const QString &front, const QString &requested) const;

    Blocking blockingByDomain(const QString &popupViewId, const QString &domain) const;
    Blocking blockingByView(const QString &popupViewId, const QString &view) const;

private:
    std::unique_ptr<Store> loadWith(const std::vector<QByteArray> &texts) const;
    void addProbes();
    QString digitName(int position, int digit) const;
    QByteArray digitNames(int number, int count) const;
    int listOf(Site::Kind kind, const QString &popupViewId) const;

    std::vector<RuleFile> m_files;
    std::vector<Site> m_sites;
    QList<QStringList> m_warnings;
    std::unique_ptr<Store> m_store;
    QString m_digitPrefix; ///< of the names that stand for digits in blacklists
    std::unique_ptr<Store> m_presence; ///< Prohibit for all that is decided by a site
    std::vector<std::unique_ptr<Store>> m_digits; ///< of the deciding site's number, lowest first
};

} // namespace hmirules
