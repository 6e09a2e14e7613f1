#include "logginglevel.h"

#include <HmiStateMachine/named/namedstate.h>

#include <QLoggingCategory>

#include <cstring>

namespace {

QLoggingCategory::CategoryFilter rulesOfTheProgram = nullptr;

void enableDebugOutput(QLoggingCategory *category)
{
    rulesOfTheProgram(category);
    if (std::strcmp(category->categoryName(), "vosk.hmistatemachine") == 0) {
        category->setEnabled(QtDebugMsg, true);
    }
}

void setDebugOutput(bool on)
{
    if (on == (rulesOfTheProgram != nullptr)) {
        return;
    }
    if (on) {
        // Installing applies the new filter at once: the one it builds on has to be known before.
        rulesOfTheProgram = QLoggingCategory::installFilter(nullptr);
        QLoggingCategory::installFilter(enableDebugOutput);
    } else {
        QLoggingCategory::installFilter(rulesOfTheProgram);
        rulesOfTheProgram = nullptr;
    }
}

} // namespace

void setLoggingLevel(LoggingLevel level)
{
    setDebugOutput(level == LoggingLevel::Debug || level == LoggingLevel::Entries);
    HmiStateMachine::NamedState::setLoggingEnabled(level == LoggingLevel::Asked
                                                   || level == LoggingLevel::Entries);
}
