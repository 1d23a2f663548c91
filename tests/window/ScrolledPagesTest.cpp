// The gallery's pages that scroll, under a storm of drags, turns of the wheel and changes of the window's
// size: what the screen shows afterwards is what a page that is drawn afresh shows.
#include "desktop/drawing/Surface.h"
#include "desktop/panes/Glog.h"
#include "desktop/panes/PaneAccess.h"
#include "desktop/windows/EventLoop.h"
#include "host/CompoundPane.h"
#include "host/glogRec.h"
#include "scrolling/ScrollBarClient.h"
#include "scrolling/ScrollBarPane.h"
#include "tests/screens/GalleryPages.h"
#include "tests/window/RealDesktop.h"
#include "tests/window/XScreen.h"
#include "tools/gallery/Gallery.h"
#include <algorithm>
#include <random>
#include <sstream>
#include <vector>

namespace {

typedef std::vector<std::uint32_t> Pixels;

short const kLeft = 10, kTop = 40; // of the window's content on the screen
int const kLeastWidth = 896, kLeastHeight = 656, kMostWidth = 1000, kMostHeight = 720;
int const kPageLeft = 200;   // in the window, beside the list of pages
int const kPagePlace = 9001; // what holds the page
int const kRounds = 4, kGestures = 30;
int const kMovesOfDrag = 6, kTurnsOfWheel = 8;

class ScrolledPage : public RealDesktop, public testing::WithParamInterface<char const *> {
protected:
    ScrolledPage()
        : gallery(desktop, GalleryFiles(), 1) {
        gallery.ShowPage(GalleryFiles().Find(GetParam()));
        ShowGlog(gallery.Window(), kHideGlog); // it comes up wherever the window manager likes
        desktop.ProcessEvents(0.1);
        ShowAt(gallery.Window(), {kTop, kLeft, kTop + kLeastHeight, kLeft + kLeastWidth});
        desktop.ProcessEvents(0.2);
    }

    Glog &TheGlog() const { return Glog::From(gallery.Window()); }
    int Random(int least, int greatest) {
        return std::uniform_int_distribution<int>(least, greatest)(random);
    }

    // The page's bars that can be scrolled.
    std::vector<ScrollBarPane *> Bars() const {
        std::vector<ScrollBarPane *> bars;
        CollectBars(*GetGlogItem(gallery.Window(), kPagePlace), bars);
        return bars;
    }
    static void CollectBars(GlogPane &pane, std::vector<ScrollBarPane *> &bars) {
        if (ScrollBarPane *const bar = dynamic_cast<ScrollBarPane *>(&pane)) {
            if (bar->GetVisibility() && bar->GetClient() && bar->GetRange() > 0)
                bars.push_back(bar);
        } else if (CompoundPane *const container = dynamic_cast<CompoundPane *>(&pane)) {
            for (short i = 0; i < container->NumSubpanes(); ++i)
                CollectBars(*container->Get(i), bars);
        }
    }

