#include "desktop/resources/XmlText.h"
#include <unicode/utf8.h>

void XmlPlace::MoveTo(std::size_t offset) {
    for (; place < offset && place < text.size(); ++place) {
        unsigned char const byte = static_cast<unsigned char>(text[place]);
        if (byte == '\n') {
            ++line;
            column = 1;
        } else if (!U8_IS_TRAIL(byte)) {
            ++column;
        }
    }
}

XmlTextFault FindXmlTextFault(std::string_view text) {
    auto const bytes = reinterpret_cast<unsigned char const *>(text.data());
    std::size_t const size = text.size();
    for (std::size_t i = 0; i < size;) {
        std::size_t const start = i;
        UChar32 character;
        U8_NEXT(bytes, i, size, character);
        if (character < 0)
            return {start, "this is not UTF-8"};
        bool const allowed = character >= 0x20 || character == '\t' || character == '\n' || character == '\r';
        if (!allowed)
            return {start, "a control character is not allowed in XML"};
    }
    return {0, std::string()};
}
