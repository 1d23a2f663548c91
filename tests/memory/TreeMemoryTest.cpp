// Item trees without memory.
#include "host/UString.h"
#include "host/XMLLib.h"
#include "tests/frame/Allocations.h"
#include <gtest/gtest.h>

namespace {

typedef boost::shared_ptr<XMLLib::ContainerItem> Container;

UString Name(char const *ascii) { return UString(ascii, UString::kByteEncoding1); }

// Containers of two numbers round a container that somebody else holds as well.
Container Tree(Container const &shared, int depth) {
    Container const tree = XMLLib::CreateContainer(Name("Item"));
    tree->AddSIntItem(Name("First"), 1);
    tree->AddItem(Name("Inner"), depth > 0 ? Tree(shared, depth - 1) : shared);
    tree->AddItem(Name("Beside"), XMLLib::CreateContainer(Name("Beside")));
    tree->AddSIntItem(Name("Last"), 2);
    return tree;
}

TEST(TreeMemory, ATreeThatGoesTakesNone) {
    Container const shared = XMLLib::CreateContainer(Name("Shared"));
    shared->AddSIntItem(Name("Kept"), 3);
    Container tree = Tree(shared, 5);
    {
        Allocations::FailAfter const fail(0);
        tree.reset();
        EXPECT_FALSE(fail.HasFailed());
    }
    EXPECT_EQ(shared.use_count(), 1);
    EXPECT_EQ(shared->GetSIntItemValue(Name("Kept")), 3);
}

} // namespace
