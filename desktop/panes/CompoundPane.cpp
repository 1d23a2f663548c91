#include "host/CompoundPane.h"
#include "desktop/drawing/Region.h"
#include "desktop/layout/LayoutEngine.h"
#include "desktop/panes/Glog.h"
#include "desktop/panes/PaneAccess.h"
#include "desktop/panes/PaneEvents.h"
#include "host/VelaDrawing.h"
#include <algorithm>
#include <iterator>

namespace {

// The content's coordinates of a point in the container's own.
Point ToContent(CompoundPane &pane, Point p) {
    pane.LocalOffset(&p);
    return p;
}

// A pane whose place depends on where it is asked must not keep a container busy for ever.
int const kMaxRounds = 4;

bool Meet(Rect const &a, Rect const &b) {
    // Without jumps: mostly it is no, but never for the same reason.
    return ((a.left < b.right) & (b.left < a.right) & (a.top < b.bottom) & (b.top < a.bottom)) != 0;
}

GlogPane *TopmostAt(std::vector<GlogPane *> const &subpanes, Point p) {
    for (auto i = subpanes.rbegin(); i != subpanes.rend(); ++i)
        if (PaneAccess::OwnVisibility(**i) && (*i)->Contains(p))
            return *i;
    return nullptr;
}

} // namespace

CompoundPane::CompoundRep::Panes &CompoundPane::CompoundRep::OwnList() {
    if (list.use_count() > 1)
        list = std::make_shared<Panes>(*list);
    return *list;
}

void CompoundPane::CompoundRep::Insert(short index, GlogPane *pane) {
    Panes &panes = OwnList();
    panes.insert(panes.begin() + index, pane);
    ++changes;
    ForgetReaches();
}

void CompoundPane::CompoundRep::Remove(GlogPane *pane) {
    Panes &panes = OwnList();
    auto const found = std::find(panes.rbegin(), panes.rend(), pane);
    if (found != panes.rend())
        panes.erase(std::next(found).base());
    ++changes;
    ForgetReaches();
}

bool CompoundPane::CompoundRep::IsAmong(GlogPane *pane) const {
    return std::find(list->begin(), list->end(), pane) != list->end();
}

// Asking for a place may settle the layout and so move what was asked before.
void CompoundPane::CompoundRep::LearnReaches() {
    for (int round = 0; !reachesKnown && round < kMaxRounds; ++round) {
        reachesKnown = true;
        reaches.assign(list->size(), Rect{0, 0, 0, 0});
        for (std::size_t i = 0; i < list->size() && i < reaches.size(); ++i)
            if (PaneAccess::OwnVisibility(*(*list)[i]))
                reaches[i] = (*list)[i]->GetDrawRectangle();
    }
    auto const isHigher = [](Rect const &below, Rect const &above) {
        return below.top < above.top || below.bottom < above.bottom;
    };
    reachesDescend = std::adjacent_find(reaches.begin(), reaches.end(), [&](Rect const &a, Rect const &b) {
                         return isHigher(b, a);
                     }) == reaches.end();
}

// In rows that lie one below the other, those above and below the area are not even looked at.
CompoundPane::CompoundRep::Panes CompoundPane::CompoundRep::Within(Rect const &area) {
    if (!reachesKnown)
        LearnReaches();
    if (!reachesKnown)
        return *list;
    auto first = reaches.begin(), last = reaches.end();
    if (reachesDescend) {
        first = std::partition_point(first, last, [&](Rect const &r) { return r.bottom <= area.top; });
        last = std::partition_point(first, last, [&](Rect const &r) { return r.top < area.bottom; });
    }
    Panes found;
    for (auto reach = first; reach != last; ++reach)
        if (Meet(*reach, area))
            found.push_back((*list)[static_cast<std::size_t>(reach - reaches.begin())]);
    return found;
}

CompoundPane::CompoundPane()
    : usesLayout(false)
    , compoundRep(new CompoundRep) {
    rep->asContainer = this;
}

CompoundPane::~CompoundPane() {
    // A subpane's destructor takes it out of the list.
    while (!compoundRep->Subpanes().empty())
        delete compoundRep->Subpanes().back();
    if (compoundRep->layout.get())
        LayoutEngine::PaneGone(*compoundRep->layout);
    delete compoundRep;
    rep->asContainer = nullptr;
}

CompoundPane *CompoundPane::CompoundPaneInit(glogRec *glog_, short id) {
    if (!GlogPaneInit(glog_, id))
        return nullptr;
    compoundRep->layout = LayoutEngine::MakeForContainer(this);
    return this;
}

// Subpanes

GlogPane *CompoundPane::Get(short index) const {
    return index >= 0 && index < NumSubpanes() ? compoundRep->Subpanes()[static_cast<std::size_t>(index)]
                                               : nullptr;
}

