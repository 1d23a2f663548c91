#include "buttons/StudButtonPane.h"
#include "host/Icons.h"
#include "host/LocalizedStrings.h"
#include "host/NamedColors.h"
#include "host/VelaDrawing.h"
#include "tests/PaneTest.h"
#include <map>

namespace {

short const kFaceFamily = 1004;
short const kLabelList = 4333;

class StudButton : public PaneTest {
protected:
    static studResRec RecordOf(short top, short left, short text, short width) {
        return {studResRec::kKind, top, left, text, width};
    }
    StudButtonPane *New(short top, short left, short text, short width) {
        studResRec record = RecordOf(top, left, text, width);
        return StudButtonPane::NewStudButtonPane(glog, &record);
    }
    static short FaceHeight() { return GetIconBounds(kFaceFamily).bottom; }
    static UString LabelOf(StudButtonPane &button) {
        UString text;
        button.GetButtonText(text);
        return text;
    }
    bool IsRedrawn() {
        desktop.TakeDrawing();
        UpdateGlog(glog);
        return !desktop.TakeDrawing().empty();
    }
    // The calls of a stud with the look that begins with that icon.
    Lines Expected(StudButtonPane &button, Rect const &box, short firstIcon, RGBColor const &color) {
        return Traced(button, [&] {
            TileIconInRectWithEndCaps(box, kFaceFamily, firstIcon);
            VelaDrawing::RGBForeColor(color);
            OS::TextLayout layout;
            Rect const textRect = {box.top, static_cast<short>(box.left + 2),
                                   static_cast<short>(box.bottom - 2), static_cast<short>(box.right - 2)};
            DrawTextLayoutInRect(layout, LabelOf(button), textRect, 1, TextSettings::kAlignCenter,
                                 TextSettings::kTruncateNone, 1, 0, 0, 0, 0.0f, 1.0f, 1.0f);
        });
    }
};

} // namespace

TEST_F(StudButton, ItsPositionsStepEightyPixelsFromTheRight) {
    short const *const positions[] = {&StudButtonPane::kGStud_Left, &StudButtonPane::kGStud_Left2,
                                      &StudButtonPane::kGStud_Left3, &StudButtonPane::kGStud_Left4,
                                      &StudButtonPane::kGStud_Left5};
    for (int i = 0; i < 5; ++i)
        EXPECT_EQ(*positions[i], -80 * (i + 1));
}

TEST_F(StudButton, IsAsHighAsItsFaceAndAsWideAsItsRecordSays) {
    EXPECT_EQ(BoxOf(*New(30, 40, 1, 70)), (Rect{30, 40, static_cast<short>(30 + FaceHeight()), 110}));
}

TEST_F(StudButton, NegativePlacesCountFromTheFarEdges) {
    EXPECT_EQ(BoxOf(*New(-50, StudButtonPane::kGStud_Left2, 1, 70)),
              (Rect{150, 160, static_cast<short>(150 + FaceHeight()), 230}));
}

TEST_F(StudButton, StaysWhenTheWindowIsResizedLater) {
    StudButtonPane *const button = New(-50, -80, 1, 70);
    Show();
    Rect const before = BoxOf(*button);
    desktop.Play("resize 500 400");
    EXPECT_EQ(BoxOf(*button), before);
}

TEST_F(StudButton, IsNotMadeWithoutAGlog) {
    studResRec record = RecordOf(0, 0, 1, 70);
    EXPECT_EQ(StudButtonPane::NewStudButtonPane(nullptr, &record), nullptr);
}

TEST_F(StudButton, TakesItsLabelFromTheStringList) {
    StudButtonPane *const button = New(0, 0, 2, 70);
    EXPECT_FALSE(LabelOf(*button).empty());
    EXPECT_TRUE(LabelOf(*button) == LocalizedStrings::GetString(kLabelList, 2));
}

TEST_F(StudButton, AnUnknownTextIsAnEmptyLabel) { EXPECT_TRUE(LabelOf(*New(0, 0, 999, 70)).empty()); }

TEST_F(StudButton, DrawsItsFaceAndItsLabelCentredInset) {
    StudButtonPane *const button = New(10, 20, 1, 70);
    EXPECT_EQ(DrawingOf(*button), Expected(*button, BoxOf(*button), 0, kDialogButtonActiveTextColor));
}

TEST_F(StudButton, DrawsItselfPressed) {
    StudButtonPane *const button = New(10, 20, 1, 70);
    button->Depress();
    EXPECT_EQ(DrawingOf(*button), Expected(*button, BoxOf(*button), 3, kDialogButtonActiveTextColor));
}

TEST_F(StudButton, DrawsItselfDisabledEvenWhenPressed) {
    StudButtonPane *const button = New(10, 20, 1, 70);
    button->Depress();
    button->Disable();
    EXPECT_EQ(DrawingOf(*button), Expected(*button, BoxOf(*button), 6, kDialogButtonInactiveTextColor));
}

TEST_F(StudButton, OtherModesLookEnabled) {
    StudButtonPane *const button = New(10, 20, 1, 70);
    button->SetMode(3);
    EXPECT_EQ(DrawingOf(*button), Expected(*button, BoxOf(*button), 0, kDialogButtonActiveTextColor));
}

TEST_F(StudButton, IsNotDrawnInTheInvisibleMode) {
    StudButtonPane *const button = New(10, 20, 1, 70);
    button->SetMode(StudButtonPane::kInvisible);
    EXPECT_TRUE(DrawingOf(*button).empty());
}

TEST_F(StudButton, RefusesClicksInTheInvisibleMode) {
    StudButtonPane *const button = New(10, 20, 1, 70);
    button->SetMode(StudButtonPane::kInvisible);
    Show();
    EXPECT_EQ(ResultOfClick("click 30 15"), 0);
}

