#include "driving.h"
#include "librarytest.h"
#include "viewflow.h"

#include <HmiStateMachine/hmi/hmimoduleblacklistfilter.h>
#include <HmiStateMachine/hmi/hmimodulewhitelistfilter.h>
#include <HmiStateMachine/hmi/hmitargetblacklistfilter.h>
#include <HmiStateMachine/hmi/hmitargetwhitelistfilter.h>
#include <HmiStateMachine/hmi/hmiviewstate.h>

#include <QtTest>

using namespace HmiStateMachine;

namespace {

using Filter = QSharedPointer<HmiTargetFilter>;

/** Refuses what it is told to refuse, and keeps what it was asked. */
class AskedFilter : public HmiTargetFilter
{
public:
    AskedFilter(const QString &name, bool answer, QStringList &asked)
        : m_name(name), m_answer(answer), m_asked(asked)
    {
    }

    bool isValid(const QString &target) const override
    {
        m_asked.append(m_name + ' ' + target);
        return m_answer;
    }

private:
    QString m_name;
    bool m_answer;
    QStringList &m_asked;
};

/** Counts its own end. */
class MortalFilter : public HmiTargetFilter
{
public:
    explicit MortalFilter(int &deaths) : m_deaths(deaths) { }
    ~MortalFilter() override { ++m_deaths; }
    bool isValid(const QString &) const override { return true; }

private:
    int &m_deaths;
};

Filter makeFilter(const QString &kind, const QString &pattern)
{
    if (kind == "target blacklist") {
        return Filter(new HmiTargetBlacklistFilter(pattern));
    }
    if (kind == "target whitelist") {
        return Filter(new HmiTargetWhitelistFilter(pattern));
    }
    if (kind == "module blacklist") {
        return Filter(new HmiModuleBlacklistFilter(pattern));
    }
    return Filter(new HmiModuleWhitelistFilter(pattern));
}

void addColumns()
{
    QTest::addColumn<QString>("kind");
    QTest::addColumn<QString>("pattern");
    QTest::addColumn<QString>("target");
    QTest::addColumn<bool>("valid");
}

void addRow(const char *kind, const char *pattern, const char *target, bool valid)
{
    const QByteArray tag = QByteArray(kind) + ' ' + pattern + ": " + target;
    QTest::newRow(tag) << QString(kind) << QString(pattern) << QString(target) << valid;
}

} // namespace

class tst_HmiTargetFilter : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void aTargetFilterComparesWholeNames_data();
    void aTargetFilterComparesWholeNames();
    void aModuleFilterComparesTheLeadingPart_data();
    void aModuleFilterComparesTheLeadingPart();
    void emptyNamesAreJudgedLikeAnyOther_data();
    void emptyNamesAreJudgedLikeAnyOther();
    void aViewWithoutFiltersAcceptsEverything();
    void aViewAcceptsWhatAllItsFiltersAccept_data();
    void aViewAcceptsWhatAllItsFiltersAccept();
    void filtersAreAskedInOrderUpToTheFirstRefusal();
    void aFilterMayBeAddedTwice();
    void aNullFilterIsNotAdded();
    void aFilterIsSharedByManyViews();
    void aRefusedViewIsNoBackTarget();
};

void tst_HmiTargetFilter::aTargetFilterComparesWholeNames_data()
{
    addColumns();

    addRow("target blacklist", "A", "A", false);
    addRow("target blacklist", "A", "AB", true);
    addRow("target blacklist", "A", "BA", true);
    addRow("target blacklist", "A", "a", true);
    addRow("target blacklist", "AB", "A", true);
    addRow("target whitelist", "A", "A", true);
    addRow("target whitelist", "A", "AB", false);
    addRow("target whitelist", "A", "BA", false);
    addRow("target whitelist", "A", "a", false);
    addRow("target whitelist", "AB", "A", false);
}

void tst_HmiTargetFilter::aTargetFilterComparesWholeNames()
{
    QFETCH(QString, kind);
    QFETCH(QString, pattern);
    QFETCH(QString, target);

    const Filter filter = makeFilter(kind, pattern);

    QTEST(filter->isValid(target), "valid");
}

void tst_HmiTargetFilter::aModuleFilterComparesTheLeadingPart_data()
{
    addColumns();

    addRow("module blacklist", "Media", "MediaMain", false);
    addRow("module blacklist", "Media", "Media", false);
    addRow("module blacklist", "Media", "Mediation", false);
    addRow("module blacklist", "Media", "media", true);
    addRow("module blacklist", "Media", "MEDIAMain", true);
    addRow("module blacklist", "Media", "MainMedia", true);
    addRow("module blacklist", "Media", "Med", true);
    addRow("module whitelist", "Media", "MediaMain", true);
    addRow("module whitelist", "Media", "Media", true);
    addRow("module whitelist", "Media", "Mediation", true);
    addRow("module whitelist", "Media", "media", false);
    addRow("module whitelist", "Media", "MEDIAMain", false);
    addRow("module whitelist", "Media", "MainMedia", false);
    addRow("module whitelist", "Media", "Med", false);
    addRow("module whitelist", "Media.*", "MediaMain", false);
}

void tst_HmiTargetFilter::aModuleFilterComparesTheLeadingPart()
{
    QFETCH(QString, kind);
    QFETCH(QString, pattern);
    QFETCH(QString, target);

    const Filter filter = makeFilter(kind, pattern);

    QTEST(filter->isValid(target), "valid");
}

