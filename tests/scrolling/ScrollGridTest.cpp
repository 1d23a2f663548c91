#include "scrolling/ScrollGrid.h"
#include "desktop/drawing/Surface.h"
#include "host/OSPort.h"
#include "host/VelaDrawing.h"
#include "tests/PaneTest.h"
#include "tests/VirtualPlace.h"
#include "tests/desktop/ProbePane.h"
#include <limits>

namespace {

Rect const kView = {0, 10, 160, 110}; // 100 x 160
Rect const kUpright = {0, 110, 160, 126};

class ScrollGridTest : public PaneTest {
protected:
    ScrollGridTest() { Place(*grid); }

    void Place(ScrollGrid &placed) {
        Rect view = kView, upright = kUpright;
        placed.SetBox(&view);
        bar->SetBox(&upright);
        placed.UpdateScrollInfo();
    }
    // Members of 100 x 20 each.
    void Fill(int count) {
        for (int i = 0; i < count; ++i)
            grid->Add(new ProbePane(glog, {0, 0, 20, 100}, calls, "member " + std::to_string(i)), -1);
        calls.clear();
    }
    void TakeBar() { grid->SetScrollbar(bar); }
    int MembersTold() const {
        int told = 0;
        for (std::string const &call : calls)
            told += call.find("PanePositionChanged") != std::string::npos;
        return told;
    }
    // All pixels of the window.
    std::string PixelsOf() const {
        Surface const &picture = *desktop.Picture(glog);
        std::size_t const pixels =
            static_cast<std::size_t>(picture.Width()) * static_cast<std::size_t>(picture.Height());
        return std::string(reinterpret_cast<char const *>(picture.Pixels()), pixels * sizeof(std::uint32_t));
    }
    void InvalidateAll() {
        grid->Inval();
        bar->Inval();
    }
    Lines ScrollRects() { return Only("ScrollRect", desktop.TakeDrawing()); }

    Calls &calls = FreshCalls();
    ScrollBarPane *bar = new ScrollBarPane(glog, 0, 0, 0);
    ScrollGrid *grid = new ScrollGrid(glog, 3, nullptr);
};

typedef std::vector<Rect> Rects;

} // namespace

TEST_F(ScrollGridTest, AddsItsOperationsAfterThoseOfAGrid) {
    class Added : public Grid {
    public:
        virtual void First() {}
    };
    ExpectInOrder(PlaceOf(&Added::First), static_cast<void (ScrollGrid::*)(int)>(&ScrollGrid::ScrollTo),
                  static_cast<int (ScrollGrid::*)(int)>(&ScrollGrid::Scroll), &ScrollGrid::RevealSubpanes,
                  &ScrollGrid::GetMaxScroll, &ScrollGrid::ScrollDelta, &ScrollGrid::ScrollGuts,
                  &ScrollGrid::UpdateScrollInfo, &ScrollGrid::UseScrollRect, &ScrollGrid::GetScrollBox);
}

TEST_F(ScrollGridTest, IsAColumnUnderItsNumberAtTheStart) {
    EXPECT_EQ(grid->GetID(), 3);
    EXPECT_TRUE(grid->IsVerticalGrid());
    EXPECT_EQ(grid->GetScrollOffset(), 0);
    EXPECT_FALSE(grid->IsSlaved());
    EXPECT_EQ(grid->GetTheScrollbar(), nullptr);
}

TEST_F(ScrollGridTest, ABarGivenAtItsMakingIsItsOwn) {
    ScrollGrid *const made = new ScrollGrid(glog, 4, bar);
    EXPECT_EQ(made->GetTheScrollbar(), bar);
    EXPECT_EQ(bar->GetClient(), made);
}

TEST_F(ScrollGridTest, AListShorterThanTheViewDoesNotScrollAndItsBarIsDead) {
    Fill(4);
    TakeBar();
    EXPECT_EQ(grid->GetMaxScroll(), 0);
    EXPECT_EQ(bar->GetRange(), -1);
    grid->ScrollTo(10);
    EXPECT_EQ(grid->GetScrollOffset(), 0);
}

