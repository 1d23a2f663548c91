#include "buttons/ButtonGroupPane.h"
#include "host/HelpTagHelper.h"
#include "host/Icons.h"
#include "host/NamedColors.h"
#include "host/OSRgn.h"
#include "host/PortSavers.h"
#include "host/StringMgr.h"
#include "host/TarnError.h"
#include "host/VelaDrawing.h"
#include "tests/VirtualPlace.h"
#include "tests/buttons/ButtonGroupTest.h"
#include <limits>
#include <set>
#include <type_traits>

namespace {

typedef std::vector<int> Icons;
typedef OpenGroup<CheckBoxPane> OpenBoxes;

class ButtonGroup : public ButtonGroupTest {
protected:
    static Rect RegionBounds(ButtonGroupPane &group) {
        OSRgn *const region = group.GetRgn();
        Rect const bounds = CarbonUtils::GetRgnBounds(region);
        VelaDrawing::DisposeRgn(region);
        return bounds;
    }
    // The keys of strings that are not empty.
    static std::set<short> UsedKeys() {
        std::set<short> keys;
        for (int key = 1; key <= std::numeric_limits<short>::max(); ++key)
            if (!(StringMgr::Instance().Lookup(static_cast<short>(key)) == UString()))
                keys.insert(static_cast<short>(key));
        return keys;
    }
    // Where the labels of the drawing stand, and in which colour.
    static std::size_t CountOf(std::string const &operation, Lines const &lines) {
        return Only(operation, lines).size();
    }
};

class ProcedureKept {
public:
    ~ProcedureKept() { btnSetOneEnable = setOneEnable; }

private:
    void (*setOneEnable)(ButtonGroupPane *, int, bool) = btnSetOneEnable;
};

} // namespace

// Form

TEST_F(ButtonGroup, HasItsBasesInOrder) {
    CheckBoxPane *const group = NewBoxes();
    char const *const whole = reinterpret_cast<char const *>(static_cast<ButtonGroupPane *>(group));
    char const *const bases[] = {
        reinterpret_cast<char const *>(static_cast<Provider<ButtonGroupPane_Listener> *>(group)),
        reinterpret_cast<char const *>(static_cast<Provider<ButtonGroupPaneListener> *>(group)),
        reinterpret_cast<char const *>(static_cast<GlogPane *>(group)),
        reinterpret_cast<char const *>(static_cast<AutoSetActivityListener *>(group))};
    EXPECT_EQ(bases[0], whole);
    EXPECT_LT(bases[0], bases[1]);
    EXPECT_LT(bases[1], bases[2]);
    EXPECT_LT(bases[2], bases[3]);
}

TEST_F(ButtonGroup, AddsItsOperationsInOrder) {
    ExpectInOrder(kAfterDestructor, &ButtonGroupPane::GetRgn, &ButtonGroupPane::AddSpecialButton,
                  &OpenBoxes::TrackButton, &OpenBoxes::GetReleaseIcon, &OpenBoxes::AutoSetButton);
}

TEST_F(ButtonGroup, HasTheNumberZero) {
    EXPECT_EQ(NewBoxes()->GetID(), 0);
    EXPECT_EQ(ThreeBoxes()->GetID(), 0);
    EXPECT_EQ(NewRadios()->GetID(), 0);
    EXPECT_EQ(ThreeRadios()->GetID(), 0);
}

TEST_F(ButtonGroup, IsAbstract) { EXPECT_TRUE(std::is_abstract<ButtonGroupPane>::value); }

// Buttons made in code

TEST_F(ButtonGroup, AButtonWithoutTextIsTenPixelsWideAndALineHigh) {
    UseSpacing(18);
    CheckBoxPane *const group = NewBoxes();
    group->AddButton(30, 40, UString());
    EXPECT_EQ(BoundsOf(*group, 0), (Rect{40, 30, 58, 40}));
}

TEST_F(ButtonGroup, AButtonIsOfNoHeightWithoutAStyleSheet) {
    CheckBoxPane *const group = NewBoxes();
    group->AddButton(30, 40, UString());
    EXPECT_EQ(BoundsOf(*group, 0), (Rect{40, 30, 40, 40}));
}

TEST_F(ButtonGroup, ASpecialButtonIsWiderByTheExtraPixels) {
    UseSpacing(18);
    CheckBoxPane *const group = NewBoxes();
    group->AddSpecialButton(30, 40, 25);
    EXPECT_EQ(BoundsOf(*group, 0), (Rect{40, 30, 58, 65}));
}

TEST_F(ButtonGroup, ALabelStandsFifteenPixelsRightAndNineBelow) {
    UseSpacing(18);
    CheckBoxPane *const group = NewBoxes();
    group->AddButton(30, 40, Text("Label"));
    TarnQuickDrawText::FontInfo const info = InfoOf(0);
    Rect const label = {static_cast<short>(49 - info.ascent), 45, static_cast<short>(49 + info.descent),
                        static_cast<short>(45 + WidthOf("Label"))};
    EXPECT_EQ(BoundsOf(*group, 0),
              (Rect{std::min<short>(40, label.top), 30, std::max<short>(58, label.bottom), label.right}));
}

TEST_F(ButtonGroup, ButtonAndLabelHaveLayoutItems) {
    CheckBoxPane *const group = NewBoxes();
    group->AddButton(0, 0, Text("Label"));
    EXPECT_EQ(group->NumLayoutSubItems(), 2);
    group->AddButton(0, 20, UString());
    EXPECT_EQ(group->NumLayoutSubItems(), 3);
}

