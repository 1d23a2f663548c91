#include "host/UString.h"
#include "desktop/resources/Utf.h"
#include <algorithm>
#include <boost/assert.hpp>
#include <cstdint>
#include <cstring>
#include <limits>
#include <new>
#include <stdexcept>
#include <string>
#include <string_view>
#include <unicode/uchar.h>
#include <unicode/utf16.h>

// A block of units with their number before them. The empty string has no block, unless it kept one for
// reuse.
struct UString::Rep {
    std::uint32_t length;
    std::uint32_t capacity;
    Unit *Units() { return reinterpret_cast<Unit *>(this + 1); }

    static Rep *Make(std::size_t capacity) {
        if (capacity > std::numeric_limits<std::uint32_t>::max())
            throw std::length_error("a string of more than 4294967295 units");
        void *block = ::operator new(sizeof(Rep) + capacity * sizeof(Unit));
        return new (block) Rep{0, static_cast<std::uint32_t>(capacity)};
    }
    static Rep *Copy(std::u16string_view units) {
        if (units.empty())
            return nullptr;
        Rep *rep = Make(units.size());
        rep->Append(units);
        return rep;
    }
    static void Dispose(Rep *rep) { ::operator delete(rep); }

    // The room must be there. The units may be the string's own.
    void Append(std::u16string_view units) {
        if (units.empty())
            return; // an empty view may have no units to point at
        std::memcpy(Units() + length, units.data(), units.size() * sizeof(Unit));
        length += static_cast<std::uint32_t>(units.size());
    }
};

namespace {

constexpr UString::Unit kReplacement = 0xFFFD;
constexpr unsigned char kFirstNonAscii = 0x80;
// The one byte above ASCII that has a meaning: the right-pointing double angle mark.
constexpr unsigned char kDoubleAngleByte = 0xC8;
constexpr UString::Unit kDoubleAngle = 0x00BB;

UString::Unit UnitOfByte(unsigned char byte) {
    if (byte < kFirstNonAscii)
        return byte;
    return byte == kDoubleAngleByte ? kDoubleAngle : kReplacement;
}

} // namespace

std::size_t const UString::npos;

UString::UString()
    : rep(nullptr) {}

UString::UString(char const *bytes, ByteEncoding)
    : rep(nullptr) {
    std::size_t const count = bytes ? std::strlen(bytes) : 0;
    if (!count)
        return;
    rep = Rep::Make(count);
    rep->length = static_cast<std::uint32_t>(count);
    std::transform(bytes, bytes + count, rep->Units(),
                   [](char c) { return UnitOfByte(static_cast<unsigned char>(c)); });
}

UString::UString(UString const &other)
    : rep(Rep::Copy(Utf::View(other))) {}

UString::UString(UString const &other, std::size_t start, std::size_t count)
    : rep(nullptr) {
    std::u16string_view const units = Utf::View(other);
    if (start < units.size())
        rep = Rep::Copy(units.substr(start, count));
}

UString::~UString() { Rep::Dispose(rep); }

bool UString::empty() const { return length() == 0; }

std::size_t UString::length() const { return rep ? rep->length : 0; }

void UString::clear() {
    if (rep)
        rep->length = 0;
}

std::size_t UString::find(UString const &part, std::size_t from) const {
    static_assert(npos == std::u16string_view::npos, "both say the same when nothing is found");
    return Utf::View(*this).find(Utf::View(part), from);
}

UString UString::substr(std::size_t start, std::size_t count) const { return UString(*this, start, count); }

UString::Unit &UString::operator[](std::size_t index) {
    BOOST_ASSERT(index < length());
    return rep->Units()[index];
}

UString::Unit UString::operator[](std::size_t index) const {
    return index < length() ? rep->Units()[index] : Unit(0);
}

UString &UString::operator+=(UString const &other) {
    std::u16string_view const added = Utf::View(other);
    if (added.empty())
        return *this;
    std::size_t const total = length() + added.size();
    if (rep && total <= rep->capacity) {
        rep->Append(added);
        return *this;
    }
    Rep *larger = Rep::Make(std::max(total, length() * 2));
    larger->Append(Utf::View(*this));
    larger->Append(added);
    Rep::Dispose(rep);
    rep = larger;
    return *this;
}

UString &UString::operator=(UString const &other) {
    if (this == &other)
        return *this;
    std::u16string_view const units = Utf::View(other);
    if (rep && units.size() <= rep->capacity) {
        rep->length = 0;
        rep->Append(units);
        return *this;
    }
    Rep *copy = Rep::Copy(units);
    Rep::Dispose(rep);
    rep = copy;
    return *this;
}

bool operator==(UString const &a, UString const &b) { return Utf::SameUnits(Utf::View(a), Utf::View(b)); }

bool operator<(UString const &a, UString const &b) { return Utf::View(a) < Utf::View(b); }

// Lets Utf reach the units.
struct UStringUnits {
    static std::u16string_view View(UString const &text) {
        return text.rep ? std::u16string_view(text.rep->Units(), text.rep->length) : std::u16string_view();
    }
    static UString Make(std::u16string_view units) {
        UString text;
        text.rep = UString::Rep::Copy(units);
        return text;
    }
};

std::u16string_view Utf::View(UString const &text) { return UStringUnits::View(text); }

UString Utf::FromUnits(std::u16string_view units) { return UStringUnits::Make(units); }

bool tarn::IsASCII(UString::Unit unit) { return unit < kFirstNonAscii; }

void tarn::ToUpper(UString &text) {
    std::u16string_view const units = Utf::View(text);
    std::u16string upper;
    upper.reserve(units.size());
    for (std::size_t i = 0; i < units.size();) {
        UChar32 character;
        U16_NEXT(units.data(), i, units.size(), character);
        // The character's own capital, never a sequence: searches compare the capitals and then cut the text
        // at the places they found, so every unit must stay where it was.
        UChar32 const capital = u_toupper(character);
        UChar32 const kept = U16_LENGTH(capital) == U16_LENGTH(character) ? capital : character;
        if (U_IS_BMP(kept)) {
            upper += static_cast<UString::Unit>(kept);
        } else {
            upper += U16_LEAD(kept);
            upper += U16_TRAIL(kept);
        }
    }
    text = Utf::FromUnits(upper);
}

void tarn::NumToUString(long long number, NumFormat, UString &out) {
    out = UString(std::to_string(number).c_str(), UString::kByteEncoding1);
}
