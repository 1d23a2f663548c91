#include "scrolling/ScrollGridPlus.h"
#include "host/PaneWatch.h"
#include "tests/PaneTest.h"
#include "tests/VirtualPlace.h"
#include "tests/desktop/ProbePane.h"
#include <functional>
#include <limits>
#include <memory>
#include <utility>
#include <vector>

namespace {

Rect const kView = {0, 0, 160, 100}; // 100 x 160
Rect const kUpright = {0, 100, 160, 116};
Rect const kLevel = {160, 0, 176, 100};

class ScrollGridPlusTest : public PaneTest {
protected:
    ScrollGridPlusTest() {
        Rect view = kView, upright = kUpright, level = kLevel;
        grid->SetBox(&view);
        main->SetBox(&upright);
        lateral->SetBox(&level);
    }
    // Members of 20 pixels' height, wider than the view.
    void Fill(int count, short width = 300) {
        for (int i = 0; i < count; ++i)
            grid->Add(new ProbePane(glog, {0, 0, 20, width}, calls, "member " + std::to_string(i)), -1);
        calls.clear();
    }
    Point Offset() {
        Point p = {0, 0};
        grid->LocalOffset(&p);
        return p;
    }

    Calls &calls = FreshCalls();
    ScrollBarPane *main = new ScrollBarPane(glog, 0, 0, 0);
    ScrollBarPane *lateral = new ScrollBarPane(glog, ScrollBarPane::kHorizontalBar, 0, 0);
    ScrollGridPlus *grid = new ScrollGridPlus(glog, 5, main, lateral);
};

} // namespace

TEST_F(ScrollGridPlusTest, AddsItsOperationsAfterThoseOfAScrollGrid) {
    class Added : public ScrollGrid {
    public:
        using ScrollGrid::ScrollGrid;
        virtual void First() {}
    };
    ExpectInOrder(PlaceOf(&Added::First), &ScrollGridPlus::LateralScrollTo, &ScrollGridPlus::LateralScroll,
                  &ScrollGridPlus::LateralScrollDelta, &ScrollGridPlus::GetMaxLateralScroll,
                  &ScrollGridPlus::LateralScrollGuts);
}

TEST_F(ScrollGridPlusTest, ServesTheBarAcrossTheAxisThroughAnotherClient) {
    EXPECT_EQ(grid->GetID(), 5);
    EXPECT_EQ(main->GetClient(), grid);
    EXPECT_NE(lateral->GetClient(), nullptr);
    EXPECT_NE(lateral->GetClient(), grid);
}

TEST_F(ScrollGridPlusTest, ScrollsAlongBothAxes) {
    Fill(20);
    EXPECT_EQ(grid->GetMaxScroll(), 240);
    EXPECT_EQ(grid->GetMaxLateralScroll(), 200);
    grid->ScrollTo(nullptr, 30);
    grid->LateralScrollTo(40);
    EXPECT_EQ(Offset(), (Point{30, 40}));
    grid->SetVerticalGrid(false);
    EXPECT_EQ(Offset(), (Point{40, 30}));
}

TEST_F(ScrollGridPlusTest, LateralPositionsAreKeptWithinTheList) {
    Fill(20);
    grid->LateralScrollTo(-1);
    EXPECT_EQ(grid->GetLateralScrollOffset(), 0);
    grid->LateralScrollTo(201);
    EXPECT_EQ(grid->GetLateralScrollOffset(), 200);
    grid->LateralScroll(-50);
    EXPECT_EQ(grid->GetLateralScrollOffset(), 150);
    grid->LateralScroll(std::numeric_limits<int>::max());
    EXPECT_EQ(grid->GetLateralScrollOffset(), 200);
    grid->LateralScroll(std::numeric_limits<int>::min());
    EXPECT_EQ(grid->GetLateralScrollOffset(), 0);
}

TEST_F(ScrollGridPlusTest, ALateralPositionIsShownOnItsBar) {
    Fill(20);
    grid->LateralScrollTo(40);
    EXPECT_EQ(lateral->GetPosition(), 40);
    EXPECT_EQ(lateral->GetRange(), 200);
    EXPECT_EQ(main->GetPosition(), 0);
    lateral->Set(1, 1);
    grid->LateralScrollTo(40); // also when it has not changed
    EXPECT_EQ(lateral->GetRange(), 200);
}

