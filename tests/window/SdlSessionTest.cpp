#include "desktop/windows/SdlWindowSystem.h"
#include <gtest/gtest.h>
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
