// Durations as notes.
#pragma once
#include "host/DurationValue.h"
#include "host/UString.h"

// A note value that a duration stands for: the duration's fields are the parts of a fraction of a whole note.
struct NoteDuration {
    enum Kind { kPlain, kDotted, kTriplet, kKindCount };
    static constexpr int kNotes = 8; // whole, half, quarter, eighth, 16th, 32nd, 64th, 128th

    int note = 0; // 0 to 7, from the whole note on
    Kind kind = kPlain;

    // The note of that length, whether the fraction is in its lowest terms or not. False, without effect,
    // when it is no such note.
    static bool Find(DurationValue const &, NoteDuration &);

    DurationValue Value() const; // in its lowest terms
    UString Name() const;        // in the user's language
};
