// Texts, places and styles that nobody should give.
#include "tests/editing/EditorTest.h"
#include <cmath>
#include <limits>

typedef EditorTest EditorBadInput;

TEST_F(EditorBadInput, LoneSurrogatesAndZerosAreKeptAndShown) {
    std::u16string const text = {u'a', char16_t(0xD800), u'b', char16_t(0xDC00), u'\0', u'c'};
    Open(kSeveralLines, text);
    EXPECT_TRUE(Text() == text);
    Play("key End\ntype \"x\"\nkey Left\nkey Left\nkey Left\nkey Left\nkey Backspace");
    EXPECT_EQ(Text().size(), 6u);
}

TEST_F(EditorBadInput, AZeroIsCopiedAsAReplacement) {
    Open(0, {u'a', u'\0', u'b'}).SelectAll();
    Play("key c command");
    EXPECT_EQ(Clipboard(), "a\uFFFDb");
}

TEST_F(EditorBadInput, SelectionsBeyondTheEndAreCut) {
    TextEditor &edit = Open(0, u"abc");
    edit.SetSelection(1, 32767);
    EXPECT_EQ(Selection(), UnitRange(1, 3));
    edit.SetSelection(900, 1000);
    EXPECT_EQ(Selection(), At(3));
    edit.SetSelection(2, 1);
    EXPECT_EQ(Selection(), At(2));
    edit.VScrollToCharacterPosition(std::numeric_limits<unsigned int>::max());
}

TEST_F(EditorBadInput, ScrollPlacesBeyondTheEndsAreCut) {
    TextEditor &edit = Open(kSeveralLines, u"a\nb\nc");
    edit.SetVScrollPos(std::numeric_limits<int>::min(), 0);
    EXPECT_EQ(edit.GetCurrentScrolledOffset(), 0);
    edit.SetVScrollPos(std::numeric_limits<int>::max(), 0);
    EXPECT_EQ(edit.GetCurrentScrolledOffset(), 0);
}

TEST_F(EditorBadInput, BoundsThatAreNoneAreHarmless) {
    TextEditor &edit = Open(kSeveralLines, u"some text to be broken");
    double const nan = std::numeric_limits<double>::quiet_NaN(),
                 inf = std::numeric_limits<double>::infinity();
    for (OS::RectBase<OS::RectTag> const &bounds :
         {OS::RectBase<OS::RectTag>(nan, nan, nan, nan), OS::RectBase<OS::RectTag>(inf, -inf, inf, inf),
          OS::RectBase<OS::RectTag>(10, 10, -50, -20), OS::RectBase<OS::RectTag>(10, 10, 0, 0),
          OS::RectBase<OS::RectTag>(-1e30, 1e30, 1e30, 1e30)}) {
        edit.SetBounds(bounds);
        pane->Inval();
        Play("type \"a\"\nkey Down\nkey PageDown\nkey Home command");
        UpdateGlog(glog);
    }
    EXPECT_EQ(Text().size(), 27u);
}

TEST_F(EditorBadInput, StylesOfAnySizeAndFontAreTaken) {
    TextEditor &edit = Open(kStyled | kSeveralLines, u"some text");
    for (int size : {-32768, -1, 0, 1, 512, 32767}) {
        OS::TextStyle style;
        style.size = static_cast<short>(size);
        style.face = -1;
        edit.SetSelection(2, 5);
        edit.SetStyle(15, style);
        UpdateGlog(glog);
        EXPECT_EQ(StyleAt(3).size, size);
    }
    OS::TextStyle colored;
    colored.color = OS::RGBAColor(std::nan(""), -5, 7, std::nan(""));
    edit.SetSelection(0, 9);
    edit.SetStyle(8, colored);
    UpdateGlog(glog);
}

TEST_F(EditorBadInput, RunsThatDoNotExistAreEmpty) {
    TextEditor &edit = Open(kStyled, u"abc");
    unsigned int start = 7, end = 7;
    OS::TextStyle style;
    edit.GetNthStyleRun(5, start, end, style);
    EXPECT_EQ(UnitRange(start, end), UnitRange(0, 0));
    edit.SetText(UString());
    EXPECT_EQ(edit.GetNumberStyleRuns(), 0u);
}

