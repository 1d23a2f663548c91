#include "desktop/drawing/GlyphMasks.h"
#include "desktop/drawing/PixelScope.h"
#include "desktop/drawing/PlacedGlyphs.h"
#include "desktop/drawing/Region.h"
#include "desktop/type/FontSpec.h"
#include "host/OSPath.h"
#include "host/TextLayout.h"
#include "host/VelaDrawing.h"
#include "tests/resources/Text.h"
#include "tests/type/Canvas.h"
#include <gtest/gtest.h>
#include <pango/pangocairo.h>
#include <vector>

namespace {

using TextSettings::kTruncateNone;

// A clip with a path, though it cuts nothing, has text drawn by Cairo itself.
void HaveCairoDraw() {
    OSPath path;
    path.CreateSubpath(-1000, -1000);
    path.AddLine(3000, -1000);
    path.AddLine(3000, 3000);
    path.AddLine(-1000, 3000);
    path.CloseSubpath();
    OSPort::Current().NarrowClipPath(path);
}

struct Sample {
    char const *text;
    short size;
    int face;
    double scale;
};

void PrintTo(Sample const &sample, std::ostream *out) {
    *out << '"' << sample.text << "\" of " << sample.size << ", face " << sample.face << " at "
         << sample.scale;
}

class GlyphMasksOf : public testing::TestWithParam<Sample> {
protected:
    static std::vector<std::uint32_t> Picture(bool byCairo) {
        Canvas canvas(240, 60, GetParam().scale);
        if (byCairo)
            HaveCairoDraw();
        VelaDrawing::TextSize(GetParam().size);
        VelaDrawing::TextFace(GetParam().face);
        SetForegroundColor(RGBColor{0x8000, 0x1000, 0xC000});
        DrawStringAtPoint(U(GetParam().text), Point{40, 7}, -1, kTruncateNone);
        return canvas.Copy();
    }
};

TEST_P(GlyphMasksOf, LookAsWhatCairoDraws) {
    std::vector<std::uint32_t> const picture = Picture(false);
    EXPECT_EQ(picture, Picture(true));
    EXPECT_NE(picture, Canvas(240, 60, GetParam().scale).Copy());
}

INSTANTIATE_TEST_SUITE_P(
    Texts, GlyphMasksOf,
    testing::Values(Sample{"Region 17, take 4", 12, 0, 1}, Sample{"Region 17, take 4", 12, 0, 1.25},
                    Sample{"Region 17, take 4", 12, 0, 1.5}, Sample{"Region 17, take 4", 12, 0, 2},
                    Sample{"Region 17, take 4", 12, 0, 3}, Sample{"AVAT fjord Wf'/\\'", 12, 0, 1},
                    Sample{"AVAT fjord Wf'/\\'", 28, 0, 1.5}, Sample{"fjfjfj", 30, FontFace::kItalic, 1},
                    Sample{"Bold AVA", 20, FontFace::kBold, 2},
                    Sample{"\xC3\x84pfel, \xC3\xA9t\xC3\xA9", 14, 0, 1}));

TEST(GlyphMasks, AreCutToTheClip) {
    auto const picture = [](bool byCairo) {
        Canvas canvas(100, 30);
        OSRgn clip(Rect{5, 5, 16, 30});
        Region::UniteRect(clip, Rect{10, 34, 30, 61});
        canvas.Port().SetClip(clip);
        if (byCairo)
            HaveCairoDraw();
        DrawStringAtPoint(U("Clipped here"), Point{18, 7}, -1, kTruncateNone);
        return canvas.Copy();
    };
    EXPECT_EQ(picture(false), picture(true));
}

TEST(GlyphMasks, AreCutToTheWidthThatATextMayHave) {
    Canvas canvas(100, 30);
    DrawStringAtPoint(U("WWWWWWWW"), Point{18, 7}, 20, kTruncateNone);
    EXPECT_EQ(canvas.Ink().right, 27);
}

TEST(GlyphMasks, LeaveNoClipBehind) {
    Canvas canvas(100, 30);
    canvas.Port().SetClip(OSRgn(Rect{5, 5, 16, 30}));
    DrawStringAtPoint(U("Clipped here"), Point{18, 7}, -1, kTruncateNone);
    canvas.Erase();
    canvas.Port().SetClip(OSRgn(Rect{0, 0, 30, 100}));
    DrawStringAtPoint(U("Clipped here"), Point{18, 7}, -1, kTruncateNone);
    EXPECT_GT(canvas.Ink().right, 60);
}

TEST(GlyphMasks, AreMadeOncePerFontAndScale) {
    PangoFontMap *const map = pango_cairo_font_map_get_default();
    PangoContext *const context = pango_font_map_create_context(map);
    PangoFontDescription *const description = pango_font_description_from_string("Roboto 12px");
    PangoFont *const font = pango_font_map_load_font(map, context, description);
    cairo_scaled_font_t *const scaled = pango_cairo_font_get_scaled_font(PANGO_CAIRO_FONT(font));
    GlyphMasks &masks = GlyphMasks::Of(scaled, DeviceScale(1));
    EXPECT_EQ(&GlyphMasks::Of(scaled, DeviceScale(1)), &masks);
    EXPECT_NE(&GlyphMasks::Of(scaled, DeviceScale(2)), &masks);
    std::uint32_t const glyph = 40;
    EXPECT_EQ(masks.Find(glyph), masks.Find(glyph));
    EXPECT_EQ(masks.Find(0x10000), nullptr); // no font file has as many
    pango_font_description_free(description);
    g_object_unref(font);
    g_object_unref(context);
}

} // namespace
