// Reports the presses of push buttons to those who watch the desktop's messages.
#pragma once

class GlogPane;

// For ItemType::ReportedBy; without effect for a pane that is no push button.
void ReportPresses(GlogPane *);
