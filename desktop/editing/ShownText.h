// A paragraph as it is given to be shaped.
#pragma once
#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

// UTF-8, and which of its bytes and characters stand for which of the paragraph's units. Lone surrogates,
// control characters, and more marks on a letter than any script has are shown as U+FFFD, line breaks within
// the paragraph as spaces.
class ShownText {
public:
    explicit ShownText(std::u16string_view);

    std::string const &Utf8() const { return utf8; }
    std::size_t Units() const { return units; }

    // Both take the end of the text too. Places within a character count as its start.
    int ByteOf(std::size_t unit) const;
    std::size_t CharacterOf(std::size_t unit) const;
    // The first unit of the character that begins at the byte, or of the one of that number.
    std::size_t UnitOfByte(int byte) const;
    std::size_t UnitOfCharacter(std::size_t character) const;

private:
    void Add(std::size_t unitCount, char32_t shown);

    std::size_t units;
    std::string utf8;
    // Of each unit, and of the end. Empty while everything is ASCII: then all numbers are the same.
    std::vector<std::uint32_t> bytes, characters;
};
