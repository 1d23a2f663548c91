#include "graphics/ProgressBarPane.h"
#include "graphics/ProgressBarDrawing.h"
#include "host/Icons.h"
#include "host/OSPort.h"
#include "host/OSRgn.h"
#include "host/VelaDrawing.h"
#include "tests/PaneTest.h"
#include <limits>

namespace {

short const kFamily = 1605;

class ProgressBarPaneTest : public PaneTest {
protected:
    ProgressBarPaneTest()
        : bar(new ProgressBarPane(glog, 3)) {
        Rect box{20, 10, 40, 210};
        bar->SetBox(&box);
    }

    // The calls that draw a bar which is filled up to the given pixel, in the test's box.
    Lines Filled(double width) {
        return Traced(*bar, [=] {
            OS::RectBase<OS::RectTag> const whole(10, 24, 200, 12);
            OSPort::Current().NarrowClip(whole);
            TileIconInRectWithEndCaps(whole, kFamily, 0);
            OSPort::Current().NarrowClip(OS::RectBase<OS::RectTag>(10, 24, width, 12));
            TileIconInRectWithEndCaps(whole, kFamily, 6);
        });
    }
    Lines Inactive() {
        return Traced(*bar, [] {
            OS::RectBase<OS::RectTag> const whole(10, 24, 200, 12);
            OSPort::Current().NarrowClip(whole);
            TileIconInRectWithEndCaps(whole, kFamily, 3);
        });
    }
    // The calls of a bar in a rectangle of its own.
    Lines BarIn(OS::RectBase<OS::RectTag> const &rect) {
        return Traced(*bar, [&] { DrawProgressBarInRect(rect, 0.5, true); });
    }
    Lines Tiles(OS::RectBase<OS::RectTag> const &rect) {
        return Traced(*bar, [&] {
            TileIconInRectWithEndCaps(rect, kFamily, 0);
            TileIconInRectWithEndCaps(rect, kFamily, 6);
        });
    }

    ProgressBarPane *bar;
};

} // namespace

TEST_F(ProgressBarPaneTest, HasItsNumber) { EXPECT_EQ(bar->GetID(), 3); }

TEST_F(ProgressBarPaneTest, IsInactiveAtFirst) {
    Show();
    EXPECT_EQ(DrawingOf(*bar), Inactive());
}

TEST_F(ProgressBarPaneTest, IsFilledByItsShareOfTheWidth) {
    Show();
    bar->SetProgress(1, 4);
    EXPECT_EQ(DrawingOf(*bar), Filled(50));
    bar->SetProgress(0, 100);
    EXPECT_EQ(DrawingOf(*bar), Filled(0));
}

TEST_F(ProgressBarPaneTest, WithoutAMaximumIsInactiveAgain) {
    Show();
    bar->SetProgress(5, 10);
    bar->SetProgress(5, 0);
    EXPECT_EQ(DrawingOf(*bar), Inactive());
    bar->SetProgress(0, 10);
    EXPECT_EQ(DrawingOf(*bar), Filled(0));
}

TEST_F(ProgressBarPaneTest, IsFullBeyondTheMaximumAndEmptyBelowZero) {
    Show();
    bar->SetProgress(200, 100);
    EXPECT_EQ(DrawingOf(*bar), Filled(200));
    bar->SetProgress(-1, 100);
    EXPECT_EQ(DrawingOf(*bar), Filled(0));
    bar->SetProgress(1, -100);
    EXPECT_EQ(DrawingOf(*bar), Filled(0));
    long long const greatest = std::numeric_limits<long long>::max();
    bar->SetProgress(greatest, greatest);
    EXPECT_EQ(DrawingOf(*bar), Filled(200));
    bar->SetProgress(std::numeric_limits<long long>::min(), greatest);
    EXPECT_EQ(DrawingOf(*bar), Filled(0));
}

TEST_F(ProgressBarPaneTest, IsRepaintedWhenItChanges) {
    Show();
    std::vector<Rect> const box = {{20, 10, 40, 210}};
    bar->SetProgress(0, 10);
    EXPECT_EQ(Repainted(), box);
    bar->SetProgress(5, 10);
    EXPECT_EQ(Repainted(), box);
    bar->SetProgress(0, 0);
    EXPECT_EQ(Repainted(), box);
}

TEST_F(ProgressBarPaneTest, IsNotRepaintedForTheSameShare) {
    bar->SetProgress(5, 10);
    Show();
    bar->SetProgress(5, 10);
    bar->SetProgress(50, 100);
    EXPECT_TRUE(Repainted().empty());
}

