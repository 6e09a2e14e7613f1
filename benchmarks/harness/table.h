#pragma once

#include <QStringList>
#include <QVector>

/** Cells of text under titles. */
struct Table
{
    struct Column
    {
        QString title;
        bool rightAligned;
    };

    QVector<Column> columns;
    QVector<QStringList> rows; ///< each with as many cells as there are columns
};

/** @p table for a terminal. */
QString asText(const Table &table);

/** @p table as Markdown. */
QString asMarkdown(const Table &table);
