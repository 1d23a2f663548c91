#include "buttons/GlogButtonPane.h"
#include "desktop/windows/SimulatedWindowSystem.h"
#include "host/CIdleChore.h"
#include "host/CompoundPane.h"
#include "host/Services.h"
#include "host/TarnError.h"
#include "tests/PaneTest.h"
#include "tests/VirtualPlace.h"
#include <type_traits>

namespace {

// A button that shows nothing but notes how it would look.
class ProbeButton : public GlogButtonPane {
public:
    struct Look {
        bool down, tracking;
        double time;
        bool operator==(Look const &other) const {
            return down == other.down && tracking == other.tracking && time == other.time;
        }
    };

    static ProbeButton *New(glogRec *owner, unsigned char mode = kEnabled) {
        ProbeButton *const button = new ProbeButton;
        if (!button->InitGlogButtonPane(owner, mode)) {
            delete button;
            return nullptr;
        }
        Rect box = {10, 20, 30, 60};
        button->SetBox(&box);
        return button;
    }
    using GlogButtonPane::ButtonIsDown;
    using GlogButtonPane::GetMode;
    using GlogButtonPane::HandleClick;
    using GlogButtonPane::InitGlogButtonPane;
    using GlogButtonPane::StillTracking;

    void Depress() override {
        GlogButtonPane::Depress();
        changes.push_back("depress");
    }
    void Release() override {
        GlogButtonPane::Release();
        changes.push_back(StillTracking() ? "release while tracking" : "release");
    }

    std::vector<Look> looks;
    std::vector<std::string> changes;

protected:
    void DrawGuts(OSRgn *) override {
        looks.push_back({ButtonIsDown(), StillTracking(), TarnSystemTime::GetCurrentEventTime()});
    }
};

std::ostream &operator<<(std::ostream &out, ProbeButton::Look const &look) {
    return out << (look.down ? "down" : "up") << (look.tracking ? ", tracking, at " : ", at ") << look.time;
}

class Listener : public GlogButtonPaneListener {
public:
    void GlogButtonPressed(GlogButtonPane *source) override {
        sources.push_back(source);
        if (onPress)
            onPress();
    }
    std::vector<GlogButtonPane *> sources;
    std::function<void()> onPress;
};

// Puts the procedure variables back when a test has replaced some of them.
class ProceduresKept {
public:
    ~ProceduresKept() {
        btnDepress = depress;
        btnRelease = release;
    }

private:
    void (*const depress)(GlogButtonPane *) = btnDepress;
    void (*const release)(GlogButtonPane *) = btnRelease;
};

typedef std::vector<std::string> Changes;
typedef std::vector<ProbeButton::Look> Looks;

class ButtonPane : public PaneTest {
protected:
    ButtonPane()
        : button(ProbeButton::New(glog)) {
        listener.DependUpon(button);
        Show();
        button->looks.clear();
    }

    // What the button shows after a change of state, if that has invalidated it.
    bool IsRedrawn() {
        button->looks.clear();
        UpdateGlog(glog);
        return !button->looks.empty();
    }

    ProbeButton *button;
    Listener listener;
};

char const kSlideOff[] = "press 30 20\nwait 0.3\nmove 90 90\nwait 0.3\nrelease";
char const kSlideOffAndBack[] = "press 30 20\nwait 0.3\nmove 90 90\nwait 0.3\nmove 31 21\nrelease";

} // namespace

TEST_F(ButtonPane, IsAProviderFirstAndAPaneSecond) {
    static_assert(std::is_base_of<Provider<GlogButtonPaneListener>, GlogButtonPane>::value, "sends presses");
    static_assert(std::is_abstract<GlogButtonPane>::value, "drawing is the subclass's");
    GlogButtonPane *const whole = button;
    EXPECT_EQ(static_cast<void *>(static_cast<Provider<GlogButtonPaneListener> *>(whole)),
              static_cast<void *>(whole));
    EXPECT_GT(reinterpret_cast<char *>(static_cast<GlogPane *>(whole)), reinterpret_cast<char *>(whole));
}

TEST_F(ButtonPane, AddsItsOperationsBehindThoseOfTheProvider) {
    ExpectInOrder(kAfterDestructor, &GlogButtonPane::Depress, &GlogButtonPane::Release,
                  &GlogButtonPane::GetButtonText);
}

