#pragma once

class HardKeys;

extern bool s_driving; // a signal of the vehicle, in earnest

void buildFlow(HardKeys *keys);
