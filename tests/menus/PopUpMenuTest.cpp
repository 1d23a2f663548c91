#include "tests/VirtualPlace.h"
#include "tests/menus/MenuTest.h"
#include <boost/make_shared.hpp>

namespace {

class PopUpMenuTest : public MenuTest {
protected:
    PopUpMenuTest() { menu.InitializeMenu(0, 137); }

    RecordingMenu menu;
};

class Undecorated : public MenuItemDecorator {
public:
    short GetWidth() const override { return 0; }
    void Draw(Rect const &, bool, bool) override {}
};

} // namespace

TEST_F(PopUpMenuTest, HasItsVirtualOperationsInOrder) {
    std::size_t const first = kAfterDestructor;
    ExpectInOrder(first, &PopUpMenu::AddItem, &PopUpMenu::AddSeparator, &PopUpMenu::InsertItem,
                  &PopUpMenu::InsertSeparator, &PopUpMenu::DeleteItem, &PopUpMenu::DeleteAllItems,
                  &PopUpMenu::SetEnableItem, &PopUpMenu::GetEnableItem, &PopUpMenu::SelectItem,
                  &PopUpMenu::GetSelectedItem, &PopUpMenu::CountItems, &PopUpMenu::SetItemIcon,
                  &PopUpMenu::SetItemCheck);
    EXPECT_EQ(PlaceOf(&PopUpMenu::ItemIsEnabled), first + 14);
    EXPECT_EQ(PlaceOf(&PopUpMenu::GetCurItemName), first + 15);
}

// A menu that is not there

TEST_F(PopUpMenuTest, WithoutAMenuAnswersNeutrally) {
    RecordingMenu none;
    EXPECT_EQ(none.AddItem(Text("a"), PopUpMenu::kDashIsSeparator), 0);
    EXPECT_EQ(none.AddSeparator(), 0);
    none.InsertItem(1, Text("a"), PopUpMenu::kDashIsSeparator);
    none.InsertSeparator(1);
    none.DeleteItem(1);
    none.SetEnableItem(0, 1);
    none.SetItemIcon(1, 1);
    none.SetItemCheck(1, true);
    none.SetItemName(1, Text("a"));
    EXPECT_TRUE(none.GetEnableItem(1));
    EXPECT_FALSE(none.ItemIsEnabled(1));
    EXPECT_EQ(none.CountItems(), 0);
    EXPECT_EQ(none.GetSelectedItem(), 0);
    EXPECT_EQ(NameIn(none, 1), "");
    int item = 9;
    EXPECT_FALSE(none.FindItemByName(Text("a"), item));
    EXPECT_EQ(item, 9);
    EXPECT_EQ(none.GetLastPopupResult(), -1);
    EXPECT_EQ(none.DoMenu(), -1);
    EXPECT_EQ(none.Calls(), "");
}

TEST_F(PopUpMenuTest, SelectsWithoutAMenuToo) {
    RecordingMenu none;
    none.SelectItem(4);
    EXPECT_EQ(none.GetCurrentSelection(), 4);
    EXPECT_EQ(none.GetSelectedItem(), 0);
    EXPECT_EQ(none.Calls(), "changed 4, inval");
}

// Taking a menu

TEST_F(PopUpMenuTest, InitialisedWithItemsTheFirstIsCurrent) {
    Store("<menu id='500'><item text='a'/><item text='b'/></menu>");
    RecordingMenu made;
    made.InitializeMenu(0, 500);
    EXPECT_EQ(made.GetSelectedItem(), 1);
    EXPECT_EQ(made.Calls(), "changed 1");
    RecordingMenu free(false);
    free.InitializeMenu(0, 500);
    EXPECT_EQ(free.GetSelectedItem(), 0);
    EXPECT_EQ(free.Calls(), "");
}

TEST_F(PopUpMenuTest, KeepsTheLowByteOfItsFlags) {
    RecordingMenu made;
    made.InitializeMenu(0x1234, 137);
    EXPECT_EQ(made.GetFlags(), 0x34);
    EXPECT_EQ(made.GetMenuID(), 137);
}

TEST_F(PopUpMenuTest, WhoHearsOfTheFirstSelectionFindsAllFlags) {
    class Looking : public RecordingMenu {
    public:
        short flagsAtChange = 0;

    protected:
        void MenuChanged(short) override { flagsAtChange = GetFlags(); }
    } made;
    Store("<menu id='500'><item text='a'/></menu>");
    made.InitializeMenu(0x1234, 500);
    EXPECT_EQ(made.flagsAtChange, 0x1234);
    EXPECT_EQ(made.GetFlags(), 0x34);
}

TEST_F(PopUpMenuTest, TakesACopyOrTheSharedMenu) {
    Store("<menu id='500'><item text='a'/></menu>");
    RecordingMenu own(true, true), shared(true, false);
    own.InitializeMenu(0, 500);
    shared.InitializeMenu(0, 500);
    EXPECT_FALSE(own.GetMenuHandle() == OSMenuHandle::GetSingletonMenu(500));
    EXPECT_TRUE(shared.GetMenuHandle() == OSMenuHandle::GetSingletonMenu(500));
}

