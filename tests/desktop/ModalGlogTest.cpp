#include "host/ModalGlog.h"
#include "desktop/drawing/DrawingPort.h"
#include "desktop/panes/Glog.h"
#include "host/CIdleChore.h"
#include "host/OSPort.h"
#include "host/Services.h"
#include "tests/PaneTest.h"
#include "tests/desktop/ProbePane.h"

namespace {

// Runs a function so many seconds after it was made, once or again and again.
class Chore : public CIdleChore {
public:
    Chore(double seconds, std::function<void()> action_, bool again_ = false)
        : CIdleChore(static_cast<long long>(seconds * 60), kInitialDelay)
        , action(std::move(action_))
        , again(again_) {
        Assign();
    }

protected:
    void DoIdle() override {
        if (!again)
            Cancel();
        action();
    }

private:
    std::function<void()> action;
    bool const again;
};

struct Answer {
    short item;
    int value;
};
bool operator==(Answer const &a, Answer const &b) { return a.item == b.item && a.value == b.value; }
std::ostream &operator<<(std::ostream &out, Answer const &a) {
    return out << "item " << a.item << ", value " << a.value;
}

Answer const kNone = {-1, 0};

// A main window with a pane, and a dialog with the panes 1, 2 and 3 below one another.
class ModalGlogTest : public PaneTest {
protected:
    ModalGlogTest()
        : main(Make(glog, 9, {0, 0, 200, 320}, "main"))
        , dialog(desktop.NewGlog(GlogOptions().Size(100, 60)))
        , confirm(Make(dialog, 1, {0, 0, 20, 100}, "confirm"))
        , cancel(Make(dialog, 2, {20, 0, 40, 100}, "cancel"))
        , other(Make(dialog, 3, {40, 0, 60, 100}, "other")) {
        Show();
        desktop.SetHitHandler([this](glogRec *, int item, int) { handled.push_back(item); });
        ShowGlog(dialog, kShowGlog);
    }
    ProbePane *Make(glogRec *owner, int id, Rect const &box, char const *name) {
        ProbePane *const pane = new ProbePane(owner, box, calls, name);
        pane->SetID(id);
        pane->clickResult = 1;
        return pane;
    }
    // What the dialog answers while the script is played.
    Answer Run(std::string const &script, GlogFilterHook filter = nullptr, void *self = nullptr, int a = 0,
               int b = 0, RunIdleChores chores = kRunIdleChores) {
        desktop.Script(script);
        Answer answer = {99, 0};
        DoModalGlog(dialog, &answer.item, &answer.value, filter, self, false, 2, a, b, false, chores);
        return answer;
    }
    // From now on the script acts on the main window.
    void BringMainToFront() {
        ShowGlog(glog, kHideGlog);
        ShowGlog(glog, kShowGlog);
    }

    Calls &calls = FreshCalls();
    ProbePane *main;
    glogRec *dialog;
    ProbePane *confirm, *cancel, *other;
    std::vector<int> handled;
};

// Ends the keys that it is shown as item 7 with value 70.
char TakeKeys(glogRec *, void *, EventRecordAdapter *event, short *item, int *value) {
    if (event->what != 3)
        return 0;
    *item = 7;
    *value = 70;
    return 1;
}

// Writes down what it is shown, and lets it go on.
char NoteEvents(glogRec *, void *self, EventRecordAdapter *event, short *item, int *value) {
    *static_cast<std::string *>(self) += std::to_string(event->what) + " at " +
                                         std::to_string(event->where.h) + " key " +
                                         std::to_string(event->message & 0xFF) + "; ";
    *item = 55;
    *value = 55;
    return 0;
}

} // namespace

// Hits

TEST_F(ModalGlogTest, EndsWithTheItemThatIsHit) {
    confirm->clickResult = 5;
    EXPECT_EQ(Run("click 50 10"), (Answer{1, 5}));
    EXPECT_EQ(Run("click 50 50"), (Answer{3, 1}));
    EXPECT_TRUE(dialog->IsVisible()) << "it stays open";
}

TEST_F(ModalGlogTest, GoesOnWhenNothingIsHit) {
    other->clickResult = -1;
    confirm->clickResult = 0;
    EXPECT_EQ(Run("click 50 50\nclick 50 10\nclick 50 30"), (Answer{2, 1}));
}

TEST_F(ModalGlogTest, HitsAreNotHandledByTheProgram) {
    Run("click 50 50");
    EXPECT_TRUE(handled.empty());
    desktop.Play("click 50 50");
    EXPECT_EQ(handled, std::vector<int>{3}) << "afterwards they are";
}

TEST_F(ModalGlogTest, AKeyMayHit) {
    other->keyResult = 2;
    dialog->SetCurItem(other);
    EXPECT_EQ(Run("key x"), (Answer{3, 2}));
}

TEST_F(ModalGlogTest, ForNothingAnswersNothing) {
    Answer answer = {99, 0};
    DoModalGlog(nullptr, &answer.item, &answer.value, nullptr, nullptr, false, 2, 0, 0, false,
                kRunIdleChores);
    EXPECT_EQ(answer, kNone);
    ShowGlog(dialog, kHideGlog);
    EXPECT_EQ(Run(""), kNone);
}

