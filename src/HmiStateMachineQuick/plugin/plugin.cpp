#include <HmiStateMachineQuick/quickviewstatetarget.h>

#include <QQmlEngineExtensionPlugin>

/**
 * Lets programs that are not linked to the library import the module: viewers, designers, tests.
 *
 * Loaded into one that is linked to it, it finds the types registered. Qt takes that from a plugin
 * that extends engines, and refuses one that registers types.
 */
class HmiStateMachinePlugin : public QQmlEngineExtensionPlugin
{
    Q_OBJECT
    Q_PLUGIN_METADATA(IID QQmlEngineExtensionInterface_iid)

public:
    HmiStateMachinePlugin() { HmiStateMachine::QuickViewStateTarget::registerQmlModule(); }
};

#include "plugin.moc"
