// Runs the recipe that is named on the command line.

#include "printing.h"
#include "recipes.h"

#include <QLoggingCategory>
#include <QTimer>
#include <QTimerEvent>

using HmiStateMachine::StateMachine;

void startIn(QAbstractState *initial)
{
    StateMachine::instance()->setInitialState(initial);
    StateMachine::instance()->start();
    QCoreApplication::sendPostedEvents();
}

bool fire(QTimer *timer)
{
    if (!timer || !timer->isActive()) {
        return false;
    }
    QTimerEvent timeout(timer->timerId());
    QCoreApplication::sendEvent(timer, &timeout);
    QCoreApplication::sendPostedEvents();
    return true;
}

int main(int argc, char *argv[])
{
    const QMap<QString, void (*)()> recipes{
        {"back-filters", backFilters},
        {"blocked-keys", blockedKeys},
        {"conditions", conditions},
        {"data-and-refresh", dataAndRefresh},
        {"delayed-transitions", delayedTransitions},
        {"domains", domains},
        {"driver-restriction", driverRestriction},
        {"fallbacks", fallbacks},
        {"other-threads", otherThreads},
        {"seeing", seeing},
        {"siblings", siblings},
    };
    QCoreApplication app(argc, argv);
    QLoggingCategory::setFilterRules("*.debug=false");
    const auto recipe = recipes.value(app.arguments().value(1));
    if (!recipe) {
        qCritical().noquote() << "Usage: recipes" << QStringList(recipes.keys()).join('|');
        return 1;
    }
    recipe();
    return 0;
}
