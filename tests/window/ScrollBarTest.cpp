// A scroll bar's thumb that a real mouse drags.
#include "host/glogRec.h"
#include "tests/scrolling/RecordingClient.h"
#include "tests/window/RealDesktop.h"
#include "tests/window/XScreen.h"
#include <algorithm>
#include <atomic>
#include <chrono>
#include <thread>

namespace {

short const kLeft = 200, kTop = 60; // of the window's content on the screen
Rect const kBar = {20, 20, 620, 36};
int const kThumbStart = kTop + 20 + 15; // on the screen, with the bar at its start

class RealThumb : public RealDesktop {
protected:
    RealThumb()
        : glog(desktop.NewGlog(GlogOptions().Size(60, 640)))
        , bar(new ScrollBarPane(glog, 0, 0, 0)) {
        Rect box = kBar;
        bar->SetBox(&box);
        bar->SetClient(&client);
        bar->Set(0, client.greatest);
        client.onScrollTo = [this] { ++delivered; };
        ShowAt(glog, {kTop, kLeft, kTop + 640, kLeft + 60});
    }

    ~RealThumb() override { bar->SetClient(nullptr); } // the bar goes later, with the desktop

    // Waits, in the hand's thread, until so many positions have come.
    void AwaitDelivered(int count) const {
        auto const patience = std::chrono::seconds(5);
        auto const end = std::chrono::steady_clock::now() + patience;
        while (delivered < count && std::chrono::steady_clock::now() < end)
            std::this_thread::sleep_for(std::chrono::microseconds(200));
    }

    RecordingClient client;
    glogRec *glog;
    ScrollBarPane *bar;
    std::atomic<int> delivered{0};
};

} // namespace

TEST_F(RealThumb, EveryPlaceThatTheMouseReportsIsSent) {
    int const kPlaces = 300;
    Beside([&] {
        XScreen const screen;
        int const h = kLeft + 28, v = kThumbStart + 10;
        screen.PointAt(h, v);
        Do("mousedown 1\n");
        for (int i = 1; i <= kPlaces; ++i) {
            screen.PointAt(h, v + i);
            AwaitDelivered(i);
        }
        Do("mouseup 1\n");
    });
    EXPECT_EQ(client.targets.size(), static_cast<std::size_t>(kPlaces));
    EXPECT_TRUE(std::is_sorted(client.targets.begin(), client.targets.end()));
    EXPECT_EQ(bar->GetPosition(), client.targets.back());
    EXPECT_EQ(client.log.back(), "done");
}
