#pragma once

#include "commandline/definitions.h"

namespace hmirules {

/** Where a parameter is kept is a template's argument, so that a plain function does the keeping.
 */
template <QByteArray Options::*member> void keep(Options &options, const QByteArray &value)
{
    options.*member = value;
}

template <QString Options::*member> void keepName(Options &options, const QByteArray &value)
{
    options.*member = QString::fromUtf8(value);
}

template <QList<QByteArray> Options::*member> void add(Options &options, const QByteArray &value)
{
    (options.*member).append(value);
}

template <QStringList Options::*member> void addName(Options &options, const QByteArray &value)
{
    (options.*member).append(QString::fromUtf8(value));
}

template <bool Options::*member> void raise(Options &options, const QByteArray &)
{
    options.*member = true;
}

using Store = void (*)(Options &, const QByteArray &);

Parameter fileArgument(const QByteArray &placeholder, const QByteArray &text);
Parameter nameArgument(const QByteArray &placeholder, const QByteArray &text, Store store);
Parameter flag(const QByteArray &name, const QByteArray &text, Store store);
Parameter fileOption(const QByteArray &name, const QByteArray &text, Store store);
Parameter nameOption(const QByteArray &name, const QByteArray &placeholder, const QByteArray &text,
                     Store store);
Parameter choiceOption(const QByteArray &name, const QByteArray &words, const QByteArray &text,
                       Store store);
Parameter repeated(Parameter parameter);

/** The options that several commands have. */
QVector<Parameter> ruleOptions(); ///< rules loaded before, and the inventory
Parameter formatOption(const QByteArray &words, const QByteArray &text);
Parameter outputOption();
Parameter colorOption();
QVector<Parameter> helpOptions();

constexpr char helpName[] = "--help";
constexpr char versionName[] = "--version";

} // namespace hmirules
