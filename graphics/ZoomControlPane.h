// A pair of buttons, each of 15 pixels, that zoom in and out.
//
// A click zooms once, when the button comes up. A held button waits a third of a second and then zooms ten
// times a second. With command or option it never repeats; with option the client is told so.
#pragma once
#include "host/CompoundPane.h"
#include "host/PanePtr.h"

class ZoomControlPane : public CompoundPane {
public:
    // Side by side, or, for any other value, above each other.
    enum Orientation : int { kHorizontal = 0, kVertical = 1 };

    // What the buttons zoom. The program's; may go before the pane or after it.
    class Client {
    public:
        Client();
        virtual ~Client();
        // One step. The pane may be deleted here.
        virtual void Zoom(bool zoomIn, bool optionKey) = 0;
        // Whether there is a further step; a button without one is disabled.
        virtual bool CanZoom(bool zoomIn);
        // Before the first step of a press, so that it can be taken back as a whole.
        virtual void SaveZoomStateHook();

        // To be called when the answers of CanZoom change: enables and disables the buttons.
        void UpdateControlPane();

    private:
        friend class ZoomControlPane;
        void SetControlPane(ZoomControlPane *);
        ZoomControlPane *controlPane; // or null
    };

    // Attaches the pane under the number 0, as large as its buttons: the one that zooms in is at the top, or
    // at the right. Becomes the one pane of the client, which must not be null. Without a glog it has no
    // buttons.
    ZoomControlPane(glogRec *, Client *, Orientation);
    ~ZoomControlPane() override;

    // Asks the client which of the buttons are enabled.
    void UpdateControls();

private:
    class ButtonPane;
    ButtonPane *NewButton(Client *, bool zoomIn, Orientation);
    void ClientGone();

    PanePtr<ButtonPane> zoomInButton, zoomOutButton; // subpanes
};
