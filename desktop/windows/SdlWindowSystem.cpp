#include "desktop/windows/SdlWindowSystem.h"
#include "desktop/drawing/WholePixels.h"
#include "desktop/windows/SdlScreen.h"
#include "desktop/windows/SdlTimeOfUse.h"
#include "desktop/windows/SdlWindow.h"
#include <SDL.h>
#include <algorithm>
#include <cmath>
#include <cstring>

static double const kMillisecondsPerSecond = 1000.0;
static double const kLongestBlock = 3600.0; // seconds; SDL counts milliseconds in 32 bits
static double const kShortestBlock = 0.001; // seconds
static double const kLongestPause = 0.2;    // seconds
// In seconds. A signal between two pauses, which does not end either, is seen after so long at the latest.
static double const kLongestUnseen = 0.5;
static double const kInputMethodInterval = 0.1; // seconds

SdlWindowSystem::SdlWindowSystem(double forcedScale_)
    : start(SDL_GetPerformanceCounter())
    , forcedScale(forcedScale_)
    , pointer(queue, windows)
    , keyboard(queue) {}

SdlWindowSystem::~SdlWindowSystem() {
    if (waker != nullptr)
        SDL_DestroyWindow(waker);
}

void SdlWindowSystem::ForceScale(double factor) {
    forcedScale = factor;
    for (SdlWindow *window : windows)
        UpdateScale(window);
}

double SdlWindowSystem::ScaleOf(int display) const {
    return forcedScale > 0 ? forcedScale : displayScale.OfDisplay(display);
}

void SdlWindowSystem::UpdateScale(SdlWindow *window) {
    DeviceScale scale(ScaleOf(window->Display()));
    if (scale.Factor() == window->Scale())
        return;
    window->SetScale(scale);
    InputEvent event = Blank();
    event.kind = InputEvent::kScaleChanged;
    event.window = window;
    event.scale = scale.Factor();
    queue.Push(event);
}

std::unique_ptr<PlatformWindow> SdlWindowSystem::CreateWindow(WindowSpec const &spec) {
    SdlWindow *neighbour = spec.owner != nullptr ? static_cast<SdlWindow *>(spec.owner) : MainWindow();
    double scale = ScaleOf(neighbour != nullptr ? neighbour->Display() : 0);
    return std::make_unique<SdlWindow>(*this, spec, DeviceScale(scale));
}

bool SdlWindowSystem::PlacesPopups() const {
    char const *const driver = SDL_GetCurrentVideoDriver();
    return driver != nullptr && std::strcmp(driver, "x11") == 0;
}

void SdlWindowSystem::Add(SdlWindow *window) { windows.push_back(window); }

void SdlWindowSystem::Remove(SdlWindow *window) {
    keyboard.Forget(window);
    pointer.Forget(window);
    queue.Forget(window);
    state.Forget(window);
    windows.erase(std::remove(windows.begin(), windows.end(), window), windows.end());
}

void SdlWindowSystem::StartTextInput(SdlWindow *window) { keyboard.StartTextInput(window); }

void SdlWindowSystem::StopTextInput(SdlWindow *window) { keyboard.StopTextInput(window); }

SdlWindow *SdlWindowSystem::Find(std::uint32_t id) const {
    for (SdlWindow *window : windows)
        if (window->Id() == id)
            return window;
    return nullptr;
}

SdlWindow *SdlWindowSystem::MainWindow() const {
    SDL_Window *active = SDL_GetKeyboardFocus();
    for (SdlWindow *window : windows)
        if (window->Raw() == active)
            return window;
    return windows.empty() ? nullptr : windows.front();
}

double SdlWindowSystem::Now() const {
    return static_cast<double>(SDL_GetPerformanceCounter() - start) /
           static_cast<double>(SDL_GetPerformanceFrequency());
}

InputEvent SdlWindowSystem::Blank() const {
    InputEvent event;
    event.time = Now();
    event.modifiers = keyboard.CurrentModifiers();
    return event;
}

void SdlWindowSystem::Send(InputEvent::Kind kind, SdlWindow *window) {
    InputEvent event = Blank();
    event.kind = kind;
    event.window = window;
    event.width = window->Width();
    event.height = window->Height();
    queue.Push(event);
}

