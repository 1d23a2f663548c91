// Listeners and hooks that change a group, its neighbours or themselves while the group is at work.
#include "host/CallbackAPI.h"
#include "host/glogRec.h"
#include "tests/buttons/ButtonGroupTest.h"

namespace {

typedef std::vector<int> Icons;

// Does something at the first step of tracking.
class FirstStep : public VelaFoundationCallbackAPI {
public:
    explicit FirstStep(std::function<void()> const &action_)
        : former(gInstance)
        , action(action_) {
        gInstance = this;
    }
    ~FirstStep() override { gInstance = former; }
    void TrackingStep() override {
        if (steps++ == 0)
            action();
    }
    void ListTrackingStep() override {}
    bool IsCancelKey(EventRecordAdapter *, bool) override { return false; }
    bool IsDoubleClick() override { return false; }
    int steps = 0;

private:
    VelaFoundationCallbackAPI *former;
    std::function<void()> action;
};

class GroupReentrancy : public ButtonGroupTest {
protected:
    RadioButtonPane *NeighbourAt(short v, short h) {
        RadioButtonPane *const neighbour = ThreeRadios();
        neighbour->Offset(Point{v, h});
        return neighbour;
    }
    static int CountOn(ButtonGroupPane &group, Icons const &icons, int onIcon) {
        EXPECT_EQ(static_cast<int>(icons.size()), group.CountButtons());
        return static_cast<int>(std::count(icons.begin(), icons.end(), onIcon));
    }
};

std::string const kHeldClick = "press 25 35\nwait 0.3\nrelease";

} // namespace

TEST_F(GroupReentrancy, ButtonsThatAListenerAddsWhileAllAreSetStayAsTheyAre) {
    CheckBoxPane *const group = ThreeBoxes();
    GroupListener listener;
    listener.HangOn(group);
    listener.onValue = [&] { group->AddButton(0, 0, Text("more")); };
    group->SetAllToSame(true);
    EXPECT_EQ(listener.heard, (Heard{"0 on", "0 changed", "1 on", "1 changed", "2 on", "2 changed"}));
    EXPECT_EQ(group->CountButtons(), 6);
    EXPECT_FALSE(group->ReadOne(3));
}

TEST_F(GroupReentrancy, AListenerMayAddButtonsInTheMiddleOfAClick) {
    CheckBoxPane *const group = ThreeBoxes(CheckBoxPane::kModifiersChangeOthers);
    group->SetAllToSame(true);
    GroupListener listener;
    listener.HangOn(group);
    listener.onChange = [&] {
        for (int i = 0; i < 100; ++i)
            group->AddButton(0, 100, Text("more"));
    };
    Show();
    EXPECT_EQ(ResultOfClick("click 25 15 option"), 1);
    EXPECT_EQ(listener.heard, (Heard{"1 off", "1 changed", "2 off", "2 changed"}));
    EXPECT_EQ(group->CountButtons(), 203);
}

TEST_F(GroupReentrancy, AListenerMayRenameLabels) {
    CheckBoxPane *const group = ThreeBoxes();
    GroupListener listener;
    listener.HangOn(group);
    listener.onValue = [&] { group->SetNthButtonName(1, Text("A new and longer name")); };
    Show();
    EXPECT_EQ(ResultOfClick("click 42 37"), 2);
    EXPECT_TRUE(NameOf(*group, 1) == Text("A new and longer name"));
}

TEST_F(GroupReentrancy, AListenerMayDeleteTheNeighbourAtEitherMessage) {
    for (bool atValue : {true, false}) {
        CheckBoxPane *const group = ThreeBoxes();
        RadioButtonPane *const neighbour = NeighbourAt(100, 100);
        GroupListener listener;
        listener.HangOn(group);
        (atValue ? listener.onValue : listener.onChange) = [&] { delete neighbour; };
        Show();
        EXPECT_EQ(ResultOfClick(kHeldClick), 2);
        EXPECT_EQ(CountGlogItems(glog), 1);
        Repainted();
        delete group;
    }
}

TEST_F(GroupReentrancy, AListenerMayDeleteTheNeighbourInTheSameLayout) {
    RadioButtonPane *const above = ThreeRadios();
    CompoundPane *const column = PutIntoLayout(above, 20);
    CheckBoxPane *const group = ThreeBoxes();
    column->Add(group, -1);
    GroupListener listener;
    listener.HangOn(group);
    listener.onValue = [&] { delete above; };
    Show();
    Rect const second = BoundsOf(*group, 1);
    EXPECT_EQ(
        ResultOfClick("click " + std::to_string(second.left + 5) + " " + std::to_string(second.top + 5)), 2);
    EXPECT_EQ(column->NumSubpanes(), 1);
    EXPECT_LT(BoundsOf(*group, 1).top, second.top) << "it moves up";
}

