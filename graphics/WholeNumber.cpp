#include "graphics/WholeNumber.h"
#include <limits>

int WholeNumber(double number) {
    constexpr int kLeast = std::numeric_limits<int>::min(), kGreatest = std::numeric_limits<int>::max();
    // Written so that what is not a number fails, and the fraction of the ends counts.
    bool const fits = number > kLeast - 1.0 && number < kGreatest + 1.0;
    return fits ? static_cast<int>(number) : kLeast;
}