TEST_F(ModalGlogTest, AWaitThatNothingCanEndIsAnError) {
    Chore const again(
        0.1, [] {}, true);
    EXPECT_THROW(Run(""), ScriptError);
    EXPECT_EQ(Run("click 50 10"), (Answer{1, 1})) << "and leaves nothing behind";
}

// Return and escape

TEST_F(ModalGlogTest, ReturnAndEnterPressTheConfirmingItem) {
    EXPECT_EQ(Run("key Return"), (Answer{1, 1}));
    EXPECT_EQ(Count(calls, "confirm: click 50 10"), 1) << "in its middle";
    EXPECT_EQ(Run("key Enter"), (Answer{1, 1}));
}

TEST_F(ModalGlogTest, EscapePressesTheCancellingItem) {
    EXPECT_EQ(Run("key Escape"), (Answer{2, 1}));
    EXPECT_EQ(Count(calls, "cancel: click 50 30"), 1);
}

TEST_F(ModalGlogTest, OtherItemsMayConfirmAndCancel) {
    EXPECT_EQ(Run("key Return", nullptr, nullptr, 3, 1), (Answer{3, 1}));
    EXPECT_EQ(Run("key Escape", nullptr, nullptr, 3, 1), (Answer{1, 1}));
    EXPECT_EQ(Run("key Return", nullptr, nullptr, -4, -4), (Answer{1, 1}));
}

TEST_F(ModalGlogTest, AnItemThatCannotBePressedIsNotHit) {
    confirm->clickResult = -1;
    cancel->clickResult = -1;
    EXPECT_EQ(Run("key Return\nkey Escape\nclick 50 50"), (Answer{3, 1}));
    EXPECT_EQ(Count(calls, "confirm: click 50 10"), 1);
    EXPECT_EQ(Count(calls, "cancel: click 50 30"), 1);
}

TEST_F(ModalGlogTest, AnItemThatIsHiddenIsNotPressed) {
    confirm->Hide();
    EXPECT_EQ(Run("key Return\nclick 50 50"), (Answer{3, 1}));
}

TEST_F(ModalGlogTest, EscapeCancelsWhereNoItemDoes) {
    delete cancel;
    EXPECT_EQ(Run("key Escape"), (Answer{2, 1}));
    EXPECT_EQ(Run("key Escape", nullptr, nullptr, 0, 30), (Answer{30, 1}));
}

TEST_F(ModalGlogTest, APaneWithTheKeyboardMayTakeTheKeys) {
    dialog->SetCurItem(other);
    other->keyResult = -1;
    EXPECT_EQ(Run("key Return\nkey Escape\nclick 50 50"), (Answer{3, 1}));
    EXPECT_EQ(Count(calls, "other: Key 13"), 1);
    EXPECT_EQ(Count(calls, "other: Key 27"), 1);
    other->keyResult = 0;
    EXPECT_EQ(Run("key Return"), (Answer{1, 1}));
}

TEST_F(ModalGlogTest, InAContainerAnItemIsPressedWhereItLies) {
    ProbeContainer *const box = new ProbeContainer(dialog, {20, 40, 60, 100});
    box->Add(confirm, -1);
    Rect place{5, 5, 15, 25};
    confirm->SetBox(&place);
    EXPECT_EQ(Run("key Return"), (Answer{1, 1}));
    EXPECT_EQ(Count(calls, "confirm: click 15 10"), 1);
}

// The filter

TEST_F(ModalGlogTest, TheFilterMayEndAnEvent) {
    dialog->SetCurItem(other);
    EXPECT_EQ(Run("key Return", TakeKeys), (Answer{7, 70}));
    EXPECT_EQ(Count(calls, "other: Key 13"), 0);
    EXPECT_EQ(Run("click 50 30", TakeKeys), (Answer{2, 1}));
}

TEST_F(ModalGlogTest, AFilterThatNamesNoItemOnlyUsesTheEventUp) {
    GlogFilterHook const takeKeys = [](glogRec *, void *, EventRecordAdapter *event, short *, int *) {
        return char(event->what == 3 ? 1 : 0);
    };
    EXPECT_EQ(Run("key Return\nkey Escape\nclick 50 50", takeKeys), (Answer{3, 1}));
    EXPECT_EQ(Count(calls, "confirm: click 50 10"), 0);
}

TEST_F(ModalGlogTest, TheFilterSeesPressesReleasesAndKeysFirst) {
    std::string seen;
    other->clickResult = -1;
    EXPECT_EQ(Run("click 50 50\nmove 40 40\nkey a\nclick 50 10", NoteEvents, &seen), (Answer{1, 1}));
    EXPECT_EQ(seen, "1 at 50 key 0; 2 at 50 key 0; 3 at 40 key 97; 1 at 50 key 0; ")
        << "what it writes counts only when it says so";
}

