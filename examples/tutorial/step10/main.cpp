#include "flow.h"
#include "hardkeys.h"
#include "printing.h"

#include <HmiStateMachine/named/hmievent.h>
#include <HmiStateMachine/named/hmiviewevent.h>

#include <QLoggingCategory>

using namespace HmiStateMachine;

int main(int argc, char *argv[])
{
    QCoreApplication app(argc, argv);
    QLoggingCategory::setFilterRules("*.debug=false");
    PrintingViewLayer viewLayer;
    HardKeys keys;
    buildFlow(&keys);
    StateMachine::instance()->start();
    QCoreApplication::sendPostedEvents();

    s_driving = true;
    request("A film, on the way.", new HmiEvent("video", QVariant()));
    s_driving = false;
    request("A film, in the car park.", new HmiEvent("video", QVariant()));
    request("Home.", new HmiViewEvent("Home", QVariant()));
    s_driving = true;
    request("The view of the film, on the way.", new HmiViewEvent("Video", QVariant()));
}
