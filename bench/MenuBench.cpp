// From the call that opens a menu to its first frame, with few items and with many out of sight.
#include "bench/BarePicture.h"
#include "desktop/SimulatedDesktop.h"
#include "desktop/windows/SimulatedWindowSystem.h"
#include "host/OSMenuHandle.h"
#include "host/glogRec.h"
#include <benchmark/benchmark.h>
#include <string>

namespace {

int const kItemHeight = 20, kShown = 20;                       // items that the window has room for
short const kWidth = 300, kHeight = kItemHeight * kShown + 18; // pixels
Rect const kPlace{0, 40, 20, 160};

OSMenuHandle MenuOf(long count) {
    OSMenuHandle menu = OSMenuHandle::CreateNewHierarchicalMenu();
    for (long i = 1; i <= count; ++i)
        menu.AppendItem(UString(("Item " + std::to_string(i)).c_str(), UString::kByteEncoding1));
    return menu;
}

// The menu is drawn over a window that has room for as many items in each case, and is dismissed when it
// first waits, which is when it shows.
void Open(benchmark::State &state) {
    SimulatedDesktop desktop;
    static_cast<SimulatedWindowSystem &>(desktop.Windows()).SetPlacesPopups(false);
    glogRec *const glog = desktop.NewGlog(GlogOptions().Size(kWidth, kHeight));
    ShowGlog(glog, kShowGlog);
    OSMenuHandle menu = MenuOf(state.range(0));
    Rect place = kPlace;
    for (auto _ : state) {
        state.PauseTiming();
        desktop.Script("menu 0");
        SetPortToGlog(glog);
        desktop.TakePresented(glog);
        state.ResumeTiming();
        RunPopupMenu(menu, 1, &place);
        state.PauseTiming();
        if (desktop.TakePresented(glog).empty())
            state.SkipWithError("the menu has not been shown");
        state.ResumeTiming();
    }
}
BENCHMARK(Open)->Name("Menu/open")->Arg(20)->Arg(1000)->Arg(10000);

// The names of what shows, laid out anew for each opening.
void OpenBare(benchmark::State &state) {
    int const kFont = 0, kIndent = 20;
    for (auto _ : state) {
        BarePicture picture(kWidth, kHeight);
        for (int i = 0; i < kShown; ++i)
            picture.Add("Item " + std::to_string(i + 1), kFont, kIndent, i * kItemHeight);
        picture.Repaint();
        if (picture.IsBlank())
            state.SkipWithError("nothing has been drawn");
    }
}
BENCHMARK(OpenBare)->Name("Menu/open bare");

} // namespace
