#include "host/Icons.h"
#include "Canvas.h"
#include "SampleAtlas.h"
#include "desktop/drawing/IconStore.h"
#include "desktop/resources/Resources.h"
#include "tests/resources/TemporaryDirectory.h"

namespace {

short const kFamily = 100;
short const kSolid = 0, kHalf = 1, kEmpty = 2, kWide = 5, kLeftCap = 10, kMiddle = 11, kRightCap = 12;
std::uint32_t const kBlue = 0xFF0000FFu, kGreen = 0xFF00FF00u, kMark = 0xFFFF00FFu, kOther = 0xFF123456u;

SampleAtlas IconsAt(double factor, std::uint32_t solid = kBlue) {
    SampleAtlas atlas(factor);
    atlas.AddFamily(0, 16, 16);
    atlas.AddIcon(0, 16, 16, kMark);
    atlas.AddFamily(kFamily, 5, 5);
    atlas.AddIcon(kSolid, 5, 5, solid);
    atlas.AddIcon(kHalf, 5, 5, 0x80000000u);
    atlas.AddIcon(kEmpty, 5, 5, 0);
    atlas.AddIcon(kWide, 8, 3, kGreen);
    atlas.AddIcon(kLeftCap, 3, 6, kBlue);
    atlas.AddIcon(kMiddle, 4, 6, kGreen);
    atlas.AddIcon(kRightCap, 3, 6, kOther);
    return atlas;
}

// An artwork directory with the atlases of the given scales.
class Artwork : public testing::Test {
protected:
    Artwork() {
        directory.Write("themes/light.xml", "<theme name=\"light\"/>");
        directory.Write("themes/dark.xml", "<theme name=\"dark\"/>");
    }
    ~Artwork() override {
        TemporaryDirectory none;
        none.Write("themes/light.xml", "<theme name=\"light\"/>");
        Resources::Instance().Open(none.Path());
        Resources::Instance().SetTheme("light");
    }
    void Open(std::vector<double> const &scales) {
        for (double factor : scales)
            Write(IconsAt(factor), "light");
        Resources::Instance().Open(directory.Path());
        Resources::Instance().SetTheme("light");
    }
    void Write(SampleAtlas const &atlas, std::string const &theme) {
        directory.Write(atlas.Name(theme), atlas.Bytes());
    }

    TemporaryDirectory directory;
};

// Where the box of the icon's pixels lies, its corners included; empty for none.
DeviceRect BoxOf(Canvas const &canvas, std::uint32_t background) {
    DeviceRect box = {canvas.surface.Width(), canvas.surface.Height(), 0, 0};
    for (int y = 0; y < canvas.surface.Height(); ++y)
        for (int x = 0; x < canvas.surface.Width(); ++x)
            if (canvas.At(x, y) != background)
                box = box.United({x, y, x + 1, y + 1});
    return box;
}

bool operator==(DeviceRect const &a, DeviceRect const &b) {
    return a.left == b.left && a.top == b.top && a.right == b.right && a.bottom == b.bottom;
}

std::uint32_t const kGround = 0xFFCCCCCCu;

} // namespace

TEST_F(Artwork, AnOpaqueIconIsCopiedToItsPlace) {
    Open({1});
    Canvas canvas(12, 10);
    canvas.Wipe(kGround);
    Draw1Icon(kFamily, kSolid, 3, 2);
    EXPECT_TRUE(BoxOf(canvas, kGround) == (DeviceRect{3, 2, 8, 7}));
    EXPECT_EQ(canvas.At(3, 2), Canvas::kWhite);
    EXPECT_EQ(canvas.At(7, 6), Canvas::kBlack);
    EXPECT_EQ(canvas.Count(kBlue), 23);
}

TEST_F(Artwork, ATransparentIconMixesWithWhatIsBeneathAndAnEmptyOneDrawsNothing) {
    Open({1});
    Canvas canvas(12, 10);
    Draw1Icon(kFamily, kHalf, 0, 0);
    EXPECT_NEAR(canvas.At(2, 2) & 0xFF, 127, 1);
    EXPECT_EQ(canvas.At(2, 2) >> 24, 0xFFu);
    canvas.Wipe(Canvas::kWhite);
    Draw1Icon(kFamily, kEmpty, 0, 0);
    EXPECT_EQ(canvas.Count(Canvas::kWhite), 120);
}

