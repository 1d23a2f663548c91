#include "host/OSFont.h"
#include "host/OSPort.h"
#include "host/PortSavers.h"
#include "host/VelaDrawing.h"
#include "tests/dialogs/DialogTest.h"
#include "text/MultiStringPane.h"
#include "text/StringGroupPane.h"
#include "text/StyledStringPane.h"
#include "text/TextPane.h"

namespace {

std::string const kPlace = "<BoundsRect top=\"10\" left=\"20\" bottom=\"60\" right=\"140\"/>";
std::string const kStates = "<TextList><String>Stopped</String><String>Playing</String></TextList>";

class StringItemsTest : public DialogTest {
protected:
    static int HeightOf(GlogPane *pane) {
        Rect const r = pane->GetLayoutRect()->GetItemRect();
        return r.bottom - r.top;
    }
    // The drawing calls of the name, when the pane's dialog is shown.
    std::vector<std::string> Drawn(GlogPane *pane, std::string const &operation) {
        desktop.TakeDrawing(); // from here on it is written down
        ShowGlog(pane->GetGlog(), kShowGlog);
        UpdateGlog(pane->GetGlog());
        std::vector<std::string> calls;
        for (std::string const &line : desktop.TakeDrawing())
            if (Holds(line, "\"op\":\"" + operation + "\""))
                calls.push_back(line);
        return calls;
    }
    // The first item of a group, laid out.
    GlogPane *InGroup(std::string const &item) {
        glogRec *const glog = Load(Dialog("<Item type=\"Group\" id=\"9\"><BoundsRect top=\"0\" left=\"0\" "
                                          "bottom=\"100\" right=\"200\"/><Items>" +
                                          item + "</Items></Item>"));
        ShowGlog(glog, kShowGlog);
        return GetGlogItem(glog, 1);
    }
};

} // namespace

TEST_F(StringItemsTest, ATextHasItsBoxItsWordsAndItsColour) {
    TextPane *const text = LoadOne<TextPane>("Text", kPlace + "<Text>Take 1</Text><GrayText>1</GrayText>");
    EXPECT_EQ(BoxOf(text), (Rect{10, 20, 60, 140}));
    EXPECT_EQ(Utf8::FromUString(text->GetText()), "Take 1");
    EXPECT_FALSE(text->GetEnable());
}

TEST_F(StringItemsTest, ATextThatIsANumberIsAText) {
    EXPECT_EQ(Utf8::FromUString(LoadOne<TextPane>("Text", kPlace + "<Text>96</Text>")->GetText()), "96");
}

TEST_F(StringItemsTest, ATextInAGroupHasTheHeightOfItsFontOrOfItsBox) {
    EXPECT_GT(HeightOf(InGroup("<Item type=\"Text\" id=\"1\"><Text>A</Text></Item>")), 8);
    EXPECT_EQ(HeightOf(InGroup("<Item type=\"Text\" id=\"1\">" + kPlace + "<Text>A</Text></Item>")), 50);
}

TEST_F(StringItemsTest, ATextIsShortenedByThreeWordsOnly) {
    EXPECT_TRUE(Holds(ComplaintAboutItem("Text", "<Text>A</Text><Truncate>Start</Truncate>"), "Truncate"));
    EXPECT_TRUE(Holds(ComplaintAboutItem("Text", "<Text>A</Text><Align>3</Align>"), "Align"));
    EXPECT_TRUE(Holds(ComplaintAboutItem("Text", kPlace), "Text"));
}

