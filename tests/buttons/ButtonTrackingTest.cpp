#include "buttons/ButtonTracking.h"
#include "desktop/windows/SimulatedWindowSystem.h"
#include "host/CallbackAPI.h"
#include "host/Icons.h"
#include "host/OSRgn.h"
#include "host/PortSavers.h"
#include "host/Services.h"
#include "host/VelaDrawing.h"
#include "tests/PaneTest.h"

namespace {

Rect const kButton = {10, 20, 30, 60};
short const kFamily = 1841;

// Runs whatever a test wants where a pane would track.
class ClickedPane : public GlogPane {
public:
    explicit ClickedPane(glogRec *owner) {
        GlogPaneInit(owner, 0);
        Rect box = {0, 0, 100, 100};
        SetBox(&box);
    }
    std::function<int()> onClick;
    std::function<void()> onDraw;

protected:
    int HandleClick(EventRecordAdapter *) override {
        Prepare();
        return onClick();
    }
    void DrawGuts(OSRgn *) override {
        if (onDraw)
            onDraw();
    }
};

struct Transition {
    int to;
    double time;
};

// What a procedure was told; it gets the recorder as its data.
class Recorder {
public:
    explicit Recorder(SimulatedDesktop &desktop)
        : clock(desktop) {}
    static void Proc(void *data, enum TransitionTo to) {
        Recorder &recorder = *static_cast<Recorder *>(data);
        recorder.transitions.push_back({to, recorder.clock.Now()});
        if (recorder.onTransition)
            recorder.onTransition();
    }
    // The values in order, ticks left out after the first, which belongs to the press.
    std::vector<int> Changes() const {
        std::vector<int> changes;
        for (Transition const &transition : transitions)
            if (transition.to != kTransitionTick)
                changes.push_back(transition.to);
        return changes;
    }
    std::vector<int> All() const {
        std::vector<int> all;
        for (Transition const &transition : transitions)
            all.push_back(transition.to);
        return all;
    }
    std::vector<Transition> transitions;
    std::function<void()> onTransition;

private:
    SimulatedDesktop &clock;
};

typedef std::vector<int> Transitions;

// Stands in for the application's hooks while a test runs.
class Hooks : public VelaFoundationCallbackAPI {
public:
    Hooks()
        : former(gInstance) {
        gInstance = this;
    }
    ~Hooks() override { gInstance = former; }
    void TrackingStep() override {
        ++steps;
        if (onStep)
            onStep();
    }
    void ListTrackingStep() override {}
    bool IsCancelKey(EventRecordAdapter *, bool) override { return false; }
    bool IsDoubleClick() override { return false; }

    int steps = 0;
    std::function<void()> onStep;

private:
    VelaFoundationCallbackAPI *former;
};

class ButtonTracking : public PaneTest {
protected:
    ButtonTracking()
        : pane(new ClickedPane(glog))
        , recorder(desktop) {
        Show();
    }

    // Tracks kButton when the script presses the pane; the loop's result.
    bool Track(std::string const &script, bool reportInside = true) {
        bool result = false;
        bool ran = false;
        pane->onClick = [&] {
            ran = true;
            start = desktop.Now();
            result = GenericButtonTrackingLoop(reportInside, &kButton, Recorder::Proc, &recorder);
            end = desktop.Now();
            return -1;
        };
        desktop.Play(script);
        EXPECT_TRUE(ran);
        return result;
    }

    ClickedPane *pane;
    Recorder recorder;
    double start = 0, end = 0;
};

} // namespace

TEST_F(ButtonTracking, AShortClickIsToldPressedTickReleased) {
    EXPECT_TRUE(Track("click 30 20"));
    EXPECT_EQ(recorder.All(), (Transitions{kTransitionToPressed, kTransitionTick, kTransitionToReleased}));
}

TEST_F(ButtonTracking, TransitionsAreToldByTheirNumbers) {
    Track("press 30 20\nwait 0.11\nmove 90 90\nmove 31 21\nrelease");
    EXPECT_EQ(recorder.All(), (Transitions{1, 3, 0, 1, 3, 2}));
}

TEST_F(ButtonTracking, ThePressShowsForATenthOfASecond) {
    Track("click 30 20");
    EXPECT_DOUBLE_EQ(recorder.transitions[0].time, start);
    EXPECT_DOUBLE_EQ(recorder.transitions[1].time, start);
    EXPECT_DOUBLE_EQ(recorder.transitions[2].time, start + 0.1);
}

