// Where the text of a field stands, how it is scrolled, and what becomes of it with its window.
#include "desktop/drawing/Surface.h"
#include "tests/text/TextFieldTest.h"

namespace {

class GTextPanePlace : public TextFieldTest {
protected:
    // The characters under two points: between the middle of the field and either side.
    static Units CharactersBesideTheMiddle(GTextPane &pane) {
        return {pane.GetCharacterIndexForPoint(OS::Point(90, 28)),
                pane.GetCharacterIndexForPoint(OS::Point(130, 28))};
    }
    // The first row with ink within the field.
    int FirstInk(GTextPane &pane) {
        pane.Inval();
        UpdateGlog(glog);
        Surface const &picture = *desktop.Picture(glog);
        int const kDark = 0x80;
        Rect const box = BoxOf(pane);
        for (int y = box.top + 1; y < box.bottom + 20; ++y)
            for (int x = box.left + 4; x < box.right - 4; ++x)
                if (static_cast<int>(picture.Row(y)[x] & 0xFF) < kDark)
                    return y;
        return -1;
    }
    // The place of the engine, as it draws.
    std::string EngineRect(GTextPane &pane) {
        Lines const drawn = Only("DrawTextEdit", Traced(pane, [&] { pane._Draw_(nullptr, 0); }));
        if (drawn.size() != 1)
            return "nothing";
        std::size_t const start = drawn[0].find('['), end = drawn[0].find(']');
        return drawn[0].substr(start, end + 1 - start);
    }
    static TestItem Bass() {
        TestItem item;
        item.String("InitTextID", "Bass");
        return item;
    }
};

// Alignment

TEST_F(GTextPanePlace, TheAlignmentIsThatOfItsIndexAndTheFirstForAnyOther) {
    struct {
        int index;
        Units characters;
    } const cases[] = {
        {0, {1, 1}}, {1, {0, 0}}, {2, {0, 1}}, {3, {1, 1}}, {255, {1, 1}}, {0x101, {0, 0}},
    };
    for (auto const &c : cases) {
        TestItem item;
        item.String("InitTextID", "mm").Integer("Align", c.index);
        EXPECT_EQ(CharactersBesideTheMiddle(*Make(item)), c.characters) << c.index;
    }
}

TEST_F(GTextPanePlace, AnAlignmentOutsideOfTheTableReachesTheEngine) {
    OpenTextField *const pane = Make();
    UString shin;
    {
        UString::Unit const units[] = {0x05E9, 0x05E9};
        shin = Text("mm");
        shin[0] = units[0];
        shin[1] = units[1];
    }
    pane->SetText(shin);
    EXPECT_EQ(CharactersBesideTheMiddle(*pane), Units(0, 0)) << "at the left, as the index says";
    pane->SetAlignment(TextSettings::kAlignDefault);
    EXPECT_EQ(CharactersBesideTheMiddle(*pane), Units(1, 1)) << "at the right, where it is read from";
    pane->SetAlignment(TextSettings::kAlignLeft);
    EXPECT_EQ(CharactersBesideTheMiddle(*pane), Units(0, 0));
}

// The baseline

TEST_F(GTextPanePlace, TheTextStandsLowerByItsOffsetAndHigherByItsFrame) {
    GTextPane *const first = Make(Bass());
    int const usual = FirstInk(*first);
    ASSERT_GT(usual, 20);
    delete first;
    GTextPane *const lower = Make(Bass().Integer("BaselineOffset", 5));
    EXPECT_EQ(FirstInk(*lower), usual + 5);
    delete lower;
    GTextPane *const framed = Make(Bass().Integer("BaselineOffset", 5).Integer("BoxIt", 1));
    EXPECT_EQ(FirstInk(*framed), usual + 5 - 2);
    framed->SetBaselineOffset(9);
    EXPECT_EQ(FirstInk(*framed), usual + 9 - 2);
    delete framed;
    GTextPane *const plain = Make(Bass());
    plain->SetBaselineOffset(3);
    EXPECT_EQ(FirstInk(*plain), usual + 3);
}

TEST_F(GTextPanePlace, OffsetsBeyondSixteenBitsAreThoseAtTheirEnds) {
    for (int flag : {0, 1}) {
        OpenTextField *const pane = Make(Bass().Integer("BoxIt", flag));
        for (int offset : {2147483647, -2147483647 - 1, 70000, 0}) {
            pane->SetBaselineOffset(offset);
            Repainted();
        }
        EXPECT_GT(FirstInk(*pane), 16);
        delete pane;
    }
}

TEST_F(GTextPanePlace, ANewFrameTakesTheOffsetFromTheGlogsOwnSheet) {
    TestItem ofTheGlog;
    ofTheGlog.Integer("BaselineOffset", 4);
    int const usual = FirstInk(*Make(Bass()));
    glog = desktop.NewGlog(
        GlogOptions().Size(320, 200).StyleSheet(std::make_shared<GlogStyleSheet>(ofTheGlog.Container())));
    GTextPane *const pane = Make(Bass());
    EXPECT_EQ(FirstInk(*pane), usual);
    pane->SetBoxAndFrame(false, false);
    EXPECT_EQ(FirstInk(*pane), usual + 4);
    pane->SetBoxAndFrame(true, false);
    EXPECT_EQ(FirstInk(*pane), usual + 2 + 4 - 2) << "within the frame, and higher by it";
}

TEST_F(GTextPanePlace, TheFrameLiesAsFarFromTheTextAsItsOffsetSays) {
    GTextPane *const outward = Make(TestItem().Integer("FrameOffset", 5));
    EXPECT_EQ(EngineRect(*outward), "[20,20,36,200]");
    outward->SetBoxAndFrame(true, true);
    EXPECT_EQ(EngineRect(*outward), "[15,15,41,205]");
    outward->SetBoxAndFrame(false, true);
    EXPECT_EQ(EngineRect(*outward), "[20,20,36,200]");
    for (int offset : {-7, -1}) {
        GTextPane *const inward = Make(TestItem().Integer("FrameOffset", offset));
        inward->SetBoxAndFrame(true, true);
        EXPECT_EQ(EngineRect(*inward), "[22,22,34,198]") << offset;
    }
}

// With its window

// Goes out of the way of what deselects it, so that only its window does anything to it.
class Staying : public OpenTextField {
public:
    void Select(bool on) override {
        if (on)
            OpenTextField::Select(on);
    }
};

TEST_F(GTextPanePlace, AFieldThatIsStillSelectedWhenItsWindowComesBackIsEditedAgain) {
    Staying *const pane = new Staying;
    TestItem item;
    item.Box("BoundsRect", {20, 20, 36, 200}).String("InitTextID", "Bass");
    ASSERT_EQ(pane->InitGTextPane(glog, item.Sheet(), nullptr, nullptr), pane);
    Show();
    desktop.Play("");
    pane->Select(true);
    EXPECT_EQ(SelectionOf(*pane), Units(0, 4));
    pane->Deactivate();
    EXPECT_EQ(SelectionOf(*pane), Units(0, 0)) << "left at the start";
    Repainted();
    desktop.Play("wait 1.5");
    EXPECT_TRUE(Repainted().empty()) << "its insertion point blinks on";
    pane->Activate();
    Repainted();
    desktop.Play("wait 0.6");
    EXPECT_FALSE(Repainted().empty());
}

TEST_F(GTextPanePlace, WithoutItsWindowItRepaintsNothing) {
    OpenTextField *const pane = Make();
    pane->PlatformWindow_Closing(*glog);
    pane->SetText(Text("Bass"));
    EXPECT_TRUE(Repainted().empty());
    pane->PlatformWindow_Opened(*glog);
    pane->SetText(Text("Drums"));
    EXPECT_FALSE(Repainted().empty());
    OpenTextField loose;
    loose.PlatformWindow_Closing(*glog);
    loose.PlatformWindow_Opened(*glog);
}

// Scrolling

class ScrolledField : public GTextPanePlace {
protected:
    // Of three lines, with twenty in it, or of one.
    OpenTextField *MakeLines(int multiLine) {
        UString lines;
        for (int i = 0; i < 20; ++i)
            lines += Text(multiLine ? "line\n" : "line ");
        OpenTextField *const pane = new OpenTextField;
        TestItem item;
        item.Box("BoundsRect", {20, 20, 68, 200}).Integer("MultiLine", multiLine);
        EXPECT_EQ(pane->InitGTextPane(glog, item.Sheet(), &lines, nullptr), pane);
        Show();
        desktop.Play("");
        return pane;
    }
};

TEST_F(ScrolledField, IsScrolledByTheProgram) {
    OpenTextField *const pane = MakeLines(1);
    EXPECT_GT(pane->GetScrollDelta(), 8);
    EXPECT_EQ(pane->GetTextHeight(), 21 * pane->GetScrollDelta());
    EXPECT_EQ(pane->GetCurrentScrolledOffset(), 0);
    pane->SetVScrollPos(17, 99);
    EXPECT_EQ(pane->GetCurrentScrolledOffset(), 17);
    pane->SetVScrollPos(100000, 0);
    EXPECT_EQ(pane->GetCurrentScrolledOffset(), pane->GetTextHeight() - 48);
}

TEST_F(ScrolledField, TheEndOfTheSelectionIsScrolledTo) {
    OpenTextField *const pane = MakeLines(1);
    pane->SetSelection(0, 52); // into line 10
    EXPECT_EQ(pane->GetCurrentScrolledOffset(), 0);
    pane->ScrollToSelectionEnd();
    EXPECT_EQ(pane->GetCurrentScrolledOffset(), 11 * pane->GetScrollDelta() - 48);
}

TEST_F(ScrolledField, FollowsTheInsertionPointOnceItIsTold) {
    OpenTextField *const pane = MakeLines(1);
    desktop.Play("click 30 24\nkey End command");
    EXPECT_EQ(pane->GetCurrentScrolledOffset(), 0);
    pane->SetAutoScroll(true);
    desktop.Play("key Left");
    EXPECT_GT(pane->GetCurrentScrolledOffset(), 0);
}

TEST_F(ScrolledField, TheWheelScrollsThreeLinesANotchAndStopsAtTheEnds) {
    OpenTextField *const pane = MakeLines(1);
    desktop.Play("wheel 100 40 0 -1");
    EXPECT_EQ(pane->GetCurrentScrolledOffset(), 3 * pane->GetScrollDelta());
    desktop.Play("wheel 100 40 0 1");
    EXPECT_EQ(pane->GetCurrentScrolledOffset(), 0);
    desktop.Play("wheel 100 40 0 5");
    EXPECT_EQ(pane->GetCurrentScrolledOffset(), 0);
    desktop.Play("wheel 100 40 0 -500");
    EXPECT_EQ(pane->GetCurrentScrolledOffset(), pane->GetTextHeight() - 48);
    EXPECT_FALSE(Repainted().empty());
}

TEST_F(ScrolledField, TheWheelAcrossScrollsNothing) {
    OpenTextField *const pane = MakeLines(1);
    desktop.Play("wheel 100 40 -3 0");
    EXPECT_EQ(pane->GetCurrentScrolledOffset(), 0);
}

TEST_F(ScrolledField, OneLineLeavesTheWheelToOthers) {
    OpenTextField *const pane = MakeLines(0);
    unsigned int const before = pane->GetCharacterIndexForPoint(OS::Point(24, 28));
    desktop.Play("wheel 100 40 0 -3");
    EXPECT_EQ(pane->GetCurrentScrolledOffset(), 0);
    EXPECT_EQ(pane->GetCharacterIndexForPoint(OS::Point(24, 28)), before);
}

} // namespace
