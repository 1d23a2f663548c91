#include "menus/DurationNotePane.h"
#include "menus/ScrollBarPopupMenuPane.h"
#include "tests/dialogs/DialogTest.h"
#include "tests/dialogs/OneRecord.h"
#include <vector>

namespace {

std::string const kPlace = "<BoundsRect top=\"10\" left=\"20\" bottom=\"30\" right=\"140\"/>";

std::string MenuItem(std::string const &text, std::string const &more = "") {
    return "<MenuItem><Text>" + text + "</Text>" + more + "</MenuItem>";
}
std::string MenuItems(std::string const &items) { return "<MenuItems>" + items + "</MenuItems>"; }

class MenuItemsTest : public DialogTest {
protected:
    PopMPane *LoadMenu(std::string const &keys) { return LoadOne<PopMPane>("PopUpMenu", kPlace + keys); }
    static std::string NameIn(PopMPane &menu, short item) {
        UString name;
        menu.GetItemName(item, name);
        return Utf8::FromUString(name);
    }
    std::vector<std::string> Messages(std::string const &script) {
        desktop.TakeMessages();
        desktop.Play(script);
        return desktop.TakeMessages();
    }
};

} // namespace

// Pop-up menus

TEST_F(MenuItemsTest, APopUpHasItsItems) {
    PopMPane *const menu = LoadMenu(
        MenuItems(MenuItem("a") + MenuItem("-") + MenuItem("c", "<Icon>4</Icon><Disabled>1</Disabled>")));
    ASSERT_EQ(menu->CountItems(), 3);
    EXPECT_EQ(NameIn(*menu, 1), "a");
    EXPECT_FALSE(menu->ItemIsEnabled(2));
    EXPECT_FALSE(menu->ItemIsEnabled(3));
    EXPECT_EQ(menu->GetMenuHandle().GetMenuItemIcon(3), 4);
    EXPECT_EQ(menu->GetSelectedItem(), 1);
    EXPECT_EQ(BoxOf(menu), (Rect{10, 20, 30, 140}));
}

TEST_F(MenuItemsTest, APopUpWithoutAnythingIsEmpty) {
    PopMPane *const menu = LoadOne<PopMPane>("PopUpMenu", "");
    EXPECT_EQ(menu->CountItems(), 0);
    EXPECT_EQ(menu->GetMenuID(), 137);
    EXPECT_EQ(BoxOf(menu), (Rect{0, 0, 0, 0}));
}

TEST_F(MenuItemsTest, SubmenusStandWithinTheirItems) {
    PopMPane *const menu = LoadMenu(MenuItems(
        MenuItem("a") + MenuItem("more", "<SubmenuItems>" + MenuItem("x") +
                                             MenuItem("further", "<SubmenuItems>" + MenuItem("y") +
                                                                     MenuItem("-") + "</SubmenuItems>") +
                                             "</SubmenuItems>")));
    menu->InstallSubMenus();
    OSMenuHandle below, last;
    ASSERT_TRUE(OSMenuHandle::FindInMenuList(menu->GetMenuHandle().GetMenuItemHierarchicalID(2), below));
    ASSERT_EQ(below.NumMenuItems(), 2);
    ASSERT_TRUE(OSMenuHandle::FindInMenuList(below.GetMenuItemHierarchicalID(2), last));
    EXPECT_EQ(last.NumMenuItems(), 2);
    EXPECT_FALSE(last.IsItemEnabled(2));
    menu->RemoveSubMenus();
}

TEST_F(MenuItemsTest, SubmenusFiftyDeepAreRefused) {
    std::string items = MenuItem("choose");
    for (int i = 0; i < 50; ++i)
        items = MenuItem("down", "<SubmenuItems>" + items + "</SubmenuItems>");
    EXPECT_TRUE(Holds(ComplaintAboutItem("PopUpMenu", MenuItems(items)), "there is no key <SubmenuItems>"));
}

TEST_F(MenuItemsTest, TheCurrentItemIsTheOneThatIsNamed) {
    EXPECT_EQ(
        LoadMenu(MenuItems(MenuItem("a") + MenuItem("b")) + "<Selected>2</Selected>")->GetSelectedItem(), 2);
    EXPECT_EQ(LoadMenu(MenuItems(MenuItem("a")) + "<Selected>0</Selected>")->GetSelectedItem(), 0);
}

TEST_F(MenuItemsTest, ACurrentItemThatIsNotThereIsAnError) {
    EXPECT_TRUE(Holds(ComplaintAboutItem("PopUpMenu", MenuItems(MenuItem("a")) + "<Selected>2</Selected>"),
                      "there is no item 2: the menu has 1"));
}

