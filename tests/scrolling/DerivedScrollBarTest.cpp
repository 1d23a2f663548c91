// The constants of a scroll bar, which a derived one may change, and where they stand.
#include "tests/VirtualPlace.h"
#include "tests/scrolling/ScrollBarTest.h"

namespace {

// A bar of other measures.
class BroadBar : public ScrollBarPane {
public:
    explicit BroadBar(glogRec *owner) {
        sbarResRec record = {sbarResRec::kType, 0, {10, 20, 210, 50}, 0, 0};
        InitScrollBarPane(owner, &record, 31);
    }
    int GetMinLength() const override { return 100; }
    int GetScrollBarWidth() const override { return 30; }
    int GetFrameWidth() const override { return 2; }
    int GetArrowPaneLength() const override { return 20; }
    int GetMinThumbLength() const override { return 40; }
    short GetArrowIconID(Orientation, ScrollDirection towards) const override {
        return towards == kTowardStart ? 500 : 510;
    }
    void DrawBackground(OSRgn *) override { ++backgrounds; }
    void DrawThumbArea(OSRgn *, bool enabled, Rect bounds, Rect thumb) override {
        drawn.push_back({enabled, bounds, thumb});
    }
    void SetUpBounds(Rect bounds) override {
        setUp.push_back(bounds);
        SetBox(&bounds);
    }

    struct Drawn {
        bool enabled;
        Rect bounds, thumb;
    };
    std::vector<Drawn> drawn;
    std::vector<Rect> setUp;
    int backgrounds = 0;
};

class DerivedScrollBar : public ScrollBarTest {};

} // namespace

TEST_F(DerivedScrollBar, FindsTheNewOperationsInTheToldOrder) {
    ExpectInOrder(PlaceOf(&BroadBar::GetMinLength), &BroadBar::GetMinLength, &BroadBar::GetScrollBarWidth,
                  &BroadBar::GetFrameWidth, &BroadBar::GetArrowPaneLength, &BroadBar::GetMinThumbLength,
                  &BroadBar::GetArrowIconID, &BroadBar::DrawBackground, &BroadBar::DrawThumbArea,
                  &BroadBar::SetUpBounds);
    class Added : public CompoundPane {
    public:
        virtual void First() {}
    };
    EXPECT_EQ(PlaceOf(&BroadBar::GetMinLength), PlaceOf(&Added::First));
}

TEST_F(DerivedScrollBar, BringsItsBoundsThroughSetUpBounds) {
    BroadBar *const bar = new BroadBar(glog);
    EXPECT_EQ(bar->setUp, (std::vector<Rect>{{10, 20, 210, 50}}));
    EXPECT_EQ(bar->GetID(), 31);
}

TEST_F(DerivedScrollBar, LaysOutItsPartsInItsOwnMeasures) {
    BroadBar *const bar = new BroadBar(glog);
    EXPECT_EQ(BoxOfPart(*bar, kUpArrow), (Rect{2, 2, 22, 28}));
    EXPECT_EQ(BoxOfPart(*bar, kThumb),
              (Rect{22, 2, 180, 28})); // an inset of 1 at each end, whatever the frame
    EXPECT_EQ(BoxOfPart(*bar, kDownArrow), (Rect{180, 2, 200, 28}));
}

TEST_F(DerivedScrollBar, TakesItsArrowsFromTheIconsOfItsChoice) {
    BroadBar *const bar = new BroadBar(glog);
    Live(bar);
    Rect const up = BoxOfPart(*bar, kUpArrow), down = BoxOfPart(*bar, kDownArrow);
    EXPECT_EQ(DrawingOfPart(*bar, kUpArrow),
              Traced(*bar->Get(kUpArrow), [&] { Draw1Icon(1000, 500, up.left, up.top); }));
    EXPECT_EQ(DrawingOfPart(*bar, kDownArrow),
              Traced(*bar->Get(kDownArrow), [&] { Draw1Icon(1000, 510, down.left, down.top); }));
}

