// A modal glog beside another window, by a real mouse and real keys.
#include "host/ModalGlog.h"
#include "desktop/Desktop.h"
#include "desktop/panes/Glog.h"
#include "host/CIdleChore.h"
#include "host/GlogPane.h"
#include "host/glogRec.h"
#include <cstdlib>
#include <gtest/gtest.h>
#include <string>
#include <thread>

namespace {

Rect const kMainPlace{300, 200, 400, 400}, kDialogPlace{300, 600, 400, 800}; // on the screen
short const kConfirm = 1, kCancel = 2;
long long const kTooLong = 15 * 60; // ticks

// Counts its clicks.
class ClickProbe : public GlogPane {
public:
    ClickProbe(glogRec *owner, short id, Rect box) {
        GlogPaneInit(owner, id);
        SetBox(&box);
    }
    int clicks = 0;

protected:
    int HandleClick(EventRecordAdapter *) override { return ++clicks; }
    void DrawGuts(OSRgn *) override {}
};

// Ends a dialog that nothing else has ended.
class Watchdog : public CIdleChore {
public:
    explicit Watchdog(glogRec *glog_)
        : CIdleChore(kTooLong, kInitialDelay)
        , glog(glog_) {
        Assign();
    }

protected:
    void DoIdle() override { ShowGlog(glog, kHideGlog); }

private:
    glogRec *glog;
};

class RealModalGlog : public testing::Test {
protected:
    RealModalGlog()
        : desktop(DesktopOptions().Scale(1))
        , main(Open(kMainPlace))
        , dialog(Open(kDialogPlace))
        , below(new ClickProbe(main, 7, {0, 0, 100, 200}))
        , confirm(new ClickProbe(dialog, kConfirm, {0, 0, 50, 200}))
        , cancel(new ClickProbe(dialog, kCancel, {50, 0, 100, 200})) {
        Show(main);
        Show(dialog);
    }
    glogRec *Open(Rect place) {
        glogRec *const glog = desktop.NewGlog(GlogOptions().Size(200, 100));
        PositionGlog(glog, &place, false);
        return glog;
    }
    void Show(glogRec *glog) {
        ShowGlog(glog, kShowGlog);
        for (int i = 0; i < 100 && !Glog::From(glog).IsActive(); ++i)
            desktop.ProcessEvents(0.05);
        EXPECT_TRUE(Glog::From(glog).IsActive());
    }

    // The steps of xdotool while the dialog runs; the item that it answered.
    short Run(std::string const &steps) {
        short item = 0;
        int value = 0;
        Watchdog const watchdog(dialog);
        std::thread hand([&] { status = std::system(("xdotool sleep 0.2 " + steps).c_str()); });
        DoModalGlog(dialog, &item, &value, nullptr, nullptr, false, 2, 0, 0, false, kRunIdleChores);
        hand.join();
        EXPECT_EQ(status, 0);
        return item;
    }
    // A click in the middle of the lower or upper half of the place.
    static std::string Click(Rect const &place, bool upper) {
        return "mousemove " + std::to_string((place.left + place.right) / 2) + ' ' +
               std::to_string(place.top + (upper ? 25 : 75)) + " sleep 0.1 click 1 ";
    }

    Desktop desktop;
    glogRec *main, *dialog;
    ClickProbe *below, *confirm, *cancel;
    int status = -1;
};

} // namespace

TEST_F(RealModalGlog, EndsWithTheItemThatIsClicked) {
    EXPECT_EQ(Run(Click(kDialogPlace, true)), kConfirm);
    EXPECT_EQ(Run(Click(kDialogPlace, false)), kCancel);
}

TEST_F(RealModalGlog, ReturnConfirmsAndEscapeCancels) {
    EXPECT_EQ(Run("key Return"), kConfirm);
    EXPECT_EQ(Run("key KP_Enter"), kConfirm);
    EXPECT_EQ(Run("key Escape"), kCancel);
}

TEST_F(RealModalGlog, ClosingItsWindowCancels) {
    EXPECT_EQ(Run("key alt+F4"), kCancel); // of the window manager
    EXPECT_TRUE(dialog->IsVisible());
}

TEST_F(RealModalGlog, OtherWindowsTakeNoClicksAndGiveTheKeyboardBack) {
    EXPECT_EQ(Run(Click(kMainPlace, true) + "sleep 0.5 key Return"), kConfirm);
    EXPECT_EQ(below->clicks, 0);
}

TEST_F(RealModalGlog, AfterwardsOtherWindowsTakeClicksAgain) {
    Run("key Escape");
    std::thread hand([&] { status = std::system(("xdotool " + Click(kMainPlace, true)).c_str()); });
    for (int i = 0; i < 100 && below->clicks == 0; ++i)
        desktop.ProcessEvents(0.05);
    hand.join();
    EXPECT_EQ(below->clicks, 1);
}
