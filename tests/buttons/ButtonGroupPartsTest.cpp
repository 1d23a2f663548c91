// Where the parts of a group lie, in its own box and in a layout, down to the layout items behind them.
#include "desktop/layout/LayoutEngine.h"
#include "desktop/panes/PaneAccess.h"
#include "host/Icons.h"
#include "host/OSRgn.h"
#include "host/TarnError.h"
#include "host/VelaDrawing.h"
#include "tests/buttons/ButtonGroupTest.h"

namespace {

typedef std::vector<int> Icons;
typedef OpenGroup<CheckBoxPane> OpenBoxes;

class GroupParts : public ButtonGroupTest {
protected:
    static GlogLayoutItem::Rep &ItemOf(ButtonGroupPane &group, std::size_t n) {
        return LayoutEngine::Rep(*PaneAccess::Rep(group).subItems.at(n));
    }
    static std::string At(Rect const &rect, int dh, int dv) {
        return std::to_string(rect.left + dh) + " " + std::to_string(rect.top + dv);
    }
    OpenBoxes *NewOpen() {
        OpenBoxes *const group = new OpenBoxes;
        group->GlogPaneInit(glog, 0);
        return group;
    }
};

} // namespace

// Layout items

TEST_F(GroupParts, AButtonMadeInCodeHasAnItemWithItsIconInTheMiddleOfTheLine) {
    UseSpacing(18);
    CheckBoxPane *const group = NewBoxes();
    LayoutEngine::Rep(*group->GetLayoutRect()).OwnRest().name = "group";
    group->AddSpecialButton(30, 40, 5);
    group->AddSpecialButton(30, 60, 5);
    GlogLayoutItem::Rep const &item = ItemOf(*group, 1);
    EXPECT_EQ(item.made, (Rect{60, 30, 78, 45}));
    EXPECT_EQ(item.Inner(), (Rect{3, 0, 16, 12}));
    EXPECT_EQ(item.insetTop, 2);
    EXPECT_EQ(item.Rest().id, -1);
    EXPECT_EQ(item.index, 1);
    EXPECT_EQ(item.Rest().name, "group");
}

TEST_F(GroupParts, HalfALineIsRoundedTowardsZero) {
    struct {
        int spacing;
        short top;
    } const halves[] = {{0, -6}, {17, 2}, {-5, -8}, {-4, -8}};
    for (auto const &row : halves) {
        UseSpacing(row.spacing);
        CheckBoxPane *const group = NewBoxes();
        group->AddSpecialButton(0, 0, 0);
        EXPECT_EQ(ItemOf(*group, 0).Inner(), (Rect{row.top, 0, static_cast<short>(row.top + 13), 12}))
            << row.spacing;
    }
}

TEST_F(GroupParts, ALabelMadeInCodeHasAnItemAsHighAsTheLine) {
    UseSpacing(40);
    CheckBoxPane *const group = NewBoxes();
    group->AddButton(30, 40, Text("Label"));
    GlogLayoutItem::Rep const &item = ItemOf(*group, 1);
    short const top = static_cast<short>(49 - InfoOf(0).ascent);
    EXPECT_EQ(item.made,
              (Rect{top, 45, static_cast<short>(top + 40), static_cast<short>(45 + WidthOf("Label"))}));
    EXPECT_FALSE(item.hasInner);
    EXPECT_EQ(item.insetTop, 0);
    EXPECT_EQ(item.Rest().id, -1);
    EXPECT_EQ(item.index, 1);
}

