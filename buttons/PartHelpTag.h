// Help tags for the parts of a pane.
#pragma once
#include "host/Geometry.h"
#include "host/LocalizedStrings.h"

class GlogPane;
class MultiHelpTagHelper;

// What keeps the tags for the parts of the pane, made when there is none; it replaces whatever the pane
// showed as a whole. Null when the program has given the pane a helper of its own. Stays the pane's.
MultiHelpTagHelper *PartHelpTags(GlogPane &);

// Shows the tag for the rectangle, in pane coordinates, from now on. A tag that is null adds nothing. The tag
// stays the host's.
void AttachPartHelpTag(GlogPane &, LocalizedStrings::HelpTag const *, Rect const &);