TEST_F(GroupReentrancy, AListenerMayLeaveAtEitherMessage) {
    CheckBoxPane *const group = ThreeBoxes();
    GroupListener value, change, other;
    value.HangOn(group);
    change.HangOn(group);
    other.HangOn(group);
    value.onValue = [&] { value.ButtonGroupPaneListener::CancelDependency(group); };
    change.onChange = [&] { change.ButtonGroupPane_Listener::CancelDependency(group); };
    Show();
    ResultOfClick("click 25 15\nclick 25 15");
    EXPECT_EQ(value.heard, (Heard{"0 on", "0 changed", "0 changed"}));
    EXPECT_EQ(change.heard, (Heard{"0 on", "0 changed", "0 off"}));
    EXPECT_EQ(other.heard, (Heard{"0 on", "0 changed", "0 off", "0 changed"}));
}

TEST_F(GroupReentrancy, AListenerMayDeleteAnotherListener) {
    CheckBoxPane *const group = ThreeBoxes();
    GroupListener first;
    std::unique_ptr<GroupListener> second(new GroupListener);
    first.HangOn(group);
    second->HangOn(group);
    first.onValue = [&] { second.reset(); };
    group->SetOne(0, true);
    EXPECT_EQ(first.heard, (Heard{"0 on", "0 changed"}));
}

TEST_F(GroupReentrancy, AListenerMayDeleteTheGroupAtEitherMessage) {
    for (bool atValue : {true, false}) {
        CheckBoxPane *const group = ThreeBoxes(CheckBoxPane::kModifiersChangeOthers);
        group->SetOne(1, true);
        GroupListener listener;
        listener.HangOn(group);
        (atValue ? listener.onValue : listener.onChange) = [&] { delete group; };
        Show();
        EXPECT_EQ(ResultOfClick("click 25 35 command"), 2);
        EXPECT_EQ(listener.heard, atValue ? Heard({"1 off"}) : Heard({"1 off", "1 changed"}));
        EXPECT_EQ(CountGlogItems(glog), 0);
    }
}

TEST_F(GroupReentrancy, AListenerMayDeleteTheGroupWhileAllAreSet) {
    for (bool enabling : {true, false}) {
        CheckBoxPane *const group = ThreeBoxes();
        GroupListener listener;
        listener.HangOn(group);
        listener.onChange = [&] {
            if (listener.heard.back() == "1 changed")
                delete group;
        };
        if (enabling)
            group->SetAllEnable(false);
        else
            group->SetAllToSame(true);
        EXPECT_EQ(listener.heard.back(), "1 changed");
        EXPECT_EQ(CountGlogItems(glog), 0);
    }
}

TEST_F(GroupReentrancy, AListenerMayDeleteAGroupThatIsToggledThroughItsProcedure) {
    CheckBoxPane *const group = ThreeBoxes();
    GroupListener listener;
    listener.HangOn(group);
    listener.onValue = [&] { delete group; };
    EXPECT_FALSE(btnToggleOne(group, 1));
}

TEST_F(GroupReentrancy, AListenerMayDeleteRadioButtonsWhenTheOldOneGoesOff) {
    RadioButtonPane *const group = ThreeRadios();
    GroupListener listener;
    listener.HangOn(group);
    listener.onValue = [&] { delete group; };
    Show();
    EXPECT_EQ(ResultOfClick("click 25 55"), 3);
    EXPECT_EQ(listener.heard, (Heard{"0 off"}));
}

TEST_F(GroupReentrancy, TheGroupMayBeDeletedWhileAButtonIsTracked) {
    for (char const *modifier : {"", " option"}) {
        CheckBoxPane *const group = ThreeBoxes(CheckBoxPane::kModifiersChangeOthers);
        FirstStep step([&] { delete group; });
        Show();
        EXPECT_EQ(ResultOfClick("press 25 35" + std::string(modifier) + "\nwait 0.3\nrelease"), -1);
        EXPECT_EQ(CountGlogItems(glog), 0);
    }
}

TEST_F(GroupReentrancy, AListenerMayCloseTheWindow) {
    CheckBoxPane *const group = ThreeBoxes(CheckBoxPane::kModifiersChangeOthers);
    GroupListener listener;
    listener.HangOn(group);
    listener.onValue = [&] { DisposeGlog(glog); };
    Show();
    desktop.Play("click 25 15 command");
    EXPECT_EQ(listener.heard, (Heard{"1 on", "1 changed", "2 on", "2 changed"}))
        << "the group lives until the click is over";
}

TEST_F(GroupReentrancy, AListenerMayHideTheGroup) {
    CheckBoxPane *const group = ThreeBoxes();
    GroupListener listener;
    listener.HangOn(group);
    listener.onValue = [&] { group->Hide(); };
    Show();
    EXPECT_EQ(ResultOfClick("click 25 15"), 1);
    EXPECT_EQ(listener.heard, (Heard{"0 on", "0 changed"}));
    EXPECT_FALSE(group->GetVisibility());
}

