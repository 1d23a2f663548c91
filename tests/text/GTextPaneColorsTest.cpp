// In which colours a field works, and that it gives the port's back.
#include "desktop/drawing/Surface.h"
#include "host/NamedColors.h"
#include "host/VelaDrawing.h"
#include "tests/text/TextFieldTest.h"

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
    EXPECT_NE(usual, PixelAt(190, 22));
    RGBColor green = {0, 0xFFFF, 0}, black = {0, 0, 0}, nearlyBlack = {0, 0, 0x0100};
    pane->SetCustomSelectionColor(&green);
    EXPECT_EQ(selected(), PixelOf(green));
    pane->SetCustomSelectionColor(&black);
    EXPECT_EQ(selected(), usual);
    pane->SetCustomSelectionColor(&nearlyBlack);
    EXPECT_EQ(selected(), PixelOf(nearlyBlack));
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

// Sets the field's text when it is pressed.
class Setting : public GlogPane {
public:
    Setting(glogRec *owner, GTextPane &field_, SimulatedDesktop &desktop_)
        : field(field_)
        , desktop(desktop_) {
        GlogPaneInit(owner, 0);
        Rect box = {100, 20, 120, 60};
        SetBox(&box);
    }
    void DrawGuts(OSRgn *) override {}
    int HandleClick(EventRecordAdapter *) override {
        desktop.TakeDrawing();
        field.SetText(UString("Drums", UString::kByteEncoding1));
        drawing = desktop.TakeDrawing();
        return -1;
    }
    GTextPane &field;
    SimulatedDesktop &desktop;
    std::vector<std::string> drawing;
};

TEST_F(GTextPaneColors, WithoutItsGroundATextIsDrawnAtOnceOnlyWhileItIsSelected) {
    OpenTextField *const pane = Make(Bass());
    Setting *const setting = new Setting(glog, *pane, desktop);
    pane->DrawBackgroundWhenNotSelected(false);
    desktop.Play("press 30 110");
    EXPECT_TRUE(Only("DrawTextEdit", setting->drawing).empty());
    EXPECT_EQ(pane->GetText(), Text("Drums"));
    pane->SetText(Text("Bass"));
    desktop.Play("release");
    class Selecting : public Setting {
    public:
        using Setting::Setting;
        int HandleClick(EventRecordAdapter *event) override {
            field.Select(true);
            return Setting::HandleClick(event);
        }
    };
    delete setting;
    Selecting *const selecting = new Selecting(glog, *pane, desktop);
    desktop.Play("press 30 110");
    EXPECT_EQ(Only("DrawTextEdit", selecting->drawing).size(), 1u);
}

} // namespace
