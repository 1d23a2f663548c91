// Panes that are selected by a click, in dialogs.
#include "lists/SelectStringPane.h"
#include "tests/dialogs/DialogTest.h"

namespace {

class SelectItems : public DialogTest {};

TEST_F(SelectItems, ASelectPaneLiesWhereItIsTold) {
    SelectPane *const pane =
        LoadOne<SelectPane>("Select", "<BoundsRect top=\"20\" left=\"30\" bottom=\"50\" right=\"130\"/>");
    EXPECT_EQ(BoxOf(pane), (Rect{20, 30, 50, 130}));
    EXPECT_FALSE(pane->IsSelected());
    EXPECT_EQ(pane->GetEditBox(), (Rect{52, 132, 51, 131}));
}

TEST_F(SelectItems, ASelectPaneNeedsABox) {
    EXPECT_TRUE(Holds(ComplaintAboutItem("Select", ""), "BoundsRect")) << ComplaintAboutItem("Select", "");
}

TEST_F(SelectItems, EachMayBeSelectedFromTheStart) {
    EXPECT_TRUE(LoadOne<SelectPane>("Select", "<BoundsRect top=\"0\" left=\"0\" bottom=\"9\" right=\"9\"/>"
                                              "<Chosen>1</Chosen>")
                    ->IsSelected());
    EXPECT_TRUE(
        LoadOne<SelectStringPane>("SelectString", "<Text>Verse</Text><Chosen>1</Chosen>")->IsSelected());
    EXPECT_FALSE(
        LoadOne<SelectStringPane>("SelectString", "<Text>Verse</Text><Chosen>0</Chosen>")->IsSelected());
}

TEST_F(SelectItems, ALineHasItsTopLeftCornerAtItsOrigin) {
    SelectStringPane *const pane =
        LoadOne<SelectStringPane>("SelectString", "<Origin v=\"17\" h=\"23\"/><Text>Verse</Text>");
    Rect const box = BoxOf(pane);
    EXPECT_EQ(box.top, 17);
    EXPECT_EQ(box.left, 23);
    EXPECT_GT(box.right, 23 + 20);
    EXPECT_EQ(pane->GetEditBox().bottom, box.bottom + 1);
}

TEST_F(SelectItems, ALineNeedsAText) {
    EXPECT_TRUE(Holds(ComplaintAboutItem("SelectString", "<Origin v=\"1\" h=\"1\"/>"), "Text"));
}

TEST_F(SelectItems, TheTextOfALineMayComeFromAStringList) {
    SelectStringPane *const pane =
        LoadOne<SelectStringPane>("SelectString", "<Text list=\"4323\" index=\"1\"/>");
    UString text;
    pane->GetText(text);
    EXPECT_EQ(text, LocalizedStrings::GetString(4323, 1));
}

TEST_F(SelectItems, InAGroupEachHasItsNaturalSize) {
    glogRec *const glog = Load(Dialog("<Item type=\"Group\"><Items>"
                                      "<Item type=\"SelectString\" id=\"1\"><Text>Verse</Text></Item>"
                                      "<Item type=\"Select\" id=\"2\">"
                                      "<BoundsRect top=\"0\" left=\"0\" bottom=\"30\" right=\"70\"/></Item>"
                                      "</Items></Item>"));
    ShowGlog(glog, kShowGlog);
    Rect const line = GetGlogItem(glog, 1)->GetDrawRectangle(),
               box = GetGlogItem(glog, 2)->GetDrawRectangle();
    EXPECT_GT(line.right - line.left, 20);
    EXPECT_EQ(box.top, line.bottom);
    EXPECT_EQ(box.bottom - box.top, 30);
    EXPECT_EQ(box.right - box.left, 70);
}

TEST_F(SelectItems, TheTreeTellsTheTextAndTheSelection) {
    SelectStringPane *const pane =
        LoadOne<SelectStringPane>("SelectString", "<Text>Verse</Text><Chosen>1</Chosen>");
    std::string const dump = Dump(pane->GetGlog());
    EXPECT_TRUE(Holds(dump, "\"text\":\"Verse\"")) << dump;
    EXPECT_TRUE(Holds(dump, "\"selected\":true")) << dump;
}

} // namespace
