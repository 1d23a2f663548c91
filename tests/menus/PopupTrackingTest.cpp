// How an open menu takes mouse, keys and time.
#include "desktop/menus/MenuRows.h"
#include "desktop/panes/Glog.h"
#include "desktop/windows/SimulatedWindowSystem.h"
#include "host/Services.h"
#include "tests/menus/MenuTest.h"
#include <boost/make_shared.hpp>

namespace {

// Items are 20 high; the menu opens with its current item's middle over the middle of this.
Rect const kPlace{90, 40, 110, 160};
int const kLeft = 70; // in every item's text

class PopupTracking : public MenuTest {
protected:
    PopupTracking()
        : menu(OSMenuHandle::CreateNewHierarchicalMenu()) {}
    ~PopupTracking() override {
        for (OSMenuHandle &submenu : submenus)
            submenu.RemoveFromMenuList();
    }

    void Fill(OSMenuHandle to, std::initializer_list<char const *> texts) {
        for (char const *text : texts) {
            if (*text == '-')
                to.AppendMenuSeparator();
            else
                to.AppendItem(Text(text));
        }
    }
    // A submenu of the item, installed.
    OSMenuHandle Below(OSMenuHandle parent, short item, std::initializer_list<char const *> texts) {
        OSMenuHandle submenu = OSMenuHandle::CreateNewHierarchicalMenu();
        Fill(submenu, texts);
        parent.SetMenuItemHierarchicalID(item, submenu.GetMenuID());
        submenu.InsertMenuBeforeMenuID(-1);
        submenus.push_back(submenu);
        return submenu;
    }

    // Runs the menu with the script; the item that was chosen, 0 for none.
    int Choose(std::string const &script, short current = 1) {
        if (!desktop.Picture(glog))
            ShowWindow();
        desktop.Script(script);
        SetPortToGlog(glog);
        Rect place = kPlace;
        int const result = RunPopupMenu(menu, current, &place);
        chosenMenu = static_cast<short>(static_cast<unsigned>(result) >> 16);
        return result & 0xFFFF;
    }
    // Where the script has to be, in window coordinates, to be on the item of the menu that opens over kPlace
    // with that current item.
    static std::string At(int item, int current = 1) {
        return std::to_string(kLeft) + " " + std::to_string(100 + (item - current) * 20) + "\n";
    }

    // While a menu is open.
    static std::vector<std::unique_ptr<MenuPanel>> const &Panels() { return MenuTracker::Open()->Panels(); }
    SimulatedWindowSystem &System() { return static_cast<SimulatedWindowSystem &>(desktop.Windows()); }
    std::size_t Popups() {
        std::size_t count = 0;
        for (SimulatedWindow *window : System().Windows())
            count += window->IsPopup() ? 1 : 0;
        return count;
    }
    // Notes something each time while the menu is open.
    std::unique_ptr<Later> After(double seconds, std::function<void()> look) {
        return std::unique_ptr<Later>(new Later(seconds, std::move(look)));
    }

    OSMenuHandle menu;
    std::vector<OSMenuHandle> submenus;
    short chosenMenu = 0;
};

} // namespace

// Opening

TEST_F(PopupTracking, OpensAWindowOfItsOwnWithTheCurrentItemOverThePlace) {
    Fill(menu, {"a", "b", "c"});
    std::size_t popups = 0;
    ScreenRect box;
    auto const look = After(0.1, [&] {
        popups = Popups();
        box = Panels()[0]->Box();
    });
    Choose("wait 1\nmenu 0", 3);
    EXPECT_EQ(popups, 1u);
    Point const content = Glog::From(glog).Window()->ScreenPlace();
    int const middleOfThird =
        box.top + MenuRows::kPad + 2 * MenuRows::kItemHeight + MenuRows::kItemHeight / 2;
    EXPECT_EQ(middleOfThird - content.v, 100);
    EXPECT_LT(box.left - content.h, kPlace.left);
    EXPECT_GE(box.right - content.h, kPlace.right);
    EXPECT_EQ(Popups(), 0u) << "the window has stayed";
}

TEST_F(PopupTracking, WithoutACurrentItemTheFirstLiesOverThePlace) {
    Fill(menu, {"a", "b", "c"});
    for (short current : {0, -7, 4, 32767}) {
        ScreenRect box;
        auto const look = After(0.1, [&] { box = Panels()[0]->Box(); });
        Choose("wait 1\nmenu 0", current);
        EXPECT_EQ(box.top - Glog::From(glog).Window()->ScreenPlace().v, 100 - 10 - MenuRows::kPad) << current;
    }
}

TEST_F(PopupTracking, HighlightsTheCurrentItem) {
    Fill(menu, {"a", "b", "c"});
    int highlighted = 0;
    auto const look = After(0.1, [&] { highlighted = Panels()[0]->Highlighted(); });
    Choose("wait 1\nmenu 0", 2);
    EXPECT_EQ(highlighted, 2);
}

