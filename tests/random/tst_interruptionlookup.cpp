#include "interruptions.h"
#include "journal.h"
#include "librarytest.h"
#include "recordingviewstatetarget.h"
#include "seeds.h"

#include <HmiStateMachine/internal/rulename.h>
#include <HmiStateMachine/popup/popupinterruptionstore.h>

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QtTest>

#include <algorithm>
#include <memory>

using namespace HmiStateMachine;

namespace {

constexpr int defaultSteps = 5000;
constexpr int stepsOfAStore = 150;
constexpr int listedCount = 3;

const char *const behaviors[] = {"Prohibit", "Allow", "AllowStack", "AllowNoReturn", "Nonsense"};

/** The two wildcards of a name in the order in which they answer; none without a slash. */
QStringList wildCards(const QString &name)
{
    const QStringList parts = name.split('/');
    return parts.size() < 2 ? QStringList() : QStringList({"*/" + parts.at(1), parts.at(0) + "/*"});
}

/** The entry that answers for @p name; null when there is none. */
template <typename Value>
const Value *lookUp(const QHash<QString, Value> &table, const QString &name)
{
    const QStringList keys = QStringList(name) + wildCards(name);
    for (const QString &key : keys) {
        const auto found = table.constFind(key);
        if (found != table.constEnd()) {
            return &found.value();
        }
    }
    return nullptr;
}

/** The rules in plain tables, in which each wildcard is looked up as it is written. */
struct PlainRules
{
    int behavior(const QString &popup, const QString &target) const
    {
        const auto *table = lookUp(rules, popup);
        const int *rule = table ? lookUp(*table, target) : nullptr;
        const int *answer = rule ? rule : lookUp(defaults, popup);
        return answer ? *answer : PopupState::Allow;
    }

    static bool isListed(const QHash<QString, QStringList> &lists, const QString &popup,
                         const QString &item)
    {
        const QStringList *list = lookUp(lists, popup);
        return list && list->contains(item);
    }

    QHash<QString, QHash<QString, int>> rules;
    QHash<QString, int> defaults;
    QHash<QString, QStringList> domains;
    QHash<QString, QStringList> views;
};

/** Names of few parts, so that most rules have to do with most names. */
class RandomNames
{
public:
    explicit RandomNames(quint32 seed) : random(seed) { }

    QString next()
    {
        if (random.oneIn(4)) {
            return longName();
        }
        static const QStringList parts = {"", "a", "b", "ab", "*", "a*"};
        static const int slashes[] = {0, 1, 1, 1, 1, 1, 2, 3};
        QStringList result;
        for (int count = slashes[random.below(8)]; count >= 0; --count) {
            result.append(parts.at(random.below(parts.size())));
        }
        return result.join('/');
    }

    /** Up to two of "0", "1", "2". */
    QStringList list()
    {
        QStringList result;
        for (int count = random.below(3); count > 0; --count) {
            result.append(QString::number(random.below(listedCount)));
        }
        return result;
    }

    Random random;

private:
    // Longer than what is hashed at once, and mostly different in one character alone.
    QString longName()
    {
        QString module = "navigation";
        QString popup = "trafficmessage";
        QString &changed = random.oneIn(2) ? module : popup;
        changed[random.below(changed.size())] = QLatin1Char("xy/*"[random.below(4)]);
        switch (random.below(4)) {
        case 0:
            return "*/" + popup;
        case 1:
            return module + "/*";
        default:
            return module + '/' + popup;
        }
    }
};

/** A store that is given rules and asked questions at random, beside plain tables. */
class RandomStore
{
public:
    explicit RandomStore(quint32 seed) : m_names(seed)
    {
        m_target.setDomains({{"0", 0}, {"1", 1}, {"2", 2}});
    }

    /** Adds something; false when that cannot be written to a file. */
    bool step()
    {
        if (m_names.random.oneIn(stepsOfAStore)) {
            m_store = std::make_unique<PopupInterruptionStore>();
            m_plain = PlainRules();
        }
        switch (m_names.random.below(6)) {
        case 0:
            return addDefault(m_names.next());
        case 1:
            return addLists(m_names.next());
        default:
            addRule(m_names.next(), m_names.next());
            return true;
        }
    }

    /** Asks about some names; empty when all answers are those of the plain tables. */
    QString firstWrongAnswer()
    {
        for (int count = m_names.random.below(6); count > 0; --count) {
            const QString popup = m_names.next();
            const QString target = m_names.next();
            if (m_store->getInterruptionBehavior(popup, target)
                != m_plain.behavior(popup, target)) {
                return QString("\"%1\" being asked for \"%2\"").arg(popup, target);
            }
            const int number = m_names.random.below(listedCount);
            const QString item = QString::number(number);
            if (m_store->isBlockedByDomain(popup, number)
                != PlainRules::isListed(m_plain.domains, popup, item)) {
                return QString("\"%1\" in the domain %2").arg(popup, item);
            }
            if (m_store->isBlockedByView(popup, item)
                != PlainRules::isListed(m_plain.views, popup, item)) {
                return QString("\"%1\" on the view %2").arg(popup, item);
            }
        }
        return QString();
    }

private:
    void addRule(const QString &popup, const QString &target)
    {
        const int behavior = m_names.random.below(4);
        m_store->insertInterruptionBehavior(static_cast<PopupState::InterruptionBehavior>(behavior),
                                            popup, target);
        m_plain.rules[popup].insert(target, behavior);
    }

