// Texts that need no layout look as if they had had one.
#include "desktop/drawing/Surface.h"
#include "desktop/type/FontLibrary.h"
#include "desktop/type/PlainShaper.h"
#include "desktop/type/ShapedText.h"
#include <algorithm>
#include <cairo.h>
#include <gtest/gtest.h>
#include <pango/pango.h>
#include <random>

namespace {

int const kWidth = 400, kHeight = 60, kLeft = 20, kBaseline = 40;

std::vector<std::uint32_t> Picture(ShapedText const &text) {
    Surface surface(kWidth, kHeight);
    std::fill(surface.Pixels(), surface.Row(kHeight), 0xFFFFFFFFu);
    cairo_t *const context = cairo_create(surface.CairoSurface());
    text.Draw(context, kLeft, kBaseline, text.Width(), TextSettings::kAlignLeft);
    cairo_destroy(context);
    cairo_surface_flush(surface.CairoSurface());
    return std::vector<std::uint32_t>(surface.Pixels(), surface.Row(kHeight));
}

// A text whose lines may break where it says is always laid out; these say nothing of breaks.
void ExpectAsLaidOut(std::u16string const &text, FontSpec const &font) {
    TextShape plain;
    plain.font = font;
    TextShape laidOut = plain;
    laidOut.wraps = true;
    ShapedText const ours(text, plain), wanted(text, laidOut);
    std::string const name(text.begin(), text.end());
    EXPECT_EQ(ours.LineCount(), wanted.LineCount()) << name;
    EXPECT_EQ(ours.Width(), wanted.Width()) << name;
    EXPECT_EQ(ours.InkWidth(), wanted.InkWidth()) << name;
    EXPECT_EQ(ours.Overhang(), wanted.Overhang()) << name;
    EXPECT_EQ(ours.Height(), wanted.Height()) << name;
    EXPECT_EQ(ours.IsRightToLeft(), wanted.IsRightToLeft()) << name;
    EXPECT_EQ(Picture(ours), Picture(wanted)) << name;
}

bool NeedsNoLayout(std::u16string const &text, FontSpec const &font) {
    PangoGlyphString *const glyphs = pango_glyph_string_new();
    bool const shaped = FontLibrary::Instance().Plain(font).Shape(text, glyphs) != nullptr;
    pango_glyph_string_free(glyphs);
    return shaped;
}

TEST(PlainText, LooksAsIfItHadBeenLaidOutInEveryFaceAndSize) {
    std::vector<int> const faces = {0, FontFace::kBold, FontFace::kItalic,
                                    FontFace::kBold | FontFace::kItalic, FontFace::kCondensed};
    std::vector<std::u16string> const texts = {u"Track 12: Vocals (dry) \"AV To\" 'fjord'",
                                               u"-96.0",
                                               u" ",
                                               u"10:30 + 4/4",
                                               u"office flight fluffy",
                                               u"  two  blanks  ",
                                               u"~!@#$%^&*()_+{}|:<>?"};
    for (int face : faces)
        for (int size : {9, 11, 12, 17, 30})
            for (std::u16string const &text : texts)
                ExpectAsLaidOut(text, FontSpec::Make(0, face, size));
}

TEST(PlainText, OfAnyPrintableCharactersLooksAsIfItHadBeenLaidOut) {
    std::mt19937 random(20);
    std::uniform_int_distribution<int> character(0x20, 0x7E), length(1, 24);
    for (int i = 0; i < 300; ++i) {
        std::u16string text;
        for (int left = length(random); left > 0; --left)
            text += static_cast<char16_t>(character(random));
        ExpectAsLaidOut(text, FontSpec::Make(0, i % 2 == 0 ? 0 : FontFace::kBold, 8 + i % 10));
    }
}

TEST(PlainText, NeedsNoLayout) {
    FontSpec const font = FontSpec::Make(0, 0, 12);
    EXPECT_TRUE(NeedsNoLayout(u"Volume", font));
    EXPECT_TRUE(NeedsNoLayout(u"-12.5", font));
}

TEST(PlainText, OfNothingOrWithOtherCharactersNeedsALayout) {
    FontSpec const font = FontSpec::Make(0, 0, 12);
    std::vector<std::u16string> const texts = {u"",     u"Lautst\u00E4rke", u"a\tb", u"a\u007F",
                                               u"a\nb", u"\u05D0"};
    for (std::u16string const &text : texts)
        EXPECT_FALSE(NeedsNoLayout(text, font));
}

} // namespace
