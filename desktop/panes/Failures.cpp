#include "desktop/AssertionHandler.h"
#include "host/AssertionFailed.h"
#include "host/TarnError.h"
#include <cstdio>
#include <cstdlib>
#include <string>

namespace {

AssertionHandler theHandler = nullptr;

[[noreturn]] void Fail(std::string const &text) {
    if (theHandler)
        theHandler(text.c_str());
    std::fprintf(stderr, "glogpanes: assertion failed: %s\n", text.c_str());
    std::abort();
}

} // namespace

void SetAssertionHandler(AssertionHandler handler) { theHandler = handler; }

void boost::assertion_failed(char const *expression, char const *function, char const *file, long line) {
    Fail(std::string(expression) + " in " + function + ", " + file + ":" + std::to_string(line));
}

void boost::assertion_failed_msg(char const *expression, char const *message, char const *function,
                                 char const *file, long line) {
    Fail(std::string(expression) + " (" + message + ") in " + function + ", " + file + ":" +
         std::to_string(line));
}

void FailMemFullError() { throw TarnError(); }
