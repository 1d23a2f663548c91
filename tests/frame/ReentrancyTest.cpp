// What dependents may do while a message goes round.
#include "desktop/AssertionHandler.h"
#include "tests/frame/Ears.h"
#include <boost/weak_ptr.hpp>
#include <gtest/gtest.h>
#include <memory>

namespace {

class Reentrancy : public testing::Test {
protected:
    Log log;
    std::unique_ptr<Mouth> mouth{new Mouth};
    std::unique_ptr<Listener> a{new Listener("a", log)};
    std::unique_ptr<Listener> b{new Listener("b", log)};
    std::unique_ptr<Listener> c{new Listener("c", log)};

    void AddAll() {
        mouth->AddDependent(a.get());
        mouth->AddDependent(b.get());
        mouth->AddDependent(c.get());
    }
    // What the next broadcast calls, with nobody doing anything any more.
    Log NextRound() {
        for (Listener *listener : {a.get(), b.get(), c.get()})
            if (listener)
                listener->onHear = nullptr;
        log.clear();
        Say(*mouth, "next");
        return log;
    }
};

} // namespace

TEST_F(Reentrancy, ADependentThatRemovesItselfIsNotCalledAgain) {
    AddAll();
    b->onHear = [this] { mouth->RemoveDependent(b.get()); };
    Say(*mouth, "one");
    EXPECT_EQ(log, (Log{"a: one", "b: one", "c: one"}));
    EXPECT_EQ(NextRound(), (Log{"a: next", "c: next"}));
}

TEST_F(Reentrancy, ALaterDependentThatIsRemovedIsNotCalled) {
    AddAll();
    a->onHear = [this] { mouth->RemoveDependent(b.get()); };
    Say(*mouth, "one");
    EXPECT_EQ(log, (Log{"a: one", "c: one"}));
    EXPECT_EQ(NextRound(), (Log{"a: next", "c: next"}));
}

TEST_F(Reentrancy, RemovingAnEarlierDependentSkipsNobody) {
    AddAll();
    b->onHear = [this] { mouth->RemoveDependent(a.get()); };
    Say(*mouth, "one");
    EXPECT_EQ(log, (Log{"a: one", "b: one", "c: one"}));
    EXPECT_EQ(NextRound(), (Log{"b: next", "c: next"}));
}

TEST_F(Reentrancy, ADependentThatJoinsIsFirstCalledByTheNextBroadcast) {
    mouth->AddDependent(a.get());
    a->onHear = [this] { mouth->AddDependent(b.get()); };
    Say(*mouth, "one");
    EXPECT_EQ(log, Log{"a: one"});
    EXPECT_EQ(NextRound(), (Log{"a: next", "b: next"}));
}

TEST_F(Reentrancy, ManyDependentsMayJoinThoughTheListMoves) {
    mouth->AddDependent(a.get());
    mouth->AddDependent(b.get());
    std::vector<std::unique_ptr<Listener>> crowd;
    a->onHear = [&] {
        for (int i = 0; i < 100; ++i) {
            crowd.push_back(std::make_unique<Listener>("x", log));
            crowd.back()->DependUpon(mouth.get());
        }
    };
    Say(*mouth, "one");
    EXPECT_EQ(log, (Log{"a: one", "b: one"}));
    EXPECT_EQ(NextRound().size(), 102u);
}

TEST_F(Reentrancy, ADependentThatLeavesAndJoinsAgainGoesToTheEnd) {
    AddAll();
    a->onHear = [this] {
        mouth->RemoveDependent(b.get());
        mouth->AddDependent(b.get());
    };
    Say(*mouth, "one");
    EXPECT_EQ(log, (Log{"a: one", "c: one"}));
    EXPECT_EQ(NextRound(), (Log{"a: next", "c: next", "b: next"}));
}

TEST_F(Reentrancy, TheListStaysWhenTheLastDependentLeavesDuringABroadcast) {
    mouth->AddDependent(a.get());
    a->onHear = [this] { a->CancelDependency(mouth.get()); };
    Say(*mouth, "one");
    EXPECT_TRUE(mouth->HasDependents());
    EXPECT_EQ(NextRound(), Log());
    mouth->AddDependent(b.get());
    EXPECT_EQ(NextRound(), Log{"b: next"});
    mouth->RemoveDependent(b.get());
    EXPECT_FALSE(mouth->HasDependents());
}

