// Random events, and random disturbances, over the gallery's pages and dialogs of random items.
//
//     storm [--events N] [--seed N] [--calm] [SUBJECT...]     a page of the gallery, or "dialogs"; all
//     without one storm --replay [--tell] [--calm] [--here] --seed N --events N [--without A-B,C...] SUBJECT
//     storm --shorten --seed N --events N SUBJECT
//     storm --list                                            all subjects
//
// A run that fails says with which seed and at which step, and how to replay it. --calm leaves out what
// happens inside messages; --tell writes every step and message; --here runs in this process, for a debugger.
#include "fuzz/storm/Trial.h"
#include "tools/gallery/PageFiles.h"
#include <algorithm>
#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <stdexcept>

namespace {

char const kDialogs[] = "dialogs";
// After so many events a run begins anew, so that what leaks or piles up is found, and replays stay short.
long const kStepsOfPage = 20000, kStepsOfDialog = 4000;

struct Request {
    StormPlan plan;
    std::vector<std::string> subjects;
    bool replays = false, shortens = false, here = false, lists = false;
};

[[noreturn]] void Misused(std::string const &what) {
    throw std::runtime_error(what + "; see fuzz/storm/main.cpp");
}

long NumberIn(char const *&text) {
    char *end = nullptr;
    long const number = std::strtol(text, &end, 10);
    if (end == text || number < 0)
        Misused(std::string("expected a number, found \"") + text + '"');
    text = end;
    return number;
}

// "3-9,12" as PrintLeftOut writes it.
std::vector<bool> Ranges(char const *text) {
    std::vector<bool> steps;
    while (*text) {
        long const from = NumberIn(text);
        long const to = *text == '-' ? NumberIn(++text) : from;
        steps.resize(std::max(steps.size(), static_cast<std::size_t>(to) + 1));
        for (long step = from; step <= to; ++step)
            steps[static_cast<std::size_t>(step)] = true;
        if (*text == ',')
            ++text;
    }
    return steps;
}

Request Read(int argc, char **argv) {
    Request request;
    request.plan.steps = kStepsOfPage;
    for (int i = 1; i < argc; ++i) {
        std::string const word = argv[i];
        auto const value = [&] {
            if (++i == argc)
                Misused(word + " needs a value");
            return static_cast<char const *>(argv[i]);
        };
        auto const number = [&] {
            char const *text = value();
            return NumberIn(text);
        };
        if (word == "--events")
            request.plan.steps = number();
        else if (word == "--seed")
            request.plan.seed = static_cast<std::uint64_t>(number());
        else if (word == "--without")
            request.plan.left_out = Ranges(value());
        else if (word == "--gallery")
            request.plan.gallery = value();
        else if (word == "--calm")
            request.plan.meddling = false;
        else if (word == "--tell")
            request.plan.telling = true;
        else if (word == "--replay")
            request.replays = true;
        else if (word == "--shorten")
            request.shortens = true;
        else if (word == "--here")
            request.here = true;
        else if (word == "--list")
            request.lists = true;
        else if (word[0] == '-')
            Misused("there is no " + word);
        else
            request.subjects.push_back(word);
    }
    return request;
}

StormPlan Of(std::string const &subject, StormPlan plan) {
    plan.page = subject == kDialogs ? std::string() : subject;
    return plan;
}

std::string LeftOut(StormPlan const &plan) {
    std::string text;
    for (std::size_t from = 0; from < plan.left_out.size(); ++from) {
        if (!plan.left_out[from])
            continue;
        std::size_t to = from;
        while (to + 1 < plan.left_out.size() && plan.left_out[to + 1])
            ++to;
        text += (text.empty() ? "" : ",") + std::to_string(from) + '-' + std::to_string(to);
        from = to;
    }
    return text;
}

void PrintReplay(std::string const &subject, StormPlan const &plan) {
    std::string const without = LeftOut(plan);
    std::printf("    storm --replay --tell%s --seed %llu --events %ld%s%s %s\n",
                plan.meddling ? "" : " --calm", static_cast<unsigned long long>(plan.seed), plan.steps,
                without.empty() ? "" : " --without ", without.c_str(), subject.c_str());
    std::fflush(stdout);
}

// Says what became of it.
bool Report(std::string const &subject, StormPlan plan, TrialResult const &result) {
    if (result.passed)
        return true;
    std::printf("%s: seed %llu %s at step %ld; to see it again:\n", subject.c_str(),
                static_cast<unsigned long long>(plan.seed), result.end.c_str(), result.step);
    plan.steps = std::max(std::min(plan.steps, result.step + 1), 1L);
    PrintReplay(subject, plan);
    return false;
}

bool RunAll(std::string const &subject, StormPlan const &request) {
    auto const start = std::chrono::steady_clock::now();
    long const atOnce = subject == kDialogs ? kStepsOfDialog : kStepsOfPage;
    long done = 0;
    StormPlan plan = Of(subject, request);
    for (; done < request.steps; ++plan.seed) {
        plan.steps = std::min(atOnce, request.steps - done);
        if (!Report(subject, plan, Trial::Run(plan, false)))
            return false;
        done += plan.steps;
    }
    std::chrono::duration<double> const taken = std::chrono::steady_clock::now() - start;
    std::printf("%s: %ld events with the seeds %llu to %llu, %.0f s\n", subject.c_str(), done,
                static_cast<unsigned long long>(request.seed), static_cast<unsigned long long>(plan.seed - 1),
                taken.count());
    std::fflush(stdout);
    return true;
}

bool Shorten(std::string const &subject, StormPlan const &request) {
    StormPlan const plan = Of(subject, request);
    if (Trial::Run(plan, true).passed) {
        std::printf("%s: this run does not fail\n", subject.c_str());
        return false;
    }
    PrintReplay(subject, Trial::Shortened(plan));
    return true;
}

std::vector<std::string> AllSubjects(std::string const &gallery) {
    std::vector<std::string> all = {kDialogs};
    PageFiles const files(gallery);
    for (PageFile const &page : files.Pages())
        all.push_back(page.name);
    return all;
}

bool Carry(Request const &request, std::string const &subject) {
    if (request.here) {
        StormProgress progress;
        Storm(Of(subject, request.plan), progress).Run();
        return true;
    }
    if (request.shortens)
        return Shorten(subject, request.plan);
    if (request.replays)
        return Report(subject, request.plan, Trial::Run(Of(subject, request.plan), false));
    return RunAll(subject, request.plan);
}

} // namespace

int main(int argc, char **argv) {
    try {
        Request request = Read(argc, argv);
        if (request.subjects.empty())
            request.subjects = AllSubjects(request.plan.gallery);
        bool passed = true;
        for (std::string const &subject : request.subjects)
            if (request.lists)
                std::printf("%s\n", subject.c_str());
            else
                passed = Carry(request, subject) && passed;
        return passed ? EXIT_SUCCESS : EXIT_FAILURE;
    } catch (std::exception const &error) {
        std::fprintf(stderr, "storm: %s\n", error.what());
        return EXIT_FAILURE;
    }
}
