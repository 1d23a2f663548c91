#include "host/CompoundPane.h"
#include "host/LocalizedStrings.h"
#include "host/TarnError.h"
#include "tests/VirtualPlace.h"
#include "tests/tabs/TabTest.h"

namespace {

class TabPaneTest : public TabTest {};

boost::shared_ptr<XMLLib::ContainerItem> ItemOf(Rect const &box) {
    TestItem item;
    item.Box("BoundsRect", box);
    return item.Container();
}

} // namespace

// Creation

TEST_F(TabPaneTest, HasItsBasesInOrder) {
    TabPane *const pane = Make();
    char const *const start = reinterpret_cast<char const *>(pane);
    auto const place = [start](void const *base) { return static_cast<char const *>(base) - start; };
    EXPECT_EQ(place(static_cast<Provider<TabPane_Listener> *>(pane)), 0);
    EXPECT_LT(0, place(static_cast<GlogPane *>(pane)));
}

TEST_F(TabPaneTest, HasItsOperationsInOrderBehindTheDestructor) {
    ExpectInOrder(kAfterDestructor, &TabPane::GetTabHeight, &TabPane::GetMinTabWidth,
                  &TabPane::GetNameExtraWidth, &TabPane::ShouldAllowTabSwitch, &TabPane::WindowIsActive,
                  &TabPane::GetTabEndWidth, &TabPane::GetTabBodyWidth, &TabPane::GetIconSet,
                  &TabPane::AdjustNameBox, &TabPane::DecorateTab, &TabPane::SetTextColor, &TabPane::SetupFont,
                  &TabPane::DefaultTextStyle, &TabPane::GetIcon);
}

TEST_F(TabPaneTest, IsMadeWithABox) {
    TabPane *const pane = Make();
    EXPECT_EQ(pane->GetID(), 0);
    EXPECT_EQ(pane->GetGlog(), glog);
    EXPECT_EQ(BoxOf(*pane), (Rect{20, 10, 37, 310}));
    EXPECT_EQ(pane->CountItems(), 3);
    EXPECT_EQ(pane->GetSelectedItem(), 0);
}

TEST_F(TabPaneTest, IsMadeWithANumber) {
    TabPane *const pane = new TabPane(glog, 7, Items({"a"}), 99);
    EXPECT_EQ(pane->GetID(), 7);
    EXPECT_EQ(pane->GetSelectedItem(), 0);
    EXPECT_EQ(BoxOf(*pane), (Rect{0, 0, 0, 0}));
}

TEST_F(TabPaneTest, SelectsNothingWhereThereIsNothing) {
    EXPECT_EQ(Make({})->GetSelectedItem(), -1);
    EXPECT_EQ((new TabPane(glog, 7, {}, 0))->GetSelectedItem(), -1);
}

TEST_F(TabPaneTest, WithoutAGlogIsNotAttachedAndStillKeepsItsItems) {
    std::unique_ptr<TabPane> const first(new TabPane(nullptr, Rect{0, 0, 17, 100}, Items({"a"}), 0));
    std::unique_ptr<TabPane> const second(new TabPane(nullptr, 4, Items({"a"}), 0));
    TestItem sheet;
    std::unique_ptr<TabPane> const third(new TabPane(nullptr, sheet.Sheet()));
    for (TabPane *pane : {first.get(), second.get(), third.get()}) {
        EXPECT_EQ(pane->GetGlog(), nullptr);
        int const before = pane->CountItems();
        pane->InsertItem(0, TabPane::Item(Text("b")));
        pane->SetSelectedItem(0);
        pane->FitIntoRect({0, 0, 17, 40});
        EXPECT_EQ(pane->CountItems(), before + 1);
    }
}

