// The font that text calls without a font of their own use.
#pragma once
#include "desktop/type/FontSpec.h"
#include "host/OSFont.h"

namespace PortFont {

// The current port's. Without a port, what was set last without one: panes measure text before there is a
// window. Font 0 of the font table at first.
FontSpec Current();
void Set(OS::Font::FamilyID const &, int face, short size);

} // namespace PortFont
