#pragma once

#include "rules/rulebase.h"

#include <HmiStateMachine/popup/popupinterruptionstore.h>

#include <memory>

using StorePointer = std::unique_ptr<HmiStateMachine::PopupInterruptionStore>;

/** The same files in a store that the tool has nothing to do with; null when that fails. */
StorePointer loaded(const QList<QByteArray> &contents);

/** The texts as files that the tool has read; empty when it refuses one. */
std::vector<hmirules::RuleFile> filesOf(const QList<QByteArray> &contents);

/** The names in the files, and popups for the wildcards among them; limited, so that all pairs of
 * them are soon asked for. */
QStringList namesToAsk(const hmirules::RuleBase &base);

/** The domains or views of all blacklists of a kind, and another one. */
QStringList placesToAsk(const hmirules::RuleBase &base, hmirules::Site::Kind kind);

bool isBlocked(const HmiStateMachine::PopupInterruptionStore &store, const QString &popup,
               const QString &where, hmirules::Site::Kind kind);

/** A pair for messages. */
QString pairText(const QString &front, const QString &requested);