TEST_F(ButtonGroup, ALabelBeforeAllButtonsBelongsToNoneAndTakesNoClicks) {
    UseSpacing(18);
    CheckBoxPane *const group = NewBoxes();
    group->AddButtonText(20, 30, Text("Heading"));
    group->AddButton(20, 20, UString());
    Rect box = {0, 0, 100, 100};
    group->SetBox(&box);
    Show();
    EXPECT_TRUE(NameOf(*group, 0) == Text("Heading"));
    EXPECT_EQ(ResultOfClick("click 32 25"), 0);
    EXPECT_EQ(ResultOfClick("click 22 25"), 1); // the button below the label
}

TEST_F(ButtonGroup, NamesCountLabelsInsteadOfButtons) {
    CheckBoxPane *const group = NewBoxes();
    group->AddButton(0, 0, UString());
    group->AddButton(0, 20, Text("Second button"));
    group->AddButtonText(100, 9, Text("Its other label"));
    EXPECT_TRUE(NameOf(*group, 0) == Text("Second button"));
    EXPECT_TRUE(NameOf(*group, 1) == Text("Its other label"));
}

TEST_F(ButtonGroup, TheBoundsOfAButtonTakeInOnlyItsLastLabel) {
    UseSpacing(18);
    CheckBoxPane *const group = NewBoxes();
    group->AddSpecialButton(0, 0, 0);
    group->AddButtonText(200, 9, Text("far"));
    group->AddButtonText(15, 9, Text("near"));
    EXPECT_EQ(BoundsOf(*group, 0).right, 15 + WidthOf("near"));
}

TEST_F(ButtonGroup, ANewNameMovesTheRightEdgeByThePortsFont) {
    CheckBoxPane *const group = ThreeBoxes();
    short const width = WidthOf("A much longer name", 9); // leaves font 9 in the port
    group->SetNthButtonName(1, Text("A much longer name"));
    EXPECT_TRUE(NameOf(*group, 1) == Text("A much longer name"));
    EXPECT_EQ(BoundsOf(*group, 1).right, 38 + width);
}

TEST_F(ButtonGroup, ANewNameLeavesBoxAndScreenAlone) {
    CheckBoxPane *const group = ThreeBoxes();
    Rect const box = BoxOf(*group);
    Show();
    group->SetNthButtonName(1, Text("A much longer name"));
    EXPECT_EQ(BoxOf(*group), box);
    EXPECT_TRUE(Repainted().empty());
}

TEST_F(ButtonGroup, ANameMayBeSetToItself) {
    CheckBoxPane *const group = ThreeBoxes();
    UString const name = NameOf(*group, 2);
    group->SetNthButtonName(2, name);
    EXPECT_TRUE(NameOf(*group, 2) == Text("Third"));
}

TEST_F(ButtonGroup, FreesTheKeysOfItsLabels) {
    std::set<short> const before = UsedKeys();
    CheckBoxPane *const group = ThreeBoxes();
    EXPECT_EQ(UsedKeys().size(), before.size() + 3);
    delete group;
    EXPECT_EQ(UsedKeys(), before);
}

// Geometry

TEST_F(ButtonGroup, CalcBoxTakesInButtonsAndLabels) {
    CheckBoxPane *const group = ThreeBoxes();
    Rect const box = BoxOf(*group);
    group->CalcBox();
    EXPECT_EQ(BoxOf(*group), box);
    EXPECT_EQ(BoundsOf(*group, 0).top, 20 - InfoOf(0).ascent);
}

TEST_F(ButtonGroup, CalcBoxMovesTheButtonsAsFarAsTheCornerOfTheBox) {
    UseSpacing(18);
    CheckBoxPane *const group = NewBoxes();
    group->AddSpecialButton(30, 40, 0);
    group->CalcBox(); // from the corner at (0, 0)
    EXPECT_EQ(BoxOf(*group), (Rect{40, 30, 58, 40}));
    EXPECT_EQ(BoundsOf(*group, 0), (Rect{80, 60, 98, 70}));
}

TEST_F(ButtonGroup, CalcBoxWithoutButtonsSetsTheInvertedRectangle) {
    CheckBoxPane *const group = NewBoxes();
    group->CalcBox();
    EXPECT_EQ(BoxOf(*group), (Rect{32767, 32767, -32768, -32768}));
}

TEST_F(ButtonGroup, SetBoxMovesButtonsAndLabelsWithTheCorner) {
    CheckBoxPane *const group = ThreeBoxes();
    Rect const first = BoundsOf(*group, 0);
    Rect box = BoxOf(*group);
    VelaDrawing::OffsetRect(&box, 7, -3);
    box.right = 300; // the size counts for nothing
    group->SetBox(&box);
    Rect moved = first;
    VelaDrawing::OffsetRect(&moved, 7, -3);
    EXPECT_EQ(BoundsOf(*group, 0), moved);
    EXPECT_EQ(BoxOf(*group), box);
}

TEST_F(ButtonGroup, TheRegionHoldsEveryButtonAndLabel) {
    UseSpacing(18);
    CheckBoxPane *const group = NewBoxes();
    group->AddSpecialButton(10, 20, 0);
    group->AddSpecialButton(100, 60, 0);
    group->AddButtonText(20, 9, Text("label"));
    OSRgn *const region = group->GetRgn();
    EXPECT_TRUE(region->Contains({20, 10}));
    EXPECT_TRUE(region->Contains({60, 109}));
    EXPECT_TRUE(region->Contains({68, 121}));
    EXPECT_FALSE(region->Contains({40, 60}));
    EXPECT_EQ(CarbonUtils::GetRgnBounds(region).right, 120 + WidthOf("label"));
    VelaDrawing::DisposeRgn(region);
}

