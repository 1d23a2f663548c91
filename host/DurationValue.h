// Note durations, and the menu that chooses one.
#pragma once
#include "host/Geometry.h"
#include <vector>

// A duration: a fraction of a whole note, the first field above and the second below the line. A quarter is
// (1, 4), a dotted one (3, 8), one of a triplet (1, 6). Durations are compared field by field.
struct DurationValue {
    int first, second;

    DurationValue() // no duration
        : first(0)
        , second(0) {}
    DurationValue(int a, int b)
        : first(a)
        , second(b) {}
};

// Opens a menu of durations at the point, in the current pane's coordinates, and waits for the choice.
// Answers what was chosen, or `current` when nothing was. `entries` are `count` durations to choose from;
// with a count of 0 or below, or null, all notes from the whole one to the 128th, plain, dotted and as
// triplets.
DurationValue RunDurationMenu(Point const &, DurationValue current, short count,
                              DurationValue const *entries);
// Replaces the list by the icons that show the duration: indices into icon family 1821, from left to right, a
// note and, for a dotted one or a triplet, a mark behind it. None for what is no such note.
void DurationValueToVela12IconIDs(DurationValue const &, std::vector<unsigned int> &);