TEST_F(ModalGlogTest, TheFilterMayDisposeOfTheGlog) {
    GlogFilterHook const dispose = [](glogRec *glog, void *, EventRecordAdapter *, short *, int *) {
        DisposeGlog(glog);
        return char(0);
    };
    EXPECT_EQ(Run("click 50 10", dispose), kNone);
    EXPECT_EQ(Count(calls, "confirm: click 50 10"), 0);
}

// Other windows

TEST_F(ModalGlogTest, OtherWindowsGetNoInput) {
    main->onClick = [](EventRecordAdapter *) { FAIL() << "a click got through"; };
    glog->SetCurItem(main);
    Chore const front(0.2, [this] { BringMainToFront(); });
    Chore const back(0.6, [this] { ShowGlog(dialog, kHideGlog); });
    EXPECT_EQ(Run("wait 0.3\nclick 50 50\nwheel 50 50 0 1\nkey Return\nkey Escape\nwait 1"), kNone);
    EXPECT_EQ(Count(calls, "main: Key 13"), 0);
    desktop.Play("key x");
    EXPECT_EQ(Count(calls, "main: Key 120"), 1) << "afterwards they do";
}

TEST_F(ModalGlogTest, OtherWindowsAreStillDrawn) {
    Chore const damage(0.2, [this] { main->Inval(); });
    desktop.TakePresented(glog);
    Run("wait 0.5\nclick 50 10");
    EXPECT_EQ(desktop.TakePresented(glog).size(), 1u);
}

TEST_F(ModalGlogTest, TheInnermostOfSeveralTakesTheInput) {
    glogRec *const inner = desktop.NewGlog(GlogOptions().Size(100, 60));
    Make(inner, 5, {0, 0, 60, 100}, "inner");
    Answer below = {99, 0};
    other->clickResult = -1;
    other->onClick = [&](EventRecordAdapter *) {
        ShowGlog(inner, kShowGlog);
        DoModalGlog(inner, &below.item, &below.value, nullptr, nullptr, false, 2, 0, 0, false,
                    kRunIdleChores);
        DisposeGlog(inner);
    };
    EXPECT_EQ(Run("click 50 50\nclick 50 10\nclick 50 30"), (Answer{2, 1}));
    EXPECT_EQ(below, (Answer{5, 1}));
    EXPECT_EQ(Count(calls, "confirm: click 50 10"), 0);
}

TEST_F(ModalGlogTest, MayBeRunFromAClickAndLeavesTheDragBehind) {
    Answer answer = {99, 0};
    bool stillDown = true;
    main->clickResult = -1;
    main->onClick = [&](EventRecordAdapter *) {
        DoModalGlog(dialog, &answer.item, &answer.value, nullptr, nullptr, false, 2, 0, 0, false,
                    kRunIdleChores);
        stillDown = OS::Services::StillDown();
    };
    Chore const front(0.1, [this] {
        ShowGlog(dialog, kHideGlog);
        ShowGlog(dialog, kShowGlog);
    });
    ShowGlog(dialog, kHideGlog);
    ShowGlog(dialog, kShowGlog);
    BringMainToFront();
    desktop.Play("press 50 50\nrelease\nwait 0.3\nclick 50 10");
    EXPECT_EQ(answer, (Answer{1, 1}));
    EXPECT_FALSE(stillDown);
}

// Endings

TEST_F(ModalGlogTest, EndsWhenItsGlogIsDisposedOf) {
    Chore const end(0.2, [this] { DisposeGlog(dialog); });
    EXPECT_EQ(Run("wait 1"), kNone);
}

TEST_F(ModalGlogTest, EndsWhenItsGlogIsHidden) {
    Chore const end(0.2, [this] { ShowGlog(dialog, kHideGlog); });
    EXPECT_EQ(Run("wait 1"), kNone);
}

TEST_F(ModalGlogTest, EndsWhenTheProgramIsToEnd) {
    Chore const end(0.2, [this] { desktop.Quit(3); });
    EXPECT_EQ(Run("wait 1"), kNone);
}

TEST_F(ModalGlogTest, EndsWhenAPaneOfItDisposesOfIt) {
    other->clickResult = 1;
    other->onClick = [this](EventRecordAdapter *) { DisposeGlog(dialog); };
    EXPECT_EQ(Run("click 50 50"), kNone);
}

// Chores

TEST_F(ModalGlogTest, ChoresRunUnlessTheyAreToWait) {
    int ran = 0;
    Chore const count(
        0.1, [&] { ++ran; }, true);
    Run("wait 0.5\nclick 50 10");
    EXPECT_GE(ran, 4);
    ran = 0;
    Run("wait 0.5\nclick 50 10", nullptr, nullptr, 0, 0, kDontRunIdleChores);
    EXPECT_EQ(ran, 0);
    desktop.Play("wait 0.5");
    EXPECT_GE(ran, 4) << "afterwards they run again";
}

TEST_F(ModalGlogTest, LeavesThePortAsItWas) {
    SetPortToGlog(glog);
    OSPort *const before = OSPort::GetCurrent();
    Run("click 50 10");
    EXPECT_EQ(OSPort::GetCurrent(), before);
}
