#include "lists/ColumnList.h"
#include "host/OSFont.h"
#include "host/TextLayout.h"
#include "tests/PaneTest.h"
#include <limits>
#include <utility>

namespace {

typedef std::vector<std::pair<int, int>> Edges;

// Three columns of 100 pixels each, side by side.
class ColumnListTest : public PaneTest {
protected:
    ColumnListTest()
        : columns(3) {
        for (short i = 0; i < 3; ++i)
            columns.SetBothEdges(i, i * 100, i * 100 + 100);
    }

    static Edges EdgesOf(ColumnList const &list) {
        Edges edges;
        for (int i = 0; i < list.GetNumColumns(); ++i)
            edges.push_back({list.GetLeftEdge(i), list.GetRightEdge(i)});
        return edges;
    }
    static int WidthOf(UString const &name) {
        SaveTextState const textState;
        SetFontData(GetIndVelaFont(8));
        return LooseStringWidth(name, 0.0f, 1.0f);
    }

    ColumnList columns;
};

} // namespace

TEST_F(ColumnListTest, IsMadeOfDefaultColumns) {
    ColumnList const made(2);
    ASSERT_EQ(made.GetNumColumns(), 2);
    EXPECT_EQ(EdgesOf(made), (Edges{{0, 0}, {0, 0}}));
    EXPECT_TRUE(made.GetName(0) == UString());
    EXPECT_EQ(made.GetColumnMargin(0), 1);
    EXPECT_EQ(made.GetHelpTag(0), nullptr);
    OS::Help::Placement placement = OS::Help::Placement(0);
    double location = 0;
    made.GetHelpTagLoc(0, placement, location);
    EXPECT_EQ(placement, 3);
    EXPECT_EQ(location, 0.5);
    EXPECT_EQ(ColumnList(1).GetAlignment(0), 0);
}

TEST_F(ColumnListTest, IsMadeOfCopiesOfRecords) {
    ColumnList::Data records[2];
    records[1].leftEdge = -7;
    records[1].rightEdge = 40;
    records[1].name = Text("Length");
    ColumnList const made(2, records);
    records[1].name = Text("changed");
    ASSERT_EQ(made.GetNumColumns(), 2);
    EXPECT_EQ(made.GetLeftEdge(1), -7);
    EXPECT_EQ(made.GetWidth(1), 47);
    EXPECT_TRUE(made.GetName(1) == Text("Length"));
}

TEST_F(ColumnListTest, ACountBelowOneMakesNone) {
    ColumnList::Data record;
    EXPECT_EQ(ColumnList(0, &record).GetNumColumns(), 0);
    EXPECT_EQ(ColumnList(-3, &record).GetNumColumns(), 0);
    EXPECT_EQ(ColumnList(-3).GetNumColumns(), 0);
}

TEST_F(ColumnListTest, CopiesAreTheirOwn) {
    columns.SetName(0, Text("Name"));
    ColumnList copy(columns);
    copy.SetName(0, Text("Other"));
    copy.ResizeColumn(0, 10);
    EXPECT_TRUE(columns.GetName(0) == Text("Name"));
    EXPECT_EQ(columns.GetWidth(0), 100);
    copy = columns;
    EXPECT_TRUE(copy.GetName(0) == Text("Name"));
}

TEST_F(ColumnListTest, KeepsWhatIsSet) {
    LocalizedStrings::HelpTag const *const tag =
        LocalizedStrings::HelpTagMgr::Instance().DemandHelpTag("kTrackSelector", "kTrackSelector");
    columns.SetName(1, Text("Track"));
    columns.SetAlignment(1, TextSettings::Alignment(2));
    columns.SetColumnMargin(1, 4);
    columns.SetHelpTag(1, tag);
    columns.SetHelpTagLoc(1, OS::Help::Placement(1), 0.25);
    EXPECT_TRUE(columns.GetName(1) == Text("Track"));
    EXPECT_EQ(columns.GetAlignment(1), 2);
    EXPECT_EQ(columns.GetColumnMargin(1), 4);
    EXPECT_EQ(columns.GetHelpTag(1), tag);
    OS::Help::Placement placement = OS::Help::Placement(0);
    double location = 0;
    columns.GetHelpTagLoc(1, placement, location);
    EXPECT_EQ(placement, 1);
    EXPECT_EQ(location, 0.25);
}

TEST_F(ColumnListTest, GivesBothEdgesInEitherSize) {
    int left = 0, right = 0;
    columns.GetBothEdges(1, left, right);
    EXPECT_EQ(left, 100);
    EXPECT_EQ(right, 200);
    short shortLeft = 0, shortRight = 0;
    columns.GetBothEdges(2, shortLeft, shortRight);
    EXPECT_EQ(shortLeft, 200);
    EXPECT_EQ(shortRight, 300);
}

TEST_F(ColumnListTest, ItsEdgesAreTheOutermostOfItsColumns) {
    columns.SetBothEdges(1, -20, 450);
    EXPECT_EQ(columns.GetColumnListLeftEdge(), -20);
    EXPECT_EQ(columns.GetColumnListRightEdge(), 450);
}

TEST_F(ColumnListTest, WithoutColumnsItsEdgesAreTheEndsOfAnInt) {
    ColumnList const none(0);
    EXPECT_EQ(none.GetColumnListLeftEdge(), std::numeric_limits<int>::max());
    EXPECT_EQ(none.GetColumnListRightEdge(), std::numeric_limits<int>::min());
}

// Setting edges