TEST_F(ScrollGridPlusTest, AListNarrowerThanTheViewLeavesTheLateralBarDead) {
    Fill(20, 80);
    EXPECT_EQ(lateral->GetRange(), -1);
    EXPECT_EQ(main->GetRange(), 240);
}

TEST_F(ScrollGridPlusTest, ALateralMoveTellsTheMembersMovesPixelsAndUpdatesAtOnce) {
    Fill(20);
    Show();
    calls.clear();
    grid->LateralScrollTo(60); // more than half of the view
    EXPECT_EQ(Count(calls, "member 19: PanePositionChanged"), 1);
    EXPECT_EQ(Only("ScrollRect", desktop.TakeDrawing()).size(), 1u);
    EXPECT_FALSE(desktop.TakePresented(glog).empty());
    grid->LateralScrollTo(60);
    EXPECT_TRUE(Only("ScrollRect", desktop.TakeDrawing()).empty());
}

TEST_F(ScrollGridPlusTest, ALateralMoveIsMadeInItsOwnPort) {
    Fill(20);
    Show();
    LeaveForAnotherPort();
    grid->LateralScrollTo(10);
    EXPECT_TRUE(IsInItsPort());
    LeaveForAnotherPort();
    grid->LateralScrollTo(10);
    EXPECT_TRUE(IsInItsPort()) << "also when nothing moves";
}

TEST_F(ScrollGridPlusTest, AnArrowMovesAPixelAcrossAndAPageFourFifths) {
    EXPECT_EQ(grid->LateralScrollDelta(1), 1);
    EXPECT_EQ(grid->LateralScrollDelta(0), 80);
    grid->SetVerticalGrid(false);
    EXPECT_EQ(grid->LateralScrollDelta(0), 128);
}

TEST_F(ScrollGridPlusTest, TheLateralBarMovesTheGridAcross) {
    Fill(20);
    Show();
    lateral->ScrollOneUnit(true);
    EXPECT_EQ(Offset(), (Point{0, 1}));
    lateral->ScrollPage(true);
    EXPECT_EQ(Offset(), (Point{0, 81}));
    lateral->ScrollToEnd(true);
    EXPECT_EQ(Offset(), (Point{0, 200}));
    main->ScrollOneUnit(true);
    EXPECT_EQ(Offset(), (Point{10, 200}));
}

TEST_F(ScrollGridPlusTest, AcrossTheAxisAHeldArrowDoesNotGetFaster) {
    Fill(20);
    ScrollBarClient *const client = lateral->GetClient();
    int amount = 10, multiplier = 2;
    client->Scroll(lateral, amount, multiplier);
    EXPECT_EQ(multiplier, 2);
    EXPECT_EQ(grid->GetLateralScrollOffset(), 20);
}

TEST_F(ScrollGridPlusTest, TheLateralThumbIsTheViewsShareOfTheListsWidth) {
    Fill(20, 200);
    EXPECT_DOUBLE_EQ(lateral->GetClient()->GetThumbRatio(lateral), 0.5);
    EXPECT_EQ(lateral->GetClient()->GetMaxScrollValue(lateral), 100);
}

TEST_F(ScrollGridPlusTest, SetLateralScrollOffsetTellsTheMembersAndNobodyElse) {
    Fill(20);
    Show();
    calls.clear();
    grid->SetLateralScrollOffset(33);
    EXPECT_EQ(grid->GetLateralScrollOffset(), 33);
    EXPECT_EQ(Count(calls, "member 0: PanePositionChanged"), 1);
    EXPECT_EQ(lateral->GetPosition(), 0);
    EXPECT_TRUE(Repainted().empty());
}

TEST_F(ScrollGridPlusTest, AnotherLateralBarLeavesTheFormerOneWithoutAClient) {
    Fill(20);
    ScrollBarClient *const client = lateral->GetClient();
    ScrollBarPane *const other = new ScrollBarPane(glog, ScrollBarPane::kHorizontalBar, 0, 0);
    grid->SetLateralScrollbar(other);
    EXPECT_EQ(lateral->GetClient(), nullptr);
    EXPECT_EQ(other->GetClient(), client);
    EXPECT_EQ(other->GetRange(), 0); // until the next change
}

