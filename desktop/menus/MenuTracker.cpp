#include "desktop/menus/MenuTracker.h"
#include "desktop/menus/MenuAccess.h"
#include "desktop/panes/Glog.h"
#include <algorithm>
#include <cstdlib>
#include <stdexcept>

namespace {

MenuTracker *theTracker = nullptr;

std::size_t const kMostLevels = 64;  // menus may be made their own submenus
double const kClickTime = 0.35;      // seconds that a press may last and still be a click
int const kClickSlack = 4;           // pixels that it may move
double const kSubmenuDelay = 0.2;    // seconds on an item before its submenu opens
double const kAimTime = 0.3;         // seconds that the mouse may rest on its way to a submenu
double const kScrollInterval = 0.05; // seconds between steps while the mouse is on an arrow
int const kScrollStep = MenuRows::kItemHeight;
int const kNotchStep = 3 * MenuRows::kItemHeight; // for a notch of the wheel

unsigned short const kShortcutModifiers = Modifiers::kCommand | Modifiers::kControl;

} // namespace

MenuTracker::MenuTracker(Glog &owner_, EventLoop &loop_, OSMenuHandle const &root_, short current_,
                         ScreenRect const &popup_)
    : owner(owner_)
    , loop(loop_)
    , root(root_)
    , current(current_)
    , popup(popup_) {
    Point const content = owner.Window()->ScreenPlace();
    ownerPlace = {content.h, content.v};
    Point const mouse = loop.Windows().MousePlace(*owner.Window());
    last = openedUnder = {content.h + mouse.h, content.v + mouse.v};
    overOwner = !loop.Windows().PlacesPopups();
    theTracker = this;
    loop.BeginMenu(owner.Window());
}

MenuTracker::~MenuTracker() {
    CloseAfter(-1);
    loop.EndMenu();
    theTracker = nullptr;
}

MenuTracker *MenuTracker::Open() { return theTracker; }

int MenuTracker::Run() {
    openedAt = loop.Windows().Now();
    panels.push_back(std::make_unique<MenuPanel>(root));
    if (Panel(0).Items().CanChoose(current))
        Panel(0).Highlight(current);
    Show(Panel(0), [this] { Panel(0).PlaceOver(popup, Room(), current); });
    while (!finished) {
        InputEvent event;
        if (loop.NextMenuEvent(NextDeadline(), event))
            Handle(event);
        else if (loop.MenuIsOver())
            break;
        if (!finished)
            OnTime(loop.Windows().Now());
    }
    return result;
}

// Panels

// What may be covered: the screen, or the owner's content where menus cannot have windows.
ScreenRect MenuTracker::Room() const {
    if (!overOwner)
        return ScreenRect::Of(loop.Windows().ScreenBounds());
    return ScreenRect{0, 0, owner.Width(), owner.Height()}.Moved(ownerPlace.h, ownerPlace.v);
}

void MenuTracker::Show(MenuPanel &panel, std::function<void()> const &place) {
    place();
    if (!overOwner) {
        try {
            panel.ShowInWindow(loop.Windows(), *owner.Window());
            return;
        } catch (std::runtime_error const &) {
            overOwner = true; // panels that have windows already keep them
            place();
        }
    }
    panel.ShowIn(DeviceScale(owner.Window()->Scale()),
                 [this](ScreenRect const &part) { PresentOwner(part); });
}

void MenuTracker::PresentOwner(ScreenRect const &part) {
    ScreenRect const inOwner = part.Moved(-ownerPlace.h, -ownerPlace.v);
    owner.PresentPart({static_cast<short>(inOwner.top), static_cast<short>(inOwner.left),
                       static_cast<short>(inOwner.bottom), static_cast<short>(inOwner.right)});
}

std::vector<PixelOverlay> MenuTracker::Pictures() const {
    DeviceScale const scale(owner.Window()->Scale());
    std::vector<PixelOverlay> pictures;
    for (std::unique_ptr<MenuPanel> const &panel : panels)
        if (panel->IsShown())
            pictures.push_back({&panel->Pixels(), scale.Edge(panel->Box().left - ownerPlace.h),
                                scale.Edge(panel->Box().top - ownerPlace.v)});
    return pictures;
}

std::vector<PixelOverlay> MenuTracker::OpenOver(Glog const &glog) {
    bool const any = theTracker && &theTracker->owner == &glog;
    return any ? theTracker->Pictures() : std::vector<PixelOverlay>();
}

std::vector<PixelOverlay> MenuTracker::DrawnOver(Glog const &glog) {
    bool const any = theTracker && theTracker->overOwner;
    return any ? OpenOver(glog) : std::vector<PixelOverlay>();
}

