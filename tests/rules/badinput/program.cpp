#include "program.h"

#include <linux/capability.h>
#include <sys/prctl.h>
#include <sys/syscall.h>
#include <unistd.h>

namespace {

constexpr int timeoutMs = 20000; // of what takes less than one second

} // namespace

Program::Program(const QString &folder)
{
    setWorkingDirectory(folder);
    setProcessEnvironment(QProcessEnvironment::systemEnvironment());
    setVariable("RULES", HMI_RULES_PROGRAM);
    setProgram(HMI_RULES_PROGRAM);
}

void Program::setVariable(const QString &name, const QString &value)
{
    QProcessEnvironment environment = processEnvironment();
    environment.insert(name, value);
    setProcessEnvironment(environment);
}

Ended Program::run(const QStringList &arguments, const QByteArray &input)
{
    setArguments(arguments);
    start();
    write(input);
    closeWriteChannel();
    return wait();
}

Ended Program::runShell(const QString &line)
{
    setProgram("/bin/sh");
    return run({"-c", line});
}

// By the bounding set, beyond which root gets nothing when the program is executed.
void Program::setupChildProcess()
{
    __user_cap_header_struct header = {_LINUX_CAPABILITY_VERSION_3, 0};
    __user_cap_data_struct data[2] = {};
    prctl(PR_CAPBSET_DROP, CAP_DAC_OVERRIDE);
    prctl(PR_CAPBSET_DROP, CAP_DAC_READ_SEARCH);
    syscall(SYS_capset, &header, data);
}

Ended Program::wait()
{
    const bool isInTime = waitForFinished(timeoutMs);
    if (!isInTime) {
        kill();
        waitForFinished();
    }
    return {isInTime, exitStatus() == QProcess::NormalExit ? exitCode() : -1,
            readAllStandardOutput(), readAllStandardError()};
}
