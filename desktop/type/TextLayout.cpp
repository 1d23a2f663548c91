#include "host/TextLayout.h"
#include "desktop/observe/DrawingTrace.h"
#include "desktop/resources/Utf.h"
#include "desktop/type/PlacedText.h"
#include "desktop/type/ShapedText.h"
#include "desktop/type/ShapedTextCache.h"
#include "desktop/type/TextTrace.h"
#include <algorithm>
#include <memory>

// Keeps the text in full, and as it was last fitted into a rectangle.
struct OS::TextLayout::Rep {
    struct Slot {
        TextShape shape;
        std::unique_ptr<ShapedText> shaped;
    };

    // What is dropped is set aside: a row of tabs, for one, goes to and fro between a few looks, and between
    // its names and short ones.
    void Drop(Slot &slot) const {
        if (slot.shaped)
            ShapedTextCache::SetAside(Utf::View(text), slot.shape, std::move(slot.shaped));
    }

    // The shaped text, made only when the text or the shape is another than last time.
    ShapedText const &Get(Slot &slot, TextShape const &shape) {
        if (!slot.shaped || !(slot.shape == shape) || !slot.shaped->IsCurrent()) {
            std::unique_ptr<ShapedText> next = ShapedTextCache::TakeAside(Utf::View(text), shape);
            Drop(slot);
            slot.shaped = std::move(next);
            slot.shape = shape;
        }
        return *slot.shaped;
    }

    void SetText(UString const &newText) {
        if (text == newText)
            return;
        Drop(whole);
        Drop(fitted);
        text = newText;
    }

    void Update(UString const &, TextShape, float scale);
    ShapedText const &Fit(UString const &, TextShape, Rect const &, float scale);

    UString text;
    Slot whole, fitted;
    int width = 0;
};

// The text without limits.
void OS::TextLayout::Rep::Update(UString const &newText, TextShape shape, float scale) {
    SetText(newText);
    shape.truncation = TextSettings::kTruncateNone;
    width = text.empty() ? 0 : PlacedText::Scaled(Get(whole, shape).Width(), scale);
}

// The text as it goes into the rectangle; not for an empty text.
ShapedText const &OS::TextLayout::Rep::Fit(UString const &newText, TextShape shape, Rect const &r,
                                           float scale) {
    TextShape limited = shape;
    limited.width = std::max(PlacedText::Unscaled(r.right - r.left, scale), 0);
    if (shape.wraps) {
        SetText(newText);
        if (shape.truncation != TextSettings::kTruncateNone)
            limited.height = std::max(r.bottom - r.top, 0);
        ShapedText const &broken = Get(fitted, limited);
        width = PlacedText::Scaled(broken.Width(), scale);
        return broken;
    }
    Update(newText, shape, scale);
    bool const fits = whole.shaped->Width() <= limited.width;
    return fits || shape.truncation == TextSettings::kTruncateNone ? *whole.shaped : Get(fitted, limited);
}

OS::TextLayout::TextLayout()
    : rep(nullptr) {}

OS::TextLayout::~TextLayout() { delete rep; }

double OS::TextLayout::GetWidth() const { return rep ? rep->width : 0; }

// Lets the drawing calls reach what a layout keeps.
namespace OS {
struct TextLayoutAccess {
    typedef TextLayout::Rep Rep;
    static Rep &Of(TextLayout &layout) {
        if (!layout.rep)
            layout.rep = new Rep;
        return *layout.rep;
    }
};
} // namespace OS

namespace {

// What the callers say in their many arguments.
struct LayoutCall {
    TextShape shape; // without limits
    PlacedText::Placement placement;
};

LayoutCall MakeCall(FontSpec const &font, TextSettings::Alignment alignment,
                    TextSettings::TruncateCode truncation, int verticalAlignment, int wrap, float spacing,
                    float scale) {
    LayoutCall call;
    call.shape.font = font;
    call.shape.spacing = TextShape::CleanSpacing(spacing);
    call.shape.wraps = wrap != 0;
    call.shape.truncation = truncation;
    call.placement = {alignment, verticalAlignment, call.shape.wraps, PlacedText::CleanScale(scale)};
    return call;
}

FontSpec SpecOf(OS::Font::FamilyID const &family, int face, int size) {
    return FontSpec::Make(family.GetOrderedFontID(), face, size);
}

FontSpec SpecOf(int font) {
    fontSaveRec const *record = GetIndVelaFont(font);
    return SpecOf(record->family, record->face, record->size);
}

void Trace(UString const &text, Rect const &r, LayoutCall const &call) {
    JsonLine line = TextTrace::Call("DrawTextLayoutInRect", text).Box("rect", r);
    TextTrace::AddAlignment(line, call.placement.alignment);
    TextTrace::AddTruncation(line, call.shape.truncation);
    line.Integer("verticalAlignment", call.placement.verticalAlignment)
        .Integer("wrap", call.placement.wraps ? 1 : 0);
    TextTrace::AddLook(line, call.shape.font);
    DrawingTrace::Write(line);
}

void Draw(OS::TextLayout &layout, UString const &text, Rect const &r, LayoutCall const &call) {
    if (DrawingTrace::On())
        Trace(text, r, call);
    OS::TextLayoutAccess::Rep &rep = OS::TextLayoutAccess::Of(layout);
    if (text.empty())
        rep.Update(text, call.shape, call.placement.scale);
    else
        PlacedText::Draw(rep.Fit(text, call.shape, r, call.placement.scale), r, call.placement);
}

void Update(OS::TextLayout &layout, UString const &text, LayoutCall const &call) {
    OS::TextLayoutAccess::Of(layout).Update(text, call.shape, call.placement.scale);
}

} // namespace

void DrawTextLayoutInRect(OS::TextLayout &layout, UString const &text, Rect const &r, int font,
                          TextSettings::Alignment alignment, TextSettings::TruncateCode truncation,
                          int verticalAlignment, int wrap, int, int, float spacing, float scale, float) {
    Draw(layout, text, r,
         MakeCall(SpecOf(font), alignment, truncation, verticalAlignment, wrap, spacing, scale));
}

void DrawTextLayoutInRect(OS::TextLayout &layout, UString const &text, Rect const &r,
                          OS::Font::FamilyID const &family, short style, short size,
                          TextSettings::Alignment alignment, TextSettings::TruncateCode truncation,
                          int verticalAlignment, int wrap, int, int, float spacing, float scale, float) {
    Draw(layout, text, r,
         MakeCall(SpecOf(family, style, size), alignment, truncation, verticalAlignment, wrap, spacing,
                  scale));
}

void UpdateTextLayout(OS::TextLayout &layout, UString const &text, int font,
                      TextSettings::Alignment alignment, TextSettings::TruncateCode truncation,
                      int verticalAlignment, int wrap, int, int, float spacing, float scale, float) {
    Update(layout, text,
           MakeCall(SpecOf(font), alignment, truncation, verticalAlignment, wrap, spacing, scale));
}

void UpdateTextLayout(OS::TextLayout &layout, UString const &text, OS::Font::FamilyID const &family,
                      short style, short size, TextSettings::Alignment alignment,
                      TextSettings::TruncateCode truncation, int verticalAlignment, int wrap, int, int,
                      float spacing, float scale, float) {
    Update(layout, text,
           MakeCall(SpecOf(family, style, size), alignment, truncation, verticalAlignment, wrap, spacing,
                    scale));
}
