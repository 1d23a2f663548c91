#include "host/CIdleChore.h"
#include "tests/tabs/TabTest.h"

namespace {

class CountingHooks : public VelaFoundationCallbackAPI {
public:
    CountingHooks()
        : before(gInstance) {
        gInstance = this;
    }
    ~CountingHooks() override { gInstance = before; }
    void TrackingStep() override {
        ++steps;
        if (then)
            then();
    }
    void ListTrackingStep() override {}
    bool IsCancelKey(EventRecordAdapter *, bool) override { return false; }
    bool IsDoubleClick() override { return false; }
    int steps = 0;
    std::function<void()> then;

private:
    VelaFoundationCallbackAPI *before;
};

// Runs a function once, so many seconds after it was made, also while a menu is open.
class Soon : public CIdleChore {
public:
    Soon(double seconds, std::function<void()> action_)
        : CIdleChore(static_cast<long long>(seconds * 60), kInitialDelay)
        , action(std::move(action_)) {
        Assign();
    }

protected:
    void DoIdle() override {
        Cancel();
        action();
    }

private:
    std::function<void()> action;
};

class Refusing : public OpenTabs {
public:
    using OpenTabs::OpenTabs;
    bool ShouldAllowTabSwitch(int from, int to) const override {
        asked += std::to_string(from) + " to " + std::to_string(to) + "; ";
        return false;
    }
    mutable std::string asked;
};

class TabPaneTrackingTest : public TabTest {
protected:
    // One visible tab and two hidden ones.
    OpenTabs *MakeOverflowing() {
        OpenTabs *const pane = Make({"one", "two", "three"});
        pane->FitIntoRect({20, 10, 37, 72});
        EXPECT_TRUE(pane->TabIsVisible(0));
        EXPECT_FALSE(pane->TabIsVisible(1));
        return pane;
    }
    std::string Edge(TabPane &pane, int item, int fromLeft) {
        return Place(pane.GetItemBox(item).left + fromLeft, 25);
    }
};

} // namespace

TEST_F(TabPaneTrackingTest, FindsTheTabAtAPoint) {
    OpenTabs *const pane = Make();
    Rect const tab = pane->GetItemBox(1);
    int item = -7;
    Rect box{0, 0, 0, 0};
    ASSERT_TRUE(pane->FindItem({20, static_cast<short>(tab.left + 2)}, item, box));
    EXPECT_EQ(item, 1);
    EXPECT_EQ(box, (Rect{20, static_cast<short>(tab.left + 2), 37, static_cast<short>(tab.right - 2)}));
    item = -7;
    for (Point p : {Point{20, static_cast<short>(tab.left + 1)}, Point{20, static_cast<short>(tab.right - 2)},
                    Point{37, static_cast<short>(tab.left + 9)}, Point{19, static_cast<short>(tab.left + 9)}})
        EXPECT_FALSE(pane->FindItem(p, item, box)) << p;
    EXPECT_EQ(item, -7) << "a miss writes nothing";
}

TEST_F(TabPaneTrackingTest, AnEmptyRowHasNoTabAnywhere) {
    int item = 0;
    Rect box;
    EXPECT_FALSE(Make({})->FindItem({25, 20}, item, box));
}

TEST_F(TabPaneTrackingTest, AClickSelectsAndGivesMinusOne) {
    TabPane *const pane = Make();
    Show();
    TabEar const ear(pane);
    EXPECT_EQ(ResultOfClick("click" + Middle(*pane, 2)), -1);
    EXPECT_EQ(pane->GetSelectedItem(), 2);
    EXPECT_EQ(ear.heard, "0 to 2; ");
}

TEST_F(TabPaneTrackingTest, AClickAtTheEndOfATabMisses) {
    TabPane *const pane = Make();
    Show();
    int const width = Width(pane->GetItemBox(1));
    for (int dead : {0, 1, width - 2, width - 1}) {
        EXPECT_EQ(ResultOfClick("click" + Edge(*pane, 1, dead)), 0) << dead;
        EXPECT_EQ(pane->GetSelectedItem(), 0) << dead;
    }
    EXPECT_EQ(ResultOfClick("click" + Edge(*pane, 1, 2)), -1);
    EXPECT_EQ(ResultOfClick("click 305 25"), 0) << "off the row, in the pane";
}

