// Icons, icon buttons, boxes and small buttons in dialogs.
#include "buttons/BoxPane.h"
#include "buttons/BoxSelectPane.h"
#include "buttons/GIconButton.h"
#include "buttons/SuccessiveIconsPane.h"
#include "buttons/TrackSelectorButtonPane.h"
#include "buttons/TwistDownButton.h"
#include "tests/dialogs/DialogTest.h"

namespace {

std::string const kBounds = "<BoundsRect top=\"20\" left=\"30\" bottom=\"36\" right=\"50\"/>";
std::string const kIconKeys = kBounds + "<FamilyID>kTransportIcons</FamilyID><Num>5</Num>"
                                        "<NumStates>2</NumStates><CanDisable>1</CanDisable>";
std::string const kBoxes = "<RectList><Box top=\"20\" left=\"30\" bottom=\"36\" right=\"50\"/>"
                           "<Box top=\"20\" left=\"60\" bottom=\"36\" right=\"80\"/></RectList>";
Rect const kBox = {20, 30, 36, 50};

class IconItems : public DialogTest {
protected:
    // The messages of the kind that the script leads to, from the pane's class on.
    std::vector<std::string> Reported(std::string const &message, std::string const &script) {
        desktop.TakeMessages();
        desktop.Play(script);
        std::vector<std::string> found;
        for (std::string const &line : desktop.TakeMessages()) {
            if (Holds(line, '"' + message + '"'))
                found.push_back(line.substr(line.find("\"message\"")));
        }
        return found;
    }
};

typedef std::vector<std::string> Lines;

// Records put together number by number.
std::string Shorts(std::vector<int> const &values) {
    std::string bytes;
    for (int value : values) {
        bytes += static_cast<char>(value & 0xFF);
        bytes += static_cast<char>(value >> 8 & 0xFF);
    }
    return bytes;
}

class IconRecords : public DialogTest {
protected:
    static std::string File(std::string const &record) {
        return "GLOGREC1" + Shorts({320, 200, 1, static_cast<int>(record.size())}) + record;
    }
    template <class Pane> Pane *LoadRecord(std::string const &record) {
        std::string const file = File(record);
        glogRec *const glog = LoadGlogFromRecords(file.data(), file.size(), GlogOptions(), "old.glog");
        return dynamic_cast<Pane *>(GetGlogItem(glog, 1));
    }
    std::string About(std::string const &record) {
        return Complaint([&] { LoadRecord<GlogPane>(record); });
    }
};

TEST_F(IconItems, MakeIcons) {
    GIconPane *const icon = LoadOne<GIconPane>("Icon", kIconKeys);
    ASSERT_NE(icon, nullptr);
    EXPECT_EQ(BoxOf(icon), kBox);
    EXPECT_EQ(icon->GetFamilyID(), 2000);
    EXPECT_EQ(icon->GetIconNum(), 5);
    EXPECT_EQ(icon->GetNumStates(), 2);
    EXPECT_TRUE(icon->CanDisable());
}

TEST_F(IconItems, BeginWithTheStateAndTheModeThatTheyAreGiven) {
    GIconPane *const icon = LoadOne<GIconPane>("Icon", kIconKeys + "<State>1</State><Mode>1</Mode>");
    EXPECT_EQ(icon->GetCurState(), 1);
    EXPECT_FALSE(icon->GetEnabled());
    GIconButton *const button = LoadOne<GIconButton>(
        "IconButton", kIconKeys + "<NumDownStates>2</NumDownStates><State>1</State><Mode>0</Mode>");
    EXPECT_EQ(button->GetCurState(), 1);
    EXPECT_TRUE(button->GetEnabled());
    EXPECT_TRUE(Holds(ComplaintAboutItem("Icon", kIconKeys + "<State>2</State>"), "there is no state 2"));
}

TEST_F(IconItems, MakeIconButtonsWhoseCommandsAreReported) {
    GIconButton *const button = LoadOne<GIconButton>(
        "IconButton", kIconKeys + "<NumDownStates>2</NumDownStates><CanCancel>1</CanCancel>"
                                  "<NotifyWindow>1</NotifyWindow><CmdClassID>15</CmdClassID><CmdID>11</CmdID>"
                                  "<OptCmdClassID>16</OptCmdClassID><OptCmdID>12</OptCmdID>");
    ASSERT_NE(button, nullptr);
    ShowGlog(button->GetGlog(), kShowGlog);
    EXPECT_EQ(Reported("ExecuteCommand", "click 40 28\nclick 40 28 option"),
              (Lines{"\"message\":\"ExecuteCommand\",\"class\":15,\"command\":11}",
                     "\"message\":\"ExecuteCommand\",\"class\":16,\"command\":12}"}));
}

TEST_F(IconItems, MakeStripsOfIcons) {
    SuccessiveIconsPane *const strip = LoadOne<SuccessiveIconsPane>(
        "SuccessiveIcons",
        kBounds + "<FamilyID>kNoteGlyphs</FamilyID><BaseIcon>3</BaseIcon><Width>16</Width>");
    ASSERT_NE(strip, nullptr);
    int family = 0, baseIcon = 0, width = 0;
    strip->GetIconData(family, baseIcon, width);
    EXPECT_EQ(BoxOf(strip), kBox);
    EXPECT_EQ(family, 1821);
    EXPECT_EQ(baseIcon, 3);
    EXPECT_EQ(width, 16);
}

TEST_F(IconItems, MakeBoxes) { EXPECT_EQ(BoxOf(LoadOne<BoxPane>("Box", kBounds)), kBox); }

TEST_F(IconItems, MakeBoxSelectionsWhoseChangesAreReported) {
    BoxSelectPane *const selection = LoadOne<BoxSelectPane>("BoxSelect", kBoxes);
    ASSERT_NE(selection, nullptr);
    EXPECT_EQ(BoxOf(selection), (Rect{20, 30, 36, 80}));
    EXPECT_TRUE(selection->ReadOne(0));
    ShowGlog(selection->GetGlog(), kShowGlog);
    EXPECT_EQ(Reported("BoxValueChanged", "click 65 25"),
              (Lines{"\"message\":\"BoxValueChanged\",\"index\":0,\"value\":false}",
                     "\"message\":\"BoxValueChanged\",\"index\":1,\"value\":true}"}));
}

TEST_F(IconItems, MakeTrianglesWhosePressesAreReported) {
    TwistDownButton *const button = LoadOne<TwistDownButton>("TwistDown", "<Origin v=\"20\" h=\"30\"/>");
    ASSERT_NE(button, nullptr);
    EXPECT_EQ(BoxOf(button), (Rect{20, 30, 33, 43}));
    ShowGlog(button->GetGlog(), kShowGlog);
    EXPECT_EQ(Reported("GlogButtonPressed", "click 35 25").size(), 1u);
    EXPECT_TRUE(button->IsOpen());
}

TEST_F(IconItems, MakeDisabledTriangles) {
    TwistDownButton *const button = LoadOne<TwistDownButton>("TwistDown", "<Mode>1</Mode>");
    ShowGlog(button->GetGlog(), kShowGlog);
    desktop.Play("click 5 5");
    EXPECT_FALSE(button->IsOpen());
}

TEST_F(IconItems, MakeTrackSelectorsWhoseReleasesAreReported) {
    TrackSelectorButtonPane *const button =
        LoadOne<TrackSelectorButtonPane>("TrackSelector", "<Origin v=\"20\" h=\"30\"/>");
    ASSERT_NE(button, nullptr);
    EXPECT_EQ(BoxOf(button), (Rect{20, 30, 36, 45}));
    ShowGlog(button->GetGlog(), kShowGlog);
    EXPECT_EQ(Reported("TrackSelectorButtonReleased", "click 35 25").size(), 1u);
    EXPECT_EQ(button->GetState(), 1);
}

TEST_F(IconItems, LieInGroupsWithTheirNaturalSizes) {
    glogRec *const glog = Load(Dialog("<Item type=\"Group\"><Origin v=\"10\" h=\"10\"/><Items>"
                                      "<Item type=\"Icon\" id=\"1\">" +
                                      kIconKeys + "</Item><Item type=\"BoxSelect\" id=\"2\">" + kBoxes +
                                      "</Item><Item type=\"TrackSelector\" id=\"3\"/></Items></Item>"));
    ShowGlog(glog, kShowGlog);
    Rect const icon = BoxOf(GetGlogItem(glog, 1));
    Rect const selection = BoxOf(GetGlogItem(glog, 2));
    Rect const selector = BoxOf(GetGlogItem(glog, 3));
    EXPECT_EQ(icon.bottom - icon.top, 16);
    EXPECT_EQ(selection.top, icon.bottom);
    EXPECT_EQ(selection.bottom - selection.top, 16);
    EXPECT_EQ(selector.top, selection.bottom);
    EXPECT_EQ(selector.bottom - selector.top, 16);
}

TEST_F(IconItems, AreToldOfInTheTreeDump) {
    std::string const dump =
        Dump(Load(Dialog(Item("Icon", kIconKeys) + "<Item type=\"BoxSelect\">" + kBoxes + "</Item>" +
                         "<Item type=\"TwistDown\"/><Item type=\"TrackSelector\"/>"
                         "<Item type=\"SuccessiveIcons\"><FamilyID>kNoteGlyphs</FamilyID><Width>9</Width>"
                         "</Item>")));
    EXPECT_TRUE(Holds(dump, "\"family\":2000,\"icon\":5,\"state\":0,\"enabled\":true")) << dump;
    EXPECT_TRUE(Holds(dump, "\"values\":[true,false],\"current\":0")) << dump;
    EXPECT_TRUE(Holds(dump, "\"open\":false")) << dump;
    EXPECT_TRUE(Holds(dump, "\"state\":0,\"enabled\":true")) << dump;
    EXPECT_TRUE(Holds(dump, "\"family\":1821,\"icon\":0,\"width\":9")) << dump;
}

TEST_F(IconItems, RefuseAnUnknownIconFamily) {
    for (char const *type : {"Icon", "IconButton", "SuccessiveIcons"}) {
        std::string const complaint = ComplaintAboutItem(
            type, "<FamilyID>kNoSuchIcons</FamilyID>" +
                      std::string(type == std::string("SuccessiveIcons") ? "<Width>9</Width>"
                                                                         : "<NumStates>1</NumStates>") +
                      (type == std::string("IconButton") ? "<NumDownStates>1</NumDownStates>" : ""));
        EXPECT_TRUE(Holds(complaint, "there is no icon family \"kNoSuchIcons\"")) << complaint;
    }
}

TEST_F(IconItems, RefuseToHaveNoStatesOrNoWidth) {
    std::string const family = "<FamilyID>kNoteGlyphs</FamilyID>";
    EXPECT_TRUE(Holds(ComplaintAboutItem("Icon", family), "NumStates"));
    EXPECT_TRUE(Holds(ComplaintAboutItem("Icon", family + "<NumStates>0</NumStates>"), "NumStates"));
    EXPECT_TRUE(
        Holds(ComplaintAboutItem("IconButton", family + "<NumStates>1</NumStates>"), "NumDownStates"));
    EXPECT_TRUE(Holds(ComplaintAboutItem("IconButton", family + "<NumStates>1</NumStates>"
                                                                "<NumDownStates>0</NumDownStates>"),
                      "NumDownStates"));
    EXPECT_TRUE(Holds(ComplaintAboutItem("SuccessiveIcons", family + "<Width>0</Width>"), "Width"));
}

TEST_F(IconItems, TellWhichNumberIsOutOfItsRange) {
    std::string const family = "<FamilyID>kNoteGlyphs</FamilyID>";
    EXPECT_EQ(ComplaintAboutItem("IconButton", family + "<NumStates>1</NumStates>\n <NumDownStates>0"
                                                        "</NumDownStates>"),
              "test.xml:2:2: item 1 (IconButton): key NumDownStates: expected an integer from 1 to 32767, "
              "found 0");
    EXPECT_EQ(ComplaintAboutItem("SuccessiveIcons", family + "\n<Width>0</Width>"),
              "test.xml:2:1: item 1 (SuccessiveIcons): key Width: expected an integer from 1 to 32767, found "
              "0");
    EXPECT_EQ(ComplaintAboutItem("SuccessiveIcons", family + "\n<Width>32768</Width>"),
              "test.xml:2:1: item 1 (SuccessiveIcons): key Width: expected an integer from 1 to 32767, found "
              "32768");
    EXPECT_TRUE(Holds(ComplaintAboutItem("Icon", family + "<NumStates>1</NumStates><Num>-1</Num>"),
                      "key Num: expected an integer from 0 to 32767, found -1"));
    EXPECT_TRUE(Holds(ComplaintAboutItem("Icon", family + "<NumStates>99999999999999999999</NumStates>"),
                      "key NumStates: "));
}

TEST_F(IconItems, RefuseMoreBoxesThanThereAreIndices) {
    std::string all;
    for (int i = 0; i < 32768; ++i)
        all += "<Box top=\"0\" left=\"0\" bottom=\"1\" right=\"1\"/>";
    for (char const *mode : {"<Mode>0</Mode>", "<Mode>1</Mode>"})
        EXPECT_TRUE(Holds(ComplaintAboutItem("BoxSelect", mode + ("<RectList>" + all + "</RectList>")),
                          "item 1 (BoxSelect): key RectList: expected 1 to 32767 boxes, found 32768"));
}

TEST_F(IconItems, RefuseASelectionWithoutBoxes) {
    EXPECT_TRUE(Holds(ComplaintAboutItem("BoxSelect", "<Mode>1</Mode>"), "RectList"));
    EXPECT_TRUE(Holds(ComplaintAboutItem("BoxSelect", "<RectList/>"), "Box"));
}

TEST_F(IconRecords, MakeIcons) {
    GIconPane *const icon = LoadRecord<GIconPane>(Shorts({47, 20, 30, 20, 16, 2000, 5, 2, 1}));
    ASSERT_NE(icon, nullptr);
    EXPECT_EQ(BoxOf(icon), kBox);
    EXPECT_EQ(icon->GetIconNum(), 5);
    EXPECT_EQ(icon->GetNumStates(), 2);
}

TEST_F(IconRecords, MakeIconButtons) {
    GIconButton *const button =
        LoadRecord<GIconButton>(Shorts({49, 20, 30, 20, 16, 2000, 5, 2, 1, 1, 1 | 1 << 8, 15, 16, 11, 12}));
    ASSERT_NE(button, nullptr);
    ShowGlog(button->GetGlog(), kShowGlog);
    desktop.TakeMessages();
    desktop.Play("click 40 28");
    std::string all;
    for (std::string const &line : desktop.TakeMessages())
        all += line;
    EXPECT_TRUE(Holds(all, "\"class\":15,\"command\":11")) << all;
    EXPECT_EQ(button->GetCurState(), 1);
}

TEST_F(IconRecords, MakeStripsOfIcons) {
    SuccessiveIconsPane *const strip =
        LoadRecord<SuccessiveIconsPane>(Shorts({64, 20, 30, 36, 50, 0, 1821, 0, 3, 0, 16, 0}));
    ASSERT_NE(strip, nullptr);
    int family = 0, baseIcon = 0, width = 0;
    strip->GetIconData(family, baseIcon, width);
    EXPECT_EQ(BoxOf(strip), kBox);
    EXPECT_EQ(family, 1821);
    EXPECT_EQ(baseIcon, 3);
    EXPECT_EQ(width, 16);
}

TEST_F(IconRecords, MakeBoxSelectionsOfEmptyBoxes) {
    BoxSelectPane *const selection = LoadRecord<BoxSelectPane>(Shorts({14, 3, 0 | 1 << 8}));
    ASSERT_NE(selection, nullptr);
    EXPECT_EQ(selection->GetNumBoxes(), 3);
    EXPECT_FALSE(selection->ReadOne(0));
}

TEST_F(IconRecords, RefuseCountsAndWidthsBelowOne) {
    EXPECT_EQ(
        About(Shorts({47, 20, 30, 20, 16, 2000, 5, 0, 1})),
        "old.glog: byte 30: item 1 (Icon): key NumStates: expected an integer from 1 to 32767, found 0");
    EXPECT_EQ(About(Shorts({47, 20, 30, 20, 16, 2000, -1, 1, 1})),
              "old.glog: byte 28: item 1 (Icon): key Num: expected an integer from 0 to 32767, found -1");
    EXPECT_EQ(About(Shorts({49, 20, 30, 20, 16, 2000, 5, -2, 1, 1, 0, 0, 0, 0, 0})),
              "old.glog: byte 30: item 1 (IconButton): key NumStates: expected an integer from 1 to 32767, "
              "found -2");
    EXPECT_EQ(About(Shorts({49, 20, 30, 20, 16, 2000, 5, 2, 1, 0, 0, 0, 0, 0, 0})),
              "old.glog: byte 34: item 1 (IconButton): key NumDownStates: expected an integer from 1 to "
              "32767, found 0");
    EXPECT_EQ(About(Shorts({64, 20, 30, 36, 50, 0, 1821, 0, 3, 0, 0, 0})),
              "old.glog: byte 36: item 1 (SuccessiveIcons): key Width: expected an integer from 1 to 32767, "
              "found 0");
    EXPECT_EQ(About(Shorts({64, 20, 30, 36, 50, 0, 1821, 0, 3, 0, -1, -1})),
              "old.glog: byte 36: item 1 (SuccessiveIcons): key Width: expected an integer from 1 to 32767, "
              "found -1");
    EXPECT_EQ(About(Shorts({64, 20, 30, 36, 50, 0, 1821, 0, 3, 0, -1, 0x7FFF})),
              "old.glog: byte 36: item 1 (SuccessiveIcons): key Width: expected an integer from 1 to 32767, "
              "found 2147483647");
    EXPECT_EQ(About(Shorts({64, 20, 30, 36, 50, 0, 1821, 0, 0, 1, 16, 0})),
              "old.glog: byte 32: item 1 (SuccessiveIcons): key BaseIcon: expected an integer from 0 to "
              "32767, found 65536");
    EXPECT_EQ(About(Shorts({14, 0, 0})), "old.glog: byte 16: item 1 (BoxSelect): key RectList: expected 1 to "
                                         "32767 boxes, found 0");
    EXPECT_EQ(About(Shorts({14, -3, 1 << 8})), "old.glog: byte 16: item 1 (BoxSelect): key RectList: "
                                               "expected 1 to 32767 boxes, found -3");
}

TEST_F(IconRecords, OfTheGreatestNumbersAreDrawnAndClicked) {
    std::string const box = Shorts({0, 0, 200, 200});
    for (std::string const &record :
         {Shorts({47}) + box + Shorts({-1, 32767, 32767, 1}),
          Shorts({49}) + box + Shorts({32767, 32767, 32767, 1, 32767, 0x0101, -1, -1, -1, -1}),
          Shorts({64, -32768, -32768, 32767, 32767, 0, -1, -1, 32767, 0, 32767, 0}),
          Shorts({64, 0, 0, 200, 200, 0, 0, 0x7FFF, 32767, 0, 1, 0}), Shorts({14, 32767, 0}),
          Shorts({47, 32767, 32767, 32767, 32767, 2000, 0, 1, 1}),
          Shorts({47, 0, 0, -1, -32768, 2000, 0, 1, 1})}) {
        GlogPane *const pane = LoadRecord<GlogPane>(record);
        ASSERT_NE(pane, nullptr);
        glogRec *const glog = pane->GetGlog();
        ShowGlog(glog, kShowGlog);
        desktop.Play("click 8 8\nclick 199 199");
        EXPECT_FALSE(Dump(glog).empty());
        DisposeGlog(glog);
    }
}

TEST_F(IconRecords, CutAtAnyLengthAreErrors) {
    for (std::string const &record :
         {Shorts({47, 20, 30, 20, 16, 2000, 5, 2, 1}),
          Shorts({49, 20, 30, 20, 16, 2000, 5, 2, 1, 1, 0, 15, 16, 11, 12}),
          Shorts({64, 20, 30, 36, 50, 0, 1821, 0, 3, 0, 16, 0}), Shorts({14, 3, 0})}) {
        for (std::size_t length = 2; length < record.size(); ++length)
            EXPECT_TRUE(Holds(About(record.substr(0, length)), "before it is complete")) << length;
    }
}

} // namespace
