#include "desktop/drawing/Surface.h"
#include "desktop/windows/EventLoop.h"
#include "host/CIdleChore.h"
#include "host/MouseTask.h"
#include "host/PanePtr.h"
#include "host/PaneWatch.h"
#include "host/Services.h"
#include "tests/PaneTest.h"
#include "tests/desktop/ProbePane.h"

namespace {

// A pane whose clicks run what the test says.
class TrackingTest : public PaneTest {
protected:
    Calls &calls = FreshCalls();
    ProbePane *pane = new ProbePane(glog, {10, 20, 110, 220}, calls);

    void Track(std::string const &script, std::function<void()> const &body) {
        Show();
        pane->onClick = [body](EventRecordAdapter *) { body(); };
        desktop.Play(script);
    }
    void Log(std::string const &what) { log.push_back(what); }
    Calls log;
};

std::string Spelled(Point p) { return std::to_string(p.h) + "," + std::to_string(p.v); }

TEST_F(TrackingTest, EachMoveIsToldUntilTheRelease) {
    Track("press 30 20\nmove 31 22\nmove 40 50\nrelease", [&] {
        Point p{0, 0};
        while (MouseIsDragging(&p, nullptr))
            Log(Spelled(p));
        Log("up");
    });
    EXPECT_EQ(log, (Calls{"31,22", "40,50", "up"}));
}

TEST_F(TrackingTest, AReleaseThatComesWhileAKeyIsHandledEndsThePress) {
    class PausingPane : public ProbePane {
    public:
        using ProbePane::ProbePane;
        int Key(EventRecordAdapter *) override {
            Yield(0.5);
            return -1;
        }
    };
    glog->SetCurItem(new PausingPane(glog, {0, 0, 5, 5}, calls));
    Show();
    desktop.Play("press 30 20\nkey a\nrelease");
    EXPECT_FALSE(EventLoop::Instance().IsTracking());
}

TEST_F(TrackingTest, PointsAreLocalToTheCurrentPort) {
    ProbeContainer *container = new ProbeContainer(glog, {20, 30, 120, 230});
    ProbePane *inside = new ProbePane(glog, {0, 0, 50, 50}, calls, "inside");
    container->Add(inside, -1);
    Show();
    Point p{0, 0};
    inside->onClick = [&](EventRecordAdapter *) {
        inside->Prepare();
        MouseIsDragging(&p, nullptr);
    };
    desktop.Play("press 40 40\nmove 50 60\nrelease");
    EXPECT_EQ(p, (Point{40, 20}));
}

TEST_F(TrackingTest, AMoveToTheSamePlaceIsNoMovement) {
    Track("press 30 20\nmove 30 20\nmove 30 20\nrelease", [&] {
        Point p{0, 0};
        while (MouseIsDragging(&p, nullptr))
            Log(Spelled(p));
    });
    EXPECT_TRUE(log.empty());
}

TEST_F(TrackingTest, WhenTheScriptHasEndedATrackingLoopGetsItsRelease) {
    Track("press 30 20\nmove 35 25", [&] {
        Point p{0, 0};
        while (MouseIsDragging(&p, nullptr))
            Log(Spelled(p));
        Log("up");
    });
    EXPECT_EQ(log, (Calls{"35,25", "up"}));
}

TEST_F(TrackingTest, ATimeoutAnswersTrueWithThePositionUnchanged) {
    Track("press 30 20\nwait 0.25\nmove 31 20\nrelease", [&] {
        Point p{7, 7};
        MouseTracking::Result result = MouseTracking::Result(0);
        double when = 0;
        for (int i = 0; MouseIsDraggingWithTimeout(0.1, &p, &when, &result); ++i)
            Log(Spelled(p) + (result == MouseTracking::kTimedOut ? " timed out at " : " moved at ") +
                std::to_string(static_cast<int>(desktop.Now() * 1000 + 0.5)));
    });
    EXPECT_EQ(log, (Calls{"7,7 timed out at 100", "7,7 timed out at 200", "31,20 moved at 250"}));
}

TEST_F(TrackingTest, BothPointersMayBeNull) {
    Track("press 30 20\nmove 31 20\nrelease", [&] {
        int steps = 0;
        while (MouseIsDragging(nullptr, nullptr))
            ++steps;
        Log(std::to_string(steps));
    });
    EXPECT_EQ(log, Calls{"1"});
}

TEST_F(TrackingTest, WithoutAHeldButtonNothingDrags) {
    Show();
    Point p{1, 2};
    EXPECT_FALSE(MouseIsDragging(&p, nullptr));
    EXPECT_FALSE(OS::Services::StillDown());
    EXPECT_EQ(desktop.Now(), 0);
}

TEST_F(TrackingTest, StillDownSeesTheReleaseThatHasHappened) {
    Track("press 30 20\nwait 0.3\nrelease", [&] {
        Log(OS::Services::StillDown() ? "down" : "up");
        Yield(0.2);
        Log(OS::Services::StillDown() ? "down" : "up");
        Yield(0.2);
        Log(OS::Services::StillDown() ? "down" : "up");
    });
    EXPECT_EQ(log, (Calls{"down", "down", "up"}));
}

TEST_F(TrackingTest, StillDownIsTrueWhenAMovementIsToCome) {
    Track("press 30 20\nmove 40 20\nrelease", [&] {
        Log(OS::Services::StillDown() ? "down" : "up");
        Point p{0, 0};
        Log(MouseIsDragging(&p, nullptr) ? "moved" : "up");
    });
    EXPECT_EQ(log, (Calls{"down", "moved"}));
}

TEST_F(TrackingTest, StillDownIsFalseAfterAClick) {
    Track("click 30 20", [&] { Log(OS::Services::StillDown() ? "down" : "up"); });
    EXPECT_EQ(log, Calls{"up"});
}

TEST_F(TrackingTest, AReleaseThatATrackerLeavesIsHandledLater) {
    Track("press 30 20\nmove 31 21\nrelease\nclick 30 20", [&] { Log("click"); });
    EXPECT_EQ(log, (Calls{"click", "click"}));
}

TEST_F(TrackingTest, YieldLetsExactlyItsTimePass) {
    Track("press 30 20\nrelease", [&] {
        double const before = TarnSystemTime::GetCurrentEventTime();
        Yield(0.125);
        Log(std::to_string(TarnSystemTime::GetCurrentEventTime() - before));
    });
    EXPECT_EQ(log, Calls{"0.125000"});
}

TEST_F(TrackingTest, KeysThatArriveWhileAPaneTracksWaitForTheMainLoop) {
    glog->SetCurItem(pane);
    Track("press 30 20\nkey a\nrelease", [&] {
        Point p{0, 0};
        while (MouseIsDragging(&p, nullptr)) {
        }
        Log(Count(calls, "pane: Key 97") ? "key came early" : "key waits");
    });
    EXPECT_EQ(log, Calls{"key waits"});
    EXPECT_EQ(Count(calls, "pane: Key 97"), 1);
}

TEST_F(TrackingTest, OtherPanesAreRedrawnWhileOneTracks) {
    ProbePane *other = new ProbePane(glog, {150, 0, 170, 50}, calls, "other");
    Track("press 30 20\nwait 0.1\nmove 40 40\nrelease", [&] {
        int const before = Count(calls, "other: draw");
        other->Inval();
        Point p{0, 0};
        MouseIsDragging(&p, nullptr);
        Log(std::to_string(Count(calls, "other: draw") - before));
    });
    EXPECT_EQ(log, Calls{"1"});
}

TEST_F(TrackingTest, LosingTheWindowsActivationEndsATrackingLoopAsARelease) {
    Track("press 30 20\nmove 50 50\nactivate off\nmove 60 60\nmove 70 70\nrelease", [&] {
        Point p{0, 0};
        while (MouseIsDragging(&p, nullptr))
            Log(Spelled(p));
        Log("up");
    });
    EXPECT_EQ(log, (Calls{"50,50", "up"}));
}

TEST_F(TrackingTest, ASnapshotInAScriptShowsTheStateOfTheTrackingLoop) {
    std::string const file = testing::TempDir() + "glog-tracking.png";
    std::remove(file.c_str());
    Track("press 30 20\nsnapshot " + file + "\nrelease", [&] {
        Point p{0, 0};
        while (MouseIsDragging(&p, nullptr)) {
        }
    });
    std::string error;
    EXPECT_NE(Surface::ReadPng(file, error), nullptr) << error;
}

TEST_F(TrackingTest, YieldUntilKeyUpEndsWithTheKey) {
    Show();
    glog->SetCurItem(pane);
    class Waiting : public ProbePane {
    public:
        using ProbePane::ProbePane;
        int Key(EventRecordAdapter *event) override {
            unsigned const key = static_cast<unsigned>(event->message & 0xFF);
            Note_(KeybdMgr::Instance().IsKeyPressed(static_cast<int>(key)) ? "pressed" : "up");
            YieldUntilKeyUp(key);
            Note_(KeybdMgr::Instance().IsKeyPressed(static_cast<int>(key)) ? "pressed" : "up");
            return -1;
        }
        void Note_(char const *what) { calls.push_back(what); }
    };
    Waiting *waiting = new Waiting(glog, {0, 0, 5, 5}, calls, "waiting");
    glog->SetCurItem(waiting);
    desktop.Play("");
    calls.clear();
    desktop.Play("key a");
    EXPECT_EQ(calls, (Calls{"pressed", "up"}));
}

// Mouse tasks

class LoggingTask : public MouseTask {
public:
    LoggingTask(Calls &log_, double sleep)
        : MouseTask(0)
        , log(log_) {
        if (sleep > 0)
            SetSleepTime(sleep);
    }
    void MouseTaskBegin() override { log.push_back("begin " + Spelled(GetStartPoint())); }
    void MouseTaskContinue(Point const &p) override {
        log.push_back("continue " + Spelled(p) +
                      (GetTrackingResult() == MouseTracking::kTimedOut ? " timed out" : ""));
    }
    void MouseTaskEnd() override { log.push_back("end"); }
    Calls &log;
};

TEST_F(TrackingTest, AMouseTaskBeginsOnceContinuesForEveryPositionAndEndsOnce) {
    Track("press 30 20\nmove 31 21\nmove 40 40\nrelease", [&] {
        LoggingTask task(log, 0);
        pane->TrackMouse(task, {20, 30});
    });
    EXPECT_EQ(log, (Calls{"begin 30,20", "continue 31,21", "continue 40,40", "end"}));
}

TEST_F(TrackingTest, AMouseTaskContinuesEachTimeItsSleepTimeRunsOut) {
    Track("press 30 20\nwait 0.25\nmove 31 21\nrelease", [&] {
        LoggingTask task(log, 0.1);
        pane->TrackMouse(task, {20, 30});
    });
    EXPECT_EQ(log, (Calls{"begin 30,20", "continue 30,20 timed out", "continue 30,20 timed out",
                          "continue 31,21", "end"}));
}

TEST_F(TrackingTest, TheAutoScrollTimeIsATwentiethOfASecond) {
    EXPECT_EQ(MouseTask::DefaultAutoScrollTime(), 0.05);
}

// Idle time

TEST_F(TrackingTest, VisiblePanesOfTheActiveGlogAreToldOfIdleTimeBeforeEachWait) {
    ProbePane *hidden = new ProbePane(glog, {0, 0, 5, 5}, calls, "hidden");
    hidden->SetVisibility(0);
    Show();
    desktop.Play("");
    int const before = pane->idles;
    desktop.Play("wait 1\nclick 1 199");
    EXPECT_GT(pane->idles, before);
    EXPECT_EQ(hidden->idles, 0);
    desktop.Play("activate off");
    int const inactive = pane->idles;
    desktop.Play("click 1 199");
    EXPECT_EQ(pane->idles, inactive);
}

// Chores

class Chore : public CIdleChore {
public:
    Chore(long long interval, UseInitialDelay delay)
        : CIdleChore(interval, delay) {}
    std::function<void()> work;

protected:
    void DoIdle() override { work(); }
};

TEST_F(TrackingTest, AChoreWithoutIntervalRunsAtEveryIdleTimeUntilItCancelsItself) {
    Show();
    Chore chore(0, CIdleChore::kNoInitialDelay);
    int runs = 0;
    chore.work = [&] {
        if (++runs == 2)
            chore.Cancel();
    };
    chore.Assign();
    desktop.Play("click 1 1\nclick 1 1\nclick 1 1");
    EXPECT_EQ(runs, 2);
}

TEST_F(TrackingTest, AChoreWithAnIntervalRunsOnTheTick) {
    Show();
    Chore chore(30, CIdleChore::kInitialDelay);
    Calls times;
    chore.work = [&] { times.push_back(std::to_string(desktop.Now())); };
    chore.Assign();
    desktop.Play("wait 1.6");
    EXPECT_EQ(times, (Calls{"0.500000", "1.000000", "1.500000"}));
}

TEST_F(TrackingTest, AChoreThatIsDestroyedIsCancelled) {
    Show();
    int runs = 0;
    {
        Chore chore(0, CIdleChore::kNoInitialDelay);
        chore.work = [&] { ++runs; };
        chore.Assign();
    }
    desktop.Play("click 1 1");
    EXPECT_EQ(runs, 0);
}

TEST_F(TrackingTest, AChoreMayCancelAnotherThatIsDueAtTheSameTime) {
    Show();
    Chore one(0, CIdleChore::kNoInitialDelay), two(0, CIdleChore::kNoInitialDelay);
    int runs = 0;
    one.work = [&] { two.Cancel(); };
    two.work = [&] { ++runs; };
    one.Assign();
    two.Assign();
    desktop.Play("click 1 1");
    EXPECT_EQ(runs, 0);
}

// A task that notes its calls and does what the test says when it goes on.
class NotingTask : public MouseTask {
public:
    NotingTask(Calls &log_, std::function<void()> onContinue_)
        : MouseTask(0)
        , log(log_)
        , onContinue(std::move(onContinue_)) {}