TEST_F(TabPaneTrackingTest, AClickOnTheSelectedTabTellsNobody) {
    TabPane *const pane = Make();
    Show();
    TabEar const ear(pane);
    EXPECT_EQ(ResultOfClick("click" + Middle(*pane, 0)), -1);
    EXPECT_EQ(ear.heard, "");
}

TEST_F(TabPaneTrackingTest, TheSelectionFollowsTheMouseAndIsToldAtTheRelease) {
    TabPane *const pane = Make();
    Show();
    TabEar const ear(pane);
    CountingHooks hooks;
    std::vector<int> selected;
    hooks.then = [&] {
        selected.push_back(pane->GetSelectedItem());
        EXPECT_EQ(ear.heard, "") << "the button is still down";
    };
    desktop.Play("press" + Middle(*pane, 1) + "\nmove" + Middle(*pane, 2) + "\nmove" + Middle(*pane, 1) +
                 "\nmove" + Middle(*pane, 2) + "\nrelease");
    EXPECT_EQ(selected, (std::vector<int>{1, 2, 1, 2}));
    EXPECT_EQ(ear.heard, "0 to 2; ");
}

TEST_F(TabPaneTrackingTest, EachStepIsDrawnAtOnce) {
    TabPane *const pane = Make();
    Show();
    CountingHooks hooks;
    std::vector<std::size_t> presented;
    hooks.then = [&] { presented.push_back(desktop.TakePresented(glog).size()); };
    desktop.Play("press" + Middle(*pane, 0) + "\nmove" + Middle(*pane, 1) + "\nrelease");
    EXPECT_EQ(presented, (std::vector<std::size_t>{0, 1}));
}

TEST_F(TabPaneTrackingTest, OutsideOfThePaneTheFirstSelectionIsBack) {
    TabPane *const pane = Make();
    Show();
    TabEar const ear(pane);
    CountingHooks hooks;
    std::vector<int> selected;
    hooks.then = [&] { selected.push_back(pane->GetSelectedItem()); };
    desktop.Play("press" + Middle(*pane, 1) + "\nmove 100 150\nmove" + Middle(*pane, 2) +
                 "\nmove 100 150\nrelease");
    EXPECT_EQ(selected, (std::vector<int>{1, 0, 2, 0}));
    EXPECT_EQ(ear.heard, "");
    EXPECT_EQ(pane->GetSelectedItem(), 0);
}

TEST_F(TabPaneTrackingTest, BetweenTabsAndOffTheRowTheSelectionStays) {
    TabPane *const pane = Make();
    Show();
    TabEar const ear(pane);
    desktop.Play("press" + Middle(*pane, 1) + "\nmove" + Edge(*pane, 2, 0) + "\nmove 305 25\nrelease");
    EXPECT_EQ(pane->GetSelectedItem(), 1);
    EXPECT_EQ(ear.heard, "0 to 1; ");
}

TEST_F(TabPaneTrackingTest, AReleaseOnTheFirstSelectionTellsNobody) {
    TabPane *const pane = Make();
    Show();
    TabEar const ear(pane);
    desktop.Play("press" + Middle(*pane, 1) + "\nmove" + Middle(*pane, 0) + "\nrelease");
    EXPECT_EQ(pane->GetSelectedItem(), 0);
    EXPECT_EQ(ear.heard, "");
}

TEST_F(TabPaneTrackingTest, ARefusedSwitchTellsNobodyAndLeavesTheSelectionThere) {
    Refusing *const pane = new Refusing(glog, Rect{20, 10, 37, 310}, Items({"a", "b", "c"}), 0);
    Show();
    TabEar const ear(pane);
    desktop.Play("click" + Middle(*pane, 2));
    EXPECT_EQ(pane->asked, "0 to 2; ");
    EXPECT_EQ(ear.heard, "");
    EXPECT_EQ(pane->GetSelectedItem(), 2) << "who refuses has to put it back";
}