TEST_F(DerivedScrollBar, WorksFromItsOwnLeastLengthOn) {
    BroadBar *const bar = new BroadBar(glog);
    Live(bar);
    Rect box = {0, 0, 99, 30};
    bar->SetBox(&box);
    EXPECT_TRUE(bar->TooSmall());
    box.bottom = 100;
    bar->SetBox(&box);
    EXPECT_FALSE(bar->TooSmall());
}

TEST_F(DerivedScrollBar, DrawsItsPartsItself) {
    BroadBar *const bar = new BroadBar(glog);
    Live(bar);
    Show();
    bar->backgrounds = 0;
    bar->drawn.clear();
    bar->Inval();
    UpdateGlog(glog);
    EXPECT_EQ(bar->backgrounds, 1);
    ASSERT_EQ(bar->drawn.size(), 1u);
    EXPECT_TRUE(bar->drawn[0].enabled);
    EXPECT_EQ(bar->drawn[0].bounds, BoxOfPart(*bar, kThumb));
    EXPECT_EQ(bar->drawn[0].thumb, (Rect{22, 2, 62, 18})); // always 16 across
}

TEST_F(DerivedScrollBar, DrawsItselfDeadWhenItIs) {
    BroadBar *const bar = new BroadBar(glog);
    Show();
    bar->drawn.clear();
    bar->Inval();
    UpdateGlog(glog);
    ASSERT_EQ(bar->drawn.size(), 1u);
    EXPECT_FALSE(bar->drawn[0].enabled);
}

namespace {

// Notes where its thumb is; the least length is 16 as it is for all.
class ThumbProbe : public ScrollBarPane {
public:
    ThumbProbe(glogRec *owner, short flags, Rect bounds) {
        sbarResRec record = {sbarResRec::kType, flags, bounds, 0, 0};
        InitScrollBarPane(owner, &record, 0);
    }
    void DrawThumbArea(OSRgn *, bool, Rect, Rect thumbRect) override { thumb = thumbRect; }
    Rect thumb = {0, 0, 0, 0};
};

class Thumb : public ScrollBarTest {
protected:
    // A trough of 100 pixels from 15 on.
    Thumb()
        : upright(new ThumbProbe(glog, 0, UprightBox(130)))
        , level(new ThumbProbe(glog, ScrollBarPane::kHorizontalBar, LevelBox(130))) {
        upright->SetClient(&client);
        level->SetClient(&client);
        client.ratio = 0.25;
    }
    Rect UprightThumb(int position, int range) {
        upright->Set(position, range);
        DrawingOfPart(*upright, kThumb);
        return upright->thumb;
    }
    Rect LevelThumb(int position, int range) {
        level->Set(position, range);
        DrawingOfPart(*level, kThumb);
        return level->thumb;
    }
    int LengthAt(double ratio) {
        client.ratio = ratio;
        Rect const r = UprightThumb(0, 10);
        return r.bottom - r.top;
    }

    ThumbProbe *upright, *level;
};

} // namespace

TEST_F(Thumb, StartsAtTheTroughsStart) {
    EXPECT_EQ(UprightThumb(0, 1000), (Rect{15, 1, 40, 17}));
    EXPECT_EQ(LevelThumb(0, 1000), (Rect{1, 15, 17, 40}));
}

TEST_F(Thumb, EndsAtTheTroughsEndWhenThePositionIsTheRange) {
    EXPECT_EQ(UprightThumb(1000, 1000), (Rect{90, 1, 115, 17}));
    EXPECT_EQ(LevelThumb(1000, 1000), (Rect{1, 90, 17, 115}));
}

TEST_F(Thumb, LiesInProportionWithFractionsCutOff) {
    EXPECT_EQ(UprightThumb(500, 1000).top, 15 + 37); // of 37.5
    EXPECT_EQ(LevelThumb(499, 1000).left, 15 + 37);  // of 37.425
    EXPECT_EQ(UprightThumb(999, 1000).top, 15 + 74); // of 74.925
}