TEST_F(ButtonGroup, TheRegionOfNoButtonsIsEmpty) { EXPECT_EQ(RegionBounds(*NewBoxes()), (Rect{0, 0, 0, 0})); }

// Buttons of a resource

TEST_F(ButtonGroup, AButtonOfAResourceIsThirteenPixelsHighWhateverTheSpacing) {
    GroupItem item(40);
    item.Button({10, 20}, 5);
    CheckBoxPane *const group = CheckBoxPane::NewCheckBoxPane(glog, item.Sheet());
    EXPECT_EQ(BoundsOf(*group, 0), (Rect{10, 20, 23, 37}));
    EXPECT_EQ(BoxOf(*group), (Rect{10, 20, 23, 37}));
}

TEST_F(ButtonGroup, AButtonWithoutOriginStandsAtTheCorner) {
    GroupItem item;
    item.Button({10, 20}).ButtonWithoutOrigin(3);
    CheckBoxPane *const group = CheckBoxPane::NewCheckBoxPane(glog, item.Sheet());
    EXPECT_EQ(BoundsOf(*group, 1), (Rect{0, 0, 13, 15}));
}

TEST_F(ButtonGroup, ALabelWithoutOriginStandsWhereTheOneBeforeDoesEvenOfAnotherButton) {
    GroupItem item;
    item.Button({0, 0}).Label({50, 60}, "one");
    item.Button({0, 0}).LabelWithoutOrigin("other");
    CheckBoxPane *const group = CheckBoxPane::NewCheckBoxPane(glog, item.Sheet());
    EXPECT_EQ(BoundsOf(*group, 1).bottom, 50 + InfoOf(0).descent);
    EXPECT_EQ(BoundsOf(*group, 1).right, 60 + WidthOf("other"));
}

TEST_F(ButtonGroup, TheFirstLabelWithoutOriginStandsAtTheCorner) {
    GroupItem item;
    item.Button({10, 10}).LabelWithoutOrigin("one");
    CheckBoxPane *const group = CheckBoxPane::NewCheckBoxPane(glog, item.Sheet());
    EXPECT_EQ(BoundsOf(*group, 0).top, -InfoOf(0).ascent);
}

TEST_F(ButtonGroup, TheBoxOfAResourceDoesNotMoveTheButtons) {
    CheckBoxPane *const group = ThreeBoxes();
    Rect const box = BoxOf(*group);
    EXPECT_EQ(box.left, 20);
    EXPECT_EQ(box.top, std::min(10, 20 - InfoOf(0).ascent));
    EXPECT_EQ(BoundsOf(*group, 2).left, 20);
    EXPECT_EQ(BoundsOf(*group, 2).bottom, box.bottom);
}

TEST_F(ButtonGroup, TheBoxOfAResourceReachesAtLeastToTheOrigin) {
    GroupItem item;
    item.Button({-50, -60});
    EXPECT_EQ(BoxOf(*CheckBoxPane::NewCheckBoxPane(glog, item.Sheet())), (Rect{-50, -60, 0, 0}));
}

TEST_F(ButtonGroup, TheBoxOfAnEmptyResourceBeginsBeyondItsEnd) {
    GroupItem item;
    EXPECT_EQ(BoxOf(*CheckBoxPane::NewCheckBoxPane(glog, item.Sheet())), (Rect{32767, 32767, 0, 0}));
}

TEST_F(ButtonGroup, FontsOfAResourceAreFolded) {
    struct {
        int fsrid, font;
    } const folded[] = {{0, 0}, {1, 1}, {9, 9}, {10, 0}, {30, 0}, {31, 1}, {32, 0}, {255, 0}, {-2, -2}};
    for (auto const &row : folded) {
        GroupItem item;
        item.Button({0, 0}).Label({60, 20}, "Measured", row.fsrid);
        CheckBoxPane *const group = CheckBoxPane::NewCheckBoxPane(glog, item.Sheet());
        EXPECT_EQ(BoundsOf(*group, 0).right, 20 + WidthOf("Measured", row.font)) << row.fsrid;
        EXPECT_EQ(BoundsOf(*group, 0).bottom, 60 + InfoOf(row.font).descent) << row.fsrid;
    }
}

TEST_F(ButtonGroup, ALabelOfFontMinusOneTakesTheFontThatThePortHas) {
    GroupItem item;
    item.Button({0, 0}).Label({60, 20}, "Measured", -1);
    short const width = WidthOf("Measured", 9);
    EXPECT_EQ(BoxOf(*CheckBoxPane::NewCheckBoxPane(glog, item.Sheet())).right, 20 + width);
}

TEST_F(ButtonGroup, LabelsOfOneFontSetItOnce) {
    GroupItem item;
    item.Button({0, 0}).Label({60, 20}, "a", 1).Label({80, 20}, "b", 1);
    item.Button({0, 0}).Label({100, 20}, "c", 1).Label({120, 20}, "d", 2);
    desktop.TakeDrawing();
    CheckBoxPane::NewCheckBoxPane(glog, item.Sheet());
    EXPECT_EQ(Only("SetFontData", desktop.TakeDrawing()).size(), 2u);
}

