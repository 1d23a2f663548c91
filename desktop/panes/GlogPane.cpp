#include "host/GlogPane.h"
#include "desktop/drawing/Region.h"
#include "desktop/layout/LayoutEngine.h"
#include "desktop/panes/Glog.h"
#include "desktop/panes/PaneAccess.h"
#include "desktop/panes/PaneEvents.h"
#include "desktop/printing/PrintJob.h"
#include "desktop/resources/DefaultHelpTagHelper.h"
#include "desktop/windows/EventLoop.h"
#include "desktop/windows/HelpTagWindow.h"
#include "host/CompoundPane.h"
#include "host/CustomEventHandler.h"
#include "host/MouseTask.h"
#include "host/PaneWatch.h"
#include "host/Services.h"
#include "host/VelaDrawing.h"

GlogPane::GlogPane()
    : glog(nullptr)
    , container(nullptr)
    , rep(new Rep) {}

GlogPane::~GlogPane() {
    while (rep->watches)
        rep->watches->Watch(nullptr);
    if (container)
        PaneAccess::TakeOut(*this);
    if (glog) {
        Glog::From(glog).RemoveItem(this);
        Glog::From(glog).PaneGone(this);
    }
    for (RCPtr<GlogLayoutRectItem> const &part : rep->subItems)
        LayoutEngine::PaneGone(*part);
    if (rep->layoutItem.get())
        LayoutEngine::PaneGone(*rep->layoutItem);
    delete rep;
}

// Attachment

GlogPane *GlogPane::GlogPaneInit(glogRec *glog_, short id) {
    rep->id = id;
    if (!glog_)
        return nullptr;
    bool const attached = glog == glog_; // a creator may begin with what its base's creator has begun
    glog = glog_;
    rep->layoutItem = LayoutEngine::MakeForPane(this);
    for (RCPtr<GlogLayoutRectItem> const &part : rep->subItems)
        LayoutEngine::Rep(*part).pane = this;
    if (!attached)
        Glog::From(glog).AddItem(this);
    Rect box;
    if (Glog::From(glog).DescribedBox(id, box)) {
        rep->box = box;
        LayoutEngine::Rep(*rep->layoutItem).made = box;
    }
    SetLayoutRectHook();
    return this;
}

void GlogPane::SetGlog(glogRec *glog_) {
    if (glog_ == glog)
        return;
    if (glog)
        Glog::From(glog).RemoveItem(this);
    PaneAccess::Adopt(*this, glog_);
    if (glog_ && !container)
        Glog::From(glog).AddItem(this);
    ContainmentChanged();
    SetActive();
}

glogRec *GlogPane::GetGlog() { return glog; }

void GlogPane::SetContainer(CompoundPane *container_) { container = container_; }

void GlogPane::ContainmentChanged() {}

void GlogPane::GlogItemInit() {}

void GlogPane::CopyPaneAttributes(GlogPane *from) {
    rep->box = from->rep->box;
    rep->visible = from->rep->visible;
    PaneAccess::ForgetReach(*this);
    rep->id = from->rep->id;
}

int GlogPane::GetID() { return rep->id; }

void GlogPane::SetID(int id) { rep->id = id; }

GlogPane *GlogPane::FindByID(int id) { return rep->id == id ? this : nullptr; }

// Bounds

void GlogPane::GetBox(Rect *out) { *out = rep->box; }

Rect GlogPane::GetBounds() const { return rep->box; }

void GlogPane::GetMainDataBox(Rect *out) { GetBox(out); }

Rect GlogPane::GetDrawRectangle() {
    if (IsInLayout())
        return rep->layoutItem->GetBorderRect();
    Rect box;
    GetBox(&box);
    return box;
}

bool GlogPane::CanSetBox() const { return !IsInLayout(); }