TEST_F(PopUpMenuTest, SetMenuTakesACopyAndTellsNobody) {
    Add(menu, {"a", "b", "c"});
    menu.SelectItem(3);
    menu.AppendNewEmptyHierarchicalMenu(Text("sub"));
    OSMenuHandle other = OSMenuHandle::CreateNewHierarchicalMenu();
    other.AppendItem(Text("x"));
    menu.Calls();
    menu.SetMenu(other, false);
    EXPECT_EQ(menu.Calls(), "");
    EXPECT_EQ(menu.GetCurrentSelection(), 3);
    EXPECT_EQ(NameIn(menu, 1), "x");
    EXPECT_EQ(menu.GetMenuID(), other.GetMenuID());
    EXPECT_FALSE(menu.GetMenuHandle() == other);
    short item = 0;
    EXPECT_FALSE(menu.FindSubMenuWithID(0, item).IsValid());
    menu.SetMenu(other, true);
    EXPECT_EQ(menu.GetCurrentSelection(), 0);
}

TEST_F(PopUpMenuTest, SetMenuLeavesASharedMenuAlone) {
    Store("<menu id='500'><item text='a'/></menu>");
    RecordingMenu shared(true, false);
    shared.InitializeMenu(0, 500);
    OSMenuHandle other = OSMenuHandle::CreateNewHierarchicalMenu();
    shared.SetMenu(other, true);
    EXPECT_EQ(OSMenuHandle::GetSingletonMenu(500).NumMenuItems(), 1);
    EXPECT_EQ(shared.CountItems(), 0);
}

TEST_F(PopUpMenuTest, SetInPlaceOfAnInvalidMenuTheSelectionStays) {
    RecordingMenu none;
    none.SelectItem(4);
    OSMenuHandle other = OSMenuHandle::CreateNewHierarchicalMenu();
    none.SetMenu(other, true);
    EXPECT_EQ(none.GetCurrentSelection(), 4);
    none.SetMenu(other, true);
    EXPECT_EQ(none.GetCurrentSelection(), 0);
}

TEST_F(PopUpMenuTest, SetToAnInvalidMenuItIsInvalid) {
    Add(menu, {"a"});
    menu.SetMenu(OSMenuHandle(), false);
    EXPECT_FALSE(menu.GetMenuHandle().IsValid());
    EXPECT_EQ(menu.GetMenuID(), 0);
    EXPECT_EQ(menu.CountItems(), 0);
}

TEST_F(PopUpMenuTest, SetMenuTakesItsOwnMenuToo) {
    Add(menu, {"a", "b"});
    menu.SetMenu(menu.GetMenuHandle(), false);
    EXPECT_EQ(menu.CountItems(), 2);
}

// Items

TEST_F(PopUpMenuTest, TheFirstItemSelectsItself) {
    EXPECT_EQ(menu.AddItem(Text("a"), PopUpMenu::kDashIsSeparator), 1);
    EXPECT_EQ(menu.Calls(), "changed 1");
    EXPECT_EQ(menu.AddItem(Text("b"), PopUpMenu::kDashIsSeparator), 2);
    EXPECT_EQ(menu.Calls(), "");
    EXPECT_EQ(menu.GetSelectedItem(), 1);
}

TEST_F(PopUpMenuTest, WithoutTheNeedOfASelectionNoItemSelectsItself) {
    RecordingMenu free(false);
    free.InitializeMenu(0, 137);
    Add(free, {"a", "b"});
    EXPECT_EQ(free.Calls(), "");
    EXPECT_EQ(free.GetSelectedItem(), 0);
    free.SetMustHaveSelection(true);
    free.AddItem(Text("c"), PopUpMenu::kDashIsSeparator);
    EXPECT_EQ(free.Calls(), "changed 1");
}

TEST_F(PopUpMenuTest, ADashIsASeparatorOrAText) {
    menu.AddItem(Text("-"), PopUpMenu::kDashIsText);
    EXPECT_TRUE(menu.ItemIsEnabled(1));
    EXPECT_EQ(NameIn(menu, 1), "-");
    EXPECT_EQ(menu.AddItem(Text("-"), PopUpMenu::kDashIsSeparator), 2);
    EXPECT_FALSE(menu.ItemIsEnabled(2));
    EXPECT_EQ(NameIn(menu, 2), "");
    menu.AddItem(Text("-"), PopUpMenu::DashIsSep(7));
    EXPECT_TRUE(menu.ItemIsEnabled(3));
    menu.AddItem(Text("--"), PopUpMenu::kDashIsSeparator);
    EXPECT_EQ(NameIn(menu, 4), "--");
}

