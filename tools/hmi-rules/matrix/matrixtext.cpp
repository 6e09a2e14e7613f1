#include "matrixtext.h"

#include "report/sitetext.h"
#include "report/visible.h"
#include "rules/libraryfacts.h"

#include <HmiStateMachine/popup/popupstate.h>

#include <algorithm>

using HmiStateMachine::PopupState;

namespace hmirules {

namespace {

constexpr char legend[] =
    "P Prohibit, A Allow, S AllowStack, N AllowNoReturn, ! an invalid default; "
    "capital by a rule,\nsmall by a default, with the line; - nothing says "
    "anything: Allow. Row: in front. Column: requested.\n";

QChar letterOf(const RuleBase &base, const Decision &decision)
{
    if (decision.site < 0) {
        return '-';
    }
    QChar letter = '!';
    switch (decision.behavior) {
    case PopupState::Prohibit:
        letter = 'P';
        break;
    case PopupState::Allow:
        letter = 'A';
        break;
    case PopupState::AllowStack:
        letter = 'S';
        break;
    case PopupState::AllowNoReturn:
        letter = 'N';
        break;
    default:
        break;
    }
    return base.site(decision.site).kind == Site::Rule ? letter : letter.toLower();
}

/** Writes the grid and what stands below it. */
class GridWriter
{
public:
    GridWriter(const RuleBase &base, const Matrix &matrix, const Paint &paint)
        : m_base(base), m_matrix(matrix), m_paint(paint)
    {
        for (const Decision &reason : matrix.reasons) {
            m_cells.append(cellText(reason));
            m_cellWidth = std::max(m_cellWidth, m_cells.last().size());
        }
        m_numberWidth = QString::number(matrix.popups.size()).size();
        m_cellWidth = std::max(m_cellWidth, m_numberWidth);
        for (const Individual &popup : matrix.popups) {
            m_nameWidth = std::max(m_nameWidth, visible(popup.name).size());
        }
    }

    QString write()
    {
        writeLegend();
        writeHeading();
        for (int row = 0; row < m_matrix.popups.size(); ++row) {
            writeRow(row);
        }
        writeBlocking();
        return std::move(m_text);
    }

private:
    QString cellText(const Decision &decision) const
    {
        QString text = letterOf(m_base, decision);
        if (decision.site >= 0) {
            const Place &place = m_base.site(decision.site).place;
            const bool isOnlyFile = m_base.files().size() == 1;
            text += isOnlyFile ? QString() : QString("%1:").arg(place.file + 1);
            text += QString::number(place.at.line);
        }
        return text;
    }

    void writeLegend()
    {
        m_text += legend;
        if (m_base.files().size() > 1) {
            int number = 1;
            for (const RuleFile &file : m_base.files()) {
                m_text += QString("%1: %2\n").arg(number++).arg(visible(file.name()));
            }
        }
        m_text += '\n';
    }

    void writeHeading()
    {
        m_text += QString(m_numberWidth + 1 + m_nameWidth, ' ');
        for (int column = 1; column <= m_matrix.popups.size(); ++column) {
            m_text += ' ' + QString::number(column).leftJustified(m_cellWidth);
        }
        m_text = trimmedRight(m_text) + '\n';
    }

    void writeRow(int row)
    {
        QString line = QString("%1 %2")
                           .arg(row + 1, m_numberWidth)
                           .arg(visible(m_matrix.popups.at(row).name), -m_nameWidth);
        for (const int reason : m_matrix.cells[static_cast<std::size_t>(row)]) {
            const QString &cell = m_cells.at(reason);
            const Decision &decision = m_matrix.reasons[static_cast<std::size_t>(reason)];
            const QString painted =
                decision.site < 0 ? m_paint.faint(cell) : m_paint.behavior(decision.behavior, cell);
            line += ' ' + painted + QString(m_cellWidth - cell.size(), ' ');
        }
        m_text += trimmedRight(line) + '\n';
    }