TEST_F(ButtonPane, CannotBeAttachedToNoGlog) {
    ProbeButton loose;
    EXPECT_EQ(loose.InitGlogButtonPane(nullptr, 5), nullptr);
    EXPECT_EQ(loose.GetMode(), GlogButtonPane::kEnabled);
}

TEST_F(ButtonPane, StartsReleasedInTheModeGivenUnderNumberZero) {
    ProbeButton *const other = ProbeButton::New(glog, 3);
    EXPECT_FALSE(other->ButtonIsDown());
    EXPECT_FALSE(other->StillTracking());
    EXPECT_EQ(other->GetMode(), 3);
    EXPECT_EQ(other->GetID(), 0);
}

TEST_F(ButtonPane, IsAttachedReleasedWhateverWasBefore) {
    ProbeButton *const other = new ProbeButton;
    other->Depress();
    other->InitGlogButtonPane(glog, GlogButtonPane::kEnabled);
    EXPECT_FALSE(other->ButtonIsDown());
}

TEST_F(ButtonPane, DepressAndReleaseKeepTheStateAndDrawNothing) {
    button->Depress();
    EXPECT_TRUE(button->ButtonIsDown());
    EXPECT_FALSE(IsRedrawn());
    button->Release();
    EXPECT_FALSE(button->ButtonIsDown());
    EXPECT_FALSE(IsRedrawn());
}

TEST_F(ButtonPane, HasNoTextOfItsOwn) {
    UString text = Text("as before");
    button->GetButtonText(text);
    EXPECT_TRUE(text == Text("as before"));
}

TEST_F(ButtonPane, DisableAndEnableChangeTheModeAndRepaint) {
    button->Disable();
    EXPECT_EQ(button->GetMode(), GlogButtonPane::kDisabled);
    EXPECT_TRUE(IsRedrawn());
    button->Enable();
    EXPECT_EQ(button->GetMode(), GlogButtonPane::kEnabled);
    EXPECT_TRUE(IsRedrawn());
}

TEST_F(ButtonPane, DisableAndEnableAlsoLeaveOtherModes) {
    button->SetMode(2);
    button->Disable();
    EXPECT_EQ(button->GetMode(), GlogButtonPane::kDisabled);
    button->SetMode(2);
    button->Enable();
    EXPECT_EQ(button->GetMode(), GlogButtonPane::kEnabled);
}

TEST_F(ButtonPane, TheSameModeOnceMoreDoesNotRepaint) {
    button->Enable();
    EXPECT_FALSE(IsRedrawn());
    button->SetMode(2);
    EXPECT_TRUE(IsRedrawn());
    button->SetMode(2);
    EXPECT_FALSE(IsRedrawn());
    button->Disable();
    EXPECT_TRUE(IsRedrawn());
    button->Disable();
    EXPECT_FALSE(IsRedrawn());
}

TEST_F(ButtonPane, AClickGivesOneAndTellsTheListenersOnce) {
    EXPECT_EQ(ResultOfClick("click 30 20"), 1);
    EXPECT_EQ(listener.sources, std::vector<GlogButtonPane *>{button});
}

TEST_F(ButtonPane, AClickIsDrawnPressedAtOnceAndReleasedAnEighthOfASecondLater) {
    double const start = desktop.Now();
    desktop.Play("click 30 20");
    EXPECT_EQ(button->looks, (Looks{{true, true, start}, {false, false, start + 0.125}}));
    EXPECT_EQ(button->changes, (Changes{"depress", "release"}));
}

TEST_F(ButtonPane, TheListenersHearAfterTheButtonIsDrawnReleased) {
    Looks seen;
    double time = 0;
    listener.onPress = [&] {
        seen = button->looks;
        time = desktop.Now();
        EXPECT_FALSE(button->StillTracking());
        EXPECT_FALSE(button->ButtonIsDown());
    };
    double const start = desktop.Now();
    desktop.Play("click 30 20");
    ASSERT_EQ(seen.size(), 2u);
    EXPECT_FALSE(seen.back().down);
    EXPECT_DOUBLE_EQ(time, start + 0.125);
}

TEST_F(ButtonPane, ALongPressLastsUntilTheRelease) {
    double const start = desktop.Now();
    desktop.Play("press 30 20\nwait 2\nrelease");
    ASSERT_EQ(button->looks.size(), 2u);
    EXPECT_DOUBLE_EQ(button->looks.back().time, start + 2);
}

