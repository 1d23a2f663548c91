// Finding and changing paragraphs, beside a plain list of them.
#include "desktop/editing/ParagraphIndex.h"
#include <gtest/gtest.h>
#include <random>
#include <vector>

namespace {

typedef ParagraphIndex::Paragraph Paragraph;

class PlainList {
public:
    std::vector<Paragraph> paragraphs = {{0, 0, false}};

    void Replace(std::size_t first, std::size_t count, std::vector<Paragraph> const &others) {
        auto const begin = paragraphs.begin() + static_cast<std::ptrdiff_t>(first);
        auto const place = paragraphs.erase(begin, begin + static_cast<std::ptrdiff_t>(count));
        paragraphs.insert(place, others.begin(), others.end());
        if (paragraphs.empty())
            paragraphs.push_back({0, 0, false});
    }
};

class ParagraphIndexTest : public testing::Test {
protected:
    std::vector<Paragraph> Random(std::size_t count) {
        std::vector<Paragraph> made;
        for (std::size_t i = 0; i < count; ++i)
            made.push_back({static_cast<std::uint32_t>(random() % 5),
                            static_cast<std::uint32_t>(random() % 40), random() % 2 == 0});
        return made;
    }
    void Replace(std::size_t first, std::size_t count, std::vector<Paragraph> const &others) {
        index.Replace(index.Prepare(first, count, others));
        plain.Replace(first, count, others);
    }

    // Everything that can be asked.
    void ExpectAlike() {
        std::vector<Paragraph> const &list = plain.paragraphs;
        ASSERT_EQ(index.Count(), list.size());
        std::size_t unit = 0;
        long long pixel = 0;
        for (std::size_t i = 0; i < list.size(); ++i) {
            ASSERT_EQ(index.StartOf(i), unit) << i;
            ASSERT_EQ(index.TopOf(i), pixel) << i;
            Paragraph const p = index.At(i);
            ASSERT_TRUE(p.units == list[i].units && p.height == list[i].height &&
                        p.measured == list[i].measured)
                << i;
            bool const isLast = i + 1 == list.size();
            if (p.units > 0 || isLast) {
                ASSERT_EQ(index.AtUnit(unit), i);
                ASSERT_EQ(index.AtUnit(unit + std::max(p.units, 1u) - 1), i);
            }
            if ((p.height > 0 || isLast) && pixel > 0) {
                ASSERT_EQ(index.AtHeight(pixel), i);
                ASSERT_EQ(index.AtHeight(pixel + std::max(p.height, 1u) - 1), i);
            }
            unit += p.units;
            pixel += p.height;
        }
        EXPECT_EQ(index.Units(), unit);
        EXPECT_EQ(index.Height(), pixel);
        EXPECT_EQ(index.StartOf(list.size()), unit);
        EXPECT_EQ(index.TopOf(list.size()), pixel);
        EXPECT_EQ(index.AtUnit(unit + 1000), list.size() - 1);
        EXPECT_EQ(index.AtHeight(pixel + 1000), list.size() - 1);
        EXPECT_EQ(index.AtHeight(-1), 0u);
    }

    ParagraphIndex index;
    PlainList plain;
    std::mt19937 random{11};
};

TEST_F(ParagraphIndexTest, BeginsWithOneThatIsEmpty) { ExpectAlike(); }

TEST_F(ParagraphIndexTest, ManyComeAndGoAtOnce) {
    Replace(0, 1, Random(3000));
    ExpectAlike();
    Replace(100, 2500, {});
    ExpectAlike();
    Replace(0, 500, {});
    ExpectAlike();
}

TEST_F(ParagraphIndexTest, SomeComeInBehindTheLast) {
    Replace(0, 1, Random(700));
    Replace(700, 0, Random(3));
    ExpectAlike();
    Replace(703, 0, Random(1000));
    ExpectAlike();
}

TEST_F(ParagraphIndexTest, ManyTakeThePlaceOfAsMany) {
    Replace(0, 1, Random(2000));
    Replace(300, 900, Random(900));
    ExpectAlike();
}

TEST_F(ParagraphIndexTest, RandomChangesLeaveItRight) {
    Replace(0, 1, Random(1200));
    for (int i = 0; i < 60; ++i) {
        std::size_t const count = index.Count(), first = random() % (count + 1);
        std::size_t const most = i % 10 == 0 ? 900 : 4;
        std::size_t const removed = std::min<std::size_t>(random() % most, count - first);
        Replace(first, removed, Random(random() % most));
        std::size_t const at = random() % index.Count();
        std::uint32_t const height = static_cast<std::uint32_t>(random() % 100);
        index.SetHeight(at, height, true);
        plain.paragraphs[at].height = height;
        plain.paragraphs[at].measured = true;
        ASSERT_NO_FATAL_FAILURE(ExpectAlike()) << i;
    }
}

TEST_F(ParagraphIndexTest, AllHeightsAreGuessedAnew) {
    Replace(0, 1, Random(2000));
    auto const guess = [](std::uint32_t units) { return units * 3 + 1; };
    index.ForgetHeights(guess);
    for (Paragraph &p : plain.paragraphs)
        p = {p.units, guess(p.units), false};
    ExpectAlike();
}

TEST_F(ParagraphIndexTest, OneOfAMillionIsAddedAndTakenAway) {
    index.Replace(index.Prepare(0, 1, std::vector<Paragraph>(1000000, {60, 14, false})));
    for (int i = 0; i < 500; ++i) {
        index.Replace(index.Prepare(500000, 1, {{30, 14, false}, {31, 14, false}}));
        EXPECT_EQ(index.StartOf(500001), 30000030u);
        index.Replace(index.Prepare(500000, 2, {{60, 14, false}}));
    }
    EXPECT_EQ(index.Units(), 60000000u);
    EXPECT_EQ(index.AtUnit(59999999), 999999u);
}

} // namespace
