#include "buttons/GIconPane.h"
#include "buttons/NaturalSize.h"
#include "frame/ResourceReading.h"
#include "host/EnumToStringMap.h"
#include "host/EventRecordAdapter.h"
#include "host/Icons.h"
#include "host/OSRgn.h"
#include <memory>
#include <new>

namespace {

long long const kCanDisable = 1; // the one value of "CanDisable" that means yes

int GetIcon(GIconPane *pane) { return pane->GetIconNum(); }
void SetIcon(GIconPane *pane, int icon) { pane->SetIconNum(static_cast<short>(icon)); }
void SetDecal(GIconPane *pane, GIconPane::DecalProc proc) { pane->SetDecalProc(proc); }
int GetState(GIconPane *pane) { return pane->GetCurState(); }
int GetStates(GIconPane *pane) { return pane->GetNumStates(); }
void SetStates(GIconPane *pane, int states) { pane->SetNumStates(static_cast<short>(states)); }
bool GetEnable(GIconPane *pane) { return pane->GetEnabled(); }

void SetStateWithinRange(GIconPane *pane, int state) {
    int const states = pane->GetNumStates();
    if (state < 0)
        state = 0;
    if (state >= states)
        state = states - 1;
    pane->SetCurState(static_cast<short>(state));
}

void SetEnableAndRepaint(GIconPane *pane, bool enable) {
    pane->SetEnabled(enable);
    pane->Inval();
}

} // namespace

int (*gcIconGetIconNum)(GIconPane *) = GetIcon;
void (*gcIconSetIconNum)(GIconPane *, int) = SetIcon;
void (*gcIconSetDecalProc)(GIconPane *, GIconPane::DecalProc) = SetDecal;
int (*gcStateIconGetCurState)(GIconPane *) = GetState;
void (*gcStateIconSetCurState)(GIconPane *, int) = SetStateWithinRange;
int (*gcStateIconGetNumStates)(GIconPane *) = GetStates;
void (*gcStateIconSetNumStates)(GIconPane *, int) = SetStates;
bool (*gcStateIconGetEnable)(GIconPane *) = GetEnable;
void (*gcStateIconSetEnable)(GIconPane *, bool) = SetEnableAndRepaint;

GIconPane::GIconPane()
    : family(0)
    , icon(0)
    , numStates(0)
    , canDisable(0)
    , curState(0)
    , enabled(1)
    , decalProc(nullptr) {}

GIconPane *GIconPane::NewGIconPane(glogRec *owner, GIconResRec *resource) {
    std::unique_ptr<GIconPane> pane(new (std::nothrow) GIconPane);
    if (!pane || !pane->InitGIconPane(owner, *resource))
        return nullptr;
    return pane.release();
}

// By value, as the interface has it. NOLINTBEGIN(performance-unnecessary-value-param)
GIconPane *GIconPane::NewGIconPane(glogRec *owner, boost::shared_ptr<XMLLib::ContainerItem> item) {
    // NOLINTEND(performance-unnecessary-value-param)
    GIconResRec resource;
    resource.kind = GIconResRec::kKind;
    ReadItem(item, resource);
    return NewGIconPane(owner, &resource);
}

void GIconPane::ReadItem(boost::shared_ptr<XMLLib::ContainerItem> const &item, GIconResRec &resource) {
    Rect const bounds = OptionalRect(item, "BoundsRect");
    resource.top = bounds.top;
    resource.left = bounds.left;
    resource.width = static_cast<short>(bounds.right - bounds.left);
    resource.height = static_cast<short>(bounds.bottom - bounds.top);
    UString const family = item->GetUStringItemValue(ResourceKey("FamilyID"));
    resource.family = static_cast<short>(ISetIDMapper::Instance().GetID(family));
    resource.icon = static_cast<short>(item->GetSIntItemValue(ResourceKey("Num")));
    resource.numStates = static_cast<short>(item->GetSIntItemValue(ResourceKey("NumStates")));
    resource.canDisable = item->GetSIntItemValue(ResourceKey("CanDisable")) == kCanDisable;
}

GIconPane *GIconPane::InitGIconPane(glogRec *owner, GIconResRec &resource) {
    if (!GlogPaneInit(owner, 0))
        return nullptr;
    Rect box;
    box.top = resource.top;
    box.left = resource.left;
    box.bottom = static_cast<short>(resource.top + resource.height);
    box.right = static_cast<short>(resource.left + resource.width);
    SetBox(&box);
    SetNaturalSize(*this, resource.width, resource.height);
    family = resource.family;
    icon = resource.icon;
    numStates = resource.numStates;
    canDisable = resource.canDisable;
    curState = 0;
    enabled = 1;
    decalProc = nullptr;
    return this;
}

void GIconPane::SetFamilyID(short newFamily) { family = newFamily; }

void GIconPane::SetIconNum(short newIcon) { icon = newIcon; }

void GIconPane::SetNumStates(short states) { numStates = states; }

void GIconPane::SetCurState(short state) { curState = state; }

void GIconPane::SetEnabled(short enable) { enabled = enable != 0; }

void GIconPane::SetDecalProc(DecalProc proc) { decalProc = proc; }

// Also a pane that cannot be disabled shows the disabled icon: the flag tells buttons how their icons are
// numbered, and no more.
short GIconPane::ShownIcon() const { return static_cast<short>(icon + (enabled ? curState : numStates)); }

void GIconPane::DrawGuts(OSRgn *) {
    Rect box;
    GetBox(&box);
    Draw1Icon(family, ShownIcon(), box.left, box.top);
    if (decalProc)
        decalProc(glog, box, GetEnabled(), false, this);
}

int GIconPane::HandleClick(EventRecordAdapter *event) {
    OSRgn shape(GetIconRegion(family, ShownIcon()));
    Rect const bounds = GetBounds();
    shape.Offset(bounds.left, bounds.top);
    return shape.Contains(event->where) && enabled ? 1 : 0;
}