TEST_F(TabPaneTest, IsMadeFromASheet) {
    TestItem item;
    item.Box("BoundsRect", {20, 30, 37, 230});
    boost::shared_ptr<XMLLib::ContainerItem> const names = XMLLib::CreateContainer(Text("Items"));
    names->AddUStringItem(Text("Tab"), Text("Notes"));
    names->AddSIntItem(Text("Tab"), 7);
    names->AddUStringItem(Text("Tab"), Text("Chords"));
    item.Container()->AddItem(Text("Items"), names);
    TabPane *const pane = new TabPane(glog, item.Sheet());
    EXPECT_EQ(pane->GetID(), -1);
    EXPECT_EQ(BoxOf(*pane), (Rect{20, 30, 37, 230}));
    ASSERT_EQ(pane->CountItems(), 2) << "what is no string is left out";
    EXPECT_EQ(pane->GetItemName(1), Text("Chords"));
    EXPECT_EQ(pane->GetItemShortName(1), Text("Chords"));
    EXPECT_TRUE(pane->GetEnableItem(1));
    EXPECT_NE(pane->GetItem(1).textLayout, nullptr);
    EXPECT_EQ(pane->GetSelectedItem(), 0);
}

TEST_F(TabPaneTest, ASheetWithoutNamesSelectsNothing) {
    TestItem item;
    item.Container()->AddItem(Text("Items"), XMLLib::CreateContainer(Text("Items")));
    TabPane *const pane = new TabPane(glog, item.Sheet());
    EXPECT_EQ(pane->CountItems(), 0);
    EXPECT_EQ(pane->GetSelectedItem(), -1);
}

TEST_F(TabPaneTest, ASheetWithoutTheListOfNamesIsAFailure) {
    GlogStyleSheet sheet(ItemOf({20, 30, 37, 230}));
    short const before = CountGlogItems(glog);
    EXPECT_THROW(new TabPane(glog, &sheet), TarnError);
    EXPECT_EQ(CountGlogItems(glog), before);
}

// Looks that subclasses may change

TEST_F(TabPaneTest, HasTheUsualLooks) {
    TabPane *const pane = Make();
    EXPECT_EQ(pane->GetTabHeight(), 17);
    EXPECT_EQ(pane->GetMinTabWidth(), 0);
    EXPECT_EQ(pane->GetNameExtraWidth(1), 0);
    EXPECT_TRUE(pane->WindowIsActive());
    EXPECT_EQ(pane->GetTabEndWidth(), 6);
    EXPECT_EQ(pane->GetTabBodyWidth(), 18);
    EXPECT_EQ(pane->GetIconSet(), 1000);
    EXPECT_EQ(pane->AdjustNameBox({1, 2, 3, 4}, 1), (Rect{1, 2, 3, 4}));
    EXPECT_EQ(pane->DefaultTextStyle(), 1);
}

TEST_F(TabPaneTest, AllowsSwitchesToAnotherTab) {
    TabPane *const pane = Make();
    EXPECT_TRUE(pane->ShouldAllowTabSwitch(0, 1));
    EXPECT_TRUE(pane->ShouldAllowTabSwitch(2, 0));
    EXPECT_FALSE(pane->ShouldAllowTabSwitch(1, 1));
}

// Items

TEST_F(TabPaneTest, AnItemWithOneNameHasItAsItsShortOneToo) {
    TabPane::Item const one(Text("Notes"));
    EXPECT_EQ(one.shortName, Text("Notes"));
    EXPECT_TRUE(one.enabled);
    TabPane::Item const two(Text("Notes"), Text("N"));
    EXPECT_EQ(two.name, Text("Notes"));
    EXPECT_EQ(two.shortName, Text("N"));
    EXPECT_NE(one.textLayout, two.textLayout);
}

TEST_F(TabPaneTest, ItemsComeAndGoWhereTheyAreWanted) {
    TabPane *const pane = Make({"a", "c"});
    pane->InsertItem(1, TabPane::Item(Text("b")));
    pane->InsertItem(3, TabPane::Item(Text("d")));
    pane->DeleteItem(0);
    ASSERT_EQ(pane->CountItems(), 3);
    EXPECT_EQ(pane->GetItemName(0), Text("b"));
    EXPECT_EQ(pane->GetItemName(2), Text("d"));
    pane->DeleteAllItems();
    EXPECT_EQ(pane->CountItems(), 0);
}

