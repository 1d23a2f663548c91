#include "graphics/MouseTrackingIndicator.h"
#include "desktop/drawing/Region.h"
#include "desktop/panes/Glog.h"
#include "host/VelaDrawing.h"
#include "tests/PaneTest.h"
#include "tests/VirtualPlace.h"

namespace {

class Marker : public MouseTrackingIndicator {
public:
    using MouseTrackingIndicator::MouseTrackingIndicator;
    void Draw(Rect *place) override {
        drawn.push_back(*place);
        VelaDrawing::FrameRect(place);
    }
    std::vector<Rect> drawn;
};

class Ground : public GlogPane {
public:
    explicit Ground(glogRec *glog) {
        GlogPaneInit(glog, 1);
        Rect box{0, 0, 200, 320};
        SetBox(&box);
    }
    void DrawGuts(OSRgn *) override {}
};

class MouseTrackingIndicatorTest : public PaneTest {
protected:
    MouseTrackingIndicatorTest()
        : ground(new Ground(glog))
        , marker(glog) {
        Show();
        ground->Prepare();
    }
    // What was damaged and not drawn yet.
    std::vector<Rect> Damaged() { return Region::Rects(Glog::From(glog).Port().GetDamage()); }
    static Rect Box(short left) { return {10, left, 20, static_cast<short>(left + 10)}; }

    Ground *ground;
    Marker marker;
};

} // namespace

TEST_F(MouseTrackingIndicatorTest, IsHiddenAtFirst) {
    EXPECT_FALSE(marker.IsShowing());
    EXPECT_EQ(marker.GetLocation(), (Rect{0, 0, 0, 0}));
    EXPECT_EQ(marker.GetGlog(), glog);
    marker.MaybeDraw();
    EXPECT_TRUE(marker.drawn.empty());
}

TEST_F(MouseTrackingIndicatorTest, ShowsAtARectangle) {
    marker.Show(Box(30));
    EXPECT_TRUE(marker.IsShowing());
    EXPECT_EQ(marker.GetLocation(), Box(30));
    EXPECT_EQ(marker.drawn, std::vector<Rect>{Box(30)});
    EXPECT_EQ(Damaged(), std::vector<Rect>{Box(30)});
}

TEST_F(MouseTrackingIndicatorTest, HidesWithoutDrawing) {
    marker.Show(Box(30));
    Repainted();
    ground->Prepare();
    marker.drawn.clear();
    marker.Hide();
    EXPECT_FALSE(marker.IsShowing());
    EXPECT_EQ(marker.GetLocation(), Box(30));
    EXPECT_TRUE(marker.drawn.empty());
    EXPECT_EQ(Damaged(), std::vector<Rect>{Box(30)});
}

TEST_F(MouseTrackingIndicatorTest, MovesFromOnePlaceToAnother) {
    marker.Show(Box(30));
    Repainted();
    ground->Prepare();
    marker.drawn.clear();
    marker.Move(Box(60));
    EXPECT_TRUE(marker.IsShowing());
    EXPECT_EQ(marker.GetLocation(), Box(60));
    EXPECT_EQ(marker.drawn, std::vector<Rect>{Box(60)});
    EXPECT_EQ(Damaged(), (std::vector<Rect>{Box(30), Box(60)}));
}

TEST_F(MouseTrackingIndicatorTest, ComesUpWhenItIsMoved) {
    marker.Move(Box(60));
    EXPECT_TRUE(marker.IsShowing());
    EXPECT_EQ(Damaged(), std::vector<Rect>{Box(60)});
}

TEST_F(MouseTrackingIndicatorTest, IsDrawnBeforeItsPlaceIsInvalidated) {
    Rect const here = Box(30), there = Box(60);
    EXPECT_EQ(Traced(*ground, [&] { marker.Show(here); }), Traced(*ground, [&] {
                  VelaDrawing::FrameRect(&here);
                  VelaDrawing::InvalRect(&here);
              }));
    EXPECT_EQ(Traced(*ground, [&] { marker.Move(there); }), Traced(*ground, [&] {
                  VelaDrawing::InvalRect(&here);
                  VelaDrawing::FrameRect(&there);
                  VelaDrawing::InvalRect(&there);
              }));
}

TEST_F(MouseTrackingIndicatorTest, IsDrawnByTheRedrawWhileItShows) {
    marker.Show(Box(30));
    marker.drawn.clear();
    marker.MaybeDraw();
    EXPECT_EQ(marker.drawn, std::vector<Rect>{Box(30)});
    marker.Hide();
    marker.MaybeDraw();
    EXPECT_EQ(marker.drawn.size(), 1u);
}

TEST_F(MouseTrackingIndicatorTest, CopiesStandForThemselves) {
    marker.Show(Box(30));
    Marker copy(marker);
    EXPECT_TRUE(copy.IsShowing());
    EXPECT_EQ(copy.GetLocation(), Box(30));
    marker.Hide();
    EXPECT_TRUE(copy.IsShowing());
    copy = marker;
    EXPECT_FALSE(copy.IsShowing());
    EXPECT_EQ(copy.GetGlog(), glog);
}

TEST_F(MouseTrackingIndicatorTest, NearbyRectanglesLieAtMostThreePixelsApart) {
    EXPECT_TRUE(MouseTrackingIndicator::Nearby(Box(10), Box(23)));
    EXPECT_FALSE(MouseTrackingIndicator::Nearby(Box(10), Box(24)));
    EXPECT_TRUE(MouseTrackingIndicator::Nearby(Box(23), Box(10)));
    EXPECT_TRUE(MouseTrackingIndicator::Nearby({0, 0, 10, 10}, {13, 0, 20, 10}));
    EXPECT_FALSE(MouseTrackingIndicator::Nearby({0, 0, 10, 10}, {14, 0, 20, 10}));
    EXPECT_TRUE(MouseTrackingIndicator::Nearby(Box(10), Box(12)));
}

TEST_F(MouseTrackingIndicatorTest, DrawsThroughItsTable) {
    EXPECT_EQ(PlaceOf(&MouseTrackingIndicator::Draw), kAfterDestructor);
}
