#include "desktop/type/TextWidths.h"
#include <gtest/gtest.h>
#include <string>

namespace {

TextShape OfSize(int size) {
    TextShape shape;
    shape.font.size = size;
    return shape;
}

std::u16string Number(int n) {
    std::string const digits = std::to_string(n);
    return std::u16string(digits.begin(), digits.end());
}

TEST(TextWidths, FindWhatWasAddedUnderTextAndShape) {
    TextWidths widths(100, 1000);
    widths.Add(u"a", OfSize(10), 5);
    widths.Add(u"a", OfSize(12), 6);
    widths.Add(u"", OfSize(10), 0);
    EXPECT_EQ(widths.Find(u"a", OfSize(10)), 5);
    EXPECT_EQ(widths.Find(u"a", OfSize(12)), 6);
    EXPECT_EQ(widths.Find(u"", OfSize(10)), 0);
    EXPECT_EQ(widths.Find(u"b", OfSize(10)), std::nullopt);
    EXPECT_EQ(widths.Find(u"aa", OfSize(10)), std::nullopt);
}

TEST(TextWidths, KeepAsManyAsAWindowAsksFor) {
    TextWidths widths(4000, 100000);
    for (int i = 0; i < 1600; ++i)
        widths.Add(Number(i), OfSize(12), i);
    for (int i = 0; i < 1600; ++i)
        ASSERT_EQ(widths.Find(Number(i), OfSize(12)), i);
    EXPECT_EQ(widths.Size(), 1600u);
}

TEST(TextWidths, ForgetWhatHasNotBeenAskedForForLong) {
    TextWidths widths(20, 1000);
    for (int i = 0; i < 1000; ++i) {
        widths.Add(Number(i), OfSize(12), i);
        ASSERT_EQ(widths.Find(u"0", OfSize(12)), 0) << "asked for again and again";
        ASSERT_LE(widths.Size(), 20u);
    }
    EXPECT_EQ(widths.Find(u"5", OfSize(12)), std::nullopt);
    EXPECT_EQ(widths.Find(u"999", OfSize(12)), 999);
}

TEST(TextWidths, AreBoundedByTheLengthOfTheirTextsToo) {
    TextWidths widths(1000, 20);
    widths.Add(u"12345678", OfSize(12), 1);
    widths.Add(u"abcdefgh", OfSize(12), 2);
    widths.Add(u"ABCDEFGH", OfSize(12), 3);
    EXPECT_EQ(widths.Find(u"12345678", OfSize(12)), std::nullopt);
    EXPECT_EQ(widths.Find(u"ABCDEFGH", OfSize(12)), 3);
    widths.Add(std::u16string(1000, u'x'), OfSize(12), 4);
    EXPECT_EQ(widths.Find(std::u16string(1000, u'x'), OfSize(12)), std::nullopt)
        << "longer than all together";
    EXPECT_EQ(widths.Find(u"ABCDEFGH", OfSize(12)), 3) << "and takes nobody's room";
}

TEST(TextWidths, OfMoreShapesThanAnyWindowHasAreForgottenAndFoundAnew) {
    TextWidths widths(10000, 100000);
    for (int size = 1; size <= 500; ++size) {
        widths.Add(u"a", OfSize(size), size);
        ASSERT_EQ(widths.Find(u"a", OfSize(size)), size);
    }
    EXPECT_LE(widths.Size(), 64u);
}

TEST(TextWidths, AreEmptyOnceCleared) {
    TextWidths widths(10, 100);
    widths.Add(u"a", OfSize(12), 1);
    widths.Clear();
    EXPECT_EQ(widths.Size(), 0u);
    EXPECT_EQ(widths.Find(u"a", OfSize(12)), std::nullopt);
}

} // namespace
