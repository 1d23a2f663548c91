#include "desktop/menus/MenuAccess.h"
#include "desktop/resources/ResourceError.h"
#include "tests/menus/MenuTest.h"
#include <boost/make_shared.hpp>
#include <set>

namespace {

class MenuHandle : public MenuTest {
protected:
    static OSMenuHandle Made(std::initializer_list<char const *> texts) {
        OSMenuHandle menu = OSMenuHandle::CreateNewHierarchicalMenu();
        for (char const *text : texts)
            menu.AppendItem(Text(text));
        return menu;
    }
    static std::string TextOf(OSMenuHandle const &menu, short item) {
        UString text = Text("before");
        menu.GetMenuItemText(item, text);
        return Ascii(text);
    }
    static std::string Texts(OSMenuHandle const &menu) {
        std::string all;
        for (short item = 1; item <= menu.NumMenuItems(); ++item)
            all += (item > 1 ? " " : "") + TextOf(menu, item);
        return all;
    }
};

class NoDecoration : public MenuItemDecorator {
public:
    short GetWidth() const override { return 0; }
    void Draw(Rect const &, bool, bool) override {}
};

} // namespace

// Handles

TEST_F(MenuHandle, WithoutAMenuIsInvalidAndTakesEverything) {
    OSMenuHandle none;
    EXPECT_FALSE(none.IsValid());
    EXPECT_EQ(none.GetMenuID(), 0);
    EXPECT_EQ(none.NumMenuItems(), 0);
    EXPECT_FALSE(none.IsEnabled());
    EXPECT_FALSE(none.IsItemEnabled(1));
    EXPECT_EQ(TextOf(none, 1), "");
    none.AppendItem(Text("a"));
    none.InsertItem(0, Text("a"));
    none.AppendMenuSeparator();
    none.DeleteItem(1);
    none.SetEnabled(true);
    none.SetMenuItemText(1, Text("a"));
    none.SetMenuItemCheck(1, true);
    none.SetMenuItemHierarchicalID(1, 5);
    none.ChangeItemAttributes(1, 1, 0);
    none.ApplyDecoratorToItem(1, boost::make_shared<NoDecoration>());
    none.SetMenuTitle(Text("t"));
    none.InsertMenuBeforeMenuID(-1);
    none.RemoveFromMenuList();
    none.clear();
    EXPECT_EQ(none.NumMenuItems(), 0);
    EXPECT_TRUE(none == OSMenuHandle());
}

TEST_F(MenuHandle, CopiesNameTheSameMenu) {
    OSMenuHandle first = Made({"a"});
    OSMenuHandle second(first), third;
    third = second;
    third.AppendItem(Text("b"));
    EXPECT_EQ(Texts(first), "a b");
    EXPECT_TRUE(first == third);
    EXPECT_FALSE(first == Made({"a"}));
}

TEST_F(MenuHandle, ClearingOneLeavesTheOthers) {
    OSMenuHandle first = Made({"a"});
    OSMenuHandle second = first;
    first.clear();
    EXPECT_FALSE(first.IsValid());
    EXPECT_EQ(Texts(second), "a");
}

TEST_F(MenuHandle, AssignedToItselfStays) {
    OSMenuHandle menu = Made({"a"});
    OSMenuHandle &same = menu;
    menu = same;
    EXPECT_EQ(Texts(menu), "a");
}

TEST_F(MenuHandle, TheMenuGoesWithItsLastHandle) {
    boost::shared_ptr<MenuItemDecorator> const decorator = boost::make_shared<NoDecoration>();
    {
        OSMenuHandle menu = Made({"a"});
        OSMenuHandle const other = menu;
        menu.ApplyDecoratorToItem(1, decorator);
        menu.clear();
        EXPECT_EQ(decorator.use_count(), 2);
    }
    EXPECT_EQ(decorator.use_count(), 1);
}

TEST_F(MenuHandle, MadeMenusHaveNumbersOfTheirOwn) {
    std::vector<OSMenuHandle> menus;
    std::set<short> ids;
    for (int i = 0; i < 1000; ++i) {
        menus.push_back(OSMenuHandle::CreateNewHierarchicalMenu());
        ids.insert(menus.back().GetMenuID());
    }
    EXPECT_EQ(ids.size(), 1000u);
    EXPECT_EQ(ids.count(0), 0u);
    EXPECT_EQ(ids.count(-1), 0u);
}