TEST_F(PopupTracking, WithoutAWindowNothingOpens) {
    Fill(menu, {"a"});
    Rect place = kPlace;
    SetPortToGlog(glog);
    EXPECT_EQ(RunPopupMenu(menu, 1, &place), 0);
    OSMenuHandle none;
    EXPECT_EQ(RunPopupMenu(none, 1, &place), 0);
    ShowWindow();
    EXPECT_EQ(RunPopupMenu(menu, 1, nullptr), 0);
}

TEST_F(PopupTracking, WhileOneIsOpenNoOtherOpens) {
    Fill(menu, {"a"});
    int second = -1;
    auto const look = After(0.1, [&] {
        Rect place = kPlace;
        second = RunPopupMenu(menu, 1, &place);
    });
    EXPECT_EQ(Choose("wait 1\nmenu 1"), 1);
    EXPECT_EQ(second, 0);
}

TEST_F(PopupTracking, AnEmptyMenuOpensAndIsDismissed) { EXPECT_EQ(Choose("wait 1\nkey Escape"), 0); }

TEST_F(PopupTracking, LeavesThePortAsItWas) {
    Fill(menu, {"a", "b"});
    ShowWindow();
    OSPort *const before = OSPort::GetCurrent();
    GraphicsState const state = Glog::From(glog).Port().State();
    Choose("move " + At(2) + "wait 1\nkey Return");
    EXPECT_EQ(OSPort::GetCurrent(), before);
    EXPECT_EQ(Glog::From(glog).Port().State().textSize, state.textSize);
}

TEST_F(PopupTracking, AScriptThatEndsLeavesNoOpenMenuWaiting) {
    Fill(menu, {"a"});
    EXPECT_THROW(Choose("wait 1"), ScriptError);
    EXPECT_EQ(MenuTracker::Open(), nullptr);
    EXPECT_EQ(Popups(), 0u);
}

TEST_F(PopupTracking, ChoresThatComeAgainAndAgainDoNotKeepItWaiting) {
    class Ticking : public CIdleChore {
    public:
        Ticking()
            : CIdleChore(1, kNoInitialDelay) {
            Assign();
        }
        void DoIdle() override {}
    } const ticking;
    Fill(menu, {"a"});
    EXPECT_THROW(Choose("wait 1"), ScriptError);
}

// Script answers

TEST_F(PopupTracking, ScriptsChooseByNumber) {
    Fill(menu, {"a", "b", "c"});
    OSMenuHandle const submenu = Below(menu, 3, {"x", "y"});
    EXPECT_EQ(Choose("menu 2"), 2);
    EXPECT_EQ(chosenMenu, menu.GetMenuID());
    EXPECT_EQ(Choose("menu 3/2"), 2);
    EXPECT_EQ(chosenMenu, submenu.GetMenuID());
    EXPECT_EQ(Choose("menu 0"), 0);
}

TEST_F(PopupTracking, ScriptsCannotChooseWhatAPersonCouldNot) {
    Fill(menu, {"a", "-", "c", "d"});
    menu.DisableItem(3);
    Below(menu, 4, {"x"});
    for (char const *wrong : {"menu 5", "menu 2", "menu 3", "menu 4", "menu 1/1", "menu 4/2", "menu 3/1"})
        EXPECT_THROW(Choose(wrong), ScriptError) << wrong;
}

// Clicks

TEST_F(PopupTracking, APressThatIsHeldChoosesWhereItEnds) {
    Fill(menu, {"a", "b", "c"});
    EXPECT_EQ(Choose("press " + At(1) + "wait 0.1\nmove " + At(3) + "release"), 3);
}

TEST_F(PopupTracking, AQuickClickLeavesItOpenForAnother) {
    Fill(menu, {"a", "b", "c"});
    ShowWindow();
    int open = 0;
    auto const look = After(0.5, [&] { open = MenuTracker::Open() ? 1 : 0; });
    desktop.Script("move 70 100\n");
    desktop.Run();
    EXPECT_EQ(Choose("release\nwait 1\nclick " + At(2)), 2);
    EXPECT_EQ(open, 1);
}

TEST_F(PopupTracking, ALongPressOnTheCurrentItemChoosesIt) {
    Fill(menu, {"a", "b"});
    ShowWindow();
    desktop.Script("move 70 100\n");
    desktop.Run();
    EXPECT_EQ(Choose("wait 0.6\nrelease", 2), 2);
}

TEST_F(PopupTracking, APressBesideItDismisses) {
    Fill(menu, {"a", "b"});
    EXPECT_EQ(Choose("release\nwait 0.5\npress 300 10\n"), 0);
    EXPECT_EQ(Choose("release\nwait 0.5\nrightclick 300 10\n"), 0);
}