TEST_F(TabPaneTrackingTest, MayBeDeletedByWhoIsAskedForTheSwitch) {
    class Vanishing : public OpenTabs {
    public:
        using OpenTabs::OpenTabs;
        bool ShouldAllowTabSwitch(int, int) const override {
            delete this;
            return true;
        }
    };
    TabPane *const pane = new Vanishing(glog, Rect{20, 10, 37, 310}, Items({"a", "b", "c"}), 0);
    Show();
    PaneWatch const watch(pane);
    desktop.Play("click" + Middle(*pane, 2));
    EXPECT_FALSE(watch.PaneExists());
}

TEST_F(TabPaneTrackingTest, MayBeDeletedWhileItIsTracked) {
    TabPane *const pane = Make();
    Show();
    PaneWatch const watch(pane);
    CountingHooks hooks;
    hooks.then = [&] {
        if (hooks.steps == 2)
            delete pane;
    };
    desktop.Play("press" + Middle(*pane, 1) + "\nmove" + Middle(*pane, 2) + "\nmove" + Middle(*pane, 0) +
                 "\nrelease");
    EXPECT_FALSE(watch.PaneExists());
}

TEST_F(TabPaneTrackingTest, EachStepIsMadeInItsOwnPort) {
    TabPane *const pane = Make();
    Show();
    CountingHooks hooks;
    std::vector<bool> inItsPort;
    hooks.then = [&] {
        inItsPort.push_back(IsInItsPort());
        LeaveForAnotherPort();
    };
    desktop.Play("press" + Middle(*pane, 1) + "\nmove" + Middle(*pane, 2) + "\nmove" + Middle(*pane, 0) +
                 "\nrelease");
    EXPECT_EQ(inItsPort, (std::vector<bool>{true, true, true}));
}

TEST_F(TabPaneTrackingTest, MayLoseItsItemsWhileItIsTracked) {
    TabPane *const pane = Make();
    Show();
    CountingHooks hooks;
    hooks.then = [&] {
        if (hooks.steps == 1)
            pane->DeleteAllItems();
    };
    desktop.Play("press" + Middle(*pane, 1) + "\nmove" + Middle(*pane, 2) + "\nrelease");
    EXPECT_EQ(pane->CountItems(), 0);
    EXPECT_EQ(hooks.steps, 2);
}

// Hidden items

TEST_F(TabPaneTrackingTest, TheTabOfHiddenItemsOpensAMenuOfThem) {
    OpenTabs *const pane = MakeOverflowing();
    Show();
    TabEar const ear(pane);
    EXPECT_EQ(ResultOfClick("click" + Middle(*pane, 1) + "\nmenu 2"), -1);
    EXPECT_EQ(pane->GetSelectedItem(), 2);
    EXPECT_EQ(ear.heard, "0 to 2; ");
    EXPECT_EQ(ResultOfClick("click" + Middle(*pane, 1) + "\nmenu 1"), -1);
    EXPECT_EQ(ear.heard, "0 to 2; 2 to 1; ");
}

TEST_F(TabPaneTrackingTest, TheMenuHasTheFullNamesOfWhatIsHidden) {
    OpenTabs *const pane = MakeOverflowing();
    pane->SetItemShortName(1, Text("2"));
    Show();
    EXPECT_THROW(desktop.Play("click" + Middle(*pane, 1) + "\nmenu 3"), ScriptError) << "there are two";
    desktop.Play("click" + Middle(*pane, 1) + "\nkey t\nkey h\nkey Return");
    EXPECT_EQ(pane->GetSelectedItem(), 2);
}

TEST_F(TabPaneTrackingTest, TheMenuComesUpInItsOwnPort) {
    TabPane *const pane = MakeOverflowing();
    Show();
    EventRecordAdapter event;
    Rect const tab = pane->GetItemBox(1);
    event.where = {static_cast<short>(tab.top + 5), static_cast<short>(tab.left + 5)};
    desktop.Script("menu 2");
    LeaveForAnotherPort();
    EXPECT_EQ((pane->*&Opened<TabPane>::HandleClick)(&event), -1);
    EXPECT_EQ(pane->GetSelectedItem(), 2);
    EXPECT_TRUE(IsInItsPort());
}

TEST_F(TabPaneTrackingTest, TheMenuComesUpWithItsFirstItemHighlighted) {
    OpenTabs *const pane = MakeOverflowing();
    Show();
    desktop.Play("click" + Middle(*pane, 1) + "\nkey Return");
    EXPECT_EQ(pane->GetSelectedItem(), 1);
}

