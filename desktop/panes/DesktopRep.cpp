#include "desktop/panes/DesktopRep.h"
#include "desktop/panes/Glog.h"
#include "desktop/panes/HostCall.h"
#include <algorithm>
#include <boost/container/small_vector.hpp>

namespace {
// A pane that damages itself whenever it is drawn must not keep the program from waiting.
int const kMostUpdateRounds = 4;
std::size_t const kFewGlogs = 16;
} // namespace

DesktopRep::DesktopRep(Desktop &desktop, DesktopOptions const &options_,
                       std::unique_ptr<WindowSystem> windows_)
    : options(options_)
    , windows(std::move(windows_))
    , loop(new EventLoop(desktop, *windows)) {}

DesktopRep::~DesktopRep() {}

void DesktopRep::CloseGlogs() {
    HostCall const call; // so that what a pane disposes of while it dies waits for its turn here
    while (!glogs.empty()) {
        Glog *const last = glogs.back();
        glogs.pop_back();
        delete last;
    }
}

Glog *DesktopRep::GlogOf(PlatformWindow *window) const {
    for (Glog *glog : glogs)
        if (window && glog->Window() == window)
            return glog;
    return nullptr;
}

Glog *DesktopRep::Front() const {
    for (auto i = glogs.rbegin(); i != glogs.rend(); ++i)
        if ((*i)->IsVisible() && !(*i)->disposed)
            return *i;
    return nullptr;
}

void DesktopRep::CameToFront(Glog *glog) {
    auto found = std::find(glogs.begin(), glogs.end(), glog);
    if (found != glogs.end())
        std::rotate(found, found + 1, glogs.end());
}

void DesktopRep::Dispose(Glog *glog) {
    if (std::find(glogs.begin(), glogs.end(), glog) == glogs.end() || glog->disposed)
        return;
    glog->disposed = true;
    glog->Hide();
    if (!HostCall::Running())
        DeleteDisposed();
}

void DesktopRep::DeleteDisposed() {
    for (std::size_t i = 0; i < glogs.size();) {
        Glog *const glog = glogs[i];
        if (!glog->disposed) {
            ++i;
            continue;
        }
        glogs.erase(glogs.begin() + static_cast<std::ptrdiff_t>(i));
        delete glog;
        i = 0; // a pane's destructor may have disposed of another one
    }
    // As long as there is a glog, some port is current.
    if (!DrawingPort::CurrentPort() && !glogs.empty())
        DrawingPort::MakeCurrent(&glogs.back()->Port());
}

// Calls for all that there are now and still are when it is their turn: glogs may be shown, hidden, brought
// to the front or deleted meanwhile. Between any two events it is done twice, so that it takes no memory.
template <class Call> void DesktopRep::ForEachGlog(Call call) {
    boost::container::small_vector<Glog *, kFewGlogs> const snapshot(glogs.begin(), glogs.end());
    for (Glog *glog : snapshot)
        if (std::find(glogs.begin(), glogs.end(), glog) != glogs.end())
            call(*glog);
}

void DesktopRep::UpdateAll() {
    // Drawing may damage again.
    for (int round = 0; round < kMostUpdateRounds; ++round) {
        ForEachGlog([](Glog &glog) { glog.Update(); });
        if (std::none_of(glogs.begin(), glogs.end(), [](Glog *glog) { return glog->NeedsUpdate(); }))
            return;
    }
}

void DesktopRep::DamageAll() {
    for (Glog *glog : glogs)
        glog->DamageAll();
}

void DesktopRep::Idle() {
    ForEachGlog([](Glog &glog) { glog.Idle(); });
}
