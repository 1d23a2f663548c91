#include "desktop/menus/MenuPanel.h"
#include "desktop/drawing/ThemeColors.h"
#include "desktop/menus/MenuAccess.h"
#include "desktop/menus/MenuMarks.h"
#include "host/PortSavers.h"
#include "host/TextLayout.h"
#include "host/VelaDrawing.h"
#include <algorithm>

namespace {

int const kIndent = 17;      // from the menu's left edge to that of the closed pop-up: their texts lie above
                             // each other
int const kOverlap = 3;      // of a submenu and its menu
int const kScreenMargin = 4; // kept free at the screen's edges
int const kSelectionInset = 5;    // left and right of the item that is highlighted
int const kSelectionCorner = 8;   // diameter
int const kRuleInset = 12;        // left and right of a separator
int const kSubmenuMarkRight = 22; // from its left edge to the menu's right edge

Rect Local(int left, int top, int right, int bottom) {
    return {static_cast<short>(top), static_cast<short>(left), static_cast<short>(bottom),
            static_cast<short>(right)};
}

Menu SnapshotOf(OSMenuHandle const &handle) {
    Menu const *const menu = MenuAccess::Of(handle);
    return menu ? *menu : Menu();
}

} // namespace

MenuPanel::MenuPanel(OSMenuHandle const &handle_)
    : handle(handle_)
    , menu(SnapshotOf(handle))
    , rows(menu)
    , columns(menu) {}

MenuPanel::~MenuPanel() {
    port.SetSurface(nullptr, DeviceScale());
    surface.reset();
}

// Place

int MenuPanel::WidthFor(MenuPlace const &place, ScreenRect const &screen) {
    WithPort const keeper(port);
    int const last = rows.FirstBelow(place.scroll + place.box.Height());
    int const width = columns.NaturalWidth(menu, rows.FirstBelow(place.scroll), std::min(last, rows.Count()));
    return std::clamp(width, 1, std::max(screen.Width(), 1));
}

void MenuPanel::TakePlace(MenuPlace const &place) {
    box = place.box;
    scroll = place.scroll;
}

// Which items show does not depend on the width, so that the first place tells what to measure.
void MenuPanel::PlaceOver(ScreenRect const &popup, ScreenRect const &screen, int current) {
    ScreenRect const room = screen.Inset(kScreenMargin);
    auto const placed = [&](int width) {
        return MenuPlace::Over(popup, room, rows, width, kIndent, current);
    };
    int const least = std::min(popup.Width() + kIndent, std::max(room.Width(), 1));
    TakePlace(placed(std::max(WidthFor(placed(1), room), least)));
}

void MenuPanel::PlaceBeside(MenuPanel const &parent, int item, ScreenRect const &screen) {
    ScreenRect const room = screen.Inset(kScreenMargin);
    auto const placed = [&](int width) {
        return MenuPlace::Beside(parent.Box(), parent.ItemTop(item), room, rows, width, kOverlap);
    };
    TakePlace(placed(WidthFor(placed(1), room)));
}

// Showing

void MenuPanel::MakeSurface(DeviceScale scale_) {
    scale = scale_;
    surface = std::make_unique<Surface>(scale.Edge(box.Width()), scale.Edge(box.Height()));
    port.SetSurface(surface.get(), scale);
    port.SetExtent(box.Width(), box.Height());
    DrawAll();
}

void MenuPanel::ShowInWindow(WindowSystem &windows, PlatformWindow &owner) {
    WindowSpec spec;
    spec.popup = true;
    spec.placed = true;
    spec.owner = &owner;
    spec.h = box.left;
    spec.v = box.top;
    spec.width = box.Width();
    spec.height = box.Height();
    window = windows.CreateWindow(spec);
    MakeSurface(DeviceScale(window->Scale()));
    PresentAll();
    window->Show();
}

void MenuPanel::ShowIn(DeviceScale scale_, Changed changed_) {
    changed = std::move(changed_);
    MakeSurface(scale_);
    PresentAll();
}

void MenuPanel::PresentAll() { Present(Local(0, 0, box.Width(), box.Height())); }

void MenuPanel::Repaint() {
    if (!surface)
        return;
    DrawAll();
    PresentAll();
}

void MenuPanel::Present(Rect const &local) {
    port.TakeTouched();
    if (!window) {
        if (changed)
            changed(
                {box.left + local.left, box.top + local.top, box.left + local.right, box.top + local.bottom});
        return;
    }
    DeviceRect const part = scale.ToDevice(local.left, local.top, local.right, local.bottom);
    window->Present(*surface, &part, 1);
}

// Geometry

Rect MenuPanel::ItemRect(int item) const {
    return Local(0, rows.Top(item) - scroll, box.Width(), rows.Bottom(item) - scroll);
}

MenuPanel::Part MenuPanel::PartAt(ScreenPoint p, int &item) const {
    if (!box.Contains(p))
        return Part::kOutside;
    if (CanScrollUp() && p.v < box.top + kArrowHeight)
        return Part::kScrollUp;
    if (CanScrollDown() && p.v >= box.bottom - kArrowHeight)
        return Part::kScrollDown;
    int const found = rows.At(p.v - box.top + scroll);
    if (found == 0)
        return Part::kBetween;
    item = found;
    return Part::kItem;
}

int MenuPanel::ItemAtDistance(int item, int pixels) const {
    int const from = item == 0 ? MenuRows::kPad : rows.Middle(item);
    int const at = std::clamp(from + pixels, MenuRows::kPad, rows.Height() - MenuRows::kPad - 1);
    return rows.At(at);
}

