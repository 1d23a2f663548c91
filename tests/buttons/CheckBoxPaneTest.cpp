#include "tests/VirtualPlace.h"
#include "tests/buttons/ButtonGroupTest.h"

namespace {

typedef std::vector<int> Icons;
typedef OpenGroup<CheckBoxPane> OpenBoxes;

class CheckBoxes : public ButtonGroupTest {
protected:
    static std::string Values(CheckBoxPane &group) {
        std::string values;
        for (short i = 0; i < group.CountButtons(); ++i)
            values += group.ReadOne(i) ? '1' : '0';
        return values;
    }
};

// Puts the procedure variables back when a test has replaced one.
class ReadKept {
public:
    ~ReadKept() { btnReadOneCB = read; }

private:
    bool (*read)(CheckBoxPane *, int) = btnReadOneCB;
};

} // namespace

TEST_F(CheckBoxes, TheirRecordHasKindAndFlags) {
    EXPECT_EQ(sizeof(ckRadItemResRec), 4u);
    EXPECT_EQ(offsetof(ckRadItemResRec, flags), 2u);
}

TEST_F(CheckBoxes, AreNotMadeWithoutAGlog) {
    ckRadItemResRec record = {ckRadItemResRec::kCheckKind, 0};
    GroupItem item = ThreeButtons();
    EXPECT_EQ(CheckBoxPane::NewCheckBoxPane(nullptr, &record), nullptr);
    EXPECT_EQ(CheckBoxPane::NewCheckBoxPane(nullptr, item.Sheet()), nullptr);
}

TEST_F(CheckBoxes, FromARecordHaveNoButtonsUntilTheyAreAdded) {
    CheckBoxPane *const group = NewBoxes();
    EXPECT_EQ(group->CountButtons(), 0);
    group->AddButton(0, 0, Text("One"));
    EXPECT_EQ(group->CountButtons(), 1);
}

TEST_F(CheckBoxes, FromASheetAreAllOff) { EXPECT_EQ(Values(*ThreeBoxes()), "000"); }

TEST_F(CheckBoxes, AreDrawnWithTheirFamilysIcons) {
    CheckBoxPane *const group = ThreeBoxes();
    group->SetOne(0, true);
    group->SetOneEnable(2, false);
    EXPECT_EQ(IconsOf(*group), (Icons{4, 6, 10}));
}

TEST_F(CheckBoxes, ADisabledButtonThatIsOnLooksLikeOneThatIsOff) {
    CheckBoxPane *const group = ThreeBoxes();
    group->SetOne(0, true);
    group->SetAllEnable(false);
    EXPECT_EQ(IconsOf(*group), (Icons{10, 10, 10}));
    EXPECT_TRUE(group->ReadOne(0));
}

TEST_F(CheckBoxes, ShowTheOtherValueAtTheRelease) {
    OpenBoxes group;
    EXPECT_EQ(group.GetReleaseIcon(true), 6);
    EXPECT_EQ(group.GetReleaseIcon(false), 4);
}

TEST_F(CheckBoxes, ReadOneIsFalseForAnIndexThatDoesNotExist) {
    CheckBoxPane *const group = ThreeBoxes();
    group->SetAllToSame(true);
    EXPECT_TRUE(group->ReadOne(2));
    EXPECT_FALSE(group->ReadOne(-1));
    EXPECT_FALSE(group->ReadOne(3));
}

TEST_F(CheckBoxes, SettingAnIndexThatDoesNotExistDoesNothing) {
    CheckBoxPane *const group = ThreeBoxes();
    GroupListener listener;
    listener.HangOn(group);
    group->SetOne(-1, true);
    group->SetOne(3, true);
    group->ToggleOne(-1);
    group->ToggleOne(3);
    EXPECT_EQ(Values(*group), "000");
    EXPECT_TRUE(listener.heard.empty());
}

TEST_F(CheckBoxes, ToggleOneTurnsTheValueOver) {
    CheckBoxPane *const group = ThreeBoxes();
    group->ToggleOne(1);
    EXPECT_EQ(Values(*group), "010");
    group->ToggleOne(1);
    EXPECT_EQ(Values(*group), "000");
}

