#include "text/EditOpInterface.h"
#include "desktop/windows/WindowSystem.h"
#include "host/OSPort.h"
#include "tests/VirtualPlace.h"
#include "tests/text/TextFieldTest.h"

namespace {

short const kEdit = EditOpInterface::kEditClass;

class PlainPane : public GlogPane {
    void DrawGuts(OSRgn *) override {}
    bool BecomeGopherOnSelect() override { return true; }
};

class EditOpInterfaceTest : public TextFieldTest {
protected:
    OpenTextField *MakeCurrent(TestItem item = TestItem()) {
        OpenTextField *const pane = Make(item.String("InitTextID", "Bass"));
        pane->Select(true);
        return pane;
    }
    bool Do(short id, bool &commits) {
        return EditOpInterface::DoEditOp(glog, CommandSpecifier(kEdit, id), commits);
    }
};

TEST_F(EditOpInterfaceTest, HasItsOperationsInTheirOrder) {
    ExpectInOrder(0, &EditOpInterface::CanDoOp, &EditOpInterface::Cut, &EditOpInterface::Copy,
                  &EditOpInterface::Paste, &EditOpInterface::Clear, &EditOpInterface::SelectAll);
}

TEST_F(EditOpInterfaceTest, TheActiveItemIsTheOneWithTheKeyboardIfItHasTheInterface) {
    EXPECT_EQ(EditOpInterface::GetActiveItemInterface(nullptr), nullptr);
    EXPECT_EQ(EditOpInterface::GetActiveItemInterface(glog), nullptr);
    OpenTextField *const pane = MakeCurrent();
    EXPECT_EQ(EditOpInterface::GetActiveItemInterface(glog), static_cast<EditOpInterface *>(pane));
    PlainPane *const plain = new PlainPane;
    plain->GlogPaneInit(glog, 0);
    plain->Select(true);
    bool commits = true;
    EXPECT_EQ(EditOpInterface::GetActiveItemInterface(glog), nullptr);
    EXPECT_FALSE(EditOpInterface::CanDoEditOp(glog, CommandSpecifier(kEdit, 11)));
    EXPECT_FALSE(Do(11, commits));
    EXPECT_TRUE(commits);
}

TEST_F(EditOpInterfaceTest, AskingLooksAtTheClassAndDoingDoesNot) {
    OpenTextField *const pane = MakeCurrent();
    bool commits = true;
    EXPECT_FALSE(EditOpInterface::CanDoEditOp(nullptr, CommandSpecifier(kEdit, 11)));
    EXPECT_TRUE(EditOpInterface::CanDoEditOp(glog, CommandSpecifier(kEdit, 11)));
    EXPECT_FALSE(EditOpInterface::CanDoEditOp(glog, CommandSpecifier(kEdit, 14)));
    EXPECT_FALSE(EditOpInterface::CanDoEditOp(glog, CommandSpecifier(12, 11)));
    EXPECT_TRUE(EditOpInterface::DoEditOp(glog, CommandSpecifier(12, 11), commits));
    EXPECT_EQ(pane->GetText(), UString());
    EXPECT_FALSE(commits);
}

TEST_F(EditOpInterfaceTest, EachCommandDoesWhatItSays) {
    OpenTextField *const pane = MakeCurrent(TestItem().Integer("RetOnModify", 1));
    bool commits = false;
    EXPECT_TRUE(Do(12, commits));
    EXPECT_FALSE(commits);
    EXPECT_EQ(desktop.Windows().GetClipboardText(), "Bass");
    EXPECT_TRUE(Do(15, commits));
    EXPECT_TRUE(commits);
    EXPECT_EQ(pane->GetText(), UString());
    EXPECT_TRUE(Do(13, commits));
    EXPECT_TRUE(commits);
    EXPECT_EQ(pane->GetText(), Text("Bass"));
    EXPECT_TRUE(Do(1, commits));
    EXPECT_FALSE(commits);
    EXPECT_EQ(SelectionOf(*pane), Units(0, 4));
}

TEST_F(EditOpInterfaceTest, AnUnknownCommandIsNotDoneButTakesTheFlagBack) {
    MakeCurrent();
    bool commits = true;
    EXPECT_FALSE(Do(14, commits));
    EXPECT_FALSE(commits);
}

TEST_F(EditOpInterfaceTest, ClearingNothingIsNotDone) {
    OpenTextField *const pane = MakeCurrent(TestItem().Integer("RetOnModify", 1));
    pane->DeselectAll();
    bool commits = true;
    EXPECT_FALSE(Do(15, commits));
    EXPECT_FALSE(commits);
}

TEST_F(EditOpInterfaceTest, ShortcutsReachItWithCommandAndWithControl) {
    OpenTextField *const pane = MakeCurrent();
    desktop.Play("key a command\nkey x control");
    EXPECT_EQ(pane->GetText(), UString());
    desktop.Play("key v command\nkey v control");
    EXPECT_EQ(pane->GetText(), Text("BassBass"));
}

TEST_F(EditOpInterfaceTest, AShortcutThatCountsIsAHitOfTheItem) {
    OpenTextField *const pane = MakeCurrent(TestItem().Integer("RetOnModify", 1));
    pane->SetID(31);
    int hit = 0, answer = 0;
    desktop.SetHitHandler([&](glogRec *, int item, int value) {
        hit = item;
        answer = value;
    });
    desktop.Play("key c command");
    EXPECT_EQ(hit, 0);
    desktop.Play("key x command");
    EXPECT_EQ(hit, 31);
    EXPECT_EQ(answer, 2);
}

TEST_F(TextFieldTest, AShortcutOfAnEditCommandThatThePaneRefusesDoesNothing) {
    class Refusing : public OpenTextField {
    public:
        bool CanDoOp(CommandSpecifier const &) override { return false; }
    };
    Refusing *const pane = new Refusing;
    TestItem item;
    item.Box("BoundsRect", {20, 20, 36, 200});
    ASSERT_EQ(pane->InitGTextPane(glog, item.Sheet(), nullptr, nullptr), pane);
    Show();
    glog->SetCurItem(pane);
    desktop.Windows().SetClipboardText("pasted");
    desktop.Play("key v command");
    EXPECT_EQ(pane->GetText(), UString());
}

TEST_F(EditOpInterfaceTest, WithoutAGlogOrACurrentItemTheFlagStays) {
    OpenTextField *const pane = Make();
    for (bool flag : {true, false}) {
        bool commits = flag;
        EXPECT_FALSE(EditOpInterface::DoEditOp(nullptr, CommandSpecifier(kEdit, 11), commits));
        EXPECT_EQ(commits, flag);
        EXPECT_EQ(glog->GetCurItem(), nullptr);
        EXPECT_FALSE(Do(11, commits));
        EXPECT_EQ(commits, flag);
    }
    EXPECT_EQ(pane->GetText(), UString());
}

TEST_F(EditOpInterfaceTest, ACommandIsDoneInThePortOfTheItem) {
    MakeCurrent();
    glogRec *const other = desktop.NewGlog(GlogOptions().Size(100, 100));
    ShowGlog(other, kShowGlog);
    for (short id : {12, 14}) {
        SetPortToGlog(other);
        ASSERT_EQ(&OSPort::Current(), other->GetPort());
        bool commits = true;
        Do(id, commits);
        EXPECT_EQ(&OSPort::Current(), glog->GetPort()) << id;
    }
}

} // namespace
