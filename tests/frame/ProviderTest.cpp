#include "tests/frame/Allocations.h"
#include "tests/frame/Ears.h"
#include <gtest/gtest.h>
#include <memory>
#include <type_traits>

static_assert(std::has_virtual_destructor<Mouth>::value, "providers are destroyed by their bases");
static_assert(std::has_virtual_destructor<Dependent<Ears>>::value, "so are dependents");
static_assert(sizeof(Mouth) == sizeof(void *) + sizeof(boost::shared_ptr<int>), "a table and the list");
static_assert(sizeof(Dependent<Ears>) == 2 * sizeof(void *), "a table and one pointer");

namespace {

class ProviderTest : public testing::Test {
protected:
    Log log;
    Listener a{"a", log}, b{"b", log}, c{"c", log};
    Mouth mouth; // goes first

    void AddAll() {
        mouth.AddDependent(&a);
        mouth.AddDependent(&b);
        mouth.AddDependent(&c);
    }
};

} // namespace

TEST_F(ProviderTest, CallsDependentsInOrderOfRegistration) {
    AddAll();
    Say(mouth, "hello");
    EXPECT_EQ(log, (Log{"a: hello", "b: hello", "c: hello"}));
}

TEST_F(ProviderTest, BroadcastsToNobodyWithoutAList) {
    Say(mouth, "hello");
    EXPECT_EQ(log, Log());
}

TEST_F(ProviderTest, HasDependentsFromTheFirstThatJoinsToTheLastThatLeaves) {
    EXPECT_FALSE(mouth.HasDependents());
    mouth.AddDependent(&a);
    mouth.AddDependent(&b);
    EXPECT_TRUE(mouth.HasDependents());
    mouth.RemoveDependent(&a);
    EXPECT_TRUE(mouth.HasDependents());
    mouth.RemoveDependent(&b);
    EXPECT_FALSE(mouth.HasDependents());
}

TEST_F(ProviderTest, CallsADependentThatWasAddedTwiceOnce) {
    mouth.AddDependent(&a);
    mouth.AddDependent(&a);
    Say(mouth, "hello");
    EXPECT_EQ(log, Log{"a: hello"});
}

TEST_F(ProviderTest, OneRemovalUndoesAddingTwice) {
    mouth.AddDependent(&a);
    mouth.AddDependent(&a);
    mouth.RemoveDependent(&a);
    EXPECT_FALSE(mouth.HasDependents());
    Say(mouth, "hello");
    EXPECT_EQ(log, Log());
}

TEST_F(ProviderTest, AddingTwiceIsRememberedOnceByTheDependent) {
    Allocations::Counter once;
    a.AddProvider(&mouth);
    long const toRememberOnce = once.Count();
    a.RemoveProvider(&mouth);
    Allocations::Counter twice;
    a.AddProvider(&mouth);
    a.AddProvider(&mouth);
    EXPECT_EQ(twice.Count(), toRememberOnce) << "a second entry needs a larger vector";
    a.RemoveProvider(&mouth);
    Allocations::Counter again;
    a.AddProvider(&mouth);
    EXPECT_EQ(again.Count(), toRememberOnce) << "an entry was left behind";
    a.RemoveProvider(&mouth);
}

TEST_F(ProviderTest, ADependentThatWasAddedTwiceAndHasLeftMayOutliveTheProvider) {
    std::unique_ptr<Listener> survivor(new Listener("s", log));
    std::unique_ptr<Mouth> shortLived(new Mouth);
    survivor->DependUpon(shortLived.get());
    survivor->DependUpon(shortLived.get());
    survivor->CancelDependency(shortLived.get());
    shortLived.reset();
    survivor.reset(); // would ask the dead provider if it still remembered it
    EXPECT_EQ(log, Log());
}

TEST_F(ProviderTest, AddingAgainKeepsTheOldPlace) {
    AddAll();
    mouth.AddDependent(&a);
    Say(mouth, "hello");
    EXPECT_EQ(log, (Log{"a: hello", "b: hello", "c: hello"}));
}

TEST_F(ProviderTest, KeepsTheOrderOfTheOthersWhenOneLeaves) {
    AddAll();
    mouth.RemoveDependent(&b);
    Say(mouth, "hello");
    EXPECT_EQ(log, (Log{"a: hello", "c: hello"}));
}

TEST_F(ProviderTest, IgnoresTheRemovalOfAStranger) {
    mouth.RemoveDependent(&b);
    mouth.AddDependent(&a);
    mouth.RemoveDependent(&b);
    Say(mouth, "hello");
    EXPECT_EQ(log, Log{"a: hello"});
}

TEST_F(ProviderTest, DoesNotCallTheExcludedDependent) {
    AddAll();
    Say(mouth, "hello", &b);
    EXPECT_EQ(log, (Log{"a: hello", "c: hello"}));
}