TEST_F(PopupTracking, AReleaseBesideItDismisses) {
    Fill(menu, {"a", "b"});
    EXPECT_EQ(Choose("move " + At(2) + "wait 0.1\nmove 300 10\nrelease"), 0);
}

TEST_F(PopupTracking, WhatCannotBeChosenKeepsItOpen) {
    Fill(menu, {"a", "-", "c"});
    menu.DisableItem(3);
    EXPECT_EQ(Choose("move 70 115\nrelease\nwait 0.1\nclick 70 130\nwait 0.1\nclick " + At(1)), 1);
}

TEST_F(PopupTracking, OfADisabledMenuNothingIsChosen) {
    Fill(menu, {"a", "b"});
    menu.SetEnabled(false);
    EXPECT_EQ(Choose("move " + At(2) + "release\nkey Down\nkey Return"), 0);
}

TEST_F(PopupTracking, TheItemUnderTheMouseIsHighlighted) {
    Fill(menu, {"a", "b", "-", "d"});
    menu.DisableItem(4);
    std::vector<int> seen;
    std::vector<std::unique_ptr<Later>> looks;
    for (double at : {0.15, 0.25, 0.35, 0.45, 0.55})
        looks.push_back(After(at, [&] { seen.push_back(Panels()[0]->Highlighted()); }));
    // b, the separator, the disabled item, outside, b again
    Choose("move 70 120\nwait 0.2\nmove 70 135\nwait 0.1\nmove 70 149\nwait 0.1\nmove 300 10\nwait 0.1\nmove "
           "71 120\n"
           "wait 0.2\nmenu 0");
    EXPECT_EQ(seen, (std::vector<int>{2, 0, 0, 0, 2}));
}

TEST_F(PopupTracking, TheReleaseThatChoosesIsNoClickForTheWindow) {
    Fill(menu, {"a", "b"});
    Choose("press " + At(2) + "wait 0.1\nrelease");
    EXPECT_FALSE(EventLoop::Instance().IsTracking());
    desktop.TakeMessages();
    desktop.Run();
    EXPECT_TRUE(desktop.TakeMessages().empty());
}

// Keys

TEST_F(PopupTracking, ArrowsGoRoundPastWhatCannotBeChosen) {
    Fill(menu, {"a", "-", "c", "d"});
    menu.DisableItem(3);
    EXPECT_EQ(Choose("key Down\nkey Return"), 4);
    EXPECT_EQ(Choose("key Down\nkey Down\nkey Return"), 1);
    EXPECT_EQ(Choose("key Up\nkey Enter"), 4);
    EXPECT_EQ(Choose("key Down\nkey Up\nkey Space"), 1);
}

TEST_F(PopupTracking, HomeAndEndGoToTheFirstAndTheLast) {
    Fill(menu, {"-", "b", "c", "d", "-"});
    EXPECT_EQ(Choose("key End\nkey Return", 3), 4);
    EXPECT_EQ(Choose("key Home\nkey Return", 3), 2);
}

TEST_F(PopupTracking, EscapeDismisses) {
    Fill(menu, {"a"});
    EXPECT_EQ(Choose("key Escape"), 0);
}

TEST_F(PopupTracking, ReturnWithoutAHighlightDismisses) {
    Fill(menu, {"a"});
    EXPECT_EQ(Choose("key Return", 0), 0);
}

TEST_F(PopupTracking, ArrowsInAMenuWithoutChoicesDoNothing) {
    Fill(menu, {"-", "b"});
    menu.DisableItem(2);
    EXPECT_EQ(
        Choose(
            "key Down\nkey Up\nkey Home\nkey End\nkey PageUp\nkey PageDown\nkey Right\nkey Left\nkey Escape"),
        0);
}

TEST_F(PopupTracking, LettersGoToTheItemThatBeginsWithThem) {
    Fill(menu, {"Sine", "Saw", "Square", "Triangle", "square two"});
    EXPECT_EQ(Choose("type \"t\"\nkey Return"), 4);
    EXPECT_EQ(Choose("type \"sq\"\nkey Return"), 3);
    EXPECT_EQ(Choose("type \"s\"\nkey Return"), 2) << "the next one, not the current one";
    EXPECT_EQ(Choose("type \"ss\"\nkey Return"), 3);
    EXPECT_EQ(Choose("type \"t\"\nwait 1.5\ntype \"s\"\nkey Return"), 5) << "after a pause it begins anew";
    EXPECT_EQ(Choose("type \"square t\"\nkey Return"), 5);
    EXPECT_EQ(Choose("type \"x\"\nkey Return"), 1) << "no item begins with it";
}

