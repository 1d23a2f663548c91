#include "host/RCPtr.h"
#include <gtest/gtest.h>
#include <type_traits>
#include <utility>

namespace {

class Counted : public RCObject {
public:
    explicit Counted(int &livingObjects)
        : living(livingObjects) {
        ++living;
    }
    RCPtr<Counted> next;

protected:
    ~Counted() override { --living; }

private:
    int &living;
};

class Derived : public Counted {
public:
    using Counted::Counted;
};

class RCPtrTest : public testing::Test {
protected:
    int living = 0;
};

static_assert(!std::is_copy_constructible<Counted>::value, "the count is the object's own");
static_assert(std::is_nothrow_move_constructible<RCPtr<Counted>>::value,
              "a growing vector moves its pointers, and touches none of the objects");
static_assert(std::is_convertible<Counted *, RCPtr<Counted>>::value,
              "a fresh object is handed over as it is");
static_assert(std::is_convertible<RCPtr<Derived>, RCPtr<Counted>>::value, "");

} // namespace

TEST_F(RCPtrTest, IsNullByDefault) {
    RCPtr<Counted> const none;
    EXPECT_EQ(none.get(), nullptr);
}

TEST_F(RCPtrTest, TheObjectGoesWithItsLastReference) {
    RCPtr<Counted> first(new Counted(living));
    {
        RCPtr<Counted> const second(first);
        first = RCPtr<Counted>();
        EXPECT_EQ(living, 1);
        EXPECT_NE(second.get(), nullptr);
    }
    EXPECT_EQ(living, 0);
}

TEST_F(RCPtrTest, AssigningReleasesTheFormerObject) {
    RCPtr<Counted> pointer(new Counted(living));
    pointer = new Counted(living);
    EXPECT_EQ(living, 1);
}

TEST_F(RCPtrTest, AssigningToItselfKeepsTheObject) {
    RCPtr<Counted> pointer(new Counted(living));
    RCPtr<Counted> const &same = pointer;
    pointer = same;
    EXPECT_EQ(living, 1);
}

TEST_F(RCPtrTest, TheHeadOfAChainCanBeReplacedByItsRest) {
    RCPtr<Counted> head(new Counted(living));
    head->next = new Counted(living);
    Counted *const rest = head->next.get();
    head = head->next;
    EXPECT_EQ(head.get(), rest);
    EXPECT_EQ(living, 1);
}

TEST_F(RCPtrTest, APointerToADerivedClassIsShared) {
    RCPtr<Derived> derived(new Derived(living));
    RCPtr<Counted> base(derived);
    derived = nullptr;
    EXPECT_EQ(living, 1);
    base = nullptr;
    EXPECT_EQ(living, 0);
}

TEST_F(RCPtrTest, ReachesTheObject) {
    RCPtr<Counted> const pointer(new Counted(living));
    EXPECT_EQ(&*pointer, pointer.get());
    EXPECT_EQ(pointer->next.get(), nullptr);
}

TEST_F(RCPtrTest, HandsItsReferenceOver) {
    RCPtr<Counted> from(new Counted(living));
    Counted *const object = from.get();
    RCPtr<Counted> to(std::move(from));
    EXPECT_EQ(from.get(), nullptr); // NOLINT(bugprone-use-after-move)
    EXPECT_EQ(to.get(), object);
    RCPtr<Counted> other(new Counted(living));
    other = std::move(to);
    EXPECT_EQ(other.get(), object);
    EXPECT_EQ(living, 1) << "what it held before is gone";
}

TEST_F(RCPtrTest, AReferenceTakenByHandCounts) {
    Counted *const object = new Counted(living);
    object->AddRef();
    { RCPtr<Counted> const pointer(object); }
    EXPECT_EQ(living, 1);
    object->Release();
    EXPECT_EQ(living, 0);
}
