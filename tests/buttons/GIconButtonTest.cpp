#include "buttons/GIconButton.h"
#include "host/CallbackAPI.h"
#include "host/CompoundPane.h"
#include "host/Icons.h"
#include "host/OSRgn.h"
#include "host/glogRec.h"
#include "tests/PaneTest.h"
#include <cstddef>

namespace {

short const kFamily = 9999; // the mark for a missing icon: solid from its second pixel on
short const kIcon = 3;
short const kStates = 3;

GIconButtonResRec Record() {
    GIconButtonResRec record = {};
    record.kind = GIconButtonResRec::kKind;
    record.top = 40;
    record.left = 30;
    record.width = 20;
    record.height = 16;
    record.family = kFamily;
    record.icon = kIcon;
    record.numStates = kStates;
    record.canDisable = 1;
    record.numDownStates = 2;
    record.canCancel = 1;
    record.notifyWindow = 1;
    record.cmdClassID = 15;
    record.optCmdClassID = 16;
    record.cmdID = 11;
    record.optCmdID = 12;
    return record;
}

std::ptrdiff_t OffsetOf(GIconButtonResRec const &record, void const *field) {
    return static_cast<char const *>(field) - reinterpret_cast<char const *>(&record);
}

// Notes commands, and whatever a test adds, in order.
class Commands : public InternalCallbackAPI {
public:
    Commands()
        : former(gInstance) {
        gInstance = this;
    }
    ~Commands() override { gInstance = former; }
    void ExecuteCommand(CommandSpecifier const *command) override {
        log.push_back("command " + std::to_string(command->classID) + " " +
                      std::to_string(command->commandID));
        if (onCommand)
            onCommand();
    }
    std::vector<std::string> log;
    std::function<void()> onCommand;

private:
    InternalCallbackAPI *former;
};

class Handler : public GIconButton::ClickHandler {
public:
    explicit Handler(std::vector<std::string> &log_)
        : log(log_) {}
    int ClickStarted(GIconButton *button, EventRecordAdapter *) override {
        log.push_back("started in state " + std::to_string(button->GetCurState()));
        return result;
    }
    void ClickFinished(GIconButton *button) override {
        log.push_back("finished in state " + std::to_string(button->GetCurState()));
        if (onFinish)
            onFinish();
    }
    int result = 0;
    std::function<void()> onFinish;

private:
    std::vector<std::string> &log;
};

typedef std::vector<std::string> Log;

class IconButton : public PaneTest {
protected:
    GIconButton *New(GIconButtonResRec record = Record()) {
        return GIconButton::NewGIconButton(glog, &record);
    }
    static GIconButtonResRec WithoutCancel() {
        GIconButtonResRec record = Record();
        record.canCancel = 0;
        return record;
    }
    // The icons that are drawn while the script is played.
    Lines DrawnDuring(std::string const &script) {
        desktop.TakeDrawing();
        desktop.Play(script);
        return Only("Draw1Icon", desktop.TakeDrawing());
    }
    Lines Icons(GIconButton &button, std::vector<short> const &icons) {
        return Traced(button, [&icons] {
            for (short icon : icons)
                Draw1Icon(kFamily, icon, 30, 40);
        });
    }

    Commands commands;
};

int AddTen(int distance) { return distance + 10; }

bool theDecalWasPressed;
void NotePressed(glogRec *, Rect, bool, bool pressed, GIconPane *) { theDecalWasPressed = pressed; }

std::string const kClick = "click 36 46";
std::string const kPressAndSlideOff = "press 36 46\nwait 0.3\nmove 200 150\nwait 0.2\nrelease";

} // namespace

TEST_F(IconButton, ItsRecordHasThirtyBytesInTheToldOrder) {
    GIconButtonResRec const record = {};
    EXPECT_EQ(sizeof record, 30u);
    EXPECT_EQ(OffsetOf(record, &record.numDownStates), 18);
    EXPECT_EQ(OffsetOf(record, &record.canCancel), 20);
    EXPECT_EQ(OffsetOf(record, &record.notifyWindow), 21);
    EXPECT_EQ(OffsetOf(record, &record.cmdClassID), 22);
    EXPECT_EQ(OffsetOf(record, &record.optCmdClassID), 24);
    EXPECT_EQ(OffsetOf(record, &record.cmdID), 26);
    EXPECT_EQ(OffsetOf(record, &record.optCmdID), 28);
}

