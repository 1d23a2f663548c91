#include "desktop/panes/DesktopRep.h"
#include <algorithm>
#include "desktop/panes/Glog.h"

DesktopRep::DesktopRep(Desktop &desktop, DesktopOptions const &options_, std::unique_ptr<WindowSystem> windows_)
    : options(options_), windows(std::move(windows_)), loop(new EventLoop(desktop, *windows)) {}

DesktopRep::~DesktopRep() {
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
    if (!loop->HandlingEvents())
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

void DesktopRep::UpdateAll() {
    for (std::size_t i = 0; i < glogs.size(); ++i)
        glogs[i]->Update();
}

void DesktopRep::DamageAll() {
    for (Glog *glog : glogs)
        glog->DamageAll();
}

void DesktopRep::Idle() {
    for (std::size_t i = 0; i < glogs.size(); ++i)
        glogs[i]->Idle();
}
