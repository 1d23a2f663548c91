#include "tools/gallery/CommandReport.h"
#include <utility>

CommandReport::CommandReport(Listener listener_)
    : listener(std::move(listener_))
    , application(gInstance) {
    gInstance = this;
}

CommandReport::~CommandReport() { gInstance = application; }

void CommandReport::ExecuteCommand(CommandSpecifier const *command) {
    application->ExecuteCommand(command);
    listener(*command);
}
