#include "seeds.h"

#include <QDateTime>
#include <QtTest>

void addSeedRows()
{
    QTest::addColumn<quint32>("seed");

    const QByteArray chosen = qgetenv("HMI_RANDOM_SEED");
    if (!chosen.isEmpty()) {
        QTest::newRow("seed " + chosen) << chosen.toUInt();
        return;
    }
    for (const quint32 seed : {1u, 22u, 333u, 4444u}) {
        QTest::addRow("seed %u", seed) << seed;
    }
    const auto now = static_cast<quint32>(QDateTime::currentSecsSinceEpoch());
    QTest::addRow("seed of the clock %u", now) << now;
}

int numberOfSteps(int defaultSteps)
{
    bool set = false;
    const int steps = qEnvironmentVariableIntValue("HMI_RANDOM_STEPS", &set);
    return set ? steps : defaultSteps;
}
