#pragma once

#include <HmiStateMachine/hmistatemachine_export.h>

#include <QString>

namespace HmiStateMachine {

/** Writes a fixed text to the library's category at debug level each time it is called. */
class HMISTATEMACHINE_EXPORT LoggingFunctor
{
public:
    explicit LoggingFunctor(const QString &message);

    void operator()() const;

private:
    QString m_message;
};

} // namespace HmiStateMachine
