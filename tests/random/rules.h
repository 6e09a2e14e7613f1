#pragma once

#include <QString>
#include <QVector>

namespace HmiStateMachine {
class PopupState;
}

/** Begins the names of one world: the rules stay in the store for as long as the process lives. */
QString uniquePrefix();
QString viewName(int view);
QString domainName(int domain);

/**
 * Puts the rules of @p seed about @p popups, and blacklists of the domains and views by their
 * names, into the store of the process, where they stay.
 */
void storeRandomRules(quint32 seed, const QVector<HmiStateMachine::PopupState *> &popups);