static bool IsLong(double pause) { return pause < 0 || pause >= kLongestPause; }

// The server is asked as seldom as that goes: each look for events is several calls of the system. Before a
// long pause it is asked, so that a signal from before does not wait until that is over.
bool SdlWindowSystem::WaitEvent(InputEvent &event, double timeout, Waiter, char const *) {
    if (queue.HasOnlyLasting() && TakeEvent(event))
        return true;
    double const end = Now() + timeout;
    bool const blocks = timeout < 0 || timeout > kShortestBlock;
    bool mayHaveCome =
        !blocks || IsLong(timeout) || !queue.Empty() || hasPaused || Now() > lookedAt + kLongestUnseen;
    for (;;) {
        if (mayHaveCome)
            Pump();
        if (TakeEvent(event))
            return true;
        double const left = timeout < 0 ? kLongestBlock : end - Now();
        if (!(left > 0)) // also true for what is not a number
            return false;
        mayHaveCome = Block(left) || IsLong(left);
        if (!mayHaveCome && timeout >= 0 && end <= Now())
            return false;
    }
}

bool SdlWindowSystem::TakeEvent(InputEvent &event) {
    while (queue.Pop(event)) {
        state.Take(event);
        if (event.window != nullptr || event.kind == InputEvent::kQuit)
            return true; // without a window it was a release in one that is gone
    }
    return false;
}

// Whether something came. SDL's own wait looks for events first, which for a pause of a moment is more than
// all the rest, and has the server wake it once more for each event that has just woken it.
bool SdlWindowSystem::Block(double seconds) {
    if (windows.empty() && waker == nullptr)
        OpenWaker();
    double longest = keyboard.MustAskInputMethod() ? kInputMethodInterval : kLongestBlock;
    // Rounded up: a rest of less than a millisecond would be waited for without blocking.
    int milliseconds = static_cast<int>(std::ceil(std::min(seconds, longest) * kMillisecondsPerSecond));
    bool const bySdl = keyboard.MustAskInputMethod() || !SdlScreen::CanWait();
    if (!bySdl && !SDL_HasEvents(SDL_FIRSTEVENT, SDL_LASTEVENT)) {
        bool const came = SdlScreen::Wait(milliseconds);
        hasPaused = hasPaused || came;
        return came;
    }
    return SDL_WaitEventTimeout(nullptr, milliseconds) != 0;
}

// SDL blocks only while there is a window of its own, and polls a thousand times a second otherwise.
void SdlWindowSystem::OpenWaker() {
    waker = SDL_CreateWindow("", 0, 0, 1, 1, SDL_WINDOW_HIDDEN);
    SdlScreen::LimitEvents(waker);
}

// Takes over everything that SDL knows, so that moves of the mouse can take each other's place.
void SdlWindowSystem::Pump() {
    hasPaused = false;
    lookedAt = Now();
    SDL_PumpEvents();
    SdlTimeOfUse::Note();
    SDL_Event event;
    while (SDL_PeepEvents(&event, 1, SDL_GETEVENT, SDL_FIRSTEVENT, SDL_LASTEVENT) > 0)
        Translate(event);
    // The activation may have gone to another window of ours, which SDL reports right after the loss.
    if (activationLost && SDL_GetKeyboardFocus() == nullptr)
        pointer.ReleaseAll(Blank());
    activationLost = false;
}

void SdlWindowSystem::Translate(SDL_Event const &event) {
    switch (event.type) {
    case SDL_QUIT: {
        InputEvent quit = Blank();
        quit.kind = InputEvent::kQuit;
        queue.Push(quit);
        break;
    }
    case SDL_WINDOWEVENT:
        TranslateWindowEvent(event.window);
        break;
    case SDL_MOUSEMOTION:
        pointer.Move(Blank(), Find(event.motion.windowID), event.motion);
        break;
    case SDL_MOUSEBUTTONDOWN:
        pointer.Press(Blank(), Find(event.button.windowID), event.button);
        break;
    case SDL_MOUSEBUTTONUP:
        pointer.Release(Blank(), Find(event.button.windowID), event.button);
        break;
    case SDL_MOUSEWHEEL:
        pointer.Turn(Blank(), Find(event.wheel.windowID), event.wheel);
        break;
    case SDL_KEYDOWN:
        keyboard.Press(Blank(), Find(event.key.windowID), event.key);
        break;
    case SDL_KEYUP:
        keyboard.Release(Blank(), Find(event.key.windowID), event.key);
        break;
    default:
        TranslateTextEvent(event);
    }
}

