// Commands to a scroll bar, by call and by the wheel, and what its client hears of them.
#include "desktop/panes/PaneEvents.h"
#include "host/CustomEventHandler.h"
#include "tests/scrolling/ScrollBarTest.h"
#include <limits>
#include <memory>

namespace {

class Turn : public WheelEvent {
public:
    explicit Turn(float delta, int axis = 1)
        : WheelEvent(Point{0, 0}, delta, axis) {}
};

class OtherEvent : public UIEvent {
public:
    boost::shared_ptr<MouseWheelParams> GetMouseWheelParams() override { return {}; }
};

class ScrollBarCommands : public ScrollBarTest {
protected:
    ScrollBarCommands()
        : bar(Live(Upright(), 500)) {
        client.TakeLog();
    }
    // The amount that the client is told to scroll by when the wheel turns.
    int AmountOfTurn(float delta, int axis = 1) {
        Turn turn(delta, axis);
        std::unique_ptr<CustomEventHandler, void (*)(CustomEventHandler *)> const handler(
            bar->CanHandleCustomEvent(&turn), [](CustomEventHandler *h) { ::operator delete(h); });
        EXPECT_TRUE(handler->HandleEvent(&turn));
        return client.steps.empty() ? -1000000 : client.steps.back().amount;
    }

    ScrollBarPane *bar;
};

int const kGreatestInt = std::numeric_limits<int>::max();
float const kInfinity = std::numeric_limits<float>::infinity();

} // namespace

// By call

TEST_F(ScrollBarCommands, AUnitIsAnnouncedStartedScrolledAndEnded) {
    bar->ScrollOneUnit(true);
    EXPECT_EQ(client.TakeLog(),
              (Log{"inhibit", "start by unit", "inhibit", "scroll 1 x 1", "inhibit", "done"}));
    EXPECT_EQ(client.announcedGlog, glog);
}

TEST_F(ScrollBarCommands, AUnitBackwardIsNegative) {
    client.unit = 4;
    bar->ScrollOneUnit(false);
    EXPECT_EQ(client.TakeLog(),
              (Log{"inhibit", "start by unit", "inhibit", "scroll -4 x 1", "inhibit", "done"}));
}

TEST_F(ScrollBarCommands, APageIsAnnouncedStartedScrolledAndEnded) {
    bar->ScrollPage(true);
    EXPECT_EQ(client.TakeLog(),
              (Log{"inhibit", "start by page", "inhibit", "scroll 10 x 1", "inhibit", "done"}));
    bar->ScrollPage(false);
    EXPECT_EQ(client.TakeLog(),
              (Log{"inhibit", "start by page", "inhibit", "scroll -10 x 1", "inhibit", "done"}));
}

TEST_F(ScrollBarCommands, TheMultiplierIsTheClientsFirstOne) {
    client.firstMultiplier = 7;
    bar->ScrollOneUnit(false);
    bar->ScrollPage(false);
    ASSERT_EQ(client.steps.size(), 2u);
    EXPECT_EQ(client.steps[0].multiplier, 7);
    EXPECT_EQ(client.steps[1].multiplier, 7);
}

TEST_F(ScrollBarCommands, AStepBelowOneBecomesOne) {
    for (int amount : {0, -1, std::numeric_limits<int>::min()}) {
        client.unit = client.page = amount;
        client.steps.clear();
        bar->ScrollOneUnit(true);
        bar->ScrollOneUnit(false);
        bar->ScrollPage(true);
        bar->ScrollPage(false);
        ASSERT_EQ(client.steps.size(), 4u);
        for (int i = 0; i < 4; ++i)
            EXPECT_EQ(client.steps[static_cast<std::size_t>(i)].amount, i % 2 ? -1 : 1);
    }
}

TEST_F(ScrollBarCommands, TheEndIsTheGreatestPosition) {
    bar->ScrollToEnd(true);
    EXPECT_EQ(client.TakeLog(), (Log{"inhibit", "greatest?", "inhibit", "to 1000", "done"}));
    EXPECT_EQ(bar->GetPosition(), 1000);
}

TEST_F(ScrollBarCommands, TheStartIsZero) {
    bar->ScrollToEnd(false);
    EXPECT_EQ(client.TakeLog(), (Log{"inhibit", "to 0", "done"}));
    EXPECT_EQ(bar->GetPosition(), 0);
}

TEST_F(ScrollBarCommands, TheEndMayBeAnywhere) {
    client.greatest = -5;
    bar->ScrollToEnd(true);
    EXPECT_EQ(client.targets, std::vector<int>{-5});
}

