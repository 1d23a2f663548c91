#include "buttons/BoxSelectPane.h"
#include "buttons/NaturalSize.h"
#include "buttons/PartHelpTag.h"
#include "frame/ResourceReading.h"
#include "host/CompoundPane.h"
#include "host/EventRecordAdapter.h"
#include "host/NamedColors.h"
#include "host/OSPort.h"
#include "host/PaneWatch.h"
#include "host/PortSavers.h"
#include "host/TarnError.h"
#include "host/VelaDrawing.h"
#include "host/glogRec.h"
#include <algorithm>
#include <limits>
#include <memory>
#include <new>

namespace {

short const kFarthest = std::numeric_limits<short>::max();
short const kHelpTagInset = 2;   // pixels off the left and right edge
OS::Size const kCorner(6, 6);    // pixels, of the ellipse that rounds a mark
int const kOutlineStrength = 70; // percent of darkening

bool ReadOneBox(BoxSelectPane *pane, int index) { return pane->ReadOne(static_cast<short>(index)); }
void SetOneBox(BoxSelectPane *pane, int index, bool value) { pane->SetOne(static_cast<short>(index), value); }
bool SetBoxOrigin(BoxSelectPane *pane, int v, int h) {
    pane->SetOrigin(Point{static_cast<short>(v), static_cast<short>(h)});
    return true;
}
void GetBoxOf(BoxSelectPane *pane, btnOneBoxRec *rec) { pane->GetOneBox(rec->index, &rec->box); }
short GetCurrentBox(BoxSelectPane *pane) { return pane->RadGet(); }
void SetCurrentBox(BoxSelectPane *pane, int index) { pane->RadSet(static_cast<short>(index)); }
void InitBoxStatus(BoxSelectPane *pane, bool status) { pane->InitStatus(status); }
void ChangeBoxStatus(BoxSelectPane *pane, bool status) { pane->ChangeStatus(status); }

short EdgeUnder(XMLLib::ContainerItem const &edges, char const *key) {
    return static_cast<short>(edges.GetSIntItemValue(ResourceKey(key)));
}

Rect RectOf(XMLLib::ContainerItem const &edges) {
    return Rect{EdgeUnder(edges, "kTop"), EdgeUnder(edges, "kLeft"), EdgeUnder(edges, "kBottom"),
                EdgeUnder(edges, "kRight")};
}

void Unite(Rect &all, Rect const &rect) {
    all.top = std::min(all.top, rect.top);
    all.left = std::min(all.left, rect.left);
    all.bottom = std::max(all.bottom, rect.bottom);
    all.right = std::max(all.right, rect.right);
}

// What any rectangle but one beyond the right and bottom edge of the plane enlarges.
Rect NothingYet() { return Rect{kFarthest, kFarthest, 0, 0}; }

void MoveBy(Rect &rect, int dh, int dv) {
    VelaDrawing::OffsetRect(&rect, static_cast<short>(dh), static_cast<short>(dv));
}

} // namespace

bool (*btnReadOneBS)(BoxSelectPane *, int) = ReadOneBox;
void (*btnSetOneBS)(BoxSelectPane *, int, bool) = SetOneBox;
bool (*btnSetOriginBS)(BoxSelectPane *, int, int) = SetBoxOrigin;
void (*btnGetOneBox)(BoxSelectPane *, btnOneBoxRec *) = GetBoxOf;
short (*radGetBS)(BoxSelectPane *) = GetCurrentBox;
void (*radSetBS)(BoxSelectPane *, int) = SetCurrentBox;
void (*gbsInitStatus)(BoxSelectPane *, bool) = InitBoxStatus;
void (*gbsChangeStatus)(BoxSelectPane *, bool) = ChangeBoxStatus;

BoxSelectPane *BoxSelectPane::NewBoxSelectPane(glogRec *owner, boxSelResRec *resource) {
    return new (std::nothrow) BoxSelectPane(owner, resource);
}

// By value, as the interface has it. NOLINTBEGIN(performance-unnecessary-value-param)
BoxSelectPane *BoxSelectPane::NewBoxSelectPane(glogRec *owner,
                                               boost::shared_ptr<XMLLib::ContainerItem> item) {
    // NOLINTEND(performance-unnecessary-value-param)
    boxSelResRec resource;
    resource.kind = boxSelResRec::kKind;
    resource.style = static_cast<unsigned char>(item->GetSIntItemValue(ResourceKey("Style")));
    resource.multiple = static_cast<unsigned char>(item->GetSIntItemValue(ResourceKey("Mode")));
    boost::shared_ptr<XMLLib::ContainerItem> const list = item->GetContainerItem(ResourceKey("RectList"));
    resource.numBoxes = static_cast<short>(list->GetNumItems());
    std::unique_ptr<BoxSelectPane> pane(NewBoxSelectPane(owner, &resource));
    if (pane && pane->GetGlog())
        pane->SetBoxes(list);
    return pane.release();
}

BoxSelectPane::BoxSelectPane(glogRec *owner, boxSelResRec *resource)
    : style(kThinFrame)
    , multiple(0)
    , radioValue(0)
    , status(true) {
    if (!GlogPaneInit(owner, 0))
        return;
    boxes.resize(static_cast<std::size_t>(resource->numBoxes), BoxSelectItem());
    style = resource->style;
    multiple = resource->multiple;
    if (!multiple)
        SetNthBoxValue(radioValue, true);
}

