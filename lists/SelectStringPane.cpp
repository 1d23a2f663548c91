#include "lists/SelectStringPane.h"
#include "buttons/NaturalSize.h"
#include "host/EventRecordAdapter.h"
#include "host/NamedColors.h"
#include "host/PortSavers.h"
#include "host/TextLayout.h"
#include "host/VelaDrawing.h"
#include "scrolling/Truncation.h"

namespace {

int const kFont = 2; // of the application's font table
int const kTop = 0, kOneLine = 0, kUpright = 0;

UString Blank() { return UString(" ", UString::kByteEncoding1); }

UString BetweenBlanks(UString const &text) {
    UString padded = Blank();
    padded += text;
    padded += Blank();
    return padded;
}

Point Moved(Point p, int dv, int dh) { return {Pixel16(p.v + dv), Pixel16(p.h + dh)}; }

} // namespace

SelectStringPane::SelectStringPane(glogRec *owner, short id, const UString &text_)
    : textOrigin()
    , font(*GetIndVelaFont(kFont))
    , text(BetweenBlanks(text_)) {
    if (SelectPaneInit(owner, id))
        SelectStringPane::CalcBox();
}

void SelectStringPane::SetText(const UString &newText) {
    Inval();
    Erase();
    text = BetweenBlanks(newText);
    CalcBox();
    Inval();
}

void SelectStringPane::GetText(UString &out) { out = text.substr(1, text.length() - 2); }

// Geometry

void SelectStringPane::CalcBox() {
    SaveTextState const state;
    SetFontData(&font);
    TarnQuickDrawText::FontInfo info;
    tarn::GetFontInfo(info);
    int const width = LooseStringWidth(text, 0.0f, 1.0f), height = info.ascent + info.descent;
    Rect box;
    GetBox(&box);
    if (!IsInLayout()) {
        box.right = Pixel16(box.left + width);
        box.bottom = Pixel16(box.top + height);
        SetBox(&box);
    }
    if (glog)
        SetNaturalSize(*this, width, height);
    textOrigin = {Pixel16(box.top + info.ascent), box.left};
}

void SelectStringPane::SetBox(Rect *newBox) {
    Rect box;
    GetBox(&box);
    int const dv = textOrigin.v - box.top, dh = textOrigin.h - box.left;
    SelectPane::SetBox(newBox);
    _SetEditBoxFromRect_(*newBox);
    textOrigin = Moved({newBox->top, newBox->left}, dv, dh);
}

void SelectStringPane::Offset(Point delta) {
    GlogPane::Offset(delta);
    textOrigin = Moved(textOrigin, delta.v, delta.h);
}

SelectStringPane *SelectStringPane::CastToSelectStringPane() { return this; }

// Clicks

int SelectStringPane::HandleClick(EventRecordAdapter *event) {
    Select(!ShiftEvent(event) || !IsSelected());
    return -1;
}

// Drawing

void SelectStringPane::_Draw_(OSRgn *, char hilite) {
    Rect box;
    GetBox(&box);
    Prepare();
    SaveTextState const state;
    SetFontData(&font);
    VelaDrawing::MoveTo(textOrigin.h, textOrigin.v);
    if (hilite)
        SetUserHiliteColorAsForeColor();
    else
        VelaDrawing::RGBForeColor(kWindowBackgroundColor);
    VelaDrawing::PaintRect(&box);
    VelaDrawing::RGBForeColor(kDialogActiveTextColor);
    DrawStringInRect(text, box, TextSettings::kAlignLeft, TextSettings::kTruncateNone, kTop, kOneLine,
                     kUpright, 0.0f, 1.0f, 1.0f, 0.0f);
}
