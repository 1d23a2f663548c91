// Placing the insertion point and selecting with the mouse.
#include "host/CIdleChore.h"
#include "tests/editing/EditorTest.h"

class EditorMouse : public EditorTest {
protected:
    static std::string Place(int h, int v) { return std::to_string(h) + " " + std::to_string(v); }
    // The middle of the character's left edge.
    std::string PlaceOf(unsigned int unit) {
        UnitRange const kept = Selection();
        editor->SetSelection(unit, unit);
        Rect const box = editor->CaretBox();
        editor->SetSelection(kept.first, kept.second);
        return Place(box.left, (box.top + box.bottom) / 2);
    }
};

TEST_F(EditorMouse, AClickPlacesTheInsertionPointAtTheNearerSideOfACharacter) {
    Open(0, u"mmmm");
    Play("click " + PlaceOf(2));
    EXPECT_EQ(Selection(), At(2));
    Play("click 190 12");
    EXPECT_EQ(Selection(), At(4));
}

TEST_F(EditorMouse, ADragSelectsEitherWay) {
    Open(0, u"abcdefgh");
    Play("press " + PlaceOf(2) + "\nmove " + PlaceOf(5) + "\nrelease");
    EXPECT_EQ(Selection(), UnitRange(2, 5));
    Play("wait 1\npress " + PlaceOf(6) + "\nmove " + PlaceOf(1) + "\nrelease");
    EXPECT_EQ(Selection(), UnitRange(1, 6));
}

TEST_F(EditorMouse, ShiftExtendsFromWhereTheSelectionBegan) {
    Open(0, u"abcdefgh");
    Play("click " + PlaceOf(3) + "\nwait 1\nclick " + PlaceOf(6) + " shift");
    EXPECT_EQ(Selection(), UnitRange(3, 6));
    Play("wait 1\nclick " + PlaceOf(1) + " shift");
    EXPECT_EQ(Selection(), UnitRange(1, 3));
}

TEST_F(EditorMouse, ADoubleClickTakesAWordAndADragGoesOnByWords) {
    Open(0, u"one two three four");
    Play("doubleclick " + PlaceOf(5));
    EXPECT_EQ(Selection(), UnitRange(4, 7));
    std::string const word = PlaceOf(5);
    Play("wait 1\npress " + word + "\nrelease\npress " + word + "\nmove " + PlaceOf(10) + "\nrelease");
    EXPECT_EQ(Selection(), UnitRange(4, 13));
}

TEST_F(EditorMouse, ADoubleClickBetweenWordsTakesOneCharacter) {
    Open(0, u"one,  two");
    Play("doubleclick " + PlaceOf(3));
    EXPECT_EQ(Selection(), UnitRange(3, 4));
}

TEST_F(EditorMouse, ATripleClickTakesTheParagraph) {
    Open(kSeveralLines, u"one two\nthree four\nfive");
    std::string const place = PlaceOf(10);
    Play("press " + place + "\nrelease\npress " + place + "\nrelease\npress " + place + "\nrelease");
    EXPECT_EQ(Selection(), UnitRange(8, 19));
}

TEST_F(EditorMouse, HoldingTheMouseBelowTheTextScrollsAndSelectsOn) {
    std::u16string text;
    for (int i = 0; i < 60; ++i)
        text += u"a line of text\n";
    TextEditor &edit = Open(kSeveralLines, text, {10, 10, 110, 210});
    Play("press 30 20\nmove 30 150\nwait 1\nrelease");
    EXPECT_GT(edit.GetCurrentScrolledOffset(), 100);
    EXPECT_LT(Selection().first, 15u);
    EXPECT_GT(Selection().second, 200u);
    EXPECT_GT(ear.scrolls, 5);
}

TEST_F(EditorMouse, WithoutAutoScrollItStaysWhereItIs) {
    std::u16string text;
    for (int i = 0; i < 60; ++i)
        text += u"a line of text\n";
    TextEditor &edit = Open(kSeveralLines | TextEditFlags::kNoAutoScroll, text, {10, 10, 110, 210});
    Play("press 30 20\nmove 30 150\nwait 1\nrelease\nkey End command\ntype \"x\"");
    EXPECT_EQ(edit.GetCurrentScrolledOffset(), 0);
    edit.SetAutoScroll(true);
    Play("type \"x\"");
    EXPECT_GT(edit.GetCurrentScrolledOffset(), 0);
}

