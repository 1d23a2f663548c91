#include "desktop/drawing/DrawingPort.h"
#include "desktop/observe/DrawingTrace.h"
#include "desktop/resources/Utf.h"
#include "desktop/type/PlacedText.h"
#include "desktop/type/PortFont.h"
#include "desktop/type/ShapedTextCache.h"
#include "desktop/type/TextTrace.h"
#include "host/TextLayout.h"
#include <algorithm>
#include <limits>

namespace {

constexpr int kNoLimit = -1;

TextShape ShapeInPortFont() {
    TextShape shape;
    shape.font = PortFont::Current();
    return shape;
}

} // namespace

void DrawString(UString const &text) {
    DrawingPort *port = DrawingPort::CurrentPort();
    if (!port)
        return;
    TextShape const shape = ShapeInPortFont();
    Point &pen = port->State().pen.location;
    if (DrawingTrace::On()) {
        JsonLine line = TextTrace::Call("DrawString", text).Spot("at", pen);
        TextTrace::AddLook(line, shape.font);
        DrawingTrace::Write(line);
    }
    if (text.empty())
        return;
    // Measured even where it cannot show: the pen moves on.
    ShapedText const &shaped = ShapedTextCache::Get(Utf::View(text), shape);
    PlacedText::DrawLine(shaped, pen, TextShape::kUnlimited);
    int const end = std::min<int>(pen.h + shaped.Width(), std::numeric_limits<short>::max());
    pen.h = static_cast<short>(end);
}

void DrawStringAtPoint(UString const &text, Point where, int maxWidth,
                       TextSettings::TruncateCode truncation) {
    TextShape shape = ShapeInPortFont();
    if (DrawingTrace::On()) {
        JsonLine line =
            TextTrace::Call("DrawStringAtPoint", text).Spot("at", where).Integer("maxWidth", maxWidth);
        TextTrace::AddTruncation(line, truncation);
        TextTrace::AddLook(line, shape.font);
        DrawingTrace::Write(line);
    }
    // A pane narrower than its margins comes to a width below nothing.
    shape.width = maxWidth == kNoLimit ? TextShape::kUnlimited : std::max(maxWidth, 0);
    shape.truncation = truncation;
    if (text.empty() || shape.width == 0 || !PlacedText::LineCouldShow(shape.font, where))
        return;
    PlacedText::DrawLine(ShapedTextCache::GetFitted(Utf::View(text), shape), where, shape.width);
}

void DrawStringInRect(UString const &text, Rect const &r, TextSettings::Alignment alignment,
                      TextSettings::TruncateCode truncation, int verticalAlignment, int wrap, int,
                      float spacing, float scale, float, float) {
    TextShape shape = ShapeInPortFont();
    if (DrawingTrace::On()) {
        JsonLine line = TextTrace::Call("DrawStringInRect", text).Box("rect", r);
        TextTrace::AddAlignment(line, alignment);
        TextTrace::AddTruncation(line, truncation);
        line.Integer("verticalAlignment", verticalAlignment).Integer("wrap", wrap);
        TextTrace::AddLook(line, shape.font);
        DrawingTrace::Write(line);
    }
    if (text.empty() || !PlacedText::CouldShow(shape.font, r))
        return;
    PlacedText::Placement const placement = {alignment, verticalAlignment, wrap != 0,
                                             PlacedText::CleanScale(scale)};
    shape.spacing = TextShape::CleanSpacing(spacing);
    shape.truncation = truncation;
    shape.width = std::max(PlacedText::Unscaled(r.right - r.left, placement.scale), 0);
    shape.wraps = placement.wraps;
    if (shape.wraps && truncation != TextSettings::kTruncateNone)
        shape.height = std::max(r.bottom - r.top, 0);
    std::u16string_view const units = Utf::View(text);
    PlacedText::Draw(shape.wraps ? ShapedTextCache::Get(units, shape)
                                 : ShapedTextCache::GetFitted(units, shape),
                     r, placement);
}
