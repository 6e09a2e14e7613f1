#include "driving.h"
#include "emitter.h"
#include "fallbackflow.h"
#include "librarytest.h"
#include "metadescription.h"

#include <HmiStateMachine/hmi/hmifallbacktransition.h>
#include <HmiStateMachine/hmi/hmilayeredstate.h>
#include <HmiStateMachine/hmi/hmipropertyboundfallbackviewstate.h>

#include <QSignalSpy>
#include <QtTest>

using namespace HmiStateMachine;

namespace {

using BoundView = HmiPropertyBoundFallbackViewState;

/** A view in a flow that is permitted while "value" of the emitter is 0 or 1. */
struct Bound
{
    explicit Bound(bool autoReevaluate = true, const char *property = "value")
        : view(flow.add(new BoundView("View", "Fallback", emitter.data(), property, {0, 1},
                                      flow.machine, autoReevaluate)))
    {
    }

    QScopedPointer<Emitter> emitter{new Emitter};
    FallbackFlow flow;
    BoundView *const view;
};

} // namespace

class tst_HmiPropertyBoundFallbackViewState : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void itAddsNothingToTheMetaObject();
    void itIsConstructedWithOrWithoutATargetView();
    void inLayersItLandsInTheExclusiveLayer();
    void itIsPermittedWithOneOfTheValues_data();
    void itIsPermittedWithOneOfTheValues();
    void valuesAreComparedWithConversion_data();
    void valuesAreComparedWithConversion();
    void aPropertyThatTheObjectLacksIsNeverPermitted_data();
    void aPropertyThatTheObjectLacksIsNeverPermitted();
    void aPropertyThatIsAddedLaterCounts();
    void withoutAnObjectItIsAlwaysPermitted_data();
    void withoutAnObjectItIsAlwaysPermitted();
    void aDestroyedObjectPermitsForGood();
    void aForbiddenViewPostsOneEventAndIsNotShown();
    void aPermittedViewIsShown();
    void aChangeToAForbiddenValueLeavesTheActiveView();
    void aChangeAmongThePermittedValuesKeepsTheView();
    void aChangeWhileInactivePostsNothing();
    void withoutAutomaticReevaluationChangesAreIgnored();
    void reevaluatingByHandStillWorks();
    void aPropertyWithoutANotifySignalNeverReevaluatesByItself();
    void theDestructionOfTheObjectKeepsTheActiveView();
    void aDestroyedViewNoLongerListens();
    void severalViewsMayWatchOneProperty();
};

void tst_HmiPropertyBoundFallbackViewState::itAddsNothingToTheMetaObject()
{
    QCOMPARE(metaDescription(BoundView::staticMetaObject), QStringList());
    QCOMPARE(BoundView::staticMetaObject.superClass(), &HmiFallbackViewState::staticMetaObject);
}

void tst_HmiPropertyBoundFallbackViewState::itIsConstructedWithOrWithoutATargetView()
{
    QState parent;
    NamedState fallback("Fallback");
    Emitter emitter;
    const BoundView named("Named", "Fallback", &emitter, "value", {0}, nullptr, true);
    const auto *shown =
        new BoundView("Shown", "Other", "Fallback", &emitter, "value", {0}, &parent, false);

    QCOMPARE(named.name(), QString("Named"));
    QCOMPARE(named.targetView(), QString("Named"));
    QVERIFY(!named.parent());
    QCOMPARE(shown->name(), QString("Other"));
    QCOMPARE(shown->targetView(), QString("Shown"));
    QCOMPARE(shown->parentState(), &parent);
    for (const BoundView *view : {&named, shown}) {
        QCOMPARE(view->findChild<HmiFallbackTransition *>()->targetState(), &fallback);
    }
}

void tst_HmiPropertyBoundFallbackViewState::inLayersItLandsInTheExclusiveLayer()
{
    HmiLayeredState layers("Layers");

    const auto *view = new BoundView("View", "Fallback", nullptr, "value", {}, &layers, true);

    QCOMPARE(view->parentState(), layers.exclusiveState());
}

