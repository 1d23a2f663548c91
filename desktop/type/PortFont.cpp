#include "desktop/type/PortFont.h"
#include "desktop/drawing/DrawingPort.h"

namespace {

struct LooseFont {
    bool set = false;
    OS::Font::FamilyID family;
    int face = 0;
    short size = 0;
};

// What is set while there is no port.
LooseFont &FontWithoutPort() {
    static LooseFont font;
    return font;
}

FontSpec SpecOf(OS::Font::FamilyID const &family, int face, short size) {
    return FontSpec::Make(family.GetOrderedFontID(), face, size);
}

} // namespace

FontSpec PortFont::Current() {
    if (DrawingPort const *port = DrawingPort::CurrentPort()) {
        GraphicsState const &state = port->State();
        return SpecOf(state.textFamily, state.textFace, state.textSize);
    }
    LooseFont const &font = FontWithoutPort();
    if (font.set)
        return SpecOf(font.family, font.face, font.size);
    fontSaveRec const *first = GetIndVelaFont(0);
    return SpecOf(first->family, first->face, first->size);
}

void PortFont::Set(OS::Font::FamilyID const &family, int face, short size) {
    if (DrawingPort *port = DrawingPort::CurrentPort()) {
        GraphicsState &state = port->State();
        state.textFamily = family;
        state.textFace = face;
        state.textSize = size;
        return;
    }
    FontWithoutPort() = {true, family, face, size};
}
