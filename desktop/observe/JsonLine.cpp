#include "desktop/observe/JsonLine.h"
#include "desktop/resources/Utf.h"
#include <charconv>
#include <cmath>
#include <cstdio>
#include <iterator>

namespace {

void AppendEscaped(std::string &out, std::string const &utf8) {
    out += '"';
    for (char c : utf8) {
        switch (c) {
        case '"':
            out += "\\\"";
            break;
        case '\\':
            out += "\\\\";
            break;
        case '\n':
            out += "\\n";
            break;
        case '\t':
            out += "\\t";
            break;
        case '\r':
            out += "\\r";
            break;
        default:
            if (static_cast<unsigned char>(c) < 0x20) {
                char code[8];
                std::snprintf(code, sizeof code, "\\u%04x",
                              static_cast<unsigned>(static_cast<unsigned char>(c)));
                out += code;
            } else {
                out += c;
            }
        }
    }
    out += '"';
}

} // namespace

void JsonLine::Key(char const *key) {
    text += text.empty() ? '{' : ',';
    AppendEscaped(text, key);
    text += ':';
}

JsonLine &JsonLine::Text(char const *key, std::string const &utf8) {
    Key(key);
    AppendEscaped(text, utf8);
    return *this;
}

JsonLine &JsonLine::Text(char const *key, UString const &value) { return Text(key, Utf::ToUtf8(value)); }

JsonLine &JsonLine::Integer(char const *key, long long value) {
    Key(key);
    text += std::to_string(value);
    return *this;
}

JsonLine &JsonLine::Number(char const *key, double value) {
    Key(key);
    text += Shortest(value);
    return *this;
}

std::string JsonLine::Shortest(double value) {
    if (!std::isfinite(value))
        return "null"; // JSON has no infinities
    char digits[32];
    char *end = digits;
    for (int precision = 1; precision <= 17; ++precision) {
        end = std::to_chars(digits, std::end(digits), value, std::chars_format::general, precision).ptr;
        double read = 0;
        if (std::from_chars(digits, end, read).ec == std::errc() && read == value)
            break;
    }
    return std::string(digits, end);
}

JsonLine &JsonLine::Flag(char const *key, bool value) {
    Key(key);
    text += value ? "true" : "false";
    return *this;
}

JsonLine &JsonLine::Box(char const *key, Rect const &r) {
    Key(key);
    text += '[' + std::to_string(r.top) + ',' + std::to_string(r.left) + ',' + std::to_string(r.bottom) +
            ',' + std::to_string(r.right) + ']';
    return *this;
}

JsonLine &JsonLine::Spot(char const *key, Point p) {
    Key(key);
    text += '[' + std::to_string(p.v) + ',' + std::to_string(p.h) + ']';
    return *this;
}

JsonLine &JsonLine::Raw(char const *key, std::string const &json) {
    Key(key);
    text += json;
    return *this;
}

std::string JsonLine::Finish() const { return text.empty() ? "{}" : text + '}'; }