TEST_F(ColumnListTest, AColumnIsNotNarrowerThanItsNameInTheHeadersFont) {
    UString const name = Text("Position");
    columns.SetName(0, name);
    columns.SetBothEdges(0, 100, 101);
    EXPECT_EQ(columns.GetLeftEdge(0), 100);
    EXPECT_EQ(columns.GetRightEdge(0), 100 + WidthOf(name) + 2);
    columns.SetBothEdges(0, 100, 100 + WidthOf(name) + 2);
    EXPECT_EQ(columns.GetWidth(0), WidthOf(name) + 2);
    columns.SetBothEdges(0, 100, 50);
    EXPECT_EQ(columns.GetWidth(0), WidthOf(name) + 2);
}

TEST_F(ColumnListTest, AColumnOfNoWidthStaysPossible) {
    columns.SetName(0, Text("Position"));
    columns.SetBothEdges(0, 100, 100);
    EXPECT_EQ(columns.GetWidth(0), 0);
}

TEST_F(ColumnListTest, AColumnWithoutANameIsTwoPixelsWideAtLeast) {
    columns.SetBothEdges(0, 100, 101);
    EXPECT_EQ(columns.GetRightEdge(0), 102);
    columns.SetBothEdges(0, 100, 103);
    EXPECT_EQ(columns.GetRightEdge(0), 103);
}

// The headers' font counts, whatever the port has.
TEST_F(ColumnListTest, TheFontOfThePortDoesNotMatter) {
    columns.SetName(0, Text("Position"));
    for (int font = 0; font < 8; ++font) {
        SetFontData(GetIndVelaFont(font));
        columns.SetBothEdges(0, 0, 1);
        EXPECT_EQ(columns.GetWidth(0), WidthOf(Text("Position")) + 2) << font;
    }
}

TEST_F(ColumnListTest, SettingEdgesLeavesOtherColumnsAlone) {
    columns.SetBothEdges(1, 150, 420);
    EXPECT_EQ(EdgesOf(columns), (Edges{{0, 100}, {150, 420}, {200, 300}}));
}

TEST_F(ColumnListTest, EdgesAreCutToSixteenBits) {
    columns.SetBothEdges(0, 65536 + 5, 65536 + 105);
    EXPECT_EQ(columns.GetLeftEdge(0), 5);
    EXPECT_EQ(columns.GetRightEdge(0), 105);
    int const greatest = std::numeric_limits<int>::max();
    columns.SetBothEdges(0, greatest, 0);
    EXPECT_EQ(columns.GetLeftEdge(0), -1);
}

TEST_F(ColumnListTest, MeasuringLeavesThePortsFontAlone) {
    SetFontData(GetIndVelaFont(0));
    int const before = LooseStringWidth(Text("Hamburgefonstiv"), 0.0f, 1.0f);
    columns.SetBothEdges(0, 0, 10);
    EXPECT_EQ(LooseStringWidth(Text("Hamburgefonstiv"), 0.0f, 1.0f), before);
}

// Resizing

TEST_F(ColumnListTest, AWiderColumnPushesThoseToItsRightAgainstTheWall) {
    columns.ResizeColumn(0, 150);
    EXPECT_EQ(EdgesOf(columns), (Edges{{0, 150}, {150, 250}, {250, 300}}));
}

TEST_F(ColumnListTest, AColumnBeyondTheWallLeavesNoRoomForTheOthers) {
    columns.ResizeColumn(0, 500);
    EXPECT_EQ(EdgesOf(columns), (Edges{{0, 300}, {300, 300}, {300, 300}}));
}

TEST_F(ColumnListTest, ANarrowerColumnPullsThoseToItsRight) {
    columns.ResizeColumn(1, 50);
    EXPECT_EQ(EdgesOf(columns), (Edges{{0, 100}, {100, 150}, {150, 300}}));
    columns.ResizeColumn(0, 20);
    EXPECT_EQ(EdgesOf(columns), (Edges{{0, 20}, {20, 70}, {70, 300}}));
}

TEST_F(ColumnListTest, TheLastColumnMadeWiderBecomesNarrower) {
    columns.ResizeColumn(2, 130);
    EXPECT_EQ(EdgesOf(columns), (Edges{{0, 100}, {100, 200}, {230, 300}}));
}

TEST_F(ColumnListTest, TheLastColumnMadeNarrowerMovesToTheLeft) {
    columns.ResizeColumn(2, 50);
    EXPECT_EQ(EdgesOf(columns), (Edges{{0, 100}, {100, 200}, {150, 250}}));
}

TEST_F(ColumnListTest, ASingleColumnIsTheLastOne) {
    ColumnList single(1);
    single.SetBothEdges(0, 0, 100);
    single.ResizeColumn(0, 130);
    EXPECT_EQ(EdgesOf(single), (Edges{{30, 100}}));
    single.ResizeColumn(0, 50);
    EXPECT_EQ(EdgesOf(single), (Edges{{10, 80}}));
}

// What is on the other side of the wall does not come before it by being pushed.
TEST_F(ColumnListTest, ColumnsBeyondTheWallComeBackToIt) {
    columns.SetBothEdges(1, 350, 400);
    columns.ResizeColumn(0, 110);
    EXPECT_EQ(EdgesOf(columns), (Edges{{0, 110}, {300, 300}, {210, 300}}));
}

TEST_F(ColumnListTest, WidthsBeyondSixteenBitsAreCut) {
    columns.ResizeColumn(0, 65536 + 150);
    EXPECT_EQ(EdgesOf(columns), (Edges{{0, 150}, {150, 250}, {250, 300}}));
    columns.ResizeColumn(0, std::numeric_limits<int>::max());
    EXPECT_EQ(columns.GetRightEdge(0), -1);
}
