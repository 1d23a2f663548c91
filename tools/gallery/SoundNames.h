// The names of 100,000 sounds, and those among them that a search finds.
#pragma once
#include "host/UString.h"
#include <vector>

class SoundNames {
public:
    static constexpr int kCount = 100000;

    SoundNames(); // all of them are found

    // From here on, those that match the string as SearchFieldPane marks matches; all of them for an empty
    // one.
    void Search(UString const &);
    int CountFound() const { return static_cast<int>(found.size()); }
    // Of a row among those that were found.
    UString const &Name(int row) const;
    UString Length(int row) const; // minutes and seconds

private:
    int Sound(int row) const { return found[static_cast<std::size_t>(row)]; }

    UString sought;         // as it is compared
    std::vector<int> found; // sounds, in order
};