void tst_HmiPropertyBoundFallbackViewState::itIsPermittedWithOneOfTheValues_data()
{
    QTest::addColumn<QList<QVariant>>("values");
    QTest::addColumn<bool>("permitted");

    QTest::newRow("the only one") << QList<QVariant>{3} << true;
    QTest::newRow("the last one") << QList<QVariant>{1, 2, 3} << true;
    QTest::newRow("another one") << QList<QVariant>{4} << false;
    QTest::newRow("none at all") << QList<QVariant>{} << false;
    QTest::newRow("invalid") << QList<QVariant>{QVariant()} << false;
}

void tst_HmiPropertyBoundFallbackViewState::itIsPermittedWithOneOfTheValues()
{
    QFETCH(QList<QVariant>, values);
    Emitter emitter;
    emitter.setValue(3);

    BoundView view("View", "Fallback", &emitter, "value", values, nullptr, true);

    QTEST(view.permitted(), "permitted");
}

void tst_HmiPropertyBoundFallbackViewState::valuesAreComparedWithConversion_data()
{
    QTest::addColumn<QVariant>("value");
    QTest::addColumn<bool>("permitted");

    QTest::newRow("text") << QVariant("3") << true;
    QTest::newRow("unsigned") << QVariant(3U) << true;
    QTest::newRow("floating") << QVariant(3.0) << true;
    QTest::newRow("other text") << QVariant("three") << false;
}

void tst_HmiPropertyBoundFallbackViewState::valuesAreComparedWithConversion()
{
    QFETCH(QVariant, value);
    Emitter emitter;
    emitter.setValue(3);

    BoundView view("View", "Fallback", &emitter, "value", {value}, nullptr, true);

    QTEST(view.permitted(), "permitted");
}

void tst_HmiPropertyBoundFallbackViewState::aPropertyThatTheObjectLacksIsNeverPermitted_data()
{
    QTest::addColumn<QByteArray>("property");

    QTest::newRow("unknown") << QByteArray("absent");
    QTest::newRow("empty") << QByteArray("");
    QTest::newRow("null") << QByteArray();
}

void tst_HmiPropertyBoundFallbackViewState::aPropertyThatTheObjectLacksIsNeverPermitted()
{
    QFETCH(QByteArray, property);
    Emitter emitter;
    const char *name = property.isNull() ? nullptr : property.constData();

    BoundView view("View", "Fallback", &emitter, name, {0}, nullptr, true);

    QVERIFY(!view.permitted());
    QCOMPARE(messages().take(), QStringList());
}

void tst_HmiPropertyBoundFallbackViewState::aPropertyThatIsAddedLaterCounts()
{
    Emitter emitter;
    BoundView view("View", "Fallback", &emitter, "added", {7}, nullptr, true);
    QVERIFY(!view.permitted());

    emitter.setProperty("added", 7);

    QVERIFY(view.permitted());
}

void tst_HmiPropertyBoundFallbackViewState::withoutAnObjectItIsAlwaysPermitted_data()
{
    QTest::addColumn<bool>("autoReevaluate");

    QTest::newRow("automatic") << true;
    QTest::newRow("by hand") << false;
}

void tst_HmiPropertyBoundFallbackViewState::withoutAnObjectItIsAlwaysPermitted()
{
    QFETCH(bool, autoReevaluate);

    BoundView view("View", "Fallback", nullptr, "value", {}, nullptr, autoReevaluate);

    QVERIFY(view.permitted());
    QCOMPARE(messages().take(), QStringList());
}

void tst_HmiPropertyBoundFallbackViewState::aDestroyedObjectPermitsForGood()
{
    Bound bound;
    bound.emitter->setValue(2);
    QVERIFY(!bound.view->permitted());
    bound.flow.start(bound.flow.home);

    bound.emitter.reset();
    bound.flow.request("View");

    QVERIFY(bound.view->permitted());
    QVERIFY(bound.view->isActive());
    QCOMPARE(bound.flow.take(), QStringList({"deactivateView Home", "activateView View"}));
}

void tst_HmiPropertyBoundFallbackViewState::aForbiddenViewPostsOneEventAndIsNotShown()
{
    Bound bound;
    bound.emitter->setValue(2);
    QSignalSpy fallbacks(bound.view->findChild<HmiFallbackTransition *>(),
                         &QAbstractTransition::triggered);
    QVERIFY(fallbacks.isValid());
    bound.flow.start(bound.flow.home);

    bound.flow.request("View");

    QVERIFY(bound.flow.fallback->isActive());
    QCOMPARE(fallbacks.size(), 1);
    QCOMPARE(bound.flow.take(),
             QStringList({"deactivateView Home", "deactivateView View", "activateView Fallback"}));
}

