#pragma once

#include <QLoggingCategory>

/**
 * Takes the place of the platform's logging category where that library is not installed.
 *
 * It is an ordinary QLoggingCategory: filter rules and the application's message handler apply.
 */
class HmiLoggingCategory : public QLoggingCategory
{
public:
    /** @p channel has a meaning to the platform's library alone and is ignored here. */
    HmiLoggingCategory(const char *category, int channel);
};

/** The process's trace category, "hmi.trace". */
HmiLoggingCategory &hmitrace();

/** The process's performance category, "hmi.performance". */
HmiLoggingCategory &hmiperformance();
