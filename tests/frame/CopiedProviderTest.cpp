// Copies of a provider share one list of dependents.
#include "tests/frame/Ears.h"
#include <gtest/gtest.h>
#include <memory>

namespace {

class CopiedProvider : public testing::Test {
protected:
    Log log;
    std::unique_ptr<Mouth> original{new Mouth};
    // Dependents know the original only, so they die before it.
    std::unique_ptr<Listener> a{new Listener("a", log)};
    std::unique_ptr<Listener> b{new Listener("b", log)};
};

} // namespace

TEST_F(CopiedProvider, ACopySendsToTheSameDependents) {
    original->AddDependent(a.get());
    Mouth copy(*original);
    Say(copy, "hello");
    EXPECT_EQ(log, Log{"a: hello"});
    a.reset();
}

TEST_F(CopiedProvider, SoDoesAProviderThatWasAssignedTo) {
    original->AddDependent(a.get());
    Mouth assigned;
    assigned = *original;
    Say(assigned, "hello");
    EXPECT_EQ(log, Log{"a: hello"});
    a.reset();
}

TEST_F(CopiedProvider, ADependentThatJoinsOneIsHeardThroughBoth) {
    original->AddDependent(a.get());
    Mouth copy(*original);
    original->AddDependent(b.get());
    Say(copy, "hello");
    EXPECT_EQ(log, (Log{"a: hello", "b: hello"}));
    a.reset();
    b.reset();
}

TEST_F(CopiedProvider, ACopyOfAProviderWithoutListSharesNothing) {
    Mouth copy(*original);
    original->AddDependent(a.get());
    EXPECT_FALSE(copy.HasDependents());
    Say(copy, "hello");
    EXPECT_EQ(log, Log());
}

TEST_F(CopiedProvider, TheOtherKeepsAnEmptyListWhenTheLastDependentLeavesOne) {
    original->AddDependent(a.get());
    Mouth copy(*original);
    original->RemoveDependent(a.get());
    EXPECT_FALSE(original->HasDependents());
    EXPECT_TRUE(copy.HasDependents());
    Say(copy, "hello");
    EXPECT_EQ(log, Log());
}

TEST_F(CopiedProvider, RemovalThroughTheOtherDuringABroadcastLeavesThePlacesAlone) {
    Listener c("c", log);
    original->AddDependent(a.get());
    original->AddDependent(b.get());
    original->AddDependent(&c);
    Mouth copy(*original);
    a->onHear = [&] { copy.RemoveDependent(b.get()); };
    Say(*original, "hello");
    EXPECT_EQ(log, (Log{"a: hello", "c: hello"}));
    b.reset();
}

TEST_F(CopiedProvider, TheDeathOfTheOriginalTellsTheDependentsAndSilencesTheCopy) {
    original->AddDependent(a.get());
    Mouth copy(*original);
    original.reset();
    Say(copy, "hello");
    EXPECT_EQ(log, Log{"a: dying"});
}

TEST_F(CopiedProvider, TheDeathOfTheCopyTellsTheDependentsAndSilencesTheOriginal) {
    original->AddDependent(a.get());
    Mouth *told = nullptr;
    a->onDying = [&](Mouth *dying) { told = dying; };
    std::unique_ptr<Mouth> copy(new Mouth(*original));
    Mouth *const expected = copy.get();
    copy.reset();
    EXPECT_EQ(told, expected);
    log.clear();
    Say(*original, "hello");
    EXPECT_EQ(log, Log());
    a.reset();
}

TEST_F(CopiedProvider, ADependentThatJoinsASilencedProviderIsNotCalled) {
    original->AddDependent(a.get());
    { Mouth copy(*original); }
    log.clear();
    original->AddDependent(b.get());
    Say(*original, "hello");
    EXPECT_EQ(log, Log());
    a.reset();
}

TEST_F(CopiedProvider, TheDeathOfACopyDuringABroadcastEndsIt) {
    original->AddDependent(a.get());
    original->AddDependent(b.get());
    std::unique_ptr<Mouth> copy(new Mouth(*original));
    a->onHear = [&] { copy.reset(); };
    Say(*original, "hello");
    EXPECT_EQ(log, (Log{"a: hello", "a: dying", "b: dying"}));
    a.reset();
    b.reset();
}