void GlogPane::SetBox(Rect *box) {
    Rect const old = rep->box;
    rep->box = *box;
    if (rep->layoutItem.get() && !IsInLayout())
        LayoutEngine::Rep(*rep->layoutItem).made = *box;
    if (old.top == box->top && old.left == box->left && old.bottom == box->bottom && old.right == box->right)
        return;
    PaneAccess::ForgetReach(*this);
    if (CanUpdateLayoutRect())
        LayoutIsNowInvalid();
    short const dh = static_cast<short>((box->right - box->left) - (old.right - old.left));
    short const dv = static_cast<short>((box->bottom - box->top) - (old.bottom - old.top));
    PaneWatch const watch(this); // subpanes that hear of it may do away with it
    PanePositionChanged();
    if (watch.PaneExists() && (dh != 0 || dv != 0))
        PaneAccess::ResizeSubpanes(*this, {dv, dh});
}

void GlogPane::Offset(Point delta) {
    Rect box = rep->box;
    VelaDrawing::OffsetRect(&box, delta.h, delta.v);
    GlogPane::SetBox(&box);
}

void GlogPane::CalcBox() {}

int GlogPane::ItemHeight() {
    Rect box;
    GetBox(&box);
    return box.bottom - box.top;
}

int GlogPane::ItemWidth() {
    Rect box;
    GetBox(&box);
    return box.right - box.left;
}

char GlogPane::Contains(Point p) {
    Rect const box = GetDrawRectangle();
    return VelaDrawing::PtInRect(p, &box);
}

char GlogPane::ContainsForHelp(Point p) { return Contains(p); }

char GlogPane::Intersects(Rect *r, char) {
    Rect const box = GetDrawRectangle();
    return box.left < r->right && r->left < box.right && box.top < r->bottom && r->top < box.bottom;
}

void GlogPane::LocalOffset(Point *p) {
    Rect box;
    GetBox(&box);
    p->h = static_cast<short>(p->h - box.left);
    p->v = static_cast<short>(p->v - box.top);
}

void GlogPane::GlogOffset(Point *p) {
    for (CompoundPane *c = container; c; c = c->container) {
        Point shift{0, 0};
        c->LocalOffset(&shift);
        p->h = static_cast<short>(p->h - shift.h);
        p->v = static_cast<short>(p->v - shift.v);
    }
}

void GlogPane::PanePositionChanged() {}

// A growing window or container takes along the panes in it that grow; those in a layout follow the layout.
void GlogPane::Resize(Point delta) {
    if (IsInLayout() || !rep->layoutItem.get())
        return;
    GlogLayoutItem::Rep::Further const &item = LayoutEngine::Rep(*rep->layoutItem).Rest();
    if (!item.growWidth && !item.growHeight)
        return;
    Rect box = rep->box;
    if (item.growWidth)
        box.right = static_cast<short>(box.right + delta.h);
    if (item.growHeight)
        box.bottom = static_cast<short>(box.bottom + delta.v);
    SetBox(&box);
}

void GlogPane::AutoResize(short, short) {}

// Layout

bool GlogPane::IsInLayout() const { return container && container->UsesLayout(); }

RCPtr<GlogLayoutRectItem> GlogPane::GetLayoutRect() { return rep->layoutItem; }

void GlogPane::UpdateLayoutRect() {
    Rect place = LayoutEngine::Rep(*rep->layoutItem).Rest().place;
    SetBox(&place);
}

// A box that is set from outside changes the layout of what the pane contains, or of the container that
// measures it.
bool GlogPane::CanUpdateLayoutRect() const { return false; }

bool GlogPane::DoesLayoutNeedToBeUpdated() const { return glog && Glog::From(glog).layoutInvalid; }

void GlogPane::LayoutIsNowInvalid() {
    if (glog)
        Glog::From(glog).layoutInvalid = true;
}

void GlogPane::SetLayoutRectHook() {}

void GlogPane::RectOperation(int) {}

