// Typing, moving, deleting and selecting by keys.
#include "tests/editing/EditorTest.h"

typedef EditorTest EditorKeys;

TEST_F(EditorKeys, TypeAtTheInsertionPoint) {
    Open(0, u"ac");
    Play("key Right\ntype \"b\"");
    EXPECT_EQ(Text(), u"abc");
    EXPECT_EQ(Selection(), At(2));
    EXPECT_EQ(ear.changes, 1);
}

TEST_F(EditorKeys, TypeInThePlaceOfWhatIsSelected) {
    Open(0, u"left right").SetSelection(0, 4);
    Play("type \"x\"");
    EXPECT_EQ(Text(), u"x right");
}

TEST_F(EditorKeys, TypeCharactersThatNoKeyHas) {
    Open(0, u"");
    Play("type \"h\u00E9llo \U0001F600\"");
    EXPECT_EQ(Text(), u"h\u00E9llo \U0001F600");
    EXPECT_EQ(Selection(), At(8));
}

TEST_F(EditorKeys, TypeNothingWithACommandThatHasNoMeaning) {
    Open(0, u"a");
    Play("key b command\nkey F5");
    EXPECT_EQ(Text(), u"a");
    EXPECT_EQ(ear.changes, 0);
}

TEST_F(EditorKeys, ReturnBreaksTheLineOnlyWhereThereAreSeveral) {
    Open(kSeveralLines, u"");
    Play("type \"a\"\nkey Return\ntype \"b\"\nkey Enter");
    EXPECT_EQ(Text(), u"a\nb\n");
}

TEST_F(EditorKeys, OneLineHasNoUseForReturnUpAndDown) {
    TextEditor &edit = Open(0, u"abc");
    for (int key : {13, 3, 30, 31, 11, 12}) {
        EventRecordAdapter event;
        event.what = 3;
        event.message = static_cast<unsigned long long>(key);
        EXPECT_FALSE(edit.HandleEvent(&event)) << key;
    }
    EXPECT_EQ(Text(), u"abc");
}

TEST_F(EditorKeys, ArrowsStepOverCharacters) {
    Open(0, u"abc");
    Play("key Right\nkey Right\nkey Left");
    EXPECT_EQ(Selection(), At(1));
    Play("key Left\nkey Left");
    EXPECT_EQ(Selection(), At(0));
}

TEST_F(EditorKeys, ArrowsWithShiftSelect) {
    Open(0, u"abcd");
    Play("key Right\nkey Right shift\nkey Right shift");
    EXPECT_EQ(Selection(), UnitRange(1, 3));
    Play("key Left shift\nkey Left shift\nkey Left shift");
    EXPECT_EQ(Selection(), UnitRange(0, 1));
}

TEST_F(EditorKeys, AnArrowLeavesASelectionOnItsSide) {
    TextEditor &edit = Open(0, u"abcdef");
    edit.SetSelection(2, 4);
    Play("key Left");
    EXPECT_EQ(Selection(), At(2));
    edit.SetSelection(2, 4);
    Play("key Right");
    EXPECT_EQ(Selection(), At(4));
}

TEST_F(EditorKeys, WordsAreSteppedOverWithCommandAndOption) {
    Open(0, u"one two, three");
    Play("key Right command");
    EXPECT_EQ(Selection(), At(3));
    Play("key Right option");
    EXPECT_EQ(Selection(), At(7));
    Play("key Right option shift");
    EXPECT_EQ(Selection(), UnitRange(7, 14));
    Play("key Left command\nkey Left command");
    EXPECT_EQ(Selection(), At(4));
}

TEST_F(EditorKeys, HomeAndEndGoToTheLinesEnds) {
    Open(kSeveralLines, u"first\nsecond\nthird").SetSelection(8, 8);
    Play("key End");
    EXPECT_EQ(Selection(), At(12));
    Play("key Home shift");
    EXPECT_EQ(Selection(), UnitRange(6, 12));
    Play("key End command");
    EXPECT_EQ(Selection(), At(18));
    Play("key Home command");
    EXPECT_EQ(Selection(), At(0));
}

TEST_F(EditorKeys, UpAndDownKeepTheirPlaceAcrossAShorterLine) {
    Open(kSeveralLines, u"iiiiiiii\ni\niiiiiiii").SetSelection(6, 6);
    Play("key Down");
    EXPECT_EQ(Selection(), At(10));
    Play("key Down");
    EXPECT_EQ(Selection(), At(17));
    Play("key Up\nkey Up");
    EXPECT_EQ(Selection(), At(6));
}

TEST_F(EditorKeys, UpFromTheFirstLineGoesToTheStartAndDownFromTheLastToTheEnd) {
    Open(kSeveralLines, u"one\ntwo").SetSelection(2, 2);
    Play("key Up");
    EXPECT_EQ(Selection(), At(0));
    Play("key Down\nkey Right\nkey Down");
    EXPECT_EQ(Selection(), At(7));
}

TEST_F(EditorKeys, ParagraphsAreSteppedOverWithOption) {
    Open(kSeveralLines, u"one\ntwo\nthree").SetSelection(5, 5);
    Play("key Up option");
    EXPECT_EQ(Selection(), At(4));
    Play("key Up option");
    EXPECT_EQ(Selection(), At(0));
    Play("key Down option");
    EXPECT_EQ(Selection(), At(4));
    Play("key Down command");
    EXPECT_EQ(Selection(), At(13));
}

