#include "desktop/panes/StoredWindows.h"
#include "desktop/Desktop.h"
#include "desktop/resources/Resources.h"
#include "host/glogRec.h"
#include <exception>

namespace {

StoredWindows::Maker theMaker = nullptr;

} // namespace

void StoredWindows::SetMaker(Maker maker) { theMaker = maker; }

glogRec *StoredWindows::Open(short resource) try {
    std::string const path = Resources::Instance().Find("windows/" + std::to_string(resource) + ".xml");
    return theMaker && !path.empty() ? theMaker(path) : nullptr;
} catch (std::exception const &) {
    return nullptr; // who wants the reason loads the file as a dialog
}

glogRec *LowLevelGlogOpening::NewGlog(short resource, TarnOSWindow::OSWindow::SendBehindArg, bool,
                                      ContainerGlog *) {
    return Desktop::Current() ? StoredWindows::Open(resource) : nullptr;
}
