#pragma once

#include <QString>

class World;

/** The first rule that does not hold in a machine that has settled; empty when all do. */
QString brokenRule(const World &world);
