// What every item of a dialog may say, whatever its type.
#pragma once
#include "dialogs/KeyList.h"

class GlogPane;
class GlogStyleSheet;
class ItemType;

namespace CommonKeys {

// Layout, HelpTag, HelpTagText and Visible.
KeyList const &List();
// The keys within Layout.
KeyList const &LayoutList();
// Carries them out on a pane that was just made. Throws KeyFault.
void Apply(GlogPane *, ItemType const &, GlogStyleSheet *);

} // namespace CommonKeys
