#include "desktop/panes/StoredWindows.h"
#include "desktop/Desktop.h"
#include "desktop/resources/Resources.h"
#include "desktop/resources/XmlFile.h"
#include "host/glogRec.h"
#include <algorithm>
#include <exception>

namespace {

int const kLargestSide = 16000; // pixels

StoredWindows::Maker theMaker = nullptr;

// A window without panes needs nobody who reads dialogs; null for one that has some.
glogRec *MakeEmpty(std::string const &path) {
    XmlFile const file = XmlFile::Read(path);
    file.RequireRoot("Glog");
    XmlNode const &root = file.Root();
    if (!std::all_of(root.children.begin(), root.children.end(),
                     [](XmlNode const &child) { return child.name == "Items" && child.children.empty(); }))
        return nullptr;
    auto const text = [&](char const *name) {
        std::string const *const value = root.Attribute(name);
        return value ? *value : std::string();
    };
    auto const side = [&](char const *name) {
        return static_cast<int>(file.RequireInteger(root, name, 1, kLargestSide));
    };
    return Desktop::Current()->NewGlog(GlogOptions()
                                           .Title(text("title"))
                                           .Size(side("width"), side("height"))
                                           .Growable(text("growable") == "yes")
                                           .Popup(text("popup") == "yes"));
}

} // namespace

void StoredWindows::SetMaker(Maker maker) { theMaker = maker; }

glogRec *StoredWindows::Open(short resource) try {
    std::string const path = Resources::Instance().Find("windows/" + std::to_string(resource) + ".xml");
    if (path.empty())
        return nullptr;
    return theMaker ? theMaker(path) : MakeEmpty(path);
} catch (std::exception const &) {
    return nullptr; // who wants the reason loads the file as a dialog
}

glogRec *LowLevelGlogOpening::NewGlog(short resource, TarnOSWindow::OSWindow::SendBehindArg, bool,
                                      ContainerGlog *) {
    return Desktop::Current() ? StoredWindows::Open(resource) : nullptr;
}
