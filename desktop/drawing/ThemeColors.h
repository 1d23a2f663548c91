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
extern RGBColor kFocusRingColor;           // round the pane that has the keyboard
extern RGBColor kMenuBackgroundColor;      // the ground of an open menu
extern RGBColor kMenuBorderColor;          // its edge
extern RGBColor kMenuTextColor;            // its items
extern RGBColor kMenuInactiveTextColor;    // those that cannot be chosen
extern RGBColor kMenuHiliteColor;          // behind the item under the mouse
extern RGBColor kMenuHiliteTextColor;      // that item
extern RGBColor kMenuSeparatorColor;       // between groups of items
extern RGBColor kPopupFaceTopColor;        // the face of a closed pop-up, from its top
extern RGBColor kPopupFaceBottomColor;     // to its bottom
extern RGBColor kPopupBorderTopColor;      // its edge, from the top
extern RGBColor kPopupBorderBottomColor;   // to the bottom
extern RGBColor kPopupInactiveFaceColor;   // the face of a disabled one
extern RGBColor kPopupInactiveBorderColor; // its edge
extern RGBColor kPopupLightColor;          // the light along the upper edge of the face

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
