#include "desktop/panes/Glog.h"
#include "desktop/drawing/PixelOverlay.h"
#include "desktop/drawing/Region.h"
#include "desktop/drawing/ThemeColors.h"
#include "desktop/editing/KeyEvent.h"
#include "desktop/editing/TextEditor.h"
#include "desktop/editing/TextFocus.h"
#include "desktop/layout/LayoutEngine.h"
#include "desktop/menus/MenuTracker.h"
#include "desktop/panes/DesktopRep.h"
#include "desktop/panes/EventRecords.h"
#include "desktop/panes/HostCall.h"
#include "desktop/panes/ModalRun.h"
#include "desktop/panes/PaneAccess.h"
#include "desktop/panes/PaneEvents.h"
#include "desktop/panes/PortKeeper.h"
#include "desktop/windows/HelpTagWindow.h"
#include "host/CompoundPane.h"
#include "host/EditCommands.h"
#include "host/NamedColors.h"
#include "host/PaneWatch.h"
#include "host/PortSavers.h"
#include "host/Services.h"
#include <algorithm>
#include <deque>
#include <list>
#include <new>

namespace {

int const kMaxSide = 16000;

// What Key answers when the pane counts as hit.
int const kHitByModifying = 2;
// With these the tab key does not move on to another pane.
unsigned short const kTabModifiers = Modifiers::kCommand | Modifiers::kControl | Modifiers::kOption;

OS::RGBAColor ToRGBA(RGBColor const &c) {
    return OS::RGBAColor(c.red / 65535.0, c.green / 65535.0, c.blue / 65535.0, 1.0);
}

short Coordinate16(int value) { return static_cast<short>(std::clamp(value, -32768, 32767)); }

} // namespace

Glog::Glog(Desktop &desktop_, GlogOptions const &options_)
    : desktop(desktop_)
    , options(options_)
    , width(std::clamp(options_.width, 1, kMaxSide))
    , height(std::clamp(options_.height, 1, kMaxSide)) {
    port.SetExtent(width, height);
    port.SetScreenPlace([this] { return window ? window->ScreenPlace() : Point{0, 0}; });
    // Panes measure text while they are being made, before anything is prepared or drawn.
    if (!DrawingPort::CurrentPort())
        DrawingPort::MakeCurrent(&port);
    DamageAll();
}

Glog::~Glog() {
    HostCall const call;
    if (window)
        TellClosing();
    current = nullptr;
    while (!items.empty())
        delete items.back();
    if (DrawingPort::CurrentPort() == &port)
        DrawingPort::MakeCurrent(nullptr);
    if (EventLoop *loop = EventLoop::Open())
        loop->WindowGone(window.get());
}

// A pane that leaves its glog because the window closes would be nobody's: it goes all the same.
void Glog::TellClosing() {
    struct Owned {
        explicit Owned(GlogPane *pane_)
            : pane(pane_)
            , watch(pane_) {}
        GlogPane *pane;
        PaneWatch const watch;
    };
    std::list<Owned> before;
    try {
        for (GlogPane *pane : items)
            before.emplace_back(pane);
    } catch (std::bad_alloc const &) {
        // The window closes without memory, too; only such panes are lost then.
    }
    Tell(&TarnOSWindow::OSWindow_PlatformWindowListener::PlatformWindow_Closing);
    for (Owned const &owned : before)
        if (owned.watch.PaneExists() && !owned.pane->GetGlog() && !PaneAccess::Container(*owned.pane))
            delete owned.pane;
}

void Glog::Tell(void (TarnOSWindow::OSWindow_PlatformWindowListener::*what)(TarnOSWindow::OSWindow &)) {
    typedef TarnOSWindow::OSWindow_PlatformWindowListener Listener;
    class WindowMsg : public DependentCastMessenger<Listener> {
    public:
        WindowMsg(Glog &glog_, void (Listener::*what_)(OSWindow &))
            : glog(glog_)
            , what(what_) {}
        void BroadcastChange(Listener *listener) override { (listener->*what)(glog); }

    private:
        Glog &glog;
        void (Listener::*what)(OSWindow &);
    };
    if (Provider<Listener>::HasDependents())
        Provider<Listener>::BroadcastChange(WindowMsg(*this, what), nullptr);
}

