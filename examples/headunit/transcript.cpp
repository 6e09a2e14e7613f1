#include "transcript.h"

#include "jsontext.h"

namespace headunit {

namespace {

constexpr int operationColumns = 11;

} // namespace

Transcript::Transcript(FILE *file) : m_stream(file)
{
    m_stream.setCodec("UTF-8");
}

void Transcript::narration(const QString &text)
{
    if (m_needsBlankLine) {
        write(QString());
    }
    write(text);
    m_needsBlankLine = false;
}

void Transcript::command(const QString &text)
{
    writeBelowNarration("> " + text);
    m_linesOfCommand = 0;
}

void Transcript::call(const QString &operation, const QString &subject, const QVariant &data)
{
    QString line = operation.leftJustified(operationColumns) + subject;
    if (data.isValid()) {
        line += ' ' + toJsonText(data);
    }
    writeBelowNarration("    " + line);
    ++m_calls;
    ++m_linesOfCommand;
}

void Transcript::note(const QString &text)
{
    writeBelowNarration("    - " + text);
    ++m_linesOfCommand;
}

bool Transcript::failed() const
{
    return m_stream.status() != QTextStream::Ok;
}

// The next narration begins a new paragraph.
void Transcript::writeBelowNarration(const QString &text)
{
    write(text);
    m_needsBlankLine = true;
}

// Flushed line by line, so that the library's messages on stderr keep their place among them.
void Transcript::write(const QString &text)
{
    m_stream << text << '\n';
    m_stream.flush();
}

} // namespace headunit