TEST_F(TabPaneTest, ChangesOfTheListLeaveTheSelectionAlone) {
    TabPane *const pane = Make();
    pane->SetSelectedItem(2);
    TabEar const ear(pane);
    pane->InsertItem(0, TabPane::Item(Text("x")));
    pane->DeleteItem(3);
    pane->DeleteItem(2);
    EXPECT_EQ(pane->GetSelectedItem(), 2) << "though there are but two items";
    EXPECT_EQ(ear.heard, "");
}

TEST_F(TabPaneTest, ChangesOfTheListAreLaidOutAndRepainted) {
    TabPane *const pane = Make({"Notes", "Chords"});
    Show();
    Rect const whole = BoxOf(*pane);
    int const before = pane->GetItemBox(1).left;
    pane->SetItemName(0, Text("Notes and rests"));
    EXPECT_GT(pane->GetItemBox(1).left, before);
    EXPECT_EQ(Repainted(), (std::vector<Rect>{whole}));
    pane->SetItemShortName(0, Text("N"));
    EXPECT_EQ(Repainted(), (std::vector<Rect>{whole}));
    pane->InsertItem(0, TabPane::Item(Text("x")));
    EXPECT_EQ(Repainted(), (std::vector<Rect>{whole}));
    pane->DeleteItem(0);
    EXPECT_EQ(Repainted(), (std::vector<Rect>{whole}));
    pane->DeleteAllItems();
    EXPECT_EQ(Repainted(), (std::vector<Rect>{whole}));
}

TEST_F(TabPaneTest, ADisabledTabIsRememberedAndLooksAndClicksLikeTheOthers) {
    TabPane *const pane = Make();
    Show();
    Lines const before = DrawingOf(*pane);
    Repainted();
    pane->SetEnableItem(1, false);
    EXPECT_EQ(Repainted(), (std::vector<Rect>{BoxOf(*pane)}));
    EXPECT_FALSE(pane->GetEnableItem(1));
    EXPECT_EQ(DrawingOf(*pane), before);
    EXPECT_EQ(ResultOfClick("click" + Middle(*pane, 1)), -1);
    EXPECT_EQ(pane->GetSelectedItem(), 1);
}

TEST_F(TabPaneTest, ANullLayoutFailsItsAssertion) {
    TabPane *const pane = Make();
    pane->GetItem(1).textLayout.reset();
    EXPECT_THROW(pane->GetItemNameWidth(1), BrokenInvariant);
}

// The row

TEST_F(TabPaneTest, TabsTouchAndAreAsWideAsTheirNamesAndPadding) {
    TabPane *const pane = Make();
    int left = 10;
    for (int i = 0; i < 3; ++i) {
        Rect const tab = pane->GetItemBox(i);
        EXPECT_EQ(tab, (Rect{20, static_cast<short>(left), 37,
                             static_cast<short>(left + pane->GetItemNameWidth(i) + 22)}));
        left = tab.right;
    }
    EXPECT_EQ(pane->GetOptimalRect(), (Rect{20, 10, 37, static_cast<short>(left)}));
}

TEST_F(TabPaneTest, ARowWithoutTabsIsNowhere) { EXPECT_EQ(Make({})->GetOptimalRect(), (Rect{0, 0, 0, 0})); }

TEST_F(TabPaneTest, TheRowFollowsTheBox) {
    TabPane *const pane = Make();
    pane->GetItemBox(0);
    Rect box{50, 60, 90, 300};
    pane->SetBox(&box);
    EXPECT_EQ(pane->GetItemBox(0).left, 60);
    EXPECT_EQ(pane->GetItemBox(0).top, 50);
    EXPECT_EQ(pane->GetItemBox(0).bottom, 67) << "the height is the tabs' own";
}