TEST_F(StringItemsTest, ATextIsDrawnAsItsKeysSay) {
    auto const drawn = [this](std::string const &keys) {
        std::vector<std::string> const calls =
            Drawn(LoadOne<TextPane>("Text", kPlace + "<Text>Take 1</Text>" + keys), "DrawTextLayoutInRect");
        return calls.size() == 1 ? calls[0] : std::to_string(calls.size()) + " calls";
    };
    struct {
        char const *word, *truncation;
    } const words[] = {{"None", "none"}, {"End", "end"}, {"Middle", "middle"}};
    for (auto const &c : words) {
        std::string const line = drawn(std::string("<Truncate>") + c.word + "</Truncate>");
        EXPECT_TRUE(Holds(line, std::string("\"truncation\":\"") + c.truncation + "\"")) << line;
    }
    EXPECT_TRUE(Holds(drawn("<WrapText>1</WrapText>"), "\"wrap\":1"));
    EXPECT_TRUE(Holds(drawn(""), "\"wrap\":0"));
    EXPECT_NE(drawn("<Align>1</Align>"), drawn("<Align>2</Align>"));
    EXPECT_EQ(drawn("<Align>0</Align>"), drawn(""));
}

TEST_F(StringItemsTest, AStyledTextHasItsParts) {
    StyledStringPane *const pane = LoadOne<StyledStringPane>(
        "StyledText", kPlace + "<Parts><Part><Text>Rate </Text></Part><Part><Text>96 kHz</Text><Face>1</Face>"
                               "<Size>14</Size><Color red=\"65535\" green=\"0\" blue=\"0\"/></Part></Parts>");
    EXPECT_EQ(BoxOf(pane), (Rect{10, 20, 60, 140}));
    std::vector<std::string> const parts = Drawn(pane, "DrawString");
    ASSERT_EQ(parts.size(), 2U);
    EXPECT_TRUE(Holds(parts[0], "\"text\":\"Rate")) << parts[0];
    EXPECT_FALSE(Holds(parts[0], "\"fore\":[65535,0,0]")) << parts[0];
    for (char const *told : {"\"text\":\"96 kHz\"", "\"face\":1", "\"size\":14", "\"fore\":[65535,0,0]"})
        EXPECT_TRUE(Holds(parts[1], told)) << told << " in " << parts[1];
}

TEST_F(StringItemsTest, AStyledTextStandsAndErasesAsItsKeysSay) {
    auto const load = [this](std::string const &keys) {
        return LoadOne<StyledStringPane>("StyledText",
                                         kPlace + keys + "<Parts><Part><Text>Rate</Text></Part></Parts>");
    };
    EXPECT_TRUE(Drawn(load(""), "EraseRect").empty());
    std::vector<std::string> const erased = Drawn(load("<Erase>1</Erase>"), "EraseRect");
    ASSERT_EQ(erased.size(), 1U);
    EXPECT_TRUE(Holds(erased[0], "[10,20,60,140]")) << erased[0];
    std::vector<std::string> const left = Drawn(load(""), "MoveTo");
    EXPECT_EQ(Drawn(load("<Align>0</Align>"), "MoveTo"), left);
    EXPECT_NE(Drawn(load("<Align>1</Align>"), "MoveTo"), left);
    EXPECT_NE(Drawn(load("<Align>2</Align>"), "MoveTo"), Drawn(load("<Align>1</Align>"), "MoveTo"));
}

TEST_F(StringItemsTest, AStyledTextKeepsItsDistanceFromTheRightOnlyIfTold) {
    for (bool const keeps : {false, true}) {
        StyledStringPane *const pane =
            LoadOne<StyledStringPane>("StyledText", kPlace + (keeps ? "<KeepRight>1</KeepRight>" : "") +
                                                        "<Parts><Part><Text>Rate</Text></Part></Parts>");
        Rect wider = {0, 0, 200, 400};
        PositionGlog(pane->GetGlog(), &wider, false);
        pane->CalcBox();
        EXPECT_EQ(BoxOf(pane).right, keeps ? 140 + 80 : 140);
    }
}

TEST_F(StringItemsTest, AStyledTextInAGroupIsAsHighAsItsHighestPart) {
    std::string const small = "<Part><Text>Rate</Text></Part>",
                      large = "<Part><Text>96</Text><Size>40</Size></Part>";
    auto const height = [&](std::string const &parts) {
        return HeightOf(InGroup("<Item type=\"StyledText\" id=\"1\"><Parts>" + parts + "</Parts></Item>"));
    };
    EXPECT_GE(height(small + large), 40);
    EXPECT_LT(height(small), 30);
}

