#include "random/rulemaker.h"
#include "random/stores.h"

#include "diff/difference.h"
#include "rules/libraryfacts.h"

#include <QLoggingCategory>
#include <QtTest>

using namespace HmiStateMachine;
using namespace hmirules;

namespace {

constexpr int defaultRuns = 40;

QStringList reportedChanges(const Difference &difference)
{
    QStringList reported;
    for (const ChangedDecision &change : difference.decisions) {
        reported.append(pairText(change.front, change.requested) + ": "
                        + behaviorText(change.before.behavior) + " to "
                        + behaviorText(change.after.behavior));
    }
    for (const ChangedBlocking &change : difference.blockings) {
        reported.append(QString("%1 %2 %3").arg(change.popupViewId, change.where).arg(change.kind));
    }
    reported.sort();
    return reported;
}

/** What two stores answer differently. */
class StoreComparison
{
public:
    StoreComparison(const PopupInterruptionStore &before, const PopupInterruptionStore &after)
        : m_before(before), m_after(after)
    {
    }

    QStringList changes(const QList<Individual> &popups, const RuleBase &old, const RuleBase &now)
    {
        for (const Individual &front : popups) {
            for (const Individual &requested : popups) {
                addPair(front.name, requested.name);
            }
            for (const auto kind : {Site::DomainBlacklist, Site::ViewBlacklist}) {
                QStringList places = placesToAsk(old, kind) + placesToAsk(now, kind);
                places.removeDuplicates();
                addPlaces(front.viewId, places, kind);
            }
        }
        m_changes.sort();
        return m_changes;
    }

private:
    void addPair(const QString &front, const QString &requested)
    {
        const int was = m_before.getInterruptionBehavior(front, requested);
        const int is = m_after.getInterruptionBehavior(front, requested);
        if (was != is) {
            m_changes.append(pairText(front, requested) + ": " + behaviorText(was) + " to "
                             + behaviorText(is));
        }
    }

    void addPlaces(const QString &viewId, const QStringList &places, Site::Kind kind)
    {
        for (const QString &where : places) {
            if (isBlocked(m_before, viewId, where, kind)
                != isBlocked(m_after, viewId, where, kind)) {
                m_changes.append(QString("%1 %2 %3").arg(viewId, where).arg(kind));
            }
        }
    }

    const PopupInterruptionStore &m_before;
    const PopupInterruptionStore &m_after;
    QStringList m_changes;
};

} // namespace

class tst_RulesPropertyDiff : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void theChangesAreThoseOfTheStoresAnswers_data();
    void theChangesAreThoseOfTheStoresAnswers();
};

void tst_RulesPropertyDiff::initTestCase()
{
    QLoggingCategory::setFilterRules("vosk.hmistatemachine=false");
}

void tst_RulesPropertyDiff::theChangesAreThoseOfTheStoresAnswers_data()
{
    addSeedRows();
}

void tst_RulesPropertyDiff::theChangesAreThoseOfTheStoresAnswers()
{
    QFETCH(quint32, seed);
    Random random(seed);
    const int runs = numberOfSteps(defaultRuns);

    for (int run = 1; run <= runs; ++run) {
        const QList<QByteArray> old = randomFiles(&random, 2);
        const QList<QByteArray> now = randomFiles(&random, 2);
        const RuleBase before(filesOf(old));
        const RuleBase after(filesOf(now));
        const auto popups = commonPopulation(before, after, Inventory());

        const QStringList reported = reportedChanges(compare(before, after, popups));

        const auto oldStore = loaded(old);
        const auto newStore = loaded(now);
        const QStringList expected =
            StoreComparison(*oldStore, *newStore).changes(popups, before, after);
        QVERIFY2(reported == expected, reproduction(seed, run, "changes", old + now));
        QVERIFY(reportedChanges(compare(before, before, popups)).isEmpty());
        QVERIFY(reportedChanges(compare(before, RuleBase(filesOf(old)), popups)).isEmpty());
    }
}

QTEST_GUILESS_MAIN(tst_RulesPropertyDiff)
#include "tst_rulespropertydiff.moc"