TEST_F(Artwork, AtEveryScaleBothEdgesAreRoundedAndNothingIsScaled) {
    std::vector<double> const scales = {1, 1.25, 1.5, 2, 3};
    Open(scales);
    for (double factor : scales) {
        for (int place = 0; place < 25; ++place) {
            short const h = static_cast<short>(place % 5), v = static_cast<short>(place / 5);
            Canvas canvas(20, 20, factor);
            canvas.Wipe(kGround);
            Draw1Icon(kFamily, kSolid, h, v);
            DeviceRect const expected = canvas.scale.ToDevice(h, v, h + 5, v + 5);
            EXPECT_TRUE(BoxOf(canvas, kGround) == expected) << factor << " at " << h << ", " << v;
            EXPECT_EQ(canvas.At(expected.left, expected.top), Canvas::kWhite)
                << factor << " at " << h << ", " << v;
            EXPECT_EQ(canvas.Count(kBlue), expected.Width() * expected.Height() - 2)
                << factor << " at " << h << ", " << v;
        }
    }
}

TEST_F(Artwork, AScaleWithoutAtlasUsesTheNextLargerOne) {
    Open({1, 2});
    Canvas canvas(20, 20, 1.5);
    canvas.Wipe(kGround);
    Draw1Icon(kFamily, kSolid, 2, 2);
    EXPECT_TRUE(BoxOf(canvas, kGround) == canvas.scale.ToDevice(2, 2, 7, 7));
    EXPECT_GE(canvas.Count(kBlue), 8 * 8 - 8);
    EXPECT_EQ(IconStore::Instance().Error(), "");
    Canvas larger(20, 20, 4);
    larger.Wipe(kGround);
    Draw1Icon(kFamily, kSolid, 2, 2);
    EXPECT_TRUE(BoxOf(larger, kGround) == (DeviceRect{8, 8, 28, 28}));
}

TEST_F(Artwork, AnIconIsStretchedToARectangleOfAnotherSize) {
    Open({1});
    Canvas canvas(20, 20);
    canvas.Wipe(kGround);
    Draw1Icon(kFamily, kSolid, Rect{1, 2, 11, 12});
    EXPECT_TRUE(BoxOf(canvas, kGround) == (DeviceRect{2, 1, 12, 11}));
    EXPECT_EQ(canvas.Count(Canvas::kWhite), 4); // the corner pixel, twice as large
    EXPECT_EQ(canvas.Count(kBlue), 92);
    canvas.Wipe(kGround);
    Draw1Icon(kFamily, kSolid, Rect{1, 2, 6, 7});
    EXPECT_EQ(canvas.Count(kBlue), 23);
    canvas.Wipe(kGround);
    Draw1Icon(kFamily, kSolid, Rect{7, 7, 7, 12});
    EXPECT_EQ(canvas.Count(kGround), 400);
}

TEST_F(Artwork, IconsAreCutToTheClip) {
    Open({1});
    Canvas canvas(10, 10);
    canvas.Wipe(kGround);
    canvas.port.SetClip(RegionOf({{0, 0, 3, 10}, {4, 0, 5, 2}}));
    Draw1Icon(kFamily, kSolid, 0, 0);
    EXPECT_EQ(canvas.Count(kGround), 100 - 15 - 2);
    Draw1Icon(kFamily, kSolid, -3, -3);
    EXPECT_EQ(canvas.At(1, 1), Canvas::kBlack);
    Draw1Icon(kFamily, kSolid, 32767, -32768);
}

TEST_F(Artwork, TheMarkStandsForMissingIconsInTheFamilysSize) {
    Open({1});
    Canvas canvas(30, 30);
    canvas.Wipe(kGround);
    Draw1Icon(kFamily, 99, 4, 4);
    EXPECT_TRUE(BoxOf(canvas, kGround) == (DeviceRect{4, 4, 9, 9}));
    canvas.Wipe(kGround);
    Draw1Icon(4711, 0, 4, 4);
    EXPECT_TRUE(BoxOf(canvas, kGround) == (DeviceRect{4, 4, 20, 20}));
    EXPECT_EQ(canvas.Count(kMark), 254);
}

TEST_F(Artwork, WithoutArtworkTheMarkIsDrawnAllTheSame) {
    Open({});
    Canvas canvas(30, 30);
    Draw1Icon(kFamily, kSolid, 4, 4);
    EXPECT_TRUE(BoxOf(canvas, Canvas::kWhite) == (DeviceRect{4, 4, 20, 20}));
    EXPECT_GT(canvas.Count(Canvas::kWhite), 900 - 256); // it is a frame, not a block
    EXPECT_EQ(GetIconBounds(kFamily), (Rect{0, 0, 16, 16}));
    EXPECT_EQ(Region::Area(GetIconRegion(kFamily, kSolid)), 256);
}