void MenuTracker::Repaint() {
    for (std::unique_ptr<MenuPanel> const &panel : panels)
        panel->Repaint();
}

bool MenuTracker::OpenSubmenu(int level, int item) {
    if (Panel(level).Opened() == item && Last() > level)
        return true;
    CloseAfter(level);
    MenuItem const *const entry = Panel(level).Items().Find(item);
    if (!Panel(level).Items().CanChoose(item) || panels.size() >= kMostLevels)
        return false;
    OSMenuHandle const submenu = MenuAccess::SubmenuOf(*entry);
    if (!submenu.IsValid() || submenu.NumMenuItems() == 0)
        return false;
    panels.push_back(std::make_unique<MenuPanel>(submenu));
    Panel(level).SetOpened(item);
    Show(Panel(level + 1), [=] { Panel(level + 1).PlaceBeside(Panel(level), item, Room()); });
    aim.Forget();
    return true;
}

void MenuTracker::CloseAfter(int level) {
    aimEnds = pendingAt = scrollAt = -1;
    if (level >= Last())
        return;
    while (Last() > level) {
        ScreenRect const box = panels.back()->Box();
        panels.pop_back();
        if (overOwner)
            PresentOwner(box);
    }
    if (level < 0)
        return;
    Panel(level).SetOpened(0);
    focus = std::min(focus, level);
}

// Submenus lie over their menus.
MenuTracker::Hit MenuTracker::HitAt(ScreenPoint p) const {
    Hit hit;
    for (int level = Last(); level >= 0; --level) {
        hit.part = panels[static_cast<std::size_t>(level)]->PartAt(p, hit.item);
        if (hit.part != Part::kOutside) {
            hit.level = level;
            return hit;
        }
    }
    return hit;
}

// Ends

// The menu may have been changed since it was opened: an item that is there no longer cannot be chosen.
void MenuTracker::Choose(int level, int item) {
    OSMenuHandle const &handle = Panel(level).Handle();
    finished = true;
    if (item <= handle.NumMenuItems())
        result = static_cast<int>(static_cast<unsigned int>(static_cast<unsigned short>(handle.GetMenuID()))
                                      << 16 |
                                  static_cast<unsigned int>(item));
}

void MenuTracker::Accept(int level, int item) {
    Menu const &menu = Panel(level).Items();
    if (!menu.CanChoose(item))
        return;
    if (menu.Find(item)->submenu == 0)
        Choose(level, item);
    else
        OpenSubmenu(level, item);
}

bool MenuTracker::Answer(std::vector<int> const &path, std::string &reason) {
    if (path.size() == 1 && path[0] == 0) {
        Dismiss();
        return true;
    }
    for (std::size_t i = 0; i < path.size(); ++i) {
        int const level = static_cast<int>(i);
        std::string const item = "item " + std::to_string(path[i]) + " of the menu";
        MenuItem const *const found = Panel(level).Items().Find(path[i]);
        if (!found)
            reason = "there is no " + item + ", which has " + std::to_string(Panel(level).Items().Count());
        else if (!Panel(level).Items().CanChoose(path[i]))
            reason = item + " cannot be chosen";
        else if (i + 1 < path.size() ? !OpenSubmenu(level, path[i]) : found->submenu != 0)
            reason =
                item + (i + 1 < path.size() ? " opens no menu" : " opens a menu and cannot be chosen itself");
        else
            continue;
        return false;
    }
    Choose(static_cast<int>(path.size()) - 1, path.back());
    return true;
}

// Events

ScreenPoint MenuTracker::PlaceOf(InputEvent const &event) const {
    Point const content = event.window ? event.window->ScreenPlace() : Point{0, 0};
    return {content.h + event.h, content.v + event.v};
}

bool MenuTracker::OwnerMoved() const {
    Point const content = owner.Window()->ScreenPlace();
    return content.h != ownerPlace.h || content.v != ownerPlace.v;
}

void MenuTracker::Handle(InputEvent const &event) {
    switch (event.kind) {
    case InputEvent::kMouseMove:
        Moved(PlaceOf(event));
        break;
    case InputEvent::kMouseDown:
        Pressed(PlaceOf(event));
        break;
    case InputEvent::kMouseUp:
        Released(PlaceOf(event));
        break;
    case InputEvent::kWheel:
        Turned(PlaceOf(event), event.wheelV);
        break;
    case InputEvent::kKeyDown:
    case InputEvent::kTextInput:
        Key(event);
        break;
    case InputEvent::kExposed:
        for (std::unique_ptr<MenuPanel> const &panel : panels)
            if (panel->IsWindow(event.window))
                panel->PresentAll();
        break;
    case InputEvent::kMoved:
        if (OwnerMoved())
            Dismiss();
        break;
    case InputEvent::kResized:
    case InputEvent::kDeactivated:
        if (event.window == owner.Window())
            Dismiss();
        break;
    case InputEvent::kScaleChanged:
    case InputEvent::kCloseRequested:
    case InputEvent::kQuit:
        Dismiss();
        break;
    default:
        break;
    }
}

