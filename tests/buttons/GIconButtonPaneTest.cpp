#include "buttons/GIconButtonPane.h"
#include "desktop/layout/LayoutEngine.h"
#include "host/CallbackAPI.h"
#include "host/Icons.h"
#include "host/OSRgn.h"
#include "host/glogRec.h"
#include "tests/PaneTest.h"
#include "tests/VirtualPlace.h"

namespace {

short const kFamily = 2000;
short const kIcon = 4;

struct Counts {
    short states, down, disabled;
};

// Notes the calls that a press leads to, with their times.
class NotedButton : public GIconButtonPane {
public:
    NotedButton(glogRec *owner, SimulatedDesktop &desktop, Counts counts)
        : clock(desktop) {
        GIconButtonPaneInit(owner, 0, kFamily, kIcon, counts.states, counts.down, counts.disabled);
        Rect box = {20, 10, 36, 26};
        SetBox(&box);
    }
    using GIconButtonPane::SetCanCancel;

    void SetState(short state) override {
        log.push_back("state " + std::to_string(state));
        GIconButtonPane::SetState(state);
    }
    short ClickAction(int modifiers) override {
        log.push_back("click " + std::to_string(modifiers));
        return GIconButtonPane::ClickAction(modifiers);
    }
    int ReleaseAction() override {
        log.push_back("release in state " + std::to_string(GetState()));
        return releaseResult;
    }
    void DoButtonPress(int modifiers) override {
        log.push_back("press " + std::to_string(modifiers));
        presses.push_back(clock.Now());
        if (onPress)
            onPress();
    }
    void DrawMore(short icon) override { drawnMore.push_back(icon); }

    std::vector<std::string> log;
    std::vector<double> presses;
    std::vector<short> drawnMore;
    int releaseResult = 5;
    std::function<void()> onPress;

private:
    SimulatedDesktop &clock;
};

// Counts the steps of tracking.
class Steps : public VelaFoundationCallbackAPI {
public:
    Steps()
        : former(gInstance) {
        gInstance = this;
    }
    ~Steps() override { gInstance = former; }
    void TrackingStep() override { ++steps; }
    void ListTrackingStep() override {}
    bool IsCancelKey(EventRecordAdapter *, bool) override { return false; }
    bool IsDoubleClick() override { return false; }
    int steps = 0;

private:
    VelaFoundationCallbackAPI *former;
};

class IconButtonPane : public PaneTest {
protected:
    NotedButton *New(Counts counts = {2, 1, 1}) { return new NotedButton(glog, desktop, counts); }
    Lines IconOf(GIconButtonPane &button, short icon) {
        return Traced(button, [icon] { Draw1Icon(kFamily, icon, 10, 20); });
    }
};

typedef std::vector<std::string> Log;

std::string const kClick = "click 12 22";

} // namespace

TEST_F(IconButtonPane, AddsItsOperationsAfterThoseOfAPane) {
    class Last : public GlogPane {
    public:
        using GlogPane::GlogPane;
        virtual void First() {}
        void DrawGuts(OSRgn *) override {}
    };
    ExpectInOrder(PlaceOf(&Last::First), &GIconButtonPane::SetState, &GIconButtonPane::GetState,
                  &GIconButtonPane::ClickAction, &GIconButtonPane::ReleaseAction,
                  &GIconButtonPane::DoButtonPress, &GIconButtonPane::DrawMore);
}

TEST_F(IconButtonPane, IsMadeUnderItsNumberEnabledInStateZero) {
    GIconButtonPane *const button = GIconButtonPane::NewGIconButtonPane(glog, 12, kFamily, kIcon, 2, 1, 1);
    EXPECT_EQ(button->GetID(), 12);
    EXPECT_TRUE(button->IsEnabled());
    EXPECT_EQ(button->GetState(), 0);
}

TEST_F(IconButtonPane, IsNotMadeWithoutAGlog) {
    EXPECT_EQ(GIconButtonPane::NewGIconButtonPane(nullptr, 0, kFamily, kIcon, 2, 1, 1), nullptr);
}

TEST_F(IconButtonPane, KeepsItsEmptyBox) {
    EXPECT_EQ(BoxOf(*GIconButtonPane::NewGIconButtonPane(glog, 0, kFamily, kIcon, 2, 1, 1)),
              (Rect{0, 0, 0, 0}));
}

TEST_F(IconButtonPane, IsMadeWithoutAFamily) {
    EXPECT_NE(GIconButtonPane::NewGIconButtonPane(glog, 0, 0, kIcon, 2, 1, 1), nullptr);
}