TEST_F(PopupTracking, ShortcutsAreNotForIt) {
    Fill(menu, {"a", "b"});
    EXPECT_EQ(Choose("key b command\nkey Return"), 1);
    EXPECT_EQ(Choose("key Escape control\nkey Return"), 1);
}

TEST_F(PopupTracking, PagesGoByWhatShows) {
    for (int i = 0; i < 200; ++i)
        Fill(menu, {"item"});
    int const page = (1200 - 2 * 4 - 2 * MenuRows::kPad) / MenuRows::kItemHeight;
    EXPECT_EQ(Choose("key PageDown\nkey Return", 100), 100 + page);
    EXPECT_EQ(Choose("key PageDown\nkey PageUp\nkey Return", 100), 100);
    EXPECT_EQ(Choose("key PageDown\nkey PageDown\nkey PageDown\nkey Return", 100), 200);
    EXPECT_EQ(Choose("key PageUp\nkey PageUp\nkey PageUp\nkey Return", 100), 1);
}

// Submenus

TEST_F(PopupTracking, ASubmenuOpensWhenTheMouseHasRestedOnItsItem) {
    Fill(menu, {"a", "sub"});
    Below(menu, 2, {"x", "y"});
    std::vector<std::size_t> open;
    auto const early = After(0.15, [&] { open.push_back(Panels().size()); });
    auto const late = After(0.35, [&] { open.push_back(Panels().size()); });
    Choose("move " + At(2) + "wait 0.5\nmenu 0");
    EXPECT_EQ(open, (std::vector<std::size_t>{1, 2}));
}

TEST_F(PopupTracking, APressOnItsItemOpensASubmenuAtOnce) {
    Fill(menu, {"a", "sub"});
    Below(menu, 2, {"x", "y"});
    std::size_t open = 0;
    auto const look = After(0.05, [&] { open = Panels().size(); });
    Choose("release\npress " + At(2) + "wait 0.1\nmenu 0");
    EXPECT_EQ(open, 2u);
}

TEST_F(PopupTracking, ASubmenuLiesBesideItsItem) {
    Fill(menu, {"a", "sub"});
    Below(menu, 2, {"x", "y"});
    ScreenRect first, second;
    int itemTop = 0;
    auto const look = After(0.4, [&] {
        first = Panels()[0]->Box();
        second = Panels()[1]->Box();
        itemTop = Panels()[0]->ItemTop(2);
    });
    Choose("move " + At(2) + "wait 0.5\nmenu 0");
    EXPECT_NEAR(second.left, first.right, 4);
    EXPECT_EQ(second.top + MenuRows::kPad, itemTop);
}

TEST_F(PopupTracking, TheMouseChoosesFromASubmenu) {
    Fill(menu, {"a", "sub"});
    OSMenuHandle const submenu = Below(menu, 2, {"x", "y"});
    ScreenRect box;
    auto const look = After(0.4, [&] { box = Panels()[1]->Box(); });
    Choose("move " + At(2) + "wait 0.5\nmenu 0"); // once, to know its place
    Point const content = Glog::From(glog).Window()->ScreenPlace();
    std::string const onY = std::to_string(box.left - content.h + 30) + " " +
                            std::to_string(box.top - content.v + MenuRows::kPad + 30) + "\n";
    EXPECT_EQ(Choose("move 5 5\nmove " + At(2) + "wait 0.5\nmove " + onY + "release"), 2);
    EXPECT_EQ(chosenMenu, submenu.GetMenuID());
}

TEST_F(PopupTracking, TheWayToASubmenuMayCrossOtherItems) {
    Fill(menu, {"sub", "b", "c", "d"});
    Below(menu, 1, {"w", "x", "y", "z"});
    std::size_t crossing = 0, resting = 0;
    auto const look = After(0.75, [&] { crossing = Panels().size(); });
    auto const later = After(1.2, [&] { resting = Panels().size(); });
    // down and to the right in small steps, across items 2 and 3, and then no further
    Choose("move 70 101\nwait 0.5\nmove 80 105\nwait 0.05\nmove 92 110\nwait 0.05\nmove 104 115\nwait 0.05\n"
           "move 116 122\nwait 0.05\nmove 124 128\nwait 1\nmenu 0");
    EXPECT_EQ(crossing, 2u) << "it has closed on the way";
    EXPECT_EQ(resting, 1u) << "it has stayed though the mouse rests elsewhere";
}

TEST_F(PopupTracking, GoingStraightToAnotherItemClosesTheSubmenu) {
    Fill(menu, {"sub", "b", "c"});
    Below(menu, 1, {"x"});
    std::size_t open = 0;
    auto const look = After(0.65, [&] { open = Panels().size(); });
    Choose("move 70 101\nwait 0.5\nmove 70 105\nmove 70 112\nmove 70 120\nwait 0.5\nmenu 0");
    EXPECT_EQ(open, 1u);
}

