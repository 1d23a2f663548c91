// Modal dialogs that are opened by number.
#include "frame/ModalGlogClass.h"
#include "desktop/resources/Resources.h"
#include "host/CIdleChore.h"
#include "host/EventRecordAdapter.h"
#include "host/OSPort.h"
#include "tests/VirtualPlace.h"
#include "tests/dialogs/DialogTest.h"
#include "tests/resources/TemporaryDirectory.h"
#include "text/GTextPane.h"
#include <functional>

namespace {

// Says what it is told to, and writes down what it is asked.
class TestDialog : public ModalGlogClass {
public:
    explicit TestDialog(short ok = 1, short cancel = 2)
        : ModalGlogClass(ok, cancel) {}
    using ModalGlogClass::DisableIdleChores;
    using ModalGlogClass::GetCancelItemNum;
    using ModalGlogClass::GetOKItemNum;
    using ModalGlogClass::GlogP;
    using ModalGlogClass::HandleItem;
    using ModalGlogClass::ModalGlogInit;
    using ModalGlogClass::ReadError;

    int refusals = 0; // how often Read says no
    bool endsKeys = false;
    std::string asked;
    std::function<void()> onRead;

private:
    char ModalFilter(EventRecordAdapter *event, short *item, int *value) override {
        asked += "filter ";
        if (!endsKeys || event->what != 3)
            return false;
        *item = 2;
        *value = 20;
        return true;
    }
    char Read() override {
        asked += "read ";
        if (onRead)
            onRead();
        return refusals-- <= 0;
    }
};

// The places of the operations that are not public.
class Places : public ModalGlogClass {
public:
    static void Expect() {
        ExpectInOrder(
            kAfterDestructor, static_cast<char (ModalGlogClass::*)(short, int)>(&Places::HandleItem),
            static_cast<char (ModalGlogClass::*)()>(&Places::ReadError), &Places::ModalFilter, &Places::Read);
    }

private:
    char ModalFilter(EventRecordAdapter *, short *, int *) override { return false; }
    char Read() override { return true; }
};

class ModalGlogClassTest : public DialogTest {
protected:
    ModalGlogClassTest() {
        directory.Write("windows/700.xml",
                        "<Glog title=\"Ask\" width=\"200\" height=\"100\"><Items>"
                        "<Item type=\"OvalButton\" id=\"1\"><BoundsRect top=\"60\" left=\"10\" bottom=\"79\" "
                        "right=\"70\"/><ButtonText>OK</ButtonText></Item>"
                        "<Item type=\"OvalButton\" id=\"2\"><BoundsRect top=\"60\" left=\"80\" bottom=\"79\" "
                        "right=\"140\"/><ButtonText>Cancel</ButtonText></Item>"
                        "<Item type=\"OvalButton\" id=\"3\"><BoundsRect top=\"20\" left=\"10\" bottom=\"39\" "
                        "right=\"70\"/><ButtonText>Help</ButtonText></Item>"
                        "</Items></Glog>");
        directory.Write("windows/701.xml", "<Glog width=\"200\" height=\"100\"><Items>");
        Resources::Instance().AddDirectory(directory.Path());
    }
    ~ModalGlogClassTest() override { EXPECT_EQ(WithCursorDispatchingDisabled::fgCount, 0); }

    // What the loop of the dialog gives while the script is played.
    short Loop(TestDialog &dialog, std::string const &script, int a = 0, int b = 0) {
        desktop.Script(script);
        value = 99;
        return dialog.ModalLoop(&value, 0, a, b);
    }
    static std::string const kOK, kCancel, kHelp;

    TemporaryDirectory directory;
    int value = 99;
};

std::string const ModalGlogClassTest::kOK = "click 40 70\n";
std::string const ModalGlogClassTest::kCancel = "click 110 70\n";
std::string const ModalGlogClassTest::kHelp = "click 40 30\n";

} // namespace

// Windows by number