TEST_F(MenuHandle, NumbersComeRoundWithoutMeetingThoseInUse) {
    OSMenuHandle const kept = OSMenuHandle::CreateNewHierarchicalMenu();
    for (int i = 0; i < 70000; ++i)
        ASSERT_NE(OSMenuHandle::CreateNewHierarchicalMenu().GetMenuID(), kept.GetMenuID());
}

TEST_F(MenuHandle, ACloneIsAMenuOfItsOwnWithTheSameNumber) {
    OSMenuHandle const original = Made({"a", "b"});
    OSMenuHandle former = Made({"x"});
    OSMenuHandle clone = former;
    clone.CloneMenu(original);
    EXPECT_EQ(Texts(clone), "a b");
    EXPECT_EQ(clone.GetMenuID(), original.GetMenuID());
    EXPECT_FALSE(clone == original);
    EXPECT_EQ(Texts(former), "x") << "the menu that the handle named before has changed";
    clone.SetMenuItemText(1, Text("changed"));
    EXPECT_EQ(Texts(original), "a b");
}

TEST_F(MenuHandle, ACloneOfNoneIsInvalid) {
    OSMenuHandle menu = Made({"a"});
    menu.CloneMenu(OSMenuHandle());
    EXPECT_FALSE(menu.IsValid());
}

TEST_F(MenuHandle, MayBeClonedFromItself) {
    OSMenuHandle menu = Made({"a"});
    menu.CloneMenu(menu);
    EXPECT_EQ(Texts(menu), "a");
}

// Items

TEST_F(MenuHandle, ItemsComeWhereTheyAreAskedFor) {
    OSMenuHandle menu = Made({"b"});
    menu.InsertItem(0, Text("a"));
    menu.InsertItem(2, Text("d"));
    menu.InsertItem(2, Text("c"));
    menu.InsertItem(1000, Text("e"));
    menu.InsertItem(-5, Text("first"));
    EXPECT_EQ(Texts(menu), "first a b c d e");
    menu.DeleteItem(1);
    menu.DeleteItem(5);
    EXPECT_EQ(Texts(menu), "a b c d");
}

TEST_F(MenuHandle, ItemsThatDoNotExistReadAsNothingAndChangeNothing) {
    OSMenuHandle menu = Made({"a", "b"});
    for (short item : {-32768, -1, 0, 3, 32767}) {
        menu.DeleteItem(item);
        menu.SetMenuItemText(item, Text("x"));
        menu.SetMenuItemIcon(item, 3);
        menu.SetItemEnabled(item, true);
        menu.SetMenuItemCheck(item, true);
        menu.SetMenuItemHierarchicalID(item, 7);
        EXPECT_EQ(TextOf(menu, item), "") << item;
        EXPECT_EQ(menu.GetMenuItemIcon(item), 0) << item;
        EXPECT_FALSE(menu.IsItemEnabled(item)) << item;
        EXPECT_FALSE(menu.IsMenuItemHierarchical(item)) << item;
        EXPECT_EQ(menu.GetMenuItemHierarchicalID(item), 0) << item;
    }
    EXPECT_EQ(Texts(menu), "a b");
}

TEST_F(MenuHandle, KeepsWhatItemsAreTold) {
    OSMenuHandle menu = Made({"a", "b"});
    menu.SetMenuItemIcon(2, 4);
    menu.SetMenuItemHierarchicalID(2, 77);
    menu.DisableItem(2);
    EXPECT_EQ(menu.GetMenuItemIcon(2), 4);
    EXPECT_EQ(menu.GetMenuItemHierarchicalID(2), 77);
    EXPECT_TRUE(menu.IsMenuItemHierarchical(2));
    EXPECT_FALSE(menu.IsItemEnabled(2));
    EXPECT_TRUE(menu.IsItemEnabled(1));
    menu.SetItemEnabled(2, true);
    menu.SetMenuItemHierarchicalID(2, 0);
    EXPECT_TRUE(menu.IsItemEnabled(2));
    EXPECT_FALSE(menu.IsMenuItemHierarchical(2));
}

TEST_F(MenuHandle, AttributesAreSetAndCleared) {
    OSMenuHandle menu = Made({});
    menu.AppendItem(Text("a"), 0x40);
    menu.ChangeItemAttributes(1, 0x05, 0x40);
    EXPECT_EQ(MenuAccess::Of(menu)->Find(1)->attributes, 0x05);
}

