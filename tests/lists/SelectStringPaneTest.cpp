#include "lists/SelectStringPane.h"
#include "host/CompoundPane.h"
#include "host/NamedColors.h"
#include "host/PortSavers.h"
#include "host/TextLayout.h"
#include "host/VelaDrawing.h"
#include "tests/PaneTest.h"

namespace {

class SelectStringPaneTest : public PaneTest {
protected:
    SelectStringPaneTest() {
        Show();
        desktop.Play(""); // the window becomes active
    }

    SelectStringPane *Make(char const *text, Point place = {20, 30}) {
        SelectStringPane *const pane = new SelectStringPane(glog, 3, Text(text));
        Rect box = BoxOf(*pane);
        VelaDrawing::OffsetRect(&box, place.h, place.v);
        pane->SetBox(&box);
        pane->SetActive();
        UpdateGlog(glog);
        desktop.TakePresented(glog);
        return pane;
    }

    static std::string TextOf(SelectStringPane &pane) {
        UString text;
        pane.GetText(text);
        std::string ascii;
        for (std::size_t i = 0; i < text.length(); ++i)
            ascii += static_cast<char>(text[i]);
        return ascii;
    }

    // The size of a text in the pane's font.
    static Point SizeOf(char const *text) {
        SaveTextState const state;
        SetFontData(GetIndVelaFont(2));
        TarnQuickDrawText::FontInfo info;
        tarn::GetFontInfo(info);
        return {static_cast<short>(info.ascent + info.descent),
                static_cast<short>(LooseStringWidth(Text(text), 0.0f, 1.0f))};
    }
};

TEST_F(SelectStringPaneTest, IsDrawnInItsOwnPort) {
    SelectStringPane *const pane = Make("Verse");
    LeaveForAnotherPort();
    (pane->*&Opened<SelectStringPane>::DrawGuts)(nullptr);
    EXPECT_TRUE(IsInItsPort());
}

TEST_F(SelectStringPaneTest, IsMeasuredAndDrawnInItsOwnFontWhateverThePortHas) {
    SelectStringPane *const pane = Make("Verse");
    auto const textIn = [&](int font) {
        return Only("DrawStringInRect", Traced(*pane, [&] {
                        SetFontData(GetIndVelaFont(font));
                        (pane->*&Opened<SelectStringPane>::DrawGuts)(nullptr);
                    }));
    };
    EXPECT_EQ(textIn(9), textIn(5));
    SetFontData(GetIndVelaFont(9));
    pane->SetText(Text("Chorus"));
    Point const size = SizeOf(" Chorus ");
    EXPECT_EQ(BoxOf(*pane).right - BoxOf(*pane).left, size.h);
    EXPECT_EQ(BoxOf(*pane).bottom - BoxOf(*pane).top, size.v);
}

TEST_F(SelectStringPaneTest, IsAttachedUnderItsNumber) {
    SelectStringPane *const pane = Make("Verse");
    EXPECT_EQ(pane->GetID(), 3);
    EXPECT_EQ(pane->GetGlog(), glog);
    EXPECT_FALSE(pane->IsSelected());
}

TEST_F(SelectStringPaneTest, WithoutAGlogItIsNot) {
    SelectStringPane pane(nullptr, 3, Text("Verse"));
    EXPECT_EQ(pane.GetGlog(), nullptr);
    EXPECT_EQ(TextOf(pane), "Verse");
}

TEST_F(SelectStringPaneTest, KnowsItselfAsOne) {
    SelectStringPane *const pane = Make("Verse");
    GlogPane *const any = pane;
    EXPECT_EQ(any->CastToSelectStringPane(), pane);
}

// Text and size

TEST_F(SelectStringPaneTest, GivesBackTheTextItWasMadeWith) {
    EXPECT_EQ(TextOf(*Make("Verse 1")), "Verse 1");
}

TEST_F(SelectStringPaneTest, GivesBackTheTextThatWasSet) {
    SelectStringPane *const pane = Make("Verse");
    for (char const *text : {"Chorus", "", " ", "  Bridge  "}) {
        pane->SetText(Text(text));
        EXPECT_EQ(TextOf(*pane), text);
    }
}

TEST_F(SelectStringPaneTest, FitsTheTextWithABlankAtEitherSide) {
    Point const size = SizeOf(" Verse ");
    EXPECT_EQ(BoxOf(*Make("Verse")),
              (Rect{20, 30, static_cast<short>(20 + size.v), static_cast<short>(30 + size.h)}));
}

TEST_F(SelectStringPaneTest, AnotherTextChangesItsWidthAndKeepsItsPlace) {
    SelectStringPane *const pane = Make("Verse");
    pane->SetText(Text("A longer verse"));
    Rect const box = BoxOf(*pane);
    EXPECT_EQ(box.left, 30);
    EXPECT_EQ(box.top, 20);
    EXPECT_EQ(box.right, 30 + SizeOf(" A longer verse ").h);
}

TEST_F(SelectStringPaneTest, AShorterTextRepaintsWhereTheLongerOneWas) {
    SelectStringPane *const pane = Make("A longer verse");
    Rect const before = BoxOf(*pane);
    pane->SetText(Text("Verse"));
    std::vector<Rect> const repainted = Repainted();
    EXPECT_FALSE(repainted.empty());
    for (Rect const &r : repainted)
        EXPECT_EQ(r, before);
}

TEST_F(SelectStringPaneTest, WhatALongerTextCoveredIsDrawnAgain) {
    class Covered : public GlogPane {
    public:
        explicit Covered(glogRec *owner) { GlogPaneInit(owner, 0); }
        int drawn = 0;

    private:
        void DrawGuts(OSRgn *) override { ++drawn; }
    };
    SelectStringPane *const pane = Make("A longer verse");
    Rect end = BoxOf(*pane);
    end.left = static_cast<short>(end.right - 5);
    Covered *const covered = new Covered(glog);
    covered->SetBox(&end);
    Repainted();
    covered->drawn = 0;
    pane->SetText(Text("Verse"));
    ASSERT_LT(BoxOf(*pane).right, end.left);
    UpdateGlog(glog);
    EXPECT_EQ(covered->drawn, 1);
}

TEST_F(SelectStringPaneTest, TheOldTextIsErasedAtOnce) {
    SelectStringPane *const pane = Make("Verse");
    desktop.TakeDrawing();
    pane->SetText(Text("Chorus"));
    EXPECT_EQ(Only("EraseRect", desktop.TakeDrawing()).size(), 1u);
}

TEST_F(SelectStringPaneTest, MeasuringLeavesThePortsFontAlone) {
    SelectStringPane *const pane = Make("Verse");
    pane->Prepare();
    SetFontData(GetIndVelaFont(8));
    int const before = LooseStringWidth(Text("Verse"), 0.0f, 1.0f);
    pane->CalcBox();
    EXPECT_EQ(LooseStringWidth(Text("Verse"), 0.0f, 1.0f), before);
}

TEST_F(SelectStringPaneTest, InALayoutItsSizeIsTheNaturalOne) {
    CompoundPane *const group = new CompoundPane;
    group->CompoundPaneInit(glog, 0);
    Rect box = {0, 0, 100, 200};
    group->SetBox(&box);
    group->SetUseLayout(true);
    SelectStringPane *const pane = new SelectStringPane(glog, 4, Text("Verse"));
    group->Add(pane, -1);
    UpdateGlog(glog);
    Point const size = SizeOf(" Verse ");
    EXPECT_EQ(pane->GetDrawRectangle().right - pane->GetDrawRectangle().left, size.h);
    pane->SetText(Text("A longer verse"));
    UpdateGlog(glog);
    EXPECT_EQ(pane->GetDrawRectangle().right - pane->GetDrawRectangle().left, SizeOf(" A longer verse ").h);
    EXPECT_EQ(BoxOf(*pane), pane->GetDrawRectangle());
}

// Clicks

TEST_F(SelectStringPaneTest, AClickSelectsAndNeverEndsIt) {
    SelectStringPane *const pane = Make("Verse");
    EXPECT_EQ(ResultOfClick("click 35 25"), -1);
    EXPECT_TRUE(pane->IsSelected());
    EXPECT_EQ(ResultOfClick("click 35 25"), -1);
    EXPECT_TRUE(pane->IsSelected());
}

TEST_F(SelectStringPaneTest, AClickWithShiftSelectsOrEndsIt) {
    SelectStringPane *const pane = Make("Verse");
    EXPECT_EQ(ResultOfClick("click 35 25 shift"), -1);
    EXPECT_TRUE(pane->IsSelected());
    EXPECT_EQ(ResultOfClick("click 35 25 shift"), -1);
    EXPECT_FALSE(pane->IsSelected());
}

TEST_F(SelectStringPaneTest, OtherModifiersChangeNothing) {
    SelectStringPane *const pane = Make("Verse");
    ResultOfClick("click 35 25 command option control");
    EXPECT_TRUE(pane->IsSelected());
    ResultOfClick("click 35 25 command option control");
    EXPECT_TRUE(pane->IsSelected());
}

// Drawing

TEST_F(SelectStringPaneTest, IsItsTextOnTheWindowsGround) {
    SelectStringPane *const pane = Make("Verse");
    Lines const drawn = DrawingOf(*pane);
    ASSERT_EQ(Only("PaintRect", drawn).size(), 1u);
    ASSERT_EQ(Only("DrawStringInRect", drawn).size(), 1u);
    EXPECT_NE(Only("DrawStringInRect", drawn)[0].find("\" Verse \""), std::string::npos);
    Lines const colors = Only("RGBForeColor", drawn);
    Lines const expected = Traced(*pane, [] {
        VelaDrawing::RGBForeColor(kWindowBackgroundColor);
        VelaDrawing::RGBForeColor(kDialogActiveTextColor);
    });
    EXPECT_EQ(Lines(colors.end() - 2, colors.end()), expected);
    EXPECT_TRUE(Only("SetUserHiliteColorAsForeColor", drawn).empty());
}

TEST_F(SelectStringPaneTest, SelectedItsGroundIsTheUsersHighlightColor) {
    SelectStringPane *const pane = Make("Verse");
    pane->Select(true);
    EXPECT_EQ(Only("SetUserHiliteColorAsForeColor", DrawingOf(*pane)).size(), 1u);
}

TEST_F(SelectStringPaneTest, SelectedInAWindowThatIsNotActiveItIsNotHighlighted) {
    SelectStringPane *const pane = Make("Verse");
    pane->Select(true);
    pane->Deactivate();
    EXPECT_TRUE(Only("SetUserHiliteColorAsForeColor", DrawingOf(*pane)).empty());
}

TEST_F(SelectStringPaneTest, TheTextStandsOnItsBaseline) {
    SelectStringPane *const pane = Make("Verse");
    DrawingOf(*pane);
    Point pen{0, 0};
    VelaDrawing::GetPen(&pen);
    SaveTextState const state;
    SetFontData(GetIndVelaFont(2));
    TarnQuickDrawText::FontInfo info;
    tarn::GetFontInfo(info);
    EXPECT_EQ(pen, (Point{static_cast<short>(20 + info.ascent), 30}));
}

TEST_F(SelectStringPaneTest, TheTextIsDrawnIntoTheBoxInItsOwnFont) {
    SelectStringPane *const pane = Make("Verse");
    Rect const box = BoxOf(*pane);
    Lines const expected =
        Only("DrawStringInRect", Traced(*pane, [&] {
                 SaveTextState const state;
                 SetFontData(GetIndVelaFont(2));
                 VelaDrawing::RGBForeColor(kDialogActiveTextColor);
                 DrawStringInRect(Text(" Verse "), box, TextSettings::kAlignLeft, TextSettings::kTruncateNone,
                                  0, 0, 0, 0.0f, 1.0f, 1.0f, 0.0f);
             }));
    pane->Prepare();
    SetFontData(GetIndVelaFont(8));
    EXPECT_EQ(Only("DrawStringInRect", DrawingOf(*pane)), expected);
}

TEST_F(SelectStringPaneTest, TheTextMovesWithTheBox) {
    SelectStringPane *const pane = Make("Verse");
    auto const pen = [&] {
        DrawingOf(*pane);
        Point place{0, 0};
        VelaDrawing::GetPen(&place);
        return place;
    };
    Point const before = pen();
    Rect box = BoxOf(*pane);
    VelaDrawing::OffsetRect(&box, 11, 7);
    pane->SetBox(&box);
    EXPECT_EQ(pen(), (Point{static_cast<short>(before.v + 7), static_cast<short>(before.h + 11)}));
    pane->Offset({2, 3});
    EXPECT_EQ(pen(), (Point{static_cast<short>(before.v + 9), static_cast<short>(before.h + 14)}));
    EXPECT_EQ(BoxOf(*pane).top, 29);
}

TEST_F(SelectStringPaneTest, SetBoxTakesTheEditBoxAlongAndOffsetDoesNot) {
    SelectStringPane *const pane = Make("Verse");
    Rect box = {20, 30, 40, 90};
    pane->SetBox(&box);
    EXPECT_EQ(pane->GetEditBox(), (Rect{42, 92, 41, 91}));
    pane->Offset({5, 5});
    EXPECT_EQ(pane->GetEditBox(), (Rect{42, 92, 41, 91}));
}

TEST_F(SelectStringPaneTest, InAContainerItIsDrawnWhereItLies) {
    CompoundPane *const container = new CompoundPane;
    container->CompoundPaneInit(glog, 0);
    Rect box = {100, 50, 180, 250};
    container->SetBox(&box);
    SelectStringPane *const pane = Make("Verse", {10, 20});
    container->Add(pane, -1);
    pane->Select(true);
    UpdateGlog(glog);
    desktop.TakePresented(glog);
    pane->Inval();
    Rect expected = BoxOf(*pane);
    VelaDrawing::OffsetRect(&expected, 50, 100);
    EXPECT_EQ(Repainted(), std::vector<Rect>{expected});
    pane->Prepare();
    Rect const drawn = BoxOf(*pane);
    DrawingOf(*pane);
    EXPECT_EQ(BoxOf(*pane), drawn);
    EXPECT_EQ(ResultOfClick("click 75 115"), -1);
}

TEST_F(SelectStringPaneTest, ThePortKeepsItsColors) { EXPECT_TRUE(KeepsColors(*Make("Verse"))); }

} // namespace
