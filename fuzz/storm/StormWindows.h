// A simulated window system that thinks up its events when they are asked for.
#pragma once
#include "desktop/Desktop.h"
#include "desktop/windows/SimulatedWindowSystem.h"
#include <memory>
#include <vector>

// What comes next: steps of a script, or something that scripts have no step for.
struct StormEvent {
    std::vector<ScriptStep> steps;
    bool isOther = false;
    InputEvent other; // with `isOther`
};

// Where events come from.
class StormSource {
public:
    virtual ~StormSource() {}
    virtual bool HasMore() const = 0;
    // Something for somebody who waits; may be nothing.
    virtual StormEvent Next(WindowSystem::Waiter) = 0;
    // The same when there is no more, for somebody who would wait for ever.
    virtual StormEvent EndOfWait() = 0;
};

// Asks the source whenever its script is empty. So what comes fits what is open just then.
class StormWindows : public SimulatedWindowSystem {
public:
    explicit StormWindows(double scale)
        : SimulatedWindowSystem(scale) {}
    void SetSource(StormSource *newSource) { source = newSource; } // stays the caller's; null: no events

    bool WaitEvent(InputEvent &, double timeout, Waiter, char const *what) override;
    bool AtEnd() const override;

private:
    bool HasMore() const { return source && source->HasMore(); }
    bool Take(StormEvent const &, InputEvent &);

    StormSource *source = nullptr;
};

// A desktop over it.
class StormDesktop : public Desktop {
public:
    explicit StormDesktop(DesktopOptions const &options)
        : Desktop(options, std::make_unique<StormWindows>(options.scale)) {}
    StormWindows &System() { return static_cast<StormWindows &>(Windows()); }
};
