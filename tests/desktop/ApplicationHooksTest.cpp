// The desktop's own hooks, and those of an application in their place.
#include "desktop/SimulatedDesktop.h"
#include "host/CallbackAPI.h"
#include "host/CommandSpecifier.h"
#include "host/EventRecordAdapter.h"
#include <gtest/gtest.h>
#include <memory>

namespace {

class OwnFoundation : public VelaFoundationCallbackAPI {
public:
    void TrackingStep() override { ++steps; }
    void ListTrackingStep() override { ++listSteps; }
    bool IsCancelKey(EventRecordAdapter *, bool) override { return true; }
    bool IsDoubleClick() override { return true; }
    int steps = 0, listSteps = 0;
};

class OwnInternal : public InternalCallbackAPI {
public:
    void ExecuteCommand(CommandSpecifier const *command) override { executed = command->commandID; }
    int executed = 0;
};

// No desktop is open at first.
class ApplicationHooks : public testing::Test {
protected:
    ~ApplicationHooks() override {
        VelaFoundationCallbackAPI::gInstance = nullptr;
        InternalCallbackAPI::gInstance = nullptr;
    }
    OwnFoundation foundation;
    OwnInternal internal;
};

} // namespace

TEST_F(ApplicationHooks, AreThereWhileADesktopIsOpen) {
    EXPECT_EQ(VelaFoundationCallbackAPI::gInstance, nullptr);
    EXPECT_EQ(InternalCallbackAPI::gInstance, nullptr);
    {
        SimulatedDesktop const desktop;
        EXPECT_NE(VelaFoundationCallbackAPI::gInstance, nullptr);
        EXPECT_NE(InternalCallbackAPI::gInstance, nullptr);
    }
    EXPECT_EQ(VelaFoundationCallbackAPI::gInstance, nullptr);
    EXPECT_EQ(InternalCallbackAPI::gInstance, nullptr);
}

TEST_F(ApplicationHooks, OfAnApplicationStayWhenADesktopOpensAndCloses) {
    VelaFoundationCallbackAPI::gInstance = &foundation;
    InternalCallbackAPI::gInstance = &internal;
    {
        SimulatedDesktop const desktop;
        EXPECT_EQ(VelaFoundationCallbackAPI::gInstance, &foundation);
        EXPECT_EQ(InternalCallbackAPI::gInstance, &internal);
    }
    EXPECT_EQ(VelaFoundationCallbackAPI::gInstance, &foundation);
    EXPECT_EQ(InternalCallbackAPI::gInstance, &internal);
}

TEST_F(ApplicationHooks, MayBeReplacedOneWithoutTheOther) {
    InternalCallbackAPI::gInstance = &internal;
    SimulatedDesktop const desktop;
    EXPECT_EQ(InternalCallbackAPI::gInstance, &internal);
    ASSERT_NE(VelaFoundationCallbackAPI::gInstance, nullptr);
    VelaFoundationCallbackAPI::gInstance->TrackingStep();
    EXPECT_EQ(foundation.steps, 0);
}

TEST_F(ApplicationHooks, OfAnApplicationReplacedWhileTheDesktopIsOpenOutliveIt) {
    std::unique_ptr<SimulatedDesktop> desktop(new SimulatedDesktop);
    VelaFoundationCallbackAPI::gInstance = &foundation;
    InternalCallbackAPI::gInstance = &internal;
    desktop.reset();
    EXPECT_EQ(VelaFoundationCallbackAPI::gInstance, &foundation);
    EXPECT_EQ(InternalCallbackAPI::gInstance, &internal);
}

TEST_F(ApplicationHooks, OfAnApplicationGetTheCommandsAndTheDesktopReportsNone) {
    SimulatedDesktop desktop;
    InternalCallbackAPI::gInstance = &internal;
    desktop.TakeMessages();
    CommandSpecifier const command(15, 11);
    InternalCallbackAPI::gInstance->ExecuteCommand(&command);
    EXPECT_EQ(internal.executed, 11);
    EXPECT_TRUE(desktop.TakeMessages().empty());
}