RGBColor Glog::GetContentColor() { return kWindowBackgroundColor; }

// Panes

void Glog::AddItem(GlogPane *pane) {
    items.push_back(pane);
    ++itemChanges;
    NotePanesAdded();
}

void Glog::RemoveItem(GlogPane *pane) {
    // From the end: a window that closes deletes its panes from there.
    auto const found = std::find(items.rbegin(), items.rend(), pane);
    if (found != items.rend())
        items.erase(std::next(found).base());
    ++itemChanges;
}

bool Glog::HasItem(GlogPane *pane) const {
    return std::find(items.begin(), items.end(), pane) != items.end();
}

template <class Operation> void Glog::ForEachItem(Operation operation) {
    std::vector<GlogPane *> const snapshot = items;
    unsigned long const changes = itemChanges;
    for (GlogPane *pane : snapshot)
        if (itemChanges == changes ||
            HasItem(pane)) // looking up each of them takes longer than most operations
            operation(*pane);
}

void Glog::PaneGone(GlogPane *pane) {
    if (current == pane)
        current = nullptr;
    HelpTagWindow::HideAny();
}

bool Glog::DescribedBox(int id, Rect &box) const {
    auto found = described.find(id);
    if (found == described.end())
        return false;
    box = found->second;
    return true;
}

void Glog::StartPanes() {
    HostCall const call;
    started = true;
    hasNewPanes = false;
    LayoutEngine::Settle(this);
    for (std::size_t i = 0; i < items.size(); ++i)
        PaneAccess::Start(*items[i]);
}

void Glog::SetCurItem(GlogPane *pane) {
    HostCall const call;
    GlogPane *const former = current;
    if (former && former != pane && former->IsSelected()) {
        PaneWatch const next(pane);
        former->Select(false);
        if (pane && !next.PaneExists())
            pane = nullptr;
    }
    current = pane;
    if (pane && !pane->IsSelected())
        pane->Select(true);
}

void Glog::NoteHit(int item) {
    if (hitNoted)
        return;
    hitNoted = true;
    hitItem = item;
}

// Window

void Glog::SetMinSize(int w, int h) {
    minWidth = std::clamp(w, 0, kMaxSide);
    minHeight = std::clamp(h, 0, kMaxSide);
    if (window)
        window->SetSizeLimits(minWidth, minHeight, maxWidth, maxHeight);
}

void Glog::SetMaxSize(int w, int h) {
    maxWidth = std::clamp(w, 0, kMaxSide);
    maxHeight = std::clamp(h, 0, kMaxSide);
    if (window)
        window->SetSizeLimits(minWidth, minHeight, maxWidth, maxHeight);
}

void Glog::MakeSurface() {
    port.SetSurface(nullptr, scale);
    surface.reset(new Surface(scale.Edge(width), scale.Edge(height)));
    port.SetSurface(surface.get(), scale);
    port.SetExtent(width, height);
    DamageAll();
}

void Glog::Show() {
    if (shown || disposed)
        return;
    HostCall const call;
    if (!started)
        StartPanes();
    DesktopRep &rep = DesktopRep::Of(desktop);
    bool const again = window != nullptr;
    if (!again) {
        WindowSpec spec;
        spec.title = options.title;
        spec.width = width;
        spec.height = height;
        spec.resizable = options.growable;
        spec.popup = options.popup;
        spec.placed = placed;
        spec.h = screenPlace.left;
        spec.v = screenPlace.top;
        window = rep.windows->CreateWindow(spec);
        window->SetSizeLimits(minWidth, minHeight, maxWidth, maxHeight);
        scale = DeviceScale(window->Scale());
        MakeSurface();
        Tell(&TarnOSWindow::OSWindow_PlatformWindowListener::PlatformWindow_Opened);
        if (disposed)
            return;
    }
    shown = true;
    if (!options.popup)
        rep.CameToFront(this);
    Update();
    if (again)
        PresentAll(); // a window that is hidden loses what it showed
    if (EventLoop *loop = options.popup ? nullptr : EventLoop::Open())
        loop->WindowShown(window.get());
    window->Show();
}

