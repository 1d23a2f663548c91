// Help tags for the parts of a pane.
#pragma once
#include "host/Geometry.h"
#include "host/LocalizedStrings.h"

class GlogPane;

// Shows the tag for the rectangle, in pane coordinates, from now on. The first one replaces whatever the pane
// showed as a whole; a tag that is null adds nothing. The tag stays the host's.
void AttachPartHelpTag(GlogPane &, LocalizedStrings::HelpTag const *, Rect const &);