TEST_F(IconButton, IsNotMadeWithoutAGlog) {
    GIconButtonResRec record = Record();
    EXPECT_EQ(GIconButton::NewGIconButton(nullptr, &record), nullptr);
    EXPECT_EQ(GIconButton::NewGIconButton(nullptr, TestItem().Container()), nullptr);
}

TEST_F(IconButton, ShowsItsStateOrTheDisabledLook) {
    GIconButton *const button = New();
    button->SetCurState(1);
    EXPECT_EQ(DrawingOf(*button), Icons(*button, {kIcon + 1}));
    button->SetEnabled(0);
    EXPECT_EQ(DrawingOf(*button), Icons(*button, {kIcon + 3}));
}

TEST_F(IconButton, PressedShowsItsDownStateAfterTheDisabledIcon) {
    GIconButton *const button = New();
    button->PushOrPopButton(true);
    EXPECT_EQ(DrawingOf(*button), Icons(*button, {kIcon + 3 + 1}));
    button->SetCurState(1);
    EXPECT_EQ(DrawingOf(*button), Icons(*button, {kIcon + 3 + 1 + 1}));
}

TEST_F(IconButton, PressedTakesTheStateModuloTheDownStates) {
    GIconButton *const button = New();
    button->SetCurState(2);
    button->PushOrPopButton(true);
    EXPECT_EQ(DrawingOf(*button), Icons(*button, {kIcon + 3 + 1}));
}

TEST_F(IconButton, PressedShowsItsDownStateRightAfterTheStatesWhenItCannotBeDisabled) {
    GIconButtonResRec record = Record();
    record.canDisable = 0;
    GIconButton *const button = New(record);
    button->PushOrPopButton(true);
    EXPECT_EQ(DrawingOf(*button), Icons(*button, {kIcon + 3}));
}

TEST_F(IconButton, DisabledWhilePressedShowsTheIconBeyondTheDownStates) {
    GIconButton *const button = New();
    button->PushOrPopButton(true);
    button->SetEnabled(0);
    EXPECT_EQ(DrawingOf(*button), Icons(*button, {kIcon + 3 + 1 + 3}));
}

TEST_F(IconButton, ItsHookSeesAndGivesDistancesFromTheFirstIcon) {
    GIconButton *const button = New();
    button->SetCurState(2);
    button->SetIconStateHook(AddTen);
    EXPECT_EQ(DrawingOf(*button), Icons(*button, {kIcon + 2 + 10}));
}

TEST_F(IconButton, ItsDecalIsToldWhetherItIsPressed) {
    GIconButton *const button = New();
    button->SetDecalProc(NotePressed);
    button->PushOrPopButton(true);
    DrawingOf(*button);
    EXPECT_TRUE(theDecalWasPressed);
    button->PushOrPopButton(false);
    DrawingOf(*button);
    EXPECT_FALSE(theDecalWasPressed);
}

TEST_F(IconButton, IsPushedAndPoppedAtOnce) {
    GIconButton *const button = New();
    Show();
    button->PushOrPopButton(true);
    EXPECT_EQ(desktop.TakePresented(glog), (std::vector<Rect>{{40, 30, 56, 50}}));
    button->PushOrPopButton(true);
    EXPECT_TRUE(desktop.TakePresented(glog).empty());
    button->PushOrPopButton(false);
    EXPECT_EQ(desktop.TakePresented(glog), (std::vector<Rect>{{40, 30, 56, 50}}));
}

TEST_F(IconButton, IsNotPushedWhileDisabled) {
    GIconButton *const button = New();
    button->SetEnabled(0);
    button->PushOrPopButton(true);
    button->SetEnabled(1);
    EXPECT_EQ(DrawingOf(*button), Icons(*button, {kIcon}));
}

TEST_F(IconButton, ACompletedClickGoesToTheNextStateAndSendsTheCommand) {
    GIconButton *const button = New();
    Show();
    EXPECT_EQ(ResultOfClick(kClick), 1);
    EXPECT_EQ(button->GetCurState(), 1);
    EXPECT_EQ(commands.log, (Log{"command 15 11"}));
}

TEST_F(IconButton, AfterTheLastStateComesTheFirst) {
    GIconButton *const button = New();
    button->SetCurState(2);
    Show();
    ResultOfClick(kClick);
    EXPECT_EQ(button->GetCurState(), 0);
}

