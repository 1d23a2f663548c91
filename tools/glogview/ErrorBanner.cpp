#include "tools/glogview/ErrorBanner.h"
#include "host/PortSavers.h"
#include "host/VelaDrawing.h"
#include "host/glogRec.h"

namespace {

short const kHeight = 48; // pixels: three lines
short const kInsetH = 12, kInsetV = 4;
int const kFont = 1;
int const kCentred = 1;
int const kWrapped = 1;

// The same in every theme, so that nobody takes it for a part of the dialog.
RGBColor const kGround = {0x9B00, 0x1C00, 0x2300};
RGBColor const kInk = {0xFFFF, 0xFFFF, 0xFFFF};

} // namespace

ErrorBanner *ErrorBanner::NewErrorBanner(glogRec *owner, UString const &text) {
    ErrorBanner *const banner = new ErrorBanner;
    banner->GlogPaneInit(owner, 0);
    short const bottom = GetGlogHeight(owner);
    Rect box = {static_cast<short>(bottom - kHeight), 0, bottom, GetGlogWidth(owner)};
    banner->SetBox(&box);
    banner->SetText(text);
    return banner;
}

void ErrorBanner::SetText(UString const &newText) {
    text = newText;
    Inval();
}

void ErrorBanner::Resize(Point delta) {
    Rect box;
    GetBox(&box);
    VelaDrawing::OffsetRect(&box, 0, delta.v);
    box.right = static_cast<short>(box.right + delta.h);
    SetBox(&box);
}

void ErrorBanner::DrawGuts(OSRgn *) {
    SaveColors const colors;
    Rect box;
    GetBox(&box);
    VelaDrawing::RGBForeColor(kGround);
    VelaDrawing::PaintRect(&box);
    VelaDrawing::InsetRect(&box, kInsetH, kInsetV);
    VelaDrawing::RGBForeColor(kInk);
    DrawTextLayoutInRect(layout, text, box, kFont, TextSettings::kAlignLeft, TextSettings::kTruncateNone,
                         kCentred, kWrapped, 0, 0, 0.0f, 1.0f, 1.0f);
}
