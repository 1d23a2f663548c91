#include "desktop/windows/SimulatedWindowSystem.h"
#include "desktop/SimulatedDesktop.h"
#include "desktop/resources/Utf.h"
#include <algorithm>

namespace {
Rect const kScreen{0, 0, 1200, 1920};
Point const kFirstPlace{80, 100}; // of windows that name no place
int const kAsCounted = 0;
} // namespace

SimulatedWindowSystem::SimulatedWindowSystem(double scale_)
    : scale(scale_ > 0 ? scale_ : 1.0) {}

SimulatedWindowSystem::~SimulatedWindowSystem() {}

void SimulatedWindowSystem::Append(std::vector<ScriptStep> const &more) {
    steps.insert(steps.end(), more.begin(), more.end());
}

std::unique_ptr<PlatformWindow> SimulatedWindowSystem::CreateWindow(WindowSpec const &spec) {
    WindowSpec placed = spec;
    if (!spec.placed) {
        placed.h = kFirstPlace.h;
        placed.v = kFirstPlace.v;
    }
    std::unique_ptr<SimulatedWindow> window(new SimulatedWindow(*this, placed, scale));
    all.push_back(window.get());
    return window;
}

void SimulatedWindowSystem::WindowShown(SimulatedWindow *window) {
    windows.push_back(window);
    if (!window->IsPopup())
        Activate(window, true);
}

void SimulatedWindowSystem::WindowHidden(SimulatedWindow *window) {
    windows.erase(std::remove(windows.begin(), windows.end(), window), windows.end());
    if (active == window)
        active = nullptr;
    if (captured == window)
        captured = nullptr;
    queue.erase(
        std::remove_if(queue.begin(), queue.end(), [=](InputEvent const &e) { return e.window == window; }),
        queue.end());
    state.Forget(window);
    if (!window->IsPopup() && !active)
        Activate(Target(), true);
}

void SimulatedWindowSystem::WindowGone(SimulatedWindow *window) {
    all.erase(std::remove(all.begin(), all.end(), window), all.end());
    clickCounter.Forget(window);
    if (std::find(windows.begin(), windows.end(), window) != windows.end())
        WindowHidden(window);
}

SimulatedWindow *SimulatedWindowSystem::Target() const {
    for (auto i = windows.rbegin(); i != windows.rend(); ++i)
        if (!(*i)->IsPopup())
            return *i;
    return nullptr;
}

void SimulatedWindowSystem::Activate(SimulatedWindow *window, bool on) {
    InputEvent event;
    event.time = now;
    if (active && (active == window) != on) {
        event.kind = InputEvent::kDeactivated;
        event.window = active;
        queue.push_back(event);
        active = nullptr;
    }
    if (!on || !window || active == window)
        return;
    active = window;
    event.kind = InputEvent::kActivated;
    event.window = window;
    queue.push_back(event);
}

// Waiting

bool SimulatedWindowSystem::Deliver(InputEvent &event) {
    if (queue.empty())
        return false;
    event = queue.front();
    queue.pop_front();
    state.Take(event);
    return true;
}

bool SimulatedWindowSystem::WaitEvent(InputEvent &event, double timeout, Waiter waiter, char const *what) {
    double const deadline = timeout < 0 ? -1 : now + timeout;
    for (;;) {
        if (Deliver(event))
            return true;
        if (steps.empty()) {
            if ((waiter == Waiter::kTracking || waiter == Waiter::kAsking) && captured) {
                ScriptStep release;
                release.kind = ScriptStep::kRelease;
                Perform(release);
                continue;
            }
            if (deadline < 0 && waiter != Waiter::kMainLoop)
                throw ScriptError(std::string("the script has ended, and nothing can end ") + what);
            if (deadline > now)
                now = deadline;
            return false;
        }
        ScriptStep const step = steps.front();
        // Only once for each movement: who does nothing but ask has to see the end of the script some time.
        if (waiter == Waiter::kAsking && step.kind == ScriptStep::kMove && !moveHeldBack) {
            moveHeldBack = true;
            return false;
        }
        // A pause in the script begins when its turn comes.
        if (!stepTimed) {
            stepTimed = true;
            nextStepAt = now + (step.kind == ScriptStep::kWait ? step.seconds : 0);
        }
        if (deadline >= 0 && nextStepAt > deadline) {
            now = std::max(now, deadline);
            return false;
        }
        now = std::max(now, nextStepAt);
        steps.pop_front();
        stepTimed = false;
        moveHeldBack = false;
        Perform(step);
        // After a step without events the wait's limit may have passed, or the script have ended.
        if (queue.empty() &&
            ((deadline >= 0 && now >= deadline) || (waiter == Waiter::kMainLoop && steps.empty())))
            return false;
    }
}