TEST_F(ButtonPane, AMouseThatSlidesOffReleasesTheButtonWhileTracking) {
    double const start = desktop.Now();
    EXPECT_EQ(ResultOfClick(kSlideOff), -1);
    EXPECT_EQ(button->looks, (Looks{{true, true, start}, {false, true, start + 0.3}}));
    EXPECT_EQ(button->changes, (Changes{"depress", "release while tracking"}));
}

TEST_F(ButtonPane, AReleaseOutsideTellsNobody) {
    desktop.Play(kSlideOff);
    EXPECT_TRUE(listener.sources.empty());
    EXPECT_FALSE(button->ButtonIsDown());
    EXPECT_FALSE(button->StillTracking());
}

TEST_F(ButtonPane, AMouseThatLeavesAndComesBackCountsAsAPress) {
    EXPECT_EQ(ResultOfClick(kSlideOffAndBack), 1);
    EXPECT_EQ(button->changes, (Changes{"depress", "release while tracking", "depress", "release"}));
    EXPECT_EQ(listener.sources.size(), 1u);
}

TEST_F(ButtonPane, AMouseThatMovesInsideChangesNothing) {
    EXPECT_EQ(ResultOfClick("press 30 20\nwait 0.3\nmove 40 25\nmove 59 29\nmove 20 10\nrelease"), 1);
    EXPECT_EQ(button->looks.size(), 2u);
}

TEST_F(ButtonPane, TheRightAndBottomEdgesAreOutside) {
    EXPECT_EQ(ResultOfClick("press 30 20\nwait 0.3\nmove 60 20\nrelease"), -1);
    EXPECT_EQ(ResultOfClick("press 30 20\nwait 0.3\nmove 30 30\nrelease"), -1);
}

TEST_F(ButtonPane, AButtonThatIsNotEnabledLetsAClickFallThrough) {
    for (unsigned char mode : {1, 2, 255}) {
        button->SetMode(mode);
        EXPECT_EQ(ResultOfClick("click 30 20"), 0);
    }
    EXPECT_TRUE(button->changes.empty());
    EXPECT_TRUE(listener.sources.empty());
}

TEST_F(ButtonPane, FlashPressesTheButtonWithTheMouseUp) {
    double const start = desktop.Now();
    EXPECT_EQ(button->Flash(0), 1);
    EXPECT_DOUBLE_EQ(desktop.Now(), start + 0.125);
    EXPECT_EQ(button->changes, (Changes{"depress", "release"}));
    EXPECT_EQ(listener.sources.size(), 1u);
}

TEST_F(ButtonPane, FlashWithoutAKeyFollowsAMouseThatIsHeldDown) {
    class Flasher : public GlogPane {
    public:
        Flasher(glogRec *owner, ProbeButton *flashed)
            : button(flashed) {
            GlogPaneInit(owner, 0);
            Rect box = {100, 100, 120, 140};
            SetBox(&box);
        }
        int HandleClick(EventRecordAdapter *) override { return button->Flash(0); }
        void DrawGuts(OSRgn *) override {}
        ProbeButton *button;
    };
    new Flasher(glog, button);
    EXPECT_EQ(ResultOfClick("press 110 110\nwait 0.3\nmove 111 111\nwait 0.2\nrelease"), -1);
    EXPECT_EQ(button->changes, (Changes{"depress", "release while tracking"}));
    EXPECT_TRUE(listener.sources.empty());
}

TEST_F(ButtonPane, FlashOfAButtonThatIsNotEnabledIsHandledAndDoesNothing) {
    for (unsigned char mode : {1, 2, 255}) {
        button->SetMode(mode);
        EXPECT_EQ(button->Flash(0), -1) << int(mode);
    }
    EXPECT_TRUE(button->changes.empty());
    EXPECT_TRUE(listener.sources.empty());
}

TEST_F(ButtonPane, FlashWithAKeyThatIsUpLastsAnEighthOfASecond) {
    double const start = desktop.Now();
    EXPECT_EQ(button->Flash('x'), 1);
    EXPECT_DOUBLE_EQ(desktop.Now(), start + 0.125);
}

TEST_F(ButtonPane, TrackTellsWhetherTheButtonWasPressed) {
    EXPECT_TRUE(button->Track(0));
    ProceduresKept kept;
    btnDepress = [](GlogButtonPane *) {};
    EXPECT_FALSE(button->Track(0));
}

TEST_F(ButtonPane, AHiddenButtonTellsButDrawsNothing) {
    button->Hide();
    UpdateGlog(glog);
    button->looks.clear();
    EXPECT_EQ(button->Flash(0), 1);
    button->SetMode(2);
    UpdateGlog(glog);
    EXPECT_TRUE(button->looks.empty());
    EXPECT_EQ(button->GetMode(), 2);
    EXPECT_EQ(listener.sources.size(), 1u);
}

