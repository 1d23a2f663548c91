// Dependents that throw, and memory that runs out.
#include "tests/frame/Allocations.h"
#include "tests/frame/Ears.h"
#include <gtest/gtest.h>
#include <memory>

namespace {

class ProviderFailure : public testing::Test {
protected:
    Log log;
    Listener a{"a", log}, b{"b", log};
    Mouth mouth; // goes first
};

} // namespace

TEST_F(ProviderFailure, TheNextDependentIsCalledWhenOneThrowsTheHostsError) {
    mouth.AddDependent(&a);
    mouth.AddDependent(&b);
    a.onHear = [] { throw TarnError(); };
    EXPECT_NO_THROW(Say(mouth, "hello"));
    EXPECT_EQ(log, (Log{"a: hello", "b: hello"}));
}

TEST_F(ProviderFailure, TheNextDependentIsCalledWhenOneThrowsAnythingElse) {
    mouth.AddDependent(&a);
    mouth.AddDependent(&b);
    a.onHear = [] { throw 7; };
    b.onHear = [] { throw std::runtime_error("broken"); };
    EXPECT_NO_THROW(Say(mouth, "hello"));
    EXPECT_EQ(log, (Log{"a: hello", "b: hello"}));
}

TEST_F(ProviderFailure, ADependentThatThrowsStaysSubscribed) {
    mouth.AddDependent(&a);
    a.onHear = [] { throw TarnError(); };
    Say(mouth, "one");
    Say(mouth, "two");
    EXPECT_EQ(log, (Log{"a: one", "a: two"}));
}

TEST_F(ProviderFailure, ABroadcastWithFailuresEndsLikeAnyOther) {
    mouth.AddDependent(&a);
    a.onHear = [] { throw TarnError(); };
    Say(mouth, "one");
    // Outside of a broadcast the last to leave releases the list.
    mouth.RemoveDependent(&a);
    EXPECT_FALSE(mouth.HasDependents());
}

TEST_F(ProviderFailure, ADependentThatRemovesItselfAndThrowsIsGone) {
    mouth.AddDependent(&a);
    mouth.AddDependent(&b);
    a.onHear = [this] {
        mouth.RemoveDependent(&a);
        throw TarnError();
    };
    Say(mouth, "one");
    Say(mouth, "two");
    EXPECT_EQ(log, (Log{"a: one", "b: one", "b: two"}));
}

TEST_F(ProviderFailure, ADependentThatDestroysTheProviderMayThrow) {
    std::unique_ptr<Mouth> doomed(new Mouth);
    doomed->AddDependent(&a);
    doomed->AddDependent(&b);
    a.onHear = [&] {
        doomed.reset();
        throw TarnError();
    };
    Say(*doomed, "hello");
    EXPECT_EQ(log, (Log{"a: hello", "a: dying", "b: dying"}));
}

TEST_F(ProviderFailure, ASubscriptionForWhichThereIsNoMemorySilentlyDoesNotHappen) {
    int failures = 0;
    for (long successes = 0;; ++successes) {
        Mouth hungry;
        Listener dependent("d", log);
        bool failed = false;
        {
            Allocations::FailAfter famine(successes);
            EXPECT_NO_THROW(hungry.AddDependent(&dependent));
            failed = famine.HasFailed();
        }
        log.clear();
        Say(hungry, "hello");
        if (!failed) {
            EXPECT_EQ(log, Log{"d: hello"});
            break;
        }
        ++failures;
        EXPECT_EQ(log, Log()) << "after " << successes << " successes";
    }
    // The list, its entries, the dependent's vector and the vector's entries.
    EXPECT_EQ(failures, 4);
}

TEST_F(ProviderFailure, OthersStaySubscribedWhenASubscriptionFails) {
    mouth.AddDependent(&a);
    Allocations::FailAfter famine(0);
    mouth.AddDependent(&b);
    EXPECT_TRUE(famine.HasFailed());
    Say(mouth, "hello");
    EXPECT_EQ(log, Log{"a: hello"});
}

TEST_F(ProviderFailure, ASubscriptionThatFailedCanBeMadeLater) {
    {
        Allocations::FailAfter famine(1);
        mouth.AddDependent(&a);
        EXPECT_TRUE(famine.HasFailed());
    }
    mouth.AddDependent(&a);
    Say(mouth, "hello");
    EXPECT_EQ(log, Log{"a: hello"});
}

namespace {

// Refuses to be subscribed when told to.
class Moody : public Dependent<Moody> {
public:
    explicit Moody(Log &itsLog)
        : log(itsLog) {}

    void AddProvider(Provider<Moody> *provider) {
        if (refuses)
            throw std::runtime_error("not now");
        Dependent<Moody>::AddProvider(provider);
    }
    void Hear() {
        log.push_back("heard");
        if (onHear)
            onHear();
    }

    bool refuses = false;
    std::function<void()> onHear;
    std::function<void(Provider<Moody> *)> onDying;

private:
    void ProviderDying(Provider<Moody> *provider) override {
        log.push_back("dying");
        if (onDying)
            onDying(provider);
    }

    Log &log;
};

void Say(Provider<Moody> &mouth) { mouth.BroadcastChange(Message0<Moody>(&Moody::Hear), nullptr); }

} // namespace

TEST_F(ProviderFailure, AddingAgainEndsTheSubscriptionWhenItFails) {
    Provider<Moody> provider;
    Moody moody(log);
    provider.AddDependent(&moody);
    moody.refuses = true;
    EXPECT_NO_THROW(provider.AddDependent(&moody));
    Say(provider);
    EXPECT_EQ(log, Log());
}

// The entry goes at once, even during a broadcast: there the walk finds the list shorter than it was.
TEST_F(ProviderFailure, AFailedSubscriptionDuringABroadcastEndsTheBroadcast) {
    Provider<Moody> provider;
    Moody first(log), second(log);
    provider.AddDependent(&first);
    provider.AddDependent(&second);
    first.refuses = true;
    first.onHear = [&] { provider.AddDependent(&first); };
    EXPECT_THROW(Say(provider), std::out_of_range);
    EXPECT_EQ(log, Log{"heard"});
    log.clear();
    Say(provider);
    EXPECT_EQ(log, Log{"heard"});
}

TEST_F(ProviderFailure, AFailedSubscriptionToADyingProviderShortensItsFarewell) {
    std::unique_ptr<Provider<Moody>> provider(new Provider<Moody>);
    Moody first(log), second(log);
    provider->AddDependent(&first);
    provider->AddDependent(&second);
    first.refuses = true;
    first.onDying = [&](Provider<Moody> *dying) {
        dying->AddDependent(&first);
        second.RemoveProvider(dying); // the farewell ends before it
    };
    provider.reset();
    EXPECT_EQ(log, Log{"dying"});
}
