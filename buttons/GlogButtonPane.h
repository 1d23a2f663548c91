// The base of the push buttons that track the mouse themselves.
//
// A click inside presses the button; it stays pressed only while the mouse is inside, and a release inside
// tells the listeners. The base draws nothing: subclasses draw from ButtonIsDown, StillTracking and GetMode.
#pragma once
#include "frame/GlogButtonPaneListener.h"
#include "frame/Provider.h"
#include "host/GlogPane.h"
#include "host/UString.h"

class EventRecordAdapter;
class GlogButtonPane;
struct glogRec;

// The button's operations for code that holds no more than a pointer. They are plain variables: a program may
// put a function of its own into each, and presses go through btnDepress and btnRelease too.
extern void (*btnDepress)(GlogButtonPane *);          // Depress
extern void (*btnRelease)(GlogButtonPane *);          // Release
extern void (*btnEnable)(GlogButtonPane *);           // Enable
extern void (*btnDisable)(GlogButtonPane *);          // Disable
extern void (*btnFlash)(GlogButtonPane *, short key); // Track while enabled, otherwise nothing
extern void (*gcSetModeBP)(GlogButtonPane *, int);    // SetMode with the low byte

class GlogButtonPane : public Provider<GlogButtonPaneListener>, public GlogPane {
public:
    // Values of the mode that mean the same for every button. Subclasses give meanings to more of them; with
    // any value but kEnabled the button refuses clicks.
    enum { kEnabled = 0, kDisabled = 1 };

    GlogButtonPane();
    ~GlogButtonPane() override;

    // Presses and releases the button. These only keep the state; whoever calls them repaints.
    virtual void Depress();
    virtual void Release();
    // Fills in the label. The base has none and leaves the string alone.
    virtual void GetButtonText(UString &) const;

    // Set the mode and invalidate the pane; a mode that is set already does neither.
    void Enable();
    void Disable();
    void SetMode(unsigned char);

    // Presses the button and follows the mouse until it is released or, for a key code that is down, waits
    // until the key is up; 0 stands for the mouse. The press shows for an eighth of a second at least, also
    // when the mouse button or key is up already. If the button is pressed at the end, it is released and
    // redrawn, then GlogButtonPanePressedMsg goes out, and the result is true. If the mouse has slid off, the
    // result is false and nobody is told. The application runs on meanwhile. It may delete the pane, as a
    // listener may: deleted before the release, the result is false.
    bool Track(short key);
    // What a key equivalent does: 1 after a press, -1 when the mouse slid off or the button is not enabled.
    int Flash(short key);

protected:
    // Attaches the pane to the glog under the number 0 and stores the mode, released. Null, and nothing
    // changed, when it cannot be attached.
    GlogButtonPane *InitGlogButtonPane(glogRec *glog, unsigned char mode);

    unsigned char GetMode() const { return mode; }     // as SetMode stored it
    bool ButtonIsDown() const { return buttonIsDown; } // between Depress and Release
    // True inside Track. The application runs there, so a button may be called while it is being pressed.
    bool StillTracking() const { return stillTracking; }

    // 1 after a press, -1 when the mouse slid off. A button that is not enabled gives 0, so that the click
    // falls through to the host; Flash gives -1 there, and that difference is meant.
    int HandleClick(EventRecordAdapter *) override;

private:
    // Changes the pressed state by way of btnDepress or btnRelease and shows it at once.
    void ChangeState(void (*change)(GlogButtonPane *));
    void FollowMouse(Rect const &box);

    bool buttonIsDown;
    bool stillTracking;
    unsigned char mode;
};
