// Texts of one line: where they stand, what shows of those that are longer than their box, and how long they
// may become.
#include "desktop/drawing/Surface.h"
#include "desktop/panes/Glog.h"
#include "tests/editing/EditorTest.h"

namespace {

TextSettings::Alignment const kAlignments[] = {TextSettings::kAlignDefault, TextSettings::kAlignLeft,
                                               TextSettings::kAlignRight, TextSettings::kAlignCenter};
std::u16string const kHebrew = u"\u05E9\u05DC\u05D5\u05DD \u05E2\u05D5\u05DC\u05DD ";

std::u16string Repeated(std::u16string const &word, int times) {
    std::u16string text;
    for (int i = 0; i < times; ++i)
        text += word;
    return text;
}

class EditorOneLine : public EditorTest {
protected:
    static constexpr Rect kBox = {10, 10, 30, 110};
    static constexpr unsigned int kMost = 32767; // units

    void OpenAligned(TextSettings::Alignment alignment, std::u16string const &text) {
        delete pane;
        Open(0, text, kBox).SetAlignment(alignment);
        UpdateGlog(glog);
    }
    // Whether the insertion point lies in the box, the unit's if it were there.
    bool CaretShows() const {
        Rect const caret = editor->CaretBox();
        return caret.left >= kBox.left && caret.right <= kBox.right;
    }
    int LeftOf(unsigned int unit) {
        editor->SetSelection(unit, unit);
        return editor->CaretBox().left;
    }
    std::vector<std::uint32_t> PixelsOfTheBox() {
        UpdateGlog(glog);
        Surface const &picture = *Glog::From(glog).Pixels();
        std::vector<std::uint32_t> pixels;
        for (int y = kBox.top; y < kBox.bottom; ++y)
            pixels.insert(pixels.end(), picture.Row(y) + kBox.left, picture.Row(y) + kBox.right);
        return pixels;
    }
};

constexpr Rect EditorOneLine::kBox;

} // namespace

// Where it stands

TEST_F(EditorOneLine, AShortTextStandsAsItIsAligned) {
    OpenAligned(TextSettings::kAlignLeft, u"mm");
    int const left = LeftOf(0), width = LeftOf(2) - left;
    EXPECT_LT(left, 16);
    OpenAligned(TextSettings::kAlignDefault, u"mm");
    EXPECT_EQ(LeftOf(0), left);
    OpenAligned(TextSettings::kAlignRight, u"mm");
    EXPECT_GT(LeftOf(2), 104);
    EXPECT_LT(LeftOf(2), 110);
    EXPECT_EQ(LeftOf(2) - LeftOf(0), width);
    OpenAligned(TextSettings::kAlignCenter, u"mm");
    EXPECT_NEAR(LeftOf(0) + width / 2, 60, 2);
}

TEST_F(EditorOneLine, LinesOfSeveralAreAlignedEachByItself) {
    Open(kSeveralLines, u"mmmm\nm", {10, 10, 90, 110}).SetAlignment(TextSettings::kAlignRight);
    EXPECT_EQ(LeftOf(4), LeftOf(6));
    EXPECT_GT(LeftOf(4), 104);
    editor->SetAlignment(TextSettings::kAlignCenter);
    EXPECT_NEAR((LeftOf(0) + LeftOf(4)) / 2, (LeftOf(5) + LeftOf(6)) / 2, 1);
    EXPECT_NEAR((LeftOf(0) + LeftOf(4)) / 2, 60, 2);
}

TEST_F(EditorOneLine, ATextThatIsReadFromTheRightStandsThereByDefault) {
    OpenAligned(TextSettings::kAlignDefault, u"\u05E9");
    EXPECT_GT(LeftOf(0), 104);
    OpenAligned(TextSettings::kAlignLeft, u"\u05E9");
    EXPECT_LT(LeftOf(1), 16);
}

// Longer than its box

TEST_F(EditorOneLine, HomeAndEndShowTheirPlacesOfALongTextWhateverItsAlignment) {
    for (TextSettings::Alignment const alignment : kAlignments)
        for (std::u16string const &text : {Repeated(u"some long text ", 10), Repeated(kHebrew, 20)}) {
            OpenAligned(alignment, text);
            for (char const *key : {"key End", "key Home", "key End", "key Home"}) {
                Play(key);
                EXPECT_TRUE(CaretShows()) << alignment << ' ' << key << ' ' << editor->CaretBox().left;
            }
        }
}

