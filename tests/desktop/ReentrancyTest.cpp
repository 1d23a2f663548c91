#include "desktop/drawing/Surface.h"
#include "desktop/panes/DesktopRep.h"
#include "desktop/panes/Glog.h"
#include "desktop/windows/HelpTagWindow.h"
#include "desktop/windows/SimulatedWindowSystem.h"
#include "host/CIdleChore.h"
#include "host/PortSavers.h"
#include "host/Services.h"
#include "tests/PaneTest.h"
#include "tests/desktop/ProbePane.h"

namespace {

// What can happen to panes, glogs and windows while the host is inside one of them.
class ReentrancyTest : public PaneTest {
protected:
    Calls &calls = FreshCalls();
    ProbePane *pane = new ProbePane(glog, {10, 20, 110, 220}, calls);

    class Chore : public CIdleChore {
    public:
        explicit Chore(std::function<void()> work_)
            : CIdleChore(0, kNoInitialDelay)
            , work(std::move(work_)) {
            Assign();
        }
        std::function<void()> work;

    protected:
        void DoIdle() override { work(); }
    };

    // Does something in each virtual operation that the host calls by itself.
    class Acting : public ProbePane {
    public:
        using ProbePane::ProbePane;
        void Idle() override { Act(inIdle); }
        void GlogItemInit() override { Act(inInit); }
        void Resize(Point delta) override {
            Act(inResize);
            ProbePane::Resize(delta);
        }
        void Activate() override { Act(inActivate); }
        int Tab(char direction) override {
            Act(inTab);
            return ProbePane::Tab(direction);
        }
        std::function<void()> inIdle, inInit, inResize, inActivate, inTab;