void tst_HmiTargetFilter::emptyNamesAreJudgedLikeAnyOther_data()
{
    addColumns();

    QTest::newRow("blacklist of a name") << "target blacklist"
                                         << "A" << QString() << true;
    QTest::newRow("blacklist of nothing") << "target blacklist" << QString() << QString() << false;
    QTest::newRow("whitelist of a name") << "target whitelist"
                                         << "A" << QString() << false;
    QTest::newRow("whitelist of nothing") << "target whitelist" << QString() << QString() << true;
    QTest::newRow("blacklist of a module") << "module blacklist"
                                           << "A" << QString() << true;
    QTest::newRow("whitelist of a module") << "module whitelist"
                                           << "A" << QString() << false;
    QTest::newRow("blacklist of every module") << "module blacklist"
                                               << ""
                                               << "Radio" << false;
    QTest::newRow("whitelist of every module") << "module whitelist"
                                               << ""
                                               << "Radio" << true;
}

void tst_HmiTargetFilter::emptyNamesAreJudgedLikeAnyOther()
{
    QFETCH(QString, kind);
    QFETCH(QString, pattern);
    QFETCH(QString, target);

    const Filter filter = makeFilter(kind, pattern);

    QTEST(filter->isValid(target), "valid");
}

void tst_HmiTargetFilter::aViewWithoutFiltersAcceptsEverything()
{
    const HmiViewState view("View");

    QVERIFY(view.backTargetValidityTest("Radio"));
    QVERIFY(view.backTargetValidityTest(QString()));
}

void tst_HmiTargetFilter::aViewAcceptsWhatAllItsFiltersAccept_data()
{
    QTest::addColumn<QStringList>("kinds");
    QTest::addColumn<QStringList>("patterns");
    QTest::addColumn<QString>("target");
    QTest::addColumn<bool>("valid");

    const QStringList module = {"module whitelist", "target blacklist"};
    QTest::newRow("within the module")
        << module << QStringList({"Media", "MediaList"}) << "MediaMain" << true;
    QTest::newRow("the exception")
        << module << QStringList({"Media", "MediaList"}) << "MediaList" << false;
    QTest::newRow("outside the module")
        << module << QStringList({"Media", "MediaList"}) << "Radio" << false;
    QTest::newRow("white and black for one id")
        << QStringList({"target whitelist", "target blacklist"}) << QStringList({"A", "A"}) << "A"
        << false;
    QTest::newRow("black and white for one id")
        << QStringList({"target blacklist", "target whitelist"}) << QStringList({"A", "A"}) << "A"
        << false;
    QTest::newRow("two names on whitelists of their own")
        << QStringList({"target whitelist", "target whitelist"}) << QStringList({"A", "B"}) << "A"
        << false;
    QTest::newRow("two blacklists, neither of which matches")
        << QStringList({"target blacklist", "module blacklist"}) << QStringList({"A", "B"}) << "C"
        << true;
}

void tst_HmiTargetFilter::aViewAcceptsWhatAllItsFiltersAccept()
{
    QFETCH(QStringList, kinds);
    QFETCH(QStringList, patterns);
    QFETCH(QString, target);
    HmiViewState view("View");

    for (int i = 0; i < kinds.size(); ++i) {
        view.addBackTargetFilter(makeFilter(kinds.at(i), patterns.at(i)));
    }

    QTEST(view.backTargetValidityTest(target), "valid");
}

void tst_HmiTargetFilter::filtersAreAskedInOrderUpToTheFirstRefusal()
{
    QStringList asked;
    HmiViewState view("View");
    view.addBackTargetFilter(Filter(new AskedFilter("first", true, asked)));
    view.addBackTargetFilter(Filter(new AskedFilter("second", false, asked)));
    view.addBackTargetFilter(Filter(new AskedFilter("third", true, asked)));

    QVERIFY(!view.backTargetValidityTest("Radio"));

    QCOMPARE(asked, QStringList({"first Radio", "second Radio"}));
}

void tst_HmiTargetFilter::aFilterMayBeAddedTwice()
{
    QStringList asked;
    HmiViewState view("View");
    const Filter filter(new AskedFilter("filter", true, asked));
    view.addBackTargetFilter(filter);
    view.addBackTargetFilter(filter);

    QVERIFY(view.backTargetValidityTest("Radio"));

    QCOMPARE(asked, QStringList({"filter Radio", "filter Radio"}));
}

void tst_HmiTargetFilter::aNullFilterIsNotAdded()
{
    HmiViewState view("View");

    view.addBackTargetFilter(Filter());

    QVERIFY(view.backTargetValidityTest("Radio"));
}

void tst_HmiTargetFilter::aFilterIsSharedByManyViews()
{
    int deaths = 0;
    Filter filter(new MortalFilter(deaths));
    QScopedPointer<HmiViewState> first(new HmiViewState("First"));
    QScopedPointer<HmiViewState> second(new HmiViewState("Second"));
    first->addBackTargetFilter(filter);
    second->addBackTargetFilter(filter);

    filter.reset();
    first.reset();
    QCOMPARE(deaths, 0);
    QVERIFY(second->backTargetValidityTest("Radio"));

    second.reset();
    QCOMPARE(deaths, 1);
}

void tst_HmiTargetFilter::aRefusedViewIsNoBackTarget()
{
    ViewFlow flow;
    flow.view("MediaList");
    HmiViewState *radio = flow.backView("Radio");
    radio->addBackTargetFilter(Filter(new HmiModuleBlacklistFilter("Media")));
    flow.start(flow.view("MediaMain"));

    flow.request("Radio");
    QCOMPARE(radio->backTarget(), QString());
    radio->addBackTargetFilter(Filter(new HmiTargetWhitelistFilter("Tuner")));
    flow.view("Tuner");
    flow.request("Tuner");
    flow.request("Radio");

    QCOMPARE(radio->backTarget(), QString("Tuner"));
}

QTEST_GUILESS_MAIN(tst_HmiTargetFilter)
#include "tst_hmitargetfilter.moc"