TEST_F(EditorOneLine, EveryPlaceOfALongTextIsSteppedThroughInSight) {
    for (TextSettings::Alignment const alignment : kAlignments)
        for (std::u16string const &text : {Repeated(u"some text ", 4), Repeated(kHebrew, 4)}) {
            OpenAligned(alignment, text);
            bool const toTheLeft = text[0] >= 0x590;
            char const *const onward = toTheLeft ? "key Left" : "key Right";
            char const *const back = toTheLeft ? "key Right" : "key Left";
            for (unsigned int unit = 1; unit <= text.size(); ++unit) {
                Play(onward);
                ASSERT_EQ(Selection(), At(unit));
                EXPECT_TRUE(CaretShows()) << alignment << ' ' << unit;
            }
            for (unsigned int unit = static_cast<unsigned int>(text.size()); unit > 0; --unit) {
                Play(back);
                ASSERT_EQ(Selection(), At(unit - 1));
                EXPECT_TRUE(CaretShows()) << alignment << ' ' << unit;
            }
        }
}

TEST_F(EditorOneLine, TypingAtTheEndOfALongTextStaysInSight) {
    for (TextSettings::Alignment const alignment : kAlignments) {
        OpenAligned(alignment, Repeated(u"some long text ", 10));
        Play("key End\ntype \"typed\"");
        EXPECT_TRUE(CaretShows()) << alignment;
        Play("key Backspace\nkey Backspace command");
        EXPECT_TRUE(CaretShows()) << alignment;
        OpenAligned(alignment, Repeated(kHebrew, 20));
        Play("key End\ntype \"\u05E9\u05DC\u05D5\"\nkey Backspace");
        EXPECT_TRUE(CaretShows()) << alignment;
    }
}

TEST_F(EditorOneLine, ALongTextThatTheUserLeavesShowsItsBeginningAgain) {
    for (TextSettings::Alignment const alignment : kAlignments)
        for (std::u16string const &text : {Repeated(u"some long text ", 10), Repeated(kHebrew, 20)}) {
            OpenAligned(alignment, text);
            editor->Deactivate();
            std::vector<std::uint32_t> const atFirst = PixelsOfTheBox();
            editor->Activate();
            Play("key End");
            EXPECT_NE(PixelsOfTheBox(), atFirst);
            editor->Deactivate();
            EXPECT_EQ(PixelsOfTheBox(), atFirst);
            editor->SetSelection(0, 0);
            EXPECT_TRUE(CaretShows()) << alignment;
        }
}

TEST_F(EditorOneLine, ALongTextLooksTheSameWhateverItsAlignment) {
    for (std::u16string const &text : {Repeated(u"some long text ", 10), Repeated(kHebrew, 20)}) {
        OpenAligned(TextSettings::kAlignDefault, text);
        editor->Deactivate();
        std::vector<std::uint32_t> const byDefault = PixelsOfTheBox();
        for (TextSettings::Alignment const alignment : kAlignments) {
            OpenAligned(alignment, text);
            editor->Deactivate();
            EXPECT_EQ(PixelsOfTheBox(), byDefault) << alignment;
        }
    }
}

TEST_F(EditorOneLine, TheCharacterAtEitherSideOfALongTextIsFound) {
    OpenAligned(TextSettings::kAlignRight, Repeated(u"m", 40));
    EXPECT_EQ(editor->GetLayoutInfo().GetCharacterIndexForPoint(OS::Point(3, 8)), 0u);
    OpenAligned(TextSettings::kAlignLeft, Repeated(u"\u05E9", 40));
    EXPECT_EQ(editor->GetLayoutInfo().GetCharacterIndexForPoint(OS::Point(96, 8)), 0u);
}

TEST_F(EditorOneLine, ALineThatHasBecomeShorterThanItsBoxIsAlignedAgain) {
    OpenAligned(TextSettings::kAlignRight, Repeated(u"m", 20));
    Play("key End command\nkey Left shift");
    editor->SetSelection(2, 20);
    Play("key Backspace");
    EXPECT_GT(editor->CaretBox().left, 104);
    EXPECT_TRUE(CaretShows());
}

