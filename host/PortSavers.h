// Objects for the stack that keep some state of the port and put it back at the end of their scope.
//
// None can be copied. Several may be nested; each puts back what it found.
#pragma once
#include "host/Geometry.h"
#include "host/RGBColor.h"

class GlogStyleSheet;
class OSPort;

// The current port's two colours. GetColors reads them, SetColors makes them the port's; neither takes null.
struct SaveColorRec {
    RGBColor fore, back;
};
void GetColors(SaveColorRec *);       // reads the port's
void SetColors(SaveColorRec const *); // makes them the port's
// Black on white, which icons need.
void ClearColors();

// Keeps which port is current.
class WithPort {
public:
    WithPort(); // the current port stays current
    // Makes the port current. It must outlive this object.
    explicit WithPort(OSPort &);
    ~WithPort();

private:
    WithPort(WithPort const &);
    WithPort &operator=(WithPort const &);

    OSPort *saved;
};

// Keeps which port is current, and its clip and origin: for the time that others may draw.
class SavePortAndClip {
public:
    SavePortAndClip();
    ~SavePortAndClip();

private:
    SavePortAndClip(SavePortAndClip const &);
    SavePortAndClip &operator=(SavePortAndClip const &);

    struct Rep;
    Rep *rep;
};

// Keeps the port's foreground and background colours.
class SaveColors {
public:
    SaveColors();
    ~SaveColors();

private:
    SaveColors(SaveColors const &);
    SaveColors &operator=(SaveColors const &);

    SaveColorRec saved;
};

// Keeps the port's font, size and face.
class SaveTextState {
public:
    SaveTextState();
    ~SaveTextState();

private:
    SaveTextState(SaveTextState const &);
    SaveTextState &operator=(SaveTextState const &);

    struct Rep;
    Rep *rep;
};

// Keeps the whole state of the given port: clip, pen, line width, colours, text state, darkening. The number
// is a hint as to which parts matter; every value keeps everything.
class WithSaveGraphicsState {
public:
    WithSaveGraphicsState(OSPort &, unsigned int parts);
    ~WithSaveGraphicsState();

private:
    WithSaveGraphicsState(WithSaveGraphicsState const &);
    WithSaveGraphicsState &operator=(WithSaveGraphicsState const &);

    struct Rep;
    Rep *rep;
};

// Narrows the current port's clip to the rectangle, in the current pane's coordinates.
class WithClipRect {
public:
    explicit WithClipRect(OS::RectBase<OS::RectTag> const &);
    ~WithClipRect();

private:
    WithClipRect(WithClipRect const &);
    WithClipRect &operator=(WithClipRect const &);

    struct Rep;
    Rep *rep;
};

// Makes drawing darken what is beneath instead of covering it.
class WithDarkenDrawMode {
public:
    enum Mode { kMode1 = 1 }; // there is one way only
    // Whatever is drawn takes the strength away from what is beneath, in percent: 0 leaves it, 100 makes it
    // black; values beyond are cut. The colour of the drawing does not count. The sheet may be null and is
    // not kept.
    WithDarkenDrawMode(int strength, GlogStyleSheet *, Mode);
    ~WithDarkenDrawMode();

private:
    WithDarkenDrawMode(WithDarkenDrawMode const &);
    WithDarkenDrawMode &operator=(WithDarkenDrawMode const &);

    struct Rep;
    Rep *rep;
};

// Keeps the cursor as it is: as long as one of these lives, moving the mouse over panes does not change it.
class WithCursorDispatchingDisabled {
public:
    WithCursorDispatchingDisabled() { ++fgCount; }
    ~WithCursorDispatchingDisabled() { --fgCount; }

    static int fgCount; // how many of these live now

private:
    WithCursorDispatchingDisabled(WithCursorDispatchingDisabled const &);
    WithCursorDispatchingDisabled &operator=(WithCursorDispatchingDisabled const &);
};