TEST_F(PopUpMenuTest, ADashThatIsTheFirstItemSelectsItselfToo) {
    menu.AddItem(Text("-"), PopUpMenu::kDashIsSeparator);
    EXPECT_EQ(menu.Calls(), "changed 1");
    RecordingMenu other;
    other.InitializeMenu(0, 137);
    other.InsertItem(1, Text("-"), PopUpMenu::kDashIsSeparator);
    EXPECT_EQ(other.Calls(), "changed 1");
}

TEST_F(PopUpMenuTest, OrdinaryItemsHaveTheAttributeOfTextsThatAreTakenAsTheyStand) {
    menu.AddItem(Text("a"), PopUpMenu::kDashIsSeparator);
    menu.InsertItem(1, Text("b"), PopUpMenu::kDashIsText);
    menu.AddSeparator();
    menu.InsertSeparator(4);
    auto const attributes = [this](int item) {
        return MenuAccess::Of(menu.GetMenuHandle())->Find(item)->attributes;
    };
    EXPECT_EQ(attributes(1), 0x40);
    EXPECT_EQ(attributes(2), 0x40);
    EXPECT_EQ(attributes(3), 0);
    EXPECT_EQ(attributes(4), 0);
}

TEST_F(PopUpMenuTest, ASeparatorThatIsAddedIsNeverSelected) {
    EXPECT_EQ(menu.AddSeparator(), 1);
    EXPECT_EQ(menu.Calls(), "");
}

TEST_F(PopUpMenuTest, InsertedItemsGetTheNumber) {
    Add(menu, {"a", "c"});
    menu.InsertItem(2, Text("b"), PopUpMenu::kDashIsSeparator);
    menu.InsertItem(1, Text("-"), PopUpMenu::kDashIsSeparator);
    menu.InsertSeparator(3);
    EXPECT_EQ(NameIn(menu, 2), "a");
    EXPECT_EQ(NameIn(menu, 4), "b");
    EXPECT_EQ(NameIn(menu, 5), "c");
    EXPECT_FALSE(menu.ItemIsEnabled(1));
    EXPECT_FALSE(menu.ItemIsEnabled(3));
    EXPECT_EQ(menu.GetCurrentSelection(), 1) << "the number of the current item stays";
}

TEST_F(PopUpMenuTest, AnItemInsertedIntoAnEmptyMenuSelectsItself) {
    menu.InsertItem(1, Text("a"), PopUpMenu::kDashIsSeparator);
    EXPECT_EQ(menu.Calls(), "changed 1");
}

TEST_F(PopUpMenuTest, ANameOfADashDisablesItsItem) {
    Add(menu, {"a", "b"});
    menu.SetItemName(1, Text("-"));
    menu.SetItemName(2, Text("other"));
    EXPECT_FALSE(menu.ItemIsEnabled(1));
    EXPECT_EQ(NameIn(menu, 1), "-");
    EXPECT_TRUE(menu.ItemIsEnabled(2));
    menu.SetItemName(3, Text("none"));
    menu.SetItemName(0, Text("none"));
    EXPECT_EQ(menu.CountItems(), 2);
}

TEST_F(PopUpMenuTest, FindsItemsByName) {
    Add(menu, {"a", "b", "b"});
    int item = 0;
    EXPECT_TRUE(menu.FindItemByName(Text("b"), item));
    EXPECT_EQ(item, 2);
    EXPECT_FALSE(menu.FindItemByName(Text("z"), item));
    EXPECT_EQ(item, 4);
}

TEST_F(PopUpMenuTest, EnablesItemsAndTheWholeMenu) {
    Add(menu, {"a", "b"});
    menu.SetEnableItem(2, 0);
    EXPECT_FALSE(menu.ItemIsEnabled(2));
    EXPECT_FALSE(menu.GetEnableItem(2));
    menu.SetEnableItem(3, 1);
    menu.SetEnableItem(-1, 1);
    menu.SetEnableItem(0, 0);
    EXPECT_FALSE(menu.ItemIsEnabled(1)) << "the menu is disabled";
    EXPECT_TRUE(menu.GetEnableItem(1)) << "the item itself is not";
    menu.Calls();
    menu.EnableMenu(true);
    EXPECT_EQ(menu.Calls(), "inval");
    EXPECT_TRUE(menu.ItemIsEnabled(1));
}

TEST_F(PopUpMenuTest, ADecoratorOfTheCurrentItemRepaints) {
    Add(menu, {"a", "b"});
    menu.Calls();
    boost::shared_ptr<MenuItemDecorator> const decorator = boost::make_shared<Undecorated>();
    menu.ApplyDecoratorToItem(2, decorator);
    EXPECT_EQ(menu.Calls(), "");
    menu.ApplyDecoratorToItem(1, decorator);
    EXPECT_EQ(menu.Calls(), "inval");
    menu.ApplyDecoratorToItem(3, decorator);
    EXPECT_EQ(menu.Calls(), "");
    EXPECT_EQ(decorator.use_count(), 3);
}

// Selection