TEST_F(ScrollGridTest, ScrollsFromTheFirstMembersStartToTheLastOnesEnd) {
    Fill(20);
    EXPECT_EQ(grid->GetMaxScroll(), 240);
    grid->ScrollTo(-5);
    EXPECT_EQ(grid->GetScrollOffset(), 0);
    grid->ScrollTo(241);
    EXPECT_EQ(grid->GetScrollOffset(), 240);
    EXPECT_EQ(grid->Scroll(std::numeric_limits<int>::max()), 0);
    EXPECT_EQ(grid->Scroll(std::numeric_limits<int>::min()), -240);
}

TEST_F(ScrollGridTest, ScrollAnswersHowFarItHasMoved) {
    Fill(20);
    EXPECT_EQ(grid->Scroll(30), 30);
    EXPECT_EQ(grid->Scroll(-10), -10);
    EXPECT_EQ(grid->Scroll(500), 220);
    EXPECT_EQ(grid->Scroll(1), 0);
}

TEST_F(ScrollGridTest, MembersLieInTheScrolledContent) {
    Fill(20);
    grid->ScrollTo(50);
    Point p = {0, 10};
    grid->LocalOffset(&p);
    EXPECT_EQ(p, (Point{50, 0}));
    grid->SetVerticalGrid(false);
    p = {0, 10};
    grid->LocalOffset(&p);
    EXPECT_EQ(p, (Point{0, 50}));
}

TEST_F(ScrollGridTest, AHorizontalGridScrollsSideways) {
    grid->SetVerticalGrid(false);
    for (int i = 0; i < 10; ++i)
        grid->Add(new ProbePane(glog, {0, 0, 20, 30}, calls), -1);
    EXPECT_EQ(grid->GetMaxScroll(), 200);
    EXPECT_EQ(grid->ScrollDelta(true), 100 / 16);
}

TEST_F(ScrollGridTest, AnArrowStepIsASixteenthOfTheViewAndAPageTheRest) {
    EXPECT_EQ(grid->ScrollDelta(true), 10);
    EXPECT_EQ(grid->ScrollDelta(false), 150);
    Rect flat = {0, 10, 7, 110};
    grid->SetBox(&flat);
    EXPECT_EQ(grid->ScrollDelta(true), 1);
    EXPECT_EQ(grid->ScrollDelta(false), 15);
}

// Drawing

TEST_F(ScrollGridTest, ASmallMoveMovesPixelsAndDrawsWhatIsUncovered) {
    Fill(20);
    Show();
    grid->Prepare();
    desktop.TakePresented(glog);
    desktop.TakeDrawing();
    calls.clear();
    grid->ScrollTo(30);
    EXPECT_EQ(ScrollRects().size(), 1u);
    // Rows 8 and 9 come into view; row 7 and those before have been moved as pixels.
    EXPECT_EQ(Count(calls, "member 7: draw"), 0);
    EXPECT_EQ(Count(calls, "member 8: draw"), 1);
    EXPECT_EQ(Count(calls, "member 9: draw"), 1);
    EXPECT_EQ(Count(calls, "member 10: draw"), 0);
}

TEST_F(ScrollGridTest, ScrollingBackDrawsTheUncoveredStart) {
    Fill(20);
    grid->ScrollTo(100);
    Show();
    grid->Prepare();
    calls.clear();
    grid->Scroll(-20);
    EXPECT_EQ(Count(calls, "member 4: draw"), 1);
    EXPECT_EQ(Count(calls, "member 5: draw"), 0);
    EXPECT_EQ(Count(calls, "member 3: draw"), 0);
}

TEST_F(ScrollGridTest, MovedPixelsShowWhatAFullRedrawShows) {
    Fill(20);
    Show();
    grid->Prepare();
    for (int const distance : {7, 33, -21, 79, -5}) {
        grid->Scroll(distance);
        std::string const moved = PixelsOf();
        InvalidateAll();
        UpdateGlog(glog);
        EXPECT_EQ(moved, PixelsOf()) << distance;
        grid->Prepare();
    }
}

TEST_F(ScrollGridTest, AMoveOfHalfTheViewIsRedrawn) {
    Fill(20);
    Show();
    grid->Prepare();
    desktop.TakeDrawing();
    grid->ScrollTo(80);
    EXPECT_TRUE(ScrollRects().empty());
    EXPECT_EQ(desktop.TakePresented(glog), Rects{kView});
}