TEST_F(IconButton, WithoutAutoIncrementAClickLeavesTheState) {
    GIconButton *const button = New();
    button->SetAutoIncrement(false);
    button->SetCurState(1);
    Show();
    EXPECT_EQ(ResultOfClick(kClick), 1);
    EXPECT_EQ(button->GetCurState(), 1);
}

TEST_F(IconButton, AnOptionClickSendsTheOtherCommand) {
    New();
    Show();
    ResultOfClick(kClick + " option");
    EXPECT_EQ(commands.log, (Log{"command 16 12"}));
}

TEST_F(IconButton, AnOptionClickSendsNothingWhenThereIsNoOtherCommand) {
    GIconButtonResRec record = Record();
    record.optCmdClassID = 0;
    New(record);
    Show();
    EXPECT_EQ(ResultOfClick(kClick + " option"), 1);
    EXPECT_TRUE(commands.log.empty());
}

TEST_F(IconButton, ACommandOfClassZeroIsNotSent) {
    for (unsigned char canCancel : {0, 1}) {
        GIconButtonResRec record = Record();
        record.cmdClassID = 0;
        record.canCancel = canCancel;
        GIconButton *const button = New(record);
        Show();
        EXPECT_EQ(ResultOfClick(kClick), 1);
        delete button;
    }
    EXPECT_TRUE(commands.log.empty());
}

TEST_F(IconButton, AClickGivesMinusOneUnlessTheWindowIsToBeNotified) {
    GIconButtonResRec record = Record();
    record.notifyWindow = 0;
    New(record);
    Show();
    EXPECT_EQ(ResultOfClick(kClick), -1);
    EXPECT_EQ(commands.log.size(), 1u);
}

TEST_F(IconButton, ThePressShowsForATenthOfASecond) {
    New();
    Show();
    double const before = desktop.Now();
    ResultOfClick(kClick);
    EXPECT_DOUBLE_EQ(desktop.Now() - before, 0.1);
}

TEST_F(IconButton, AClickShowsThePressThenTheNextState) {
    GIconButton *const button = New();
    Show();
    EXPECT_EQ(DrawnDuring(kClick), Icons(*button, {kIcon + 4, kIcon + 1}));
}

TEST_F(IconButton, SlidingOffPopsTheButtonAndComingBackPushesIt) {
    GIconButton *const button = New();
    Show();
    EXPECT_EQ(DrawnDuring("press 36 46\nwait 0.3\nmove 200 150\nwait 0.2\nmove 37 47\nwait 0.2\nrelease"),
              Icons(*button, {kIcon + 4, kIcon, kIcon + 4, kIcon + 1}));
}

TEST_F(IconButton, SlidingOffACancelsTheClick) {
    GIconButton *const button = New();
    Show();
    EXPECT_EQ(ResultOfClick(kPressAndSlideOff), -1);
    EXPECT_EQ(button->GetCurState(), 0);
    EXPECT_TRUE(commands.log.empty());
}

TEST_F(IconButton, WithoutCancelTheCommandHasGoneOutAfterSlidingOff) {
    GIconButton *const button = New(WithoutCancel());
    Show();
    EXPECT_EQ(ResultOfClick(kPressAndSlideOff), 1);
    EXPECT_EQ(commands.log, (Log{"command 15 11"}));
    EXPECT_EQ(button->GetCurState(), 0) << "the state goes on only with a release inside";
}

TEST_F(IconButton, WithCancelTheCommandFollowsTheHandler) {
    Handler handler(commands.log);
    New()->SetClickHandler(&handler);
    Show();
    ResultOfClick(kClick);
    EXPECT_EQ(commands.log, (Log{"started in state 0", "finished in state 1", "command 15 11"}));
}

TEST_F(IconButton, WithoutCancelTheCommandGoesOutAtThePress) {
    Handler handler(commands.log);
    New(WithoutCancel())->SetClickHandler(&handler);
    Show();
    ResultOfClick(kClick);
    EXPECT_EQ(commands.log, (Log{"started in state 0", "command 15 11", "finished in state 1"}));
}

TEST_F(IconButton, AHandlerMayTakeTheClickOver) {
    Handler handler(commands.log);
    handler.result = 7;
    GIconButton *const button = New(WithoutCancel());
    button->SetClickHandler(&handler);
    Show();
    EXPECT_EQ(ResultOfClick(kClick), 7);
    EXPECT_EQ(commands.log, (Log{"started in state 0"}));
    EXPECT_EQ(button->GetCurState(), 0);
}