TEST_F(ScrollBarCommands, TheBarMovesOnlyWhenItsClientSaysSo) {
    client.setsBar = false;
    bar->ScrollOneUnit(true);
    bar->ScrollPage(true);
    bar->ScrollToEnd(true);
    EXPECT_EQ(bar->GetPosition(), 500);
}

TEST_F(ScrollBarCommands, WithoutClientNothingHappens) {
    bar->SetClient(nullptr);
    bar->ScrollOneUnit(true);
    bar->ScrollPage(false);
    bar->ScrollToEnd(true);
    Turn turn(1);
    EXPECT_TRUE(bar->DispatchCustomEvent(&turn));
    EXPECT_TRUE(client.log.empty());
    EXPECT_EQ(bar->GetPosition(), 500);
}

TEST_F(ScrollBarCommands, ADeadBarPassesThemOnAsWell) {
    bar->Set(0, 0);
    bar->ScrollOneUnit(true);
    EXPECT_EQ(client.steps.size(), 1u);
}

// By the wheel

TEST_F(ScrollBarCommands, ANotchUpScrollsOneUnitTowardTheStart) {
    EXPECT_EQ(AmountOfTurn(1), -1);
    EXPECT_EQ(client.TakeLog(),
              (Log{"inhibit", "start by unit", "inhibit", "scroll -1 x 1", "inhibit", "done"}));
}

TEST_F(ScrollBarCommands, NotchesAreUnitsOfTheClientsSize) {
    client.unit = 12;
    EXPECT_EQ(AmountOfTurn(-3), 36);
    EXPECT_EQ(AmountOfTurn(2), -24);
}

TEST_F(ScrollBarCommands, FractionsOfANotchAreCutOff) {
    EXPECT_EQ(AmountOfTurn(1.9f), -1);
    EXPECT_EQ(AmountOfTurn(-2.9f), 2);
}

// The client hears of it, with nothing to scroll by.
TEST_F(ScrollBarCommands, LessThanANotchScrollsByNothing) {
    EXPECT_EQ(AmountOfTurn(0.9f), 0);
    EXPECT_EQ(AmountOfTurn(-0.9f), 0);
    EXPECT_EQ(client.steps.size(), 2u);
}

TEST_F(ScrollBarCommands, TheWheelsAxisDoesNotMatter) {
    EXPECT_EQ(AmountOfTurn(1, 0), -1);
    EXPECT_EQ(AmountOfTurn(1, 1), -1);
    EXPECT_EQ(AmountOfTurn(1, 2), -1);
}

TEST_F(ScrollBarCommands, TurnsBeyondAllNumbersStayWithinAnInt) {
    EXPECT_EQ(AmountOfTurn(-1e30f), kGreatestInt);
    EXPECT_EQ(AmountOfTurn(-kInfinity), kGreatestInt);
    EXPECT_EQ(AmountOfTurn(1e30f), -kGreatestInt);
    EXPECT_EQ(AmountOfTurn(kInfinity), -kGreatestInt);
    EXPECT_EQ(AmountOfTurn(std::numeric_limits<float>::quiet_NaN()), 0);
}

TEST_F(ScrollBarCommands, UnitsBeyondAllNumbersStayWithinAnInt) {
    client.unit = kGreatestInt;
    EXPECT_EQ(AmountOfTurn(-100), kGreatestInt);
    EXPECT_EQ(AmountOfTurn(100), std::numeric_limits<int>::min());
}

TEST_F(ScrollBarCommands, OtherEventsAreNotHandled) {
    OtherEvent other;
    EXPECT_EQ(bar->CanHandleCustomEvent(&other), nullptr);
}

TEST_F(ScrollBarCommands, ACopiedHandlerTurnsTheSameBar) {
    Turn turn(1);
    CustomEventHandler *const handler = bar->CanHandleCustomEvent(&turn);
    CustomEventHandler *const copy = handler->Clone();
    ::operator delete(handler);
    EXPECT_TRUE(copy->HandleEvent(&turn));
    ::operator delete(copy);
    EXPECT_EQ(client.steps.size(), 1u);
}

TEST_F(ScrollBarCommands, AHandlerThatIsGivenAnotherEventBreaksAnInvariant) {
    Turn turn(1);
    CustomEventHandler *const handler = bar->CanHandleCustomEvent(&turn);
    OtherEvent withoutTurn;
    EXPECT_THROW(handler->HandleEvent(&withoutTurn), BrokenInvariant);
    ::operator delete(handler);
    EXPECT_TRUE(client.steps.empty());
}

TEST_F(ScrollBarCommands, TheWheelOverTheBarScrolls) {
    Show();
    desktop.Play("wheel 28 70 0 -2");
    ASSERT_EQ(client.steps.size(), 1u);
    EXPECT_EQ(bar->GetPosition(), 502);
}
