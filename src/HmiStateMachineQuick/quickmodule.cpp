#include <HmiStateMachineQuick/hostattached.h>
#include <HmiStateMachineQuick/popupcomponent.h>
#include <HmiStateMachineQuick/popuphost.h>
#include <HmiStateMachineQuick/quickviewstatetarget.h>
#include <HmiStateMachineQuick/requests.h>
#include <HmiStateMachineQuick/screenhost.h>
#include <HmiStateMachineQuick/viewcomponent.h>

#include <HmiStateMachineQuick/internal/log.h>

#include <QQmlEngine>
#include <QQmlModuleRegistration>

// A static library's resources are not known to the process by themselves.
static void initResources()
{
    Q_INIT_RESOURCE(hmistatemachinequick);
}

namespace HmiStateMachine {

namespace {

const char uri[] = "HmiStateMachine";
constexpr int major = 1;
constexpr int minor = 0;

// Belongs to the application, whatever the engine does.
template <typename T> T *lend(T *object)
{
    QQmlEngine::setObjectOwnership(object, QQmlEngine::CppOwnership);
    return object;
}

// A scene without a flow (in a designer's tool, say) gets a target that nobody speaks to.
QuickViewStateTarget *targetFor(QQmlEngine *engine)
{
    if (auto *published = QuickViewStateTarget::published()) {
        return lend(published);
    }
    if (auto *own =
            engine->findChild<QuickViewStateTarget *>(QString(), Qt::FindDirectChildrenOnly)) {
        return lend(own);
    }
    qCWarning(hmistatemachinequick,
              "There is no QuickViewStateTarget: make one before the scene is loaded.");
    auto *published = ViewStateTarget::instance();
    auto *idle = lend(new QuickViewStateTarget(engine));
    ViewStateTarget::VIEW_STATE_TARGET_INSTANCE = published;
    return idle;
}

QObject *provideTarget(QQmlEngine *engine, QJSEngine *)
{
    return targetFor(engine);
}

QObject *provideRequests(QQmlEngine *engine, QJSEngine *)
{
    return lend(targetFor(engine)->requests());
}

void registerTypes()
{
    const QString notMade = QStringLiteral("belongs to ViewTarget");
    qmlRegisterSingletonType<QuickViewStateTarget>(uri, major, minor, "ViewTarget", provideTarget);
    qmlRegisterSingletonType<Requests>(uri, major, minor, "Requests", provideRequests);
    qmlRegisterUncreatableType<PopupListModel>(uri, major, minor, "PopupListModel", notMade);
    qmlRegisterUncreatableType<SceneHost>(
        uri, major, minor, "SceneHost", QStringLiteral("is the base of ScreenHost and PopupHost"));
    qmlRegisterType<ScreenHost>(uri, major, minor, "ScreenHost");
    qmlRegisterType<PopupHost>(uri, major, minor, "PopupHost");
    qmlRegisterType<ViewComponent>(uri, major, minor, "ViewComponent");
    qmlRegisterType<PopupComponent>(uri, major, minor, "PopupComponent");
    qmlRegisterAnonymousType<HostAttached>(uri, major);
}

} // namespace

void QuickViewStateTarget::registerQmlModule()
{
    initResources();
    // Qt registers the types at the first import. Registered before, they would make it refuse the
    // plugin of an installed module, which it loads into linked programs, too.
    static const QQmlModuleRegistration registration(uri, major, registerTypes);
}

} // namespace HmiStateMachine
