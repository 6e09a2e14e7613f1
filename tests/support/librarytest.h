#pragma once

#include "messagerecorder.h"

#include <QObject>
#include <QScopedPointer>

/**
 * Base of the test classes: each function starts with the process-wide settings of the library at
 * their defaults, and ends with nothing of it left behind.
 *
 * After each function it fails when a state is still registered or recorded, when a transition is
 * still listed as firing, or when the library wrote a message that the function did not take.
 */
class LibraryTest : public QObject
{
    Q_OBJECT

protected:
    /** The messages of the library during this function. */
    MessageRecorder &messages() { return *m_messages; }

private Q_SLOTS:
    void init();
    void cleanup();

private:
    QScopedPointer<MessageRecorder> m_messages;
};
