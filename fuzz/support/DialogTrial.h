// Dialogs of unknown content, put to use.
#pragma once
#include <functional>
#include <string>

struct glogRec;

namespace DialogTrial {

// The name that dialogs have in messages.
extern std::string const kName;

// Calls `load` on a simulated desktop that stays open. A dialog that loads is shown, drawn, clicked,
// described and disposed of; one that does not has to say why in a LoadError with its name. Either way
// nothing may be left on the desktop.
void Run(std::function<glogRec *()> const &load);

} // namespace DialogTrial
