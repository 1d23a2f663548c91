// Numbers in scripts and in JSON stay what they are in programs that write theirs with a comma.
#include "desktop/observe/JsonLine.h"
#include "desktop/windows/EventScript.h"
#include "tests/resources/TemporaryDirectory.h"
#include <clocale>
#include <cstdio>
#include <cstdlib>
#include <gtest/gtest.h>

namespace {

class WithCommas : public testing::Test {
protected:
    WithCommas() {
        std::string const make = "localedef -i de_DE -f UTF-8 '" + directory.Path() + "/de_DE.UTF-8'";
        EXPECT_EQ(std::system(make.c_str()), 0);
        setenv("LOCPATH", directory.Path().c_str(), 1);
        EXPECT_NE(std::setlocale(LC_NUMERIC, "de_DE.UTF-8"), nullptr);
    }
    ~WithCommas() override {
        std::setlocale(LC_NUMERIC, "C");
        unsetenv("LOCPATH");
    }

    TemporaryDirectory directory;
};

TEST_F(WithCommas, NumbersInScriptsAndJsonHavePoints) {
    char text[8];
    std::snprintf(text, sizeof text, "%.1f", 0.5);
    ASSERT_STREQ(text, "0,5") << "the locale is not in force";
    EXPECT_EQ(EventScript::Parse("wait 0.5", "test").front().seconds, 0.5);
    EXPECT_EQ(JsonLine().Number("time", 0.125).Number("large", 1e300).Finish(),
              "{\"time\":0.125,\"large\":1e+300}");
}

} // namespace