TEST_F(Reentrancy, CancellingOnAListThatWasEmptiedIsHarmless) {
    mouth->AddDependent(a.get());
    a->onHear = [this] { a->CancelDependency(mouth.get()); };
    Say(*mouth, "one");
    b->CancelDependency(mouth.get());
    EXPECT_TRUE(mouth->HasDependents());
}

TEST_F(Reentrancy, ADependentMayDestroyItself) {
    AddAll();
    b->onHear = [this] { b.reset(); };
    Say(*mouth, "one");
    EXPECT_EQ(log, (Log{"a: one", "b: one", "c: one"}));
    EXPECT_EQ(NextRound(), (Log{"a: next", "c: next"}));
}

TEST_F(Reentrancy, ADependentMayDestroyALaterOne) {
    AddAll();
    a->onHear = [this] { c.reset(); };
    Say(*mouth, "one");
    EXPECT_EQ(log, (Log{"a: one", "b: one"}));
    EXPECT_EQ(NextRound(), (Log{"a: next", "b: next"}));
}

TEST_F(Reentrancy, ADependentMayDestroyTheProvider) {
    AddAll();
    b->onHear = [this] { mouth.reset(); };
    Say(*mouth, "one");
    EXPECT_EQ(log, (Log{"a: one", "b: one", "a: dying", "b: dying", "c: dying"}));
}

TEST_F(Reentrancy, ADependentMayDestroyTheProviderInTheInnerOfTwoBroadcasts) {
    AddAll();
    bool inner = false;
    a->onHear = [&] {
        if (inner)
            return mouth.reset();
        inner = true;
        Say(*mouth, "two");
    };
    Say(*mouth, "one");
    EXPECT_EQ(log, (Log{"a: one", "a: two", "a: dying", "b: dying", "c: dying"}));
}

TEST_F(Reentrancy, ADependentThatLeftBeforeTheProviderDiesIsNotTold) {
    AddAll();
    a->onHear = [this] {
        mouth->RemoveDependent(c.get());
        mouth.reset();
    };
    Say(*mouth, "one");
    EXPECT_EQ(log, (Log{"a: one", "a: dying", "b: dying"}));
}

TEST_F(Reentrancy, ANestedBroadcastReachesAllAndTheOuterOneGoesOn) {
    AddAll();
    b->onHear = [this] {
        b->onHear = nullptr;
        Say(*mouth, "two");
    };
    Say(*mouth, "one");
    EXPECT_EQ(log, (Log{"a: one", "b: one", "a: two", "b: two", "c: two", "c: one"}));
}

TEST_F(Reentrancy, RemovalInANestedBroadcastDisturbsNeither) {
    AddAll();
    b->onHear = [this] {
        b->onHear = [this] { mouth->RemoveDependent(a.get()); };
        Say(*mouth, "two");
    };
    Say(*mouth, "one");
    EXPECT_EQ(log, (Log{"a: one", "b: one", "a: two", "b: two", "c: two", "c: one"}));
    EXPECT_EQ(NextRound(), (Log{"b: next", "c: next"}));
}

TEST_F(Reentrancy, RemovalAfterANestedBroadcastStillLeavesThePlacesAlone) {
    AddAll();
    a->onHear = [this] {
        a->onHear = nullptr;
        Say(*mouth, "two");
        mouth->RemoveDependent(a.get());
    };
    Say(*mouth, "one");
    EXPECT_EQ(log, (Log{"a: one", "a: two", "b: two", "c: two", "b: one", "c: one"}));
    EXPECT_EQ(NextRound(), (Log{"b: next", "c: next"}));
}

TEST_F(Reentrancy, ADependentThatJoinedIsCalledByANestedBroadcast) {
    mouth->AddDependent(a.get());
    a->onHear = [this] {
        a->onHear = nullptr;
        mouth->AddDependent(b.get());
        Say(*mouth, "two");
    };
    Say(*mouth, "one");
    EXPECT_EQ(log, (Log{"a: one", "a: two", "b: two"}));
}

