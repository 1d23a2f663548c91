// A framed button of 24 x 16 pixels with an icon on its face and two states.
//
// A click is tracked as by any push button; whoever listens changes the state. A click gives 1, with the
// shift key 2. The face shows off, on or disabled; it does not change while the button is held down.
#pragma once
#include "buttons/GlogButtonPane.h"
#include "buttons/gfbResRec.h"
#include "host/XMLLib.h"
#include <boost/shared_ptr.hpp>

class FrameButtonPane;

// SetState by way of a variable that a program may replace.
extern void (*gfbSetState)(FrameButtonPane *, bool);

class FrameButtonPane : public GlogButtonPane {
public:
    // Make a button and attach it to the glog, which owns it from then on; null when memory or glog is
    // wanting. The record, and the item with its "Origin", "ISetID", "IconID", "GutsOrigin", "DownOffset" and
    // "HiliteWhenDown", are only read; keys that are absent count as 0. A null item fails the assertion of
    // its pointer.
    static FrameButtonPane *NewFrameButtonPane(glogRec *, gfbResRec *);
    static FrameButtonPane *NewFrameButtonPane(glogRec *, boost::shared_ptr<XMLLib::ContainerItem>);

    // 1 for on, 0 for off.
    unsigned char GetState() const { return state; }
    // Any value but 0 is on. Invalidates the pane when the state changes, and tells nobody.
    void SetState(unsigned char);
    // Flips the state and invalidates the pane.
    void ToggleState();

    // Nothing is added to the base's; subclasses build on these.
    void Depress() override;
    void Release() override;
    // Draws the face with its top left corner at the point, unless the stock face is shown. Here: the
    // button's own icon, which then is drawn over once more.
    virtual void DoDrawButtonFace(short h, short v);

protected:
    FrameButtonPane();
    // Attaches the pane, enabled, and takes box and icon from the record.
    FrameButtonPane *InitFrameButtonPane(glogRec *, gfbResRec *);

    // 2 for a press with the shift key, 1 without; -1 when the mouse slid off, 0 when not enabled.
    int HandleClick(EventRecordAdapter *) override;
    void DrawGuts(OSRgn *updateRegion) override;

private:
    short FaceIcon() const;
    void SetIconColor() const;

    gfbResRec record;
    unsigned char state; // 0 or 1
};
