#include "random/rulemaker.h"
#include "random/stores.h"

#include "explain/explanationtext.h"
#include "matrix/matrixtext.h"
#include "report/sitetext.h"
#include "report/visible.h"
#include "rules/libraryfacts.h"
#include "rules/names.h"

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QLoggingCategory>
#include <QRegularExpression>
#include <QtTest>

#include <algorithm>

using namespace HmiStateMachine;
using namespace hmirules;

namespace {

constexpr int defaultRuns = 12;

QString keyTaken(const std::vector<KeyTried> &keys)
{
    const auto taken =
        std::find_if(keys.cbegin(), keys.cend(), [](const KeyTried &key) { return key.isTaken; });
    return taken == keys.cend() ? QString() : taken->key;
}

// Whether the keys are those of a name, and the first with a site is the one that is taken.
bool areTriedInOrder(const std::vector<KeyTried> &keys, const QString &name)
{
    QStringList tried;
    QString first;
    int taken = 0;
    for (const KeyTried &key : keys) {
        tried.append(key.key);
        taken += key.isTaken ? 1 : 0;
        first = first.isEmpty() && !key.sites.empty() ? key.key : first;
    }
    return tried == keysOf(name) && keyTaken(keys) == first && taken == (first.isEmpty() ? 0 : 1);
}

/** Judges one explanation by the answers of the store. */
class ExplanationCheck
{
public:
    ExplanationCheck(const RuleBase &base, const Explanation &explanation)
        : m_base(base), m_explanation(explanation)
    {
    }

    bool areKeysRight() const
    {
        const QString entry = keyTaken(m_explanation.ruleKeys);
        return areTriedInOrder(m_explanation.ruleKeys, m_explanation.front)
            && areTriedInOrder(m_explanation.defaultKeys, m_explanation.front)
            && (entry.isEmpty()
                    ? m_explanation.targetKeys.empty()
                    : areTriedInOrder(m_explanation.targetKeys, m_explanation.requested));
    }

    bool isDecisionAtTakenKey() const
    {
        const int number = m_explanation.decision.site;
        const QString target = keyTaken(m_explanation.targetKeys);
        const QString byDefault = keyTaken(m_explanation.defaultKeys);
        if (number < 0) {
            return target.isEmpty() && byDefault.isEmpty();
        }
        const Site &site = m_base.site(number);
        return site.kind == Site::Rule
            ? site.popup == keyTaken(m_explanation.ruleKeys) && site.target == target
            : target.isEmpty() && site.popup == byDefault;
    }

    // Each would decide under its own key, and applies to the pair.
    bool areHiddenOnesRight() const
    {
        std::vector<int> seen = {m_explanation.decision.site};
        for (const HiddenSite &hidden : m_explanation.hidden) {
            const Site &site = m_base.site(hidden.site);
            const QString target = site.kind == Site::Rule ? site.target : unnamedPopup(m_base);
            if (std::count(seen.cbegin(), seen.cend(), hidden.site) > 0
                || m_base.decision(site.popup, target).site != hidden.site
                || !matches(site.popup, m_explanation.front)
                || (site.kind == Site::Rule && !matches(target, m_explanation.requested))) {
                return false;
            }
            seen.push_back(hidden.site);
        }
        return int(seen.size()) == countOfApplying() + (seen.front() < 0 ? 1 : 0);
    }

private:
    // All that could decide for the pair and is not lost to what stands later.
    int countOfApplying() const
    {
        int count = 0;
        int number = -1;
        for (const Site &site : m_base.sites()) {
            ++number;
            const bool isRule = site.kind == Site::Rule;
            const QString target = isRule ? site.target : unnamedPopup(m_base);
            const bool applies = (isRule || site.kind == Site::Default)
                && matches(site.popup, m_explanation.front)
                && (!isRule || matches(target, m_explanation.requested));
            count += applies && m_base.decision(site.popup, target).site == number ? 1 : 0;
        }
        return count;
    }

