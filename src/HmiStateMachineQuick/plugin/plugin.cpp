#include <HmiStateMachineQuick/quickviewstatetarget.h>

#include <QQmlExtensionPlugin>

/** Lets programs that are not linked to the library import the module: viewers, designers, tests.
 */
class HmiStateMachinePlugin : public QQmlExtensionPlugin
{
    Q_OBJECT
    Q_PLUGIN_METADATA(IID QQmlExtensionInterface_iid)

public:
    void registerTypes(const char *uri) override
    {
        Q_ASSERT(QLatin1String(uri) == QLatin1String("HmiStateMachine"));
        Q_UNUSED(uri)
        HmiStateMachine::QuickViewStateTarget::registerQmlModule();
    }
};

#include "plugin.moc"
