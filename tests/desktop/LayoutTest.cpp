#include "tests/PaneTest.h"
#include "tests/desktop/ProbePane.h"

namespace {

class LayoutTest : public PaneTest {
protected:
    typedef GlogLayoutItem Item;
    Calls &calls = FreshCalls();
    ProbeContainer *box = new ProbeContainer(glog, {10, 10, 110, 210});

    ProbePane *Add(short width, short height, char const *name = "pane") {
        ProbePane *pane = new ProbePane(glog, {0, 0, height, width}, calls, name);
        box->Add(pane, -1);
        return pane;
    }
    static void Set(GlogPane *pane, Item::Attribute attribute, int value) {
        pane->GetLayoutRect()->SetAttribute(attribute, value, Item::kPixels, UString());
    }
    void Horizontal() { box->GetLayout()->SetAttributeFromString(Item::kDirection, Text("horiz")); }
};

TEST_F(LayoutTest, WithoutUseOfTheLayoutPanesKeepTheirBoxes) {
    ProbePane *pane = Add(30, 20);
    Rect r{5, 6, 25, 36};
    pane->SetBox(&r);
    EXPECT_FALSE(pane->IsInLayout());
    EXPECT_TRUE(pane->CanSetBox());
    EXPECT_EQ(pane->GetDrawRectangle(), r);
    EXPECT_EQ(pane->GetLayoutRect()->GetBorderRect(), r);
}

TEST_F(LayoutTest, AVerticalGroupStacksItsItemsDownward) {
    ProbePane *a = Add(30, 20), *b = Add(50, 10);
    box->SetUseLayout(true);
    EXPECT_TRUE(a->IsInLayout());
    EXPECT_EQ(a->GetDrawRectangle(), (Rect{0, 0, 20, 30}));
    EXPECT_EQ(b->GetDrawRectangle(), (Rect{20, 0, 30, 50}));
    EXPECT_EQ(b->GetBounds(), (Rect{20, 0, 30, 50}));
}

TEST_F(LayoutTest, TheWordHorizTurnsTheGroupAndSpacingSeparatesTheItems) {
    ProbePane *a = Add(30, 20), *b = Add(50, 10);
    box->SetUseLayout(true);
    Horizontal();
    box->GetLayout()->SetAttribute(Item::kSpacing, 8, Item::kPixels, UString());
    EXPECT_EQ(a->GetDrawRectangle(), (Rect{0, 0, 20, 30}));
    EXPECT_EQ(b->GetDrawRectangle(), (Rect{0, 38, 10, 88}));
}

TEST_F(LayoutTest, InsetsOfTheGroupAndOfAnItemKeepTheirDistance) {
    ProbePane *a = Add(30, 20), *b = Add(50, 10);
    box->SetUseLayout(true);
    box->GetLayout()->SetAttribute(Item::kInsetTop, 4, Item::kPixels, UString());
    box->GetLayout()->SetAttribute(Item::kInsetLeft, 6, Item::kPixels, UString());
    Set(a, Item::kInsetBottom, 3);
    Set(b, Item::kInsetLeft, 2);
    EXPECT_EQ(a->GetDrawRectangle(), (Rect{4, 6, 24, 36}));
    EXPECT_EQ(b->GetDrawRectangle(), (Rect{27, 8, 37, 58}));
}

TEST_F(LayoutTest, ReportedSizesReplaceTheMadeOnes) {
    ProbePane *a = Add(30, 20);
    box->SetUseLayout(true);
    Set(a, Item::kWidth, 44);
    Set(a, Item::kHeight, 15);
    EXPECT_EQ(a->GetDrawRectangle(), (Rect{0, 0, 15, 44}));
    Set(a, Item::kMinWidth, 60);
    EXPECT_EQ(a->GetDrawRectangle().right, 60);
    Set(a, Item::kHeight, 0);
    EXPECT_EQ(a->GetDrawRectangle().bottom, 20) << "0 tells nothing: the rectangle it was made with counts";
}

TEST_F(LayoutTest, GrowingItemsShareTheRoomThatIsLeftToThePixel) {
    ProbePane *a = Add(30, 20), *b = Add(30, 20), *c = Add(30, 20);
    box->SetUseLayout(true);
    Horizontal(); // 200 wide, 110 left over
    Set(a, Item::kGrowWidth, 1);
    Set(c, Item::kGrowWidth, 2);
    EXPECT_EQ(a->GetDrawRectangle(), (Rect{0, 0, 20, 66}));
    EXPECT_EQ(b->GetDrawRectangle(), (Rect{0, 66, 20, 96}));
    EXPECT_EQ(c->GetDrawRectangle(), (Rect{0, 96, 20, 200}));
}

TEST_F(LayoutTest, AlignmentActsAcrossTheGroup) {
    ProbePane *centre = Add(30, 20), *end = Add(30, 20), *fill = Add(30, 20);
    box->SetUseLayout(true);
    Set(centre, Item::kAlignment, 1);
    Set(end, Item::kAlignment, 2);
    Set(fill, Item::kAlignment, 3);
    EXPECT_EQ(centre->GetDrawRectangle(), (Rect{0, 85, 20, 115}));
    EXPECT_EQ(end->GetDrawRectangle(), (Rect{20, 170, 40, 200}));
    EXPECT_EQ(fill->GetDrawRectangle(), (Rect{40, 0, 60, 200}));
}

TEST_F(LayoutTest, HiddenPanesTakeNoRoom) {
    ProbePane *a = Add(30, 20), *b = Add(30, 20);
    box->SetUseLayout(true);
    EXPECT_EQ(b->GetDrawRectangle().top, 20);
    a->SetVisibility(0);
    EXPECT_EQ(b->GetDrawRectangle().top, 0);
}

TEST_F(LayoutTest, ANestedContainerIsMeasuredByItsContent) {
    ProbeContainer *inner = new ProbeContainer(glog, {0, 0, 0, 0});
    box->Add(inner, -1);
    inner->SetUseLayout(true);
    ProbePane *inside = new ProbePane(glog, {0, 0, 12, 34}, calls, "inside");
    inner->Add(inside, -1);
    ProbePane *after = Add(10, 10);
    box->SetUseLayout(true);
    EXPECT_EQ(after->GetDrawRectangle().top, 12);
    EXPECT_EQ(inner->GetDrawRectangle(), (Rect{0, 0, 12, 34}));
    Set(inside, Item::kHeight, 30);
    EXPECT_EQ(after->GetDrawRectangle().top, 30);
}

TEST_F(LayoutTest, ABoxThatFollowsItsLayoutHasTheSizeOfItsContent) {
    Add(30, 20);
    Add(50, 10);
    box->SetUseLayout(true);
    box->SetSizeToLayout(true);
    UpdateGlog(glog);
    box->Get(0)->GetDrawRectangle();
    EXPECT_EQ(BoxOf(*box), (Rect{10, 10, 40, 60}));
}

TEST_F(LayoutTest, AGroupInsideAGroupIsLaidOutAndFound) {
    ProbePane *a = Add(30, 20), *b = Add(30, 20);
    RCPtr<GlogLayoutGroup> row(new GlogLayoutGroup(false));
    row->MoveItem(a->GetLayoutRect(), -1);
    row->MoveItem(b->GetLayoutRect(), -1);
    box->GetLayout()->MoveItem(row, -1);
    box->SetUseLayout(true);
    EXPECT_EQ(b->GetDrawRectangle(), (Rect{0, 30, 20, 60}));
    EXPECT_EQ(row->GetBorderRect(), (Rect{0, 0, 20, 60}));
    b->SetID(5);
    EXPECT_EQ(box->GetLayout()->FindItemByID(5).get(), b->GetLayoutRect().get());
    EXPECT_EQ(box->GetLayout()->FindItemByID(6).get(), nullptr);
}

TEST_F(LayoutTest, ReplaceItemPutsAnotherInTheSamePlace) {
    ProbePane *a = Add(30, 20), *b = Add(30, 20);
    RCPtr<GlogLayoutGroup> gap(new GlogLayoutGroup(true));
    gap->SetAttribute(Item::kHeight, 7, Item::kPixels, UString());
    box->SetUseLayout(true);
    box->GetLayout()->ReplaceItem(a->GetLayoutRect(), gap);
    EXPECT_EQ(b->GetDrawRectangle().top, 7);
}

TEST_F(LayoutTest, AnItemWithoutPlaceAnswersTheRectangleItWasMadeWith) {
    RCPtr<GlogLayoutRectItem> plain = GlogLayout::MakeRectItem({1, 2, 3, 4}, -1, 0, "part");
    EXPECT_EQ(plain->GetBorderRect(), (Rect{1, 2, 3, 4}));
    EXPECT_EQ(plain->GetItemRect(), (Rect{1, 2, 3, 4}));
    EXPECT_STREQ(plain->GetName(), "part");
    RCPtr<GlogLayoutRectItem> nested =
        GlogLayout::MakeRectItem({2, 3, 5, 9}, {10, 20, 30, 60}, -1, 1, "icon");
    EXPECT_EQ(nested->GetBorderRect(), (Rect{10, 20, 30, 60}));
    EXPECT_EQ(nested->GetItemRect(), (Rect{12, 23, 15, 29}));
}

TEST_F(LayoutTest, TheLastReferenceFreesTheItemEvenAfterItsPaneIsGone) {
    ProbePane *a = Add(30, 20);
    box->SetUseLayout(true);
    RCPtr<GlogLayoutRectItem> item = a->GetLayoutRect();
    box->Del(0);
    EXPECT_EQ(item->GetBorderRect().left, 0);
    item->SetAttribute(Item::kWidth, 10, Item::kPixels, UString());
}

TEST_F(LayoutTest, PartsOfAPaneMoveWithIt) {
    Add(30, 20);
    ProbePane *pane = new ProbePane(glog, {0, 0, 20, 50}, calls, "parts");
    pane->UseLayoutSubItemMode();
    RCPtr<GlogLayoutRectItem> part =
        GlogLayout::MakeRectItem({4, 5, 14, 25}, -1, pane->NumLayoutSubItems(), "");
    pane->AddLayoutSubItem(part);
    EXPECT_EQ(pane->NumLayoutSubItems(), 1);
    box->Add(pane, -1);
    box->SetUseLayout(true);
    EXPECT_EQ(part->GetBorderRect(), (Rect{24, 5, 34, 25}));
}

TEST_F(LayoutTest, InsetsOfAPartKeepItsDistanceAndEnlargeItsPane) {
    ProbePane *pane = new ProbePane(glog, {0, 0, 20, 50}, calls, "parts");
    pane->UseLayoutSubItemMode();
    RCPtr<GlogLayoutRectItem> part = GlogLayout::MakeRectItem({4, 5, 20, 45}, -1, 0, "");
    pane->AddLayoutSubItem(part);
    box->Add(pane, -1);
    box->SetUseLayout(true);
    part->SetAttribute(Item::kInsetTop, 2, Item::kPixels, UString());
    part->SetAttribute(Item::kInsetLeft, 3, Item::kPixels, UString());
    part->SetAttribute(Item::kInsetBottom, 4, Item::kPixels, UString());
    part->SetAttribute(Item::kInsetRight, 5, Item::kPixels, UString());
    EXPECT_EQ(part->GetBorderRect(), (Rect{6, 8, 22, 48}));
    EXPECT_EQ(pane->GetLayoutRect()->GetBorderRect(), (Rect{0, 0, 26, 53}));
}

TEST_F(LayoutTest, LayoutIsDoneOnceForManyChanges) {
    ProbePane *a = Add(30, 20), *b = Add(30, 20);
    box->SetUseLayout(true);
    a->GetDrawRectangle();
    calls.clear();
    for (int i = 0; i < 50; ++i)
        Set(a, Item::kHeight, 21 + i);
    b->GetDrawRectangle();
    EXPECT_EQ(calls, (Calls{"pane: PanePositionChanged", "pane: PanePositionChanged"}));
}

TEST_F(LayoutTest, WhatTheLayoutMovesIsRedrawnInBothPlaces) {
    ProbePane *a = Add(30, 20), *b = Add(30, 20, "moved");
    box->SetUseLayout(true);
    Show();
    Set(a, Item::kHeight, 30);
    (void)b;
    UpdateGlog(glog);
    long area = 0;
    for (Rect const &r : desktop.TakePresented(glog))
        area += (r.bottom - r.top) * (r.right - r.left);
    EXPECT_EQ(area, 30 * 50) << "the two panes' old and new places, and nothing else";
}

TEST_F(LayoutTest, LayoutKeysOfAnItemAreRead) {
    ProbePane *a = Add(30, 20);
    box->SetUseLayout(true);
    TestItem item;
    boost::shared_ptr<XMLLib::ContainerItem> keys = XMLLib::CreateContainer(Text("Layout"));
    keys->AddSIntItem(Text("InsetTop"), 3);
    keys->AddSIntItem(Text("Width"), 77);
    keys->AddSIntItem(Text("Height"), 1000000);
    item.Container()->AddItem(Text("Layout"), keys);
    a->GetLayoutRect()->ReadLayoutProperties(18, item.Sheet());
    EXPECT_EQ(a->GetDrawRectangle().top, 3);
    EXPECT_EQ(a->GetDrawRectangle().right, 77);
    a->GetLayoutRect()->ReadLayoutProperties(18, nullptr);
    EXPECT_EQ(a->GetDrawRectangle().right, 77);
}

TEST_F(LayoutTest, AGrowingPaneAtTheTopLevelFollowsTheWindow) {
    ProbePane *pane = new ProbePane(glog, {100, 0, 150, 300}, calls, "grows");
    Set(pane, Item::kGrowWidth, 1);
    Show();
    desktop.Play("resize 400 250");
    EXPECT_EQ(BoxOf(*pane), (Rect{100, 0, 150, 380}));
    EXPECT_EQ(Count(calls, "grows: Resize 80 50"), 1);
}

} // namespace
