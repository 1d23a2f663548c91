// Makes windows with panes from dialogs in files.
//
// A dialog is XML, as docs/glog.xsd describes it, or binary records (dialogs/RecordFile.h). The item types
// are those of dialogs/ItemRegistry.h. All calls need an open Desktop and throw std::logic_error without one;
// for whatever is wrong with a dialog they throw LoadError, and nothing half-made is left behind.
#pragma once
#include "desktop/Desktop.h"
#include "dialogs/LoadError.h"
#include <cstddef>
#include <string>
#include <string_view>

class CompoundPane;
struct glogRec;

// Makes the dialog's glog with all its panes, not shown yet. The desktop owns it until DisposeGlog. Which of
// the two forms the file has, its first bytes tell.
glogRec *LoadGlog(std::string const &path);
// The same from XML in memory, and from records; size and number of items come from the records, the rest
// from the options. `name` stands in messages for the file.
glogRec *LoadGlogFromText(std::string_view xml, std::string const &name);
glogRec *LoadGlogFromRecords(void const *bytes, std::size_t size, GlogOptions const &options = GlogOptions(),
                             std::string const &name = "records");

// Loads the dialog anew and shows it in the place of the glog, which is disposed of. When that fails the glog
// stays as it is.
glogRec *ReloadGlog(glogRec *shown, std::string const &path);

// Adds the panes of an XML dialog to a container of a glog that stands already, and starts them; what the
// dialog says about its own window is only checked. The glog is not drawn until the panes stand. When that
// fails the container stays as it is.
void LoadItems(std::string const &path, CompoundPane *into);

// What LoadGlog would make the XML dialog's window with.
GlogOptions ReadGlogOptions(std::string const &path);
