// Memory that runs out while panes are made of binary records: at each use of memory there is, once.
#include "dialogs/ItemRegistry.h"
#include "tests/dialogs/OneRecord.h"
#include "tests/memory/MemoryTest.h"
#include <algorithm>
#include <vector>

namespace {

typedef std::vector<int> Record; // numbers of 16 bits

// One of each kind, at the top left of its window.
std::vector<Record> Records() {
    return {
        {2, 0, 0, 4, 100, 20, 0, 0},
        {3, 0, 0, 0, 0, 0, 0, 0},
        {4, 0, 0, 60, 120, 0, 1, 0, 14, 3, 5, 6, 0x100, 1, 0, 0, 1, 0},
        {5, 2, 2, 1, 80},
        {8, 2, 2, 22, 120, 0x21F, 0, 0, 0, 0, 0, 0, 'a' | 'b' << 8},
        {9, 12, 4, 0x206, 0, 'a' | 'b' << 8},
        {10, 0, 0, 50, 80, 1, 9003},
        {11, 10, 0, 10, 80},
        {12, 0, 0, 60, 100},
        {13, 2, 2, 1608, 3, 1, 8, 0, 0},
        {14, 2, 1},
        {18, 2, 2, 80, 1, 0},
        {43, 2, 2, 2, 18, 90, 137},
        {47, 2, 2, 16, 16, 1608, 0, 2, 0},
        {49, 2, 2, 24, 24, 1608, 0, 1, 0, 1, 0, 3, 0, 4, 0},
        {53, 1, 16, 1, 4, 4, 6, 1, 15, 22, 0, 2, 'a' | 'b' << 8},
        {54, 1, 16, 1, 4, 4, 6, 1, 15, 22, 0, 2, 'a' | 'b' << 8},
        {64, 0, 0, 16, 96, 0, 1608, 0, 0, 0, 6, 0},
    };
}

class RecordMemory : public MemoryTest, public testing::WithParamInterface<Record> {};

TEST_P(RecordMemory, LeavesNoWindowWhereItsDialogIsLoaded) {
    LoadForEachUse([] { return LoadOneRecord(GetParam()); });
}

TEST_P(RecordMemory, WorksAfterAClickAndKeysWithout) {
    glogRec *const glog = LoadOneRecord(GetParam());
    ShowGlog(glog, kShowGlog);
    desktop.Play("");
    PlayForEachUse(glog, "click 12 10\nkey Escape\nkey Tab\nkey b\nkey Down\nkey Escape\n");
}

TEST(RecordsWithoutMemory, AreTriedWithEachKindThereIs) {
    ItemRegistry const &registry = ItemRegistry::Instance();
    std::vector<Record> const records = Records();
    for (std::string const &name : registry.Names()) {
        ItemType const *const type = registry.Find(name);
        if (!type->recordMaker)
            continue;
        EXPECT_TRUE(std::any_of(records.begin(), records.end(), [&](Record const &record) {
            return registry.FindByRecord(record.front()) == type;
        })) << name;
    }
}

INSTANTIATE_TEST_SUITE_P(Kinds, RecordMemory, testing::ValuesIn(Records()),
                         [](testing::TestParamInfo<Record> const &info) {
                             return ItemRegistry::Instance().FindByRecord(info.param.front())->name;
                         });

} // namespace
