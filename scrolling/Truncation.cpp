#include "scrolling/Truncation.h"
#include <algorithm>
#include <cmath>
#include <limits>

int Truncated(double number) {
    constexpr int kLeast = std::numeric_limits<int>::min(), kGreatest = std::numeric_limits<int>::max();
    if (std::isnan(number))
        return 0;
    if (number <= kLeast)
        return kLeast;
    if (number >= kGreatest)
        return kGreatest;
    return static_cast<int>(number);
}

int Saturated(long long number) {
    constexpr long long kLeast = std::numeric_limits<int>::min(), kGreatest = std::numeric_limits<int>::max();
    return static_cast<int>(std::clamp(number, kLeast, kGreatest));
}

short Pixel16(long long number) {
    constexpr long long kLeast = std::numeric_limits<short>::min(),
                        kGreatest = std::numeric_limits<short>::max();
    return static_cast<short>(std::clamp(number, kLeast, kGreatest));
}
