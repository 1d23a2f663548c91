#include "desktop/windows/HelpTagWindow.h"
#include "desktop/drawing/Region.h"
#include "desktop/drawing/ThemeColors.h"
#include "desktop/panes/Glog.h"
#include "desktop/panes/PaneAccess.h"
#include "desktop/resources/HelpTag.h"
#include "desktop/windows/EventLoop.h"
#include "host/CompoundPane.h"
#include "host/TextSettings.h"
#include "host/VelaDrawing.h"
#include <algorithm>
#include <stdexcept>

namespace {

int const kFont = 1;
int const kPadH = 7, kPadV = 4;
int const kLineHeight = 15;
int const kGap = 4; // between the part and its tag
int const kWidest = 360;
double const kPaneDelay = 0.5; // of tags that name no delay

Rect Moved(Rect const &r, Point by) {
    return {static_cast<short>(r.top + by.v), static_cast<short>(r.left + by.h),
            static_cast<short>(r.bottom + by.v), static_cast<short>(r.right + by.h)};
}

} // namespace

HelpTagWindow::HelpTagWindow(WindowSystem &windows_)
    : windows(windows_) {}

HelpTagWindow::~HelpTagWindow() { Hide(); }

// The innermost pane under the point that has a tag.
bool HelpTagWindow::Find(GlogPane &pane, Point p, Found &found) {
    if (!PaneAccess::OwnVisibility(pane) || !pane.ContainsForHelp(p))
        return false;
    if (CompoundPane *container = PaneAccess::AsContainer(pane)) {
        Point inside = p;
        container->LocalOffset(&inside);
        for (short i = static_cast<short>(container->NumSubpanes() - 1); i >= 0; --i)
            if (Find(*container->Get(i), inside, found))
                return true;
    }
    found.part = pane.GetDrawRectangle();
    found.delay = kPaneDelay;
    if (!pane.GetHelpTagForPoint(p, found.tag, found.part, found.placement, found.delay) || !found.tag)
        return false;
    found.part = Moved(found.part, PaneAccess::Origin(pane));
    found.text = found.tag->Text();
    return true;
}

void HelpTagWindow::PointerAt(Glog &over, Point p) {
    Found found;
    bool any = false;
    for (auto i = over.Items().rbegin(); i != over.Items().rend() && !any; ++i)
        any = Find(**i, p, found);
    if (!any) {
        Hide();
        return;
    }
    bool const same = glog == &over && wanted.tag == found.tag && VelaDrawing::PtInRect(p, &wanted.part);
    if (same && (window || due >= 0))
        return;
    Hide();
    wanted = found;
    glog = &over;
    owner = over.Window();
    due = windows.Now() + std::max(0.0, found.delay);
}

void HelpTagWindow::HideAny() {
    if (EventLoop *loop = EventLoop::Open())
        loop->HelpTags().Hide();
}

void HelpTagWindow::Hide() {
    due = -1;
    glog = nullptr;
    owner = nullptr;
    window.reset();
    port.SetSurface(nullptr, DeviceScale());
    surface.reset();
}

void HelpTagWindow::Tick(double now) {
    if (due >= 0 && now >= due) {
        due = -1;
        // A window that cannot be had for it takes the tag's place away, and nothing else.
        try {
            Show();
        } catch (std::runtime_error const &) {
            Hide();
        }
    }
}

double HelpTagWindow::UntilNext(double now) const { return due < 0 ? -1 : std::max(0.0, due - now); }

void HelpTagWindow::OwnerGone(PlatformWindow *gone) {
    if (gone && gone == owner)
        Hide();
}

void HelpTagWindow::Exposed(PlatformWindow *exposed) {
    if (!window || exposed != window.get())
        return;
    DeviceRect const all{0, 0, surface->Width(), surface->Height()};
    window->Present(*surface, &all, 1);
}

// Below the part where there is room, else above it; never beyond the screen.
Rect HelpTagWindow::ChoosePlace(int width, int height) const {
    Point const content = owner->ScreenPlace();
    Rect const part = Moved(wanted.part, content);
    Rect const screen = windows.ScreenBounds();
    int top = part.bottom + kGap;
    if (top + height > screen.bottom)
        top = part.top - kGap - height;
    int const left = std::max<int>(screen.left, std::min<int>(part.left, screen.right - width));
    return {static_cast<short>(top), static_cast<short>(left), static_cast<short>(top + height),
            static_cast<short>(left + width)};
}

void HelpTagWindow::Show() {
    UString const text = wanted.text;
    UpdateTextLayout(layout, text, kFont, TextSettings::kAlignLeft, TextSettings::kTruncateNone, 1, 0, 0, 0,
                     0.0f, 1.0f, 1.0f);
    int const textWidth = static_cast<int>(layout.GetWidth());
    int const width = std::min(textWidth + 2 * kPadH, kWidest);
    // Lines break at words and are not filled to the end, so that some room for one more is kept from the
    // second line on.
    int const room = kWidest - 2 * kPadH;
    int const lines = textWidth <= room ? 1 : (textWidth + textWidth / 8) / room + 1;
    place = ChoosePlace(width, lines * kLineHeight + 2 * kPadV);
    WindowSpec spec;
    spec.popup = true;
    spec.placed = true;
    spec.owner = owner;
    spec.h = place.left;
    spec.v = place.top;
    spec.width = place.right - place.left;
    spec.height = place.bottom - place.top;
    window = windows.CreateWindow(spec);
    DeviceScale const scale(window->Scale());
    surface.reset(new Surface(scale.Edge(spec.width), scale.Edge(spec.height)));
    port.SetSurface(surface.get(), scale);
    port.SetExtent(spec.width, spec.height);
    Draw();
    DeviceRect const all{0, 0, surface->Width(), surface->Height()};
    window->Present(*surface, &all, 1);
    window->Show();
}

void HelpTagWindow::Draw() {
    WithPort keeper(port);
    port.SetOrigin(0, 0);
    port.SetBoundary(OSRgn(port.Extent()));
    Rect const all = port.Extent();
    RGBColor const ground = ThemeColors::kTooltipBackgroundColor;
    VelaDrawing::RGBForeColor(ground);
    VelaDrawing::PaintRect(&all);
    VelaDrawing::RGBForeColor(ThemeColors::kTooltipBorderColor);
    VelaDrawing::FrameRect(&all);
    Rect inside = all;
    VelaDrawing::InsetRect(&inside, kPadH, kPadV);
    VelaDrawing::RGBForeColor(ThemeColors::kTooltipTextColor);
    DrawTextLayoutInRect(layout, wanted.text, inside, kFont, TextSettings::kAlignLeft,
                         TextSettings::kTruncateNone, 1, inside.bottom - inside.top > kLineHeight, 0, 0, 0.0f,
                         1.0f, 1.0f);
}
