#include "buttons/ButtonTracking.h"
#include "host/CallbackAPI.h"
#include "host/Icons.h"
#include "host/OSRgn.h"
#include "host/PortSavers.h"
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

TEST_F(ButtonTracking, TheStockProcedureDrawsTheIconOfTheTransition) {
    IconTrackingRec rec = {7, 9, kFamily, 0, 3, 2};
    for (int to = kTransitionToIdle; to <= kTransitionToReleased; ++to) {
        short const icon = to == kTransitionToIdle ? 0 : to == kTransitionToPressed ? 3 : 2;
        EXPECT_EQ(Traced(*pane, [&] { IconButtonTransitionProc(&rec, static_cast<TransitionTo>(to)); }),
                  Traced(*pane, [&] { Draw1Icon(kFamily, icon, 9, 7); }));
    }
}

TEST_F(ButtonTracking, TheStockProcedureDrawsNothingForATick) {
    IconTrackingRec rec = {7, 9, kFamily, 0, 3, 2};
    EXPECT_TRUE(Traced(*pane, [&] { IconButtonTransitionProc(&rec, kTransitionTick); }).empty());
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

namespace {

bool SameColor(RGBColor const &a, RGBColor const &b) {
    return a.red == b.red && a.green == b.green && a.blue == b.blue;
}

RGBColor const kReddish = {0xC000, 0x1000, 0x2000};
RGBColor const kBlack = {0, 0, 0};
RGBColor seenForeColor;

void NoteForeColor(void *, enum TransitionTo) { VelaDrawing::GetForeColor(&seenForeColor); }

} // namespace

TEST_F(ButtonTracking, IconButtonsDrawInBlackAndGiveTheColoursBack) {
    for (bool special : {false, true}) {
        RGBColor after = kBlack;
        seenForeColor = kReddish;
        pane->onClick = [&] {
            IconTrackingRec rec = {kButton.top, kButton.left, kFamily, 0, 3, 2};
            VelaDrawing::RGBForeColor(kReddish);
            if (special)
                TrackSpecialIconButton(true, &kButton, &rec, NoteForeColor);
            else
                TrackIconButton(true, &kButton, kFamily, 0, 3, 2, NoteForeColor);
            VelaDrawing::GetForeColor(&after);
            return -1;
        };
        desktop.Play("click 30 20");
        EXPECT_TRUE(SameColor(seenForeColor, kBlack)) << "special: " << special;
        EXPECT_TRUE(SameColor(after, kReddish)) << "special: " << special;
    }
}

TEST_F(ButtonTracking, ASpecialIconButtonHasItsRectangleRedrawnAtTheEnd) {
    IconTrackingRec rec = {kButton.top, kButton.left, kFamily, 0, 3, 2};
    int redraws = 0;
    pane->onClick = [&] {
        pane->onDraw = [&] { ++redraws; };
        bool const inside = TrackSpecialIconButton(true, &kButton, &rec, IconButtonTransitionProc);
        EXPECT_EQ(redraws, 0);
        UpdateGlog(glog);
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