TEST_F(ModalGlogClassTest, AWindowIsOpenedByItsNumberAndInvisible) {
    using TarnOSWindow::OSWindow;
    glogRec *const glog =
        LowLevelGlogOpening::NewGlog(700, OSWindow::SendBehindArg(OSWindow::PositionOnTop), false, nullptr);
    ASSERT_NE(glog, nullptr);
    EXPECT_FALSE(glog->IsVisible());
    EXPECT_EQ(GetGlogWidth(glog), 200);
    EXPECT_EQ(CountGlogItems(glog), 3);
}

TEST_F(ModalGlogClassTest, TheWindowOfTheZoomSliderIsAmongThem) {
    using TarnOSWindow::OSWindow;
    glogRec *const glog =
        LowLevelGlogOpening::NewGlog(3510, OSWindow::SendBehindArg(OSWindow::PositionOnTop), false, nullptr);
    ASSERT_NE(glog, nullptr);
    EXPECT_EQ(GetGlogWidth(glog), 55);
    EXPECT_EQ(GetGlogHeight(glog), 34);
}

TEST_F(ModalGlogClassTest, ANumberWithoutAWindowOpensNothing) {
    using TarnOSWindow::OSWindow;
    std::size_t const before = Glogs();
    for (short missing : {0, -1, 1, 702, 32767, -32768})
        EXPECT_EQ(LowLevelGlogOpening::NewGlog(missing, OSWindow::SendBehindArg(OSWindow::PositionOnTop),
                                               false, nullptr),
                  nullptr)
            << missing;
    EXPECT_EQ(
        LowLevelGlogOpening::NewGlog(701, OSWindow::SendBehindArg(OSWindow::PositionOnTop), false, nullptr),
        nullptr)
        << "a broken file";
    EXPECT_EQ(Glogs(), before);
}

// The class

TEST_F(ModalGlogClassTest, HasItsOperationsInOrder) { Places::Expect(); }

TEST_F(ModalGlogClassTest, BeginsWithoutADialog) {
    TestDialog dialog;
    EXPECT_EQ(dialog.GlogP(), nullptr);
    EXPECT_EQ(dialog.GetOKItemNum(), 1);
    EXPECT_EQ(dialog.GetCancelItemNum(), 2);
    EXPECT_TRUE(dialog.ReadError());
    EXPECT_EQ(Loop(dialog, ""), -1);
    EXPECT_EQ(value, 99);
}

TEST_F(ModalGlogClassTest, OpensADialogInvisibleAndMakesItsPortCurrent) {
    TestDialog dialog;
    ASSERT_TRUE(dialog.ModalGlogInit(700));
    ASSERT_NE(dialog.GlogP(), nullptr);
    EXPECT_FALSE(dialog.GlogP()->IsVisible());
    EXPECT_EQ(OSPort::GetCurrent(), dialog.GlogP()->GetPort());
    EXPECT_FALSE(dialog.ReadError());
}

TEST_F(ModalGlogClassTest, ADialogThatIsNotThereIsNotOpened) {
    TestDialog dialog;
    for (short missing : {0, -5, 702, 701}) {
        EXPECT_FALSE(dialog.ModalGlogInit(missing)) << missing;
        EXPECT_EQ(Loop(dialog, ""), -1) << missing;
    }
}

TEST_F(ModalGlogClassTest, AnotherDialogTakesThePlaceOfTheFirst) {
    std::size_t const before = Glogs();
    {
        TestDialog dialog;
        dialog.ModalGlogInit(700);
        ASSERT_TRUE(dialog.ModalGlogInit(3510));
        EXPECT_EQ(GetGlogWidth(dialog.GlogP()), 55);
        EXPECT_EQ(OSPort::GetCurrent(), dialog.GlogP()->GetPort());
        EXPECT_TRUE(dialog.ModalGlogInit(702)) << "the second is still there";
        EXPECT_EQ(GetGlogWidth(dialog.GlogP()), 55);
    }
    EXPECT_EQ(Glogs(), before);
}

