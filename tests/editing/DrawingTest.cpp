// What the engine redraws, and that it draws the same however little that is.
#include "desktop/drawing/Surface.h"
#include "desktop/panes/Glog.h"
#include "tests/editing/EditorTest.h"

inline bool operator==(Rect const &a, Rect const &b) {
    return a.top == b.top && a.left == b.left && a.bottom == b.bottom && a.right == b.right;
}

class EditorDrawing : public EditorTest {
protected:
    std::vector<std::uint32_t> Pixels() {
        UpdateGlog(glog);
        Surface const &pixels = *Glog::From(glog).Pixels();
        return {pixels.Pixels(), pixels.Pixels() + pixels.Width() * pixels.Height()};
    }
    // What has been redrawn bit by bit equals what is drawn at once.
    void ExpectAsIfDrawnAtOnce() {
        std::vector<std::uint32_t> const shown = Pixels();
        Glog::From(glog).DamageAll();
        EXPECT_TRUE(shown == Pixels());
    }
    static Rect Around(std::vector<Rect> const &rects) {
        Rect all = rects.empty() ? Rect{0, 0, 0, 0} : rects.front();
        for (Rect const &r : rects)
            all = {std::min(all.top, r.top), std::min(all.left, r.left), std::max(all.bottom, r.bottom),
                   std::max(all.right, r.right)};
        return all;
    }
    static std::u16string Lines(int count) {
        std::u16string text;
        for (int i = 0; i < count; ++i)
            text += u"some line of text\n";
        return text;
    }
};

TEST_F(EditorDrawing, ABlinkRedrawsTheInsertionPointAlone) {
    TextEditor &edit = Open(kSeveralLines, u"abc\ndef");
    edit.SetSelection(5, 5);
    Repainted();
    Play("wait 0.6");
    std::vector<Rect> const rects = Repainted();
    ASSERT_EQ(rects.size(), 1u);
    EXPECT_TRUE(rects[0] == edit.CaretBox());
    ExpectAsIfDrawnAtOnce();
}

TEST_F(EditorDrawing, TheInsertionPointComesBackAfterAnotherHalfSecond) {
    Open(0, u"abc");
    std::vector<std::uint32_t> const lit = Pixels();
    Play("wait 0.6");
    std::vector<std::uint32_t> const dark = Pixels();
    Play("wait 0.5");
    EXPECT_FALSE(lit == dark);
    EXPECT_TRUE(lit == Pixels());
}

TEST_F(EditorDrawing, AHiddenInsertionPointStopsToBlink) {
    Open(0, u"abc");
    pane->Hide();
    Play("wait 0.6");
    Repainted();
    Play("wait 3");
    EXPECT_TRUE(Repainted().empty());
    pane->Show();
    UpdateGlog(glog);
    Play("wait 0.6");
    EXPECT_FALSE(Repainted().empty());
}

TEST_F(EditorDrawing, AnInactiveTextDoesNotBlink) {
    Open(0, u"abc").Deactivate();
    Repainted();
    Play("wait 3");
    EXPECT_TRUE(Repainted().empty());
}

TEST_F(EditorDrawing, ATypedCharacterRedrawsItsParagraph) {
    TextEditor &edit = Open(kSeveralLines, u"abc\ndef\nghi");
    edit.SetSelection(5, 5);
    Rect const caret = edit.CaretBox();
    Repainted();
    Play("type \"x\"");
    Rect const all = Around(Repainted());
    EXPECT_EQ(all.top, caret.top);
    EXPECT_EQ(all.bottom, caret.bottom);
    ExpectAsIfDrawnAtOnce();
}

TEST_F(EditorDrawing, ANewLineRedrawsWhatIsBelow) {
    TextEditor &edit = Open(kSeveralLines, u"abc\ndef\nghi");
    edit.SetSelection(5, 5);
    Rect const caret = edit.CaretBox();
    Repainted();
    Play("key Return");
    Rect const all = Around(Repainted());
    EXPECT_EQ(all.top, caret.top);
    EXPECT_EQ(all.bottom, 210);
    ExpectAsIfDrawnAtOnce();
}

TEST_F(EditorDrawing, MovingTheInsertionPointRedrawsItsTwoPlaces) {
    Open(kSeveralLines, u"abc\ndef");
    Play("key Right");
    long area = 0;
    for (Rect const &r : Repainted())
        area += (r.right - r.left) * (r.bottom - r.top);
    EXPECT_LE(area, 40);
    ExpectAsIfDrawnAtOnce();
}