TEST_F(ButtonTracking, ARestingMouseTicksFifteenTimesASecond) {
    Track("press 30 20\nwait 0.5\nrelease");
    std::vector<double> ticks;
    for (Transition const &transition : recorder.transitions)
        if (transition.to == kTransitionTick)
            ticks.push_back(transition.time);
    ASSERT_GE(ticks.size(), 5u);
    EXPECT_NEAR(ticks[1] - ticks[0], 0.1 + 1.0 / 15.0, 1e-9);
    for (std::size_t i = 2; i < ticks.size(); ++i)
        EXPECT_NEAR(ticks[i] - ticks[i - 1], 1.0 / 15.0, 1e-9);
}

TEST_F(ButtonTracking, ARestingMouseChangesNothing) {
    EXPECT_TRUE(Track("press 30 20\nwait 0.5\nrelease"));
    EXPECT_EQ(recorder.Changes(), (Transitions{kTransitionToPressed, kTransitionToReleased}));
}

TEST_F(ButtonTracking, AReleaseOutsideEndsWithIdleAndIsReportedWhenAsked) {
    EXPECT_FALSE(Track("press 30 20\nwait 0.2\nmove 90 90\nwait 0.1\nrelease"));
    EXPECT_EQ(recorder.Changes(), (Transitions{kTransitionToPressed, kTransitionToIdle}));
    EXPECT_EQ(recorder.transitions.back().to, kTransitionToIdle);
}

TEST_F(ButtonTracking, AReleaseOutsideCountsAsAPressWhenNotAsked) {
    EXPECT_TRUE(Track("press 30 20\nwait 0.2\nmove 90 90\nwait 0.1\nrelease", false));
    EXPECT_EQ(recorder.transitions.back().to, kTransitionToIdle);
}

TEST_F(ButtonTracking, AMouseThatLeavesAndReturnsIsToldIdlePressedTick) {
    EXPECT_TRUE(Track("press 30 20\nwait 0.2\nmove 90 90\nwait 0.2\nmove 31 21\nrelease"));
    std::vector<int> const all = recorder.All();
    auto const idle = std::find(all.begin(), all.end(), static_cast<int>(kTransitionToIdle));
    ASSERT_GE(all.end() - idle, 4);
    EXPECT_EQ(idle[1], kTransitionToPressed);
    EXPECT_EQ(idle[2], kTransitionTick);
    EXPECT_EQ(all.back(), kTransitionToReleased);
}

TEST_F(ButtonTracking, NothingIsToldWhileTheMouseIsOutside) {
    Track("press 30 20\nwait 0.2\nmove 90 90\nwait 1\nmove 95 95\nwait 1\nrelease");
    EXPECT_EQ(std::count_if(recorder.transitions.begin(), recorder.transitions.end(),
                            [this](Transition const &t) { return t.time > start + 0.5; }),
              0);
}

TEST_F(ButtonTracking, TheRightAndBottomEdgesAreOutside) {
    EXPECT_FALSE(Track("press 30 20\nwait 0.2\nmove 60 20\nwait 0.1\nrelease"));
    recorder.transitions.clear();
    EXPECT_FALSE(Track("press 30 20\nwait 0.2\nmove 30 30\nwait 0.1\nrelease"));
}

TEST_F(ButtonTracking, TheLastPixelsInsideAreInside) {
    EXPECT_TRUE(Track("press 30 20\nwait 0.2\nmove 59 29\nwait 0.1\nrelease"));
    EXPECT_EQ(recorder.Changes(), (Transitions{kTransitionToPressed, kTransitionToReleased}));
}

TEST_F(ButtonTracking, AMouseThatHasNotMovedCountsAsInside) {
    EXPECT_TRUE(Track("press 90 90\nwait 0.3\nrelease"));
    EXPECT_EQ(recorder.Changes(), (Transitions{kTransitionToPressed, kTransitionToReleased}));
}

TEST_F(ButtonTracking, ThePressIsShownBeforeTheMouseIsLookedAt) {
    EXPECT_FALSE(Track("press 30 20\nmove 90 90\nwait 0.3\nrelease"));
    EXPECT_EQ(recorder.All(), (Transitions{kTransitionToPressed, kTransitionTick, kTransitionToIdle}));
    EXPECT_DOUBLE_EQ(recorder.transitions.back().time, start + 0.1);
}

