#include "tests/VirtualPlace.h"
#include "tests/buttons/ButtonGroupTest.h"

namespace {

typedef std::vector<int> Icons;
typedef OpenGroup<RadioButtonPane> OpenRadios;

class RadioButtons : public ButtonGroupTest {};

// Sets what it is told in another pane's place.
class CountingRadios : public RadioButtonPane {
public:
    static CountingRadios *New(glogRec *owner) {
        ckRadItemResRec record = {ckRadItemResRec::kRadioKind, 0};
        CountingRadios *const group = new CountingRadios;
        return group->InitRadioButtonPane(owner, &record) ? group : nullptr;
    }
    void RadioSet(short index) override {
        sets.push_back(index);
        RadioButtonPane::RadioSet(index);
    }
    short RadioGet() override { return static_cast<short>(RadioButtonPane::RadioGet() + 100); }
    std::vector<short> sets;
};

} // namespace

TEST_F(RadioButtons, AreNotMadeWithoutAGlog) {
    ckRadItemResRec record = {ckRadItemResRec::kRadioKind, 0};
    GroupItem item = ThreeButtons();
    EXPECT_EQ(RadioButtonPane::NewRadioButtonPane(nullptr, &record), nullptr);
    EXPECT_EQ(RadioButtonPane::NewRadioButtonPane(nullptr, item.Sheet()), nullptr);
}

TEST_F(RadioButtons, FromASheetBeginWithTheFirst) {
    RadioButtonPane *const group = ThreeRadios();
    EXPECT_EQ(group->RadioGet(), 0);
    EXPECT_EQ(IconsOf(*group), (Icons{0, 2, 2}));
}

TEST_F(RadioButtons, FromASheetDrawNothingWhileTheyAreMade) {
    Show();
    LeaveForAnotherPort();
    desktop.TakeDrawing();
    RadioButtonPane *const group = ThreeRadios();
    EXPECT_FALSE(IsInItsPort());
    EXPECT_EQ(Only("InvalRect", desktop.TakeDrawing()), Lines());
    EXPECT_EQ(IconsOf(*group), (Icons{0, 2, 2}));
}

TEST_F(RadioButtons, FromASheetWithoutButtonsAreMade) {
    GroupItem item;
    RadioButtonPane *const group = RadioButtonPane::NewRadioButtonPane(glog, item.Sheet());
    EXPECT_EQ(group->RadioGet(), 0);
    EXPECT_EQ(group->CountButtons(), 0);
}

TEST_F(RadioButtons, AreVisibleWhenMade) { EXPECT_TRUE(ThreeRadios()->GetVisibility()); }

TEST_F(RadioButtons, MadeInCodeBeginWithTheFirstWithoutAMessage) {
    RadioButtonPane *const group = NewRadios();
    GroupListener listener;
    listener.HangOn(group);
    group->AddButton(0, 0, Text("One"));
    group->AddButton(0, 20, Text("Two"));
    EXPECT_EQ(IconsOf(*group), (Icons{0, 2}));
    EXPECT_TRUE(listener.heard.empty());
}

TEST_F(RadioButtons, AddingAButtonDoesNotRedraw) {
    RadioButtonPane *const group = ThreeRadios();
    Show();
    group->AddSpecialButton(20, 70, 0);
    EXPECT_TRUE(Repainted().empty());
}

TEST_F(RadioButtons, ADisabledButtonHasAnIconOfItsOwn) {
    RadioButtonPane *const group = ThreeRadios();
    group->SetAllEnable(false);
    EXPECT_EQ(IconsOf(*group), (Icons{8, 8, 8}));
}

TEST_F(RadioButtons, ShowAnOnButtonAtTheRelease) {
    OpenRadios group;
    EXPECT_EQ(group.GetReleaseIcon(true), 0);
    EXPECT_EQ(group.GetReleaseIcon(false), 0);
}

TEST_F(RadioButtons, RadioSetTurnsTheOldOneOffFirst) {
    RadioButtonPane *const group = ThreeRadios();
    GroupListener listener;
    listener.HangOn(group);
    group->RadioSet(2);
    EXPECT_EQ(group->RadioGet(), 2);
    EXPECT_EQ(listener.heard, (Heard{"0 off", "0 changed", "2 on", "2 changed"}));
    EXPECT_EQ(IconsOf(*group), (Icons{2, 2, 0}));
}

TEST_F(RadioButtons, TheNewValueIsKnownWhileTheOldButtonGoesOff) {
    RadioButtonPane *const group = ThreeRadios();
    GroupListener listener;
    listener.HangOn(group);
    std::vector<short> values;
    listener.onValue = [&] { values.push_back(group->RadioGet()); };
    group->RadioSet(2);
    EXPECT_EQ(values, (std::vector<short>{2, 2}));
}

