// What has to hold between any two events.
#pragma once

class StormDesktop;

namespace Soundness {

// Whether two panes of a window, or of a container in it, lie over each other. What one of them draws by
// itself, as a button does while it is pressed, is then drawn over the other one.
bool PanesOverlap(StormDesktop &);

// Ends the process, with a sentence, when something does not hold: panes know where they are, the current
// item is one of them, nothing is being tracked that is not pressed, no menu or dialog is left open, and
// drawing comes to an end.
void Check(StormDesktop &);

// Ends the process when a window cannot be described. Takes long where there are many panes.
void CheckDescription(StormDesktop &);

// Ends the process when a window does not show what was drawn, or a full redraw does not give what the
// redraws of damage have left.
void CheckRedraw(StormDesktop &);

} // namespace Soundness
