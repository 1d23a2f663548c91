// Windows by number, from resource files.
#pragma once
#include <string>

struct glogRec;

// windows/NUMBER.xml in the resources' directories is a dialog. Whoever reads dialogs says so here; those
// without panes are opened without him too.
namespace StoredWindows {

// Makes an invisible glog with its panes from a file; throws std::exception for one that is broken.
typedef glogRec *(*Maker)(std::string const &path);
void SetMaker(Maker); // null: nobody can any more

// The glog of the resource. Null without one, for a file that is broken, and for panes that nobody can make.
glogRec *Open(short resource);

} // namespace StoredWindows
