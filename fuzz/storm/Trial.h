// Runs of storms in processes of their own, so that whatever becomes of them can be told.
#pragma once
#include "fuzz/storm/Storm.h"

struct TrialResult {
    bool passed = false;
    long step = 0;   // that was being taken at the end
    std::string end; // how the process ended, in words
};

namespace Trial {

// Runs the plan. `quietly`: what the process writes is dropped.
TrialResult Run(StormPlan const &, bool quietly);

// A plan of a run that fails: the same without steps that it fails without, as far as a few hundred tries
// show.
StormPlan Shortened(StormPlan const &failing);

} // namespace Trial
