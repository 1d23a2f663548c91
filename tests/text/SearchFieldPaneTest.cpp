#include "text/SearchFieldPane.h"
#include "desktop/drawing/Surface.h"
#include "host/Icons.h"
#include "host/VelaDrawing.h"
#include "tests/VirtualPlace.h"
#include "tests/text/SearchFieldTest.h"
#include <algorithm>
#include <memory>

namespace {

typedef SearchFieldTest SearchFieldPaneTest;

short const kFamily = 1728;

// What it is made of

TEST_F(SearchFieldPaneTest, HasItsBasesInTheirOrder) {
    OpenSearchField *const pane = Make();
    void const *const provider = static_cast<Provider<SearchFieldPane_Listener> *>(pane);
    EXPECT_EQ(provider, static_cast<void *>(pane));
    EXPECT_LT(provider, static_cast<void const *>(static_cast<CompoundPane *>(pane)));
    SearchTextPane &text = TextOf(*pane);
    void const *const ofText = static_cast<Provider<SearchTextPane_Listener> *>(&text);
    EXPECT_EQ(ofText, static_cast<void *>(&text));
    EXPECT_LT(ofText, static_cast<void const *>(static_cast<GTextPane *>(&text)));
}

TEST_F(SearchFieldPaneTest, IsEmptyAndWithoutABoxAtFirst) {
    SearchFieldPane *const pane = new SearchFieldPane;
    EXPECT_EQ(pane->GetText(), UString());
    EXPECT_EQ(pane->NumSubpanes(), 0);
    pane->Init(glog);
    EXPECT_EQ(pane->GetText(), UString());
    EXPECT_EQ(pane->GetID(), -1);
    EXPECT_EQ(BoxOf(*pane), (Rect{0, 0, 0, 0}));
    EXPECT_EQ(BoxOf(*pane->Get(0)), (Rect{3, 20, 19, 230}));
}

TEST_F(SearchFieldPaneTest, WithoutAGlogItStaysEmpty) {
    std::unique_ptr<SearchFieldPane> const pane(new SearchFieldPane);
    pane->Init(nullptr);
    EXPECT_EQ(pane->NumSubpanes(), 0);
    Rect box = {0, 0, 20, 200};
    pane->SetBox(&box);
    pane->CancelSearch();
    pane->Select(true);
    EXPECT_EQ(pane->GetText(), UString());
}

TEST_F(SearchFieldPaneTest, ItsTextIsMadeFromAnItemOfTheGlogsOwnSheet) {
    std::shared_ptr<GlogStyleSheet> const sheet = std::make_shared<GlogStyleSheet>();
    glogRec *const other = desktop.NewGlog(GlogOptions().StyleSheet(sheet));
    (new SearchFieldPane)->Init(other);
    ASSERT_TRUE(sheet->GetItemRes());
    EXPECT_EQ(sheet->GetUStringItemValue(Text("GlogItemType")), Text("GText"));
    struct {
        char const *key;
        int value;
    } const numbers[] = {{"FSRID", 0},        {"Align", 0},          {"BoxIt", 1},
                         {"AutoScroll", 1},   {"NoTabIn", 0},        {"MultiLine", 0},
                         {"ReadOnly", 0},     {"NotSelectable", 0},  {"RetOnClick", 0},
                         {"RetOnModify", 0},  {"UseSavedColors", 0}, {"TextWell", 1},
                         {"FrameOffset", -2}, {"FirstLineOffset", 1}};
    for (auto const &number : numbers)
        EXPECT_EQ(sheet->GetSInt32ItemValue(Text(number.key)), number.value) << number.key;
    EXPECT_EQ(sheet->GetUStringItemValue(Text("InitTextID")), UString());
}

TEST_F(SearchFieldPaneTest, ItsTextGoesWithIt) {
    OpenSearchField *const pane = Make();
    PaneWatch const text(pane->Get(0));
    delete pane;
    EXPECT_FALSE(text.PaneExists());
}

// The box

TEST_F(SearchFieldPaneTest, TheTextKeepsTwentyPixelsFreeAtEitherEnd) {
    EXPECT_EQ(BoxOf(TextOf(*Make(200))), (Rect{3, 20, 19, 180}));
}

TEST_F(SearchFieldPaneTest, TheTextNeverGrowsBeyond230) {
    OpenSearchField *const pane = Make(250);
    for (int width : {250, 251, 300, 16000}) {
        Resize(*pane, width);
        EXPECT_EQ(BoxOf(TextOf(*pane)).right, 230) << width;
        EXPECT_EQ(BoxOf(*pane).right, kLeft + width);
    }
    Resize(*pane, 249);
    EXPECT_EQ(BoxOf(TextOf(*pane)).right, 229);
}

TEST_F(SearchFieldPaneTest, HidesBelow61PixelsAndComesBack) {
    OpenSearchField *const pane = Make(61);
    EXPECT_TRUE(pane->GetVisibility());
    Resize(*pane, 60);
    EXPECT_FALSE(pane->GetVisibility());
    EXPECT_EQ(BoxOf(*pane).right, kLeft + 60);
    Resize(*pane, 61);
    EXPECT_TRUE(pane->GetVisibility());
    Resize(*pane, -32768 - kLeft);
    EXPECT_FALSE(pane->GetVisibility());
}

// Drawing

TEST_F(SearchFieldPaneTest, DrawsTheTilesThenCapsAndMark) {
    OpenSearchField *const pane = Make(200);
    Lines const expected = Traced(*pane, [] {
        Rect const middle = {kTop, kLeft + 20, kTop + 20, kLeft + 180};
        TileIcon(&middle, kFamily, 1, 20, 20);
        Draw1Icon(kFamily, 0, kLeft, kTop);
        Draw1Icon(kFamily, 2, kLeft + 180, kTop);
        Draw1Icon(kFamily, 3, kLeft, kTop);
    });
    EXPECT_EQ(Traced(*pane, [&] { pane->DrawBackgroundGuts(nullptr); }), expected);
}

TEST_F(SearchFieldPaneTest, TheButtonShowsAsSoonAsThereIsText) {
    OpenSearchField *const pane = Make(300);
    Click(*pane);
    desktop.Play("type \"a\"");
    Lines const button = Traced(*pane, [] { Draw1Icon(kFamily, 4, kLeft + 280, kTop); });
    EXPECT_EQ(Traced(*pane, [&] { pane->DrawBackgroundGuts(nullptr); }).back(), button.front());
    desktop.Play("key Backspace");
    Lines const mark = Traced(*pane, [] { Draw1Icon(kFamily, 3, kLeft, kTop); });
    EXPECT_EQ(Traced(*pane, [&] { pane->DrawBackgroundGuts(nullptr); }).back(), mark.front());
}

TEST_F(SearchFieldPaneTest, ItsIconsShowThroughWhereOtherFieldsHaveAWell) {
    OpenSearchField *const pane = Make();
    EXPECT_TRUE(Only("FrameTextWell", DrawingOf(*static_cast<CompoundPane *>(pane))).empty());
    Lines const lines = DrawingOf(*static_cast<CompoundPane *>(pane));
    EXPECT_TRUE(Only("EraseRect", lines).empty());
    EXPECT_EQ(Only("DrawTextEdit", lines).size(), 1u);
}

// How many rows of pixels in the rectangle have ink.
int InkRows(Surface const &picture, Rect const &where) {
    int const kDark = 0x80;
    int rows = 0;
    for (int y = where.top; y < where.bottom; ++y)
        rows += std::any_of(picture.Row(y) + where.left, picture.Row(y) + where.right,
                            [](std::uint32_t pixel) { return static_cast<int>(pixel & 0xFF) < kDark; });
    return rows;
}

TEST_F(SearchFieldPaneTest, LettersAreNotCutThoughTheFieldIsNarrowForThem) {
    OpenSearchField *const pane = Make(200);
    TextOf(*pane).SetText(U("\u00C9g"));
    Rect box = {80, 40, 120, 200};
    GTextPane::NewGTextPane(glog, 7, &box, U("\u00C9g"), nullptr)->SetBaselineOffset(8);
    UpdateGlog(glog);
    Surface const &picture = *desktop.Picture(glog);
    int const whole = InkRows(picture, {82, 44, 118, 100});
    EXPECT_GT(whole, 10);
    EXPECT_EQ(InkRows(picture, {kTop + 1, kLeft + 23, kTop + 19, kLeft + 100}), whole);
}

// Typing

TEST_F(SearchFieldPaneTest, TellsTheTextAfterEachKey) {
    OpenSearchField *const pane = Make();
    SearchEar ear(*pane);
    Click(*pane);
    EXPECT_EQ(ear.Take(), Heard());
    desktop.Play("type \"ab\"\nkey Backspace");
    EXPECT_EQ(ear.Take(), (Heard{"Text a", "Text ab", "Text a"}));
    EXPECT_EQ(pane->GetText(), U("a"));
}

TEST_F(SearchFieldPaneTest, AKeyThatChangesNothingTellsTheTextAllTheSame) {
    OpenSearchField *const pane = Make();
    SearchEar ear(*pane);
    Click(*pane);
    desktop.Play("type \"a\"\nkey Left\nkey Home");
    EXPECT_EQ(ear.Take(), (Heard{"Text a", "Text a", "Text a"}));
    desktop.Play("key Return");
    EXPECT_EQ(ear.Take(), (Heard{"Text a"}));
    EXPECT_FALSE(TextOf(*pane).IsSelected());
}

TEST_F(SearchFieldPaneTest, LettersBeyondAsciiAreToldOnce) {
    OpenSearchField *const pane = Make();
    SearchEar ear(*pane);
    Click(*pane);
    desktop.Play("type \"\u00E9a\u05E9\"");
    EXPECT_EQ(ear.Take(), (Heard{"Text \u00E9", "Text \u00E9a", "Text \u00E9a\u05E9"}));
}

TEST_F(SearchFieldPaneTest, WhatIsComposedIsSearchedForAtOnce) {
    OpenSearchField *const pane = Make();
    SearchEar ear(*pane);
    Click(*pane);
    desktop.Play("compose \"ni\" 2\ncompose \"\" 0");
    EXPECT_EQ(ear.Take(), (Heard{"Text ni", "Text "}));
}

TEST_F(SearchFieldPaneTest, EditCommandsAreToldOnce) {
    OpenSearchField *const pane = Make();
    Click(*pane);
    desktop.Play("type \"ab\"");
    SearchEar ear(*pane);
    desktop.Play("key a command\nkey c command");
    EXPECT_EQ(ear.Take(), Heard());
    desktop.Play("key x command");
    EXPECT_EQ(ear.Take(), (Heard{"Text "}));
    desktop.Play("key v command");
    EXPECT_EQ(ear.Take(), (Heard{"Text ab"}));
    desktop.Play("key z command");
    EXPECT_EQ(ear.Take(), (Heard{"Text "}));
}

TEST_F(SearchFieldPaneTest, ATextThatAProgramSetsIsNotTold) {
    OpenSearchField *const pane = Make();
    SearchEar ear(*pane);
    TextOf(*pane).SetText(U("set"));
    EXPECT_EQ(ear.Take(), Heard());
    EXPECT_EQ(pane->GetText(), U("set"));
}

TEST_F(SearchFieldPaneTest, ArrowsUpAndDownAreNotForTheText) {
    OpenSearchField *const pane = Make();
    Click(*pane);
    desktop.Play("type \"ab\"");
    SearchEar ear(*pane);
    desktop.TakeMessages();
    desktop.Play("key Up\nkey Down shift\ntype \"c\"");
    EXPECT_EQ(ear.Take(), (Heard{"Up", "Down", "Text abc"}));
}

TEST_F(SearchFieldPaneTest, ArrowsAndEscapeAreHandled) {
    OpenSearchField *const pane = Make();
    Click(*pane);
    for (int key : {27, 30, 31}) {
        EventRecordAdapter event;
        event.what = 3;
        event.message = static_cast<unsigned long long>(key);
        EXPECT_EQ(TextOf(*pane).Key(&event), -1) << key;
    }
}

TEST_F(SearchFieldPaneTest, OnlyTheButtonIsRedrawnBesideTheText) {
    OpenSearchField *const pane = Make(300);
    pane->SearchTextChanged(U("x"));
    EXPECT_EQ(Repainted(), (std::vector<Rect>{{kTop, kLeft + 280, kTop + 20, kLeft + 300}}));
}

TEST_F(SearchFieldPaneTest, AKeyRedrawsTextAndButtonOnly) {
    OpenSearchField *const pane = Make(300);
    Click(*pane);
    desktop.Play("type \"a\"");
    Repainted();
    desktop.Play("type \"b\"");
    for (Rect const &r : desktop.TakePresented(glog)) {
        bool const inText = r.left >= kLeft + 20 && r.right <= kLeft + 230;
        bool const inButton = r.left >= kLeft + 280 && r.right <= kLeft + 300;
        EXPECT_TRUE((inText || inButton) && r.top >= kTop && r.bottom <= kTop + 20) << r;
    }
}

TEST_F(SearchFieldPaneTest, AHiddenFieldTellsWithoutDrawing) {
    OpenSearchField *const pane = Make();
    pane->Hide();
    Repainted();
    SearchEar ear(*pane);
    pane->SearchTextChanged(U("x"));
    pane->CancelSearch();
    EXPECT_EQ(ear.Take(), (Heard{"Text x", "Canceled"}));
    EXPECT_TRUE(Repainted().empty());
}

// Giving the search up

TEST_F(SearchFieldPaneTest, CancellingEmptiesTheTextAndTells) {
    OpenSearchField *const pane = Make();
    TextOf(*pane).SetText(U("ab"));
    Repainted();
    SearchEar ear(*pane);
    pane->CancelSearch();
    EXPECT_EQ(ear.Take(), (Heard{"Canceled"}));
    EXPECT_EQ(pane->GetText(), UString());
    EXPECT_EQ(Repainted(), (std::vector<Rect>{BoxOf(*pane)}));
}

TEST_F(SearchFieldPaneTest, EscapeCancelsAlsoWhenItIsEmptyAndKeepsTheKeyboard) {
    OpenSearchField *const pane = Make();
    SearchEar ear(*pane);
    Click(*pane);
    desktop.Play("key Escape\ntype \"a\"\nkey Escape\ntype \"b\"");
    EXPECT_EQ(ear.Take(), (Heard{"Canceled", "Text a", "Canceled", "Text b"}));
}

TEST_F(SearchFieldPaneTest, TheButtonCancelsWhenItComesUp) {
    OpenSearchField *const pane = Make();
    Click(*pane);
    desktop.Play("type \"ab\"");
    SearchEar ear(*pane);
    desktop.TakeDrawing();
    EXPECT_EQ(ResultOfClick(PressOnButton(*pane) + "wait 0.5\nrelease"), -1);
    EXPECT_EQ(ear.Take(), (Heard{"Canceled"}));
    Lines const drawn = desktop.TakeDrawing();
    auto const isPressed = [](std::string const &line) {
        return line.find("\"family\":1728,\"icon\":5") != std::string::npos;
    };
    EXPECT_TRUE(std::any_of(drawn.begin(), drawn.end(), isPressed)) << "it never looked pressed";
}

TEST_F(SearchFieldPaneTest, TheButtonCancelsWhereverItComesUp) {
    OpenSearchField *const pane = Make();
    SearchEar ear(*pane);
    desktop.Play(PressOnButton(*pane) + "move 5 190\nrelease");
    EXPECT_EQ(ear.Take(), (Heard{"Canceled"}));
}

TEST_F(SearchFieldPaneTest, TheLastTwentyPixelsCancelAlsoWithoutAButton) {
    OpenSearchField *const pane = Make();
    SearchEar ear(*pane);
    desktop.Play("click " + std::to_string(kLeft + 180) + " " + std::to_string(kTop));
    EXPECT_EQ(ear.Take(), (Heard{"Canceled"}));
    desktop.Play("click " + std::to_string(kLeft + 179) + " " + std::to_string(kTop + 10));
    EXPECT_EQ(ear.Take(), Heard());
}

TEST_F(SearchFieldPaneTest, TheButtonLooksPressedDuringAClickIntoTheTextToo) {
    OpenSearchField *const pane = Make();
    Click(*pane);
    desktop.Play("type \"ab\"");
    Lines const pressed = Traced(*pane, [] { Draw1Icon(kFamily, 5, kLeft + 180, kTop); });
    Lines const idle = Traced(*pane, [] { Draw1Icon(kFamily, 4, kLeft + 180, kTop); });
    Lines during;
    class Drawer : public AutoSetActivityListener {
    public:
        explicit Drawer(std::function<void()> draw_)
            : draw(std::move(draw_)) {}
        void ListenToActivity(Provider<AutoSetActivityListener> *) override { draw(); }

    private:
        std::function<void()> draw;
    } drawer([&] { during = Traced(*pane, [&] { pane->DrawBackgroundGuts(nullptr); }); });
    drawer.DependUpon(&TextOf(*pane));
    Click(*pane);
    ASSERT_FALSE(during.empty());
    EXPECT_EQ(during.back(), pressed.front());
    EXPECT_EQ(Traced(*pane, [&] { pane->DrawBackgroundGuts(nullptr); }).back(), idle.front());
}

// Having the keyboard

TEST_F(SearchFieldPaneTest, AClickAndTheTabKeySelectTheText) {
    OpenSearchField *const first = Make();
    Rect box = {80, 20, 100, 220};
    OpenSearchField *const second = Make();
    second->SetBox(&box);
    Click(*first);
    EXPECT_EQ(glog->GetCurItem(), &TextOf(*first));
    desktop.Play("key Tab");
    EXPECT_EQ(glog->GetCurItem(), &TextOf(*second));
    EXPECT_FALSE(TextOf(*first).IsSelected());
}

TEST_F(SearchFieldPaneTest, SelectingItSelectsItsText) {
    OpenSearchField *const pane = Make();
    pane->Select(true);
    EXPECT_TRUE(pane->IsSelected());
    EXPECT_TRUE(TextOf(*pane).IsSelected());
    EXPECT_EQ(glog->GetCurItem(), &TextOf(*pane));
    pane->Select(false);
    EXPECT_FALSE(pane->IsSelected());
    EXPECT_FALSE(TextOf(*pane).IsSelected());
}

TEST_F(SearchFieldPaneTest, AsTheCurrentItemItPassesTheKeyboardOnToItsText) {
    OpenSearchField *const pane = Make();
    SearchEar ear(*pane);
    for (int i = 0; i < 2; ++i) {
        glog->SetCurItem(pane);
        EXPECT_EQ(glog->GetCurItem(), &TextOf(*pane));
        EXPECT_TRUE(TextOf(*pane).IsSelected());
        desktop.Play("type \"a\"");
        glog->SetCurItem(nullptr);
        EXPECT_FALSE(TextOf(*pane).IsSelected());
    }
    EXPECT_EQ(ear.Take(), (Heard{"Text a", "Text a"}));
}

// What passes the field by

class TextEar : public TextPaneListener, public AutoSetActivityListener {
public:
    explicit TextEar(GTextPane &pane) {
        TextPaneListener::DependUpon(&pane);
        AutoSetActivityListener::DependUpon(&pane);
    }
    void ResetValue(GTextPane *) override { ++calls; }
    void ValueChanged(GTextPane *) override { ++calls; }
    void EndEditing(GTextPane *) override { ++calls; }
    void ListenToActivity(Provider<AutoSetActivityListener> *) override { ++calls; }
    int calls = 0;
};

TEST_F(SearchFieldPaneTest, TheTextSeesNothingOfArrowsAndEscape) {
    OpenSearchField *const pane = Make();
    Click(*pane);
    desktop.Play("type \"ab\"\nkey Left");
    TextEar ear(TextOf(*pane));
    desktop.Play("key Up\nkey Down shift\nkey Escape");
    EXPECT_EQ(ear.calls, 0);
    EXPECT_TRUE(TextOf(*pane).IsSelected());
}

TEST_F(SearchFieldPaneTest, EscapeRedrawsTheWholeField) {
    OpenSearchField *const pane = Make();
    Click(*pane);
    desktop.Play("type \"ab\"");
    Repainted();
    EventRecordAdapter escape;
    escape.what = 3;
    escape.message = 27;
    TextOf(*pane).Key(&escape);
    EXPECT_EQ(Repainted(), (std::vector<Rect>{BoxOf(*pane)}));
}

TEST_F(SearchFieldPaneTest, TheTextIsEmptyAlreadyWhenTheSearchIsSaidToBeCanceled) {
    class Asking : public SearchFieldPane_Listener {
    public:
        explicit Asking(SearchFieldPane &pane_)
            : pane(pane_) {
            DependUpon(&pane_);
        }
        void SearchIsCanceled() override { text = pane.GetText(); }
        SearchFieldPane &pane;
        UString text = U("not told");
    };
    OpenSearchField *const pane = Make();
    TextOf(*pane).SetText(U("ab"));
    Asking asking(*pane);
    pane->CancelSearch();
    EXPECT_EQ(asking.text, UString());
}

TEST_F(SearchFieldPaneTest, ASpecialKeyIsHandedOnAsItIs) {
    class Keeping : public SearchFieldPane_Listener {
    public:
        void HandleSpecialKey(EventRecordAdapter *given) override { event = given; }
        EventRecordAdapter *event = nullptr;
    };
    OpenSearchField *const pane = Make();
    Keeping keeping;
    keeping.DependUpon(pane);
    EventRecordAdapter event;
    pane->HandleSpecialKey(&event);
    EXPECT_EQ(keeping.event, &event);
}

TEST_F(SearchFieldPaneTest, AClickThatFailsLeavesTheButtonAtRest) {
    class Failing : public GlogPane {
        void DrawGuts(OSRgn *) override {}
        int HandleClick(EventRecordAdapter *) override { throw std::runtime_error("a click"); }
    };
    OpenSearchField *const pane = Make();
    TextOf(*pane).SetText(U("ab"));
    Failing *const failing = new Failing;
    failing->GlogPaneInit(glog, 0);
    pane->Add(failing, -1);
    Rect all = {0, 0, 20, 200};
    failing->SetBox(&all);
    pane->Prepare();
    EventRecordAdapter event;
    event.what = 1;
    event.where = {kTop + 10, kLeft + 60};
    EXPECT_THROW(pane->HandleClick(&event), std::runtime_error);
    Lines const idle = Traced(*pane, [] { Draw1Icon(kFamily, 4, kLeft + 180, kTop); });
    EXPECT_EQ(Traced(*pane, [&] { pane->DrawBackgroundGuts(nullptr); }).back(), idle.front());
}

TEST_F(SearchFieldPaneTest, AClickAboveOrBelowTheButtonIsNoneOnIt) {
    OpenSearchField *const pane = Make();
    SearchEar ear(*pane);
    pane->Prepare();
    EventRecordAdapter event;
    event.what = 1;
    for (short v : {short(kTop - 1), short(kTop + 20)}) {
        event.where = {v, kLeft + 190};
        EXPECT_EQ(pane->HandleClick(&event), 0) << v;
    }
    EXPECT_EQ(ear.Take(), Heard());
}

TEST_F(SearchFieldPaneTest, AKeyThatTheTextHasNoUseForIsToldAndAnsweredAsTheTextDoes) {
    OpenSearchField *const pane = Make();
    TextOf(*pane).SetText(U("ab"));
    TextOf(*pane).SetMode(1);
    SearchEar ear(*pane);
    EventRecordAdapter letter;
    letter.what = 3;
    letter.message = 'c';
    EXPECT_EQ(TextOf(*pane).Key(&letter), 0);
    EXPECT_EQ(ear.Take(), (Heard{"Text ab"}));
}

TEST_F(SearchFieldPaneTest, AClickIntoTheTextIsAnsweredAsTheTextDoes) {
    Make();
    EXPECT_EQ(ResultOfClick("click " + std::to_string(kLeft + 60) + " " + std::to_string(kTop + 10)), -1);
    EXPECT_EQ(ResultOfClick("click " + std::to_string(kLeft + 4) + " " + std::to_string(kTop + 10)), 0)
        << "on the mark";
}

// In which order

// Writes down its invalidations among the messages.
class NotingField : public OpenSearchField, public SearchFieldPane_Listener {
public:
    NotingField() { DependUpon(this); }
    void Inval() override {
        done.push_back("Inval");
        OpenSearchField::Inval();
    }
    void TextChanged(UString const &) override { done.push_back("Text"); }
    void SearchIsCanceled() override { done.push_back("Canceled"); }
    Heard Take() {
        Heard taken;
        taken.swap(done);
        return taken;
    }

private:
    Heard done;
};

TEST_F(SearchFieldPaneTest, EscapeAndTheButtonRepaintBeforeAndAfterTheSearchIsGivenUp) {
    NotingField *const pane = new NotingField;
    pane->Init(glog);
    Resize(*pane, 200);
    Show();
    desktop.Play("");
    Heard const expected = {"Inval", "Canceled", "Inval"};
    pane->Take();
    EventRecordAdapter escape;
    escape.what = 3;
    escape.message = 27;
    TextOf(*pane).Key(&escape);
    EXPECT_EQ(pane->Take(), expected);
    desktop.Play(PressOnButton(*pane) + "release");
    EXPECT_EQ(pane->Take(), expected);
    pane->SearchTextChanged(U("x"));
    EXPECT_EQ(pane->Take(), (Heard{"Text"})) << "the button is not all of the field";
}

TEST_F(SearchFieldPaneTest, TheButtonIsInvalidatedInTheFieldsOwnPort) {
    OpenSearchField *const pane = Make(300);
    LeaveForAnotherPort();
    pane->SearchTextChanged(U("x"));
    EXPECT_TRUE(IsInItsPort());
    EXPECT_EQ(Repainted(), (std::vector<Rect>{{kTop, kLeft + 280, kTop + 20, kLeft + 300}}));
}

TEST_F(SearchFieldPaneTest, WhatItOverridesStandsInItsOrder) {
    ExpectInOrder(kAfterDestructor, &SearchFieldPane::Select, &SearchFieldPane::SetBox,
                  &OpenSearchField::HandleClick, &OpenSearchField::DrawBackgroundGuts);
}

} // namespace
