// One open menu on the screen.
#pragma once
#include "desktop/drawing/DrawingPort.h"
#include "desktop/drawing/Surface.h"
#include "desktop/menus/MenuColumns.h"
#include "desktop/menus/MenuPlace.h"
#include "desktop/windows/WindowSystem.h"
#include "host/OSMenuHandle.h"
#include <functional>
#include <memory>

// Shows a menu as it was when the panel was made, in a pop-up window of its own or as part of another window.
// Only the items that show are measured and drawn. Knows nothing of what the mouse and the keys mean.
class MenuPanel {
public:
    // What a place on the screen is to the panel.
    enum class Part { kOutside, kItem, kBetween, kScrollUp, kScrollDown };

    explicit MenuPanel(OSMenuHandle const &);
    ~MenuPanel();
    MenuPanel(MenuPanel const &) = delete;
    MenuPanel &operator=(MenuPanel const &) = delete;

    // Chooses the place; see MenuPlace. The menu over a pop-up is at least as wide as that.
    void PlaceOver(ScreenRect const &popup, ScreenRect const &screen, int current);
    void PlaceBeside(MenuPanel const &parent, int item, ScreenRect const &screen);

    // Opens a pop-up window of the owner's at the place. Throws std::runtime_error when there is none to be
    // had.
    void ShowInWindow(WindowSystem &, PlatformWindow &owner);
    // Shows the panel by other means: they are told of each part, in screen coordinates, that has changed.
    typedef std::function<void(ScreenRect const &)> Changed;
    void ShowIn(DeviceScale, Changed);
    bool IsWindow(PlatformWindow const *asked) const { return asked && asked == window.get(); }
    void PresentAll();
    void Repaint(); // all of it, in the colours that hold now
    bool IsShown() const { return surface != nullptr; }
    Surface const &Pixels() const { return *surface; } // while it is shown

    OSMenuHandle const &Handle() const { return handle; }
    Menu const &Items() const { return menu; }
    ScreenRect const &Box() const { return box; }
    // `item` is set for kItem alone.
    Part PartAt(ScreenPoint, int &item) const;
    // Screen coordinates.
    int ItemTop(int item) const { return box.top + rows.Top(item) - scroll; }
    // The height of what shows of the items, in pixels.
    int PageHeight() const { return box.Height() - 2 * MenuRows::kPad; }
    int ItemAtDistance(int item, int pixels) const; // the nearest one to so far below it, or above

    int Highlighted() const { return highlighted; } // 0: none
    void Highlight(int item);
    // The item whose submenu is open; 0: none. It looks highlighted, too.
    int Opened() const { return opened; }
    void SetOpened(int item);

    // Scrolls by the pixels, down when positive; false when it was at that end already.
    bool ScrollBy(int pixels);
    void Reveal(int item);

private:
    static constexpr int kArrowHeight = 16; // of the strip that scrolls

    void TakePlace(MenuPlace const &);
    int WidthFor(MenuPlace const &, ScreenRect const &screen);
    int LargestScroll() const { return rows.Height() - box.Height(); }
    bool CanScrollUp() const { return scroll > 0; }
    bool CanScrollDown() const { return scroll < LargestScroll(); }
    void MakeSurface(DeviceScale);
    void DrawAll();
    void DrawPart(Rect const &local);
    void DrawItem(int item, Rect const &) const;
    void DrawSeparator(Rect const &) const;
    void DrawArrows() const;
    void Redraw(int item);
    void Present(Rect const &local);
    bool LooksHighlighted(int item) const { return item != 0 && (item == highlighted || item == opened); }
    Rect ItemRect(int item) const;

    OSMenuHandle handle;
    Menu menu;
    MenuRows rows;
    MenuColumns columns;
    ScreenRect box;
    int scroll = 0;
    int highlighted = 0, opened = 0;
    std::unique_ptr<PlatformWindow> window; // null when something else shows the panel
    Changed changed;
    std::unique_ptr<Surface> surface; // goes before the window, which may have given its memory
    DeviceScale scale;
    DrawingPort port;
};
