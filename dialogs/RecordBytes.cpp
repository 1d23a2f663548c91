#include "dialogs/RecordBytes.h"

RecordBytes::RecordBytes(unsigned char const *bytes_, std::size_t size_, LoadError::Place const &place)
    : bytes(bytes_)
    , size(size_)
    , start(place) {}

LoadError::Place RecordBytes::Place() const {
    LoadError::Place place = start;
    place.byte += static_cast<long long>(at);
    return place;
}

unsigned char RecordBytes::Byte() {
    if (at == size)
        throw LoadError(Place(),
                        "the record ends after " + std::to_string(size) + " bytes, before it is complete");
    return bytes[at++];
}

short RecordBytes::Short() {
    unsigned const low = Byte();
    unsigned const high = Byte();
    return static_cast<short>(high << 8 | low);
}

int RecordBytes::Long() {
    unsigned const low = static_cast<unsigned short>(Short());
    unsigned const high = static_cast<unsigned short>(Short());
    return static_cast<int>(high << 16 | low);
}

Point RecordBytes::ReadPoint() {
    short const v = Short();
    short const h = Short();
    return Point{v, h};
}

Rect RecordBytes::ReadRect() {
    Rect rect;
    rect.top = Short();
    rect.left = Short();
    rect.bottom = Short();
    rect.right = Short();
    return rect;
}

std::string RecordBytes::Rest() {
    std::string const rest(bytes + at, bytes + size);
    at = size;
    return rest;
}

void RecordBytes::Skip(std::size_t count) {
    for (std::size_t i = 0; i < count; ++i)
        Byte();
}
