// How a scroll bar is drawn, call by call.
#include "host/NamedColors.h"
#include "host/OSRgn.h"
#include "host/VelaDrawing.h"
#include "tests/scrolling/ScrollBarTest.h"

namespace {

short const kFamily = 1000;

class ScrollBarDrawing : public ScrollBarTest {
protected:
    // What the trough's pane draws, against the calls of the action.
    void ExpectThumbDrawing(ScrollBarPane &bar, std::function<void()> const &expected,
                            OSRgn *region = nullptr) {
        Lines const drawn = DrawingOfPart(bar, kThumb, region);
        EXPECT_EQ(drawn, Traced(*bar.Get(kThumb), expected));
    }
    static void Tile(Rect r, short icon, int width, int height) {
        TileIcon(&r, kFamily, icon, static_cast<short>(width), static_cast<short>(height));
    }
    // Whether the icon is drawn when the region from the first to the second place along the bar is.
    bool Draws(ScrollBarPane &bar, short icon, int from, int to) {
        Rect const r = bar.IsHorizontal() ? Rect{0, static_cast<short>(from), 16, static_cast<short>(to)}
                                          : Rect{static_cast<short>(from), 0, static_cast<short>(to), 16};
        OSRgn region;
        VelaDrawing::RectRgn(&region, &r);
        for (std::string const &line : DrawingOfPart(bar, kThumb, &region))
            if (line.find("\"icon\":" + std::to_string(icon) + ",") != std::string::npos)
                return true;
        return false;
    }
    // The calls behind the parts.
    void ExpectBackground(ScrollBarPane &bar, Rect frame) {
        Show();
        bar.Inval();
        desktop.TakeDrawing();
        UpdateGlog(glog);
        Lines drawn = desktop.TakeDrawing();
        Rect const box = BoxOf(bar);
        Lines const expected = Traced(bar, [&] {
            VelaDrawing::RGBForeColor(kScrollBarBackgroundColor);
            VelaDrawing::PaintRect(&box);
            VelaDrawing::RGBForeColor(kScrollBarBorderColor);
            VelaDrawing::PenNormal();
            VelaDrawing::FrameRect(&frame);
        });
        ASSERT_FALSE(expected.empty());
        auto const found = std::search(drawn.begin(), drawn.end(), expected.begin(), expected.end());
        EXPECT_NE(found, drawn.end()) << testing::PrintToString(drawn) << testing::PrintToString(expected);
    }
};

} // namespace

// Frame

TEST_F(ScrollBarDrawing, ErasesNothingBeforeItPaints) {
    ScrollBarPane *const bar = Upright();
    Show();
    bar->Inval();
    desktop.TakeDrawing();
    UpdateGlog(glog);
    EXPECT_EQ(Only("EraseRect", desktop.TakeDrawing()), Lines());
}

TEST_F(ScrollBarDrawing, PaintsItsBackgroundAndFramesItsBox) {
    ExpectBackground(*Upright(), UprightBox(130));
}

TEST_F(ScrollBarDrawing, ABorderOutsideTheEndIsOnePixelBeyondIt) {
    ExpectBackground(*Upright(130, ScrollBarPane::kEndBorderOutside), {10, 20, 141, 36});
}

TEST_F(ScrollBarDrawing, ALevelBarsBorderOutsideTheEndIsToTheRight) {
    ExpectBackground(*Level(130, ScrollBarPane::kEndBorderOutside), {10, 50, 26, 181});
}

TEST_F(ScrollBarDrawing, ABorderOutsideTheStartIsOnePixelBeforeIt) {
    ExpectBackground(*Upright(130, ScrollBarPane::kStartBorderOutside), {9, 20, 140, 36});
}

TEST_F(ScrollBarDrawing, ALevelBarsBorderOutsideTheStartIsToTheLeft) {
    ExpectBackground(*Level(130, ScrollBarPane::kStartBorderOutside), {10, 49, 26, 180});
}

// Arrows

TEST_F(ScrollBarDrawing, ArrowsShowTheirIdlePressedAndDisabledIcons) {
    struct {
        bool horizontal;
        Part part;
        short icon;
    } const arrows[] = {
        {false, kUpArrow, 26}, {false, kDownArrow, 29}, {true, kUpArrow, 32}, {true, kDownArrow, 35}};
    for (auto const &arrow : arrows) {
        ScrollBarPane &bar = arrow.horizontal ? *Level() : *Upright();
        Rect const place = BoxOfPart(bar, arrow.part);
        auto const looks = [&](int icon) {
            return DrawingOfPart(bar, arrow.part) == Traced(*bar.Get(arrow.part), [&] {
                       Draw1Icon(kFamily, static_cast<short>(icon), place.left, place.top);
                   });
        };
        EXPECT_TRUE(looks(arrow.icon + 2)) << arrow.icon;
        Live(&bar);
        EXPECT_TRUE(looks(arrow.icon)) << arrow.icon;
    }
}

TEST_F(ScrollBarDrawing, AnArrowThatIsHeldDownShowsItsPressedIcon) {
    ScrollBarPane &bar = *Live(Upright());
    Show();
    desktop.Play("press 28 18\nwait 0.05\nrelease");
    Lines const icons = Only("Draw1Icon", desktop.TakeDrawing());
    Lines const pressed = Traced(*bar.Get(kUpArrow), [] { Draw1Icon(kFamily, 27, 1, 1); });
    EXPECT_EQ(std::count(icons.begin(), icons.end(), pressed[0]), 1);
}

// Trough and thumb

