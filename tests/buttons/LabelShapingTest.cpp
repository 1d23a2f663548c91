// How often labels of groups are shaped.
#include "tests/ShapingCount.h"
#include "tests/buttons/ButtonGroupTest.h"

namespace {

class LabelShaping : public ButtonGroupTest {
protected:
    // A font that is used for the first time is measured, by a layout of its own.
    LabelShaping() {
        for (int font : {0, 1, 9})
            WidthOf("x", font);
    }
    // How many texts the action shapes.
    static int Shaped(std::function<void()> const &action) {
        int const before = ShapingCount::texts;
        action();
        return ShapingCount::texts - before;
    }
    // Names that no other test has.
    static UString Name(std::string const &test, int i) {
        return Text((test + " label " + std::to_string(i)).c_str());
    }
};

} // namespace

TEST_F(LabelShaping, ALabelIsShapedOnceWhenItIsMeasuredForTheFirstTime) {
    CheckBoxPane *const group = NewBoxes();
    EXPECT_EQ(Shaped([&] {
                  for (int i = 0; i < 10; ++i)
                      group->AddButton(0, static_cast<short>(20 * i), Name("new", i));
              }),
              10);
}

TEST_F(LabelShaping, MeasuringALabelWhoseFontAndTextAreKnownShapesNothing) {
    CheckBoxPane *const first = NewBoxes();
    for (int i = 0; i < 10; ++i)
        first->AddButton(0, static_cast<short>(20 * i), Name("known", i));
    RadioButtonPane *const second = NewRadios();
    EXPECT_EQ(Shaped([&] {
                  for (int i = 0; i < 10; ++i)
                      second->AddButton(100, static_cast<short>(20 * i), Name("known", i));
              }),
              0);
    SetFontData(GetIndVelaFont(0));
    EXPECT_EQ(Shaped([&] { second->SetNthButtonName(3, Name("known", 4)); }), 0);
}

TEST_F(LabelShaping, ALabelOfAResourceWhoseFontAndTextAreKnownIsNotShapedAgain) {
    auto const load = [this] {
        GroupItem item;
        for (short i = 0; i < 10; ++i)
            item.Button({static_cast<short>(20 * i), 20})
                .Label({static_cast<short>(20 * i + 10), 38}, ("resource " + std::to_string(i)).c_str(), 1);
        CheckBoxPane::NewCheckBoxPane(glog, item.Sheet());
    };
    EXPECT_EQ(Shaped(load), 10);
    EXPECT_EQ(Shaped(load), 0);
}

TEST_F(LabelShaping, AnotherFontShapesTheSameTextOnceMore) {
    GroupItem item;
    item.Button({10, 20}).Label({20, 38}, "in two fonts", 0).Label({40, 38}, "in two fonts", 9);
    EXPECT_EQ(Shaped([&] { CheckBoxPane::NewCheckBoxPane(glog, item.Sheet()); }), 2);
}

TEST_F(LabelShaping, WhatWasMeasuredIsNotShapedAgainToBeDrawn) {
    UseSpacing(16);
    CheckBoxPane *const group = NewBoxes();
    for (int i = 0; i < 9; ++i)
        group->AddButton(0, static_cast<short>(20 * i), Name("drawn", i));
    Rect box = {0, 0, 200, 320};
    group->SetBox(&box);
    EXPECT_EQ(Shaped([&] { Show(); }), 0);
    EXPECT_EQ(Shaped([&] {
                  group->SetAllToSame(true);
                  group->SetAllEnable(false);
                  Repainted();
              }),
              0);
}

TEST_F(LabelShaping, AThousandLabelsOfTenTextsShapeTen) {
    CheckBoxPane *const group = NewBoxes();
    EXPECT_EQ(Shaped([&] {
                  for (int i = 0; i < 1000; ++i)
                      group->AddButton(0, 0, Name("thousand", i % 10));
              }),
              10);
}
