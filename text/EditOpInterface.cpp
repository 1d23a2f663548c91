#include "text/EditOpInterface.h"
#include "host/EditCommands.h"
#include "host/GlogPane.h"
#include "host/glogRec.h"

// What the keyboard calls. A shortcut that the active item knows and cannot carry out now is lost: nobody
// else may take it for text.
EditOpInterface::EditOpInterface() {
    EditCommands::Install([](glogRec *glog, CommandSpecifier const &command, bool &commits) {
        if (CanDoEditOp(glog, command))
            return DoEditOp(glog, command, commits);
        commits = false;
        return GetActiveItemInterface(glog) && KnowsCommand(command);
    });
}

bool EditOpInterface::KnowsCommand(CommandSpecifier const &command) {
    switch (command.commandID) {
    case kSelectAll:
    case kCut:
    case kCopy:
    case kPaste:
    case kClear:
        return true;
    default:
        return false;
    }
}

EditOpInterface *EditOpInterface::GetActiveItemInterface(glogRec *glog) {
    return glog ? dynamic_cast<EditOpInterface *>(glog->GetCurItem()) : nullptr;
}

bool EditOpInterface::CanDoEditOp(glogRec *glog, CommandSpecifier const &command) {
    EditOpInterface *const item = GetActiveItemInterface(glog);
    return item && command.classID == kEditClass && item->CanDoOp(command);
}

bool EditOpInterface::DoEditOp(glogRec *glog, CommandSpecifier const &command, bool &commits) {
    EditOpInterface *const item = GetActiveItemInterface(glog);
    if (!item)
        return false;
    glog->GetCurItem()->Prepare();
    commits = false;
    switch (command.commandID) {
    case kSelectAll:
        item->SelectAll();
        return true;
    case kCut:
        item->Cut(commits);
        return true;
    case kCopy:
        item->Copy();
        return true;
    case kPaste:
        item->Paste(commits);
        return true;
    case kClear:
        return item->Clear(commits);
    default:
        return false;
    }
}