void tst_HmiPropertyBoundFallbackViewState::aPermittedViewIsShown()
{
    Bound bound;
    bound.flow.start(bound.flow.home);

    bound.flow.request("View");

    QVERIFY(bound.view->isActive());
    QCOMPARE(bound.flow.take(), QStringList({"deactivateView Home", "activateView View"}));
}

void tst_HmiPropertyBoundFallbackViewState::aChangeToAForbiddenValueLeavesTheActiveView()
{
    Bound bound;
    bound.flow.start(bound.view);

    bound.emitter->setValue(2);
    QVERIFY(bound.view->isActive());
    settle();

    QVERIFY(bound.flow.fallback->isActive());
    QCOMPARE(bound.flow.take(), QStringList({"deactivateView View", "activateView Fallback"}));
    QCOMPARE(bound.flow.target.viewData("View").value("exitReason"), QVariant(1));
}

void tst_HmiPropertyBoundFallbackViewState::aChangeAmongThePermittedValuesKeepsTheView()
{
    Bound bound;
    bound.flow.start(bound.view);

    bound.emitter->setValue(1);
    settle();

    QVERIFY(bound.view->isActive());
    QCOMPARE(bound.flow.take(), QStringList());
}

// Any view would do that listens for fallback events: here it is another one of the kind.
void tst_HmiPropertyBoundFallbackViewState::aChangeWhileInactivePostsNothing()
{
    Bound bound;
    auto *other =
        bound.flow.add(new HmiFallbackViewState("Other", "Fallback", StateMachine::instance()));
    bound.flow.start(other);

    bound.emitter->setValue(2);
    settle();

    QVERIFY(other->isActive());
    QCOMPARE(bound.flow.take(), QStringList());
}

void tst_HmiPropertyBoundFallbackViewState::withoutAutomaticReevaluationChangesAreIgnored()
{
    Bound bound(false);
    bound.flow.start(bound.view);

    bound.emitter->setValue(2);
    settle();

    QVERIFY(bound.view->isActive());
}

void tst_HmiPropertyBoundFallbackViewState::reevaluatingByHandStillWorks()
{
    Bound bound(false);
    bound.flow.start(bound.view);
    bound.emitter->setValue(2);

    bound.view->reevaluate();
    settle();

    QVERIFY(bound.flow.fallback->isActive());
}

void tst_HmiPropertyBoundFallbackViewState::aPropertyWithoutANotifySignalNeverReevaluatesByItself()
{
    Bound bound(true, "silent");
    bound.flow.start(bound.view);

    bound.emitter->setValue(2);
    settle();
    QVERIFY(bound.view->isActive());
    QCOMPARE(messages().take(), QStringList());
    bound.view->reevaluate();
    settle();

    QVERIFY(bound.flow.fallback->isActive());
}

void tst_HmiPropertyBoundFallbackViewState::theDestructionOfTheObjectKeepsTheActiveView()
{
    Bound bound;
    bound.flow.start(bound.view);

    bound.emitter.reset();
    bound.view->reevaluate();
    settle();

    QVERIFY(bound.view->isActive());
}

void tst_HmiPropertyBoundFallbackViewState::aDestroyedViewNoLongerListens()
{
    Emitter emitter;
    QScopedPointer<BoundView> view(
        new BoundView("View", "Fallback", &emitter, "value", {0}, nullptr, true));
    view.reset();

    emitter.setValue(2);

    QCOMPARE(NamedState::namedStates().size(), 0);
}

void tst_HmiPropertyBoundFallbackViewState::severalViewsMayWatchOneProperty()
{
    Bound bound;
    auto *second = bound.flow.add(new BoundView("Second", "View", bound.emitter.data(), "value",
                                                {2}, bound.flow.machine, true));
    bound.emitter->setValue(2);
    bound.flow.start(second);

    bound.emitter->setValue(1);
    settle();
    QVERIFY(bound.view->isActive());
    bound.emitter->setValue(2);
    settle();

    QVERIFY(bound.flow.fallback->isActive());
}

QTEST_GUILESS_MAIN(tst_HmiPropertyBoundFallbackViewState)
#include "tst_hmipropertyboundfallbackviewstate.moc"
