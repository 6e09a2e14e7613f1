#pragma once

#include <QMetaType>

class QEvent;

/** Makes the event of a row; the machine that it is posted to owns it. */
using MakeEvent = QEvent *(*)();
Q_DECLARE_METATYPE(MakeEvent)
