// The bytes of one binary record.
#pragma once
#include "dialogs/LoadError.h"
#include "host/Geometry.h"
#include <cstddef>
#include <string>

// Read from front to back, numbers with their low byte first. Reading beyond the end throws a LoadError that
// names the record and the byte.
class RecordBytes {
public:
    // The bytes stay the caller's and must outlive this object. `place` names the record and the offset of
    // its first byte.
    RecordBytes(unsigned char const *bytes, std::size_t size, LoadError::Place const &place);

    unsigned char Byte(); // the next 8 bits
    short Short();        // the next 16
    int Long();           // the next 32
    // The same, but a number outside of the limits, which are both allowed, throws a LoadError under the key.
    short Short(char const *key, int smallest, int largest);
    int Long(char const *key, int smallest, int largest);
    Point ReadPoint();                             // v, then h
    Rect ReadRect();                               // top, left, bottom, right
    std::string Rest();                            // what is left, as a text in UTF-8
    void Skip(std::size_t count);                  // leaves out bytes
    std::size_t Left() const { return size - at; } // how many bytes are still to be read

    // The place of the next byte.
    LoadError::Place Place() const;

private:
    static int Within(LoadError::Place, char const *key, int value, int smallest, int largest);

    unsigned char const *bytes;
    std::size_t size;
    std::size_t at = 0;
    LoadError::Place start;
};
