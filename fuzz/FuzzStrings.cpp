// Strings: between UTF-8 and UTF-16, their operations, and how they are written to JSON.
#include "desktop/observe/JsonLine.h"
#include "desktop/resources/Utf.h"
#include "desktop/type/TextSanitizer.h"
#include "fuzz/support/Entry.h"
#include "fuzz/support/Require.h"
#include <algorithm>
#include <cmath>
#include <cstdlib>
#include <cstring>
#include <string>
#include <string_view>

namespace {

std::u16string UnitsFrom(std::uint8_t const *data, std::size_t size) {
    std::u16string units(size / sizeof(char16_t), u'\0');
    if (!units.empty())
        std::memcpy(&units[0], data, units.size() * sizeof(char16_t));
    return units;
}

void CheckEncodings(std::string_view bytes, UString const &units) {
    UString const text = Utf::FromUtf8(bytes);
    Require(text.length() <= bytes.size(), "a byte never gives more than one unit");
    Require(Utf::FromUtf8(Utf::ToUtf8(text)) == text, "what was UTF-8 comes back as it was");
    Require(Utf::FromUtf8(Utf::ToUtf8(units)).length() == units.length(),
            "a lone surrogate is replaced by one unit");
}

void CheckOperations(UString const &text, std::uint8_t first, std::uint8_t second) {
    std::size_t const length = text.length();
    UString const part = text.substr(first, second);
    Require(part.length() <= second && part.length() <= length, "a part is no longer than was asked for");
    Require(part.empty() || text.find(part, 0) <= first, "a part is found where it is, or before");
    UString whole = text.substr(0, first);
    whole += text.substr(first, UString::npos);
    Require(whole == text, "two parts make the whole");
    whole += whole;
    Require(whole.length() == 2 * length, "a string can be appended to itself");
    UString capitals = text;
    tarn::ToUpper(capitals);
    Require(capitals.length() == length, "capitals take the same places");
    Require(text[length] == 0, "beyond the end there is nothing");
    Require(!(text < text), "no string comes before itself");
}

// Of text between quotes, as JsonLine escapes it.
std::string Unescaped(std::string const &json) {
    std::string text;
    for (std::size_t i = 0; i < json.size(); ++i) {
        if (json[i] != '\\') {
            text += json[i];
            continue;
        }
        switch (json.at(++i)) {
        case 'n':
            text += '\n';
            break;
        case 't':
            text += '\t';
            break;
        case 'r':
            text += '\r';
            break;
        case 'u':
            text += static_cast<char>(std::stoi(json.substr(i + 1, 4), nullptr, 16));
            i += 4;
            break;
        default:
            text += json[i];
        }
    }
    return text;
}

void CheckJson(std::string const &utf8) {
    std::string const line = JsonLine().Text("k", utf8).Finish();
    std::string const start = "{\"k\":\"", end = "\"}";
    Require(line.size() >= start.size() + end.size() && line.compare(0, start.size(), start) == 0 &&
                line.compare(line.size() - end.size(), end.size(), end) == 0,
            "a line has its key and both braces");
    Require(
        std::none_of(line.begin(), line.end(), [](char c) { return static_cast<unsigned char>(c) < 0x20; }),
        "a line has no control characters");
    Require(Unescaped(line.substr(start.size(), line.size() - start.size() - end.size())) == utf8,
            "what was written reads back the same");
}

void CheckNumber(std::uint8_t const *data, std::size_t size) {
    double value = 0;
    std::memcpy(&value, data, std::min(size, sizeof value));
    std::string const written = JsonLine::Shortest(value);
    Require(std::isfinite(value) ? std::strtod(written.c_str(), nullptr) == value : written == "null",
            "a number reads back the same");
}

void CheckShapable(std::string const &utf8, bool mayBreak) {
    auto const isControl = [=](char c) {
        return static_cast<unsigned char>(c) < 0x20 && c != '\t' && !(mayBreak && c == '\n');
    };
    Require(std::none_of(utf8.begin(), utf8.end(), isControl), "text to be shaped has no control characters");
    Require(Utf::ToUtf8(Utf::FromUtf8(utf8)) == utf8, "text to be shaped is UTF-8");
}

} // namespace

int LLVMFuzzerTestOneInput(std::uint8_t const *data, std::size_t size) {
    if (size < 2)
        return 0;
    std::uint8_t const first = data[0], second = data[1];
    data += 2;
    size -= 2;
    std::string_view const bytes(reinterpret_cast<char const *>(data), size);
    std::u16string const raw = UnitsFrom(data, size);
    UString const units = Utf::FromUnits(raw);
    CheckEncodings(bytes, units);
    CheckOperations(units, first, second);
    CheckJson(std::string(bytes));
    CheckNumber(data, size);
    CheckShapable(TextSanitizer::OneLine(raw), false);
    CheckShapable(TextSanitizer::Lines(raw), true);
    return 0;
}
