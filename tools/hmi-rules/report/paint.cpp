#include "paint.h"

#include <HmiStateMachine/popup/popupstate.h>

#include <unistd.h>

using HmiStateMachine::PopupState;

namespace hmirules {

QString Paint::severity(Severity severity, const QString &text) const
{
    switch (severity) {
    case Severity::Error:
        return paint("1;31", text);
    case Severity::Warning:
        return paint("1;33", text);
    case Severity::Note:
        break;
    }
    return paint("1;36", text);
}

// Colours that stay apart for the colour-blind, beside the letters.
QString Paint::behavior(int behavior, const QString &text) const
{
    switch (behavior) {
    case PopupState::Prohibit:
        return paint("1;35", text);
    case PopupState::Allow:
        return paint("36", text);
    case PopupState::AllowStack:
        return paint("1;34", text);
    case PopupState::AllowNoReturn:
        return paint("33", text);
    default:
        return paint("7", text);
    }
}

QString Paint::paint(const char *code, const QString &text) const
{
    return m_isOn ? QString("\033[%1m%2\033[0m").arg(code, text) : text;
}

bool isColored(const Options &options)
{
    if (options.color != Color::Auto) {
        return options.color == Color::Always;
    }
    // See no-color.org for the variable.
    return options.output.isEmpty() && isatty(STDOUT_FILENO)
        && qEnvironmentVariableIsEmpty("NO_COLOR") && qgetenv("TERM") != "dumb";
}

} // namespace hmirules