TEST_F(Thumb, BeyondTheRangeStaysAtTheEnd) {
    for (int position : {1001, 100000, std::numeric_limits<int>::max()}) {
        EXPECT_EQ(UprightThumb(position, 1000), (Rect{90, 1, 115, 17})) << position;
        EXPECT_EQ(LevelThumb(position, 1), (Rect{1, 90, 17, 115})) << position;
    }
}

TEST_F(Thumb, BelowZeroLiesBeforeTheTrough) {
    EXPECT_EQ(UprightThumb(-100, 1000), (Rect{8, 1, 33, 17})); // 7.5 before
    EXPECT_EQ(LevelThumb(-1000, 1000), (Rect{1, -60, 17, -35}));
}

TEST_F(Thumb, FarBelowZeroItStaysWithinCoordinates) {
    EXPECT_EQ(UprightThumb(std::numeric_limits<int>::min(), 1).top, -32768);
}

TEST_F(Thumb, OfALargeRangeIsCalculatedExactly) {
    int const greatest = std::numeric_limits<int>::max();
    EXPECT_EQ(UprightThumb(greatest, greatest).bottom, 115);
    EXPECT_EQ(UprightThumb(greatest / 2, greatest).top, 15 + 37);
}

TEST_F(Thumb, TakesTheVisiblePartOfTheTroughWithFractionsCutOff) {
    EXPECT_EQ(LengthAt(0.25), 25);
    EXPECT_EQ(LengthAt(0.259), 25);
    EXPECT_EQ(LengthAt(0.5), 50);
    EXPECT_EQ(LengthAt(0.999), 99);
}

TEST_F(Thumb, IsNeverShorterThanSixteenPixels) {
    EXPECT_EQ(LengthAt(0.17), 17);
    EXPECT_EQ(LengthAt(0.16), 16);
    EXPECT_EQ(LengthAt(0.1599), 16);
    EXPECT_EQ(LengthAt(0.0), 16);
    EXPECT_EQ(LengthAt(-1e300), 16);
    EXPECT_EQ(LengthAt(-std::numeric_limits<double>::infinity()), 16);
    EXPECT_EQ(LengthAt(std::numeric_limits<double>::quiet_NaN()), 16);
}

TEST_F(Thumb, IsNeverLongerThanTheTrough) {
    EXPECT_EQ(LengthAt(1.0), 100);
    EXPECT_EQ(LengthAt(1e300), 100);
    EXPECT_EQ(LengthAt(std::numeric_limits<double>::infinity()), 100);
}

TEST_F(Thumb, IsSixteenPixelsLongWithoutAClient) {
    upright->SetClient(nullptr);
    EXPECT_EQ(UprightThumb(0, 10), (Rect{15, 1, 31, 17}));
}

TEST_F(Thumb, KeepsItsLeastLengthInATroughThatIsShorter) {
    Rect box = UprightBox(40); // the trough has 10 pixels
    upright->SetBox(&box);
    EXPECT_EQ(UprightThumb(5, 10), (Rect{9, 1, 25, 17}));
}

TEST_F(Thumb, OfNoLessThanItsLeastLengthEndsWithAShorterTrough) {
    Rect box = UprightBox(40); // the trough has 10 pixels
    upright->SetBox(&box);
    EXPECT_EQ(LengthAt(1.59), 16);
    EXPECT_EQ(LengthAt(1.6), 10);
}

TEST_F(Thumb, IsSixteenPixelsAcrossInABroaderBar) {
    Rect box = {10, 20, 140, 80};
    upright->SetBox(&box);
    EXPECT_EQ(UprightThumb(0, 10).right - UprightThumb(0, 10).left, 16);
}

TEST_F(Thumb, OfARangeOfZeroLiesAtTheStart) {
    EXPECT_EQ(UprightThumb(0, 0).top, 15);
    EXPECT_EQ(UprightThumb(5, 0).top, 15);
}