TEST_F(TabPaneTest, FlagsMakeNamesSmallerCondensedOrShort) {
    OpenTabs *const pane = Make({"Instrument"});
    pane->SetItemShortName(0, Text("Inst"));
    int const plain = pane->GetItemNameWidth(0);
    auto const width = [&](int flags) {
        pane->SetTextDrawingFlags(flags);
        return pane->GetItemNameWidth(0);
    };
    EXPECT_LT(width(TabPane::kTextSize10), plain);
    int const size9 = width(TabPane::kTextSize9);
    EXPECT_LT(size9, width(TabPane::kTextSize10));
    EXPECT_EQ(width(TabPane::kTextSize9 | TabPane::kTextSize10), size9);
    EXPECT_LT(width(TabPane::kUseCondensedText), plain);
    EXPECT_LT(width(TabPane::kUseShortNames), size9);
}

TEST_F(TabPaneTest, SetsFontStyleAndSizeFromTheFlags) {
    OpenTabs *const pane = Make({"Instrument"});
    auto const expect = [&](int flags, short style, short size) {
        pane->SetTextDrawingFlags(flags);
        OS::TextLayout layout;
        UpdateTextLayout(layout, Text("Instrument"), GetIndVelaFont(3)->family, style, size,
                         TextSettings::kAlignCenter, TextSettings::kTruncateNone, 1, 0, 0, 0, 0.0f, 1.0f,
                         1.0f);
        EXPECT_EQ(pane->GetItemNameWidth(0), static_cast<int>(layout.GetWidth())) << flags;
    };
    expect(0, 1, 11);
    expect(TabPane::kUseCondensedText, 32, 11);
    expect(TabPane::kTextSize10, 1, 10);
    expect(TabPane::kUseCondensedText | TabPane::kTextSize10, 32, 10);
    expect(TabPane::kTextSize9, 1, 9);
    expect(TabPane::kUseCondensedText | TabPane::kTextSize9, 32, 9);
    expect(0x10000, 1, 11);
}

TEST_F(TabPaneTest, FlagsAreNotRepainted) {
    TabPane *const pane = Make();
    Show();
    pane->SetTextDrawingFlags(TabPane::kTextSize9);
    EXPECT_TRUE(Repainted().empty());
}

TEST_F(TabPaneTest, HiddenItemsShareOneBox) {
    TabPane *const pane = Make({"one", "two", "three", "four"});
    pane->FitIntoRect({20, 10, 37, 90});
    ASSERT_TRUE(pane->TabIsVisible(0));
    ASSERT_FALSE(pane->TabIsVisible(2));
    ASSERT_FALSE(pane->TabIsVisible(3));
    Rect const shared = pane->GetItemBox(3);
    EXPECT_EQ(Width(shared), 24);
    EXPECT_EQ(pane->GetItemBox(2), shared);
    EXPECT_EQ(pane->GetOptimalRect().right, shared.right);
}

TEST_F(TabPaneTest, WithoutOverflowEveryTabIsVisible) {
    TabPane *const pane = Make();
    EXPECT_TRUE(pane->TabIsVisible(2));
    EXPECT_TRUE(pane->TabIsVisible(99)) << "nothing is checked";
    pane->SetTextDrawingFlags(TabPane::kOverflow);
    EXPECT_TRUE(pane->TabIsVisible(2)) << "nothing is hidden yet";
}

TEST_F(TabPaneTest, TheRowIsTheNaturalSizeInALayout) {
    CompoundPane *const column = new CompoundPane;
    column->CompoundPaneInit(glog, 5);
    column->SetUseLayout(true);
    column->SetSizeToLayout(true);
    TabPane *const pane = Make();
    column->Add(pane, -1);
    pane->InvalItemRects();
    Show();
    EXPECT_EQ(Width(pane->GetDrawRectangle()), Width(pane->GetOptimalRect()) + 1);
    EXPECT_EQ(pane->GetDrawRectangle().bottom - pane->GetDrawRectangle().top, 17);
    pane->SetItemName(0, Text("Notes and many rests"));
    EXPECT_EQ(Width(pane->GetDrawRectangle()), Width(pane->GetOptimalRect()) + 1);
}

