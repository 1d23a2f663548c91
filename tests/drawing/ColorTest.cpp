#include "Canvas.h"
#include "desktop/drawing/ThemeColors.h"
#include <limits>

namespace {

// Puts back the colours that a test changes.
class KeptColors {
public:
    KeptColors() {
        for (std::string const &name : NamedColorNames()) {
            RGBColor color = {0, 0, 0};
            GetNamedColor(name, &color);
            colors.emplace_back(name, color);
        }
    }
    ~KeptColors() {
        for (auto const &color : colors)
            SetNamedColor(color.first, color.second);
    }

private:
    std::vector<std::pair<std::string, RGBColor>> colors;
};

bool Same(RGBColor const &a, RGBColor const &b) {
    return a.red == b.red && a.green == b.green && a.blue == b.blue;
}

RGBColor Fore() {
    RGBColor color;
    VelaDrawing::GetForeColor(&color);
    return color;
}

RGBColor Back() {
    RGBColor color;
    VelaDrawing::GetBackColor(&color);
    return color;
}

RGBColor const kDark = {0x1000, 0x1000, 0x1000};

} // namespace

TEST(Colors, AColourComesBackFromThePortAsItWent) {
    Canvas canvas(4, 4);
    for (int component = 0; component <= 0xFFFF; component += 77) {
        RGBColor const color = {static_cast<unsigned short>(component),
                                static_cast<unsigned short>(0xFFFF - component), 0x1234};
        VelaDrawing::RGBForeColor(color);
        ASSERT_TRUE(Same(Fore(), color));
    }
}

TEST(Colors, ComponentsAreDividedInSinglePrecision) {
    OS::RGBAColor const color = ToRGBA({0x1234, 0xFFFF, 0});
    EXPECT_EQ(color.r, static_cast<double>(static_cast<float>(0x1234) / 65535.0f));
    EXPECT_EQ(color.g, 1.0);
    EXPECT_EQ(color.a, 1.0);
}

TEST(Colors, WhatIsBeyondAColourIsCut) {
    RGBColor const color = ToRGB({-3, 7, std::numeric_limits<double>::quiet_NaN(), 1});
    EXPECT_TRUE(Same(color, {0, 0xFFFF, 0}));
}

TEST(Colors, ANameFindsTheObjectThatPanesSee) {
    KeptColors kept;
    RGBColor const *address = &kDialogActiveTextColor;
    EXPECT_TRUE(SetNamedColor("kDialogActiveTextColor", {1, 2, 3}));
    EXPECT_TRUE(Same(*address, {1, 2, 3}));
    EXPECT_TRUE(Same(kDialogActiveTextColor, {1, 2, 3}));
    EXPECT_TRUE(SetNamedColor("kTooltipTextColor", {4, 5, 6}));
    EXPECT_TRUE(Same(ThemeColors::kTooltipTextColor, {4, 5, 6}));
    EXPECT_FALSE(SetNamedColor("kNoSuchColor", {1, 2, 3}));
    RGBColor untouched = {9, 9, 9};
    EXPECT_FALSE(GetNamedColor("kNoSuchColor", &untouched));
    EXPECT_EQ(untouched.red, 9);
}

TEST(Colors, EveryNameIsListedOnceAndLeadsToItsOwnColour) {
    KeptColors kept;
    std::vector<std::string> const names = NamedColorNames();
    EXPECT_EQ(names.size(), 36u);
    for (std::size_t i = 0; i < names.size(); ++i)
        ASSERT_TRUE(SetNamedColor(names[i], {static_cast<unsigned short>(i + 1), 0, 0}));
    for (std::size_t i = 0; i < names.size(); ++i) {
        RGBColor color = {0, 0, 0};
        ASSERT_TRUE(GetNamedColor(names[i], &color));
        EXPECT_EQ(color.red, i + 1) << names[i];
    }
    EXPECT_EQ(kHiliteColor.red, 17); // the last of those that panes know
}

TEST(Colors, GraysRunFromBlackToWhiteInALightThemeAndTheOtherWayInADarkOne) {
    KeptColors kept;
    Canvas canvas(4, 4);
    GrayForeColor(0);
    GrayBackColor(100);
    EXPECT_TRUE(Same(Fore(), {0, 0, 0}));
    EXPECT_TRUE(Same(Back(), {0xFFFF, 0xFFFF, 0xFFFF}));
    GrayForeColor(250);
    EXPECT_EQ(Fore().red, 0xFFFF);
    GrayForeColor(-5);
    EXPECT_EQ(Fore().red, 0);

    SetNamedColor("kWindowBackgroundColor", kDark);
    EXPECT_TRUE(ThemeColors::IsDark());
    GrayForeColor(0);
    GrayBackColor(100);
    EXPECT_EQ(Fore().red, 0xFFFF);
    EXPECT_EQ(Back().red, 0);
    GrayForeColor(20);
    EXPECT_EQ(Fore().red, 0xCCCC);
}

TEST(Colors, TheHiliteColourIsTheThemes) {
    KeptColors kept;
    Canvas canvas(4, 4);
    SetNamedColor("kSystemHiliteColor", {0x1111, 0x2222, 0x3333});
    RGBColor color;
    GetHiliteColor(&color);
    EXPECT_TRUE(Same(color, {0x1111, 0x2222, 0x3333}));
    SetUserHiliteColorAsForeColor();
    EXPECT_TRUE(Same(Fore(), color));
}

TEST(Colors, ClearColorsGivesBlackOnWhite) {
    Canvas canvas(4, 4);
    SetForegroundColor(RGBColor{1, 2, 3});
    SetBackgroundColor(OS::RGBAColor(0.5, 0.25, 0, 0.5));
    SaveColorRec colors;
    GetColors(&colors);
    EXPECT_TRUE(Same(colors.fore, {1, 2, 3}));
    EXPECT_EQ(colors.back.red, 0x8000);
    ClearColors();
    EXPECT_TRUE(Same(Fore(), {0, 0, 0}));
    EXPECT_TRUE(Same(Back(), {0xFFFF, 0xFFFF, 0xFFFF}));
    SetColors(&colors);
    EXPECT_TRUE(Same(Fore(), {1, 2, 3}));
    EXPECT_EQ(canvas.port.State().back.a, 1.0);
}
