#include "desktop/type/ShapedText.h"
#include "desktop/drawing/GlyphMasks.h"
#include "desktop/drawing/PixelScope.h"
#include "desktop/drawing/PlacedGlyphs.h"
#include "desktop/type/FontLibrary.h"
#include "desktop/type/PlainShaper.h"
#include "desktop/type/TextSanitizer.h"
#include <algorithm>
#include <cmath>
#include <pango/pangocairo.h>

namespace {

constexpr float kMostSpacing = 256;
constexpr std::size_t kLongestPlain = 1024; // characters
// Keeps sums of places within 32 bits whatever a text claims to be.
constexpr int kWidestLine = 1 << 20;

int ClampWidth(int pixels) { return std::clamp(pixels, -kWidestLine, kWidestLine); }

PangoEllipsizeMode EllipsizeMode(TextSettings::TruncateCode truncation) {
    switch (truncation) {
    case TextSettings::kTruncateEnd:
        return PANGO_ELLIPSIZE_END;
    case TextSettings::kTruncateMiddle:
        return PANGO_ELLIPSIZE_MIDDLE;
    default:
        return PANGO_ELLIPSIZE_NONE;
    }
}

PangoAttrList *NewAttributes(TextShape const &shape) {
    bool const underlined = (shape.font.face & FontFace::kUnderline) != 0;
    if (!underlined && shape.spacing == 0)
        return nullptr;
    PangoAttrList *attributes = pango_attr_list_new();
    if (underlined)
        pango_attr_list_insert(attributes, pango_attr_underline_new(PANGO_UNDERLINE_SINGLE));
    if (shape.spacing != 0)
        pango_attr_list_insert(attributes, pango_attr_letter_spacing_new(
                                               static_cast<int>(std::lround(shape.spacing * PANGO_SCALE))));
    return attributes;
}

PangoLayout *NewLayout(std::string const &utf8, TextShape const &shape) {
    PangoLayout *layout = FontLibrary::Instance().NewLayout(shape.font);
    if (PangoAttrList *attributes = NewAttributes(shape)) {
        pango_layout_set_attributes(layout, attributes);
        pango_attr_list_unref(attributes);
    }
    pango_layout_set_single_paragraph_mode(layout, !shape.wraps);
    if (shape.width >= 0 && (shape.wraps || shape.truncation != TextSettings::kTruncateNone)) {
        pango_layout_set_width(layout, std::min(shape.width, kWidestLine) * PANGO_SCALE);
        pango_layout_set_wrap(layout, PANGO_WRAP_WORD_CHAR);
        pango_layout_set_ellipsize(layout, EllipsizeMode(shape.truncation));
        if (shape.wraps && shape.height >= 0)
            pango_layout_set_height(layout, std::min(shape.height, kWidestLine) * PANGO_SCALE);
    }
    pango_layout_set_text(layout, utf8.data(), static_cast<int>(utf8.size()));
    return layout;
}

// The text of a line that was shortened, with an ellipsis for what is missing. Shaped for itself it looks as
// it should: the layout that did the shortening widens the ellipsis until the line fills its whole width.
std::string ShortenedText(PangoLayout *layout, std::string const &utf8) {
    constexpr char kEllipsis[] = "\xE2\x80\xA6";
    std::string text = utf8;
    for (GSList *node = pango_layout_get_line_readonly(layout, 0)->runs; node; node = node->next) {
        PangoItem const *item = static_cast<PangoLayoutRun *>(node->data)->item;
        if (item->analysis.flags & PANGO_ANALYSIS_FLAG_IS_ELLIPSIS)
            text.replace(static_cast<std::size_t>(item->offset), static_cast<std::size_t>(item->length),
                         kEllipsis);
    }
    return text;
}

} // namespace

float TextShape::CleanSpacing(float spacing) {
    return std::isnan(spacing) ? 0 : std::clamp(spacing, -kMostSpacing, kMostSpacing);
}

// What has been made is let go too where memory for the rest is wanting.
ShapedText::ShapedText(std::u16string_view text, TextShape const &shape)
    : ShapedText() {
    TakeMetrics(shape.font);
    if (!ShapePlain(text, shape)) {
        Shape(text, shape);
        TakeMetrics(shape.font); // of fonts that may only have been added now
        MeasureLines();
        // A line below the text is drawn by Pango.
        if (!(shape.font.face & FontFace::kUnderline))
            KeepGlyphs();
    }
    overhang += 1; // finer pixels may round outward once more
    rightToLeft = !lines.empty() && lines.front().rightToLeft;
    generation = FontLibrary::Instance().Generation();
}

ShapedText::ShapedText() {}

ShapedText::~ShapedText() {
    DropGlyphs();
    Replace(nullptr);
}

bool ShapedText::IsCurrent() const { return generation == FontLibrary::Instance().Generation(); }

