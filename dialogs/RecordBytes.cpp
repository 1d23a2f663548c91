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

int RecordBytes::Within(LoadError::Place place, char const *key, int value, int smallest, int largest) {
    if (value >= smallest && value <= largest)
        return value;
    place.key = key;
    throw LoadError(place, "expected an integer from " + std::to_string(smallest) + " to " +
                               std::to_string(largest) + ", found " + std::to_string(value));
}

short RecordBytes::Short(char const *key, int smallest, int largest) {
    LoadError::Place const place = Place();
    return static_cast<short>(Within(place, key, Short(), smallest, largest));
}

int RecordBytes::Long(char const *key, int smallest, int largest) {
    LoadError::Place const place = Place();
    return Within(place, key, Long(), smallest, largest);
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
