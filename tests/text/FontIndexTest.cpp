#include "text/FontIndex.h"
#include <gtest/gtest.h>

TEST(FontIndex, ZeroToNineStand) {
    for (int number = 0; number <= 9; ++number)
        EXPECT_EQ(FontIndexFromFSRID(number), number);
}

TEST(FontIndex, ThirtyAndThirtyOneAreFormerNumbersOfZeroAndOne) {
    EXPECT_EQ(FontIndexFromFSRID(30), 0);
    EXPECT_EQ(FontIndexFromFSRID(31), 1);
}

TEST(FontIndex, EveryOtherNumberIsZero) {
    for (int number = 10; number <= 255; ++number)
        EXPECT_EQ(FontIndexFromFSRID(number), number == 31 ? 1 : 0) << number;
}

TEST(FontIndex, OnlyTheLowByteCounts) {
    EXPECT_EQ(FontIndexFromFSRID(0x1203), 3);
    EXPECT_EQ(FontIndexFromFSRID(0x7FFFFF1F), 1);
    EXPECT_EQ(FontIndexFromFSRID(-256 + 5), 5);
    EXPECT_EQ(FontIndexFromFSRID(-1), 0);
}
