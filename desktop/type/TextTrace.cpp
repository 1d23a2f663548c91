#include "desktop/type/TextTrace.h"
#include "desktop/drawing/Colors.h"
#include "desktop/drawing/DrawingPort.h"
#include "desktop/observe/DrawingTrace.h"
#include "desktop/type/FontFamilies.h"
#include <string>

namespace {

char const *NameOf(TextSettings::Alignment alignment) {
    switch (alignment) {
    case TextSettings::kAlignRight:
        return "right";
    case TextSettings::kAlignCenter:
        return "center";
    case TextSettings::kAlignLeft:
        return "left";
    default:
        return "default";
    }
}

char const *NameOf(TextSettings::TruncateCode truncation) {
    switch (truncation) {
    case TextSettings::kTruncateEnd:
        return "end";
    case TextSettings::kTruncateMiddle:
        return "middle";
    default:
        return "none";
    }
}

} // namespace

JsonLine TextTrace::Call(char const *operation, UString const &text) {
    return DrawingTrace::Call(operation).Text("text", text);
}

void TextTrace::AddLook(JsonLine &line, FontSpec const &font) {
    line.Text("family", FontFamilies::NameOf(font.family))
        .Integer("face", font.face)
        .Integer("size", font.size);
    DrawingPort const *port = DrawingPort::CurrentPort();
    if (!port)
        return;
    RGBColor const fore = ToRGB(port->State().fore);
    line.Raw("fore", '[' + std::to_string(fore.red) + ',' + std::to_string(fore.green) + ',' +
                         std::to_string(fore.blue) + ']');
}

void TextTrace::AddAlignment(JsonLine &line, TextSettings::Alignment alignment) {
    line.Text("alignment", std::string(NameOf(alignment)));
}

void TextTrace::AddTruncation(JsonLine &line, TextSettings::TruncateCode truncation) {
    line.Text("truncation", std::string(NameOf(truncation)));
}