TEST_F(ButtonGroup, AResourceWithoutItsContainersRunsOutOfMemoryAndLeavesNoPane) {
    short const before = CountGlogItems(glog);
    TestItem bare;
    EXPECT_THROW(CheckBoxPane::NewCheckBoxPane(glog, bare.Sheet()), TarnError);

    GroupItem noStrings;
    boost::shared_ptr<XMLLib::ContainerItem> const button = XMLLib::CreateContainer(Text("Button"));
    noStrings.buttons->AddItem(Text("Button"), button);
    EXPECT_THROW(CheckBoxPane::NewCheckBoxPane(glog, noStrings.Sheet()), TarnError);

    GroupItem noButton;
    noButton.buttons->AddSIntItem(Text("Button"), 1);
    EXPECT_THROW(RadioButtonPane::NewRadioButtonPane(glog, noButton.Sheet()), TarnError);

    boost::shared_ptr<XMLLib::ContainerItem> const strings =
        XMLLib::CreateContainer(Text("RadioCheckButtonStrings"));
    strings->AddSIntItem(Text("String"), 1);
    GroupItem noString;
    boost::shared_ptr<XMLLib::ContainerItem> const other = XMLLib::CreateContainer(Text("Button"));
    other->AddItem(Text("RadioCheckButtonStrings"), strings);
    noString.buttons->AddItem(Text("Button"), other);
    EXPECT_THROW(CheckBoxPane::NewCheckBoxPane(glog, noString.Sheet()), TarnError);
    EXPECT_EQ(CountGlogItems(glog), before);
}

TEST_F(ButtonGroup, ASheetWithoutItemFailsAnAssertion) {
    GlogStyleSheet empty;
    EXPECT_THROW(CheckBoxPane::NewCheckBoxPane(glog, &empty), BrokenInvariant);
}

// Drawing

TEST_F(ButtonGroup, IsDrawnTextsFirstThenIcons) {
    CheckBoxPane *const group = ThreeBoxes();
    group->SetOne(1, true);
    group->SetOneEnable(2, false);
    EXPECT_EQ(DrawingOf(*group), Traced(*group, [&] {
                  ClearColors();
                  SetBackgroundColor(glog->GetContentColor());
                  SetFontData(GetIndVelaFont(0));
                  char const *const names[] = {"First", "Second", "Third"};
                  for (int i = 0; i < 3; ++i) {
                      SetForegroundColor(i == 2 ? kDialogInactiveTextColor : kDialogActiveTextColor);
                      DrawStringAtPoint(Text(names[i]), Point{static_cast<short>(21 + 20 * i), 38}, -1,
                                        TextSettings::kTruncateNone);
                  }
                  ClearColors();
                  Draw1Icon(1002, 6, 20, 11);
                  Draw1Icon(1002, 4, 20, 31);
                  Draw1Icon(1002, 10, 20, 51);
              }));
}

TEST_F(ButtonGroup, DrawsOnlyWhatMeetsTheRegion) {
    CheckBoxPane *const group = ThreeBoxes();
    OSRgn region(Rect{30, 20, 31, 200});
    Lines const lines = Traced(*group, [&] { (group->*&Opened<CheckBoxPane>::DrawGuts)(&region); });
    EXPECT_EQ(IconsIn(lines).size(), 1u);
    EXPECT_EQ(CountOf("DrawStringAtPoint", lines), 1u);
}

TEST_F(ButtonGroup, DrawsNothingForARegionElsewhere) {
    CheckBoxPane *const group = ThreeBoxes();
    OSRgn region(Rect{150, 0, 160, 200});
    EXPECT_TRUE(Traced(*group, [&] { (group->*&Opened<CheckBoxPane>::DrawGuts)(&region); }).empty());
}

TEST_F(ButtonGroup, LeavesTheColoursOfThePortAsTheyWere) {
    CheckBoxPane *const group = ThreeBoxes();
    RGBColor const reddish = {0xC000, 0x1000, 0x2000};
    group->Prepare();
    VelaDrawing::RGBForeColor(reddish);
    (group->*&Opened<CheckBoxPane>::DrawGuts)(nullptr);
    RGBColor after;
    VelaDrawing::GetForeColor(&after);
    EXPECT_EQ(after.red, reddish.red);
}

TEST_F(ButtonGroup, AnInvisibleOneDrawsNoIcons) {
    CheckBoxPane *const group = ThreeBoxes();
    group->SetVisibility(false);
    EXPECT_TRUE(IconsOf(*group).empty());
}

TEST_F(ButtonGroup, PrintingMakesNoDifference) {
    CheckBoxPane *const group = ThreeBoxes();
    Lines const before = DrawingOf(*group);
    group->SetForPrinting(false);
    EXPECT_EQ(DrawingOf(*group), before);
}

// Values, enabling, messages

TEST_F(ButtonGroup, AValueRedrawsItsButtonWithThreePixelsRound) {
    CheckBoxPane *const group = ThreeBoxes();
    Show();
    group->SetOne(1, true);
    EXPECT_EQ(Repainted(), (std::vector<Rect>{{27, 17, 46, 39}}));
}