TEST_F(MenuItemsTest, AMenuThatIsNotStoredIsAnError) {
    for (std::string const type : {"PopUpMenu", "ScrollBarPopUpMenu"})
        EXPECT_TRUE(Holds(ComplaintAboutItem(type, "<MenuID>138</MenuID>"), "there is no menu of the id 138"))
            << type;
}

TEST_F(MenuItemsTest, RefusesNumbersOutOfTheirRanges) {
    for (std::string const key :
         {"<Flags>256</Flags>", "<Flags>-1</Flags>", "<Selected>-1</Selected>", "<Pulldown>4</Pulldown>",
          "<Face>256</Face>", "<Enabled>2</Enabled>", "<IconOnly>2</IconOnly>", "<Truncate>Start</Truncate>",
          "<MenuID>32768</MenuID>", "<MenuItems><MenuItem/></MenuItems>"})
        EXPECT_NE(ComplaintAboutItem("PopUpMenu", key), "no complaint") << key;
    EXPECT_NE(ComplaintAboutItem("PopUpMenu", MenuItems(MenuItem("a", "<Icon>-1</Icon>"))), "no complaint");
}

TEST_F(MenuItemsTest, RefusesMoreItemsThanAMenuHas) {
    std::string items;
    for (int i = 0; i < 32768; ++i)
        items += "<MenuItem><Text/></MenuItem>";
    EXPECT_TRUE(Holds(ComplaintAboutItem("PopUpMenu", MenuItems(items)), "at most 32767 items"));
}

TEST_F(MenuItemsTest, APopUpFitsItsItem) {
    PopMPane *const wide = LoadMenu(MenuItems(MenuItem("a rather long name of an item, wider than its box")) +
                                    "<FitToItem>1</FitToItem>");
    EXPECT_GT(BoxOf(wide).right, 140);
    PopMPane *const narrow = LoadMenu(MenuItems(MenuItem("a")) + "<FitToItem>1</FitToItem>");
    EXPECT_LT(BoxOf(narrow).right, 70);
}

TEST_F(MenuItemsTest, InAGroupAPopUpHasTheSizeOfItsLayoutProperties) {
    glogRec *const grouped = Load(
        Dialog("<Item type=\"Group\"><Items>" +
               Item("PopUpMenu", kPlace + MenuItems(MenuItem("a")) + "<Layout><Width>77</Width></Layout>") +
               "</Items></Item>"));
    ShowGlog(grouped, kShowGlog);
    Rect const place = GetGlogItem(grouped, 1)->GetDrawRectangle();
    EXPECT_EQ(place.right - place.left, 77);
    EXPECT_EQ(place.bottom - place.top, 20);
}

TEST_F(MenuItemsTest, ADisabledPopUpDoesNotOpen) {
    PopMPane *const menu = LoadMenu(MenuItems(MenuItem("a")) + "<Enabled>0</Enabled>");
    EXPECT_FALSE(menu->GetMenuHandle().IsEnabled());
}

TEST_F(MenuItemsTest, WatchersHearOfChangesAndChoices) {
    PopMPane *const menu =
        LoadMenu(MenuItems(MenuItem("a") + MenuItem("b") +
                           MenuItem("more", "<SubmenuItems>" + MenuItem("x") + "</SubmenuItems>")));
    ShowGlog(menu->GetGlog(), kShowGlog);
    std::string heard;
    for (std::string const &line : Messages("click 60 20\nmenu 2\nclick 60 20\nmenu 3/1"))
        heard += line;
    EXPECT_TRUE(Holds(heard, "\"message\":\"MenuChange\",\"item\":2")) << heard;
    EXPECT_TRUE(Holds(heard, "\"message\":\"ItemSelected\",\"submenu\":\"\",\"item\":2")) << heard;
    EXPECT_TRUE(Holds(heard, "\"message\":\"ItemSelected\",\"submenu\":\"more\",\"item\":1")) << heard;
}

TEST_F(MenuItemsTest, TheDumpTellsTheCurrentItem) {
    PopMPane *const menu = LoadMenu(MenuItems(MenuItem("a") + MenuItem("b")) + "<Selected>2</Selected>");
    EXPECT_TRUE(
        Holds(Dump(menu->GetGlog()), "\"selectedItem\":2,\"items\":2,\"name\":\"b\",\"enabled\":true"))
        << Dump(menu->GetGlog());
}

