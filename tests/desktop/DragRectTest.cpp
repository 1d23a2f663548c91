#include "host/DragRect.h"
#include "desktop/drawing/Surface.h"
#include "host/CIdleChore.h"
#include "host/NamedColors.h"
#include "host/OSPort.h"
#include "host/OSRgn.h"
#include "host/Services.h"
#include "tests/PaneTest.h"
#include "tests/desktop/ProbePane.h"
#include <cstdio>

namespace {

// The grabbed row of every test, and the pane around it. Windows are 320 x 200.
Rect const kPane = {20, 40, 120, 240};
Rect const kRow = {60, 41, 76, 239};
Point const kGrab = {68, 100};

OS::RectBase<OS::RectTag> Floating(Rect const &r) {
    return {double(r.left), double(r.top), double(r.right - r.left), double(r.bottom - r.top)};
}

OS::RectBase<OS::RectTag> Around(Rect const &r, short dh, short dv) {
    Rect grown = r;
    VelaDrawing::InsetRect(&grown, static_cast<short>(-dh), static_cast<short>(-dv));
    return Floating(grown);
}

class Updater : public DragRegionUpdater {
public:
    explicit Updater(std::function<void()> work_)
        : work(std::move(work_)) {}
    void UpdateDragRegion() override { work(); }

private:
    std::function<void()> work;
};

std::uint32_t PixelOf(RGBColor const &c) {
    return 0xFF000000u | static_cast<std::uint32_t>(c.red >> 8) << 16 |
           static_cast<std::uint32_t>(c.green >> 8) << 8 | static_cast<std::uint32_t>(c.blue >> 8);
}

std::vector<std::uint32_t> Pixels(Surface const &surface) {
    return {surface.Pixels(),
            surface.Pixels() + static_cast<std::size_t>(surface.Width()) * surface.Height()};
}

class DragRectTest : public PaneTest {
protected:
    Calls &calls = FreshCalls();
    ProbePane *pane = new ProbePane(glog, kPane, calls);
    DragRegionTypes::Constraint constraint = DragRegionTypes::kFree;
    Rect limit = kPane;
    DragRegionTypes::Result result = {true, -1, -1};
    int passes = 0;
    std::function<void()> duringPass;

    // Drags the row by the script, which begins where it is grabbed.
    void Drag(std::string const &script) {
        Show();
        pane->onClick = [this](EventRecordAdapter *) {
            Updater updater([this] {
                ++passes;
                if (duringPass)
                    duringPass();
            });
            result = DragRect(pane, Floating(kRow), {double(kGrab.h), double(kGrab.v)}, Floating(limit),
                              Around(kPane, 24, 40), constraint, &updater);
        };
        desktop.Play("press 100 68\n" + script);
    }

    std::uint32_t Shown(int h, int v) const { return desktop.Picture(glog)->Row(v)[h]; }

