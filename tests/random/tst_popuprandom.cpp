#include "librarytest.h"
#include "run.h"
#include "seeds.h"

#include <QtTest>

#include <cstdio>

class tst_PopupRandom : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void whatMustHoldHoldsAfterEachStep_data();
    void whatMustHoldHoldsAfterEachStep();
    void aLongerListOfStepsBeginsWithTheShorterOne();
    void aFailureIsFoundAtTheStepThatBreaksTheRule();
    void aFailingListIsReducedToTheStepsThatMatter();
    void aReportNamesTheSeedTheRuleAndTheSteps();
};

namespace {

constexpr int defaultSteps = 20000;
constexpr int faultyPopup = 4;

/** A fault put in on purpose: the third request of one popup. */
MakeRule thirdRequestFails()
{
    return [] {
        return [count = 0](const World &, const Step &step) mutable {
            if (step.action == Action::Request && step.first == faultyPopup) {
                ++count;
            }
            return count == 3 ? QStringLiteral("third request") : QString();
        };
    };
}

const QVector<Step> faultySteps = {{Action::Request, 1, 0},    {Action::Request, 4, 0},
                                   {Action::Domain, 2, 0},     {Action::DismissAny, 0, 0},
                                   {Action::Request, 4, 0},    {Action::Report, 0, 0},
                                   {Action::RequestTwo, 4, 7}, {Action::Reset, 0, 0},
                                   {Action::Request, 4, 0},    {Action::DismissCurrent, 1, 0}};

QStringList texts(const QVector<Step> &steps)
{
    QStringList result;
    for (const Step &step : steps) {
        result.append(toText(step));
    }
    return result;
}

} // namespace

void tst_PopupRandom::whatMustHoldHoldsAfterEachStep_data()
{
    addSeedRows();
}

void tst_PopupRandom::whatMustHoldHoldsAfterEachStep()
{
    QFETCH(quint32, seed);
    const Runner runner(seed, messages());
    const QVector<Step> steps = makeSteps(seed, numberOfSteps(defaultSteps));

    const auto failure = runner.run(steps);

    if (failure) {
        std::fputs(qPrintable(runner.report(steps)), stderr);
        QFAIL(qPrintable(failure->rule));
    }
}

void tst_PopupRandom::aLongerListOfStepsBeginsWithTheShorterOne()
{
    const QVector<Step> longer = makeSteps(7, 50);

    const QVector<Step> shorter = makeSteps(7, 20);

    QCOMPARE(texts(shorter), texts(longer.mid(0, 20)));
}

void tst_PopupRandom::aFailureIsFoundAtTheStepThatBreaksTheRule()
{
    const Runner runner(1, messages(), thirdRequestFails());

    const QVector<Step> prefix = runner.shortestFailingPrefix(faultySteps);

    QCOMPARE(prefix.size(), 9);
    QCOMPARE(toText(prefix.last()), QString("request 4"));
    QVERIFY(!runner.run(prefix.mid(0, 8)));
}

void tst_PopupRandom::aFailingListIsReducedToTheStepsThatMatter()
{
    const Runner runner(1, messages(), thirdRequestFails());

    const QVector<Step> few = runner.reduced(faultySteps);

    QCOMPARE(texts(few), QStringList({"request 4", "request 4", "request 4"}));
}

void tst_PopupRandom::aReportNamesTheSeedTheRuleAndTheSteps()
{
    const Runner runner(1, messages(), thirdRequestFails());

    const QString report = runner.report(faultySteps);

    QCOMPARE(report,
             QString("Broken: third request\n"
                     "HMI_RANDOM_SEED=1 HMI_RANDOM_STEPS=9, the shortest prefix:\n"
                     "  request 1\n  request 4\n  domain 2\n  dismiss any\n  request 4\n"
                     "  report\n  request two 4 7\n  reset layer 0\n  request 4\n"
                     "Of these, 3 break a rule too:\n"
                     "  request 4\n  request 4\n  request 4\n"));
}

QTEST_GUILESS_MAIN(tst_PopupRandom)
#include "tst_popuprandom.moc"
