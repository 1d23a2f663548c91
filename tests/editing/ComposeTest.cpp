// What an input method composes.
#include "tests/editing/EditorTest.h"

typedef EditorTest EditorCompose;

TEST_F(EditorCompose, StandsMarkedInThePlaceOfTheSelection) {
    TextEditor &edit = Open(0, u"abcd");
    edit.SetSelection(1, 3);
    Play("compose \"\u306B\u307B\" 1");
    EXPECT_EQ(Text(), u"a\u306B\u307Bd");
    ASSERT_TRUE(edit.GetMarkedRange());
    EXPECT_EQ(*edit.GetMarkedRange(), UnitRange(1, 3));
    EXPECT_EQ(Selection(), At(2));
    EXPECT_EQ(ear.changes, 1);
}

TEST_F(EditorCompose, IsReplacedByWhatIsComposedNext) {
    TextEditor &edit = Open(0, u"ab");
    edit.SetSelection(1, 1);
    Play("compose \"n\"\ncompose \"\u306B\"\ncompose \"\u306Bh\"");
    EXPECT_EQ(Text(), u"a\u306Bhb");
    EXPECT_EQ(*edit.GetMarkedRange(), UnitRange(1, 3));
}

TEST_F(EditorCompose, IsCommittedByTypingAndTakenBackAsOne) {
    TextEditor &edit = Open(0, u"abcd");
    edit.SetSelection(1, 3);
    Play("compose \"n\"\ncompose \"\u306B\"\ntype \"\u65E5\"\ncompose \"\"");
    EXPECT_EQ(Text(), u"a\u65E5d");
    EXPECT_FALSE(edit.GetMarkedRange());
    EXPECT_EQ(Selection(), At(2));
    Play("key z command");
    EXPECT_EQ(Text(), u"abcd");
    EXPECT_EQ(Selection(), UnitRange(1, 3));
}

TEST_F(EditorCompose, IsGivenUpByAnEmptyText) {
    TextEditor &edit = Open(0, u"abcd");
    edit.SetSelection(1, 3);
    Play("compose \"n\"\ncompose \"\"");
    EXPECT_EQ(Text(), u"abcd");
    EXPECT_EQ(Selection(), UnitRange(1, 3));
    EXPECT_FALSE(edit.GetMarkedRange());
    EXPECT_EQ(ear.changes, 2);
    Play("key z command");
    EXPECT_EQ(Text(), u"abcd");
}

TEST_F(EditorCompose, IsKeptWhenTheTextLosesTheKeyboard) {
    TextEditor &edit = Open(0, u"ab");
    Play("compose \"n\"");
    edit.Deactivate();
    EXPECT_EQ(Text(), u"nab");
    EXPECT_FALSE(edit.GetMarkedRange());
    edit.Activate();
    Play("key z command");
    EXPECT_EQ(Text(), u"ab");
}

TEST_F(EditorCompose, GoesWithATextThatTheProgramSets) {
    TextEditor &edit = Open(0, u"ab");
    Play("compose \"n\"");
    edit.SetText(Utf::FromUnits(u"new"));
    EXPECT_FALSE(edit.GetMarkedRange());
    Play("compose \"\"");
    EXPECT_EQ(Text(), u"new");
}

TEST_F(EditorCompose, TheCaretCountsCharactersAndIsCutToTheText) {
    Open(0, u"");
    Play("compose \"\U0001F600x\" 1");
    EXPECT_EQ(Selection(), At(2));
    Play("compose \"ab\" 99");
    EXPECT_EQ(Selection(), At(2));
}

TEST_F(EditorCompose, NothingIsComposedInAReadOnlyText) {
    TextEditor &edit = Open(kReadOnly, u"ab");
    Play("compose \"n\"");
    EXPECT_EQ(Text(), u"ab");
    EXPECT_FALSE(edit.GetMarkedRange());
}

TEST_F(EditorCompose, ALookOfAllTextThatIsSetMeanwhileIsTheOnlyOne) {
    TextEditor &edit = Open(0, u"abcd");
    edit.SetSelection(1, 3);
    Play("compose \"n\"");
    OS::TextStyle large;
    large.size = 20;
    edit.SetStyle(4, large);
    Play("compose \"no\"");
    EXPECT_EQ(edit.GetNumberStyleRuns(), 1u);
    Play("compose \"\"");
    EXPECT_EQ(Text(), u"abcd");
    EXPECT_EQ(edit.GetNumberStyleRuns(), 1u);
    EXPECT_EQ(StyleAt(1).size, 20);
}

TEST_F(EditorCompose, GivesTheLooksBackThatItStoodInThePlaceOf) {
    TextEditor &edit = Open(kStyled, u"abcd");
    OS::TextStyle large;
    large.size = 20;
    edit.SetSelection(2, 3);
    edit.SetStyle(4, large);
    edit.SetSelection(1, 4);
    Play("compose \"n\"");
    EXPECT_EQ(edit.GetNumberStyleRuns(), 1u);
    Play("compose \"\"");
    ASSERT_EQ(edit.GetNumberStyleRuns(), 3u);
    unsigned int start = 0, end = 0;
    OS::TextStyle style;
    edit.GetNthStyleRun(1, start, end, style);
    EXPECT_EQ(UnitRange(start, end), UnitRange(2, 3));
    EXPECT_EQ(style.size, 20);
}