TEST_F(ScrollGridPlusTest, WorksOnWithoutALateralBarThatIsGone) {
    Fill(20);
    delete lateral;
    grid->LateralScrollTo(70);
    EXPECT_EQ(grid->GetLateralScrollOffset(), 70);
    grid->SetLateralScrollbar(nullptr);
}

TEST_F(ScrollGridPlusTest, ItsBarsHaveNoClientOnceItIsGone) {
    delete grid;
    EXPECT_EQ(main->GetClient(), nullptr);
    EXPECT_EQ(lateral->GetClient(), nullptr);
}

// Changes of size

TEST_F(ScrollGridPlusTest, AListThatHasShrunkIsBroughtBackIntoViewOnBothAxes) {
    grid->SetMayHaveDifferentSizes(true);
    Fill(20, 120);
    ProbePane *const wide = new ProbePane(glog, {0, 0, 20, 300}, calls);
    grid->Add(wide, -1);
    grid->LateralScrollTo(200);
    grid->ScrollTo(nullptr, 260);
    grid->Del(20);
    EXPECT_EQ(Offset(), (Point{240, 20}));
    EXPECT_EQ(lateral->GetPosition(), 20);
    EXPECT_EQ(lateral->GetRange(), 20);
}

TEST_F(ScrollGridPlusTest, AViewAtTheEndStaysThereWhenTheListGrowsIfItSticks) {
    grid->SetMayHaveDifferentSizes(true);
    Fill(5, 200);
    grid->LateralScrollTo(100);
    grid->SetStickToEnd(true);
    grid->Add(new ProbePane(glog, {0, 0, 20, 260}, calls), -1);
    EXPECT_EQ(grid->GetLateralScrollOffset(), 160);
    EXPECT_EQ(lateral->GetRange(), 160);
}

TEST_F(ScrollGridPlusTest, AViewBeforeTheEndKeepsItsDistanceIfItSticks) {
    grid->SetMayHaveDifferentSizes(true);
    Fill(5, 200);
    grid->LateralScrollTo(90);
    grid->SetStickToEnd(true);
    grid->Add(new ProbePane(glog, {0, 0, 20, 260}, calls), -1);
    EXPECT_EQ(grid->GetLateralScrollOffset(), 150);
    grid->Del(5);
    EXPECT_EQ(grid->GetLateralScrollOffset(), 90);
    while (grid->NumSubpanes() > 0)
        grid->Del(0);
    EXPECT_EQ(grid->GetLateralScrollOffset(), 0);
}

TEST_F(ScrollGridPlusTest, AViewThatDoesNotStickStaysWhereItIs) {
    grid->SetMayHaveDifferentSizes(true);
    Fill(5, 200);
    grid->LateralScrollTo(100);
    grid->Add(new ProbePane(glog, {0, 0, 20, 260}, calls), -1);
    EXPECT_EQ(grid->GetLateralScrollOffset(), 100);
    EXPECT_EQ(lateral->GetRange(), 160);
}

TEST_F(ScrollGridPlusTest, AnOffsetBeyondTheLastMaximumDoesNotStick) {
    grid->SetMayHaveDifferentSizes(true);
    Fill(5, 200);
    grid->SetLateralScrollOffset(150);
    grid->SetStickToEnd(true);
    grid->Add(new ProbePane(glog, {0, 0, 20, 400}, calls), -1);
    EXPECT_EQ(grid->GetLateralScrollOffset(), 150);
}

// Wheel

TEST_F(ScrollGridPlusTest, EachWheelAxisScrollsItsAxis) {
    Fill(20);
    Show();
    desktop.Play("wheel 50 50 0 -3");
    EXPECT_EQ(Offset(), (Point{6, 0}));
    desktop.Play("wheel 50 50 -4 0");
    EXPECT_EQ(Offset(), (Point{6, 8}));
    desktop.Play("wheel 50 50 1 0");
    EXPECT_EQ(Offset(), (Point{6, 6}));
}

TEST_F(ScrollGridPlusTest, TheWheelCallsWhatASubclassMakesOfScrolling) {
    class Counting : public ScrollGridPlus {
    public:
        using ScrollGrid::Scroll;
        using ScrollGridPlus::ScrollGridPlus;
        int Scroll(int distance) override {
            distances.push_back(distance);
            return 0;
        }
        std::vector<int> distances;
    };
    Rect empty = {0, 0, 0, 0};
    grid->SetBox(&empty);
    Counting *const counting = new Counting(glog, 6, nullptr, nullptr);
    Rect view = kView;
    counting->SetBox(&view);
    Show();
    desktop.Play("wheel 50 50 0 -3");
    EXPECT_EQ(counting->distances, std::vector<int>{6});
}

