// How resources name fonts.
#pragma once

// The index in the application's font table that an "FSRID" value stands for; its low byte counts. 0 to 9 are
// indices. 30 and 31 are former numbers of the fonts 0 and 1; any other value means font 0 as well.
inline short FontIndexFromFSRID(int fsrid) {
    int const kLastIndex = 9;
    int const kFormerFont1 = 31;
    int const number = static_cast<unsigned char>(fsrid);
    if (number <= kLastIndex)
        return static_cast<short>(number);
    return number == kFormerFont1 ? 1 : 0;
}
