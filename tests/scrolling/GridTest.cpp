#include "scrolling/Grid.h"
#include "tests/PaneTest.h"
#include "tests/VirtualPlace.h"
#include "tests/desktop/ProbePane.h"
#include <algorithm>

namespace {

class GridTest : public PaneTest {
protected:
    GridTest() {
        Rect box = {10, 20, 110, 220};
        grid->GridInit(glog, 7);
        grid->SetBox(&box);
    }

    ProbePane *Member(short width, short height) {
        return new ProbePane(glog, Rect{3, 4, static_cast<short>(3 + height), static_cast<short>(4 + width)},
                             calls, "member " + std::to_string(++made));
    }
    ProbePane *Added(short width, short height, short index = -1) {
        ProbePane *const member = Member(width, height);
        grid->Add(member, index);
        return member;
    }
    std::vector<Rect> Boxes() {
        std::vector<Rect> boxes;
        for (short i = 0; i < grid->NumSubpanes(); ++i)
            boxes.push_back(BoxOf(*grid->Get(i)));
        return boxes;
    }

    Calls &calls = FreshCalls();
    Grid *grid = new Grid;
    int made = 0;
};

typedef std::vector<Rect> Rects;

// A grid that leaves its first subpane out.
class GridWithHeader : public Grid {
public:
    bool IsAGridItem(GlogPane *pane) override { return pane != Get(0); }
    short GetNumGridItems() override { return static_cast<short>(NumSubpanes() - 1); }
    GlogPane *GetNthGridItem(short index) override { return Get(static_cast<short>(index + 1)); }
    short GetGridItemIndex(GlogPane *pane) override { return static_cast<short>(Find(pane) - 1); }
};

// A grid that counts what comes and goes.
class CountingGrid : public Grid {
public:
    short AddGuts(GlogPane *pane, short position) override {
        ++added;
        return Grid::AddGuts(pane, position);
    }
    void DelGuts(short index, bool keep) override {
        ++taken;
        Grid::DelGuts(index, keep);
    }
    int added = 0, taken = 0;
};

} // namespace

TEST_F(GridTest, IsMadeAsAColumnOfEqualMembersUnderItsNumber) {
    EXPECT_EQ(grid->GetID(), 7);
    EXPECT_TRUE(grid->IsVerticalGrid());
    EXPECT_FALSE(grid->GetMayHaveDifferentSizes());
}

TEST_F(GridTest, CannotBeMadeWithoutAGlog) {
    Grid grid;
    EXPECT_EQ(grid.GridInit(nullptr, 1), nullptr);
}

TEST_F(GridTest, AddsItsOperationsAfterThoseOfAContainer) {
    class Added : public CompoundPane {
    public:
        virtual void First() {}
    };
    ExpectInOrder(PlaceOf(&Added::First), &Grid::Move, &Grid::Reposition, &Grid::ListHeight, &Grid::ListWidth,
                  &Grid::SetMemberBounds, &Grid::GetNumGridItems, &Grid::GetNthGridItem,
                  &Grid::GetGridItemIndex, &Grid::IsAGridItem);
}

TEST_F(GridTest, MayBecomeNearlyAsLargeAsCoordinatesGo) {
    EXPECT_EQ(Grid::MaxListHeight(), 32667);
    EXPECT_EQ(Grid::MaxListWidth(), 32667);
}

TEST_F(GridTest, StacksMembersDownwardInTheirSizes) {
    Added(50, 20);
    Added(30, 10);
    Added(60, 40);
    EXPECT_EQ(Boxes(), (Rects{{0, 0, 20, 50}, {20, 0, 30, 30}, {30, 0, 70, 60}}));
}

TEST_F(GridTest, RunsToTheRightWhenItIsNotVertical) {
    grid->SetVerticalGrid(false);
    Added(50, 20);
    Added(30, 10);
    EXPECT_EQ(Boxes(), (Rects{{0, 0, 20, 50}, {0, 50, 10, 80}}));
}

TEST_F(GridTest, SettingTheAxisLaysOutNothing) {
    Added(50, 20);
    Added(30, 10);
    Rects const before = Boxes();
    grid->SetVerticalGrid(false);
    grid->SetMayHaveDifferentSizes(true);
    EXPECT_EQ(Boxes(), before);
}

TEST_F(GridTest, AddAnswersTheIndex) {
    EXPECT_EQ(grid->Add(Member(10, 10), -1), 0);
    EXPECT_EQ(grid->Add(Member(10, 10), -1), 1);
    EXPECT_EQ(grid->Add(Member(10, 10), 0), 0);
    EXPECT_LT(grid->Add(nullptr, -1), 0);
}