TEST_F(StringItemsTest, AStyledTextWithoutPartsOrWithAFontOfNoSizeIsAnError) {
    EXPECT_TRUE(Holds(ComplaintAboutItem("StyledText", kPlace), "Parts"));
    EXPECT_TRUE(
        Holds(ComplaintAboutItem("StyledText", "<Parts><Part><Text>A</Text><Size>0</Size></Part></Parts>"),
              "Size"));
    EXPECT_TRUE(Holds(
        ComplaintAboutItem("StyledText", "<Parts><Part><Text>A</Text><Color red=\"70000\"/></Part></Parts>"),
        "red"));
}

TEST_F(StringItemsTest, AGroupOfStringsHasAllOfThem) {
    StringGroupPane *const group = LoadOne<StringGroupPane>(
        "StringGroup", "<LineSpacing>16</LineSpacing><TextList>"
                       "<Line><TextOrigin v=\"30\" h=\"20\"/><Text>Attack</Text></Line>"
                       "<Line><Text>7</Text></Line></TextList>");
    ASSERT_EQ(group->CountStrings(), 2U);
    EXPECT_EQ(Utf8::FromUString(group->StringAt(0)), "Attack");
    EXPECT_EQ(Utf8::FromUString(group->StringAt(1)), "7");
    ShowGlog(group->GetGlog(), kShowGlog);
}

TEST_F(StringItemsTest, LoadingAGroupOfStringsLeavesThePort) {
    glogRec *const other = desktop.NewGlog(GlogOptions().Size(50, 50));
    SetPortToGlog(other);
    fontSaveRec const font = {OS::Font::FamilyID(), 1, 33};
    SetFontData(&font);
    LoadOne<StringGroupPane>("StringGroup", "<TextList><Line><Text>Attack</Text></Line></TextList>");
    OSPort *port = nullptr;
    VelaDrawing::GetPort(&port);
    ASSERT_EQ(port, other->GetPort());
    EXPECT_EQ(VelaDrawing::GetPortTextSize(port), 33);
    EXPECT_EQ(VelaDrawing::GetPortTextFace(port), 1);
}

TEST_F(StringItemsTest, AGroupOfStringsMayBeEmptyButNotWithoutAList) {
    StringGroupPane *const group = LoadOne<StringGroupPane>("StringGroup", "<TextList/>");
    EXPECT_EQ(group->CountStrings(), 0U);
    ShowGlog(group->GetGlog(), kShowGlog);
    EXPECT_TRUE(Holds(ComplaintAboutItem("StringGroup", ""), "TextList"));
}

TEST_F(StringItemsTest, OfSeveralStringsTheFirstOrTheOneThatIsNamedShows) {
    EXPECT_EQ(LoadOne<MultiStringPane>("MultiString", kPlace + kStates)->CurrentIndex(), 0);
    MultiStringPane *const second =
        LoadOne<MultiStringPane>("MultiString", kPlace + kStates + "<Current>1</Current>");
    EXPECT_EQ(second->CurrentIndex(), 1);
    EXPECT_EQ(BoxOf(second), (Rect{10, 20, 60, 140}));
    ShowGlog(second->GetGlog(), kShowGlog);
}

TEST_F(StringItemsTest, AStringThatIsNotThereIsAnError) {
    EXPECT_TRUE(Holds(ComplaintAboutItem("MultiString", kStates + "<Current>2</Current>"),
                      "there is no string 2: the list has 2, counted from 0"));
    EXPECT_TRUE(Holds(ComplaintAboutItem("MultiString", "<TextList/>"), "TextList"));
    EXPECT_TRUE(Holds(ComplaintAboutItem("MultiString", kPlace), "TextList"));
}

TEST_F(StringItemsTest, AStringOfSeveralInAGroupHasTheHeightOfItsFont) {
    EXPECT_GT(HeightOf(InGroup("<Item type=\"MultiString\" id=\"1\">" + kStates + "</Item>")), 8);
    EXPECT_EQ(HeightOf(InGroup("<Item type=\"MultiString\" id=\"1\">" + kStates +
                               "<LineSpacing>33</LineSpacing></Item>")),
              33);
}
