// What listeners of a text field may do from inside of its messages.
#include "host/PaneWatch.h"
#include "tests/text/TextFieldTest.h"
#include <functional>

namespace {

// Does the same at each message.
class Acting : public TextPaneListener, public AutoSetActivityListener {
public:
    Acting(GTextPane *pane_, std::function<void(GTextPane *)> act_)
        : pane(pane_)
        , act(std::move(act_)) {
        TextPaneListener::DependUpon(pane_);
        AutoSetActivityListener::DependUpon(pane_);
    }
    void TextPaneConfirmation(GTextPane *p) override { Act("Confirmation", p); }
    void BeginEditing(GTextPane *p) override { Act("Begin", p); }
    void EndEditing(GTextPane *p) override { Act("End", p); }
    void ResetValue(GTextPane *p) override { Act("Reset", p); }
    void ValueChanged(GTextPane *p) override { Act("Changed", p); }
    void ListenToActivity(Provider<AutoSetActivityListener> *) override { Act("Activity", pane); }
    std::string at;
    int calls = 0;

private:
    void Act(char const *message, GTextPane *p) {
        ++calls;
        if (at.empty() || at == message)
            act(p);
    }
    GTextPane *pane;
    std::function<void(GTextPane *)> act;
};

class GTextPaneReentrancy : public TextFieldTest {
protected:
    // All that makes a field talk.
    void UseEverything() {
        desktop.Play(
            "click 190 28\ntype \"ab\"\nkey Backspace\nkey a command\nkey c command\nkey v command\nkey x "
            "command\nkey z command\nkey Escape\nkey Tab\ntype \"x\"\nkey Return\nactivate off\nactivate on");
    }
};

TEST_F(GTextPaneReentrancy, TheFieldMayBeDeletedFromAnyMessage) {
    for (char const *message : {"Confirmation", "Begin", "End", "Reset", "Changed", "Activity"}) {
        OpenTextField *const pane = Make(TestItem().String("InitTextID", "Bass").Integer("RetOnModify", 1));
        PaneWatch const watch(pane);
        Acting acting(pane, [](GTextPane *p) { delete p; });
        acting.at = message;
        UseEverything();
        EXPECT_FALSE(watch.PaneExists()) << message;
    }
}

TEST_F(GTextPaneReentrancy, TheWindowMayBeClosedFromAnyMessage) {
    for (char const *message : {"Confirmation", "Begin", "End", "Reset", "Changed", "Activity"}) {
        OpenTextField *const pane = Make();
        PaneWatch const watch(pane);
        Acting acting(pane, [](GTextPane *p) { DisposeGlog(p->GetGlog()); });
        acting.at = message;
        UseEverything();
        EXPECT_FALSE(watch.PaneExists()) << message;
        glog = desktop.NewGlog(GlogOptions().Size(320, 200));
    }
}

TEST_F(GTextPaneReentrancy, DeselectingFromAnyMessageComesToAnEnd) {
    OpenTextField *const pane = Make();
    Acting acting(pane, [](GTextPane *p) { p->Select(false); });
    UseEverything();
    EXPECT_FALSE(pane->IsSelected());
    EXPECT_GT(acting.calls, 5);
    EXPECT_LT(acting.calls, 200);
}

TEST_F(GTextPaneReentrancy, SelectingFromAnyMessageComesToAnEnd) {
    OpenTextField *const pane = Make();
    Acting acting(pane, [](GTextPane *p) { p->Select(true); });
    UseEverything();
    EXPECT_GT(acting.calls, 5);
    EXPECT_LT(acting.calls, 200);
}

TEST_F(GTextPaneReentrancy, TheTextMayBeSetFromAnyMessage) {
    OpenTextField *const pane = Make();
    UString const text = Text("set");
    Acting acting(pane, [&](GTextPane *p) { p->SetText(text); });
    UseEverything();
    EXPECT_EQ(pane->GetText(), text);
}

TEST_F(GTextPaneReentrancy, ModeAndFontMayBeSetFromAnyMessage) {
    OpenTextField *const pane = Make();
    Acting acting(pane, [&](GTextPane *p) {
        p->SetMode(static_cast<unsigned char>(p->GetMode() ^ 1));
        p->SetFontFSRID(static_cast<short>(p->GetFontFSRID() ^ 1));
    });
    UseEverything();
    EXPECT_LT(acting.calls, 2000);
}

TEST_F(GTextPaneReentrancy, ANeighbourMayBeDeletedWhileItTakesTheKeyboard) {
    for (char const *message : {"End", "Confirmation"})
        for (int way : {0, 1, 2}) {
            OpenTextField *const first = Make();
            OpenTextField *second = new OpenTextField;
            TestItem item;
            item.Box("BoundsRect", {60, 20, 76, 200});
            ASSERT_EQ(second->InitGTextPane(glog, item.Sheet(), nullptr, nullptr), second);
            Repainted();
            glog->SetCurItem(first);
            Acting acting(first, [&second](GTextPane *) {
                delete second;
                second = nullptr;
            });
            acting.at = message;
            if (way == 0)
                desktop.Play("click 190 68");
            else if (way == 1)
                desktop.Play("key Tab");
            else
                glog->SetCurItem(second);
            EXPECT_EQ(second, nullptr) << message << way;
            desktop.Play("type \"x\"");
            delete first;
        }
}

TEST_F(GTextPaneReentrancy, AFieldThatIsSelectedAgainWhileItIsDeselectedHasNoCaretLeft) {
    for (char const *message : {"End", "Confirmation"}) {
        OpenTextField *const pane = Make();
        glog->SetCurItem(pane);
        {
            Acting acting(pane, [](GTextPane *p) { p->Select(true); });
            acting.at = message;
            glog->SetCurItem(nullptr);
        }
        EXPECT_FALSE(pane->IsSelected()) << message;
        Repainted();
        desktop.Play("wait 1.5");
        EXPECT_TRUE(Repainted().empty()) << message;
        delete pane;
    }
}

} // namespace