TEST_F(PopUpMenuTest, SelectingTellsAndRepaints) {
    Add(menu, {"a", "b"});
    menu.Calls();
    menu.SelectItem(2);
    EXPECT_EQ(menu.Calls(), "changed 2, inval");
    menu.SelectItem(2);
    EXPECT_EQ(menu.Calls(), "");
    menu.SetSelectedItem(1);
    EXPECT_EQ(menu.Calls(), "changed 1");
}

TEST_F(PopUpMenuTest, ANegativeNumberSelectsNone) {
    Add(menu, {"a", "b"});
    menu.SelectItem(2);
    menu.Calls();
    menu.SelectItem(-3);
    EXPECT_EQ(menu.GetSelectedItem(), 0);
    EXPECT_EQ(menu.Calls(), "changed 0, inval");
    menu.SelectItem(-3);
    EXPECT_EQ(menu.Calls(), "changed 0, inval") << "-3 is never the current item";
}

TEST_F(PopUpMenuTest, ASelectionBeyondTheItemsHasNoName) {
    Add(menu, {"a"});
    menu.SelectItem(9);
    UString name = Text("before");
    menu.GetCurItemName(name);
    EXPECT_TRUE(name.empty());
    EXPECT_EQ(menu.GetSelectedItem(), 9);
}

TEST_F(PopUpMenuTest, TellsHowTheCurrentItemIsDrawn) {
    Add(menu, {"a", "b"});
    menu.SetItemIcon(2, 5);
    menu.SetEnableItem(2, 0);
    bool enabled = false;
    short icon = 9;
    menu.GetCurItemMenuInfo(enabled, icon);
    EXPECT_TRUE(enabled);
    EXPECT_EQ(icon, 0);
    menu.SelectItem(2);
    menu.GetCurItemMenuInfo(enabled, icon);
    EXPECT_FALSE(enabled);
    EXPECT_EQ(icon, 5);
    menu.itemInfo = false;
    menu.GetCurItemMenuInfo(enabled, icon);
    EXPECT_TRUE(enabled) << "the menu is";
    EXPECT_EQ(icon, 0);
    menu.SelectItem(7);
    menu.itemInfo = true;
    menu.GetCurItemMenuInfo(enabled, icon);
    EXPECT_TRUE(enabled);
    EXPECT_EQ(icon, 0);
}

TEST_F(PopUpMenuTest, ASubclassMaySayThatNoSelectionChangesAnything) {
    class Steadfast : public RecordingMenu {
    protected:
        bool NewSelectionRequiresAction(short) override { return false; }
    } steadfast;
    steadfast.InitializeMenu(0, 137);
    Add(steadfast, {"a", "b"});
    steadfast.SelectItem(2);
    steadfast.SetSelectedItem(1);
    EXPECT_EQ(steadfast.GetCurrentSelection(), 0);
    steadfast.DeleteAllItems();
    EXPECT_EQ(steadfast.CountItems(), 0);
    EXPECT_EQ(steadfast.Calls(), "");
}

// Deleting

TEST_F(PopUpMenuTest, WithoutTheSelectedLastItemTheFirstIsSelected) {
    Add(menu, {"a", "b", "c"});
    menu.SelectItem(3);
    menu.Calls();
    menu.DeleteItem(3);
    EXPECT_EQ(menu.GetSelectedItem(), 1);
    EXPECT_EQ(menu.Calls(), "changed 1, inval");
}

TEST_F(PopUpMenuTest, WithoutTheSelectedMiddleItemTheNextIsSelectedUnheard) {
    Add(menu, {"a", "b", "c"});
    menu.SelectItem(2);
    menu.Calls();
    menu.DeleteItem(2);
    EXPECT_EQ(menu.GetSelectedItem(), 2);
    EXPECT_EQ(NameIn(menu, 2), "c");
    EXPECT_EQ(menu.Calls(), "inval");
}

TEST_F(PopUpMenuTest, WithoutAnEarlierItemTheSelectionCountsOneLess) {
    Add(menu, {"a", "b", "c"});
    menu.SelectItem(3);
    menu.Calls();
    menu.DeleteItem(1);
    EXPECT_EQ(menu.GetSelectedItem(), 2);
    EXPECT_EQ(menu.Calls(), "changed 2");
    menu.DeleteItem(0);
    menu.DeleteItem(3);
    EXPECT_EQ(menu.Calls(), "");
}

TEST_F(PopUpMenuTest, WithoutALaterItemTheSelectionStays) {
    Add(menu, {"a", "b"});
    menu.Calls();
    menu.DeleteItem(2);
    EXPECT_EQ(menu.Calls(), "");
}

TEST_F(PopUpMenuTest, WithoutItsOnlyItemNoneIsSelected) {
    Add(menu, {"a"});
    menu.Calls();
    menu.DeleteItem(1);
    EXPECT_EQ(menu.GetCurrentSelection(), 0);
    EXPECT_EQ(menu.Calls(), "changed 0, inval");
}

