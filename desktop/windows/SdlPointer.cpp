#include "desktop/windows/SdlPointer.h"
#include "desktop/windows/SdlScreen.h"
#include "desktop/windows/SdlWindow.h"
#include <SDL.h>

static int const kNoButton = 0, kFirstButton = 1, kLastButton = 3;

static int ButtonOf(int sdlButton) {
    switch (sdlButton) {
    case SDL_BUTTON_LEFT:
        return 1;
    case SDL_BUTTON_RIGHT:
        return 2;
    case SDL_BUTTON_MIDDLE:
        return 3;
    default:
        return kNoButton;
    }
}

static unsigned int Bit(int button) { return 1U << button; }

SdlPointer::SdlPointer(InputQueue &queue_, std::vector<SdlWindow *> const &windows)
    : queue(queue_)
    , sdlCapture(windows) {}

SdlWindow *SdlPointer::Target(SdlWindow *window) const {
    if (capture != nullptr)
        return capture;
    return held != 0 ? pressWindow : window;
}

// SDL tells only of places in its windows; of others the X server is asked. Without a capture SDL moves
// places outside to the window's edge: when a drag leaves the window before its press is captured, and when
// it ends outside.
void SdlPointer::SetScreenPlace(SdlWindow *window, int x, int y) {
    bool const maybeOutside = held != 0 || hover == nullptr;
    if (window == nullptr || (maybeOutside && window->IsAtEdge(x, y))) {
        SdlScreen::GetMousePlace(screenX, screenY);
        return;
    }
    screenX = window->ScreenX() + x;
    screenY = window->ScreenY() + y;
}

void SdlPointer::Place(InputEvent &event, SdlWindow *window) const {
    event.window = window;
    event.h = window->ContentH(screenX);
    event.v = window->ContentV(screenY);
}

void SdlPointer::Send(InputEvent &event, InputEvent::Kind kind, SdlWindow *window) {
    event.kind = kind;
    Place(event, window);
    queue.Push(event);
}

void SdlPointer::Enter(InputEvent event, SdlWindow *window) {
    if (hover != nullptr && hover != window)
        Send(event, InputEvent::kMouseLeave, hover);
    hover = window;
}

bool SdlPointer::IsOver(SdlWindow const &window) const {
    return window.Contains(window.ContentH(screenX), window.ContentV(screenY));
}

void SdlPointer::LeaveIfOutside(InputEvent event) {
    if (hover == nullptr || IsOver(*hover))
        return;
    Send(event, InputEvent::kMouseLeave, hover);
    hover = nullptr;
}

void SdlPointer::Move(InputEvent event, SdlWindow *window, SDL_MouseMotionEvent const &motion) {
    SdlWindow *target = Target(window);
    if (target == nullptr)
        return;
    SetScreenPlace(window, motion.x, motion.y);
    if (held == 0 && capture == nullptr && !IsOver(*target))
        return;
    CaptureDrag();
    Enter(event, target);
    Send(event, InputEvent::kMouseMove, target);
}

// The server gives a window all of a drag that begins in it. It is SDL that does not report it outside,
// without a capture. That costs the server half a dozen questions, which a click without movement is spared.
// Of a quick drag SDL has taken the release already: nothing is left to be captured.
void SdlPointer::CaptureDrag() {
    if (held != 0 && !sdlCapture.Holds() && !HasBeenReleased())
        sdlCapture.Hold();
}

void SdlPointer::Press(InputEvent event, SdlWindow *window, SDL_MouseButtonEvent const &press) {
    int button = ButtonOf(press.button);
    SdlWindow *target = Target(window);
    if (button == kNoButton || target == nullptr)
        return;
    SetScreenPlace(window, press.x, press.y);
    Enter(event, target);
    pressWindow = target;
    held |= Bit(button);
    event.button = button;
    Place(event, target);
    event.clicks = clicks = clickCounter.Count(event);
    Send(event, InputEvent::kMouseDown, target);
}

void SdlPointer::Release(InputEvent event, SdlWindow *window, SDL_MouseButtonEvent const &release) {
    int button = ButtonOf(release.button);
    if ((held & Bit(button)) == 0)
        return; // it was pressed elsewhere, or has been released for it
    SetScreenPlace(window, release.x, release.y);
    ReleaseButton(event, button);
    if (held != 0 || capture != nullptr)
        return;
    EndCapture();
    LeaveIfOutside(event);
}

void SdlPointer::ReleaseButton(InputEvent event, int button) {
    SdlWindow *target = Target(nullptr);
    held &= ~Bit(button);
    event.button = button;
    event.clicks = clicks;
    Send(event, InputEvent::kMouseUp, target);
}

void SdlPointer::ReleaseAll(InputEvent event) {
    for (int button = kFirstButton; button <= kLastButton; ++button)
        if ((held & Bit(button)) != 0)
            ReleaseButton(event, button);
    EndCapture();
}

void SdlPointer::EndCapture() {
    if (held == 0 && capture == nullptr)
        sdlCapture.End();
}

// Up is positive for SDL and for us, right is positive for SDL and left for us.
void SdlPointer::Turn(InputEvent event, SdlWindow *window, SDL_MouseWheelEvent const &wheel) {
    SdlWindow *target = Target(window);
    if (target == nullptr)
        return;
    SetScreenPlace(window, wheel.mouseX, wheel.mouseY);
    event.wheelH = -static_cast<double>(wheel.preciseX);
    event.wheelV = static_cast<double>(wheel.preciseY);
    Send(event, InputEvent::kWheel, target);
}

void SdlPointer::Leave(InputEvent event, SdlWindow *window) {
    if (held != 0 || capture != nullptr || window == nullptr || window != hover)
        return;
    SetScreenPlace(nullptr, 0, 0); // the last move was one to the window's edge, wherever the pointer went
    Send(event, InputEvent::kMouseLeave, hover);
    hover = nullptr;
}

void SdlPointer::Recapture() {
    if (sdlCapture.Holds())
        sdlCapture.Hold();
}

void SdlPointer::Capture(InputEvent event, SdlWindow *window) {
    if (capture == window)
        return;
    capture = window;
    if (window != nullptr) {
        CaptureFor(window);
        return;
    }
    if (held != 0)
        return;
    EndCapture();
    LeaveIfOutside(event);
}

// The press that is still held has the mouse from its first movement on. That of a quick click wants it only
// until the release, which has come already.
void SdlPointer::CaptureFor(SdlWindow *window) {
    bool const isPress = held != 0 ? window == pressWindow : queue.HasRelease(window);
    if (!isPress && !sdlCapture.Holds())
        sdlCapture.Hold();
}

// All that was pressed, though the event of it may not have been taken yet.
bool SdlPointer::HasBeenReleased() { return SDL_GetMouseState(nullptr, nullptr) == 0; }

void SdlPointer::Forget(SdlWindow const *window) {
    if (hover == window)
        hover = nullptr;
    clickCounter.Forget(window);
    if (pressWindow == window) {
        pressWindow = nullptr;
        held = 0;
    }
    if (capture == window)
        capture = nullptr;
    sdlCapture.Forget(window);
    EndCapture();
}
