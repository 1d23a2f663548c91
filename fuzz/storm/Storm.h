// A run of random events over a window with panes.
#pragma once
#include "fuzz/storm/Meddler.h"
#include "fuzz/storm/Stage.h"
#include "fuzz/storm/StormEvents.h"
#include "fuzz/storm/StormWindows.h"
#include <cstdint>
#include <memory>
#include <string>
#include <vector>

// What a run is made of. The same plan gives the same run.
struct StormPlan {
    std::string page;           // of the gallery; empty: a dialog of random items
    std::string gallery;        // the directory of the gallery's dialogs; empty: beside the program
    std::uint64_t seed = 1;     // that everything follows from
    long steps = 0;             // events
    std::vector<bool> left_out; // steps that are passed over; those beyond the list are not
    bool meddling = true;       // panes are disturbed from inside messages, too
    bool telling = false;       // each step is written to the standard error
};

// What is known of a run from outside, whatever becomes of it.
struct StormProgress {
    long step = 0; // that is being taken
};

class Storm : private StormSource {
public:
    Storm(StormPlan const &, StormProgress &);
    ~Storm() override;

    // Takes all steps. What must not happen ends the process.
    void Run();

private:
    bool HasMore() const override;
    StormEvent Next(WindowSystem::Waiter) override;
    StormEvent EndOfWait() override;
    void RunUntil(long step);
    bool IsLeftOut(long step) const;
    void Heard(std::string const &message);
    void Tell(StormEvent const &) const;

    StormPlan const plan;
    StormProgress &progress;
    StormDesktop desktop;
    std::unique_ptr<Stage> stage;
    std::unique_ptr<Meddler> meddler;
    std::unique_ptr<StormEvents> events;
    long batchEnd = 0;  // the step before which events pause
    int messages = 0;   // in the present step
    int endsOfWait = 0; // since the last step
};