TEST_F(ButtonPane, AHiddenButtonIsNotClicked) {
    button->Hide();
    EXPECT_EQ(ResultOfClick("click 30 20"), kNoClick);
}

TEST_F(ButtonPane, WorksBeforeTheGlogStands) {
    glogRec *const other = desktop.NewGlog(GlogOptions().Size(100, 100));
    ProbeButton *const early = ProbeButton::New(other);
    early->SetMode(1);
    early->Enable();
    EXPECT_EQ(early->Flash(0), 1);
}

TEST_F(ButtonPane, PressesGoThroughTheProcedureVariables) {
    ProceduresKept kept;
    static Changes calls;
    calls.clear();
    btnDepress = [](GlogButtonPane *pane) {
        calls.push_back("my depress");
        pane->Depress();
    };
    btnRelease = [](GlogButtonPane *pane) {
        calls.push_back("my release");
        pane->Release();
    };
    EXPECT_EQ(ResultOfClick(kSlideOffAndBack), 1);
    EXPECT_EQ(calls, (Changes{"my depress", "my release", "my depress", "my release"}));
}

TEST_F(ButtonPane, AReplacedDepressThatDoesNotPressIsAskedAgainWhileTheMouseIsInside) {
    ProceduresKept kept;
    static int calls;
    calls = 0;
    btnDepress = [](GlogButtonPane *) { ++calls; };
    EXPECT_EQ(ResultOfClick("press 30 20\nwait 0.3\nmove 31 20\nmove 32 20\nrelease"), -1);
    EXPECT_EQ(calls, 3);
    EXPECT_TRUE(listener.sources.empty());
}

TEST_F(ButtonPane, TheProcedureVariablesDoWhatTheOperationsDo) {
    btnDepress(button);
    EXPECT_TRUE(button->ButtonIsDown());
    btnRelease(button);
    EXPECT_FALSE(button->ButtonIsDown());
    EXPECT_EQ(button->changes, (Changes{"depress", "release"}));
    btnDisable(button);
    EXPECT_EQ(button->GetMode(), GlogButtonPane::kDisabled);
    EXPECT_TRUE(IsRedrawn());
    btnEnable(button);
    EXPECT_EQ(button->GetMode(), GlogButtonPane::kEnabled);
    EXPECT_TRUE(IsRedrawn());
    gcSetModeBP(button, 2);
    EXPECT_EQ(button->GetMode(), 2);
    EXPECT_TRUE(IsRedrawn());
}

TEST_F(ButtonPane, TheModeOfTheProcedureVariableIsNarrowed) {
    gcSetModeBP(button, 0x103);
    EXPECT_EQ(button->GetMode(), 3);
    gcSetModeBP(button, -1);
    EXPECT_EQ(button->GetMode(), 255);
}

TEST_F(ButtonPane, BtnFlashPressesAnEnabledButtonOnly) {
    btnFlash(button, 0);
    EXPECT_EQ(listener.sources.size(), 1u);
    button->changes.clear();
    for (unsigned char mode : {1, 2, 255}) {
        button->SetMode(mode);
        btnFlash(button, 0);
    }
    EXPECT_TRUE(button->changes.empty());
    EXPECT_EQ(listener.sources.size(), 1u);
}

TEST_F(ButtonPane, APressWithoutListenersIsAPressAsWell) {
    listener.CancelDependency(button);
    EXPECT_EQ(ResultOfClick("click 30 20"), 1);
    EXPECT_TRUE(listener.sources.empty());
}

TEST_F(ButtonPane, AListenerThatThrowsDoesNotStopTheOthers) {
    Listener second;
    second.DependUpon(button);
    for (bool hostError : {true, false}) {
        listener.onPress = [hostError] {
            if (hostError)
                throw TarnError();
            throw 1;
        };
        EXPECT_EQ(ResultOfClick("click 30 20"), 1);
    }
    EXPECT_EQ(second.sources.size(), 2u);
    EXPECT_FALSE(button->StillTracking());
}

TEST_F(ButtonPane, AListenerMayDeleteTheButton) {
    listener.onPress = [this] { delete button; };
    EXPECT_EQ(ResultOfClick("click 30 20"), 1);
    EXPECT_EQ(listener.sources.size(), 1u);
    EXPECT_EQ(ResultOfClick("click 30 20"), kNoClick);
}

