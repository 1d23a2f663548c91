#include "scrolling/GutterPane.h"
#include "tests/PaneTest.h"
#include "tests/VirtualPlace.h"
#include "tests/desktop/ProbePane.h"

namespace {

class Gutter : public GutterPane {
public:
    Gutter(glogRec *glog_, GutterType type, int right_ = 0, int bottom_ = 0)
        : GutterPane(glog_, type)
        , right(right_)
        , bottom(bottom_) {}

    std::vector<int> changes; // the types that GutterLengthChanged was called with
    Rect boxAtChange = {0, 0, 0, 0};

private:
    void GutterLengthChanged(int type) override {
        changes.push_back(type);
        GetBox(&boxAtChange);
    }
    int GetPaneRightEdgeOffset() override { return right; }
    int GetPaneBottomEdgeOffset() override { return bottom; }

    int right, bottom;
};

class GutterPaneTest : public PaneTest {
protected:
    // In the container, with a box that then follows it.
    Gutter *Added(GutterPane::GutterType type, Rect box, int right = 0, int bottom = 0) {
        Gutter *const gutter = new Gutter(glog, type, right, bottom);
        container->Add(gutter, -1);
        gutter->SetBox(&box);
        gutter->changes.clear();
        return gutter;
    }

    ProbeContainer *container = new ProbeContainer(glog, {10, 20, 110, 220}); // 200 x 100
};

typedef std::vector<int> Types;

} // namespace

TEST_F(GutterPaneTest, KnowsItsTypeAndItsContainersSize) {
    Gutter *const gutter = Added(GutterPane::kRightGutter, {0, 180, 50, 200});
    EXPECT_EQ(gutter->GetGutterType(), GutterPane::kRightGutter);
    EXPECT_EQ(gutter->GetContainerHeight(), 100);
    EXPECT_EQ(gutter->GetContainerWidth(), 200);
}

TEST_F(GutterPaneTest, IsAttachedUnderNumberZero) {
    Gutter *const gutter = new Gutter(glog, GutterPane::kBottomGutter);
    EXPECT_EQ(gutter->GetGlog(), glog);
    EXPECT_EQ(gutter->GetID(), 0);
}

TEST_F(GutterPaneTest, WithoutAContainerTheContainersSizeIsZero) {
    Gutter *const gutter = new Gutter(glog, GutterPane::kBottomGutter);
    EXPECT_EQ(gutter->GetContainerHeight(), 0);
    EXPECT_EQ(gutter->GetContainerWidth(), 0);
    Rect box = {10, 20, 30, 40};
    gutter->SetBox(&box);
    EXPECT_EQ(BoxOf(*gutter), (Rect{10, 20, 30, 0}));
}

TEST_F(GutterPaneTest, ARightGutterReachesDownToTheContainersBottom) {
    Gutter *const gutter = Added(GutterPane::kRightGutter, {5, 180, 50, 200});
    EXPECT_EQ(BoxOf(*gutter), (Rect{5, 180, 100, 200}));
}

TEST_F(GutterPaneTest, ABottomGutterReachesToTheContainersRightSide) {
    Gutter *const gutter = Added(GutterPane::kBottomGutter, {80, 5, 100, 50});
    EXPECT_EQ(BoxOf(*gutter), (Rect{80, 5, 100, 200}));
}

TEST_F(GutterPaneTest, KeepsItsOffsetFromTheEdgeThatItReaches) {
    EXPECT_EQ(BoxOf(*Added(GutterPane::kRightGutter, {5, 180, 50, 200}, 3, 16)), (Rect{5, 180, 84, 200}));
    EXPECT_EQ(BoxOf(*Added(GutterPane::kBottomGutter, {80, 5, 100, 50}, 16, 3)), (Rect{80, 5, 100, 184}));
}

TEST_F(GutterPaneTest, AnotherLengthIsToldOnceTheBoxHasIt) {
    Gutter *const gutter = Added(GutterPane::kRightGutter, {5, 180, 50, 200});
    Rect box = {20, 180, 50, 200};
    gutter->SetBox(&box);
    EXPECT_EQ(gutter->changes, Types{GutterPane::kRightGutter});
    EXPECT_EQ(gutter->boxAtChange, (Rect{20, 180, 100, 200}));
    Gutter *const level = Added(GutterPane::kBottomGutter, {80, 5, 100, 50});
    box = {80, 20, 100, 50};
    level->SetBox(&box);
    EXPECT_EQ(level->changes, Types{GutterPane::kBottomGutter});
}

TEST_F(GutterPaneTest, TheSameLengthIsNotTold) {
    Gutter *const gutter = Added(GutterPane::kRightGutter, {5, 180, 50, 200});
    Rect box = {5, 100, 70, 120};
    gutter->SetBox(&box);
    EXPECT_EQ(BoxOf(*gutter), (Rect{5, 100, 100, 120}));
    EXPECT_TRUE(gutter->changes.empty());
}

TEST_F(GutterPaneTest, AResizeBringsABottomGutterOnePixelBeyondTheBottom) {
    Gutter *const gutter = Added(GutterPane::kBottomGutter, {0, 0, 16, 50});
    gutter->Resize({0, 0});
    EXPECT_EQ(BoxOf(*gutter), (Rect{85, 0, 101, 200}));
}

TEST_F(GutterPaneTest, AResizeBringsARightGutterOnePixelBeyondTheRightSide) {
    Gutter *const gutter = Added(GutterPane::kRightGutter, {0, 0, 50, 16});
    gutter->Resize({0, 0});
    EXPECT_EQ(BoxOf(*gutter), (Rect{0, 185, 100, 201}));
}

TEST_F(GutterPaneTest, AResizeKeepsTheOffsetFromTheEdge) {
    Gutter *const level = Added(GutterPane::kBottomGutter, {0, 0, 16, 50}, 20, 5);
    level->Resize({0, 0});
    EXPECT_EQ(BoxOf(*level), (Rect{80, 0, 96, 180}));
    Gutter *const upright = Added(GutterPane::kRightGutter, {0, 0, 50, 16}, 5, 20);
    upright->Resize({0, 0});
    EXPECT_EQ(BoxOf(*upright), (Rect{0, 180, 80, 196}));
}

TEST_F(GutterPaneTest, AResizeInvalidatesTheOldAndTheNewPlace) {
    Gutter *const gutter = Added(GutterPane::kBottomGutter, {0, 0, 10, 200});
    Show();
    gutter->Resize({0, 0});
    // In the glog's coordinates, cut to the container.
    EXPECT_EQ(Repainted(), (std::vector<Rect>{{10, 20, 20, 220}, {101, 20, 110, 220}}));
}

TEST_F(GutterPaneTest, ANewContainerBringsItToItsEdge) {
    Gutter *const gutter = Added(GutterPane::kBottomGutter, {0, 0, 16, 50});
    gutter->ContainmentChanged();
    EXPECT_EQ(BoxOf(*gutter), (Rect{85, 0, 101, 200}));
}

TEST_F(GutterPaneTest, BeginsWithTheBoundsOfItsLayout) {
    Gutter *const gutter = Added(GutterPane::kRightGutter, {0, 0, 50, 16});
    gutter->SetUseLayout(true);
    gutter->InitializeBounds();
    EXPECT_EQ(BoxOf(*gutter), (Rect{0, 185, 100, 201}));
}