    const RuleBase &m_base;
    const Explanation &m_explanation;
};

bool isPlace(const QJsonValue &json, const RuleBase &base, int site)
{
    return site < 0 ? json.isNull()
                    : json["line"].toInt() == base.site(site).place.at.line
            && json["column"].toInt() == base.site(site).place.at.column
            && json["pointer"].toString() == base.site(site).place.pointer;
}

bool isJsonRight(const RuleBase &base, const Explanation &explanation)
{
    const QString text = explanationAsJson(base, explanation, {});
    const QJsonObject json = QJsonDocument::fromJson(text.toUtf8()).object();
    const QJsonArray hidden = json["hidden"].toArray();
    bool isRight = json["behavior"] == behaviorText(explanation.decision.behavior)
        && json["whileStacked"] == behaviorText(explanation.whileStacked)
        && isPlace(json["decidedBy"], base, explanation.decision.site)
        && hidden.size() == int(explanation.hidden.size());
    for (int i = 0; isRight && i < hidden.size(); ++i) {
        isRight = isPlace(hidden.at(i)["hidden"], base, explanation.hidden[unsigned(i)].site);
    }
    return isRight;
}

bool isTextRight(const RuleBase &base, const Explanation &explanation)
{
    const QString text = explanationAsText(base, explanation, {}, Paint(false));
    QStringList lines;
    for (const auto &keys :
         {explanation.ruleKeys, explanation.targetKeys, explanation.defaultKeys}) {
        for (const KeyTried &key : keys) {
            lines.append((key.isTaken ? "  * " : "    ") + visible(key.key));
        }
    }
    const auto isWritten = [&text](const QString &line) {
        return text.contains('\n' + line + ' ');
    };
    return std::all_of(lines.cbegin(), lines.cend(), isWritten)
        && text.section('\n', 0, 0)
               .endsWith("is requested: " + behaviorText(explanation.decision.behavior));
}

QString firstWrongExplanation(const RuleBase &base)
{
    const QStringList names = namesToAsk(base);
    for (const QString &front : names) {
        for (const QString &requested : names) {
            const Explanation explanation = explain(base, Inventory(), front, requested);
            const ExplanationCheck check(base, explanation);
            const Decision decision = base.decision(front, requested);
            if (explanation.decision.site != decision.site
                || explanation.decision.behavior != decision.behavior || !check.areKeysRight()
                || !check.isDecisionAtTakenKey() || !check.areHiddenOnesRight()
                || !isJsonRight(base, explanation) || !isTextRight(base, explanation)) {
                return pairText(front, requested);
            }
        }
    }
    return QString();
}

// Comma-separated values, of which a quoted one may contain anything.
QVector<QStringList> parsedCsv(const QString &text)
{
    QVector<QStringList> lines = {{QString()}};
    bool isQuoted = false;
    for (int i = 0; i < text.size(); ++i) {
        const QChar c = text.at(i);
        if (c == '"' && isQuoted && i + 1 < text.size() && text.at(i + 1) == '"') {
            lines.last().last() += text.at(i++);
        } else if (c == '"') {
            isQuoted = !isQuoted;
        } else if (c == ',' && !isQuoted) {
            lines.last().append(QString());
        } else if (c == '\n' && !isQuoted) {
            lines.append({QString()});
        } else {
            lines.last().last() += c;
        }
    }
    lines.removeLast();
    return lines;
}

/** Compares all that the matrix writes with the store's answers. */
class MatrixCheck
{
public:
    MatrixCheck(const RuleBase &base, const PopupInterruptionStore &store)
        : m_base(base), m_store(store), m_popups(populationOf(base, Inventory())),
          m_matrix(makeMatrix(base, m_popups))
    {
    }

    QString firstWrong() const
    {
        const QVector<QStringList> csv = parsedCsv(matrixAsCsv(m_base, m_matrix));
        const QVector<QStringList> grid = parsedGrid();
        if (csv.size() != 1 + m_popups.size() * m_popups.size() || grid.size() != m_popups.size()) {
            return "the number of lines";
        }
        for (int row = 0; row < m_popups.size(); ++row) {
            for (int column = 0; column < m_popups.size(); ++column) {
                const QStringList line = csv.at(1 + row * m_popups.size() + column);
                if (!isCellRight(row, column) || !isLineRight(line, row, column)
                    || !isLetterRight(grid.at(row).value(column), row, column)) {
                    return pairText(m_popups.at(row).name, m_popups.at(column).name);
                }
            }
        }
        return wrongBlocking();
    }

private:
    int answer(int row, int column) const
    {
        return m_store.getInterruptionBehavior(m_popups.at(row).name, m_popups.at(column).name);
    }

    const Decision &decision(int row, int column) const
    {
        return m_matrix.reasons[unsigned(m_matrix.cells[unsigned(row)][unsigned(column)])];
    }

    bool isCellRight(int row, int column) const
    {
        return decision(row, column).behavior == answer(row, column)
            && decision(row, column).site
            == m_base.decision(m_popups.at(row).name, m_popups.at(column).name).site;
    }

