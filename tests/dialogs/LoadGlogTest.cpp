// Dialogs as the glogs and panes that come of them.
#include "buttons/FrameButtonPane.h"
#include "buttons/OvalButtonPane.h"
#include "buttons/StudButtonPane.h"
#include "dialogs/GroupPane.h"
#include "dialogs/SpacerPane.h"
#include "frame/ResourceReading.h"
#include "host/GlogStyleSheet.h"
#include "tests/dialogs/DialogTest.h"
#include "tests/resources/TemporaryDirectory.h"
#include "text/LabelPane.h"

namespace {

std::string const kOvalRect = "<BoundsRect top=\"20\" left=\"30\" bottom=\"39\" right=\"130\"/>";

template <class Pane> class OpenMode : public Pane {
public:
    using Pane::GetMode;
};
template <class Pane> int ModeOf(Pane *pane) { return (pane->*&OpenMode<Pane>::GetMode)(); }

std::string TextOf(GlogButtonPane *button) {
    UString text;
    button->GetButtonText(text);
    return Utf8::FromUString(text);
}

class LoadedGlog : public DialogTest {};

TEST_F(LoadedGlog, HasTheSizeOfItsAttributes) {
    glogRec *const glog = Load("<Glog width=\"360\" height=\"220\"><Items/></Glog>");
    EXPECT_EQ(GetGlogWidth(glog), 360);
    EXPECT_EQ(GetGlogHeight(glog), 220);
    EXPECT_EQ(CountGlogItems(glog), 0);
}

TEST_F(LoadedGlog, IsNotShownYet) { EXPECT_FALSE(Load(Dialog(""))->IsVisible()); }

TEST_F(LoadedGlog, HasTheTitleOfItsAttribute) {
    glogRec *const glog = Load("<Glog title=\"Métronome &amp; Co\" width=\"9\" height=\"9\"><Items/></Glog>");
    EXPECT_EQ(Glog::From(glog).Options().title, "Métronome & Co");
}

TEST_F(LoadedGlog, MayTakeItsTitleFromAStringList) {
    glogRec *const glog =
        Load("<Glog titleList=\"4323\" titleIndex=\"2\" width=\"9\" height=\"9\"><Items/></Glog>");
    EXPECT_EQ(Glog::From(glog).Options().title, "Cancel");
}

TEST_F(LoadedGlog, GrowsOnlyIfItIsToldTo) {
    EXPECT_TRUE(Glog::From(Load("<Glog width=\"9\" height=\"9\" growable=\"yes\"><Items/></Glog>"))
                    .Options()
                    .growable);
    EXPECT_FALSE(Glog::From(Load("<Glog width=\"9\" height=\"9\" growable=\"no\"><Items/></Glog>"))
                     .Options()
                     .growable);
    EXPECT_FALSE(Glog::From(Load(Dialog(""))).Options().growable);
}

TEST_F(LoadedGlog, HasAStyleSheetIfTheDialogHasOne) {
    glogRec *const glog = Load("<Glog width=\"9\" height=\"9\"><StyleSheet><BaselineOffset>3</BaselineOffset>"
                               "</StyleSheet><Items/></Glog>");
    ASSERT_NE(glog->GetStyleSheet(), nullptr);
    EXPECT_EQ(glog->GetStyleSheet()->GetSInt32ItemValue(ResourceKey("BaselineOffset")), 3);
    EXPECT_EQ(Load(Dialog(""))->GetStyleSheet(), nullptr);
}

TEST_F(LoadedGlog, HasItsItemsInTheirOrderUnderTheirNumbers) {
    glogRec *const glog = Load(Dialog("<Item type=\"Label\" id=\"7\"><Text>a</Text></Item>"
                                      "<Item type=\"Spacer\"/><Item type=\"OvalButton\" id=\"3\"/>"));
    ASSERT_EQ(CountGlogItems(glog), 3);
    std::vector<GlogPane *> const &items = Glog::From(glog).Items();
    EXPECT_EQ(items[0]->GetID(), 7);
    EXPECT_EQ(items[1]->GetID(), 0);
    EXPECT_EQ(items[2]->GetID(), 3);
}

TEST_F(LoadedGlog, MayHaveCommentsAndADeclaration) {
    glogRec *const glog =
        Load("<?xml version=\"1.0\" encoding=\"UTF-8\"?><!-- one --><Glog width=\"9\" height=\"9\">"
             "<!-- two --><Items><!-- three --></Items></Glog>");
    EXPECT_EQ(CountGlogItems(glog), 0);
}

TEST_F(LoadedGlog, KeepsToItsSizeLimits) {
    glogRec *const glog =
        Load("<Glog width=\"100\" height=\"100\" growable=\"yes\" minWidth=\"80\" minHeight=\"70\" "
             "maxWidth=\"200\" maxHeight=\"150\"><Items/></Glog>");
    ShowGlog(glog, kShowGlog);
    desktop.Play("resize 10 10");
    EXPECT_EQ(GetGlogWidth(glog), 80);
    EXPECT_EQ(GetGlogHeight(glog), 70);
    desktop.Play("resize 500 500");
    EXPECT_EQ(GetGlogWidth(glog), 200);
    EXPECT_EQ(GetGlogHeight(glog), 150);
}

TEST(LoadGlog, NeedsADesktop) {
    EXPECT_THROW(LoadGlog("any.xml"), std::logic_error);
    EXPECT_THROW(LoadGlogFromText("<Glog/>", "text"), std::logic_error);
    EXPECT_THROW(LoadGlogFromRecords("", 0), std::logic_error);
    EXPECT_THROW(ReadGlogOptions("any.xml"), std::logic_error);
}

class OvalButtonItem : public DialogTest {};

TEST_F(OvalButtonItem, LiesAtItsBoundsRect) {
    EXPECT_EQ(BoxOf(LoadOne<OvalButtonPane>("OvalButton", kOvalRect)), (Rect{20, 30, 39, 130}));
}

TEST_F(OvalButtonItem, LiesAtTheCornerWithoutOne) {
    EXPECT_EQ(BoxOf(LoadOne<OvalButtonPane>("OvalButton", "")), (Rect{0, 0, 19, 0}));
}

TEST_F(OvalButtonItem, TakesItsLabelFromTheListByTextNum) {
    EXPECT_EQ(TextOf(LoadOne<OvalButtonPane>("OvalButton", "<TextNum>2</TextNum>")), "Cancel");
}

TEST_F(OvalButtonItem, HasNoNumberThatNoLabelHas) {
    EXPECT_TRUE(Holds(ComplaintAboutItem("OvalButton", "<TextNum>999</TextNum>"),
                      "item 1 (OvalButton): key TextNum: there is no label of the number 999"));
    EXPECT_TRUE(Holds(ComplaintAboutItem("StudButton", "<TextID>999</TextID>"),
                      "item 1 (StudButton): key TextID: there is no label of the number 999"));
}

TEST_F(OvalButtonItem, PrefersButtonText) {
    EXPECT_EQ(
        TextOf(LoadOne<OvalButtonPane>("OvalButton", "<TextNum>2</TextNum><ButtonText>Größe</ButtonText>")),
        "Größe");
}

TEST_F(OvalButtonItem, HasTheMode) {
    EXPECT_EQ(ModeOf(LoadOne<OvalButtonPane>("OvalButton", "<Mode>1</Mode>")), GlogButtonPane::kDisabled);
    EXPECT_EQ(ModeOf(LoadOne<OvalButtonPane>("OvalButton", "<Mode>255</Mode>")), 255);
    EXPECT_EQ(ModeOf(LoadOne<OvalButtonPane>("OvalButton", "")), GlogButtonPane::kEnabled);
}

class StudButtonItem : public DialogTest {};

TEST_F(StudButtonItem, HasTheHeightOfItsFace) {
    EXPECT_EQ(BoxOf(LoadOne<StudButtonPane>("StudButton", kOvalRect)), (Rect{20, 30, 40, 130}));
}

TEST_F(StudButtonItem, CountsNegativeEdgesFromTheFarEnd) {
    EXPECT_EQ(BoxOf(LoadOne<StudButtonPane>(
                  "StudButton", "<BoundsRect top=\"-30\" left=\"-80\" bottom=\"-10\" right=\"-16\"/>")),
              (Rect{170, 240, 190, 304}));
}

TEST_F(StudButtonItem, TakesItsLabelByTheFormerNumber) {
    EXPECT_EQ(TextOf(LoadOne<StudButtonPane>("StudButton", "<TextID>1</TextID>")), "Play");
    EXPECT_EQ(TextOf(LoadOne<StudButtonPane>("StudButton", "<TextID>19</TextID>")), "Cut");
}

TEST_F(StudButtonItem, PrefersButtonText) {
    EXPECT_EQ(TextOf(LoadOne<StudButtonPane>("StudButton", "<TextID>1</TextID><ButtonText>Go</ButtonText>")),
              "Go");
}

TEST_F(StudButtonItem, HasTheMode) {
    EXPECT_EQ(ModeOf(LoadOne<StudButtonPane>("StudButton", "<Mode>2</Mode>")), StudButtonPane::kInvisible);
    EXPECT_EQ(ModeOf(LoadOne<StudButtonPane>("StudButton", "")), GlogButtonPane::kEnabled);
}

class FrameButtonItem : public DialogTest {
protected:
    std::vector<std::string> Icons(std::string const &keys) {
        glogRec *const glog = LoadOne<FrameButtonPane>("FrameButton", keys)->GetGlog();
        desktop.TakeDrawing();
        ShowGlog(glog, kShowGlog);
        std::vector<std::string> icons;
        for (std::string const &line : desktop.TakeDrawing()) {
            if (Holds(line, "Draw1Icon"))
                icons.push_back(line);
        }
        return icons;
    }
};

TEST_F(FrameButtonItem, LiesAtItsOrigin) {
    EXPECT_EQ(BoxOf(LoadOne<FrameButtonPane>("FrameButton", "<Origin v=\"60\" h=\"20\"/>")),
              (Rect{60, 20, 76, 44}));
}

TEST_F(FrameButtonItem, IsLargerByItsDownOffset) {
    EXPECT_EQ(BoxOf(LoadOne<FrameButtonPane>("FrameButton", "<DownOffset>2</DownOffset>")),
              (Rect{0, 0, 18, 26}));
}

TEST_F(FrameButtonItem, ShowsTheIconOfTheNamedFamily) {
    EXPECT_EQ(Icons("<Origin v=\"60\" h=\"20\"/><ISetID>kNoteGlyphs</ISetID><IconID>2</IconID>"
                    "<GutsOrigin v=\"1\" h=\"8\"/>"),
              (std::vector<std::string>{R"({"op":"Draw1Icon","family":1608,"icon":69,"h":20,"v":60})",
                                        R"({"op":"Draw1Icon","family":1821,"icon":2,"h":28,"v":61})"}));
}

TEST_F(FrameButtonItem, TakesANumberForTheFamilyToo) {
    EXPECT_EQ(Icons("<ISetID>1821</ISetID><State>1</State>"),
              (std::vector<std::string>{R"({"op":"Draw1Icon","family":1608,"icon":70,"h":0,"v":0})",
                                        R"({"op":"Draw1Icon","family":1821,"icon":0,"h":0,"v":0})"}));
}

TEST_F(FrameButtonItem, MayHaveNoIcon) { EXPECT_EQ(Icons("<ISetID>0</ISetID>").size(), 1u); }

TEST_F(FrameButtonItem, HasStateAndMode) {
    FrameButtonPane *const button = LoadOne<FrameButtonPane>(
        "FrameButton", "<State>1</State><Mode>1</Mode><HiliteWhenDown>1</HiliteWhenDown>");
    EXPECT_EQ(button->GetState(), 1);
    EXPECT_EQ(ModeOf(button), GlogButtonPane::kDisabled);
}

class LabelItem : public DialogTest {};

TEST_F(LabelItem, HasTextFontAndAnchor) {
    LabelPane *const label =
        LoadOne<LabelPane>("Label", "<Origin v=\"50\" h=\"10\"/><FSRID>6</FSRID><Text>Tempo</Text>");
    EXPECT_EQ(Utf8::FromUString(label->GetText()), "Tempo");
    EXPECT_EQ(label->GetFontFSRID(), 6);
    EXPECT_EQ(label->GetOrigin().v, 50);
    EXPECT_EQ(label->GetOrigin().h, 10);
}

TEST_F(LabelItem, AlignsAtItsAnchor) {
    Rect const left = BoxOf(LoadOne<LabelPane>("Label", "<Origin v=\"50\" h=\"100\"/><Text>Tempo</Text>"));
    Rect const right =
        BoxOf(LoadOne<LabelPane>("Label", "<Origin v=\"50\" h=\"100\"/><Align>1</Align><Text>Tempo</Text>"));
    EXPECT_EQ(left.left, 100);
    EXPECT_EQ(right.right, 100);
}

TEST_F(LabelItem, MayShowANumber) {
    EXPECT_EQ(Utf8::FromUString(LoadOne<LabelPane>("Label", "<Text>120</Text>")->GetText()), "120");
    EXPECT_EQ(Utf8::FromUString(LoadOne<LabelPane>("Label", "<Text type=\"string\">120</Text>")->GetText()),
              "120");
}

TEST_F(LabelItem, MayBeEmpty) { EXPECT_TRUE(LoadOne<LabelPane>("Label", "<Text/>")->GetText().empty()); }

TEST_F(LabelItem, MayTakeItsTextFromAStringList) {
    EXPECT_EQ(Utf8::FromUString(LoadOne<LabelPane>("Label", "<Text list=\"4323\" index=\"2\"/>")->GetText()),
              "Cancel");
}

TEST_F(LabelItem, KeepsSpacesInCData) {
    EXPECT_EQ(Utf8::FromUString(LoadOne<LabelPane>("Label", "<Text><![CDATA[  a ]]></Text>")->GetText()),
              "  a ");
}

TEST_F(LabelItem, IsAsHighAsItsFontInAGroup) {
    glogRec *const glog =
        Load(Dialog("<Item type=\"Group\"><Items><Item type=\"Label\" id=\"1\"><Text>a</Text></Item>"
                    "</Items></Item>"));
    ShowGlog(glog, kShowGlog);
    EXPECT_GT(GetGlogItem(glog, 1)->ItemHeight(), 10);
}

TEST_F(LabelItem, IsAsHighAsItsLineSpacingInAGroup) {
    glogRec *const glog =
        Load(Dialog("<Item type=\"Group\"><Items><Item type=\"Label\" id=\"1\"><Text>a</Text>"
                    "<LineSpacing>31</LineSpacing></Item></Items></Item>"));
    ShowGlog(glog, kShowGlog);
    EXPECT_EQ(GetGlogItem(glog, 1)->ItemHeight(), 31);
}

TEST_F(LabelItem, IsGrayWithGrayText) {
    auto const colorOf = [&](std::string const &keys) {
        glogRec *const glog =
            LoadOne<LabelPane>("Label", "<Origin v=\"50\" h=\"10\"/><Text>a</Text>" + keys)->GetGlog();
        desktop.TakeDrawing();
        ShowGlog(glog, kShowGlog);
        for (std::string const &line : desktop.TakeDrawing()) {
            if (Holds(line, "DrawStringAtPoint"))
                return line;
        }
        return std::string();
    };
    EXPECT_EQ(colorOf(""), colorOf("<GrayText>0</GrayText>"));
    EXPECT_NE(colorOf(""), colorOf("<GrayText>1</GrayText>"));
}

class EveryItem : public DialogTest {};

TEST_F(EveryItem, MayBeHidden) {
    EXPECT_FALSE(LoadOne<OvalButtonPane>("OvalButton", "<Visible>0</Visible>")->GetVisibility());
    EXPECT_TRUE(LoadOne<OvalButtonPane>("OvalButton", "<Visible>1</Visible>")->GetVisibility());
    EXPECT_TRUE(LoadOne<OvalButtonPane>("OvalButton", "")->GetVisibility());
}

TEST_F(EveryItem, MayHaveAHelpTagOfTheTable) {
    GlogPane *const pane =
        LoadOne<OvalButtonPane>("OvalButton", "<HelpTag group=\"kGallery\" key=\"kOvalButton\"/>");
    LocalizedStrings::HelpTag const *tag = nullptr;
    Rect part = BoxOf(pane);
    OS::Help::Placement placement = OS::Help::kPlacementForParts;
    double delay = 0;
    ASSERT_TRUE(pane->GetHelpTagForPoint(Point{0, 0}, tag, part, placement, delay));
    EXPECT_EQ(tag, LocalizedStrings::HelpTagMgr::Instance().DemandHelpTag("kGallery", "kOvalButton"));
}

TEST_F(EveryItem, MayHaveAHelpTagOfItsOwn) {
    glogRec *const glog =
        LoadOne<OvalButtonPane>("OvalButton", kOvalRect + "<HelpTagText>Starts the clock</HelpTagText>")
            ->GetGlog();
    ShowGlog(glog, kShowGlog);
    desktop.TakeDrawing();
    desktop.Play("move 40 30\nwait 2");
    std::string drawn;
    for (std::string const &line : desktop.TakeDrawing())
        drawn += line;
    EXPECT_TRUE(Holds(drawn, "Starts the clock")) << drawn;
}

class GroupItem : public DialogTest {
protected:
    static std::string Button(int id, int width, std::string const &keys = std::string()) {
        return "<Item type=\"OvalButton\" id=\"" + std::to_string(id) +
               "\"><BoundsRect top=\"0\" left=\"0\" " + "bottom=\"19\" right=\"" + std::to_string(width) +
               "\"/>" + keys + "</Item>";
    }
    glogRec *LoadGroup(std::string const &keys, std::string const &items) {
        glogRec *const glog =
            Load(Dialog("<Item type=\"Group\" id=\"9\">" + keys + "<Items>" + items + "</Items></Item>"));
        ShowGlog(glog, kShowGlog);
        return glog;
    }
    static Rect Place(glogRec *glog, short id) { return BoxOf(GetGlogItem(glog, id)); }
};

TEST_F(GroupItem, PlacesItsItemsDownward) {
    glogRec *const glog = LoadGroup("<Spacing>8</Spacing>", Button(1, 60) + Button(2, 80));
    EXPECT_EQ(Place(glog, 1), (Rect{0, 0, 19, 60}));
    EXPECT_EQ(Place(glog, 2), (Rect{27, 0, 46, 80}));
}

TEST_F(GroupItem, PlacesItsItemsToTheRightWhenItIsHorizontal) {
    glogRec *const glog =
        LoadGroup("<Direction>horiz</Direction><Spacing>8</Spacing>", Button(1, 60) + Button(2, 80));
    EXPECT_EQ(Place(glog, 2), (Rect{0, 68, 19, 148}));
}

TEST_F(GroupItem, LeavesItsItemsWhereTheyAreWhenItIsFree) {
    glogRec *const glog = LoadGroup(
        "<BoundsRect top=\"10\" left=\"10\" bottom=\"100\" right=\"200\"/><Direction>free</Direction>",
        "<Item type=\"OvalButton\" id=\"1\">" + kOvalRect + "</Item>");
    EXPECT_EQ(Place(glog, 1), (Rect{20, 30, 39, 130}));
}

TEST_F(GroupItem, KeepsItsInsetsFree) {
    glogRec *const glog =
        LoadGroup("<Insets top=\"4\" left=\"6\" bottom=\"8\" right=\"10\"/>", Button(1, 60) + Button(2, 80));
    EXPECT_EQ(Place(glog, 1), (Rect{4, 6, 23, 66}));
    EXPECT_EQ(Place(glog, 9), (Rect{0, 0, 50, 96}));
}

TEST_F(GroupItem, HasTheSizeOfItsItemsAtItsOrigin) {
    glogRec *const glog = LoadGroup("<Origin v=\"7\" h=\"5\"/>", Button(1, 60) + Button(2, 80));
    EXPECT_EQ(Place(glog, 9), (Rect{7, 5, 45, 85}));
}

TEST_F(GroupItem, KeepsItsBoundsRect) {
    glogRec *const glog =
        LoadGroup("<BoundsRect top=\"10\" left=\"10\" bottom=\"100\" right=\"200\"/>", Button(1, 60));
    EXPECT_EQ(Place(glog, 9), (Rect{10, 10, 100, 200}));
}

TEST_F(GroupItem, GivesEachItemWhatItsLayoutSays) {
    glogRec *const glog = LoadGroup(
        "<BoundsRect top=\"0\" left=\"0\" bottom=\"100\" right=\"200\"/>",
        Button(1, 60, "<Layout><Alignment>1</Alignment></Layout>") +
            Button(
                2, 60,
                "<Layout><Alignment>2</Alignment><InsetTop>5</InsetTop><InsetRight>3</InsetRight></Layout>") +
            Button(3, 60, "<Layout><Width>90</Width><Height>20</Height><InsetLeft>2</InsetLeft></Layout>") +
            Button(4, 60,
                   "<Layout><Alignment>3</Alignment><InsetBottom>7</InsetBottom><GrowHeight>1</GrowHeight>"
                   "</Layout>"));
    EXPECT_EQ(Place(glog, 1), (Rect{0, 70, 19, 130}));
    EXPECT_EQ(Place(glog, 2), (Rect{24, 137, 43, 197}));
    EXPECT_EQ(Place(glog, 3), (Rect{43, 2, 63, 92}));
    EXPECT_EQ(Place(glog, 4), (Rect{63, 0, 93, 200}));
}

TEST_F(GroupItem, LetsNoHiddenItemTakeRoom) {
    glogRec *const glog =
        Load(Dialog("<Item type=\"Group\" id=\"1\"><Spacing>5</Spacing><Items>" +
                    Button(2, 40, "<Visible>0</Visible>") + Button(3, 40, "") + "</Items></Item>"));
    ShowGlog(glog, kShowGlog);
    EXPECT_EQ(BoxOf(GetGlogItem(glog, 3)).top, 0);
    GetGlogItem(glog, 2)->Show();
    desktop.Play("wait 0.1");
    EXPECT_EQ(BoxOf(GetGlogItem(glog, 3)).top, 19 + 5);
}

TEST_F(GroupItem, SharesOutRoomByGrowWidthAndKeepsMinima) {
    glogRec *const glog = LoadGroup(
        "<BoundsRect top=\"0\" left=\"0\" bottom=\"50\" right=\"200\"/><Direction>horiz</Direction>",
        Button(1, 40, "<Layout><GrowWidth>1</GrowWidth></Layout>") +
            Button(2, 40, "<Layout><MinWidth>60</MinWidth><MinHeight>30</MinHeight></Layout>"));
    EXPECT_EQ(Place(glog, 1), (Rect{0, 0, 19, 140}));
    EXPECT_EQ(Place(glog, 2), (Rect{0, 140, 30, 200}));
}

TEST_F(GroupItem, GrowsWithTheWindow) {
    glogRec *const glog =
        Load("<Glog width=\"200\" height=\"100\" growable=\"yes\"><Items><Item type=\"Group\" id=\"9\">"
             "<BoundsRect top=\"0\" left=\"0\" bottom=\"100\" right=\"200\"/>"
             "<Layout><GrowWidth>1</GrowWidth><GrowHeight>1</GrowHeight></Layout><Items>" +
             Button(1, 60, "<Layout><Alignment>3</Alignment></Layout>") + "</Items></Item></Items></Glog>");
    ShowGlog(glog, kShowGlog);
    desktop.Play("resize 260 130");
    EXPECT_EQ(Place(glog, 9), (Rect{0, 0, 130, 260}));
    EXPECT_EQ(Place(glog, 1), (Rect{0, 0, 19, 260}));
}

TEST_F(GroupItem, HoldsGroups) {
    glogRec *const glog = LoadGroup(
        "<Spacing>5</Spacing>",
        "<Item type=\"Group\" id=\"8\"><Direction>horiz</Direction><Items>" + Button(1, 60) + Button(2, 60) +
            "</Items></Item><Item type=\"Spacer\"><Layout><Height>11</Height></Layout></Item>" +
            Button(3, 60));
    EXPECT_EQ(Place(glog, 8), (Rect{0, 0, 19, 120}));
    EXPECT_EQ(Place(glog, 2), (Rect{0, 60, 19, 120}));
    EXPECT_EQ(Place(glog, 3), (Rect{40, 0, 59, 60}));
}

TEST_F(GroupItem, DrawsAPlateOnlyAsAPanel) {
    auto const plates = [&](std::string const &keys) {
        desktop.TakeDrawing();
        LoadGroup(keys + "<BoundsRect top=\"0\" left=\"0\" bottom=\"50\" right=\"90\"/>", "");
        int count = 0;
        for (std::string const &line : desktop.TakeDrawing())
            count += Holds(line, "PaintRoundRect");
        return count;
    };
    EXPECT_EQ(plates("<Style>panel</Style>"), 1);
    EXPECT_EQ(plates("<Style>plain</Style>"), 0);
    EXPECT_EQ(plates(""), 0);
}

TEST_F(GroupItem, LetsClicksThroughToItsItems) {
    glogRec *const glog = LoadGroup("<Origin v=\"50\" h=\"100\"/>", Button(4, 60));
    int hit = 0;
    desktop.SetHitHandler([&](glogRec *where, int item, int) { hit = where == glog ? item : -1; });
    desktop.Play("click 110 60");
    EXPECT_EQ(hit, 4);
}

class DialogFile : public DialogTest {
protected:
    std::string Write(std::string const &name, std::string const &text) const {
        return directory.Write(name, text);
    }
    TemporaryDirectory directory;
};

TEST_F(DialogFile, IsLoaded) {
    glogRec *const glog = LoadGlog(Write("a.xml", Dialog(Item("OvalButton", "<TextNum>1</TextNum>"))));
    EXPECT_TRUE(Holds(Dump(glog), "\"text\":\"OK\"")) << Dump(glog);
}

TEST_F(DialogFile, TellsItsOptionsWithoutBeingMade) {
    GlogOptions const options = ReadGlogOptions(
        Write("a.xml", "<Glog title=\"A\" width=\"9\" height=\"8\" growable=\"yes\"><Items/></Glog>"));
    EXPECT_EQ(options.title, "A");
    EXPECT_EQ(options.width, 9);
    EXPECT_EQ(options.height, 8);
    EXPECT_TRUE(options.growable);
    EXPECT_EQ(Glogs(), 0u);
}

TEST_F(DialogFile, MayBeLoadedIntoAContainer) {
    glogRec *const glog = Load(Dialog("<Item type=\"Group\" id=\"9\"/>"));
    CompoundPane *const into = dynamic_cast<CompoundPane *>(GetGlogItem(glog, 9));
    ShowGlog(glog, kShowGlog);
    LoadItems(
        Write("a.xml", Dialog(Item("OvalButton", kOvalRect) + "<Item type=\"Label\"><Text>a</Text></Item>")),
        into);
    EXPECT_EQ(into->NumSubpanes(), 2);
    EXPECT_EQ(into->Get(0)->GetID(), 1);
    EXPECT_EQ(CountGlogItems(glog), 1);
}

TEST_F(DialogFile, LeavesTheContainerAloneWhenItIsWrong) {
    glogRec *const glog = Load(Dialog("<Item type=\"Group\" id=\"9\"/>"));
    CompoundPane *const into = dynamic_cast<CompoundPane *>(GetGlogItem(glog, 9));
    std::string const path = Write(
        "a.xml", Dialog("<Item type=\"Spacer\"/><Item type=\"FrameButton\"><ISetID>kNone</ISetID></Item>"));
    EXPECT_THROW(LoadItems(path, into), LoadError);
    EXPECT_EQ(into->NumSubpanes(), 0);
    EXPECT_EQ(CountGlogItems(glog), 1);
}

TEST_F(DialogFile, MayBeLoadedAgainInThePlaceOfItsGlog) {
    std::string const path = Write("a.xml", Dialog(Item("OvalButton", "<ButtonText>One</ButtonText>")));
    glogRec *const first = LoadGlog(path);
    Rect place = {120, 140, 320, 460};
    PositionGlog(first, &place, false);
    ShowGlog(first, kShowGlog);
    Write("a.xml", Dialog(Item("OvalButton", "<ButtonText>Two</ButtonText>")));
    glogRec *const second = ReloadGlog(first, path);
    EXPECT_EQ(Glogs(), 1u);
    EXPECT_TRUE(second->IsVisible());
    EXPECT_TRUE(Holds(Dump(second), "\"text\":\"Two\""));
    Point const at = Glog::From(second).Window()->ScreenPlace();
    EXPECT_EQ(at.v, 120);
    EXPECT_EQ(at.h, 140);
}

TEST_F(DialogFile, LeavesItsGlogAloneWhenItCannotBeLoadedAgain) {
    std::string const path = Write("a.xml", Dialog(""));
    glogRec *const first = LoadGlog(path);
    ShowGlog(first, kShowGlog);
    Write("a.xml", "<Glog");
    EXPECT_THROW(ReloadGlog(first, path), LoadError);
    EXPECT_EQ(Glogs(), 1u);
    EXPECT_TRUE(first->IsVisible());
}

TEST(DialogLanguage, IsThatOfTheDesktop) {
    SimulatedDesktop desktop(DesktopOptions().Language("de"));
    glogRec *const glog = LoadGlogFromText(
        "<Glog width=\"9\" height=\"9\"><Items><Item type=\"OvalButton\" id=\"1\"><TextNum>2</TextNum>"
        "</Item></Items></Glog>",
        "text");
    EXPECT_EQ(TextOf(dynamic_cast<GlogButtonPane *>(GetGlogItem(glog, 1))), "Abbrechen");
}

class TopLevelItem : public DialogTest {
protected:
    // Pixels by which the item becomes wider when the window becomes 50 wider.
    int Growth(std::string const &type, std::string const &keys) {
        glogRec *const glog =
            Load("<Glog width=\"100\" height=\"90\" growable=\"yes\"><Items>" +
                 Item(type, "<BoundsRect top=\"0\" left=\"0\" bottom=\"40\" right=\"60\"/>" + keys +
                                "<Layout><GrowWidth>1</GrowWidth></Layout>") +
                 "</Items></Glog>");
        ShowGlog(glog, kShowGlog);
        Rect const before = BoxOf(GetGlogItem(glog, 1));
        desktop.Play("resize 150 90");
        Rect const after = BoxOf(GetGlogItem(glog, 1));
        DisposeGlog(glog);
        return (after.right - after.left) - (before.right - before.left);
    }
};

TEST_F(TopLevelItem, FollowsTheWindowByItsSharesOfGrowth) {
    for (char const *type : {"Group", "Box", "TextField", "Tabs", "PopUpMenu", "ScrollPane"})
        EXPECT_EQ(Growth(type, type == std::string("Tabs") ? "<Items/>" : ""), 50) << type;
}

TEST_F(TopLevelItem, HasOtherWaysToFollowInSomeTypes) {
    for (char const *type : {"List", "ProgressBar", "ScrollBar", "ScrollGrid"})
        EXPECT_EQ(Growth(type, type == std::string("List") ? "<LineHeight>18</LineHeight>" : ""), 0) << type;
}

} // namespace
