#include "childprocess.h"

#include <QCoreApplication>
#include <QProcessEnvironment>

namespace {

constexpr char childVariable[] = "HMI_TEST_CHILD";
constexpr int childTimeoutMs = 20000;

} // namespace

ChildResult runAsChild(const QString &function)
{
    QProcess process;
    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    environment.insert(childVariable, "1");
    environment.insert("QT_FORCE_STDERR_LOGGING", "1");
    process.setProcessEnvironment(environment);
    process.setProcessChannelMode(QProcess::MergedChannels);
    process.start(QCoreApplication::applicationFilePath(), {function});
    const bool ended = process.waitForFinished(childTimeoutMs);
    if (!ended) {
        process.kill();
        process.waitForFinished();
    }
    return {ended && process.exitStatus() == QProcess::CrashExit, process.exitCode(),
            QString::fromLocal8Bit(process.readAll())};
}

bool isChildProcess()
{
    return qEnvironmentVariableIsSet(childVariable);
}
