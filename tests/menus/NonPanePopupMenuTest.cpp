#include "menus/NonPanePopupMenu.h"
#include "tests/menus/MenuTest.h"

namespace {

Rect const kPlace{50, 50, 70, 150};

class NonPanePopup : public MenuTest {
protected:
    NonPanePopup()
        : menu(true) {}

    // What RunPopup answers and gives while the script is played; the outputs start as 88 and 99.
    bool Run(std::string const &script) {
        chosenID = 88;
        chosenItem = 99;
        desktop.Script(script);
        SetPortToGlog(glog);
        return menu.RunPopup(kPlace, chosenID, chosenItem);
    }

    NonPanePopupMenu menu;
    short chosenID = 88, chosenItem = 99;
};

} // namespace

TEST_F(NonPanePopup, BeginsEmptyWithTheStockMenu) {
    EXPECT_EQ(menu.GetMenuID(), 137);
    EXPECT_EQ(menu.CountItems(), 0);
    EXPECT_EQ(menu.GetFlags(), 0);
}

TEST_F(NonPanePopup, TakesAStoredMenu) {
    Store("<menu id='500'><item text='a'/><item text='b'/></menu>");
    NonPanePopupMenu own(500, true, true), shared(500, false, false);
    EXPECT_EQ(own.GetSelectedItem(), 1);
    EXPECT_EQ(shared.GetSelectedItem(), 0);
    EXPECT_TRUE(shared.GetMenuHandle() == OSMenuHandle::GetSingletonMenu(500));
    EXPECT_FALSE(own.GetMenuHandle() == OSMenuHandle::GetSingletonMenu(500));
}

TEST_F(NonPanePopup, GivesTheChosenItem) {
    ShowWindow();
    Add(menu, {"a", "b"});
    EXPECT_TRUE(Run("menu 2"));
    EXPECT_EQ(chosenID, 137);
    EXPECT_EQ(chosenItem, 2);
    EXPECT_EQ(menu.GetSelectedItem(), 2);
}

TEST_F(NonPanePopup, OpensOverTheRectangle) {
    ShowWindow();
    Add(menu, {"a", "b"});
    int middle = 0;
    Later const look(0.1, [&] { middle = MenuTracker::Open()->Panels()[0]->ItemTop(1) + 10; });
    Run("wait 0.5\nmenu 0");
    EXPECT_EQ(middle - 80, 60);
}

TEST_F(NonPanePopup, DismissedGivesNothing) {
    ShowWindow();
    Add(menu, {"a"});
    Run("menu 1");
    EXPECT_FALSE(Run("menu 0"));
    EXPECT_EQ(chosenID, 88);
    EXPECT_EQ(chosenItem, 99);
    OSMenuHandle handle = OSMenuHandle::CreateNewHierarchicalMenu();
    OSMenuHandle const before = handle;
    desktop.Script("key Escape");
    SetPortToGlog(glog);
    EXPECT_FALSE(menu.RunPopup(kPlace, handle, chosenItem));
    EXPECT_TRUE(handle == before);
    EXPECT_EQ(chosenItem, 99);
}

TEST_F(NonPanePopup, GivesTheSubmenuThatWasChosenFrom) {
    ShowWindow();
    Add(menu, {"a"});
    OSMenuHandle submenu = menu.AppendNewEmptyHierarchicalMenu(Text("more"));
    submenu.AppendItem(Text("x"));
    submenu.AppendItem(Text("y"));
    EXPECT_TRUE(Run("menu 2/2"));
    EXPECT_EQ(chosenID, submenu.GetMenuID());
    EXPECT_EQ(chosenItem, 2);
    OSMenuHandle handle;
    desktop.Script("menu 2/1");
    SetPortToGlog(glog);
    EXPECT_TRUE(menu.RunPopup(kPlace, handle, chosenItem));
    EXPECT_TRUE(handle == submenu);
    EXPECT_EQ(chosenItem, 1);
}

TEST_F(NonPanePopup, OfAStoredSubmenuItGivesTheMenuThatTheItemOpens) {
    Store("<menu id='500'><item text='a'/><item text='down' submenu='501'/></menu>"
          "<menu id='501'><item text='x'/><item text='further' submenu='502'/></menu>"
          "<menu id='502'><item text='y'/><item text='z'/></menu>");
    ShowWindow();
    NonPanePopupMenu stored(500, true, true);
    desktop.Script("menu 2/1");
    SetPortToGlog(glog);
    EXPECT_TRUE(stored.RunPopup(kPlace, chosenID, chosenItem));
    EXPECT_EQ(chosenID, 501);
    EXPECT_EQ(chosenItem, 1);
    desktop.Script("menu 2/2/2");
    SetPortToGlog(glog);
    EXPECT_TRUE(stored.RunPopup(kPlace, chosenID, chosenItem));
    EXPECT_EQ(chosenID, 501) << "however far below the choice was made";
    EXPECT_EQ(chosenItem, 2);
    EXPECT_EQ(stored.GetSelectedItem(), 2);
}

TEST_F(NonPanePopup, GivesItsOwnMenuForItsOwnItems) {
    ShowWindow();
    Add(menu, {"a", "b"});
    OSMenuHandle handle;
    desktop.Script("menu 2");
    SetPortToGlog(glog);
    EXPECT_TRUE(menu.RunPopup(kPlace, handle, chosenItem));
    EXPECT_TRUE(handle == menu.GetMenuHandle());
    EXPECT_EQ(chosenItem, 2);
}

TEST_F(NonPanePopup, RepaintsNothingWhenAnotherItemIsSelected) {
    class Counting : public NonPanePopupMenu {
    public:
        Counting()
            : NonPanePopupMenu(true) {}
        int repaints = 0;
        std::vector<short> changes;

    protected:
        void InvalPane() override { ++repaints; }
        void MenuChanged(short item) override { changes.push_back(item); }
    } counting;
    ShowWindow();
    Add(counting, {"a", "b"});
    counting.SelectItem(2);
    EXPECT_EQ(counting.GetSelectedItem(), 2);
    desktop.Script("menu 1");
    SetPortToGlog(glog);
    counting.RunPopup(kPlace, chosenID, chosenItem);
    EXPECT_EQ(counting.changes, (std::vector<short>{1, 2, 1}));
    EXPECT_EQ(counting.repaints, 0);
}

TEST_F(NonPanePopup, AnEmptyMenuDoesNotOpen) {
    ShowWindow();
    EXPECT_FALSE(Run(""));
    EXPECT_EQ(chosenItem, 99);
}

TEST_F(NonPanePopup, WithoutAStoredMenuItNeverOpens) {
    ShowWindow();
    NonPanePopupMenu none(31000, true, true);
    EXPECT_FALSE(none.GetMenuHandle().IsValid());
    EXPECT_FALSE(none.RunPopup(kPlace, chosenID, chosenItem));
}

TEST_F(NonPanePopup, MayBeDeletedWhileItIsOpen) {
    ShowWindow();
    std::unique_ptr<NonPanePopupMenu> dying(new NonPanePopupMenu(true));
    Add(*dying, {"a", "b"});
    Later const end(0.2, [&] { dying.reset(); });
    desktop.Script("wait 0.5\nmenu 2");
    SetPortToGlog(glog);
    EXPECT_FALSE(dying->RunPopup(kPlace, chosenID, chosenItem));
    EXPECT_EQ(chosenItem, 99);
}
