#include "rulebase.h"

#include "libraryfacts.h"

#include <algorithm>

using namespace HmiStateMachine;

namespace hmirules {

namespace {

constexpr int base = 4; // as many digits as there are behaviours

int digitAt(int number, int position)
{
    for (; position > 0; --position) {
        number /= base;
    }
    return number % base;
}

int digitCount(int numbers)
{
    int count = 1;
    for (int covered = base; covered < numbers; covered *= base) {
        ++count;
    }
    return count;
}

bool isBlacklist(const Site &site)
{
    return site.kind == Site::DomainBlacklist || site.kind == Site::ViewBlacklist;
}

QByteArray quoted(const QString &text)
{
    return '"' + text.toUtf8() + '"';
}

// No name in a blacklist begins with it.
QString prefixForDigits(const std::vector<Site> &sites)
{
    QString prefix = "digit ";
    const auto isTaken = [&prefix](const Site &site) {
        return std::any_of(site.names.cbegin(), site.names.cend(),
                           [&prefix](const QString &name) { return name.startsWith(prefix); });
    };
    while (std::any_of(sites.cbegin(), sites.cend(), isTaken)) {
        prefix += ' ';
    }
    return prefix;
}

} // namespace

RuleBase::RuleBase(std::vector<RuleFile> files) : m_files(std::move(files))
{
    QList<QByteArray> contents;
    int number = 0;
    for (RuleFile &file : m_files) {
        file.setNumber(number++);
        contents.append(file.content());
        for (Site &site : file.sites()) {
            m_sites.push_back(std::move(site));
        }
    }
    LoadedStore loaded = loadStore(contents);
    m_store = std::move(loaded.store);
    m_warnings = loaded.warnings;
    addProbes();
}

void RuleBase::addProbes()
{
    const int count = digitCount(static_cast<int>(m_sites.size()));
    m_digitPrefix = prefixForDigits(m_sites);
    std::vector<QByteArray> texts(m_sites.size());
    for (int position = 0; position < count; ++position) {
        for (std::size_t i = 0; i < m_sites.size(); ++i) {
            const auto number = static_cast<int>(i);
            texts[i] = isBlacklist(m_sites[i]) ? digitNames(number, count)
                                               : quoted(behaviorText(digitAt(number, position)));
        }
        m_digits.push_back(loadWith(texts));
    }
    std::fill(texts.begin(), texts.end(), quoted(behaviorText(PopupState::Prohibit)));
    m_presence = loadWith(texts);
}

QString RuleBase::digitName(int position, int digit) const
{
    return QString("%1%2.%3").arg(m_digitPrefix).arg(position).arg(digit);
}

// The names of all digits, in the place of a list's first name.
QByteArray RuleBase::digitNames(int number, int count) const
{
    QByteArray names;
    for (int position = 0; position < count; ++position) {
        names +=
            (position == 0 ? "" : ",") + quoted(digitName(position, digitAt(number, position)));
    }
    return names;
}

// The texts take the place of what the sites say.
std::unique_ptr<Store> RuleBase::loadWith(const std::vector<QByteArray> &texts) const
{
    std::vector<int> positions(m_files.size(), 0);
    QList<QByteArray> contents;
    for (const RuleFile &file : m_files) {
        Q_UNUSED(file)
        contents.append(QByteArray());
    }
    for (std::size_t i = 0; i < m_sites.size(); ++i) {
        const Site &site = m_sites[i];
        const auto file = static_cast<std::size_t>(site.place.file);
        int &position = positions[file];
        contents[site.place.file] +=
            m_files[file].content().mid(position, site.begin - position) + texts[i];
        position = site.end;
    }
    for (std::size_t file = 0; file < m_files.size(); ++file) {
        contents[static_cast<int>(file)] += m_files[file].content().mid(positions[file]);
    }
    return loadStore(contents).store;
}

Decision RuleBase::decision(const QString &front, const QString &requested) const
{
    Decision result;
    result.behavior = behavior(front, requested);
    if (m_presence->getInterruptionBehavior(front, requested) != PopupState::Prohibit) {
        return result;
    }
    result.site = 0;
    int weight = 1;
    for (const auto &store : m_digits) {
        result.site += weight * store->getInterruptionBehavior(front, requested);
        weight *= base;
    }
    return result;
}

int RuleBase::behavior(const QString &front, const QString &requested) const
{
    return m_store->getInterruptionBehavior(front, requested);
}

Blocking RuleBase::blockingByDomain(const QString &popupViewId, const QString &domain) const
{
    return {m_store->isBlockedByDomain(popupViewId, numberOfDomain(domain)),
            listOf(Site::DomainBlacklist, popupViewId)};
}

Blocking RuleBase::blockingByView(const QString &popupViewId, const QString &view) const
{
    return {m_store->isBlockedByView(popupViewId, view), listOf(Site::ViewBlacklist, popupViewId)};
}

int RuleBase::listOf(Site::Kind kind, const QString &popupViewId) const
{
    const Store &store = *m_digits.front();
    int number = 0;
    int weight = 1;
    for (int position = 0; position < static_cast<int>(m_digits.size()); ++position) {
        int digit = 0;
        for (; digit < base; ++digit) {
            const QString name = digitName(position, digit);
            if (kind == Site::DomainBlacklist
                    ? store.isBlockedByDomain(popupViewId, numberOfDomain(name))
                    : store.isBlockedByView(popupViewId, name)) {
                break;
            }
        }
        if (digit == base) {
            return -1;
        }
        number += weight * digit;
        weight *= base;
    }
    return number;
}

} // namespace hmirules