TEST_F(EditorKeys, PagesAreSteppedOver) {
    std::u16string text;
    for (int i = 0; i < 100; ++i)
        text += u"line\n";
    TextEditor &edit = Open(kSeveralLines, text);
    Play("key PageDown");
    unsigned int const line = Selection().first / 5;
    EXPECT_NEAR(line, 200 / edit.GetScrollDelta() - 1, 1);
    EXPECT_GT(edit.GetCurrentScrolledOffset(), 0);
    EXPECT_GT(ear.scrolls, 0);
    Play("key PageUp");
    EXPECT_EQ(Selection(), At(0));
    EXPECT_EQ(edit.GetCurrentScrolledOffset(), 0);
}

TEST_F(EditorKeys, DeletionsTakeACharacterAWordOrALine) {
    TextEditor &edit = Open(kSeveralLines, u"one two three\nfour");
    edit.SetSelection(13, 13);
    Play("key Backspace");
    EXPECT_EQ(Text(), u"one two thre\nfour");
    Play("key Backspace command");
    EXPECT_EQ(Text(), u"one two \nfour");
    Play("key Backspace command shift");
    EXPECT_EQ(Text(), u"\nfour");
    Play("key Delete");
    EXPECT_EQ(Text(), u"four");
    Play("key Delete\nkey Delete option");
    EXPECT_EQ(Text(), u"");
    Play("key Delete\nkey Backspace");
    EXPECT_EQ(Text(), u"");
}

TEST_F(EditorKeys, DeletionTakesWhatIsSelected) {
    Open(0, u"one two").SetSelection(3, 7);
    Play("key Delete");
    EXPECT_EQ(Text(), u"one");
}

TEST_F(EditorKeys, AReadOnlyTextIsSelectedAndCopiedButNotChanged) {
    Open(kReadOnly | kSeveralLines, u"fixed");
    Play("type \"x\"\nkey Backspace\nkey Delete\nkey Return\nkey a command\nkey x command\nkey c "
         "command\nkey v "
         "command\nkey z command");
    EXPECT_EQ(Text(), u"fixed");
    EXPECT_EQ(Selection(), UnitRange(0, 5));
    EXPECT_EQ(Clipboard(), "fixed");
    EXPECT_EQ(ear.changes, 0);
}

TEST_F(EditorKeys, ShortcutsCutCopyAndPasteWithCommandAndWithControl) {
    Open(0, u"Drums").SetSelection(0, 2);
    Play("key x command");
    EXPECT_EQ(Text(), u"ums");
    EXPECT_EQ(Clipboard(), "Dr");
    Play("key End\nkey v control");
    EXPECT_EQ(Text(), u"umsDr");
    Play("key a control\nkey c control");
    EXPECT_EQ(Clipboard(), "umsDr");
}

TEST_F(EditorKeys, WithoutASelectionTheClipboardStays) {
    Open(0, u"Drums");
    desktop.Windows().SetClipboardText("kept");
    Play("key c command\nkey x command");
    EXPECT_EQ(Clipboard(), "kept");
    EXPECT_EQ(Text(), u"Drums");
}

TEST_F(EditorKeys, LineBreaksBecomeSpacesInOneLine) {
    Open(0, u"");
    desktop.Windows().SetClipboardText("a\r\nb\nc\rd");
    Play("key v command");
    EXPECT_EQ(Text(), u"a b c d");
}

TEST_F(EditorKeys, LineBreaksOfEveryKindBecomeLineFeeds) {
    Open(kSeveralLines, u"");
    desktop.Windows().SetClipboardText("a\r\nb\nc\rd");
    Play("key v command");
    EXPECT_EQ(Text(), u"a\nb\nc\nd");
}

TEST_F(EditorKeys, AnInactiveTextTakesNoKeys) {
    Open(0, u"a").Deactivate();
    Play("type \"b\"\nkey Backspace");
    EXPECT_EQ(Text(), u"a");
}

TEST_F(EditorKeys, UpAndDownWithShiftSelectFromWhereTheyBegan) {
    Open(kSeveralLines, u"iiiiiiii\niiiiiiii\niiiiiiii").SetSelection(4, 4);
    Play("key Down shift");
    EXPECT_EQ(Selection(), UnitRange(4, 13));
    Play("key Down shift");
    EXPECT_EQ(Selection(), UnitRange(4, 22));
    Play("key Up shift\nkey Up shift");
    EXPECT_EQ(Selection(), At(4));
    Play("key Up shift");
    EXPECT_EQ(Selection(), UnitRange(0, 4));
}

TEST_F(EditorKeys, PagesWithShiftAreSelected) {
    std::u16string text;
    for (int i = 0; i < 100; ++i)
        text += u"line\n";
    TextEditor &edit = Open(kSeveralLines, text);
    edit.SetSelection(7, 7);
    Play("key PageDown shift");
    EXPECT_EQ(Selection().first, 7u);
    EXPECT_EQ(Selection().second % 5, 2u);
    EXPECT_NEAR(Selection().second / 5, 200 / edit.GetScrollDelta(), 1);
    Play("key PageUp shift");
    EXPECT_EQ(Selection(), At(7));
}

TEST_F(EditorKeys, EveryPlaceOfABrokenParagraphIsSteppedThrough) {
    std::u16string const hebrew = u"\u05E9\u05DC\u05D5\u05DD \u05E2\u05D5\u05DC\u05DD ";
    for (std::u16string const &word : {std::u16string(u"some text "), hebrew}) {
        delete pane;
        std::u16string const text = word + word + word + word;
        Open(kSeveralLines, text, {10, 10, 210, 70});
        bool const toTheLeft = word == hebrew;
        for (unsigned int unit = 1; unit <= text.size(); ++unit) {
            Play(toTheLeft ? "key Left" : "key Right");
            ASSERT_EQ(Selection(), At(unit));
        }
        for (unsigned int unit = static_cast<unsigned int>(text.size()); unit > 0; --unit) {
            Play(toTheLeft ? "key Right" : "key Left");
            ASSERT_EQ(Selection(), At(unit - 1));
        }
    }
}