TEST_F(StudButton, DrawsTheTextThatASubclassGives) {
    class Counter : public StudButtonPane {
    public:
        explicit Counter(glogRec *owner) {
            studResRec record = {studResRec::kKind, 10, 20, 1, 70};
            InitStudButtonPane(owner, &record);
        }
        void GetButtonText(UString &text) const override { text = UString("12", UString::kByteEncoding1); }
    };
    Counter *const button = new Counter(glog);
    EXPECT_EQ(DrawingOf(*button), Expected(*button, BoxOf(*button), 0, kDialogButtonActiveTextColor));
}

TEST_F(StudButton, LeavesTheColoursOfThePortAsTheyWere) {
    StudButtonPane *const button = New(10, 20, 1, 70);
    EXPECT_TRUE(KeepsColors(*button));
    button->SetMode(StudButtonPane::kInvisible);
    EXPECT_TRUE(KeepsColors(*button));
}

TEST_F(StudButton, AnotherLabelIsShownAtOnce) {
    StudButtonPane *const button = New(10, 20, 1, 70);
    Show();
    button->SetLabel(Text("Anew"));
    EXPECT_TRUE(LabelOf(*button) == Text("Anew"));
    EXPECT_TRUE(IsRedrawn());
}

TEST_F(StudButton, TheSameLabelIsNotRepainted) {
    StudButtonPane *const button = New(10, 20, 1, 70);
    Show();
    button->SetLabel(LocalizedStrings::GetString(kLabelList, 1));
    EXPECT_FALSE(IsRedrawn());
}

TEST_F(StudButton, ALabelMayBeGivenByItsNumber) {
    StudButtonPane *const button = New(10, 20, 1, 70);
    Show();
    button->SetLabel(short(2));
    EXPECT_TRUE(LabelOf(*button) == LocalizedStrings::GetString(kLabelList, 2));
    EXPECT_TRUE(IsRedrawn());
    button->SetLabel(short(2));
    EXPECT_FALSE(IsRedrawn());
}

TEST_F(StudButton, AClickGivesOne) {
    New(10, 20, 1, 70);
    Show();
    EXPECT_EQ(ResultOfClick("click 30 15"), 1);
}

TEST_F(StudButton, IsMadeFromASheet) {
    TestItem item;
    item.Box("BoundsRect", {12, 14, 99, 84}).Integer("TextID", 2);
    StudButtonPane *const button = StudButtonPane::NewStudButtonPane(glog, item.Sheet());
    EXPECT_EQ(BoxOf(*button), (Rect{12, 14, static_cast<short>(12 + FaceHeight()), 84}));
    EXPECT_TRUE(LabelOf(*button) == LocalizedStrings::GetString(kLabelList, 2));
}

TEST_F(StudButton, CountsFromTheFarEdgesInASheetToo) {
    TestItem item;
    item.Box("BoundsRect", {-50, -80, -30, -10}).Integer("TextID", 2);
    StudButtonPane *const button = StudButtonPane::NewStudButtonPane(glog, item.Sheet());
    EXPECT_EQ(BoxOf(*button), (Rect{150, 240, static_cast<short>(150 + FaceHeight()), 310}));
}

TEST_F(StudButton, IsMadeFromASheetWithoutBoundsAtZero) {
    TestItem item;
    StudButtonPane *const button = StudButtonPane::NewStudButtonPane(glog, item.Sheet());
    EXPECT_EQ(BoxOf(*button), (Rect{0, 0, FaceHeight(), 0}));
}

TEST_F(StudButton, IsNotMadeFromASheetWithoutAGlog) {
    TestItem item;
    EXPECT_EQ(StudButtonPane::NewStudButtonPane(nullptr, item.Sheet()), nullptr);
}

TEST_F(StudButton, FormerTextNumbersOfASheetAreTurnedIntoThePresentOnes) {
    std::map<short, short> const changed = {
        {6, 5},   {8, 6},   {9, 7},   {10, 8},  {11, 9},  {12, 10}, {13, 11}, {15, 13}, {19, 16},
        {21, 17}, {22, 18}, {23, 19}, {24, 20}, {25, 21}, {27, 22}, {28, 23}, {29, 24}, {30, 25},
        {32, 26}, {33, 27}, {34, 28}, {35, 29}, {36, 30}, {37, 31}, {38, 32}, {39, 33}, {40, 34},
        {41, 35}, {42, 36}, {43, 37}, {44, 38}, {45, 39}, {46, 40}, {47, 41}};
    for (short number = -2; number <= 60; ++number) {
        auto const entry = changed.find(number);
        short const expected = entry == changed.end() ? number : entry->second;
        TestItem item;
        item.Integer("TextID", number);
        StudButtonPane *const button = StudButtonPane::NewStudButtonPane(glog, item.Sheet());
        EXPECT_TRUE(LabelOf(*button) == LocalizedStrings::GetString(kLabelList, expected)) << number;
    }
}

TEST_F(StudButton, TextNumbersOfARecordAreThePresentOnes) {
    EXPECT_TRUE(LabelOf(*New(0, 0, 6, 70)) == LocalizedStrings::GetString(kLabelList, 6));
    EXPECT_FALSE(LocalizedStrings::GetString(kLabelList, 6) == LocalizedStrings::GetString(kLabelList, 5));
}

TEST_F(StudButton, ASheetWithoutItemFailsAnAssertion) {
    GlogStyleSheet empty;
    EXPECT_THROW(StudButtonPane::NewStudButtonPane(glog, &empty), BrokenInvariant);
}