TEST_F(PopupTracking, AReleaseOnItsItemOpensTheSubmenuForClicks) {
    Fill(menu, {"a", "sub"});
    Below(menu, 2, {"x"});
    std::size_t open = 0;
    auto const look = After(0.05, [&] { open = Panels().size(); });
    Choose("move " + At(2) + "release\nwait 0.1\nmenu 0");
    EXPECT_EQ(open, 2u);
}

TEST_F(PopupTracking, ArrowsGoIntoASubmenuAndBack) {
    Fill(menu, {"a", "sub"});
    OSMenuHandle const submenu = Below(menu, 2, {"-", "x", "y"});
    EXPECT_EQ(Choose("key Down\nkey Right\nkey Return"), 2);
    EXPECT_EQ(chosenMenu, submenu.GetMenuID());
    EXPECT_EQ(Choose("key Down\nkey Return\nkey Down\nkey Return"), 3);
    EXPECT_EQ(chosenMenu, submenu.GetMenuID());
    EXPECT_EQ(Choose("key Down\nkey Right\nkey Left\nkey Up\nkey Return"), 1);
    EXPECT_EQ(chosenMenu, menu.GetMenuID());
    EXPECT_EQ(Choose("key Left\nkey Right\nkey Return"), 1);
}

TEST_F(PopupTracking, ASubmenuThatIsNotThereDoesNotOpen) {
    Fill(menu, {"a", "lost", "empty"});
    menu.SetMenuItemHierarchicalID(2, 12345);
    Below(menu, 3, {});
    std::size_t open = 0;
    auto const look = After(0.9, [&] { open = Panels().size(); });
    EXPECT_EQ(
        Choose("move " + At(2) + "wait 0.5\nmove " + At(3) + "wait 0.5\nrelease\nkey Right\nkey Escape"), 0);
    EXPECT_EQ(open, 1u);
}

TEST_F(PopupTracking, StoredMenusOpenAsSubmenus) {
    ShowWindow();
    Store("<menu id='700'><item text='x'/><item text='y'/></menu>");
    Fill(menu, {"a", "sub"});
    menu.SetMenuItemHierarchicalID(2, 700);
    EXPECT_EQ(Choose("menu 2/2"), 2);
    EXPECT_EQ(chosenMenu, 700);
}

TEST_F(PopupTracking, FiftyMenusOpenWithinEachOther) {
    Fill(menu, {"down"});
    OSMenuHandle parent = menu;
    std::string path = "menu 1";
    for (int i = 0; i < 50; ++i) {
        parent = Below(parent, 1, {"down", "choose"});
        path += i == 49 ? "/2" : "/1";
    }
    EXPECT_EQ(Choose(path), 2);
    EXPECT_EQ(chosenMenu, parent.GetMenuID());
}

TEST_F(PopupTracking, AMenuMayBeItsOwnSubmenu) {
    Fill(menu, {"again"});
    menu.SetMenuItemHierarchicalID(1, menu.GetMenuID());
    menu.InsertMenuBeforeMenuID(-1);
    submenus.push_back(menu);
    std::string keys;
    for (int i = 0; i < 200; ++i)
        keys += "key Right\n";
    std::size_t deepest = 0;
    auto const look = After(0.5, [&] { deepest = Panels().size(); });
    EXPECT_EQ(Choose(keys + "wait 1\nkey Escape"), 0);
    EXPECT_EQ(deepest, 64u);
}

// Room

TEST_F(PopupTracking, NearTheScreensEdgesItMovesToWhereThereIsRoom) {
    for (int i = 0; i < 30; ++i)
        Fill(menu, {"item"});
    ScreenRect box;
    auto const look = After(0.1, [&] { box = Panels()[0]->Box(); });
    Choose("wait 1\nmenu 0", 30); // the last item over the place would need room above the screen
    EXPECT_EQ(box.top, 4);
    EXPECT_EQ(box.Height(), 30 * MenuRows::kItemHeight + 2 * MenuRows::kPad);
}

TEST_F(PopupTracking, WhatIsHigherThanTheScreenScrolls) {
    for (int i = 0; i < 100; ++i)
        Fill(menu, {"item"});
    ScreenRect box;
    int itemTop = 0;
    auto const look = After(0.1, [&] {
        box = Panels()[0]->Box();
        itemTop = Panels()[0]->ItemTop(40);
    });
    Choose("wait 1\nmenu 0", 40);
    EXPECT_EQ(box.top, 4);
    EXPECT_EQ(box.bottom, 1196);
    EXPECT_EQ(itemTop + MenuRows::kItemHeight / 2, Glog::From(glog).Window()->ScreenPlace().v + 100)
        << "the current item does not lie over its place";
}

