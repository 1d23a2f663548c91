#include "graphics/WholeNumber.h"
#include <gtest/gtest.h>
#include <limits>

namespace {

int const kLeast = std::numeric_limits<int>::min(), kGreatest = std::numeric_limits<int>::max();
double const kInfinity = std::numeric_limits<double>::infinity();

} // namespace

TEST(WholeNumberTest, LeavesOutTheFraction) {
    EXPECT_EQ(WholeNumber(2.9), 2);
    EXPECT_EQ(WholeNumber(-2.9), -2);
    EXPECT_EQ(WholeNumber(-0.5), 0);
    EXPECT_EQ(WholeNumber(kGreatest + 0.5), kGreatest);
    EXPECT_EQ(WholeNumber(kLeast - 0.5), kLeast);
}

TEST(WholeNumberTest, GivesTheSmallestIntForWhatDoesNotFit) {
    for (double number : {kGreatest + 1.0, kLeast - 1.0, 1e300, -1e300, kInfinity, -kInfinity,
                          std::numeric_limits<double>::quiet_NaN()})
        EXPECT_EQ(WholeNumber(number), kLeast) << number;
}
