#pragma once
#include "host/Geometry.h"
#include "host/RGBColor.h"
#include "host/TextLayout.h"
#include "host/TextSettings.h"
#include "host/UString.h"

enum PopupMenuBackColor { kPopupBackDefault = 0, kPopupBackScrollBar = 3 };

enum PopupMenuPulldown { kPulldown0 = 0, kPulldownNoText = 1, kPulldownNormal = 2, kPulldownNarrow = 3 };

void DrawPopupMenuWithTextLayout(OS::TextLayout &, Rect const &, UString const &name, short icon, bool enabled,
                                 short textFace, RGBColor const *color, PopupMenuBackColor, PopupMenuPulldown,
                                 TextSettings::TruncateCode, TextSettings::Alignment,
                                 int wrap, int unknown, int last);