void BoxSelectPane::SetBoxes(boost::shared_ptr<XMLLib::ContainerItem> const &list) {
    Rect around = NothingYet();
    for (short i = 0; i < GetNumBoxes(); ++i) {
        boost::shared_ptr<XMLLib::ContainerItem> const edges =
            XMLLib::ContainerFromItem(list->GetNthItem(static_cast<std::size_t>(i)));
        if (!edges)
            FailMemFullError();
        Rect const bounds = RectOf(*edges);
        Unite(around, bounds);
        SetNthBoxBounds(i, bounds);
    }
    // The boxes are in their places already: the pane's own SetBox would move them.
    GlogPane::SetBox(&around);
    SetNaturalSize(*this, around.right - around.left, around.bottom - around.top);
}

BoxSelectItem &BoxSelectPane::Nth(short index) { return boxes[static_cast<std::size_t>(index)]; }

BoxSelectItem const &BoxSelectPane::Nth(short index) const { return boxes[static_cast<std::size_t>(index)]; }

Rect BoxSelectPane::GetNthBoxBounds(short index) const { return Nth(index).bounds; }

void BoxSelectPane::SetNthBoxBounds(short index, Rect const &bounds) { Nth(index).bounds = bounds; }

bool BoxSelectPane::GetNthBoxValue(short index) const { return Nth(index).value; }

void BoxSelectPane::SetNthBoxValue(short index, bool value) { Nth(index).value = value; }

short BoxSelectPane::GetNumBoxes() const { return static_cast<short>(boxes.size()); }

bool BoxSelectPane::ReadOne(short index) { return GetNthBoxValue(index); }

void BoxSelectPane::SetOne(short index, bool value) {
    if (value == GetNthBoxValue(index))
        return;
    SetNthBoxValue(index, value);
    Inval();
    if (Provider<BoxSelectPaneListener>::HasDependents())
        Provider<BoxSelectPaneListener>::BroadcastChange(BoxSelectPaneChangeMsg(this, index, value), nullptr);
}

void BoxSelectPane::RadSet(short index) {
    if (index == radioValue)
        return;
    PaneWatch const self(this);
    SetOne(radioValue, false);
    if (!self.PaneExists())
        return;
    radioValue = index;
    SetOne(index, true);
}

void BoxSelectPane::InitStatus(bool newStatus) { status = newStatus; }

void BoxSelectPane::ChangeStatus(bool newStatus) {
    status = true; // while the pane is invalidated, marks count as shown
    Inval();
    status = newStatus;
}

void BoxSelectPane::GetOneBox(short index, Rect *out) {
    *out = GetNthBoxBounds(index);
    if (!container || !container->UsesLayout())
        return;
    Rect box;
    GetBox(&box);
    MoveBy(*out, box.left, box.top);
}

void BoxSelectPane::SetOrigin(Point origin) {
    Rect box;
    GetBox(&box);
    MoveBy(box, origin.h - box.left, origin.v - box.top);
    SetBox(&box);
}

void BoxSelectPane::AttachHelpTag(short index, LocalizedStrings::HelpTag const *tag) {
    Rect rect;
    GetOneBox(index, &rect);
    VelaDrawing::InsetRect(&rect, kHelpTagInset, 0);
    AttachPartHelpTag(*this, tag, rect);
}

void BoxSelectPane::SetContainer(CompoundPane *newContainer) {
    GlogPane::SetContainer(newContainer);
    if (!newContainer || !newContainer->UsesLayout())
        return;
    Rect around = NothingYet();
    for (BoxSelectItem const &box : boxes)
        Unite(around, box.bounds);
    for (BoxSelectItem &box : boxes)
        MoveBy(box.bounds, -around.left, -around.top);
}

void BoxSelectPane::SetBox(Rect *newBox) {
    if (!IsInLayout()) {
        Rect old;
        GetBox(&old);
        for (short i = static_cast<short>(GetNumBoxes() - 1); i >= 0; --i) {
            Rect bounds;
            GetOneBox(i, &bounds);
            MoveBy(bounds, newBox->left - old.left, newBox->top - old.top);
            SetNthBoxBounds(i, bounds);
        }
    }
    GlogPane::SetBox(newBox);
}

short BoxSelectPane::IndexAt(Point where) {
    for (short i = static_cast<short>(GetNumBoxes() - 1); i >= 0; --i) {
        Rect box;
        GetOneBox(i, &box);
        if (VelaDrawing::PtInRect(where, &box))
            return i;
    }
    return -1;
}

int BoxSelectPane::HandleClick(EventRecordAdapter *event) {
    short const index = IndexAt(event->where);
    if (index < 0)
        return 0;
    if (multiple)
        SetOne(index, !GetNthBoxValue(index));
    else
        RadSet(index);
    return index + 1;
}

void BoxSelectPane::DrawGuts(OSRgn *updateRegion) {
    for (short i = 0; i < GetNumBoxes(); ++i) {
        if (!GetNthBoxValue(i))
            continue;
        Rect box;
        GetOneBox(i, &box);
        if (VelaDrawing::RectInRgn(&box, updateRegion))
            InvertNthBox(i);
    }
}

void BoxSelectPane::InvertNthBox(short index) {
    if (!GetVisibility() || !status)
        return;
    Prepare();
    Rect bounds;
    GetOneBox(index, &bounds);
    OS::RectBase<OS::RectTag> const mark(bounds);
    OSPort *const port = OSPort::GetCurrent();
    switch (style) {
    case kThinFrame:
        port->PenNormal();
        port->FrameRect(mark);
        break;
    case kHighlight:
    case kHighlightToo: {
        port->SetForeColor(kHiliteColor);
        port->PaintRoundRect(mark, kCorner);
        WithDarkenDrawMode const darken(kOutlineStrength, glog->GetStyleSheet(), WithDarkenDrawMode::kMode1);
        port->FrameRoundRect(mark, kCorner);
        break;
    }
    default:
        break;
    }
}
