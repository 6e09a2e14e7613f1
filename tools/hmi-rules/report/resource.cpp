#include "resource.h"

#include <QFile>

#include <stdexcept>

// Not in a namespace, where the macro cannot be used.
static void initializeResources()
{
    Q_INIT_RESOURCE(hmirules);
}

namespace hmirules {

QString resource(const QString &name)
{
    // The linker leaves out of a static library what nobody names.
    initializeResources();
    QFile file(":/hmi-rules/" + name);
    if (!file.open(QIODevice::ReadOnly)) {
        throw std::logic_error(("missing in the program: " + name).toStdString());
    }
    return QString::fromUtf8(file.readAll());
}

} // namespace hmirules