short CompoundPane::Find(GlogPane *pane) {
    auto found = std::find(compoundRep->Subpanes().begin(), compoundRep->Subpanes().end(), pane);
    return found == compoundRep->Subpanes().end()
               ? short(-1)
               : static_cast<short>(found - compoundRep->Subpanes().begin());
}

short CompoundPane::NumSubpanes() const { return static_cast<short>(compoundRep->Subpanes().size()); }

short CompoundPane::Add(GlogPane *pane, short position) {
    short const index = AddGuts(pane, position);
    if (index < 0)
        return index;
    pane->SetContainer(this);
    pane->ContainmentChanged();
    pane->PanePositionChanged();
    pane->SetActive();
    pane->Inval();
    return index;
}

short CompoundPane::AddGuts(GlogPane *pane, short position) {
    if (!pane || NumSubpanes() == 32767)
        return -1;
    for (CompoundPane *outer = this; outer; outer = outer->container)
        if (outer == pane)
            return -1; // a pane cannot lie in itself
    if (pane->GetLayoutRect().get())
        LayoutEngine::TakeOut(*pane->GetLayoutRect());
    if (PaneAccess::Container(*pane))
        PaneAccess::TakeOut(*pane);
    else if (pane->GetGlog())
        Glog::From(pane->GetGlog()).RemoveItem(pane);
    // Set before the pane is one of the list, so that its destructor would find it.
    PaneAccess::SetContainerField(*pane, this);
    if (pane->GetGlog() != glog)
        PaneAccess::Adopt(*pane, glog);
    short const index = position < 0 || position > NumSubpanes() ? NumSubpanes() : position;
    compoundRep->Insert(index, pane);
    PaneAccess::JoinLayout(*pane);
    if (glog)
        Glog::From(glog).NotePanesAdded();
    return index;
}

void CompoundPane::Del(short index) {
    if (GlogPane *pane = Get(index))
        pane->Inval();
    DelGuts(index, false);
}

void CompoundPane::DelGuts(short index, bool keep) {
    GlogPane *pane = Get(index);
    if (!pane)
        return;
    if (!keep) {
        delete pane;
        return;
    }
    compoundRep->Remove(pane);
    if (pane->GetLayoutRect().get())
        LayoutEngine::TakeOut(*pane->GetLayoutRect());
    PaneAccess::SetContainerField(*pane, nullptr);
}

GlogPane *CompoundPane::FindByID(int id) {
    if (GetID() == id)
        return this;
    for (GlogPane *pane : compoundRep->Subpanes())
        if (GlogPane *found = pane->FindByID(id))
            return found;
    return nullptr;
}

bool CompoundPane::FindGophers(GopherInfo &info) {
    for (GlogPane *pane : compoundRep->Subpanes())
        if (pane->FindGophers(info))
            return true;
    return false;
}

// State that the subpanes share

void CompoundPane::Activate() {
    GlogPane::Activate();
    compoundRep->ForEach(*this, [](GlogPane &pane) { pane.Activate(); });
}

void CompoundPane::Deactivate() {
    GlogPane::Deactivate();
    compoundRep->ForEach(*this, [](GlogPane &pane) { pane.Deactivate(); });
}

// What loses its activation tells of it, and whoever hears that may delete any pane.
void CompoundPane::SetActive() {
    PaneWatch const self(this);
    GlogPane::SetActive();
    if (!self.PaneExists())
        return;
    compoundRep->ForEach(*this, [](GlogPane &pane) { pane.SetActive(); });
}

void CompoundPane::ContainmentChanged() {
    GlogPane::ContainmentChanged();
    compoundRep->ForEach(*this, [](GlogPane &pane) { pane.ContainmentChanged(); });
}

void CompoundPane::PanePositionChanged() {
    GlogPane::PanePositionChanged();
    compoundRep->ForEach(*this, [](GlogPane &pane) { pane.PanePositionChanged(); });
}

void CompoundPane::SetVisibility(unsigned char visible) {
    bool const before = PaneAccess::OwnVisibility(*this);
    GlogPane::SetVisibility(visible);
    if (before != PaneAccess::OwnVisibility(*this))
        ContainerChangedVisibility();
}

void CompoundPane::ContainerChangedVisibility() {
    GlogPane::ContainerChangedVisibility();
    compoundRep->ForEach(*this, [](GlogPane &pane) { pane.ContainerChangedVisibility(); });
}

void CompoundPane::SelectSubpanes(char select) {
    compoundRep->ForEach(*this, [=](GlogPane &pane) { pane.Select(select != 0); });
}

// Bounds and layout

char CompoundPane::Contains(Point p) { return GlogPane::Contains(p); }

void CompoundPane::GetBox(Rect *out) { GlogPane::GetBox(out); }

char CompoundPane::Intersects(Rect *r, char mode) { return GlogPane::Intersects(r, mode); }

