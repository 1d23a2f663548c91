#include "fuzz/storm/RandomText.h"

namespace {

char const *const kPlain[] = {"Level", "Chorus", "Drums in", "a", "Take 4 of the second verse",
                              "OK",    "-20 dB"};
char const *const kOdd[] = {"",
                            "-",
                            "0",
                            " ",
                            "&<>\"'",
                            "two\nlines",
                            "a\tb",
                            "\xC3\x9Ct\xC3\xB6ne \xE2\x80\xA6",
                            "\xF0\x9F\x8E\xB9\xF0\x9F\x91\xA9\xE2\x80\x8D\xF0\x9F\x9A\x80",
                            "\xD7\xA9\xD7\x9C\xD7\x95\xD7\x9D abc \xD7\xA2\xD7\x95",
                            "\xE0\xA4\x95\xE0\xA5\x8D\xE0\xA4\xB7\xE0\xA4\xBF",
                            "e\xCC\x81\xCC\x82\xCC\x83",
                            "\xE6\xBC\xA2\xE5\xAD\x97"};
int const kLongest = 400;

} // namespace

std::string RandomText::Of(Chance &chance) {
    if (!chance.OneIn(3))
        return chance.Of(kPlain);
    if (!chance.OneIn(6))
        return chance.Of(kOdd);
    std::string text;
    for (int rest = chance.Below(kLongest); rest > 0; rest -= 8)
        text += chance.OneIn(9) ? chance.Of(kOdd) : chance.Of(kPlain);
    return text;
}

std::string RandomText::Escaped(std::string const &utf8) {
    std::string escaped;
    for (char const c : utf8) {
        switch (c) {
        case '&':
            escaped += "&amp;";
            break;
        case '<':
            escaped += "&lt;";
            break;
        case '"':
            escaped += "&quot;";
            break;
        default:
            escaped += c;
        }
    }
    return escaped;
}
