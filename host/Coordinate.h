#pragma once
#include "host/Geometry.h"
class GlogPane;
namespace Coordinate {

OS::RectBase<OS::RectTag> PaneToWindow(GlogPane &, OS::RectBase<OS::RectTag> const &);
OS::Point PaneToWindow(GlogPane &, OS::Point const &);
}
