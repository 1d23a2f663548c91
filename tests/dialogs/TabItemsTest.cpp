#include "host/LocalizedStrings.h"
#include "tabs/TabPane.h"
#include "tests/dialogs/DialogTest.h"

namespace {

std::string const kPlace = "<BoundsRect top=\"10\" left=\"20\" bottom=\"27\" right=\"140\"/>";
std::string const kNames = "<Items><Tab>Notes</Tab><Tab>Chords</Tab><Tab>Lyrics</Tab></Items>";

class TabItemsTest : public DialogTest {
protected:
    TabPane *LoadTabs(std::string const &keys) { return LoadOne<TabPane>("Tabs", kPlace + keys); }
};

} // namespace

TEST_F(TabItemsTest, ARowHasItsTabs) {
    TabPane *const tabs = LoadTabs(kNames);
    ASSERT_EQ(tabs->CountItems(), 3);
    EXPECT_EQ(Utf8::FromUString(tabs->GetItemName(1)), "Chords");
    EXPECT_EQ(Utf8::FromUString(tabs->GetItemShortName(1)), "Chords");
    EXPECT_EQ(tabs->GetSelectedItem(), 0);
    EXPECT_EQ(tabs->GetID(), 1);
    EXPECT_EQ(BoxOf(tabs), (Rect{10, 20, 27, 140}));
}

TEST_F(TabItemsTest, ANameMayBeANumberOrNothing) {
    TabPane *const tabs = LoadTabs("<Items><Tab>1</Tab><Tab/></Items>");
    ASSERT_EQ(tabs->CountItems(), 2);
    EXPECT_EQ(Utf8::FromUString(tabs->GetItemName(0)), "1");
    EXPECT_TRUE(tabs->GetItemName(1).empty());
}

TEST_F(TabItemsTest, ANameMayComeFromAStringList) {
    TabPane *const tabs = LoadTabs("<Items><Tab list=\"4323\" index=\"1\"/></Items>");
    ASSERT_EQ(tabs->CountItems(), 1);
    EXPECT_EQ(tabs->GetItemName(0), LocalizedStrings::GetString(4323, 1));
    EXPECT_FALSE(tabs->GetItemName(0).empty());
}

TEST_F(TabItemsTest, ARowMayBeEmpty) {
    TabPane *const tabs = LoadTabs("<Items/>");
    EXPECT_EQ(tabs->CountItems(), 0);
    EXPECT_EQ(tabs->GetSelectedItem(), -1);
    ShowGlog(tabs->GetGlog(), kShowGlog);
}

TEST_F(TabItemsTest, TheListOfTabsMustBeThere) {
    EXPECT_TRUE(Holds(ComplaintAboutItem("Tabs", kPlace), "Items"));
}

TEST_F(TabItemsTest, TheSelectedTabIsTheOneThatIsNamed) {
    EXPECT_EQ(LoadTabs(kNames + "<Selected>2</Selected>")->GetSelectedItem(), 2);
    EXPECT_EQ(LoadTabs("<Items/><Selected>0</Selected>")->GetSelectedItem(), -1);
}

TEST_F(TabItemsTest, ASelectedTabThatIsNotThereIsAnError) {
    EXPECT_TRUE(Holds(ComplaintAboutItem("Tabs", kNames + "<Selected>3</Selected>"),
                      "there is no tab 3: there are 3, counted from 0"));
}

TEST_F(TabItemsTest, RefusesNumbersOutOfTheirRanges) {
    for (std::string const key : {"<Selected>-1</Selected>", "<Selected>32768</Selected>",
                                  "<FitToRect>2</FitToRect>", "<Items><Item type=\"Box\"/></Items>"})
        EXPECT_NE(ComplaintAboutItem("Tabs", key + kNames), "no complaint") << key;
}

TEST_F(TabItemsTest, TabsMayHaveShortNames) {
    TabPane *const tabs = LoadTabs(kNames + "<ShortNames><Tab>N</Tab><Tab/></ShortNames>");
    EXPECT_EQ(Utf8::FromUString(tabs->GetItemShortName(0)), "N");
    EXPECT_TRUE(tabs->GetItemShortName(1).empty());
    EXPECT_EQ(Utf8::FromUString(tabs->GetItemShortName(2)), "Lyrics");
    EXPECT_EQ(LoadTabs("<Items/><ShortNames><Tab>N</Tab></ShortNames>")->CountItems(), 0);
}

TEST_F(TabItemsTest, ARowMayFitItsBox) {
    TabPane *const tabs = LoadTabs(kNames + "<FitToRect>1</FitToRect>");
    EXPECT_LE(BoxOf(tabs).right, 140);
    EXPECT_EQ(BoxOf(tabs).right, tabs->GetOptimalRect().right);
}

TEST_F(TabItemsTest, InAGroupARowHasItsOwnSize) {
    glogRec *const glog =
        Load(Dialog("<Item type=\"Group\"><Items>" + Item("Tabs", kPlace + kNames) + "</Items></Item>"));
    ShowGlog(glog, kShowGlog);
    TabPane *const tabs = dynamic_cast<TabPane *>(GetGlogItem(glog, 1));
    ASSERT_NE(tabs, nullptr);
    Rect const row = tabs->GetOptimalRect(), place = tabs->GetDrawRectangle();
    EXPECT_EQ(place.right - place.left, row.right - row.left + 1);
    EXPECT_EQ(place.bottom - place.top, 17);
}

TEST_F(TabItemsTest, WatchersHearOfTheSelection) {
    TabPane *const tabs = LoadTabs(kNames);
    ShowGlog(tabs->GetGlog(), kShowGlog);
    Rect const tab = tabs->GetItemBox(1);
    desktop.TakeMessages();
    desktop.Play("click " + std::to_string(tab.left + 5) + " 18");
    std::string heard;
    for (std::string const &line : desktop.TakeMessages())
        heard += line;
    EXPECT_TRUE(Holds(heard, "\"message\":\"TabSelected\",\"item\":1,\"before\":0")) << heard;
}

TEST_F(TabItemsTest, TheDumpTellsTheSelectedTab) {
    TabPane *const tabs = LoadTabs(kNames + "<Selected>1</Selected><FitToRect>1</FitToRect>");
    tabs->FitIntoRect({10, 20, 27, 60});
    std::string const dump = Dump(tabs->GetGlog());
    EXPECT_TRUE(Holds(dump, "\"selectedItem\":1,\"items\":3,\"hidden\":3,\"name\":\"Chords\"")) << dump;
}