TEST_F(ButtonGroup, EnablingRedrawsTheWholePane) {
    CheckBoxPane *const group = ThreeBoxes();
    Show();
    group->SetOneEnable(1, false);
    Rect sum = {32767, 32767, 0, 0};
    for (Rect const &rect : Repainted())
        sum = {std::min(sum.top, rect.top), std::min(sum.left, rect.left), std::max(sum.bottom, rect.bottom),
               std::max(sum.right, rect.right)};
    Rect const box = BoxOf(*group);
    EXPECT_EQ(sum, (Rect{box.top, 17, box.bottom, box.right})); // the button's margin sticks out
}

TEST_F(ButtonGroup, WhatAButtonIsAlreadySendsAndRedrawsNothing) {
    CheckBoxPane *const group = ThreeBoxes();
    GroupListener listener;
    listener.HangOn(group);
    Show();
    group->SetOneEnable(1, true);
    group->SetOne(1, false);
    EXPECT_TRUE(listener.heard.empty());
    EXPECT_TRUE(Repainted().empty());
}

TEST_F(ButtonGroup, EnablingIsToldByTheSecondMessageOnly) {
    CheckBoxPane *const group = ThreeBoxes();
    GroupListener listener;
    listener.HangOn(group);
    group->SetOneEnable(1, false);
    EXPECT_EQ(listener.heard, (Heard{"1 changed"}));
    EXPECT_EQ(listener.sources, (std::vector<ButtonGroupPane *>{group}));
}

TEST_F(ButtonGroup, TellsWhichButtonsAreEnabledAndHowManyLabelsThereAre) {
    CheckBoxPane *const group = ThreeBoxes();
    group->SetOneEnable(1, false);
    EXPECT_TRUE(group->IsEnabled(0));
    EXPECT_FALSE(group->IsEnabled(1));
    EXPECT_FALSE(group->IsEnabled(-1));
    EXPECT_FALSE(group->IsEnabled(3));
    group->AddSpecialButton(0, 0, 0);
    EXPECT_EQ(group->CountButtonTexts(), 3);
    EXPECT_EQ(group->CountButtons(), 4);
}

TEST_F(ButtonGroup, SetAllEnableTellsOfThoseThatChangeInOrder) {
    CheckBoxPane *const group = ThreeBoxes();
    group->SetOneEnable(1, false);
    GroupListener listener;
    listener.HangOn(group);
    group->SetAllEnable(false);
    EXPECT_EQ(listener.heard, (Heard{"0 changed", "2 changed"}));
}

TEST_F(ButtonGroup, AnIndexThatDoesNotExistIsNotEnabled) {
    CheckBoxPane *const group = ThreeBoxes();
    GroupListener listener;
    listener.HangOn(group);
    group->SetOneEnable(-1, false);
    group->SetOneEnable(3, false);
    EXPECT_TRUE(listener.heard.empty());
}

TEST_F(ButtonGroup, TheFirstMessageComesBeforeTheRedrawIsAskedForAndTheSecondAfter) {
    CheckBoxPane *const group = ThreeBoxes();
    GroupListener listener;
    listener.HangOn(group);
    Show();
    std::vector<std::size_t> repainted;
    listener.onValue = [&] { repainted.push_back(Repainted().size()); };
    listener.onChange = [&] { repainted.push_back(Repainted().size()); };
    group->SetOne(0, true);
    EXPECT_EQ(repainted, (std::vector<std::size_t>{0, 1}));
    EXPECT_EQ(listener.heard, (Heard{"0 on", "0 changed"}));
}

TEST_F(ButtonGroup, TheValueIsStoredWhenTheFirstMessageComes) {
    CheckBoxPane *const group = ThreeBoxes();
    GroupListener listener;
    listener.HangOn(group);
    bool value = false;
    listener.onValue = [&] { value = group->ReadOne(0); };
    group->SetOne(0, true);
    EXPECT_TRUE(value);
}

TEST_F(ButtonGroup, AnInvisibleOneChangesAndTellsButRedrawsNothing) {
    CheckBoxPane *const group = ThreeBoxes();
    GroupListener listener;
    listener.HangOn(group);
    Show();
    group->SetVisibility(false);
    Repainted();
    group->SetOne(0, true);
    EXPECT_TRUE(group->ReadOne(0));
    EXPECT_EQ(listener.heard, (Heard{"0 on", "0 changed"}));
    EXPECT_TRUE(Repainted().empty());
}

TEST_F(ButtonGroup, AListenerMayAddButtonsToTheGroup) {
    CheckBoxPane *const group = ThreeBoxes();
    GroupListener listener;
    listener.HangOn(group);
    listener.onValue = [&] {
        for (int i = 0; i < 100; ++i)
            group->AddButton(0, 0, Text("more"));
    };
    Show();
    group->SetOne(0, true);
    EXPECT_EQ(listener.heard, (Heard{"0 on", "0 changed"}));
    EXPECT_EQ(group->CountButtons(), 103);
}

TEST_F(ButtonGroup, AListenerMayDeleteTheNeighbour) {
    CheckBoxPane *const group = ThreeBoxes();
    RadioButtonPane *const neighbour = ThreeRadios();
    Rect box = {100, 100, 180, 200};
    neighbour->SetBox(&box);
    GroupListener listener;
    listener.HangOn(group);
    listener.onValue = [&] { delete neighbour; };
    Show();
    EXPECT_EQ(ResultOfClick("click 25 15"), 1);
    EXPECT_EQ(CountGlogItems(glog), 1);
}

TEST_F(ButtonGroup, AListenerOfTheLastMessageMayDeleteTheGroup) {
    CheckBoxPane *const group = ThreeBoxes();
    GroupListener listener;
    listener.HangOn(group);
    listener.onChange = [&] { delete group; };
    Show();
    EXPECT_EQ(ResultOfClick("click 25 15"), 1);
    EXPECT_EQ(CountGlogItems(glog), 0);
}

