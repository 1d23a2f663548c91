#include "text/GTextPane.h"
#include "desktop/drawing/Surface.h"
#include "host/CompoundPane.h"
#include "host/NamedColors.h"
#include "host/OSRgn.h"
#include "host/Services.h"
#include "host/TarnError.h"
#include "host/VelaDrawing.h"
#include "tests/LibraryExports.h"
#include "tests/VirtualPlace.h"
#include "tests/buttons/ButtonGroupTest.h"
#include "tests/frame/Allocations.h"
#include "tests/text/TextFieldTest.h"
#include <cstddef>
#include <type_traits>

namespace {

typedef TextFieldTest GTextPaneTest;

// The table and the bases

TEST_F(GTextPaneTest, HasItsNewOperationsInTheirOrder) {
    ExpectInOrder(kAfterDestructor, &GTextPane::SetVScrollPos, &GTextPane::SetupColors,
                  &GTextPane::MaybeSelectTextWhenSelected, &GTextPane::MaybeDeselectTextWhenDeactivated,
                  &GTextPane::GetTextEditCreationFlags, &GTextPane::DrawTextWell,
                  &GTextPane::DoFrameTextWell);
}

TEST_F(GTextPaneTest, HasItsBasesInTheirOrder) {
    OpenTextField *const pane = Make();
    void const *const places[] = {static_cast<Provider<TextPaneListener> *>(pane),
                                  static_cast<EditBoxPane *>(pane),
                                  static_cast<EditOpInterface *>(pane),
                                  static_cast<Provider<AutoSetActivityListener> *>(pane),
                                  static_cast<TarnOSWindow::OSWindow_PlatformWindowListener *>(pane),
                                  static_cast<OS::TextEditListener *>(pane)};
    for (std::size_t i = 1; i < 6; ++i)
        EXPECT_LT(places[i - 1], places[i]) << i;
    EXPECT_EQ(static_cast<void const *>(pane), places[0]);
}

TEST_F(GTextPaneTest, AHelperHasNoVirtualDestructor) {
    EXPECT_FALSE(std::has_virtual_destructor<GTextPaneDrawingHelper>::value);
}

TEST_F(GTextPaneTest, TheRecordHasTheLayoutOfItsResource) {
    gtextResRec record;
    auto const offset = [&](void const *field) {
        return static_cast<char const *>(field) - reinterpret_cast<char const *>(&record);
    };
    EXPECT_EQ(offset(&record.bounds), 2);
    EXPECT_EQ(offset(&record.font), 10);
    EXPECT_EQ(offset(&record.alignment), 11);
    EXPECT_EQ(offset(&record.flags), 12);
    EXPECT_EQ(offset(&record.moreFlags), 13);
    EXPECT_EQ(offset(&record.textWell), 14);
    EXPECT_EQ(offset(&record.frameOffset), 16);
    EXPECT_EQ(offset(&record.firstLineOffset), 18);
    EXPECT_EQ(offset(&record.initialText), 24);
}

// Creation

TEST_F(GTextPaneTest, WithoutAFrameItsBoxIsItsBounds) { EXPECT_EQ(BoxOf(*Make()), (Rect{20, 20, 36, 200})); }

TEST_F(GTextPaneTest, AFrameAddsTwoPixelsOnEachSideWhateverItsOffsetSays) {
    EXPECT_EQ(BoxOf(*Make(TestItem().Integer("BoxIt", 1))), (Rect{18, 18, 38, 202}));
    EXPECT_EQ(BoxOf(*Make(TestItem().Integer("BoxIt", 1).Integer("FrameOffset", 5))),
              (Rect{18, 18, 38, 202}));
}

TEST_F(GTextPaneTest, FlagsAreTheLowestBitsOfTheirKeys) {
    EXPECT_EQ(BoxOf(*Make(TestItem().Integer("BoxIt", 2))), (Rect{20, 20, 36, 200}));
    EXPECT_EQ(BoxOf(*Make(TestItem().Integer("BoxIt", 3))), (Rect{18, 18, 38, 202}));
}

TEST_F(GTextPaneTest, TakesItsTextFromTheSheetOrFromTheCaller) {
    EXPECT_EQ(Make(TestItem().String("InitTextID", "Bass"))->GetText(), Text("Bass"));
    TestItem item;
    UString const text = Text("Drums");
    GTextPane *const pane =
        GTextPane::NewGTextPane(glog, item.String("InitTextID", "Bass").Sheet(), &text, nullptr);
    EXPECT_EQ(pane->GetText(), Text("Drums"));
}

TEST_F(GTextPaneTest, WithoutAGlogThereIsNone) {
    TestItem item;
    EXPECT_EQ(GTextPane::NewGTextPane(nullptr, item.Sheet(), nullptr, nullptr), nullptr);
}

TEST_F(GTextPaneTest, ASheetWithoutAnItemBreaksAnInvariant) {
    GlogStyleSheet empty;
    EXPECT_THROW(GTextPane::NewGTextPane(glog, &empty, nullptr, nullptr), BrokenInvariant);
}

TEST_F(GTextPaneTest, TheFontFollowsTheRuleOfItsKey) {
    struct {
        int id, font;
    } const cases[] = {{0, 0}, {9, 9}, {30, 0}, {31, 1}, {10, 0}, {0x109, 9}};
    for (auto const &c : cases)
        EXPECT_EQ(Make(TestItem().Integer("FSRID", c.id))->GetFontFSRID(), c.font) << c.id;
}

TEST_F(GTextPaneTest, TheEngineIsCreatedAsTheKeysSay) {
    EXPECT_EQ(Make()->GetTextEditCreationFlags(false), 8u);
    EXPECT_EQ(Make(TestItem().Integer("AutoScroll", 1))->GetTextEditCreationFlags(false), 0u);
    TestItem readOnly;
    readOnly.Integer("ReadOnly", 1).Integer("MultiLine", 1);
    EXPECT_EQ(Make(readOnly)->GetTextEditCreationFlags(false), 14u);
    EXPECT_EQ(Make(readOnly)->GetTextEditCreationFlags(true), 15u);
    EXPECT_EQ(Make(TestItem().Integer("ReadOnly", 1).Integer("MultiLine", 1).Integer("AutoScroll", 1))
                  ->GetTextEditCreationFlags(false),
              6u);
}

TEST_F(GTextPaneTest, ARectangleGivesAFramedFieldWithExactlyThatBox) {
    Rect rect = {10, 10, 30, 110};
    GTextPane *const pane = GTextPane::NewGTextPane(glog, 12, &rect, Text("Take"), nullptr);
    EXPECT_EQ(BoxOf(*pane), rect);
    EXPECT_EQ(pane->GetID(), 12);
    EXPECT_EQ(pane->GetText(), Text("Take"));
}

TEST_F(GTextPaneTest, ARectanglesItemGoesIntoTheGlogsOwnSheet) {
    std::shared_ptr<GlogStyleSheet> const sheet = std::make_shared<GlogStyleSheet>();
    glogRec *const other = desktop.NewGlog(GlogOptions().StyleSheet(sheet));
    Rect rect = {10, 10, 30, 110};
    GTextPane::NewGTextPane(other, 12, &rect, Text("Take"), nullptr);
    ASSERT_TRUE(sheet->GetItemRes());
    EXPECT_EQ(sheet->GetUStringItemValue(Text("GlogItemType")), Text("GText"));
    EXPECT_EQ(XMLLib::GetRect(sheet->GetItemRes(), Text("BoundsRect")), rect);
    struct {
        char const *key;
        int value;
    } const numbers[] = {{"FSRID", 0},    {"Align", 0},       {"FirstLineOffset", -1}, {"BoxIt", 1},
                         {"NoTabIn", 0},  {"RetOnClick", 0},  {"RetOnModify", 0},      {"MultiLine", 0},
                         {"ReadOnly", 0}, {"AutoScroll", 0},  {"NotSelectable", 0},    {"UseSavedColors", 0},
                         {"TextWell", 1}, {"FrameOffset", -2}};
    for (auto const &number : numbers)
        EXPECT_EQ(sheet->GetSInt32ItemValue(Text(number.key)), number.value) << number.key;
    EXPECT_EQ(sheet->GetUStringItemValue(Text("InitTextID")), UString()) << "the text is given apart";
}

TEST_F(GTextPaneTest, ARectangleWithoutAGlogIsAFailure) {
    Rect rect = {10, 10, 30, 110};
    EXPECT_THROW(GTextPane::NewGTextPane(nullptr, 12, &rect, Text("Take"), nullptr), TarnError);
}

long long NumberAt(XMLLib::ContainerItem const &item, std::size_t index) {
    boost::shared_ptr<XMLLib::SIntItem> const number =
        boost::dynamic_pointer_cast<XMLLib::SIntItem>(item.GetNthItem(index));
    return number ? number->Get() : -99;
}

TEST_F(GTextPaneTest, ARecordBecomesAnItemWithAllItsKeysInOrder) {
    gtextResRec record;
    record.bounds = {1, 2, 3, 4};
    record.font = 7;
    record.alignment = 2;
    record.flags = gtextResRec::kNoTabIn | gtextResRec::kRetOnModify | gtextResRec::kAutoScroll |
                   gtextResRec::kUseSavedColors;
    record.moreFlags = gtextResRec::kReadOnly;
    record.textWell = -1;
    record.frameOffset = 3;
    record.firstLineOffset = -4;
    record.initialText = Text("Init");
    boost::shared_ptr<XMLLib::ContainerItem> const item = GTextPane::XMLResFrom_GTextResRec(record);
    EXPECT_EQ(item->GetNumItems(), 17u);
    EXPECT_EQ(XMLLib::GetRect(item, Text("BoundsRect")), (Rect{1, 2, 3, 4}));
    struct {
        char const *key;
        int value;
    } const numbers[] = {{"FSRID", 7},     {"Align", 2},      {"FirstLineOffset", -4}, {"BoxIt", 0},
                         {"NoTabIn", 1},   {"RetOnClick", 0}, {"RetOnModify", 1},      {"MultiLine", 0},
                         {"ReadOnly", 1},  {"AutoScroll", 1}, {"NotSelectable", 0},    {"UseSavedColors", 1},
                         {"TextWell", -1}, {"FrameOffset", 3}};
    for (auto const &number : numbers)
        EXPECT_EQ(item->GetSIntItemValue(Text(number.key)), number.value) << number.key;
    EXPECT_EQ(item->GetUStringItemValue(Text("InitTextID")), Text("Init"));
    EXPECT_EQ(NumberAt(*item, 2), 7);
    EXPECT_EQ(NumberAt(*item, 3), 2);
    EXPECT_EQ(NumberAt(*item, 4), -4);
    EXPECT_EQ(NumberAt(*item, 14), -1);
    EXPECT_EQ(NumberAt(*item, 15), 3);
    boost::shared_ptr<XMLLib::UStringItem> const type = XMLLib::UStringFromItem(item->GetNthItem(0)),
                                                 text = XMLLib::UStringFromItem(item->GetNthItem(16));
    ASSERT_TRUE(type && text);
    EXPECT_EQ(type->Get(), Text("GText"));
    EXPECT_EQ(text->Get(), Text("Init"));
    EXPECT_TRUE(XMLLib::ContainerFromItem(item->GetNthItem(1)));
}

TEST_F(GTextPaneTest, EachFlagOfARecordHasItsPlaceInTheItem) {
    struct {
        int flags, moreFlags;
        std::size_t place;
    } const cases[] = {{gtextResRec::kBoxIt, 0, 5},          {gtextResRec::kNoTabIn, 0, 6},
                       {gtextResRec::kRetOnClick, 0, 7},     {gtextResRec::kRetOnModify, 0, 8},
                       {gtextResRec::kMultiLine, 0, 9},      {0, gtextResRec::kReadOnly, 10},
                       {gtextResRec::kAutoScroll, 0, 11},    {gtextResRec::kNotSelectable, 0, 12},
                       {gtextResRec::kUseSavedColors, 0, 13}};
    for (auto const &c : cases) {
        gtextResRec record;
        record.flags = static_cast<unsigned char>(c.flags);
        record.moreFlags = static_cast<unsigned char>(c.moreFlags | 0xFE);
        boost::shared_ptr<XMLLib::ContainerItem> const item = GTextPane::XMLResFrom_GTextResRec(record);
        for (std::size_t i = 5; i <= 13; ++i)
            EXPECT_EQ(NumberAt(*item, i), i == c.place) << c.place << ' ' << i;
    }
}

// Selecting

TEST_F(GTextPaneTest, SelectingTellsOfTheBeginningAndSelectsAllText) {
    OpenTextField *const pane = Make(TestItem().String("InitTextID", "Bass"));
    FieldEar ear(*pane);
    pane->Select(true);
    EXPECT_EQ(ear.Take(), (Heard{"Begin"}));
    EXPECT_TRUE(pane->IsSelected());
    EXPECT_EQ(SelectionOf(*pane), Units(0, 4));
    EXPECT_EQ(glog->GetCurItem(), pane);
}

TEST_F(GTextPaneTest, DeselectingTellsOfTheEndAndThenConfirmsAndOnlyConfirmsAgain) {
    OpenTextField *const pane = Make();
    pane->Select(true);
    FieldEar ear(*pane);
    pane->Select(false);
    EXPECT_EQ(ear.Take(), (Heard{"End", "Confirmation"}));
    pane->Select(false);
    EXPECT_EQ(ear.Take(), (Heard{"Confirmation"}));
}

TEST_F(GTextPaneTest, AWindowThatGoesBehindEndsTheEditing) {
    OpenTextField *const pane = Make(TestItem().String("InitTextID", "Bass"));
    pane->Select(true);
    FieldEar ear(*pane);
    desktop.Play("activate off");
    EXPECT_EQ(ear.Take(), (Heard{"End", "Confirmation"}));
    EXPECT_FALSE(pane->IsSelected());
}

TEST_F(GTextPaneTest, TheTabKeyMovesFromFieldToField) {
    OpenTextField *const first = Make();
    OpenTextField *const second = Make();
    desktop.Play("key Tab");
    EXPECT_TRUE(first->IsSelected());
    desktop.Play("key Tab");
    EXPECT_FALSE(first->IsSelected());
    EXPECT_TRUE(second->IsSelected());
}

TEST_F(GTextPaneTest, TabAnswersWhetherItTookTheSelection) {
    OpenTextField *const pane = Make(), *const closed = Make(TestItem().Integer("NoTabIn", 1));
    EXPECT_EQ(pane->Tab(1), 0);
    EXPECT_EQ(pane->Tab(1), 1);
    EXPECT_EQ(closed->Tab(1), 3);
    EXPECT_TRUE(closed->Selectable());
}

TEST_F(GTextPaneTest, WhatIsHiddenOrNotEditableCannotBeSelected) {
    OpenTextField *const pane = Make();
    EXPECT_TRUE(pane->Selectable());
    pane->SetVisibility(0);
    EXPECT_FALSE(pane->Selectable());
    pane->SetVisibility(1);
    pane->SetMode(1);
    EXPECT_FALSE(pane->Selectable());
    EXPECT_FALSE(pane->CanTabIn());
    EXPECT_EQ(pane->Tab(1), 3);
    EXPECT_FALSE(Make(TestItem().Integer("NotSelectable", 1))->Selectable());
}

TEST_F(GTextPaneTest, AnUndeselectableFieldKeepsTheKeyboard) {
    OpenTextField *const pane = Make();
    EXPECT_TRUE(pane->CanDeselect());
    pane->SetUnDeselectable(true);
    EXPECT_FALSE(pane->CanDeselect());
    pane->Select(true);
    EXPECT_EQ(Press(*pane, kReturn), -1);
    EXPECT_EQ(Press(*pane, kEscape), -1);
    EXPECT_TRUE(pane->IsSelected());
}

// Clicks

TEST_F(GTextPaneTest, AClickSelectsAndPlacesTheInsertionPoint) {
    OpenTextField *const pane = Make(TestItem().String("InitTextID", "Bass"));
    FieldEar ear(*pane);
    EXPECT_EQ(ResultOfClick("click 190 28"), -1);
    EXPECT_EQ(ear.Take(), (Heard{"Activity", "Begin"}));
    EXPECT_EQ(SelectionOf(*pane), Units(4, 4));
}

TEST_F(GTextPaneTest, AClickIsAHitWhereTheFieldSaysSo) {
    Make(TestItem().Integer("RetOnClick", 1));
    EXPECT_EQ(ResultOfClick("click 190 28"), 1);
}

TEST_F(GTextPaneTest, AClickOnAFieldThatCannotBeSelectedSaysNothing) {
    OpenTextField *const pane = Make(TestItem().Integer("NotSelectable", 1));
    FieldEar ear(*pane);
    EXPECT_EQ(ResultOfClick("click 190 28"), 0);
    EXPECT_EQ(ear.Take(), Heard());
}

TEST_F(GTextPaneTest, ARangeIsNotSelectedDuringAClick) {
    class Ranging : public TextPaneListener {
    public:
        void BeginEditing(GTextPane *pane) override { pane->SelectTextRange(1, 3); }
    };
    OpenTextField *const pane = Make(TestItem().String("InitTextID", "Bass"));
    Ranging ranging;
    ranging.DependUpon(static_cast<Provider<TextPaneListener> *>(pane));
    desktop.Play("click 190 28");
    EXPECT_EQ(SelectionOf(*pane), Units(4, 4));
    pane->SelectTextRange(-5, 3);
    EXPECT_EQ(SelectionOf(*pane), Units(0, 3));
}

// Keys

TEST_F(GTextPaneTest, AKeyTellsOfActivityAndThenOfTheChange) {
    OpenTextField *const pane = Make();
    desktop.Play("click 190 28");
    FieldEar ear(*pane);
    desktop.Play("type \"a\"");
    EXPECT_EQ(ear.Take(), (Heard{"Activity", "Changed"}));
    EXPECT_EQ(pane->GetText(), Text("a"));
}

TEST_F(GTextPaneTest, ReturnAndEnterEndTheEditingOfOneLine) {
    for (int key : {kReturn, kEnter}) {
        OpenTextField *const pane = Make();
        pane->Select(true);
        FieldEar ear(*pane);
        EXPECT_EQ(Press(*pane, key), -1);
        EXPECT_EQ(ear.Take(), (Heard{"Activity", "End", "Confirmation"}));
    }
}

TEST_F(GTextPaneTest, ReturnGoesToTheEngineWhereThereAreSeveralLines) {
    OpenTextField *const pane = Make(TestItem().Integer("MultiLine", 1));
    pane->Select(true);
    EXPECT_EQ(Press(*pane, kReturn), -1);
    EXPECT_TRUE(pane->IsSelected());
    EXPECT_EQ(pane->GetText(), Text("\n"));
}

TEST_F(GTextPaneTest, TheCancelKeyAsksForTheOldValueAndEndsTheEditing) {
    OpenTextField *const pane = Make();
    pane->Select(true);
    FieldEar ear(*pane);
    EXPECT_EQ(Press(*pane, kEscape), -1);
    EXPECT_EQ(ear.Take(), (Heard{"Reset", "End", "Confirmation"}));
}

TEST_F(GTextPaneTest, KeysAreHitsWhereTheFieldSaysSo) {
    OpenTextField *const pane = Make(TestItem().Integer("RetOnModify", 1));
    pane->Select(true);
    EXPECT_EQ(Press(*pane, 'a'), 2);
    EXPECT_EQ(Press(*pane, kReturn), 2);
    EXPECT_EQ(Press(*pane, kEscape), 2);
}

TEST_F(GTextPaneTest, AKeyThatTheEngineHasNoUseForIsNotUsed) {
    OpenTextField *const pane = Make(TestItem().Integer("RetOnModify", 1));
    pane->Select(true);
    EXPECT_EQ(Press(*pane, 30), 0); // up
}

TEST_F(GTextPaneTest, InAnyOtherModeNoKeyIsUsed) {
    OpenTextField *const pane = Make();
    pane->SetMode(1);
    FieldEar ear(*pane);
    EXPECT_EQ(Press(*pane, 'a'), 0);
    EXPECT_EQ(Press(*pane, kEscape), 0);
    EXPECT_EQ(ear.Take(), Heard());
}

TEST_F(GTextPaneTest, KeysAreUsedInEditableModeAlsoWhereItCannotBeSelected) {
    OpenTextField *const pane = Make(TestItem().Integer("NotSelectable", 1));
    FieldEar ear(*pane);
    EXPECT_EQ(Press(*pane, kEscape), -1);
    EXPECT_EQ(Press(*pane, kReturn), -1);
    EXPECT_EQ(ear.Take(), (Heard{"Reset", "Confirmation", "Activity", "Confirmation"}));
}

TEST_F(GTextPaneTest, LettersOfOtherScriptsAndCompositionsDoNotPassThroughKey) {
    OpenTextField *const pane = Make();
    desktop.Play("click 190 28");
    FieldEar ear(*pane);
    desktop.Play("type \"\u05E9\"");
    EXPECT_EQ(ear.Take(), (Heard{"Changed"}));
    desktop.Play("compose \"n\"\nkey Return\ntype \"x\"");
    EXPECT_EQ(ear.Take().front(), "Changed");
    EXPECT_TRUE(pane->IsSelected());
}

TEST_F(GTextPaneTest, ThePlatformMayHandleAllTextInput) {
    OpenTextField *const pane = Make(TestItem().Integer("PlatformHandlesTextInputEvents", 1));
    EXPECT_TRUE(pane->PlatformHandlesTextInputEvents());
    desktop.Play("click 190 28");
    FieldEar ear(*pane);
    desktop.Play("type \"a\"\nkey Backspace");
    EXPECT_EQ(ear.Take(), (Heard{"Changed", "Changed"}));
    pane->SetPlatformHandlesTextInputEvents(false);
    desktop.Play("type \"a\"");
    EXPECT_EQ(ear.Take(), (Heard{"Activity", "Changed"}));
}

TEST_F(GTextPaneTest, WithoutAClientThePlatformsPartBreaksAnInvariant) {
    OpenTextField pane;
    EXPECT_THROW(pane.SetPlatformHandlesTextInputEvents(true), BrokenInvariant);
    EXPECT_THROW(pane.PlatformHandlesTextInputEvents(), BrokenInvariant);
}

// Without an engine

TEST_F(GTextPaneTest, WithoutAnEngineWhatIsAskedIsNothing) {
    OpenTextField pane;
    OS::TextStyle style;
    unsigned int start = 7, end = 7;
    bool commits = false;
    EXPECT_EQ(pane.GetCurrentScrolledOffset(), 0);
    EXPECT_EQ(pane.GetScrollDelta(), 0);
    EXPECT_EQ(pane.GetTextHeight(), 0);
    EXPECT_EQ(pane.GetNumberStyleRuns(), 0u);
    EXPECT_FALSE(pane.HasSelection());
    EXPECT_FALSE(pane.Clear(commits));
    pane.GetSelection(start, end);
    EXPECT_EQ(Units(start, end), Units(0, 0));
    pane.SetAutoScroll(true);
    pane.SetSelection(1, 2);
    pane.SetStyle(7, style);
    pane.GetStyle(7, style);
    pane.GetNthStyleRun(0, start, end, style);
    pane.SetVScrollPos(1, 1);
    pane.SetFontFSRID(0x105);
    pane.SetAlignment(TextSettings::kAlignCenter);
    pane.SetBaselineOffset(3);
    pane.ScrollToSelectionEnd();
    pane.Cut(commits);
    pane.Copy();
    pane.Paste(commits);
    EXPECT_EQ(pane.GetFontFSRID(), 5);
}

// The text

TEST_F(GTextPaneTest, SettingATextTellsNobody) {
    OpenTextField *const pane = Make();
    FieldEar ear(*pane);
    pane->SetText(Text("Bass"));
    EXPECT_EQ(pane->GetText(), Text("Bass"));
    EXPECT_EQ(ear.Take(), Heard());
    EXPECT_FALSE(Repainted().empty());
    pane->SetText(Text("Bass"));
    EXPECT_TRUE(Repainted().empty());
}

// Styles

TEST_F(GTextPaneTest, RunsStylePartsOfTheTextInTheirOrder) {
    StyleRunRec big, red;
    big.start = 0;
    big.end = 6;
    big.style.size = 20;
    red.start = 4;
    red.end = 900;
    red.style.size = 9;
    red.style.color = OS::RGBAColor(1, 0, 0, 1);
    std::vector<StyleRunRec> const runs = {big, red};
    UString const text = Text("Bass left");
    TestItem item;
    GTextPane *const pane = GTextPane::NewGTextPane(glog, item.Sheet(), &text, &runs);
    ASSERT_EQ(pane->GetNumberStyleRuns(), 2u);
    unsigned int start = 0, end = 0;
    OS::TextStyle style;
    pane->GetNthStyleRun(1, start, end, style);
    EXPECT_EQ(Units(start, end), Units(4, 9));
    EXPECT_EQ(style.size, 9);
    EXPECT_EQ(style.color.r, 1.0);
    EXPECT_EQ(SelectionOf(*pane), Units(0, 0));
}

TEST_F(GTextPaneTest, AStyleForAllEndsTheEditingAndKeepsTheSelection) {
    OpenTextField *const pane = Make(TestItem().String("InitTextID", "Bass"));
    pane->Select(true);
    pane->SetSelection(1, 3);
    FieldEar ear(*pane);
    OS::TextStyle style;
    style.size = 17;
    pane->SetTextStyle(style);
    EXPECT_EQ(ear.Take(), (Heard{"End", "Confirmation"}));
    EXPECT_EQ(SelectionOf(*pane), Units(1, 3));
    EXPECT_EQ(glog->GetCurItem(), nullptr);
    OS::TextStyle got;
    pane->GetStyle(7, got);
    EXPECT_EQ(got.size, 17);
}

TEST_F(GTextPaneTest, TheFontIsThatOfTheTable) {
    OpenTextField *const pane = Make();
    pane->SetFontFSRID(9);
    OS::TextStyle got;
    pane->GetStyle(7, got);
    EXPECT_EQ(got.size, GetIndVelaFont(9)->size);
    EXPECT_EQ(pane->GetTextHeight(), Make(TestItem().Integer("FSRID", 9))->GetTextHeight());
    gcSetFontFSRID(pane, 7);
    EXPECT_EQ(pane->GetFontFSRID(), 7);
    EXPECT_EQ(pane->GetTextHeight(), Make(TestItem().Integer("FSRID", 7))->GetTextHeight());
}

TEST_F(GTextPaneTest, IsReachedByItsProcedureVariables) {
    OpenTextField *const pane = Make();
    gcSetFontFSRID(pane, 0x70105);
    EXPECT_EQ(pane->GetFontFSRID(), 5) << "the low byte of the low 16 bits";
    gcSetModeGText(pane, 0x301);
    EXPECT_EQ(pane->GetMode(), 1);
    typedef void (*OfField)(GTextPane *, int);
    std::map<std::string, Symbol> const exports = ExportsOfTheLibrary();
    for (char const *name : {"gcSetFontFSRID", "gcSetModeGText"}) {
        ASSERT_EQ(exports.count(name), 1u) << name;
        char const type = exports.at(name).type;
        EXPECT_TRUE(type == 'D' || type == 'B') << name << " is of type " << type;
        Replaced<OfField> const replaced(Find<OfField>(name), [](GTextPane *, int) {});
        gcSetFontFSRID(pane, 5);
        gcSetModeGText(pane, 1);
    }
    {
        Replaced<OfField> const font(Find<OfField>("gcSetFontFSRID"), [](GTextPane *, int) {});
        gcSetFontFSRID(pane, 3);
        EXPECT_EQ(pane->GetFontFSRID(), 5);
    }
    Replaced<OfField> const mode(Find<OfField>("gcSetModeGText"),
                                 [](GTextPane *field, int number) { field->SetMode(number ? 5 : 2); });
    gcSetModeGText(pane, 1);
    EXPECT_EQ(pane->GetMode(), 5);
}

TEST_F(GTextPaneTest, TypingTurnsTheCheckBoxOnThatItIsBoundTo) {
    OpenTextField *const pane = Make();
    GroupItem item;
    item.Button({60, 20}).Label({70, 38}, "First").Button({80, 20}).Label({90, 38}, "Second");
    CheckBoxPane *const boxes = CheckBoxPane::NewCheckBoxPane(glog, item.Sheet());
    boxes->SetAutoBinding(static_cast<Provider<AutoSetActivityListener> *>(pane), 1);
    GroupListener listener;
    listener.HangOn(boxes);
    pane->Select(true);
    EXPECT_FALSE(boxes->ReadOne(1));
    desktop.Play("type \"a\"");
    EXPECT_FALSE(boxes->ReadOne(0));
    EXPECT_TRUE(boxes->ReadOne(1));
    ASSERT_FALSE(listener.heard.empty());
    EXPECT_EQ(listener.heard.front(), "1 on");
    EXPECT_EQ(listener.sources.front(), boxes);
}

TEST_F(GTextPaneTest, ARunThatCoversNothingChangesNothing) {
    StyleRunRec empty, beyond, backwards;
    for (StyleRunRec *run : {&empty, &beyond, &backwards})
        run->style.size = 30;
    empty.start = empty.end = 0;
    beyond.start = 900;
    beyond.end = 950;
    backwards.start = 3;
    backwards.end = 1;
    std::vector<StyleRunRec> const runs = {beyond, backwards, empty};
    UString const text = Text("Bass");
    OpenTextField *const pane = new OpenTextField;
    TestItem item;
    item.Box("BoundsRect", {20, 20, 36, 200});
    ASSERT_EQ(pane->InitGTextPane(glog, item.Sheet(), &text, &runs), pane);
    EXPECT_EQ(pane->GetNumberStyleRuns(), 1u);
    Show();
    glog->SetCurItem(pane);
    pane->SetSelection(0, 0);
    desktop.Play("type \"a\"\nkey End\ntype \"z\"");
    EXPECT_EQ(pane->GetText(), Text("aBassz"));
    EXPECT_EQ(pane->GetNumberStyleRuns(), 1u);
}

// Wherever memory runs out on the way, it is there again for what puts the selection back.
TEST_F(GTextPaneTest, AStyleForAllKeepsTheSelectionAlsoWhenItFails) {
    OpenTextField *const pane = Make(TestItem().String("InitTextID", "Bass"));
    OS::TextStyle style;
    int failures = 0;
    for (long successes = 0; successes < 200; ++successes) {
        style.size = static_cast<short>(10 + successes % 2);
        pane->SetSelection(1, 3);
        Allocations::FailAfter const failing(successes);
        try {
            pane->SetTextStyle(style);
        } catch (std::bad_alloc const &) {
            ++failures;
        }
        EXPECT_EQ(SelectionOf(*pane), Units(1, 3)) << successes;
        if (!failing.HasFailed())
            break;
    }
    EXPECT_GT(failures, 0);
}

// Neither of the others is asked to draw, and no pixel beyond the one is presented.
TEST_F(GTextPaneTest, AKeyRedrawsItsFieldOnly) {
    OpenTextField *const pane = Make(TestItem().String("InitTextID", "Bass").Integer("AutoScroll", 1));
    for (short top : {4, 36, 90}) {
        Rect box = {top, 20, short(top + 16), 200};
        GTextPane::NewGTextPane(glog, 9, &box, Text("Other"), nullptr);
    }
    Repainted();
    desktop.Play("click 190 28");
    Repainted();
    for (char const *key : {"type \"x\"", "key Backspace", "key Home", "key Delete", "key z command"}) {
        desktop.TakeDrawing();
        desktop.TakePresented(glog);
        desktop.Play(key);
        std::vector<Rect> const presented = Repainted();
        EXPECT_FALSE(presented.empty()) << key;
        Rect const box = BoxOf(*pane);
        for (Rect const &r : presented)
            EXPECT_TRUE(r.top >= box.top && r.left >= box.left && r.bottom <= box.bottom &&
                        r.right <= box.right)
                << key << ": " << r;
        for (std::string const &line : Only("DrawTextEdit", desktop.TakeDrawing()))
            EXPECT_EQ(line.find("Other"), std::string::npos) << key;
    }
}

TEST_F(GTextPaneTest, ANewModeEndsTheEditingAndRepaints) {
    OpenTextField *const pane = Make();
    pane->Select(true);
    Repainted();
    FieldEar ear(*pane);
    gcSetModeGText(pane, 0);
    EXPECT_EQ(ear.Take(), Heard());
    gcSetModeGText(pane, 1);
    EXPECT_EQ(ear.Take(), (Heard{"End", "Confirmation"}));
    EXPECT_EQ(pane->GetMode(), 1);
    EXPECT_EQ(glog->GetCurItem(), nullptr);
    EXPECT_FALSE(Repainted().empty());
}

// Commands

TEST_F(GTextPaneTest, KnowsTheFiveCommandsWhateverTheirClass) {
    OpenTextField *const pane = Make();
    for (short id = -20; id < 40; ++id) {
        bool const known = id == 1 || id == 11 || id == 12 || id == 13 || id == 15;
        EXPECT_EQ(pane->CanDoOp(CommandSpecifier(99, id)), known) << id;
    }
}

TEST_F(GTextPaneTest, CommandsSayWhetherTheyCount) {
    for (int counts : {0, 1}) {
        OpenTextField *const pane =
            Make(TestItem().String("InitTextID", "Bass").Integer("RetOnModify", counts));
        bool commits = counts == 0;
        pane->SelectAll();
        pane->Cut(commits);
        EXPECT_EQ(commits, counts != 0);
        EXPECT_EQ(pane->GetText(), UString());
        commits = counts == 0;
        FieldEar ear(*pane);
        pane->Paste(commits);
        EXPECT_EQ(ear.Take(), (Heard{"Activity", "Changed"}));
        EXPECT_EQ(commits, counts != 0);
        EXPECT_EQ(pane->GetText(), Text("Bass"));
        EXPECT_FALSE(pane->Clear(commits));
        pane->SelectAll();
        EXPECT_TRUE(pane->Clear(commits));
        EXPECT_EQ(pane->GetText(), UString());
    }
}

TEST_F(GTextPaneTest, CommandsChangeTheSelectionAloneAndOnlyPastingIsActivity) {
    OpenTextField *const pane = Make(TestItem().String("InitTextID", "Bass"));
    FieldEar ear(*pane);
    bool commits = false;
    pane->SetSelection(1, 2);
    pane->Copy();
    EXPECT_EQ(ear.Take(), Heard());
    EXPECT_TRUE(pane->Clear(commits));
    EXPECT_EQ(pane->GetText(), Text("Bss"));
    EXPECT_EQ(ear.Take(), (Heard{"Changed"}));
    pane->SetSelection(1, 3);
    pane->Cut(commits);
    EXPECT_EQ(pane->GetText(), Text("B"));
    EXPECT_EQ(ear.Take(), (Heard{"Changed"}));
    pane->SelectAll();
    EXPECT_EQ(ear.Take(), Heard());
    pane->Paste(commits);
    EXPECT_EQ(pane->GetText(), Text("ss"));
    EXPECT_EQ(ear.Take(), (Heard{"Activity", "Changed"}));
}

// Drawing

TEST_F(GTextPaneTest, DrawsItsWellAndThenItsText) {
    OpenTextField *const pane = Make(TestItem().Integer("TextWell", 1));
    Lines const drawn = DrawingOf(*pane);
    ASSERT_EQ(Only("FrameTextWell", drawn).size(), 1u);
    ASSERT_EQ(Only("DrawTextEdit", drawn).size(), 1u);
    EXPECT_TRUE(KeepsColors(*pane));
}

TEST_F(GTextPaneTest, TheWellIsFramedByEitherFlagButByBoxItInEditableModeOnly) {
    EXPECT_TRUE(Only("FrameTextWell", DrawingOf(*Make())).empty());
    OpenTextField *const boxed = Make(TestItem().Integer("BoxIt", 1));
    EXPECT_EQ(Only("FrameTextWell", DrawingOf(*boxed)).size(), 1u);
    boxed->SetMode(1);
    EXPECT_TRUE(Only("FrameTextWell", DrawingOf(*boxed)).empty());
    boxed->SetBoxAndFrame(true, true);
    EXPECT_EQ(Only("FrameTextWell", DrawingOf(*boxed)).size(), 1u);
}

TEST_F(GTextPaneTest, AWellWithoutBoxItIsNotCoveredByTheText) {
    OpenTextField *const pane = Make(TestItem().String("InitTextID", "Bass").Integer("TextWell", 1));
    Surface const &picture = *desktop.Picture(glog);
    std::uint32_t const ground = picture.Row(28)[150];
    auto const edges = [&] {
        return std::vector<std::uint32_t>{picture.Row(20)[150], picture.Row(35)[150], picture.Row(28)[20],
                                          picture.Row(28)[199]};
    };
    std::vector<std::uint32_t> const framed = edges();
    for (std::uint32_t const edge : framed)
        EXPECT_NE(edge, ground);
    pane->Select(true);
    UpdateGlog(glog);
    EXPECT_EQ(edges(), framed);
}

TEST_F(GTextPaneTest, ABlankFieldErasesWithinItsWell) {
    OpenTextField *const pane = Make(TestItem().Integer("BoxIt", 1));
    pane->SetMode(5);
    Lines const drawn = DrawingOf(*pane);
    EXPECT_TRUE(Only("DrawTextEdit", drawn).empty());
    Lines const erased = Only("EraseRect", drawn);
    ASSERT_EQ(erased.size(), 1u);
    EXPECT_NE(erased[0].find("[20,20,36,200]"), std::string::npos) << erased[0];
}

TEST_F(GTextPaneTest, InModeTwoNothingIsDrawnOutsideOfTheRegion) {
    OpenTextField *const pane = Make();
    OSRgn far(Rect{100, 100, 120, 120}), near(Rect{20, 20, 30, 30});
    EXPECT_EQ(Only("DrawTextEdit", Traced(*pane, [&] { pane->_Draw_(&far, 0); })).size(), 1u);
    pane->SetMode(2);
    EXPECT_TRUE(Only("DrawTextEdit", Traced(*pane, [&] { pane->_Draw_(&far, 0); })).empty());
    EXPECT_EQ(Only("DrawTextEdit", Traced(*pane, [&] { pane->_Draw_(&near, 0); })).size(), 1u);
    EXPECT_EQ(Only("DrawTextEdit", Traced(*pane, [&] { pane->_Draw_(nullptr, 0); })).size(), 1u);
}

class Helper : public GTextPaneDrawingHelper {
public:
    void SetColors(unsigned char mode) override { colorModes().push_back(mode); }
    void DrawTextWell(Rect &, unsigned char mode) override { wellModes().push_back(mode); }
    static std::vector<int> &colorModes() {
        static std::vector<int> modes;
        return modes;
    }
    static std::vector<int> &wellModes() {
        static std::vector<int> modes;
        return modes;
    }
};

TEST_F(GTextPaneTest, AHelperTakesOverColoursAndWell) {
    OpenTextField *const pane = Make(TestItem().Integer("TextWell", 1));
    pane->SetDrawingHelper(AutoPtr<GTextPaneDrawingHelper>(new Helper));
    Helper::colorModes().clear();
    Helper::wellModes().clear();
    Lines const drawn = DrawingOf(*pane);
    EXPECT_TRUE(Only("FrameTextWell", drawn).empty());
    EXPECT_EQ(Helper::colorModes(), std::vector<int>{0});
    EXPECT_EQ(Helper::wellModes(), std::vector<int>{0});
    pane->SetDrawingHelper(AutoPtr<GTextPaneDrawingHelper>());
    EXPECT_EQ(Only("FrameTextWell", DrawingOf(*pane)).size(), 1u);
}

TEST_F(GTextPaneTest, ItsColoursAreTheThemesUnlessItHasItsOwn) {
    OpenTextField *const pane = Make();
    auto const fore = [&] { return Only("RGBForeColor", Traced(*pane, [&] { pane->SetupColors(); })); };
    Lines const themes = Traced(*pane, [] { VelaDrawing::RGBForeColor(kTextWellTextColor); });
    EXPECT_EQ(fore(), themes);
    RGBColor const red = {0xFFFF, 0, 0}, blue = {0, 0, 0xFFFF};
    pane->SetColors(red, blue);
    EXPECT_EQ(fore(), Traced(*pane, [&] { VelaDrawing::RGBForeColor(red); }));
}

// The engine's place

TEST_F(GTextPaneTest, TheCharacterUnderAPointIsFoundInItsCoordinates) {
    OpenTextField *const pane = Make(TestItem().String("InitTextID", "mmmm").Integer("BoxIt", 1));
    EXPECT_EQ(pane->GetCharacterIndexForPoint(OS::Point(23, 25)), 0u);
    EXPECT_EQ(pane->GetCharacterIndexForPoint(OS::Point(40, 25)), 1u);
}

TEST_F(GTextPaneTest, TheCharacterUnderAPointIsFoundWhereverItsContainerLies) {
    CompoundPane *const container = new CompoundPane;
    container->CompoundPaneInit(glog, 0);
    Rect box = {0, 0, 200, 300};
    container->SetBox(&box);
    OpenTextField *const pane = Make(TestItem().Integer("MultiLine", 1));
    Rect high = {20, 20, 100, 200};
    pane->SetBox(&high);
    pane->SetText(Text("mm\nmm\nmm"));
    container->Add(pane, -1);
    container->Offset({50, 30});
    int const line = pane->GetScrollDelta();
    for (int row = 0; row < 3; ++row)
        EXPECT_EQ(pane->GetCharacterIndexForPoint(OS::Point(21, 20 + row * line + line / 2)),
                  static_cast<unsigned int>(3 * row))
            << row;
}

TEST_F(GTextPaneTest, FollowsItsContainer) {
    CompoundPane *const container = new CompoundPane;
    container->CompoundPaneInit(glog, 0);
    Rect box = {0, 0, 200, 300};
    container->SetBox(&box);
    OpenTextField *const pane = Make(TestItem().String("InitTextID", "Bass"));
    container->Add(pane, -1);
    Point const delta = {50, 30};
    container->Offset(delta);
    EXPECT_EQ(ResultOfClick("click 225 78"), -1);
    EXPECT_EQ(SelectionOf(*pane), Units(4, 4));
}

TEST_F(GTextPaneTest, AWindowThatClosesLeavesNoTrace) {
    OpenTextField *const pane = Make();
    pane->Select(true);
    DisposeGlog(glog);
    glog = desktop.NewGlog(GlogOptions());
    ShowGlog(glog, kShowGlog);
    desktop.Play("type \"a\"\nwait 2");
}

} // namespace