TEST_F(ButtonTracking, TheApplicationsHookRunsOnEachPass) {
    Hooks hooks;
    Track("press 30 20\nwait 0.5\nrelease");
    std::ptrdiff_t const ticks = std::count_if(recorder.transitions.begin(), recorder.transitions.end(),
                                               [](Transition const &t) { return t.to == kTransitionTick; });
    EXPECT_EQ(hooks.steps, ticks - 1); // the first tick belongs to the press
}

TEST_F(ButtonTracking, TheApplicationsHookRunsOutsideToo) {
    Hooks hooks;
    Track("press 30 20\nwait 0.2\nmove 90 90\nwait 1\nrelease");
    EXPECT_GE(hooks.steps, 15);
}

TEST_F(ButtonTracking, NoHookRunsWhenTheButtonIsUpAtOnce) {
    Hooks hooks;
    Track("click 30 20");
    EXPECT_EQ(hooks.steps, 0);
}

TEST_F(ButtonTracking, AHookThatNarrowsTheClipDoesNotHarmTheNextStep) {
    Hooks hooks;
    hooks.onStep = [] {
        Rect const narrow = {0, 0, 1, 1};
        VelaDrawing::ClipRect(&narrow);
    };
    std::vector<Rect> clips;
    recorder.onTransition = [&clips] {
        OSRgn clip;
        VelaDrawing::GetClip(&clip);
        clips.push_back(CarbonUtils::GetRgnBounds(&clip));
    };
    Track("press 30 20\nwait 0.4\nrelease");
    ASSERT_GE(clips.size(), 4u);
    for (Rect const &clip : clips)
        EXPECT_EQ(clip, clips.front());
}

TEST_F(ButtonTracking, AHookThatChangesThePortDoesNotHarmTheNextStep) {
    glogRec *const other = desktop.NewGlog(GlogOptions().Size(50, 50));
    Hooks hooks;
    hooks.onStep = [other] { SetPortToGlog(other); };
    std::vector<OSPort *> ports;
    recorder.onTransition = [&ports] {
        OSPort *port = nullptr;
        VelaDrawing::GetPort(&port);
        ports.push_back(port);
    };
    Track("press 30 20\nwait 0.4\nrelease");
    ASSERT_GE(ports.size(), 4u);
    for (OSPort *port : ports)
        EXPECT_EQ(port, glog->GetPort());
}

namespace {

// A platform on which something else may have drawn whenever the application has waited.
class MeddlingWindows : public SimulatedWindowSystem {
public:
    MeddlingWindows()
        : SimulatedWindowSystem(1.0) {}
    bool WaitEvent(InputEvent &event, double timeout, Waiter waiter, char const *what) override {
        if (onWait)
            onWait();
        return SimulatedWindowSystem::WaitEvent(event, timeout, waiter, what);
    }
    std::function<void()> onWait;
};

class MeddlingDesktop : public Desktop {
public:
    MeddlingDesktop()
        : Desktop(DesktopOptions(), std::make_unique<MeddlingWindows>()) {}
    MeddlingWindows &System() { return static_cast<MeddlingWindows &>(Windows()); }
};

// Leaves a narrow clip and another port behind in some of the waits of a press.
class MeddledTracking : public testing::Test {
protected:
    struct Transition {
        OSPort *port;
        Rect clip;
    };

    MeddledTracking()
        : glog(desktop.NewGlog(GlogOptions().Size(320, 200)))
        , other(desktop.NewGlog(GlogOptions().Size(50, 50)))
        , pane(new ClickedPane(glog)) {
        desktop.FinishGlog(glog);
        ShowGlog(glog, kShowGlog);
        desktop.System().onWait = [this] {
            if (!mayMeddle || !mayMeddle())
                return;
            ++meddled;
            Rect const narrow = {0, 0, 1, 1};
            VelaDrawing::ClipRect(&narrow);
            SetPortToGlog(other);
        };
        pane->onClick = [this] {
            start = TarnSystemTime::GetCurrentEventTime();
            GenericButtonTrackingLoop(true, &kButton, Note, this);
            return -1;
        };
    }

    static void Note(void *data, enum TransitionTo) {
        Transition seen = {nullptr, {}};
        VelaDrawing::GetPort(&seen.port);
        OSRgn clip;
        VelaDrawing::GetClip(&clip);
        seen.clip = CarbonUtils::GetRgnBounds(&clip);
        static_cast<MeddledTracking *>(data)->seen.push_back(seen);
    }

