#pragma once

#include <HmiStateMachine/hmistatemachine_export.h>

#include <hmiloggingcategory.h>

#include <QDebug>
#include <QMessageLogger>

/**
 * The library's logging category, "vosk.hmistatemachine"; made on the first call, from any thread.
 */
HMISTATEMACHINE_EXPORT HmiLoggingCategory &hmistatemachine();

// The level is tested before the message is built. File, line and plain function name are passed on
// by hand, because Qt's own macros leave them out of release builds.
#define HMI_MESSAGE(category, Level, level, function) \
    for (bool hmiLevelEnabled = (category).is##Level##Enabled(); hmiLevelEnabled; \
         hmiLevelEnabled = false) \
    QMessageLogger(__FILE__, __LINE__, function, (category).categoryName()).level()

#define HMI_DEBUG(category) HMI_MESSAGE(category, Debug, debug, __func__)
#define HMI_WARNING(category) HMI_MESSAGE(category, Warning, warning, __func__)

// From a helper, in the name of the operation that a reader of the log knows.
#define HMI_DEBUG_FROM(category, function) HMI_MESSAGE(category, Debug, debug, function)
#define HMI_WARNING_FROM(category, function) HMI_MESSAGE(category, Warning, warning, function)
