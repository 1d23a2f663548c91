// The tabs in our panes: a TabPane, which takes one step after the other until it fits.
#include "bench/peers/GlogToolkit.h"
#include "bench/peers/PeerTabs.h"
#include "desktop/Desktop.h"
#include "host/glogRec.h"
#include "tabs/TabPane.h"

namespace {

short const kRowHeight = 17; // which is what tabs have

class GlogTabs : public PeerTabs {
public:
    GlogTabs()
        : desktop(DesktopOptions().Scale(1)) {}

    void Show() override {
        glog = desktop.NewGlog(GlogOptions().Title("Tabs").Size(kWidest, kHeight));
        std::vector<TabPane::Item> items;
        for (int i = 0; i < kTabs; ++i)
            items.push_back(TabPane::Item(UString(NameOf(i).c_str(), UString::kByteEncoding1)));
        tabs = new TabPane(glog, Rect{0, 0, kRowHeight, kWidest}, items, 0);
        Rect place = {0, 0, kHeight, kWidest};
        PositionGlog(glog, &place, false);
        desktop.FinishGlog(glog);
        tabs->FitIntoRect({0, 0, kHeight, kWidest});
        ShowGlog(glog, kShowGlog);
        Settle();
    }
    void SetWidth(int width) override {
        tabs->FitIntoRect({0, 0, kHeight, static_cast<short>(width)});
        FinishDrawing(glog);
    }
    void Settle() override { desktop.ProcessEvents(0); }

private:
    Desktop desktop;
    glogRec *glog = nullptr;
    TabPane *tabs = nullptr; // the glog's
};

} // namespace

PeerTabs *NewPeerTabs(int &, char **) { return new GlogTabs; }
