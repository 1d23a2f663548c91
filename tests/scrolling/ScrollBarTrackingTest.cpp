// What a press of the mouse on a scroll bar makes of time and movement.
#include "host/glogRec.h"
#include "tests/scrolling/ScrollBarTest.h"
#include <cmath>

namespace {

class ScrollBarTracking : public ScrollBarTest {
protected:
    ScrollBarTracking()
        : bar(Live(Upright(), 500)) {
        Show();
        client.TakeLog();
    }

    // Plays the script; when the client was told to scroll, in seconds from the first step, which is the
    // press.
    std::vector<double> TimesOf(std::string const &script) {
        double const start = desktop.Now();
        client.steps.clear();
        desktop.Play(script);
        std::vector<double> times;
        for (RecordingClient::Step const &step : client.steps)
            times.push_back(std::round((step.time - start) * 1000) / 1000);
        return times;
    }
    std::vector<int> Amounts() const {
        std::vector<int> amounts;
        for (RecordingClient::Step const &step : client.steps)
            amounts.push_back(step.amount);
        return amounts;
    }
    std::vector<int> Multipliers() const {
        std::vector<int> multipliers;
        for (RecordingClient::Step const &step : client.steps)
            multipliers.push_back(step.multiplier);
        return multipliers;
    }

    ScrollBarPane *bar; // from {10, 20}: arrows at 11 and 125, the trough from 25 to 125
};

typedef std::vector<double> Times;

std::string const kUp = "press 28 18\n", kDown = "press 28 130\n";
std::string const kAbove = "press 28 30\n", kBelow = "press 28 110\n";

} // namespace

// Arrows

TEST_F(ScrollBarTracking, AClickOnAnArrowTakesOneStepAndEnds) {
    desktop.Play("click 28 130");
    EXPECT_EQ(client.TakeLog(),
              (Log{"inhibit", "start by unit", "inhibit", "scroll 1 x 1", "inhibit", "done"}));
    EXPECT_EQ(client.announcedGlog, glog);
}

TEST_F(ScrollBarTracking, TheUpperArrowStepsTowardTheStart) {
    desktop.Play("click 28 18");
    EXPECT_EQ(Amounts(), std::vector<int>{-1});
}

TEST_F(ScrollBarTracking, TheFirstStepIsTakenAtThePressItself) {
    EXPECT_EQ(TimesOf(kDown + "wait 0.05\nrelease"), (Times{0}));
}

TEST_F(ScrollBarTracking, AnArrowThatIsHeldDownRepeatsAtItsWakeUpsAfterNineTicks) {
    EXPECT_EQ(TimesOf(kDown + "wait 0.55\nrelease"), (Times{0, 0.2, 0.3, 0.4, 0.5}));
}

TEST_F(ScrollBarTracking, TheFirstRepeatIsDueFromTheNinthTickOn) {
    EXPECT_EQ(TimesOf(kDown + "wait 0.141\nmove 29 130\nrelease"), (Times{0}));
    EXPECT_EQ(TimesOf(kDown + "wait 0.15\nmove 29 130\nrelease"), (Times{0, 0.15}));
}

TEST_F(ScrollBarTracking, FurtherRepeatsAreDueEveryThreeTicks) {
    EXPECT_EQ(TimesOf(kDown + "wait 0.15\nmove 29 130\nwait 0.03\nmove 28 130\nrelease"), (Times{0, 0.15}));
    EXPECT_EQ(
        TimesOf(kDown + "wait 0.15\nmove 29 130\nwait 0.05\nmove 28 130\nwait 0.05\nmove 27 130\nrelease"),
        (Times{0, 0.15, 0.2, 0.25}));
}

TEST_F(ScrollBarTracking, TheClientMayChooseItsOwnDelay) {
    client.arrowDelay = 12; // the first repeat after 36 ticks, 0.6 s
    EXPECT_EQ(TimesOf(kDown + "wait 1.05\nrelease"), (Times{0, 0.6, 0.8, 1.0}));
}

TEST_F(ScrollBarTracking, ADelayBelowZeroRepeatsAtEveryWakeUp) {
    client.arrowDelay = -5;
    EXPECT_EQ(TimesOf(kDown + "wait 0.25\nrelease"), (Times{0, 0, 0.1, 0.2}));
}

// The wait until the next step begins when the client is done.
TEST_F(ScrollBarTracking, TheTimeThatAClientTakesIsNoneOfTheDelay) {
    client.arrowDelay = 12;
    client.onScroll = [this] { desktop.ProcessEvents(0.25); };
    EXPECT_EQ(TimesOf(kDown + "wait 2\nrelease"),
              (Times{0, 0.85, 1.3, 1.75})); // 36 ticks after 0.25, then 12 after each end
}