TEST_F(IconButtonPane, ItsNaturalSizeIsThatOfItsIconsOrOfTheBoxThatItHas) {
    class Boxed : public GIconButtonPane {
    public:
        Boxed(glogRec *owner, Rect box, short family) {
            SetBox(&box);
            GIconButtonPaneInit(owner, 0, family, kIcon, 2, 1, 1);
        }
    };
    auto const size = [](GIconButtonPane *button) {
        GlogLayoutItem::Rep const &rep = LayoutEngine::Rep(*button->GetLayoutRect());
        return std::pair<int, int>(rep.width, rep.height);
    };
    Rect const icon = GetIconBounds(kFamily);
    Rect const none = {0, 0, 0, 0}, box = {10, 20, 33, 61};
    EXPECT_EQ(size(new Boxed(glog, none, kFamily)),
              std::make_pair(icon.right - icon.left, icon.bottom - icon.top));
    EXPECT_EQ(size(new Boxed(glog, box, kFamily)), std::make_pair(41, 23));
    EXPECT_EQ(size(new Boxed(glog, box, 0)), std::make_pair(41, 23));
    EXPECT_EQ(size(new Boxed(glog, none, 0)), std::make_pair(0, 0)) << "left alone";
    EXPECT_EQ(size(new Boxed(glog, none, -3)), std::make_pair(0, 0));
}

TEST_F(IconButtonPane, TransparentPartsOfItsIconTakeClicksToo) {
    short const shaped = 1821;
    Rect const bounds = GetIconBounds(shaped);
    OSRgn const shape = GetIconRegion(shaped, kIcon);
    std::string out;
    for (short v = 0; v < std::min<short>(bounds.bottom, 16); ++v)
        for (short h = 0; h < std::min<short>(bounds.right, 16); ++h)
            if (!shape.Contains(Point{v, h}))
                out = std::to_string(h + 10) + ' ' + std::to_string(v + 20);
    ASSERT_FALSE(out.empty());
    NotedButton *const button = New();
    button->SetIconSet(shaped);
    Show();
    EXPECT_EQ(ResultOfClick("click " + out), 5);
}

TEST_F(IconButtonPane, WhileItIsHeldDownItsStateIsTheDownState) {
    NotedButton *const button = New({3, 2, 0});
    Show();
    std::vector<short> states;
    button->onPress = [&] { states.push_back(button->GetState()); };
    desktop.Play("press 12 22\nwait 0.15\nrelease");
    EXPECT_EQ(states, (std::vector<short>{3, 3}));
    EXPECT_EQ(button->GetState(), 1);
}

TEST_F(IconButtonPane, APressMayDeleteTheNeighbour) {
    NotedButton *const button = New();
    GIconButtonPane *const neighbour = GIconButtonPane::NewGIconButtonPane(glog, 0, kFamily, kIcon, 2, 1, 1);
    button->onPress = [&] {
        if (button->presses.size() == 1)
            delete neighbour;
    };
    Show();
    EXPECT_EQ(ResultOfClick("press 12 22\nwait 0.35\nrelease"), 5);
    EXPECT_EQ(CountGlogItems(glog), 1);
    EXPECT_EQ(button->presses.size(), 4u);
}

TEST_F(IconButtonPane, APressMayCloseTheWindow) {
    NotedButton *const button = New();
    int presses = 0;
    button->onPress = [&] {
        ++presses;
        DisposeGlog(glog);
    };
    Show();
    desktop.Play("press 12 22\nwait 0.35\nrelease");
    EXPECT_EQ(presses, 1) << "a window that closes releases the button";
}

TEST_F(IconButtonPane, APressMayDisableTheButtonWhichCompletesItsClick) {
    NotedButton *const button = New();
    button->onPress = [&] { button->Disable(); };
    Show();
    EXPECT_EQ(ResultOfClick(kClick), 5);
    EXPECT_FALSE(button->IsEnabled());
    EXPECT_EQ(ResultOfClick(kClick), -1);
}

TEST_F(IconButtonPane, ShowsItsStateAndDrawsMoreOnTop) {
    NotedButton *const button = New();
    EXPECT_EQ(DrawingOf(*button), IconOf(*button, kIcon));
    button->SetState(1);
    EXPECT_EQ(DrawingOf(*button), IconOf(*button, kIcon + 1));
    EXPECT_EQ(button->drawnMore, (std::vector<short>{kIcon, kIcon + 1}));
}

