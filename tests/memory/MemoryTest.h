// What the tests of items without memory share.
#pragma once
#include "desktop/SimulatedDesktop.h"
#include "desktop/panes/DesktopRep.h"
#include "desktop/panes/Glog.h"
#include "desktop/windows/EventLoop.h"
#include "dialogs/LoadError.h"
#include "host/TarnError.h"
#include "host/glogRec.h"
#include "tests/frame/Allocations.h"
#include <functional>
#include <gtest/gtest.h>
#include <new>
#include <string>

class MemoryTest : public testing::Test {
protected:
    static constexpr long kMostUses = 20000; // of memory; more would be a loop without end

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

    // With each use of memory failing in its turn. The check comes after each time.
    static void ForEachUse(std::function<void()> const &action, std::function<void()> const &check) {
        long uses = 0;
        for (bool ranOut = true; ranOut && uses < kMostUses; ++uses) {
            ranOut = RunsOut(uses, action);
            check();
            if (HasFatalFailure())
                break;
        }
        EXPECT_LT(uses, kMostUses);
    }

    // A dialog that is loaded without memory leaves no window behind.
    void LoadForEachUse(std::function<glogRec *()> const &load) {
        std::size_t const before = DesktopRep::Of(desktop).Glogs().size();
        glogRec *loaded = nullptr;
        ForEachUse(
            [&] {
                loaded = nullptr;
                loaded = load();
            },
            [&] {
                ASSERT_EQ(DesktopRep::Of(desktop).Glogs().size(), before + (loaded ? 1 : 0));
                DisposeGlog(loaded);
            });
        EXPECT_NE(loaded, nullptr);
    }

    // The script in the only window there is; afterwards it works as before.
    void PlayForEachUse(glogRec *glog, std::string const &script) {
        ForEachUse([&] { desktop.Play(script); },
                   [&] {
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
};