TEST_F(ModalGlogClassTest, TheDialogGoesWithTheObjectAndThePortIsBack) {
    glogRec *const main = desktop.NewGlog(GlogOptions());
    SetPortToGlog(main);
    std::size_t const before = Glogs();
    {
        TestDialog dialog;
        dialog.ModalGlogInit(700);
        EXPECT_EQ(Glogs(), before + 1);
    }
    EXPECT_EQ(Glogs(), before);
    EXPECT_EQ(OSPort::GetCurrent(), main->GetPort());
}

// The loop

TEST_F(ModalGlogClassTest, ShowsTheDialogAndEndsWithTheConfirmingItem) {
    TestDialog dialog;
    dialog.ModalGlogInit(700);
    EXPECT_EQ(Loop(dialog, kOK), 1);
    EXPECT_EQ(value, 1);
    EXPECT_TRUE(dialog.GlogP()->IsVisible());
    EXPECT_EQ(dialog.asked, "filter read ");
}

TEST_F(ModalGlogClassTest, ADialogThatIsShownAlreadyStaysWhereItIs) {
    TestDialog dialog;
    dialog.ModalGlogInit(700);
    ShowGlog(dialog.GlogP(), kShowGlog);
    EXPECT_EQ(Loop(dialog, kOK), 1);
}

TEST_F(ModalGlogClassTest, TheCancellingItemEndsItWithoutReading) {
    TestDialog dialog;
    dialog.ModalGlogInit(700);
    EXPECT_EQ(Loop(dialog, kCancel), 2);
    EXPECT_EQ(dialog.asked, "filter ");
}

TEST_F(ModalGlogClassTest, OtherItemsKeepItOpen) {
    TestDialog dialog;
    dialog.ModalGlogInit(700);
    EXPECT_EQ(Loop(dialog, kHelp + kHelp + kCancel), 2);
}

TEST_F(ModalGlogClassTest, AReadingThatFailsKeepsItOpen) {
    TestDialog dialog;
    dialog.refusals = 2;
    dialog.ModalGlogInit(700);
    EXPECT_EQ(Loop(dialog, kOK + kOK + kOK), 1);
    EXPECT_EQ(dialog.refusals, -1);
}

TEST_F(ModalGlogClassTest, HasOtherItemsForConfirmingAndCancelling) {
    TestDialog dialog(3, 1);
    dialog.ModalGlogInit(700);
    EXPECT_EQ(Loop(dialog, kCancel + kHelp), 3);
    EXPECT_NE(dialog.asked.find("read"), std::string::npos);
    EXPECT_EQ(Loop(dialog, kCancel + kOK), 1);
    EXPECT_EQ(Loop(dialog, "key Return", 3, 1), 3);
    EXPECT_EQ(Loop(dialog, "key Escape", 3, 1), 1);
}

TEST_F(ModalGlogClassTest, ReturnConfirmsAndEscapeCancels) {
    TestDialog dialog;
    dialog.ModalGlogInit(700);
    EXPECT_EQ(Loop(dialog, "key Return"), 1);
    EXPECT_EQ(Loop(dialog, "key Escape"), 2);
}

TEST_F(ModalGlogClassTest, InATextFieldReturnEndsTheEditingFirst) {
    TestDialog dialog;
    dialog.ModalGlogInit(700);
    Rect box = {20, 80, 40, 190};
    GTextPane *const field = GTextPane::NewGTextPane(dialog.GlogP(), 40, &box, UString(), nullptr);
    EXPECT_EQ(Loop(dialog, "click 130 30\nkey a\nkey Return\n" + kCancel), 2);
    EXPECT_EQ(field->GetText().length(), 1u) << "the first return is the field's";
    EXPECT_FALSE(field->IsSelected());
    EXPECT_EQ(Loop(dialog, "click 130 30\nkey Return\nkey Return"), 1);
    EXPECT_EQ(Loop(dialog, "click 130 30\nkey Escape\nkey Escape"), 2);
}

TEST_F(ModalGlogClassTest, TheFilterEndsEvents) {
    TestDialog dialog;
    dialog.endsKeys = true;
    dialog.ModalGlogInit(700);
    EXPECT_EQ(Loop(dialog, "key Return"), 2);
    EXPECT_EQ(value, 20);
}

