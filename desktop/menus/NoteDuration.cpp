#include "desktop/menus/NoteDuration.h"
#include "host/LocalizedStrings.h"

namespace {

short const kNameList = 4400;
short const kFirstNames[NoteDuration::kKindCount] = {1, 11, 21};

// How much longer than the plain note, as a fraction in lowest terms.
DurationValue const kFactors[NoteDuration::kKindCount] = {{1, 1}, {3, 2}, {2, 3}};

} // namespace

DurationValue NoteDuration::Value() const {
    DurationValue const factor = kFactors[kind];
    int const length = 1 << note; // of a whole note, that many make one
    // Only a 2 on top and the power of two below have anything in common.
    return factor.first % 2 == 0 && length > 1 ? DurationValue(factor.first / 2, factor.second * (length / 2))
                                               : DurationValue(factor.first, factor.second * length);
}

bool NoteDuration::Find(DurationValue const &value, NoteDuration &found) {
    if (value.first <= 0 || value.second <= 0)
        return false;
    for (int kind = 0; kind < kKindCount; ++kind) {
        for (int note = 0; note < kNotes; ++note) {
            NoteDuration const candidate{note, static_cast<Kind>(kind)};
            DurationValue const exact = candidate.Value();
            if (static_cast<long long>(value.first) * exact.second ==
                static_cast<long long>(exact.first) * value.second) {
                found = candidate;
                return true;
            }
        }
    }
    return false;
}

UString NoteDuration::Name() const {
    return LocalizedStrings::GetString(kNameList, static_cast<short>(kFirstNames[kind] + note));
}
