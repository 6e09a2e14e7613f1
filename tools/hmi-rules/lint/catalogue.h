#pragma once

#include "commandline/options.h"

#include <QStringList>

#include <vector>

namespace hmirules {

/** A kind of finding: what people read about it, in each place. */
struct FindingKind
{
    QString id; ///< stable: scripts and files of settings go by it
    Severity severity;
    QString title; ///< what is wrong, in a few words
    QString effect; ///< what happens on the target
    QString remedy; ///< how to mend it
};

/** All kinds, the severe ones first. */
const std::vector<FindingKind> &findingKinds();

/** The kind with this id; null when there is none. */
const FindingKind *findingKind(const QString &id);

QStringList findingIds();

/** "error", "warning" or "note". */
QString severityText(Severity severity);

} // namespace hmirules