TEST_F(ScrollBarTracking, AVeryLongDelayNeverRepeats) {
    client.arrowDelay = std::numeric_limits<int>::max();
    EXPECT_EQ(TimesOf(kDown + "wait 5\nrelease"), (Times{0}));
}

TEST_F(ScrollBarTracking, EachRepeatIsAnnounced) {
    desktop.Play(kDown + "wait 0.25\nrelease");
    EXPECT_EQ(client.TakeLog(), (Log{"inhibit", "start by unit", "inhibit", "scroll 1 x 1", "inhibit",
                                     "scroll 1 x 1", "inhibit", "done"}));
}

TEST_F(ScrollBarTracking, AStepBelowOneBecomesOne) {
    for (int unit : {0, -7, std::numeric_limits<int>::min()}) {
        client.unit = unit;
        TimesOf(kDown + "wait 0.25\nrelease");
        EXPECT_EQ(Amounts(), (std::vector<int>{1, 1}));
        TimesOf(kUp + "wait 0.25\nrelease");
        EXPECT_EQ(Amounts(), (std::vector<int>{-1, -1}));
    }
}

TEST_F(ScrollBarTracking, AClientThatSpeedsUpDoesSoTowardTheEnd) {
    client.acceleration = 1;
    TimesOf(kDown + "wait 0.55\nrelease");
    EXPECT_EQ(Multipliers(), (std::vector<int>{1, 2, 3, 4, 5}));
}

// Every repeat toward the start begins with 1 again.
TEST_F(ScrollBarTracking, AClientThatSpeedsUpStaysSlowTowardTheStart) {
    client.acceleration = 1;
    client.firstMultiplier = 4;
    TimesOf(kUp + "wait 0.55\nrelease");
    EXPECT_EQ(Multipliers(), (std::vector<int>{4, 1, 1, 1, 1}));
}

TEST_F(ScrollBarTracking, ANewPressBeginsAtTheFirstMultiplierAgain) {
    client.acceleration = 1;
    desktop.Play(kDown + "wait 0.55\nrelease");
    TimesOf("click 28 130");
    EXPECT_EQ(Multipliers(), std::vector<int>{1});
}

TEST_F(ScrollBarTracking, AMouseThatLeavesPausesTheSteps) {
    EXPECT_EQ(TimesOf(kDown + "wait 0.25\nmove 200 130\nwait 1\nmove 28 18\nwait 1\nrelease"),
              (Times{0, 0.2}));
}

TEST_F(ScrollBarTracking, AMouseThatReturnsStepsAtOnceWhenTheTimeHasCome) {
    EXPECT_EQ(TimesOf(kDown + "wait 0.05\nmove 200 130\nwait 0.45\nmove 28 130\nwait 0.05\nrelease"),
              (Times{0, 0.5}));
}

TEST_F(ScrollBarTracking, AMouseThatReturnsEarlyWaitsForTheTime) {
    EXPECT_EQ(TimesOf(kDown + "wait 0.02\nmove 200 130\nwait 0.02\nmove 28 130\nwait 0.05\nrelease"),
              (Times{0}));
}

// The press is over, and the client is not told so.
TEST_F(ScrollBarTracking, AReleaseOutsideAnArrowDoesNotTellTheEnd) {
    desktop.Play(kDown + "wait 0.05\nmove 200 130\nwait 0.05\nrelease");
    EXPECT_EQ(client.TakeLog(), (Log{"inhibit", "start by unit", "inhibit", "scroll 1 x 1"}));
}

TEST_F(ScrollBarTracking, AnArrowReportsNothingToItsGlog) {
    EXPECT_EQ(ResultOfClick("click 28 130"), -1);
    EXPECT_EQ(ResultOfClick(kDown + "wait 0.05\nmove 200 130\nwait 0.05\nrelease"), -1);
}

TEST_F(ScrollBarTracking, AnArrowStepsThoughTheBarDoesNotMove) {
    client.setsBar = false;
    EXPECT_EQ(TimesOf(kDown + "wait 0.35\nrelease").size(), 3u);
    EXPECT_EQ(bar->GetPosition(), 500);
}

TEST_F(ScrollBarTracking, ABarThatDiesUnderTheMouseGoesOnUntilTheRelease) {
    client.onScroll = [this] { bar->Set(0, 0); };
    EXPECT_EQ(TimesOf(kDown + "wait 0.25\nrelease").size(), 2u);
    EXPECT_EQ(TimesOf("click 28 130").size(), 0u);
}

