#include <HmiStateMachineQuick/quickviewstatetarget.h>

#include <QQmlEngineExtensionPlugin>

/** Lets programs that are not linked to the library import the module: viewers, designers, tests.
 */
class HmiStateMachinePlugin : public QQmlEngineExtensionPlugin
{
    Q_OBJECT
    Q_PLUGIN_METADATA(IID QQmlEngineExtensionInterface_iid)

public:
    HmiStateMachinePlugin() { HmiStateMachine::QuickViewStateTarget::registerQmlModule(); }
};

#include "plugin.moc"
