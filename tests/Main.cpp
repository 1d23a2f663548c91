// The main function of the test programs. When a test crashes or does not end, it says which: a program runs
// many, and the brief form of the output names only those that fail otherwise.
#include <csignal>
#include <cstring>
#include <gtest/gtest.h>
#include <string>
#include <unistd.h>

namespace {
unsigned const kMostSeconds = 300; // for one test

// Written before a test starts, so that the handler only has to print it.
std::string running; // NOLINT(cert-err58-cpp)

extern "C" void TellTheTest(int number) {
    char const *const what = number == SIGALRM ? " does not end\n" : " crashes\n";
    // Nothing can be done about output that fails.
    if (write(STDERR_FILENO, running.data(), running.size()) < 0 ||
        write(STDERR_FILENO, what, std::strlen(what)) < 0) {
    }
    // The handler is gone by now: this ends the process as if there had been none.
    std::raise(number);
}

class Watch : public testing::EmptyTestEventListener {
    void OnTestStart(testing::TestInfo const &test) override {
        running = std::string(test.test_suite_name()) + "." + test.name();
        alarm(kMostSeconds);
    }
    void OnTestEnd(testing::TestInfo const &) override { alarm(0); }
};

void HandleOnce(int number) {
    struct sigaction action = {};
    action.sa_handler = TellTheTest;
    action.sa_flags = SA_RESETHAND | SA_NODEFER;
    sigaction(number, &action, nullptr);
}
} // namespace

int main(int argc, char **argv) {
    testing::InitGoogleTest(&argc, argv);
    testing::UnitTest::GetInstance()->listeners().Append(new Watch);
    for (int number : {SIGABRT, SIGALRM})
        HandleOnce(number);
    // A sanitizer tells more of these, with the test among the calls.
    struct sigaction installed = {};
    for (int number : {SIGSEGV, SIGBUS, SIGFPE, SIGILL}) {
        sigaction(number, nullptr, &installed);
        if (installed.sa_handler == SIG_DFL)
            HandleOnce(number);
    }
    return RUN_ALL_TESTS();
}
