#include "interruptions.h"
#include "librarytest.h"
#include "recordingviewstatetarget.h"

#include <HmiStateMachine/popup/popupinterruptionstore.h>

#include <QFile>
#include <QtTest>

#include <algorithm>

using namespace HmiStateMachine;

namespace {

const QMap<QString, int> domains = {{"Phone", 1}, {"Navigation", 2}, {"Media", 3}};

constexpr char answers[] = "| In front | Requested | Answer |";
constexpr char blockings[] = "| Popup | Domain | Blocked |";

/** A row of a table, with the rules that stand above it. */
struct Row
{
    QString heading;
    QByteArray rules;
    QStringList cells;
};

QStringList cellsOf(const QString &line)
{
    QStringList cells;
    const auto parts = line.mid(1, line.size() - 2).split('|');
    for (const QString &part : parts) {
        cells.append(part.trimmed().remove('`'));
    }
    return cells;
}

/** The rows of all tables of the page that stand under rules in JSON. */
QList<Row> readRows(const QString &page)
{
    QList<Row> rows;
    QByteArray rules;
    QString heading;
    bool inRules = false;
    const auto lines = page.split('\n');
    for (const QString &line : lines) {
        if (line.startsWith("```")) {
            inRules = line == "```json";
            rules = inRules ? QByteArray() : rules;
        } else if (inRules) {
            rules += line.toUtf8() + '\n';
        } else if (line.startsWith('#')) {
            rules.clear();
        } else if (!line.startsWith('|')) {
            heading.clear();
        } else if (heading.isEmpty()) {
            heading = line;
        } else if (!line.startsWith("|---") && !rules.isEmpty()) {
            rows.append({heading, rules, cellsOf(line)});
        }
    }
    return rows;
}

QString textOf(PopupState::InterruptionBehavior behavior)
{
    return QStringList({"Prohibit", "Allow", "AllowStack", "AllowNoReturn"}).value(behavior);
}

} // namespace

/** What docs/popup-rules.md says of its examples, asked of the library. */
class tst_PopupRulesPage : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void behavesAsThePageSays_data();
    void behavesAsThePageSays();
    void blocksWhereThePageSays_data();
    void blocksWhereThePageSays();

private:
    void addRows(const QString &heading);

    QList<Row> m_rows;
};

void tst_PopupRulesPage::initTestCase()
{
    QFile page(HMI_POPUP_RULES_PAGE);
    QVERIFY(page.open(QIODevice::ReadOnly));
    m_rows = readRows(QString::fromUtf8(page.readAll()));
    for (const char *heading : {answers, blockings}) {
        const auto isUnder = [heading](const Row &row) { return row.heading == heading; };
        QVERIFY2(std::any_of(m_rows.cbegin(), m_rows.cend(), isUnder), heading);
    }
}

void tst_PopupRulesPage::addRows(const QString &heading)
{
    QTest::addColumn<QByteArray>("rules");
    QTest::addColumn<QStringList>("cells");
    int number = 0;
    for (const Row &row : qAsConst(m_rows)) {
        if (row.heading == heading) {
            QTest::addRow("%d: %s", ++number, qPrintable(row.cells.join(' ')))
                << row.rules << row.cells;
        }
    }
}

void tst_PopupRulesPage::behavesAsThePageSays_data()
{
    addRows(answers);
}

void tst_PopupRulesPage::behavesAsThePageSays()
{
    QFETCH(QByteArray, rules);
    QFETCH(QStringList, cells);
    PopupInterruptionStore store;
    QVERIFY(loadInterruptions(store, rules));

    QCOMPARE(textOf(store.getInterruptionBehavior(cells.value(0), cells.value(1))), cells.value(2));
}

void tst_PopupRulesPage::blocksWhereThePageSays_data()
{
    addRows(blockings);
}

void tst_PopupRulesPage::blocksWhereThePageSays()
{
    QFETCH(QByteArray, rules);
    QFETCH(QStringList, cells);
    Journal journal;
    RecordingViewStateTarget target(journal);
    target.setDomains(domains);
    PopupInterruptionStore store;
    QVERIFY(loadInterruptions(store, rules));
    QVERIFY(domains.contains(cells.value(1)));

    const bool blocked = store.isBlockedByDomain(cells.value(0), domains.value(cells.value(1)));

    QCOMPARE(QString(blocked ? "yes" : "no"), cells.value(2));
}

QTEST_GUILESS_MAIN(tst_PopupRulesPage)
#include "tst_popuprulespage.moc"