    bool isLineRight(const QStringList &line, int row, int column) const
    {
        const int number = decision(row, column).site;
        const Place place = number < 0 ? Place() : m_base.site(number).place;
        return line.size() == 9 && line.at(0) == m_popups.at(row).name
            && line.at(1) == m_popups.at(column).name
            && line.at(2) == behaviorText(answer(row, column))
            && line.at(4) == (number < 0 ? "" : fileName(m_base, place))
            && line.at(5) == (number < 0 ? "" : QString::number(place.at.line))
            && line.at(7) == place.pointer;
    }

    bool isLetterRight(const QString &cell, int row, int column) const
    {
        static const QMap<int, QChar> letters = {{-1, '!'}, {0, 'P'}, {1, 'A'}, {2, 'S'}, {3, 'N'}};
        const QChar letter = cell.isEmpty() ? QChar() : cell.at(0);
        return decision(row, column).site < 0
            ? letter == '-' && answer(row, column) == 1
            : letter.toUpper() == letters.value(answer(row, column));
    }

    // The cells of each row, cut at the numbers of the heading.
    QVector<QStringList> parsedGrid() const
    {
        QStringList lines = matrixAsText(m_base, m_matrix, Paint(false)).split('\n');
        lines = lines.mid(lines.indexOf(QString()) + 1);
        QVector<int> begins;
        auto number = QRegularExpression("\\d+").globalMatch(lines.takeFirst());
        while (number.hasNext()) {
            begins.append(number.next().capturedStart());
        }
        QVector<QStringList> grid;
        while (!lines.isEmpty() && !lines.first().isEmpty()) {
            const QString line = lines.takeFirst();
            QStringList cells;
            for (const int begin : begins) {
                cells.append(line.mid(begin).section(' ', 0, 0));
            }
            grid.append(cells);
        }
        return grid;
    }

    QString wrongBlocking() const
    {
        QVector<QStringList> csv = parsedCsv(blockingAsCsv(m_base, m_matrix));
        csv.removeFirst();
        QVector<QStringList> told;
        for (const QStringList &line : csv) {
            told.append(line.mid(1, 3));
        }
        for (const auto kind : {Site::DomainBlacklist, Site::ViewBlacklist}) {
            const QString word = kind == Site::DomainBlacklist ? "domain" : "view";
            for (const Individual &popup : m_popups) {
                for (const QString &where : placesToAsk(m_base, kind)) {
                    const int lines = told.count({popup.viewId, word, where});
                    if (lines != (isBlocked(m_store, popup.viewId, where, kind) ? 1 : 0)) {
                        return '"' + popup.viewId + "\" in \"" + where + '"';
                    }
                }
            }
        }
        return QString();
    }

    const RuleBase &m_base;
    const PopupInterruptionStore &m_store;
    QList<Individual> m_popups;
    Matrix m_matrix;
};

} // namespace

class tst_RulesPropertyReports : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void explanationsAreWhatTheStoreDecides_data();
    void explanationsAreWhatTheStoreDecides();
    void theMatrixIsWhatTheStoreAnswers_data();
    void theMatrixIsWhatTheStoreAnswers();
};

void tst_RulesPropertyReports::initTestCase()
{
    QLoggingCategory::setFilterRules("vosk.hmistatemachine=false");
}

void tst_RulesPropertyReports::explanationsAreWhatTheStoreDecides_data()
{
    addSeedRows();
}

void tst_RulesPropertyReports::explanationsAreWhatTheStoreDecides()
{
    QFETCH(quint32, seed);
    Random random(seed);
    const int runs = numberOfSteps(defaultRuns);

    for (int run = 1; run <= runs; ++run) {
        const QList<QByteArray> contents = randomFiles(&random, 2);

        const QString wrong = firstWrongExplanation(RuleBase(filesOf(contents)));

        QVERIFY2(wrong.isEmpty(), reproduction(seed, run, wrong, contents));
    }
}

void tst_RulesPropertyReports::theMatrixIsWhatTheStoreAnswers_data()
{
    addSeedRows();
}

void tst_RulesPropertyReports::theMatrixIsWhatTheStoreAnswers()
{
    QFETCH(quint32, seed);
    Random random(seed);
    const int runs = 4 * numberOfSteps(defaultRuns);

    for (int run = 0; run < runs; ++run) {
        const QList<QByteArray> contents = randomFiles(&random, 3);
        const RuleBase base(filesOf(contents));
        const auto store = loaded(contents);

        const QString wrong = MatrixCheck(base, *store).firstWrong();

        QVERIFY2(wrong.isEmpty(), reproduction(seed, 1 + run / 4, wrong, contents));
    }
}

QTEST_GUILESS_MAIN(tst_RulesPropertyReports)
#include "tst_rulespropertyreports.moc"
