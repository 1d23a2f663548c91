// Events of the window system as panes and filters see them.
#pragma once
#include "desktop/windows/InputEvent.h"
#include "host/EventRecordAdapter.h"

namespace EventRecords {

// Presses, releases and keys; places in window coordinates.
void Fill(EventRecordAdapter &, InputEvent const &);
EventRecordAdapter Of(InputEvent const &);
// The place, cut to what coordinates reach.
Point PlaceOf(InputEvent const &);

} // namespace EventRecords