TEST_F(EditorDrawing, ExtendingASelectionRedrawsTheLinesOfTheDifference) {
    TextEditor &edit = Open(kSeveralLines, Lines(8));
    edit.SetSelection(0, 40);
    Repainted();
    edit.SetSelection(0, 58);
    Rect const all = Around(Repainted());
    int const line = edit.GetScrollDelta();
    EXPECT_EQ(all.top, 10 + 2 * line);
    EXPECT_EQ(all.bottom, 10 + 4 * line);
    ExpectAsIfDrawnAtOnce();
}

TEST_F(EditorDrawing, EditingScrollingAndSelectingLookAsIfDrawnAtOnce) {
    Open(kSeveralLines | kStyled, Lines(40), {10, 10, 110, 210});
    for (char const *script : {"key PageDown", "type \"typed here and long enough to be broken into lines\"",
                               "key Up shift\nkey Up shift", "key Backspace", "key Return\nkey Return",
                               "key z command", "key End command", "key Left command shift",
                               "compose \"\u306B\u307B\"", "compose \"\"", "key Home command"}) {
        Play(script);
        ExpectAsIfDrawnAtOnce();
    }
}

TEST_F(EditorDrawing, NothingIsDrawnBesideTheBounds) {
    TextEditor &edit = Open(0, u"a line that is much longer than its field", {20, 40, 36, 100});
    edit.SelectAll();
    std::vector<std::uint32_t> with = Pixels();
    edit.SetText(UString());
    std::vector<std::uint32_t> const without = Pixels();
    for (std::size_t i = 0; i < with.size(); ++i) {
        int const h = static_cast<int>(i % 320), v = static_cast<int>(i / 320);
        bool const beside = h < 40 || h >= 100 || v < 20 || v >= 36;
        ASSERT_TRUE(!beside || with[i] == without[i]) << h << ' ' << v;
    }
}

TEST_F(EditorDrawing, WithoutItsGroundAnInactiveTextStandsOnWhatIsBeneath) {
    TextEditor &edit = Open(0, u"");
    edit.SetBackgroundColor({0, 0, 0xFFFF});
    edit.Deactivate();
    edit.DrawBackgroundWhenNotSelected(false);
    std::size_t const inside = 20 * 320 + 100;
    EXPECT_NE(Pixels()[inside], 0xFF0000FFu);
    edit.DrawBackgroundWhenNotSelected(true);
    EXPECT_EQ(Pixels()[inside], 0xFF0000FFu);
}

TEST_F(EditorDrawing, ASelectionIsPalerWhereTheTextIsNotActiveAndGoneInOneLine) {
    TextEditor &edit = Open(kSeveralLines, u"iiiii   ");
    edit.SetDefaultColors(OS::RGBAColor(0, 0, 0, 1), OS::RGBAColor(1, 0, 0, 1));
    edit.SelectAll();
    Rect const caret = edit.CaretBox();
    std::size_t const inside =
        static_cast<std::size_t>(caret.top + 1) * 320 + static_cast<std::size_t>(caret.left - 2);
    EXPECT_EQ(Pixels()[inside], 0xFFFF0000u);
    edit.Deactivate();
    std::uint32_t const pale = Pixels()[inside];
    EXPECT_NE(pale, 0xFFFF0000u);
    EXPECT_NE(pale, 0xFFFFFFFFu);
}

TEST_F(EditorDrawing, AtTwiceTheScaleTheInsertionPointIsTwoPixelsWide) {
    TextEditor &edit = Open(0, u"");
    desktop.SetScale(2);
    UpdateGlog(glog);
    Rect const caret = edit.CaretBox();
    Surface const &pixels = *Glog::From(glog).Pixels();
    std::uint32_t const *const row = pixels.Row(2 * caret.top + 4) + 2 * caret.left;
    EXPECT_EQ(row[0], row[1]);
    EXPECT_NE(row[1], row[2]);
    EXPECT_NE(row[-1], row[0]);
}

TEST_F(EditorTest, AShorterTextShowsInAFieldThatWasScrolled) {
    Open(0, std::u16string(100, u'm'), {10, 10, 30, 110});
    Play("key End");
    editor->SetText(Utf::FromUnits(u"ab"));
    UpdateGlog(glog);
    Surface const &scrolled = *desktop.Picture(glog);
    std::vector<std::uint32_t> const shown(scrolled.Row(12) + 10, scrolled.Row(28) + 100);
    delete pane;
    Open(0, u"ab", {10, 10, 30, 110});
    Play("key End");
    UpdateGlog(glog);
    Surface const &fresh = *desktop.Picture(glog);
    EXPECT_EQ(shown, std::vector<std::uint32_t>(fresh.Row(12) + 10, fresh.Row(28) + 100));
}
