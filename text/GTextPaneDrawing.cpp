// How a text field is drawn.
#include "host/NamedColors.h"
#include "host/OSPort.h"
#include "host/VelaDrawing.h"
#include "text/GTextPane.h"
#include "text/WithTextColors.h"

namespace {

OS::RGBAColor Opaque(RGBColor const &color) {
    auto const component = [](unsigned short value) { return static_cast<double>(value / 65535.0f); };
    return {component(color.red), component(color.green), component(color.blue), 1.0};
}

} // namespace

// Colours

bool GTextPane::ColorsApply() const { return useSavedColors || (mode == kEditable && !notSelectable); }

void GTextPane::SetupColors() {
    if (drawingHelper) {
        drawingHelper->SetColors(mode);
    } else {
        bool const saved = useSavedColors && savedFore && savedBack;
        VelaDrawing::RGBForeColor(saved ? *savedFore : kTextWellTextColor);
        VelaDrawing::RGBBackColor(saved ? *savedBack : kTextWellBackgroundColor);
    }
    if (!textEdit)
        return;
    PassColorsOn();
    colorsApplied = true;
}

// The port's colours become the engine's.
void GTextPane::PassColorsOn() {
    RGBColor back, fore, selected;
    VelaDrawing::GetBackColor(&back);
    textEdit->SetBackgroundColor(back);
    VelaDrawing::GetForeColor(&fore);
    GetHiliteColor(&selected);
    textEdit->SetDefaultColors(Opaque(fore), Opaque(selectionColor ? *selectionColor : selected));
}

void GTextPane::SetColors(const RGBColor &fore, const RGBColor &back) {
    savedFore = &fore;
    savedBack = &back;
    useSavedColors = true;
}

// Black is the way to ask for the system's colour.
void GTextPane::SetCustomSelectionColor(RGBColor *color) {
    selectionColor = color && (color->red > 0 || color->green > 0 || color->blue > 0) ? color : nullptr;
}

void GTextPane::DrawBackgroundWhenNotSelected(bool on) {
    drawsBackground = on;
    if (textEdit)
        textEdit->DrawBackgroundWhenNotSelected(on);
}

// Drawing

void GTextPane::_Draw_(OSRgn *region, char) {
    if (!textEdit)
        return;
    WithTextColors const colors(*this);
    Rect box = GetDrawRectangle();
    if (!colorsApplied) {
        colorsApplied = true;
        PassColorsOn();
    }
    if (mode == kDrawnWithinRegion && region && !VelaDrawing::RectInRgn(&box, region))
        return;
    DrawTextWell(box);
    if (boxIt)
        VelaDrawing::InsetRect(&box, static_cast<short>(-frameOffset), static_cast<short>(-frameOffset));
    if (mode == kBlank)
        VelaDrawing::EraseRect(&box);
    else
        DrawEngine();
}

// A frame round a field without "BoxIt" lies where its text does, whose ground must not cover it.
void GTextPane::DrawEngine() {
    short const kFrame = 1; // pixels
    if (boxIt || !textWell || drawingHelper) {
        textEdit->Draw(OSPort::Current());
        return;
    }
    Rect within = GetDrawRectangle();
    VelaDrawing::InsetRect(&within, kFrame, kFrame);
    WithClipRect const clip(within);
    textEdit->Draw(OSPort::Current());
}

void GTextPane::DrawTextWell(Rect &box) {
    SaveColors const colors;
    if (drawingHelper)
        drawingHelper->DrawTextWell(box, mode);
    else if (textWell || (boxIt && mode == kEditable))
        DoFrameTextWell(box);
}

void GTextPane::DoFrameTextWell(Rect &box) { FrameTextWell(box); }

void GTextPane::UpdateTextEdit() {
    if (!GetVisibility() || !textEdit)
        return;
    SavePortAndClip const port;
    WithTextColors const colors(*this);
    Prepare();
    Rect const box = TextBox();
    VelaDrawing::ClipRect(&box);
    DrawEngine();
}
