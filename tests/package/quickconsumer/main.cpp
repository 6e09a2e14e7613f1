#include <HmiStateMachineQuick/HmiStateMachineQuick>

#include <QGuiApplication>
#include <QQmlComponent>
#include <QQmlEngine>

#include <cstdio>
#include <memory>

using namespace HmiStateMachine;

namespace {

const char scene[] = R"(
import QtQuick 2.15
import HmiStateMachine 1.0

ScreenHost {
    duration: 0
    ViewComponent { viewId: "Home"; Item { } }
    ViewComponent { viewId: "Radio"; Item { objectName: "the radio is shown" } }
}
)";

} // namespace

int main(int argc, char **argv)
{
    QGuiApplication app(argc, argv);
    QuickViewStateTarget target;
    StateMachine *machine = StateMachine::instance();
    auto *home = new HmiViewState(QStringLiteral("Home"), machine);
    new HmiViewState(QStringLiteral("Radio"), machine);
    machine->setInitialState(home);

    // The component has its resources in a static library too.
    QQmlEngine engine;
    QQmlComponent component(&engine);
    component.setData(scene, QUrl(QStringLiteral("file:///Scene.qml")));
    const std::unique_ptr<QObject> root(component.create());
    const auto *host = qobject_cast<ScreenHost *>(root.get());
    if (!host) {
        std::fputs(qPrintable(component.errorString()), stderr);
        return 1;
    }
    machine->start();
    QCoreApplication::sendPostedEvents();
    target.requests()->view(QStringLiteral("Radio"));
    QCoreApplication::sendPostedEvents();

    std::puts(qPrintable(host->currentItem()->objectName()));
    target.requests()->setChecksIds(true);
    target.requests()->view(QStringLiteral("Nowhere")); // shows the banner
    return host->findChild<QQuickItem *>(QStringLiteral("warningBanner")) ? 0 : 1;
}
