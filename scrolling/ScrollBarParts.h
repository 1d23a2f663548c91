// The parts of a scroll bar. For scroll bars alone.
#pragma once
#include "buttons/GIconButtonPane.h"
#include "scrolling/ScrollBarPane.h"
#include "scrolling/SingleAxis.h"

// An arrow scrolls when it is pressed, and again and again while it is held down with the mouse inside. A
// release outside of it ends the gesture without telling the client.
class ScrollBarPane::ArrowPane : public GIconButtonPane {
public:
    // Disabled at first.
    ArrowPane(glogRec *, Orientation, ScrollDirection, ScrollBarPane *owner);

    short ClickAction(int modifiers) override;
    int ReleaseAction() override;
    void DoButtonPress(int modifiers) override;

private:
    ScrollDirection direction;
    ScrollBarPane *owner;
};

// The trough with the thumb. A press on the thumb drags it, one beside it scrolls by pages.
class ScrollBarPane::ThumbPane : public GlogPane {
public:
    // Not enabled at first.
    ThumbPane(glogRec *, Orientation, ScrollBarPane *owner);

    // Only stores.
    void SetEnabled(bool enable) { enabled = enable; }
    // The axis that the thumb moves along.
    SingleAxis Along() const { return SingleAxis(orientation == kVertical); }
    // Where the thumb lies: 16 pixels across, and from 16 pixels to the whole trough along the bar.
    Rect GetThumbRect() const;

protected:
    int HandleClick(EventRecordAdapter *) override;
    void DrawGuts(OSRgn *updateRegion) override;

private:
    int GetThumbLength() const;

    Orientation orientation;
    bool enabled;
    ScrollBarPane *owner;
};