    bool addDefault(const QString &popup)
    {
        if (popup.isEmpty()) {
            return true; // is refused in a file
        }
        const int number = m_names.random.below(5);
        m_plain.defaults.insert(popup, number < 4 ? number : -1);
        return load({{"popup", popup}, {"default", behaviors[number]}});
    }

    bool addLists(const QString &popup)
    {
        if (popup.isEmpty()) {
            return true;
        }
        const QStringList domains = m_names.list();
        const QStringList views = m_names.list();
        if (!domains.isEmpty()) {
            m_plain.domains.insert(popup, domains);
        }
        if (!views.isEmpty()) {
            m_plain.views.insert(popup, views);
        }
        return load({{"popup", popup},
                     {"domainBlacklist", QJsonArray::fromStringList(domains)},
                     {"viewBlacklist", QJsonArray::fromStringList(views)}});
    }

    bool load(const QJsonObject &entry)
    {
        return loadInterruptions(*m_store, QJsonDocument(QJsonArray({entry})).toJson());
    }

    Journal m_journal;
    RecordingViewStateTarget m_target{m_journal};
    RandomNames m_names;
    std::unique_ptr<PopupInterruptionStore> m_store = std::make_unique<PopupInterruptionStore>();
    PlainRules m_plain;
};

/** Texts of one length that, put into @p entry, have the same hash; a handful among so many. */
QVector<QPair<QString, QString>> partsOfOneHash(const QString &entry)
{
    constexpr int first = 100000;
    constexpr int last = 399999;
    QHash<uint, QString> byHash;
    byHash.reserve(last - first + 1);
    QVector<QPair<QString, QString>> result;
    for (int number = first; number <= last; ++number) {
        const QString part = QString::number(number);
        QString &other = byHash[qHash(RuleName(entry.arg(part)))];
        if (!other.isEmpty()) {
            result.append({other, part});
        }
        other = part;
    }
    return result;
}

} // namespace

class tst_InterruptionLookup : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void everyAnswerIsThatOfPlainTables_data();
    void everyAnswerIsThatOfPlainTables();
    void theWildCardsOfANameAreItsParts_data();
    void theWildCardsOfANameAreItsParts();
    void namesOfOneHashAreToldApart_data();
    void namesOfOneHashAreToldApart();
    void aNameWithTheHashOfAWildCardIsNone_data();
    void aNameWithTheHashOfAWildCardIsNone();
    void namesThatDifferInOneCharacterSpreadOverTheTable_data();
    void namesThatDifferInOneCharacterSpreadOverTheTable();
    void namesThatDifferInEveryFourthCharacterHaveHashesOfTheirOwn_data();
    void namesThatDifferInEveryFourthCharacterHaveHashesOfTheirOwn();
};

void tst_InterruptionLookup::everyAnswerIsThatOfPlainTables_data()
{
    addSeedRows();
}

void tst_InterruptionLookup::everyAnswerIsThatOfPlainTables()
{
    QFETCH(quint32, seed);
    RandomStore store(seed);
    const int steps = numberOfSteps(defaultSteps);

    for (int step = 1; step <= steps; ++step) {
        QVERIFY(store.step());
        const QString wrong = store.firstWrongAnswer();

        QVERIFY2(wrong.isEmpty(),
                 qPrintable(QString("HMI_RANDOM_SEED=%1 HMI_RANDOM_STEPS=%2: wrong answer to %3")
                                .arg(seed)
                                .arg(step)
                                .arg(wrong)));
    }
}

void tst_InterruptionLookup::theWildCardsOfANameAreItsParts_data()
{
    addSeedRows();
}

void tst_InterruptionLookup::theWildCardsOfANameAreItsParts()
{
    QFETCH(quint32, seed);
    RandomNames names(seed);

    for (int count = 0; count < defaultSteps; ++count) {
        const QString name = names.next();
        const QStringList expected = wildCards(name);

        QCOMPARE(extractPopupWildCard(name), expected.value(0));
        QCOMPARE(extractModuleWildCard(name), expected.value(1));
    }
}

void tst_InterruptionLookup::namesOfOneHashAreToldApart_data()
{
    QTest::addColumn<QString>("entry");
    QTest::addColumn<QString>("question");

    QTest::newRow("names") << "module/%1"
                           << "module/%1";
    QTest::newRow("a popup of any module") << "*/%1"
                                           << "module/%1";
    QTest::newRow("any popup of a module") << "%1/*"
                                           << "%1/popup";
}

