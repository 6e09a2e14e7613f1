#pragma once

#include "fault.h"

#include <QStringList>
#include <QVariant>

#include <optional>

namespace headunit {

/**
 * Takes the arguments of one command off its line, from left to right.
 *
 * The first fault is kept and everything after it yields empty values, so a command can take all
 * its arguments and look for a fault at the end.
 */
class Arguments
{
public:
    /** @p usage is shown as the remedy for missing and surplus arguments. */
    Arguments(const QString &command, const QString &text, const QString &usage);

    bool atEnd() const;
    QString word(const QString &what);
    QString name(const QString &what, const QStringList &known);

    /** One or more names, to the end of the line. */
    QStringList names(const QString &what, const QStringList &known);
    int number(const QString &what, int minimum, int maximum);

    /** The rest of the line as JSON; @p what may be left out when it is optional. */
    QVariant data(const QString &what);
    QVariant optionalData();

    /** The rest of the line as it stands. */
    QString text(const QString &what);

    void fail(const Fault &fault);
    std::optional<Fault> fault() const;

    /** The command as it was understood, its data in one line of JSON. */
    QString echo() const;

private:
    QString takeWord();
    void missing(const QString &what);

    QString m_rest;
    QString m_usage;
    QStringList m_echo;
    std::optional<Fault> m_fault;
};

} // namespace headunit
