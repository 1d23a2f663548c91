#pragma once
class EventRecordAdapter;
struct CommandSpecifier;

class VelaFoundationCallbackAPI {
public:
    static VelaFoundationCallbackAPI *gInstance;
    virtual ~VelaFoundationCallbackAPI() {}
    virtual void TrackingStep() = 0;
    virtual void ListTrackingStep() = 0;
    virtual bool IsCancelKey(EventRecordAdapter *, bool) = 0;
    virtual bool IsDoubleClick() = 0;
};

class InternalCallbackAPI {
public:
    static InternalCallbackAPI *gInstance;
    virtual ~InternalCallbackAPI() {}
    virtual void ExecuteCommand(CommandSpecifier const *) = 0;
};