TEST_F(PopUpMenuTest, DeletingOneItemAloneLeavesTheSelection) {
    Add(menu, {"a", "b"});
    menu.SelectItem(2);
    menu.Calls();
    menu.DeleteOneMenuItem(2);
    menu.DeleteOneMenuItem(2);
    EXPECT_EQ(menu.CountItems(), 1);
    EXPECT_EQ(menu.GetCurrentSelection(), 2);
    EXPECT_EQ(menu.Calls(), "");
}

TEST_F(PopUpMenuTest, DeletingAllItemsDropsTheSubmenusToo) {
    Add(menu, {"a", "b"});
    OSMenuHandle submenu = menu.AppendNewEmptyHierarchicalMenu(Text("sub"));
    menu.Calls();
    menu.DeleteAllItems();
    EXPECT_EQ(menu.Calls(), "changed 0");
    EXPECT_EQ(menu.CountItems(), 0);
    int item = 0;
    EXPECT_FALSE(menu.FindSubMenuItem(submenu, item));
    menu.DeleteAllItems();
    EXPECT_EQ(menu.Calls(), "");
}

TEST_F(PopUpMenuTest, WithoutAMenuDeletingAllItemsStillDropsTheSubmenus) {
    RecordingMenu none;
    OSMenuHandle parent = OSMenuHandle::CreateNewHierarchicalMenu();
    OSMenuHandle submenu = none.AppendNewEmptyHierarchicalMenu(Text("sub"), parent);
    int item = 0;
    ASSERT_TRUE(none.FindSubMenuItem(submenu, item));
    none.DeleteAllItems();
    EXPECT_FALSE(none.FindSubMenuItem(submenu, item));
    EXPECT_TRUE(submenu.IsValid()) << "other handles keep it";
    EXPECT_EQ(none.Calls(), "");
}

// Submenus

TEST_F(PopUpMenuTest, MakesSubmenusOfItselfAndOfOthers) {
    Add(menu, {"a"});
    OSMenuHandle submenu = menu.AppendNewEmptyHierarchicalMenu(Text("sub"));
    OSMenuHandle below = menu.AppendNewEmptyHierarchicalMenu(Text("below"), submenu);
    EXPECT_EQ(menu.CountItems(), 2);
    EXPECT_EQ(NameIn(menu, 2), "sub");
    EXPECT_EQ(submenu.NumMenuItems(), 1);
    int item = 0;
    EXPECT_TRUE(menu.FindSubMenuItem(submenu, item));
    EXPECT_EQ(item, 2);
    EXPECT_TRUE(menu.FindSubMenuItem(below, item));
    EXPECT_EQ(item, 1);
    OSMenuHandle stranger = OSMenuHandle::CreateNewHierarchicalMenu();
    EXPECT_FALSE(menu.FindSubMenuItem(stranger, item));
}

TEST_F(PopUpMenuTest, FindsSubmenusByTheirNumbers) {
    Add(menu, {"a"});
    OSMenuHandle submenu = menu.AppendNewEmptyHierarchicalMenu(Text("sub"));
    short item = 0;
    EXPECT_TRUE(menu.FindSubMenuWithID(submenu.GetMenuID(), item) == submenu);
    EXPECT_EQ(item, 2);
    menu.SetItemName(2, Text("renamed"));
    EXPECT_TRUE(menu.FindSubMenuWithID(submenu.GetMenuID(), item) == submenu);
    EXPECT_EQ(item, 3) << "no item has its title any more";
    EXPECT_FALSE(menu.FindSubMenuWithID(12345, item).IsValid());
}

TEST_F(PopUpMenuTest, SubmenusAreInstalledOnDemand) {
    OSMenuHandle submenu = menu.AppendNewEmptyHierarchicalMenu(Text("sub"));
    OSMenuHandle found;
    menu.InstallSubMenus();
    EXPECT_TRUE(OSMenuHandle::FindInMenuList(submenu.GetMenuID(), found));
    EXPECT_EQ(menu.GetMenuHandle().GetMenuItemHierarchicalID(1), submenu.GetMenuID());
    menu.RemoveSubMenus();
    EXPECT_FALSE(OSMenuHandle::FindInMenuList(submenu.GetMenuID(), found));
}

// Running

TEST_F(PopUpMenuTest, AChoiceSelectsAndTellsInOrder) {
    ShowWindow();
    Add(menu, {"a", "b", "c"});
    menu.Calls();
    EXPECT_EQ(Do(menu, "menu 3"), 3);
    EXPECT_EQ(menu.Calls(), "about, activity, changed 3, inval, selected 3, done");
    EXPECT_FALSE(menu.chosenMenu.IsValid());
    EXPECT_TRUE(menu.chosenName.empty());
    EXPECT_EQ(menu.GetLastPopupResult(), 137 << 16 | 3);
}

TEST_F(PopUpMenuTest, ChoosingTheCurrentItemIsAChoiceAndNoChange) {
    ShowWindow();
    Add(menu, {"a", "b"});
    menu.Calls();
    EXPECT_EQ(Do(menu, "menu 1"), 1);
    EXPECT_EQ(menu.Calls(), "about, activity, selected 1, done");
}