namespace {

// Deletes another pane, once, when it is drawn.
class Deleting : public ProbePane {
public:
    using ProbePane::ProbePane;
    GlogPane *victim = nullptr;

protected:
    void DrawGuts(OSRgn *) override { delete std::exchange(victim, nullptr); }
};

// Does something when it hears that it has moved.
class Moving : public ProbePane {
public:
    using ProbePane::ProbePane;
    std::function<void()> onMove;
    void PanePositionChanged() override {
        if (onMove)
            std::exchange(onMove, nullptr)();
    }
};

class ScrollGridThatGoes : public ScrollGridPlusTest {
protected:
    ScrollGridThatGoes() {
        Fill(20);
        Show();
    }

    // Whether the grid, or what is named instead, has gone in the middle of the action.
    bool GoesIn(std::function<void()> const &action, GlogPane *victim = nullptr) {
        PaneWatch const watch(victim ? victim : grid);
        last->victim = victim ? victim : grid;
        last->Inval();
        action();
        return !watch.PaneExists();
    }

    Deleting *last = new Deleting(glog, {176, 0, 196, 20}, calls, "deleting");
};

} // namespace

TEST_F(ScrollGridThatGoes, IsLeftAloneWhenItGoesAwayWhileItsWindowIsDrawn) {
    EXPECT_TRUE(GoesIn([this] { grid->ScrollTo(nullptr, 10); }));
}

TEST_F(ScrollGridThatGoes, MayGoInALateralMove) {
    EXPECT_TRUE(GoesIn([this] { grid->LateralScrollTo(10); }));
}

TEST_F(ScrollGridThatGoes, MayGoWhenItIsBroughtBackIntoView) {
    grid->SetScrollOffset(1000);
    EXPECT_TRUE(GoesIn([this] { grid->UpdateScrollInfo(); }));
}

TEST_F(ScrollGridThatGoes, MayGoWhenItIsBroughtBackIntoViewAcross) {
    grid->SetLateralScrollOffset(1000);
    EXPECT_TRUE(GoesIn([this] { grid->UpdateScrollInfo(); }));
}

TEST_F(ScrollGridThatGoes, MayGoWhenItKeepsItsDistanceFromTheEnd) {
    grid->LateralScrollTo(200);
    grid->SetStickToEnd(true);
    GlogPane *const wider = new ProbePane(glog, {0, 0, 20, 400}, calls, "wider");
    EXPECT_TRUE(GoesIn([=] { grid->Add(wider, -1); }));
}

TEST_F(ScrollGridThatGoes, MayGoWhenAMemberIsAdded) {
    GlogPane *const member = new ProbePane(glog, {0, 0, 20, 300}, calls, "added");
    grid->SetScrollOffset(1000);
    EXPECT_TRUE(GoesIn([=] { EXPECT_EQ(grid->Add(member, -1), 20); }));
}

TEST_F(ScrollGridThatGoes, MayGoWhenAMemberIsDeleted) {
    grid->SetScrollOffset(1000);
    EXPECT_TRUE(GoesIn([this] { grid->Del(3); }));
}

TEST_F(ScrollGridThatGoes, MayGoInAResize) {
    grid->SetScrollOffset(1000);
    EXPECT_TRUE(GoesIn([this] { grid->Resize({0, 0}); }));
}

TEST_F(ScrollGridThatGoes, MayGoInAResizeByItsContainer) {
    grid->SetScrollOffset(1000);
    EXPECT_TRUE(GoesIn([this] { grid->AutoResize(10, 10); }));
}

TEST_F(ScrollGridThatGoes, MayGoWhenItTakesABar) {
    grid->SetScrollOffset(1000);
    EXPECT_TRUE(GoesIn([this] { grid->SetScrollbar(main); }));
    EXPECT_EQ(main->GetClient(), nullptr);
}

TEST_F(ScrollGridThatGoes, MayGoUnderItsGuards) {
    EXPECT_TRUE(GoesIn([this] {
        WithScrollGridSuppressUpdates const both(grid, true);
        grid->ScrollTo(nullptr, 10);
    }));
}

