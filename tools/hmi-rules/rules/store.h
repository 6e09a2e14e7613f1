#pragma once

#include <HmiStateMachine/popup/popupinterruptionstore.h>

#include <QByteArray>
#include <QList>
#include <QStringList>

#include <memory>

namespace hmirules {

using Store = HmiStateMachine::PopupInterruptionStore;

/** A store into which files have been loaded, and what the library said meanwhile. */
struct LoadedStore
{
    std::unique_ptr<Store> store;
    QList<QStringList> warnings; ///< of each file
};

/**
 * Has the library itself load these texts one after another. Throws std::runtime_error when no
 * temporary file can be written, which is how the library gets to see them.
 */
LoadedStore loadStore(const QList<QByteArray> &contents);

/** The number that domains have in all stores of this process; a new name gets the next one. */
int numberOfDomain(const QString &name);

} // namespace hmirules