TEST_F(GridTest, AddAtTheBeginningLaysOutEveryMember) {
    Added(50, 20);
    Added(30, 10);
    Added(40, 5, 0);
    EXPECT_EQ(Boxes(), (Rects{{0, 0, 5, 40}, {5, 0, 25, 50}, {25, 0, 35, 30}}));
}

TEST_F(GridTest, AddInvalidatesTheNewMemberAndThoseBehindIt) {
    Added(50, 20);
    Added(30, 10);
    Show();
    Added(40, 5, 1);
    calls.clear();
    std::vector<Rect> const drawn = Repainted();
    auto const covers = [&](Rect const &member) {
        return std::any_of(drawn.begin(), drawn.end(), [&](Rect const &r) {
            return r.top <= member.top && r.left <= member.left && r.bottom >= member.bottom &&
                   r.right >= member.right;
        });
    };
    EXPECT_TRUE(covers({30, 20, 35, 60}));
    EXPECT_TRUE(covers({35, 20, 45, 50}));
    EXPECT_EQ(Count(calls, "member 3: draw"), 1);
    EXPECT_EQ(Count(calls, "member 2: draw"), 1);
}

TEST_F(GridTest, AddAtTheEndMovesNoOtherMember) {
    Added(50, 20);
    Added(30, 10);
    calls.clear();
    Added(10, 10);
    EXPECT_EQ(Count(calls, "member 1: PanePositionChanged"), 0);
    EXPECT_EQ(Count(calls, "member 2: PanePositionChanged"), 0);
}

TEST_F(GridTest, DelLaysOutWhatComesBehind) {
    Added(50, 20);
    Added(30, 10);
    Added(60, 40);
    grid->Del(0);
    EXPECT_EQ(Boxes(), (Rects{{0, 0, 10, 30}, {10, 0, 50, 60}}));
    EXPECT_EQ(Count(calls, "member 1: gone"), 1);
}

TEST_F(GridTest, DelOfTheLastMovesNone) {
    Added(50, 20);
    Added(30, 10);
    calls.clear();
    grid->Del(1);
    EXPECT_EQ(calls, Calls{"member 2: gone"});
}

TEST_F(GridTest, DelIgnoresAnIndexThatDoesNotExist) {
    Added(50, 20);
    calls.clear();
    grid->Del(-1);
    grid->Del(1);
    EXPECT_EQ(grid->NumSubpanes(), 1);
    EXPECT_TRUE(calls.empty());
}

TEST_F(GridTest, DelInvalidatesOnlyTheMemberThatGoes) {
    Added(50, 20);
    Added(30, 10);
    Added(60, 40);
    Show();
    grid->Del(1);
    EXPECT_EQ(Repainted(), (Rects{{30, 20, 40, 50}})); // the last member has moved without being drawn
}

TEST_F(GridTest, MoveLaysOutWhatLiesBetweenTheIndices) {
    Added(50, 20);
    Added(30, 10);
    Added(60, 40);
    Added(10, 10);
    calls.clear();
    grid->Move(0, 2);
    EXPECT_EQ(Boxes(), (Rects{{0, 0, 10, 30}, {10, 0, 50, 60}, {50, 0, 70, 50}, {70, 0, 80, 10}}));
    EXPECT_EQ(Count(calls, "member 4: PanePositionChanged"), 0);
    grid->Move(2, 0);
    EXPECT_EQ(Boxes(), (Rects{{0, 0, 20, 50}, {20, 0, 30, 30}, {30, 0, 70, 60}, {70, 0, 80, 10}}));
}

TEST_F(GridTest, MoveDrawsWhatItLaysOut) {
    Added(50, 20);
    Added(50, 10);
    Added(50, 40);
    Show();
    grid->Move(0, 1);
    EXPECT_EQ(Repainted(), (Rects{{10, 20, 40, 70}}));
}

TEST_F(GridTest, MoveToTheSameIndexDrawsThatMemberAlone) {
    Added(50, 20);
    ProbePane *const second = Added(50, 10);
    Added(50, 40);
    Show();
    grid->Move(1, 1);
    EXPECT_EQ(grid->Get(1), second);
    EXPECT_EQ(Repainted(), (Rects{{30, 20, 40, 70}}));
}

