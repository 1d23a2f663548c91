// A point in a cube whose coordinates a label shows while it is dragged.
#pragma once

class ItemType;

namespace PannerPane {

// With all keys of a ThreeD, and "TextID", the number of the label.
ItemType Type();

} // namespace PannerPane
