// Real windows, on an X server through SDL.
#pragma once
#include "desktop/windows/InputQueue.h"
#include "desktop/windows/InputState.h"
#include "desktop/windows/SdlCursors.h"
#include "desktop/windows/SdlDisplayScale.h"
#include "desktop/windows/SdlKeyboard.h"
#include "desktop/windows/SdlPointer.h"
#include "desktop/windows/SdlSession.h"
#include "desktop/windows/WindowSystem.h"
#include <cstdint>
#include <vector>

struct SDL_Window;
struct SDL_WindowEvent;
union SDL_Event;
class SdlWindow;

// One at a time. It must outlive its windows. Waiting blocks in the system until something happens; nothing
// is polled.
class SdlWindowSystem : public WindowSystem {
public:
    // `forcedScale` holds for all windows; 0 chooses for each by its display. Throws std::runtime_error when
    // there is no display.
    explicit SdlWindowSystem(double forcedScale = 0);
    ~SdlWindowSystem() override;
    SdlWindowSystem(SdlWindowSystem const &) = delete;
    SdlWindowSystem &operator=(SdlWindowSystem const &) = delete;

    // WindowSystem
    char const *Name() const override { return "SDL"; }
    std::unique_ptr<PlatformWindow> CreateWindow(WindowSpec const &) override;
    // Only X servers let a program say where its windows come.
    bool PlacesPopups() const override;
    bool WaitEvent(InputEvent &, double timeout, Waiter, char const *what) override;
    double Now() const override;
    bool IsMouseDown() const override { return state.IsMouseDown(); }
    bool IsKeyPressed(int keyCode) const override { return state.IsKeyPressed(keyCode); }
    unsigned short CurrentModifiers() const override { return state.CurrentModifiers(); }
    Point MousePlace(PlatformWindow const &) const override;
    void CaptureMouse(PlatformWindow *) override;
    // 0 goes back to the displays'. Every window whose scale changes by it keeps its logical size and gets
    // kScaleChanged.
    void ForceScale(double factor) override;
    void SetCursor(int cursor) override;
    std::string GetClipboardText() override;
    void SetClipboardText(std::string const &utf8) override;
    // Without what panels and docks of the system cover.
    Rect ScreenBounds() const override;

private:
    friend class SdlWindow;
    // For SdlWindow: its life, and the text input that all windows share.
    void Add(SdlWindow *);
    void Remove(SdlWindow *);
    void StartTextInput(SdlWindow *window);
    void StopTextInput(SdlWindow *window);

    SdlWindow *Find(std::uint32_t id) const; // null for none of ours
    SdlWindow *MainWindow() const;           // the active one, else the oldest, else null
    double ScaleOf(int display) const;
    void UpdateScale(SdlWindow *);
    InputEvent Blank() const; // with time and modifiers
    void Send(InputEvent::Kind, SdlWindow *);

    void Pump();
    void Translate(SDL_Event const &);
    void TranslateWindowEvent(SDL_WindowEvent const &);
    void TranslateTextEvent(SDL_Event const &);
    bool TakeEvent(InputEvent &);
    bool Block(double seconds);
    void OpenWaker();

    SdlSession session;
    std::uint64_t const start; // of the clock
    double forcedScale;
    SdlDisplayScale displayScale;
    std::vector<SdlWindow *> windows; // in the order of their making
    InputQueue queue;
    InputState state;
    SdlPointer pointer;
    SdlKeyboard keyboard;
    SdlCursors cursors;
    SDL_Window *waker = nullptr; // see OpenWaker
    bool activationLost = false; // since the last Pump
    bool hasPaused = false;      // since then, and something has come
    double lookedAt = 0;         // time of the last Pump
};
