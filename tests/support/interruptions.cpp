#include "interruptions.h"

#include <HmiStateMachine/popup/popupinterruptionstore.h>

#include <QTemporaryFile>

bool loadInterruptions(HmiStateMachine::PopupInterruptionStore &store, const QByteArray &json)
{
    QTemporaryFile file;
    if (!file.open() || file.write(json) != json.size() || !file.flush()) {
        return false;
    }
    store.loadInterruptionBehaviors(file.fileName());
    return true;
}