void tst_InterruptionLookup::namesOfOneHashAreToldApart()
{
    QFETCH(QString, entry);
    QFETCH(QString, question);
    const auto pairs = partsOfOneHash(entry);
    QVERIFY(!pairs.isEmpty());

    for (const auto &pair : pairs) {
        PopupInterruptionStore store;
        store.insertInterruptionBehavior(PopupState::Prohibit, entry.arg(pair.first), "called");
        store.insertInterruptionBehavior(PopupState::AllowStack, "shown", entry.arg(pair.first));

        QCOMPARE(store.getInterruptionBehavior(question.arg(pair.first), "called"),
                 PopupState::Prohibit);
        QCOMPARE(store.getInterruptionBehavior(question.arg(pair.second), "called"),
                 PopupState::Allow);
        QCOMPARE(store.getInterruptionBehavior("shown", question.arg(pair.first)),
                 PopupState::AllowStack);
        QCOMPARE(store.getInterruptionBehavior("shown", question.arg(pair.second)),
                 PopupState::Allow);
    }
}

// Found by trial: these have the hash of the wildcard, and its fixed part in the same place.
// Another hash, or another order of bytes, needs others.
void tst_InterruptionLookup::aNameWithTheHashOfAWildCardIsNone_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<QString>("wildCard");
    QTest::addColumn<QString>("question");

    QTest::newRow("a popup of any module") << "pqakziop"
                                           << "*/akziop"
                                           << "module/akziop";
    QTest::newRow("any popup of a module") << "aulamyfo"
                                           << "aulamy/*"
                                           << "aulamy/popup";
}

void tst_InterruptionLookup::aNameWithTheHashOfAWildCardIsNone()
{
    QFETCH(QString, name);
    QFETCH(QString, wildCard);
    QFETCH(QString, question);
    PopupInterruptionStore store;
    QCOMPARE(qHash(RuleName(name)), qHash(RuleName(wildCard)));

    store.insertInterruptionBehavior(PopupState::Prohibit, name, "called");
    QCOMPARE(store.getInterruptionBehavior(question, "called"), PopupState::Allow);

    store.insertInterruptionBehavior(PopupState::AllowStack, wildCard, "called");
    QCOMPARE(store.getInterruptionBehavior(question, "called"), PopupState::AllowStack);
    QCOMPARE(store.getInterruptionBehavior(name, "called"), PopupState::Prohibit);
}

void tst_InterruptionLookup::namesThatDifferInOneCharacterSpreadOverTheTable_data()
{
    QTest::addColumn<QString>("before");
    QTest::addColumn<QString>("after");

    QTest::newRow("names") << ""
                           << "";
    QTest::newRow("a popup of any module") << "*/"
                                           << "";
    QTest::newRow("any popup of a module") << ""
                                           << "/*";
}

void tst_InterruptionLookup::namesThatDifferInOneCharacterSpreadOverTheTable()
{
    QFETCH(QString, before);
    QFETCH(QString, after);
    const QString longest = "the traffic messages of this navigation.";
    constexpr int buckets = 13007; // a prime of about the number of names
    QSet<uint> hashes;
    QVector<int> fill(buckets, 0);
    int count = 0;

    for (int length = 1; length <= longest.size(); ++length) {
        for (int place = 0; place < length; ++place) {
            for (ushort letter = 'A'; letter < 'A' + 16; ++letter) {
                QString text = longest.left(length);
                text[place] = QChar(letter);
                const uint hash = qHash(RuleName(before + text + after));
                hashes.insert(hash);
                ++fill[static_cast<int>(hash % buckets)];
                ++count;
            }
        }
    }

    // As of numbers thrown at random: hardly two are the same, and no bucket is full.
    QCOMPARE(count, 13120);
    QVERIFY2(hashes.size() >= count - 2, qPrintable(QString::number(hashes.size())));
    const int fullest = *std::max_element(fill.cbegin(), fill.cend());
    QVERIFY2(fullest <= 12, qPrintable(QString::number(fullest)));
}

void tst_InterruptionLookup::namesThatDifferInEveryFourthCharacterHaveHashesOfTheirOwn_data()
{
    QTest::addColumn<int>("first");

    QTest::newRow("from the first on") << 0;
    QTest::newRow("from the second on") << 1;
    QTest::newRow("from the third on") << 2;
    QTest::newRow("from the fourth on") << 3;
}

// Four characters are hashed at once: differences in the same place of each may not cancel out.
void tst_InterruptionLookup::namesThatDifferInEveryFourthCharacterHaveHashesOfTheirOwn()
{
    QFETCH(int, first);
    const QString letters = "ABCDEFGHIJKLMNOPQRSTUVW";
    QString name = "the traffic news";
    QSet<uint> hashes;
    int count = 0;

    for (const QChar one : letters) {
        for (const QChar two : letters) {
            for (const QChar three : letters) {
                name[first] = one;
                name[first + 4] = two;
                name[first + 8] = three;
                hashes.insert(qHash(RuleName(name)));
                ++count;
            }
        }
    }

    QCOMPARE(count, 12167);
    QVERIFY2(hashes.size() >= count - 2, qPrintable(QString::number(hashes.size())));
}

QTEST_GUILESS_MAIN(tst_InterruptionLookup)
#include "tst_interruptionlookup.moc"