TEST_F(IconButtonPane, DisabledShowsTheIconAfterTheStates) {
    NotedButton *const button = New();
    button->SetState(1);
    button->Disable();
    EXPECT_EQ(DrawingOf(*button), IconOf(*button, kIcon + 2));
}

TEST_F(IconButtonPane, DisabledShowsTheIconAfterTheDownStatesWhereTheyComeFirst) {
    NotedButton *const button = New({2, 3, 1});
    button->SetDisabledIconsAfterDownStateIcons();
    button->Disable();
    EXPECT_EQ(DrawingOf(*button), IconOf(*button, kIcon + 2 + 3));
}

TEST_F(IconButtonPane, DisabledShowsItsStateFromTwoDisabledStatesOn) {
    NotedButton *const button = New({2, 1, 2});
    button->SetState(1);
    button->Disable();
    EXPECT_EQ(DrawingOf(*button), IconOf(*button, kIcon + 2 + 1));
}

TEST_F(IconButtonPane, DisabledWithoutDisabledIconsShowsTheFirstIcon) {
    NotedButton *const button = New();
    button->SetNoDisabledIcons();
    button->SetDisabledIconsAfterDownStateIcons();
    button->SetState(1);
    button->Disable();
    EXPECT_EQ(DrawingOf(*button), IconOf(*button, kIcon));
}

TEST_F(IconButtonPane, DisabledWithoutDisabledIconsShowsItsStateFromTwoDisabledStatesOn) {
    NotedButton *const button = New({2, 1, 2});
    button->SetNoDisabledIcons();
    button->SetState(1);
    button->Disable();
    EXPECT_EQ(DrawingOf(*button), IconOf(*button, kIcon + 1));
}

TEST_F(IconButtonPane, RepaintsOnlyAChangeOfStateEnablingOrIcon) {
    NotedButton *const button = New();
    std::vector<Rect> const all = {{20, 10, 36, 26}};
    Show();
    button->SetState(0);
    button->Enable();
    button->SetIcon(kIcon);
    EXPECT_TRUE(Repainted().empty());
    button->SetState(1);
    EXPECT_EQ(Repainted(), all);
    button->Disable();
    EXPECT_EQ(Repainted(), all);
    button->SetEnable(true);
    EXPECT_EQ(Repainted(), all);
    button->SetIcon(kIcon + 3);
    EXPECT_EQ(Repainted(), all);
}

TEST_F(IconButtonPane, OtherSettersDoNotRepaint) {
    NotedButton *const button = New();
    Show();
    button->SetIconSet(1821);
    button->SetCanDisable(true);
    button->SetDisabledIconsAfterDownStateIcons();
    button->SetNoDisabledIcons();
    EXPECT_TRUE(Repainted().empty());
}

TEST_F(IconButtonPane, SetIconSetChangesTheFamily) {
    NotedButton *const button = New();
    button->SetIconSet(1821);
    EXPECT_EQ(DrawingOf(*button), Traced(*button, [] { Draw1Icon(1821, kIcon, 10, 20); }));
}

TEST_F(IconButtonPane, AClickGoesThroughActionDownStatePressNextStateAndRelease) {
    NotedButton *const button = New();
    Show();
    EXPECT_EQ(ResultOfClick(kClick), 5);
    EXPECT_EQ(button->log, (Log{"click 0", "state 2", "press 0", "state 1", "release in state 1"}));
}

TEST_F(IconButtonPane, AClickAfterTheLastStateLeadsToTheFirst) {
    NotedButton *const button = New();
    button->SetState(1);
    Show();
    ResultOfClick(kClick);
    EXPECT_EQ(button->GetState(), 0);
}

TEST_F(IconButtonPane, ReleasesWithOneByDefault) {
    GIconButtonPane *const button = GIconButtonPane::NewGIconButtonPane(glog, 0, kFamily, kIcon, 2, 1, 1);
    Rect box = {20, 10, 36, 26};
    button->SetBox(&box);
    Show();
    EXPECT_EQ(ResultOfClick(kClick), 1);
}

TEST_F(IconButtonPane, GivesTheModifiersOfThePress) {
    NotedButton *const button = New();
    Show();
    ResultOfClick(kClick + " option");
    EXPECT_EQ(button->log[0], "click 2048");
    EXPECT_EQ(button->log[2], "press 2048");
}

TEST_F(IconButtonPane, TheDownStateFollowsDisabledIconsThatPrecede) {
    NotedButton *const button = New({2, 1, 2});
    button->SetCanDisable(true);
    Show();
    ResultOfClick(kClick);
    EXPECT_EQ(button->log[1], "state 4");
}