TEST_F(Artwork, ABrokenAtlasIsReportedAndLeavesTheMark) {
    Open({1});
    directory.Write("atlas-light-100.glogatlas", "broken");
    Resources::Instance().Open(directory.Path());
    Canvas canvas(30, 30);
    Draw1Icon(kFamily, kSolid, 4, 4);
    EXPECT_LT(canvas.Count(Canvas::kWhite), 900);
    EXPECT_NE(IconStore::Instance().Error().find("atlas-light-100.glogatlas: too short"), std::string::npos);
}

TEST_F(Artwork, BoundsAreTheFamilysSizeAtTheOrigin) {
    Open({2});
    EXPECT_EQ(GetIconBounds(kFamily), (Rect{0, 0, 5, 5}));
    EXPECT_EQ(GetIconBounds(4711), (Rect{0, 0, 16, 16}));
}

TEST_F(Artwork, TheRegionHoldsThePixelsThatAreAtLeastHalfCovered) {
    Open({1, 2});
    EXPECT_TRUE(Region::Equal(GetIconRegion(kFamily, kWide), OSRgn(Rect{0, 0, 3, 8})));
    EXPECT_EQ(Region::Area(GetIconRegion(kFamily, kHalf)), 25);
    EXPECT_TRUE(Region::IsEmpty(GetIconRegion(kFamily, kEmpty)));
    OSRgn const &kept = GetIconRegion(kFamily, kWide);
    GetIconRegion(kFamily, kSolid);
    EXPECT_EQ(&kept, &GetIconRegion(kFamily, kWide));
}

TEST_F(Artwork, TheThemeChoosesTheAtlas) {
    Write(IconsAt(1, kOther), "dark");
    Open({1});
    Canvas canvas(10, 10);
    Draw1Icon(kFamily, kSolid, 0, 0);
    EXPECT_EQ(canvas.At(2, 2), kBlue);
    Resources::Instance().SetTheme("dark");
    Draw1Icon(kFamily, kSolid, 0, 0);
    EXPECT_EQ(canvas.At(2, 2), kOther);
}

TEST_F(Artwork, AnApplicationsAtlasGoesBeforeAndNeedHoldOnlyWhatDiffers) {
    Open({1, 2});
    TemporaryDirectory own;
    SampleAtlas atlas(2);
    atlas.AddFamily(kFamily, 5, 5);
    atlas.AddIcon(kSolid, 5, 5, kOther);
    own.Write(atlas.Name(), atlas.Bytes());
    Resources::Instance().AddDirectory(own.Path());
    for (double factor : {1.0, 2.0}) {
        Canvas canvas(10, 10, factor);
        Draw1Icon(kFamily, kSolid, 0, 0);
        EXPECT_EQ(canvas.At(2, 2), kOther);
        Draw1Icon(kFamily, kWide, 0, 0);
        EXPECT_EQ(canvas.At(2, 2), kGreen);
    }
}

TEST_F(Artwork, TilesFillFromTheTopLeftAndAreCutAtTheOtherEdges) {
    Open({1});
    Canvas canvas(20, 14);
    canvas.Wipe(kGround);
    Rect const r = {1, 2, 13, 14};
    TileIcon(&r, kFamily, kSolid, 5, 5);
    EXPECT_TRUE(BoxOf(canvas, kGround) == (DeviceRect{2, 1, 14, 13}));
    for (int h : {2, 7, 12})
        for (int v : {1, 6, 11})
            EXPECT_EQ(canvas.At(h, v), Canvas::kWhite);
    EXPECT_EQ(canvas.Count(Canvas::kWhite), 9);
    EXPECT_EQ(canvas.Count(Canvas::kBlack), 4); // the last column and row are cut before their black corners
}

TEST_F(Artwork, TilesAreTheSameAsSingleIconsAtEveryScale) {
    Open({1, 1.25, 1.5, 2});
    for (double factor : {1.0, 1.25, 1.5, 1.75, 2.0}) {
        Canvas tiled(24, 24, factor);
        tiled.Wipe(kGround);
        tiled.port.SetOrigin(1, 0);
        Rect const r = {1, 2, 18, 21};
        TileIcon(&r, kFamily, kSolid, 5, 5);
        std::vector<std::uint32_t> const pixels = tiled.Pixels();
        Canvas single(24, 24, factor);
        single.Wipe(kGround);
        single.port.SetOrigin(1, 0);
        WithClipRect clip(OS::RectBase<OS::RectTag>{r});
        for (short v = 1; v < 18; v = static_cast<short>(v + 5))
            for (short h = 2; h < 21; h = static_cast<short>(h + 5))
                Draw1Icon(kFamily, kSolid, h, v);
        EXPECT_EQ(single.Pixels(), pixels) << factor;
    }
}

