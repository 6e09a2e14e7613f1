#pragma once

#include <QByteArray>
#include <QList>
#include <QString>
#include <QStringList>

namespace hmirules {

enum class Command { Lint, Explain, Matrix, Diff, Schema, Findings };
enum class Format { Text, Json, Sarif, Csv, Html, Markdown };
enum class Color { Auto, Always, Never };
enum class Severity { Note, Warning, Error };

/**
 * What the command line asks for. Files are paths as they were given, in the bytes of the file
 * system; "-" is the standard input.
 */
struct Options
{
    Command command = Command::Lint;
    QList<QByteArray> files; ///< of lint: one at least; explain and matrix: one; diff: old and new
    QList<QByteArray> base; ///< rules that are loaded before the files
    QByteArray inventory; ///< empty for none, as are the three lists
    QByteArray popupList;
    QByteArray domainList;
    QByteArray viewList;
    Format format = Format::Text;
    QByteArray output; ///< empty for the standard output
    Color color = Color::Auto;

    Severity failOn = Severity::Warning; ///< of lint: the least severity that counts as failure
    QStringList ignore; ///< of lint: ids of findings
    bool each = false; ///< of lint: each file by itself

    QString front; ///< of explain
    QString requested; ///< of explain
    QStringList domains; ///< of explain
    QStringList views; ///< of explain

    bool blocking = false; ///< of matrix, as CSV: where popups are blocked, in place of behaviours
    QStringList only; ///< of matrix: popups or wildcards to which it is restricted

    QString finding; ///< of findings: an id; empty for all
};

} // namespace hmirules
