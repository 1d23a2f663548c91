// The colours that a theme sets.
#pragma once
#include "host/NamedColors.h"
#include "host/RGBColor.h"
#include <string>
#include <vector>

// Beside the colours of host/NamedColors.h, those that only the desktop itself uses. They can be set by name
// like the others.
namespace ThemeColors {

extern RGBColor kSystemHiliteColor; // what is selected in a text or list
extern RGBColor kTooltipBackgroundColor;
extern RGBColor kTooltipTextColor;
extern RGBColor kTooltipBorderColor;
extern RGBColor kFocusRingColor; // round the pane that has the keyboard

// Whether the theme is a dark one: its kWindowBackgroundColor is darker than a middle gray.
bool IsDark();

} // namespace ThemeColors

// Sets the colour of that name, such as "kDialogActiveTextColor" or "kTooltipTextColor". False, without
// effect, for an unknown name. Nothing is redrawn by it.
bool SetNamedColor(std::string const &name, RGBColor const &);

// Reads the colour of that name; false, without effect, for an unknown name.
bool GetNamedColor(std::string const &name, RGBColor *);

// The names that SetNamedColor knows, in the order of host/NamedColors.h, then those above.
std::vector<std::string> NamedColorNames();
