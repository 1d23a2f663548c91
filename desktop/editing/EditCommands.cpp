#include "host/EditCommands.h"
#include "desktop/editing/EditAction.h"

namespace {

// As they stand for editing.
short const kEditClass = 15;
short const kSelectAll = 1, kCut = 11, kCopy = 12, kPaste = 13;

EditCommands::Handler theHandler = nullptr;

} // namespace

void EditCommands::Install(Handler handler) {
    if (!theHandler)
        theHandler = handler;
}

bool EditCommands::Run(glogRec *glog, CommandSpecifier const &command, bool &commits) {
    return theHandler && theHandler(glog, command, commits);
}

CommandSpecifier EditCommands::OfKey(int key, unsigned short modifiers) {
    switch (OS::TextEditAction::OfKey(key, modifiers).kind) {
    case OS::TextEditAction::kSelectAll:
        return CommandSpecifier(kEditClass, kSelectAll);
    case OS::TextEditAction::kCut:
        return CommandSpecifier(kEditClass, kCut);
    case OS::TextEditAction::kCopy:
        return CommandSpecifier(kEditClass, kCopy);
    case OS::TextEditAction::kPaste:
        return CommandSpecifier(kEditClass, kPaste);
    default:
        return CommandSpecifier();
    }
}
