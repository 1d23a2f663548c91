#include "host/XMLLib.h"
#include "desktop/resources/Resources.h"
#include "host/GlogStyleSheet.h"
#include "tests/resources/Text.h"
#include <boost/make_shared.hpp>
#include <boost/weak_ptr.hpp>
#include <chrono>
#include <gtest/gtest.h>
#include <string>

namespace {

using boost::shared_ptr;
using XMLLib::ContainerItem;

shared_ptr<ContainerItem> NewContainer() { return XMLLib::CreateContainer(U("Item")); }

TEST(ContainerItem, HasNoItemsAtFirst) {
    shared_ptr<ContainerItem> const container = NewContainer();
    EXPECT_EQ(container->GetNumItems(), 0u);
    EXPECT_FALSE(container->GetNthItem(0));
}

TEST(ContainerItem, KeepsItemsInTheOrderOfAdding) {
    shared_ptr<ContainerItem> const container = NewContainer();
    container->AddUStringItem(U("b"), U("first"));
    container->AddSIntItem(U("a"), 2);
    ASSERT_EQ(container->GetNumItems(), 2u);
    EXPECT_EQ(XMLLib::UStringFromItem(container->GetNthItem(0))->Get(), U("first"));
    EXPECT_EQ(boost::dynamic_pointer_cast<XMLLib::SIntItem>(container->GetNthItem(1))->Get(), 2);
    EXPECT_FALSE(container->GetNthItem(2));
}

TEST(ContainerItem, GivesTheStatedDefaultsForAbsentKeys) {
    shared_ptr<ContainerItem> const container = NewContainer();
    EXPECT_EQ(container->GetSIntItemValue(U("x")), 0);
    EXPECT_FALSE(container->GetSInt32Item(U("x")));
    EXPECT_TRUE(container->GetUStringItemValue(U("x")).empty());
    EXPECT_FALSE(container->GetContainerItem(U("x")));
}

TEST(ContainerItem, KeepsAllBitsOfAnInteger) {
    shared_ptr<ContainerItem> const container = NewContainer();
    container->AddSIntItem(U("big"), -9223372036854775807LL - 1);
    EXPECT_EQ(container->GetSIntItemValue(U("big")), -9223372036854775807LL - 1);
}

TEST(ContainerItem, FindsTheFirstItemOfTheRightKindUnderAKey) {
    shared_ptr<ContainerItem> const container = NewContainer();
    container->AddUStringItem(U("k"), U("text"));
    container->AddSIntItem(U("k"), 1);
    container->AddSIntItem(U("k"), 2);
    container->AddItem(U("k"), NewContainer());
    EXPECT_EQ(container->GetSIntItemValue(U("k")), 1);
    EXPECT_EQ(container->GetUStringItemValue(U("k")), U("text"));
    EXPECT_EQ(container->GetContainerItem(U("k")), container->GetNthItem(3));
}

TEST(ContainerItem, FindsTheFirstOfManyToo) {
    shared_ptr<ContainerItem> const container = NewContainer();
    for (int i = 0; i < 100; ++i) {
        container->AddSIntItem(U("Item"), i);
        container->AddUStringItem(U("key" + std::to_string(i)), U(std::to_string(i)));
    }
    EXPECT_EQ(container->GetSIntItemValue(U("Item")), 0);
    for (int i = 0; i < 100; ++i)
        EXPECT_EQ(container->GetUStringItemValue(U("key" + std::to_string(i))), U(std::to_string(i)));
    EXPECT_TRUE(container->GetUStringItemValue(U("key100")).empty());
    EXPECT_TRUE(container->GetUStringItemValue(U("Item")).empty());
}

TEST(ContainerItem, LooksUpAmongTenThousandAboutAsFastAsAmongAHundred) {
    auto const timeLookups = [](int items) {
        shared_ptr<ContainerItem> const container = NewContainer();
        for (int i = 0; i < items; ++i)
            container->AddSIntItem(U("key" + std::to_string(i)), i + 1);
        UString const last = U("key" + std::to_string(items - 1));
        auto best = std::chrono::nanoseconds::max();
        for (int round = 0; round < 5; ++round) {
            auto const start = std::chrono::steady_clock::now();
            long long sum = 0;
            for (int i = 0; i < 2000; ++i)
                sum += container->GetSIntItemValue(last);
            best = std::min<std::chrono::nanoseconds>(best, std::chrono::steady_clock::now() - start);
            EXPECT_EQ(sum, 2000LL * items);
        }
        return best;
    };
    // A walk would take a hundred times as long.
    EXPECT_LT(timeLookups(10000).count(), timeLookups(100).count() * 10);
}

TEST(ContainerItem, IgnoresANullItem) {
    shared_ptr<ContainerItem> const container = NewContainer();
    container->AddItem(U("k"), shared_ptr<XMLLib::Item>());
    EXPECT_EQ(container->GetNumItems(), 0u);
}

TEST(ContainerItem, TakesApartTreesOfAnyDepth) {
    shared_ptr<ContainerItem> root = NewContainer();
    shared_ptr<ContainerItem> innermost = root;
    for (int depth = 0; depth < 100000; ++depth) {
        shared_ptr<ContainerItem> const next = NewContainer();
        innermost->AddItem(U("in"), next);
        innermost = next;
    }
    boost::weak_ptr<ContainerItem> const watched(innermost);
    innermost.reset();
    root.reset();
    EXPECT_TRUE(watched.expired());
}

TEST(ContainerItem, LeavesSharedPartsToTheirOtherOwners) {
    shared_ptr<ContainerItem> const kept = NewContainer();
    kept->AddSIntItem(U("n"), 5);
    {
        shared_ptr<ContainerItem> const outer = NewContainer();
        outer->AddItem(U("kept"), kept);
    }
    EXPECT_EQ(kept->GetSIntItemValue(U("n")), 5);
}

TEST(Items, CastsGiveNullForAnotherKindAndForNull) {
    shared_ptr<XMLLib::Item> const integer = boost::make_shared<XMLLib::SIntItem>(1);
    EXPECT_FALSE(XMLLib::ContainerFromItem(integer));
    EXPECT_FALSE(XMLLib::UStringFromItem(integer));
    EXPECT_FALSE(XMLLib::ContainerFromItem(shared_ptr<XMLLib::Item>()));
    EXPECT_FALSE(XMLLib::UStringFromItem(shared_ptr<XMLLib::Item>()));
}

TEST(Rectangles, ComeBackAsTheyWereAdded) {
    shared_ptr<ContainerItem> const container = NewContainer();
    XMLLib::AddRect(container, U("BoundsRect"), Rect{1, -2, 30, 40});
    Rect const rect = XMLLib::GetRect(container, U("BoundsRect"));
    EXPECT_EQ(rect.top, 1);
    EXPECT_EQ(rect.left, -2);
    EXPECT_EQ(rect.bottom, 30);
    EXPECT_EQ(rect.right, 40);
}

TEST(Rectangles, AreContainersOfFourIntegers) {
    shared_ptr<ContainerItem> const container = NewContainer();
    XMLLib::AddRect(container, U("R"), Rect{1, 2, 3, 4});
    shared_ptr<ContainerItem> const rect = container->GetContainerItem(U("R"));
    ASSERT_TRUE(rect);
    EXPECT_EQ(rect->GetSIntItemValue(U("kTop")), 1);
    EXPECT_EQ(rect->GetSIntItemValue(U("kLeft")), 2);
    EXPECT_EQ(rect->GetSIntItemValue(U("kBottom")), 3);
    EXPECT_EQ(rect->GetSIntItemValue(U("kRight")), 4);
}

TEST(Rectangles, AreAllZeroWhenAbsent) {
    Rect const rect = XMLLib::GetRect(NewContainer(), U("BoundsRect"));
    EXPECT_TRUE(rect.top == 0 && rect.left == 0 && rect.bottom == 0 && rect.right == 0);
}

TEST(Rectangles, BeyondThePlaneGoToItsEdge) {
    shared_ptr<ContainerItem> const container = NewContainer();
    shared_ptr<ContainerItem> const inner = NewContainer();
    inner->AddSIntItem(U("kTop"), -1000000);
    inner->AddSIntItem(U("kBottom"), 9223372036854775807LL);
    container->AddItem(U("R"), inner);
    Rect const rect = XMLLib::GetRect(container, U("R"));
    EXPECT_EQ(rect.top, -32768);
    EXPECT_EQ(rect.bottom, 32767);
}

TEST(Points, AbsentOnesAreZeroOrLeaveTheOutputAlone) {
    shared_ptr<ContainerItem> const container = NewContainer();
    Point const origin = XMLLib::GetPoint(container, U("Origin"));
    EXPECT_TRUE(origin.v == 0 && origin.h == 0);
    Point point = {7, 8};
    EXPECT_FALSE(XMLLib::MaybeGetPoint(container, U("Origin"), point));
    EXPECT_TRUE(point.v == 7 && point.h == 8);
}

TEST(Points, AreReadFromTheirContainer) {
    shared_ptr<ContainerItem> const container = NewContainer();
    shared_ptr<ContainerItem> const inner = NewContainer();
    inner->AddSIntItem(U("kV"), 20);
    inner->AddSIntItem(U("kH"), -3);
    container->AddItem(U("Origin"), inner);
    Point point = {0, 0};
    EXPECT_TRUE(XMLLib::MaybeGetPoint(container, U("Origin"), point));
    EXPECT_TRUE(point.v == 20 && point.h == -3);
    Point const same = XMLLib::GetPoint(container, U("Origin"));
    EXPECT_TRUE(same.v == 20 && same.h == -3);
}

TEST(SystemLanguage, IsFourCharactersInAnInteger) {
    Resources::Instance().SetLanguage("en");
    EXPECT_EQ(XMLLib::GetSystemLanguageCode(), 1701737843u);
    Resources::Instance().SetLanguage("de");
    EXPECT_EQ(XMLLib::GetSystemLanguageCode(), 0x64656465u); // "dede"
    Resources::Instance().SetLanguage("en");
}

TEST(GlogStyleSheet, ReadsFromItsItem) {
    shared_ptr<ContainerItem> const item = NewContainer();
    item->AddSIntItem(U("Mode"), 3);
    item->AddUStringItem(U("Text"), U("hello"));
    item->AddItem(U("Items"), NewContainer());
    GlogStyleSheet const sheet(item);
    EXPECT_EQ(sheet.GetItemRes(), item);
    EXPECT_EQ(sheet.GetSInt32ItemValue(U("Mode")), 3);
    EXPECT_TRUE(sheet.HasSInt32ItemValue(U("Mode")));
    EXPECT_EQ(sheet.GetUStringItemValue(U("Text")), U("hello"));
    EXPECT_TRUE(sheet.GetContainerItem(U("Items")));
}

TEST(GlogStyleSheet, HasNoIntegerWhereAStringStands) {
    shared_ptr<ContainerItem> const item = NewContainer();
    item->AddUStringItem(U("Mode"), U("3"));
    GlogStyleSheet const sheet(item);
    EXPECT_FALSE(sheet.HasSInt32ItemValue(U("Mode")));
    EXPECT_EQ(sheet.GetSInt32ItemValue(U("Mode")), 0);
}

TEST(GlogStyleSheet, NarrowsToTheLow32Bits) {
    shared_ptr<ContainerItem> const item = NewContainer();
    item->AddSIntItem(U("n"), 0x100000005LL);
    EXPECT_EQ(GlogStyleSheet(item).GetSInt32ItemValue(U("n")), 5);
}

TEST(GlogStyleSheet, WithoutAnItemHasNothing) {
    GlogStyleSheet const sheet;
    EXPECT_FALSE(sheet.GetItemRes());
    EXPECT_FALSE(sheet.HasSInt32ItemValue(U("k")));
    EXPECT_EQ(sheet.GetSInt32ItemValue(U("k")), 0);
    EXPECT_TRUE(sheet.GetUStringItemValue(U("k")).empty());
    EXPECT_FALSE(sheet.GetContainerItem(U("k")));
}

TEST(GlogStyleSheet, WrapsAnotherItem) {
    shared_ptr<ContainerItem> const other = NewContainer();
    other->AddSIntItem(U("n"), 9);
    GlogStyleSheet sheet(NewContainer());
    sheet.SetItemRes(other);
    EXPECT_EQ(sheet.GetSInt32ItemValue(U("n")), 9);
}

} // namespace