void MenuTracker::Moved(ScreenPoint p) {
    if (p.h == last.h && p.v == last.v)
        return;
    last = p;
    if (std::abs(p.h - openedUnder.h) > kClickSlack || std::abs(p.v - openedUnder.v) > kClickSlack)
        mayBeClick = false;
    Hit const hit = HitAt(p);
    if (IsAiming(p, hit))
        return;
    Hover(hit);
}

// Crossing other items of the menu whose submenu is open, on the way there.
bool MenuTracker::IsAiming(ScreenPoint p, Hit const &hit) {
    bool const above = hit.level >= 0 && hit.level < Last();
    if (!above || hit.item == Panel(hit.level).Opened()) {
        aim.Forget();
        if (above)
            aim.Follow(p, Panel(hit.level + 1).Box());
        aimEnds = -1;
        return false;
    }
    if (!aim.Follow(p, Panel(hit.level + 1).Box())) {
        aimEnds = -1;
        return false;
    }
    aimEnds = loop.Windows().Now() + kAimTime;
    return true;
}

void MenuTracker::Hover(Hit const &hit) {
    bool const onArrow = hit.part == Part::kScrollUp || hit.part == Part::kScrollDown;
    if (onArrow && scrollAt >= 0 && hit.level == scrollLevel)
        return; // it scrolls already
    scrollAt = -1;
    if (hit.level < 0) {
        Panel(Last()).Highlight(0);
        pendingAt = -1;
        return;
    }
    for (int level = hit.level + 1; level <= Last(); ++level)
        Panel(level).Highlight(0);
    focus = hit.level;
    MenuPanel &panel = Panel(hit.level);
    if (hit.part != Part::kItem) {
        panel.Highlight(0);
        pendingAt = -1;
        if (onArrow)
            StartScrolling(hit);
        return;
    }
    if (hit.item == panel.Opened()) {
        panel.Highlight(hit.item);
        pendingAt = -1;
        return;
    }
    CloseAfter(hit.level);
    bool const can = panel.Items().CanChoose(hit.item);
    panel.Highlight(can ? hit.item : 0);
    if (!can || panel.Items().Find(hit.item)->submenu == 0)
        return;
    pendingLevel = hit.level;
    pendingItem = hit.item;
    pendingAt = loop.Windows().Now() + kSubmenuDelay;
}

void MenuTracker::Pressed(ScreenPoint p) {
    Hit const hit = HitAt(p);
    last = p;
    held = true;
    mayBeClick = false;
    if (hit.level < 0) {
        Dismiss();
        return;
    }
    Hover(hit);
    if (hit.part == Part::kItem && Panel(hit.level).Items().CanChoose(hit.item) &&
        Panel(hit.level).Items().Find(hit.item)->submenu != 0)
        OpenSubmenu(hit.level, hit.item);
}

// A click leaves the menu open. A press that is held chooses where it ends, and nothing beside the menus; on
// something that cannot be chosen it leaves the menu open as well.
void MenuTracker::Released(ScreenPoint p) {
    if (!held)
        return;
    held = false;
    bool const click = mayBeClick && loop.Windows().Now() - openedAt < kClickTime;
    mayBeClick = false;
    if (click)
        return;
    Hit const hit = HitAt(p);
    if (hit.level < 0)
        Dismiss();
    else if (hit.part == Part::kItem)
        Accept(hit.level, hit.item);
}

void MenuTracker::Turned(ScreenPoint p, double notches) {
    Hit const hit = HitAt(p);
    if (hit.level < 0 || notches == 0)
        return;
    double const pixels = std::clamp(-notches * kNotchStep, -1e6, 1e6);
    if (!Panel(hit.level).ScrollBy(static_cast<int>(pixels)))
        return;
    CloseAfter(hit.level);
    Hover(HitAt(p));
}

// Time

double MenuTracker::NextDeadline() const {
    double next = -1;
    for (double at : {aimEnds, pendingAt, scrollAt})
        if (at >= 0 && (next < 0 || at < next))
            next = at;
    return next;
}

