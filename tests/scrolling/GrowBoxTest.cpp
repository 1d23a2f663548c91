#include "scrolling/GrowBox.h"
#include "desktop/windows/PlatformConventions.h"
#include "host/Icons.h"
#include "host/NamedColors.h"
#include "host/VelaDrawing.h"
#include "tests/PaneTest.h"
#include "tests/desktop/ProbePane.h"

namespace {

short const kFamily = 1000;
Rect const kCorner = {185, 305, 200, 320}; // of the glog of 320 x 200
Rect const kNoLimits = {0, 0, 0, 0};

class GrowBoxTest : public PaneTest {
protected:
    GrowBoxTest() { PlatformConventions::showsGrowBoxes = false; }
    ~GrowBoxTest() override { PlatformConventions::showsGrowBoxes = true; }

    GrowBox *New(unsigned char left, unsigned char top, int color) {
        growResRec record = {growResRec::kKind, kNoLimits, left, top, color};
        return GrowBox::InitGrowBox(glog, 9, &record);
    }
    // The icon that the box draws where the platform has grow boxes.
    short IconOf(GrowBox *box) {
        PlatformConventions::showsGrowBoxes = true;
        Lines const drawn = DrawingOf(*box);
        for (short icon = 20; icon <= 25; ++icon)
            if (Only("Draw1Icon", drawn) ==
                Traced(*box, [=] { Draw1Icon(kFamily, icon, kCorner.left, kCorner.top); }))
                return icon;
        return -1;
    }
    // What a box draws where the platform has none: the ground, the icon on it, then the lines.
    void ExpectFlat(GrowBox *box, short icon, RGBColor const &ground, std::function<void()> const &lines) {
        EXPECT_EQ(DrawingOf(*box), Traced(*box, [&] {
                      SaveColors const colors;
                      VelaDrawing::PenNormal();
                      SetBackgroundColor(ground);
                      VelaDrawing::EraseRect(&kCorner);
                      Draw1Icon(kFamily, icon, kCorner.left, kCorner.top);
                      VelaDrawing::RGBForeColor(kScrollBarBorderColor);
                      VelaDrawing::MoveTo(kCorner.left, kCorner.top);
                      lines();
                  }));
    }
};

} // namespace

TEST_F(GrowBoxTest, ItsRecordHasSixteenBytes) { EXPECT_EQ(sizeof(growResRec), 16u); }

TEST_F(GrowBoxTest, LiesInTheGlogsCornerUnderItsNumber) {
    GrowBox *const box = New(0, 0, 0);
    EXPECT_EQ(BoxOf(*box), kCorner);
    EXPECT_EQ(box->GetID(), 9);
}

TEST_F(GrowBoxTest, CannotBeMadeWithoutAGlog) {
    growResRec record = {growResRec::kKind, kNoLimits, 0, 0, 0};
    EXPECT_EQ(GrowBox::InitGrowBox(nullptr, 1, &record), nullptr);
}

TEST_F(GrowBoxTest, BordersAndColorChooseTheIcon) {
    EXPECT_EQ(IconOf(New(0, 0, 0)), 24);
    EXPECT_EQ(IconOf(New(1, 0, 0)), 20);
    EXPECT_EQ(IconOf(New(0, 255, 0)), 21);
    EXPECT_EQ(IconOf(New(7, 1, 3)), 22);
    EXPECT_EQ(IconOf(New(1, 1, 1)), 23);
    EXPECT_EQ(IconOf(New(1, 0, 2)), 25);
    EXPECT_EQ(IconOf(New(0, 0, -1)), 24);
}

TEST_F(GrowBoxTest, WithoutARecordItIsPlainAndLeavesTheLimitsAlone) {
    glog->SetMinSize(100, 80);
    GrowBox *const box = GrowBox::InitGrowBox(glog, 1, static_cast<growResRec *>(nullptr));
    EXPECT_EQ(IconOf(box), 24);
    Show();
    desktop.Play("resize 50 50");
    EXPECT_EQ(GetGlogWidth(glog), 100);
    EXPECT_EQ(GetGlogHeight(glog), 80);
}

TEST_F(GrowBoxTest, ItsRecordLimitsTheWindowsSize) {
    growResRec record = {growResRec::kKind, {110, 210, 310, 410}, 0, 0, 0};
    GrowBox::InitGrowBox(glog, 1, &record);
    Show();
    desktop.Play("resize 50 50");
    EXPECT_EQ(GetGlogWidth(glog), 210);
    EXPECT_EQ(GetGlogHeight(glog), 110);
    desktop.Play("resize 900 900");
    EXPECT_EQ(GetGlogWidth(glog), 410);
    EXPECT_EQ(GetGlogHeight(glog), 310);
}

TEST_F(GrowBoxTest, IsMadeFromAnItem) {
    TestItem item;
    item.Box("LimitsRect", {110, 210, 310, 410}).Integer("BorderLeft", 1).Integer("BorderTop", 0);
    GrowBox *const box = GrowBox::InitGrowBox(glog, 4, item.Container());
    EXPECT_EQ(box->GetID(), 4);
    EXPECT_EQ(IconOf(box), 20);
    Show();
    desktop.Play("resize 50 50");
    EXPECT_EQ(GetGlogWidth(glog), 210);
}

