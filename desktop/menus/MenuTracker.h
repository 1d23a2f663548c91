// The menu that is open.
#pragma once
#include "desktop/drawing/PixelOverlay.h"
#include "desktop/menus/MenuAim.h"
#include "desktop/menus/MenuPanel.h"
#include "desktop/menus/TypedPrefix.h"
#include "desktop/windows/EventLoop.h"
#include <functional>
#include <memory>
#include <string>
#include <vector>

class Glog;

// Runs a pop-up menu with its submenus: a stack of panels, and what mouse, keys and time mean to it. There is
// at most one.
class MenuTracker {
public:
    // `popup` is the place of the closed pop-up on the screen. `current` 0: none. Opens nothing yet.
    MenuTracker(Glog &owner, EventLoop &, OSMenuHandle const &, short current, ScreenRect const &popup);
    ~MenuTracker();
    MenuTracker(MenuTracker const &) = delete;
    MenuTracker &operator=(MenuTracker const &) = delete;
    static MenuTracker *Open(); // null when no menu is open

    // Opens the menu and waits for the choice, which it answers as RunPopupMenu does.
    int Run();

    // Chooses an item by its number; each number before the last one leads into a submenu. A single 0
    // dismisses. False, with the reason, when the menu has no such item or it cannot be chosen.
    bool Answer(std::vector<int> const &path, std::string &reason);

    // The menus that are open over the glog: all, or only those that are drawn over its content since they
    // could not have windows.
    static std::vector<PixelOverlay> OpenOver(Glog const &);
    static std::vector<PixelOverlay> DrawnOver(Glog const &);
    std::vector<std::unique_ptr<MenuPanel>> const &Panels() const { return panels; }
    void Repaint(); // all menus that are open, when colours have changed

private:
    typedef MenuPanel::Part Part;
    // A place in the panels.
    struct Hit {
        int level = -1; // -1: outside of all
        Part part = Part::kOutside;
        int item = 0;
    };

    // Panels
    int Last() const { return static_cast<int>(panels.size()) - 1; }
    MenuPanel &Panel(int level) { return *panels[static_cast<std::size_t>(level)]; }
    // Asks for its place, again if it turns out that it has to be shown otherwise.
    void Show(MenuPanel &, std::function<void()> const &place);
    ScreenRect Room() const;
    void PresentOwner(ScreenRect const &);
    std::vector<PixelOverlay> Pictures() const;
    bool OpenSubmenu(int level, int item);
    void CloseAfter(int level);
    Hit HitAt(ScreenPoint) const;

    // Ends
    void Dismiss() { finished = true; }
    void Choose(int level, int item);
    // What a press, a release or a key does to an enabled item.
    void Accept(int level, int item);

    // Events
    void Handle(InputEvent const &);
    ScreenPoint PlaceOf(InputEvent const &) const;
    void Moved(ScreenPoint);
    bool IsAiming(ScreenPoint, Hit const &);
    void Hover(Hit const &);
    void Pressed(ScreenPoint);
    void Released(ScreenPoint);
    void Turned(ScreenPoint, double notches);
    bool OwnerMoved() const;

    // Keys
    void Key(InputEvent const &);
    void Step(int from, int direction, bool wraps);
    void StepPage(int direction);
    void KeyHighlight(int item);
    void EnterSubmenu();
    void LeaveSubmenu();
    void Type(InputEvent const &);
    int FirstChoosable(MenuPanel const &, int from, int direction) const;

    // Time
    double NextDeadline() const; // negative: none
    void OnTime(double now);
    void StartScrolling(Hit const &);

    Glog &owner;
    EventLoop &loop;
    OSMenuHandle const root;
    short const current;
    ScreenRect const popup;
    ScreenPoint ownerPlace; // when the menu opened
    bool overOwner = false; // the panels are drawn over the owner's content
    std::vector<std::unique_ptr<MenuPanel>> panels;

    bool finished = false;
    int result = 0;
    int focus = 0; // the level that keys act on

    bool held = true;        // a button is down, as far as is known
    bool mayBeClick = true;  // the press that opened the menu may yet turn out to be a click
    double openedAt = 0;     // seconds
    ScreenPoint openedUnder; // the mouse
    ScreenPoint last;        // where the mouse was last

    MenuAim aim;
    double aimEnds = -1; // when a mouse that rests no longer aims; negative: it does not aim
    int pendingLevel = -1, pendingItem = 0; // the submenu that is to open
    double pendingAt = -1;
    int scrollLevel = -1, scrollBy = 0; // a panel that scrolls while the mouse rests on its arrow
    double scrollAt = -1;
    TypedPrefix typed;
};