TEST_F(CheckBoxes, SetAllToSameTellsOfThoseThatChangeInOrder) {
    CheckBoxPane *const group = ThreeBoxes();
    group->SetOne(1, true);
    GroupListener listener;
    listener.HangOn(group);
    group->SetAllToSame(true);
    EXPECT_EQ(Values(*group), "111");
    EXPECT_EQ(listener.heard, (Heard{"0 on", "0 changed", "2 on", "2 changed"}));
}

TEST_F(CheckBoxes, APlainClickToggles) {
    CheckBoxPane *const group = ThreeBoxes();
    Show();
    EXPECT_EQ(ResultOfClick("click 25 35"), 2);
    EXPECT_EQ(Values(*group), "010");
    EXPECT_EQ(ResultOfClick("click 25 35"), 2);
    EXPECT_EQ(Values(*group), "000");
}

TEST_F(CheckBoxes, AnOptionClickTurnsOnWhateverTheValue) {
    CheckBoxPane *const group = ThreeBoxes();
    Show();
    EXPECT_EQ(ResultOfClick("click 25 35 option"), 2);
    EXPECT_EQ(ResultOfClick("click 25 35 option"), 2);
    EXPECT_EQ(Values(*group), "010");
}

TEST_F(CheckBoxes, ACommandClickTurnsOffWhateverTheValue) {
    CheckBoxPane *const group = ThreeBoxes();
    group->SetOne(1, true);
    Show();
    EXPECT_EQ(ResultOfClick("click 25 35 command"), 2);
    EXPECT_EQ(ResultOfClick("click 25 35 command"), 2);
    EXPECT_EQ(Values(*group), "000");
}

TEST_F(CheckBoxes, OptionGoesBeforeCommand) {
    CheckBoxPane *const group = ThreeBoxes();
    Show();
    ResultOfClick("click 25 35 command option");
    EXPECT_EQ(Values(*group), "010");
}

TEST_F(CheckBoxes, WithoutTheFlagModifiersLeaveTheOthersAlone) {
    CheckBoxPane *const group = ThreeBoxes(0xFFFE);
    group->SetOne(0, true);
    Show();
    ResultOfClick("click 25 35 option");
    EXPECT_EQ(Values(*group), "110");
    ResultOfClick("click 25 35 command");
    EXPECT_EQ(Values(*group), "100");
}

TEST_F(CheckBoxes, WithTheFlagAnOptionClickTurnsAllOthersOff) {
    CheckBoxPane *const group = ThreeBoxes(CheckBoxPane::kModifiersChangeOthers);
    group->SetAllToSame(true);
    Show();
    ResultOfClick("click 25 35 option");
    EXPECT_EQ(Values(*group), "010");
}

TEST_F(CheckBoxes, WithTheFlagACommandClickTurnsAllOthersOn) {
    CheckBoxPane *const group = ThreeBoxes(CheckBoxPane::kModifiersChangeOthers);
    Show();
    ResultOfClick("click 25 35 command");
    EXPECT_EQ(Values(*group), "101");
}

TEST_F(CheckBoxes, WithTheFlagAPlainClickLeavesTheOthersAlone) {
    CheckBoxPane *const group = ThreeBoxes(CheckBoxPane::kModifiersChangeOthers);
    group->SetOne(0, true);
    Show();
    ResultOfClick("click 25 35");
    EXPECT_EQ(Values(*group), "110");
}

TEST_F(CheckBoxes, TheFlagOfARecordCountsToo) {
    CheckBoxPane *const group = NewBoxes(CheckBoxPane::kModifiersChangeOthers);
    group->AddButton(0, 20, Text("One"));
    group->AddButton(0, 60, Text("Two"));
    Rect box = {0, 0, 120, 100};
    group->SetBox(&box);
    Show();
    EXPECT_EQ(ResultOfClick("click 18 28 command"), 1);
    EXPECT_EQ(Values(*group), "01");
}