    // The storm, as lines for xdotool.
    std::string MoveTo(int h, int v) {
        ++events;
        return "mousemove " + std::to_string(kLeft + h) + ' ' + std::to_string(kTop + v) + "\nsleep 0.002\n";
    }
    // Done before what follows: a hand does not press what is about to move. The tool waits for a change.
    std::string Resize() {
        ++events;
        int const before = width;
        while (width == before)
            width = Random(kLeastWidth, kMostWidth);
        height = Random(kLeastHeight, kMostHeight);
        return "getactivewindow windowsize --sync " + std::to_string(width) + ' ' + std::to_string(height) +
               '\n';
    }
    // From somewhere on the bar, an arrow, the trough or most of all the thumb, to and fro beside it.
    std::string Drag(ScrollBarPane &bar) {
        Rect const box = bar.GetDrawRectangle();
        Point const origin = PaneAccess::Origin(bar);
        SingleAxis const along(!bar.IsHorizontal());
        double const share = static_cast<double>(bar.GetPosition()) / bar.GetRange();
        int const inner = along.Length(box) - 60;
        int const grip = Random(0, 3) == 0 ? Random(2, along.Length(box) - 2)
                                           : 20 + static_cast<int>(share * std::max(inner, 0));
        auto const at = [&](int place, int beside) {
            int const h = origin.h + (bar.IsHorizontal() ? box.left + place : box.left + beside);
            int const v = origin.v + (bar.IsHorizontal() ? box.top + beside : box.top + place);
            return MoveTo(h, v);
        };
        std::string drag = at(grip, 8) + "mousedown 1\n";
        for (int i = 0; i < kMovesOfDrag; ++i)
            drag += at(Random(-20, along.Length(box) + 20), Random(-40, 40));
        if (Random(0, 7) == 0)
            drag += Resize() + "sleep 0.05\n";
        events += 2;
        return drag + "mouseup 1\n";
    }
    std::string Wheel() {
        std::string turns = MoveTo(Random(kPageLeft, kLeastWidth - 20), Random(100, kLeastHeight - 20));
        for (int i = 0; i < kTurnsOfWheel; ++i) {
            std::string const button = std::to_string(Random(4, 7));
            turns += "mousedown " + button + " mouseup " + button + "\nsleep 0.001\n";
            ++events;
        }
        return turns;
    }
    std::string Storm() {
        std::vector<ScrollBarPane *> const bars = Bars();
        std::string storm;
        for (int i = 0; i < kGestures; ++i) {
            int const kind = Random(0, 9);
            if (kind < 5 && !bars.empty())
                storm += Drag(*bars[static_cast<std::size_t>(Random(0, static_cast<int>(bars.size()) - 1))]);
            else
                storm += kind < 9 ? Wheel() : Resize();
        }
        return storm + "mousemove 1020 2\n"; // off the window
    }

    // The pixels that the window is drawn from, as the screen has them.
    Pixels Drawn() const {
        Surface const &picture = *TheGlog().Pixels();
        std::size_t const count =
            static_cast<std::size_t>(picture.Width()) * static_cast<std::size_t>(picture.Height());
        Pixels pixels(picture.Pixels(), picture.Pixels() + count);
        for (std::uint32_t &pixel : pixels)
            pixel &= 0xFFFFFFu;
        return pixels;
    }
    Pixels DrawnAfresh() const {
        TheGlog().DamageAll();
        TheGlog().Update();
        return Drawn();
    }
    Pixels Shown() const { return XScreen().PixelsIn(kLeft, kTop, TheGlog().Width(), TheGlog().Height()); }

    // The first place that differs, or nothing.
    std::string DifferenceOf(Pixels const &pixels, Pixels const &expected) const {
        auto const fault = std::mismatch(expected.begin(), expected.end(), pixels.begin(), pixels.end());
        if (fault.first == expected.end() && fault.second == pixels.end())
            return std::string();
        int const at = static_cast<int>(fault.first - expected.begin());
        std::ostringstream text;
        text << "at " << at % TheGlog().Width() << ", " << at / TheGlog().Width();
        return text.str();
    }

    Gallery gallery;
    std::mt19937 random{20250301};
    int width = kLeastWidth, height = kLeastHeight; // that the window was asked to take
    int events = 0;
};

INSTANTIATE_TEST_SUITE_P(Gallery, ScrolledPage,
                         testing::Values("scroll-bars", "scroll-pane", "grid", "lists"),
                         [](testing::TestParamInfo<char const *> const &info) {
                             return AsTestName(info.param);
                         });

} // namespace

TEST_P(ScrolledPage, ShowsWhatAFreshOneShowsAfterAStorm) {
    ASSERT_FALSE(Bars().empty());
    for (int round = 0; round < kRounds; ++round) {
        std::string const storm = Storm();
        Beside([&] { Do(storm); });
        WaitFor([this] {
            return TheGlog().Width() == width && TheGlog().Height() == height &&
                   !EventLoop::Instance().IsTracking();
        });
        ASSERT_FALSE(HasFailure()) << TheGlog().Width() << " x " << TheGlog().Height() << " in place of "
                                   << width << " x " << height << ", tracking "
                                   << EventLoop::Instance().IsTracking() << ", round " << round;
        desktop.ProcessEvents(0.1); // what lies behind the last release
        Pixels const shown = Shown(), drawn = Drawn(), fresh = DrawnAfresh();
        ASSERT_EQ(DifferenceOf(drawn, fresh), "") << "what is drawn, round " << round;
        ASSERT_EQ(DifferenceOf(shown, fresh), "") << "what the screen shows, round " << round;
    }
    RecordProperty("events", events);
}
