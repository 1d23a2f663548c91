// What an open desktop consists of.
#pragma once
#include "desktop/Desktop.h"
#include "desktop/windows/EventLoop.h"
#include "desktop/windows/WindowSystem.h"
#include <memory>
#include <string>
#include <vector>

class Glog;
class PlatformWindow;

// The desktop's parts, and all glogs there are.
class DesktopRep {
public:
    DesktopRep(Desktop &, DesktopOptions const &, std::unique_ptr<WindowSystem>);
    ~DesktopRep();
    static DesktopRep &Of(Desktop &desktop) { return *desktop.rep; }

    std::vector<Glog *> const &Glogs() const { return glogs; }
    Glog *GlogOf(PlatformWindow *) const; // null for a window that is none of a glog
    Glog *Front() const;                  // shown last of those that are visible; null without one
    bool AnyVisible() const { return Front() != nullptr; }
    void CameToFront(Glog *);
    void Dispose(Glog *); // at once, or when no event is being handled any more
    void DeleteDisposed();
    void CloseGlogs(); // all of them, before the desktop goes
    void UpdateAll();
    void Idle();
    void DamageAll();

    DesktopOptions options;
    std::unique_ptr<WindowSystem> windows;
    std::unique_ptr<EventLoop> loop;
    std::vector<Glog *> glogs; // owned, in the order of their last showing
    Desktop::HitHandler hitHandler;

private:
    template <class Call> void ForEachGlog(Call);
};