    private:
        static void Act(std::function<void()> const &action) {
            if (action)
                action();
        }
    };
};

TEST_F(ReentrancyTest, AGlogMayBeDisposedOfWhereverItsPanesAreCalled) {
    std::function<void()> const dispose = [this] { DisposeGlog(glog); };
    for (std::function<void()> Acting::*place :
         {&Acting::inIdle, &Acting::inInit, &Acting::inResize, &Acting::inActivate}) {
        glog = desktop.NewGlog(GlogOptions().Size(100, 100));
        Acting *acting = new Acting(glog, {0, 0, 10, 10}, calls, "acting");
        acting->*place = dispose;
        calls.clear();
        ShowGlog(glog, kShowGlog);
        desktop.Play("resize 120 120\nclick 50 50");
        desktop.ProcessEvents(0);
        EXPECT_EQ(Count(calls, "acting: gone"), 1);
    }
}

TEST_F(ReentrancyTest, AGlogMayBeDisposedOfWhileItIsDrawn) {
    Show();
    pane->onDraw = [&](OSRgn *) { DisposeGlog(glog); };
    pane->Inval();
    desktop.ProcessEvents(0);
    EXPECT_EQ(Count(calls, "pane: gone"), 1);
}

TEST_F(ReentrancyTest, RunEndsWhenAChoreDisposesOfTheLastGlog) {
    Show();
    Chore chore([&] { DisposeGlog(glog); });
    desktop.Script("wait 1000");
    EXPECT_EQ(desktop.Run(), 0);
    EXPECT_EQ(desktop.Now(), 0);
}

TEST_F(ReentrancyTest, RunEndsWhenAChoreQuits) {
    Show();
    Chore chore([&] { desktop.Quit(3); });
    desktop.Script("wait 1000");
    EXPECT_EQ(desktop.Run(), 3);
    EXPECT_EQ(desktop.Now(), 0);
}

TEST_F(ReentrancyTest, RunWithoutAVisibleGlogReturnsAtOnce) {
    desktop.Script("wait 1000");
    EXPECT_EQ(desktop.Run(), 0);
    EXPECT_EQ(desktop.Now(), 0);
}

TEST_F(ReentrancyTest, ADragEndsWithItsWindow) {
    Show();
    int steps = 0;
    pane->onClick = [&](EventRecordAdapter *) {
        Chore chore([&] { ShowGlog(glog, kHideGlog); });
        Point p{0, 0};
        while (MouseIsDraggingWithTimeout(0.1, &p, nullptr, nullptr) && steps < 100)
            ++steps;
    };
    desktop.Play("press 30 20\nwait 50\nrelease");
    EXPECT_EQ(steps, 0);
}

TEST_F(ReentrancyTest, APressThatWaitsGoesWithItsWindow) {
    Show();
    int clicks = 0;
    pane->onClick = [&](EventRecordAdapter *) {
        ++clicks;
        Yield(0.1);
        ShowGlog(glog, kHideGlog);
        ShowGlog(glog, kShowGlog);
    };
    desktop.Play("click 30 20\npress 30 20\nmove 31 20");
    EXPECT_EQ(clicks, 1);
    desktop.Play("release\nclick 30 20");
    EXPECT_EQ(clicks, 2);
}

TEST_F(ReentrancyTest, WaitingForTheReleaseByAskingForTheButtonEnds) {
    Show();
    int asked = 0;
    pane->onClick = [&](EventRecordAdapter *) {
        while (OS::Services::StillDown() && asked < 100)
            ++asked;
    };
    for (std::string const script : {"press 30 20", "press 30 20\nmove 31 20\nmove 32 20"}) {
        asked = 0;
        desktop.Play(script);
        EXPECT_LT(asked, 100) << script;
    }
}

TEST_F(ReentrancyTest, TheCurrentItemIsForgottenByAGlogThatAPaneLeavesInAContainer) {
    ProbeContainer *container = new ProbeContainer(glog, {0, 0, 50, 50});
    ProbePane *inside = new ProbePane(glog, {0, 0, 5, 5}, calls, "inside");
    container->Add(inside, -1);
    glog->SetCurItem(inside);
    container->SetGlog(nullptr);
    EXPECT_EQ(glog->GetCurItem(), nullptr);
    delete container;
}

TEST_F(ReentrancyTest, TheCurrentItemIsForgottenWhenAContainerOfAnotherGlogTakesThePane) {
    glogRec *other = desktop.NewGlog(GlogOptions());
    ProbeContainer *container = new ProbeContainer(other, {0, 0, 50, 50});
    glog->SetCurItem(pane);
    container->Add(pane, -1);
    EXPECT_EQ(glog->GetCurItem(), nullptr);
    EXPECT_EQ(pane->GetGlog(), other);
}

TEST_F(ReentrancyTest, TabMayDeleteTheNextPane) {
    Acting *acting = new Acting(glog, {0, 0, 5, 5}, calls, "acting");
    ProbePane *victim = new ProbePane(glog, {0, 0, 5, 5}, calls, "victim");
    ProbePane *last = new ProbePane(glog, {0, 0, 5, 5}, calls, "last");
    acting->inTab = [&] {
        delete victim;
        victim = nullptr;
        acting->inTab = nullptr;
    };
    last->takesTab = last->becomesGopher = true;
    acting->takesTab = acting->becomesGopher = true;
    glog->SetCurItem(acting);
    Show();
    desktop.Play("key Tab");
    EXPECT_EQ(glog->GetCurItem(), last);
}

TEST_F(ReentrancyTest, TabIsNotOfferedToAPaneThatItHides) {
    Acting *acting = new Acting(glog, {0, 0, 5, 5}, calls, "acting");
    ProbePane *hidden = new ProbePane(glog, {0, 0, 5, 5}, calls, "hidden");
    ProbePane *last = new ProbePane(glog, {0, 0, 5, 5}, calls, "last");
    acting->inTab = [&] { hidden->Hide(); };
    for (ProbePane *each : {static_cast<ProbePane *>(acting), hidden, last})
        each->takesTab = each->becomesGopher = true;
    glog->SetCurItem(acting);
    Show();
    desktop.Play("key Tab");
    EXPECT_EQ(glog->GetCurItem(), last);
}

TEST_F(ReentrancyTest, TabGoesOnFromWhereItWasWhenThePaneGivesUpBeingCurrent) {
    Acting *acting = new Acting(glog, {0, 0, 5, 5}, calls, "acting");
    ProbePane *next = new ProbePane(glog, {0, 0, 5, 5}, calls, "next");
    pane->takesTab = pane->becomesGopher = true;
    next->takesTab = next->becomesGopher = true;
    acting->takesTab = acting->becomesGopher = true;
    glog->SetCurItem(acting);
    acting->inTab = [&] { Glog::From(glog).MakeCurrent(nullptr); };
    Show();
    desktop.Play("key Tab");
    EXPECT_EQ(glog->GetCurItem(), next);
}

TEST(ClosingADesktop, APaneMayDisposeOfAnotherGlogWhileItDies) {
    Calls &calls = FreshCalls();
    {
        SimulatedDesktop desktop;
        class Owner : public ProbePane {
        public:
            Owner(glogRec *glog, Calls &calls, glogRec *owned_)
                : ProbePane(glog, {0, 0, 5, 5}, calls, "owner")
                , owned(owned_) {}
            ~Owner() override { DisposeGlog(owned); }
            glogRec *owned;
        };
        glogRec *popup = desktop.NewGlog(GlogOptions());
        new ProbePane(popup, {0, 0, 5, 5}, calls, "popup");
        new Owner(desktop.NewGlog(GlogOptions()), calls, popup);
    }
    EXPECT_EQ(Count(calls, "popup: gone"), 1);
    EXPECT_EQ(Count(calls, "owner: gone"), 1);
}

TEST_F(ReentrancyTest, AHelpTagMayBeTakenAwayWhileItsDelayRuns) {
    pane->SetHelpTag(LocalizedStrings::HelpTagMgr::Instance().DemandHelpTag("kZoom", "kHZoomIn"));
    Show();
    desktop.Play("move 30 20\nwait 0.2");
    pane->SetHelpTag(nullptr);
    desktop.Play("wait 1");
    EXPECT_FALSE(DesktopRep::Of(desktop).loop->HelpTags().IsShown());
}

TEST_F(ReentrancyTest, TheHelpTagOfAPaneThatIsHiddenMeanwhileDoesNotAppear) {
    pane->SetHelpTag(LocalizedStrings::HelpTagMgr::Instance().DemandHelpTag("kZoom", "kHZoomIn"));
    Show();
    desktop.Play("move 30 20\nwait 0.2");
    pane->Hide();
    desktop.Play("wait 1");
    EXPECT_FALSE(DesktopRep::Of(desktop).loop->HelpTags().IsShown());
}

TEST_F(ReentrancyTest, AChoreThatWaitsIsNotRunAgainMeanwhile) {
    Show();
    int runs = 0;
    Chore chore([&] {
        ++runs;
        Yield(0.1);
    });
    desktop.Play("click 1 1");
    EXPECT_LT(runs, 10);
}

TEST_F(ReentrancyTest, GroupsAndContainersCannotLieInThemselves) {
    ProbeContainer *outer = new ProbeContainer(glog, {0, 0, 50, 50}),
                   *inner = new ProbeContainer(glog, {0, 0, 9, 9});
    EXPECT_EQ(outer->Add(inner, -1), 0);
    EXPECT_LT(inner->Add(outer, -1), 0);
    EXPECT_EQ(CountGlogItems(glog), 2);
    RCPtr<GlogLayoutGroup> a(new GlogLayoutGroup(true)), b(new GlogLayoutGroup(true));
    a->MoveItem(b, -1);
    b->MoveItem(a, -1);
    a->ReplaceItem(b, a);
    a->SetAttribute(GlogLayoutItem::kSpacing, 3, GlogLayoutItem::kPixels, UString());
}

TEST_F(ReentrancyTest, AContainerThatIsAttachedLaterHasAllThatLayoutNeeds) {
    class Late : public CompoundPane {};
    Late *late = new Late;
    EXPECT_EQ(late->CompoundPaneInit(nullptr, 7), nullptr);
    late->SetGlog(glog);
    EXPECT_EQ(late->GetID(), 7);
    ASSERT_NE(late->GetLayout().get(), nullptr);
    late->Add(pane, -1);
    late->SetUseLayout(true);
    Show();
    EXPECT_EQ(pane->GetDrawRectangle(), (Rect{0, 0, 100, 200}));
}

TEST_F(ReentrancyTest, WhatRunsBetweenTwoDragPointsLeavesThePortOfTheDrag) {
    ProbeContainer *container = new ProbeContainer(glog, {120, 100, 190, 300});
    ProbePane *meter = new ProbePane(glog, {0, 0, 5, 5}, calls, "meter");
    container->Add(meter, -1);
    Show();
    Point p{0, 0};
    pane->onClick = [&](EventRecordAdapter *) {
        Chore chore([&] { meter->Prepare(); });
        MouseIsDragging(&p, nullptr);
    };
    desktop.Play("press 30 20\nmove 40 50\nrelease");
    EXPECT_EQ(p, (Point{50, 40}));
}

TEST_F(ReentrancyTest, DragPointsAreLocalToAPortOfAnotherWindowToo) {
    glogRec *other = desktop.NewGlog(GlogOptions().Size(100, 100));
    Rect const place{280, 300, 380, 400};
    Rect target = place;
    ShowGlog(other, kShowGlog);
    PositionGlog(other, &target, false);
    Show();
    Point p{0, 0};
    pane->onClick = [&](EventRecordAdapter *) {
        SetPortToGlog(other);
        MouseIsDragging(&p, nullptr);
    };
    desktop.Play("press 30 20\nmove 20 20\nrelease");
    EXPECT_EQ(p, (Point{20 + 80 - 280, 20 + 100 - 300}));
}

TEST_F(ReentrancyTest, TheOpeningAndClosingOfAWindowAreTold) {
    class Listener : public TarnOSWindow::OSWindow_PlatformWindowListener {
    public:
        void PlatformWindow_Opened(TarnOSWindow::OSWindow &) override { ++opened; }
        void PlatformWindow_Closing(TarnOSWindow::OSWindow &) override { ++closing; }
        int opened = 0, closing = 0;
    } listener;
    typedef TarnOSWindow::OSWindow_PlatformWindowListener Base;
    static_cast<Dependent<Base> &>(listener).DependUpon(glog);
    EXPECT_EQ(listener.opened, 0);
    ShowGlog(glog, kShowGlog);
    EXPECT_EQ(listener.opened, 1);
    DisposeGlog(glog);
    EXPECT_EQ(listener.closing, 1);
}

TEST_F(ReentrancyTest, PanesMadeWhileTheGlogRunsAreStartedAndActive) {
    Show();
    desktop.Play("");
    calls.clear();
    ProbePane *late = new ProbePane(glog, {0, 0, 5, 5}, calls, "late");
    desktop.Play("click 200 190");
    EXPECT_EQ(Count(calls, "late: GlogItemInit"), 1);
    EXPECT_TRUE(late->IsActive());
}

TEST_F(ReentrancyTest, ASubpaneThatIsTakenOutAndAddedAgainIsInTheLayoutAgain) {
    ProbeContainer *container = new ProbeContainer(glog, {0, 0, 100, 100});
    ProbePane *a = new ProbePane(glog, {0, 0, 20, 30}, calls),
              *b = new ProbePane(glog, {0, 0, 10, 30}, calls);
    container->Add(a, -1);
    container->Add(b, -1);
    container->SetUseLayout(true);
    EXPECT_EQ(b->GetDrawRectangle().top, 20);
    container->DelGuts(0, true);
    container->AddGuts(a, 1);
    EXPECT_EQ(a->GetDrawRectangle().top, 10);
    EXPECT_EQ(b->GetDrawRectangle().top, 0);
}

TEST_F(ReentrancyTest, SubpanesAreToldWhenTheirContainerGrowsAndHaveIdleTime) {
    ProbeContainer *container = new ProbeContainer(glog, {0, 0, 100, 100});
    ProbePane *inside = new ProbePane(glog, {0, 0, 20, 30}, calls, "inside");
    container->Add(inside, -1);
    Rect larger{0, 0, 105, 110};
    container->SetBox(&larger);
    EXPECT_EQ(Count(calls, "inside: Resize 10 5"), 1);
    Show();
    desktop.Play("click 300 190");
    EXPECT_GT(inside->idles, 0);
}

TEST_F(ReentrancyTest, LettersBeyondAsciiDoNotPassForNamedKeys) {
    Show();
    glog->SetCurItem(pane);
    InputEvent event;
    event.kind = InputEvent::kKeyDown;
    event.window = Glog::From(glog).Window();
    event.key = 0x0E1B; // its low byte is that of the escape key
    Glog::From(glog).KeyDown(event);
    EXPECT_EQ(Count(calls, "pane: Key 27"), 0);
    EXPECT_EQ(Count(calls, "pane: Key 0"), 1);
}

TEST_F(ReentrancyTest, DamageMadeWhileDrawingIsRedrawnBeforeTheNextWait) {
    Show();
    ProbePane *other = new ProbePane(glog, {150, 0, 160, 10}, calls, "other");
    desktop.ProcessEvents(0);
    calls.clear();
    bool once = true;
    pane->onDraw = [&](OSRgn *) {
        if (once)
            other->Inval();
        once = false;
    };
    pane->Inval();
    desktop.ProcessEvents(0);
    EXPECT_EQ(Count(calls, "other: draw"), 1);
}

TEST_F(ReentrancyTest, APaneThatDamagesItselfWheneverItIsDrawnDoesNotStopTheProgram) {
    Show();
    pane->onDraw = [&](OSRgn *) { pane->Inval(); };
    pane->Inval();
    EXPECT_TRUE(desktop.ProcessEvents(0));
}

TEST_F(ReentrancyTest, WhatAThrowingPaneLeftUndrawnStaysDamaged) {
    Show();
    pane->onDraw = [](OSRgn *) { throw std::runtime_error("drawing failed"); };
    pane->Inval();
    EXPECT_THROW(UpdateGlog(glog), std::runtime_error);
    pane->onDraw = nullptr;
    calls.clear();
    UpdateGlog(glog);
    EXPECT_EQ(Count(calls, "pane: draw"), 1);
}

TEST_F(ReentrancyTest, IdleTimeGoesOnAfterAPaneThrewInIt) {
    Acting *acting = new Acting(glog, {0, 0, 5, 5}, calls, "acting");
    Show();
    acting->inIdle = [] { throw std::runtime_error("idle failed"); };
    EXPECT_THROW(desktop.Play("click 300 190"), std::runtime_error);
    int idles = 0;
    acting->inIdle = [&] { ++idles; };
    desktop.Play("click 300 190");
    EXPECT_GT(idles, 0);
}

TEST_F(ReentrancyTest, CursorsStayWhileTheirDispatchingIsDisabled) {
    Show();
    CrsrMain(650);
    WithCursorDispatchingDisabled const disabled;
    desktop.Play("move 30 20\nmove 300 190");
    CrsrMain(651);
    EXPECT_EQ(static_cast<SimulatedWindowSystem &>(desktop.Windows()).Cursor(), 650);
}

TEST_F(ReentrancyTest, EachClickReportsItsOwnHitAlsoWhenOneIsHandledInsideAnother) {
    ProbePane *inner = new ProbePane(glog, {150, 0, 190, 50}, calls, "inner");
    pane->SetID(1);
    inner->SetID(2);
    pane->clickResult = 1;
    inner->clickResult = 1;
    std::vector<int> hits;
    desktop.SetHitHandler([&](glogRec *, int item, int) { hits.push_back(item); });
    Show();
    pane->onClick = [&](EventRecordAdapter *) { desktop.ProcessEvents(0.5); };
    desktop.Play("click 30 20\nclick 10 160");
    EXPECT_EQ(hits, (std::vector<int>{2, 1}));
}

} // namespace