TEST_F(ScrollBarDrawing, ADeadUprightBarShowsADeadTroughOnly) {
    ExpectThumbDrawing(*Upright(), [] { Tile({15, 1, 115, 15}, 43, 14, 16); });
}

TEST_F(ScrollBarDrawing, ADeadLevelBarShowsADeadTroughOnly) {
    ExpectThumbDrawing(*Level(), [] { Tile({1, 15, 15, 115}, 41, 16, 14); });
}

TEST_F(ScrollBarDrawing, ALiveUprightBarShowsTroughCapsAndAThumbOfThreePieces) {
    client.ratio = 0.4;
    ExpectThumbDrawing(*Live(Upright(), 500), [] {
        Tile({15, 1, 115, 15}, 42, 14, 16);
        Draw1Icon(kFamily, 16, 1, 13);
        Draw1Icon(kFamily, 17, 1, 109);
        Draw1Icon(kFamily, 68, 0, 45);
        Draw1Icon(kFamily, 64, 0, 78);
        Tile({52, 0, 78, 16}, 66, 16, 9);
    });
}

TEST_F(ScrollBarDrawing, ALiveLevelBarDiffersByAPixelHereAndThere) {
    client.ratio = 0.4;
    ExpectThumbDrawing(*Live(Level(), 500), [] {
        Tile({1, 15, 15, 115}, 40, 16, 14);
        Draw1Icon(kFamily, 19, 12, 1);
        Draw1Icon(kFamily, 18, 108, 1);
        Draw1Icon(kFamily, 69, 45, 0);
        Draw1Icon(kFamily, 65, 77, 0);
        Tile({0, 52, 16, 78}, 67, 10, 16);
    });
}

TEST_F(ScrollBarDrawing, AThumbOfSixteenPixelsHasThreePieces) {
    ExpectThumbDrawing(*Live(Upright()), [] {
        Tile({15, 1, 115, 15}, 42, 14, 16);
        Draw1Icon(kFamily, 16, 1, 13);
        Draw1Icon(kFamily, 17, 1, 109);
        Draw1Icon(kFamily, 68, 0, 15);
        Draw1Icon(kFamily, 64, 0, 24);
        Tile({22, 0, 24, 16}, 66, 16, 9);
    });
}

namespace {

// A bar whose thumb may be shorter than others'.
class ShortThumbBar : public ScrollBarPane {
public:
    ShortThumbBar(glogRec *owner, short flags, Rect bounds) {
        sbarResRec record = {sbarResRec::kType, flags, bounds, 0, 0};
        InitScrollBarPane(owner, &record, 0);
    }
    int GetMinThumbLength() const override { return 15; }
};

} // namespace

TEST_F(ScrollBarDrawing, AThumbUnderSixteenPixelsIsOneIcon) {
    ScrollBarPane &upright = *Live(new ShortThumbBar(glog, 0, UprightBox(130)));
    ExpectThumbDrawing(upright, [] {
        Tile({15, 1, 115, 15}, 42, 14, 16);
        Draw1Icon(kFamily, 16, 1, 13);
        Draw1Icon(kFamily, 17, 1, 109);
        Draw1Icon(kFamily, 38, 0, 15);
    });
    ScrollBarPane &level = *Live(new ShortThumbBar(glog, ScrollBarPane::kHorizontalBar, LevelBox(130)));
    ExpectThumbDrawing(level, [] {
        Tile({1, 15, 15, 115}, 40, 16, 14);
        Draw1Icon(kFamily, 19, 12, 1);
        Draw1Icon(kFamily, 18, 108, 1);
        Draw1Icon(kFamily, 39, 15, 0);
    });
}

TEST_F(ScrollBarDrawing, APartialRedrawLeavesOutAStartCapThatEndsBeforeIt) {
    ScrollBarPane &upright = *Live(Upright(), 500), &level = *Live(Level(), 500);
    EXPECT_TRUE(Draws(upright, 16, 21, 60)); // the trough begins at 15
    EXPECT_FALSE(Draws(upright, 16, 22, 60));
    EXPECT_TRUE(Draws(level, 19, 20, 60));
    EXPECT_FALSE(Draws(level, 19, 21, 60));
}

TEST_F(ScrollBarDrawing, APartialRedrawLeavesOutAnEndCapThatBeginsBehindIt) {
    ScrollBarPane &upright = *Live(Upright(), 500), &level = *Live(Level(), 500);
    EXPECT_TRUE(Draws(upright, 17, 60, 109)); // the trough ends at 115
    EXPECT_FALSE(Draws(upright, 17, 60, 108));
    EXPECT_TRUE(Draws(level, 18, 60, 108));
    EXPECT_FALSE(Draws(level, 18, 60, 107));
}

TEST_F(ScrollBarDrawing, APartialRedrawDrawsTroughAndThumbAllTheSame) {
    ScrollBarPane &bar = *Live(Upright(), 500);
    for (short icon : {42, 64, 66, 68})
        EXPECT_TRUE(Draws(bar, icon, 100, 101)) << icon;
}

TEST_F(ScrollBarDrawing, InABroaderBarThumbAndCapsStayAtTheNearSide) {
    ScrollBarPane &bar = *Live(Upright(130, ScrollBarPane::kEndBorderOutside));
    ExpectThumbDrawing(bar, [] {
        Tile({15, 1, 116, 16}, 42, 14, 16);
        Draw1Icon(kFamily, 16, 1, 13);
        Draw1Icon(kFamily, 17, 1, 110);
        Draw1Icon(kFamily, 68, 0, 15);
        Draw1Icon(kFamily, 64, 0, 24);
        Tile({22, 0, 24, 16}, 66, 16, 9);
    });
}
