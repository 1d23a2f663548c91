#pragma once
#include <vector>
#include "host/Geometry.h"

struct DurationValue {
    int first, second;
    DurationValue() : first(0), second(0) {}
    DurationValue(int a, int b) : first(a), second(b) {}
};

DurationValue RunDurationMenu(Point const &, DurationValue current, short count, DurationValue const *entries);

void DurationValueToVela12IconIDs(DurationValue const &, std::vector<unsigned int> &);