TEST_F(MenuHandle, TextsAreTakenAsTheyStand) {
    OSMenuHandle menu = Made({"-", "(Grey", "Cut/X", "A;B"});
    EXPECT_EQ(Texts(menu), "- (Grey Cut/X A;B");
    EXPECT_TRUE(menu.IsItemEnabled(1));
}

TEST_F(MenuHandle, SeparatorsAreItemsThatCannotBeChosen) {
    OSMenuHandle menu = Made({"a"});
    menu.AppendMenuSeparator();
    menu.InsertMenuSeparator(0);
    EXPECT_EQ(menu.NumMenuItems(), 3);
    EXPECT_FALSE(menu.IsItemEnabled(1));
    EXPECT_FALSE(menu.IsItemEnabled(3));
    menu.SetItemEnabled(1, true);
    EXPECT_FALSE(MenuAccess::Of(menu)->CanChoose(1));
}

TEST_F(MenuHandle, TakesNoMoreItemsThanThereAreNumbers) {
    OSMenuHandle menu = Made({});
    for (int i = 0; i < 32800; ++i)
        menu.AppendItem(UString());
    EXPECT_EQ(menu.NumMenuItems(), 32767);
}

TEST_F(MenuHandle, OfADisabledMenuNothingCanBeChosen) {
    OSMenuHandle menu = Made({"a"});
    menu.SetEnabled(false);
    EXPECT_FALSE(menu.IsEnabled());
    EXPECT_TRUE(menu.IsItemEnabled(1));
    EXPECT_FALSE(MenuAccess::Of(menu)->CanChoose(1));
}

// The list of installed menus

TEST_F(MenuHandle, InstalledMenusAreFoundUntilTheyAreRemoved) {
    OSMenuHandle menu = Made({"a"}), found = Made({"other"});
    EXPECT_FALSE(OSMenuHandle::FindInMenuList(menu.GetMenuID(), found));
    EXPECT_EQ(Texts(found), "other");
    menu.InsertMenuBeforeMenuID(-1);
    EXPECT_TRUE(OSMenuHandle::FindInMenuList(menu.GetMenuID(), found));
    EXPECT_TRUE(found == menu);
    menu.RemoveFromMenuList();
    EXPECT_FALSE(OSMenuHandle::FindInMenuList(menu.GetMenuID(), found));
}

TEST_F(MenuHandle, InstalledTwiceMustBeRemovedTwice) {
    OSMenuHandle menu = Made({"a"}), found;
    menu.InsertMenuBeforeMenuID(-1);
    menu.InsertMenuBeforeMenuID(-1);
    menu.RemoveFromMenuList();
    EXPECT_TRUE(OSMenuHandle::FindInMenuList(menu.GetMenuID(), found));
    menu.RemoveFromMenuList();
    EXPECT_FALSE(OSMenuHandle::FindInMenuList(menu.GetMenuID(), found));
}

TEST_F(MenuHandle, OfTwoInstalledMenusOfOneNumberTheOneInFrontIsFound) {
    OSMenuHandle first = Made({"first"}), second, found;
    second.CloneMenu(first);
    first.InsertMenuBeforeMenuID(-1);
    second.InsertMenuBeforeMenuID(first.GetMenuID());
    ASSERT_TRUE(OSMenuHandle::FindInMenuList(first.GetMenuID(), found));
    EXPECT_TRUE(found == second);
    first.RemoveFromMenuList();
    second.RemoveFromMenuList();
}

TEST_F(MenuHandle, AnInstalledMenuThatGoesIsFoundNoLonger) {
    OSMenuHandle menu = Made({"a"}), found;
    short const id = menu.GetMenuID();
    menu.InsertMenuBeforeMenuID(-1);
    menu.clear();
    EXPECT_FALSE(OSMenuHandle::FindInMenuList(id, found));
}

// Stored menus

TEST_F(MenuHandle, TheStockMenuIsEmpty) {
    OSMenuHandle const menu = OSMenuHandle::CopyPrototypeMenu(137);
    ASSERT_TRUE(menu.IsValid());
    EXPECT_EQ(menu.GetMenuID(), 137);
    EXPECT_EQ(menu.NumMenuItems(), 0);
    EXPECT_TRUE(menu.IsEnabled());
}

