#include "librarytest.h"
#include "metadescription.h"

#include <HmiStateMachineQuick/popuplistmodel.h>

#include <QAbstractItemModelTester>
#include <QtTest>

using namespace HmiStateMachine;

Q_DECLARE_METATYPE(PopupEntry)

namespace {

PopupEntry entryOf(const QString &id, int kind = 1)
{
    PopupEntry entry;
    entry.popupId = id;
    entry.kind = kind;
    return entry;
}

QStringList idsIn(const PopupListModel &model)
{
    QStringList ids;
    for (int row = 0; row < model.count(); ++row) {
        ids.append(model.entry(row).popupId);
    }
    return ids;
}

/** A list of "Fuel", "Call" and "Oil" whose changes are checked and counted. */
struct Popups
{
    Popups()
    {
        for (const char *id : {"Fuel", "Call", "Oil"}) {
            model.raise(entryOf(id));
        }
        counts.clear();
        changes.clear();
    }

    PopupListModel model;
    QAbstractItemModelTester tester{&model, QAbstractItemModelTester::FailureReportingMode::QtTest};
    QSignalSpy counts{&model, &PopupListModel::countChanged};
    QSignalSpy changes{&model, &QAbstractItemModel::dataChanged};
};

} // namespace

class tst_PopupListModel : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void itsMetaObjectIsAsPublished();
    void itsRolesAreNamedAsInQml();
    void aRowAnswersEachRole_data();
    void aRowAnswersEachRole();
    void anotherRoleHasNoValue();
    void whatIsNotThereHasNoValue();
    void aNewPopupComesOnTop();
    void aPopupBelowIsRaised();
    void thePopupOnTopIsReplaced();
    void anUpdateTellsTheRolesThatChanged_data();
    void anUpdateTellsTheRolesThatChanged();
    void anUpdateWithoutAChangeTellsNothing();
    void anUpdateOfAnUnknownPopupDoesNothing();
    void aPopupIsRemoved();
    void anUnknownPopupIsNotRemoved();
    void aRowIsAMapForScripts();
};

void tst_PopupListModel::itsMetaObjectIsAsPublished()
{
    QCOMPARE(metaDescription(PopupListModel::staticMetaObject),
             QStringList({"signal countChanged()", "method indexOf(QString popupId)",
                          "method get(int row)", "property int count read countChanged()",
                          "enum Role"}));
    QCOMPARE(PopupListModel::staticMetaObject.superClass(), &QAbstractListModel::staticMetaObject);
}

void tst_PopupListModel::itsRolesAreNamedAsInQml()
{
    const PopupListModel model;

    const QHash<int, QByteArray> expected{
        {257, "popupId"},       {258, "kind"},      {259, "popupData"}, {260, "layer"},
        {261, "remainingTime"}, {262, "totalTime"}, {263, "covered"}};
    QCOMPARE(model.roleNames(), expected);
}

void tst_PopupListModel::aRowAnswersEachRole_data()
{
    QTest::addColumn<int>("role");
    QTest::addColumn<QVariant>("value");

    QTest::newRow("popupId") << int(PopupListModel::PopupIdRole) << QVariant("Fuel");
    QTest::newRow("kind") << int(PopupListModel::KindRole) << QVariant(4);
    QTest::newRow("popupData") << int(PopupListModel::PopupDataRole) << QVariant("low");
    QTest::newRow("layer") << int(PopupListModel::LayerRole) << QVariant("Screens");
    QTest::newRow("remainingTime") << int(PopupListModel::RemainingTimeRole) << QVariant(1200);
    QTest::newRow("totalTime") << int(PopupListModel::TotalTimeRole) << QVariant(5000);
    QTest::newRow("covered") << int(PopupListModel::CoveredRole) << QVariant(true);
}

void tst_PopupListModel::aRowAnswersEachRole()
{
    QFETCH(int, role);
    PopupListModel model;

    model.raise({"Fuel", 4, "low", "Screens", 1200, 5000, true});

    QTEST(model.data(model.index(0), role), "value");
}

void tst_PopupListModel::anotherRoleHasNoValue()
{
    Popups popups;

    QCOMPARE(popups.model.data(popups.model.index(0), Qt::DisplayRole), QVariant());
}

void tst_PopupListModel::whatIsNotThereHasNoValue()
{
    Popups popups;

    QCOMPARE(popups.model.rowCount(popups.model.index(0)), 0);
    QCOMPARE(popups.model.indexOf("Door"), -1);
    QCOMPARE(popups.model.entry(-1).popupId, QString());
    QCOMPARE(popups.model.entry(3).popupId, QString());
    QCOMPARE(popups.model.entry(3).kind, -1);
    QCOMPARE(popups.model.get(-1), QVariantMap());
    QCOMPARE(popups.model.get(3), QVariantMap());
}

