#include "desktop/windows/SdlComposeCache.h"
#include "tests/resources/TemporaryDirectory.h"
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <gtest/gtest.h>
#include <optional>
#include <string>
#include <sys/stat.h>
#include <vector>

namespace fs = std::filesystem;

namespace {

unsigned int const kSomebody = 1000, kSuperuser = 0;
char const *const kVariables[] = {"XCOMPOSECACHE", "XCOMPOSEFILE", "XDG_CACHE_HOME", "HOME"};

// A user with an empty home who has settled nothing.
class SdlComposeCacheTest : public testing::Test {
protected:
    SdlComposeCacheTest() {
        for (char const *variable : kVariables) {
            before.push_back(Get(variable));
            unsetenv(variable);
        }
        setenv("HOME", Home().c_str(), 1);
    }
    ~SdlComposeCacheTest() override {
        for (std::size_t i = 0; i < before.size(); ++i) {
            if (before[i])
                setenv(kVariables[i], before[i]->c_str(), 1);
            else
                unsetenv(kVariables[i]);
        }
    }

    static std::optional<std::string> Get(char const *variable) {
        char const *const value = std::getenv(variable);
        return value != nullptr ? std::optional<std::string>(value) : std::nullopt;
    }
    fs::path Home() const { return directory.Path(); }
    // What Xlib is told while a cache lives.
    static std::optional<std::string> Told(unsigned int user = kSomebody) {
        SdlComposeCache const cache(user);
        return Get("XCOMPOSECACHE");
    }

private:
    TemporaryDirectory directory;
    std::vector<std::optional<std::string>> before;
};

} // namespace

TEST_F(SdlComposeCacheTest, XlibIsToldOfADirectoryOfTheUsersOwn) {
    std::optional<std::string> const told = Told();
    ASSERT_TRUE(told);
    EXPECT_EQ(fs::path(*told).parent_path(), Home() / ".cache" / "glogpanes");
    struct stat made = {};
    ASSERT_EQ(stat(told->c_str(), &made), 0);
    EXPECT_TRUE(S_ISDIR(made.st_mode));
    EXPECT_EQ(made.st_mode & 0777, 0700u);
}

TEST_F(SdlComposeCacheTest, XlibIsToldTheSameTheNextTimeAndNothingInBetween) {
    std::optional<std::string> const told = Told();
    EXPECT_FALSE(Get("XCOMPOSECACHE"));
    std::ofstream(fs::path(*told) / "table") << "keys";
    EXPECT_EQ(Told(), told);
    EXPECT_TRUE(fs::exists(fs::path(*told) / "table"));
}

TEST_F(SdlComposeCacheTest, TheUsersCacheIsWhereTheEnvironmentSays) {
    fs::path const elsewhere = Home() / "elsewhere" / "cache";
    setenv("XDG_CACHE_HOME", elsewhere.c_str(), 1);
    std::optional<std::string> const told = Told();
    ASSERT_TRUE(told);
    EXPECT_EQ(fs::path(*told).parent_path(), elsewhere / "glogpanes");
}

TEST_F(SdlComposeCacheTest, ACacheThatIsNoWholePathIsNone) {
    setenv("XDG_CACHE_HOME", "elsewhere", 1);
    std::optional<std::string> const told = Told();
    ASSERT_TRUE(told);
    EXPECT_EQ(fs::path(*told).parent_path(), Home() / ".cache" / "glogpanes");
}

TEST_F(SdlComposeCacheTest, TablesOfOtherReleasesGoAndNothingElse) {
    fs::path const folder = Home() / ".cache" / "glogpanes";
    fs::create_directories(folder / "compose-1-2");
    fs::create_directories(folder / "others");
    std::ofstream(folder / "compose-1-2" / "table") << "keys";
    ASSERT_TRUE(Told());
    EXPECT_FALSE(fs::exists(folder / "compose-1-2"));
    EXPECT_TRUE(fs::exists(folder / "others"));
}

TEST_F(SdlComposeCacheTest, WhereTheUserHasATableItStays) {
    setenv("XCOMPOSECACHE", "/somewhere", 1);
    EXPECT_EQ(Told(), "/somewhere");
    EXPECT_EQ(Get("XCOMPOSECACHE"), "/somewhere");
    unsetenv("XCOMPOSECACHE");
    fs::create_directory(Home() / ".compose-cache");
    EXPECT_FALSE(Told());
}

TEST_F(SdlComposeCacheTest, KeysOfTheUsersOwnAreReadEachTime) {
    setenv("XCOMPOSEFILE", "/somewhere", 1);
    EXPECT_FALSE(Told());
    unsetenv("XCOMPOSEFILE");
    std::ofstream(Home() / ".XCompose") << "include \"%L\"\n";
    EXPECT_FALSE(Told());
}

TEST_F(SdlComposeCacheTest, TheSuperuserHasNone) {
    EXPECT_FALSE(Told(kSuperuser));
    EXPECT_TRUE(fs::is_empty(Home()));
}

TEST_F(SdlComposeCacheTest, WithoutAHomeThereIsNone) {
    unsetenv("HOME");
    EXPECT_FALSE(Told());
    setenv("HOME", "", 1);
    EXPECT_FALSE(Told());
}

TEST_F(SdlComposeCacheTest, WhereNoDirectoryCanBeMadeThereIsNone) {
    std::ofstream(Home() / ".cache") << "a file in its place";
    EXPECT_FALSE(Told());
}