TEST_F(GridTest, MoveIsNoAdditionForASubclass) {
    CountingGrid *const counting = new CountingGrid;
    counting->GridInit(glog, 8);
    GlogPane *const first = Member(50, 20);
    counting->Add(first, -1);
    counting->Add(Member(50, 10), -1);
    EXPECT_EQ(counting->added, 2);
    counting->Move(0, 1);
    EXPECT_EQ(counting->Get(1), first);
    EXPECT_EQ(counting->taken, 1);
    EXPECT_EQ(counting->added, 2);
}

TEST_F(GridTest, MoveIgnoresIndicesThatDoNotExist) {
    Added(50, 20);
    Added(30, 10);
    Rects const before = Boxes();
    for (short const index : {short(-1), short(2)}) {
        grid->Move(index, 0);
        grid->Move(0, index);
    }
    EXPECT_EQ(Boxes(), before);
}

TEST_F(GridTest, RepositionInvalidatesOnlyWhenItIsTold) {
    Added(50, 20);
    Added(30, 10);
    Show();
    grid->Reposition(0, false);
    EXPECT_TRUE(Repainted().empty());
    grid->Reposition(1, true);
    EXPECT_EQ(Repainted(), (Rects{{30, 20, 40, 50}}));
}

TEST_F(GridTest, AMemberInALayoutIsNotMoved) {
    Added(50, 20);
    ProbePane *const second = Added(30, 10);
    Added(60, 40);
    Rect place = {5, 6, 15, 36};
    second->SetBox(&place);
    grid->SetUseLayout(true);
    ASSERT_TRUE(second->IsInLayout());
    grid->SetMemberBounds(1);
    EXPECT_EQ(BoxOf(*second), place);
}

TEST_F(GridTest, SetMemberBoundsIgnoresAnIndexThatDoesNotExist) {
    Added(50, 20);
    calls.clear();
    grid->SetMemberBounds(-1);
    grid->SetMemberBounds(1);
    EXPECT_TRUE(calls.empty());
}

TEST_F(GridTest, ASubpaneThatIsNoItemStaysWhereItIs) {
    GridWithHeader *const withHeader = new GridWithHeader;
    withHeader->GridInit(glog, 0);
    ProbePane *const header = Member(70, 15);
    withHeader->Add(header, -1);
    Rect const place = BoxOf(*header);
    withHeader->Add(Member(50, 20), -1);
    withHeader->Add(Member(50, 30), -1);
    EXPECT_EQ(BoxOf(*withHeader->Get(0)), place);
    EXPECT_EQ(BoxOf(*withHeader->Get(1)), (Rect{0, 0, 20, 50}));
    EXPECT_EQ(BoxOf(*withHeader->Get(2)), (Rect{20, 0, 50, 50}));
    EXPECT_EQ(withHeader->ListHeight(), 50);
}

TEST_F(GridTest, AnEmptyGridHasNoSize) {
    EXPECT_EQ(grid->ListHeight(), 0);
    EXPECT_EQ(grid->ListWidth(), 0);
    grid->SetMayHaveDifferentSizes(true);
    EXPECT_EQ(grid->ListHeight(), 0);
    EXPECT_EQ(grid->ListWidth(), 0);
}

TEST_F(GridTest, AlongTheAxisTheSizeReachesFromTheFirstToTheLast) {
    Added(50, 20);
    Added(30, 10);
    Added(60, 40);
    EXPECT_EQ(grid->ListHeight(), 70);
    grid->SetMayHaveDifferentSizes(true);
    EXPECT_EQ(grid->ListHeight(), 70);
}

TEST_F(GridTest, AcrossTheAxisTheSizeReachesFromTheFirstsStartToTheLastsEnd) {
    Added(50, 20);
    Added(90, 10);
    Added(60, 40);
    EXPECT_EQ(grid->ListWidth(), 60);
}

TEST_F(GridTest, MembersOfDifferentSizesAreMeasuredAcrossTheAxis) {
    Added(50, 20);
    Added(90, 10);
    Added(60, 40);
    grid->SetMayHaveDifferentSizes(true);
    EXPECT_EQ(grid->ListWidth(), 90);
}

TEST_F(GridTest, AHorizontalGridMeasuresItsTallestMember) {
    grid->SetVerticalGrid(false);
    Added(50, 20);
    Added(90, 70);
    Added(60, 40);
    EXPECT_EQ(grid->ListHeight(), 40);
    EXPECT_EQ(grid->ListWidth(), 200);
    grid->SetMayHaveDifferentSizes(true);
    EXPECT_EQ(grid->ListHeight(), 70);
    EXPECT_EQ(grid->ListWidth(), 200);
}