TEST_F(PopUpMenuTest, ADismissedMenuIsDoneWithoutAChoice) {
    ShowWindow();
    Add(menu, {"a", "b"});
    menu.Calls();
    EXPECT_EQ(Do(menu, "menu 0"), -1);
    EXPECT_EQ(menu.Calls(), "about, activity, done");
    EXPECT_EQ(menu.GetLastPopupResult(), 0);
}

TEST_F(PopUpMenuTest, AnEmptyOrDisabledMenuDoesNotOpen) {
    ShowWindow();
    EXPECT_EQ(menu.DoMenu(), -1);
    Add(menu, {"a"});
    menu.SetEnableItem(0, 0);
    menu.Calls();
    EXPECT_EQ(menu.DoMenu(), -1);
    EXPECT_EQ(menu.Calls(), "");
    EXPECT_EQ(menu.GetLastPopupResult(), -1);
}

TEST_F(PopUpMenuTest, AMenuThatDoesNotOpenHasNoResultOfAnEarlierChoice) {
    ShowWindow();
    Add(menu, {"a", "b"});
    EXPECT_EQ(Do(menu, "menu 2"), 2);
    EXPECT_EQ(menu.GetLastPopupResult() & 0xFFFF, 2);
    menu.SetEnableItem(0, 0);
    EXPECT_EQ(menu.DoMenu(), -1);
    EXPECT_EQ(menu.GetLastPopupResult(), -1);
}

TEST_F(PopUpMenuTest, AChoiceFromASubmenuSelectsItsItem) {
    ShowWindow();
    Add(menu, {"a", "b"});
    OSMenuHandle submenu = menu.AppendNewEmptyHierarchicalMenu(Text("sub"));
    submenu.AppendItem(Text("x"));
    submenu.AppendItem(Text("y"));
    menu.Calls();
    EXPECT_EQ(Do(menu, "menu 3/2"), 3);
    EXPECT_EQ(menu.Calls(), "about, activity, changed 3, inval, selected 2, done");
    EXPECT_TRUE(menu.chosenMenu == submenu);
    EXPECT_EQ(Ascii(menu.chosenName), "sub");
    OSMenuHandle found;
    EXPECT_FALSE(OSMenuHandle::FindInMenuList(submenu.GetMenuID(), found)) << "it is installed still";
}

TEST_F(PopUpMenuTest, AChoiceTwoSubmenusDownSelectsByTheNumberInItsParent) {
    ShowWindow();
    Add(menu, {"a", "b"});
    OSMenuHandle submenu = menu.AppendNewEmptyHierarchicalMenu(Text("sub"));
    OSMenuHandle below = menu.AppendNewEmptyHierarchicalMenu(Text("below"), submenu);
    below.AppendItem(Text("x"));
    menu.SelectItem(2);
    EXPECT_EQ(Do(menu, "menu 3/1/1"), 1);
    EXPECT_EQ(Ascii(menu.chosenName), "below");
    EXPECT_TRUE(menu.chosenMenu == below);
}

TEST_F(PopUpMenuTest, AChoiceFromASubmenuWithoutATitleIsLookedForAmongTheItems) {
    ShowWindow();
    Add(menu, {"a"});
    OSMenuHandle submenu = menu.AppendNewEmptyHierarchicalMenu(UString());
    submenu.AppendItem(Text("x"));
    menu.AppendNewEmptyHierarchicalMenu(Text("other"));
    EXPECT_EQ(Do(menu, "menu 2/1"), 2);
    EXPECT_TRUE(menu.chosenName.empty());
    EXPECT_FALSE(menu.chosenMenu.IsValid()) << "it is not installed any more by then";
}

TEST_F(PopUpMenuTest, AChoiceFromAStoredSubmenuSelectsTheItemThatLeadsThere) {
    Store("<menu id='500'><item text='a'/><item text='down' submenu='501'/><item text='b'/></menu>"
          "<menu id='501'><item text='x'/><item text='further' submenu='502'/></menu>"
          "<menu id='502'><item text='y'/><item text='z'/></menu>");
    RecordingMenu stored;
    stored.InitializeMenu(0, 500);
    ShowWindow();
    stored.Calls();
    EXPECT_EQ(Do(stored, "menu 2/1"), 2);
    EXPECT_TRUE(stored.chosenMenu == OSMenuHandle::GetSingletonMenu(501));
    stored.SelectItem(1);
    EXPECT_EQ(Do(stored, "menu 2/2/2"), 2);
    EXPECT_EQ(stored.chosenItem, 2);
    EXPECT_TRUE(stored.chosenMenu == OSMenuHandle::GetSingletonMenu(501)) << "the one that the item opens";
    EXPECT_EQ(stored.GetLastPopupResult(), 502 << 16 | 2);
}

