#pragma once

#include <QString>
#include <QStringList>

namespace headunit {

/** What the recogniser understands. */
QStringList voicePhrases();

/** The name of the HmiEvent that a recognised phrase is posted as. */
QString voiceEvent(const QString &phrase);

} // namespace headunit