void CompoundPane::AutoResize(short dh, short dv) {
    GlogPane::AutoResize(dh, dv);
    compoundRep->ForEach(*this, [=](GlogPane &pane) { pane.AutoResize(dh, dv); });
}

RCPtr<GlogLayoutGroup> CompoundPane::GetLayout() { return compoundRep->layout; }

void CompoundPane::SetUseLayout(bool use) {
    if (use == usesLayout)
        return;
    usesLayout = use;
    compoundRep->ForgetReaches();
    LayoutIsNowInvalid();
}

void CompoundPane::SetSizeToLayout(bool on) {
    if (on == compoundRep->sizesToLayout)
        return;
    compoundRep->sizesToLayout = on;
    LayoutIsNowInvalid();
}

bool CompoundPane::HasFrame() const { return compoundRep->hasFrame; }

void CompoundPane::UpdateLayoutRect() { GlogPane::UpdateLayoutRect(); }

// The places of the subpanes follow the box.
bool CompoundPane::CanUpdateLayoutRect() const { return usesLayout; }

bool CompoundPane::DoesLayoutNeedToBeUpdated() const {
    return usesLayout && GlogPane::DoesLayoutNeedToBeUpdated();
}

void CompoundPane::LayoutIsNowInvalid() { GlogPane::LayoutIsNowInvalid(); }

void CompoundPane::SetLayoutRectHook() { GlogPane::SetLayoutRectHook(); }

// Drawing

void CompoundPane::SetNoErase(char on) { compoundRep->noErase = on != 0; }

void CompoundPane::Erase() { GlogPane::Erase(); }

void CompoundPane::DrawBackgroundGuts(OSRgn *) {}

void CompoundPane::DrawFrame(Rect *r) { VelaDrawing::FrameRect(r); }

void CompoundPane::Flush() {
    if (glog)
        UpdateGlog(glog);
}

void CompoundPane::DrawGuts(OSRgn *region) {
    if (!compoundRep->noErase) {
        Rect const box = GetDrawRectangle();
        VelaDrawing::EraseRect(&box);
    }
    DrawBackgroundGuts(region);
    if (compoundRep->Subpanes().empty())
        return;
    Point const shift = ToContent(*this, {0, 0});
    if (!region) {
        compoundRep->ForEach(*this, [](GlogPane &pane) { PaneAccess::Draw(pane, nullptr); });
        return;
    }
    OSRgn content(*region);
    Region::IntersectRect(content, GetDrawRectangle()); // nothing beyond it is seen
    Region::Translate(content, shift.h, shift.v);
    compoundRep->ForEachOf(*this, compoundRep->Within(Region::Bounds(content)),
                           [&](GlogPane &pane) { PaneAccess::Draw(pane, &content); });
}

// Input

int CompoundPane::HandleClick(EventRecordAdapter *event) {
    EventRecordAdapter inside = *event;
    inside.where = ToContent(*this, event->where);
    PaneWatch const watch(this);
    auto const snapshot = compoundRep->Snapshot();
    unsigned long const changes = compoundRep->changes;
    // What a subpane does not take goes on to those below it.
    for (auto i = snapshot->rbegin(); i != snapshot->rend(); ++i) {
        if (!compoundRep->Has(*i, changes) || !PaneAccess::OwnVisibility(**i) ||
            !(*i)->Contains(inside.where))
            continue;
        EventRecordAdapter record = inside;
        int const value = PaneEvents::Click(**i, record);
        if (value != 0 || !watch.PaneExists())
            return value;
    }
    return 0;
}

int CompoundPane::HandleSecondaryButtonClick(EventRecordAdapter *event) {
    EventRecordAdapter inside = *event;
    inside.where = ToContent(*this, event->where);
    GlogPane *pane = TopmostAt(compoundRep->Subpanes(), inside.where);
    return pane ? PaneEvents::SecondaryClick(*pane, inside) : 0;
}

bool CompoundPane::DispatchCustomEvent(UIEvent *event) {
    PointedEvent *pointed = dynamic_cast<PointedEvent *>(event);
    PaneWatch const watch(this);
    auto const snapshot = compoundRep->Snapshot();
    unsigned long const changes = compoundRep->changes;
    for (auto i = snapshot->rbegin(); i != snapshot->rend(); ++i) {
        if (!compoundRep->Has(*i, changes))
            continue;
        if (!PaneAccess::OwnVisibility(**i) || (pointed && !pointed->LiesIn(**i)))
            continue;
        if ((*i)->DispatchCustomEvent(event) || !watch.PaneExists())
            return true;
    }
    return GlogPane::DispatchCustomEvent(event);
}

char CompoundPane::DispatchCursor(Point p) {
    if (!Contains(p))
        return 0;
    Point const inside = ToContent(*this, p);
    if (GlogPane *pane = TopmostAt(compoundRep->Subpanes(), inside))
        if (pane->DispatchCursor(inside))
            return 1;
    return GlogPane::DispatchCursor(p);
}