TEST_F(ProviderTest, ExcludingAStrangerExcludesNobody) {
    mouth.AddDependent(&a);
    Say(mouth, "hello", &b);
    EXPECT_EQ(log, Log{"a: hello"});
}

TEST_F(ProviderTest, CostsNoMemoryUntilSomebodyJoins) {
    Allocations::Counter counter;
    Mouth fresh;
    Listener quiet("q", log);
    std::string const word;
    fresh.BroadcastChange(Message1<Ears, std::string const &, std::string>(&Ears::Hear, &word), nullptr);
    EXPECT_EQ(counter.Count(), 0);
    fresh.AddDependent(&quiet);
    EXPECT_GT(counter.Count(), 0);
}

TEST_F(ProviderTest, BroadcastsWithoutUsingMemory) {
    struct Silent : Ears {
        void Hear(std::string const &) override {}
    } silent;
    mouth.AddDependent(&silent);
    std::string const word;
    Allocations::Counter counter;
    mouth.BroadcastChange(Message1<Ears, std::string const &, std::string>(&Ears::Hear, &word), nullptr);
    EXPECT_EQ(counter.Count(), 0);
}

TEST_F(ProviderTest, ADependentJoinsByDependUponAndLeavesByCancelDependency) {
    a.DependUpon(&mouth);
    Say(mouth, "one");
    a.CancelDependency(&mouth);
    Say(mouth, "two");
    EXPECT_EQ(log, Log{"a: one"});
    EXPECT_FALSE(mouth.HasDependents());
}

TEST_F(ProviderTest, CancellingWhatWasNeverBegunChangesNothing) {
    a.CancelDependency(&mouth);
    b.DependUpon(&mouth);
    a.CancelDependency(&mouth);
    Say(mouth, "hello");
    EXPECT_EQ(log, Log{"b: hello"});
}

TEST_F(ProviderTest, DependUponOfAnObjectThatIsNoListenerDoesNothing) {
    Dependent<Ears> deaf;
    deaf.DependUpon(&mouth);
    EXPECT_FALSE(mouth.HasDependents());
}

TEST_F(ProviderTest, AMessageIsNotDeliveredToAnObjectThatIsNoListener) {
    Dependent<Ears> deaf;
    std::string const word = "hello";
    Message1<Ears, std::string const &, std::string> message(&Ears::Hear, &word);
    message.CastAndBroadcast(&deaf);
    message.CastAndBroadcast(&a);
    EXPECT_EQ(log, Log{"a: hello"});
}

TEST_F(ProviderTest, ADyingDependentLeavesAllItsProviders) {
    Mouth second, third;
    {
        Listener shortLived("s", log);
        shortLived.DependUpon(&mouth);
        shortLived.DependUpon(&second);
        shortLived.DependUpon(&third);
        a.DependUpon(&second);
    }
    EXPECT_FALSE(mouth.HasDependents());
    EXPECT_TRUE(second.HasDependents());
    EXPECT_FALSE(third.HasDependents());
    Say(second, "hello");
    EXPECT_EQ(log, Log{"a: hello"});
    a.CancelDependency(&second);
}

TEST_F(ProviderTest, ADependentOfTwoProvidersKeepsOneWhenItLeavesTheOther) {
    Mouth second;
    a.DependUpon(&mouth);
    a.DependUpon(&second);
    a.CancelDependency(&mouth);
    Say(mouth, "one");
    Say(second, "two");
    EXPECT_EQ(log, Log{"a: two"});
    a.CancelDependency(&second);
}

TEST_F(ProviderTest, ACopyOfADependentDependsOnNobody) {
    a.DependUpon(&mouth);
    {
        Listener copy(a);
        Say(mouth, "hello");
    }
    Say(mouth, "again");
    EXPECT_EQ(log, (Log{"a: hello", "a: again"}));
}

TEST_F(ProviderTest, ACopyOfADependentMayOutliveItsProvider) {
    std::unique_ptr<Mouth> shortLived(new Mouth);
    a.DependUpon(shortLived.get());
    Listener const copy(a);
    shortLived.reset();
    EXPECT_EQ(log, Log{"a: dying"});
}

TEST_F(ProviderTest, HoldsNoMemoryOnEitherSideOnceTheLastHasLeft) {
    Allocations::Counter first;
    a.DependUpon(&mouth);
    long const toJoin = first.Count();
    a.CancelDependency(&mouth);
    Allocations::Counter second;
    a.DependUpon(&mouth);
    EXPECT_EQ(second.Count(), toJoin) << "something was still there";
}

TEST_F(ProviderTest, AssigningDependentsLeavesWhatBothDependOn) {
    struct Counting : Ears {
        int heard = 0;
        void Hear(std::string const &) override { ++heard; }
    } first, second;
    first.DependUpon(&mouth);
    second = first;
    Say(mouth, "hello");
    EXPECT_EQ(first.heard, 1);
    EXPECT_EQ(second.heard, 0);
}
