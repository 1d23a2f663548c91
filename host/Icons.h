#pragma once
#include "host/Geometry.h"
class OSRgn;

void Draw1Icon(short family, short index, short h, short v);
void Draw1Icon(short family, short index, Rect const &);
Rect GetIconBounds(short family);

OSRgn const &GetIconRegion(short family, short index);

void TileIcon(Rect const *, short family, short index, short tileWidth, short tileHeight);

void TileIconInRectWithEndCaps(OS::RectBase<OS::RectTag> const &, short family, short firstIndex);
