// A button of 12 pixels that pops up a zoom slider under the mouse.
//
// The slider stays up while the mouse button is held; its thumb follows the mouse. The wheel over the button
// steps through the levels. Clicks give -1. The slider's window is the stored one of the number 3510; without
// it nothing comes up.
#pragma once
#include "graphics/ZoomPopUpPaneClient.h"
#include "host/GlogPane.h"

class ZoomPopUpPane : public GlogPane, public Noncopyable<ZoomPopUpPane> {
public:
    // Attaches the pane under the number 0 in the top left corner, with a help tag, and takes the client
    // over, which must not be null.
    ZoomPopUpPane(glogRec *, ZoomPopUpPaneClient *);
    ~ZoomPopUpPane() override;

    // Overridden operations of panes.
    CustomEventHandler *CanHandleCustomEvent(UIEvent *) override; // the wheel's

protected:
    // Runs the slider for a press at the event's point until the button is up. The pane may be deleted
    // meanwhile.
    void PopZoomControl(EventRecordAdapter *);

    int HandleClick(EventRecordAdapter *) override;
    void DrawGuts(OSRgn *updateRegion) override;

private:
    void RunSlider(glogRec *popup, Point mouse);

    ZoomPopUpPaneClient *client; // owned
};
