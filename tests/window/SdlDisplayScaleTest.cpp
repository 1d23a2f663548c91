#include "desktop/windows/SdlDisplayScale.h"
#include <gtest/gtest.h>
#include <limits>

TEST(SdlDisplayScale, ATextResolutionGivesTheNearestQuarter) {
    EXPECT_EQ(SdlDisplayScale::FromTextResolution(96), 1.0);
    EXPECT_EQ(SdlDisplayScale::FromTextResolution(107), 1.0);
    EXPECT_EQ(SdlDisplayScale::FromTextResolution(108), 1.25);
    EXPECT_EQ(SdlDisplayScale::FromTextResolution(144), 1.5);
    EXPECT_EQ(SdlDisplayScale::FromTextResolution(192), 2.0);
}

TEST(SdlDisplayScale, ATextResolutionGivesNothingBelowOneOrAboveFour) {
    EXPECT_EQ(SdlDisplayScale::FromTextResolution(48), 1.0);
    EXPECT_EQ(SdlDisplayScale::FromTextResolution(0), 1.0);
    EXPECT_EQ(SdlDisplayScale::FromTextResolution(-96), 1.0);
    EXPECT_EQ(SdlDisplayScale::FromTextResolution(100000), 4.0);
    EXPECT_EQ(SdlDisplayScale::FromTextResolution(std::numeric_limits<double>::infinity()), 4.0);
    EXPECT_EQ(SdlDisplayScale::FromTextResolution(std::numeric_limits<double>::quiet_NaN()), 1.0);
}

TEST(SdlDisplayScale, OnlyADisplayThatIsSurelyDenseIsScaled) {
    EXPECT_EQ(SdlDisplayScale::FromDisplayDensity(109), 1.0);
    EXPECT_EQ(SdlDisplayScale::FromDisplayDensity(143), 1.0);
    EXPECT_EQ(SdlDisplayScale::FromDisplayDensity(144), 1.5);
    EXPECT_EQ(SdlDisplayScale::FromDisplayDensity(220), 2.25);
}