TEST_F(EditorMouse, AnEngineThatIsDeletedWhileItFollowsTheMouseIsLeftAlone) {
    class Deleting : public OS::TextEditListener {
    public:
        explicit Deleting(EditorPane &pane_)
            : pane(pane_) {}
        void TextEditListener_AutoScrolled() override { pane.editor.reset(); }
        EditorPane &pane;
    };
    std::u16string text;
    for (int i = 0; i < 60; ++i)
        text += u"a line of text\n";
    TextEditor &edit = Open(kSeveralLines, text, {10, 10, 110, 210});
    Deleting deleting(*pane);
    deleting.DependUpon(&edit);
    Play("press 30 20\nmove 30 150\nwait 1\nrelease");
    EXPECT_EQ(pane->editor, nullptr);
}

TEST_F(EditorMouse, TheCharacterUnderAPointCountsFromTheBounds) {
    TextEditor &edit = Open(0, u"mmmm");
    edit.SetSelection(2, 2);
    double const h = edit.CaretBox().left - edit.GetBounds().origin.x;
    EXPECT_EQ(edit.GetLayoutInfo().GetCharacterIndexForPoint(OS::Point(h + 1, 4)), 2u);
    EXPECT_EQ(edit.GetLayoutInfo().GetCharacterIndexForPoint(OS::Point(h - 1, 4)), 1u);
    EXPECT_EQ(edit.GetLayoutInfo().GetCharacterIndexForPoint(OS::Point(-1e9, -1e9)), 0u);
}

TEST_F(EditorMouse, ATextThatIsReplacedDuringADragLeavesASelectionWithinIt) {
    class Shortening : public CIdleChore {
    public:
        explicit Shortening(TextEditor &editor_)
            : CIdleChore(2, kInitialDelay)
            , editor(editor_) {
            Assign();
        }
        void DoIdle() override {
            Cancel();
            editor.SetText(Utf::FromUnits(u"abc"));
        }

    private:
        TextEditor &editor;
    };
    for (int clicks : {1, 2, 3}) {
        Open(kSeveralLines, u"one two three four\nfive six seven eight\nnine");
        std::string const place = PlaceOf(40);
        Shortening const shortening(*editor);
        std::string script;
        for (int i = 1; i < clicks; ++i)
            script += "press " + place + "\nrelease\n";
        Play(script + "press " + place + "\nwait 0.5\nmove 12 14\nmove 150 14\nmove 12 14\nrelease");
        EXPECT_EQ(Text(), u"abc");
        EXPECT_LE(Selection().first, 3u);
        EXPECT_LE(Selection().second, 3u);
        Play("key c command\ntype \"x\"");
        EXPECT_LE(Text().size(), 4u);
        delete pane;
    }
}

TEST_F(EditorMouse, ADragBackwardsGoesOnByWordsAndByParagraphs) {
    Open(kSeveralLines, u"one two three four\nfive\nsix seven");
    std::string const word = PlaceOf(10), third = PlaceOf(28), first = PlaceOf(5);
    Play("press " + word + "\nrelease\npress " + word + "\nmove " + first + "\nrelease");
    EXPECT_EQ(Selection(), UnitRange(4, 13));
    Play("wait 1\npress " + third + "\nrelease\npress " + third + "\nrelease\npress " + third + "\nmove " +
         first + "\nrelease");
    EXPECT_EQ(Selection(), UnitRange(0, 33));
    Play("key Left shift");
    EXPECT_EQ(Selection(), UnitRange(0, 33)) << "it was begun at the end and has come to the start";
}

TEST_F(EditorMouse, ATripleClickWithShiftSelectsOnToTheParagraphsEnd) {
    Open(kSeveralLines, u"one two\nthree four\nfive").SetSelection(2, 2);
    std::string const place = PlaceOf(10) + " shift";
    Play("press " + place + "\nrelease\npress " + place + "\nrelease\npress " + place + "\nrelease");
    EXPECT_EQ(Selection(), UnitRange(2, 19));
}

TEST_F(EditorMouse, HoldingTheMouseBesideALineScrollsAcross) {
    TextEditor &edit = Open(0, std::u16string(100, u'm'), {10, 10, 30, 110});
    unsigned int const before = edit.GetLayoutInfo().GetCharacterIndexForPoint(OS::Point(3, 8));
    Play("press 30 20\nmove 150 20\nwait 1\nrelease");
    EXPECT_EQ(before, 0u);
    EXPECT_GT(edit.GetLayoutInfo().GetCharacterIndexForPoint(OS::Point(3, 8)), 5u);
    EXPECT_GT(Selection().second, 15u);
}