TEST_F(MenuItemsTest, ARecordMakesAPopUp) {
    glogRec *const loaded = LoadOneRecord({43, 2, 10, 20, 30, 140, 137});
    PopMPane *const menu = dynamic_cast<PopMPane *>(GetGlogItem(loaded, 1));
    ASSERT_NE(menu, nullptr);
    EXPECT_EQ(menu->GetFlags(), 2);
    EXPECT_EQ(BoxOf(menu), (Rect{10, 20, 30, 140}));
    EXPECT_EQ(menu->GetMenuID(), 137);
}

TEST_F(MenuItemsTest, ARecordOfAMenuThatIsNotThereIsRefused) {
    EXPECT_TRUE(Holds(Complaint([&] {
                          LoadOneRecord({43, 0, 10, 20, 30, 140, 1});
                      }),
                      "there is no menu of the id 1"));
    EXPECT_NE(Complaint([&] { LoadOneRecord({43, 0, 10, 20, 30}); }), "no complaint");
    EXPECT_NE(Complaint([&] { LoadOneRecord({43, 0, 10, 20, 30, 140, 137, 1}); }), "no complaint");
}

// In scroll bars

TEST_F(MenuItemsTest, APopUpForAScrollBarHasItsHeight) {
    ScrollBarPopupMenuPane *const menu =
        LoadOne<ScrollBarPopupMenuPane>("ScrollBarPopUpMenu", kPlace + MenuItems(MenuItem("50 %")));
    EXPECT_EQ(menu->CountItems(), 1);
    EXPECT_EQ(menu->GetMenuBackgroundColor(), kPopupBackScrollBar);
    glogRec *const grouped =
        Load(Dialog("<Item type=\"Group\"><Items>" +
                    Item("ScrollBarPopUpMenu", kPlace + MenuItems(MenuItem("50 %"))) + "</Items></Item>"));
    ShowGlog(grouped, kShowGlog);
    Rect const box = BoxOf(GetGlogItem(grouped, 1));
    EXPECT_EQ(box.bottom - box.top, 16);
    EXPECT_EQ(box.right - box.left, 120);
}

// Durations

TEST_F(MenuItemsTest, ADurationIsAFraction) {
    DurationNotePane *const notes =
        LoadOne<DurationNotePane>("DurationNote", kPlace + "<Duration numerator=\"3\" denominator=\"8\"/>");
    EXPECT_EQ(notes->GetDurationValue().first, 3);
    EXPECT_EQ(notes->GetDurationValue().second, 8);
    EXPECT_EQ(BoxOf(notes), (Rect{10, 20, 30, 140}));
    EXPECT_TRUE(Holds(Dump(notes->GetGlog()), "\"numerator\":3,\"denominator\":8"));
}

TEST_F(MenuItemsTest, ADurationMayOfferAFew) {
    DurationNotePane *const notes = LoadOne<DurationNotePane>(
        "DurationNote", kPlace + "<Duration numerator=\"1\" denominator=\"4\"/><MenuDurations>"
                                 "<Duration numerator=\"1\" denominator=\"2\"/>"
                                 "<Duration numerator=\"1\" denominator=\"8\"/></MenuDurations>");
    ShowGlog(notes->GetGlog(), kShowGlog);
    std::string heard;
    for (std::string const &line : Messages("click 60 20\nmenu 2"))
        heard += line;
    EXPECT_EQ(notes->GetDurationValue().second, 8);
    EXPECT_TRUE(Holds(heard, "\"message\":\"DurationValueChanged\",\"numerator\":1,\"denominator\":8"))
        << heard;
}

TEST_F(MenuItemsTest, ADisabledDurationOpensNoMenu) {
    DurationNotePane *const notes =
        LoadOne<DurationNotePane>("DurationNote", kPlace + "<Enabled>0</Enabled>");
    ShowGlog(notes->GetGlog(), kShowGlog);
    EXPECT_THROW(desktop.Play("click 60 20\nmenu 2"), ScriptError);
}

TEST_F(MenuItemsTest, RefusesFractionsOfNothing) {
    for (std::string const fraction :
         {"numerator=\"0\" denominator=\"4\"", "numerator=\"1\" denominator=\"0\"", "numerator=\"1\"",
          "numerator=\"-1\" denominator=\"4\"", "numerator=\"1\" denominator=\"99999\""})
        EXPECT_NE(ComplaintAboutItem("DurationNote", "<Duration " + fraction + "/>"), "no complaint")
            << fraction;
}