// Steps

void SimulatedWindowSystem::Push(InputEvent event, ScriptStep const &step) {
    event.window = captured ? captured : Target();
    event.time = now;
    event.modifiers = step.modifiers;
    queue.push_back(event);
}

void SimulatedWindowSystem::PushButton(InputEvent::Kind kind, int button, int clicks,
                                       ScriptStep const &step) {
    InputEvent event;
    event.kind = kind;
    event.h = lastH;
    event.v = lastV;
    event.button = button;
    event.clicks = clicks;
    Push(event, step);
}

// Presses count as a user's would. A click is what the script calls it, however quickly it follows another.
void SimulatedWindowSystem::PushPress(int button, int clicks, ScriptStep const &step) {
    PushButton(InputEvent::kMouseDown, button, clicks, step);
    InputEvent &press = queue.back();
    if (clicks == kAsCounted)
        press.clicks = clickCounter.Count(press);
    else
        clickCounter.Take(press, clicks);
}

void SimulatedWindowSystem::PushKey(int key, std::string const &text, ScriptStep const &step) {
    InputEvent event;
    event.kind = InputEvent::kKeyDown;
    event.key = key;
    event.text = Utf::FromUtf8(text);
    event.h = lastH;
    event.v = lastV;
    Push(event, step);
    event.kind = InputEvent::kKeyUp;
    event.text = UString();
    Push(event, step);
}

// What a key types comes with the key; what no key types comes by itself, as from an input method.
void SimulatedWindowSystem::Type(ScriptStep const &step) {
    for (std::size_t i = 0; i < step.text.size();) {
        unsigned char const lead = static_cast<unsigned char>(step.text[i]);
        std::size_t const length = lead < 0x80 ? 1 : lead < 0xE0 ? 2 : lead < 0xF0 ? 3 : 4;
        std::string const character = step.text.substr(i, length);
        i += length;
        if (length == 1) {
            bool const capital = lead >= 'A' && lead <= 'Z';
            ScriptStep keyStep = step;
            keyStep.modifiers = static_cast<unsigned short>(capital ? Modifiers::kShift : 0);
            PushKey(capital ? lead - 'A' + 'a' : lead, character, keyStep);
        } else {
            InputEvent event;
            event.kind = InputEvent::kTextInput;
            event.text = Utf::FromUtf8(character);
            Push(event, step);
        }
    }
}

// A press where nothing of the program is would go nowhere. The mouse may move there, and pop-ups may lie
// there; steps that are no script's may be anything.
void SimulatedWindowSystem::RequireWithin(SimulatedWindow const *target, ScriptStep const &step) const {
    bool const maybe = step.source.empty() || !target || captured || step.kind == ScriptStep::kMove ||
                       std::any_of(windows.begin(), windows.end(),
                                   [](SimulatedWindow const *window) { return window->IsPopup(); });
    if (maybe || (step.h >= 0 && step.h < target->Width() && step.v >= 0 && step.v < target->Height()))
        return;
    throw ScriptError(step.source + ": " + std::to_string(step.h) + " " + std::to_string(step.v) +
                      " lies outside of the window, which is " + std::to_string(target->Width()) + " by " +
                      std::to_string(target->Height()));
}

