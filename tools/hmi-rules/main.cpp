#include "commandline/commandline.h"
#include "commands/output.h"

#include "input/fault.h"

#include <QCoreApplication>

#include <exception>

using namespace hmirules;

namespace {

// What the library itself cannot foresee: no memory, no temporary file.
Outcome failed(const QString &reason)
{
    Fault fault;
    fault.message = reason;
    return {exitUnusable, QByteArray(), toText(fault).toUtf8(), false};
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
    QCoreApplication app(argc, argv); // which takes the names of files as the system has them
    try {
        return runProgram(std::vector<std::string>(argv + 1, argv + argc));
    } catch (const std::exception &exception) {
        return write(failed(QString::fromUtf8(exception.what())), QByteArray());
    }
}
