// Note durations, and the menu that chooses one.
#pragma once
#include "host/Geometry.h"
#include <vector>

// A duration; equal when both fields are. What the fields mean is the host's.
struct DurationValue {
    int first, second;

    DurationValue()
        : first(0)
        , second(0) {}
    DurationValue(int a, int b)
        : first(a)
        , second(b) {}
};

// Opens a menu of durations at the point, in the current pane's coordinates, and waits for the choice.
// Answers what was chosen, or `current` when nothing was. `entries` are `count` durations to choose from;
// with a count of 0, the host's own.
DurationValue RunDurationMenu(Point const &, DurationValue current, short count,
                              DurationValue const *entries);
// Replaces the list by the icons that show the duration: indices into icon family 1821, from left to right.
void DurationValueToVela12IconIDs(DurationValue const &, std::vector<unsigned int> &);
