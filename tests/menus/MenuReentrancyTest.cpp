// Listeners and others that change or delete the pane, its menu or its window while the menu is at work.
#include "buttons/OvalButtonPane.h"
#include "desktop/windows/EventLoop.h"
#include "host/PaneWatch.h"
#include "tests/menus/MenuTest.h"

namespace {

class MenuReentrancy : public MenuTest {
protected:
    MenuReentrancy() {
        Rect box{10, 20, 30, 140};
        pane = PopMPane::NewPopMPane(glog, 7, 0, &box, 137);
        Add(*pane, {"one", "two", "three"});
        submenu = pane->AppendNewEmptyHierarchicalMenu(Text("more"));
        submenu.AppendItem(Text("x"));
    }

    PopMPane *pane;
    OSMenuHandle submenu;
};

// With a button, which shows a press for a while: what comes meanwhile has to wait.
class MenuInAHurry : public MenuReentrancy {
protected:
    MenuInAHurry() {
        gobResRec record = {gobResRec::kKind, 20, 200, 80, 1, 0};
        OvalButtonPane::NewOvalButtonPane(glog, &record);
        Show();
    }

    // What the clicks of the script came to, in their order.
    Lines Results(std::string const &script) { return ReportsOf(script, "pane"); }

    std::string const button =
        "\"pane\":\"OvalButtonPane\",\"id\":0,\"message\":\"HandleClick\",\"result\":1}";
    std::string const menu = "\"pane\":\"PopMPane\",\"id\":7,\"message\":\"HandleClick\",\"result\":";
};

// Does something when it hears of a change, of a choice, of activity.
class ActingEar : public PopUpMenuListener, public AutoSetActivityListener {
public:
    explicit ActingEar(PopMPane *pane) {
        Dependent<PopUpMenuListener>::DependUpon(pane);
        Dependent<AutoSetActivityListener>::DependUpon(pane);
    }
    void ListenToMenuChange(PopUpMenu *, short) override {
        if (onChange)
            onChange();
    }
    void ListenToItemSelected(PopUpMenu *, OSMenuHandle &menu, UString const &name, short item) override {
        chosenItem = item;
        if (onChoice)
            onChoice();
        nameAfterwards = name.length();
        validAfterwards = menu.IsValid();
    }
    void ListenToActivity(Provider<AutoSetActivityListener> *) override {
        if (onActivity)
            onActivity();
    }
    std::function<void()> onChange, onChoice, onActivity;
    short chosenItem = 0;
    std::size_t nameAfterwards = 0;
    bool validAfterwards = false;
};

} // namespace

TEST_F(MenuReentrancy, AListenerDeletesThePaneAtAChange) {
    Show();
    PaneWatch const watch(pane);
    ActingEar ear(pane);
    ear.onChange = [&] { delete pane; };
    EXPECT_EQ(ResultOfClick("click 60 20\nmenu 2"), -1);
    EXPECT_FALSE(watch.PaneExists());
}

TEST_F(MenuReentrancy, AListenerDeletesThePaneAtAChoice) {
    Show();
    PaneWatch const watch(pane);
    ActingEar ear(pane);
    ear.onChoice = [&] { delete pane; };
    EXPECT_EQ(ResultOfClick("click 60 20\nmenu 4/1"), 4);
    EXPECT_FALSE(watch.PaneExists());
    EXPECT_EQ(ear.nameAfterwards, 4u) << "the name was the pane's";
    EXPECT_TRUE(ear.validAfterwards) << "the submenu was the pane's";
}

TEST_F(MenuReentrancy, AListenerDeletesThePaneBeforeTheMenuOpens) {
    Show();
    PaneWatch const watch(pane);
    ActingEar ear(pane);
    ear.onActivity = [&] { delete pane; };
    EXPECT_EQ(ResultOfClick("click 60 20"), -1);
    EXPECT_FALSE(watch.PaneExists());
    EXPECT_EQ(MenuTracker::Open(), nullptr);
}

TEST_F(MenuReentrancy, ThePaneIsDeletedWhileItsMenuIsOpen) {
    Show();
    PaneWatch const watch(pane);
    short const id = submenu.GetMenuID();
    submenu.clear();
    Later const end(0.2, [&] { delete pane; });
    EXPECT_EQ(ResultOfClick("click 60 20\nwait 0.5\nmenu 2"), -1);
    EXPECT_FALSE(watch.PaneExists());
    OSMenuHandle found;
    EXPECT_FALSE(OSMenuHandle::FindInMenuList(id, found)) << "its submenus are installed still";
}

TEST_F(MenuReentrancy, TheWindowIsDisposedOfWhileItsMenuIsOpen) {
    Show();
    Later const end(0.2, [&] { DisposeGlog(glog); });
    desktop.Play("click 60 20\nwait 0.5");
    EXPECT_EQ(MenuTracker::Open(), nullptr);
}

TEST_F(MenuReentrancy, TheMenuIsRebuiltWhileItIsOpen) {
    Show();
    Later const rebuild(0.2, [&] {
        pane->DeleteAllItems();
        Add(*pane, {"new one", "new two"});
    });
    EXPECT_EQ(ResultOfClick("click 60 20\nwait 0.5\nmenu 2"), 2);
    EXPECT_EQ(NameIn(*pane, 2), "new two");
}

