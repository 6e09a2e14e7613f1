#pragma once

#include <QStringList>

/** What happened, one line an event, written by all fakes of a test in the order of the events. */
class Journal
{
public:
    void add(const QString &line) { m_lines.append(line); }
    QStringList lines() const { return m_lines; }
    void clear() { m_lines.clear(); }

private:
    QStringList m_lines;
};
