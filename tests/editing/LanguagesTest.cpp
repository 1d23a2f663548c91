// Characters that are more than one unit, and scripts that run the other way.
#include "tests/editing/EditorTest.h"

typedef EditorTest EditorLanguages;

namespace {
// A family of three, joined; a flag; a letter with two marks.
std::u16string const kFamily = u"\U0001F468\u200D\U0001F469\u200D\U0001F467", kFlag = u"\U0001F1E9\U0001F1EA",
                     kMarked = u"e\u0301\u0323";
std::u16string const kHebrew = u"\u05E9\u05DC\u05D5\u05DD", kArabic = u"\u0645\u0631\u062D\u0628\u0627";
} // namespace

TEST_F(EditorLanguages, ArrowsStepOverWholeCharacters) {
    Open(0, u"a" + kFamily + kFlag + kMarked + u"b");
    std::vector<unsigned int> stops;
    for (int i = 0; i < 6; ++i) {
        Play("key Right");
        stops.push_back(Selection().first);
    }
    EXPECT_EQ(stops, (std::vector<unsigned int>{1, 9, 13, 16, 17, 17}));
    Play("key Left\nkey Left");
    EXPECT_EQ(Selection(), At(13));
}

TEST_F(EditorLanguages, DeletionTakesAnEmojiWithAllItsParts) {
    Open(0, u"a" + kFamily + kFlag).SetSelection(13, 13);
    Play("key Backspace");
    EXPECT_EQ(Text(), u"a" + kFamily);
    Play("key Backspace");
    EXPECT_EQ(Text(), u"a");
}

TEST_F(EditorLanguages, DeletionForwardTakesALetterWithItsMarks) {
    Open(0, kMarked + u"b");
    Play("key Delete");
    EXPECT_EQ(Text(), u"b");
}

TEST_F(EditorLanguages, HindiStepsBySyllableAndLosesItsLastSignFirst) {
    std::u16string const word = u"\u0928\u092E\u0938\u094D\u0924\u0947"; // na, ma, s-te
    Open(0, word);
    Play("key Right\nkey Right\nkey Right\nkey Right");
    EXPECT_EQ(Selection(), At(6));
    Play("key Left");
    EXPECT_EQ(Selection(), At(4));
    Play("key Right\nkey Backspace");
    EXPECT_EQ(Text(), word.substr(0, 5));
}

TEST_F(EditorLanguages, ThaiVowelsAboveAndBelowAreNotStepsOfTheirOwn) {
    Open(0, u"\u0E01\u0E34\u0E19"); // ko, the vowel above it, no
    Play("key Right");
    EXPECT_EQ(Selection(), At(2));
    Play("key Right");
    EXPECT_EQ(Selection(), At(3));
}

TEST_F(EditorLanguages, ThaiWordsAreFoundWithoutSpaces) {
    Open(0, u"\u0E20\u0E32\u0E29\u0E32\u0E44\u0E17\u0E22"); // language, Thai
    Play("key Right command");
    EXPECT_EQ(Selection(), At(4));
}

TEST_F(EditorLanguages, TheRightArrowGoesToTheRightAlsoWhereTextRunsToTheLeft) {
    Open(0, kHebrew).SetSelection(4, 4);
    Play("key Right");
    EXPECT_EQ(Selection(), At(3));
    Play("key Left\nkey Left");
    EXPECT_EQ(Selection(), At(4));
}

TEST_F(EditorLanguages, WordsAndDeletionsFollowTheOrderOfTheText) {
    Open(0, kHebrew + u" " + kArabic);
    Play("key Left command");
    EXPECT_EQ(Selection(), At(4));
    Play("key Backspace");
    EXPECT_EQ(Text(), kHebrew.substr(0, 3) + u" " + kArabic);
}

TEST_F(EditorLanguages, AMixedLineIsSteppedThroughAsItIsSeen) {
    TextEditor &edit = Open(0, u"ab" + kHebrew + u"cd");
    int before = edit.CaretBox().left;
    for (int i = 0; i < 3; ++i) {
        Play("key Right");
        EXPECT_GT(edit.CaretBox().left, before) << i;
        before = edit.CaretBox().left;
    }
}

TEST_F(EditorLanguages, ArabicIsTypedAndCopied) {
    Open(0, u"");
    Play("type \"\u0645\u0631\u062D\"\nkey a command\nkey c command");
    EXPECT_EQ(Clipboard(), "\u0645\u0631\u062D");
}

TEST_F(EditorLanguages, ARightToLeftParagraphStandsOnTheRightByDefault) {
    TextEditor &edit = Open(kSeveralLines, kArabic + u"\nabc");
    EXPECT_GT(edit.CaretBox().left, 190);
    edit.SetSelection(6, 6);
    EXPECT_LT(edit.CaretBox().left, 20);
}

TEST_F(EditorLanguages, APlaceWithinAPairOfSurrogatesCountsAsItsStart) {
    TextEditor &edit = Open(0, u"a\U0001F600b");
    edit.SetSelection(1, 1);
    int const start = edit.CaretBox().left;
    edit.SetSelection(2, 2);
    EXPECT_EQ(edit.CaretBox().left, start);
}