TEST_F(ScrollGridThatGoes, AMemberThatHearsOfAMoveMayDeleteIt) {
    for (bool lateral : {false, true}) {
        ScrollGridPlus *const fresh = new ScrollGridPlus(glog, 6, nullptr, nullptr);
        Moving *const member = new Moving(glog, {0, 0, 300, 300}, calls, "member");
        fresh->Add(member, -1);
        PaneWatch const watch(fresh);
        member->onMove = [=] { delete fresh; };
        if (lateral)
            fresh->LateralScrollTo(10);
        else
            fresh->ScrollTo(nullptr, 10);
        EXPECT_FALSE(watch.PaneExists()) << lateral;
    }
}

TEST_F(ScrollGridThatGoes, AMemberThatHearsOfAMoveMayDeleteOthersOrItself) {
    Moving *const member = new Moving(glog, {0, 0, 20, 300}, calls, "member");
    grid->Add(member, 5);
    member->onMove = [=] {
        grid->Del(7);
        grid->Del(3);
        grid->Del(grid->Find(member));
    };
    grid->ScrollTo(nullptr, 10);
    EXPECT_EQ(grid->NumSubpanes(), 18);
    EXPECT_EQ(grid->GetScrollOffset(), 10);
}

TEST_F(ScrollGridThatGoes, MembersMayGoInTheMiddleOfAMove) {
    EXPECT_TRUE(GoesIn([this] { grid->ScrollTo(nullptr, 10); }, grid->Get(2)));
    EXPECT_TRUE(GoesIn([this] { grid->LateralScrollTo(10); }, grid->Get(3)));
    EXPECT_EQ(grid->NumSubpanes(), 18);
}

TEST_F(ScrollGridThatGoes, AListenerOfItsBarMayDeleteMembersAndIt) {
    class Mourner : public ScrollBarPane_Listener {
    public:
        std::function<void()> onDeath;

    private:
        void ScrollBarPaneDying() override { onDeath(); }
    } mourner;
    mourner.DependUpon(main);
    PaneWatch const watch(grid);
    mourner.onDeath = [this] {
        grid->Del(2);
        delete grid;
    };
    delete main;
    EXPECT_FALSE(watch.PaneExists());
}

TEST_F(ScrollGridPlusTest, WithoutAGlogItMovesAndDrawsNothing) {
    std::unique_ptr<ScrollGridPlus> const loose(new ScrollGridPlus(nullptr, 5, nullptr, nullptr));
    loose->SetScrollOffset(5);
    loose->SetLateralScrollOffset(7);
    loose->UpdateScrollInfo();
    EXPECT_EQ(loose->GetScrollOffset(), 0);
    EXPECT_EQ(loose->GetLateralScrollOffset(), 0);
}

TEST_F(ScrollGridThatGoes, ItsBarMayGoWhenItIsTaken) {
    grid->SetScrollOffset(1000);
    EXPECT_TRUE(GoesIn([this] { grid->SetScrollbar(main); }, main));
    EXPECT_EQ(grid->GetTheScrollbar(), nullptr);
    grid->ScrollTo(nullptr, 10);
    EXPECT_EQ(grid->GetScrollOffset(), 10);
}

TEST_F(ScrollGridThatGoes, ItsBarsMayGoInTheMiddleOfAMove) {
    EXPECT_TRUE(GoesIn([this] { grid->ScrollTo(nullptr, 10); }, main));
    EXPECT_TRUE(GoesIn([this] { grid->LateralScrollTo(10); }, lateral));
    EXPECT_EQ(grid->GetScrollOffset(), 10);
    EXPECT_EQ(grid->GetLateralScrollOffset(), 10);
}

TEST_F(ScrollGridPlusTest, AHorizontalGridExchangesTheWheelsAxes) {
    grid->SetVerticalGrid(false);
    for (int i = 0; i < 20; ++i)
        grid->Add(new ProbePane(glog, {0, 0, 300, 20}, calls), -1);
    Show();
    desktop.Play("wheel 50 50 0 -3");
    EXPECT_EQ(grid->GetLateralScrollOffset(), 6);
    EXPECT_EQ(grid->GetScrollOffset(), 0);
    desktop.Play("wheel 50 50 -2 0");
    EXPECT_EQ(grid->GetScrollOffset(), 4);
}
