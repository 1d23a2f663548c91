// In which colours a field works, and that it gives the port's back.
#include "desktop/drawing/Surface.h"
#include "host/NamedColors.h"
#include "host/VelaDrawing.h"
#include "tests/text/TextFieldTest.h"
#include <functional>

namespace {

SaveColorRec const kTinted = {{0xC000, 0x1000, 0x2000}, {0x3000, 0xD000, 0x4000}};

class GTextPaneColors : public TextFieldTest {
protected:
    static TestItem Bass() {
        TestItem item;
        item.String("InitTextID", "Bass");
        return item;
    }
    // Whether the action leaves the port with the colours that it has.
    template <class Action> bool KeepsPortColors(GTextPane &pane, Action const &action) {
        pane.Prepare();
        SetColors(&kTinted);
        action();
        SaveColorRec after;
        GetColors(&after);
        return after == kTinted;
    }
    // The colours that the pane's drawing sets, beside those of its well.
    Lines ColorsSetBy(GTextPane &pane) {
        Rect box = BoxOf(pane);
        Lines all = Only("RGBForeColor", Traced(pane, [&] { pane._Draw_(nullptr, 0); }));
        Lines const ofTheWell = Only("RGBForeColor", Traced(pane, [&] { pane.DrawTextWell(box); }));
        EXPECT_TRUE(ofTheWell.empty());
        return all;
    }
    std::uint32_t PixelAt(int h, int v) {
        UpdateGlog(glog);
        return desktop.Picture(glog)->Row(v)[h];
    }
    static std::uint32_t PixelOf(RGBColor const &c) {
        auto const byte = [](unsigned short component) { return std::uint32_t(component + 128) / 257; };
        return 0xFF000000u | byte(c.red) << 16 | byte(c.green) << 8 | byte(c.blue);
    }
};

// The port's

TEST_F(GTextPaneColors, NothingThatIsDoneToAFieldChangesThePorts) {
    OpenTextField *const pane = Make(Bass());
    bool commits = false;
    EventRecordAdapter key = KeyOf('a'), escape = KeyOf(kEscape), enter = KeyOf(kReturn), press;
    press.what = 1;
    press.where = {28, 40};
    EXPECT_TRUE(KeepsPortColors(*pane, [&] { pane->Select(true); })) << "Select(true)";
    EXPECT_TRUE(KeepsPortColors(*pane, [&] { pane->Key(&key); })) << "Key";
    EXPECT_TRUE(KeepsPortColors(*pane, [&] { pane->SelectAll(); })) << "SelectAll";
    EXPECT_TRUE(KeepsPortColors(*pane, [&] { pane->Copy(); })) << "Copy";
    EXPECT_TRUE(KeepsPortColors(*pane, [&] { pane->Paste(commits); })) << "Paste";
    EXPECT_TRUE(KeepsPortColors(*pane, [&] { pane->SelectTextRange(0, 2); })) << "SelectTextRange";
    EXPECT_TRUE(KeepsPortColors(*pane, [&] { pane->Cut(commits); })) << "Cut";
    EXPECT_TRUE(KeepsPortColors(*pane, [&] {
        pane->SelectAll();
        pane->Clear(commits);
    })) << "Clear";
    EXPECT_TRUE(KeepsPortColors(*pane, [&] { pane->HandleClick(&press); })) << "HandleClick";
    EXPECT_TRUE(KeepsPortColors(*pane, [&] { pane->UpdateTextEdit(); })) << "UpdateTextEdit";
    EXPECT_TRUE(KeepsPortColors(*pane, [&] { pane->Key(&enter); })) << "return";
    EXPECT_TRUE(KeepsPortColors(*pane, [&] { pane->Key(&escape); })) << "Escape";
    EXPECT_TRUE(KeepsPortColors(*pane, [&] { pane->Select(false); })) << "Select(false)";
    EXPECT_TRUE(KeepsPortColors(*pane, [&] { pane->_Draw_(nullptr, 0); })) << "_Draw_";
}

// Its own

TEST_F(GTextPaneColors, AFieldThatIsNotEditableSetsNoneUnlessItHasItsOwn) {
    OpenTextField *const pane = Make(Bass());
    EXPECT_FALSE(ColorsSetBy(*pane).empty());
    pane->SetMode(1);
    EXPECT_TRUE(ColorsSetBy(*pane).empty());
    RGBColor const red = {0xFFFF, 0, 0}, blue = {0, 0, 0xFFFF};
    pane->SetColors(red, blue);
    EXPECT_FALSE(ColorsSetBy(*pane).empty());
    TestItem fixed = Bass().Integer("NotSelectable", 1);
    EXPECT_TRUE(ColorsSetBy(*Make(fixed)).empty());
    EXPECT_FALSE(ColorsSetBy(*Make(fixed.Integer("UseSavedColors", 1))).empty());
}

TEST_F(GTextPaneColors, WithoutColoursOfItsOwnTheFirstDrawingTakesThoseOfThePort) {
    Make();
    OpenTextField *const pane = new OpenTextField;
    TestItem item = Bass().Integer("NotSelectable", 1).Box("BoundsRect", {60, 20, 76, 200});
    ASSERT_EQ(pane->InitGTextPane(glog, item.Sheet(), nullptr, nullptr), pane);
    pane->PanePositionChanged();
    pane->Prepare();
    SetColors(&kTinted);
    pane->_Draw_(nullptr, 0);
    EXPECT_EQ(PixelAt(190, 70), PixelOf(kTinted.back));
    SaveColorRec const others = {{0, 0, 0}, {0xFFFF, 0xFFFF, 0xFFFF}};
    pane->Prepare();
    SetColors(&others);
    pane->_Draw_(nullptr, 0);
    EXPECT_EQ(PixelAt(190, 70), PixelOf(kTinted.back)) << "only the first";
}

TEST_F(GTextPaneColors, ColoursOfItsOwnThatNobodyHasSetAreTheThemes) {
    OpenTextField *const pane = Make(TestItem().Integer("UseSavedColors", 1));
    EXPECT_EQ(Traced(*pane, [&] { pane->SetupColors(); }), Traced(*pane, [] {
                  VelaDrawing::RGBForeColor(kTextWellTextColor);
                  VelaDrawing::RGBBackColor(kTextWellBackgroundColor);
              }));
}

TEST_F(GTextPaneColors, ColoursThatItIsGivenShowWithTheNextDrawing) {
    OpenTextField *const pane = Make(Bass());
    RGBColor const red = {0xFFFF, 0, 0}, blue = {0, 0, 0xFFFF};
    pane->SetColors(red, blue);
    EXPECT_TRUE(Repainted().empty());
    pane->Inval();
    EXPECT_EQ(PixelAt(190, 28), PixelOf(blue));
}

TEST_F(GTextPaneColors, ItsTextHasTheForeground) {
    OpenTextField *const pane = Make(TestItem().String("InitTextID", "mmmm"));
    RGBColor const red = {0xFFFF, 0, 0}, white = {0xFFFF, 0xFFFF, 0xFFFF};
    pane->SetColors(red, white);
    auto const hasRed = [&] { // letters are smoothed: nearly red
        pane->Inval();
        UpdateGlog(glog);
        bool found = false;
        for (int v = 21; v < 35; ++v)
            for (int h = 21; h < 60; ++h) {
                std::uint32_t const pixel = desktop.Picture(glog)->Row(v)[h];
                found |= (pixel >> 16 & 0xFF) == 0xFF && (pixel & 0xFF) < 0x80 && (pixel >> 8 & 0xFF) < 0x80;
            }
        return found;
    };
    EXPECT_TRUE(hasRed());
    OS::TextStyle style;
    style.size = 14;
    style.color = OS::RGBAColor(0, 1, 0, 1);
    pane->SetTextStyle(style);
    EXPECT_TRUE(hasRed()) << "of a style for all, the colour does not count";
    pane->SetFontFSRID(9);
    EXPECT_TRUE(hasRed());
}

TEST_F(GTextPaneColors, TheEngineHasEachComponentAsAShareOfTheLargest) {
    OpenTextField *const pane = Make(Bass());
    RGBColor const color = {0xFFFF, 0x8001, 0x1234}, white = {0xFFFF, 0xFFFF, 0xFFFF};
    pane->SetColors(color, white);
    pane->Prepare();
    pane->SetupColors();
    OS::TextStyle style;
    pane->GetStyle(15, style);
    EXPECT_EQ(style.color.r, 1.0);
    EXPECT_EQ(style.color.g, static_cast<double>(0x8001 / 65535.0f)) << "in single precision";
    EXPECT_EQ(style.color.b, static_cast<double>(0x1234 / 65535.0f));
    EXPECT_EQ(style.color.a, 1.0);
}

TEST_F(GTextPaneColors, OnceItHasItsColoursADrawingTakesNoneOfThePort) {
    Make();
    OpenTextField *const pane = new OpenTextField;
    TestItem item = Bass().Integer("NotSelectable", 1).Box("BoundsRect", {60, 20, 76, 200});
    ASSERT_EQ(pane->InitGTextPane(glog, item.Sheet(), nullptr, nullptr), pane);
    pane->PanePositionChanged();
    pane->Prepare();
    pane->SetupColors();
    SetColors(&kTinted);
    pane->_Draw_(nullptr, 0);
    EXPECT_EQ(PixelAt(190, 70), PixelOf(kTextWellBackgroundColor));
}

TEST_F(GTextPaneColors, MakingItForgetsThatItHadColours) {
    Make();
    OpenTextField *const pane = new OpenTextField;
    UString const text = Text("Bass");
    pane->CreateTextEdit(&text, nullptr);
    pane->SetupColors();
    TestItem item = Bass().Integer("NotSelectable", 1).Box("BoundsRect", {60, 20, 76, 200});
    ASSERT_EQ(pane->InitGTextPane(glog, item.Sheet(), nullptr, nullptr), pane);
    pane->PanePositionChanged();
    pane->Prepare();
    SetColors(&kTinted);
    pane->_Draw_(nullptr, 0);
    EXPECT_EQ(PixelAt(190, 70), PixelOf(kTinted.back));
}

TEST_F(GTextPaneColors, WithoutItsGroundOnlyTheTextIsDrawnWhileItIsNotSelected) {
    OpenTextField *const pane = Make(Bass());
    RGBColor const red = {0xFFFF, 0, 0}, blue = {0, 0, 0xFFFF};
    pane->SetColors(red, blue);
    pane->DrawBackgroundWhenNotSelected(false);
    pane->Inval();
    EXPECT_NE(PixelAt(190, 28), PixelOf(blue));
    pane->DrawBackgroundWhenNotSelected(true);
    pane->Inval();
    EXPECT_EQ(PixelAt(190, 28), PixelOf(blue));
}

// Taken over by a helper

// Writes down the modes that it is given, and leaves colours of its own. Must go before the list.
class TintingHelper : public GTextPaneDrawingHelper {
public:
    explicit TintingHelper(std::vector<int> &modes_)
        : modes(modes_) {}
    void SetColors(unsigned char mode) override {
        modes.push_back(mode);
        ::SetColors(&kTinted);
    }
    void DrawTextWell(Rect &, unsigned char mode) override {
        modes.push_back(-mode);
        ::SetColors(&kTinted);
    }

private:
    std::vector<int> &modes;
};

TEST_F(GTextPaneColors, AHelperIsToldTheMode) {
    std::vector<int> modes;
    OpenTextField *const pane = Make(Bass());
    pane->SetDrawingHelper(AutoPtr<GTextPaneDrawingHelper>(new TintingHelper(modes)));
    pane->SetMode(3);
    modes.clear();
    Rect box = BoxOf(*pane);
    pane->SetupColors();
    pane->DrawTextWell(box);
    EXPECT_EQ(modes, (std::vector<int>{3, -3}));
    pane->SetDrawingHelper(AutoPtr<GTextPaneDrawingHelper>());
}

TEST_F(GTextPaneColors, AHelpersColoursComeBeforeThoseOfTheField) {
    std::vector<int> modes;
    OpenTextField *const pane = Make(Bass());
    RGBColor const red = {0xFFFF, 0, 0}, blue = {0, 0, 0xFFFF};
    pane->SetColors(red, blue);
    pane->SetDrawingHelper(AutoPtr<GTextPaneDrawingHelper>(new TintingHelper(modes)));
    pane->Inval();
    EXPECT_EQ(PixelAt(190, 28), PixelOf(kTinted.back));
    pane->SetDrawingHelper(AutoPtr<GTextPaneDrawingHelper>());
}

TEST_F(GTextPaneColors, TheWellLeavesThePortsColours) {
    std::vector<int> modes;
    OpenTextField *const pane = Make(Bass());
    pane->SetDrawingHelper(AutoPtr<GTextPaneDrawingHelper>(new TintingHelper(modes)));
    SaveColorRec const others = {{0, 0, 0}, {0xFFFF, 0xFFFF, 0xFFFF}};
    pane->Prepare();
    SetColors(&others);
    Rect box = BoxOf(*pane);
    pane->DrawTextWell(box);
    SaveColorRec after;
    GetColors(&after);
    EXPECT_EQ(after, others);
    pane->SetDrawingHelper(AutoPtr<GTextPaneDrawingHelper>());
}

TEST_F(GTextPaneColors, ADerivedFieldMayFrameItsWellInItsOwnWay) {
    class Framing : public OpenTextField {
    public:
        void DoFrameTextWell(Rect &box) override { framed.push_back(box); }
        std::vector<Rect> framed;
    };
    Framing *const pane = new Framing;
    TestItem item = Bass().Integer("TextWell", 1).Box("BoundsRect", {20, 20, 36, 200});
    ASSERT_EQ(pane->InitGTextPane(glog, item.Sheet(), nullptr, nullptr), pane);
    EXPECT_TRUE(Only("FrameTextWell", Traced(*pane, [&] { pane->_Draw_(nullptr, 0); })).empty());
    EXPECT_EQ(pane->framed, (std::vector<Rect>{{20, 20, 36, 200}}));
}

// Of the selection

TEST_F(GTextPaneColors, ASelectionHasTheColourThatItIsGiven) {
    OpenTextField *const pane = Make(TestItem().String("InitTextID", "        "));
    auto const selected = [&] {
        pane->Select(true);
        pane->SelectAll();
        pane->Inval();
        return PixelAt(28, 22);
    };
    std::uint32_t const usual = selected();
    RGBColor ofTheSystem;
    GetHiliteColor(&ofTheSystem);
    EXPECT_EQ(usual, PixelOf(ofTheSystem));
    EXPECT_NE(usual, PixelAt(190, 22));
    RGBColor green = {0, 0xFFFF, 0}, black = {0, 0, 0};
    pane->SetCustomSelectionColor(&green);
    EXPECT_EQ(selected(), PixelOf(green));
    pane->SetCustomSelectionColor(&black);
    EXPECT_EQ(selected(), usual);
    RGBColor nearlyBlack[] = {{0x0100, 0, 0}, {0, 0x0100, 0}, {0, 0, 0x0100}};
    for (RGBColor &color : nearlyBlack) {
        pane->SetCustomSelectionColor(&color);
        EXPECT_EQ(selected(), PixelOf(color));
    }
    pane->SetCustomSelectionColor(nullptr);
    EXPECT_EQ(selected(), usual);
}

// Drawing at once

TEST_F(GTextPaneColors, DrawingAtOnceStaysWithinTheText) {
    OpenTextField *const pane = Make(Bass().Integer("BoxIt", 1));
    Lines const drawn = Traced(*pane, [&] { pane->UpdateTextEdit(); });
    Lines const clips = Only("ClipRect", drawn);
    ASSERT_EQ(clips.size(), 1u);
    EXPECT_NE(clips[0].find("[20,20,36,200]"), std::string::npos) << clips[0];
    EXPECT_EQ(Only("DrawTextEdit", drawn).size(), 1u);
    EXPECT_TRUE(Only("FrameTextWell", drawn).empty());
}

TEST_F(GTextPaneColors, AHiddenFieldIsNotDrawnAtOnce) {
    OpenTextField *const pane = Make(Bass());
    pane->Hide();
    EXPECT_TRUE(Traced(*pane, [&] { pane->UpdateTextEdit(); }).empty());
}

// Does something to the field when it is pressed.
class Pressed : public GlogPane {
public:
    Pressed(glogRec *owner, std::function<void()> act_)
        : act(std::move(act_)) {
        GlogPaneInit(owner, 0);
        Rect box = {100, 20, 120, 60};
        SetBox(&box);
    }
    void DrawGuts(OSRgn *) override {}
    int HandleClick(EventRecordAdapter *) override {
        act();
        return -1;
    }

private:
    std::function<void()> act;
};

class GTextPaneAtOnce : public GTextPaneColors {
protected:
    // The calls of drawing at once while the field gets the text; what is damaged may be drawn as well.
    Lines DrawnAtOnce(OpenTextField &pane, char const *text) {
        desktop.TakeDrawing();
        pane.SetText(Text(text));
        return Only("ClipRect", desktop.TakeDrawing());
    }
    std::string const heldDown = "press 30 110\nwait 1\nrelease";
};

TEST_F(GTextPaneAtOnce, ATextThatIsSetWhileTheButtonIsDownIsDrawnAtOnce) {
    OpenTextField *const pane = Make(Bass());
    Lines held;
    new Pressed(glog, [&] { held = DrawnAtOnce(*pane, "Drums"); });
    desktop.Play(heldDown);
    ASSERT_EQ(held.size(), 1u);
    EXPECT_NE(held[0].find("[20,20,36,200]"), std::string::npos) << held[0];
    EXPECT_TRUE(DrawnAtOnce(*pane, "Bass").empty()) << "the button is up";
}

TEST_F(GTextPaneAtOnce, TheTextThatItHasIsNotDrawnAgain) {
    OpenTextField *const pane = Make(Bass());
    Lines held;
    new Pressed(glog, [&] { held = DrawnAtOnce(*pane, "Bass"); });
    desktop.Play(heldDown);
    EXPECT_TRUE(held.empty());
}

TEST_F(GTextPaneAtOnce, ATextThatIsDrawnAtOnceIsRepaintedToo) {
    class Counting : public OpenTextField {
    public:
        void Inval() override {
            ++invalidations;
            OpenTextField::Inval();
        }
        int invalidations = 0;
    };
    Counting *const pane = new Counting;
    TestItem item = Bass().Box("BoundsRect", {20, 20, 36, 200});
    ASSERT_EQ(pane->InitGTextPane(glog, item.Sheet(), nullptr, nullptr), pane);
    Show();
    desktop.Play("");
    pane->invalidations = 0;
    pane->SetText(Text("Drums"));
    EXPECT_EQ(pane->invalidations, 0) << "the engine has done it";
    new Pressed(glog, [&] { pane->SetText(Text("Bass")); });
    desktop.Play(heldDown);
    EXPECT_EQ(pane->invalidations, 1);
}

TEST_F(GTextPaneAtOnce, WithoutItsGroundATextIsDrawnAtOnceOnlyWhileItIsSelected) {
    OpenTextField *const pane = Make(Bass());
    pane->DrawBackgroundWhenNotSelected(false);
    Lines unselected, selected;
    new Pressed(glog, [&] {
        unselected = DrawnAtOnce(*pane, "Drums");
        pane->Select(true);
        selected = DrawnAtOnce(*pane, "Bass");
    });
    desktop.Play(heldDown);
    EXPECT_TRUE(unselected.empty());
    EXPECT_EQ(selected.size(), 1u);
    EXPECT_EQ(pane->GetText(), Text("Bass"));
}

TEST_F(GTextPaneAtOnce, ItIsDrawnInItsOwnPortAndTheFormerOneComesBack) {
    OpenTextField *const pane = Make(Bass());
    RGBColor const red = {0xFFFF, 0, 0}, blue = {0, 0, 0xFFFF};
    pane->SetColors(red, blue);
    LeaveForAnotherPort();
    pane->UpdateTextEdit();
    EXPECT_FALSE(IsInItsPort());
    EXPECT_EQ(PixelAt(190, 28), PixelOf(blue));
}

} // namespace
