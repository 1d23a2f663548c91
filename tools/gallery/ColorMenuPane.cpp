#include "tools/gallery/ColorMenuPane.h"
#include "frame/ResourceReading.h"
#include "host/GlogStyleSheet.h"
#include "host/Icons.h"
#include "host/MenuItemDecorator.h"
#include "host/OSPort.h"
#include "host/PortSavers.h"
#include "host/VelaDrawing.h"
#include "tools/gallery/Phrases.h"
#include <boost/make_shared.hpp>
#include <memory>
#include <new>

namespace {

short const kNoNumber = 0, kNoFlags = 0, kEmptyMenu = 137;
short const kSwatchWidth = 22, kSwatchHeight = 12; // in the menu, pixels
double const kCorner = 5;                          // diameter
double const kFrameAlpha = 0.35;

struct NamedColor {
    Phrase name;
    OS::RGBAColor color;
};
NamedColor const kColors[] = {
    {Phrase::kBlue, {0.32, 0.56, 0.93, 1}},   {Phrase::kTeal, {0.20, 0.68, 0.68, 1}},
    {Phrase::kGreen, {0.33, 0.70, 0.42, 1}},  {Phrase::kAmber, {0.92, 0.68, 0.24, 1}},
    {Phrase::kCoral, {0.90, 0.45, 0.36, 1}},  {Phrase::kRose, {0.86, 0.42, 0.62, 1}},
    {Phrase::kViolet, {0.58, 0.46, 0.86, 1}}, {Phrase::kSlate, {0.48, 0.53, 0.60, 1}},
};
short const kColorCount = sizeof kColors / sizeof kColors[0];

void DrawSwatch(Rect const &r, OS::RGBAColor const &color) {
    OSPort &port = OSPort::Current();
    port.PenNormal();
    port.SetForeColor(color);
    port.PaintRoundRect(r, OS::Size(kCorner, kCorner));
    port.SetForeColor(OS::RGBAColor(0, 0, 0, kFrameAlpha));
    port.FrameRoundRect(r, OS::Size(kCorner, kCorner));
}

class SwatchDecorator : public MenuItemDecorator {
public:
    explicit SwatchDecorator(OS::RGBAColor const &color_)
        : color(color_) {}
    short GetWidth() const override { return kSwatchWidth; }
    void Draw(Rect const &r, bool, bool) override {
        short const top = static_cast<short>((r.top + r.bottom - kSwatchHeight) / 2);
        DrawSwatch({top, r.left, static_cast<short>(top + kSwatchHeight), r.right}, color);
    }

private:
    OS::RGBAColor const color;
};

} // namespace

ColorMenuPane::ColorMenuPane()
    : PopMPane(true) {
    SetAgent(&swatch);
}

ColorMenuPane::~ColorMenuPane() { SetAgent(nullptr); }

ColorMenuPane *ColorMenuPane::NewColorMenuPane(glogRec *owner, GlogStyleSheet *sheet) {
    Rect bounds = OptionalRect(sheet->GetItemRes(), "BoundsRect");
    std::unique_ptr<ColorMenuPane> pane(new (std::nothrow) ColorMenuPane);
    if (!pane || !pane->PopMPaneInit(owner, kNoNumber, kNoFlags, &bounds, kEmptyMenu))
        return nullptr;
    pane->AddColors();
    return pane.release();
}

void ColorMenuPane::AddColors() {
    for (short i = 0; i < kColorCount; ++i) {
        AddItem(Phrases::Get(kColors[i].name), kDashIsText);
        ApplyDecoratorToItem(static_cast<short>(i + 1),
                             boost::make_shared<SwatchDecorator>(kColors[i].color));
    }
}

void ColorMenuPane::Swatch::DrawGuts(PopMPane *pane, OSRgn *, bool &handled) {
    handled = true;
    short const item = pane->GetSelectedItem();
    if (item < 1 || item > kColorCount)
        return;
    SaveColors const colors;
    DrawSwatch(pane->GetDrawRectangle(), kColors[item - 1].color);
}