TEST_F(ModalGlogClassTest, TheHookAsksTheFilterOfItsObject) {
    TestDialog dialog;
    dialog.endsKeys = true;
    EventRecordAdapter key;
    key.what = 3;
    short item = 0;
    int what = 0;
    EXPECT_TRUE(ModalGlogClass::FilterHook(nullptr, &dialog, &key, &item, &what));
    EXPECT_EQ(item, 2);
    EXPECT_EQ(what, 20);
    key.what = 1;
    EXPECT_FALSE(ModalGlogClass::FilterHook(nullptr, &dialog, &key, &item, &what));
}

TEST_F(ModalGlogClassTest, DecidesByTheItem) {
    TestDialog dialog;
    EXPECT_TRUE(dialog.HandleItem(1, 0));
    EXPECT_TRUE(dialog.HandleItem(2, 0));
    EXPECT_FALSE(dialog.HandleItem(3, 0));
    EXPECT_FALSE(dialog.HandleItem(-1, 0));
    dialog.refusals = 1;
    EXPECT_FALSE(dialog.HandleItem(1, 0));
}

TEST_F(ModalGlogClassTest, TheCursorStaysWhileTheLoopRuns) {
    TestDialog dialog;
    dialog.ModalGlogInit(700);
    int during = -1;
    dialog.onRead = [&] { during = WithCursorDispatchingDisabled::fgCount; };
    Loop(dialog, kOK);
    EXPECT_EQ(during, 1);
}

TEST_F(ModalGlogClassTest, ChoresMayHaveToWait) {
    class Counting : public CIdleChore {
    public:
        Counting()
            : CIdleChore(6, kInitialDelay) {
            Assign();
        }
        int count = 0;

    protected:
        void DoIdle() override { ++count; }
    } chore;
    TestDialog first;
    first.ModalGlogInit(700);
    Loop(first, "wait 0.5\n" + kOK);
    EXPECT_GE(chore.count, 4);
    TestDialog second;
    second.DisableIdleChores();
    second.ModalGlogInit(700);
    chore.count = 0;
    Loop(second, "wait 0.5\n" + kOK);
    EXPECT_EQ(chore.count, 0);
}

TEST_F(ModalGlogClassTest, DialogsMayLieWithinEachOther) {
    TestDialog outer; // what is clicked while its button shows the press is still its own
    outer.ModalGlogInit(700);
    short innerItem = 0;
    outer.onRead = [&] {
        TestDialog inner;
        inner.ModalGlogInit(700);
        int innerValue = 0;
        innerItem = inner.ModalLoop(&innerValue, 1, 0, 0);
    };
    EXPECT_EQ(Loop(outer, kOK + "wait 1\n" + kCancel), 1);
    EXPECT_EQ(innerItem, 2);
}

TEST_F(ModalGlogClassTest, ADialogThatIsDisposedOfEndsTheLoop) {
    TestDialog dialog;
    dialog.ModalGlogInit(700);
    dialog.refusals = 1;
    dialog.onRead = [&] { DisposeGlog(dialog.GlogP()); };
    EXPECT_EQ(Loop(dialog, kOK), -1);
}

TEST_F(ModalGlogClassTest, ADialogThatIsClosedBeforeItsLoopRunsIsAnsweredAtOnce) {
    TestDialog dialog;
    dialog.ModalGlogInit(700);
    ShowGlog(dialog.GlogP(), kShowGlog);
    DisposeGlog(dialog.GlogP());
    EXPECT_TRUE(dialog.ReadError());
    EXPECT_EQ(Loop(dialog, ""), -1);
    EXPECT_EQ(value, 99);
    EXPECT_EQ(dialog.asked, "");
}

TEST_F(ModalGlogClassTest, TheEndOfTheProgramEndsTheLoop) {
    TestDialog dialog;
    dialog.ModalGlogInit(700);
    dialog.refusals = 1;
    dialog.onRead = [&] { desktop.Quit(0); };
    EXPECT_EQ(Loop(dialog, kOK), -1);
}