int GlogPane::NumLayoutSubItems() const { return static_cast<int>(rep->subItems.size()); }

void GlogPane::UseLayoutSubItemMode() { rep->subItemMode = true; }

void GlogPane::AddLayoutSubItem(RCPtr<GlogLayoutRectItem> item) {
    GlogLayoutItem::Rep &part = LayoutEngine::Rep(*item);
    part.pane = this;
    part.isPart = true;
    rep->subItems.push_back(item);
    if (IsInLayout())
        LayoutIsNowInvalid();
}

// Visibility

void GlogPane::SetVisibility(unsigned char visible) {
    bool const on = visible != 0;
    if (on == rep->visible)
        return;
    rep->visible = on;
    PaneAccess::ForgetReach(*this);
    if (!on)
        HelpTagWindow::HideAny();
    if (IsInLayout())
        LayoutIsNowInvalid();
}

unsigned char GlogPane::GetVisibility() {
    if (!rep->visible)
        return 0;
    for (CompoundPane *c = container; c; c = c->container)
        if (!PaneAccess::OwnVisibility(*c))
            return 0;
    return 1;
}

void GlogPane::Show() {
    if (rep->visible)
        return;
    SetVisibility(1);
    Inval();
}

// The damage has to be made while the pane still counts as visible.
void GlogPane::Hide() {
    if (!rep->visible)
        return;
    Inval();
    SetVisibility(0);
}

void GlogPane::ContainerChangedVisibility() {}

// Drawing

void GlogPane::Inval() {
    PaneAccess::ForgetReach(*this); // a box that is calculated may have changed without a word
    // The first picture is drawn as a whole, so a glog that is being made need not look where its panes lie.
    if (!glog || !Glog::From(glog).Pixels() || !GetVisibility())
        return;
    Rect const part = PaneAccess::VisiblePart(*this);
    Glog::From(glog).DamageWindowRect(part);
}

void GlogPane::Prepare() {
    if (!glog || (PrintJob::Running() && PrintJob::Running()->PrepareFor(*this)))
        return;
    Glog &host = Glog::From(glog);
    DrawingPort &port = host.Port();
    DrawingPort::MakeCurrent(&port);
    Point const origin = PaneAccess::Origin(*this);
    port.SetOrigin(origin.h, origin.v);
    Rect const part = GetVisibility() ? PaneAccess::VisiblePart(*this) : Rect{0, 0, 0, 0};
    OSRgn const *const update = host.UpdateRegion();
    if (!update) {
        port.SetBoundary(part);
        return;
    }
    OSRgn boundary(*update);
    Region::IntersectRect(boundary, part);
    port.SetBoundary(boundary);
}

// Prepare keeps nothing from one call to the next, so there is nothing to force.
void GlogPane::ForceNextPrepare() {}

void GlogPane::PrepareDuringTrackMouse() { Prepare(); }

void GlogPane::Erase() {
    if (!GetVisibility())
        return;
    Prepare();
    Rect const box = GetDrawRectangle();
    VelaDrawing::EraseRect(&box);
}

void GlogPane::ActivateColors() { ClearColors(); }

void GlogPane::GetDrawOptimizationHints(DrawOptimizationHints &) {}

bool GlogPane::Print(PrintMessageRec *) { return false; }

// Activation and focus

void GlogPane::Activate() { rep->active = true; }

void GlogPane::Deactivate() { rep->active = false; }

void GlogPane::SetActive() {
    bool const windowActive = glog && Glog::From(glog).IsActive();
    if (windowActive == rep->active)
        return;
    if (windowActive)
        Activate();
    else
        Deactivate();
}

bool GlogPane::IsActive() const { return rep->active; }

bool GlogPane::IsSelected() const { return rep->selected; }

void GlogPane::SetSelectedFlag(bool selected) { rep->selected = selected; }