TEST_F(PopupTracking, TheMouseOnAnArrowScrollsWhileItRests) {
    for (int i = 0; i < 100; ++i)
        Fill(menu, {"item"});
    std::vector<int> tops;
    std::vector<std::unique_ptr<Later>> looks;
    for (double at : {0.05, 0.5, 30.0})
        looks.push_back(After(at, [&] { tops.push_back(Panels()[0]->ItemTop(1)); }));
    Choose("wait 0.1\nmove 70 1110\nwait 60\nmenu 0"); // the lower end of the screen
    ASSERT_EQ(tops.size(), 3u);
    EXPECT_LT(tops[1], tops[0]);
    EXPECT_EQ(tops[2], 1196 - (100 * MenuRows::kItemHeight + MenuRows::kPad)) << "it has not come to its end";
}

TEST_F(PopupTracking, TheWheelScrolls) {
    for (int i = 0; i < 100; ++i)
        Fill(menu, {"item"});
    std::vector<int> tops;
    std::vector<std::unique_ptr<Later>> looks;
    for (double at : {0.05, 0.15, 0.25, 0.35})
        looks.push_back(After(at, [&] { tops.push_back(Panels()[0]->ItemTop(1)); }));
    Choose("wait 0.1\nwheel 70 300 0 -2\nwait 0.1\nwheel 70 300 0 1\nwait 0.1\nwheel 70 300 0 -1000\nwait "
           "0.2\nmenu 0\n");
    ASSERT_EQ(tops.size(), 4u);
    EXPECT_EQ(tops[1], tops[0] - 120);
    EXPECT_EQ(tops[2], tops[0] - 60);
    EXPECT_EQ(tops[3], 1196 - (100 * MenuRows::kItemHeight + MenuRows::kPad)) << "it has gone beyond its end";
}

TEST_F(PopupTracking, ScrollingBringsAnotherItemUnderTheMouse) {
    for (int i = 0; i < 100; ++i)
        Fill(menu, {"item"});
    EXPECT_EQ(Choose("release\nmove 70 300\nwheel 70 300 0 -1\nclick 70 300"), 1 + 10 + 3);
}

TEST_F(PopupTracking, KeysBringTheirItemIntoSight) {
    for (int i = 0; i < 100; ++i)
        Fill(menu, {"item"});
    int top = 0;
    auto const look = After(0.1, [&] { top = Panels()[0]->ItemTop(100); });
    EXPECT_EQ(Choose("key End\nwait 0.2\nkey Return"), 100);
    EXPECT_LE(top + MenuRows::kItemHeight, 1196);
}

// What ends it

TEST_F(PopupTracking, TheLossOfTheActivationDismisses) {
    Fill(menu, {"a"});
    EXPECT_EQ(Choose("wait 0.5\nactivate off\nwait 1"), 0);
}

TEST_F(PopupTracking, AResizedWindowDismisses) {
    Fill(menu, {"a"});
    EXPECT_EQ(Choose("wait 0.5\nresize 400 300\nwait 1"), 0);
}

TEST_F(PopupTracking, AWindowThatClosesTakesItsMenuAlong) {
    Fill(menu, {"a"});
    auto const close = After(0.2, [&] { DisposeGlog(glog); });
    EXPECT_EQ(Choose("wait 1"), 0);
    EXPECT_EQ(Popups(), 0u);
}

TEST_F(PopupTracking, AWindowThatHidesTakesItsMenuAlong) {
    Fill(menu, {"a"});
    auto const hide = After(0.2, [&] { ShowGlog(glog, kHideGlog); });
    EXPECT_EQ(Choose("wait 1"), 0);
}

TEST_F(PopupTracking, AProgramThatQuitsDismisses) {
    Fill(menu, {"a"});
    auto const quit = After(0.2, [&] { desktop.Quit(3); });
    EXPECT_EQ(Choose("wait 1"), 0);
}

TEST_F(PopupTracking, TheMenuMayBeChangedWhileItIsOpen) {
    Fill(menu, {"a", "b", "c"});
    auto const change = After(0.2, [&] {
        menu.DeleteItem(1);
        menu.SetMenuItemText(1, Text("other"));
    });
    EXPECT_EQ(Choose("wait 0.5\nmenu 2"), 2);
}

TEST_F(PopupTracking, AnItemThatIsGoneByThenIsNotChosen) {
    Fill(menu, {"a", "b", "c"});
    auto const change = After(0.2, [&] {
        while (menu.NumMenuItems() > 0)
            menu.DeleteItem(1);
    });
    EXPECT_EQ(Choose("wait 0.5\nmenu 2"), 0);
}

TEST_F(PopupTracking, ItsHandleMayBeClearedWhileItIsOpen) {
    Fill(menu, {"a", "b"});
    short const id = menu.GetMenuID();
    auto const change = After(0.2, [&] { menu.clear(); });
    EXPECT_EQ(Choose("wait 0.5\nmenu 2"), 2);
    EXPECT_EQ(chosenMenu, id);
}