TEST_F(GroupReentrancy, AListenerMaySetOtherBoxesWhileAllAreSet) {
    CheckBoxPane *const group = ThreeBoxes();
    GroupListener listener;
    listener.HangOn(group);
    listener.onValue = [&] { group->SetOne(2, true); };
    group->SetAllToSame(true);
    EXPECT_EQ(listener.heard, (Heard{"0 on", "2 on", "2 changed", "0 changed", "1 on", "1 changed"}));
}

// Exactly one radio button is on

TEST_F(GroupReentrancy, WhenAListenerTakesTheOldRadioButtonBackItAloneIsOn) {
    RadioButtonPane *const group = ThreeRadios();
    GroupListener listener;
    listener.HangOn(group);
    listener.onValue = [&] {
        listener.onValue = nullptr;
        group->RadioSet(0);
    };
    group->RadioSet(2);
    EXPECT_EQ(group->RadioGet(), 0);
    EXPECT_EQ(IconsOf(*group), (Icons{0, 2, 2}));
    EXPECT_EQ(listener.heard, (Heard{"0 off", "0 on", "0 changed", "0 changed"}));
}

TEST_F(GroupReentrancy, WhenAListenerChoosesAnotherRadioButtonItAloneIsOn) {
    for (bool atValue : {true, false}) {
        RadioButtonPane *const group = ThreeRadios();
        GroupListener listener;
        listener.HangOn(group);
        std::function<void()> &moment = atValue ? listener.onValue : listener.onChange;
        moment = [&] {
            moment = nullptr;
            group->RadioSet(1);
        };
        group->RadioSet(2);
        EXPECT_EQ(group->RadioGet(), 1);
        EXPECT_EQ(CountOn(*group, IconsOf(*group), 0), 1);
        EXPECT_EQ(IconsOf(*group), (Icons{2, 0, 2}));
    }
}

TEST_F(GroupReentrancy, WhenAListenerChoosesAnotherRadioButtonAfterTheNewOneItAloneIsOn) {
    RadioButtonPane *const group = ThreeRadios();
    GroupListener listener;
    listener.HangOn(group);
    listener.onValue = [&] {
        if (listener.heard.back() == "2 on")
            group->RadioSet(1);
    };
    group->RadioSet(2);
    EXPECT_EQ(group->RadioGet(), 1);
    EXPECT_EQ(IconsOf(*group), (Icons{2, 0, 2}));
}

// The application acts while the mouse is held down

TEST_F(GroupReentrancy, ButtonsMayBeAddedWhileOneIsTracked) {
    CheckBoxPane *const group = ThreeBoxes();
    FirstStep step([&] {
        for (int i = 0; i < 100; ++i)
            group->AddButton(0, 100, Text("more"));
    });
    Show();
    EXPECT_EQ(ResultOfClick(kHeldClick), 2);
    EXPECT_GT(step.steps, 0);
    EXPECT_TRUE(group->ReadOne(1));
    EXPECT_EQ(group->CountButtons(), 103);
}

TEST_F(GroupReentrancy, TheNeighbourMayBeDeletedWhileAButtonIsTracked) {
    CheckBoxPane *const group = ThreeBoxes();
    RadioButtonPane *const neighbour = NeighbourAt(100, 100);
    FirstStep step([&] { delete neighbour; });
    Show();
    EXPECT_EQ(ResultOfClick(kHeldClick), 2);
    EXPECT_TRUE(group->ReadOne(1));
    EXPECT_EQ(CountGlogItems(glog), 1);
}

TEST_F(GroupReentrancy, AButtonMayChangeWhileItIsTracked) {
    CheckBoxPane *const group = ThreeBoxes();
    FirstStep step([&] { group->SetOne(1, true); });
    Show();
    EXPECT_EQ(ResultOfClick(kHeldClick), 2);
    EXPECT_FALSE(group->ReadOne(1)) << "a plain click inverts the value of the release";
}

TEST_F(GroupReentrancy, TheGroupMayBeHiddenWhileAButtonIsTracked) {
    CheckBoxPane *const group = ThreeBoxes();
    FirstStep step([&] { group->Hide(); });
    Show();
    EXPECT_EQ(ResultOfClick(kHeldClick), 2);
    EXPECT_TRUE(group->ReadOne(1));
}

TEST_F(GroupReentrancy, TheWindowMayBeClosedWhileAButtonIsTracked) {
    ThreeBoxes();
    FirstStep step([&] { DisposeGlog(glog); });
    Show();
    desktop.Play(kHeldClick);
    EXPECT_EQ(step.steps, 1) << "a window that closes releases the button";
}