TEST_F(ScrollBarTracking, ArrowsOfADeadBarTakeNoPress) {
    bar->Set(0, 0);
    EXPECT_EQ(ResultOfClick("click 28 130"), -1);
    EXPECT_TRUE(client.log.empty());
}

TEST_F(ScrollBarTracking, ALevelBarsArrowsStepLeftAndRight) {
    ScrollBarPane *const level = Live(Level(), 500);
    UpdateGlog(glog);
    desktop.Play("click 57 18\nclick 172 18");
    EXPECT_EQ(Amounts(), (std::vector<int>{-1, 1}));
    EXPECT_EQ(level->GetPosition(), 500);
}

TEST_F(ScrollBarTracking, ArrowsThatStandTogetherStepTheirWays) {
    ArrowsTogether const together;
    delete bar;
    bar = Live(Upright(), 500);
    UpdateGlog(glog);
    desktop.Play("click 28 116\nclick 28 130");
    EXPECT_EQ(Amounts(), (std::vector<int>{-1, 1}));
}

// Pages

TEST_F(ScrollBarTracking, APressBelowTheThumbTakesAPageAtOnce) {
    desktop.Play("click 28 110");
    EXPECT_EQ(client.TakeLog(),
              (Log{"inhibit", "start by page", "inhibit", "scroll 10 x 1", "inhibit", "done"}));
}

TEST_F(ScrollBarTracking, APressAboveTheThumbTakesAPageBack) {
    desktop.Play("click 28 30");
    EXPECT_EQ(Amounts(), std::vector<int>{-10});
}

TEST_F(ScrollBarTracking, PagesRepeatAtTheirWakeUpsAfterFifteenTicks) {
    EXPECT_EQ(TimesOf(kBelow + "wait 0.65\nrelease"), (Times{0, 0.3, 0.4, 0.5, 0.6}));
}

TEST_F(ScrollBarTracking, TheFirstPageRepeatIsDueFromTheFifteenthTickOn) {
    EXPECT_EQ(TimesOf(kBelow + "wait 0.24\nmove 28 111\nrelease"), (Times{0}));
    EXPECT_EQ(TimesOf(kBelow + "wait 0.25\nmove 28 111\nrelease"), (Times{0, 0.25}));
}

TEST_F(ScrollBarTracking, FurtherPagesAreDueEveryFiveTicks) {
    EXPECT_EQ(
        TimesOf(kBelow + "wait 0.25\nmove 28 111\nwait 0.06\nmove 28 112\nwait 0.03\nmove 28 113\nrelease"),
        (Times{0, 0.25, 0.34}));
}

TEST_F(ScrollBarTracking, TheClientMayChooseItsOwnDelayOfPages) {
    client.pageDelay = 12;
    EXPECT_EQ(TimesOf(kBelow + "wait 1.05\nrelease"), (Times{0, 0.6, 0.8, 1.0}));
}

TEST_F(ScrollBarTracking, PagesStopWhenTheThumbIsUnderTheMouse) {
    client.page = 100; // 8.4 pixels; the thumb has 16
    desktop.Play(kBelow + "wait 3\nrelease");
    EXPECT_EQ(bar->GetPosition(), 900);
    EXPECT_EQ(client.log.back(), "done");
}

TEST_F(ScrollBarTracking, PagesTowardTheStartStopWhenTheThumbIsUnderTheMouse) {
    client.page = 100;
    desktop.Play("press 28 30\nwait 3\nrelease");
    EXPECT_EQ(bar->GetPosition(), 0);
    EXPECT_EQ(Amounts(), std::vector<int>(5, -100));
}

TEST_F(ScrollBarTracking, PagesGoOnWhenTheMouseMovesOn) {
    client.page = 100;
    desktop.Play("press 28 90\nwait 2\nmove 28 120\nwait 2\nrelease");
    EXPECT_EQ(bar->GetPosition(), 1000);
}

TEST_F(ScrollBarTracking, PagesTurnRoundWithTheMouse) {
    client.page = 100;
    desktop.Play("press 28 90\nwait 2\nmove 28 40\nwait 2\nrelease");
    EXPECT_EQ(Amounts(), (std::vector<int>{100, -100, -100, -100, -100, -100}));
    EXPECT_EQ(bar->GetPosition(), 100);
}