// Changes

void MenuPanel::Highlight(int item) {
    if (item == highlighted)
        return;
    int const former = highlighted;
    highlighted = item;
    Redraw(former);
    Redraw(item);
}

void MenuPanel::SetOpened(int item) {
    if (item == opened)
        return;
    int const former = opened;
    opened = item;
    Redraw(former);
    Redraw(item);
}

void MenuPanel::Redraw(int item) {
    if (item == 0 || !surface)
        return;
    Rect part = ItemRect(item);
    Rect const all = port.Extent();
    if (!VelaDrawing::SectRect(&part, &all, &part))
        return;
    DrawPart(part);
    Present(part);
}

bool MenuPanel::ScrollBy(int pixels) {
    int const target = std::clamp(scroll + pixels, 0, std::max(LargestScroll(), 0));
    if (target == scroll)
        return false;
    scroll = target;
    Repaint();
    return true;
}

// Whole, and clear of the strips that scroll.
void MenuPanel::Reveal(int item) {
    int const top = rows.Top(item) - scroll, bottom = rows.Bottom(item) - scroll;
    if (top < kArrowHeight)
        ScrollBy(top - kArrowHeight);
    else if (bottom > box.Height() - kArrowHeight)
        ScrollBy(bottom - box.Height() + kArrowHeight);
}

// Drawing

void MenuPanel::DrawAll() { DrawPart(port.Extent()); }

void MenuPanel::DrawPart(Rect const &part) {
    WithPort const keeper(port);
    port.SetOrigin(0, 0);
    port.SetBoundary(OSRgn(part));
    MenuColumns::SetFont();
    Rect const all = port.Extent();
    VelaDrawing::PenNormal();
    VelaDrawing::RGBForeColor(ThemeColors::kMenuBackgroundColor);
    VelaDrawing::PaintRect(&all);
    int const end = scroll + part.bottom;
    for (int item = rows.FirstBelow(scroll + part.top); item <= rows.Count() && rows.Top(item) < end; ++item)
        DrawItem(item, ItemRect(item));
    DrawArrows();
    VelaDrawing::RGBForeColor(ThemeColors::kMenuBorderColor);
    VelaDrawing::FrameRect(&all);
}

void MenuPanel::DrawSeparator(Rect const &r) const {
    int const middle = (r.top + r.bottom) / 2;
    Rect const rule = Local(r.left + kRuleInset, middle, r.right - kRuleInset, middle + 1);
    VelaDrawing::RGBForeColor(ThemeColors::kMenuSeparatorColor);
    VelaDrawing::PaintRect(&rule);
}

void MenuPanel::DrawItem(int number, Rect const &r) const {
    MenuItem const &item = *menu.Find(number);
    if (item.separator) {
        DrawSeparator(r);
        return;
    }
    bool const enabled = menu.CanChoose(number), lit = LooksHighlighted(number) && enabled;
    if (lit) {
        VelaDrawing::RGBForeColor(ThemeColors::kMenuHiliteColor);
        Rect const selection = Local(r.left + kSelectionInset, r.top, r.right - kSelectionInset, r.bottom);
        OSPort::Current().PaintRoundRect(selection, OS::Size(kSelectionCorner, kSelectionCorner));
    }
    MenuMarks::State const state = !enabled ? MenuMarks::kDisabled
                                   : lit    ? MenuMarks::kLit
                                            : MenuMarks::kPlain;
    if (item.checked)
        MenuMarks::Draw(MenuMarks::kCheck, state, r.left + MenuColumns::kMarkLeft, r);
    if (item.icon != 0)
        MenuMarks::DrawItemIcon(item.icon, state, r.left + columns.IconLeft(), r);
    if (item.decorator) {
        Rect const place = Local(r.left + columns.DecoratorLeft(), r.top,
                                 r.left + columns.DecoratorLeft() + columns.DecoratorWidth(), r.bottom);
        MenuMarks::DrawDecorator(*item.decorator, place, lit, enabled);
    }
    if (item.submenu != 0)
        MenuMarks::Draw(MenuMarks::kSubmenu, state, r.right - kSubmenuMarkRight, r);
    VelaDrawing::RGBForeColor(lit       ? ThemeColors::kMenuHiliteTextColor
                              : enabled ? ThemeColors::kMenuTextColor
                                        : ThemeColors::kMenuInactiveTextColor);
    DrawStringInRect(item.text,
                     Local(r.left + columns.TextLeft(), r.top, r.right - columns.RightPad() + 1, r.bottom),
                     TextSettings::kAlignLeft, TextSettings::kTruncateEnd, 1, 0, 0, 0.0f, 1.0f, 1.0f, 0.0f);
}

// Over the items, whatever shows of them there.
void MenuPanel::DrawArrows() const {
    auto const strip = [&](bool shows, int top, MenuMarks::Mark mark) {
        if (!shows)
            return;
        Rect const r = Local(1, top, box.Width() - 1, top + kArrowHeight);
        VelaDrawing::RGBForeColor(ThemeColors::kMenuBackgroundColor);
        VelaDrawing::PaintRect(&r);
        MenuMarks::Draw(mark, MenuMarks::kPlain, (box.Width() - MenuMarks::kArrowWidth) / 2, r);
    };
    strip(CanScrollUp(), 1, MenuMarks::kScrollUp);
    strip(CanScrollDown(), box.Height() - kArrowHeight - 1, MenuMarks::kScrollDown);
}
