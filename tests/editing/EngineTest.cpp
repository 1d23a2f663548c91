// What whoever has an engine may count on.
#include "desktop/drawing/Surface.h"
#include "tests/editing/EditorTest.h"
#include <boost/make_shared.hpp>

namespace {

unsigned int const kFace = 2, kColor = 8, kFont = 7, kAll = 15; // which parts of a style count

class Engine : public EditorTest {
protected:
    static EventRecordAdapter KeyOf(int character) {
        EventRecordAdapter event;
        event.what = EventKinds::kKeyDown;
        event.message = static_cast<unsigned long long>(character);
        return event;
    }
    std::uint32_t PixelAt(int h, int v) {
        UpdateGlog(glog);
        return desktop.Picture(glog)->Row(v)[h];
    }
};

// Read-only

TEST_F(Engine, AReadOnlyTextIsCopiedAndNothingElse) {
    Open(kReadOnly, u"Bass");
    editor->SetSelection(1, 3);
    editor->Cut();
    EXPECT_EQ(Clipboard(), "") << "what cannot be cut is not copied either";
    editor->Copy();
    EXPECT_EQ(Clipboard(), "as");
    editor->Paste();
    editor->Delete(OS::TextEditAction::kCharacter, OS::TextEditAction::kLeft);
    EventRecordAdapter letter = KeyOf('x');
    EXPECT_FALSE(editor->HandleEvent(&letter)) << "a letter is of no use";
    EXPECT_EQ(Text(), u"Bass");
    EXPECT_EQ(Selection(), UnitRange(1, 3));
    EXPECT_EQ(ear.changes, 0);
}

// Keys

TEST_F(Engine, AKeyThatIsHeldTypesOn) {
    Open(0, u"");
    EventRecordAdapter letter = KeyOf('x');
    EXPECT_TRUE(editor->HandleEvent(&letter));
    letter.what = EventKinds::kAutoKey;
    EXPECT_TRUE(editor->HandleEvent(&letter));
    EXPECT_EQ(Text(), u"xx");
}

TEST_F(Engine, AClientMaySendAnyKeyDownThePanesOwnPath) {
    class Taking : public OS::TextEditClient {
    public:
        DispatchPath TextEditClient_HandleEvent(OSTextEdit &, EventRecordAdapter *) override {
            ++events;
            return kOwnPath;
        }
        DispatchPath TextEditClient_HandleTextEntry(OSTextEdit &, EventRecordAdapter *,
                                                    UString const &) override {
            ++others;
            return kPlatformPath;
        }
        DispatchPath TextEditClient_HandleTextAction(OSTextEdit &, EventRecordAdapter *,
                                                     OS::TextEditAction const &) override {
            ++others;
            return kPlatformPath;
        }
        int events = 0, others = 0;
    };
    Open(0, u"");
    boost::shared_ptr<Taking> const client = boost::make_shared<Taking>();
    editor->SetClient(client);
    Play("type \"a\"\nkey Left");
    EXPECT_EQ(client->events, 2);
    EXPECT_EQ(client->others, 0);
    EXPECT_EQ(Text(), u"") << "the pane has done nothing with it";
}

// With its window

TEST_F(Engine, GetsTheKeysOfTheWindowThatItIsShownIn) {
    Open(0, u"");
    editor->SetWindow(OSTextEdit::Window());
    Play("type \"a\"");
    EXPECT_EQ(Text(), u"");
    editor->SetWindow(OSTextEdit::Window(*glog));
    Play("type \"b\"");
    EXPECT_EQ(Text(), u"b");
}

// Styles

TEST_F(Engine, OnlyThePartsOfAStyleThatAreAskedForAreTold) {
    Open(kStyled, u"Bass");
    OS::TextStyle const untouched = [] {
        OS::TextStyle style;
        style.face = 77;
        style.size = 78;
        style.color = OS::RGBAColor(0.25, 0.5, 0.75, 1);
        return style;
    }();
    OS::TextStyle style = untouched;
    editor->GetStyle(kColor, style);
    EXPECT_EQ(style.face, 77);
    EXPECT_EQ(style.size, 78);
    style = untouched;
    editor->GetStyle(kFace, style);
    EXPECT_EQ(style.face, 0);
    EXPECT_EQ(style.size, 78);
    EXPECT_EQ(style.color.b, 0.75);
}

TEST_F(Engine, TextWithoutAColourOfItsOwnHasTheDefaultColour) {
    Open(kStyled, u"Bass");
    OS::TextStyle style;
    style.size = 20;
    style.color = OS::RGBAColor(0, 0, 1, 1);
    editor->SetSelection(0, 2);
    editor->SetStyle(kFont, style);
    editor->SetDefaultColors(OS::RGBAColor(1, 0, 0, 1), OS::RGBAColor(0, 1, 0, 1));
    EXPECT_EQ(StyleAt(0).color.r, 1);
    EXPECT_EQ(StyleAt(0).color.b, 0);
    unsigned int start = 0, end = 0;
    editor->GetNthStyleRun(0, start, end, style);
    EXPECT_EQ(style.color.r, 1);
    style.color = OS::RGBAColor(0, 0, 1, 1);
    editor->SetSelection(0, 2);
    editor->SetStyle(kAll, style);
    EXPECT_EQ(StyleAt(0).color.b, 1);
    EXPECT_EQ(StyleAt(2).color.r, 1);
}

TEST_F(Engine, WithoutASelectionAStyleIsThatOfWhatIsTypedNext) {
    Open(kStyled, u"Bass");
    short const usual = StyleAt(0).size;
    OS::TextStyle style;
    style.size = static_cast<short>(usual + 8);
    editor->SetSelection(4, 4);
    editor->SetStyle(kFont, style);
    EXPECT_EQ(editor->GetNumberStyleRuns(), 1u);
    Play("type \"x\"");
    EXPECT_EQ(StyleAt(4).size, usual + 8);
    EXPECT_EQ(StyleAt(3).size, usual);
}

// The selection

TEST_F(Engine, DeselectingLeavesTheInsertionPointAtTheEndOfTheSelection) {
    Open(0, u"Bass");
    editor->SetSelection(1, 3);
    editor->DeselectAll();
    EXPECT_EQ(Selection(), At(3));
}

TEST_F(Engine, OnlySeveralLinesShowWhatIsSelectedOnceTheUserHasLeft) {
    for (bool const several : {false, true}) {
        Open(several ? kSeveralLines : 0, u"        ", {10, 10, 30, 110});
        std::uint32_t const ground = PixelAt(100, 20);
        editor->SelectAll();
        EXPECT_NE(PixelAt(20, 20), ground);
        editor->Deactivate();
        EXPECT_EQ(PixelAt(20, 20) != ground, several);
        delete pane;
    }
}

// The place

TEST_F(Engine, ItsGroundIsAlwaysDrawnWhileItIsActive) {
    Open(0, u"Bass");
    editor->SetBackgroundColor({0, 0, 0xFFFF});
    editor->DrawBackgroundWhenNotSelected(false);
    EXPECT_EQ(PixelAt(200, 200), 0xFF0000FFu);
    editor->Deactivate();
    EXPECT_NE(PixelAt(200, 200), 0xFF0000FFu);
}

TEST_F(Engine, OneLineIsNeverScrolledDown) {
    Open(0, u"Bass", {10, 10, 14, 110});
    editor->SetVScrollPos(3, 0);
    EXPECT_EQ(editor->GetCurrentScrolledOffset(), 0);
}

TEST_F(Engine, TheAlignmentThatItHasRepaintsNothing) {
    Open(0, u"Bass");
    editor->SetAlignment(TextSettings::kAlignRight);
    EXPECT_FALSE(Repainted().empty());
    editor->SetAlignment(TextSettings::kAlignRight);
    EXPECT_TRUE(Repainted().empty());
}

} // namespace
