#include "tools/gallery/WaveViewPane.h"
#include "frame/ResourceReading.h"
#include "graphics/ProgressBarPane.h"
#include "graphics/ZoomPopUpPane.h"
#include "host/GlogStyleSheet.h"
#include "host/NamedColors.h"
#include "host/PortSavers.h"
#include "host/VelaDrawing.h"
#include "host/glogRec.h"
#include "scrolling/ScrollBarPane.h"
#include "tools/gallery/LabelText.h"
#include "tools/gallery/PageFiles.h"
#include "tools/gallery/Phrases.h"
#include "tools/gallery/WellPane.h"
#include <algorithm>
#include <cmath>
#include <memory>
#include <new>

namespace {

short const kBarThickness = 16, kButtonsWidth = 32, kSliderWidth = 16, kSliderSide = 12; // pixels
int const kFirstPart = 901;       // item number of the buttons; bar and slider follow
double const kFewest = 100;       // samples that are shown at the greatest zoom
float const kFirstZoom = 3.0f;    // steps
float const kStep = 1.0f / 12.0f; // of the zoom
double const kSamplesPerSecond = 11025;
int const kLoudest = 32768;
char const kRecording[] = "/sounds/loop.wav";

UString InSeconds(int sample) { return LabelText::OfDecimal(sample / kSamplesPerSecond, 2); }

} // namespace

// What is seen of the recording.
class WaveViewPane::Wave : public GlogPane {
public:
    Wave(glogRec *owner, WaveViewPane &of, Rect box)
        : view(of) {
        GlogPaneInit(owner, 0);
        SetBox(&box);
    }

protected:
    void DrawGuts(OSRgn *region) override {
        SaveColors const colors;
        Rect const box = GetBounds();
        VelaDrawing::RGBForeColor(kDialogListBackgroundColor);
        VelaDrawing::PaintRect(&box);
        short const middle = static_cast<short>((box.top + box.bottom) / 2);
        VelaDrawing::PenNormal();
        VelaDrawing::RGBForeColor(kPanelUnderline);
        VelaDrawing::MoveTo(box.left, middle);
        VelaDrawing::LineTo(static_cast<short>(box.right - 1), middle);
        VelaDrawing::RGBForeColor(kHiliteColor);
        for (short h = box.left; h < box.right; ++h) {
            Rect const column = {box.top, h, box.bottom, static_cast<short>(h + 1)};
            if (VelaDrawing::RectInRgn(&column, region))
                DrawColumn(column, middle, box.right - box.left);
        }
    }

private:
    void DrawColumn(Rect const &column, short middle, int width) const {
        double const samples = static_cast<double>(view.Shown()) / width;
        double const from = view.first + (column.left - GetBounds().left) * samples;
        WaveFile::Peak const peak = view.file.PeakOf(static_cast<long long>(from),
                                                     static_cast<long long>(std::ceil(from + samples)) + 1);
        int const half = (column.bottom - column.top) / 2 - 2;
        VelaDrawing::MoveTo(column.left, static_cast<short>(middle - peak.most * half / kLoudest));
        VelaDrawing::LineTo(column.left, static_cast<short>(middle - peak.least * half / kLoudest));
    }

    WaveViewPane &view;
};

class WaveViewPane::Slider : public ZoomPopUpPaneClient {
public:
    explicit Slider(WaveViewPane &zoomed)
        : view(zoomed) {}
    float GetZoomFraction() override { return view.Zoom(); }
    void SetZoomFraction(float fraction) override { view.SetZoom(fraction); }
    void ZoomStep(bool up) override { view.ZoomStep(up); }

private:
    WaveViewPane &view;
};

// The card shows at its corners.
class WaveViewPane::ButtonPair : public ZoomControlPane {
public:
    ButtonPair(glogRec *owner, Client *zoomed)
        : ZoomControlPane(owner, zoomed, kHorizontal) {
        SetNoErase(1);
    }
};

void WaveViewPane::Buttons::Zoom(bool zoomIn, bool) { view.ZoomStep(zoomIn); }

bool WaveViewPane::Buttons::CanZoom(bool zoomIn) { return zoomIn ? view.zoom < 1.0f : view.zoom > 0.0f; }

// Creation