TEST_F(ScrollGridTest, MovesPixelsForLessThanHalfOfTheViewOnly) {
    Show();
    grid->Prepare();
    EXPECT_TRUE(grid->UseScrollRect(79));
    EXPECT_TRUE(grid->UseScrollRect(-79));
    EXPECT_FALSE(grid->UseScrollRect(80));
    EXPECT_FALSE(grid->UseScrollRect(-80));
    EXPECT_FALSE(grid->UseScrollRect(std::numeric_limits<int>::min()));
}

TEST_F(ScrollGridTest, MovesNoPixelsWhileAnotherGlogsPortIsTheCurrentOne) {
    Fill(20);
    glogRec *const other = desktop.NewGlog(GlogOptions().Size(100, 100));
    ProbePane *const elsewhere = new ProbePane(other, {0, 0, 10, 10}, calls, "elsewhere");
    Show();
    elsewhere->Prepare();
    EXPECT_FALSE(grid->UseScrollRect(1));
    desktop.TakeDrawing();
    grid->ScrollTo(10);
    EXPECT_TRUE(ScrollRects().empty());
    EXPECT_EQ(desktop.TakePresented(glog), Rects{kView});
}

TEST_F(ScrollGridTest, ForItsBarItMovesPixelsWhateverPortIsTheCurrentOne) {
    Fill(20);
    Show();
    LeaveForAnotherPort();
    desktop.TakeDrawing();
    grid->ScrollTo(bar, 10);
    EXPECT_EQ(ScrollRects().size(), 1u);
}

TEST_F(ScrollGridTest, AMoveTellsEveryMemberAndUpdatesTheGlogAtOnce) {
    Fill(20);
    Show();
    grid->Prepare();
    calls.clear();
    grid->ScrollTo(10);
    EXPECT_EQ(MembersTold(), 20);
    EXPECT_FALSE(desktop.TakePresented(glog).empty());
    EXPECT_TRUE(Repainted().empty());
}

TEST_F(ScrollGridTest, NoMoveTellsAndDrawsNothing) {
    Fill(20);
    Show();
    calls.clear();
    grid->ScrollTo(0);
    EXPECT_TRUE(calls.empty());
    EXPECT_TRUE(Repainted().empty());
}

TEST_F(ScrollGridTest, HiddenMembersAreNotDrawn) {
    Fill(100);
    Show();
    grid->Prepare();
    calls.clear();
    grid->ScrollTo(1000);
    int drawn = 0;
    for (std::string const &call : calls)
        drawn += call.find(": draw") != std::string::npos;
    EXPECT_EQ(drawn, 8); // the view holds eight members
}

// The bar

TEST_F(ScrollGridTest, ShowsItsPositionOnItsBar) {
    Fill(20);
    TakeBar();
    EXPECT_EQ(bar->GetRange(), 240);
    grid->ScrollTo(50);
    EXPECT_EQ(bar->GetPosition(), 50);
    EXPECT_EQ(bar->GetRange(), 240);
}

TEST_F(ScrollGridTest, TellsItsBarAlsoOfAPositionThatHasNotChangedUnlessToldOtherwise) {
    Fill(20);
    TakeBar();
    bar->Set(99, 99);
    grid->ScrollTo(0);
    EXPECT_EQ(bar->GetRange(), 240);
    grid->SetAlwaysUpdateScrollbar(false);
    bar->Set(99, 99);
    grid->ScrollTo(0);
    EXPECT_EQ(bar->GetRange(), 99);
    grid->ScrollTo(1);
    EXPECT_EQ(bar->GetPosition(), 1);
}

TEST_F(ScrollGridTest, SetScrollOffsetTellsTheMembersAndNobodyElse) {
    Fill(20);
    TakeBar();
    Show();
    calls.clear();
    grid->SetScrollOffset(33);
    EXPECT_EQ(grid->GetScrollOffset(), 33);
    EXPECT_EQ(MembersTold(), 20);
    EXPECT_EQ(bar->GetPosition(), 0);
    EXPECT_TRUE(Repainted().empty());
}

TEST_F(ScrollGridTest, TheThumbIsTheViewsShareOfTheList) {
    EXPECT_EQ(grid->GetThumbRatio(bar), 0.0);
    Fill(16);
    EXPECT_DOUBLE_EQ(grid->GetThumbRatio(bar), 0.5);
    EXPECT_EQ(grid->GetMaxScrollValue(bar), 160);
}

