#include "commandline/commandline.h"
#include "commands/output.h"

#include "input/fault.h"

#include <QCoreApplication>

#include <exception>

#include <fcntl.h>
#include <unistd.h>

using namespace hmirules;

namespace {

// What the library itself cannot foresee: no memory, no temporary file.
Outcome failed(const QString &reason)
{
    Fault fault;
    fault.message = reason;
    return {exitUnusable, QByteArray(), toText(fault).toUtf8(), false};
}

// A file that is opened takes the lowest free number: without these it could be taken for one of
// the standard streams. The directions are the wrong ones, so that using them still fails.
void occupyStandardStreams()
{
    while (true) {
        const int descriptor = open("/dev/null", O_RDONLY);
        if (descriptor > STDERR_FILENO || descriptor < 0) {
            close(descriptor);
            return;
        }
        if (descriptor == STDIN_FILENO) {
            close(descriptor);
            open("/dev/null", O_WRONLY);
        }
    }
}

int runProgram(const std::vector<std::string> &arguments)
{
    const Parsed parsed = parse(arguments);
    if (!parsed.options) {
        Outcome outcome;
        outcome.exitCode = parsed.exitCode;
        outcome.hasOutput = parsed.exitCode == exitFine;
        (outcome.hasOutput ? outcome.output : outcome.errors) = parsed.text;
        return write(outcome, QByteArray());
    }
    return write(run(*parsed.options), parsed.options->output);
}

} // namespace

int main(int argc, char **argv)
{
    occupyStandardStreams();
    QCoreApplication app(argc, argv); // which takes the names of files as the system has them
    try {
        return runProgram(std::vector<std::string>(argv + 1, argv + argc));
    } catch (const std::exception &exception) {
        return write(failed(QString::fromUtf8(exception.what())), QByteArray());
    }
}
