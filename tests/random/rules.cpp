#include "rules.h"

#include "steps.h"

#include <HmiStateMachine/popup/popupinterruptionstore.h>
#include <HmiStateMachine/popup/popupstate.h>

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QTemporaryFile>

using namespace HmiStateMachine;

namespace {

constexpr int ruleCount = 60;
const char *const behaviors[] = {"Prohibit", "Allow", "AllowStack", "AllowNoReturn"};

/** The rules of one seed, about the names of one world. */
class RuleMaker
{
public:
    RuleMaker(quint32 seed, const QVector<PopupState *> &popups) : m_random(seed), m_popups(popups)
    {
    }

    void insertRules()
    {
        for (int i = 0; i < ruleCount; ++i) {
            const auto behavior = static_cast<PopupState::InterruptionBehavior>(m_random.below(4));
            const QString popup = anyName();
            PopupInterruptionStore::instance()->insertInterruptionBehavior(behavior, popup,
                                                                           anyName());
        }
    }

    QJsonArray entries()
    {
        QJsonArray result;
        for (const PopupState *popup : m_popups) {
            // Rules of stacked popups and blacklists go by view ids.
            if (m_random.oneIn(4)) {
                result.append(entry(popup->popupViewId()));
            }
        }
        result.append(entry(wildCard()));
        return result;
    }

private:
    QString anyName()
    {
        const PopupState *popup = m_popups.at(m_random.below(m_popups.size()));
        const int kind = m_random.below(4);
        if (kind == 0) {
            return popup->popupViewId();
        }
        return kind == 1 ? wildCard() : popup->name();
    }

    QString wildCard()
    {
        const QString name = m_popups.at(m_random.below(m_popups.size()))->name();
        return m_random.oneIn(2) ? extractPopupWildCard(name) : extractModuleWildCard(name);
    }

    QJsonObject entry(const QString &popup)
    {
        QJsonObject result{{"popup", popup}};
        if (m_random.oneIn(2)) {
            result.insert("default", behaviors[m_random.below(4)]);
        }
        if (m_random.oneIn(2)) {
            result.insert("domainBlacklist",
                          QJsonArray{domainName(m_random.below(domainCount)),
                                     domainName(m_random.below(domainCount))});
        }
        if (m_random.oneIn(2)) {
            result.insert("viewBlacklist", QJsonArray{viewName(m_random.below(viewCount))});
        }
        return result;
    }

    Random m_random;
    const QVector<PopupState *> &m_popups;
};

void load(const QJsonArray &entries)
{
    QTemporaryFile file;
    if (file.open()) {
        file.write(QJsonDocument(entries).toJson());
        file.close();
        PopupInterruptionStore::instance()->loadInterruptionBehaviors(file.fileName());
    }
}

} // namespace

QString uniquePrefix()
{
    static int worlds = 0;
    return 'w' + QString::number(worlds++);
}

QString viewName(int view)
{
    return "view" + QString::number(view);
}

QString domainName(int domain)
{
    return "domain" + QString::number(domain);
}

void storeRandomRules(quint32 seed, const QVector<PopupState *> &popups)
{
    RuleMaker maker(seed, popups);
    maker.insertRules();
    load(maker.entries());
}
