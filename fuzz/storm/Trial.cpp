#include "fuzz/storm/Trial.h"
#include <algorithm>
#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <exception>
#include <fcntl.h>
#include <new>
#include <sys/mman.h>
#include <sys/wait.h>
#include <unistd.h>

namespace {

int const kPatience = 90;      // seconds that one step may take; sanitizers are slow
useconds_t const kLook = 5000; // microseconds between two looks at the process
int const kMostTries = 400;
long const kFewestAtOnce = 1;

// Seen by both processes.
StormProgress &SharedProgress() {
    static void *const memory =
        mmap(nullptr, sizeof(StormProgress), PROT_READ | PROT_WRITE, MAP_SHARED | MAP_ANONYMOUS, -1, 0);
    return *new (memory) StormProgress;
}

// Ends as a program does, so that leaks are looked for.
[[noreturn]] void RunInside(StormPlan const &plan, StormProgress &progress, bool quietly) {
    if (quietly)
        dup2(open("/dev/null", O_WRONLY), STDERR_FILENO);
    try {
        Storm(plan, progress).Run();
    } catch (std::exception const &error) {
        std::fprintf(stderr, "what was not to come out: %s\n", error.what());
        std::exit(EXIT_FAILURE);
    }
    std::exit(EXIT_SUCCESS);
}

std::string Ending(int status, bool stood) {
    if (stood)
        return "stood still";
    if (WIFSIGNALED(status))
        return std::string("was ended by ") + strsignal(WTERMSIG(status));
    return "ended with " + std::to_string(WEXITSTATUS(status));
}

// Whether it had to be ended because it did not go on.
bool AwaitEnd(pid_t process, StormProgress const &progress, int &status) {
    long last = -1;
    long long looks = 0;
    while (waitpid(process, &status, WNOHANG) == 0) {
        long const now = *const_cast<long const volatile *>(&progress.step);
        looks = now == last ? looks + 1 : 0;
        last = now;
        if (looks * kLook > kPatience * 1000000LL) {
            kill(process, SIGKILL);
            waitpid(process, &status, 0);
            return true;
        }
        usleep(kLook);
    }
    return false;
}

StormPlan Without(StormPlan plan, long from, long to) {
    plan.left_out.resize(static_cast<std::size_t>(plan.steps));
    for (long step = from; step < to; ++step)
        plan.left_out[static_cast<std::size_t>(step)] = true;
    return plan;
}

bool IsLeftOut(StormPlan const &plan, long step) {
    return static_cast<std::size_t>(step) < plan.left_out.size() &&
           plan.left_out[static_cast<std::size_t>(step)];
}

} // namespace

TrialResult Trial::Run(StormPlan const &plan, bool quietly) {
    StormProgress &progress = SharedProgress();
    std::fflush(nullptr);
    pid_t const process = fork();
    if (process == 0)
        RunInside(plan, progress, quietly);
    TrialResult result;
    if (process < 0) {
        result.end = "could not be started";
        return result;
    }
    int status = 0;
    bool const stood = AwaitEnd(process, progress, status);
    result.passed = !stood && WIFEXITED(status) && WEXITSTATUS(status) == EXIT_SUCCESS;
    result.step = progress.step - 1;
    result.end = Ending(status, stood);
    return result;
}

// First large parts, then smaller ones.
StormPlan Trial::Shortened(StormPlan const &failing) {
    StormPlan plan = failing;
    int tries = 0;
    for (long size = (plan.steps + 1) / 2; size >= kFewestAtOnce && tries < kMostTries; size /= 2) {
        for (long from = 0; from < plan.steps && tries < kMostTries; from += size) {
            if (IsLeftOut(plan, from) && size == kFewestAtOnce)
                continue;
            StormPlan const shorter = Without(plan, from, std::min(from + size, plan.steps));
            ++tries;
            if (!Run(shorter, true).passed)
                plan = shorter;
        }
    }
    return plan;
}
