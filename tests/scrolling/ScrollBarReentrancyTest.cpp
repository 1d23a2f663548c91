// Clients and listeners that do away with the bar, its client or its neighbours while the bar is at work.
#include "desktop/panes/PaneEvents.h"
#include "host/PaneWatch.h"
#include "host/glogRec.h"
#include "tests/scrolling/ScrollBarTest.h"
#include <memory>

namespace {

// Does away with the bar when it becomes active or no longer is.
class Deleting : public GlogPane {
public:
    Deleting(glogRec *owner, GlogPane *victim_)
        : victim(victim_) {
        GlogPaneInit(owner, 0);
    }
    void Activate() override { delete victim; }
    void Deactivate() override { delete victim; }
    void DrawGuts(OSRgn *) override {}

private:
    GlogPane *const victim;
};

// Where a client is called in the middle of things.
enum Moment { kInhibit, kGreatest, kStart, kScroll, kScrollTo, kDelay, kDone };

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
        // In the order of the moments.
        std::function<void()> *const slots[] = {&own->onInhibit, &own->onGreatest, &own->onStart,
                                                &own->onScroll,  &own->onScrollTo, &own->onDelay,
                                                &own->onDone};
        *slots[moment] = action;
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
    {kInhibit, "press 28 18\nwait 0.5\nrelease"},
    {kInhibit, "press 28 110\nwait 0.5\nrelease"},
    {kInhibit, "press 28 70\nmove 28 91\nmove 28 80\nrelease"},
    {kInhibit, "press 28 70\nrelease"}, // at the end alone
    {kInhibit, "wheel 28 70 0 -1"},
    {kGreatest, "press 28 70\nmove 28 91\nmove 28 80\nrelease"},
    {kStart, "press 28 18\nwait 0.5\nrelease"},
    {kStart, "press 28 110\nwait 0.5\nrelease"},
    {kStart, "wheel 28 70 0 -1"},
    {kDelay, "press 28 18\nwait 0.5\nrelease"},
    {kDelay, "press 28 110\nwait 0.5\nrelease"},
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

TEST_F(ScrollBarReentrancy, APaneInTheBarMayDeleteItWhenItBecomesInactive) {
    bar->Add(new Deleting(glog, bar), -1);
    bar->Deactivate();
    EXPECT_FALSE(watch.PaneExists());
}

TEST_F(ScrollBarReentrancy, APaneInTheBarMayDeleteItWhenItBecomesActive) {
    bar->Add(new Deleting(glog, bar), -1);
    bar->Activate();
    EXPECT_FALSE(watch.PaneExists());
}

TEST_F(ScrollBarReentrancy, APaneInTheBarMayDeleteItWhenTheWindowBecomesInactive) {
    bar->Add(new Deleting(glog, bar), -1);
    desktop.Play("activate off");
    EXPECT_FALSE(watch.PaneExists());
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

TEST_P(DuringGesture, AClientThatLetsGoOfTheBarHearsNoMore) {
    std::size_t heard = 0;
    At(GetParam().moment, [this, &heard] {
        bar->SetClient(nullptr);
        heard = own->log.size();
    });
    desktop.Play(GetParam().script);
    EXPECT_EQ(own->log.size(), heard);
    EXPECT_EQ(bar->GetClient(), nullptr);
}

namespace {

struct Command {
    Moment moment;
    void (ScrollBarPane::*run)(bool);
};

// Every command that comes by the moment.
Command const kCommands[] = {
    {kInhibit, &ScrollBarPane::ScrollOneUnit}, {kInhibit, &ScrollBarPane::ScrollPage},
    {kInhibit, &ScrollBarPane::ScrollToEnd},   {kGreatest, &ScrollBarPane::ScrollToEnd},
    {kStart, &ScrollBarPane::ScrollOneUnit},   {kStart, &ScrollBarPane::ScrollPage},
    {kScroll, &ScrollBarPane::ScrollOneUnit},  {kScroll, &ScrollBarPane::ScrollPage},
    {kScrollTo, &ScrollBarPane::ScrollToEnd},  {kDone, &ScrollBarPane::ScrollOneUnit},
    {kDone, &ScrollBarPane::ScrollPage},       {kDone, &ScrollBarPane::ScrollToEnd},
};

class DuringCommand : public ScrollBarReentrancy, public testing::WithParamInterface<Command> {
protected:
    void Run() { (bar->*GetParam().run)(true); }
};

INSTANTIATE_TEST_SUITE_P(OfEachKind, DuringCommand, testing::ValuesIn(kCommands));

} // namespace

TEST_P(DuringCommand, TheClientMayDeleteTheBar) {
    At(GetParam().moment, [this] { delete bar; });
    Run();
    EXPECT_FALSE(watch.PaneExists());
}

TEST_P(DuringCommand, TheClientMayDeleteItself) {
    At(GetParam().moment, [this] { DropClient(); });
    Run();
    EXPECT_EQ(own, nullptr);
    EXPECT_TRUE(watch.PaneExists());
}

TEST_P(DuringCommand, TheClientMayDeleteItselfAndTheBar) {
    At(GetParam().moment, [this] {
        delete bar;
        own.reset();
    });
    Run();
    EXPECT_FALSE(watch.PaneExists());
}

TEST_F(ScrollBarReentrancy, AJumpToTheStartMayEndWhenItIsAnnounced) {
    At(kInhibit, [this] { DropClient(); });
    bar->ScrollToEnd(false);
    EXPECT_EQ(own, nullptr);
}

TEST_F(ScrollBarReentrancy, AClientThatLetsGoAtTheSecondAnnouncementIsNotScrolled) {
    int announcements = 0;
    At(kInhibit, [this, &announcements] {
        if (++announcements == 2)
            bar->SetClient(nullptr);
    });
    desktop.Play("press 28 130\nwait 0.5\nrelease");
    EXPECT_EQ(announcements, 2);
    EXPECT_TRUE(own->steps.empty());
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
