#include "desktop/panes/PaneAccess.h"
#include "desktop/drawing/Region.h"
#include "desktop/layout/LayoutEngine.h"
#include "desktop/panes/Glog.h"
#include "desktop/panes/PortKeeper.h"
#include "desktop/printing/PrintJob.h"
#include <algorithm>

namespace {

Rect Moved(Rect const &r, Point by) {
    auto add = [](short a, short b) { return static_cast<short>(std::clamp(a + b, -32768, 32767)); };
    return {add(r.top, by.v), add(r.left, by.h), add(r.bottom, by.v), add(r.right, by.h)};
}

Rect Common(Rect const &a, Rect const &b) {
    Rect const r{std::max(a.top, b.top), std::max(a.left, b.left), std::min(a.bottom, b.bottom),
                 std::min(a.right, b.right)};
    return r.bottom <= r.top || r.right <= r.left ? Rect{0, 0, 0, 0} : r;
}

} // namespace

Point PaneAccess::Origin(GlogPane &pane) {
    Point origin{0, 0};
    pane.GlogOffset(&origin);
    return origin;
}

Rect PaneAccess::VisiblePart(GlogPane &pane) {
    Rect part = Moved(pane.GetDrawRectangle(), Origin(pane));
    for (CompoundPane *c = pane.container; c && part.right > part.left; c = c->container)
        part = Common(part, Moved(c->GetDrawRectangle(), Origin(*c)));
    return Common(part, Glog::From(pane.glog).Port().Extent());
}

void PaneAccess::Draw(GlogPane &pane, OSRgn *region) {
    if (!pane.rep->visible || !pane.glog)
        return;
    Rect const reach = pane.GetDrawRectangle();
    if (region && !Region::Touches(*region, reach))
        return;
    Glog &glog = Glog::From(pane.glog);
    PortKeeper keeper(glog.Port());
    GraphicsState plain;
    RGBColor const ground = glog.GetContentColor();
    plain.back = OS::RGBAColor(ground.red / 65535.0, ground.green / 65535.0, ground.blue / 65535.0, 1.0);
    glog.Port().State() = plain;
    pane.Prepare();
    pane.DrawGuts(region);
}

void PaneAccess::ForgetReach(GlogPane &pane) {
    if (pane.container)
        pane.container->compoundRep->ForgetReaches();
}

void PaneAccess::MoveTo(GlogPane &pane, Rect const &box) {
    pane.Inval();
    Rect target = box;
    pane.SetBox(&target);
    pane.Inval();
}

void PaneAccess::PlacedByLayout(GlogPane &pane) {
    Rect const place = LayoutEngine::Rep(*pane.rep->layoutItem).Rest().place;
    Rect const &old = pane.rep->box;
    if (old.top == place.top && old.left == place.left && old.bottom == place.bottom &&
        old.right == place.right)
        return;
    Glog &glog = Glog::From(pane.glog);
    // While the engine works the layout's rectangle is new already; the box still tells where the pane was
    // drawn.
    if (pane.GetVisibility())
        glog.DamageWindowRect(Moved(old, Origin(pane)));
    pane.UpdateLayoutRect();
    pane.Inval();
}

void PaneAccess::ResizeSubpanes(GlogPane &pane, Point delta) {
    CompoundPane *const container = AsContainer(pane);
    if (!container)
        return;
    container->compoundRep->ForEach(*container, [=](GlogPane &inside) { inside.Resize(delta); });
}

void PaneAccess::TakeOut(GlogPane &pane) { pane.container->compoundRep->Remove(&pane); }

void PaneAccess::Adopt(GlogPane &pane, glogRec *glog) {
    if (pane.glog && pane.glog != glog)
        Glog::From(pane.glog).PaneGone(&pane);
    pane.glog = glog;
    if (glog)
        EnsureLayoutItems(pane);
    if (CompoundPane *container = AsContainer(pane))
        for (GlogPane *inside : container->compoundRep->Subpanes())
            Adopt(*inside, glog);
}

void PaneAccess::EnsureLayoutItems(GlogPane &pane) {
    if (!pane.rep->layoutItem.get()) {
        pane.rep->layoutItem = LayoutEngine::MakeForPane(&pane);
        LayoutEngine::Rep(*pane.rep->layoutItem).made = pane.rep->box;
    }
    CompoundPane *const container = AsContainer(pane);
    if (container && !container->compoundRep->layout.get())
        container->compoundRep->layout = LayoutEngine::MakeForContainer(container);
    JoinLayout(pane);
}

void PaneAccess::JoinLayout(GlogPane &pane) {
    if (!pane.container || !pane.container->compoundRep->layout.get() || !pane.rep->layoutItem.get())
        return;
    if (!LayoutEngine::Rep(*pane.rep->layoutItem).Parent())
        LayoutEngine::Append(*pane.container->compoundRep->layout, pane.rep->layoutItem, -1);
}

void PaneAccess::Print(GlogPane &pane, PrintJob &job) {
    if (!pane.rep->visible)
        return;
    PaneWatch const watch(&pane);
    job.Print(pane);
    CompoundPane *const container = watch.PaneExists() ? AsContainer(pane) : nullptr;
    if (container)
        container->compoundRep->ForEach(*container, [&](GlogPane &inside) { Print(inside, job); });
}

void PaneAccess::Idle(GlogPane &pane) {
    if (!pane.rep->visible)
        return;
    CompoundPane *const container = AsContainer(pane);
    for (short i = 0; container && i < container->NumSubpanes(); ++i)
        Idle(*container->Get(i));
    pane.Idle(); // last, since it may delete the pane
}

void PaneAccess::Start(GlogPane &pane) {
    if (!pane.rep->started) {
        pane.rep->started = true;
        pane.PanePositionChanged();
        pane.GlogItemInit();
        pane.SetActive();
    }
    if (CompoundPane *container = AsContainer(pane))
        for (short i = 0; i < container->NumSubpanes(); ++i)
            Start(*container->Get(i));
}
