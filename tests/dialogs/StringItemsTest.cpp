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

TEST_F(StringItemsTest, AStyledTextHasItsParts) {
    StyledStringPane *const pane = LoadOne<StyledStringPane>(
        "StyledText", kPlace + "<Parts><Part><Text>Rate </Text></Part><Part><Text>96 kHz</Text><Face>1</Face>"
                               "<Size>14</Size><Color red=\"65535\" green=\"0\" blue=\"0\"/></Part></Parts>");
    EXPECT_EQ(BoxOf(pane), (Rect{10, 20, 60, 140}));
    ShowGlog(pane->GetGlog(), kShowGlog);
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
