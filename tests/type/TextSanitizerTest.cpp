#include "desktop/type/TextSanitizer.h"
#include <gtest/gtest.h>

namespace {

constexpr char kReplacement[] = "\xEF\xBF\xBD";

TEST(TextSanitizer, TurnsLineBreaksOfEveryKindIntoSpacesInOneLine) {
    EXPECT_EQ(TextSanitizer::OneLine(u"a\rb\nc\r\nd\u2028e\u2029f\u0085g\vh\fi"), "a b c d e f g h i");
}

TEST(TextSanitizer, TurnsLineBreaksOfEveryKindIntoLineFeeds) {
    EXPECT_EQ(TextSanitizer::Lines(u"a\rb\nc\r\nd\u2028e\u2029f"), "a\nb\nc\nd\ne\nf");
    EXPECT_EQ(TextSanitizer::Lines(u"\r\r\n\n"), "\n\n\n");
}

TEST(TextSanitizer, ReplacesZeroesAndControlCharacters) {
    std::u16string const text = {u'a', u'\0', u'b', u'\x01', u'\x7F', u'\x9F', u'c'};
    EXPECT_EQ(TextSanitizer::OneLine(text),
              std::string("a") + kReplacement + "b" + kReplacement + kReplacement + kReplacement + "c");
}

TEST(TextSanitizer, KeepsTabs) { EXPECT_EQ(TextSanitizer::OneLine(u"a\tb"), "a\tb"); }

TEST(TextSanitizer, ReplacesLoneSurrogatesAndKeepsPairs) {
    std::u16string const text = {char16_t(0xD834), u'x', char16_t(0xDD1E), char16_t(0xD834),
                                 char16_t(0xDD1E)};
    EXPECT_EQ(TextSanitizer::OneLine(text),
              std::string(kReplacement) + "x" + kReplacement + "\xF0\x9D\x84\x9E");
}

TEST(TextSanitizer, CutsALineThatReachesBeyondAnyWindow) {
    EXPECT_EQ(TextSanitizer::OneLine(std::u16string(100000, u'x')).size(), TextSanitizer::kMaxLineUnits);
}

} // namespace