TEST_F(MenuHandle, OfAnUnknownNumberThereIsNoStoredMenu) {
    for (short id : {-32768, -1, 0, 1, 32767}) {
        EXPECT_FALSE(OSMenuHandle::CopyPrototypeMenu(id).IsValid()) << id;
        EXPECT_FALSE(OSMenuHandle::GetSingletonMenu(id).IsValid()) << id;
        EXPECT_FALSE(OSMenuHandle::IsSingletonMenu(id)) << id;
    }
}

TEST_F(MenuHandle, AStoredMenuHasWhatItsFileSays) {
    Store("<menu id='500' title='Edit'><item text='Cut' icon='2' checked='1'/><separator/>"
          "<item text='More' submenu='501' disabled='1'/></menu>");
    OSMenuHandle const menu = OSMenuHandle::CopyPrototypeMenu(500);
    ASSERT_EQ(menu.NumMenuItems(), 3);
    EXPECT_EQ(TextOf(menu, 1), "Cut");
    EXPECT_EQ(menu.GetMenuItemIcon(1), 2);
    EXPECT_TRUE(MenuAccess::Of(menu)->Find(1)->checked);
    EXPECT_TRUE(MenuAccess::Of(menu)->Find(2)->separator);
    EXPECT_EQ(menu.GetMenuItemHierarchicalID(3), 501);
    EXPECT_FALSE(menu.IsItemEnabled(3));
    EXPECT_EQ(Ascii(MenuAccess::Of(menu)->title), "Edit");
}

TEST_F(MenuHandle, PrototypesAreCopiedAndSingletonsShared) {
    Store("<menu id='500'><item text='a'/></menu>");
    OSMenuHandle copy = OSMenuHandle::CopyPrototypeMenu(500);
    copy.AppendItem(Text("own"));
    EXPECT_EQ(OSMenuHandle::CopyPrototypeMenu(500).NumMenuItems(), 1);
    OSMenuHandle shared = OSMenuHandle::GetSingletonMenu(500);
    shared.AppendItem(Text("for all"));
    EXPECT_EQ(OSMenuHandle::GetSingletonMenu(500).NumMenuItems(), 2);
    EXPECT_TRUE(OSMenuHandle::GetSingletonMenu(500) == shared);
    EXPECT_TRUE(OSMenuHandle::IsSingletonMenu(500));
}

TEST_F(MenuHandle, AnotherLanguageHasItsOwnMenus) {
    directory.Write("menus/de.xml", "<menus><menu id='500'><item text='Kopieren'/></menu></menus>");
    Store("<menu id='500'><item text='Copy'/></menu><menu id='501'><item text='Only here'/></menu>");
    EXPECT_EQ(Texts(OSMenuHandle::GetSingletonMenu(500)), "Copy");
    Resources::Instance().SetLanguage("de");
    EXPECT_EQ(Texts(OSMenuHandle::GetSingletonMenu(500)), "Kopieren");
    EXPECT_EQ(Texts(OSMenuHandle::GetSingletonMenu(501)), "Only here");
}

TEST_F(MenuHandle, ABrokenFileOfMenusIsAnError) {
    for (char const *broken :
         {"<menu/>", "<menu id='0'/>", "<menu id='-4'/>", "<menu id='40000'/>", "<other id='1'/>",
          "<menu id='1'><item/></menu>", "<menu id='1'><thing text='a'/></menu>",
          "<menu id='1'><item text='a' icon='-1'/></menu>",
          "<menu id='1'><item text='a' checked='2'/></menu>"}) {
        TemporaryDirectory own;
        own.Write("menus/en.xml", std::string("<menus>") + broken + "</menus>");
        Resources::Instance().AddDirectory(own.Path());
        EXPECT_THROW(OSMenuHandle::IsSingletonMenu(1), ResourceError) << broken;
        Resources::Instance().Open(Resources::FindDirectory());
    }
}

TEST_F(MenuHandle, AMenuThatIsShownStaysAsItIsWhileItIsChanged) {
    OSMenuHandle menu = Made({"a", "b"});
    Menu const shown = *MenuAccess::Of(menu);
    menu.DeleteItem(1);
    menu.SetMenuItemText(1, Text("changed"));
    EXPECT_EQ(shown.Count(), 2);
    EXPECT_EQ(Ascii(shown.Find(2)->text), "b");
    EXPECT_EQ(Texts(menu), "changed");
}
