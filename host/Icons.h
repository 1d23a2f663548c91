// Icons: small pictures, each an index in a family, and a family a resource number.
//
// All icons are drawn over what is beneath, sharp at the window's scale, at whole pixels. Drawing them needs
// black on white as the port's colours (ClearColors). An index or family that has no artwork is drawn as the
// mark for a missing icon.
#pragma once
#include "host/Geometry.h"

class OSRgn;

// Draws the icon with its top left corner at the point.
void Draw1Icon(short family, short index, short h, short v);
// Draws the icon into the rectangle: at its own size when the rectangle has that size, else stretched to it.
void Draw1Icon(short family, short index, Rect const &);

// Size of the family's icons, as a rectangle whose top left is (0, 0). Single icons may be of
// another size than their family's. An unknown family answers the size of the missing-icon mark.
Rect GetIconBounds(short family);
// The icon's visible pixels, with its top left corner at (0, 0). The region stays the host's; a copy is
// wanted for keeping or moving it.
OSRgn const &GetIconRegion(short family, short index);

// Fills the rectangle with copies of the icon, side by side from the top left corner, each taking the given
// width and height; those at the right and bottom edges are cut off. Nothing is drawn for a tile size
// below 1.
void TileIcon(Rect const *, short family, short index, short tileWidth, short tileHeight);
// Fills the rectangle from three icons of the family, beginning with the first index: the left cap, the
// middle, repeated as often as it takes, and the right cap, all as high as the rectangle. When it is narrower
// than both caps each gets half of it.
void TileIconInRectWithEndCaps(OS::RectBase<OS::RectTag> const &, short family, short firstIndex);