TEST_F(ScrollBarTracking, PagesTowardTheStartBeginWithOneToo) {
    client.acceleration = 2;
    TimesOf("press 28 30\nwait 0.45\nrelease");
    EXPECT_EQ(Multipliers(), (std::vector<int>{1, 1, 1}));
    TimesOf("press 28 120\nwait 0.45\nrelease");
    EXPECT_EQ(Multipliers(), (std::vector<int>{1, 3, 5}));
}

TEST_F(ScrollBarTracking, AMouseOutsideTheTroughPausesThePages) {
    EXPECT_EQ(TimesOf(kBelow + "wait 0.05\nmove 60 110\nwait 1\nmove 28 140\nwait 1\nrelease"), (Times{0}));
}

TEST_F(ScrollBarTracking, AMouseThatReturnsToTheTroughTakesAPageAtOnce) {
    EXPECT_EQ(TimesOf(kBelow + "wait 0.05\nmove 60 110\nwait 0.95\nmove 28 110\nrelease"), (Times{0, 1.0}));
}

// Unlike an arrow, the trough tells the end wherever the mouse is.
TEST_F(ScrollBarTracking, AReleaseOutsideTheTroughTellsTheEnd) {
    desktop.Play(kBelow + "wait 0.05\nmove 200 110\nwait 0.05\nrelease");
    EXPECT_EQ(client.log.back(), "done");
}

TEST_F(ScrollBarTracking, TheTroughReportsNothingToItsGlog) {
    EXPECT_EQ(ResultOfClick("click 28 110"), -1);
    EXPECT_EQ(ResultOfClick("click 28 75"), -1);
}

TEST_F(ScrollBarTracking, TheTroughOfADeadBarTakesNoPress) {
    bar->Set(0, 0);
    EXPECT_EQ(ResultOfClick("click 28 110"), -1);
    EXPECT_TRUE(client.log.empty());
}

TEST_F(ScrollBarTracking, ThePagesOfALevelBarGoLeftAndRight) {
    Live(Level(), 500);
    UpdateGlog(glog);
    desktop.Play("click 70 18\nclick 160 18");
    EXPECT_EQ(Amounts(), (std::vector<int>{-10, 10}));
}

TEST_F(ScrollBarTracking, PagesAreShownWhileTheButtonIsDown) {
    desktop.TakePresented(glog);
    std::vector<std::size_t> presented;
    client.onScroll = [&] { presented.push_back(desktop.TakePresented(glog).size()); };
    desktop.Play(kBelow + "wait 0.45\nrelease");
    ASSERT_EQ(presented.size(), 3u);
    EXPECT_GT(presented[2], 0u); // the page before it
}

// Thumb

// At 500 of 1000 the thumb lies from 25 + 42 to 25 + 58.
TEST_F(ScrollBarTracking, APressOnTheThumbAloneMovesNothing) {
    desktop.Play("click 28 75");
    EXPECT_EQ(client.targets, std::vector<int>{});
    EXPECT_EQ(client.log.back(), "done");
}

TEST_F(ScrollBarTracking, TheThumbFollowsTheMouseFromWhereItWasTaken) {
    desktop.Play("press 28 70\nmove 28 91\nrelease"); // taken at 3, so 63 of 84 pixels
    EXPECT_EQ(client.targets, std::vector<int>{750});
    EXPECT_EQ(bar->GetPosition(), 750);
}

TEST_F(ScrollBarTracking, FractionsOfAPositionAreCutOff) {
    desktop.Play("press 28 67\nmove 28 68\nrelease"); // 43 of 84: 511.9
    EXPECT_EQ(client.targets, std::vector<int>{511});
}

TEST_F(ScrollBarTracking, ADragIsAnnouncedWhenItMovesAndEndsAnnounced) {
    desktop.Play("press 28 70\nmove 28 91\nrelease");
    EXPECT_EQ(client.TakeLog(), (Log{"greatest?", "inhibit", "to 750", "inhibit", "done"}));
}

TEST_F(ScrollBarTracking, TheThumbStopsAtTheEndsOfTheTrough) {
    desktop.Play("press 28 70\nmove 28 199\nmove 28 1\nrelease");
    EXPECT_EQ(client.targets, (std::vector<int>{1000, 0}));
}

TEST_F(ScrollBarTracking, TheMouseMayBeAnywhereBesideTheBar) {
    desktop.Play("press 28 70\nmove 300 91\nrelease");
    EXPECT_EQ(client.targets, std::vector<int>{750});
}

TEST_F(ScrollBarTracking, TheSamePositionIsNotSentAgain) {
    desktop.Play("press 28 70\nmove 29 70\nmove 28 91\nmove 29 91\nmove 40 91\nrelease");
    // The first point is that of 42 of 84 pixels, which is 500 as it was.
    EXPECT_EQ(client.targets, std::vector<int>{750});
}