void MenuTracker::OnTime(double now) {
    if (aimEnds >= 0 && now >= aimEnds) {
        aimEnds = -1;
        aim.Forget();
        Hover(HitAt(last));
    }
    if (pendingAt >= 0 && now >= pendingAt) {
        pendingAt = -1;
        OpenSubmenu(pendingLevel, pendingItem);
    }
    if (scrollAt >= 0 && now >= scrollAt) {
        int const level = scrollLevel;
        bool const moved = Panel(level).ScrollBy(scrollBy);
        scrollAt = moved ? now + kScrollInterval : -1;
        if (!moved)
            Hover(HitAt(last)); // what was under the arrow shows now
    }
}

void MenuTracker::StartScrolling(Hit const &hit) {
    CloseAfter(hit.level);
    scrollLevel = hit.level;
    scrollBy = hit.part == Part::kScrollUp ? -kScrollStep : kScrollStep;
    scrollAt = loop.Windows().Now() + kScrollInterval;
}

// Keys

int MenuTracker::FirstChoosable(MenuPanel const &panel, int from, int direction) const {
    Menu const &menu = panel.Items();
    for (int item = from; menu.Find(item); item += direction)
        if (menu.CanChoose(item))
            return item;
    return 0;
}

void MenuTracker::KeyHighlight(int item) {
    if (item == 0)
        return;
    CloseAfter(focus);
    Panel(focus).Highlight(item);
    Panel(focus).Reveal(item);
}

void MenuTracker::Step(int from, int direction, bool wraps) {
    MenuPanel const &panel = Panel(focus);
    int item = FirstChoosable(panel, from, direction);
    if (item == 0 && wraps)
        item = FirstChoosable(panel, direction > 0 ? 1 : panel.Items().Count(), direction);
    KeyHighlight(item);
}

void MenuTracker::StepPage(int direction) {
    MenuPanel const &panel = Panel(focus);
    if (panel.Items().Count() == 0)
        return;
    int const target = panel.ItemAtDistance(panel.Highlighted(), direction * panel.PageHeight());
    int item = FirstChoosable(panel, target, direction);
    if (item == 0)
        item = FirstChoosable(panel, target, -direction);
    KeyHighlight(item);
}

void MenuTracker::EnterSubmenu() {
    int const item = Panel(focus).Highlighted();
    if (item == 0 || Panel(focus).Items().Find(item)->submenu == 0 || !OpenSubmenu(focus, item))
        return;
    ++focus;
    if (int const first = FirstChoosable(Panel(focus), 1, 1)) {
        Panel(focus).Highlight(first);
        Panel(focus).Reveal(first);
    }
}

void MenuTracker::LeaveSubmenu() {
    if (focus == 0)
        return;
    int const item = Panel(focus - 1).Opened();
    CloseAfter(focus - 1);
    Panel(focus).Highlight(item);
}

void MenuTracker::Key(InputEvent const &event) {
    if (event.modifiers & kShortcutModifiers)
        return;
    mayBeClick = mayBeClick && event.kind != InputEvent::kKeyDown;
    int const highlighted = Panel(focus).Highlighted();
    int const count = Panel(focus).Items().Count();
    switch (event.kind == InputEvent::kKeyDown ? event.key : static_cast<int>(KeyCodes::kNone)) {
    case KeyCodes::kEscape:
        Dismiss();
        break;
    case KeyCodes::kDown:
        Step(highlighted + 1, 1, true);
        break;
    case KeyCodes::kUp:
        Step(highlighted == 0 ? count : highlighted - 1, -1, true);
        break;
    case KeyCodes::kHome:
        Step(1, 1, false);
        break;
    case KeyCodes::kEnd:
        Step(count, -1, false);
        break;
    case KeyCodes::kPageDown:
        StepPage(1);
        break;
    case KeyCodes::kPageUp:
        StepPage(-1);
        break;
    case KeyCodes::kRight:
        EnterSubmenu();
        break;
    case KeyCodes::kLeft:
        LeaveSubmenu();
        break;
    case KeyCodes::kSpace:
        if (typed.IsGoing(loop.Windows().Now())) {
            Type(event);
            break;
        }
        [[fallthrough]];
    case KeyCodes::kReturn:
    case KeyCodes::kEnter:
        if (highlighted == 0)
            Dismiss();
        else if (Panel(focus).Items().Find(highlighted)->submenu != 0)
            EnterSubmenu();
        else
            Accept(focus, highlighted);
        break;
    default:
        Type(event);
    }
}

void MenuTracker::Type(InputEvent const &event) {
    if (event.text.empty() || event.text[0] < KeyCodes::kSpace)
        return;
    MenuPanel const &panel = Panel(focus);
    KeyHighlight(typed.Type(event.text, loop.Windows().Now(), panel.Items(), panel.Highlighted()));
}