TEST_F(ScrollGridTest, AStepStartsWithAMultiplierOfOne) {
    int amount = 0, multiplier = 0;
    grid->StartScrolling(bar, true, amount, multiplier);
    EXPECT_EQ(amount, 10);
    EXPECT_EQ(multiplier, 1);
    grid->StartScrolling(bar, false, amount, multiplier);
    EXPECT_EQ(amount, 150);
    EXPECT_EQ(multiplier, 1);
}

TEST_F(ScrollGridTest, EachStepRaisesTheMultiplierUpToFour) {
    Fill(50);
    int amount = 10, multiplier = 1;
    std::vector<int> offsets, multipliers;
    for (int i = 0; i < 5; ++i) {
        grid->Scroll(bar, amount, multiplier);
        offsets.push_back(grid->GetScrollOffset());
        multipliers.push_back(multiplier);
    }
    EXPECT_EQ(offsets, (std::vector<int>{10, 30, 60, 100, 140}));
    EXPECT_EQ(multipliers, (std::vector<int>{2, 3, 4, 4, 4}));
    EXPECT_EQ(amount, 10);
}

TEST_F(ScrollGridTest, AHeldDownArrowGetsFasterAndAHeldUpArrowDoesNot) {
    Fill(100);
    TakeBar();
    Show();
    // The first step at the press, the first repeat at the first wake-up 9 ticks later, then every 3 ticks.
    desktop.Play("press 118 152\nwait 0.65\nrelease");
    int const down = grid->GetScrollOffset();
    // At the press, and at 0.2, 0.3, 0.4, 0.5 and 0.6 seconds.
    EXPECT_EQ(down, 10 + 20 + 30 + 40 + 40 + 40);
    desktop.Play("press 118 8\nwait 0.65\nrelease");
    EXPECT_EQ(down - grid->GetScrollOffset(), 6 * 10);
}

TEST_F(ScrollGridTest, ScrollToOfABarGoesToThePosition) {
    Fill(20);
    Show();
    grid->ScrollTo(bar, 90);
    EXPECT_EQ(grid->GetScrollOffset(), 90);
}

TEST_F(ScrollGridTest, AnotherBarLeavesTheFormerOneWithoutAClient) {
    Fill(20);
    TakeBar();
    ScrollBarPane *const other = new ScrollBarPane(glog, 0, 0, 0);
    grid->SetScrollbar(other);
    EXPECT_EQ(bar->GetClient(), nullptr);
    EXPECT_EQ(other->GetClient(), grid);
    EXPECT_EQ(other->GetRange(), 240);
    delete bar; // and nobody listens to it
    EXPECT_EQ(grid->GetTheScrollbar(), other);
    grid->SetScrollbar(nullptr);
    EXPECT_EQ(other->GetClient(), nullptr);
}

TEST_F(ScrollGridTest, WorksOnWithoutABarThatIsGone) {
    Fill(20);
    TakeBar();
    delete bar;
    EXPECT_EQ(grid->GetTheScrollbar(), nullptr);
    grid->ScrollTo(70);
    EXPECT_EQ(grid->GetScrollOffset(), 70);
}

TEST_F(ScrollGridTest, ItsBarHasNoClientOnceItIsGone) {
    TakeBar();
    delete grid;
    EXPECT_EQ(bar->GetClient(), nullptr);
    EXPECT_FALSE(static_cast<Provider<ScrollBarPane_Listener> *>(bar)->HasDependents());
}

TEST_F(ScrollGridTest, TheBarsBoxIsAskedForAndSetThroughTheGrid) {
    Rect box = {1, 2, 3, 4};
    grid->GetScrollbarBounds(&box);
    EXPECT_EQ(box, (Rect{1, 2, 3, 4}));
    grid->SetScrollbarBounds(&box);
    TakeBar();
    grid->GetScrollbarBounds(&box);
    EXPECT_EQ(box, kUpright);
    box.bottom = 100;
    grid->SetScrollbarBounds(&box);
    EXPECT_EQ(BoxOf(*bar), box);
}

// Members come and go

TEST_F(ScrollGridTest, AddingAndDeletingMembersShowsTheNewRange) {
    Fill(20);
    TakeBar();
    Fill(5);
    EXPECT_EQ(bar->GetRange(), 340);
    grid->Del(0);
    EXPECT_EQ(bar->GetRange(), 320);
}