void ShapedText::TakeMetrics(FontSpec const &font) {
    FontMetrics const &metrics = FontLibrary::Instance().Metrics(font);
    ascent = metrics.ascent;
    lineHeight = metrics.LineHeight();
}

// Ligatures stay with the layout, see KeepGlyphs; so does what has to be shortened or has no end.
bool ShapedText::ShapePlain(std::u16string_view text, TextShape const &shape) {
    bool const shortens = shape.truncation != TextSettings::kTruncateNone && shape.width >= 0;
    if (shape.wraps || shortens || shape.spacing != 0 || (shape.font.face & FontFace::kUnderline) ||
        text.size() > kLongestPlain)
        return false;
    static PangoGlyphString *const shaped = pango_glyph_string_new();
    PangoFont *const font = FontLibrary::Instance().Plain(shape.font).Shape(text, shaped);
    if (!font || shaped->num_glyphs != static_cast<int>(text.size()))
        return false;
    PangoRectangle ink, logical;
    pango_glyph_string_extents(shaped, font, &ink, &logical);
    int h = 0;
    glyphs.reserve(text.size());
    if (!AddGlyphs(font, *shaped, h, 0)) {
        DropGlyphs();
        return false;
    }
    MeasureLine(ink, logical, false);
    lines.back().runs = 1;
    return true;
}

void ShapedText::Shape(std::u16string_view text, TextShape const &shape) {
    std::string const utf8 = shape.wraps ? TextSanitizer::Lines(text) : TextSanitizer::OneLine(text);
    Replace(NewLayout(utf8, shape));
    if (pango_layout_get_unknown_glyphs_count(layout) != 0 && FontLibrary::Instance().AddSystemFonts())
        Replace(NewLayout(utf8, shape));
    if (shape.wraps || !pango_layout_is_ellipsized(layout))
        return;
    TextShape whole = shape;
    whole.width = TextShape::kUnlimited;
    Replace(NewLayout(ShortenedText(layout, utf8), whole));
}

void ShapedText::Replace(PangoLayout *other) {
    if (layout)
        g_object_unref(layout);
    layout = other;
}

void ShapedText::MeasureLines() {
    int const count = pango_layout_get_line_count(layout);
    lines.reserve(static_cast<std::size_t>(count));
    for (int i = 0; i < count; ++i) {
        PangoLayoutLine *const line = pango_layout_get_line_readonly(layout, i);
        PangoRectangle ink, logical;
        pango_layout_line_get_extents(line, &ink, &logical);
        MeasureLine(ink, logical, pango_layout_line_get_resolved_direction(line) == PANGO_DIRECTION_RTL);
    }
}

// Whole pixels that hold both, which are in units of Pango.
void ShapedText::MeasureLine(PangoRectangle ink, PangoRectangle logical, bool fromTheRight) {
    pango_extents_to_pixels(&ink, nullptr);
    pango_extents_to_pixels(&logical, nullptr);
    int const lineWidth = std::max(ClampWidth(logical.width), 0);
    lines.push_back({0, lineWidth, fromTheRight});
    width = std::max(width, lineWidth);
    if (ink.width <= 0)
        return;
    int const left = ClampWidth(ink.x), right = ClampWidth(ink.x + ink.width);
    bool const first = inkRight <= inkLeft;
    inkLeft = first ? left : std::min(inkLeft, left);
    inkRight = first ? right : std::max(inkRight, right);
    overhang = std::max({overhang, -left, right - lineWidth, -ClampWidth(ink.y) - ascent,
                         ClampWidth(ink.y + ink.height) - (lineHeight - ascent)});
}

// Takes what drawing needs out of the layout, and gives the layout up. Glyphs that no font has are boxes with
// their number, which Pango draws: then the layout stays. So it does where glyphs stand for several
// characters, as ligatures do: from the layout a printed page knows which, and its text can be read.
void ShapedText::KeepGlyphs() {
    for (std::size_t i = 0; i < lines.size(); ++i) {
        std::size_t const before = runs.size();
        if (!AddRunsOf(*pango_layout_get_line_readonly(layout, static_cast<int>(i)))) {
            DropGlyphs();
            return;
        }
        lines[i].runs = static_cast<std::uint32_t>(runs.size() - before);
    }
    glyphs.shrink_to_fit();
    Replace(nullptr);
}

bool ShapedText::AddRunsOf(PangoLayoutLine const &line) {
    int h = 0;
    for (GSList const *node = line.runs; node; node = node->next)
        if (!AddRun(*static_cast<PangoLayoutRun const *>(node->data), h))
            return false;
    return true;
}