TEST_F(PopUpMenuTest, AChoiceFromAMenuThatAProgramHasInstalledSelectsItsItem) {
    ShowWindow();
    Add(menu, {"a", "down", "b"});
    OSMenuHandle first = OSMenuHandle::CreateNewHierarchicalMenu(), second, third;
    second = OSMenuHandle::CreateNewHierarchicalMenu();
    third = OSMenuHandle::CreateNewHierarchicalMenu();
    menu.GetMenuHandle().SetMenuItemHierarchicalID(2, first.GetMenuID());
    for (OSMenuHandle *below : {&first, &second, &third}) {
        below->AppendItem(Text("choose"));
        below->AppendItem(Text("further"));
        below->InsertMenuBeforeMenuID(-1);
    }
    first.SetMenuItemHierarchicalID(2, second.GetMenuID());
    second.SetMenuItemHierarchicalID(2, third.GetMenuID());
    EXPECT_EQ(Do(menu, "menu 2/1"), 2);
    EXPECT_TRUE(menu.chosenMenu == first);
    menu.SelectItem(1);
    EXPECT_EQ(Do(menu, "menu 2/2/1"), 2);
    EXPECT_TRUE(menu.chosenMenu == first) << "the one that the item opens";
    // Only stored menus are looked into further than that.
    menu.SelectItem(3);
    EXPECT_EQ(Do(menu, "menu 2/2/2/1"), 3) << "the selection stays";
    EXPECT_FALSE(menu.chosenMenu.IsValid());
    EXPECT_EQ(menu.chosenItem, 1);
    for (OSMenuHandle *below : {&first, &second, &third})
        below->RemoveFromMenuList();
}

TEST_F(PopUpMenuTest, AChoiceThatNoItemStandsForLeavesTheSelection) {
    ShowWindow();
    Add(menu, {"a", "b"});
    OSMenuHandle other = OSMenuHandle::CreateNewHierarchicalMenu();
    other.AppendItem(Text("x"));
    Later const change(0.2, [&] { menu.SetMenu(other, false); });
    menu.Calls();
    EXPECT_EQ(Do(menu, "wait 0.5\nmenu 2"), 1);
    EXPECT_EQ(menu.Calls(), "about, activity, selected 2, done");
}

TEST_F(PopUpMenuTest, OfTwoItemsThatLeadThereTheLastIsSelected) {
    Store("<menu id='500'><item text='one' submenu='501'/><item text='two' submenu='501'/></menu>"
          "<menu id='501'><item text='x'/></menu>");
    RecordingMenu stored;
    stored.InitializeMenu(0, 500);
    ShowWindow();
    EXPECT_EQ(Do(stored, "menu 1/1"), 2);
}

TEST_F(PopUpMenuTest, MenusBelowThemselvesAreSearchedOnce) {
    Store("<menu id='500'><item text='a'/><item text='loop' submenu='501'/><item text='aim' "
          "submenu='503'/></menu>"
          "<menu id='501'><item text='again' submenu='501'/><item text='up' submenu='502'/></menu>"
          "<menu id='502'><item text='down' submenu='501'/></menu>"
          "<menu id='503'><item text='x'/></menu>");
    RecordingMenu stored;
    stored.InitializeMenu(0, 500);
    ShowWindow();
    EXPECT_EQ(Do(stored, "menu 3/1"), 3);
}

TEST_F(PopUpMenuTest, MarksTheCurrentItemWhileItIsOpen) {
    ShowWindow();
    Add(menu, {"a", "b"});
    menu.SelectItem(2);
    bool marked = false;
    Later const look(0.1, [&] { marked = MenuTracker::Open()->Panels()[0]->Items().Find(2)->checked; });
    Do(menu, "wait 1\nmenu 0");
    EXPECT_TRUE(marked);
    Do(menu, "menu 0");
    EXPECT_FALSE(MenuAccess::Of(menu.GetMenuHandle())->Find(2)->checked);
}

TEST_F(PopUpMenuTest, DoesNotMarkWhenItIsToldNotTo) {
    ShowWindow();
    Add(menu, {"a"});
    menu.EnableCurrentSelectionCheckmark(false);
    bool marked = true;
    Later const look(0.1, [&] { marked = MenuTracker::Open()->Panels()[0]->Items().Find(1)->checked; });
    Do(menu, "wait 1\nmenu 0");
    EXPECT_FALSE(marked);
    RecordingMenu flagged;
    flagged.InitializeMenu(2, 137);
    Add(flagged, {"a"});
    marked = true;
    Later const again(0.1, [&] { marked = MenuTracker::Open()->Panels()[0]->Items().Find(1)->checked; });
    Do(flagged, "wait 1\nmenu 0");
    EXPECT_FALSE(marked);
}

TEST_F(PopUpMenuTest, DoesNotMarkAnItemThatOpensASubmenu) {
    ShowWindow();
    Add(menu, {"a", "sub"});
    OSMenuHandle submenu = OSMenuHandle::CreateNewHierarchicalMenu();
    menu.GetMenuHandle().SetMenuItemHierarchicalID(2, submenu.GetMenuID());
    menu.SelectItem(2);
    bool marked = true;
    Later const look(0.1, [&] { marked = MenuTracker::Open()->Panels()[0]->Items().Find(2)->checked; });
    Do(menu, "wait 1\nmenu 0");
    EXPECT_FALSE(marked);
}

