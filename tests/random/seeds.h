#pragma once

#include <QtGlobal>

#include <random>

/** The same numbers from the same seed on every platform, which std's distributions do not give. */
class Random
{
public:
    explicit Random(quint32 seed) : m_engine(seed) { }

    /** 0 up to, and without, @p limit. */
    int below(int limit) { return static_cast<int>(m_engine() % static_cast<quint32>(limit)); }
    bool oneIn(int chances) { return below(chances) == 0; }

private:
    std::mt19937 m_engine;
};

/** Adds the column "seed", with HMI_RANDOM_SEED alone or with a few seeds and one of the clock. */
void addSeedRows();

/** HMI_RANDOM_STEPS, or else @p defaultSteps. */
int numberOfSteps(int defaultSteps);