TEST_F(Artwork, TilesWithoutSizeAreNotDrawn) {
    Open({1});
    Canvas canvas(10, 10);
    Rect const r = {0, 0, 10, 10};
    TileIcon(&r, kFamily, kSolid, 0, 5);
    TileIcon(&r, kFamily, kSolid, 5, -1);
    EXPECT_EQ(canvas.Count(Canvas::kWhite), 100);
}

TEST_F(Artwork, MissingTilesAreMarked) {
    Open({});
    Canvas canvas(40, 10);
    Rect const r = {0, 0, 10, 40};
    TileIcon(&r, kFamily, kSolid, 10, 10);
    for (int h : {0, 10, 20, 30})
        EXPECT_NE(canvas.At(h, 5), Canvas::kWhite);
}

TEST_F(Artwork, CapsStandAtBothEndsAndTheMiddleFillsTheRest) {
    Open({1});
    for (int width = 6; width < 30; ++width) {
        Canvas canvas(32, 8);
        canvas.Wipe(kGround);
        TileIconInRectWithEndCaps(OS::RectBase<OS::RectTag>(1, 1, width, 6), kFamily, kLeftCap);
        EXPECT_TRUE(BoxOf(canvas, kGround) == (DeviceRect{1, 1, 1 + width, 7}));
        EXPECT_EQ(canvas.Count(kBlue), 16);
        EXPECT_EQ(canvas.Count(kOther), 16);
        for (int h = 4; h < width - 2; ++h)
            EXPECT_EQ(canvas.At(h, 3), kGreen);
    }
}

TEST_F(Artwork, CapsShareARectangleThatIsTooNarrow) {
    Open({1});
    Canvas canvas(10, 8);
    canvas.Wipe(kGround);
    TileIconInRectWithEndCaps(OS::RectBase<OS::RectTag>(2, 0, 4, 6), kFamily, kLeftCap);
    EXPECT_TRUE(BoxOf(canvas, kGround) == (DeviceRect{2, 0, 6, 6}));
    EXPECT_EQ(canvas.At(3, 3), kBlue);
    EXPECT_EQ(canvas.At(4, 3), kOther);
    EXPECT_EQ(canvas.At(5, 5), Canvas::kBlack); // the right cap keeps its right end
    TileIconInRectWithEndCaps(OS::RectBase<OS::RectTag>(2, 0, 0, 6), kFamily, kLeftCap);
}

TEST_F(Artwork, PiecesGetTheRectanglesHeight) {
    Open({1});
    Canvas canvas(30, 20);
    canvas.Wipe(kGround);
    TileIconInRectWithEndCaps(OS::RectBase<OS::RectTag>(0, 0, 20, 12), kFamily, kLeftCap);
    EXPECT_TRUE(BoxOf(canvas, kGround) == (DeviceRect{0, 0, 20, 12}));
}

TEST_F(Artwork, DarkeningAppliesToIconsByTheirAlpha) {
    Open({1});
    Canvas canvas(12, 6);
    {
        WithDarkenDrawMode darken(50, nullptr, WithDarkenDrawMode::kMode1);
        Draw1Icon(kFamily, kSolid, 0, 0);
        Draw1Icon(kFamily, kHalf, 6, 0);
    }
    EXPECT_NEAR(canvas.At(2, 2) & 0xFF, 127, 1);
    EXPECT_NEAR(canvas.At(8, 2) & 0xFF, 191, 1);
}

TEST_F(Artwork, ALightGrayForegroundFadesIconsUntilTheNextColour) {
    Open({1});
    Canvas canvas(20, 6);
    GrayForeColor(0);
    Draw1Icon(kFamily, kSolid, 0, 0);
    EXPECT_EQ(canvas.At(2, 2), kBlue);
    GrayForeColor(50);
    Draw1Icon(kFamily, kSolid, 5, 0);
    EXPECT_NEAR(canvas.At(7, 2) >> 16 & 0xFF, 0.6 * 255, 1);
    EXPECT_EQ(canvas.At(7, 2) & 0xFF, 0xFFu);
    ClearColors();
    Draw1Icon(kFamily, kSolid, 10, 0);
    EXPECT_EQ(canvas.At(12, 2), kBlue);
}
