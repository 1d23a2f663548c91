#include "desktop/windows/PlatformConventions.h"
#include "host/Services.h"
#include "tests/PaneTest.h"
#include "tests/desktop/ProbePane.h"

namespace {

// A window of 200 x 100 with a pane in its corner that takes presses.
class GrowingTest : public PaneTest {
protected:
    ~GrowingTest() override { PlatformConventions::showsGrowBoxes = true; }

    void Open(bool growable) {
        window = desktop.NewGlog(GlogOptions().Size(200, 100).Growable(growable));
        corner = new ProbePane(window, {85, 185, 100, 200}, calls, "corner");
        corner->clickResult = -1;
        desktop.FinishGlog(window);
        ShowGlog(window, kShowGlog);
    }
    Point Size() const { return {GetGlogHeight(window), GetGlogWidth(window)}; }

    Calls &calls = FreshCalls();
    glogRec *window = nullptr;
    ProbePane *corner = nullptr;
};

} // namespace

TEST_F(GrowingTest, TheWindowFollowsADragOfItsCorner) {
    Open(true);
    desktop.Play("press 190 90\nmove 200 95");
    EXPECT_EQ(Size(), (Point{105, 210}));
    Open(true);
    desktop.Play("press 190 90\nmove 290 190\nmove 150 80\nrelease\nmove 10 10");
    EXPECT_EQ(Size(), (Point{90, 160}));
}

TEST_F(GrowingTest, PanesHearOfEachStep) {
    Open(true);
    calls.clear();
    desktop.Play("press 190 90\nmove 195 90\nmove 195 92\nrelease");
    EXPECT_EQ(Count(calls, "corner: Resize 5 0"), 1);
    EXPECT_EQ(Count(calls, "corner: Resize 0 2"), 1);
}

TEST_F(GrowingTest, StaysWithinTheLimits) {
    Open(true);
    window->SetMinSize(150, 80);
    window->SetMaxSize(250, 120);
    desktop.Play("press 190 90\nmove 10 10");
    EXPECT_EQ(Size(), (Point{80, 150}));
    Rect place = {65, 135, 80, 150};
    corner->SetBox(&place);
    desktop.Play("press 145 75\nmove 900 900");
    EXPECT_EQ(Size(), (Point{120, 250}));
}

TEST_F(GrowingTest, NeverBecomesNothing) {
    Open(true);
    desktop.Play("press 190 90\nmove -500 -500");
    EXPECT_EQ(Size(), (Point{1, 1}));
}

TEST_F(GrowingTest, AWindowThatIsNotGrowableStays) {
    Open(false);
    desktop.Play("press 190 90\nmove 220 120\nrelease");
    EXPECT_EQ(Size(), (Point{100, 200}));
}

TEST_F(GrowingTest, WithoutGrowBoxesOnThePlatformTheCornerIsNothingSpecial) {
    PlatformConventions::showsGrowBoxes = false;
    Open(true);
    desktop.Play("press 190 90\nmove 220 120\nrelease");
    EXPECT_EQ(Size(), (Point{100, 200}));
}

TEST_F(GrowingTest, APaneThatLeavesTheCornersPressGrowsNothing) {
    Open(true);
    corner->clickResult = 0;
    desktop.Play("press 190 90\nmove 220 120\nrelease");
    EXPECT_EQ(Size(), (Point{100, 200}));
}

TEST_F(GrowingTest, APaneThatFollowsTheMouseItselfGrowsNothing) {
    Open(true);
    corner->onClick = [](EventRecordAdapter *) {
        Point p{0, 0};
        while (MouseIsDragging(&p, nullptr)) {
        }
    };
    desktop.Play("press 190 90\nmove 220 120\nrelease");
    EXPECT_EQ(Size(), (Point{100, 200}));
}

TEST_F(GrowingTest, OnlyTheCornerGrowsTheWindow) {
    Open(true);
    ProbePane *const elsewhere = new ProbePane(window, {0, 0, 50, 50}, calls);
    elsewhere->clickResult = -1;
    desktop.Play("press 20 20\nmove 50 50\nrelease");
    EXPECT_EQ(Size(), (Point{100, 200}));
}

// Closes its glog when it hears of a new size.
class ClosingPane : public ProbePane {
public:
    using ProbePane::ProbePane;
    void Resize(Point) override { DisposeGlog(GetGlog()); }
};

TEST_F(GrowingTest, AWindowThatIsClosedWhileItGrowsGrowsNoMore) {
    Open(true);
    new ClosingPane(window, {0, 0, 5, 5}, calls, "closing");
    desktop.Play("press 190 90\nmove 195 95\nmove 199 99\nrelease");
    EXPECT_EQ(Count(calls, "corner: Resize 5 5"), 1);
    EXPECT_EQ(Count(calls, "corner: Resize 4 4"), 0);
    EXPECT_EQ(Count(calls, "corner: gone"), 1);
}
