#pragma once

#include "commandline/options.h"

namespace hmirules {

/** Colours for a terminal, or none. */
class Paint
{
public:
    explicit Paint(bool isOn) : m_isOn(isOn) { }

    QString bold(const QString &text) const { return paint("1", text); }
    QString faint(const QString &text) const { return paint("2", text); }
    QString severity(Severity severity, const QString &text) const;
    QString behavior(int behavior, const QString &text) const;

private:
    QString paint(const char *code, const QString &text) const;

    bool m_isOn;
};

/** Whether what is written to the standard output, or else to a file, is coloured. */
bool isColored(const Options &options);

} // namespace hmirules
