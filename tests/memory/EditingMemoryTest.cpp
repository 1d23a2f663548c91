// Memory that runs out in the middle of a change of an edited text: at each use of memory there is, once.
#include "tests/editing/EditorTest.h"
#include "tests/frame/Allocations.h"
#include <functional>
#include <new>
#include <ostream>

namespace {

long const kMostUses = 5000; // of memory; more would be a loop without end
int const kParagraphs = 64;  // one more takes another block of them
unsigned short const kNoModifiers = 0;

struct Change {
    std::string name;
    std::function<void(TextEditor &)> before, change;
};
void PrintTo(Change const &change, std::ostream *stream) { *stream << change.name; }

void Key(TextEditor &edit, int code, std::u16string const &text = {},
         unsigned short modifiers = kNoModifiers) {
    KeyEvent event;
    event.what = EventKinds::kKeyDown;
    event.message = static_cast<unsigned long long>(code);
    event.modifiers = modifiers;
    event.text = Utf::FromUnits(text);
    edit.HandleEvent(&event);
}

void Type(TextEditor &edit, std::u16string const &text) { Key(edit, 0, text); }

void Compose(TextEditor &edit, std::u16string const &text) { edit.Compose(Utf::FromUnits(text), 1); }

void Embolden(TextEditor &edit, unsigned int start, unsigned int end) {
    OS::TextStyle style;
    style.face = 1;
    edit.SetSelection(start, end);
    edit.SetStyle(StyleMask::kFace, style);
}

std::u16string Paragraphs() {
    std::u16string text;
    for (int i = 0; i < kParagraphs; ++i)
        text += i % 7 == 0 ? u"A longer one that takes two lines of this field\n" : u"short\n";
    return text;
}

// What can be known of an engine without changing it.
struct State {
    std::u16string text;
    UnitRange selection, marked;
    std::vector<std::pair<UnitRange, int>> faces;

    explicit State(TextEditor const &edit)
        : text(Utf::View(edit.GetText())) {
        edit.GetSelection(selection.first, selection.second);
        if (edit.GetMarkedRange())
            marked = *edit.GetMarkedRange();
        for (unsigned int i = 0; i < edit.GetNumberStyleRuns(); ++i) {
            UnitRange run;
            OS::TextStyle style;
            edit.GetNthStyleRun(i, run.first, run.second, style);
            faces.emplace_back(run, style.face);
        }
    }
    bool operator==(State const &other) const {
        return text == other.text && selection == other.selection && marked == other.marked &&
               faces == other.faces;
    }
};

class EditingMemory : public EditorTest, public testing::WithParamInterface<Change> {
protected:
    // The same each time: with looks, and with something to be undone and to be done again.
    void Begin() {
        editor->SetText(Utf::FromUnits(Paragraphs()));
        Embolden(*editor, 10, 20);
        editor->SetSelection(60, 60);
        Type(*editor, u"one");
        editor->SetSelection(70, 75);
        Key(*editor, KeyCodes::kBackspace);
        Type(*editor, u"two");
        editor->Undo();
        GetParam().before(*editor);
        UpdateGlog(glog);
    }

    // True when memory ran out before the change was made.
    bool IsRefused(long uses, bool &ranOut) {
        Allocations::FailAfter const fail(uses);
        bool refused = false;
        try {
            GetParam().change(*editor);
        } catch (std::bad_alloc const &) {
            refused = true;
        }
        ranOut = fail.HasFailed();
        return refused;
    }

    // All texts that the history leads to.
    std::vector<std::u16string> History() {
        std::vector<std::u16string> texts;
        while (editor->Undo())
            texts.push_back(Text());
        while (editor->Redo())
            texts.push_back(Text());
        return texts;
    }

    // Where lines are: with wrong paragraphs they would be elsewhere.
    std::vector<unsigned int> Lines() {
        std::vector<unsigned int> places;
        editor->SetVScrollPos(0, 0);
        for (int v = 0; v < 190; v += 10)
            places.push_back(editor->GetLayoutInfo().GetCharacterIndexForPoint(OS::Point(5, v)));
        editor->VScrollToCharacterPosition(static_cast<unsigned int>(Text().size()));
        for (int v = 0; v < 190; v += 10)
            places.push_back(editor->GetLayoutInfo().GetCharacterIndexForPoint(OS::Point(5, v)));
        return places;
    }

