#include "lists/SelectionFlags.h"
#include <gtest/gtest.h>
#include <limits>
#include <random>

namespace {

int const kMany = 20000; // rows: several blocks

SelectionFlags WithRows(int count) {
    SelectionFlags flags;
    flags.SetCount(count);
    return flags;
}

} // namespace

TEST(SelectionFlagsTest, BeginsWithoutRows) {
    SelectionFlags const flags;
    EXPECT_EQ(flags.Count(), 0);
    EXPECT_FALSE(flags.Has(0));
    EXPECT_EQ(flags.FirstNonZero(), SelectionFlags::kNone);
    EXPECT_EQ(flags.FirstSelectedFrom(0), SelectionFlags::kNone);
    EXPECT_EQ(flags.LastSelectedTo(0), SelectionFlags::kNone);
}

TEST(SelectionFlagsTest, NewRowsAreNotSelected) {
    SelectionFlags flags = WithRows(3);
    flags.Set(1, 1);
    flags.SetCount(5);
    EXPECT_EQ(flags.NumNonZero(), 1);
    EXPECT_TRUE(flags.IsSelected(1));
    EXPECT_EQ(flags.At(4), 0);
}

TEST(SelectionFlagsTest, RowsThatGoAreForgotten) {
    SelectionFlags flags = WithRows(5);
    flags.Set(4, 1);
    flags.SetCount(2);
    flags.SetCount(5);
    EXPECT_EQ(flags.At(4), 0);
    EXPECT_EQ(flags.NumNonZero(), 0);
}

TEST(SelectionFlagsTest, ACountBelowZeroIsNone) {
    SelectionFlags flags = WithRows(5);
    flags.SetCount(-3);
    EXPECT_EQ(flags.Count(), 0);
}

TEST(SelectionFlagsTest, RowsThatThereAreNotAreLeftAlone) {
    SelectionFlags flags = WithRows(2);
    flags.Set(-1, 1);
    flags.Set(2, 1);
    flags.Remove(-1);
    flags.Remove(2);
    EXPECT_EQ(flags.NumNonZero(), 0);
    EXPECT_EQ(flags.Count(), 2);
    EXPECT_EQ(flags.At(-1), 0);
    EXPECT_EQ(flags.At(2), 0);
}

TEST(SelectionFlagsTest, OnlyFlagsAboveZeroAreSelected) {
    SelectionFlags flags = WithRows(4);
    flags.Set(0, -2);
    flags.Set(1, -1);
    flags.Set(2, 3);
    EXPECT_FALSE(flags.IsSelected(0));
    EXPECT_FALSE(flags.IsSelected(1));
    EXPECT_TRUE(flags.IsSelected(2));
    EXPECT_EQ(flags.NumNonZero(), 3);
    EXPECT_EQ(flags.FirstNonZero(), 0);
    EXPECT_EQ(flags.FirstSelectedFrom(0), 2);
}

TEST(SelectionFlagsTest, ANumberBeyondSixteenBitsKeepsItsSignAndWhetherItIsOdd) {
    SelectionFlags flags = WithRows(4);
    flags.Set(0, 1000001);
    flags.Set(1, 1000000);
    flags.Set(2, -1000001);
    flags.Set(3, std::numeric_limits<int>::min());
    EXPECT_GT(flags.At(0), 0);
    EXPECT_EQ(flags.At(0) & 1, 1);
    EXPECT_GT(flags.At(1), 0);
    EXPECT_EQ(flags.At(1) & 1, 0);
    EXPECT_LT(flags.At(2), 0);
    EXPECT_EQ(flags.At(2) & 1, 1);
    EXPECT_LT(flags.At(3), 0);
    EXPECT_EQ(flags.At(3) & 1, 0);
}

TEST(SelectionFlagsTest, ARowThatComesInMovesThoseBehindIt) {
    SelectionFlags flags = WithRows(3);
    flags.Set(1, 1);
    flags.Insert(1);
    EXPECT_EQ(flags.Count(), 4);
    EXPECT_FALSE(flags.IsSelected(1));
    EXPECT_TRUE(flags.IsSelected(2));
    flags.Insert(-5);
    flags.Insert(100);
    EXPECT_EQ(flags.Count(), 6);
    EXPECT_TRUE(flags.IsSelected(3));
}

TEST(SelectionFlagsTest, ARowThatGoesMovesThoseBehindIt) {
    SelectionFlags flags = WithRows(3);
    flags.Set(2, 1);
    flags.Remove(0);
    EXPECT_EQ(flags.Count(), 2);
    EXPECT_TRUE(flags.IsSelected(1));
}

TEST(SelectionFlagsTest, NormalisedFlagsAreZeroOrOne) {
    SelectionFlags flags = WithRows(6);
    int const values[] = {-2, -1, 0, 1, 2, 3};
    for (int row = 0; row < 6; ++row)
        flags.Set(row, values[row]);
    flags.Normalise();
    int const expected[] = {0, 0, 0, 1, 1, 1};
    for (int row = 0; row < 6; ++row)
        EXPECT_EQ(flags.At(row), expected[row]) << row;
}

