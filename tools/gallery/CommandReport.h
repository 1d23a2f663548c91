// Hears of the commands that icon buttons send.
#pragma once
#include "host/CallbackAPI.h"
#include "host/CommandSpecifier.h"
#include <functional>

// Stands in for the application's object while it lives, and hands each command on to it.
class CommandReport : public InternalCallbackAPI {
public:
    typedef std::function<void(CommandSpecifier const &)> Listener;
    explicit CommandReport(Listener);
    ~CommandReport() override;
    CommandReport(CommandReport const &) = delete;
    CommandReport &operator=(CommandReport const &) = delete;

    void ExecuteCommand(CommandSpecifier const *) override;

private:
    Listener listener;
    InternalCallbackAPI *application; // the object that it stands in for
};