    // Whether the press has been shown and nothing else yet.
    bool Pressed() const { return seen.size() == 2; }
    double SincePress() const { return TarnSystemTime::GetCurrentEventTime() - start; }

    // Every transition of a press that was not moved finds the port and the clip of the first.
    void ExpectUndisturbed(std::string const &script) {
        desktop.System().Append(EventScript::Parse(script, "press"));
        desktop.Run();
        EXPECT_GT(meddled, 0);
        ASSERT_EQ(seen.size(), 3u);
        for (Transition const &transition : seen) {
            EXPECT_EQ(transition.port, glog->GetPort());
            EXPECT_EQ(transition.clip, seen.front().clip);
        }
    }

    MeddlingDesktop desktop;
    glogRec *glog, *other;
    ClickedPane *pane;
    std::function<bool()> mayMeddle;
    int meddled = 0;
    double start = 0;
    std::vector<Transition> seen;
};

double const kShownFor = 0.1;

} // namespace

TEST_F(MeddledTracking, WhatDrawsWhileThePressShowsDoesNotHarmTheRelease) {
    mayMeddle = [this] { return Pressed() && SincePress() < kShownFor; };
    ExpectUndisturbed("click 30 20");
}

TEST_F(MeddledTracking, WhatDrawsDuringTheLastWaitDoesNotHarmTheRelease) {
    mayMeddle = [this] { return Pressed() && SincePress() >= kShownFor; };
    ExpectUndisturbed("press 30 20\nwait 0.12\nrelease");
}

TEST_F(ButtonTracking, TheStockProcedureDrawsTheIconOfTheTransition) {
    IconTrackingRec rec = {7, 9, kFamily, 0, 3, 2};
    short const icons[] = {0, 3, 2}; // by the number of the transition
    for (int to = 0; to < 3; ++to)
        EXPECT_EQ(Traced(*pane, [&] { IconButtonTransitionProc(&rec, static_cast<TransitionTo>(to)); }),
                  Traced(*pane, [&] { Draw1Icon(kFamily, icons[to], 9, 7); }));
}

TEST_F(ButtonTracking, TheStockProcedureDrawsNothingForATickOrAnyOtherValue) {
    IconTrackingRec rec = {7, 9, kFamily, 0, 3, 2};
    for (int to : {3, 4, 255, -1})
        EXPECT_TRUE(
            Traced(*pane, [&] { IconButtonTransitionProc(&rec, static_cast<TransitionTo>(to)); }).empty())
            << to;
}

TEST_F(ButtonTracking, AnIconRecordHasSixShortsInOrder) {
    EXPECT_EQ(sizeof(IconTrackingRec), 12u);
    EXPECT_EQ(offsetof(IconTrackingRec, h), 2u);
    EXPECT_EQ(offsetof(IconTrackingRec, family), 4u);
    EXPECT_EQ(offsetof(IconTrackingRec, idleIcon), 6u);
    EXPECT_EQ(offsetof(IconTrackingRec, pressedIcon), 8u);
    EXPECT_EQ(offsetof(IconTrackingRec, releaseIcon), 10u);
}

TEST_F(ButtonTracking, AnIconButtonDrawsPressedThenReleasedAtTheRectangle) {
    pane->onClick = [] {
        return TrackIconButton(true, &kButton, kFamily, 0, 3, 2, IconButtonTransitionProc) ? 1 : -1;
    };
    desktop.TakeDrawing();
    EXPECT_EQ(ResultOfClick("click 30 20"), 1);
    Lines const drawn = Only("Draw1Icon", desktop.TakeDrawing());
    EXPECT_EQ(drawn, Traced(*pane, [] {
                  Draw1Icon(kFamily, 3, kButton.left, kButton.top);
                  Draw1Icon(kFamily, 2, kButton.left, kButton.top);
              }));
}

TEST_F(ButtonTracking, AnIconButtonReportsAReleaseOutside) {
    pane->onClick = [] {
        return TrackIconButton(true, &kButton, kFamily, 0, 3, 2, IconButtonTransitionProc) ? 1 : -1;
    };
    EXPECT_EQ(ResultOfClick("press 30 20\nwait 0.2\nmove 90 90\nwait 0.1\nrelease"), -1);
}