TEST_F(RadioButtons, RadioSetToTheCurrentOneDoesNothing) {
    RadioButtonPane *const group = ThreeRadios();
    GroupListener listener;
    listener.HangOn(group);
    Show();
    group->RadioSet(0);
    EXPECT_TRUE(listener.heard.empty());
    EXPECT_TRUE(Repainted().empty());
}

TEST_F(RadioButtons, RadioSetToAnIndexThatDoesNotExistDoesNothing) {
    RadioButtonPane *const group = ThreeRadios();
    GroupListener listener;
    listener.HangOn(group);
    group->RadioSet(-1);
    group->RadioSet(3);
    EXPECT_EQ(group->RadioGet(), 0);
    EXPECT_TRUE(listener.heard.empty());
}

TEST_F(RadioButtons, AClickMakesAButtonTheCurrentOne) {
    RadioButtonPane *const group = ThreeRadios();
    Show();
    EXPECT_EQ(ResultOfClick("click 25 55"), 3);
    EXPECT_EQ(group->RadioGet(), 2);
}

TEST_F(RadioButtons, AClickOnTheCurrentButtonIsAHitWithoutAMessage) {
    RadioButtonPane *const group = ThreeRadios();
    GroupListener listener;
    listener.HangOn(group);
    Show();
    EXPECT_EQ(ResultOfClick("click 25 15"), 1);
    EXPECT_TRUE(listener.heard.empty());
    EXPECT_EQ(group->RadioGet(), 0);
}

TEST_F(RadioButtons, ModifiersMakeNoDifference) {
    RadioButtonPane *const group = ThreeRadios();
    Show();
    EXPECT_EQ(ResultOfClick("click 25 35 command"), 2);
    EXPECT_EQ(ResultOfClick("click 25 55 option"), 3);
    EXPECT_EQ(group->RadioGet(), 2);
}

TEST_F(RadioButtons, APressThatSlidesOffChangesNothing) {
    RadioButtonPane *const group = ThreeRadios();
    Show();
    EXPECT_EQ(ResultOfClick("press 25 55\nwait 0.2\nmove 300 190\nwait 0.1\nrelease"), -1);
    EXPECT_EQ(group->RadioGet(), 0);
}

TEST_F(RadioButtons, AreTrackedWithThePressedLookOfTheirValue) {
    ThreeRadios();
    Show();
    ResultOfClick("press 25 55\nwait 0.3\nrelease");
    EXPECT_EQ(IconsIn(desktop.TakeDrawing()), (Icons{3, 0, 2, 0}));
    ResultOfClick("press 25 55\nwait 0.3\nrelease");
    Icons const again = IconsIn(desktop.TakeDrawing());
    ASSERT_GE(again.size(), 2u);
    EXPECT_EQ(again[0], 1);
    EXPECT_EQ(again[1], 0);
}

TEST_F(RadioButtons, ActivityOfABoundPaneMakesTheButtonTheCurrentOne) {
    RadioButtonPane *const group = ThreeRadios();
    ActivePane source;
    group->SetAutoBinding(&source, 1);
    source.Use();
    EXPECT_EQ(group->RadioGet(), 1);
}

TEST_F(RadioButtons, ClicksActivityAndProceduresGoThroughTheVirtualOperations) {
    CountingRadios *const group = CountingRadios::New(glog);
    ActivePane source;
    for (short i = 0; i < 4; ++i)
        group->AddSpecialButton(0, static_cast<short>(20 * i), 0);
    group->SetAutoBinding(&source, 2);
    source.Use();
    radSet(group, 3);
    radSet(group, 0x10001);
    EXPECT_EQ(group->sets, (std::vector<short>{2, 3, 1}));
    EXPECT_EQ(radGet(group), 101);
}

TEST_F(RadioButtons, AddTheirOperationsAfterThoseOfTheGroup) {
    std::size_t const first = PlaceOf(&RadioButtonPane::RadioSet);
    EXPECT_GT(first, PlaceOf(&OpenRadios::AutoSetButton));
    ExpectInOrder(first, &RadioButtonPane::RadioSet, &RadioButtonPane::RadioGet);
}

TEST_F(RadioButtons, TakeTheirLayoutPropertiesFromTheSheet) {
    GroupItem item = ThreeButtons();
    boost::shared_ptr<XMLLib::ContainerItem> const layout = XMLLib::CreateContainer(Text("Layout"));
    layout->AddSIntItem(Text("Width"), 93);
    item.item->AddItem(Text("Layout"), layout);
    RadioButtonPane *const group = RadioButtonPane::NewRadioButtonPane(glog, item.Sheet());
    PutIntoLayout(group, 0);
    Rect const place = group->GetLayoutRect()->GetBorderRect();
    EXPECT_EQ(place.right - place.left, 93);
}