TEST_F(PopupTracking, WhatComesWhileSomethingElsePausesIsItsOwnToo) {
    Fill(menu, {"a", "b", "c"});
    auto const pause = After(0.2, [] { Yield(0.5); });
    EXPECT_EQ(Choose("wait 0.3\nkey Down\nkey Down\nwait 1\nkey Return"), 3);
}

TEST_F(PopupTracking, TheCursorIsAnArrow) {
    Fill(menu, {"a"});
    ShowWindow();
    System().SetCursor(Cursors::kText);
    int cursor = Cursors::kText;
    auto const look = After(0.1, [&] { cursor = System().Cursor(); });
    Choose("wait 0.5\nmenu 0");
    EXPECT_EQ(cursor, Cursors::kArrow);
}

TEST_F(PopupTracking, OtherWindowsStayDrawn) {
    Fill(menu, {"a"});
    ShowWindow();
    desktop.TakePresented(glog);
    std::vector<Rect> presented;
    auto const damage = After(0.2, [&] { Glog::From(glog).DamageWindowRect({1, 2, 3, 4}); });
    auto const look = After(0.4, [&] { presented = desktop.TakePresented(glog); });
    Choose("wait 1\nmenu 0");
    ASSERT_EQ(presented.size(), 1u);
    EXPECT_EQ(presented[0], (Rect{1, 2, 3, 4}));
}

TEST_F(PopupTracking, AChangeOfTheThemeRecoloursWhatIsOpen) {
    Fill(menu, {"a", "b"});
    Below(menu, 1, {"x", "y"});
    for (bool places : {true, false}) {
        System().SetPlacesPopups(places);
        desktop.SetTheme("light");
        auto const ground = [](std::size_t level) { return Panels()[level]->Pixels().Row(3)[3]; };
        std::vector<std::uint32_t> light, dark;
        auto const change = After(0.2, [&] {
            light = {ground(0), ground(1)};
            desktop.SetTheme("dark");
            dark = {ground(0), ground(1)};
        });
        Choose("key Right\nwait 0.5\nmenu 0");
        ASSERT_EQ(dark.size(), 2u);
        EXPECT_EQ(light[0], light[1]);
        EXPECT_EQ(dark[0], dark[1]);
        EXPECT_NE(light[0], dark[0]) << places;
    }
}

// What is drawn

namespace {

std::size_t CountOf(std::string const &part, std::vector<std::string> const &lines) {
    return static_cast<std::size_t>(std::count_if(lines.begin(), lines.end(), [&](std::string const &line) {
        return line.find(part) != std::string::npos;
    }));
}

} // namespace

TEST_F(PopupTracking, OnlyWhatShowsIsDrawn) {
    for (int i = 0; i < 10000; ++i)
        Fill(menu, {"item"});
    ShowWindow();
    desktop.TakeDrawing();
    Choose("wait 1\nmenu 0", 5000);
    std::size_t const texts = CountOf("DrawStringInRect", desktop.TakeDrawing());
    EXPECT_GE(texts, 1192u / MenuRows::kItemHeight);
    EXPECT_LE(texts, 1192u / MenuRows::kItemHeight + 3);
}

TEST_F(PopupTracking, AnotherHighlightDrawsTwoItems) {
    Fill(menu, {"a", "b", "c", "d", "e"});
    std::vector<std::string> drawing;
    ShowWindow();
    auto const before = After(0.1, [&] { desktop.TakeDrawing(); });
    auto const after = After(0.3, [&] { drawing = desktop.TakeDrawing(); });
    Choose("wait 0.2\nmove " + At(4) + "wait 0.5\nmenu 0");
    EXPECT_EQ(CountOf("DrawStringInRect", drawing), 2u);
}

TEST_F(PopupTracking, DecoratorsDrawBeforeTheirTexts) {
    class Mark : public MenuItemDecorator {
    public:
        explicit Mark(std::vector<std::string> &notes_)
            : notes(notes_) {}
        short GetWidth() const override { return 30; }
        void Draw(Rect const &r, bool highlighted, bool enabled) override {
            notes.push_back(std::to_string(r.right - r.left) + (highlighted ? " lit" : "") +
                            (enabled ? "" : " grey"));
        }

    private:
        std::vector<std::string> &notes;
    };
    Fill(menu, {"a", "b"});
    std::vector<std::string> notes;
    menu.ApplyDecoratorToItem(1, boost::make_shared<Mark>(notes));
    menu.ApplyDecoratorToItem(2, boost::make_shared<Mark>(notes));
    menu.DisableItem(2);
    Choose("wait 1\nmenu 0");
    EXPECT_EQ(notes, (std::vector<std::string>{"30 lit", "30 grey"}));
}

