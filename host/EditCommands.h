// The commands of an Edit menu, from the keyboard to the pane that has it.
#pragma once
#include "host/CommandSpecifier.h"

struct glogRec;

namespace EditCommands {

// Carries a command out on the glog's current item; false when that cannot. The flag becomes true when the
// pane counts as hit by it. The glog is not null.
typedef bool (*Handler)(glogRec *, CommandSpecifier const &, bool &commits);

// Sets who carries commands out, once for the process: a second handler has no effect. The panes that know
// these commands see to it themselves.
void Install(Handler);
// Whether the command was carried out; false without a handler.
bool Run(glogRec *, CommandSpecifier const &, bool &commits);
// The command that a key stands for, by its character and the modifiers of its event: command or control with
// X, C, V and A. A command of class 0 for any other key.
CommandSpecifier OfKey(int key, unsigned short modifiers);

} // namespace EditCommands
