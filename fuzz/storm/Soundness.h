// What has to hold between any two events.
#pragma once

class StormDesktop;

namespace Soundness {

// Whether two panes of a window, or of a container in it, lie over each other. What one of them draws by
// itself, as a button does while it is pressed, is then drawn over the other one.
bool PanesOverlap(StormDesktop &);

// Ends the process, with a sentence, when something does not hold: panes know where they are, the current
// item is one of them, nothing is being tracked that is not pressed, no menu or dialog is left open, every
// window shows what was drawn, and, with `pixels`, a full redraw gives what the redraws of damage have left.
void Check(StormDesktop &, bool pixels);

// Ends the process when a full redraw does not give what the redraws of damage have left.
void CheckRedraw(StormDesktop &);

} // namespace Soundness