void Glog::Hide() {
    if (!shown)
        return;
    HostCall const call;
    shown = false;
    if (EventLoop *loop = EventLoop::Open())
        loop->WindowHidden(window.get());
    window->Hide();
    if (active)
        Activation(false);
}

void Glog::Place(Rect const &screen) {
    screenPlace = screen;
    placed = true;
    int const w = std::clamp(screen.right - screen.left, 1, kMaxSide);
    int const h = std::clamp(screen.bottom - screen.top, 1, kMaxSide);
    if (window) {
        window->SetPlace(screen.left, screen.top);
        if (w != width || h != height)
            window->SetContentSize(w, h);
    }
    Resized(w, h);
}

void Glog::Resized(int w, int h) {
    w = std::clamp(w, 1, kMaxSide);
    h = std::clamp(h, 1, kMaxSide);
    if (w == width && h == height)
        return;
    HostCall const call;
    Point const delta{Coordinate16(h - height), Coordinate16(w - width)};
    width = w;
    height = h;
    if (surface)
        MakeSurface();
    port.SetExtent(width, height);
    ForEachItem([&](GlogPane &pane) { pane.Resize(delta); });
    resizedInClick = true;
    DamageAll();
}

void Glog::SetScale(DeviceScale scale_) {
    if (scale_.Factor() == scale.Factor())
        return;
    scale = scale_;
    if (surface)
        MakeSurface();
}

// Drawing

void Glog::DamageAll() { DamageWindowRect({0, 0, Coordinate16(height), Coordinate16(width)}); }

void Glog::DamageWindowRect(Rect const &r) { port.DamageWindow(r); }

void Glog::Update() {
    if (makings > 0)
        return;
    if (started && hasNewPanes)
        StartPanes();
    if (!shown || !surface || updateRegion)
        return;
    HostCall const call;
    LayoutEngine::Settle(this);
    if (!outline.HasChanged() && !port.HasWork())
        return; // as after most events
    std::vector<DeviceRect> shownBoxes = outline.TakeChanged(scale);
    MoveShown(!shownBoxes.empty());
    for (DeviceRect const &box : port.TakeTouched())
        shownBoxes.push_back(box);
    OSRgn region = port.TakeDamage();
    Region::IntersectRect(region, port.Extent());
    if (!Region::IsEmpty(region)) {
        DrawDamage(region);
        port.TakeTouched(); // lies within the region
        for (Rect const &r : Region::Rects(region))
            shownBoxes.push_back(scale.ToDevice(r.left, r.top, r.right, r.bottom));
    }
    if (!shownBoxes.empty())
        Present(shownBoxes);
}

bool Glog::NeedsUpdate() const {
    return shown && makings == 0 && (layoutInvalid || !Region::IsEmpty(port.GetDamage()));
}

DeviceRect Glog::DeviceBounds(OSRgn const &region) const {
    Rect const bounds = Region::Bounds(region);
    return scale.ToDevice(bounds.left, bounds.top, bounds.right, bounds.bottom);
}

// All that was drawn is in the surface itself, and what comes next goes there: after an update, or for
// whoever looks at the pixels in the middle of one.
void Glog::CompleteSurface() {
    port.FinishGround();
    if (surface && port.GetSurface() != surface.get())
        port.ExchangeSurface(*surface);
}

void Glog::DrawDamage(OSRgn const &region) {
    // The region is the glog's for the time of the update. When a pane throws, what it left undrawn stays
    // damaged.
    struct Updating {
        Updating(Glog &glog_, OSRgn const &region_)
            : glog(glog_) {
            glog.updateRegion = &region_;
        }
        ~Updating() {
            glog.CompleteSurface();
            if (!done)
                glog.port.DamageWindow(*glog.updateRegion);
            glog.updateRegion = nullptr;
        }
        Glog &glog;
        bool done = false;
        std::unique_ptr<Surface> part; // null when the surface itself is drawn on
    };
    PortKeeper const keeper(port);
    Updating updating(*this, region);
    updating.part = surface->PartOf(DeviceBounds(region));
    port.SetOrigin(0, 0);
    port.SetBoundary(region);
    if (updating.part)
        port.ExchangeSurface(*updating.part);
    port.LayGround(ToRGBA(GetContentColor()));
    OSRgn local(region);
    ForEachItem([&](GlogPane &pane) { PaneAccess::Draw(pane, &local); });
    updating.done = true;
}