TEST_F(ButtonGroup, AListenerMayTurnTheButtonBack) {
    CheckBoxPane *const group = ThreeBoxes();
    GroupListener listener;
    listener.HangOn(group);
    listener.onValue = [&] { group->SetOne(0, false); };
    group->SetOne(0, true);
    EXPECT_FALSE(group->ReadOne(0));
    EXPECT_EQ(listener.heard, (Heard{"0 on", "0 off", "0 changed", "0 changed"}));
}

TEST_F(ButtonGroup, AListenerMayLeaveFromInsideABroadcast) {
    CheckBoxPane *const group = ThreeBoxes();
    GroupListener listener, other;
    listener.HangOn(group);
    other.HangOn(group);
    listener.onValue = [&] { listener.ButtonGroupPaneListener::CancelDependency(group); };
    group->SetOne(0, true);
    group->SetOne(0, false);
    EXPECT_EQ(listener.heard, (Heard{"0 on", "0 changed", "0 changed"}));
    EXPECT_EQ(other.heard, (Heard{"0 on", "0 changed", "0 off", "0 changed"}));
}

TEST_F(ButtonGroup, CanBeEnabledThroughItsProcedures) {
    CheckBoxPane *const group = ThreeBoxes();
    btnSetAllEnable(group, false);
    EXPECT_EQ(IconsOf(*group), (Icons{10, 10, 10}));
    btnSetOneEnable(group, 0x10001, true); // the low 16 bits
    EXPECT_EQ(IconsOf(*group), (Icons{10, 6, 10}));
}

TEST_F(ButtonGroup, AProcedureCanBeReplaced) {
    ProcedureKept const kept;
    static int replaced;
    replaced = 0;
    btnSetOneEnable = [](ButtonGroupPane *, int, bool) { ++replaced; };
    btnSetOneEnable(ThreeBoxes(), 0, false);
    EXPECT_EQ(replaced, 1);
}

// Clicks

TEST_F(ButtonGroup, AClickOnALabelIsAClickOnItsButton) {
    CheckBoxPane *const group = ThreeBoxes();
    Show();
    EXPECT_EQ(ResultOfClick("click 42 37"), 2);
    EXPECT_TRUE(group->ReadOne(1));
}

TEST_F(ButtonGroup, AClickBetweenTheButtonsFallsThrough) {
    GroupItem item;
    item.Button({10, 20}).Button({60, 20});
    CheckBoxPane::NewCheckBoxPane(glog, item.Sheet());
    Show();
    EXPECT_EQ(ResultOfClick("click 25 40"), 0);
}

TEST_F(ButtonGroup, TheGapBetweenButtonAndLabelIsNotHit) {
    GroupItem item;
    item.Button({10, 20}).Label({20, 60}, "label");
    CheckBoxPane::NewCheckBoxPane(glog, item.Sheet());
    Show();
    EXPECT_EQ(ResultOfClick("click 45 15"), 0);
}

TEST_F(ButtonGroup, TheHitExtensionTakesClicksRightOfTheIcon) {
    GroupItem item;
    item.Button({10, 20}, 30);
    CheckBoxPane::NewCheckBoxPane(glog, item.Sheet());
    Show();
    EXPECT_EQ(ResultOfClick("click 61 15"), 1);
}

TEST_F(ButtonGroup, LabelsGoBeforeButtonsWhereTheyOverlap) {
    GroupItem item;
    item.Button({10, 20}, 100);
    item.Button({60, 20}).Label({20, 40}, "over the first");
    CheckBoxPane *const group = CheckBoxPane::NewCheckBoxPane(glog, item.Sheet());
    Show();
    EXPECT_EQ(ResultOfClick("click 45 17"), 2);
    EXPECT_TRUE(group->ReadOne(1));
    EXPECT_FALSE(group->ReadOne(0));
}

TEST_F(ButtonGroup, OfOverlappingButtonsTheFirstIsHit) {
    GroupItem item;
    item.Button({10, 20}).Button({10, 20});
    CheckBoxPane::NewCheckBoxPane(glog, item.Sheet());
    Show();
    EXPECT_EQ(ResultOfClick("click 25 15"), 1);
}

TEST_F(ButtonGroup, ADisabledButtonTakesTheClickAndDoesNothing) {
    CheckBoxPane *const group = ThreeBoxes();
    group->SetOneEnable(1, false);
    Show();
    EXPECT_EQ(ResultOfClick("click 42 37"), -1);
    EXPECT_EQ(ResultOfClick("click 25 35"), -1);
    EXPECT_FALSE(group->ReadOne(1));
    EXPECT_TRUE(IconsIn(desktop.TakeDrawing()).empty());
}

TEST_F(ButtonGroup, WhenClicksAreNotAllowedEveryClickIsTaken) {
    CheckBoxPane *const group = ThreeBoxes();
    group->SetAllowClicks(false);
    Show();
    EXPECT_EQ(ResultOfClick("click 25 35"), -1);
    EXPECT_FALSE(group->ReadOne(1));
    group->SetAllowClicks(true);
    EXPECT_EQ(ResultOfClick("click 25 35"), 2);
}