TEST_F(ButtonPane, MayBeDeletedWhileThePressShowsAndWhileTheMouseIsFollowed) {
    class Deleting : public CIdleChore {
    public:
        Deleting(long long ticks, GlogButtonPane *button_)
            : CIdleChore(ticks, kInitialDelay)
            , button(button_) {
            Assign();
        }
        void DoIdle() override {
            Cancel();
            delete button;
        }
        GlogButtonPane *button;
    };
    for (int ticks : {3, 18}) {
        ProbeButton *const doomed = ProbeButton::New(glog); // on top of the other
        Deleting const deleting(ticks, doomed);
        listener.DependUpon(doomed);
        EXPECT_EQ(ResultOfClick("press 30 20\nwait 0.5\nmove 31 21\nrelease"), -1) << ticks;
        EXPECT_TRUE(listener.sources.empty());
    }
}

TEST_F(ButtonPane, AListenerMayRemoveItself) {
    Listener second;
    second.DependUpon(button);
    listener.onPress = [this] { listener.CancelDependency(button); };
    desktop.Play("click 30 20\nclick 30 20");
    EXPECT_EQ(listener.sources.size(), 1u);
    EXPECT_EQ(second.sources.size(), 2u);
}

TEST_F(ButtonPane, AListenerMayDisposeOfTheGlog) {
    listener.onPress = [this] { DisposeGlog(glog); };
    EXPECT_EQ(ResultOfClick("click 30 20"), 1);
}

TEST_F(ButtonPane, AListenerMayPressTheButtonAgain) {
    listener.onPress = [this] {
        if (listener.sources.size() == 1) {
            EXPECT_EQ(button->Flash(0), 1);
        }
    };
    EXPECT_EQ(ResultOfClick("click 30 20"), 1);
    EXPECT_EQ(listener.sources.size(), 2u);
}

namespace {

// Asks the button how it is while another pane is being drawn.
class Neighbour : public GlogPane {
public:
    Neighbour(glogRec *owner, ProbeButton &watched)
        : button(watched) {
        GlogPaneInit(owner, 0);
        Rect box = {100, 100, 110, 110};
        SetBox(&box);
    }
    bool sawTracking = false;

protected:
    void DrawGuts(OSRgn *) override { sawTracking |= button.StillTracking(); }

private:
    ProbeButton &button;
};

} // namespace

TEST_F(ButtonPane, TracksAllTheTimeOfThePressForWhoeverAsksMeanwhile) {
    Neighbour *const neighbour = new Neighbour(glog, *button);
    ProceduresKept kept;
    static Neighbour *invalidated;
    invalidated = neighbour;
    btnDepress = [](GlogButtonPane *pane) {
        pane->Depress();
        invalidated->Inval();
    };
    desktop.Play("click 30 20");
    EXPECT_TRUE(neighbour->sawTracking);
    EXPECT_FALSE(button->StillTracking());
}

TEST_F(ButtonPane, AnEnabledButtonInAMovedPlaceIsTrackedThere) {
    Rect moved = {110, 120, 130, 160};
    button->SetBox(&moved);
    EXPECT_EQ(ResultOfClick("click 30 20"), kNoClick);
    EXPECT_EQ(ResultOfClick("press 130 120\nwait 0.3\nmove 159 129\nrelease"), 1);
}

namespace {

// Answers for its box what it likes, and is nowhere once it is pressed.
class ElusiveButton : public ProbeButton {
public:
    explicit ElusiveButton(glogRec *owner) { InitGlogButtonPane(owner, kEnabled); }
    void GetBox(Rect *out) override { *out = box; }
    void Depress() override {
        ProbeButton::Depress();
        box = {0, 0, 0, 0};
    }

private:
    Rect box = {100, 100, 120, 120};
};

} // namespace

TEST_F(ButtonPane, TakesItsPlaceFromGetBoxOnceBeforeThePress) {
    ElusiveButton *const elusive = new ElusiveButton(glog);
    EXPECT_EQ(ResultOfClick("press 110 110\nwait 0.3\nmove 119 119\nmove 100 100\nrelease"), 1);
    EXPECT_EQ(elusive->changes, (Changes{"depress", "release"}));
}

