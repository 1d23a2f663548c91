// Memory that runs out at any moment of an item's life: at each use of memory there is, once.
//
// What is asked for from the C++ library is meant; the libraries underneath end the program by themselves.
#include "desktop/SimulatedDesktop.h"
#include "desktop/panes/DesktopRep.h"
#include "desktop/panes/Glog.h"
#include "desktop/windows/EventLoop.h"
#include "dialogs/DialogReader.h"
#include "dialogs/ItemRegistry.h"
#include "dialogs/LoadGlog.h"
#include "dialogs/PaneMaker.h"
#include "host/CompoundPane.h"
#include "host/GlogPane.h"
#include "host/TarnError.h"
#include "host/glogRec.h"
#include "tests/frame/Allocations.h"
#include <algorithm>
#include <fstream>
#include <functional>
#include <gtest/gtest.h>
#include <new>
#include <string>
#include <vector>

namespace {

std::string const kItems = std::string(GLOG_TEST_SOURCE_DIR) + "/memory/items.xml";
int const kWidth = 200, kHeight = 120;
long const kMostUses = 20000; // of memory; more would be a loop without end

std::vector<std::string> Types() { return ItemRegistry::Instance().Names(); }

class ItemMemory : public testing::TestWithParam<std::string> {
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

    // Does it, with memory that runs out after so many uses. True when it did run out.
    static bool RunsOut(long uses, std::function<void()> const &action) {
        Allocations::FailAfter const fail(uses);
        try {
            action();
        } catch (TarnError const &) {
            EXPECT_TRUE(fail.HasFailed());
        } catch (std::bad_alloc const &) {
            EXPECT_TRUE(fail.HasFailed());
        } catch (LoadError const &error) {
            EXPECT_TRUE(fail.HasFailed()) << error.what();
        }
        return fail.HasFailed();
    }

    // With each use of memory failing in its turn. The check comes after each time; the count of times.
    static long ForEachUse(std::function<void()> const &action, std::function<void()> const &check) {
        long uses = 0;
        for (bool ranOut = true; ranOut && uses < kMostUses; ++uses) {
            ranOut = RunsOut(uses, action);
            check();
            if (HasFatalFailure())
                break;
        }
        EXPECT_LT(uses, kMostUses);
        return uses;
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
        ForEachUse([&] { desktop.Play(script); },
                   [this] {
                       desktop.Play("release\nkey Escape\n");
                       ASSERT_FALSE(EventLoop::Instance().IsTracking());
                       ASSERT_FALSE(GlogError(glog));
                       ASSERT_EQ(DesktopRep::Of(desktop).Glogs().size(), 1u) << "a window is left open";
                   });
        Glog::From(glog).DamageAll();
        UpdateGlog(glog);
        EXPECT_FALSE(Glog::From(glog).NeedsUpdate());
        EXPECT_FALSE(desktop.DumpTree(glog).empty());
    }

    SimulatedDesktop desktop;
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
    std::size_t const before = DesktopRep::Of(desktop).Glogs().size();
    std::string const xml = "<Glog width=\"200\" height=\"120\"><Items>" + Written() + "</Items></Glog>";
    glogRec *loaded = nullptr;
    ForEachUse(
        [&] {
            loaded = nullptr;
            loaded = LoadGlogFromText(xml, "item");
        },
        [&] {
            ASSERT_EQ(DesktopRep::Of(desktop).Glogs().size(), before + (loaded ? 1 : 0));
            DisposeGlog(loaded);
        });
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