TEST_F(EditorBadInput, WithoutAWindowItEditsAllTheSame) {
    std::unique_ptr<OSTextEdit> edit(OSTextEdit::Create(OSTextEdit::Window(), 2));
    edit->SetText(Utf::FromUnits(u"a\nb"));
    edit->Activate();
    edit->SetSelection(1, 3);
    OS::TextEditActions::DeleteBackward(*edit, OS::TextEditActions::kCharacter);
    EXPECT_TRUE(edit->GetText() == Utf::FromUnits(u"a"));
    EXPECT_FALSE(edit->HandleEvent(nullptr));
    edit->Deactivate();
}

TEST_F(EditorBadInput, AListenerMayDeleteTheEngineWhenTheTextChanges) {
    class Deleting : public OS::TextEditListener {
    public:
        explicit Deleting(EditorPane &pane_)
            : pane(pane_) {}
        void TextEditListener_TextChanged() override { pane.editor.reset(); }
        EditorPane &pane;
    };
    for (char const *script :
         {"type \"a\"", "key Backspace", "key z command", "compose \"a\"", "key v command"}) {
        TextEditor &edit = Open(0, u"abc");
        edit.SetSelection(1, 1);
        desktop.Windows().SetClipboardText("x");
        EventRecordAdapter typed;
        typed.what = 3;
        typed.message = 'q';
        edit.HandleEvent(&typed);
        Deleting deleting(*pane);
        deleting.DependUpon(&edit);
        Play(script);
        EXPECT_EQ(pane->editor, nullptr) << script;
        delete pane;
    }
}

TEST_F(EditorBadInput, AListenerMayChangeTheTextAgain) {
    class Shortening : public OS::TextEditListener {
    public:
        explicit Shortening(TextEditor &edit_)
            : edit(edit_) {}
        void TextEditListener_TextChanged() override { edit.SetText(Utf::FromUnits(u"no")); }
        TextEditor &edit;
    };
    TextEditor &edit = Open(0, u"abcdef");
    edit.SetSelection(6, 6);
    Shortening shortening(edit);
    shortening.DependUpon(&edit);
    Play("type \"g\"\ntype \"h\"");
    EXPECT_EQ(Text(), u"no");
    EXPECT_EQ(Selection(), At(2));
}

TEST_F(EditorBadInput, AFamilyThatDoesNotExistIsThatOfDialogText) {
    TextEditor &edit = Open(kStyled, u"mm");
    edit.SetSelection(2, 2);
    int const end = edit.CaretBox().left;
    OS::TextStyle unknown;
    unknown.family = OS::Font::FamilyID(static_cast<OS::Font::FixedFontFamily>(9999));
    edit.SetSelection(0, 2);
    edit.SetStyle(1, unknown);
    edit.SetSelection(2, 2);
    EXPECT_EQ(edit.CaretBox().left, end);
    Play("type \"m\"");
    EXPECT_EQ(Text(), u"mmm");
    EXPECT_GT(edit.CaretBox().left, end);
}

TEST_F(EditorBadInput, AStyleForWhatIsTypedNextEndsWithAnotherSelectionOfTheSamePlace) {
    TextEditor &edit = Open(kStyled, u"ab");
    OS::TextStyle large;
    large.size = 30;
    edit.SetSelection(2, 2);
    edit.SetStyle(4, large);
    edit.SetSelection(2, 2);
    Play("type \"c\"");
    EXPECT_EQ(edit.GetNumberStyleRuns(), 1u);
}

TEST_F(EditorBadInput, MoreMarksThanALetterHasStandBesideIt) {
    Open(0, u'a' + std::u16string(40, u'\u0301') + u'b');
    for (unsigned int place : {31u, 32u, 33u}) {
        Play("key Right");
        EXPECT_EQ(Selection(), At(place));
    }
    Play("key End\nkey Left\nkey Left\nkey Backspace");
    EXPECT_TRUE(Text() == u'a' + std::u16string(39, u'\u0301') + u'b');
}