TEST_F(ButtonGroup, APressShowsThePressedLookThenTheNewOne) {
    ThreeBoxes();
    Show();
    ResultOfClick("press 25 35\nwait 0.3\nrelease");
    Icons const drawn = IconsIn(desktop.TakeDrawing());
    ASSERT_GE(drawn.size(), 3u);
    EXPECT_EQ(drawn[0], 7); // off and pressed
    EXPECT_EQ(drawn[1], 4); // released
    EXPECT_EQ(drawn.back(), 4);
}

TEST_F(ButtonGroup, APressLastsATenthOfASecondAtLeast) {
    ThreeBoxes();
    Show();
    double const start = desktop.Now();
    ResultOfClick("click 25 35");
    EXPECT_DOUBLE_EQ(desktop.Now() - start, 0.1);
}

TEST_F(ButtonGroup, OverTheLabelTheButtonStaysPressed) {
    CheckBoxPane *const group = ThreeBoxes();
    Show();
    EXPECT_EQ(ResultOfClick("press 25 35\nwait 0.2\nmove 45 36\nwait 0.2\nrelease"), 2);
    EXPECT_TRUE(group->ReadOne(1));
}

TEST_F(ButtonGroup, AClickRepaintsOnlyRoundItsButton) {
    CheckBoxPane *const group = ThreeBoxes();
    Show();
    ResultOfClick("click 25 35");
    Rect const button = BoundsOf(*group, 1);
    for (Rect const &rect : desktop.TakePresented(glog)) {
        EXPECT_GE(rect.top, button.top - 3) << rect;
        EXPECT_LE(rect.bottom, button.bottom + 3) << rect;
    }
}

// In a layout

TEST_F(ButtonGroup, InALayoutThePartsMoveWithThePane) {
    CheckBoxPane *const group = ThreeBoxes();
    Rect const first = BoundsOf(*group, 0);
    Rect const box = BoxOf(*group);
    PutIntoLayout(group, 100);
    ASSERT_TRUE(group->IsInLayout());
    EXPECT_EQ(BoundsOf(*group, 0).left, first.left - box.left);
    EXPECT_EQ(BoundsOf(*group, 0).top, first.top - box.top + 100);
}

TEST_F(ButtonGroup, InALayoutTheLabelTakesTheWholeLine) {
    GroupItem item(40);
    item.Button({10, 20}).Label({20, 38}, "label");
    CheckBoxPane *const group = CheckBoxPane::NewCheckBoxPane(glog, item.Sheet());
    Rect const box = BoxOf(*group);
    PutIntoLayout(group, 100);
    EXPECT_EQ(BoundsOf(*group, 0).bottom, 20 - InfoOf(0).ascent - box.top + 100 + 40);
}

TEST_F(ButtonGroup, InALayoutClicksFindThePartsWhereTheyAreDrawn) {
    CheckBoxPane *const group = ThreeBoxes();
    PutIntoLayout(group, 100);
    Show();
    EXPECT_EQ(ResultOfClick("click 5 " + std::to_string(BoundsOf(*group, 1).top + 6)), 2);
    EXPECT_TRUE(group->ReadOne(1));
    EXPECT_EQ(ResultOfClick("click 25 35"), 0);
}

TEST_F(ButtonGroup, InALayoutALabelIsCentredInItsLine) {
    GroupItem item(41);
    item.Button({10, 20}).Label({20, 38}, "label");
    CheckBoxPane *const group = CheckBoxPane::NewCheckBoxPane(glog, item.Sheet());
    PutIntoLayout(group, 100);
    std::string const drawn = Only("DrawStringAtPoint", DrawingOf(*group)).at(0);
    short const top = static_cast<short>(BoundsOf(*group, 0).bottom - 41);
    Point const pen = {static_cast<short>(InfoOf(0).ascent / 2 + 41 / 2 + top + 1), 18};
    std::string const at = "\"at\":[" + std::to_string(pen.v) + "," + std::to_string(pen.h) + "]";
    EXPECT_NE(drawn.find(at), std::string::npos) << drawn << " should stand at " << pen;
}

TEST_F(ButtonGroup, InALayoutANewNameWidensItsLabelAndThePane) {
    CheckBoxPane *const group = ThreeBoxes();
    PutIntoLayout(group, 100);
    char const name[] = "A name that is much longer than all the others";
    short const width = WidthOf(name);
    group->SetNthButtonName(1, Text(name));
    EXPECT_EQ(BoundsOf(*group, 1).right, 18 + width);
    EXPECT_EQ(group->GetLayoutRect()->GetBorderRect().right, 18 + width);
    group->SetNthButtonName(1, Text("i"));
    EXPECT_EQ(BoundsOf(*group, 1).right, 18 + WidthOf("i"));
    EXPECT_GE(group->GetLayoutRect()->GetBorderRect().right, BoundsOf(*group, 2).right);
}

TEST_F(ButtonGroup, InALayoutCalcBoxDoesNothing) {
    CheckBoxPane *const group = ThreeBoxes();
    PutIntoLayout(group, 100);
    Rect const box = BoxOf(*group);
    group->AddSpecialButton(500, 500, 0);
    group->CalcBox();
    EXPECT_EQ(BoxOf(*group), box);
}

TEST_F(ButtonGroup, InALayoutSetBoxMovesNoParts) {
    CheckBoxPane *const group = ThreeBoxes();
    CompoundPane *const column = PutIntoLayout(group, 100);
    Rect box = {0, 0, 5, 5};
    group->SetBox(&box);
    column->SetUseLayout(false);
    EXPECT_EQ(BoundsOf(*group, 0).left, 20);
}

