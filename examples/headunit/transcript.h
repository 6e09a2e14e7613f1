#pragma once

#include <QString>
#include <QTextStream>
#include <QVariant>

namespace headunit {

/**
 * What the user of the demo reads: narration, commands, and below each command the calls that the
 * view layer was given, four columns in. Notes, which begin with a dash, tell what is no call.
 */
class Transcript
{
public:
    explicit Transcript(FILE *file);

    void narration(const QString &text);
    void command(const QString &text);
    void call(const QString &operation, const QString &subject, const QVariant &data = QVariant());
    void note(const QString &text);

    /** Some of it could not be written. */
    bool failed() const;

    /** The number of calls since the last reset. */
    int calls() const { return m_calls; }
    void resetCalls() { m_calls = 0; }

    /** The number of calls and notes since the last command. */
    int linesOfCommand() const { return m_linesOfCommand; }

private:
    void write(const QString &text);
    void writeBelowNarration(const QString &text);

    QTextStream m_stream;
    bool m_needsBlankLine = false;
    int m_calls = 0;
    int m_linesOfCommand = 0;
};

} // namespace headunit
