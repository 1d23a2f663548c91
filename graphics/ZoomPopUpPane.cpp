#include "graphics/ZoomPopUpPane.h"
#include "graphics/WholeNumber.h"
#include "graphics/ZoomPopUpControl.h"
#include "host/CustomEventHandler.h"
#include "host/EventRecordAdapter.h"
#include "host/Icons.h"
#include "host/LocalizedStrings.h"
#include "host/PaneWatch.h"
#include "host/PortSavers.h"
#include "host/UIEvent.h"
#include "host/VelaDrawing.h"
#include "host/glogRec.h"
#include "scrolling/Truncation.h"
#include <memory>
#include <new>

namespace {

short const kNoNumber = 0;
int const kHandled = -1;
short const kFamily = 1007, kIcon = 46;
short const kSide = 12; // pixels
short const kSliderWindow = 3510;
short const kAboveButton = 17; // pixels from the slider's top to the button's

} // namespace

struct ZoomPopUpPaneMouseWheelHandler : CustomEventHandler {
    ZoomPopUpPaneMouseWheelHandler(GlogPane *ownerPane, ZoomPopUpPaneClient *zoomed)
        : owner(ownerPane)
        , client(zoomed) {}

    // Less than a whole notch is a step down, whichever way it goes. The client may delete its owner.
    bool HandleEvent(UIEvent *event) override {
        PaneWatch const watch(owner);
        client->PrepareToZoom();
        if (watch.PaneExists())
            client->ZoomStep(WholeNumber(static_cast<double>(event->GetMouseWheelParams()->delta)) > 0);
        return true;
    }

    CustomEventHandler *Clone() override {
        return new (std::nothrow) ZoomPopUpPaneMouseWheelHandler(owner, client);
    }

private:
    GlogPane *owner; // the client lives as long
    ZoomPopUpPaneClient *client;
};

ZoomPopUpPane::ZoomPopUpPane(glogRec *owner, ZoomPopUpPaneClient *zoomed)
    : client(zoomed) {
    if (!GlogPaneInit(owner, kNoNumber))
        return;
    Rect box = {0, 0, kSide, kSide};
    GlogPane::SetBox(&box);
    SetHelpTag(LocalizedStrings::HelpTagMgr::Instance().DemandHelpTag("kGlobalTags", "kZoomPopupPane"));
}

ZoomPopUpPane::~ZoomPopUpPane() { delete client; }

CustomEventHandler *ZoomPopUpPane::CanHandleCustomEvent(UIEvent *event) {
    return IsMouseWheelEvent(*event) ? new (std::nothrow) ZoomPopUpPaneMouseWheelHandler(this, client)
                                     : nullptr;
}

void ZoomPopUpPane::DrawGuts(OSRgn *) {
    Rect box;
    GetBox(&box);
    Draw1Icon(kFamily, kIcon, box.left, box.top);
}

int ZoomPopUpPane::HandleClick(EventRecordAdapter *event) {
    PopZoomControl(event);
    return kHandled;
}

void ZoomPopUpPane::PopZoomControl(EventRecordAdapter *event) {
    Rect box;
    GetBox(&box);
    Prepare();
    Point corner = {box.top, box.left}, mouse = event->where;
    VelaDrawing::LocalToGlobal(&corner);
    VelaDrawing::LocalToGlobal(&mouse);

    WithPort const port;
    using TarnOSWindow::OSWindow;
    glogRec *const popup = LowLevelGlogOpening::NewGlog(
        kSliderWindow, OSWindow::SendBehindArg(OSWindow::PositionOnTop), false, nullptr);
    if (!popup)
        return;
    // Also when the client or the slider throws.
    struct Disposed {
        ~Disposed() { DisposeGlog(glog); }
        glogRec *glog;
    } const disposed{popup};
    SetPortToGlog(popup);
    PaneWatch const self(this);
    // The level that the client has comes up under the mouse. The fraction's own error counts, so that one
    // which the slider has set may come up a pixel beside it.
    int const level =
        WholeNumber(static_cast<double>(client->GetZoomFraction()) * ZoomPopUpControl::kTrackLength);
    Rect place = {0, 0, ZoomPopUpControl::kHeight, ZoomPopUpControl::kWidth};
    VelaDrawing::OffsetRect(&place,
                            Pixel16(mouse.h - static_cast<long long>(level) - ZoomPopUpControl::kTrackLeft),
                            Pixel16(corner.v - kAboveButton));
    PositionGlog(popup, &place, false);
    if (self.PaneExists())
        RunSlider(popup, mouse);
}

void ZoomPopUpPane::RunSlider(glogRec *popup, Point mouse) {
    ZoomPopUpControl *const control = new (std::nothrow) ZoomPopUpControl(popup, *this, client);
    if (!control)
        return;
    PaneWatch const watch(control);
    ShowGlog(popup, kShowGlog);
    if (watch.PaneExists())
        UpdateGlog(popup);
    if (!watch.PaneExists())
        return;
    control->Prepare();
    VelaDrawing::GlobalToLocal(&mouse);
    control->Track(mouse);
}