namespace {

struct BrokenPointer {};

[[noreturn]] void ThrowBrokenPointer(char const *text) {
    EXPECT_EQ(std::string(text).find("px != 0"), 0u) << text;
    throw BrokenPointer();
}

// The walk over a list that the test can look into.
class Walk : public testing::Test {
protected:
    typedef Mouth::DependentList List;

    Walk() { list->dependents = {&a, &b, &c}; }

    void Broadcast(Dependent<Ears> *exclude = nullptr) {
        Message1<Ears, std::string const &, std::string> message(&Ears::Hear, &word);
        Mouth::BroadcastChangeImpl(list, message, exclude);
    }
    void Leave(std::size_t place) {
        list->dependents[place] = nullptr;
        list->needsCompaction = true;
    }

    Log log;
    Listener a{"a", log}, b{"b", log}, c{"c", log};
    std::string const word = "w";
    boost::shared_ptr<List> list = boost::make_shared<List>();
};

} // namespace

TEST_F(Walk, MarksTheListWhileItRuns) {
    bool during = false;
    a.onHear = [&] { during = list->broadcasting; };
    Broadcast();
    EXPECT_TRUE(during);
    EXPECT_FALSE(list->broadcasting);
}

TEST_F(Walk, LeavesTheMarkOfAnOuterWalkAlone) {
    list->broadcasting = true;
    Broadcast();
    EXPECT_TRUE(list->broadcasting);
}

TEST_F(Walk, CompactsOnceAfterTheOutermostBroadcast) {
    std::size_t afterInner = 0;
    bool waiting = false;
    a.onHear = [&] {
        a.onHear = nullptr;
        Leave(1);
        Broadcast();
        afterInner = list->dependents.size();
        waiting = list->needsCompaction;
    };
    Broadcast();
    EXPECT_EQ(afterInner, 3u);
    EXPECT_TRUE(waiting);
    EXPECT_EQ(list->dependents, (std::vector<Ears *>{&a, &c}));
    EXPECT_FALSE(list->needsCompaction);
}

TEST_F(Walk, CompactionTakesOutEveryNullAndKeepsTheOrder) {
    c.onHear = [&] {
        Leave(0);
        list->dependents.insert(list->dependents.begin() + 1, nullptr);
        list->dependents.push_back(nullptr);
    };
    Broadcast();
    EXPECT_EQ(list->dependents, (std::vector<Ears *>{&b, &c}));
}

TEST_F(Walk, NullsStayWhereNobodyAskedForCompaction) {
    list->dependents[1] = nullptr;
    Broadcast();
    EXPECT_EQ(log, (Log{"a: w", "c: w"}));
    EXPECT_EQ(list->dependents.size(), 3u);
}

TEST_F(Walk, ADeadProvidersListIsNeitherWalkedNorCompacted) {
    a.onHear = [&] {
        Leave(1);
        list->providerDead = true;
    };
    Broadcast();
    EXPECT_EQ(log, Log{"a: w"});
    EXPECT_EQ(list->dependents.size(), 3u);
    EXPECT_TRUE(list->needsCompaction);
}

TEST_F(Walk, AListThatBecameShorterIsReportedToTheSender) {
    a.onHear = [&] { list->dependents.pop_back(); };
    try {
        Broadcast();
        FAIL() << "nothing was thrown";
    } catch (std::out_of_range const &error) {
        EXPECT_STREQ(error.what(), "invalid vector<T> subscript");
    }
    EXPECT_EQ(log, (Log{"a: w", "b: w"}));
    EXPECT_FALSE(list->broadcasting);
}

TEST_F(Walk, OfNoListFailsAnAssertion) {
    list.reset();
    SetAssertionHandler(ThrowBrokenPointer);
    EXPECT_THROW(Broadcast(), BrokenPointer);
    SetAssertionHandler(nullptr);
}

TEST_F(Walk, KeepsTheListAliveUntilItEnds) {
    boost::weak_ptr<List> const watched = list;
    bool alive = false;
    a.onHear = [&] { list.reset(); };
    c.onHear = [&] { alive = !watched.expired(); };
    Broadcast();
    EXPECT_TRUE(alive);
    EXPECT_TRUE(watched.expired());
}
