#pragma once

#include "catalogue.h"
#include "input/inventory.h"
#include "rules/rulebase.h"

namespace hmirules {

/** Another place that a finding is about. */
struct Related
{
    Place place;
    QString message;
};

struct Finding
{
    const FindingKind *kind = nullptr;
    Place place;
    QString message;
    QString remedy;
    std::vector<Related> related;
};

/** What is checked, and where what is found goes. */
class Findings
{
public:
    /** Files before @p firstFile are loaded too, and not checked. */
    Findings(const RuleBase &base, const Inventory &inventory, int firstFile)
        : m_base(base), m_inventory(inventory), m_firstFile(firstFile)
    {
    }

    const RuleBase &base() const { return m_base; }
    const Inventory &inventory() const { return m_inventory; }

    int firstFile() const { return m_firstFile; }

    /** The numbers of the files that are checked. */
    std::vector<int> files() const;
    const RuleFile &file(int number) const
    {
        return m_base.files()[static_cast<std::size_t>(number)];
    }

    /** Without a remedy of its own it gets that of its kind. */
    void add(const char *id, const Place &place, const QString &message,
             const std::vector<Related> &related = {}, const QString &remedy = QString());

    /** In the order of the files; what concerns the same place in the order of the checks. */
    std::vector<Finding> takeSorted();

private:
    const RuleBase &m_base;
    const Inventory &m_inventory;
    int m_firstFile;
    std::vector<Finding> m_findings;
};

} // namespace hmirules