TEST_F(TabPaneTest, FromASheetTheRowIsTheNaturalSizeFromTheStart) {
    CompoundPane *const column = new CompoundPane;
    column->CompoundPaneInit(glog, 5);
    column->SetUseLayout(true);
    column->SetSizeToLayout(true);
    TestItem item;
    item.Box("BoundsRect", {20, 30, 37, 330});
    boost::shared_ptr<XMLLib::ContainerItem> const names = XMLLib::CreateContainer(Text("Items"));
    names->AddUStringItem(Text("Tab"), Text("Notes"));
    item.Container()->AddItem(Text("Items"), names);
    TabPane *const pane = new TabPane(glog, item.Sheet());
    column->Add(pane, -1);
    Show();
    EXPECT_LT(Width(pane->GetDrawRectangle()), 300);
    EXPECT_EQ(Width(pane->GetDrawRectangle()), Width(pane->GetOptimalRect()) + 1);
}

TEST_F(TabPaneTest, AnEmptyRowSetsNoNaturalSize) {
    CompoundPane *const column = new CompoundPane;
    column->CompoundPaneInit(glog, 5);
    column->SetUseLayout(true);
    TabPane *const pane = Make({});
    pane->GetLayoutRect()->SetAttribute(GlogLayoutItem::kWidth, 77, GlogLayoutItem::kPixels, UString());
    column->Add(pane, -1);
    pane->InvalItemRects();
    Show();
    EXPECT_EQ(Width(pane->GetDrawRectangle()), 77);
}

// Selection

TEST_F(TabPaneTest, SelectingTellsThenRepaints) {
    TabPane *const pane = Make();
    Show();
    TabEar ear(pane);
    bool repaintedBefore = true;
    ear.then = [&] { repaintedBefore = !Repainted().empty(); };
    pane->SetSelectedItem(2);
    EXPECT_EQ(ear.heard, "0 to 2; ");
    EXPECT_EQ(ear.sender, pane);
    EXPECT_FALSE(repaintedBefore);
    EXPECT_EQ(Repainted(), (std::vector<Rect>{BoxOf(*pane)}));
}

TEST_F(TabPaneTest, SelectingTheSelectedTabIsToldToo) {
    TabPane *const pane = Make();
    TabEar const ear(pane);
    pane->SetSelectedItem(0);
    EXPECT_EQ(ear.heard, "0 to 0; ");
}

TEST_F(TabPaneTest, SelectingWithNobodyListeningRepaints) {
    TabPane *const pane = Make();
    Show();
    pane->SetSelectedItem(1);
    EXPECT_EQ(Repainted(), (std::vector<Rect>{BoxOf(*pane)}));
}

TEST_F(TabPaneTest, SelectingWithoutBroadcastOnlyStores) {
    TabPane *const pane = Make();
    Show();
    TabEar const ear(pane);
    pane->SetSelectedItem_NoBroadcast(1);
    EXPECT_EQ(pane->GetSelectedItem(), 1);
    EXPECT_EQ(ear.heard, "");
    EXPECT_TRUE(Repainted().empty());
}

TEST_F(TabPaneTest, ALaterListenerHearsTheTabThatIsSelectedByThen) {
    TabPane *const pane = Make();
    TabEar first(pane);
    TabEar const second(pane);
    first.then = [&] { pane->SetSelectedItem_NoBroadcast(1); };
    pane->SetSelectedItem(2);
    EXPECT_EQ(first.heard, "0 to 2; ");
    EXPECT_EQ(second.heard, "0 to 1; ");
}

TEST_F(TabPaneTest, MayBeDeletedByWhoHearsOfIt) {
    TabPane *const pane = Make();
    Show();
    TabEar first(pane);
    TabEar const second(pane);
    PaneWatch const watch(pane);
    first.then = [&] { delete pane; };
    pane->SetSelectedItem(2);
    EXPECT_FALSE(watch.PaneExists());
    EXPECT_EQ(second.heard, "");
}

