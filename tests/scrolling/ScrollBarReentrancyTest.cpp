// Clients and listeners that do away with the bar, its client or its neighbours while the bar is at work.
#include "desktop/panes/PaneEvents.h"
#include "host/PaneWatch.h"
#include "host/glogRec.h"
#include "tests/scrolling/ScrollBarTest.h"
#include <memory>

namespace {

// Where a client is called in the middle of things.
enum Moment { kScroll, kScrollTo, kDone };

class ScrollBarReentrancy : public ScrollBarTest {
protected:
    ScrollBarReentrancy()
        : bar(Live(Upright(), 500))
        , neighbour(Level())
        , watch(bar) {
        own->greatest = 1000;
        own->page = 100;
        Live(neighbour);
        bar->SetClient(own.get());
        bar->Set(500, 1000);
        Show();
    }

    void At(Moment moment, std::function<void()> const &action) {
        std::function<void()> &slot = moment == kScroll     ? own->onScroll
                                      : moment == kScrollTo ? own->onScrollTo
                                                            : own->onDone;
        slot = action;
    }
    // The client goes away as clients have to: no bar holds on to it.
    void DropClient() {
        bar->SetClient(nullptr);
        own.reset();
    }

    ScrollBarPane *bar, *neighbour;
    PaneWatch watch; // of the bar
    std::unique_ptr<RecordingClient> own = std::make_unique<RecordingClient>();
};

struct Gesture {
    Moment moment;
    char const *script;
};

// Every gesture that comes by the moment, held on for a while.
Gesture const kGestures[] = {
    {kScroll, "press 28 18\nwait 0.5\nrelease"},
    {kScroll, "press 28 130\nwait 0.5\nrelease"},
    {kScroll, "press 28 110\nwait 0.5\nrelease"},
    {kScroll, "wheel 28 70 0 -1"},
    {kScrollTo, "press 28 70\nmove 28 91\nmove 28 80\nwait 0.5\nrelease"},
    {kDone, "press 28 18\nwait 0.5\nrelease"},
    {kDone, "press 28 110\nwait 0.5\nrelease"},
    {kDone, "press 28 70\nmove 28 91\nrelease"},
    {kDone, "wheel 28 70 0 -1"},
};

class DuringGesture : public ScrollBarReentrancy, public testing::WithParamInterface<Gesture> {};

INSTANTIATE_TEST_SUITE_P(OfEachKind, DuringGesture, testing::ValuesIn(kGestures));

} // namespace

TEST_P(DuringGesture, TheClientMayDeleteTheBar) {
    At(GetParam().moment, [this] { delete bar; });
    desktop.Play(GetParam().script);
    EXPECT_FALSE(watch.PaneExists());
}

TEST_P(DuringGesture, TheClientMayDeleteItself) {
    At(GetParam().moment, [this] { DropClient(); });
    desktop.Play(GetParam().script);
    EXPECT_EQ(own, nullptr);
    EXPECT_TRUE(watch.PaneExists());
    desktop.Play("click 28 70");
}

TEST_P(DuringGesture, TheClientMayDeleteItselfAndTheBar) {
    At(GetParam().moment, [this] {
        delete bar;
        own.reset();
    });
    desktop.Play(GetParam().script);
    EXPECT_FALSE(watch.PaneExists());
}

TEST_P(DuringGesture, TheClientMayHandTheBarToAnother) {
    client.TakeLog();
    At(GetParam().moment, [this] { bar->SetClient(&client); });
    desktop.Play(GetParam().script);
    EXPECT_EQ(bar->GetClient(), &client);
    // Whoever is the client at the end hears of it.
    EXPECT_EQ(client.log.empty(), GetParam().moment == kDone);
}

TEST_P(DuringGesture, TheClientMayDeleteANeighbour) {
    At(GetParam().moment, [this] {
        delete neighbour;
        neighbour = nullptr;
    });
    desktop.Play(GetParam().script);
    EXPECT_EQ(neighbour, nullptr);
    EXPECT_TRUE(watch.PaneExists());
}