TEST(SelectionFlagsTest, FlagsThatHaveMovedMeanwhileAreNormalisedToo) {
    SelectionFlags flags = WithRows(6);
    flags.Set(2, 3);
    flags.Set(4, -1);
    flags.Insert(0);
    flags.Remove(4);
    flags.Normalise();
    EXPECT_EQ(flags.At(3), 1);
    EXPECT_EQ(flags.At(4), 0);
    EXPECT_EQ(flags.NumNonZero(), 1);
}

TEST(SelectionFlagsTest, AllBecomeZero) {
    SelectionFlags flags = WithRows(kMany);
    for (int row = 0; row < kMany; row += 7)
        flags.Set(row, 1);
    flags.SetAllToZero();
    EXPECT_EQ(flags.NumNonZero(), 0);
    for (int row = 0; row < kMany; ++row)
        ASSERT_EQ(flags.At(row), 0) << row;
}

TEST(SelectionFlagsTest, ZerosBecomeOneAndOthersStay) {
    SelectionFlags flags = WithRows(kMany);
    flags.Set(5, -1);
    flags.Set(9000, 2);
    flags.SetZerosToOne();
    EXPECT_EQ(flags.At(5), -1);
    EXPECT_EQ(flags.At(9000), 2);
    EXPECT_EQ(flags.At(0), 1);
    EXPECT_EQ(flags.At(kMany - 1), 1);
    EXPECT_EQ(flags.NumNonZero(), kMany);
    flags.Normalise();
    EXPECT_EQ(flags.NumNonZero(), kMany - 1);
    EXPECT_EQ(flags.FirstSelectedFrom(5), 6);
}

TEST(SelectionFlagsTest, TheNearestSelectedRowIsFoundOverManyRows) {
    SelectionFlags flags = WithRows(kMany);
    flags.Set(3, 1);
    flags.Set(kMany - 2, 1);
    EXPECT_EQ(flags.FirstSelectedFrom(3), 3);
    EXPECT_EQ(flags.FirstSelectedFrom(4), kMany - 2);
    EXPECT_EQ(flags.FirstSelectedFrom(kMany - 1), SelectionFlags::kNone);
    EXPECT_EQ(flags.LastSelectedTo(kMany - 3), 3);
    EXPECT_EQ(flags.LastSelectedTo(kMany + 100), kMany - 2);
    EXPECT_EQ(flags.LastSelectedTo(2), SelectionFlags::kNone);
    EXPECT_EQ(flags.FirstSelectedFrom(-10), 3);
}

// A deselected row of a running gesture has a flag, but is no selected row.
TEST(SelectionFlagsTest, SearchingPassesOverFlagsBelowZero) {
    SelectionFlags flags = WithRows(kMany);
    flags.Set(5000, -1);
    flags.Set(9000, 1);
    EXPECT_EQ(flags.FirstSelectedFrom(0), 9000);
    EXPECT_EQ(flags.LastSelectedTo(8999), SelectionFlags::kNone);
}

TEST(SelectionFlagsTest, AgreesWithAPlainVectorWhateverIsDone) {
    std::mt19937 random(1);
    auto const below = [&random](int limit) {
        return static_cast<int>(random() % static_cast<unsigned int>(limit));
    };
    SelectionFlags flags;
    std::vector<int> plain;
    for (int step = 0; step < 3000; ++step) {
        int const rows = static_cast<int>(plain.size());
        int const row = below(rows + 1);
        switch (below(6)) {
        case 0:
            flags.Insert(row);
            plain.insert(plain.begin() + row, 0);
            break;
        case 1:
            flags.Remove(row);
            if (row < rows)
                plain.erase(plain.begin() + row);
            break;
        case 2:
            if (below(30) == 0) {
                int const count = below(3 * 4096);
                flags.SetCount(count);
                plain.resize(static_cast<std::size_t>(count), 0);
            }
            break;
        case 3:
            if (below(30) == 0) {
                flags.Normalise();
                for (int &flag : plain)
                    flag = flag > 0;
            }
            break;
        default: {
            int const flag = below(6) - 2;
            flags.Set(row, flag);
            if (row < rows)
                plain[static_cast<std::size_t>(row)] = flag;
        }
        }
        ASSERT_EQ(flags.Count(), static_cast<int>(plain.size()));
        if (step % 100 != 0)
            continue;
        int nonZero = 0;
        for (int i = 0; i < flags.Count(); ++i) {
            ASSERT_EQ(flags.At(i), plain[static_cast<std::size_t>(i)]) << "step " << step << ", row " << i;
            nonZero += flags.At(i) != 0;
        }
        ASSERT_EQ(flags.NumNonZero(), nonZero) << "step " << step;
    }
}
