#include "graphics/GLinePane.h"
#include "graphics/GLine.h"
#include "host/CompoundPane.h"
#include "host/NamedColors.h"
#include "host/PortSavers.h"
#include "host/VelaDrawing.h"
#include "tests/PaneTest.h"

namespace {

class GLinePaneTest : public PaneTest {
protected:
    GLinePane *Made(GLineResRec record) { return GLinePane::NewGLinePane(glog, &record); }
    GLinePane *MadeFrom(Rect const &line) {
        return GLinePane::NewGLinePane(glog, TestItem().Box("BoundsRect", line).Sheet());
    }
    // The calls of a line of whole pixels in the dividing colour.
    Lines Drawn(GlogPane &pane, Point from, Point to) {
        return Traced(pane, [=] {
            VelaDrawing::PenNormal();
            VelaDrawing::RGBForeColor(kPanelUnderline);
            VelaDrawing::MoveTo(from.h, from.v);
            VelaDrawing::LineTo(to.h, to.v);
        });
    }
    Lines LineBetween(GlogPane &pane, Point a, Point b) {
        return Traced(pane, [=] { DrawGLine(a, b); });
    }
    // A line in a container whose layout gives it the place; drawn and shown.
    GLinePane *LaidOut(Rect const &line, int width, int height) {
        CompoundPane *const group = new CompoundPane;
        group->CompoundPaneInit(glog, 1);
        Rect box{10, 10, 110, 210};
        group->SetBox(&box);
        group->SetUseLayout(true);
        GLinePane *const pane = MadeFrom(line);
        group->Add(pane, -1);
        RCPtr<GlogLayoutRectItem> const item = pane->GetLayoutRect();
        item->SetAttribute(GlogLayoutItem::kWidth, width, GlogLayoutItem::kPixels, UString());
        item->SetAttribute(GlogLayoutItem::kHeight, height, GlogLayoutItem::kPixels, UString());
        Show();
        return pane;
    }
};

GLineResRec Record(short top, short left, short bottom, short right) {
    return {GLineResRec::kKind, top, left, bottom, right};
}

} // namespace

// Lines

TEST_F(GLinePaneTest, ALevelLineLiesAPixelLowerThanItsEnds) {
    GLinePane *const pane = MadeFrom({0, 0, 0, 100});
    Show();
    EXPECT_EQ(LineBetween(*pane, {10, 20}, {10, 60}), Drawn(*pane, {11, 20}, {11, 60}));
    EXPECT_EQ(LineBetween(*pane, {10, 60}, {10, 20}), Drawn(*pane, {11, 20}, {11, 60}));
}

TEST_F(GLinePaneTest, AnUprightLineLiesAPixelToTheRightOfItsEnds) {
    GLinePane *const pane = MadeFrom({0, 0, 0, 100});
    Show();
    EXPECT_EQ(LineBetween(*pane, {10, 20}, {60, 20}), Drawn(*pane, {10, 21}, {60, 21}));
    EXPECT_EQ(LineBetween(*pane, {60, 20}, {10, 20}), Drawn(*pane, {10, 21}, {60, 21}));
}

TEST_F(GLinePaneTest, ASlantedLineIsLevelAtItsUpperEnd) {
    GLinePane *const pane = MadeFrom({0, 0, 0, 100});
    Show();
    EXPECT_EQ(LineBetween(*pane, {50, 20}, {10, 60}), Drawn(*pane, {11, 20}, {11, 60}));
}

TEST_F(GLinePaneTest, EqualEndsMakeAPixel) {
    GLinePane *const pane = MadeFrom({0, 0, 0, 100});
    Show();
    EXPECT_EQ(LineBetween(*pane, {10, 20}, {10, 20}), Drawn(*pane, {10, 21}, {10, 21}));
}

TEST_F(GLinePaneTest, ASimpleLineBeginsAtThePen) {
    GLinePane *const pane = MadeFrom({0, 0, 0, 100});
    Show();
    Lines const simple = Traced(*pane, [] {
        VelaDrawing::MoveTo(20, 10);
        SimpleGLineTo(60, 10);
    });
    EXPECT_EQ(simple, Traced(*pane, [] {
                  VelaDrawing::MoveTo(20, 10);
                  DrawGLine({10, 20}, {10, 60});
              }));
}

