#include "program.h"

#include <QCoreApplication>
#include <QHash>
#include <QLoggingCategory>

namespace {

// What is logged costs what it costs the logging of the application: it is made up, not written.
// What this program itself has to say does not go this way.
void discard(QtMsgType, const QMessageLogContext &, const QString &)
{
}

} // namespace

int main(int argc, char **argv)
{
    // The order within Qt's tables must not change from run to run.
    qSetGlobalQHashSeed(0);
    QCoreApplication application(argc, argv);
    // As on the target: warnings are logged, debug output is not.
    QLoggingCategory::setFilterRules(QStringLiteral("*.debug=false"));
    qInstallMessageHandler(discard);
    return runProgram(application.arguments());
}