void SdlWindowSystem::TranslateTextEvent(SDL_Event const &event) {
    switch (event.type) {
    case SDL_TEXTINPUT:
        keyboard.CommitText(Blank(), Find(event.text.windowID), event.text.text);
        break;
    case SDL_TEXTEDITING:
        keyboard.EditText(Blank(), Find(event.edit.windowID), event.edit.text, event.edit.start);
        break;
    case SDL_TEXTEDITING_EXT:
        keyboard.EditText(Blank(), Find(event.editExt.windowID), event.editExt.text, event.editExt.start);
        SDL_free(event.editExt.text); // SDL hands it over with the event
        break;
    default:
        break;
    }
}

void SdlWindowSystem::TranslateWindowEvent(SDL_WindowEvent const &event) {
    SdlWindow *window = Find(event.windowID);
    if (window == nullptr)
        return; // events of destroyed windows still arrive
    switch (event.event) {
    case SDL_WINDOWEVENT_EXPOSED:
        window->Lost();
        window->CorrectPlace();
        Send(InputEvent::kExposed, window);
        break;
    case SDL_WINDOWEVENT_MOVED:
        window->CorrectPlace();
        Send(InputEvent::kMoved, window);
        break;
    case SDL_WINDOWEVENT_SIZE_CHANGED:
        if (window->TakeSize())
            Send(InputEvent::kResized, window);
        break;
    case SDL_WINDOWEVENT_DISPLAY_CHANGED:
        UpdateScale(window);
        break;
    case SDL_WINDOWEVENT_LEAVE:
        pointer.Leave(Blank(), window);
        break;
    case SDL_WINDOWEVENT_FOCUS_GAINED:
        Send(InputEvent::kActivated, window);
        pointer.Recapture();
        break;
    case SDL_WINDOWEVENT_FOCUS_LOST:
        Send(InputEvent::kDeactivated, window);
        activationLost = true;
        break;
    case SDL_WINDOWEVENT_CLOSE:
        Send(InputEvent::kCloseRequested, window);
        break;
    default:
        break;
    }
}

Point SdlWindowSystem::MousePlace(PlatformWindow const &asked) const {
    SdlWindow const &window = static_cast<SdlWindow const &>(asked);
    if (state.PointerWindow() == &window)
        return {SaturatedPixel(state.PointerV()), SaturatedPixel(state.PointerH())};
    int x = 0, y = 0;
    SdlScreen::GetMousePlace(x, y);
    return {SaturatedPixel(window.ContentV(y)), SaturatedPixel(window.ContentH(x))};
}

void SdlWindowSystem::CaptureMouse(PlatformWindow *window) {
    pointer.Capture(Blank(), static_cast<SdlWindow *>(window));
}

void SdlWindowSystem::SetCursor(int cursor) {
    SdlWindow *window = MainWindow();
    cursors.Show(cursor, DeviceScale(window != nullptr ? window->Scale() : 1.0));
}

std::string SdlWindowSystem::GetClipboardText() {
    std::unique_ptr<char, void (*)(void *)> text(SDL_GetClipboardText(), SDL_free);
    return text != nullptr ? text.get() : "";
}

void SdlWindowSystem::SetClipboardText(std::string const &utf8) { SDL_SetClipboardText(utf8.c_str()); }

Rect SdlWindowSystem::ScreenBounds() const {
    SdlWindow *window = MainWindow();
    int display = window != nullptr ? window->Display() : 0;
    SDL_Rect bounds = {0, 0, 0, 0};
    if (SDL_GetDisplayUsableBounds(display, &bounds) != 0)
        SDL_GetDisplayBounds(display, &bounds);
    DeviceScale scale(window != nullptr ? window->Scale() : ScaleOf(display));
    return {SaturatedPixel(scale.ToLogical(bounds.y)), SaturatedPixel(scale.ToLogical(bounds.x)),
            SaturatedPixel(scale.ToLogical(bounds.y + bounds.h)),
            SaturatedPixel(scale.ToLogical(bounds.x + bounds.w))};
}
