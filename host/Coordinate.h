// From a pane's coordinates to those of its window.
#pragma once
#include "host/Geometry.h"

class GlogPane;

namespace Coordinate {

// The window's coordinates begin at the top left of its content. The pane must be attached to a glog.
OS::RectBase<OS::RectTag> PaneToWindow(GlogPane &, OS::RectBase<OS::RectTag> const &);
OS::Point PaneToWindow(GlogPane &, OS::Point const &);

} // namespace Coordinate