TEST_F(IconButton, AHandlerHearsNothingOfAClickThatIsCancelled) {
    Handler handler(commands.log);
    New()->SetClickHandler(&handler);
    Show();
    ResultOfClick(kPressAndSlideOff);
    EXPECT_EQ(commands.log, (Log{"started in state 0"}));
}

TEST_F(IconButton, DisabledItLetsClicksFallThrough) {
    Handler handler(commands.log);
    GIconButton *const button = New(WithoutCancel());
    button->SetClickHandler(&handler);
    button->SetEnabled(0);
    Show();
    EXPECT_EQ(ResultOfClick(kClick), 0);
    EXPECT_TRUE(commands.log.empty());
}

TEST_F(IconButton, APressIsMetByTheShapeButFollowedInTheRectangle) {
    short const shaped = 1821; // its icons leave parts of their rectangle transparent
    GIconButtonResRec record = Record();
    record.family = shaped;
    Rect const bounds = GetIconBounds(shaped);
    OSRgn const shape = GetIconRegion(shaped, kIcon);
    std::string in, out;
    for (short v = 0; v < bounds.bottom; ++v)
        for (short h = 0; h < std::min<short>(bounds.right, 20); ++h)
            (shape.Contains(Point{v, h}) ? in : out) = std::to_string(h + 30) + ' ' + std::to_string(v + 40);
    ASSERT_FALSE(in.empty() || out.empty());
    GIconButton *const button = New(record);
    Show();
    EXPECT_EQ(ResultOfClick("click " + out), 0);
    EXPECT_EQ(button->GetCurState(), 0);
    EXPECT_EQ(ResultOfClick("press " + in + "\nwait 0.2\nmove " + out + "\nwait 0.2\nrelease"), 1);
    EXPECT_EQ(button->GetCurState(), 1);
}

TEST_F(IconButton, TheNextStateIsCountedFromThatOfThePress) {
    Handler handler(commands.log);
    GIconButton *const button = New();
    button->SetClickHandler(&handler);
    class Step : public VelaFoundationCallbackAPI {
    public:
        explicit Step(GIconButton *button_)
            : former(gInstance)
            , button(button_) {
            gInstance = this;
        }
        ~Step() override { gInstance = former; }
        void TrackingStep() override { button->SetCurState(2); }
        void ListTrackingStep() override {}
        bool IsCancelKey(EventRecordAdapter *, bool) override { return false; }
        bool IsDoubleClick() override { return false; }
        VelaFoundationCallbackAPI *former;
        GIconButton *button;
    } const step(button);
    Show();
    ResultOfClick("press 36 46\nwait 0.3\nrelease");
    EXPECT_EQ(button->GetCurState(), 1);
}

TEST_F(IconButton, AnyValueButZeroOfAnItemIsAFlag) {
    TestItem item;
    item.Box("BoundsRect", {40, 30, 56, 50}).String("FamilyID", "9999").Integer("NumStates", 2);
    item.Integer("NumDownStates", 1).Integer("CanCancel", -1).Integer("NotifyWindow", 256);
    GIconButton::NewGIconButton(glog, item.Container());
    Show();
    EXPECT_EQ(ResultOfClick(kPressAndSlideOff), -1);
    EXPECT_EQ(ResultOfClick(kClick), 1);
}

TEST_F(IconButton, ItsCommandMayDeleteTheNeighbour) {
    GIconButton *const button = New();
    GIconButtonResRec record = Record();
    record.top = 100;
    GIconButton *const neighbour = New(record);
    commands.onCommand = [neighbour] { delete neighbour; };
    Show();
    EXPECT_EQ(ResultOfClick(kClick), 1);
    EXPECT_EQ(CountGlogItems(glog), 1);
    EXPECT_EQ(button->GetCurState(), 1);
}

TEST_F(IconButton, AHandlerMayDeleteTheButtonWhenTheClickStarts) {
    class Deleting : public GIconButton::ClickHandler {
    public:
        int ClickStarted(GIconButton *button, EventRecordAdapter *) override {
            delete button;
            return 0;
        }
        void ClickFinished(GIconButton *) override { ADD_FAILURE() << "there is no button"; }
    } deleting;
    New(WithoutCancel())->SetClickHandler(&deleting);
    Show();
    EXPECT_EQ(ResultOfClick(kClick), -1);
    EXPECT_TRUE(commands.log.empty());
    EXPECT_EQ(CountGlogItems(glog), 0);
}

