#include "fuzz/storm/Soundness.h"
#include "desktop/drawing/Region.h"
#include "desktop/drawing/Surface.h"
#include "desktop/menus/MenuTracker.h"
#include "desktop/panes/DesktopRep.h"
#include "desktop/panes/Glog.h"
#include "desktop/panes/HostCall.h"
#include "desktop/panes/ModalRun.h"
#include "desktop/panes/PaneAccess.h"
#include "desktop/windows/EventLoop.h"
#include "fuzz/storm/StormWindows.h"
#include "fuzz/support/Require.h"
#include "host/CompoundPane.h"
#include "host/VelaDrawing.h"
#include "lists/EditBoxPane.h"
#include "lists/SelectPane.h"
#include <algorithm>
#include <cstdlib>
#include <vector>

namespace {

typedef std::vector<std::uint32_t> Pixels;

// Where a path with smooth edges is cut by the damage, the edge's shades come out a little differently.
int const kSlightly = 4; // of 255

bool Alike(std::uint32_t a, std::uint32_t b) {
    for (int shift = 0; a != b && shift < 32; shift += 8) {
        if (std::abs(static_cast<int>(a >> shift & 0xFF) - static_cast<int>(b >> shift & 0xFF)) > kSlightly)
            return false;
    }
    return true;
}

Pixels Copy(Surface const &surface) {
    std::size_t const count =
        static_cast<std::size_t>(surface.Width()) * static_cast<std::size_t>(surface.Height());
    return Pixels(surface.Pixels(), surface.Pixels() + count);
}

void RequireAlike(Pixels const &a, Pixels const &b, int width, char const *sentence) {
    if (a == b) // which takes no time
        return;
    auto const fault = std::mismatch(a.begin(), a.end(), b.begin(), Alike);
    if (fault.first == a.end())
        return;
    int const at = static_cast<int>(fault.first - a.begin());
    std::fprintf(stderr, "at device pixel %d, %d: %08x and %08x\n", at % width, at / width, *fault.first,
                 *fault.second);
    Require(false, sentence);
}

std::vector<GlogPane *> Inside(GlogPane &pane) {
    std::vector<GlogPane *> panes;
    CompoundPane *const container = dynamic_cast<CompoundPane *>(&pane);
    for (short i = 0; container && i < container->NumSubpanes(); ++i)
        panes.push_back(container->Get(i));
    return panes;
}

bool Overlap(std::vector<GlogPane *> const &panes) {
    for (std::size_t i = 0; i < panes.size(); ++i) {
        if (!panes[i]->GetVisibility())
            continue;
        Rect const box = panes[i]->GetDrawRectangle();
        for (std::size_t k = 0; k < i; ++k) {
            Rect const other = panes[k]->GetDrawRectangle();
            Rect common;
            if (panes[k]->GetVisibility() && VelaDrawing::SectRect(&box, &other, &common))
                return true;
        }
        if (Overlap(Inside(*panes[i])))
            return true;
    }
    return false;
}

void CheckPane(GlogPane &pane, glogRec *glog, CompoundPane *container) {
    Require(PaneAccess::GlogOf(pane) == glog, "a pane knows its window");
    Require(PaneAccess::Container(pane) == container, "a pane knows its container");
    for (GlogPane *inner : Inside(pane))
        CheckPane(*inner, glog, dynamic_cast<CompoundPane *>(&pane));
}

bool Holds(std::vector<GlogPane *> const &panes, GlogPane *wanted) {
    return std::any_of(panes.begin(), panes.end(),
                       [wanted](GlogPane *pane) { return pane == wanted || Holds(Inside(*pane), wanted); });
}

// A selected pane of this class is filled in an active window only, and leaves it to its next drawing to show
// that the window has become inactive.
bool ShowsItsPast(GlogPane &pane) {
    return dynamic_cast<SelectPane *>(&pane) && !dynamic_cast<EditBoxPane *>(&pane) && pane.IsSelected() &&
           !pane.IsActive();
}

void RedrawThePast(std::vector<GlogPane *> const &panes) {
    for (GlogPane *pane : panes) {
        if (ShowsItsPast(*pane))
            pane->Inval();
        RedrawThePast(Inside(*pane));
    }
}

void CheckPixels(StormDesktop &desktop, Glog &glog) {
    RedrawThePast(glog.Items());
    DesktopRep::Of(desktop).UpdateAll();
    Surface const *const drawn = glog.Pixels();
    if (!drawn || !glog.IsVisible())
        return;
    Surface const *const shown = static_cast<SimulatedWindow *>(glog.Window())->Picture();
    Require(shown != nullptr, "a window that is open shows something");
    Require(shown->Width() == drawn->Width() && shown->Height() == drawn->Height(),
            "a window shows something of its size");
    Pixels const before = Copy(*drawn);
    RequireAlike(Copy(*shown), before, drawn->Width(), "a window shows what was drawn");
    glog.DamageAll();
    DesktopRep::Of(desktop).UpdateAll();
    Require(glog.Pixels() == drawn, "drawing does not resize the window");
    Pixels const after = Copy(*drawn);
    if (before != after && !std::equal(before.begin(), before.end(), after.begin(), Alike))
        std::fprintf(stderr, "%s\n", desktop.DumpTree(&glog).c_str());
    RequireAlike(before, after, drawn->Width(), "a full redraw changes nothing");
}

// All that was damaged has been drawn, and drawing has damaged nothing.
void RequireDrawn(StormDesktop &desktop, Glog &glog) {
    if (!glog.NeedsUpdate())
        return;
    for (Rect const &r : Region::Rects(glog.Port().GetDamage()))
        std::fprintf(stderr, "still to be drawn: top %d, left %d, bottom %d, right %d\n", r.top, r.left,
                     r.bottom, r.right);
    std::fprintf(stderr, "%s\n", desktop.DumpTree(&glog).c_str());
    Require(false, "drawing comes to an end");
}

} // namespace

bool Soundness::PanesOverlap(StormDesktop &desktop) {
    std::vector<Glog *> const &glogs = DesktopRep::Of(desktop).Glogs();
    return std::any_of(glogs.begin(), glogs.end(), [](Glog *glog) { return Overlap(glog->Items()); });
}

void Soundness::Check(StormDesktop &desktop) {
    Require(!HostCall::Running(), "no call into a pane is left open");
    Require(!MenuTracker::Open(), "no menu is left open");
    Require(!ModalRun::Innermost(), "no modal dialog is left running");
    Require(!EventLoop::Instance().IsTracking() || desktop.System().IsMouseDown(),
            "nothing is tracked when the mouse is up");
    for (Glog *glog : DesktopRep::Of(desktop).Glogs()) {
        Require(!glog->disposed, "a window that was closed is gone");
        for (GlogPane *pane : glog->Items())
            CheckPane(*pane, glog, nullptr);
        Require(!glog->GetCurItem() || Holds(glog->Items(), glog->GetCurItem()),
                "the current item is one of the window's");
        DesktopRep::Of(desktop).UpdateAll();
        RequireDrawn(desktop, *glog);
    }
}

void Soundness::CheckDescription(StormDesktop &desktop) {
    for (Glog *glog : DesktopRep::Of(desktop).Glogs())
        Require(!desktop.DumpTree(glog).empty(), "every window can be described");
}

void Soundness::CheckRedraw(StormDesktop &desktop) {
    DesktopRep::Of(desktop).UpdateAll();
    std::vector<Glog *> const glogs = DesktopRep::Of(desktop).Glogs();
    for (Glog *glog : glogs)
        CheckPixels(desktop, *glog);
}
