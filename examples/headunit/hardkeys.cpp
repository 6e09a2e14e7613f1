#include "hardkeys.h"

#include <HmiStateMachineQuick/requests.h>

#include <QMetaEnum>
#include <QVariantMap>

namespace headunit {

HardKeys::HardKeys(QObject *parent) : QObject(parent)
{
}

HardKeys::~HardKeys() = default;

const char *HardKeys::signal()
{
    return SIGNAL(keyChanged(int, int));
}

QStringList HardKeys::names()
{
    const auto keys = QMetaEnum::fromType<Key>();
    QStringList result;
    for (int i = 0; i < keys.keyCount(); ++i) {
        result.append(QString::fromLatin1(keys.key(i)));
    }
    return result;
}

int HardKeys::fromName(const QString &name)
{
    return QMetaEnum::fromType<Key>().keyToValue(qPrintable(name));
}

void connectKeys(HmiStateMachine::Requests *requests, HardKeys *keys)
{
    QVariantMap codes;
    const QStringList names = HardKeys::names();
    for (const QString &name : names) {
        codes.insert(name, HardKeys::fromName(name));
    }
    requests->setKeys(codes);
    QObject::connect(requests, &HmiStateMachine::Requests::keyChanged, keys, &HardKeys::keyChanged);
}

} // namespace headunit
