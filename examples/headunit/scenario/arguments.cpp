#include "arguments.h"

#include "jsontext.h"
#include "vocabulary.h"

#include <QRegularExpression>

namespace headunit {

Arguments::Arguments(const QString &command, const QString &text, const QString &usage)
    : m_rest(text.trimmed()), m_usage(usage), m_echo(command)
{
}

bool Arguments::atEnd() const
{
    return m_rest.isEmpty();
}

QString Arguments::word(const QString &what)
{
    const QString result = takeWord();
    if (result.isEmpty()) {
        missing(what);
    }
    return result;
}

QString Arguments::name(const QString &what, const QStringList &known)
{
    const QString result = word(what);
    if (m_fault || known.contains(result)) {
        return result;
    }
    const QString nearest = nearestName(result, known);
    fail({what, quoted(result),
          nearest.isEmpty() ? "known are " + known.join(", ")
                            : "did you mean " + quoted(nearest) + '?'});
    return QString();
}

QStringList Arguments::names(const QString &what, const QStringList &known)
{
    QStringList result;
    do {
        result.append(name(what, known));
    } while (!atEnd());
    return result;
}

int Arguments::number(const QString &what, int minimum, int maximum)
{
    const QString text = takeWord();
    const QString expected =
        QString("%1, a whole number from %2 to %3").arg(what).arg(minimum).arg(maximum);
    if (text.isEmpty()) {
        missing(expected);
        return minimum;
    }
    bool isNumber = false;
    const int result = text.toInt(&isNumber);
    if (!isNumber || result < minimum || result > maximum) {
        fail({expected, quoted(text), QString()});
        return minimum;
    }
    return result;
}

QVariant Arguments::data(const QString &what)
{
    if (atEnd()) {
        missing(what);
        return QVariant();
    }
    QString error;
    const QVariant result = fromJsonText(m_rest, &error);
    if (!result.isValid()) {
        fail({what + " as one JSON value", quoted(m_rest) + " (" + error + ')',
              "texts stand in double quotes, and data ends the line"});
    }
    m_echo.append(toJsonText(result));
    m_rest.clear();
    return result;
}

QVariant Arguments::optionalData()
{
    return atEnd() || m_fault ? QVariant() : data("data");
}

QString Arguments::text(const QString &what)
{
    if (atEnd()) {
        missing(what);
    }
    const QString result = m_rest;
    m_rest.clear();
    return result;
}

void Arguments::fail(const Fault &fault)
{
    if (!m_fault) {
        m_fault = fault;
    }
}

std::optional<Fault> Arguments::fault() const
{
    if (!m_fault && !atEnd()) {
        return Fault{"the end of the line", quoted(m_rest), "usage: " + m_usage};
    }
    return m_fault;
}

QString Arguments::echo() const
{
    return m_echo.join(' ');
}

QString Arguments::takeWord()
{
    static const QRegularExpression blank("\\s");
    const QString result = m_rest.section(blank, 0, 0);
    m_rest = m_rest.mid(result.size()).trimmed();
    if (!result.isEmpty()) {
        m_echo.append(result);
    }
    return result;
}

void Arguments::missing(const QString &what)
{
    fail({what, "the end of the line", "usage: " + m_usage});
}

} // namespace headunit
