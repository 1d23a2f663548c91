#include "desktop/type/ShapedText.h"
#include "desktop/type/FontLibrary.h"
#include "desktop/type/TextSanitizer.h"
#include <algorithm>
#include <cmath>
#include <pango/pangocairo.h>

namespace {

constexpr float kMostSpacing = 256;
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

ShapedText::ShapedText(std::u16string_view text, TextShape const &shape) {
    Shape(text, shape);
    FontMetrics const &metrics = FontLibrary::Instance().Metrics(shape.font);
    ascent = metrics.ascent;
    lineHeight = metrics.LineHeight();
    MeasureLines();
    generation = FontLibrary::Instance().Generation();
}

ShapedText::~ShapedText() { Replace(nullptr); }

bool ShapedText::IsCurrent() const { return generation == FontLibrary::Instance().Generation(); }

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
    int below = 0; // ink beneath the last line's box
    for (int i = 0; i < count; ++i) {
        PangoLayoutLine *glyphs = pango_layout_get_line_readonly(layout, i);
        PangoRectangle ink, logical;
        pango_layout_line_get_pixel_extents(glyphs, &ink, &logical);
        int const lineWidth = std::max(ClampWidth(logical.width), 0);
        lines.push_back(
            {glyphs, lineWidth, pango_layout_line_get_resolved_direction(glyphs) == PANGO_DIRECTION_RTL});
        width = std::max(width, lineWidth);
        if (ink.width <= 0)
            continue;
        int const left = ClampWidth(ink.x), right = ClampWidth(ink.x + ink.width);
        bool const first = inkRight <= inkLeft;
        inkLeft = first ? left : std::min(inkLeft, left);
        inkRight = first ? right : std::max(inkRight, right);
        below = std::max({below, -left, right - lineWidth, -ClampWidth(ink.y) - ascent,
                          ClampWidth(ink.y + ink.height) - (lineHeight - ascent)});
    }
    // Finer pixels may round outward once more.
    overhang = below + 1;
    rightToLeft = !lines.empty() && lines.front().rightToLeft;
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
    for (Line const &line : lines) {
        cairo_move_to(context, h + LineStart(line.width, boxWidth, alignment, line.rightToLeft), baseline);
        pango_cairo_show_layout_line(context, line.glyphs);
        baseline += lineHeight;
    }
    cairo_new_path(context);
}