    void writeBlocking()
    {
        QString text;
        for (int row = 0; row < m_matrix.popups.size(); ++row) {
            const auto at = static_cast<std::size_t>(row);
            text += blockingLine(row, "in the domains", m_matrix.domains[at]);
            text += blockingLine(row, "by the views", m_matrix.views[at]);
        }
        if (!text.isEmpty()) {
            m_text += "\nBlocked\n" + text;
        }
    }

    QString blockingLine(int row, const QString &where, const BlockedIn &blocked) const
    {
        if (blocked.names.isEmpty()) {
            return QString();
        }
        return QString("    %1 %2 %3 (%4)\n")
            .arg(visible(m_matrix.popups.at(row).viewId), where, visible(blocked.names.join(", ")),
                 sitePlace(m_base, m_base.site(blocked.site)));
    }

    static QString trimmedRight(QString text)
    {
        while (text.endsWith(' ')) {
            text.chop(1);
        }
        return text;
    }

    const RuleBase &m_base;
    const Matrix &m_matrix;
    const Paint &m_paint;
    QStringList m_cells; ///< by reason
    int m_cellWidth = 0;
    int m_numberWidth = 0;
    int m_nameWidth = 0;
    QString m_text;
};

QString field(QString text)
{
    const bool needsQuotes =
        text.contains(',') || text.contains('"') || text.contains('\n') || text.contains('\r');
    return needsQuotes ? '"' + text.replace('"', "\"\"") + '"' : text;
}

QString placeFields(const RuleBase &base, int site)
{
    if (site < 0) {
        return ",,,";
    }
    const Place &place = base.site(site).place;
    return field(fileName(base, place)) + QString(",%1,%2,").arg(place.at.line).arg(place.at.column)
        + field(place.pointer);
}

QString decidedBy(const RuleBase &base, const Decision &decision)
{
    if (decision.site < 0) {
        return "none";
    }
    return base.site(decision.site).kind == Site::Rule ? "rule" : "default";
}

QString blockingLines(const RuleBase &base, const Individual &popup, const QString &kind,
                      const BlockedIn &blocked)
{
    QString text;
    for (const QString &name : blocked.names) {
        text += field(popup.name) + ',' + field(popup.viewId) + ',' + kind + ',' + field(name) + ','
            + placeFields(base, blocked.site) + '\n';
    }
    return text;
}

} // namespace

QString matrixAsText(const RuleBase &base, const Matrix &matrix, const Paint &paint)
{
    return GridWriter(base, matrix, paint).write();
}

QString matrixAsCsv(const RuleBase &base, const Matrix &matrix)
{
    QStringList ends;
    for (const Decision &reason : matrix.reasons) {
        ends.append(behaviorText(reason.behavior) + ',' + decidedBy(base, reason) + ','
                    + placeFields(base, reason.site) + ',' + field(reasonText(base, reason))
                    + '\n');
    }
    QString text = "front,requested,behavior,decided by,file,line,column,pointer,reason\n";
    for (int row = 0; row < matrix.popups.size(); ++row) {
        for (int column = 0; column < matrix.popups.size(); ++column) {
            const int reason =
                matrix.cells[static_cast<std::size_t>(row)][static_cast<std::size_t>(column)];
            text += field(matrix.popups.at(row).name) + ',' + field(matrix.popups.at(column).name)
                + ',' + ends.at(reason);
        }
    }
    return text;
}

QString blockingAsCsv(const RuleBase &base, const Matrix &matrix)
{
    QString text = "popup,popup view id,kind,blocked,file,line,column,pointer\n";
    for (int row = 0; row < matrix.popups.size(); ++row) {
        const auto at = static_cast<std::size_t>(row);
        text += blockingLines(base, matrix.popups.at(row), "domain", matrix.domains[at]);
        text += blockingLines(base, matrix.popups.at(row), "view", matrix.views[at]);
    }
    return text;
}

} // namespace hmirules