    void MouseTaskBegin() override { log.push_back("begin"); }
    void MouseTaskContinue(Point const &where) override {
        log.push_back(Spelled(where));
        onContinue();
    }
    void MouseTaskEnd() override { log.push_back("end"); }

private:
    Calls &log;
    std::function<void()> onContinue;
};

TEST_F(TrackingTest, ATaskRunsFromThePressToTheRelease) {
    Track("press 30 20\nmove 31 22\nrelease", [&] {
        NotingTask task(log, [] {});
        pane->TrackMouse(task, {20, 30});
    });
    EXPECT_EQ(log, (Calls{"begin", "31,22", "end"}));
}

TEST_F(TrackingTest, ATaskWhosePaneIsDeletedIsOverWithoutItsEnd) {
    Track("press 30 20\nmove 31 22\nmove 32 22\nrelease", [&] {
        NotingTask task(log, [&] {
            delete pane;
            pane = nullptr;
        });
        pane->TrackMouse(task, {20, 30});
    });
    EXPECT_EQ(pane, nullptr);
    EXPECT_EQ(log, (Calls{"begin", "31,22"}));
}

TEST_F(TrackingTest, AWatchKnowsWhetherItsPaneExists) {
    PaneWatch first(pane), second(pane);
    ProbePane *other = new ProbePane(glog, {0, 0, 10, 10}, calls);
    second.Watch(other);
    EXPECT_TRUE(first.PaneExists());
    delete pane;
    EXPECT_FALSE(first.PaneExists());
    EXPECT_TRUE(second.PaneExists());
    second.Watch(nullptr);
    EXPECT_FALSE(second.PaneExists());
}

TEST_F(TrackingTest, APointerToAPaneIsNullOnceThePaneIsGone) {
    PanePtr<ProbePane> pointer;
    EXPECT_FALSE(pointer);
    pointer = pane;
    EXPECT_EQ(pointer.Get(), pane);
    delete pane;
    EXPECT_EQ(pointer.Get(), nullptr);
}

} // namespace
