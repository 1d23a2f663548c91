// What dependents learn when a provider goes.
#include "tests/frame/Ears.h"
#include <gtest/gtest.h>
#include <memory>

namespace {

class ProviderDying : public testing::Test {
protected:
    Log log;
    std::unique_ptr<Mouth> mouth{new Mouth};
    std::unique_ptr<Listener> a{new Listener("a", log)};
    std::unique_ptr<Listener> b{new Listener("b", log)};
    std::unique_ptr<Listener> c{new Listener("c", log)};

    void AddAll() {
        a->DependUpon(mouth.get());
        b->DependUpon(mouth.get());
        c->DependUpon(mouth.get());
    }
};

} // namespace

TEST_F(ProviderDying, EveryDependentIsToldInOrderOfRegistration) {
    AddAll();
    mouth.reset();
    EXPECT_EQ(log, (Log{"a: dying", "b: dying", "c: dying"}));
}

TEST_F(ProviderDying, NamesTheProvider) {
    Mouth *const expected = mouth.get();
    Mouth *told = nullptr;
    a->onDying = [&](Mouth *dying) { told = dying; };
    a->DependUpon(mouth.get());
    mouth.reset();
    EXPECT_EQ(told, expected);
}

TEST_F(ProviderDying, TheProviderIsTakenOutOfTheDependentFirst) {
    a->DependUpon(mouth.get());
    a->onDying = [this](Mouth *) { a.reset(); };
    mouth.reset();
    EXPECT_EQ(log, Log{"a: dying"});
    EXPECT_EQ(a, nullptr);
}

TEST_F(ProviderDying, CancellingOnThatOccasionIsHarmless) {
    AddAll();
    b->onDying = [this](Mouth *dying) { b->CancelDependency(dying); };
    mouth.reset();
    EXPECT_EQ(log, (Log{"a: dying", "b: dying", "c: dying"}));
}

TEST_F(ProviderDying, ALaterDependentThatIsRemovedOnThatOccasionIsNotTold) {
    AddAll();
    a->onDying = [this](Mouth *dying) { dying->RemoveDependent(b.get()); };
    mouth.reset();
    EXPECT_EQ(log, (Log{"a: dying", "c: dying"}));
}

TEST_F(ProviderDying, ALaterDependentThatIsDestroyedOnThatOccasionIsNotTold) {
    AddAll();
    a->onDying = [this](Mouth *) { c.reset(); };
    mouth.reset();
    EXPECT_EQ(log, (Log{"a: dying", "b: dying"}));
}

TEST_F(ProviderDying, AnEarlierDependentMayBeDestroyedOnThatOccasion) {
    AddAll();
    c->onDying = [this](Mouth *) { a.reset(); };
    mouth.reset();
    EXPECT_EQ(log, (Log{"a: dying", "b: dying", "c: dying"}));
}

TEST_F(ProviderDying, ABroadcastOnThatOccasionReachesThoseInTheList) {
    AddAll();
    a->onDying = [](Mouth *dying) { Say(*dying, "farewell"); };
    mouth.reset();
    EXPECT_EQ(log, (Log{"a: dying", "a: farewell", "b: farewell", "c: farewell", "b: dying", "c: dying"}));
}

TEST_F(ProviderDying, LeavesTheOtherProvidersOfADependentAlone) {
    Mouth other;
    a->DependUpon(mouth.get());
    a->DependUpon(&other);
    mouth.reset();
    Say(other, "hello");
    EXPECT_EQ(log, (Log{"a: dying", "a: hello"}));
    a->CancelDependency(&other);
}

TEST_F(ProviderDying, ADependentThatDiesAfterItsProviderTouchesNothing) {
    AddAll();
    mouth.reset();
    a.reset();
    b.reset();
    EXPECT_EQ(log, (Log{"a: dying", "b: dying", "c: dying"}));
}

TEST_F(ProviderDying, IsSilentForADependentThatHasLeft) {
    AddAll();
    b->CancelDependency(mouth.get());
    mouth.reset();
    EXPECT_EQ(log, (Log{"a: dying", "c: dying"}));
}

TEST_F(ProviderDying, ADependentThatJoinsOnThatOccasionIsNotTold) {
    a->DependUpon(mouth.get());
    a->onDying = [this](Mouth *dying) {
        dying->AddDependent(b.get());
        b->RemoveProvider(dying); // nobody else will
    };
    mouth.reset();
    EXPECT_EQ(log, Log{"a: dying"});
}
