// Handles one custom event for a pane.
#pragma once

class UIEvent;

// Made with new by GlogPane::CanHandleCustomEvent and owned by the host. There is no virtual destructor: the
// host frees a handler with ::operator delete, without calling a destructor. So a handler holds one pointer
// and has a trivial destructor, and nobody uses a delete expression on this type.
struct CustomEventHandler {
    // Handles the event; true when it has been used up, false to offer it to the container.
    virtual bool HandleEvent(UIEvent *) = 0;
    // A new handler for the same pane, owned by the caller; null when none could be made.
    virtual CustomEventHandler *Clone() = 0;
};
