#include "host/StringMgr.h"
#include "host/TarnError.h"
#include "tests/resources/Text.h"
#include <gtest/gtest.h>
#include <vector>

namespace {

TEST(StringMgr, GivesBackWhatWasStored) {
    short const key = StringMgr::Instance().Store(U("one"));
    EXPECT_EQ(StringMgr::Instance().Lookup(key), U("one"));
    StringMgr::Instance().Free(key);
}

TEST(StringMgr, NeverGivesTheKeyZero) {
    short const key = StringMgr::Instance().Store(U("one"));
    EXPECT_GT(key, 0);
    StringMgr::Instance().Free(key);
}

TEST(StringMgr, UsesAFreedKeyAgain) {
    short const first = StringMgr::Instance().Store(U("first"));
    StringMgr::Instance().Free(first);
    short const second = StringMgr::Instance().Store(U("second"));
    EXPECT_EQ(second, first);
    EXPECT_EQ(StringMgr::Instance().Lookup(second), U("second"));
    StringMgr::Instance().Free(second);
}

TEST(StringMgr, AnUnknownKeyGivesTheEmptyString) {
    for (short const key : {short(0), short(-1), short(32767), short(-32768)})
        EXPECT_TRUE(StringMgr::Instance().Lookup(key).empty()) << key;
}

TEST(StringMgr, AFreedKeyGivesTheEmptyString) {
    short const key = StringMgr::Instance().Store(U("gone"));
    StringMgr::Instance().Free(key);
    EXPECT_TRUE(StringMgr::Instance().Lookup(key).empty());
}

TEST(StringMgr, FreeingTwiceFreesOnce) {
    short const key = StringMgr::Instance().Store(U("x"));
    StringMgr::Instance().Free(key);
    StringMgr::Instance().Free(key);
    short const first = StringMgr::Instance().Store(U("a"));
    short const second = StringMgr::Instance().Store(U("b"));
    EXPECT_NE(first, second);
    StringMgr::Instance().Free(first);
    StringMgr::Instance().Free(second);
}

TEST(StringMgr, AReferenceStaysValidWhileOthersAreStored) {
    short const key = StringMgr::Instance().Store(U("steady"));
    UString const &text = StringMgr::Instance().Lookup(key);
    std::vector<short> keys;
    for (int i = 0; i < 1000; ++i)
        keys.push_back(StringMgr::Instance().Store(U("other")));
    EXPECT_EQ(text, U("steady"));
    for (short const other : keys)
        StringMgr::Instance().Free(other);
    StringMgr::Instance().Free(key);
}

TEST(StringMgr, ReportsAFullTableAsMemoryExhaustion) {
    std::vector<short> keys;
    EXPECT_THROW(
        {
            for (;;)
                keys.push_back(StringMgr::Instance().Store(U("x")));
        },
        TarnError);
    EXPECT_GT(keys.size(), 32000u);
    for (short const key : keys)
        StringMgr::Instance().Free(key);
    short const key = StringMgr::Instance().Store(U("room again"));
    EXPECT_EQ(StringMgr::Instance().Lookup(key), U("room again"));
    StringMgr::Instance().Free(key);
}

} // namespace
