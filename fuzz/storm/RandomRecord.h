// Binary records of panes that nobody would write.
#pragma once
#include "fuzz/storm/Chance.h"
#include "host/Geometry.h"
#include <string>

namespace RandomRecord {

// A binary dialog of one record, of any kind there is, at about this place. Not all can be loaded.
std::string Of(Chance &, Rect const &place);

} // namespace RandomRecord
