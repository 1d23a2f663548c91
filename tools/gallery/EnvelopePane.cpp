#include "tools/gallery/EnvelopePane.h"
#include "frame/ResourceReading.h"
#include "host/EventRecordAdapter.h"
#include "host/GlogStyleSheet.h"
#include "host/NamedColors.h"
#include "host/OSPort.h"
#include "host/PaneWatch.h"
#include "host/Services.h"
#include "host/VelaDrawing.h"
#include "host/glogRec.h"
#include "tools/gallery/LabelText.h"
#include <algorithm>
#include <cmath>
#include <cstdio>
#include <memory>
#include <new>
#include <vector>

namespace {

int const kHandled = -1, kNotTaken = 0, kNoPoint = -1;
int const kLongest = 1000, kTimeStep = 250, kTimeMargin = 25;              // milliseconds
int const kSoftest = -60, kLoudest = 4, kLevelStep = 12, kLevelMargin = 4; // decibels
double const kReach = 8.0;                                                 // pixels
int const kHandle = 4;          // pixels from a point to the sides of its mark
double const kHandleCorner = 8; // diameter

} // namespace

// Five points: where the note starts, is loudest, goes on, fades, and ends.
class EnvelopePane::Envelope : public GraphData {
public:
    int CountPoints() override { return static_cast<int>(points.size()); }
    GraphDataPoint GetPoint(int index) override { return points.at(static_cast<std::size_t>(index)); }

    // Points stay in their order, and the ends at theirs.
    void Move(int index, GraphDataPoint to) {
        bool const isFirst = index == 0, isLast = index == CountPoints() - 1;
        int const least = isFirst ? 0 : isLast ? kLongest : GetPoint(index - 1).horizontal;
        int const most = isFirst ? 0 : isLast ? kLongest : GetPoint(index + 1).horizontal;
        points.at(static_cast<std::size_t>(index)) = {std::clamp(to.horizontal, least, most),
                                                      std::clamp(to.vertical, kSoftest, kLoudest)};
    }

private:
    std::vector<GraphDataPoint> points = {{0, -60}, {90, 0}, {330, -15}, {720, -21}, {1000, -60}};
};

EnvelopePane *EnvelopePane::NewEnvelopePane(glogRec *owner, GlogStyleSheet *sheet) {
    std::unique_ptr<EnvelopePane> pane(new (std::nothrow) EnvelopePane(owner, sheet));
    return pane && pane->GetGlog() ? pane.release() : nullptr;
}

EnvelopePane::EnvelopePane(glogRec *owner, GlogStyleSheet *sheet)
    : GraphPane(owner, 0, sheet->GetItemRes())
    , envelope(new Envelope)
    , labelID(sheet->GetSInt32ItemValue(ResourceKey("TextID"))) {
    SetGraphData(envelope);
    SetupHorizontalAxis({-kTimeMargin, kLongest + kTimeMargin, kTimeStep, 0, 0});
    SetupVerticalAxis({kSoftest - kLevelMargin, kLoudest + kLevelMargin, kLevelStep, 0, 0});
}

void EnvelopePane::DrawDataPoint(int index, int h, int v) {
    OSPort &port = OSPort::Current();
    OS::RectBase<OS::RectTag> const mark(h - kHandle, v - kHandle, 2 * kHandle, 2 * kHandle);
    OS::Size const corner(kHandleCorner, kHandleCorner);
    port.SetForeColor(index == dragged ? kHiliteColor : kDialogListBackgroundColor);
    port.PaintRoundRect(mark, corner);
    port.SetLineWidth(1.5);
    port.SetForeColor(kHiliteColor);
    port.FrameRoundRect(mark, corner);
    VelaDrawing::RGBForeColor(kDialogListTextColor);
}

int EnvelopePane::PointAt(Point p) const {
    int nearest = kNoPoint;
    double best = kReach;
    for (int i = 0; i < envelope->CountPoints(); ++i) {
        int h = 0, v = 0;
        GraphDataPointToCoords(envelope->GetPoint(i), h, v);
        double const distance = std::hypot(h - p.h, v - p.v);
        if (distance < best) {
            best = distance;
            nearest = i;
        }
    }
    return nearest;
}

int EnvelopePane::HandleClick(EventRecordAdapter *event) {
    int const index = PointAt(event->where);
    if (index == kNoPoint)
        return kNotTaken;
    Drag(index);
    return kHandled;
}

void EnvelopePane::Drag(int index) {
    PaneWatch const watch(this);
    dragged = index;
    Inval();
    ShowPoint(index);
    UpdateGlog(GetGlog());
    Prepare();
    Point p = {0, 0};
    while (MouseIsDragging(&p, nullptr) && watch.PaneExists()) {
        MoveTo(index, CoordsToGraphDataPoint(p.h, p.v));
        UpdateGlog(GetGlog());
        Prepare();
    }
    if (!watch.PaneExists())
        return;
    dragged = kNoPoint;
    Inval();
}

void EnvelopePane::MoveTo(int index, GraphDataPoint to) {
    envelope->Move(index, to);
    Inval();
    ShowPoint(index);
}

void EnvelopePane::ShowPoint(int index) {
    GraphDataPoint const point = envelope->GetPoint(index);
    char text[64];
    std::snprintf(text, sizeof text, "%d ms, %d dB", point.horizontal, point.vertical);
    LabelText::Show(GetGlog(), labelID, LabelText::WithMinus(text));
}
