// Texts of many lines, and of very long ones.
#include "tests/editing/EditorTest.h"
#include <random>

class EditorLongText : public EditorTest {
protected:
    static std::u16string Lines(int count) {
        std::u16string text;
        for (int i = 0; i < count; ++i)
            text += u"line of a long text\n";
        return text;
    }
};

TEST_F(EditorLongText, OnlyWhatShowsIsLaidOut) {
    TextEditor &edit = Open(kSeveralLines, Lines(100000));
    EXPECT_LT(edit.NumLaidOut(), 60u);
    Play("key End command\nkey PageUp\nkey Home command\nkey PageDown");
    EXPECT_LT(edit.NumLaidOut(), 60u);
}

TEST_F(EditorLongText, AMillionLinesAreScrolledAndEdited) {
    TextEditor &edit = Open(kSeveralLines, Lines(1000000));
    Play("key End command\ntype \"end\"");
    EXPECT_EQ(Selection(), At(20000003));
    EXPECT_GE(edit.GetCurrentScrolledOffset(), 999000 * edit.GetScrollDelta());
    edit.SetVScrollPos(500000 * edit.GetScrollDelta(), 0);
    EXPECT_EQ(edit.GetLayoutInfo().GetCharacterIndexForPoint(OS::Point(0, 1)), 10000000u);
}

TEST_F(EditorLongText, ALineWithoutEndIsCutWhereItShows) {
    std::u16string text(200000, u'x');
    TextEditor &edit = Open(kSeveralLines, text);
    edit.SetSelection(100000, 100000);
    Play("type \"y\"\nkey Backspace\nkey Backspace");
    EXPECT_EQ(Text().size(), 199999u);
    Play("key End command\nkey Left\nkey Left\nkey Right");
    EXPECT_EQ(Selection(), At(199998));
}

TEST_F(EditorLongText, EveryPlaceOfACutLineCanBeReached) {
    std::u16string text(9000, u'x');
    TextEditor &edit = Open(kSeveralLines, text);
    edit.SetSelection(1018, 1018);
    for (unsigned int i = 1; i <= 12; ++i) {
        Play("key Right");
        EXPECT_EQ(Selection(), At(1018 + i));
    }
    for (unsigned int i = 1; i <= 12; ++i) {
        Play("key Left");
        EXPECT_EQ(Selection(), At(1030 - i));
    }
}

TEST_F(EditorLongText, ALargePasteIsTaken) {
    Open(kSeveralLines, u"");
    desktop.Windows().SetClipboardText(std::string(10000000, 'a'));
    Play("key v command\ntype \"b\"");
    EXPECT_EQ(Text().size(), 10000001u);
    Play("key z command\nkey z command");
    EXPECT_EQ(Text().size(), 0u);
}

TEST_F(EditorLongText, TheHeightIsRightOnceAllHasBeenSeen) {
    std::u16string text;
    for (int i = 0; i < 300; ++i)
        text +=
            i % 3 ? u"short\n" : u"a line that is long enough to be broken into two or three of its width\n";
    TextEditor &edit = Open(kSeveralLines, text);
    for (int i = 0; i < 60; ++i)
        Play("key PageDown");
    int const seen = edit.GetTextHeight();
    int const lines = seen / edit.GetScrollDelta();
    EXPECT_EQ(seen % edit.GetScrollDelta(), 0);
    EXPECT_GT(lines, 400);
    EXPECT_EQ(edit.GetCurrentScrolledOffset(), seen - 200);
}

TEST_F(EditorLongText, RandomEditsKeepParagraphsAndTextTogether) {
    TextEditor &edit = Open(kSeveralLines, u"");
    std::mt19937 random(7);
    std::u16string const pieces[] = {u"a",     u"\n",     u"\r",         u"\r\n",
                                     u"word ", u"\u2028", u"\U0001F600", std::u16string(1100, u'z')};
    std::u16string model;
    for (int i = 0; i < 120; ++i) {
        std::size_t const start = random() % (model.size() + 1);
        std::size_t const end = std::min(model.size(), start + random() % 20);
        std::u16string const &piece = pieces[random() % 8];
        model.replace(start, end - start, piece);
        edit.SetSelection(static_cast<unsigned int>(start), static_cast<unsigned int>(end));
        if (piece == u"\r" || piece == u"\r\n" || piece == u"\u2028") {
            model.replace(start, piece.size(), u"\n");
        }
        KeyEvent event;
        event.what = 3;
        event.text = Utf::FromUnits(piece);
        ASSERT_TRUE(edit.HandleEvent(&event));
        ASSERT_TRUE(Text() == model) << i;
        UpdateGlog(glog);
    }
    for (int i = 0; i < 120; ++i)
        edit.Undo();
    EXPECT_TRUE(Text().empty());
    while (edit.Redo()) {
    }
    EXPECT_TRUE(Text() == model);
}
