// The mouse of an X server.
#pragma once
#include "desktop/windows/ClickCounter.h"
#include "desktop/windows/InputQueue.h"
#include "desktop/windows/SdlCapture.h"
#include <vector>

struct SDL_MouseButtonEvent;
struct SDL_MouseMotionEvent;
struct SDL_MouseWheelEvent;
class SdlWindow;

// Makes the mouse's events. While a button is held all of them belong to the window of the press, and while a
// window has the capture to that one: SDL reports some for another window, or for none. Places are therefore
// worked out on the screen.
//
// The calls take the event with its time and modifiers filled in, and the window that SDL names; null for
// none of ours.
class SdlPointer {
public:
    // `windows`: those that there are, at any time.
    SdlPointer(InputQueue &, std::vector<SdlWindow *> const &windows);

    void Move(InputEvent, SdlWindow *, SDL_MouseMotionEvent const &);
    // Other buttons than the three are not reported.
    void Press(InputEvent, SdlWindow *, SDL_MouseButtonEvent const &);
    void Release(InputEvent, SdlWindow *, SDL_MouseButtonEvent const &);
    void Turn(InputEvent, SdlWindow *, SDL_MouseWheelEvent const &);
    void Leave(InputEvent, SdlWindow *);
    // The activation went to another program: what is held counts as released, since its release may never be
    // reported.
    void ReleaseAll(InputEvent);
    // A window of ours was activated, which ends SDL's capture: it is taken up again when it is still wanted.
    void Recapture();

    void Capture(InputEvent, SdlWindow *); // null ends it
    // The window is about to be destroyed.
    void Forget(SdlWindow const *);

private:
    SdlWindow *Target(SdlWindow *) const;
    void SetScreenPlace(SdlWindow *, int x, int y);
    void Place(InputEvent &, SdlWindow *) const;
    void Send(InputEvent &, InputEvent::Kind, SdlWindow *);
    void Enter(InputEvent, SdlWindow *);
    bool IsOver(SdlWindow const &) const;
    void LeaveIfOutside(InputEvent);
    void ReleaseButton(InputEvent, int button);
    void CaptureDrag();
    void CaptureFor(SdlWindow *);
    static bool HasBeenReleased();
    void EndCapture();

    InputQueue &queue;
    SdlCapture sdlCapture;
    SdlWindow *capture = nullptr;     // set by Capture
    SdlWindow *pressWindow = nullptr; // while a button is held
    SdlWindow *hover = nullptr;       // has been told of the pointer and not that it left
    unsigned int held = 0;            // bit n: button n
    int screenX = 0, screenY = 0;     // device pixels
    ClickCounter clickCounter;
    int clicks = 0; // of the last press
};
