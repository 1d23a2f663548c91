// What the application does for panes and the host.
#pragma once

class EventRecordAdapter;
struct CommandSpecifier;

// Told while panes track the mouse, and asked about clicks and keys.
class VelaFoundationCallbackAPI {
public:
    // The application's object; must be set before panes get events, for nobody tests it. Stays the
    // application's.
    static VelaFoundationCallbackAPI *gInstance;

    virtual ~VelaFoundationCallbackAPI() {}
    // A button or tab is being tracked: called once in each pass of its loop.
    virtual void TrackingStep() = 0;
    // The same for lists.
    virtual void ListTrackingStep() = 0;
    // Whether the key gives up what the user is doing. The flag is true when a text field asks.
    virtual bool IsCancelKey(EventRecordAdapter *, bool) = 0;
    // Whether the current press of the mouse is the second of a double click. Asked once for each press.
    virtual bool IsDoubleClick() = 0;
};

// Carries out the commands of icon buttons.
class InternalCallbackAPI {
public:
    // As above.
    static InternalCallbackAPI *gInstance;

    virtual ~InternalCallbackAPI() {}
    // The command must not be null and is not kept.
    virtual void ExecuteCommand(CommandSpecifier const *) = 0;
};
