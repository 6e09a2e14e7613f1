#include <HmiStateMachine/internal/logging.h>

HmiLoggingCategory &hmistatemachine()
{
    static HmiLoggingCategory category("vosk.hmistatemachine", 1);
    return category;
}
