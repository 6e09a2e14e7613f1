#pragma once

#include <QString>
#include <QStringList>

namespace headunit {

/** What the command line asks for. */
struct Options
{
    QString scenario; ///< a file; empty to drive by hand
    bool headless = false;
    QString screenshots; ///< a folder, which is there; empty for none
    int paceMs = 0;
    bool panels = false;
    QString rules; ///< a file
    bool firstStart = false;
    bool list = false;
    bool inventory = false;
    bool verbose = false;
    bool help = false;
};

/** Empty when the command line is understood, else what is wrong with it. */
QString parseOptions(const QStringList &arguments, Options *options);

QString helpText();

} // namespace headunit