    // Whether the screen shows an outline of the row, moved by so much.
    bool ShowsOutline(int dh, int dv) {
        UpdateGlog(glog);
        Rect r = kRow;
        VelaDrawing::OffsetRect(&r, static_cast<short>(dh), static_cast<short>(dv));
        std::uint32_t const ink = PixelOf(kDialogActiveTextColor), ground = PixelOf(kWindowBackgroundColor);
        for (int h = r.left; h < r.right; ++h)
            if (Shown(h, r.top) != ink || Shown(h, r.bottom - 1) != ink)
                return false;
        for (int v = r.top; v < r.bottom; ++v)
            if (Shown(r.left, v) != ink || Shown(r.right - 1, v) != ink)
                return false;
        return Shown(r.left + 1, r.top + 1) == ground && Shown(r.right - 2, r.bottom - 2) == ground &&
               Shown(r.left + 2, r.top + 2) != ground;
    }
};

void ExpectResult(DragRegionTypes::Result const &result, bool moved, double dh, double dv) {
    EXPECT_EQ(result.moved, moved);
    EXPECT_EQ(result.dh, dh);
    EXPECT_EQ(result.dv, dv);
}

TEST_F(DragRectTest, TheResultIsHowFarTheMouseHasGone) {
    Drag("move 105 70\nmove 112 75\nrelease");
    ExpectResult(result, true, 12, 7);
}

TEST_F(DragRectTest, WithoutAMovementNothingHasMoved) {
    Drag("wait 0.2\nrelease");
    ExpectResult(result, false, 0, 0);
}

TEST_F(DragRectTest, BackAtItsPlaceTheOutlineHasNotMoved) {
    Drag("move 120 90\nmove 100 68\nrelease");
    ExpectResult(result, false, 0, 0);
}

TEST_F(DragRectTest, TheOutlineFollowsTheMouse) {
    std::vector<bool> shown;
    duringPass = [&] {
        // The pass comes before the outline is moved to the place that has been reported.
        shown.push_back(passes == 1 ? ShowsOutline(0, 0) : ShowsOutline(0, 10 * (passes - 1)));
    };
    Drag("move 100 78\nmove 100 88\nmove 100 98\nrelease");
    EXPECT_EQ(shown, (std::vector<bool>{true, true, true}));
}

TEST_F(DragRectTest, HeldToTheVerticalItOnlyGoesUpAndDown) {
    constraint = DragRegionTypes::kVerticalOnly;
    bool shown = false;
    duringPass = [&] { shown = passes < 2 || ShowsOutline(0, 12); };
    Drag("move 130 80\nmove 131 80\nrelease");
    ExpectResult(result, true, 0, 12);
    EXPECT_TRUE(shown);
}

TEST_F(DragRectTest, HeldToTheHorizontalItOnlyGoesLeftAndRight) {
    constraint = DragRegionTypes::kHorizontalOnly;
    Drag("move 130 80\nrelease");
    ExpectResult(result, true, 30, 0);
}

TEST_F(DragRectTest, ASidewaysMovementIsNoneWhenHeldToTheVertical) {
    constraint = DragRegionTypes::kVerticalOnly;
    Drag("move 130 68\nrelease");
    ExpectResult(result, false, 0, 0);
}

TEST_F(DragRectTest, TheGrabbedPointStaysWithinTheLimit) {
    Drag("move 30 10\nrelease");
    ExpectResult(result, true, kPane.left - kGrab.h, kPane.top - kGrab.v);
    Drag("move 250 140\nrelease");
    ExpectResult(result, true, kPane.right - 1 - kGrab.h, kPane.bottom - 1 - kGrab.v);
}

TEST_F(DragRectTest, WhatLiesBeyondTheLimitDoesNotShow) {
    bool above = true, inside = false;
    duringPass = [&] {
        UpdateGlog(glog);
        if (passes < 2)
            return;
        // The row hangs out of the pane by half of its height.
        above = Shown(100, kPane.top - 1) != PixelOf(kWindowBackgroundColor);
        inside = Shown(kRow.left, kPane.top) == PixelOf(kDialogActiveTextColor);
    };
    Drag("move 100 10\nmove 101 10\nrelease");
    EXPECT_FALSE(above);
    EXPECT_TRUE(inside);
}

TEST_F(DragRectTest, AGrabBeyondTheLimitCanBeReturnedTo) {
    limit = {20, 40, 60, 240};
    Drag("move 100 50\nmove 100 64\nrelease");
    ExpectResult(result, true, 0, 64 - kGrab.v);
}

TEST_F(DragRectTest, OutsideOfTheSlopItSnapsBackAndIsNotMoved) {
    bool back = false;
    duringPass = [&] { back = passes < 3 || ShowsOutline(0, 0); };
    Drag("move 100 110\nmove 100 161\nmove 101 161\nrelease");
    ExpectResult(result, false, 0, 0);
    EXPECT_TRUE(back);
}

TEST_F(DragRectTest, AtTheEdgeOfTheSlopItStillCounts) {
    Drag("move 100 159\nrelease");
    ExpectResult(result, true, 0, kPane.bottom - 1 - kGrab.v);
    Drag("move 100 160\nrelease");
    ExpectResult(result, false, 0, 0);
}

TEST_F(DragRectTest, BackInTheSlopItGoesOn) {
    Drag("move 100 190\nmove 100 80\nrelease");
    ExpectResult(result, true, 0, 12);
}

TEST_F(DragRectTest, TheUpdaterIsCalledTwentyTimesASecondWhileTheMouseRests) {
    Drag("wait 0.5\nrelease");
    EXPECT_EQ(passes, 10);
}

TEST_F(DragRectTest, TheUpdaterIsCalledForEachMovementToo) {
    Drag("move 100 70\nmove 100 71\nmove 100 72\nrelease");
    EXPECT_EQ(passes, 3);
}

TEST_F(DragRectTest, WithoutAnUpdaterItDragsAllTheSame) {
    Show();
    pane->onClick = [this](EventRecordAdapter *) {
        result = DragRect(pane, Floating(kRow), {double(kGrab.h), double(kGrab.v)}, Floating(kPane),
                          Around(kPane, 24, 40), DragRegionTypes::kFree, nullptr);
    };
    desktop.Play("press 100 68\nwait 3\nmove 101 70\nrelease");
    ExpectResult(result, true, 1, 2);
}

TEST_F(DragRectTest, WithoutAPaneThereIsNothingToDrag) {
    ExpectResult(DragRect(nullptr, Floating(kRow), {0, 0}, Floating(kPane), Floating(kPane),
                          DragRegionTypes::kFree, nullptr),
                 false, 0, 0);
}

TEST_F(DragRectTest, NumbersThatAreNoneMoveNothing) {
    Show();
    double const none = std::numeric_limits<double>::quiet_NaN();
    pane->onClick = [&](EventRecordAdapter *) {
        result = DragRect(pane, {none, none, none, 1e300}, {none, 1e300}, {none, none, none, none},
                          {none, none, none, none}, DragRegionTypes::kFree, nullptr);
    };
    desktop.Play("press 100 68\nmove 101 70\nrelease");
    ExpectResult(result, false, 0, 0);
}

TEST_F(DragRectTest, ThePaneIsPreparedAfterwards) {
    ProbePane *other = new ProbePane(glog, {150, 0, 170, 50}, calls, "other");
    duringPass = [&] { other->Prepare(); };
    Rect afterwards = {0, 0, 0, 0};
    Show();
    pane->onClick = [&](EventRecordAdapter *) {
        Updater updater(duringPass);
        DragRect(pane, Floating(kRow), {double(kGrab.h), double(kGrab.v)}, Floating(kPane),
                 Around(kPane, 24, 40), DragRegionTypes::kFree, &updater);
        OSRgn clip;
        VelaDrawing::GetClip(&clip);
        afterwards = CarbonUtils::GetRgnBounds(&clip);
    };
    desktop.Play("press 100 68\nmove 100 80\nrelease");
    EXPECT_EQ(afterwards, kPane);
}

// What lies beneath

class DragRectAtScale : public testing::TestWithParam<double> {};

TEST_P(DragRectAtScale, WhatLiesUnderTheOutlineIsRestoredExactly) {
    SimulatedDesktop desktop(DesktopOptions().Scale(GetParam()));
    glogRec *const glog = desktop.NewGlog(GlogOptions().Size(320, 200));
    Calls &calls = FreshCalls();
    ProbePane *pane = new ProbePane(glog, kPane, calls);
    pane->onDraw = [](OSRgn *) {
        for (short i = 0; i < 100; ++i) {
            GrayForeColor(i % 2 ? 0 : 100);
            VelaDrawing::MoveTo(kPane.left, static_cast<short>(kPane.top + i));
            VelaDrawing::LineTo(kPane.right, static_cast<short>(kPane.bottom - i));
        }
    };
    ShowGlog(glog, kShowGlog);
    UpdateGlog(glog);
    std::vector<std::uint32_t> const before = Pixels(*desktop.Picture(glog));
    std::vector<std::uint32_t> meanwhile;
    pane->onClick = [&](EventRecordAdapter *) {
        Updater updater([&] {
            UpdateGlog(glog);
            meanwhile = Pixels(*desktop.Picture(glog));
        });
        DragRect(pane, Floating(kRow), {double(kGrab.h), double(kGrab.v)}, Floating(kPane),
                 Around(kPane, 24, 40), DragRegionTypes::kFree, &updater);
    };
    int const draws = Count(calls, "pane: draw");
    desktop.Play("press 100 68\nmove 108 75\nmove 117 83\nrelease");
    EXPECT_NE(meanwhile, before);
    EXPECT_EQ(Pixels(*desktop.Picture(glog)), before);
    EXPECT_EQ(Count(calls, "pane: draw"), draws) << "the pane was redrawn";
}

INSTANTIATE_TEST_SUITE_P(Scales, DragRectAtScale, testing::Values(1.0, 1.25, 1.5, 2.0, 3.0));

TEST_F(DragRectTest, WhatIsRedrawnMeanwhileComesUpUnderIt) {
    std::vector<std::uint32_t> before;
    duringPass = [&] {
        if (passes == 1)
            before = Pixels(*desktop.Picture(glog));
        pane->onDraw = [](OSRgn *) {
            GrayForeColor(100);
            VelaDrawing::PaintRect(&kPane);
        };
        pane->Inval();
        EXPECT_TRUE(ShowsOutline(0, passes == 1 ? 0 : 10));
    };
    Drag("move 100 78\nmove 101 78\nrelease");
    std::vector<std::uint32_t> const after = Pixels(*desktop.Picture(glog));
    pane->Inval();
    UpdateGlog(glog);
    EXPECT_EQ(after, Pixels(*desktop.Picture(glog)));
    EXPECT_NE(after, before);
}

TEST_F(DragRectTest, WhatScrollsMeanwhileLeavesTheOutlineWhereItIs) {
    duringPass = [&] {
        pane->Prepare();
        OSPort::Current().ScrollRect(Floating(kPane), OS::Size(0, 16));
        EXPECT_TRUE(ShowsOutline(0, passes == 1 ? 0 : 10));
    };
    Drag("move 100 78\nmove 100 79\nrelease");
    std::vector<std::uint32_t> const after = Pixels(*desktop.Picture(glog));
    pane->Inval();
    UpdateGlog(glog);
    EXPECT_EQ(after, Pixels(*desktop.Picture(glog)));
}

TEST_F(DragRectTest, AStepPresentsTheTwoOutlinesAlone) {
    int area = 0;
    duringPass = [&] {
        UpdateGlog(glog);
        for (Rect const &r : desktop.TakePresented(glog))
            area += passes == 2 ? (r.right - r.left) * (r.bottom - r.top) : 0;
    };
    Drag("move 100 78\nmove 101 78\nrelease");
    int const width = kRow.right - kRow.left, height = kRow.bottom - kRow.top;
    int const outline = 2 * (2 * width + 2 * height);
    EXPECT_GT(area, outline);
    EXPECT_LE(area, 2 * outline);
}

TEST_F(DragRectTest, APictureOfTheWindowShowsIt) {
    std::string const file = testing::TempDir() + "glog-drag-outline.png";
    std::remove(file.c_str());
    Drag("move 100 78\nsnapshot " + file + "\nrelease");
    std::string error;
    std::unique_ptr<Surface> const picture = Surface::ReadPng(file, error);
    ASSERT_NE(picture, nullptr) << error;
    EXPECT_EQ(picture->Row(kRow.top + 10)[100], PixelOf(kDialogActiveTextColor));
}

// What may happen meanwhile

TEST_F(DragRectTest, AnUpdaterMayDeleteThePane) {
    Show();
    std::vector<std::uint32_t> const before = Pixels(*desktop.Picture(glog));
    duringPass = [&] { delete pane; };
    Drag("move 100 78\nmove 100 88\nrelease");
    ExpectResult(result, false, 0, 0);
    EXPECT_EQ(passes, 1);
    UpdateGlog(glog);
    EXPECT_EQ(Pixels(*desktop.Picture(glog)), before) << "the outline is still there";
}

TEST_F(DragRectTest, AnUpdaterMayCloseTheWindow) {
    glogRec *const other = desktop.NewGlog(GlogOptions());
    ShowGlog(other, kShowGlog);
    duringPass = [&] { DisposeGlog(glog); };
    Drag("move 100 78\nmove 100 88\nrelease");
    EXPECT_EQ(passes, 1);
}

TEST_F(DragRectTest, LosingTheActivationEndsItWhereItIs) {
    Drag("move 100 78\nactivate off\nmove 100 98\nrelease");
    ExpectResult(result, true, 0, 10);
}

TEST_F(DragRectTest, AnUpdaterThatThrowsLeavesNoOutline) {
    Show();
    std::vector<std::uint32_t> const before = Pixels(*desktop.Picture(glog));
    duringPass = [] { throw std::runtime_error("enough"); };
    EXPECT_THROW(Drag("move 100 78\nmove 100 88\nrelease"), std::runtime_error);
    UpdateGlog(glog);
    EXPECT_EQ(Pixels(*desktop.Picture(glog)), before);
}

TEST_F(DragRectTest, APaneInAContainerDragsInItsOwnCoordinates) {
    ProbeContainer *container = new ProbeContainer(glog, {130, 10, 190, 110});
    ProbePane *inside = new ProbePane(glog, {0, 0, 200, 100}, calls, "inside");
    container->Add(inside, -1);
    Show();
    inside->onClick = [&](EventRecordAdapter *) {
        Updater updater([&] {
            UpdateGlog(glog);
            if (++passes == 2) {
                EXPECT_EQ(Shown(12, 130 + 20), PixelOf(kDialogActiveTextColor));
            }
        });
        result = DragRect(inside, Floating({10, 2, 30, 90}), {5, 15}, Floating({0, 0, 200, 100}),
                          Floating({0, 0, 200, 100}), DragRegionTypes::kVerticalOnly, &updater);
    };
    desktop.Play("press 15 145\nmove 15 155\nmove 16 155\nrelease");
    ExpectResult(result, true, 0, 10);
    EXPECT_EQ(passes, 2);
}

TEST_F(DragRectTest, TheOutlineDoesNotLeaveTheContainer) {
    ProbeContainer *container = new ProbeContainer(glog, {130, 10, 190, 110});
    ProbePane *inside = new ProbePane(glog, {0, 0, 200, 100}, calls, "inside");
    container->Add(inside, -1);
    Show();
    std::uint32_t beyond = 0;
    inside->onClick = [&](EventRecordAdapter *) {
        Updater updater([&] {
            UpdateGlog(glog);
            beyond = Shown(12, 191);
        });
        DragRect(inside, Floating({10, 2, 30, 90}), {5, 15}, Floating({0, 0, 200, 100}),
                 Floating({0, 0, 200, 100}), DragRegionTypes::kVerticalOnly, &updater);
    };
    desktop.Play("press 15 145\nmove 15 190\nmove 16 190\nrelease");
    EXPECT_EQ(beyond, PixelOf(kWindowBackgroundColor));
}

} // namespace
