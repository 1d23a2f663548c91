// What buttons tell the application's hooks, the desktop's own and those in their place.
#include "buttons/GIconButton.h"
#include "buttons/GIconButtonPane.h"
#include "buttons/TrackSelectorButtonPane.h"
#include "host/CallbackAPI.h"
#include "tests/buttons/ButtonGroupTest.h"

namespace {

// Puts itself into the place of the desktop's own, for a while.
class Own : public VelaFoundationCallbackAPI, public InternalCallbackAPI {
public:
    explicit Own(SimulatedDesktop &desktop)
        : clock(desktop)
        , formerFoundation(VelaFoundationCallbackAPI::gInstance)
        , formerInternal(InternalCallbackAPI::gInstance) {
        VelaFoundationCallbackAPI::gInstance = this;
        InternalCallbackAPI::gInstance = this;
    }
    ~Own() override {
        VelaFoundationCallbackAPI::gInstance = formerFoundation;
        InternalCallbackAPI::gInstance = formerInternal;
    }
    void TrackingStep() override { steps.push_back(clock.Now()); }
    void ListTrackingStep() override { ++listSteps; }
    bool IsCancelKey(EventRecordAdapter *, bool) override { return false; }
    bool IsDoubleClick() override { return false; }
    void ExecuteCommand(CommandSpecifier const *command) override { commands.push_back(command->commandID); }

    std::vector<double> steps; // when they came
    int listSteps = 0;
    std::vector<int> commands;

private:
    SimulatedDesktop &clock;
    VelaFoundationCallbackAPI *formerFoundation;
    InternalCallbackAPI *formerInternal;
};

class HooksOfButtons : public ButtonGroupTest {
protected:
    GIconButton *NewIconButton() {
        GIconButtonResRec record = {};
        record.top = 40;
        record.left = 30;
        record.width = 20;
        record.height = 16;
        record.family = 9999; // the mark for a missing icon: solid
        record.numStates = record.numDownStates = 1;
        record.canCancel = 1;
        record.cmdClassID = 15;
        record.cmdID = 11;
        return GIconButton::NewGIconButton(glog, &record);
    }
    // When the hooks are told, counted from the press, in seconds.
    std::vector<double> StepsOf(std::string const &script) {
        Own own(desktop);
        double const start = desktop.Now();
        desktop.Play(script);
        EXPECT_EQ(own.listSteps, 0);
        for (double &step : own.steps)
            step -= start;
        return own.steps;
    }
    static void ExpectNear(std::vector<double> const &found, std::vector<double> const &expected) {
        ASSERT_EQ(found.size(), expected.size());
        for (std::size_t i = 0; i < found.size(); ++i)
            EXPECT_NEAR(found[i], expected[i], 1e-9) << i;
    }
};

} // namespace

TEST_F(HooksOfButtons, AGroupTellsOfEachStepAfterATenthOfASecondFifteenTimesASecond) {
    ThreeBoxes();
    Show();
    ExpectNear(StepsOf("press 25 35\nwait 0.35\nrelease"), {0.1 + 1 / 15.0, 0.1 + 2 / 15.0, 0.1 + 3 / 15.0});
}

TEST_F(HooksOfButtons, AnIconButtonTellsOfEachStepInTheSameRhythm) {
    NewIconButton();
    Show();
    ExpectNear(StepsOf("press 36 46\nwait 0.35\nrelease"), {0.1 + 1 / 15.0, 0.1 + 2 / 15.0, 0.1 + 3 / 15.0});
}

TEST_F(HooksOfButtons, ARepeatingButtonTellsOfEachStepTenTimesASecond) {
    TrackSelectorButtonPane *const button = new TrackSelectorButtonPane(glog);
    Rect box = {20, 10, 36, 25};
    button->SetBox(&box);
    Show();
    ExpectNear(StepsOf("press 12 22\nwait 0.35\nrelease"), {0.1, 0.2, 0.3});
}

TEST_F(HooksOfButtons, AShortClickOnAGroupOrIconButtonHasNoStep) {
    ThreeBoxes();
    GIconButton *const button = NewIconButton();
    Rect box = {140, 30, 156, 50};
    button->SetBox(&box);
    Show();
    EXPECT_TRUE(StepsOf("click 25 35\nclick 36 146").empty());
}

TEST_F(HooksOfButtons, AnApplicationsObjectGetsTheCommandsInsteadOfTheReport) {
    NewIconButton();
    Show();
    {
        Own own(desktop);
        desktop.TakeMessages();
        desktop.Play("click 36 46");
        EXPECT_EQ(own.commands, (std::vector<int>{11}));
        for (std::string const &line : desktop.TakeMessages())
            EXPECT_EQ(line.find("ExecuteCommand"), std::string::npos) << line;
    }
    desktop.Play("click 36 46");
    std::string all;
    for (std::string const &line : desktop.TakeMessages())
        all += line;
    EXPECT_NE(all.find("\"message\":\"ExecuteCommand\",\"class\":15,\"command\":11"), std::string::npos)
        << all;
}

TEST_F(HooksOfButtons, AnObjectThatIsReplacedWhileAButtonIsTrackedHearsNoMore) {
    ThreeBoxes();
    Show();
    class Passing : public VelaFoundationCallbackAPI {
    public:
        explicit Passing(VelaFoundationCallbackAPI *next_)
            : next(next_) {}
        void TrackingStep() override {
            ++steps;
            gInstance = next;
        }
        void ListTrackingStep() override {}
        bool IsCancelKey(EventRecordAdapter *, bool) override { return false; }
        bool IsDoubleClick() override { return false; }
        int steps = 0;
        VelaFoundationCallbackAPI *next;
    };
    VelaFoundationCallbackAPI *const former = VelaFoundationCallbackAPI::gInstance;
    Passing second(former), first(&second);
    VelaFoundationCallbackAPI::gInstance = &first;
    desktop.Play("press 25 35\nwait 0.35\nrelease");
    EXPECT_EQ(first.steps, 1);
    EXPECT_EQ(second.steps, 1);
    EXPECT_EQ(VelaFoundationCallbackAPI::gInstance, former);
}
