// The look of a closed pop-up menu.
#pragma once
#include "host/Geometry.h"
#include "host/RGBColor.h"
#include "host/TextLayout.h"
#include "host/TextSettings.h"
#include "host/UString.h"

// What the pop-up stands on.
enum PopupMenuBackColor { kPopupBackDefault = 0, kPopupBackScrollBar = 3 };
// Which arrow there is: none; one without a name beside it; the usual one behind the name; a small one alone,
// for rectangles under 25 pixels wide, which have no room for a name.
enum PopupMenuPulldown { kPulldown0 = 0, kPulldownNoText = 1, kPulldownNormal = 2, kPulldownNarrow = 3 };

// Draws the pop-up into the rectangle: ground, the current item's icon (in family 2006; 0: none) and name,
// and the arrow, greyed when not enabled. The layout belongs to this pop-up and keeps the shaped name from
// one drawing to the next. A null colour is the usual one. `wrap` is that of the text calls; pass 0 and 2 as
// the last two.
void DrawPopupMenuWithTextLayout(OS::TextLayout &, Rect const &, UString const &name, short icon,
                                 bool enabled, short textFace, RGBColor const *color, PopupMenuBackColor,
                                 PopupMenuPulldown, TextSettings::TruncateCode, TextSettings::Alignment,
                                 int wrap, int unknown, int last);