TEST_F(PopupTracking, TakesDecoratorsOfAnyWidth) {
    class Wide : public MenuItemDecorator {
    public:
        explicit Wide(short width_)
            : width(width_) {}
        short GetWidth() const override { return width; }
        void Draw(Rect const &, bool, bool) override {}

    private:
        short width;
    };
    Fill(menu, {"a", "b"});
    menu.ApplyDecoratorToItem(1, boost::make_shared<Wide>(short(32767)));
    menu.ApplyDecoratorToItem(2, boost::make_shared<Wide>(short(-32768)));
    ScreenRect box;
    auto const look = After(0.1, [&] { box = Panels()[0]->Box(); });
    Choose("wait 1\nmenu 0");
    EXPECT_LT(box.Width(), 400);
}

TEST_F(PopupTracking, ItemsWithoutATextAreChosenLikeOthers) {
    Fill(menu, {"", "", ""});
    EXPECT_EQ(Choose("key Down\nkey Return"), 2);
    EXPECT_EQ(Choose("type \"a\"\nkey Return"), 1) << "no item begins with it";
    EXPECT_EQ(Choose("menu 3"), 3);
}

TEST_F(PopupTracking, TextsAreShortenedToTheScreen) {
    std::string const endless(10000, 'w');
    menu.AppendItem(Text(endless.c_str()));
    ScreenRect box;
    auto const look = After(0.1, [&] { box = Panels()[0]->Box(); });
    Choose("wait 1\nmenu 0");
    EXPECT_EQ(box.left, 4);
    EXPECT_EQ(box.right, 1916);
}

// Without pop-up windows

TEST_F(PopupTracking, WherePopUpsCannotBePlacedItIsDrawnOverTheWindow) {
    System().SetPlacesPopups(false);
    ShowWindow();
    Fill(menu, {"a", "b"});
    std::vector<std::uint32_t> const before(desktop.Picture(glog)->Pixels(),
                                            desktop.Picture(glog)->Row(desktop.Picture(glog)->Height()));
    std::size_t popups = 9;
    bool shows = false, inThePixels = true;
    auto const look = After(0.1, [&] {
        popups = Popups();
        Surface const &picture = *desktop.Picture(glog);
        shows = picture.Row(100)[kLeft - 20] !=
                before[static_cast<std::size_t>(100 * picture.Width() + kLeft - 20)];
        Surface const &pixels = *Glog::From(glog).Pixels();
        inThePixels = pixels.Row(100)[kLeft - 20] !=
                      before[static_cast<std::size_t>(100 * pixels.Width() + kLeft - 20)];
    });
    EXPECT_EQ(Choose("wait 0.2\nmove " + At(2) + "release"), 2);
    EXPECT_EQ(popups, 0u);
    EXPECT_TRUE(shows);
    EXPECT_FALSE(inThePixels) << "what panes draw on has been drawn over";
    std::vector<std::uint32_t> const after(desktop.Picture(glog)->Pixels(),
                                           desktop.Picture(glog)->Row(desktop.Picture(glog)->Height()));
    EXPECT_EQ(before, after) << "something of the menu is left";
}

TEST_F(PopupTracking, DrawnOverTheWindowItStaysWithinIt) {
    System().SetPlacesPopups(false);
    for (int i = 0; i < 50; ++i)
        Fill(menu, {"item"});
    Below(menu, 1, {"x", "y"});
    std::vector<ScreenRect> boxes;
    auto const look = After(0.1, [&] {
        for (auto const &panel : Panels())
            boxes.push_back(panel->Box());
    });
    Choose("key Right\nwait 0.2\nmenu 0");
    Point const content = Glog::From(glog).Window()->ScreenPlace();
    ASSERT_EQ(boxes.size(), 2u);
    for (ScreenRect const &box : boxes) {
        EXPECT_GE(box.left, content.h);
        EXPECT_GE(box.top, content.v);
        EXPECT_LE(box.right, content.h + 320);
        EXPECT_LE(box.bottom, content.v + 200);
    }
}

TEST_F(PopupTracking, DrawnOverTheWindowItOutlivesARedraw) {
    System().SetPlacesPopups(false);
    ShowWindow();
    Fill(menu, {"a", "b"});
    std::vector<std::uint32_t> first, second;
    auto const copy = [&] {
        Surface const &picture = *desktop.Picture(glog);
        return std::vector<std::uint32_t>(picture.Pixels(), picture.Row(picture.Height()));
    };
    auto const look = After(0.1, [&] {
        first = copy();
        Glog::From(glog).DamageAll();
    });
    auto const again = After(0.3, [&] { second = copy(); });
    Choose("wait 0.5\nmenu 0");
    EXPECT_EQ(first, second);
}
