#include "desktop/resources/Utf.h"
#include "desktop/type/PlacedText.h"
#include "desktop/type/PortFont.h"
#include "desktop/type/ShapedTextCache.h"
#include "host/TextLayout.h"

namespace {

TextShape MeasuredShape(float spacing) {
    TextShape shape;
    shape.font = PortFont::Current();
    shape.spacing = TextShape::CleanSpacing(spacing);
    return shape;
}

} // namespace

int LooseStringWidth(UString const &text, float spacing, float scale) {
    if (text.empty())
        return 0;
    int const width = ShapedTextCache::Width(Utf::View(text), MeasuredShape(spacing));
    return PlacedText::Scaled(width, PlacedText::CleanScale(scale));
}

int TightStringWidth(UString const &text, float spacing, float scale) {
    if (text.empty())
        return 0;
    int const width = ShapedTextCache::Get(Utf::View(text), MeasuredShape(spacing)).InkWidth();
    return PlacedText::Scaled(width, PlacedText::CleanScale(scale));
}
