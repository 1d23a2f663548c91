#include "tests/window/RealDesktop.h"
#include "desktop/panes/Glog.h"
#include "host/glogRec.h"
#include <atomic>
#include <cstdio>
#include <thread>

namespace {

// Far longer than anything takes: a machine under load must not fail a test.
double const kPatience = 10.0;
double const kStep = 0.02, kMoment = 0.1;

} // namespace

void RealDesktop::WaitFor(std::function<bool()> const &isSo) {
    for (double waited = 0; waited < kPatience && !isSo(); waited += kStep)
        desktop.ProcessEvents(kStep);
    EXPECT_TRUE(isSo());
}

void RealDesktop::ShowAt(glogRec *record, Rect const &place) {
    Rect wanted = place;
    PositionGlog(record, &wanted, false);
    ShowGlog(record, kShowGlog);
    WaitFor([&] {
        Glog &glog = Glog::From(record);
        Point const content = glog.Window()->ScreenPlace();
        return content.h == place.left && content.v == place.top && glog.IsActive();
    });
}

void RealDesktop::Beside(std::function<void()> const &hand) {
    std::atomic<bool> done{false};
    std::thread thread([&] {
        hand();
        done = true;
    });
    while (!done)
        desktop.ProcessEvents(kStep);
    thread.join();
    desktop.ProcessEvents(kMoment);
}

void RealDesktop::Do(std::string const &lines) {
    std::FILE *const tool = popen("xdotool -", "w");
    ASSERT_NE(tool, nullptr);
    std::fputs(lines.c_str(), tool);
    EXPECT_EQ(pclose(tool), 0) << lines;
}
