// An outline that follows a real mouse over a real window.
#include "host/DragRect.h"
#include "host/EventRecordAdapter.h"
#include "host/GlogPane.h"
#include "host/NamedColors.h"
#include "host/VelaDrawing.h"
#include "host/glogRec.h"
#include "tests/window/RealDesktop.h"
#include "tests/window/XScreen.h"
#include <cstdlib>
#include <functional>
#include <string>
#include <thread>
#include <vector>

namespace {

short const kLeft = 200, kTop = 150; // of the window's content on the screen
short const kWidth = 240, kHeight = 160;
Rect const kPane = {20, 20, 140, 220};
Rect const kRow = {60, 21, 80, 219};

OS::RectBase<OS::RectTag> Floating(Rect const &r) {
    return {double(r.left), double(r.top), double(r.right - r.left), double(r.bottom - r.top)};
}

// Stripes, and a row that can be dragged up and down.
class StripedPane : public GlogPane, private DragRegionUpdater {
public:
    explicit StripedPane(glogRec *owner) {
        GlogPaneInit(owner, 1);
        Rect box = kPane;
        SetBox(&box);
    }

    std::function<void()> onPass;
    DragRegionTypes::Result result = {false, 0, 0};
    bool dropped = false;

protected:
    int HandleClick(EventRecordAdapter *event) override {
        result = DragRect(this, Floating(kRow), OS::Point(event->where), Floating(kPane), Floating(kPane),
                          DragRegionTypes::kVerticalOnly, this);
        dropped = true;
        return -1;
    }
    void DrawGuts(OSRgn *) override {
        for (short v = kPane.top; v < kPane.bottom; ++v) {
            VelaDrawing::RGBForeColor(v % 3 ? RGBColor{0xFFFF, 0xC000, 0x4000}
                                            : RGBColor{0x2000, 0x4000, 0xFFFF});
            VelaDrawing::MoveTo(kPane.left, v);
            VelaDrawing::LineTo(static_cast<short>(kPane.right - 1), v);
        }
    }

private:
    void UpdateDragRegion() override {
        if (onPass)
            onPass();
    }
};

class RealDrag : public RealDesktop {
protected:
    RealDrag()
        : glog(desktop.NewGlog(GlogOptions().Size(kWidth, kHeight)))
        , pane(new StripedPane(glog)) {
        ShowAt(glog, {kTop, kLeft, kTop + kHeight, kLeft + kWidth});
        desktop.ProcessEvents(0.2);
    }

    static std::string To(int h, int v) {
        return "mousemove " + std::to_string(kLeft + h) + " " + std::to_string(kTop + v) + " ";
    }
    // The steps of xdotool while the program runs, until the row has been dropped.
    void Drag(std::string const &steps) {
        int status = -1;
        std::thread hand([&] { status = std::system(("xdotool " + steps).c_str()); });
        for (int i = 0; i < 200 && !pane->dropped; ++i)
            desktop.ProcessEvents(0.05);
        hand.join();
        EXPECT_EQ(status, 0);
        desktop.ProcessEvents(0.2);
    }

    std::uint32_t Shown(int h, int v) const { return screen.PixelAt(kLeft + h, kTop + v); }
    std::vector<std::uint32_t> AllShown() const {
        std::vector<std::uint32_t> pixels;
        for (int v = 0; v < kHeight; ++v)
            for (int h = 0; h < kWidth; h += 13)
                pixels.push_back(Shown(h, v));
        return pixels;
    }
    static std::uint32_t InkOfOutlines() {
        return static_cast<std::uint32_t>(kDialogActiveTextColor.red >> 8) << 16 |
               static_cast<std::uint32_t>(kDialogActiveTextColor.green >> 8) << 8 |
               static_cast<std::uint32_t>(kDialogActiveTextColor.blue >> 8);
    }

    glogRec *glog;
    StripedPane *pane;
    XScreen screen;
};

TEST_F(RealDrag, TheOutlineFollowsTheMouseAndLeavesNoTrace) {
    std::vector<std::uint32_t> const before = AllShown();
    bool followed = false;
    pane->onPass = [&] {
        followed = followed || (Shown(100, kRow.top + 30) == InkOfOutlines() &&
                                Shown(100, kRow.bottom + 30 - 1) == InkOfOutlines() &&
                                Shown(100, kRow.top) != InkOfOutlines());
    };
    Drag(To(100, 70) + "mousedown 1 sleep 0.2 " + To(103, 85) + "sleep 0.1 " + To(106, 100) +
         "sleep 0.5 mouseup 1");
    EXPECT_TRUE(followed) << "the screen did not show the outline where the mouse took it";
    EXPECT_TRUE(pane->result.moved);
    EXPECT_EQ(pane->result.dv, 30);
    EXPECT_EQ(pane->result.dh, 0);
    EXPECT_EQ(AllShown(), before);
}

TEST_F(RealDrag, ReleasedFarAwayItHasNotMoved) {
    std::vector<std::uint32_t> const before = AllShown();
    Drag(To(100, 70) + "mousedown 1 sleep 0.2 " + To(100, 400) + "sleep 0.3 mouseup 1");
    EXPECT_FALSE(pane->result.moved);
    EXPECT_EQ(AllShown(), before);
}

} // namespace
