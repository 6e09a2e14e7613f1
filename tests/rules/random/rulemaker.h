#pragma once

#include "../../random/seeds.h"

#include <QByteArray>
#include <QPair>
#include <QStringList>
#include <QVector>

/** An entry as it was written. */
struct WrittenEntry
{
    QString popup;
    QVector<QPair<QString, QString>> rules; ///< targets and behaviours
    QString defaultBehavior; ///< empty for none
    QStringList domains;
    QStringList views;
};

/** Writes files of rules at random: valid JSON, of which more or less is odd. */
class RuleMaker
{
public:
    /** One choice in @p oddness is an odd one. */
    RuleMaker(Random *random, int oddness) : m_random(*random), m_oddness(oddness) { }

    QByteArray file(int maximumOfEntries);

    /** Those entries of the last file in which no value was replaced by an odd one. */
    const QVector<WrittenEntry> &entries() const { return m_entries; }

private:
    using Member = QPair<QByteArray, QByteArray>; ///< key and value, as they are written

    bool isOdd() { return m_random.oneIn(m_oddness); }
    QString anyOf(const QStringList &list) { return list.at(m_random.below(list.size())); }
    QString name();
    QString behavior();
    QByteArray space();
    QByteArray literal(const QString &text);
    QByteArray escaped(QChar character);
    QByteArray oddValue();
    QByteArray array(const QVector<QByteArray> &items);
    QByteArray object(QVector<Member> members);
    QByteArray entry();
    QByteArray rules(WrittenEntry *written);
    QByteArray blacklist(const QString &prefix, QStringList *written);
    QByteArray oddOr(const QByteArray &value);

    Random &m_random;
    int m_oddness;
    bool m_isReplaced = false; ///< whether a value of the entry is not what it was to be
    QVector<WrittenEntry> m_entries;
};

/** One file or several, of which some are odder than others. */
QList<QByteArray> randomFiles(Random *random, int maximumOfFiles);

/** What a failing test says: how it is run again, what is wrong, and the files. */
QByteArray reproduction(quint32 seed, int run, const QString &wrong,
                        const QList<QByteArray> &contents);
