// What a field does when it gets and loses the keyboard, in which order, and what derived fields may change.
#include "desktop/editing/EditAction.h"
#include "host/CallbackAPI.h"
#include "host/CompoundPane.h"
#include "tests/VirtualPlace.h"
#include "tests/text/TextFieldTest.h"
#include <algorithm>
#include <functional>

namespace {

// Writes down what it is asked to do, among the messages that it sends.
class Telling : public OpenTextField, public TextPaneListener {
public:
    using OpenTextField::BecomeGopherOnSelect;
    Telling() { TextPaneListener::DependUpon(this); }

    void Inval() override {
        done.push_back("Inval");
        OpenTextField::Inval();
    }
    void SetupColors() override {
        done.push_back("Colours");
        OpenTextField::SetupColors();
    }
    void MaybeSelectTextWhenSelected() override { done.push_back("Select text"); }
    void MaybeDeselectTextWhenDeactivated() override { done.push_back("Deselect text"); }

    void TextPaneConfirmation(GTextPane *) override { done.push_back("Confirmation"); }
    void BeginEditing(GTextPane *) override { done.push_back("Begin"); }
    void EndEditing(GTextPane *pane) override {
        done.push_back("End");
        modeAtEnd = pane->GetMode();
    }

    Heard Take() {
        Heard taken;
        taken.swap(done);
        return taken;
    }
    std::size_t CountOf(char const *what) {
        Heard const all = Take();
        return static_cast<std::size_t>(std::count(all.begin(), all.end(), what));
    }
    int modeAtEnd = -1;

private:
    Heard done;
};

class GTextPaneSelecting : public TextFieldTest {
protected:
    Telling *MakeTelling(TestItem item = TestItem()) {
        item.Box("BoundsRect", {20, 20, 36, 200}).String("InitTextID", "Bass");
        Telling *const pane = new Telling;
        EXPECT_EQ(pane->InitGTextPane(glog, item.Sheet(), nullptr, nullptr), pane);
        Show();
        desktop.Play("");
        Repainted();
        pane->Take();
        return pane;
    }
};

// The table

TEST_F(GTextPaneSelecting, HasWhatItOverridesBehindItsNewOperationsInTheirOrder) {
    ExpectInOrder(PlaceOf(&GTextPane::DoFrameTextWell) + 1, &GTextPane::Activate, &GTextPane::Deactivate,
                  &GTextPane::Select, &GTextPane::Key, &GTextPane::Selectable, &GTextPane::Tab,
                  &GTextPane::CanTabIn, &GTextPane::CanDeselect, &GTextPane::PanePositionChanged,
                  &Telling::HandleClick, &Telling::BecomeGopherOnSelect, &GTextPane::_Draw_,
                  &GTextPane::SetMode, &GTextPane::CanDoOp, &GTextPane::Cut, &GTextPane::Copy,
                  &GTextPane::Paste, &GTextPane::Clear, &GTextPane::SelectAll,
                  &GTextPane::PlatformWindow_Opened, &GTextPane::PlatformWindow_Closing,
                  &GTextPane::TextEditListener_TextChanged);
}

// Selecting and deselecting

TEST_F(GTextPaneSelecting, SelectingSetsColoursTellsAndRepaintsInThisOrder) {
    Telling *const pane = MakeTelling();
    pane->Select(true);
    EXPECT_EQ(pane->Take(), (Heard{"Colours", "Begin", "Inval", "Select text", "Inval", "Inval"}));
    pane->Select(true);
    EXPECT_EQ(pane->Take(), (Heard{"Colours", "Begin", "Inval", "Select text", "Inval"})) << "once more";
}

TEST_F(GTextPaneSelecting, DeselectingSetsColoursTellsAndRepaintsInThisOrder) {
    Telling *const pane = MakeTelling();
    pane->Select(true);
    pane->Take();
    pane->Select(false);
    EXPECT_EQ(pane->Take(), (Heard{"Colours", "End", "Inval", "Inval", "Confirmation", "Inval"}));
    pane->Select(false);
    EXPECT_EQ(pane->Take(), (Heard{"Colours", "Inval", "Inval", "Confirmation"})) << "once more";
}

TEST_F(GTextPaneSelecting, WithoutAnEngineSelectingIsNotTold) {
    Telling *const pane = new Telling;
    pane->GlogPaneInit(glog, 0);
    pane->Take();
    pane->Select(true);
    EXPECT_EQ(pane->Take(), (Heard{"Select text", "Inval", "Inval"}));
    pane->Select(false);
    EXPECT_EQ(pane->Take(), (Heard{"Inval", "Confirmation", "Inval"}));
}

TEST_F(GTextPaneSelecting, SelectingOnceMoreSelectsAllTextAgain) {
    OpenTextField *const pane = Make(TestItem().String("InitTextID", "Bass"));
    pane->Select(true);
    pane->SetSelection(2, 2);
    pane->Select(true);
    EXPECT_EQ(SelectionOf(*pane), Units(0, 4));
}

TEST_F(GTextPaneSelecting, OfALongTextTheFirst32767UnitsAreSelected) {
    UString lines;
    for (int i = 0; i < 700; ++i)
        lines += Text("A line of forty-nine units and the one behind it\n");
    ASSERT_GT(lines.length(), 32767u);
    OpenTextField *const pane = Make(TestItem().Integer("MultiLine", 1));
    pane->SetText(lines);
    pane->Select(true);
    EXPECT_EQ(SelectionOf(*pane), Units(0, 32767));
}

TEST_F(GTextPaneSelecting, AClickWithShiftSelectsFromWhereTheInsertionPointWas) {
    OpenTextField *const pane = Make(TestItem().String("InitTextID", "Bass"));
    pane->SetSelection(2, 2);
    desktop.Play("click 190 28 shift");
    EXPECT_EQ(SelectionOf(*pane), Units(2, 4));
}

TEST_F(GTextPaneSelecting, AClickFindsItsPlaceWhateverPortAListenerLeaves) {
    CompoundPane *const container = new CompoundPane;
    container->CompoundPaneInit(glog, 0);
    Rect all = {0, 0, 200, 300};
    container->SetBox(&all);
    OpenTextField *const pane = Make(TestItem().String("InitTextID", "mmmmmmmmmmmm"));
    container->Add(pane, -1);
    container->Offset({50, 30});
    desktop.Play("click 120 78");
    Units const usual = SelectionOf(*pane);
    ASSERT_GT(usual.first, 5u);
    glog->SetCurItem(nullptr);
    pane->SetSelection(0, 0);
    class Leaving : public TextPaneListener {
    public:
        explicit Leaving(std::function<void()> leave_)
            : leave(std::move(leave_)) {}
        void BeginEditing(GTextPane *) override { leave(); }

    private:
        std::function<void()> leave;
    } leaving([this] { LeaveForAnotherPort(); });
    leaving.TextPaneListener::DependUpon(pane);
    desktop.Play("wait 2\nclick 120 78");
    EXPECT_EQ(SelectionOf(*pane), usual);
}

// With its window

TEST_F(GTextPaneSelecting, ItsWindowMakesItActiveAndNot) {
    OpenTextField *const pane = Make();
    ASSERT_TRUE(pane->IsActive());
    pane->Deactivate();
    EXPECT_FALSE(pane->IsActive());
    pane->Activate();
    EXPECT_TRUE(pane->IsActive());
}

TEST_F(GTextPaneSelecting, TheTextIsDeselectedOnlyWhereTheEngineIsStillActive) {
    // Goes out of the way of what deselects it, so that its engine stays active.
    class Staying : public Telling {
    public:
        void Select(bool on) override {
            if (on)
                Telling::Select(on);
        }
    };
    Telling *const usual = MakeTelling();
    usual->Select(true);
    usual->Take();
    usual->Deactivate();
    EXPECT_EQ(usual->CountOf("Deselect text"), 0u);
    Staying *const staying = new Staying;
    TestItem item;
    staying->InitGTextPane(glog, item.Sheet(), nullptr, nullptr);
    staying->Select(true);
    staying->Take();
    staying->Deactivate();
    EXPECT_EQ(staying->CountOf("Deselect text"), 1u);
    staying->Deactivate();
    EXPECT_EQ(staying->CountOf("Deselect text"), 0u);
}

// Changes that end the editing

TEST_F(GTextPaneSelecting, ANewModeRepaintsOnceMoreThanDeselectingAndHoldsOnlyThen) {
    Telling *const pane = MakeTelling();
    pane->Select(true);
    pane->Take();
    pane->SetMode(3);
    EXPECT_EQ(pane->modeAtEnd, 0) << "the old one";
    EXPECT_EQ(pane->CountOf("Inval"), 4u);
    pane->SetMode(3);
    EXPECT_EQ(pane->Take(), Heard());
}

TEST_F(GTextPaneSelecting, AStyleRepaintsOnceMoreThanDeselectingAndAlsoWithoutAnEngine) {
    Telling *const pane = MakeTelling();
    pane->Select(true);
    pane->Take();
    OS::TextStyle style;
    style.size = 17;
    pane->SetTextStyle(style);
    EXPECT_EQ(pane->CountOf("Inval"), 4u);
    Telling *const bare = new Telling;
    bare->GlogPaneInit(glog, 0);
    bare->Take();
    bare->SetTextStyle(style);
    EXPECT_EQ(bare->Take(), (Heard{"Inval"}));
}

TEST_F(GTextPaneSelecting, AModeOrAStyleLeavesTheKeyboardToWhoeverElseHasIt) {
    OpenTextField *const first = Make(), *const second = Make();
    first->Select(true);
    second->SetMode(1);
    EXPECT_EQ(glog->GetCurItem(), first);
    OS::TextStyle style;
    second->SetTextStyle(style);
    EXPECT_EQ(glog->GetCurItem(), first);
}

// Keys

TEST_F(GTextPaneSelecting, TheApplicationHearsThatATextFieldAsksForTheCancelKey) {
    class Application : public VelaFoundationCallbackAPI {
    public:
        Application() { gInstance = this; }
        ~Application() override { gInstance = former; }
        void TrackingStep() override { former->TrackingStep(); }
        void ListTrackingStep() override { former->ListTrackingStep(); }
        bool IsCancelKey(EventRecordAdapter *event, bool ofTextField) override {
            asked.push_back(ofTextField);
            return (event->message & 0xFF) == 'c';
        }
        bool IsDoubleClick() override { return former->IsDoubleClick(); }
        std::vector<bool> asked;

    private:
        VelaFoundationCallbackAPI *former = gInstance;
    };
    OpenTextField *const pane = Make();
    pane->Select(true);
    Application application;
    FieldEar ear(*pane);
    EXPECT_EQ(Press(*pane, 'x'), -1);
    EXPECT_EQ(Press(*pane, 'c'), -1);
    EXPECT_EQ(application.asked, (std::vector<bool>{true, true}));
    EXPECT_EQ(ear.Take(), (Heard{"Activity", "Changed", "Reset", "End", "Confirmation"}));
    EXPECT_EQ(pane->GetText(), Text("x"));
}

// Colours

TEST_F(GTextPaneSelecting, WhateverTouchesTheEngineSetsTheColoursFirst) {
    Telling *const pane = MakeTelling();
    bool commits = false;
    EventRecordAdapter letter = KeyOf('a'), press;
    press.what = 1;
    press.where = {28, 40};
    struct {
        char const *name;
        std::function<void()> act;
    } const actions[] = {
        {"Key", [&] { pane->Key(&letter); }},
        {"SelectAll", [&] { pane->SelectAll(); }},
        {"Copy", [&] { pane->Copy(); }},
        {"Paste", [&] { pane->Paste(commits); }},
        {"SelectTextRange", [&] { pane->SelectTextRange(0, 2); }},
        {"Cut", [&] { pane->Cut(commits); }},
        {"Clear",
         [&] {
             pane->SetSelection(0, 1);
             pane->Clear(commits);
         }},
        {"UpdateTextEdit", [&] { pane->UpdateTextEdit(); }},
        {"_Draw_", [&] { pane->_Draw_(nullptr, 0); }},
    };
    for (auto const &action : actions) {
        pane->Prepare();
        pane->Take();
        action.act();
        EXPECT_EQ(pane->CountOf("Colours"), 1u) << action.name;
    }
    pane->HandleClick(&press);
    EXPECT_EQ(pane->CountOf("Colours"), 2u) << "to be selected, and to be clicked";
    pane->SetMode(1);
    pane->Take();
    for (auto const &action : actions) {
        action.act();
        EXPECT_EQ(pane->CountOf("Colours"), 0u) << action.name << " of a field that is not editable";
    }
}

// The client

class Asking : public GTextPaneSelecting {
protected:
    typedef OS::TextEditClient::DispatchPath Path;
    static Path Entry(GTextPane::Client &client, OSTextEdit &edit, UString const &text) {
        EventRecordAdapter event;
        return client.TextEditClient_HandleTextEntry(edit, &event, text);
    }
    std::unique_ptr<OSTextEdit> const edit{OSTextEdit::Create(OSTextEdit::Window(), 0)};
};

TEST_F(Asking, OnlyASingleAsciiCharacterGoesThroughThePane) {
    GTextPane::Client client(Make());
    UString wide = Text("a");
    EXPECT_EQ(Entry(client, *edit, wide), OS::TextEditClient::kOwnPath);
    wide[0] = 0x7F;
    EXPECT_EQ(Entry(client, *edit, wide), OS::TextEditClient::kOwnPath);
    wide[0] = 0x80;
    EXPECT_EQ(Entry(client, *edit, wide), OS::TextEditClient::kPlatformPath);
    EXPECT_EQ(Entry(client, *edit, Text("ab")), OS::TextEditClient::kPlatformPath);
    EXPECT_EQ(Entry(client, *edit, UString()), OS::TextEditClient::kPlatformPath);
}

TEST_F(Asking, WithoutAnEngineEverythingElseGoesThroughThePane) {
    OpenTextField pane;
    GTextPane::Client client(&pane);
    EXPECT_EQ(Entry(client, *edit, Text("a")), OS::TextEditClient::kOwnPath);
    EXPECT_EQ(Entry(client, *edit, Text("ab")), OS::TextEditClient::kPlatformPath);
    EventRecordAdapter event;
    EXPECT_EQ(client.TextEditClient_HandleTextAction(*edit, &event, OS::TextEditAction()),
              OS::TextEditClient::kOwnPath);
    EXPECT_EQ(client.TextEditClient_HandleEvent(*edit, &event), OS::TextEditClient::kPlatformPath);
}

} // namespace
