#include "tools/glogview/ErrorBanner.h"
#include "host/PortSavers.h"
#include "host/VelaDrawing.h"
#include "host/glogRec.h"
#include <algorithm>
#include <cmath>

namespace {

// Pixels.
short const kInsetH = 12, kInsetV = 4;
int const kLineHeight = 14;
int const kFewestLines = 3;
// Of a line, that words leave free at its end at the most.
double const kFreeShare = 0.15;
int const kFont = 1;
int const kCentred = 1;
int const kOneLine = 0, kWrapped = 1;

// The same in every theme, so that nobody takes it for a part of the dialog.
RGBColor const kGround = {0x9B00, 0x1C00, 0x2300};
RGBColor const kInk = {0xFFFF, 0xFFFF, 0xFFFF};

} // namespace

ErrorBanner *ErrorBanner::NewErrorBanner(glogRec *owner, UString const &text) {
    ErrorBanner *const banner = new ErrorBanner;
    banner->GlogPaneInit(owner, 0);
    banner->SetText(text);
    return banner;
}

void ErrorBanner::SetText(UString const &newText) {
    Inval();
    text = newText;
    Place();
    Inval();
}

void ErrorBanner::Resize(Point) { Place(); }

void ErrorBanner::Place() {
    UpdateTextLayout(layout, text, kFont, TextSettings::kAlignLeft, TextSettings::kTruncateNone, kCentred,
                     kOneLine, 0, 0, 0.0f, 1.0f, 1.0f);
    short const width = GetGlogWidth(GetGlog()), bottom = GetGlogHeight(GetGlog());
    double const lineWidth = std::max((width - 2 * kInsetH) * (1 - kFreeShare), 1.0);
    double const lines = std::max<double>(std::ceil(layout.GetWidth() / lineWidth), kFewestLines);
    double const height = std::min<double>(lines * kLineHeight + 2 * kInsetV, bottom);
    Rect box = {static_cast<short>(bottom - static_cast<int>(height)), 0, bottom, width};
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
