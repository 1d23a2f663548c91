// What listeners of a search field may do from inside of its messages.
#include "frame/TextPaneListener.h"
#include "host/CIdleChore.h"
#include "host/PaneWatch.h"
#include "tests/text/SearchFieldTest.h"
#include <functional>

namespace {

// Does the same at each message of the field and its text.
class Acting : public SearchFieldPane_Listener, public TextPaneListener {
public:
    Acting(SearchFieldPane *pane_, std::function<void(SearchFieldPane *)> act_)
        : pane(pane_)
        , act(std::move(act_)) {
        SearchFieldPane_Listener::DependUpon(pane_);
        TextPaneListener::DependUpon(dynamic_cast<SearchTextPane *>(pane_->Get(0)));
    }
    void TextChanged(UString const &) override { Act("Text"); }
    void SearchIsCanceled() override { Act("Canceled"); }
    void HandleSpecialKey(EventRecordAdapter *) override { Act("Special"); }
    void ValueChanged(GTextPane *) override { Act("Changed"); }
    void BeginEditing(GTextPane *) override { Act("Begin"); }
    void EndEditing(GTextPane *) override { Act("End"); }
    void TextPaneConfirmation(GTextPane *) override { Act("Confirmation"); }
    std::string at;
    int calls = 0;

private:
    void Act(char const *message) {
        ++calls;
        if (at.empty() || at == message)
            act(pane);
    }
    SearchFieldPane *pane;
    std::function<void(SearchFieldPane *)> act;
};

char const *const kMessages[] = {"Text", "Canceled", "Special", "Changed", "Begin", "End", "Confirmation"};

class SearchFieldPaneReentrancy : public SearchFieldTest {
protected:
    // All that makes a field talk.
    void UseEverything() {
        desktop.Play(
            "click 80 40\ntype \"ab\u00E9\"\ncompose \"n\" 1\ncompose \"\" 0\nkey a command\nkey c command\n"
            "key v command\nkey x command\nkey z command\nkey Up\nkey Down\ntype \"c\"\nclick 210 40\n"
            "type \"d\"\nkey Escape\nkey Tab\nclick 80 40\ntype \"x\"\nkey Return\nactivate off\n"
            "activate on");
    }
};

TEST_F(SearchFieldPaneReentrancy, TheFieldMayBeDeletedFromAnyMessage) {
    for (char const *message : kMessages) {
        OpenSearchField *const pane = Make();
        PaneWatch const watch(pane);
        Acting acting(pane, [](SearchFieldPane *p) { delete p; });
        acting.at = message;
        UseEverything();
        EXPECT_FALSE(watch.PaneExists()) << message;
    }
}

TEST_F(SearchFieldPaneReentrancy, ItsTextAloneMayBeDeletedFromAnyMessage) {
    for (char const *message : kMessages) {
        OpenSearchField *const pane = Make();
        Acting acting(pane, [](SearchFieldPane *p) { p->Del(0); });
        acting.at = message;
        UseEverything();
        EXPECT_EQ(pane->NumSubpanes(), 0) << message;
        EXPECT_EQ(pane->GetText(), UString());
        delete pane;
    }
}

TEST_F(SearchFieldPaneReentrancy, TheWindowMayBeClosedFromAnyMessage) {
    for (char const *message : kMessages) {
        OpenSearchField *const pane = Make();
        PaneWatch const watch(pane);
        Acting acting(pane, [](SearchFieldPane *p) { DisposeGlog(p->GetGlog()); });
        acting.at = message;
        UseEverything();
        EXPECT_FALSE(watch.PaneExists()) << message;
        glog = desktop.NewGlog(GlogOptions().Size(320, 200));
    }
}

TEST_F(SearchFieldPaneReentrancy, TheTextMayBeSetFromAnyMessage) {
    OpenSearchField *const pane = Make();
    Acting acting(pane, [](SearchFieldPane *p) { TextOf(*p).SetText(U("set")); });
    UseEverything();
    EXPECT_EQ(pane->GetText(), U("set"));
    EXPECT_LT(acting.calls, 200);
}

TEST_F(SearchFieldPaneReentrancy, TheSearchMayBeGivenUpFromEveryOtherMessage) {
    OpenSearchField *const pane = Make();
    for (char const *message : kMessages) {
        Acting acting(pane, [](SearchFieldPane *p) { p->CancelSearch(); });
        acting.at = message;
        if (acting.at != "Canceled")
            UseEverything();
        EXPECT_LT(acting.calls, 200) << message;
    }
}

TEST_F(SearchFieldPaneReentrancy, SelectingFromAnyMessageComesToAnEnd) {
    OpenSearchField *const pane = Make();
    for (bool const on : {true, false}) {
        Acting acting(pane, [on](SearchFieldPane *p) { p->Select(on); });
        UseEverything();
        EXPECT_GT(acting.calls, 5);
        EXPECT_LT(acting.calls, 400);
    }
}

TEST_F(SearchFieldPaneReentrancy, ATextThatWasTakenOutOutlivesItsField) {
    OpenSearchField *const pane = Make();
    SearchTextPane &text = TextOf(*pane);
    pane->DelGuts(0, true);
    delete pane;
    EventRecordAdapter event;
    event.what = 3;
    event.message = 31;
    text.Key(&event);
    text.TextEditListener_TextChanged();
    delete &text;
}

// Deletes the field while its button is held.
class Remover : public CIdleChore {
public:
    explicit Remover(SearchFieldPane *pane_)
        : CIdleChore(1, kInitialDelay)
        , pane(pane_) {
        Assign();
    }

protected:
    void DoIdle() override {
        Cancel();
        delete pane;
    }

private:
    SearchFieldPane *pane;
};

TEST_F(SearchFieldPaneReentrancy, TheFieldMayGoWhileItsButtonIsHeld) {
    OpenSearchField *const pane = Make();
    SearchEar ear(*pane);
    PaneWatch const watch(pane);
    std::string const press = PressOnButton(*pane);
    Remover remover(pane);
    desktop.Play(press + "wait 1\nmove 5 5\nrelease");
    EXPECT_FALSE(watch.PaneExists());
    EXPECT_EQ(ear.Take(), Heard());
}

} // namespace
