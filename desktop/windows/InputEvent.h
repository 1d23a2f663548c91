// What a window system reports.
#pragma once
#include "desktop/windows/KeyCodes.h"
#include "host/UString.h"

class PlatformWindow;

// One report of a window system, in the window's logical content coordinates. While a button is held the
// mouse is captured, and positions may lie outside the window.
struct InputEvent {
    enum Kind {
        kNone,
        kMouseDown,
        kMouseUp,
        kMouseMove,
        kMouseLeave, // the pointer left the window and no button is held
        kWheel,
        kKeyDown, // `key`, and `text` where the key types something
        kKeyUp,
        kTextInput,   // `text` was committed without a key of its own
        kTextEditing, // an input method composes: `text`, `compositionCaret`
        kResized,     // `width`, `height`
        kMoved,
        kActivated,
        kDeactivated,
        kExposed,      // the window's picture was lost
        kScaleChanged, // the window came to a display of another scale: `scale`
        kCloseRequested,
        kQuit // the session ends
    };
    Kind kind = kNone;
    PlatformWindow *window = nullptr;
    double time = 0; // seconds on the window system's clock
    int h = 0, v = 0;
    int button = 0;                // 1 primary, 2 secondary, 3 middle
    int clicks = 0;                // as ClickCounter counts: 1 single, 2 double
    unsigned short modifiers = 0;  // as in EventRecordAdapter
    double wheelH = 0, wheelV = 0; // notches; positive toward the left and the top
    int key = KeyCodes::kNone;
    bool repeat = false;
    UString text;
    int compositionCaret = 0;  // characters into `text`
    int width = 0, height = 0; // logical pixels
    double scale = 1.0;
};
