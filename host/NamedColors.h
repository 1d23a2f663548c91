// The theme's colours.
//
// Each is one object for the life of the process, so its address may be kept; its value changes when the
// theme changes.
#pragma once
#include "host/RGBColor.h"

extern RGBColor const kDialogActiveTextColor;         // text on the window's ground
extern RGBColor const kDialogInactiveTextColor;       // the same, of something disabled
extern RGBColor const kDialogButtonActiveTextColor;   // the label of a push button
extern RGBColor const kDialogButtonInactiveTextColor; // the same, disabled
extern RGBColor const kDialogListBackgroundColor;     // the ground of a list or graph
extern RGBColor const kDialogListTextColor;           // text in a list, lines of a graph
extern RGBColor const kDialogListInactiveTextColor;   // the same, disabled
extern RGBColor const kListBackgroundColor;           // a small list below its rows
extern RGBColor const kListItemColor;                 // a small list behind its rows
extern RGBColor const kSmallListActiveTextColor;      // text in a small list
extern RGBColor const kPanelUnderline;                // dividing lines
extern RGBColor const kScrollBarBackgroundColor;      // the trough of a scroll bar
extern RGBColor const kScrollBarBorderColor;          // the frame of a scroll bar or list
extern RGBColor const kTextWellBackgroundColor;       // the ground of editable text
extern RGBColor const kTextWellTextColor;             // editable text
extern RGBColor const kWindowBackgroundColor;         // the ground of a window
extern RGBColor const kHiliteColor;                   // outline of what is selected in a picture