TEST_F(GLinePaneTest, ALineLeavesTheColorsAsTheyWere) {
    GLinePane *const pane = MadeFrom({0, 0, 0, 100});
    Show();
    EXPECT_TRUE(KeepsColors(*pane));
}

// The pane

TEST_F(GLinePaneTest, ALevelLineHasRoomBelowIt) {
    GLinePane *const pane = Made(Record(20, 10, 20, 110));
    EXPECT_EQ(BoxOf(*pane), (Rect{20, 10, 23, 111}));
    EXPECT_EQ(pane->GetID(), 0);
    Show();
    EXPECT_EQ(DrawingOf(*pane), Drawn(*pane, {21, 10}, {21, 110}));
}

TEST_F(GLinePaneTest, AnUprightLineHasRoomBesideIt) {
    GLinePane *const pane = Made(Record(20, 10, 90, 10));
    EXPECT_EQ(BoxOf(*pane), (Rect{20, 10, 91, 13}));
    Show();
    EXPECT_EQ(DrawingOf(*pane), Drawn(*pane, {20, 11}, {90, 11}));
}

TEST_F(GLinePaneTest, ASheetMayNameTheEndsInAnyOrder) {
    EXPECT_EQ(BoxOf(*MadeFrom({20, 110, 20, 10})), (Rect{20, 10, 23, 111}));
    EXPECT_EQ(BoxOf(*MadeFrom({90, 10, 20, 10})), (Rect{20, 10, 91, 13}));
}

TEST_F(GLinePaneTest, ARecordsEndsAreTakenAsTheyAre) {
    EXPECT_EQ(BoxOf(*Made(Record(20, 110, 20, 10))), (Rect{20, 110, 23, 11}));
}

TEST_F(GLinePaneTest, ASheetWithoutALineMakesAnUprightPixel) {
    EXPECT_EQ(BoxOf(*GLinePane::NewGLinePane(glog, TestItem().Sheet())), (Rect{0, 0, 1, 3}));
}

TEST_F(GLinePaneTest, EndsAtTheEdgeOfThePlaneStayThere) {
    EXPECT_EQ(BoxOf(*Made(Record(32767, 0, 32767, 32767))), (Rect{32767, 0, 32767, 32767}));
}

TEST_F(GLinePaneTest, WithoutAGlogThereIsNoPane) {
    GLineResRec record = Record(0, 0, 0, 10);
    EXPECT_EQ(GLinePane::NewGLinePane(nullptr, &record), nullptr);
    EXPECT_EQ(GLinePane::NewGLinePane(nullptr, TestItem().Sheet()), nullptr);
}

TEST_F(GLinePaneTest, InALayoutItRunsAlongItsPlace) {
    GLinePane *const level = LaidOut({0, 0, 50, 0}, 100, 21);
    Rect const place = level->GetDrawRectangle();
    ASSERT_EQ(place.right - place.left, 100);
    short const middle = static_cast<short>(place.top + 10);
    EXPECT_EQ(DrawingOf(*level), Drawn(*level, {static_cast<short>(middle + 1), place.left},
                                       {static_cast<short>(middle + 1), place.right}))
        << "though it was made upright";
}

TEST_F(GLinePaneTest, InALayoutASquarePlaceHasAnUprightLine) {
    GLinePane *const pane = LaidOut({0, 0, 0, 50}, 40, 40);
    Rect const place = pane->GetDrawRectangle();
    short const column = static_cast<short>(place.left + 21);
    EXPECT_EQ(DrawingOf(*pane), Drawn(*pane, {place.top, column}, {place.bottom, column}));
}

TEST_F(GLinePaneTest, IsDrawnInItsOwnPort) {
    GLinePane *const pane = MadeFrom({10, 20, 10, 120});
    Show();
    LeaveForAnotherPort();
    (pane->*&Opened<GLinePane>::DrawGuts)(nullptr);
    EXPECT_TRUE(IsInItsPort());
}

TEST_F(GLinePaneTest, ShowsInItsBox) {
    GLinePane *const pane = Made(Record(20, 10, 20, 110));
    Show();
    pane->Inval();
    EXPECT_EQ(Repainted(), (std::vector<Rect>{{20, 10, 23, 111}}));
}