void GlogPane::Select(bool select) {
    rep->selected = select;
    if (!select || !glog || !BecomeGopherOnSelect())
        return;
    Glog &host = Glog::From(glog);
    GlogPane *former = host.GetCurItem();
    host.MakeCurrent(this);
    if (former && former != this && former->IsSelected())
        former->Select(false);
}

unsigned char GlogPane::Selectable() { return 0; }

char GlogPane::CanDeselect() { return 1; }

bool GlogPane::BecomeGopherOnSelect() { return false; }

bool GlogPane::FindGophers(GopherInfo &) { return false; }

void GlogPane::ConfirmChangesOnClickAway() {}

// Input

int GlogPane::Key(EventRecordAdapter *) { return 0; }

int GlogPane::Tab(char) { return 3; }

char GlogPane::CanTabIn() { return 0; }

void GlogPane::Error() {}

unsigned char GlogPane::TryMouseControl(Point) { return 0; }

void GlogPane::Idle() {}

int GlogPane::HandleClick(EventRecordAdapter *) { return 0; }

int GlogPane::HandleSecondaryButtonClick(EventRecordAdapter *) { return 0; }

void GlogPane::TrackMouse(MouseTask &task, Point const &start) {
    task.startPoint = start;
    task.trackingResult = MouseTracking::Result(0);
    PaneWatch const self(this);
    PrepareDuringTrackMouse();
    task.MouseTaskBegin();
    Point where = start;
    while (self.PaneExists() && task.MouseIsDragging(where) && self.PaneExists()) {
        PrepareDuringTrackMouse();
        task.MouseTaskContinue(where);
    }
    if (!self.PaneExists())
        return;
    PrepareDuringTrackMouse();
    task.MouseTaskEnd();
}

// Nothing of this desktop makes tasks of the older form, so there is nothing that could be run.
void GlogPane::TrackMouse(OldMouseTask *, Point *) {}

void GlogPane::MultiTaskTrackMouse(std::vector<OldMouseTask *> &, Point *) {}

CustomEventHandler *GlogPane::CanHandleCustomEvent(UIEvent *) { return nullptr; }

bool GlogPane::DispatchCustomEvent(UIEvent *event) {
    CustomEventHandler *handler = CanHandleCustomEvent(event);
    if (!handler)
        return false;
    // A handler has a trivial destructor that is not virtual; the storage alone is given back.
    struct Freed {
        ~Freed() { ::operator delete(handler); }
        CustomEventHandler *handler;
    } const freed{handler};
    return handler->HandleEvent(event);
}

char GlogPane::DispatchCursor(Point p) { return Contains(p) ? AdjustCursorAndDisplayHelp(p) : 0; }

char GlogPane::AdjustCursorAndDisplayHelp(Point) {
    CrsrMain(Cursors::kArrow);
    return 1;
}

// Help tags

void GlogPane::SetHelpTag(LocalizedStrings::HelpTag const *tag) {
    HelpTagWindow::HideAny();
    rep->help.reset(tag ? new DefaultHelpTagHelper(tag) : nullptr);
}

bool GlogPane::GetHelpTagForPoint(Point p, LocalizedStrings::HelpTag const *&tag, Rect &place,
                                  enum OS::Help::Placement &placement, double &delay) {
    return rep->help && rep->help->GetHelpTag(p, tag, place, placement, delay);
}

HelpTagHelper *GlogPane::GetHelpTagHelper() const { return rep->help.get(); }

void GlogPane::SetHelpTagHelper(AutoPtr<HelpTagHelper> helper) {
    HelpTagWindow::HideAny();
    rep->help.reset(helper.release());
}

bool GlogPane::UsesNonVLHelpTagSystem() const { return rep->help != nullptr; }

// Casts

ConsoleControlSet *GlogPane::CastToConsoleControlSet() { return nullptr; }

SelectStringPane *GlogPane::CastToSelectStringPane() { return nullptr; }

ControlItem *GlogPane::CastToControlItem() { return nullptr; }
