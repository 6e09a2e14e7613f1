#pragma once

#include "stores.h"

/** Files that are loaded one after another, with what the tool and a store of the test's make of
 * them. */
class DecisionCase
{
public:
    explicit DecisionCase(const QList<QByteArray> &contents)
        : m_contents(contents), m_base(filesOf(contents)), m_names(namesToAsk(m_base)),
          m_store(loaded(contents))
    {
    }

    bool isUsable() const { return m_base.files().size() == unsigned(m_contents.size()); }
    const hmirules::RuleBase &base() const { return m_base; }

    /** What is wrong about the decisions, by a pair or a popup; empty when all is right. */
    QString firstWrong() const;

private:
    // Each of these returns the first that is wrong; empty when all is right.
    QString wrongDecision() const;
    QString wrongSiteAlone() const;
    QString wrongAfterChange() const;
    QString wrongWithoutSite() const;
    QString wrongBlocking() const;
    QString wrongAfterLifting() const;

    template <typename Check> QString firstPair(Check check) const
    {
        for (const QString &front : m_names) {
            for (const QString &requested : m_names) {
                if (!check(front, requested)) {
                    return pairText(front, requested);
                }
            }
        }
        return QString();
    }

    QList<QByteArray> changed(int site, const QByteArray &text) const;
    QList<QByteArray> withList(const hmirules::Site &site, const QString &onlyName) const;
    QString wrongAfterLifting(int site) const;

    QList<QByteArray> m_contents;
    hmirules::RuleBase m_base;
    QStringList m_names;
    StorePointer m_store;
};
