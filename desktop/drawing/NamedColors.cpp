// The named colours are constant to all who use them, and change with the theme. So they are defined here as
// the variables that they are: this file must not include host/NamedColors.h, whose declarations are the
// constant view of the same objects. The values are those of the light theme, until a theme is loaded.
#include "desktop/drawing/NamedColorTable.h"

namespace {

constexpr RGBColor Rgb(unsigned rgb) {
    constexpr unsigned kRepeat = 0x101; // 0xAB becomes 0xABAB
    return {static_cast<unsigned short>((rgb >> 16 & 0xFF) * kRepeat),
            static_cast<unsigned short>((rgb >> 8 & 0xFF) * kRepeat),
            static_cast<unsigned short>((rgb & 0xFF) * kRepeat)};
}

} // namespace

RGBColor kDialogActiveTextColor = Rgb(0x1D1F23);
RGBColor kDialogInactiveTextColor = Rgb(0x636974);
RGBColor kDialogButtonActiveTextColor = Rgb(0x1D1F23);
RGBColor kDialogButtonInactiveTextColor = Rgb(0x787E89);
RGBColor kDialogListBackgroundColor = Rgb(0xFFFFFF);
RGBColor kDialogListTextColor = Rgb(0x1D1F23);
RGBColor kDialogListInactiveTextColor = Rgb(0x6B717C);
RGBColor kListBackgroundColor = Rgb(0xF5F6F8);
RGBColor kListItemColor = Rgb(0xFFFFFF);
RGBColor kSmallListActiveTextColor = Rgb(0x1D1F23);
RGBColor kPanelUnderline = Rgb(0xC3C8D0);
RGBColor kScrollBarBackgroundColor = Rgb(0xEFF1F4);
RGBColor kScrollBarBorderColor = Rgb(0xB9BFC9);
RGBColor kTextWellBackgroundColor = Rgb(0xFFFFFF);
RGBColor kTextWellTextColor = Rgb(0x1D1F23);
RGBColor kWindowBackgroundColor = Rgb(0xE8EAED);
RGBColor kHiliteColor = Rgb(0x2A6BDB);

namespace ThemeColors {
RGBColor kSystemHiliteColor = Rgb(0xB9D4FB);
RGBColor kTooltipBackgroundColor = Rgb(0x2B2E34);
RGBColor kTooltipTextColor = Rgb(0xF5F6F8);
RGBColor kTooltipBorderColor = Rgb(0x17191C);
RGBColor kFocusRingColor = Rgb(0x3478E5);
RGBColor kMenuBackgroundColor = Rgb(0xFBFCFD);
RGBColor kMenuBorderColor = Rgb(0xA9B0BB);
RGBColor kMenuTextColor = Rgb(0x1D1F23);
RGBColor kMenuInactiveTextColor = Rgb(0x757B86);
RGBColor kMenuHiliteColor = Rgb(0x2A6BDB);
RGBColor kMenuHiliteTextColor = Rgb(0xFFFFFF);
RGBColor kMenuSeparatorColor = Rgb(0xDDE1E6);
RGBColor kPopupFaceTopColor = Rgb(0xFFFFFF);
RGBColor kPopupFaceBottomColor = Rgb(0xF1F3F5);
RGBColor kPopupBorderTopColor = Rgb(0xC2C8D0);
RGBColor kPopupBorderBottomColor = Rgb(0xA4ACB8);
RGBColor kPopupInactiveFaceColor = Rgb(0xEEF0F2);
RGBColor kPopupInactiveBorderColor = Rgb(0xC9CED5);
RGBColor kPopupLightColor = Rgb(0xFFFFFF);
} // namespace ThemeColors

NamedColorEntry const kNamedColorTable[kNamedColorCount] = {
    {"kDialogActiveTextColor", &kDialogActiveTextColor},
    {"kDialogInactiveTextColor", &kDialogInactiveTextColor},
    {"kDialogButtonActiveTextColor", &kDialogButtonActiveTextColor},
    {"kDialogButtonInactiveTextColor", &kDialogButtonInactiveTextColor},
    {"kDialogListBackgroundColor", &kDialogListBackgroundColor},
    {"kDialogListTextColor", &kDialogListTextColor},
    {"kDialogListInactiveTextColor", &kDialogListInactiveTextColor},
    {"kListBackgroundColor", &kListBackgroundColor},
    {"kListItemColor", &kListItemColor},
    {"kSmallListActiveTextColor", &kSmallListActiveTextColor},
    {"kPanelUnderline", &kPanelUnderline},
    {"kScrollBarBackgroundColor", &kScrollBarBackgroundColor},
    {"kScrollBarBorderColor", &kScrollBarBorderColor},
    {"kTextWellBackgroundColor", &kTextWellBackgroundColor},
    {"kTextWellTextColor", &kTextWellTextColor},
    {"kWindowBackgroundColor", &kWindowBackgroundColor},
    {"kHiliteColor", &kHiliteColor},
    {"kSystemHiliteColor", &ThemeColors::kSystemHiliteColor},
    {"kTooltipBackgroundColor", &ThemeColors::kTooltipBackgroundColor},
    {"kTooltipTextColor", &ThemeColors::kTooltipTextColor},
    {"kTooltipBorderColor", &ThemeColors::kTooltipBorderColor},
    {"kFocusRingColor", &ThemeColors::kFocusRingColor},
    {"kMenuBackgroundColor", &ThemeColors::kMenuBackgroundColor},
    {"kMenuBorderColor", &ThemeColors::kMenuBorderColor},
    {"kMenuTextColor", &ThemeColors::kMenuTextColor},
    {"kMenuInactiveTextColor", &ThemeColors::kMenuInactiveTextColor},
    {"kMenuHiliteColor", &ThemeColors::kMenuHiliteColor},
    {"kMenuHiliteTextColor", &ThemeColors::kMenuHiliteTextColor},
    {"kMenuSeparatorColor", &ThemeColors::kMenuSeparatorColor},
    {"kPopupFaceTopColor", &ThemeColors::kPopupFaceTopColor},
    {"kPopupFaceBottomColor", &ThemeColors::kPopupFaceBottomColor},
    {"kPopupBorderTopColor", &ThemeColors::kPopupBorderTopColor},
    {"kPopupBorderBottomColor", &ThemeColors::kPopupBorderBottomColor},
    {"kPopupInactiveFaceColor", &ThemeColors::kPopupInactiveFaceColor},
    {"kPopupInactiveBorderColor", &ThemeColors::kPopupInactiveBorderColor},
    {"kPopupLightColor", &ThemeColors::kPopupLightColor},
};