void tst_PopupListModel::aNewPopupComesOnTop()
{
    Popups popups;

    popups.model.raise(entryOf("Door"));

    QCOMPARE(idsIn(popups.model), QStringList({"Fuel", "Call", "Oil", "Door"}));
    QCOMPARE(popups.model.count(), 4);
    QCOMPARE(popups.model.indexOf("Door"), 3);
    QCOMPARE(popups.counts.size(), 1);
}

void tst_PopupListModel::aPopupBelowIsRaised()
{
    Popups popups;

    popups.model.raise(entryOf("Fuel", 7));

    QCOMPARE(idsIn(popups.model), QStringList({"Call", "Oil", "Fuel"}));
    QCOMPARE(popups.model.entry(2).kind, 7);
    QCOMPARE(popups.changes.size(), 0);
}

void tst_PopupListModel::thePopupOnTopIsReplaced()
{
    Popups popups;

    popups.model.raise(entryOf("Oil", 7));

    QCOMPARE(idsIn(popups.model), QStringList({"Fuel", "Call", "Oil"}));
    QCOMPARE(popups.model.entry(2).kind, 7);
    QCOMPARE(popups.counts.size(), 0);
    QCOMPARE(popups.changes.size(), 1);
}

void tst_PopupListModel::anUpdateTellsTheRolesThatChanged_data()
{
    QTest::addColumn<PopupEntry>("entry");
    QTest::addColumn<QVector<int>>("roles");

    QTest::newRow("kind") << PopupEntry{"Call", 7, QVariant(), "", 0, 0, false}
                          << QVector<int>{258};
    QTest::newRow("data") << PopupEntry{"Call", 1, "ringing", "", 0, 0, false} << QVector<int>{259};
    QTest::newRow("layer") << PopupEntry{"Call", 1, QVariant(), "Screens", 0, 0, false}
                           << QVector<int>{260};
    QTest::newRow("times") << PopupEntry{"Call", 1, QVariant(), "", 10, 20, false}
                           << QVector<int>{261, 262};
    QTest::newRow("covered") << PopupEntry{"Call", 1, QVariant(), "", 0, 0, true}
                             << QVector<int>{263};
}

void tst_PopupListModel::anUpdateTellsTheRolesThatChanged()
{
    QFETCH(PopupEntry, entry);
    Popups popups;

    popups.model.update(entry);

    QCOMPARE(popups.changes.size(), 1);
    QCOMPARE(popups.changes.first().at(0).toModelIndex().row(), 1);
    QCOMPARE(popups.changes.first().at(1).toModelIndex().row(), 1);
    QTEST(popups.changes.first().at(2).value<QVector<int>>(), "roles");
}

void tst_PopupListModel::anUpdateWithoutAChangeTellsNothing()
{
    Popups popups;

    popups.model.update(entryOf("Call"));

    QCOMPARE(popups.changes.size(), 0);
}

void tst_PopupListModel::anUpdateOfAnUnknownPopupDoesNothing()
{
    Popups popups;

    popups.model.update(entryOf("Door"));

    QCOMPARE(idsIn(popups.model), QStringList({"Fuel", "Call", "Oil"}));
    QCOMPARE(popups.changes.size(), 0);
}

void tst_PopupListModel::aPopupIsRemoved()
{
    Popups popups;
    QSignalSpy removed(&popups.model, &QAbstractItemModel::rowsRemoved);
    QVERIFY(removed.isValid());

    QVERIFY(popups.model.remove("Call"));

    QCOMPARE(removed.size(), 1);
    QCOMPARE(removed.first().at(1).toInt(), 1);
    QCOMPARE(removed.first().at(2).toInt(), 1);
    QCOMPARE(idsIn(popups.model), QStringList({"Fuel", "Oil"}));
    QCOMPARE(popups.counts.size(), 1);
}

void tst_PopupListModel::anUnknownPopupIsNotRemoved()
{
    Popups popups;

    QVERIFY(!popups.model.remove("Door"));

    QCOMPARE(popups.model.count(), 3);
    QCOMPARE(popups.counts.size(), 0);
}

void tst_PopupListModel::aRowIsAMapForScripts()
{
    PopupListModel model;

    model.raise({"Fuel", 4, "low", "Screens", 1200, 5000, true});

    QCOMPARE(model.get(0),
             QVariantMap({{"popupId", "Fuel"},
                          {"kind", 4},
                          {"popupData", "low"},
                          {"layer", "Screens"},
                          {"remainingTime", 1200},
                          {"totalTime", 5000},
                          {"covered", true}}));
}

QTEST_MAIN(tst_PopupListModel)
#include "tst_popuplistmodel.moc"