TEST_F(MenuReentrancy, AnItemThatIsGoneByThenIsNotChosen) {
    Show();
    Later const rebuild(0.2, [&] {
        pane->DeleteAllItems();
        Add(*pane, {"only"});
    });
    EXPECT_EQ(ResultOfClick("click 60 20\nwait 0.5\nmenu 3"), -1);
    EXPECT_EQ(pane->GetSelectedItem(), 1);
}

TEST_F(MenuReentrancy, AnotherMenuIsSetWhileOneIsOpen) {
    Show();
    OSMenuHandle other = OSMenuHandle::CreateNewHierarchicalMenu();
    other.AppendItem(Text("other"));
    Later const change(0.2, [&] { pane->SetMenu(other, true); });
    ResultOfClick("click 60 20\nwait 0.5\nmenu 2");
    EXPECT_EQ(NameIn(*pane, 1), "other");
    EXPECT_EQ(pane->CountItems(), 1);
}

TEST_F(MenuReentrancy, TheListenerOfAChangeRebuildsTheMenu) {
    Show();
    ActingEar ear(pane);
    bool rebuilt = false;
    ear.onChange = [&] {
        if (rebuilt)
            return;
        rebuilt = true;
        pane->DeleteAllItems();
        Add(*pane, {"a"});
    };
    ResultOfClick("click 60 20\nmenu 4/1");
    EXPECT_EQ(pane->CountItems(), 1);
    EXPECT_EQ(ear.chosenItem, 1);
    EXPECT_EQ(ear.nameAfterwards, 4u);
}

TEST_F(MenuReentrancy, TheListenerOfAChangeChoosesAnother) {
    Show();
    ActingEar ear(pane);
    ear.onChange = [&] { pane->SelectItem(1); };
    EXPECT_EQ(ResultOfClick("click 60 20\nmenu 3"), 1);
    EXPECT_EQ(pane->GetSelectedItem(), 1);
}

TEST_F(MenuReentrancy, AListenerOpensAnotherMenu) {
    Show();
    Rect box{40, 20, 60, 140};
    PopMPane *const other = PopMPane::NewPopMPane(glog, 8, 0, &box, 137);
    Add(*other, {"a", "b"});
    ActingEar ear(pane);
    ear.onChoice = [&] {
        ear.onChoice = nullptr;
        other->Prepare();
        other->DoMenu();
    };
    EXPECT_EQ(ResultOfClick("click 60 20\nmenu 2\nmenu 2"), 2);
    EXPECT_EQ(other->GetSelectedItem(), 2);
}

TEST_F(MenuReentrancy, TheSamePopUpCannotOpenTwice) {
    Show();
    int second = 0;
    Later const again(0.2, [&] { second = pane->DoMenu(); });
    EXPECT_EQ(ResultOfClick("click 60 20\nwait 0.5\nmenu 4/1"), 4)
        << "its submenus were removed with the second";
    EXPECT_EQ(second, -1);
}

TEST_F(MenuReentrancy, AListenerThatThrowsChangesNothing) {
    Show();
    ActingEar ear(pane);
    ear.onChange = [] { throw 1; };
    EXPECT_EQ(ResultOfClick("click 60 20\nmenu 2"), 2);
    EXPECT_EQ(pane->GetSelectedItem(), 2);
}

TEST_F(MenuReentrancy, AnAgentDeletesThePaneAndLeavesItTheClick) {
    class Deleting : public PopMPane::Agent {
        int HandleClick(PopMPane *clicked, EventRecordAdapter *, bool &handled) override {
            delete clicked;
            handled = false;
            return 5;
        }
    } agent;
    Show();
    PaneWatch const watch(pane);
    pane->SetAgent(&agent);
    EXPECT_EQ(ResultOfClick("click 60 20"), 5);
    EXPECT_FALSE(watch.PaneExists());
    EXPECT_EQ(MenuTracker::Open(), nullptr);
}

TEST_F(MenuReentrancy, AListenerDeletesThePaneOutsideOfAnyMenu) {
    Show();
    ActingEar ear(pane);
    for (auto const &action : {std::function<void()>([&] { pane->SelectItem(2); }),
                               std::function<void()>([&] { pane->DeleteItem(1); }),
                               std::function<void()>([&] { pane->DeleteAllItems(); })}) {
        Rect box{10, 20, 30, 140};
        PopMPane *const fresh = PopMPane::NewPopMPane(glog, 9, 0, &box, 137);
        Add(*fresh, {"a"});
        ActingEar own(fresh);
        PaneWatch const watch(fresh);
        pane = fresh;
        own.onChange = [&] { delete fresh; };
        action();
        EXPECT_FALSE(watch.PaneExists());
    }
}

TEST_F(MenuInAHurry, KeysThatHadToWaitAreTheMenus) {
    EXPECT_EQ(Results("click 220 30\nclick 60 20\nkey Down\nkey Return"), (Lines{button, menu + "2}"}));
}

TEST_F(MenuInAHurry, APressThatHadToWaitDismissesTheMenuAndItsReleaseEndsIt) {
    EXPECT_EQ(Results("click 220 30\nclick 60 20\npress 300 190\nwait 1\nrelease\nwait 1"),
              (Lines{button, menu + "-1}"}));
    EXPECT_FALSE(EventLoop::Instance().IsTracking());
}

TEST_F(MenuInAHurry, WhatTheMenuLeavesIsHeardAfterIt) {
    EXPECT_EQ(Results("click 220 30\nclick 60 20\nkey Escape\nclick 220 30"),
              (Lines{button, menu + "-1}", button}));
}