// Events count from the window that has captured the mouse, items stand in the one that scripts act on.
void SimulatedWindowSystem::TakePlace(ScriptStep const &step) {
    lastH = step.h;
    lastV = step.v;
    SimulatedWindow *const target = Target();
    if (!step.item || !placeFinder || !target) {
        RequireWithin(target, step);
        return;
    }
    Point const place = placeFinder(step, target);
    Point const from = captured ? captured->ScreenPlace() : target->ScreenPlace();
    lastH = place.h + target->ScreenPlace().h - from.h;
    lastV = place.v + target->ScreenPlace().v - from.v;
}

void SimulatedWindowSystem::Perform(ScriptStep const &step) {
    bool const hasPlace = step.kind <= ScriptStep::kWheel && step.kind != ScriptStep::kRelease;
    if (hasPlace)
        TakePlace(step);
    switch (step.kind) {
    case ScriptStep::kPress:
        PushPress(1, kAsCounted, step);
        break;
    case ScriptStep::kMove:
        PushButton(InputEvent::kMouseMove, 0, 0, step);
        break;
    case ScriptStep::kRelease:
        PushButton(InputEvent::kMouseUp, 1, 1, step);
        break;
    case ScriptStep::kDoubleClick:
        PushPress(1, 1, step);
        PushButton(InputEvent::kMouseUp, 1, 1, step);
        PushPress(1, 2, step);
        PushButton(InputEvent::kMouseUp, 1, 2, step);
        break;
    case ScriptStep::kClick:
        PushPress(1, 1, step);
        PushButton(InputEvent::kMouseUp, 1, 1, step);
        break;
    case ScriptStep::kRightClick:
        PushPress(2, 1, step);
        PushButton(InputEvent::kMouseUp, 2, 1, step);
        break;
    case ScriptStep::kWheel: {
        InputEvent event;
        event.kind = InputEvent::kWheel;
        event.h = lastH;
        event.v = lastV;
        event.wheelH = step.wheelH;
        event.wheelV = step.wheelV;
        Push(event, step);
        break;
    }
    case ScriptStep::kKey: {
        bool const types = step.key >= ' ' && step.key < KeyCodes::kDelete &&
                           !(step.modifiers & (Modifiers::kCommand | Modifiers::kControl));
        PushKey(step.key, types ? std::string(1, static_cast<char>(step.key)) : std::string(), step);
        break;
    }
    case ScriptStep::kType:
        Type(step);
        break;
    case ScriptStep::kCompose: {
        InputEvent event;
        event.kind = InputEvent::kTextEditing;
        event.text = Utf::FromUtf8(step.text);
        event.compositionCaret = step.caret;
        Push(event, step);
        break;
    }
    case ScriptStep::kWait:
        break;
    case ScriptStep::kResize: {
        SimulatedWindow *window = Target();
        if (!window)
            break;
        window->Resize(step.h, step.v);
        InputEvent event;
        event.kind = InputEvent::kResized;
        event.width = window->Width();
        event.height = window->Height();
        Push(event, step);
        queue.back().window = window;
        break;
    }
    case ScriptStep::kActivate:
        Activate(Target(), step.on);
        break;
    case ScriptStep::kMenu:
        if (commandHandler)
            commandHandler(step, Target());
        Push(InputEvent(), step); // the open menu looks up
        break;
    case ScriptStep::kPrint:
    case ScriptStep::kSnapshot:
    case ScriptStep::kDump:
        if (commandHandler)
            commandHandler(step, Target());
        break;
    }
}

Point SimulatedWindowSystem::MousePlace(PlatformWindow const &window) const {
    int h = state.PointerH(), v = state.PointerV();
    if (PlatformWindow const *const over = state.PointerWindow()) {
        h += over->ScreenPlace().h - window.ScreenPlace().h;
        v += over->ScreenPlace().v - window.ScreenPlace().v;
    }
    return {static_cast<short>(v), static_cast<short>(h)};
}

void SimulatedWindowSystem::ForceScale(double factor) {
    scale = factor;
    for (SimulatedWindow *window : all)
        window->SetScaleFactor(scale);
}

Rect SimulatedWindowSystem::ScreenBounds() const { return kScreen; }
