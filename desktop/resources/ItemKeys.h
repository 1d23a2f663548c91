// The inner keys of rectangles and points in an item tree.
#pragma once

namespace XMLLib {

// A rectangle is a container with these four integers, a point one with the other two.
constexpr char kRectTopKey[] = "kTop";
constexpr char kRectLeftKey[] = "kLeft";
constexpr char kRectBottomKey[] = "kBottom";
constexpr char kRectRightKey[] = "kRight";
constexpr char kPointVKey[] = "kV";
constexpr char kPointHKey[] = "kH";

} // namespace XMLLib
