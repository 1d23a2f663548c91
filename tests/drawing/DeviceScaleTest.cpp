#include "desktop/drawing/DeviceScale.h"
#include <cmath>
#include <limits>

TEST(DeviceScale, EdgesRoundToTheNearestDevicePixelHalvesUp) {
    DeviceScale const quarter(1.25), half(1.5);
    int const quarterEdges[] = {0, 1, 3, 4, 5, 6, 8};
    int const halfEdges[] = {0, 2, 3, 5, 6, 8, 9};
    for (int i = 0; i < 7; ++i) {
        EXPECT_EQ(quarter.Edge(i), quarterEdges[i]);
        EXPECT_EQ(half.Edge(i), halfEdges[i]);
    }
}

TEST(DeviceScale, TheSpacingOfEdgesDoesNotDependOnTheirSign) {
    for (double factor : {1.25, 1.5, 1.1}) {
        DeviceScale const scale(factor);
        for (int i = -40; i < 0; ++i)
            EXPECT_EQ(scale.Edge(i + 1) - scale.Edge(i), scale.Edge(i + 41) - scale.Edge(i + 40))
                << factor << " at " << i;
    }
}

TEST(DeviceScale, WholeFactorsMultiply) {
    EXPECT_EQ(DeviceScale(2).Edge(-7), -14);
    EXPECT_EQ(DeviceScale(1).Edge(32767), 32767);
    EXPECT_TRUE(DeviceScale(3).IsWhole());
    EXPECT_FALSE(DeviceScale(1.5).IsWhole());
}

TEST(DeviceScale, EveryDevicePixelBelongsToTheLogicalPixelWhoseEdgesHoldIt) {
    for (double factor : {0.5, 0.75, 1.0, 1.1, 1.25, 1.5, 1.75, 2.0, 3.3, 4.0}) {
        DeviceScale const scale(factor);
        for (int device = -50; device < 50; ++device) {
            int const logical = scale.ToLogical(device);
            EXPECT_LE(scale.Edge(logical), device) << factor;
            EXPECT_GT(scale.Edge(logical + 1), device) << factor;
        }
    }
}

TEST(DeviceScale, FactorsOutOfRangeAreCutAndWhatIsNotANumberIsOne) {
    EXPECT_EQ(DeviceScale(0.1).Factor(), 0.5);
    EXPECT_EQ(DeviceScale(-2).Factor(), 0.5);
    EXPECT_EQ(DeviceScale(100).Factor(), 4.0);
    EXPECT_EQ(DeviceScale(std::numeric_limits<double>::infinity()).Factor(), 4.0);
    EXPECT_EQ(DeviceScale(std::nan("")).Factor(), 1.0);
    EXPECT_EQ(DeviceScale(1.25).Factor(), 1.25);
}

TEST(DeviceScale, AMoveIsExactWhenItsDistanceIsAWholeNumberOfDevicePixels) {
    EXPECT_TRUE(DeviceScale(1.25).MovesExactly(4));
    EXPECT_TRUE(DeviceScale(1.25).MovesExactly(-8));
    EXPECT_FALSE(DeviceScale(1.25).MovesExactly(2));
    EXPECT_TRUE(DeviceScale(1.5).MovesExactly(2));
    EXPECT_FALSE(DeviceScale(1.5).MovesExactly(1));
    EXPECT_TRUE(DeviceScale(2).MovesExactly(1));
    EXPECT_TRUE(DeviceScale(1.1).MovesExactly(10));
}
