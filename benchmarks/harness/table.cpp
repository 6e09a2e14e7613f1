#include "table.h"

#include <algorithm>

namespace {

QStringList titles(const Table &table)
{
    QStringList result;
    for (const Table::Column &column : table.columns) {
        result.append(column.title);
    }
    return result;
}

QVector<int> widths(const Table &table)
{
    QVector<int> result;
    for (int column = 0; column < table.columns.size(); ++column) {
        int width = table.columns.at(column).title.size();
        for (const QStringList &row : table.rows) {
            width = std::max(width, row.at(column).size());
        }
        result.append(width);
    }
    return result;
}

QString textLine(const Table &table, const QVector<int> &widths, const QStringList &cells)
{
    QStringList padded;
    for (int column = 0; column < cells.size(); ++column) {
        const QString &cell = cells.at(column);
        padded.append(table.columns.at(column).rightAligned
                          ? cell.rightJustified(widths.at(column))
                          : cell.leftJustified(widths.at(column)));
    }
    QString line = padded.join(QStringLiteral("  "));
    while (line.endsWith(QLatin1Char(' '))) {
        line.chop(1);
    }
    return line + QLatin1Char('\n');
}

QString markdownLine(const QStringList &cells)
{
    return QStringLiteral("| %1 |\n").arg(cells.join(QStringLiteral(" | ")));
}

} // namespace

QString asText(const Table &table)
{
    const QVector<int> columnWidths = widths(table);
    QString text = textLine(table, columnWidths, titles(table));
    for (const QStringList &row : table.rows) {
        text += textLine(table, columnWidths, row);
    }
    return text;
}

QString asMarkdown(const Table &table)
{
    QString text = markdownLine(titles(table));
    QStringList alignments;
    for (const Table::Column &column : table.columns) {
        alignments.append(column.rightAligned ? QStringLiteral("---:") : QStringLiteral("---"));
    }
    text += markdownLine(alignments);
    for (const QStringList &row : table.rows) {
        text += markdownLine(row);
    }
    return text;
}