TEST_F(CheckBoxes, TheClickedButtonIsToldBeforeTheOthers) {
    CheckBoxPane *const group = ThreeBoxes(CheckBoxPane::kModifiersChangeOthers);
    GroupListener listener;
    listener.HangOn(group);
    group->SetAllToSame(true);
    group->SetOne(1, false);
    listener.heard.clear();
    Show();
    ResultOfClick("click 25 35 option");
    EXPECT_EQ(listener.heard, (Heard{"1 on", "1 changed", "0 off", "0 changed", "2 off", "2 changed"}));
}

TEST_F(CheckBoxes, APressThatSlidesOffChangesNothing) {
    CheckBoxPane *const group = ThreeBoxes(CheckBoxPane::kModifiersChangeOthers);
    GroupListener listener;
    listener.HangOn(group);
    Show();
    EXPECT_EQ(ResultOfClick("press 25 35 option\nwait 0.2\nmove 300 190\nwait 0.1\nrelease"), -1);
    EXPECT_EQ(Values(*group), "000");
    EXPECT_TRUE(listener.heard.empty());
}

TEST_F(CheckBoxes, ActivityOfABoundPaneTurnsTheButtonOn) {
    CheckBoxPane *const group = ThreeBoxes();
    ActivePane source;
    group->SetAutoBinding(&source, 2);
    GroupListener listener;
    listener.HangOn(group);
    source.Use();
    EXPECT_EQ(Values(*group), "001");
    EXPECT_EQ(listener.heard, (Heard{"2 on", "2 changed"}));
    source.Use();
    EXPECT_EQ(listener.heard.size(), 2u);
}

TEST_F(CheckBoxes, CanBeWorkedThroughTheirProcedures) {
    CheckBoxPane *const group = ThreeBoxes();
    btnSetAllToSame(group, true);
    EXPECT_EQ(Values(*group), "111");
    btnSetOneCB(group, 1, false);
    EXPECT_EQ(Values(*group), "101");
    EXPECT_TRUE(btnReadOneCB(group, 0));
    EXPECT_FALSE(btnReadOneCB(group, 1));
    EXPECT_TRUE(btnToggleOne(group, 1));
    EXPECT_FALSE(btnToggleOne(group, 1));
    EXPECT_FALSE(btnToggleOne(group, -1));
}

TEST_F(CheckBoxes, ProceduresNarrowTheIndex) {
    CheckBoxPane *const group = ThreeBoxes();
    btnSetOneCB(group, 0x10001, true);
    EXPECT_EQ(Values(*group), "010");
    EXPECT_TRUE(btnReadOneCB(group, 0x10001));
}

TEST_F(CheckBoxes, AProcedureCanBeReplaced) {
    ReadKept const kept;
    btnReadOneCB = [](CheckBoxPane *, int) { return true; };
    EXPECT_TRUE(btnReadOneCB(ThreeBoxes(), 0));
}

TEST_F(CheckBoxes, TakeTheirLayoutPropertiesFromTheSheet) {
    GroupItem item = ThreeButtons();
    boost::shared_ptr<XMLLib::ContainerItem> const layout = XMLLib::CreateContainer(Text("Layout"));
    layout->AddSIntItem(Text("Width"), 93);
    item.item->AddItem(Text("Layout"), layout);
    CheckBoxPane *const group = CheckBoxPane::NewCheckBoxPane(glog, item.Sheet());
    PutIntoLayout(group, 0);
    Rect const place = group->GetLayoutRect()->GetBorderRect();
    EXPECT_EQ(place.right - place.left, 93);
}

TEST_F(CheckBoxes, OverrideTheGroupsOperationsInTheirPlaces) {
    OpenBoxes group;
    EXPECT_EQ(PlaceOf(&OpenBoxes::TrackButton), PlaceOf(&ButtonGroupPane::GetRgn) + 2);
    ExpectInOrder(PlaceOf(&OpenBoxes::TrackButton), &OpenBoxes::TrackButton, &OpenBoxes::GetReleaseIcon,
                  &OpenBoxes::AutoSetButton);
}