TEST_F(GroupParts, OfAResourceEachButtonsItemPrecedesThoseOfItsLabels) {
    GroupItem resource(18);
    resource.Button({10, 20}, 5).Label({20, 38}, "a").Label({40, 38}, "b");
    resource.Button({60, 20}).Label({70, 38}, "c");
    CheckBoxPane *const group = CheckBoxPane::NewCheckBoxPane(glog, resource.Sheet());
    ASSERT_EQ(group->NumLayoutSubItems(), 5);
    for (std::size_t i = 0; i < 5; ++i)
        EXPECT_EQ(ItemOf(*group, i).index, static_cast<int>(i));
    EXPECT_EQ(ItemOf(*group, 0).made, (Rect{10, 20, 23, 37}));
    EXPECT_EQ(ItemOf(*group, 0).Inner(), (Rect{3, 0, 16, 12}));
    EXPECT_EQ(ItemOf(*group, 0).insetTop, 2);
    EXPECT_EQ(ItemOf(*group, 3).made, (Rect{60, 20, 73, 32}));
    short const top = static_cast<short>(40 - InfoOf(0).ascent);
    EXPECT_EQ(ItemOf(*group, 2).made,
              (Rect{top, 38, static_cast<short>(top + 18), static_cast<short>(38 + WidthOf("b"))}));
    EXPECT_EQ(ItemOf(*group, 2).insetTop, 0);
}

TEST_F(GroupParts, ANewNameTellsItsItemTheWidthOnly) {
    CheckBoxPane *const group = ThreeBoxes();
    short const width = WidthOf("Another name");
    group->SetNthButtonName(1, Text("Another name"));
    EXPECT_EQ(ItemOf(*group, 3).width, width);
    EXPECT_EQ(ItemOf(*group, 3).height, 0);
    EXPECT_EQ(ItemOf(*group, 1).width, 0);
}

// In its own box

TEST_F(GroupParts, AButtonWithALabelReachesToTheLabel) {
    UseSpacing(18);
    CheckBoxPane *const group = NewBoxes();
    group->AddButton(20, 20, Text("Label"));
    Rect box = {0, 0, 100, 200};
    group->SetBox(&box);
    Show();
    EXPECT_EQ(ResultOfClick("click 34 37"), 1) << "the button's last pixel, below the label";
    EXPECT_EQ(ResultOfClick("click 36 37"), 0);
}

TEST_F(GroupParts, ALabelOfNoButtonHidesTheLabelsBelowIt) {
    UseSpacing(18);
    CheckBoxPane *const group = NewBoxes();
    group->AddButtonText(40, 30, Text("Heading over everything"));
    group->AddButton(20, 21, Text("Label"));
    Rect box = {0, 0, 100, 250};
    group->SetBox(&box);
    Show();
    EXPECT_EQ(ResultOfClick("click 42 28"), 0) << "where both labels lie";
    EXPECT_EQ(ResultOfClick("click 25 28"), 1);
}

TEST_F(GroupParts, LabelsAreDrawnWhereSetBoxHasMovedThem) {
    CheckBoxPane *const group = ThreeBoxes();
    std::string const before = Only("DrawStringAtPoint", DrawingOf(*group)).at(0);
    EXPECT_NE(before.find("\"at\":[21,38]"), std::string::npos) << before;
    Rect box = BoxOf(*group);
    VelaDrawing::OffsetRect(&box, 7, -3);
    group->SetBox(&box);
    std::string const after = Only("DrawStringAtPoint", DrawingOf(*group)).at(0);
    EXPECT_NE(after.find("\"at\":[18,45]"), std::string::npos) << after;
}

TEST_F(GroupParts, OfAGroupThatTakesNoClicksAlsoTheGapsTakeThem) {
    GroupItem item;
    item.Button({10, 20}).Button({60, 20});
    CheckBoxPane *const group = CheckBoxPane::NewCheckBoxPane(glog, item.Sheet());
    group->SetAllowClicks(false);
    Show();
    EXPECT_EQ(ResultOfClick("click 25 40"), -1);
}

TEST_F(GroupParts, APressIsDrawnAtTheButtonsPlaceOnePixelDown) {
    CheckBoxPane *const group = ThreeBoxes();
    group->SetOne(1, true);
    Show();
    desktop.TakeDrawing();
    ResultOfClick("press 25 35\nwait 0.3\nrelease");
    Lines const drawn = Only("Draw1Icon", desktop.TakeDrawing());
    ASSERT_GE(drawn.size(), 2u);
    EXPECT_EQ(Lines(drawn.begin(), drawn.begin() + 2), Traced(*group, [] {
                  Draw1Icon(1002, 5, 20, 31); // on and pressed
                  Draw1Icon(1002, 6, 20, 31); // off at the release
              }));
}

