#include "host/UString.h"
#include "tests/resources/Text.h"
#include <gtest/gtest.h>
#include <new>
#include <stdexcept>
#include <string>

namespace {

UString FromBytes(char const *bytes) { return UString(bytes, UString::kByteEncoding1); }

TEST(UString, IsEmptyAtFirst) {
    UString const text;
    EXPECT_TRUE(text.empty());
    EXPECT_EQ(text.length(), 0u);
}

TEST(UString, ReadsAsciiBytesAsTheyAre) { EXPECT_EQ(Utf::ToUtf8(FromBytes("BoundsRect")), "BoundsRect"); }

TEST(UString, ReadsTheOneByteAboveAsciiThatHasAMeaning) {
    UString const text = FromBytes("\xC8");
    ASSERT_EQ(text.length(), 1u);
    EXPECT_EQ(text[0], u'\u00BB');
}

TEST(UString, ReadsOtherBytesAboveAsciiAsReplacements) {
    UString const text = FromBytes("a\x80z");
    ASSERT_EQ(text.length(), 3u);
    EXPECT_EQ(text[1], u'\uFFFD');
}

TEST(UString, IsEmptyFromANullPointer) { EXPECT_TRUE(FromBytes(nullptr).empty()); }

TEST(UString, CountsUnitsNotCharacters) { EXPECT_EQ(U("\xF0\x9D\x84\x9E").length(), 2u); }

TEST(UString, CopiesDoNotShareUnits) {
    UString const original = U("stay");
    UString copy(original);
    copy[0] = u'p';
    EXPECT_EQ(original, U("stay"));
    EXPECT_EQ(copy, U("ptay"));
}

TEST(UString, AssignmentToItselfKeepsTheText) {
    UString text = U("same");
    UString const &alias = text;
    text = alias;
    EXPECT_EQ(text, U("same"));
}

TEST(UString, AssignmentReplacesShorterAndLongerTexts) {
    UString text = U("a long one");
    text = U("short");
    EXPECT_EQ(text, U("short"));
    text = U("and then a much longer one again");
    EXPECT_EQ(text, U("and then a much longer one again"));
    text = UString();
    EXPECT_TRUE(text.empty());
}

TEST(UString, AppendsItselfToItself) {
    UString text = U("abc");
    for (int i = 0; i < 3; ++i)
        text += text;
    EXPECT_EQ(text, U("abcabcabcabcabcabcabcabc"));
}

TEST(UString, AppendsAfterClear) {
    UString text = U("before");
    text.clear();
    EXPECT_TRUE(text.empty());
    text += U("after");
    EXPECT_EQ(text, U("after"));
}

TEST(UString, FindsFromAPlaceOn) {
    UString const text = U("ab ab");
    EXPECT_EQ(text.find(U("ab"), 0), 0u);
    EXPECT_EQ(text.find(U("ab"), 1), 3u);
}

TEST(UString, FindsNothingThatIsAbsentOrBeyondTheEnd) {
    EXPECT_EQ(U("abc").find(U("d"), 0), UString::npos);
    EXPECT_EQ(U("abc").find(U("a"), 100), UString::npos);
    EXPECT_EQ(UString().find(U("a"), 0), UString::npos);
}

TEST(UString, FindsTheEmptyStringWhereItLooks) {
    EXPECT_EQ(U("abc").find(UString(), 2), 2u);
    EXPECT_EQ(UString().find(UString(), 0), 0u);
}

TEST(UString, SubstrCutsTheCountAtTheEnd) {
    EXPECT_EQ(U("abcdef").substr(2, 3), U("cde"));
    EXPECT_EQ(U("abcdef").substr(4, UString::npos), U("ef"));
}

TEST(UString, SubstrWithAWrappedCountGivesTheFirstUnits) {
    // What a search that found nothing relies on: the largest value plus 3 is 2.
    EXPECT_EQ(U("abcdef").substr(0, UString::npos + 3), U("ab"));
}

TEST(UString, SubstrBeyondTheEndIsEmpty) { EXPECT_TRUE(U("abc").substr(4, 1).empty()); }

TEST(UString, TheRangeConstructorTakesThePart) { EXPECT_EQ(UString(U("abcdef"), 1, 2), U("bc")); }

TEST(UString, ReadingBeyondTheEndGivesZero) {
    UString const text = U("ab");
    EXPECT_EQ(text[2], u'\0');
    EXPECT_EQ(text[UString::npos], u'\0');
}

TEST(UString, ComparesByUnits) {
    EXPECT_TRUE(U("B") < U("a"));
    EXPECT_TRUE(U("ab") < U("abc"));
    EXPECT_FALSE(U("b") < U("abc"));
    EXPECT_FALSE(U("a") == U("A"));
    EXPECT_TRUE(UString() == U(""));
}

TEST(Utf, ReplacesBrokenSequences) {
    EXPECT_EQ(Utf::ToUtf8(U("a\xFFz")), "a\xEF\xBF\xBDz");
    EXPECT_EQ(Utf::ToUtf8(U("a\xE2\x82")), "a\xEF\xBF\xBD");
}

TEST(Utf, ReplacesLoneSurrogates) {
    EXPECT_EQ(Utf::ToUtf8(Utf::FromUnits(std::u16string(1, char16_t(0xD800)) + u"x")), "\xEF\xBF\xBDx");
}

TEST(Utf, KeepsEmbeddedZeroes) {
    UString const text = U(std::string_view("a\0b", 3));
    EXPECT_EQ(text.length(), 3u);
    EXPECT_EQ(Utf::ToUtf8(text), std::string("a\0b", 3));
}

TEST(Utf, RoundTripsEveryPlane) {
    std::string const text = "K\xC3\xB6nig \xE2\x82\xAC \xF0\x9D\x84\x9E";
    EXPECT_EQ(Utf::ToUtf8(U(text)), text);
}

TEST(Strings, AsciiEndsAt127) {
    EXPECT_TRUE(tarn::IsASCII(u'\x7F'));
    EXPECT_FALSE(tarn::IsASCII(u'\x80'));
}

TEST(Strings, ToUpperCapitalisesLettersOfAllScripts) {
    UString text = U("mixdown \xC3\xA4\xC3\xB6 \xD0\xB1");
    tarn::ToUpper(text);
    EXPECT_EQ(text, U("MIXDOWN \xC3\x84\xC3\x96 \xD0\x91"));
}

TEST(Strings, ToUpperKeepsEveryUnitInItsPlace) {
    // Capital sharp s would be two letters.
    UString text = U("Gro\xC3\x9F \xF0\x90\x90\xA8z");
    std::size_t const length = text.length();
    tarn::ToUpper(text);
    EXPECT_EQ(text.length(), length);
    EXPECT_EQ(text, U("GRO\xC3\x9F \xF0\x90\x90\x80Z"));
}

TEST(Strings, ToUpperLeavesLoneSurrogatesAlone) {
    UString text = Utf::FromUnits(std::u16string(1, char16_t(0xDC00)) + u"a");
    tarn::ToUpper(text);
    EXPECT_EQ(text[0], char16_t(0xDC00));
    EXPECT_EQ(text[1], u'A');
}

TEST(Strings, NumbersAreWrittenInDecimal) {
    UString text = U("old");
    tarn::NumToUString(-9223372036854775807LL - 1, tarn::kPlainNumber, text);
    EXPECT_EQ(text, U("-9223372036854775808"));
    tarn::NumToUString(0, tarn::kPlainNumber, text);
    EXPECT_EQ(text, U("0"));
}

} // namespace