TEST_F(ButtonGroup, PartsThatWereMovedBeforehandLieInTheLayoutAsInTheBox) {
    UseSpacing(18);
    CheckBoxPane *const group = NewBoxes();
    group->AddButton(0, 0, Text("One"));
    group->AddButton(0, 20, Text("Two"));
    group->CalcBox();
    Rect box = BoxOf(*group);
    VelaDrawing::OffsetRect(&box, 30, 40);
    group->SetBox(&box);
    Rect const second = BoundsOf(*group, 1);
    PutIntoLayout(group, 100);
    EXPECT_EQ(BoundsOf(*group, 1).left, second.left - box.left);
    EXPECT_EQ(BoundsOf(*group, 1).top, second.top - box.top + 100);
}

TEST_F(ButtonGroup, InALayoutAValueRedrawsItsButtonWhereItLies) {
    CheckBoxPane *const group = ThreeBoxes();
    PutIntoLayout(group, 100);
    Show();
    short const top = static_cast<short>(BoundsOf(*group, 0).top);
    group->SetOne(0, true);
    std::vector<Rect> const repainted = Repainted();
    ASSERT_EQ(repainted.size(), 1u);
    EXPECT_GE(repainted[0].top, top - 3);
    EXPECT_LE(repainted[0].bottom, top + 2 + 13 + 6) << "the icon lies below its inset";
}

// Help tags

TEST_F(ButtonGroup, ShowsTheHelpTagOfAPart) {
    CheckBoxPane *const group = ThreeBoxes();
    LocalizedStrings::HelpTag const *const given =
        LocalizedStrings::HelpTagMgr::Instance().DemandHelpTag("kGallery", "kOvalButton");
    group->SetHelpTag(given); // a default helper, which gives way
    group->AttachHelpTag(1, given);
    LocalizedStrings::HelpTag const *tag = nullptr;
    Rect rect;
    OS::Help::Placement placement = OS::Help::Placement();
    double delay = 0;
    EXPECT_FALSE(group->GetHelpTagForPoint(Point{15, 25}, tag, rect, placement, delay));
    ASSERT_TRUE(group->GetHelpTagForPoint(Point{35, 25}, tag, rect, placement, delay));
    EXPECT_EQ(tag, given);
    EXPECT_EQ(rect, BoundsOf(*group, 1));
    EXPECT_EQ(placement, OS::Help::kPlacementForParts);
    EXPECT_EQ(delay, 0.5);
}

TEST_F(ButtonGroup, KeepsTheTagsThatItHas) {
    CheckBoxPane *const group = ThreeBoxes();
    LocalizedStrings::HelpTag const *const given =
        LocalizedStrings::HelpTagMgr::Instance().DemandHelpTag("kGallery", "kOvalButton");
    group->AttachHelpTag(0, given);
    HelpTagHelper *const helper = group->GetHelpTagHelper();
    group->AttachHelpTag(1, given);
    EXPECT_EQ(group->GetHelpTagHelper(), helper);
}

// Auto-set

TEST_F(ButtonGroup, OfTwoButtonsBoundToOneProviderOnlyTheFirstIsSet) {
    CheckBoxPane *const group = ThreeBoxes();
    ActivePane source;
    group->SetAutoBinding(&source, 2);
    group->SetAutoBinding(&source, 0);
    GroupListener listener;
    listener.HangOn(group);
    source.Use();
    EXPECT_EQ(listener.heard, (Heard{"2 on", "2 changed"}));
}

TEST_F(ButtonGroup, ActivityOfAnotherProviderIsIgnored) {
    CheckBoxPane *const group = ThreeBoxes();
    ActivePane source, stranger;
    group->SetAutoBinding(&source, 2);
    group->ListenToActivity(&stranger);
    EXPECT_FALSE(group->ReadOne(2));
}

TEST_F(ButtonGroup, ABindingToAButtonThatDoesNotExistDoesNothing) {
    CheckBoxPane *const group = ThreeBoxes();
    ActivePane source;
    group->SetAutoBinding(&source, 7);
    source.Use();
    EXPECT_EQ(IconsOf(*group), (Icons{6, 6, 6}));
}

TEST_F(ButtonGroup, ADyingProviderTakesItsFirstBindingAlong) {
    CheckBoxPane *const group = ThreeBoxes();
    ActivePane other;
    std::unique_ptr<ActivePane> source(new ActivePane);
    Provider<AutoSetActivityListener> *const address = source.get();
    group->SetAutoBinding(source.get(), 0);
    group->SetAutoBinding(&other, 1);
    group->SetAutoBinding(source.get(), 2);
    source.reset();
    group->ListenToActivity(address); // the second row of the provider is the first now
    EXPECT_EQ(IconsOf(*group), (Icons{6, 6, 4}));
    other.Use();
    EXPECT_EQ(IconsOf(*group), (Icons{6, 4, 4}));
}

TEST_F(ButtonGroup, AProviderWithoutBindingMayDie) {
    CheckBoxPane *const group = ThreeBoxes();
    {
        ActivePane unbound;
        unbound.AddDependent(group);
    }
    EXPECT_EQ(group->CountButtons(), 3);
}

TEST_F(ButtonGroup, AGroupThatDiesLeavesItsProviders) {
    ActivePane source;
    CheckBoxPane *const group = ThreeBoxes();
    group->SetAutoBinding(&source, 0);
    delete group;
    EXPECT_FALSE(source.HasDependents());
}
