#include "desktop/panes/ApplicationHooks.h"
#include "desktop/observe/MessageTrace.h"
#include "desktop/windows/EventLoop.h"
#include "host/CallbackAPI.h"
#include "host/CommandSpecifier.h"
#include "host/EventRecordAdapter.h"

namespace {

class DefaultFoundation : public VelaFoundationCallbackAPI {
public:
    // A step of a tracking loop is an application's chance to act; without one there is nothing to do.
    void TrackingStep() override {}
    void ListTrackingStep() override {}
    bool IsCancelKey(EventRecordAdapter *event, bool) override { return EscapeKey(event); }
    bool IsDoubleClick() override { return EventLoop::Instance().LastPressWasDouble(); }
};

class DefaultInternal : public InternalCallbackAPI {
public:
    // Nobody carries commands out; those who watch the messages see them.
    void ExecuteCommand(CommandSpecifier const *command) override {
        if (MessageTrace::On())
            MessageTrace::Write(MessageTrace::Begin()
                                    .Text("message", std::string("ExecuteCommand"))
                                    .Integer("class", command->classID)
                                    .Integer("command", command->commandID));
    }
};

DefaultFoundation theFoundation;
DefaultInternal theInternal;

} // namespace

VelaFoundationCallbackAPI *VelaFoundationCallbackAPI::gInstance = nullptr;
InternalCallbackAPI *InternalCallbackAPI::gInstance = nullptr;

void ApplicationHooks::InstallWhereNoneAre() {
    if (!VelaFoundationCallbackAPI::gInstance)
        VelaFoundationCallbackAPI::gInstance = &theFoundation;
    if (!InternalCallbackAPI::gInstance)
        InternalCallbackAPI::gInstance = &theInternal;
}

void ApplicationHooks::Remove() {
    if (VelaFoundationCallbackAPI::gInstance == &theFoundation)
        VelaFoundationCallbackAPI::gInstance = nullptr;
    if (InternalCallbackAPI::gInstance == &theInternal)
        InternalCallbackAPI::gInstance = nullptr;
}
