// What the creators of panes share when they read an item of a dialog.
#pragma once
#include "host/Geometry.h"
#include "host/UString.h"
#include "host/XMLLib.h"
#include <boost/shared_ptr.hpp>

// A key as resources spell it; the literal has to be plain ASCII.
inline UString ResourceKey(char const *ascii) { return UString(ascii, UString::kByteEncoding1); }

// The rectangle stored under the key, all zero when the item has none. A null item fails the assertion of its
// pointer.
Rect OptionalRect(boost::shared_ptr<XMLLib::ContainerItem> const &item, char const *key);

// The point stored under the key, (0, 0) when the item has none. A null item fails the assertion of its
// pointer.
Point OptionalPoint(boost::shared_ptr<XMLLib::ContainerItem> const &item, char const *key);