// What lies over the window's pixels does not move with them.
void Glog::MoveShown(bool outlineChanged) {
    if (outlineChanged || outline.Shown() || !MenuTracker::DrawnOver(*this).empty())
        return;
    std::optional<PixelMove> const move = port.TakeMove();
    if (move && !window->Move(*move))
        port.Touch(move->to);
}

void Glog::Present(std::vector<DeviceRect> const &rects) {
    CompleteSurface();
    std::vector<PixelOverlay> const menus = MenuTracker::DrawnOver(*this);
    WithOutline const outlined(*surface, scale, outline);
    WithOverlays const covered(*surface, menus);
    window->Present(*surface, rects.data(), rects.size());
    surface->AllowScrolling(window->CanMove());
}

void Glog::PresentAll() {
    if (!shown || !surface)
        return;
    port.TakeMove(); // shown with the rest
    Present({{0, 0, surface->Width(), surface->Height()}});
}

void Glog::PresentPart(Rect const &part) {
    if (!shown || !surface)
        return;
    // What the part is to show has moved already, so what is shown can no longer be.
    if (std::optional<PixelMove> const move = port.TakeMove())
        port.Touch(move->to);
    Present({scale.ToDevice(part.left, part.top, part.right, part.bottom)});
}

bool Glog::WritePng(std::string const &path, std::string &error) {
    if (!surface) {
        error = path + ": its window has not been shown";
        return false;
    }
    Update();
    CompleteSurface();
    WithOutline const outlined(*surface, scale, outline);
    WithOverlays const menus(*surface, MenuTracker::OpenOver(*this));
    return surface->WritePng(path, error);
}

void Glog::Print(PrintJob &job) {
    HostCall const call;
    if (!started || hasNewPanes)
        StartPanes();
    LayoutEngine::Settle(this);
    ForEachItem([&](GlogPane &pane) { PaneAccess::Print(pane, job); });
}

// Events

GlogPane *Glog::TopmostAt(Point p) const {
    for (auto i = items.rbegin(); i != items.rend(); ++i)
        if (PaneAccess::OwnVisibility(**i) && (*i)->Contains(p))
            return *i;
    return nullptr;
}

void Glog::ReportHit(int value) {
    if (ModalRun *const modal = ModalRun::Innermost(); modal && modal->NoteHit(*this, hitItem, value))
        return;
    Desktop::HitHandler const handler = DesktopRep::Of(desktop).hitHandler;
    if (handler)
        handler(this, hitItem, value);
}

void Glog::Click(InputEvent const &event) {
    HostCall const call;
    EventRecordAdapter record = EventRecords::Of(event);
    GlogPane *const pane = TopmostAt(record.where);
    if (current && current != pane && current->GetVisibility()) {
        Point const origin = PaneAccess::Origin(*current);
        Point const inside{Coordinate16(record.where.v - origin.v), Coordinate16(record.where.h - origin.h)};
        if (!current->Contains(inside))
            PaneAccess::ConfirmChanges(*current);
    }
    // The confirmation can have changed everything.
    if (!pane || !HasItem(pane))
        return;
    // A nested loop may handle further clicks in this glog; each has its own hit.
    struct OwnHit {
        explicit OwnHit(Glog &glog_)
            : glog(glog_)
            , item(glog.hitItem)
            , noted(glog.hitNoted) {
            glog.hitNoted = false;
        }
        ~OwnHit() {
            glog.hitItem = item;
            glog.hitNoted = noted;
        }
        Glog &glog;
        int item;
        bool noted;
    } const ownHit(*this);
    resizedInClick = false;
    int const value = event.button == 1   ? ClickFrom(*pane, record)
                      : event.button == 2 ? PaneEvents::SecondaryClick(*pane, record)
                                          : 0;
    if (disposed)
        return;
    // While it follows the mouse a pane draws by the clip that it saved before, wherever it lies by then.
    if (resizedInClick)
        DamageAll();
    if (value == 0 && event.button == 1 && HasItem(pane))
        pane->TryMouseControl(record.where);
    if (value < 0 && event.button == 1 && IsGrowCorner(record.where))
        GrowByDragging(record.where);
    if (value > 0)
        ReportHit(value);
}