// How long it may become

TEST_F(EditorOneLine, ALargePasteIsTakenAsFarAsALineGoes) {
    Open(0, u"ab", kBox).SetSelection(1, 1);
    desktop.Windows().SetClipboardText(std::string(10000000, 'x'));
    Play("key v command");
    EXPECT_EQ(Text().size(), kMost);
    EXPECT_EQ(Selection(), At(kMost - 1));
    EXPECT_TRUE(CaretShows());
    EXPECT_EQ(Text().back(), u'b');
    Play("key z command");
    EXPECT_EQ(Text(), u"ab");
    EXPECT_EQ(Selection(), At(1));
}

TEST_F(EditorOneLine, AFullLineTakesNothingButInThePlaceOfSomethingElse) {
    Open(0, std::u16string(kMost, u'x'), kBox);
    Play("key End\ntype \"a\"");
    desktop.Windows().SetClipboardText("b");
    Play("key v command");
    EXPECT_EQ(Text(), std::u16string(kMost, u'x'));
    EXPECT_EQ(ear.changes, 0);
    Play("key Left shift\ntype \"c\"");
    EXPECT_EQ(Text(), std::u16string(kMost - 1, u'x') + u'c');
    Play("key Home\nkey Delete\ntype \"de\"");
    EXPECT_EQ(Text(), u'd' + std::u16string(kMost - 2, u'x') + u'c');
    EXPECT_TRUE(CaretShows());
}

TEST_F(EditorOneLine, ATextThatIsSetIsCutBetweenTwoCharacters) {
    Open(0, u"", kBox);
    editor->SetText(Utf::FromUnits(std::u16string(kMost - 1, u'x') + u"\U0001F600"));
    EXPECT_EQ(Text(), std::u16string(kMost - 1, u'x'));
    editor->SetText(Utf::FromUnits(std::u16string(kMost - 1, u'x') + u"e\u0301"));
    EXPECT_EQ(Text(), std::u16string(kMost - 1, u'x'));
    editor->SetText(Utf::FromUnits(std::u16string(kMost, u'\u0301') + u'\u0301'));
    EXPECT_EQ(Text().size(), kMost);
    editor->SetText(Utf::FromUnits(std::u16string(kMost, u'x')));
    EXPECT_EQ(Text().size(), kMost);
}

TEST_F(EditorOneLine, ACharacterThatDoesNotFitReplacesNothing) {
    Open(0, std::u16string(kMost, u'x'), kBox).SetSelection(5, 6);
    Play("type \"\U0001F600\"");
    EXPECT_EQ(Text(), std::u16string(kMost, u'x'));
    EXPECT_EQ(Selection(), UnitRange(5, 6));
}

TEST_F(EditorOneLine, WhatIsComposedEndsWithTheLine) {
    Open(0, std::u16string(kMost - 1, u'x'), kBox).SetSelection(kMost - 1, kMost - 1);
    Play("compose \"abc\" 3");
    EXPECT_EQ(Text().size(), kMost);
    EXPECT_EQ(Text().back(), u'a');
    int const before = ear.changes;
    Play("type \"\U0001F600\"");
    EXPECT_EQ(Text(), std::u16string(kMost - 1, u'x'));
    EXPECT_EQ(ear.changes, before + 1);
    EXPECT_FALSE(editor->GetMarkedRange());
}

TEST_F(EditorOneLine, SeveralLinesHaveNoSuchLimit) {
    Open(kSeveralLines, std::u16string(kMost + 10, u'x'), kBox);
    Play("type \"a\"");
    EXPECT_EQ(Text().size(), kMost + 11);
}

TEST_F(EditorOneLine, AFullLineOfTheLargestLettersShowsEitherEnd) {
    Open(0, std::u16string(kMost, u'W'), kBox);
    OS::TextStyle large;
    large.size = 512;
    editor->SetStyle(4, large);
    for (char const *key : {"key End", "key Left", "key Home", "key Right"}) {
        Play(key);
        UpdateGlog(glog);
        EXPECT_TRUE(CaretShows()) << key << ' ' << editor->CaretBox().left;
    }
    EXPECT_EQ(Selection(), At(1));
}
