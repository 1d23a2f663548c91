#include "desktop/type/PlacedText.h"
#include "desktop/drawing/DrawingPort.h"
#include "desktop/drawing/PixelScope.h"
#include <algorithm>
#include <cairo.h>
#include <cmath>
#include <limits>

namespace {

constexpr int kCentered = 1;
// No font's ink reaches farther from its line than this many times its size.
constexpr int kMostReach = 2;

short Narrow(int place) {
    typedef std::numeric_limits<short> Limits;
    return static_cast<short>(std::clamp<int>(place, Limits::min(), Limits::max()));
}

Rect MakeRect(int top, int left, int bottom, int right) {
    return Rect{Narrow(top), Narrow(left), Narrow(bottom), Narrow(right)};
}

// Half of the room, rounded down when there is too little.
int HalfOf(int room) { return room >= 0 ? room / 2 : -((1 - room) / 2); }

// On device pixels, so that a cut text has a sharp edge at every scale.
void ClipTo(cairo_t *context, DrawingPort const &port, Rect const &local) {
    Rect const window = port.LocalToWindow(local);
    DeviceRect const box = port.Scale().ToDevice(window.left, window.top, window.right, window.bottom);
    cairo_matrix_t matrix;
    cairo_get_matrix(context, &matrix);
    cairo_identity_matrix(context);
    cairo_rectangle(context, box.left, box.top, box.Width(), box.Height());
    cairo_clip(context);
    cairo_set_matrix(context, &matrix);
}

// Text as it lies in local coordinates before anything is cut.
struct Lie {
    int left, width; // the box in which lines are aligned
    int baseline;    // of the first line
    TextSettings::Alignment alignment;
    float scale;
};

// False where Cairo has to draw.
bool DrawAsMasks(DrawingPort &port, ShapedText const &text, Lie const &lie, Rect const &bounds) {
    if (lie.scale != 1 || !port.Visible(bounds))
        return lie.scale == 1;
    PixelScope scope(port);
    if (!scope.CanDraw())
        return true;
    if (!scope.TakesGlyphs() || !text.HasMasks(port.Scale()))
        return false;
    text.DrawMasks(scope, port.Scale(), lie.left, lie.baseline, lie.width, lie.alignment,
                   scope.ToDevice(bounds));
    return true;
}

void DrawWithin(ShapedText const &text, Lie const &lie, Rect const &bounds, Rect const *cut) {
    DrawingPort *port = DrawingPort::CurrentPort();
    if (!port || DrawAsMasks(*port, text, lie, bounds))
        return;
    CairoScope const scope(*port, bounds);
    cairo_t *context = scope.Context();
    if (!context)
        return;
    if (cut)
        ClipTo(context, *port, *cut);
    if (lie.scale == 1) {
        text.Draw(context, lie.left, lie.baseline, lie.width, lie.alignment);
        return;
    }
    cairo_translate(context, lie.left, 0);
    cairo_scale(context, double(lie.scale), 1);
    text.Draw(context, 0, lie.baseline, PlacedText::Unscaled(lie.width, lie.scale), lie.alignment);
}

// What the text covers: the lines' box, and the ink that reaches beyond it.
Rect BoundsOf(ShapedText const &text, int left, int width, int baseline, float scale) {
    int const reach = text.Overhang(), sideways = PlacedText::Scaled(reach, scale);
    int const top = baseline - text.Ascent();
    return MakeRect(top - reach, left - sideways, top + text.Height() + reach, left + width + sideways);
}

} // namespace

float PlacedText::CleanScale(float scale) {
    constexpr float kLargest = 64;
    return scale > 0 ? std::min(scale, kLargest) : 1;
}

int PlacedText::Scaled(int width, float scale) {
    return scale == 1 ? width : static_cast<int>(std::ceil(double(width) * double(scale)));
}

int PlacedText::Unscaled(int width, float scale) {
    constexpr double kMost = 1 << 20;
    return scale == 1
               ? width
               : static_cast<int>(std::clamp(std::floor(double(width) / double(scale)), -kMost, kMost));
}

void PlacedText::Draw(ShapedText const &text, Rect const &r, Placement const &placement) {
    int const boxWidth = r.right - r.left, boxHeight = r.bottom - r.top;
    if (boxWidth <= 0)
        return;
    bool const tooHigh = placement.wraps && text.Height() > boxHeight;
    int const down =
        placement.verticalAlignment == kCentered && !tooHigh ? HalfOf(boxHeight - text.Height()) : 0;
    int const baseline = r.top + down + text.Ascent();
    int const width = Scaled(text.Width(), placement.scale);
    int const start = ShapedText::LineStart(width, boxWidth, placement.alignment,
                                            text.IsRightToLeft() && text.LineCount() == 1);
    // Lines of different widths start at different places; together they lie within the whole box.
    bool const oneLine = text.LineCount() == 1;
    Rect bounds = BoundsOf(text, oneLine ? r.left + start : r.left,
                           oneLine ? width : std::max(width, boxWidth), baseline, placement.scale);
    bool const tooWide = width > boxWidth;
    if (tooWide) {
        bounds.left = r.left;
        bounds.right = r.right;
    }
    if (tooHigh)
        bounds.bottom = std::min(bounds.bottom, r.bottom);
    Lie const lie = {r.left, boxWidth, baseline, placement.alignment, placement.scale};
    DrawWithin(text, lie, bounds, tooWide || tooHigh ? &bounds : nullptr);
}

void PlacedText::DrawLine(ShapedText const &text, Point baseline, int maxWidth) {
    Rect bounds = BoundsOf(text, baseline.h, text.Width(), baseline.v, 1);
    bool const tooWide = maxWidth >= 0 && text.Width() > maxWidth;
    if (tooWide) {
        bounds.left = baseline.h;
        bounds.right = Narrow(baseline.h + maxWidth);
    }
    Lie const lie = {baseline.h, text.Width(), baseline.v, TextSettings::kAlignLeft, 1};
    DrawWithin(text, lie, bounds, tooWide ? &bounds : nullptr);
}

bool PlacedText::LineCouldShow(FontSpec const &font, Point baseline) {
    DrawingPort const *port = DrawingPort::CurrentPort();
    int const reach = kMostReach * font.size;
    return port && port->Visible(MakeRect(baseline.v - reach, baseline.h - reach, baseline.v + reach,
                                          std::numeric_limits<short>::max()));
}

bool PlacedText::CouldShow(FontSpec const &font, Rect const &r) {
    DrawingPort const *port = DrawingPort::CurrentPort();
    int const reach = kMostReach * font.size;
    return port && port->Visible(MakeRect(r.top - reach, r.left - reach, r.bottom + reach, r.right + reach));
}