// What a pane does not take goes on to those below it.
int Glog::ClickFrom(GlogPane &topmost, EventRecordAdapter const &record) {
    std::vector<GlogPane *> const snapshot = items;
    auto at = std::find(snapshot.rbegin(), snapshot.rend(), &topmost);
    for (; at != snapshot.rend() && !disposed; ++at) {
        if (!HasItem(*at) || !PaneAccess::OwnVisibility(**at) || !(*at)->Contains(record.where))
            continue;
        EventRecordAdapter copy = record;
        if (int const value = PaneEvents::Click(**at, copy))
            return value;
    }
    return 0;
}

// A pane in the corner that has taken the press and has not followed the mouse is a grow box.
bool Glog::IsGrowCorner(Point p) const {
    constexpr int kCornerSide = 15;
    return options.growable && OS::Services::ShowsGrowBoxes() && p.h >= width - kCornerSide &&
           p.v >= height - kCornerSide && EventLoop::Instance().HeldWindow() == window.get();
}

void Glog::GrowByDragging(Point start) {
    constexpr double kNoLimit = -1;
    int const startWidth = width, startHeight = height;
    Point place = start;
    double when = 0;
    bool timedOut = false;
    while (!disposed && window && EventLoop::Instance().NextDragPoint(kNoLimit, place, when, timedOut))
        GrowTo(startWidth + place.h - start.h, startHeight + place.v - start.v);
}

void Glog::GrowTo(int newWidth, int newHeight) {
    auto const limited = [](int size, int least, int greatest) {
        return std::clamp(size, std::max(least, 1), greatest > 0 ? std::max(greatest, least) : kMaxSide);
    };
    newWidth = limited(newWidth, minWidth, maxWidth);
    newHeight = limited(newHeight, minHeight, maxHeight);
    if (newWidth == width && newHeight == height)
        return;
    window->SetContentSize(newWidth, newHeight);
    Resized(newWidth, newHeight);
    Update();
}

bool Glog::DispatchKey(EventRecordAdapter &record, InputEvent const &event) {
    if (event.key == KeyCodes::kTab && !(event.modifiers & kTabModifiers))
        return OfferTab(event.modifiers & Modifiers::kShift ? -1 : 1);
    if (!current)
        return false;
    GlogPane *const pane = current;
    int const id = pane->GetID();
    int const value = PaneEvents::Key(*pane, record);
    if (value == kHitByModifying && !disposed) {
        hitItem = id;
        ReportHit(value);
    }
    return value != 0;
}

// What an active text does not take is the current item's.
bool Glog::KeyDown(InputEvent const &event) {
    HostCall const call;
    KeyEvent record;
    EventRecords::Fill(record, event);
    record.text = event.text;
    if (RunEditCommand(event))
        return true;
    TextEditor *const text = TextFocus::Of(*this);
    bool const movesOn = event.key == KeyCodes::kTab && !(event.modifiers & kTabModifiers);
    return (text && !movesOn && text->TakeKey(record)) || DispatchKey(record, event);
}

// The shortcuts of editing reach whichever pane has the keyboard, if it knows them.
bool Glog::RunEditCommand(InputEvent const &event) {
    CommandSpecifier const command = EditCommands::OfKey(event.key, event.modifiers);
    if (command.classID == 0 || !current)
        return false;
    int const id = current->GetID();
    bool commits = false;
    if (!EditCommands::Run(this, command, commits))
        return false;
    if (commits && !disposed) {
        hitItem = id;
        ReportHit(kHitByModifying);
    }
    return true;
}