TEST_F(ScrollGridTest, AListThatHasShrunkIsBroughtBackIntoView) {
    Fill(20);
    TakeBar();
    grid->ScrollTo(240);
    grid->Del(19);
    EXPECT_EQ(grid->GetScrollOffset(), 220);
    EXPECT_EQ(bar->GetPosition(), 220);
    while (grid->NumSubpanes() > 2)
        grid->Del(0);
    EXPECT_EQ(grid->GetScrollOffset(), 0);
    EXPECT_EQ(bar->GetRange(), -1);
}

TEST_F(ScrollGridTest, AnAdditionOrDeletionThatFailsShowsNothing) {
    Fill(20);
    TakeBar();
    bar->Set(5, 5);
    EXPECT_LT(grid->Add(nullptr, -1), 0);
    grid->Del(20);
    EXPECT_EQ(bar->GetRange(), 5);
}

// Slaved grids

TEST_F(ScrollGridTest, ASlavedGridMovesWithoutTouchingBarOrScreen) {
    Fill(20);
    TakeBar();
    grid->SetSlaved();
    EXPECT_TRUE(grid->IsSlaved());
    Show();
    bar->Set(5, 5);
    UpdateGlog(glog);
    desktop.TakePresented(glog);
    grid->Prepare();
    EXPECT_EQ(grid->ScrollGuts(100), 100);
    EXPECT_TRUE(desktop.TakePresented(glog).empty());
    EXPECT_EQ(Repainted(), Rects{kView});
    EXPECT_EQ(bar->GetRange(), 5);
    grid->ScrollTo(100);
    grid->UpdateScrollInfo();
    EXPECT_EQ(bar->GetRange(), 5);
}

// Reaching members

TEST_F(ScrollGridTest, TellsWhetherThereIsSomethingToScrollTo) {
    Fill(20);
    EXPECT_FALSE(grid->CanScroll(0));
    EXPECT_FALSE(grid->CanScroll(-1));
    EXPECT_TRUE(grid->CanScroll(1));
    grid->ScrollTo(240);
    EXPECT_TRUE(grid->CanScroll(-7));
    EXPECT_FALSE(grid->CanScroll(7));
}

TEST_F(ScrollGridTest, RevealsAMemberThatLiesBeforeTheView) {
    Fill(20);
    grid->ScrollTo(100);
    grid->ScrollTillVisible(grid->Get(3));
    EXPECT_EQ(grid->GetScrollOffset(), 60);
}

TEST_F(ScrollGridTest, RevealsAMemberThatLiesBehindTheView) {
    Fill(20);
    grid->ScrollTillVisible(grid->Get(10));
    EXPECT_EQ(grid->GetScrollOffset(), 60);
}

TEST_F(ScrollGridTest, RevealingAVisibleMemberDoesNothing) {
    Fill(20);
    grid->ScrollTo(60);
    for (short const index : {short(3), short(10)})
        grid->ScrollTillVisible(grid->Get(index));
    EXPECT_EQ(grid->GetScrollOffset(), 60);
}

TEST_F(ScrollGridTest, RevealsManyMembersWhereTheViewHoldsThem) {
    Fill(20);
    grid->RevealSubpanes({grid->Get(9), grid->Get(7), grid->Get(11)});
    EXPECT_EQ(grid->GetScrollOffset(), 80);
}

TEST_F(ScrollGridTest, RevealsTheStartOfMoreMembersThanTheViewHolds) {
    Fill(20);
    grid->RevealSubpanes({grid->Get(15), grid->Get(4)});
    EXPECT_EQ(grid->GetScrollOffset(), 80);
}

TEST_F(ScrollGridTest, RevealingNoMembersDoesNothing) {
    Fill(20);
    grid->ScrollTo(60);
    grid->RevealSubpanes({});
    EXPECT_EQ(grid->GetScrollOffset(), 60);
}

TEST_F(ScrollGridTest, RevealingAMemberWithoutSizeDoesNothing) {
    Fill(20);
    ProbePane *const flat = new ProbePane(glog, {0, 0, 0, 100}, calls, "flat");
    grid->Add(flat, -1);
    grid->ScrollTillVisible(flat);
    EXPECT_EQ(grid->GetScrollOffset(), 0);
}

