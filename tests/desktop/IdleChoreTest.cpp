#include "host/CIdleChore.h"
#include "host/Services.h"
#include "tests/PaneTest.h"
#include "tests/desktop/ProbePane.h"
#include <memory>

namespace {

class Chore : public CIdleChore {
public:
    Chore(long long interval, UseInitialDelay delay, std::function<void()> work_)
        : CIdleChore(interval, delay)
        , work(std::move(work_)) {}

protected:
    void DoIdle() override { work(); }

private:
    std::function<void()> work;
};

class IdleChoreTest : public PaneTest {
protected:
    typedef std::vector<double> Times;

    IdleChoreTest() { Show(); }
    std::function<void()> Noting(Times &times) {
        return [this, &times] { times.push_back(desktop.Now()); };
    }
    Calls &calls = FreshCalls();
};

TEST_F(IdleChoreTest, WithoutAnInitialDelayItIsCalledAtOnceAndThenByItsInterval) {
    Times times;
    Chore chore(30, CIdleChore::kNoInitialDelay, Noting(times));
    chore.Assign();
    desktop.Play("wait 1.2");
    EXPECT_EQ(times, (Times{0, 0.5, 1}));
}

TEST_F(IdleChoreTest, AnIntervalBelowZeroIsNone) {
    Times times;
    Chore chore(-5, CIdleChore::kInitialDelay, Noting(times));
    chore.Assign();
    desktop.Play("click 1 1\nclick 1 1");
    EXPECT_GE(times.size(), 2u);
}

TEST_F(IdleChoreTest, AssigningItTwiceChangesNothing) {
    Times times;
    Chore chore(30, CIdleChore::kInitialDelay, Noting(times));
    chore.Assign();
    desktop.Play("wait 0.4");
    chore.Assign();
    desktop.Play("wait 0.8");
    EXPECT_EQ(times, (Times{0.5, 1}));
}

TEST_F(IdleChoreTest, CancelledAndAssignedItBeginsAnew) {
    Times times;
    Chore chore(30, CIdleChore::kInitialDelay, Noting(times));
    chore.Assign();
    desktop.Play("wait 0.25");
    chore.Cancel();
    chore.Assign();
    desktop.Play("wait 0.75");
    EXPECT_EQ(times, (Times{0.75}));
}

TEST_F(IdleChoreTest, ACallThatComesLateIsNotMadeUpFor) {
    Times times;
    Chore chore(6, CIdleChore::kNoInitialDelay, [&] {
        times.push_back(desktop.Now());
        if (times.size() == 1)
            Yield(0.55);
    });
    chore.Assign();
    desktop.Play("wait 0.7");
    EXPECT_EQ(times.size(), 3u);
}

TEST_F(IdleChoreTest, WhatIsAssignedWhileAPaneDrawsIsCalledBeforeTheNextEvent) {
    Times times;
    Chore chore(0, CIdleChore::kNoInitialDelay, [&] {
        times.push_back(desktop.Now());
        chore.Cancel();
    });
    ProbePane *const pane = new ProbePane(glog, {0, 0, 20, 20}, calls);
    pane->onDraw = [&](OSRgn *) { chore.Assign(); };
    pane->Inval();
    desktop.Play("wait 1");
    EXPECT_EQ(times, Times{0});
}

TEST_F(IdleChoreTest, AfterItsFirstCallOneWithoutIntervalWakesNobody) {
    int runs = 0;
    Chore chore(0, CIdleChore::kNoInitialDelay, [&] { ++runs; });
    chore.Assign();
    desktop.Play("wait 100");
    EXPECT_LT(runs, 10);
}

TEST_F(IdleChoreTest, WhatAChoreAssignsIsNotCalledInTheSameRound) {
    std::vector<std::string> order;
    Chore second(0, CIdleChore::kNoInitialDelay, [&] {
        order.push_back("second");
        second.Cancel();
    });
    Chore first(0, CIdleChore::kNoInitialDelay, [&] {
        order.push_back("first");
        first.Cancel();
        second.Assign();
    });
    Chore last(0, CIdleChore::kNoInitialDelay, [&] {
        order.push_back("last");
        last.Cancel();
    });
    first.Assign();
    last.Assign();
    desktop.Play("wait 0.1");
    EXPECT_EQ(order, (std::vector<std::string>{"first", "last", "second"}));
}

TEST_F(IdleChoreTest, AChoreMayDeleteItself) {
    int runs = 0;
    Chore *chore = nullptr;
    chore = new Chore(0, CIdleChore::kNoInitialDelay, [&runs, &chore] {
        ++runs;
        delete std::exchange(chore, nullptr);
    });
    chore->Assign();
    desktop.Play("click 1 1");
    EXPECT_EQ(runs, 1);
}

TEST_F(IdleChoreTest, AChoreThatFailsIsCalledAgain) {
    int runs = 0;
    Chore chore(0, CIdleChore::kNoInitialDelay, [&] {
        if (++runs == 1)
            throw std::runtime_error("not now");
    });
    chore.Assign();
    EXPECT_THROW(desktop.Play("click 1 1"), std::runtime_error);
    desktop.Play("click 1 1");
    EXPECT_GE(runs, 2);
}

TEST_F(IdleChoreTest, ItIsCalledWhileAPaneTracksTheMouse) {
    Times times;
    Chore chore(6, CIdleChore::kInitialDelay, Noting(times));
    ProbePane *const pane = new ProbePane(glog, {0, 0, 20, 20}, calls);
    Times within;
    pane->onClick = [&](EventRecordAdapter *) {
        chore.Assign();
        while (MouseIsDragging(nullptr, nullptr)) {
        }
        within = times;
    };
    desktop.Play("press 5 5\nwait 0.35\nrelease");
    EXPECT_EQ(within.size(), 3u);
}

TEST(IdleChoreWithoutDesktop, IsNeverCalledAndDoesNoHarm) {
    int runs = 0;
    Chore chore(0, CIdleChore::kNoInitialDelay, [&] { ++runs; });
    chore.Assign();
    {
        SimulatedDesktop desktop;
        ShowGlog(desktop.NewGlog(GlogOptions()), kShowGlog);
        desktop.Play("click 1 1");
        EXPECT_EQ(runs, 0);
        chore.Assign();
    }
    SimulatedDesktop another;
    ShowGlog(another.NewGlog(GlogOptions()), kShowGlog);
    another.Play("click 1 1");
    EXPECT_EQ(runs, 0);
    chore.Cancel();
}

} // namespace
