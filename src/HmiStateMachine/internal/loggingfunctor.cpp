#include <HmiStateMachine/internal/loggingfunctor.h>

#include <HmiStateMachine/internal/logging.h>

namespace HmiStateMachine {

LoggingFunctor::LoggingFunctor(const QString &message) : m_message(message)
{
}

void LoggingFunctor::operator()() const
{
    HMI_DEBUG(hmistatemachine()) << m_message;
}

} // namespace HmiStateMachine