TEST_F(GroupParts, NumbersOfAResourceAreSixteenBitsWide) {
    GroupItem item;
    item.Button({0, 0}, 65536 + 7).Label({60, 20}, "Measured", 65536 + 31);
    item.Flags(65536 + CheckBoxPane::kModifiersChangeOthers);
    CheckBoxPane *const group = CheckBoxPane::NewCheckBoxPane(glog, item.Sheet());
    EXPECT_EQ(ItemOf(*group, 0).made, (Rect{0, 0, 13, 19}));
    EXPECT_EQ(BoundsOf(*group, 0).right, 20 + WidthOf("Measured", 1));
    group->AddSpecialButton(0, 100, 0);
    Show();
    ResultOfClick("click 5 5 command");
    EXPECT_TRUE(group->ReadOne(1)) << "the flag's low 16 bits count";
}

TEST_F(GroupParts, WhatStoodBeforeAMissingContainerStays) {
    OpenBoxes *const group = NewOpen();
    GroupItem item;
    item.Button({10, 20}).Label({20, 38}, "kept");
    item.buttons->AddItem(Text("Button"), XMLLib::CreateContainer(Text("Button")));
    EXPECT_THROW(group->GlogItemFromRes(item.Sheet()), TarnError);
    EXPECT_EQ(group->CountButtons(), 1);
    EXPECT_TRUE(NameOf(*group, 0) == Text("kept"));
    EXPECT_EQ(BoxOf(*group), (Rect{0, 0, 0, 0})) << "the box comes last";
}

TEST_F(GroupParts, AnEmptyListOfStringsMakesAButtonWithoutLabel) {
    GroupItem item;
    item.Button({10, 20}, 5);
    CheckBoxPane *const group = CheckBoxPane::NewCheckBoxPane(glog, item.Sheet());
    EXPECT_EQ(group->CountButtonTexts(), 0);
    EXPECT_EQ(BoundsOf(*group, 0), (Rect{10, 20, 23, 37}));
    Show();
    EXPECT_EQ(ResultOfClick("click 25 15"), 1);
}

// In a layout

TEST_F(GroupParts, InALayoutTheBoundsOfAButtonTakeInOnlyItsLastLabel) {
    GroupItem item;
    item.Button({10, 20}).Label({20, 200}, "far").Label({20, 38}, "near");
    CheckBoxPane *const group = CheckBoxPane::NewCheckBoxPane(glog, item.Sheet());
    PutIntoLayout(group, 50);
    EXPECT_EQ(BoundsOf(*group, 0).right, 18 + WidthOf("near"));
}

TEST_F(GroupParts, InALayoutTheRegionIsThatOfThePlacesThere) {
    CheckBoxPane *const group = ThreeBoxes();
    PutIntoLayout(group, 100);
    OSRgn *const region = group->GetRgn();
    Rect const third = BoundsOf(*group, 2);
    EXPECT_TRUE(region->Contains(Point{static_cast<short>(third.top + 5), third.left}));
    EXPECT_FALSE(region->Contains(Point{15, 25})) << "where the first was before";
    VelaDrawing::DisposeRgn(region);
}

TEST_F(GroupParts, InALayoutOnlyWhatMeetsTheRegionIsDrawn) {
    CheckBoxPane *const group = ThreeBoxes();
    PutIntoLayout(group, 100);
    Show();
    Rect const second = BoundsOf(*group, 1);
    OSRgn region(Rect{static_cast<short>(second.top + 8), 0, static_cast<short>(second.top + 9), 200});
    Lines const lines = Traced(*group, [&] { (group->*&Opened<CheckBoxPane>::DrawGuts)(&region); });
    EXPECT_EQ(IconsIn(lines).size(), 1u);
    EXPECT_EQ(Only("DrawStringAtPoint", lines).size(), 1u);
}

