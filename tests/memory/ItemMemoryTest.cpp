// Memory that runs out at any moment of an item's life: at each use of memory there is, once.
//
// What is asked for from the C++ library is meant; the libraries underneath end the program by themselves.
#include "dialogs/DialogReader.h"
#include "dialogs/ItemRegistry.h"
#include "dialogs/LoadGlog.h"
#include "dialogs/PaneMaker.h"
#include "host/GlogPane.h"
#include "tests/memory/MemoryTest.h"
#include <fstream>
#include <stdexcept>
#include <vector>

namespace {

std::string const kItems = std::string(GLOG_TEST_SOURCE_DIR) + "/memory/items.xml";
int const kWidth = 200, kHeight = 120;

std::vector<std::string> Types() { return ItemRegistry::Instance().Names(); }

class ItemMemory : public MemoryTest, public testing::WithParamInterface<std::string> {
protected:
    ItemMemory()
        : dialog(DialogReader::ReadFile(kItems))
        , glog(desktop.NewGlog(GlogOptions().Size(kWidth, kHeight))) {}

    DialogItem const &Item() const {
        for (DialogItem const &item : dialog.items) {
            if (item.type->name == GetParam())
                return item;
        }
        throw std::logic_error("items.xml has no " + GetParam());
    }

    // The item's line of the file.
    static std::string Written() {
        std::ifstream file(kItems);
        std::string const mark = "<Item type=\"" + GetParam() + '"';
        std::string line;
        while (std::getline(file, line)) {
            if (line.find(mark) != std::string::npos)
                return line;
        }
        return std::string();
    }

    std::vector<GlogPane *> Panes() const { return Glog::From(glog).Items(); }

    // The item in a window that is shown.
    void Show() {
        PaneMaker(glog).Make(Item());
        desktop.FinishGlog(glog);
        ShowGlog(glog, kShowGlog);
        desktop.Run();
        desktop.WatchMessages([](std::string const &) {});
    }

    // The script, with each use of memory failing in its turn; afterwards the window works as before.
    void PlayWithoutMemory(std::string const &script) {
        Show();
        PlayForEachUse(glog, script);
    }

    Dialog dialog;
    glogRec *glog;
};

TEST_P(ItemMemory, LeavesNothingHalfMadeInItsWindow) {
    GlogPane *made = nullptr;
    ForEachUse(
        [&] {
            made = nullptr;
            made = PaneMaker(glog).Make(Item());
        },
        [&] {
            // Of what had no memory some can be done without.
            std::vector<GlogPane *> const panes = Panes();
            ASSERT_EQ(panes.size(), made ? 1u : 0u);
            delete made;
            made = nullptr;
            ASSERT_EQ(CountGlogItems(glog), 0);
        });
}

TEST_P(ItemMemory, LeavesNoWindowWhereItsDialogIsLoaded) {
    std::string const xml = "<Glog width=\"200\" height=\"120\"><Items>" + Written() + "</Items></Glog>";
    LoadForEachUse([&] { return LoadGlogFromText(xml, "item"); });
}

TEST_P(ItemMemory, IsDrawnAgainAfterADrawingWithout) {
    Show();
    ForEachUse(
        [&] {
            Glog::From(glog).DamageAll();
            UpdateGlog(glog);
        },
        [] {});
    EXPECT_FALSE(Glog::From(glog).NeedsUpdate());
}

TEST_P(ItemMemory, WorksAfterAClickWithout) {
    PlayWithoutMemory("click 12 10\nkey Escape\nwait 1\nkey Escape\n");
}

TEST_P(ItemMemory, WorksAfterADragWithout) {
    PlayWithoutMemory(
        "press 12 10\nmove 20 12\nwait 0.5\nmove 40 30\nrelease\nkey Escape\nwait 1\nkey Escape\n");
}

TEST_P(ItemMemory, WorksAfterKeysWithout) {
    PlayWithoutMemory("key Tab\ntype \"ab\"\nkey Left shift\nkey Backspace\nkey Return\nkey Down\n");
}

TEST_P(ItemMemory, WorksAfterTheWheelWithout) { PlayWithoutMemory("wheel 12 10 0 -1\nwheel 12 10 1 0\n"); }

TEST_P(ItemMemory, WorksAfterItsHelpTagWithout) { PlayWithoutMemory("move 12 10\nwait 2\nmove 150 100\n"); }

INSTANTIATE_TEST_SUITE_P(Types, ItemMemory, testing::ValuesIn(Types()),
                         [](testing::TestParamInfo<std::string> const &info) { return info.param; });

} // namespace
