// What a field takes from its item, and what it begins with.
#include "desktop/drawing/Surface.h"
#include "host/CompoundPane.h"
#include "host/GlogLayout.h"
#include "tests/text/ClosingWindow.h"
#include "tests/text/TextFieldTest.h"

namespace {

class GTextPaneItem : public TextFieldTest {
protected:
    static TestItem Bass() {
        TestItem item;
        item.String("InitTextID", "Bass");
        return item;
    }
    int FramesOf(GTextPane &pane) {
        return int(Only("FrameTextWell", Traced(pane, [&] { pane._Draw_(nullptr, 0); })).size());
    }
    std::uint32_t PixelAt(int h, int v) {
        UpdateGlog(glog);
        return desktop.Picture(glog)->Row(v)[h];
    }
};

// Bits

TEST_F(GTextPaneItem, OfEachFlagTheLowestBitCounts) {
    auto const with = [](char const *key, int value) { return Bass().Integer(key, value); };
    for (int value : {0, 1, 2, 3, -1, -2}) {
        bool const on = (value & 1) != 0;
        EXPECT_EQ(Make(with("NoTabIn", value))->CanTabIn() == 0, on) << "NoTabIn " << value;
        EXPECT_EQ(Make(with("NotSelectable", value))->Selectable() == 0, on) << "NotSelectable " << value;
        unsigned int const flags = on ? 8u : 0u;
        EXPECT_EQ(Make(with("MultiLine", value))->GetTextEditCreationFlags(false), 8u | (flags >> 2))
            << "MultiLine " << value;
        EXPECT_EQ(Make(with("ReadOnly", value))->GetTextEditCreationFlags(false), 8u | (flags >> 1))
            << "ReadOnly " << value;
        EXPECT_EQ(Make(with("AutoScroll", value))->GetTextEditCreationFlags(false), 8u - flags)
            << "AutoScroll " << value;
        bool commits = !on;
        Make(with("RetOnModify", value))->Cut(commits);
        EXPECT_EQ(commits, on) << "RetOnModify " << value;
        EventRecordAdapter press;
        press.what = 1;
        press.where = {28, 40};
        EXPECT_EQ(Make(with("RetOnClick", value))->HandleClick(&press), on ? 1 : -1)
            << "RetOnClick " << value;
        OpenTextField *const still = Make(with("UseSavedColors", value));
        still->SetMode(1);
        Lines const colors = Only("RGBForeColor", Traced(*still, [&] { still->_Draw_(nullptr, 0); }));
        EXPECT_EQ(!colors.empty(), on) << "UseSavedColors " << value;
    }
}

// Numbers

TEST_F(GTextPaneItem, OfTheWellTheLowByteCounts) {
    for (int value : {1, 2, -1, 255, 0x102})
        EXPECT_EQ(FramesOf(*Make(Bass().Integer("TextWell", value))), 1) << value;
    for (int value : {0, 0x100, -0x100})
        EXPECT_EQ(FramesOf(*Make(Bass().Integer("TextWell", value))), 0) << value;
}

TEST_F(GTextPaneItem, TheWellMayBeTakenAway) {
    OpenTextField *const pane = Make(Bass().Integer("TextWell", 1));
    pane->SetBoxAndFrame(false, false);
    EXPECT_EQ(FramesOf(*pane), 0);
    pane->SetBoxAndFrame(false, true);
    EXPECT_EQ(FramesOf(*pane), 1);
}

TEST_F(GTextPaneItem, OfTheFramesOffsetSixteenBitsCount) {
    struct {
        int value;
        char const *place;
    } const cases[] = {{0x10005, "[15,15,41,205]"}, {40000, "[22,22,34,198]"}};
    for (auto const &c : cases) {
        OpenTextField *const pane = Make(Bass().Integer("FrameOffset", c.value));
        pane->SetBoxAndFrame(true, true);
        Lines const drawn = Only("DrawTextEdit", Traced(*pane, [&] { pane->_Draw_(nullptr, 0); }));
        ASSERT_EQ(drawn.size(), 1u);
        EXPECT_NE(drawn[0].find(c.place), std::string::npos) << c.value << ": " << drawn[0];
    }
}

TEST_F(GTextPaneItem, ThePlatformHandlesTextInputForAnyNumberButZero) {
    for (int value : {1, 2, -1})
        EXPECT_TRUE(
            Make(Bass().Integer("PlatformHandlesTextInputEvents", value))->PlatformHandlesTextInputEvents())
            << value;
    EXPECT_FALSE(Make(Bass().Integer("PlatformHandlesTextInputEvents", 0))->PlatformHandlesTextInputEvents());
    EXPECT_FALSE(Make(Bass())->PlatformHandlesTextInputEvents());
}

TEST_F(GTextPaneItem, ALayoutAsksTheItemForItsSize) {
    CompoundPane *const column = new CompoundPane;
    column->CompoundPaneInit(glog, 1);
    Rect all = {0, 0, 200, 300};
    column->SetBox(&all);
    column->SetUseLayout(true);
    boost::shared_ptr<XMLLib::ContainerItem> const layout = XMLLib::CreateContainer(Text("Layout"));
    layout->AddSIntItem(Text("Width"), 120);
    layout->AddSIntItem(Text("Height"), 33);
    TestItem item;
    item.Container()->AddItem(Text("Layout"), layout);
    OpenTextField *const pane = Make(item);
    column->Add(pane, -1);
    UpdateGlog(glog);
    EXPECT_EQ(pane->GetLayoutRect()->GetItemRect(), (Rect{0, 0, 33, 120}));
}

// Before it is made

TEST_F(GTextPaneItem, AFieldThatIsNotMadeYetHasAWell) {
    OpenTextField pane;
    OpenTextField *const made = Make();
    Rect box = {20, 20, 36, 200};
    EXPECT_EQ(Only("FrameTextWell", Traced(*made, [&] { pane.DrawTextWell(box); })).size(), 1u);
}

TEST_F(GTextPaneItem, WhatWasSetBeforeItIsMadeIsForgotten) {
    OpenTextField *const usual = Make(TestItem().String("InitTextID", "        "));
    usual->Select(true);
    std::uint32_t const selected = PixelAt(28, 22);
    delete usual;
    OpenTextField *const pane = new OpenTextField;
    RGBColor green = {0, 0xFFFF, 0};
    pane->SetMode(1);
    pane->SetUnDeselectable(true);
    pane->SetCustomSelectionColor(&green);
    TestItem item;
    item.String("InitTextID", "        ").Box("BoundsRect", {20, 20, 36, 200});
    ASSERT_EQ(pane->InitGTextPane(glog, item.Sheet(), nullptr, nullptr), pane);
    EXPECT_EQ(pane->GetMode(), 0);
    EXPECT_TRUE(pane->CanDeselect());
    pane->PanePositionChanged();
    pane->Select(true);
    EXPECT_EQ(PixelAt(28, 22), selected);
}

TEST_F(GTextPaneItem, ItsGroundIsDrawnWhateverWasSetBeforeItIsMade) {
    Make();
    OpenTextField *const pane = new OpenTextField;
    pane->DrawBackgroundWhenNotSelected(false);
    TestItem item = Bass().Box("BoundsRect", {60, 20, 76, 200});
    ASSERT_EQ(pane->InitGTextPane(glog, item.Sheet(), nullptr, nullptr), pane);
    RGBColor const red = {0xFFFF, 0, 0}, blue = {0, 0, 0xFFFF};
    pane->SetColors(red, blue);
    pane->PanePositionChanged();
    pane->Inval();
    EXPECT_EQ(PixelAt(190, 70), 0xFF0000FFu);
}

// The engine

TEST_F(GTextPaneItem, TheEngineThatItHasIsKept) {
    Make();
    OpenTextField *const pane = new OpenTextField;
    UString const first = Text("first"), second = Text("second");
    pane->CreateTextEdit(&first, nullptr);
    pane->CreateTextEdit(&second, nullptr);
    EXPECT_EQ(pane->GetText(), first);
    TestItem item = Bass();
    ASSERT_EQ(pane->InitGTextPane(glog, item.Sheet(), &second, nullptr), pane);
    EXPECT_EQ(pane->GetText(), first);
}

TEST_F(GTextPaneItem, ANewEngineIsToldWhetherItsGroundIsDrawn) {
    Make();
    OpenTextField *const pane = new OpenTextField;
    pane->GlogPaneInit(glog, 0);
    pane->DrawBackgroundWhenNotSelected(false);
    UString const text = Text("Bass");
    pane->CreateTextEdit(&text, nullptr);
    RGBColor const red = {0xFFFF, 0, 0}, blue = {0, 0, 0xFFFF};
    pane->SetColors(red, blue);
    Rect box = {60, 20, 76, 200};
    pane->SetBox(&box);
    pane->Inval();
    EXPECT_NE(PixelAt(190, 70), 0xFF0000FFu);
}

// Says itself what its engine is created with.
class Choosing : public OpenTextField {
public:
    unsigned int GetTextEditCreationFlags(bool isStyled) override {
        styled.push_back(isStyled);
        return 4; // read-only
    }
    std::vector<bool> styled;
};

TEST_F(GTextPaneItem, ADerivedFieldMaySayWhatTheEngineIsCreatedWith) {
    std::vector<StyleRunRec> const noRuns;
    TestItem item = Bass().Box("BoundsRect", {20, 20, 36, 200});
    Choosing *const plain = new Choosing, *const styled = new Choosing;
    plain->InitGTextPane(glog, item.Sheet(), nullptr, nullptr);
    styled->InitGTextPane(glog, item.Sheet(), nullptr, &noRuns);
    EXPECT_EQ(plain->styled, std::vector<bool>{false});
    EXPECT_EQ(styled->styled, std::vector<bool>{true}) << "also without any run";
    Show();
    plain->Select(true);
    desktop.Play("type \"a\"");
    EXPECT_EQ(plain->GetText(), Text("Bass"));
}

TEST_F(GTextPaneItem, TheFormWithARectangleTakesRunsToo) {
    std::vector<StyleRunRec> runs(1);
    runs[0].start = 1;
    runs[0].end = 3;
    runs[0].style.size = 20;
    Rect rect = {10, 10, 30, 110};
    GTextPane *const pane = GTextPane::NewGTextPane(glog, 12, &rect, Text("Take"), &runs);
    EXPECT_EQ(pane->GetNumberStyleRuns(), 3u);
}

// With its window

TEST_F(GTextPaneItem, HearsOfItsWindow) {
    OpenTextField *const pane = Make(Bass());
    pane->SetText(Text("Drums"));
    EXPECT_FALSE(Repainted().empty());
    glog->BroadcastChange(ClosingWindow(*glog), nullptr);
    pane->SetText(Text("Bass"));
    EXPECT_TRUE(Repainted().empty());
}

} // namespace