bool ShapedText::AddRun(PangoGlyphItem const &run, int &h) {
    if (run.glyphs->num_glyphs != run.item->num_chars)
        return false;
    h += run.start_x_offset;
    if (!AddGlyphs(run.item->analysis.font, *run.glyphs, h, run.y_offset))
        return false;
    h += run.end_x_offset;
    return true;
}

bool ShapedText::AddGlyphs(PangoFont *of, PangoGlyphString const &string, int &h, int rise) {
    cairo_scaled_font_t *const font =
        pango_cairo_font_get_scaled_font(reinterpret_cast<PangoCairoFont *>(of));
    if (!font)
        return false;
    runs.push_back({cairo_scaled_font_reference(font), 0});
    for (int i = 0; i < string.num_glyphs; ++i) {
        PangoGlyphInfo const &glyph = string.glyphs[i];
        if (glyph.glyph & PANGO_GLYPH_UNKNOWN_FLAG)
            return false;
        if (glyph.glyph != PANGO_GLYPH_EMPTY) {
            glyphs.push_back({glyph.glyph, h + glyph.geometry.x_offset, glyph.geometry.y_offset - rise});
            ++runs.back().glyphs;
        }
        h += glyph.geometry.width;
    }
    return true;
}

void ShapedText::DropGlyphs() {
    for (Run const &run : runs)
        cairo_scaled_font_destroy(run.font);
    runs.clear();
    glyphs.clear();
}

int ShapedText::LineStart(int lineWidth, int boxWidth, TextSettings::Alignment alignment, bool rightToLeft) {
    int const room = boxWidth - lineWidth;
    switch (alignment) {
    case TextSettings::kAlignCenter:
        return room >= 0 ? room / 2 : -((1 - room) / 2);
    case TextSettings::kAlignRight:
        return room;
    case TextSettings::kAlignLeft:
        return 0;
    default:
        return rightToLeft ? room : 0;
    }
}

void ShapedText::Draw(cairo_t *context, int h, int baseline, int boxWidth,
                      TextSettings::Alignment alignment) const {
    Run const *run = runs.data();
    Glyph const *glyph = glyphs.data();
    for (std::size_t i = 0; i < lines.size(); ++i) {
        Line const &line = lines[i];
        int const start = h + LineStart(line.width, boxWidth, alignment, line.rightToLeft);
        if (layout) {
            cairo_move_to(context, start, baseline);
            pango_cairo_show_layout_line(context,
                                         pango_layout_get_line_readonly(layout, static_cast<int>(i)));
        } else {
            DrawRuns(context, run, glyph, line, start, baseline);
        }
        baseline += lineHeight;
    }
    cairo_new_path(context);
}

// Moves both pointers behind what the line has.
void ShapedText::DrawRuns(cairo_t *context, Run const *&run, Glyph const *&glyph, Line const &line, int h,
                          int baseline) const {
    constexpr std::size_t kMostOfLabel = 64;
    boost::container::small_vector<cairo_glyph_t, kMostOfLabel> placed;
    for (Run const *const end = run + line.runs; run != end; ++run) {
        placed.clear();
        for (Glyph const *const last = glyph + run->glyphs; glyph != last; ++glyph)
            placed.push_back({glyph->index, h + static_cast<double>(glyph->h) / PANGO_SCALE,
                              baseline + static_cast<double>(glyph->v) / PANGO_SCALE});
        cairo_set_scaled_font(context, run->font);
        cairo_show_glyphs(context, placed.data(), static_cast<int>(placed.size()));
    }
}

bool ShapedText::HasMasks(DeviceScale scale) const {
    if (layout)
        return false;
    Glyph const *glyph = glyphs.data();
    for (Run const &run : runs) {
        GlyphMasks &masks = GlyphMasks::Of(run.font, scale);
        for (Glyph const *const last = glyph + run.glyphs; glyph != last; ++glyph)
            if (!masks.Find(glyph->index))
                return false;
    }
    return true;
}

void ShapedText::DrawMasks(PixelScope &scope, DeviceScale scale, int h, int baseline, int boxWidth,
                           TextSettings::Alignment alignment, DeviceRect const &cut) const {
    Run const *run = runs.data();
    Glyph const *glyph = glyphs.data();
    for (Line const &line : lines) {
        int const start = h + LineStart(line.width, boxWidth, alignment, line.rightToLeft);
        for (Run const *const end = run + line.runs; run != end; ++run) {
            PlacedGlyphs placed(GlyphMasks::Of(run->font, scale));
            for (Glyph const *const last = glyph + run->glyphs; glyph != last; ++glyph)
                placed.Add(glyph->index, scope.GlyphH(start + static_cast<double>(glyph->h) / PANGO_SCALE),
                           scope.GlyphV(baseline + static_cast<double>(glyph->v) / PANGO_SCALE));
            scope.DrawGlyphs(placed, cut);
        }
        baseline += lineHeight;
    }
}
