#include "desktop/windows/SdlWindowSystem.h"
#include "tests/resources/TemporaryDirectory.h"
#include <cstdlib>
#include <filesystem>
#include <grp.h>
#include <gtest/gtest.h>
#include <stdexcept>
#include <string>
#include <sys/wait.h>
#include <unistd.h>
#include <vector>
// After those: Xlib has macros of common words.
#include <X11/Xlib.h>

namespace {

int errors = 0;

int CountError(Display *, XErrorEvent *) {
    ++errors;
    return 0;
}

// A program with an error handler of its own.
class SdlSessionTest : public testing::Test {
protected:
    SdlSessionTest()
        : before(XSetErrorHandler(CountError)) {
        errors = 0;
    }
    ~SdlSessionTest() override { XSetErrorHandler(before); }

    // Has the server refuse a request.
    static void MakeError() {
        constexpr Window kNoWindow = 0x1FFFFFF0;
        Display *const display = XOpenDisplay(nullptr);
        ASSERT_NE(display, nullptr);
        XMapWindow(display, kNoWindow);
        XSync(display, False);
        XCloseDisplay(display);
    }

    XErrorHandler before;
};

} // namespace

TEST_F(SdlSessionTest, GivesTheProgramsErrorHandlerBack) {
    for (int i = 0; i < 2; ++i)
        SdlWindowSystem().Now();
    EXPECT_EQ(XSetErrorHandler(CountError), &CountError);
}

TEST_F(SdlSessionTest, AnErrorReachesTheProgramsHandlerOnceInEverySession) {
    for (int i = 1; i <= 3; ++i) {
        SdlWindowSystem const system;
        MakeError();
        EXPECT_EQ(errors, i);
    }
}

namespace {

namespace fs = std::filesystem;

// A home for the processes of a user, also where the tests run as the superuser.
class SessionOfAUser : public testing::Test {
protected:
    SessionOfAUser() {
        if (isSuperuser && chown(home.Path().c_str(), kNobody, kNobody) != 0)
            throw std::runtime_error("the home cannot be given away");
    }

    // Opens and closes a session in a process of its own; whether that has worked.
    bool Open() const {
        pid_t const child = fork();
        if (child == 0)
            _exit(OpenAsUser() ? EXIT_SUCCESS : EXIT_FAILURE);
        int status = 0;
        return child > 0 && waitpid(child, &status, 0) == child && WIFEXITED(status) &&
               WEXITSTATUS(status) == EXIT_SUCCESS;
    }
    std::vector<fs::path> Files() const {
        std::vector<fs::path> files;
        for (fs::directory_entry const &entry : fs::recursive_directory_iterator(home.Path()))
            if (entry.is_regular_file())
                files.push_back(entry.path());
        return files;
    }

private:
    static unsigned int const kNobody = 65534;

    bool OpenAsUser() const {
        if (isSuperuser && (setgroups(0, nullptr) != 0 || setresgid(kNobody, kNobody, kNobody) != 0 ||
                            setresuid(kNobody, kNobody, kNobody) != 0))
            return false;
        setenv("HOME", home.Path().c_str(), 1);
        setenv("LC_ALL", "C.UTF-8", 1); // has composed keys
        for (char const *variable : {"XDG_CACHE_HOME", "XCOMPOSECACHE", "XCOMPOSEFILE", "XMODIFIERS"})
            unsetenv(variable);
        try {
            return SdlWindowSystem().Now() >= 0;
        } catch (std::runtime_error const &) {
            return false;
        }
    }

    bool isSuperuser = geteuid() == 0;
    TemporaryDirectory home;
};

} // namespace

TEST_F(SessionOfAUser, XlibMakesItsTableOfComposedKeysOnce) {
    ASSERT_TRUE(Open());
    std::vector<fs::path> const made = Files();
    ASSERT_EQ(made.size(), 1U);
    EXPECT_GT(fs::file_size(made[0]), 100000U);
    fs::file_time_type const time = fs::last_write_time(made[0]);
    ASSERT_TRUE(Open());
    EXPECT_EQ(Files(), made);
    EXPECT_EQ(fs::last_write_time(made[0]), time);
}
