// The text type: UTF-16.
#pragma once
#include <cstddef>

// A string of UTF-16 code units, copied as a value. Lengths, indices and counts are units, not characters: a
// character beyond U+FFFF takes two.
class UString {
public:
    // How the bytes given to a constructor are to be read. 1: bytes up to 0x7F are ASCII, 0xC8 is the
    // right-pointing double angle mark (U+00BB).
    enum ByteEncoding { kByteEncoding1 = 1 };

    typedef char16_t Unit; // of UTF-16
    // Not found; also "to the end" where a count is wanted.
    static std::size_t const npos = static_cast<std::size_t>(-1);

    UString(); // empty
    // From bytes up to the first zero; null gives the empty string. The pointer is not kept.
    UString(char const *bytes, ByteEncoding);
    UString(UString const &);
    // A part of another string; cut at its end, and empty for a start beyond it.
    UString(UString const &, std::size_t start, std::size_t count);
    ~UString();

    bool empty() const;         // whether there is no unit
    std::size_t length() const; // in units
    void clear();               // makes it empty

    // Where the other string first occurs at or after the index; npos when it does not.
    std::size_t find(UString const &, std::size_t from) const;
    // A part of the string; cut at its end, and empty for a start beyond it.
    UString substr(std::size_t start, std::size_t count) const;
    // One unit. The index must be below the length; reading beyond it gives 0.
    Unit &operator[](std::size_t);
    Unit operator[](std::size_t) const;
    UString &operator+=(UString const &); // appends; also to itself
    UString &operator=(UString const &);

private:
    friend struct UStringUnits;
    struct Rep;
    Rep *rep;
};

// By code units; no normalisation, no regard to language.
bool operator==(UString const &, UString const &);
bool operator<(UString const &, UString const &);

namespace tarn {

// Whether the unit is below 0x80.
bool IsASCII(UString::Unit);
// Replaces letters by their capitals, by the rules of Unicode without regard to language. Every unit stays in
// its place: a letter whose capital is a sequence stays as it is.
void ToUpper(UString &);

enum NumFormat { kPlainNumber = 0 }; // decimal digits, with a minus when negative
// Replaces the string by the number.
void NumToUString(long long, NumFormat, UString &);

} // namespace tarn