TEST_F(ScrollBarTracking, ADragBackToTheStartSendsTheOldPosition) {
    desktop.Play("press 28 70\nmove 28 91\nmove 28 70\nmove 29 70\nrelease");
    EXPECT_EQ(client.targets, (std::vector<int>{750, 500}));
}

TEST_F(ScrollBarTracking, WhatTheClientRefusesIsSentAgain) {
    client.setsBar = false;
    desktop.Play("press 28 70\nmove 28 91\nmove 29 91\nrelease");
    EXPECT_EQ(client.targets, (std::vector<int>{750, 750}));
    EXPECT_EQ(bar->GetPosition(), 500);
}

TEST_F(ScrollBarTracking, AThumbThatIsHeldStillSendsNothing) {
    desktop.Play("press 28 70\nwait 5\nrelease");
    EXPECT_TRUE(client.targets.empty());
}

TEST_F(ScrollBarTracking, ANewLengthOfTheThumbCountsAtOnce) {
    client.onScrollTo = [this] {
        client.ratio = 0.5;
        client.onScrollTo = nullptr;
    };
    desktop.Play("press 28 70\nmove 28 91\nmove 29 91\nrelease"); // 63 of 84, then of 50 pixels
    EXPECT_EQ(client.targets, (std::vector<int>{750, 1000}));
}

TEST_F(ScrollBarTracking, AThumbAsLongAsTheTroughHasNoWayToGo) {
    client.ratio = 0.5;
    bar->Set(500, 1000);
    client.onScroll = nullptr;
    UpdateGlog(glog);
    client.ratio = 1.0; // the bar has not heard of it and is live still
    desktop.Play("press 28 70\nmove 28 91\nrelease");
    EXPECT_EQ(client.targets, std::vector<int>{0});
}

TEST_F(ScrollBarTracking, AGreatestPositionBelowZeroStandsForZero) {
    client.greatest = -10;
    desktop.Play("press 28 70\nmove 28 91\nrelease");
    EXPECT_EQ(client.targets, std::vector<int>{0});
}

TEST_F(ScrollBarTracking, TheLargestPositionIsReached) {
    client.greatest = std::numeric_limits<int>::max();
    bar->Set(0, client.greatest);
    UpdateGlog(glog);
    desktop.Play("press 28 30\nmove 28 199\nrelease");
    EXPECT_EQ(client.targets, std::vector<int>{client.greatest});
}

TEST_F(ScrollBarTracking, ALevelThumbFollowsTheMouseAcross) {
    ScrollBarPane *const level = Live(Level(), 500);
    UpdateGlog(glog);
    desktop.Play("press 110 18\nmove 131 190\nrelease");
    EXPECT_EQ(client.targets, std::vector<int>{750});
    EXPECT_EQ(level->GetPosition(), 750);
}

TEST_F(ScrollBarTracking, ADragIsShownAtEachMove) {
    desktop.TakePresented(glog);
    std::vector<std::size_t> presented;
    client.onScrollTo = [&] { presented.push_back(desktop.TakePresented(glog).size()); };
    desktop.Play("press 28 70\nmove 28 80\nmove 28 91\nrelease");
    ASSERT_EQ(presented.size(), 2u);
    EXPECT_GT(presented[1], 0u);
}

TEST_F(ScrollBarTracking, EveryPlaceThatTheMouseReportsIsSent) {
    // A thousand places in a second, down and up the trough again and again.
    int const kPlaces = 1000;
    std::string script = "press 28 75\n";
    int v = 75, step = 1;
    for (int i = 0; i < kPlaces; ++i) {
        v += step;
        if (v == 110 || v == 40)
            step = -step;
        script += "wait 0.001\nmove 28 " + std::to_string(v) + "\n";
    }
    desktop.Play(script + "release");
    EXPECT_EQ(client.targets.size(), static_cast<std::size_t>(kPlaces));
}

// The thumb's start belongs to the thumb, and the place before it to the trough.
TEST_F(ScrollBarTracking, TheThumbBeginsAndEndsWhereItIsDrawn) {
    desktop.Play("click 28 67\nclick 28 82");
    EXPECT_TRUE(client.steps.empty());
    desktop.Play("click 28 66\n");
    EXPECT_EQ(Amounts(), std::vector<int>{-10});
    bar->Set(500, 1000);
    UpdateGlog(glog);
    client.steps.clear();
    desktop.Play("click 28 83\n");
    EXPECT_EQ(Amounts(), std::vector<int>{10});
}