TEST_F(ProgressBarPaneTest, IsNotRepaintedForLessThanAPixel) {
    bar->SetProgress(500000, 1000000);
    Show();
    bar->SetProgress(500001, 1000000);
    EXPECT_TRUE(Repainted().empty());
    bar->SetProgress(505000, 1000000);
    EXPECT_FALSE(Repainted().empty());
}

TEST_F(ProgressBarPaneTest, SmallStepsAddUp) {
    bar->SetProgress(0, 10000);
    Show();
    int repaints = 0;
    for (int step = 1; step <= 10000; ++step) {
        bar->SetProgress(step, 10000);
        repaints += !Repainted().empty();
    }
    EXPECT_EQ(repaints, 200) << "once for each pixel";
    EXPECT_EQ(DrawingOf(*bar), Filled(200));
}

TEST_F(ProgressBarPaneTest, KeepsItsPlaceWhenTheWindowGrows) {
    Show();
    desktop.Play("resize 500 400");
    EXPECT_EQ(BoxOf(*bar), (Rect{20, 10, 40, 210}));
}

TEST_F(ProgressBarPaneTest, IsCentredFromTopToBottom) {
    Show();
    EXPECT_EQ(Only("TileIconInRectWithEndCaps", BarIn({0, 0, 100, 13})), Tiles({0, 0, 100, 12}));
    EXPECT_EQ(Only("TileIconInRectWithEndCaps", BarIn({0, 0, 100, 14})), Tiles({0, 1, 100, 12}));
    EXPECT_EQ(Only("TileIconInRectWithEndCaps", BarIn({0, 10, 100, 11})), Tiles({0, 9, 100, 12}))
        << "half a pixel goes up";
}

TEST_F(ProgressBarPaneTest, IsAPixelNarrowerWhereWhatLiesBetweenItsCapsIsOdd) {
    Show();
    EXPECT_EQ(Only("TileIconInRectWithEndCaps", BarIn({0, 0, 101, 12})), Tiles({0, 0, 100, 12}));
    EXPECT_EQ(Only("TileIconInRectWithEndCaps", BarIn({0, 0, 7, 12})), Tiles({0, 0, 6, 12}))
        << "narrower than its caps";
}

TEST_F(ProgressBarPaneTest, LeavesThePortAsItWas) {
    Show();
    bar->SetProgress(1, 2);
    EXPECT_TRUE(KeepsColors(*bar));
    bar->Prepare();
    OSRgn before, after;
    VelaDrawing::GetClip(&before);
    DrawProgressBarInRect(OS::RectBase<OS::RectTag>(0, 0, 50, 12), 0.5, true);
    VelaDrawing::GetClip(&after);
    EXPECT_EQ(CarbonUtils::GetRgnBounds(&after), CarbonUtils::GetRgnBounds(&before));
}

TEST_F(ProgressBarPaneTest, DrawsNothingHarmfulForFractionsThatAreNone) {
    Show();
    for (double fraction :
         {std::numeric_limits<double>::quiet_NaN(), std::numeric_limits<double>::infinity(), -1.0, 1e300})
        EXPECT_EQ(Only("TileIconInRectWithEndCaps", Traced(*bar,
                                                           [&] {
                                                               DrawProgressBarInRect(
                                                                   OS::RectBase<OS::RectTag>(0, 0, 50, 12),
                                                                   fraction, true);
                                                           }))
                      .size(),
                  2u)
            << fraction;
}

TEST_F(ProgressBarPaneTest, DrawsNothingHarmfulInRectanglesThatAreNone) {
    Show();
    double const none = std::numeric_limits<double>::quiet_NaN(),
                 endless = std::numeric_limits<double>::infinity();
    for (double width : {0.0, -5.0, 1.0, 1e300, -1e300, endless, none})
        for (double place : {0.0, 1e300, -endless, none})
            for (bool active : {false, true})
                EXPECT_EQ(Traced(*bar,
                                 [&] {
                                     DrawProgressBarInRect({place, place, width, width}, 0.5, active);
                                 })
                              .size(),
                          active ? 4u : 2u)
                    << width << " at " << place;
}

TEST_F(ProgressBarPaneTest, OfAnyBoxKeepsItsProgress) {
    for (Rect box : {Rect{0, 0, 0, 0}, Rect{10, 10, 5, 5}, Rect{-32768, -32768, 32767, 32767}}) {
        bar->SetBox(&box);
        bar->SetProgress(1, 4);
        Show();
        EXPECT_EQ(bar->GetFraction(), 0.25);
    }
}
