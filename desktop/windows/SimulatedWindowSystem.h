// Windows without a display, time without a clock.
#pragma once
#include "desktop/windows/ClickCounter.h"
#include "desktop/windows/EventScript.h"
#include "desktop/windows/InputState.h"
#include "desktop/windows/SimulatedWindow.h"
#include "desktop/windows/WindowSystem.h"
#include <deque>
#include <functional>
#include <string>
#include <vector>

// Events come from a script. Time stands still but for waits: a wait moves it to the next step of the script
// or to its own end, whichever comes first.
class SimulatedWindowSystem : public WindowSystem {
public:
    explicit SimulatedWindowSystem(double scale);
    ~SimulatedWindowSystem() override;

    void Append(std::vector<ScriptStep> const &);
    // Carries out the steps that are no events (snapshot, dump, menu, print), on the window that scripts act
    // on; null without one.
    typedef std::function<void(ScriptStep const &, PlatformWindow *)> CommandHandler;
    void SetCommandHandler(CommandHandler handler) { commandHandler = std::move(handler); }
    // Answers where in the window a place lies that the step names by an item; throws ScriptError where there
    // is none.
    typedef std::function<Point(ScriptStep const &, PlatformWindow *)> PlaceFinder;
    void SetPlaceFinder(PlaceFinder finder) { placeFinder = std::move(finder); }

    char const *Name() const override { return "simulated"; }
    std::unique_ptr<PlatformWindow> CreateWindow(WindowSpec const &) override;
    bool PlacesPopups() const override { return placesPopups; }
    void SetPlacesPopups(bool on) { placesPopups = on; } // at first it does
    bool WaitEvent(InputEvent &, double timeout, Waiter, char const *what) override;
    bool AtEnd() const override { return steps.empty() && queue.empty(); }
    double Now() const override { return now; }
    bool IsMouseDown() const override { return state.IsMouseDown(); }
    bool IsKeyPressed(int keyCode) const override { return state.IsKeyPressed(keyCode); }
    unsigned short CurrentModifiers() const override { return state.CurrentModifiers(); }
    Point MousePlace(PlatformWindow const &) const override;
    void CaptureMouse(PlatformWindow *window) override { captured = window; }
    void ForceScale(double factor) override;
    void SetCursor(int cursor_) override { cursor = cursor_; }
    std::string GetClipboardText() override { return clipboard; }
    void SetClipboardText(std::string const &text) override { clipboard = text; }
    Rect ScreenBounds() const override;

    int Cursor() const { return cursor; }
    std::vector<SimulatedWindow *> const &Windows() const { return windows; } // in the order of their showing

    // For SimulatedWindow
    void WindowShown(SimulatedWindow *);
    void WindowHidden(SimulatedWindow *);
    void WindowGone(SimulatedWindow *);

private:
    SimulatedWindow *Target() const; // what the script acts on: the window shown last that is no pop-up
    bool Deliver(InputEvent &);
    void Perform(ScriptStep const &);
    void TakePlace(ScriptStep const &);
    void RequireWithin(SimulatedWindow const *, ScriptStep const &) const;
    void Push(InputEvent, ScriptStep const &);
    void PushButton(InputEvent::Kind, int button, int clicks, ScriptStep const &);
    void PushPress(int button, int clicks, ScriptStep const &);
    void PushKey(int key, std::string const &text, ScriptStep const &);
    void Type(ScriptStep const &);
    void Activate(SimulatedWindow *, bool on);

    double now = 0;
    double scale;
    std::deque<ScriptStep> steps;
    double nextStepAt = 0; // when the step at the front is due
    bool stepTimed = false;
    bool moveHeldBack = false; // the next step is a movement that has not happened yet, as somebody was told
    bool placesPopups = true;
    std::deque<InputEvent> queue;
    InputState state;
    ClickCounter clickCounter;
    std::vector<SimulatedWindow *> all;     // hidden ones too
    std::vector<SimulatedWindow *> windows; // the shown ones
    SimulatedWindow *active = nullptr;
    PlatformWindow *captured = nullptr;
    CommandHandler commandHandler;
    PlaceFinder placeFinder;
    std::string clipboard;
    int cursor = Cursors::kArrow;
    int lastH = 0, lastV = 0;
};