TEST_P(DuringGesture, TheClientMayMoveTheBarAway) {
    At(GetParam().moment, [this] {
        Rect elsewhere = {100, 200, 180, 216};
        bar->SetBox(&elsewhere);
    });
    desktop.Play(GetParam().script);
    EXPECT_EQ(BoxOf(*bar), (Rect{100, 200, 180, 216}));
}

TEST_P(DuringGesture, TheClientMayHideTheBar) {
    At(GetParam().moment, [this] { bar->Hide(); });
    desktop.Play(GetParam().script);
    EXPECT_FALSE(bar->GetVisibility());
}

TEST_P(DuringGesture, TheClientMayDisposeOfTheGlog) {
    At(GetParam().moment, [this] { DisposeGlog(glog); });
    desktop.Play(GetParam().script);
    EXPECT_FALSE(watch.PaneExists());
}

TEST_P(DuringGesture, TheClientMayScrollTheBarFurther) {
    int depth = 0;
    At(GetParam().moment, [this, &depth] {
        if (depth++ == 0)
            bar->ScrollPage(true);
    });
    desktop.Play(GetParam().script);
    EXPECT_GE(depth, 1);
}

TEST_F(ScrollBarReentrancy, ACommandMayEndInTheBarsDeath) {
    At(kScroll, [this] { delete bar; });
    bar->ScrollPage(true);
    EXPECT_FALSE(watch.PaneExists());
}

TEST_F(ScrollBarReentrancy, AJumpToTheEndMayEndInTheBarsDeath) {
    At(kScrollTo, [this] { delete bar; });
    bar->ScrollToEnd(true);
    EXPECT_FALSE(watch.PaneExists());
}

TEST_F(ScrollBarReentrancy, AJumpToTheEndMayEndInTheClientsDeath) {
    At(kScrollTo, [this] { DropClient(); });
    bar->ScrollToEnd(true);
    EXPECT_EQ(own, nullptr);
}

TEST_F(ScrollBarReentrancy, AMouseThatLeavesAnArrowOfWhichTheBarIsDeletedEndsThePress) {
    At(kScroll, [this] { delete bar; });
    desktop.Play("press 28 130\nwait 0.05\nmove 200 190\nwait 0.5\nrelease\nclick 57 18");
    EXPECT_FALSE(watch.PaneExists());
    EXPECT_EQ(client.steps.size(), 1u); // the neighbour works
}

namespace {

class Mourner : public ScrollBarPane_Listener {
public:
    std::function<void()> onDeath;

private:
    void ScrollBarPaneDying() override { onDeath(); }
};

} // namespace

TEST_F(ScrollBarReentrancy, AListenerMayDropTheClientOfABarThatDiesUnderTheMouse) {
    Mourner mourner;
    mourner.DependUpon(bar);
    mourner.onDeath = [this] { DropClient(); };
    At(kDone, [this] { delete bar; });
    desktop.Play("click 28 130");
    EXPECT_EQ(own, nullptr);
    EXPECT_FALSE(watch.PaneExists());
}

TEST_F(ScrollBarReentrancy, AListenerMayDeleteANeighbourWhileABarDiesUnderTheMouse) {
    Mourner mourner;
    mourner.DependUpon(bar);
    mourner.onDeath = [this] {
        delete neighbour;
        neighbour = nullptr;
    };
    At(kScroll, [this] { delete bar; });
    desktop.Play("press 28 110\nwait 0.5\nrelease");
    EXPECT_EQ(neighbour, nullptr);
}

TEST_F(ScrollBarReentrancy, PressesOfALiveBarWithoutClientComeToNothing) {
    bar->SetClient(nullptr);
    for (char const *press : {"press 28 18", "press 28 130", "press 28 110", "press 28 70"})
        desktop.Play(std::string(press) + "\nwait 0.5\nmove 28 80\nwait 0.5\nrelease");
    EXPECT_EQ(bar->GetPosition(), 500);
}