TEST_F(ButtonTracking, AnIconButtonReportsNoReleaseOutsideWhenNotAsked) {
    pane->onClick = [] {
        return TrackIconButton(false, &kButton, kFamily, 0, 3, 2, IconButtonTransitionProc) ? 1 : -1;
    };
    EXPECT_EQ(ResultOfClick("press 30 20\nwait 0.2\nmove 90 90\nwait 0.1\nrelease"), 1);
}

TEST_F(ButtonTracking, ASpecialIconButtonReportsAReleaseOutside) {
    IconTrackingRec rec = {kButton.top, kButton.left, kFamily, 0, 3, 2};
    pane->onClick = [&] {
        return TrackSpecialIconButton(true, &kButton, &rec, IconButtonTransitionProc) ? 1 : -1;
    };
    EXPECT_EQ(ResultOfClick("press 30 20\nwait 0.2\nmove 90 90\nwait 0.1\nrelease"), -1);
}

namespace {

SaveColorRec const kTinted = {{0xC000, 0x1000, 0x2000}, {0x3000, 0xD000, 0x4000}};
SaveColorRec const kBlackOnWhite = {{0, 0, 0}, {0xFFFF, 0xFFFF, 0xFFFF}};
SaveColorRec seenColors;

void NoteColors(void *, enum TransitionTo) { GetColors(&seenColors); }

} // namespace

TEST_F(ButtonTracking, IconButtonsDrawBlackOnWhiteAndGiveTheColoursBack) {
    for (bool special : {false, true}) {
        SaveColorRec after = kBlackOnWhite;
        seenColors = kTinted;
        pane->onClick = [&] {
            IconTrackingRec rec = {kButton.top, kButton.left, kFamily, 0, 3, 2};
            SetColors(&kTinted);
            if (special)
                TrackSpecialIconButton(true, &kButton, &rec, NoteColors);
            else
                TrackIconButton(true, &kButton, kFamily, 0, 3, 2, NoteColors);
            GetColors(&after);
            return -1;
        };
        desktop.Play("click 30 20");
        EXPECT_EQ(seenColors, kBlackOnWhite) << "special: " << special;
        EXPECT_EQ(after, kTinted) << "special: " << special;
    }
}

TEST_F(ButtonTracking, ASpecialIconButtonHasItsRectangleRedrawnAtTheEnd) {
    IconTrackingRec rec = {kButton.top, kButton.left, kFamily, 0, 3, 2};
    int redraws = 0;
    pane->onClick = [&] {
        pane->onDraw = [&] { ++redraws; };
        // Nothing is drawn on the way, so that the damage alone is presented.
        bool const inside = TrackSpecialIconButton(true, &kButton, &rec, NoteColors);
        EXPECT_EQ(redraws, 0);
        desktop.TakePresented(glog);
        EXPECT_EQ(Repainted(), std::vector<Rect>{kButton});
        return inside ? 1 : -1;
    };
    EXPECT_EQ(ResultOfClick("click 30 20"), 1);
    EXPECT_EQ(redraws, 1);
}

TEST_F(ButtonTracking, AnIconButtonIsNotRedrawnAtTheEnd) {
    int redraws = 0;
    pane->onClick = [&] {
        pane->onDraw = [&] { ++redraws; };
        TrackIconButton(true, &kButton, kFamily, 0, 3, 2, IconButtonTransitionProc);
        UpdateGlog(glog);
        return -1;
    };
    desktop.Play("click 30 20");
    EXPECT_EQ(redraws, 0);
}

TEST_F(ButtonTracking, ASpecialIconButtonUsesTheCallersRecordAndPlace) {
    IconTrackingRec rec = {5, 6, kFamily, 1, 4, 5};
    pane->onClick = [&] {
        return TrackSpecialIconButton(false, &kButton, &rec, IconButtonTransitionProc) ? 1 : -1;
    };
    desktop.TakeDrawing();
    EXPECT_EQ(ResultOfClick("press 30 20\nwait 0.2\nmove 90 90\nwait 0.1\nrelease"), 1);
    Lines const drawn = Only("Draw1Icon", desktop.TakeDrawing());
    EXPECT_EQ(drawn, Traced(*pane, [] {
                  Draw1Icon(kFamily, 4, 6, 5);
                  Draw1Icon(kFamily, 1, 6, 5);
              }));
}