    // As if every paragraph was laid out for the first time.
    std::vector<unsigned int> LinesLaidOutAnew() {
        OS::RectBase<OS::RectTag> const bounds = editor->GetBounds();
        OS::RectBase<OS::RectTag> narrow = bounds;
        narrow.size.width /= 2;
        editor->SetBounds(narrow);
        editor->SetBounds(bounds);
        return Lines();
    }
};

TEST_P(EditingMemory, IsAskedForBeforeAnythingIsChanged) {
    Open(kSeveralLines | kStyled, u"");
    Begin();
    State const before(*editor);
    std::vector<std::u16string> const history = History();
    Begin();
    GetParam().change(*editor);
    State const after(*editor);
    std::vector<std::u16string> const laterHistory = History();
    ASSERT_FALSE(before == after);

    bool ranOut = true, wasRefused = false;
    for (long uses = 0; ranOut && uses < kMostUses; ++uses) {
        Begin();
        bool const refused = IsRefused(uses, ranOut);
        wasRefused = wasRefused || refused;
        ASSERT_TRUE(State(*editor) == (refused ? before : after)) << "use " << uses;
        ASSERT_EQ(History(), refused ? history : laterHistory) << "use " << uses;
    }
    EXPECT_FALSE(ranOut);
    EXPECT_TRUE(wasRefused);
}

TEST_P(EditingMemory, LeavesTheLinesWhereTheTextHasThem) {
    Open(kSeveralLines | kStyled, u"");
    bool ranOut = true;
    for (long uses = 0; ranOut && uses < kMostUses; ++uses) {
        Begin();
        IsRefused(uses, ranOut);
        UpdateGlog(glog);
        editor->SetSelection(0, 0); // nothing is composed any longer
        std::vector<unsigned int> const lines = Lines();
        ASSERT_EQ(lines, LinesLaidOutAnew()) << "use " << uses;
    }
    EXPECT_FALSE(ranOut);
}

void Nothing(TextEditor &) {}

std::vector<Change> Changes() {
    auto const select = [](unsigned int start, unsigned int end) {
        return [=](TextEditor &edit) { edit.SetSelection(start, end); };
    };
    auto const key = [](int code) { return [=](TextEditor &edit) { Key(edit, code); }; };
    auto const type = [](TextEditor &edit) { Type(edit, u"x"); };
    auto const compose = [](TextEditor &edit) { Compose(edit, u"composed"); };
    return {
        {"ALetter", Nothing, type},
        {"AnotherLetter", type, type},
        {"ALetterOverASelection", select(5, 200), type},
        {"ALetterInsteadOfWhatIsComposed", compose, type},
        {"ANewLine", select(100, 100), key(KeyCodes::kReturn)},
        {"Backspace", select(49, 49), key(KeyCodes::kBackspace)},
        {"BackspaceAgain",
         [](TextEditor &edit) {
             edit.SetSelection(50, 50);
             Key(edit, KeyCodes::kBackspace);
         },
         key(KeyCodes::kBackspace)},
        {"DeleteAgain",
         [](TextEditor &edit) {
             edit.SetSelection(8, 8);
             Key(edit, KeyCodes::kDelete);
         },
         key(KeyCodes::kDelete)},
        {"ADeletionOfParagraphs", select(3, 300), key(KeyCodes::kDelete)},
        {"Cut", select(3, 300), [](TextEditor &edit) { edit.Cut(); }},
        {"Paste",
         [](TextEditor &edit) {
             edit.SelectAll();
             edit.Copy();
             edit.SetSelection(30, 40);
         },
         [](TextEditor &edit) { edit.Paste(); }},
        {"Undo", Nothing, [](TextEditor &edit) { edit.Undo(); }},
        {"Redo", Nothing, [](TextEditor &edit) { edit.Redo(); }},
        {"TheBeginOfComposing", select(70, 90), compose},
        {"MoreComposing", compose, [](TextEditor &edit) { Compose(edit, u"composed of\nmore"); }},
        {"TheEndOfComposing", compose, [](TextEditor &edit) { Compose(edit, u""); }},
        {"ATextFromOutside", Nothing,
         [](TextEditor &edit) { edit.SetText(Utf::FromUnits(Paragraphs() + u"more\n\nof it")); }},
        {"AnotherLook", select(15, 40),
         [](TextEditor &edit) {
             OS::TextStyle style;
             style.size = 20;
             style.face = 2;
             edit.SetStyle(StyleMask::kFace | StyleMask::kSize, style);
         }},
    };
}

INSTANTIATE_TEST_SUITE_P(Changes, EditingMemory, testing::ValuesIn(Changes()),
                         [](testing::TestParamInfo<Change> const &info) { return info.param.name; });

} // namespace
