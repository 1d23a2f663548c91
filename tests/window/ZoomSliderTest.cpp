// The slider that a zoom button pops up in a window of its own, by a real mouse.
#include "desktop/panes/DesktopRep.h"
#include "desktop/panes/Glog.h"
#include "graphics/ZoomPopUpPane.h"
#include "host/glogRec.h"
#include "tests/window/RealDesktop.h"
#include "tests/window/XScreen.h"
#include <functional>
#include <string>
#include <vector>

namespace {

int const kLeft = 200, kTop = 300;               // of the window's content on the screen
int const kButtonH = 100, kButtonV = 80;         // of the middle of the button in the window
int const kSliderTop = kTop + kButtonV - 6 - 17; // on the screen

// What the slider zooms; goes with its pane.
class Zoomed : public ZoomPopUpPaneClient {
public:
    float GetZoomFraction() override { return fraction; }
    void SetZoomFraction(float wanted) override {
        fraction = wanted;
        fractions.push_back(wanted);
    }
    void ZoomStep(bool up) override { steps.push_back(up); }
    void ZoomIdle() override {
        if (onIdle)
            onIdle();
    }
    float fraction = 0.0f;
    std::vector<float> fractions;
    std::vector<bool> steps;
    std::function<void()> onIdle;
};

class RealZoomSlider : public RealDesktop {
protected:
    RealZoomSlider()
        : glog(desktop.NewGlog(GlogOptions().Size(300, 200)))
        , client(new Zoomed)
        , pane(new ZoomPopUpPane(glog, client)) {
        pane->Offset({kButtonV - 6, kButtonH - 6});
        ShowAt(glog, {kTop, kLeft, kTop + 200, kLeft + 300});
    }

    // Takes the steps of xdotool to their end, and what follows from them.
    void Run(std::string const &steps) {
        Beside([&] { Do(steps + '\n'); });
    }
    // A step to so many pixels beside the middle of the button.
    static std::string To(int right, int down = 0) {
        return "mousemove " + std::to_string(kLeft + kButtonH + right) + ' ' +
               std::to_string(kTop + kButtonV + down) + ' ';
    }
    bool SliderIsUp() { return DesktopRep::Of(desktop).Glogs().size() == 2; }

    glogRec *glog;
    Zoomed *client;
    ZoomPopUpPane *pane;
};

} // namespace

TEST_F(RealZoomSlider, FollowsTheMouseWhileItIsHeld) {
    Run(To(0) + "mousedown 1 sleep 0.3 " + To(20) + "sleep 0.2 mouseup 1");
    ASSERT_GE(client->fractions.size(), 2u);
    EXPECT_FLOAT_EQ(client->fractions.front(), 0.0f) << "the level that it had is under the mouse";
    EXPECT_FLOAT_EQ(client->fractions.back(), 20.0f / 47.0f);
    EXPECT_FALSE(SliderIsUp());
}

TEST_F(RealZoomSlider, ReachesItsEndsBesideItsWindow) {
    client->fraction = 0.5f;
    Run(To(0) + "mousedown 1 sleep 0.3 " + To(150, 60) + "sleep 0.2 mouseup 1");
    EXPECT_EQ(client->fraction, 1.0f);
    Run(To(0) + "mousedown 1 sleep 0.3 " + To(-250, -90) + "sleep 0.2 mouseup 1");
    EXPECT_EQ(client->fraction, 0.0f) << "beside the window that it belongs to as well";
}

TEST_F(RealZoomSlider, ShowsItselfUnderTheMouseAndGoesAtTheRelease) {
    XScreen const screen;
    // Its upper edge is above the button, where the window shows its ground.
    int const h = kLeft + kButtonH + 15, v = kSliderTop + 2;
    std::uint32_t const before = screen.PixelAt(h, v);
    std::uint32_t during = before;
    bool wasUp = false;
    client->onIdle = [&] {
        wasUp = SliderIsUp();
        during = screen.PixelAt(h, v);
    };
    Run(To(0) + "mousedown 1 sleep 0.5 mouseup 1");
    EXPECT_TRUE(wasUp);
    EXPECT_NE(during, before);
    EXPECT_FALSE(SliderIsUp());
    EXPECT_EQ(screen.PixelAt(h, v), before);
}

TEST_F(RealZoomSlider, LeavesTheWindowActive) {
    bool active = false;
    client->onIdle = [&] { active = Glog::From(glog).IsActive(); };
    Run(To(0) + "mousedown 1 sleep 0.5 mouseup 1");
    EXPECT_TRUE(active) << "while it is up";
    EXPECT_TRUE(Glog::From(glog).IsActive());
}

TEST_F(RealZoomSlider, ComesUpAgain) {
    Run(To(0) + "mousedown 1 sleep 0.3 " + To(10) + "sleep 0.1 mouseup 1");
    client->fractions.clear();
    Run(To(0) + "mousedown 1 sleep 0.3 " + To(5) + "sleep 0.1 mouseup 1");
    ASSERT_GE(client->fractions.size(), 2u);
    EXPECT_GT(client->fractions.back(), client->fractions.front());
}

TEST_F(RealZoomSlider, StepsWithTheWheelOverItsButton) {
    Run(To(0) + "sleep 0.1 click 4 sleep 0.1 click 5");
    EXPECT_EQ(client->steps, (std::vector<bool>{true, false}));
    EXPECT_FALSE(SliderIsUp());
}
