#include "fuzz/storm/Storm.h"
#include "fuzz/storm/Soundness.h"
#include "fuzz/support/Require.h"
#include "host/glogRec.h"
#include <algorithm>
#include <cstdio>

namespace {

long const kBatch = 64;       // events between two checks
long const kRedrawEvery = 8;  // batches between two checks that take long
int const kDisturbed = 3;     // one message in so many
int const kMostMessages = 40; // disturbed ones of one step
int const kMostEnds = 60;     // attempts to end what waits
std::uint64_t const kOpening = ~std::uint64_t(0), kBetween = std::uint64_t(1) << 40,
                    kMessage = std::uint64_t(1) << 48; // what random numbers are for

// Somebody may have hidden it, or made it so small that nothing in it can be reached.
void Restore(glogRec *window) {
    short const kSmall = 200, kUsualWidth = 360, kUsualHeight = 256; // pixels
    if (GetGlogWidth(window) < kSmall || GetGlogHeight(window) < kSmall) {
        Rect place = {80, 100, 80 + kUsualHeight, 100 + kUsualWidth};
        PositionGlog(window, &place, false);
    }
    ShowGlog(window, kShowGlog);
}

std::uint64_t Step(long step) { return static_cast<std::uint64_t>(step); }

} // namespace

Storm::Storm(StormPlan const &plan_, StormProgress &progress_)
    : plan(plan_)
    , progress(progress_)
    , desktop(DesktopOptions().Scale(1)) {
    Chance chance(plan.seed, kOpening);
    stage = plan.page.empty() ? Stages::RandomDialog(desktop, chance)
                              : Stages::GalleryPage(desktop, plan.gallery, plan.page);
    meddler = std::make_unique<Meddler>(desktop, *stage, plan.telling);
    events = std::make_unique<StormEvents>(desktop, *stage);
    desktop.System().SetSource(this);
    desktop.WatchMessages([this](std::string const &message) { Heard(message); });
}

Storm::~Storm() {
    desktop.WatchMessages(nullptr);
    desktop.System().SetSource(nullptr);
}

bool Storm::IsLeftOut(long step) const {
    return Step(step) < plan.left_out.size() && plan.left_out[Step(step)];
}

bool Storm::HasMore() const { return progress.step < batchEnd; }

StormEvent Storm::Next(WindowSystem::Waiter waiter) {
    long const step = progress.step++;
    messages = 0;
    endsOfWait = 0;
    if (plan.telling && waiter == WindowSystem::Waiter::kMainLoop && !Soundness::PanesOverlap(desktop))
        Soundness::CheckRedraw(desktop);
    if (IsLeftOut(step))
        return StormEvent();
    Chance chance(plan.seed, Step(step));
    StormEvent const event = events->Next(chance, waiter);
    if (plan.telling)
        Tell(event);
    return event;
}

StormEvent Storm::EndOfWait() {
    Require(endsOfWait < kMostEnds, "a menu or dialog can be ended");
    return events->EndOfWait(endsOfWait++);
}

void Storm::Tell(StormEvent const &event) const {
    std::fprintf(stderr, "step %ld:", progress.step - 1);
    if (event.isOther)
        std::fprintf(stderr, " event %d at %d %d", event.other.kind, event.other.h, event.other.v);
    for (ScriptStep const &step : event.steps)
        std::fprintf(stderr, " kind %d at %d %d, modifiers %x, key %d, text \"%s\"", step.kind, step.h,
                     step.v, step.modifiers, step.key, step.text.c_str());
    std::fprintf(stderr, "\n");
}

// Panes are in the middle of telling something, or of being told.
void Storm::Heard(std::string const &message) {
    if (plan.telling)
        std::fprintf(stderr, "    %s\n", message.c_str());
    if (!plan.meddling || messages == kMostMessages || progress.step == 0 || IsLeftOut(progress.step - 1))
        return;
    Chance chance(plan.seed, Step(progress.step) + kMessage * static_cast<std::uint64_t>(++messages));
    if (chance.OneIn(kDisturbed))
        meddler->Disturb(chance);
}

void Storm::RunUntil(long step) {
    batchEnd = step;
    while (HasMore()) {
        if (!stage->Window()) {
            Chance chance(plan.seed, kBetween + Step(progress.step));
            stage->Reopen(chance);
        }
        Restore(stage->Window());
        // Ends early when the last window closes.
        desktop.Run();
    }
}

void Storm::Run() {
    for (long batch = 0; progress.step < plan.steps; ++batch) {
        RunUntil(std::min(progress.step + kBatch, plan.steps));
        Soundness::Check(desktop);
        if (batch % kRedrawEvery == 0) {
            Soundness::CheckDescription(desktop);
            if (!Soundness::PanesOverlap(desktop))
                Soundness::CheckRedraw(desktop);
        }
        Chance chance(plan.seed, kBetween + Step(batch));
        if (plan.meddling && !IsLeftOut(progress.step - 1) && chance.OneIn(8))
            meddler->DisturbDesktop(chance);
    }
}