TEST_F(IconButtonPane, TheDownStateFollowsTheStatesWhereDisabledIconsComeLast) {
    NotedButton *const button = New({2, 1, 2});
    button->SetCanDisable(true);
    button->SetDisabledIconsAfterDownStateIcons();
    Show();
    ResultOfClick(kClick);
    EXPECT_EQ(button->log[1], "state 2");
}

TEST_F(IconButtonPane, TheDownStateIsThatOfTheStateUpToTheLastDownState) {
    for (short state : {0, 1, 2}) {
        NotedButton *const button = New({3, 2, 0});
        button->SetState(state);
        button->log.clear();
        Show();
        ResultOfClick(kClick);
        EXPECT_EQ(button->log[1], "state " + std::to_string(3 + std::min<int>(state, 1)));
        delete button;
    }
}

TEST_F(IconButtonPane, HeldDownItPressesTenTimesASecond) {
    NotedButton *const button = New();
    Show();
    double const start = desktop.Now();
    desktop.Play("press 12 22\nwait 0.35\nrelease");
    ASSERT_EQ(button->presses.size(), 4u);
    for (std::size_t i = 0; i < button->presses.size(); ++i)
        EXPECT_NEAR(button->presses[i], start + 0.1 * static_cast<double>(i), 1e-9) << i;
}

TEST_F(IconButtonPane, OutsideItShowsItsFormerStateAndPressesNothing) {
    NotedButton *const button = New();
    button->SetState(1);
    button->log.clear();
    Show();
    EXPECT_EQ(ResultOfClick("press 12 22\nmove 100 100\nwait 0.35\nrelease"), -1);
    EXPECT_EQ(button->log, (Log{"click 0", "state 2", "press 0", "state 1"}));
    EXPECT_EQ(button->GetState(), 1);
}

TEST_F(IconButtonPane, BackInsideItIsDownAgainAndCompletesTheClick) {
    NotedButton *const button = New();
    Show();
    EXPECT_EQ(ResultOfClick("press 12 22\nmove 100 100\nmove 13 23\nrelease"), 5);
    EXPECT_EQ(button->log, (Log{"click 0", "state 2", "press 0", "state 0", "state 2", "press 0", "state 1",
                                "release in state 1"}));
}

TEST_F(IconButtonPane, IsShownAtOnceWhileItIsTracked) {
    NotedButton *const button = New();
    Show();
    desktop.TakeDrawing();
    desktop.Play("press 12 22\nmove 100 100\nmove 13 23\nrelease");
    UpdateGlog(glog);
    EXPECT_EQ(button->drawnMore, (std::vector<short>{kIcon, kIcon + 2, kIcon, kIcon + 2, kIcon + 1}));
}

TEST_F(IconButtonPane, WithoutCancelItPressesOnceAndIgnoresWhereTheMouseGoes) {
    NotedButton *const button = New();
    button->SetCanCancel(false);
    Show();
    EXPECT_EQ(ResultOfClick("press 12 22\nwait 0.35\nmove 100 100\nwait 0.2\nrelease"), 5);
    EXPECT_EQ(button->log, (Log{"click 0", "state 2", "press 0", "state 1", "release in state 1"}));
}

TEST_F(IconButtonPane, TellsTheApplicationOfEachStepWithAndWithoutCancel) {
    for (bool canCancel : {true, false}) {
        Steps steps;
        NotedButton *const button = New();
        button->SetCanCancel(canCancel);
        Show();
        desktop.Play("press 12 22\nwait 0.35\nrelease");
        EXPECT_EQ(steps.steps, 3) << canCancel;
        delete button;
    }
}

TEST_F(IconButtonPane, DisabledItRefusesClicks) {
    NotedButton *const button = New();
    button->Disable();
    Show();
    EXPECT_EQ(ResultOfClick(kClick), -1);
    EXPECT_TRUE(button->log.empty());
}

TEST_F(IconButtonPane, MayBeDeletedWhenItIsReleased) {
    class Mayfly : public GIconButtonPane {
    public:
        explicit Mayfly(glogRec *owner) {
            GIconButtonPaneInit(owner, 0, kFamily, kIcon, 2, 1, 1);
            Rect box = {20, 10, 36, 26};
            SetBox(&box);
        }
        int ReleaseAction() override {
            delete this;
            return 3;
        }
    };
    new Mayfly(glog);
    Show();
    EXPECT_EQ(ResultOfClick(kClick), 3);
    EXPECT_EQ(CountGlogItems(glog), 0);
}