TEST_F(GroupParts, InALayoutLabelsTakeClicksAndGoBeforeButtons) {
    GroupItem item;
    item.Button({10, 20}, 100);
    item.Button({60, 20}).Label({20, 40}, "over the first");
    CheckBoxPane *const group = CheckBoxPane::NewCheckBoxPane(glog, item.Sheet());
    PutIntoLayout(group, 50);
    Show();
    Rect const second = BoundsOf(*group, 1);
    EXPECT_EQ(ResultOfClick("click 25 " + std::to_string(second.top + 5)), 2);
}

TEST_F(GroupParts, InALayoutAPressIsDrawnAndTrackedWhereTheButtonLies) {
    CheckBoxPane *const group = ThreeBoxes();
    PutIntoLayout(group, 100);
    Show();
    Rect const place = PaneAccess::Rep(*group).subItems.at(2)->GetBorderRect();
    desktop.TakeDrawing();
    EXPECT_EQ(ResultOfClick("press " + At(place, 5, 5) + "\nwait 0.2\nmove 5 5\nwait 0.2\nmove " +
                            At(place, 30, 5) + "\nwait 0.2\nrelease"),
              2)
        << "over its label";
    Lines const drawn = Only("Draw1Icon", desktop.TakeDrawing());
    ASSERT_GE(drawn.size(), 4u);
    EXPECT_EQ(Lines(drawn.begin(), drawn.begin() + 4), Traced(*group, [&] {
                  for (short icon : {7, 6, 7, 4})
                      Draw1Icon(1002, icon, place.left, static_cast<short>(place.top + 1));
              }));
}

TEST_F(GroupParts, InALayoutADisabledButtonTakesTheClickAndDoesNothing) {
    CheckBoxPane *const group = ThreeBoxes();
    PutIntoLayout(group, 100);
    group->SetOneEnable(1, false);
    Show();
    EXPECT_EQ(ResultOfClick("click " + At(BoundsOf(*group, 1), 5, 8)), -1);
    EXPECT_FALSE(group->ReadOne(1));
}

TEST_F(GroupParts, InALayoutTheHelpTagOfAPartHoldsWhereItLies) {
    CheckBoxPane *const group = ThreeBoxes();
    PutIntoLayout(group, 100);
    LocalizedStrings::HelpTag const *const given =
        LocalizedStrings::HelpTagMgr::Instance().DemandHelpTag("kGallery", "kOvalButton");
    group->AttachHelpTag(1, given);
    LocalizedStrings::HelpTag const *tag = nullptr;
    Rect rect;
    OS::Help::Placement placement = OS::Help::Placement();
    double delay = 0;
    Rect const second = BoundsOf(*group, 1);
    ASSERT_TRUE(
        group->GetHelpTagForPoint(Point{static_cast<short>(second.top + 5), 5}, tag, rect, placement, delay));
    EXPECT_EQ(rect, second);
}

TEST_F(GroupParts, InALayoutRadioButtonsGoOverAndRepaintBothWhereTheyLie) {
    RadioButtonPane *const group = ThreeRadios();
    PutIntoLayout(group, 100);
    Show();
    group->RadioSet(2);
    std::vector<Rect> const repainted = Repainted();
    ASSERT_EQ(repainted.size(), 2u);
    EXPECT_LT(repainted[0].bottom, BoundsOf(*group, 1).bottom);
    EXPECT_GT(repainted[1].top, BoundsOf(*group, 1).top);
    EXPECT_EQ(IconsOf(*group), (Icons{2, 2, 0}));
}

// Large groups

TEST_F(GroupParts, OneBoxOfTenThousandRedrawsItsOwnRectangleAlone) {
    UseSpacing(16);
    CheckBoxPane *const group = NewBoxes();
    for (int i = 0; i < 10000; ++i)
        group->AddButton(static_cast<short>(20 * (i % 100)), static_cast<short>(20 * (i / 100)), UString());
    Rect box = {0, 0, 2000, 2000};
    group->SetBox(&box);
    Show();
    group->SetOne(304, true);
    EXPECT_EQ(Repainted(), (std::vector<Rect>{{57, 77, 79, 93}}));
    EXPECT_LE(Only("Draw1Icon", desktop.TakeDrawing()).size(), 9u)
        << "its own and those that its margin meets";
}
