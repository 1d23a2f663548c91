// Taking changes back, and making them again.
#include "tests/editing/EditorTest.h"

typedef EditorTest EditorUndo;

TEST_F(EditorUndo, TypingInOneGoIsOneStep) {
    Open(0, u"").SetSelection(0, 0);
    Play("type \"bass\"\nkey z command");
    EXPECT_EQ(Text(), u"");
    Play("key z command shift");
    EXPECT_EQ(Text(), u"bass");
    EXPECT_EQ(Selection(), At(4));
}

TEST_F(EditorUndo, MovingBetweenBeginsANewStep) {
    Open(0, u"");
    Play("type \"ab\"\nkey Left\ntype \"x\"\nkey z command");
    EXPECT_EQ(Text(), u"ab");
    EXPECT_EQ(Selection(), At(1));
    Play("key z command");
    EXPECT_EQ(Text(), u"");
}

TEST_F(EditorUndo, DeletionsInOneGoAreOneStepInEitherDirection) {
    Open(0, u"abcdef").SetSelection(3, 3);
    Play("key Backspace\nkey Backspace\nkey z command");
    EXPECT_EQ(Text(), u"abcdef");
    EXPECT_EQ(Selection(), At(3));
    Play("key Delete\nkey Delete\nkey Delete\nkey z command");
    EXPECT_EQ(Text(), u"abcdef");
    Play("key y command");
    EXPECT_EQ(Text(), u"abc");
}

TEST_F(EditorUndo, RestoresWhatWasSelected) {
    Open(0, u"one two").SetSelection(4, 7);
    Play("type \"x\"\nkey z command");
    EXPECT_EQ(Text(), u"one two");
    EXPECT_EQ(Selection(), UnitRange(4, 7));
}

TEST_F(EditorUndo, RestoresStyles) {
    TextEditor &edit = Open(kStyled, u"one two");
    edit.SetSelection(4, 7);
    OS::TextStyle big;
    big.size = 20;
    big.color = OS::RGBAColor(1, 0, 0, 1);
    edit.SetStyle(12, big);
    edit.SetSelection(2, 6);
    Play("key Delete");
    EXPECT_EQ(Text(), u"ono");
    EXPECT_EQ(StyleAt(2).size, 20);
    Play("key z command");
    EXPECT_EQ(Text(), u"one two");
    EXPECT_NE(StyleAt(3).size, 20);
    EXPECT_EQ(StyleAt(4).size, 20);
    EXPECT_EQ(StyleAt(5).color.r, 1.0);
    EXPECT_EQ(edit.GetNumberStyleRuns(), 2u);
}

TEST_F(EditorUndo, ANewChangeLeavesNothingToBeMadeAgain) {
    Open(0, u"");
    Play("type \"a\"\nkey z command\ntype \"b\"\nkey y command");
    EXPECT_EQ(Text(), u"b");
}

TEST_F(EditorUndo, PastesAndCutsAreStepsOfTheirOwn) {
    Open(0, u"ab").SetSelection(0, 2);
    Play("key x command\nkey v command\nkey v command");
    EXPECT_EQ(Text(), u"abab");
    Play("key z command");
    EXPECT_EQ(Text(), u"ab");
    Play("key z command");
    EXPECT_EQ(Text(), u"");
    Play("key z command");
    EXPECT_EQ(Text(), u"ab");
    EXPECT_EQ(Selection(), UnitRange(0, 2));
}

TEST_F(EditorUndo, ATextThatTheProgramSetIsNotTakenBack) {
    TextEditor &edit = Open(0, u"");
    Play("type \"a\"");
    edit.SetText(Utf::FromUnits(u"new"));
    Play("key z command");
    EXPECT_EQ(Text(), u"new");
}

TEST_F(EditorUndo, TellsThatTheTextHasChanged) {
    Open(0, u"");
    Play("type \"a\"");
    int const before = ear.changes;
    Play("key z command\nkey z command");
    EXPECT_EQ(ear.changes, before + 1);
}

TEST_F(EditorUndo, MakingAgainRestoresLooksAndSelectionToo) {
    TextEditor &edit = Open(kStyled, u"one two");
    edit.SetSelection(4, 7);
    OS::TextStyle big;
    big.size = 20;
    edit.SetStyle(4, big);
    edit.SetSelection(0, 5);
    Play("key Delete\nkey z command");
    EXPECT_EQ(Selection(), UnitRange(0, 5));
    EXPECT_NE(StyleAt(0).size, 20);
    Play("key y command");
    EXPECT_EQ(Text(), u"wo");
    EXPECT_EQ(Selection(), At(0));
    EXPECT_EQ(StyleAt(0).size, 20);
    EXPECT_EQ(edit.GetNumberStyleRuns(), 1u);
    Play("key z command");
    EXPECT_EQ(edit.GetNumberStyleRuns(), 2u);
}