TEST_F(IconButton, ACommandThatGoesOutAtThePressMayDeleteTheButton) {
    GIconButton *const button = New(WithoutCancel());
    commands.onCommand = [button] { delete button; };
    Show();
    EXPECT_EQ(ResultOfClick(kClick), -1);
    EXPECT_EQ(CountGlogItems(glog), 0);
}

TEST_F(IconButton, MayBeDeletedWhileItIsTracked) {
    for (unsigned char canCancel : {0, 1}) {
        GIconButtonResRec record = Record();
        record.canCancel = canCancel;
        GIconButton *const button = New(record);
        class Deleting : public VelaFoundationCallbackAPI {
        public:
            explicit Deleting(GIconButton *button_)
                : former(gInstance)
                , button(button_) {
                gInstance = this;
            }
            ~Deleting() override { gInstance = former; }
            void TrackingStep() override {
                delete button;
                button = nullptr;
            }
            void ListTrackingStep() override {}
            bool IsCancelKey(EventRecordAdapter *, bool) override { return false; }
            bool IsDoubleClick() override { return false; }
            VelaFoundationCallbackAPI *former;
            GIconButton *button;
        } const deleting(button);
        Show();
        EXPECT_EQ(ResultOfClick("press 36 46\nwait 0.3\nmove 200 150\nmove 36 46\nrelease"), -1);
        EXPECT_EQ(CountGlogItems(glog), 0);
    }
}

TEST_F(IconButton, AHandlerMayDeleteTheButton) {
    Handler handler(commands.log);
    GIconButton *const button = New();
    button->SetClickHandler(&handler);
    handler.onFinish = [button] { delete button; };
    Show();
    EXPECT_EQ(ResultOfClick(kClick), 1);
    EXPECT_EQ(commands.log.back(), "command 15 11");
}

TEST_F(IconButton, ItsCommandMayDeleteTheButton) {
    GIconButton *const button = New();
    commands.onCommand = [button] { delete button; };
    Show();
    EXPECT_EQ(ResultOfClick(kClick), 1);
}

TEST_F(IconButton, ItsCommandMayCloseTheWindow) {
    New();
    commands.onCommand = [this] { DisposeGlog(glog); };
    Show();
    desktop.Play(kClick);
    EXPECT_EQ(commands.log.size(), 1u);
}

TEST_F(IconButton, IsTrackedInTheCoordinatesOfItsGroup) {
    class Group : public CompoundPane {
    public:
        explicit Group(glogRec *owner) {
            CompoundPaneInit(owner, 0);
            Rect box = {50, 100, 150, 300};
            SetBox(&box);
        }
    };
    Group *const group = new Group(glog);
    GIconButton *const button = New();
    group->Add(button, -1);
    Show();
    desktop.Play("press 136 96\nwait 0.3\nmove 137 97\nwait 0.2\nrelease");
    EXPECT_EQ(button->GetCurState(), 1);
    desktop.Play("press 136 96\nwait 0.3\nmove 37 47\nwait 0.2\nrelease");
    EXPECT_EQ(button->GetCurState(), 1);
}

TEST_F(IconButton, KeepsANumberOfItsOwner) {
    GIconButton *const button = New();
    EXPECT_EQ(button->GetRefCon(), 0);
    button->SetRefCon(-77);
    EXPECT_EQ(button->GetRefCon(), -77);
}

TEST_F(IconButton, IsMadeFromAnItem) {
    TestItem item;
    item.Box("BoundsRect", {40, 30, 56, 50}).String("FamilyID", "9999").Integer("Num", kIcon);
    item.Integer("NumStates", 3).Integer("CanDisable", 1).Integer("NumDownStates", 2);
    item.Integer("CanCancel", 0).Integer("NotifyWindow", 5).Integer("CmdClassID", 15).Integer("CmdID", 3);
    item.Integer("OptCmdClassID", 17).Integer("OptCmdID", 4);
    GIconButton *const button = GIconButton::NewGIconButton(glog, item.Container());
    Show();
    EXPECT_EQ(ResultOfClick(kPressAndSlideOff), 1);
    EXPECT_EQ(ResultOfClick(kClick + " option"), 1);
    EXPECT_EQ(commands.log, (Log{"command 15 3", "command 17 4"}));
    button->SetCurState(1);
    button->PushOrPopButton(true);
    EXPECT_EQ(DrawingOf(*button), Icons(*button, {kIcon + 3 + 1 + 1}));
}