TEST_F(TabPaneTrackingTest, ADismissedMenuChangesNothing) {
    OpenTabs *const pane = MakeOverflowing();
    Show();
    TabEar const ear(pane);
    EXPECT_EQ(ResultOfClick("click" + Middle(*pane, 1) + "\nmenu 0"), -1);
    EXPECT_EQ(pane->GetSelectedItem(), 0);
    EXPECT_EQ(ear.heard, "");
}

TEST_F(TabPaneTrackingTest, ChoosingTheSelectedTabAgainTellsNobody) {
    OpenTabs *const pane = MakeOverflowing();
    pane->SetSelectedItem(2);
    Show();
    TabEar const ear(pane);
    desktop.Play("click" + Middle(*pane, 1) + "\nmenu 2");
    EXPECT_EQ(ear.heard, "");
}

TEST_F(TabPaneTrackingTest, AChoiceFromTheMenuIsNotAskedFor) {
    Refusing *const pane = new Refusing(glog, Rect{20, 10, 37, 310}, Items({"one", "two", "three"}), 0);
    pane->FitIntoRect({20, 10, 37, 72});
    Show();
    TabEar const ear(pane);
    desktop.Play("click" + Middle(*pane, 2) + "\nmenu 1");
    EXPECT_EQ(pane->asked, "");
    EXPECT_EQ(ear.heard, "0 to 1; ");
}

TEST_F(TabPaneTrackingTest, AVisibleTabBesideHiddenOnesIsAnOrdinaryOne) {
    OpenTabs *const pane = MakeOverflowing();
    pane->SetSelectedItem(2);
    Show();
    TabEar const ear(pane);
    EXPECT_EQ(ResultOfClick("click" + Middle(*pane, 0)), -1);
    EXPECT_EQ(ear.heard, "2 to 0; ");
}

TEST_F(TabPaneTrackingTest, DraggingOverTheTabOfHiddenItemsSelectsTheFirstOfThem) {
    OpenTabs *const pane = MakeOverflowing();
    Show();
    desktop.Play("press" + Middle(*pane, 0) + "\nmove" + Middle(*pane, 2) + "\nrelease");
    EXPECT_EQ(pane->GetSelectedItem(), 1);
}

TEST_F(TabPaneTrackingTest, AnOnlyItemThatIsHiddenClicksAsATab) {
    TabPane *const pane = Make({"Instrument"});
    pane->FitIntoRect({20, 10, 37, 40});
    pane->SetSelectedItem_NoBroadcast(-1);
    Show();
    TabEar const ear(pane);
    EXPECT_EQ(ResultOfClick("click" + Middle(*pane, 0)), -1);
    EXPECT_EQ(ear.heard, "-1 to 0; ");
}

TEST_F(TabPaneTrackingTest, TheMenuOffersWhatThereIsWhenMoreCountAsHidden) {
    OpenTabs *const pane = Make({"one", "two", "three", "four"});
    pane->FitIntoRect({20, 10, 37, 40});
    pane->DeleteItem(0);
    pane->DeleteItem(0);
    Show();
    TabEar const ear(pane);
    EXPECT_EQ(ResultOfClick("click" + Middle(*pane, 1) + "\nmenu 2"), -1);
    EXPECT_EQ(ear.heard, "0 to 1; ");
}

TEST_F(TabPaneTrackingTest, MayBeDeletedWhileItsMenuIsOpen) {
    OpenTabs *const pane = MakeOverflowing();
    Show();
    PaneWatch const watch(pane);
    Soon const end(0.2, [&] { delete pane; });
    EXPECT_EQ(ResultOfClick("click" + Middle(*pane, 1) + "\nwait 0.5\nmenu 1"), -1);
    EXPECT_FALSE(watch.PaneExists());
}

TEST_F(TabPaneTrackingTest, AChoiceThatWasDeletedMeanwhileIsNotSelected) {
    OpenTabs *const pane = MakeOverflowing();
    Show();
    TabEar const ear(pane);
    Soon const end(0.2, [&] { pane->DeleteItem(2); });
    EXPECT_EQ(ResultOfClick("click" + Middle(*pane, 1) + "\nwait 0.5\nmenu 2"), -1);
    EXPECT_EQ(ear.heard, "");
}
