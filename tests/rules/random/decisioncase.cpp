#include "decisioncase.h"

#include "rules/libraryfacts.h"

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

using namespace HmiStateMachine;
using namespace hmirules;

namespace {

// A byte order mark in front of a text is kept only as an escape.
QByteArray written(const QJsonArray &entries)
{
    return QJsonDocument(entries).toJson().replace("\xef\xbb\xbf", "\\ufeff");
}

Blocking ask(const RuleBase &base, const QString &popup, const QString &where, Site::Kind kind)
{
    return kind == Site::DomainBlacklist ? base.blockingByDomain(popup, where)
                                         : base.blockingByView(popup, where);
}

} // namespace

QString DecisionCase::wrongDecision() const
{
    return firstPair([this](const QString &front, const QString &requested) {
        return m_base.decision(front, requested).behavior
            == m_store->getInterruptionBehavior(front, requested);
    });
}

// The deciding site, as if nothing else were in the files.
QString DecisionCase::wrongSiteAlone() const
{
    std::vector<StorePointer> alone;
    for (const Site &site : m_base.sites()) {
        QJsonObject entry = {{"popup", site.popup}};
        if (site.kind == Site::Rule) {
            entry["interruptions"] =
                QJsonArray({QJsonObject({{"target", site.target}, {"behavior", site.text}})});
        } else {
            entry["default"] = site.text;
        }
        alone.push_back(loaded({written(QJsonArray({entry}))}));
    }
    return firstPair([this, &alone](const QString &front, const QString &requested) {
        const Decision decision = m_base.decision(front, requested);
        return decision.site < 0
            || alone[std::size_t(decision.site)]->getInterruptionBehavior(front, requested)
            == decision.behavior;
    });
}

// The files with another text in the place of one site's, or of every behaviour for -1.
QList<QByteArray> DecisionCase::changed(int site, const QByteArray &text) const
{
    QList<QByteArray> contents = m_contents;
    for (int number = int(m_base.sites().size()) - 1; number >= 0; --number) {
        const Site &each = m_base.site(number);
        const bool isBehavior = each.kind == Site::Rule || each.kind == Site::Default;
        if (isBehavior && (site == -1 || site == number)) {
            contents[each.place.file].replace(each.begin, each.end - each.begin, text);
        }
    }
    return contents;
}

// With one site changed, exactly the answers change that it decides.
QString DecisionCase::wrongAfterChange() const
{
    for (int number = 0; number < int(m_base.sites().size()); ++number) {
        const Site &site = m_base.site(number);
        if (site.kind != Site::Rule && site.kind != Site::Default) {
            continue;
        }
        const int other = (behaviorFromString(site.text) + 1) % 4;
        const auto store = loaded(changed(number, '"' + behaviorText(other).toUtf8() + '"'));
        const QString wrong = firstPair([&](const QString &front, const QString &requested) {
            const Decision decision = m_base.decision(front, requested);
            return store->getInterruptionBehavior(front, requested)
                == (decision.site == number ? other : decision.behavior);
        });
        if (!wrong.isEmpty()) {
            return wrong + ", with another behaviour at " + site.place.pointer;
        }
    }
    return QString();
}

QString DecisionCase::wrongWithoutSite() const
{
    const auto store = loaded(changed(-1, "\"Prohibit\""));
    return firstPair([this, &store](const QString &front, const QString &requested) {
        return store->getInterruptionBehavior(front, requested)
            == (m_base.decision(front, requested).site < 0 ? PopupState::Allow
                                                           : PopupState::Prohibit);
    });
}

QString DecisionCase::wrongBlocking() const
{
    for (const auto kind : {Site::DomainBlacklist, Site::ViewBlacklist}) {
        for (const QString &popup : m_names) {
            for (const QString &where : placesToAsk(m_base, kind)) {
                const Blocking blocking = ask(m_base, popup, where, kind);
                const bool fits = blocking.site < 0 || m_base.site(blocking.site).kind == kind;
                if (!fits || blocking.isBlocked != isBlocked(*m_store, popup, where, kind)) {
                    return QString("\"%1\" in \"%2\"").arg(popup, where);
                }
            }
        }
    }
    return QString();
}

QList<QByteArray> DecisionCase::withList(const Site &site, const QString &onlyName) const
{
    QList<QByteArray> contents = m_contents;
    QByteArray &content = contents[site.place.file];
    QJsonArray entries = QJsonDocument::fromJson(content).array();
    QJsonObject entry = entries.at(site.entry).toObject();
    entry[site.place.pointer.section('/', -1)] = QJsonArray({onlyName});
    entries[site.entry] = entry;
    content = written(entries);
    return contents;
}

QString DecisionCase::wrongAfterLifting() const
{
    QString wrong;
    for (int number = 0; wrong.isEmpty() && number < int(m_base.sites().size()); ++number) {
        if (!m_base.site(number).names.isEmpty()) {
            wrong = wrongAfterLifting(number);
        }
    }
    return wrong;
}

// With another list, exactly the popups that it decides for are blocked elsewhere.
QString DecisionCase::wrongAfterLifting(int number) const
{
    const QString elsewhere = "elsewhere";
    const Site &site = m_base.site(number);
    const auto store = loaded(withList(site, elsewhere));
    for (const QString &popup : m_names) {
        const bool decides = ask(m_base, popup, elsewhere, site.kind).site == number;
        bool isRight = isBlocked(*store, popup, elsewhere, site.kind) == decides;
        for (const QString &where : placesToAsk(m_base, site.kind)) {
            const bool was = isBlocked(*m_store, popup, where, site.kind);
            isRight =
                isRight && isBlocked(*store, popup, where, site.kind) == (decides ? false : was);
        }
        if (!isRight) {
            return '"' + popup + "\", with another list at " + site.place.pointer;
        }
    }
    return QString();
}

QString DecisionCase::firstWrong() const
{
    for (const auto check :
         {&DecisionCase::wrongDecision, &DecisionCase::wrongSiteAlone,
          &DecisionCase::wrongAfterChange, &DecisionCase::wrongWithoutSite,
          &DecisionCase::wrongBlocking, qOverload<>(&DecisionCase::wrongAfterLifting)}) {
        const QString wrong = (this->*check)();
        if (!wrong.isEmpty()) {
            return wrong;
        }
    }
    return QString();
}
