#include "host/PopupMenuDrawing.h"
#include "desktop/drawing/Colors.h"
#include "desktop/drawing/DrawingPort.h"
#include "desktop/drawing/ThemeColors.h"
#include "desktop/menus/MenuMarks.h"
#include "desktop/menus/PopupLayout.h"
#include "host/NamedColors.h"
#include "host/OSFont.h"
#include "host/PortSavers.h"
#include "host/VelaDrawing.h"
#include <algorithm>

namespace {

int const kFont = 0;    // in the font table
int const kCorner = 8;  // diameter of the round corners
int const kCentred = 1; // vertically

RGBColor Between(RGBColor const &from, RGBColor const &to, int part, int whole) {
    auto const mix = [=](int a, int b) { return static_cast<unsigned short>(a + (b - a) * part / whole); };
    return {mix(from.red, to.red), mix(from.green, to.green), mix(from.blue, to.blue)};
}

// The rounded rectangle in colours that change from its top to its bottom. Only rows with corners need them.
void PaintShaded(Rect const &r, int corner, RGBColor const &top, RGBColor const &bottom) {
    int const height = r.bottom - r.top, radius = corner / 2;
    for (int i = 0; i < height; ++i) {
        Rect const row = {static_cast<short>(r.top + i), r.left, static_cast<short>(r.top + i + 1), r.right};
        VelaDrawing::RGBForeColor(Between(top, bottom, i, std::max(height - 1, 1)));
        if (i >= radius && i < height - radius) {
            VelaDrawing::PaintRect(&row);
        } else {
            WithClipRect const clip(row);
            OSPort::Current().PaintRoundRect(r, OS::Size(corner, corner));
        }
    }
}

// A button's face: rounded, lighter at the top.
void DrawFace(Rect const &r, bool enabled) {
    Rect inside = r;
    VelaDrawing::InsetRect(&inside, 1, 1);
    if (!enabled) {
        PaintShaded(r, kCorner, ThemeColors::kPopupInactiveBorderColor,
                    ThemeColors::kPopupInactiveBorderColor);
        PaintShaded(inside, kCorner - 2, ThemeColors::kPopupInactiveFaceColor,
                    ThemeColors::kPopupInactiveFaceColor);
        return;
    }
    PaintShaded(r, kCorner, ThemeColors::kPopupBorderTopColor, ThemeColors::kPopupBorderBottomColor);
    PaintShaded(inside, kCorner - 2, ThemeColors::kPopupFaceTopColor, ThemeColors::kPopupFaceBottomColor);
    if (VelaDrawing::EmptyRect(&inside))
        return;
    Rect const light = {inside.top, static_cast<short>(inside.left + kCorner / 2),
                        static_cast<short>(inside.top + 1), static_cast<short>(inside.right - kCorner / 2)};
    VelaDrawing::RGBForeColor(ThemeColors::kPopupLightColor);
    VelaDrawing::PaintRect(&light);
}

// Part of the bar that the pop-up sits in.
void DrawScrollBarGround(Rect const &r) {
    VelaDrawing::RGBForeColor(kScrollBarBackgroundColor);
    VelaDrawing::PaintRect(&r);
    VelaDrawing::RGBForeColor(kScrollBarBorderColor);
    VelaDrawing::FrameRect(&r);
}

// A small mark over an icon stands on the ground alone.
void ClearBehind(Rect const &arrow, bool enabled, bool inScrollBar) {
    Rect r = arrow;
    VelaDrawing::InsetRect(&r, -1, -1);
    VelaDrawing::RGBForeColor(inScrollBar ? kScrollBarBackgroundColor
                              : enabled   ? ThemeColors::kPopupFaceBottomColor
                                          : ThemeColors::kPopupInactiveFaceColor);
    VelaDrawing::PaintRect(&r);
}

RGBColor TextColor(bool enabled, RGBColor const *color) {
    if (color)
        return *color;
    return enabled ? kDialogButtonActiveTextColor : kDialogButtonInactiveTextColor;
}

} // namespace

void DrawPopupMenuWithTextLayout(OS::TextLayout &layout, Rect const &r, UString const &name, short icon,
                                 bool enabled, short textFace, RGBColor const *color,
                                 PopupMenuBackColor background, PopupMenuPulldown pulldown,
                                 TextSettings::TruncateCode truncation, TextSettings::Alignment alignment,
                                 int wrap, int, int) {
    if (VelaDrawing::EmptyRect(&r) || !OSPort::GetCurrent())
        return;
    SaveColors const colors;
    VelaDrawing::PenNormal();
    bool const inScrollBar = background == kPopupBackScrollBar;
    if (inScrollBar)
        DrawScrollBarGround(r);
    else
        DrawFace(r, enabled);
    PopupLayout const parts(r, pulldown, icon != 0);
    WithClipRect const clip(r);
    MenuMarks::State const state = enabled ? MenuMarks::kPlain : MenuMarks::kDisabled;
    if (icon != 0)
        MenuMarks::DrawItemIcon(icon, state, parts.icon.left, parts.icon);
    if (parts.narrowArrow && icon != 0)
        ClearBehind(parts.arrow, enabled, inScrollBar);
    if (parts.hasArrow)
        MenuMarks::Draw(parts.narrowArrow ? MenuMarks::kNarrowPulldown : MenuMarks::kPulldown, state,
                        parts.arrow.left, parts.arrow);
    if (name.empty() || parts.text.left >= parts.text.right)
        return;
    fontSaveRec const &font = *GetIndVelaFont(kFont);
    VelaDrawing::RGBForeColor(TextColor(enabled, color));
    DrawTextLayoutInRect(layout, name, parts.text, font.family, textFace, font.size, alignment, truncation,
                         kCentred, wrap, 0, 0, 0.0f, 1.0f, 1.0f);
}
