#include "flow.h"

#include <HmiStateMachine/named/statemachine.h>
#include <HmiStateMachineQuick/quickviewstatetarget.h>
#include <QGuiApplication>
#include <QLoggingCategory>
#include <QQmlApplicationEngine>

int main(int argc, char *argv[])
{
    QGuiApplication app(argc, argv);
    QLoggingCategory::setFilterRules("*.debug=false");
    HmiStateMachine::QuickViewStateTarget viewLayer; // before the scene and the flow
    buildFlow();
    QQmlApplicationEngine engine(QUrl("qrc:/Main.qml"));
    HmiStateMachine::StateMachine::instance()->start();
    return engine.rootObjects().isEmpty() ? 1 : app.exec();
}
