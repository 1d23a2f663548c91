#include "desktop/menus/PopupLayout.h"
#include <algorithm>

namespace {

int const kTextInset = 9; // before the text, and behind it where there is no arrow
int const kIconSide = 16;
int const kIconInset = 6, kIconGap = 5;
int const kArrowWidth = 9, kArrowInset = 7; // the latter from the right edge
int const kArrowGap = 4;                    // between text and arrow
int const kNarrowWidth = 7, kNarrowHeight = 5;
int const kNarrowInset = 3; // from the corner

Rect Slice(Rect const &r, int left, int right) {
    return {r.top, static_cast<short>(left), r.bottom, static_cast<short>(right)};
}

Rect Centred(Rect const &r, int width) {
    int const left = (r.left + r.right - width) / 2;
    return Slice(r, left, left + width);
}

} // namespace

PopupLayout::PopupLayout(Rect const &r, PopupMenuPulldown pulldown, bool hasIcon)
    : icon(Slice(r, r.left, r.left))
    , text(icon)
    , arrow(icon)
    , hasArrow(pulldown != kPulldown0)
    , narrowArrow(pulldown == kPulldownNarrow) {
    if (narrowArrow) {
        // There is no room for a name: the arrow stands alone in the middle, or in the corner of an icon.
        arrow = Centred(r, kNarrowWidth);
        if (hasIcon) {
            icon = Centred(r, kIconSide);
            arrow = Slice(r, r.right - kNarrowInset - kNarrowWidth, r.right - kNarrowInset);
            arrow.bottom = static_cast<short>(r.bottom - kNarrowInset);
            arrow.top = static_cast<short>(arrow.bottom - kNarrowHeight);
        }
        return;
    }
    int left = r.left + kTextInset, right = r.right - kTextInset;
    if (pulldown == kPulldownNoText && !hasIcon) {
        arrow = Centred(r, kArrowWidth);
        return;
    }
    if (hasArrow) {
        arrow = Slice(r, r.right - kArrowInset - kArrowWidth, r.right - kArrowInset);
        right = arrow.left - kArrowGap;
    }
    if (hasIcon) {
        int const iconLeft = r.left + kIconInset;
        icon = Slice(r, iconLeft, iconLeft + kIconSide);
        left = icon.right + kIconGap;
    }
    if (pulldown != kPulldownNoText)
        text = Slice(r, left, std::max(left, right));
}