TEST_F(GrowBoxTest, ItemsAreCutToTheFieldsOfTheRecord) {
    TestItem item;
    item.Integer("BorderLeft", 256).Integer("BorderTop", 257).Integer("Color", 0);
    EXPECT_EQ(IconOf(GrowBox::InitGrowBox(glog, 4, item.Container())), 21);
}

TEST_F(GrowBoxTest, SetIconChoosesAnyIcon) {
    GrowBox *const box = New(0, 0, 0);
    box->SetIcon(22);
    EXPECT_EQ(IconOf(box), 22);
}

TEST_F(GrowBoxTest, FollowsTheCornerOfAWindowThatGrows) {
    GrowBox *const box = New(0, 0, 0);
    Show();
    desktop.Play("resize 400 300");
    EXPECT_EQ(BoxOf(*box), (Rect{285, 385, 300, 400}));
}

TEST_F(GrowBoxTest, AResizeInvalidatesTheOldAndTheNewPlace) {
    GrowBox *const box = New(0, 0, 0);
    Show();
    Rect elsewhere = {10, 10, 25, 25};
    box->SetBox(&elsewhere);
    box->Resize({0, 0});
    EXPECT_EQ(Repainted(), (std::vector<Rect>{elsewhere, kCorner}));
}

TEST_F(GrowBoxTest, AResizeIsMadeInItsOwnPort) {
    GrowBox *const box = New(0, 0, 0);
    LeaveForAnotherPort();
    box->Resize({0, 0});
    EXPECT_TRUE(IsInItsPort());
}

TEST_F(GrowBoxTest, InALayoutItStaysWhereTheLayoutHasIt) {
    GrowBox *const box = New(0, 0, 0);
    ProbeContainer *const container = new ProbeContainer(glog, {0, 0, 100, 100});
    container->SetUseLayout(true);
    container->Add(box, -1);
    ASSERT_TRUE(box->IsInLayout());
    Rect place = {1, 2, 16, 17};
    box->SetBox(&place);
    box->Resize({5, 5});
    box->ContainmentChanged();
    EXPECT_EQ(BoxOf(*box), place);
}

TEST_F(GrowBoxTest, ANewContainerBringsItToTheCorner) {
    GrowBox *const box = New(0, 0, 0);
    Rect place = {1, 2, 16, 17};
    box->SetBox(&place);
    box->ContainmentChanged();
    EXPECT_EQ(BoxOf(*box), kCorner);
}

TEST_F(GrowBoxTest, TakesClicksWithoutReportingThem) {
    New(0, 0, 0);
    Show();
    EXPECT_EQ(ResultOfClick("click 310 190"), -1);
}

TEST_F(GrowBoxTest, KeepsTheColoursOfThePort) {
    for (int const color : {0, 1, 2})
        EXPECT_TRUE(KeepsColors(*New(1, 1, color))) << color;
}

// Where the platform has no grow boxes

TEST_F(GrowBoxTest, PlainIsASquareWithALineOfNoLengthAtTheCorner) {
    ExpectFlat(New(0, 0, 0), 83, kScrollBarBackgroundColor,
               [] { VelaDrawing::LineTo(kCorner.left, kCorner.top); });
}

TEST_F(GrowBoxTest, ALeftBorderIsALineDownTheLeftSide) {
    ExpectFlat(New(1, 0, 0), 84, kScrollBarBackgroundColor,
               [] { VelaDrawing::LineTo(kCorner.left, kCorner.bottom); });
}

TEST_F(GrowBoxTest, ATopBorderIsALineAlongTheTop) {
    ExpectFlat(New(0, 1, 0), 85, kScrollBarBackgroundColor,
               [] { VelaDrawing::LineTo(kCorner.right, kCorner.top); });
}

TEST_F(GrowBoxTest, BothBordersAreTheTopLineThenTheLeftOne) {
    ExpectFlat(New(1, 1, 0), 83, kScrollBarBackgroundColor, [] {
        VelaDrawing::LineTo(kCorner.right, kCorner.top);
        VelaDrawing::MoveTo(kCorner.left, kCorner.top);
        VelaDrawing::LineTo(kCorner.left, kCorner.bottom);
    });
}

TEST_F(GrowBoxTest, TheFirstColourIsTheGlogsOwnGroundWithoutLines) {
    ExpectFlat(New(1, 1, 1), 83, glog->GetContentColor(), [] {});
}

TEST_F(GrowBoxTest, TheSecondColourErasesAndDrawsNothing) {
    GrowBox *const box = New(1, 1, 2);
    EXPECT_EQ(DrawingOf(*box), Traced(*box, [] {
                  SaveColors const colors;
                  VelaDrawing::PenNormal();
                  VelaDrawing::RGBForeColor(kScrollBarBorderColor);
                  VelaDrawing::MoveTo(kCorner.left, kCorner.top);
              }));
}
