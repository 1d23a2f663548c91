// When a window was used last, as window managers find it.
#include "desktop/windows/SdlScreen.h"
#include "tests/window/WindowTest.h"
#include <cstdlib>

namespace {

int const kMoment = 100; // milliseconds

char const kTime[] = "_NET_WM_USER_TIME", kTimeWindow[] = "_NET_WM_USER_TIME_WINDOW";

class TimeOfUse : public WindowTest {
protected:
    typedef std::vector<std::string> Names;

    void SetUp() override {
        WindowTest::SetUp();
        said = Screen().SaidByManager();
    }
    void TearDown() override { Screen().LetManagerSay(said); }

    void OpenToBeUsed() {
        window = Open(At(100, 100, 120, 80));
        PointAt(*window, 60, 40);
        Drain();
    }
    void Use(std::string const &step) {
        Do(step);
        Drain();
    }

    // In milliseconds of the server; 0 where there is none.
    unsigned long TimeAtTheWindow() { return Time(kWindow); }
    unsigned long TimeBesideTheWindow() {
        std::string const number = PropertyOf(kWindow, kTimeWindow, "# ");
        return number.empty() ? 0 : Time("-id " + number);
    }

    Window window;

private:
    static char const kWindow[];

    // As xprop writes it after the mark; empty where there is none.
    std::string PropertyOf(std::string const &where, std::string const &name,
                           std::string const &mark = "= ") {
        std::string const told = RunBeside("xprop " + where + " " + name);
        std::size_t const at = told.find(mark);
        return at == std::string::npos
                   ? ""
                   : told.substr(at + mark.size(), told.find('\n', at) - at - mark.size());
    }
    unsigned long Time(std::string const &where) {
        return std::strtoul(PropertyOf(where, kTime).c_str(), nullptr, 10);
    }

    Names said;
};

char const TimeOfUse::kWindow[] = "-name 'window under test'";

} // namespace

TEST_F(TimeOfUse, OfAPressIsBesideTheWindow) {
    Screen().LetManagerSay({kTime, kTimeWindow});
    OpenToBeUsed();
    EXPECT_EQ(TimeBesideTheWindow(), 0u);
    Use("click 1");
    unsigned long const first = TimeBesideTheWindow();
    EXPECT_GT(first, 0u);
    Use("click 3");
    EXPECT_GT(TimeBesideTheWindow(), first);
    EXPECT_EQ(TimeAtTheWindow(), 0u) << "there it would wake the program";
}

TEST_F(TimeOfUse, OfAKeyIsBesideTheWindow) {
    Screen().LetManagerSay({kTime, kTimeWindow});
    OpenToBeUsed();
    Use("click 1");
    unsigned long const pressed = TimeBesideTheWindow();
    Use("key a");
    EXPECT_GT(TimeBesideTheWindow(), pressed);
}

TEST_F(TimeOfUse, IsBesideTheWindowWhereNobodyReadsIt) {
    Screen().LetManagerSay({});
    OpenToBeUsed();
    Use("click 1");
    EXPECT_GT(TimeBesideTheWindow(), 0u);
    EXPECT_EQ(TimeAtTheWindow(), 0u);
}

TEST_F(TimeOfUse, IsAtTheWindowForAManagerThatReadsItOnlyThere) {
    Screen().LetManagerSay({"_NET_WM_NAME", kTime});
    OpenToBeUsed();
    Use("click 1");
    unsigned long const pressed = TimeAtTheWindow();
    EXPECT_GT(pressed, 0u);
    EXPECT_EQ(TimeBesideTheWindow(), 0u);
    Use("key a");
    EXPECT_GT(TimeAtTheWindow(), pressed);
}

TEST_F(TimeOfUse, OfEachWindowIsItsOwn) {
    Screen().LetManagerSay({kTime, kTimeWindow});
    OpenToBeUsed();
    WindowSpec other = At(300, 100, 120, 80);
    other.title = "another";
    Window const neighbour = Open(other);
    PointAt(*neighbour, 60, 40);
    Use("click 1");
    EXPECT_EQ(TimeBesideTheWindow(), 0u);
}

TEST_F(TimeOfUse, OfAWindowThatIsGoneIsNotNoted) {
    Screen().LetManagerSay({});
    OpenToBeUsed();
    Do("click 1");
    EXPECT_TRUE(SdlScreen::Wait(kMoment)) << "the press is there, and nobody has taken it";
    window.reset();
    EXPECT_TRUE(Drain(InputEvent::kMouseDown).empty());
}

// The server reports what SDL notes at the window, which is nothing to anybody here.
TEST_F(TimeOfUse, WakesNobody) {
    for (Names const &known : {Names{kTime}, Names{kTime, kTimeWindow}}) {
        Screen().LetManagerSay(known);
        OpenToBeUsed();
        Do("click 1");
        Await(InputEvent::kMouseUp);
        EXPECT_FALSE(SdlScreen::Wait(kMoment)) << "where the manager knows of " << known.back();
        Do("key a");
        Await(InputEvent::kKeyUp);
        EXPECT_FALSE(SdlScreen::Wait(kMoment)) << "where the manager knows of " << known.back();
    }
}
