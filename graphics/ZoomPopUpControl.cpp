#include "graphics/ZoomPopUpControl.h"
#include "graphics/WholeNumber.h"
#include "graphics/ZoomPopUpPaneClient.h"
#include "host/Icons.h"
#include "host/MouseTask.h"
#include "host/glogRec.h"
#include <algorithm>

namespace {

short const kNumber = 1;
short const kTrackFamily = 1776, kThumbFamily = 1777;
float const kLastThumb = 15.0f; // the icon of 0.0; that of 1.0 is 0
short const kThumbLeft = 4, kThumbTop = 3;

} // namespace

// One drag of the slider.
class ZoomPopUpControlMouseTask : public MouseTask {
public:
    explicit ZoomPopUpControlMouseTask(ZoomPopUpControl *tracked)
        : MouseTask(0)
        , control(tracked) {
        SetSleepTime(DefaultAutoScrollTime());
    }
    void MouseTaskBegin() override { control->Apply(GetStartPoint()); }
    void MouseTaskContinue(Point const &where) override {
        PaneWatch const watch(control);
        if (GetTrackingResult() != MouseTracking::kTimedOut)
            control->Apply(where);
        if (watch.PaneExists())
            control->ZoomIdle();
    }
    void MouseTaskEnd() override {}

private:
    ZoomPopUpControl *control;
};

ZoomPopUpControl::ZoomPopUpControl(glogRec *window, GlogPane &ownerPane, ZoomPopUpPaneClient *zoomed)
    : fraction(zoomed->GetZoomFraction())
    , client(zoomed)
    , owner(&ownerPane) {
    client->PrepareToZoom();
    GlogPaneInit(window, kNumber);
    Rect box = {0, 0, kHeight, kWidth};
    SetBox(&box);
}

ZoomPopUpControl::~ZoomPopUpControl() {}

void ZoomPopUpControl::Track(Point start) {
    ZoomPopUpControlMouseTask task(this);
    TrackMouse(task, start);
}

// The client may do anything, close this window and delete its owner too.
void ZoomPopUpControl::Apply(Point where) {
    if (!owner.PaneExists())
        return;
    Prepare();
    Rect box;
    GetBox(&box);
    float level = where.h < box.left ? 0.0f : 1.0f;
    if (where.h >= box.left && where.h <= box.right)
        level = static_cast<float>(std::clamp<int>(where.h - kTrackLeft, 0, kTrackLength) /
                                   static_cast<double>(kTrackLength));
    PaneWatch const watch(this);
    client->SetZoomFraction(level);
    if (!watch.PaneExists() || !owner.PaneExists())
        return;
    float const taken = client->GetZoomFraction();
    if (!watch.PaneExists())
        return;
    if (taken != fraction) {
        fraction = taken;
        Inval();
    }
    UpdateGlog(GetGlog());
}

void ZoomPopUpControl::ZoomIdle() {
    if (owner.PaneExists())
        client->ZoomIdle();
}

void ZoomPopUpControl::DrawGuts(OSRgn *) {
    Draw1Icon(kTrackFamily, 0, 0, 0);
    double const shown = std::clamp(static_cast<double>(kLastThumb - fraction * kLastThumb), 0.0,
                                    static_cast<double>(kLastThumb));
    Draw1Icon(kThumbFamily, static_cast<short>(WholeNumber(shown)), kThumbLeft, kThumbTop);
}
