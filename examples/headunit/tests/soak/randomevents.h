#pragma once

#include "random/seeds.h"
#include "scenario/commands.h"

#include <QStringList>
#include <QVariant>
#include <QVector>

class QTimer;

/** Gives the running flow one event after the other, drawn by lot; the same ones for the same seed.
 */
class RandomEvents
{
public:
    /** The flow has to be built. */
    RandomEvents(quint32 seed, const headunit::Stage &stage);

    /** One event, and all that follows from it without time passing. */
    void next();

private:
    using Deed = void (RandomEvents::*)();

    void requestView();
    void pressBack();
    void pressKey();
    void requestPopup();
    void refreshPopup();
    void dismissPopup();
    void letTimerRunOut();
    void changeDomain();
    void changeProperty();
    void drive();
    void raiseEvent();
    void speak();
    void askForTheUnknown();

    const QString &anyOf(const QStringList &list);
    QVariant newData();

    Random m_random;
    headunit::Stage m_stage;
    QStringList m_views;
    QStringList m_viewStates;
    QStringList m_popups;
    QStringList m_domains;
    QStringList m_phrases;
    QVector<QTimer *> m_timers;
    QVector<Deed> m_deeds;
    int m_count = 0;
};
