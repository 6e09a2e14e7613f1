#pragma once

#include "journal.h"

#include <QEvent>
#include <QObject>

/** Writes "<name> asked" and "<name> refused" when the guard is asked about a real event. */
template <typename Transition>
void record(Transition *transition, const QString &name, Journal &journal)
{
    QObject::connect(transition, &Transition::transitionTest, transition,
                     [name, &journal](QEvent *event) {
                         if (event->type() != QEvent::None) {
                             journal.add(name + " asked");
                         }
                     });
    QObject::connect(transition, &Transition::testFailed, transition,
                     [name, &journal](QEvent *event) {
                         if (event->type() != QEvent::None) {
                             journal.add(name + " refused");
                         }
                     });
}

/** Has the guard of @p transition answer every question with @p allow. */
template <typename Transition> void answer(Transition *transition, bool allow)
{
    QObject::connect(transition, &Transition::transitionTest, transition,
                     [transition, allow] { transition->setAllowTransition(allow); });
}