WaveViewPane *WaveViewPane::NewWaveViewPane(glogRec *owner, GlogStyleSheet *sheet) {
    std::unique_ptr<WaveViewPane> pane(new (std::nothrow) WaveViewPane(owner, sheet));
    return pane && pane->GetGlog() ? pane.release() : nullptr;
}

WaveViewPane::WaveViewPane(glogRec *owner, GlogStyleSheet *sheet)
    : file(PageFiles::OwnDirectory() + kRecording)
    , labelID(sheet->GetSInt32ItemValue(ResourceKey("TextID")))
    , progressID(sheet->GetSInt32ItemValue(ResourceKey("CmdID"))) {
    if (!CompoundPaneInit(owner, 0))
        return;
    SetNoErase(1);
    Rect box = OptionalRect(sheet->GetItemRes(), "BoundsRect");
    SetBox(&box);
    AddParts();
}

WaveViewPane::~WaveViewPane() {
    if (bar)
        bar->SetClient(nullptr);
}

void WaveViewPane::AddParts() {
    short const width = static_cast<short>(ItemWidth()), height = static_cast<short>(ItemHeight());
    short const strip = static_cast<short>(height - kBarThickness);
    wave = new Wave(GetGlog(), *this, {0, 0, static_cast<short>(strip - 4), width});
    Add(wave, -1);

    ButtonPair *const pair = new ButtonPair(GetGlog(), &buttons);
    pair->Offset({strip, 0});
    pair->SetID(kFirstPart);
    Add(pair, -1);

    sbarResRec record = {sbarResRec::kType, 1, {0, 0, 0, 0}, 0, 0};
    record.bounds = {strip, kButtonsWidth, height, static_cast<short>(width - kSliderWidth)};
    bar = ScrollBarPane::NewScrollBarPane(GetGlog(), &record);
    bar->SetID(kFirstPart + 1);
    Add(bar, -1);

    ZoomPopUpPane *const slider = new ZoomPopUpPane(GetGlog(), new Slider(*this));
    slider->Offset({static_cast<short>(strip + 2), static_cast<short>(width - kSliderSide)});
    slider->SetID(kFirstPart + 2);
    Add(slider, -1);
}

void WaveViewPane::GlogItemInit() {
    CompoundPane::GlogItemInit();
    bar->SetClient(this);
    SetZoom(kFirstZoom * kStep);
}

// Zoom

int WaveViewPane::Shown() const {
    double const all = std::max(All(), 1);
    return static_cast<int>(all * std::pow(std::min(kFewest / all, 1.0), static_cast<double>(zoom)));
}

void WaveViewPane::SetZoom(float newZoom) {
    int const middle = first + Shown() / 2;
    zoom = std::clamp(newZoom, 0.0f, 1.0f);
    ScrollTo(bar, middle - Shown() / 2);
    buttons.UpdateControlPane();
}

void WaveViewPane::ZoomStep(bool in) {
    float const steps = std::round(zoom / kStep) + (in ? 1.0f : -1.0f);
    SetZoom(steps * kStep);
}

// Scrolling

int WaveViewPane::GetMaxScrollValue(ScrollBarPane *) { return std::max(All() - Shown(), 0); }

void WaveViewPane::ScrollTo(ScrollBarPane *, int position) {
    first = std::clamp(position, 0, GetMaxScrollValue(bar));
    wave->Inval();
    ShowPlace();
}

double WaveViewPane::GetThumbRatio(ScrollBarPane *) {
    return static_cast<double>(Shown()) / std::max(All(), 1);
}

void WaveViewPane::StartScrolling(ScrollBarPane *, bool byUnit, int &amount, int &multiplier) {
    amount = std::max(byUnit ? Shown() / 32 : Shown() * 9 / 10, 1);
    multiplier = 1;
}

void WaveViewPane::Scroll(ScrollBarPane *, int &amount, int &multiplier) {
    ScrollTo(bar, first + amount * multiplier);
}

void WaveViewPane::ShowPlace() {
    bar->Set(first, GetMaxScrollValue(bar));
    if (!container)
        return;
    LabelText::Show(container->FindByID(labelID),
                    Phrases::Fill(Phrase::kStretch, {InSeconds(first), InSeconds(first + Shown())}));
    GlogPane *const progress = container->FindByID(progressID);
    if (ProgressBarPane *const shown = dynamic_cast<ProgressBarPane *>(progress))
        shown->SetProgress(first + Shown(), std::max(All(), 1));
}
