#pragma once
#include "host/RGBColor.h"

extern RGBColor const kDialogActiveTextColor;
extern RGBColor const kDialogInactiveTextColor;
extern RGBColor const kDialogButtonActiveTextColor;
extern RGBColor const kDialogButtonInactiveTextColor;
extern RGBColor const kDialogListBackgroundColor;
extern RGBColor const kDialogListTextColor;
extern RGBColor const kDialogListInactiveTextColor;
extern RGBColor const kListBackgroundColor;
extern RGBColor const kListItemColor;
extern RGBColor const kSmallListActiveTextColor;
extern RGBColor const kPanelUnderline;
extern RGBColor const kScrollBarBackgroundColor;
extern RGBColor const kScrollBarBorderColor;
extern RGBColor const kTextWellBackgroundColor;
extern RGBColor const kTextWellTextColor;
extern RGBColor const kWindowBackgroundColor;

extern RGBColor const kHiliteColor;
