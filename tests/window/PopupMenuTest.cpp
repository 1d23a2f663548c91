// Pop-up menus in windows of their own, by a real mouse and real keys.
#include "desktop/menus/MenuTracker.h"
#include "host/GlogPane.h"
#include "host/OSMenuHandle.h"
#include "host/glogRec.h"
#include "tests/window/RealDesktop.h"
#include "tests/window/XScreen.h"
#include <chrono>
#include <cstdlib>
#include <string>
#include <thread>
// Last, since it defines common words.
#include <X11/Xlib.h>

namespace {

int const kLeft = 200, kTop = 300; // of the window's content on the screen
Rect const kBox{90, 40, 110, 160}; // of the pane

// Opens a menu when it is clicked.
class MenuProbe : public GlogPane {
public:
    explicit MenuProbe(glogRec *owner) {
        GlogPaneInit(owner, 1);
        Rect box = kBox;
        SetBox(&box);
        for (char const *text : {"alpha", "beta", "gamma"})
            menu.AppendItem(UString(text, UString::kByteEncoding1));
        below.AppendItem(UString("one", UString::kByteEncoding1));
        below.AppendItem(UString("two", UString::kByteEncoding1));
        menu.SetMenuItemHierarchicalID(3, below.GetMenuID());
        below.InsertMenuBeforeMenuID(-1);
    }
    ~MenuProbe() override { below.RemoveFromMenuList(); }

    OSMenuHandle menu = OSMenuHandle::CreateNewHierarchicalMenu();
    OSMenuHandle below = OSMenuHandle::CreateNewHierarchicalMenu();
    int result = -1;

protected:
    int HandleClick(EventRecordAdapter *) override {
        Prepare();
        Rect place = kBox;
        result = RunPopupMenu(menu, 1, &place);
        return -1;
    }
    void DrawGuts(OSRgn *) override {}
};

// A window of another client, which becomes active.
class OtherProgram {
public:
    OtherProgram()
        : display(XOpenDisplay(nullptr)) {
        Window const window =
            XCreateSimpleWindow(display, DefaultRootWindow(display), 600, 500, 80, 60, 0, 0, 0);
        XMapRaised(display, window);
        XSync(display, False);
    }
    ~OtherProgram() { XCloseDisplay(display); }
    OtherProgram(OtherProgram const &) = delete;
    OtherProgram &operator=(OtherProgram const &) = delete;

private:
    Display *display;
};

class RealMenu : public RealDesktop {
protected:
    RealMenu()
        : glog(desktop.NewGlog(GlogOptions().Size(300, 200)))
        , probe(new MenuProbe(glog)) {
        ShowAt(glog, {kTop, kLeft, kTop + 200, kLeft + 300});
    }

    // The steps of xdotool while the program runs; what the menu answered, -1 if it has not been open.
    int Run(std::string const &steps) {
        probe->result = -1;
        std::thread hand([&] {
            std::string const command = "xdotool " + steps;
            status = std::system(command.c_str());
        });
        for (int i = 0; i < 200 && probe->result == -1; ++i)
            if (!desktop.ProcessEvents(0.05))
                break;
        hand.join();
        EXPECT_EQ(status, 0);
        return probe->result;
    }
    // A step to the place in the window.
    static std::string To(int h, int v) {
        return "mousemove " + std::to_string(kLeft + h) + " " + std::to_string(kTop + v) + " ";
    }
    static std::string Item(int item) { return To(70, 100 + (item - 1) * 20); }
    int Choice(OSMenuHandle const &menu, int item) const {
        return static_cast<int>(static_cast<unsigned>(static_cast<unsigned short>(menu.GetMenuID())) << 16 |
                                static_cast<unsigned>(item));
    }

    glogRec *glog;
    MenuProbe *probe;
    int status = -1;
};

} // namespace

TEST_F(RealMenu, IsChosenFromByOnePressThatIsHeld) {
    EXPECT_EQ(Run(Item(1) + "mousedown 1 sleep 0.3 " + Item(2) + "sleep 0.1 mouseup 1"),
              Choice(probe->menu, 2));
}

TEST_F(RealMenu, IsChosenFromByTwoClicks) {
    EXPECT_EQ(Run(Item(1) + "click 1 sleep 0.6 " + Item(2) + "sleep 0.1 click 1"), Choice(probe->menu, 2));
}

TEST_F(RealMenu, IsChosenFromByKeys) {
    EXPECT_EQ(Run(Item(1) + "click 1 sleep 0.5 key Down sleep 0.05 key Return"), Choice(probe->menu, 2));
    EXPECT_EQ(Run(Item(1) + "click 1 sleep 0.5 key b sleep 0.05 key Return"), Choice(probe->menu, 2));
    EXPECT_EQ(Run(Item(1) + "click 1 sleep 0.5 key Up key Right key Down key Return"),
              Choice(probe->below, 2));
}

TEST_F(RealMenu, IsDismissedByEscapeAndByAClickElsewhere) {
    EXPECT_EQ(Run(Item(1) + "click 1 sleep 0.5 key Escape"), 0);
    EXPECT_EQ(Run(Item(1) + "click 1 sleep 0.5 " + To(280, 190) + "click 1"), 0) << "in the window";
    EXPECT_EQ(Run(Item(1) + "click 1 sleep 0.5 mousemove 5 5 click 1"), 0) << "on the screen's ground";
}

TEST_F(RealMenu, OpensASubmenuUnderTheMouse) {
    // to the right of the menu, level with its third item
    EXPECT_EQ(Run(Item(1) + "mousedown 1 sleep 0.3 " + Item(3) + "sleep 0.6 " + To(150, 141) + "sleep 0.1 " +
                  To(190, 160) + "sleep 0.1 mouseup 1"),
              Choice(probe->below, 2));
}

TEST_F(RealMenu, ShowsItselfInItsPlace) {
    XScreen const screen;
    std::uint32_t const before = screen.PixelAt(kLeft + 60, kTop + 118);
    std::uint32_t during = before;
    std::thread look([&] {
        std::this_thread::sleep_for(std::chrono::milliseconds(900));
        during = XScreen().PixelAt(kLeft + 30, kTop + 128);
    });
    EXPECT_EQ(Run(Item(1) + "click 1 sleep 1.2 key Escape"), 0);
    look.join();
    EXPECT_EQ(during, 0xFBFCFDu) << "the menu's ground";
    EXPECT_NE(before, during);
}

TEST_F(RealMenu, GoesWhenAnotherProgramIsActivated) {
    std::thread other([] {
        std::this_thread::sleep_for(std::chrono::milliseconds(700));
        OtherProgram const program;
        std::this_thread::sleep_for(std::chrono::milliseconds(700));
    });
    EXPECT_EQ(Run(Item(1) + "click 1 sleep 1.5"), 0);
    other.join();
}

TEST_F(RealMenu, LeavesTheMouseFree) {
    Run(Item(1) + "click 1 sleep 0.5 key Escape");
    EXPECT_FALSE(EventLoop::Instance().IsTracking());
    EXPECT_EQ(Run(Item(1) + "click 1 sleep 0.5 key Return"), Choice(probe->menu, 1)) << "a second time";
}
