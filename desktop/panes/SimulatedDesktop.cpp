#include "desktop/SimulatedDesktop.h"
#include "desktop/menus/MenuTracker.h"
#include "desktop/panes/DesktopRep.h"
#include "desktop/panes/Glog.h"
#include "desktop/panes/PaneAccess.h"
#include "desktop/windows/SimulatedWindowSystem.h"
#include <cmath>
#include <fstream>

namespace {

SimulatedWindowSystem &SystemOf(Desktop const &desktop) {
    return static_cast<SimulatedWindowSystem &>(const_cast<Desktop &>(desktop).Windows());
}

SimulatedWindow *WindowOf(glogRec *glog) { return static_cast<SimulatedWindow *>(Glog::From(glog).Window()); }

void WriteDump(Desktop &desktop, glogRec *glog, ScriptStep const &step) {
    std::ofstream file(step.text, std::ios::binary);
    file << desktop.DumpTree(glog);
    if (!file.flush())
        throw ScriptError(step.source + ": cannot write " + step.text);
}

// Does what the step says; what goes wrong is the script's error.
template <class Action> void Reported(ScriptStep const &step, Action action) {
    try {
        action();
    } catch (std::exception const &error) {
        throw ScriptError(step.source + ": " + error.what());
    }
}

void AnswerMenu(ScriptStep const &step) {
    MenuTracker *const menu = MenuTracker::Open();
    if (!menu)
        throw ScriptError(step.source + ": no menu is open that could be answered");
    std::string reason;
    if (!menu->Answer(step.path, reason))
        throw ScriptError(step.source + ": " + reason);
}

// The place that the step names, in the window.
Point PlaceInItem(Desktop &desktop, ScriptStep const &step, PlatformWindow *window) {
    std::string const item = "item " + std::to_string(step.item);
    glogRec *const glog = DesktopRep::Of(desktop).GlogOf(window);
    GlogPane *const pane = glog ? GetGlogItem(glog, static_cast<short>(step.item)) : nullptr;
    if (!pane || pane->GetID() != step.item)
        throw ScriptError(step.source + ": there is no " + item + " in the window");
    if (!pane->GetVisibility())
        throw ScriptError(step.source + ": " + item + " is hidden");
    Rect const box = pane->GetDrawRectangle();
    Point const origin = PaneAccess::Origin(*pane);
    int const h = origin.h + box.left + (step.inMiddle ? (box.right - box.left) / 2 : step.h);
    int const v = origin.v + box.top + (step.inMiddle ? (box.bottom - box.top) / 2 : step.v);
    Rect const shown = PaneAccess::VisiblePart(*pane);
    if (h < shown.left || h >= shown.right || v < shown.top || v >= shown.bottom)
        throw ScriptError(step.source + ": this place of " + item + " does not show in the window");
    return {static_cast<short>(v), static_cast<short>(h)};
}

void CarryOut(Desktop &desktop, ScriptStep const &step, PlatformWindow *window) {
    glogRec *const glog = DesktopRep::Of(desktop).GlogOf(window);
    if (!glog)
        throw ScriptError(step.source + ": there is no window");
    switch (step.kind) {
    case ScriptStep::kSnapshot:
        Reported(step, [&] { desktop.Snapshot(glog, step.text); });
        break;
    case ScriptStep::kDump:
        WriteDump(desktop, glog, step);
        break;
    case ScriptStep::kMenu:
        AnswerMenu(step);
        break;
    case ScriptStep::kPrint:
        Reported(step, [&] {
            if (desktop.Print(glog, step.text) == 0)
                throw std::runtime_error("nothing in the window prints");
        });
        break;
    default:
        break;
    }
}

} // namespace

SimulatedDesktop::SimulatedDesktop(DesktopOptions const &options)
    : Desktop(options, std::unique_ptr<WindowSystem>(new SimulatedWindowSystem(options.scale))) {
    SystemOf(*this).SetCommandHandler(
        [this](ScriptStep const &step, PlatformWindow *window) { CarryOut(*this, step, window); });
    SystemOf(*this).SetPlaceFinder(
        [this](ScriptStep const &step, PlatformWindow *window) { return PlaceInItem(*this, step, window); });
}

SimulatedDesktop::~SimulatedDesktop() {}

void SimulatedDesktop::Script(std::string const &steps, std::string const &name) {
    SystemOf(*this).Append(EventScript::Parse(steps, name));
}

void SimulatedDesktop::Play(std::string const &steps) {
    Script(steps);
    Run();
}

double SimulatedDesktop::Now() const { return SystemOf(*this).Now(); }

std::vector<std::string> SimulatedDesktop::TakeMessages() {
    if (!recordsMessages)
        WatchMessages([this](std::string const &line) { messages.push_back(line); });
    recordsMessages = true;
    std::vector<std::string> taken;
    taken.swap(messages);
    return taken;
}

std::vector<std::string> SimulatedDesktop::TakeDrawing() {
    if (!recordsDrawing)
        WatchDrawing([this](std::string const &line) { drawing.push_back(line); });
    recordsDrawing = true;
    std::vector<std::string> taken;
    taken.swap(drawing);
    return taken;
}

Surface const *SimulatedDesktop::Picture(glogRec *glog) const {
    SimulatedWindow *window = WindowOf(glog);
    return window ? window->Picture() : nullptr;
}

std::vector<Rect> SimulatedDesktop::TakePresented(glogRec *glog) {
    std::vector<Rect> taken;
    SimulatedWindow *window = WindowOf(glog);
    if (!window)
        return taken;
    double const scale = window->Scale();
    auto floor = [=](int device) { return static_cast<short>(std::floor(device / scale)); };
    auto ceil = [=](int device) { return static_cast<short>(std::ceil(device / scale)); };
    for (DeviceRect const &r : window->TakePresented())
        taken.push_back({floor(r.top), floor(r.left), ceil(r.bottom), ceil(r.right)});
    return taken;
}