// Help tags

TEST_F(TabPaneTest, AHelpTagStaysWhereTheTabWas) {
    TabPane *const pane = Make();
    LocalizedStrings::HelpTag const *const tag =
        LocalizedStrings::HelpTagMgr::Instance().DemandHelpTag("kZoom", "kHZoomIn");
    ASSERT_NE(tag, nullptr);
    pane->AttachHelpTag(1, tag);
    Rect const tab = pane->GetItemBox(1);
    pane->SetItemName(0, Text("Notes and many, many rests"));
    LocalizedStrings::HelpTag const *found = nullptr;
    Rect place{0, 0, 0, 0};
    OS::Help::Placement placement = OS::Help::Placement(0);
    double delay = 0;
    short const middle = static_cast<short>((tab.left + tab.right) / 2);
    ASSERT_TRUE(pane->GetHelpTagForPoint({25, middle}, found, place, placement, delay));
    EXPECT_EQ(found, tag);
    EXPECT_EQ(place, (Rect{20, static_cast<short>(tab.left + 2), 37, static_cast<short>(tab.right - 2)}));
    EXPECT_EQ(int(placement), 3);
    EXPECT_EQ(delay, 0.5);
    EXPECT_FALSE(
        pane->GetHelpTagForPoint({25, static_cast<short>(tab.left + 1)}, found, place, placement, delay));
}

// Bad input

TEST_F(TabPaneTest, AnEmptyNameIsAllPadding) {
    TabPane *const pane = Make({"", "a"});
    EXPECT_EQ(Width(pane->GetItemBox(0)), 22);
}

TEST_F(TabPaneTest, EmptyNamesHaveTabsThatCanBeChosenAndHidden) {
    TabPane *const pane = Make({"", "", ""});
    Show();
    EXPECT_EQ(ResultOfClick("click" + Middle(*pane, 2)), -1);
    EXPECT_EQ(pane->GetSelectedItem(), 2);
    pane->FitIntoRect({20, 10, 37, 30});
    EXPECT_TRUE(pane->TabIsVisible(2)) << "they need 6 pixels each";
    pane->FitIntoRect({20, 10, 37, 25});
    EXPECT_FALSE(pane->TabIsVisible(0));
    EXPECT_EQ(ResultOfClick("click" + Middle(*pane, 0) + "\nmenu 1"), -1);
    EXPECT_EQ(pane->GetSelectedItem(), 0);
}

TEST_F(TabPaneTest, LongNamesAreFittedAndOfferedInTheMenu) {
    std::string const name(10000, 'W');
    TabPane *const pane = Make({name.c_str(), name.c_str()});
    Show();
    pane->FitIntoRect({20, 10, 37, 200});
    EXPECT_EQ(BoxOf(*pane), (Rect{20, 10, 37, 34}));
    EXPECT_EQ(ResultOfClick("click" + Middle(*pane, 0) + "\nmenu 2"), -1);
    EXPECT_EQ(pane->GetSelectedItem(), 1);
}

TEST_F(TabPaneTest, ManyItemsAreFittedAndDrawn) {
    std::vector<TabPane::Item> const items(10000, TabPane::Item(Text("Track")));
    TabPane *const pane = new TabPane(glog, Rect{20, 10, 37, 310}, items, 0);
    Show();
    EXPECT_EQ(pane->GetOptimalRect().right, 32767);
    EXPECT_FALSE(DrawingOf(*pane).empty());
}

TEST_F(TabPaneTest, ALongNameEndsWhereCoordinatesDo) {
    std::string const name(10000, 'W');
    TabPane *const pane = Make({name.c_str(), name.c_str(), "a"});
    Show();
    Rect const last = pane->GetItemBox(2);
    EXPECT_LE(last.left, last.right);
    EXPECT_EQ(pane->GetOptimalRect().right, 32767);
    EXPECT_FALSE(DrawingOf(*pane).empty());
}
