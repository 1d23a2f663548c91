#include "host/AutoPtr.h"
#include <gtest/gtest.h>

// That this file compiles at all shows that the name brings no deprecation warning with it: warnings are
// errors here.

namespace {

class Counted {
public:
    explicit Counted(int &livingObjects)
        : living(livingObjects) {
        ++living;
    }
    ~Counted() { --living; }

private:
    int &living;
};

void Swallow(AutoPtr<Counted>) {}

} // namespace

TEST(AutoPtr, OwnsItsObject) {
    int living = 0;
    {
        AutoPtr<Counted> const owner(new Counted(living));
        EXPECT_EQ(living, 1);
    }
    EXPECT_EQ(living, 0);
}

TEST(AutoPtr, HandsItsObjectOverToACall) {
    int living = 0;
    AutoPtr<Counted> owner(new Counted(living));
    Swallow(owner);
    EXPECT_EQ(living, 0);
    EXPECT_EQ(owner.get(), nullptr);
}

TEST(AutoPtr, CanBePassedAsATemporary) {
    int living = 0;
    Swallow(AutoPtr<Counted>(new Counted(living)));
    EXPECT_EQ(living, 0);
    Swallow(AutoPtr<Counted>());
}
