#pragma once

#include <QHash>
#include <QString>

/** Folds values into one number that depends on their order (FNV-1a, by whole values). */
class Checksum
{
public:
    void add(quint64 value) { m_sum = (m_sum ^ value) * 0x100000001b3ULL; }
    void add(const QString &text) { add(qHash(text)); }

    quint64 value() const { return m_sum; }

private:
    quint64 m_sum = 0xcbf29ce484222325ULL;
};