TEST_F(PopUpMenuTest, AMarkOfTheProgramsOwnGoesWithThatOfTheCurrentItem) {
    ShowWindow();
    Add(menu, {"a", "b"});
    menu.SetItemCheck(1, true);
    menu.SetItemCheck(2, true);
    Do(menu, "menu 0");
    EXPECT_FALSE(MenuAccess::Of(menu.GetMenuHandle())->Find(1)->checked);
    EXPECT_TRUE(MenuAccess::Of(menu.GetMenuHandle())->Find(2)->checked);
}

TEST_F(PopUpMenuTest, AMarkThatOpeningHasSetIsGoneAfterwards) {
    ShowWindow();
    OSMenuHandle submenu = menu.AppendNewEmptyHierarchicalMenu(Text("sub"));
    submenu.AppendItem(Text("x"));
    menu.SelectItem(1);
    Do(menu, "menu 0");
    EXPECT_FALSE(MenuAccess::Of(menu.GetMenuHandle())->Find(1)->checked);
}

// Bad input

TEST_F(PopUpMenuTest, ItemsThatAreNotThereChangeNothing) {
    Add(menu, {"a", "b"});
    menu.Calls();
    for (short item : {-32768, -1, 3, 32767}) {
        menu.DeleteItem(item);
        menu.DeleteOneMenuItem(item);
        menu.SetEnableItem(item, 0);
        menu.SetItemIcon(item, 5);
        menu.SetItemCheck(item, true);
        menu.SetItemName(item, Text("-"));
        menu.ApplyDecoratorToItem(item, boost::make_shared<Undecorated>());
        EXPECT_FALSE(menu.ItemIsEnabled(item)) << item;
        EXPECT_FALSE(menu.GetEnableItem(item)) << item;
        UString name = Text("left over");
        menu.GetItemName(item, name);
        EXPECT_TRUE(name.empty()) << item;
    }
    EXPECT_EQ(menu.CountItems(), 2);
    EXPECT_EQ(NameIn(menu, 2), "b");
    EXPECT_TRUE(menu.ItemIsEnabled(2));
    EXPECT_EQ(menu.GetMenuHandle().GetMenuItemIcon(2), 0);
    EXPECT_EQ(menu.Calls(), "");
}

TEST_F(PopUpMenuTest, ItemsAreInsertedAtTheEndThatIsNearer) {
    Add(menu, {"b"});
    menu.InsertItem(-5, Text("a"), PopUpMenu::kDashIsText);
    menu.InsertItem(32767, Text("c"), PopUpMenu::kDashIsText);
    menu.InsertSeparator(1000);
    ASSERT_EQ(menu.CountItems(), 4);
    EXPECT_EQ(NameIn(menu, 1), "a");
    EXPECT_EQ(NameIn(menu, 3), "c");
    EXPECT_FALSE(menu.ItemIsEnabled(4));
}

TEST_F(PopUpMenuTest, TenThousandItemsAreChosenFrom) {
    ShowWindow();
    for (int i = 0; i < 10000; ++i)
        menu.AddItem(UString(), PopUpMenu::kDashIsText);
    menu.SetItemName(10000, Text("last"));
    EXPECT_EQ(Do(menu, "menu 10000"), 10000);
    int found = 0;
    EXPECT_TRUE(menu.FindItemByName(Text("last"), found));
    EXPECT_EQ(found, 10000);
    menu.DeleteAllItems();
    EXPECT_EQ(menu.CountItems(), 0);
}

TEST_F(PopUpMenuTest, FiftySubmenusLieWithinEachOther) {
    ShowWindow();
    OSMenuHandle deepest = menu.GetMenuHandle();
    std::string path = "menu 1";
    for (int i = 0; i < 50; ++i) {
        deepest = menu.AppendNewEmptyHierarchicalMenu(Text("down"), deepest);
        path += "/1";
    }
    deepest.AppendItem(Text("choose"));
    EXPECT_EQ(Do(menu, path), 1);
    EXPECT_TRUE(menu.chosenMenu == deepest);
    EXPECT_EQ(menu.chosenItem, 1);
}

TEST_F(PopUpMenuTest, ASubmenuMayOpenItsOwnParent) {
    ShowWindow();
    OSMenuHandle submenu = menu.AppendNewEmptyHierarchicalMenu(Text("down"));
    submenu.AppendItem(Text("up again"));
    submenu.AppendItem(Text("choose"));
    OSMenuHandle parent = menu.GetMenuHandle();
    parent.InsertMenuBeforeMenuID(-1);
    submenu.SetMenuItemHierarchicalID(1, parent.GetMenuID());
    EXPECT_EQ(Do(menu, "menu 1/1/1/2"), 1);
    EXPECT_TRUE(menu.chosenMenu == submenu);
    EXPECT_EQ(menu.chosenItem, 2);
    parent.RemoveFromMenuList();
}