TEST_F(ScrollGridTest, WhereTheGridDoesNotBeginAtTheStartTheViewsEndIsTakenAsMuchTooFar) {
    Rect lower = {30, 10, 190, 110};
    grid->SetBox(&lower);
    Fill(20);
    grid->ScrollTillVisible(grid->Get(8)); // ends at 180, the view at 160, but is taken to end at 190
    EXPECT_EQ(grid->GetScrollOffset(), 0);
    grid->ScrollTillVisible(grid->Get(10));
    EXPECT_EQ(grid->GetScrollOffset(), 30);
}

// Wheel

TEST_F(ScrollGridTest, AWheelNotchScrollsTwoPixelsAlongTheAxisAlone) {
    Fill(20);
    Show();
    desktop.Play("wheel 50 50 0 -3");
    EXPECT_EQ(grid->GetScrollOffset(), 6);
    desktop.Play("wheel 50 50 -3 0");
    EXPECT_EQ(grid->GetScrollOffset(), 6);
    desktop.Play("wheel 50 50 0 1");
    EXPECT_EQ(grid->GetScrollOffset(), 4);
}

TEST_F(ScrollGridTest, AHorizontalGridTakesTheHorizontalWheel) {
    grid->SetVerticalGrid(false);
    for (int i = 0; i < 10; ++i)
        grid->Add(new ProbePane(glog, {0, 0, 20, 30}, calls), -1);
    Show();
    desktop.Play("wheel 50 10 0 -3");
    EXPECT_EQ(grid->GetScrollOffset(), 0);
    desktop.Play("wheel 50 10 -3 0");
    EXPECT_EQ(grid->GetScrollOffset(), 6);
}

// Size changes

TEST_F(ScrollGridTest, AResizeShowsThePositionAnew) {
    Fill(20);
    TakeBar();
    Rect smaller = {0, 10, 100, 110};
    grid->SetBox(&smaller);
    grid->Resize({0, 0});
    EXPECT_EQ(bar->GetRange(), 300);
    Rect larger = {0, 10, 180, 110};
    grid->SetBox(&larger);
    grid->AutoResize(0, 0);
    EXPECT_EQ(bar->GetRange(), 220);
}

TEST_F(ScrollGridTest, AResizeRepaintsWhatTheGridHasLeft) {
    // As a layout of the program's own would do it.
    class Narrowing : public ProbePane {
    public:
        using ProbePane::ProbePane;
        void AutoResize(short dh, short dv) override {
            Rect box;
            container->GetBox(&box);
            box.right = static_cast<short>(box.right + dh);
            box.bottom = static_cast<short>(box.bottom + dv);
            container->SetBox(&box);
        }
    };
    grid->Add(new Narrowing(glog, {0, 0, 20, 100}, calls, "narrowing"), -1);
    Show();
    grid->AutoResize(0, -70);
    EXPECT_EQ(BoxOf(*grid), (Rect{0, 10, 90, 110}));
    EXPECT_EQ(Repainted(), (Rects{{90, 10, 160, 110}}));
    grid->AutoResize(0, 70);
    EXPECT_EQ(Repainted(), Rects()) << "what it gains is the members' affair";
    grid->Resize({70, 0});
    EXPECT_EQ(Repainted(), Rects()) << "the box stays";
}

// Suppression

TEST_F(ScrollGridTest, WhatIsSuppressedIsNeverAskedFor) {
    grid->SetSupressGridUpdate(true);
    grid->SetSupressSBarUpdate(true);
    EXPECT_FALSE(grid->GetSupressGridUpdate());
    EXPECT_FALSE(grid->GetSupressSBarUpdate());
}

TEST_F(ScrollGridTest, ScrollingGoesOnUnderEveryGuard) {
    Fill(20);
    TakeBar();
    {
        WithScrollGridSuppressGridUpdate const grids(grid, true);
        WithScrollGridSuppressSBarUpdate const bars(grid, true);
        WithScrollGridSuppressUpdates const both(grid, true);
        grid->ScrollTo(40);
        EXPECT_EQ(bar->GetPosition(), 40);
    }
    grid->ScrollTo(50);
    EXPECT_EQ(bar->GetPosition(), 50);
}