void Glog::ComposeText(InputEvent const &event) {
    HostCall const call;
    if (TextEditor *const text = TextFocus::Of(*this))
        text->Compose(event.text, event.compositionCaret);
}

void Glog::AddToTabOrder(GlogPane &pane, std::vector<GlogPane *> &order) const {
    if (!PaneAccess::OwnVisibility(pane))
        return;
    order.push_back(&pane);
    if (CompoundPane *container = PaneAccess::AsContainer(pane))
        for (short i = 0; i < container->NumSubpanes(); ++i)
            AddToTabOrder(*container->Get(i), order);
}

std::vector<GlogPane *> Glog::TabOrder(char direction) const {
    std::vector<GlogPane *> order;
    for (GlogPane *pane : items)
        AddToTabOrder(*pane, order);
    if (direction < 0)
        std::reverse(order.begin(), order.end());
    return order;
}

// Every Tab may remove and hide panes, the next one on the list among them.
bool Glog::OfferTab(char direction) {
    std::vector<GlogPane *> const order = TabOrder(direction);
    std::deque<PaneWatch> watches;
    for (GlogPane *pane : order)
        watches.emplace_back(pane);
    std::size_t next = 0;
    if (GlogPane *const from = current) {
        auto const found = std::find(order.begin(), order.end(), from);
        if (found != order.end())
            next = static_cast<std::size_t>(found - order.begin()) + 1;
        if (PaneEvents::Tab(*from, direction) != 1)
            return true;
    }
    for (std::size_t offers = order.size(); offers > 0 && !disposed; --offers, ++next) {
        std::size_t const at = next % order.size();
        if (watches[at].PaneExists() && IsOfferedTab(*order[at]) &&
            PaneEvents::Tab(*order[at], direction) == 0)
            return true;
    }
    return false;
}

// It is shown, as far as that is the panes' matter, and in this glog.
bool Glog::IsOfferedTab(GlogPane &pane) {
    if (pane.GetGlog() != this)
        return false;
    for (GlogPane *at = &pane; at; at = PaneAccess::Container(*at)) {
        if (!PaneAccess::OwnVisibility(*at))
            return false;
    }
    return true;
}

void Glog::Wheel(InputEvent const &event) {
    HostCall const call;
    struct Axis {
        double delta;
        int number;
    };
    for (Axis axis : {Axis{event.wheelH, 0}, Axis{event.wheelV, 1}}) {
        if (axis.delta == 0)
            continue;
        WheelEvent wheel(EventRecords::PlaceOf(event), static_cast<float>(axis.delta), axis.number);
        if (GlogPane *pane = TopmostAt(EventRecords::PlaceOf(event)))
            pane->DispatchCustomEvent(&wheel);
    }
}

void Glog::PointerMoved(Point p) {
    HostCall const call;
    GlogPane *const pane = TopmostAt(p);
    if (WithCursorDispatchingDisabled::fgCount == 0) {
        EventLoop::CursorChoice const choice(EventLoop::Instance());
        if (!pane || !pane->DispatchCursor(p))
            CrsrMain(Cursors::kArrow);
    }
    EventLoop::Instance().HelpTags().PointerAt(*this, p);
}

void Glog::PointerLeft() { EventLoop::Instance().HelpTags().Hide(); }

void Glog::Activation(bool on) {
    if (on == active)
        return;
    HostCall const call;
    active = on;
    if (on)
        DesktopRep::Of(desktop).CameToFront(this);
    ForEachItem([&](GlogPane &pane) { pane.SetActive(); });
}

void Glog::Idle() {
    if (!active || !shown || idling)
        return; // a pane that waits in its Idle is not called again meanwhile
    struct Idling {
        explicit Idling(bool &idling_)
            : idling(idling_) {
            idling = true;
        }
        ~Idling() { idling = false; }
        bool &idling;
    } const guard(idling);
    HostCall const call;
    for (std::size_t i = 0; i < items.size(); ++i)
        PaneAccess::Idle(*items[i]);
}