TEST_F(ButtonPane, FollowsTheMouseInItsOwnCoordinatesWhateverPortItIsLeftWith) {
    CompoundPane *const box = new CompoundPane;
    box->CompoundPaneInit(glog, 1);
    Rect place = {50, 60, 150, 260};
    box->SetBox(&place);
    box->Add(button, 0);
    ProceduresKept kept;
    static glogRec *owner;
    owner = glog;
    btnDepress = [](GlogButtonPane *pane) {
        pane->Depress();
        SetPortToGlog(owner);
    };
    EXPECT_EQ(ResultOfClick("press 90 70\nwait 0.3\nmove 91 71\nrelease"), 1);
    EXPECT_EQ(button->changes, (Changes{"depress", "release"}));
    btnRelease = [](GlogButtonPane *pane) {
        pane->Release();
        SetPortToGlog(owner);
    };
    EXPECT_EQ(ResultOfClick("press 90 70\nwait 0.3\nmove 5 5\nwait 0.3\nmove 91 71\nrelease"), 1);
}

namespace {

// One key is held down until a moment.
class HeldKey : public SimulatedWindowSystem {
public:
    HeldKey(int code, double until)
        : SimulatedWindowSystem(1.0)
        , key(code)
        , release(until) {}
    bool IsKeyPressed(int asked) const override { return asked == key && Now() < release; }

private:
    int key;
    double release;
};

class HeldKeyDesktop : public Desktop {
public:
    HeldKeyDesktop(int key, double until)
        : Desktop(DesktopOptions(), std::make_unique<HeldKey>(key, until)) {}
    void Script(std::string const &steps) {
        static_cast<SimulatedWindowSystem &>(Windows()).Append(EventScript::Parse(steps, "held key"));
    }
};

int const kF1Key = 0xF001;

} // namespace

TEST(ButtonPaneWithKeys, FlashWithAKeyThatIsDownLastsUntilTheKeyIsUp) {
    for (int key : {static_cast<int>('x'), kF1Key}) {
        HeldKeyDesktop desktop(key, 1.5);
        ProbeButton *const button = ProbeButton::New(desktop.NewGlog(GlogOptions().Size(100, 100)));
        Listener listener;
        listener.DependUpon(button);
        desktop.Script("wait 1\nmove 5 5\nwait 0.5\nmove 6 6\nwait 9");
        EXPECT_EQ(button->Flash(static_cast<short>(key)), 1) << key;
        EXPECT_DOUBLE_EQ(TarnSystemTime::GetCurrentEventTime(), 1.5) << key;
        EXPECT_EQ(listener.sources.size(), 1u) << key;
    }
}

TEST(ButtonPaneWithKeys, BtnFlashWithAKeyThatIsDownLastsUntilTheKeyIsUp) {
    HeldKeyDesktop desktop('x', 1.5);
    ProbeButton *const button = ProbeButton::New(desktop.NewGlog(GlogOptions().Size(100, 100)));
    desktop.Script("wait 1\nmove 5 5\nwait 0.5\nmove 6 6\nwait 9");
    btnFlash(button, 'x');
    EXPECT_DOUBLE_EQ(TarnSystemTime::GetCurrentEventTime(), 1.5);
    EXPECT_EQ(button->changes, (Changes{"depress", "release"}));
}

namespace {

// A pane that has a button pressed by a key while the mouse is held down on the pane.
class KeyPresser : public GlogPane {
public:
    KeyPresser(glogRec *owner, ProbeButton &pressed)
        : button(pressed) {
        GlogPaneInit(owner, 0);
        Rect box = {50, 50, 70, 70};
        SetBox(&box);
    }
    std::vector<bool> results;

protected:
    int HandleClick(EventRecordAdapter *) override {
        results.push_back(button.Track('x'));
        return -1;
    }
    void DrawGuts(OSRgn *) override {}

private:
    ProbeButton &button;
};

} // namespace

TEST(ButtonPaneWithKeys, TheMouseDoesNotCountWhileAKeyPresses) {
    HeldKeyDesktop desktop('x', 0.5);
    glogRec *const glog = desktop.NewGlog(GlogOptions().Size(100, 100));
    ProbeButton *const button = ProbeButton::New(glog);
    KeyPresser *const presser = new KeyPresser(glog, *button);
    desktop.FinishGlog(glog);
    ShowGlog(glog, kShowGlog);
    desktop.Script("press 60 60\nwait 0.3\nmove 90 90\nwait 0.3\nmove 95 95\nwait 0.1\nrelease");
    desktop.Run();
    EXPECT_EQ(presser->results, std::vector<bool>{true});
    EXPECT_EQ(button->changes, (Changes{"depress", "release"}));
}
