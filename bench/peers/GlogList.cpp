// The list in our panes: a grid, which moves the pixels that stay in view.
#include "bench/peers/GlogToolkit.h"
#include "bench/peers/PeerList.h"
#include "desktop/Desktop.h"
#include "host/UString.h"
#include "host/glogRec.h"
#include "scrolling/ScrollGrid.h"
#include "text/LabelPane.h"

namespace {

class GlogList : public PeerList {
public:
    GlogList()
        : desktop(DesktopOptions().Scale(1)) {}

    void Show() override {
        glog = desktop.NewGlog(GlogOptions().Title("List").Size(kWidth + kBarWidth, kHeight));
        ScrollBarPane *const bar = new ScrollBarPane(glog, 0, 0, 0);
        Rect upright = {0, kWidth, kHeight, kWidth + kBarWidth};
        bar->SetBox(&upright);
        grid = new ScrollGrid(glog, 0, bar);
        Rect view = {0, 0, kHeight, kWidth};
        grid->SetBox(&view);
        for (int i = 0; i < kLabels; ++i)
            grid->Add(NewLabel(i), -1);
        Rect place = {0, 0, kHeight, kWidth + kBarWidth};
        PositionGlog(glog, &place, false);
        desktop.FinishGlog(glog);
        ShowGlog(glog, kShowGlog);
        Settle();
    }
    void ScrollTo(int position) override {
        grid->Scroll(position - grid->GetScrollOffset());
        FinishDrawing(glog); // the bar, which is told last
    }
    void Settle() override { desktop.ProcessEvents(0); }

private:
    LabelPane *NewLabel(int number) {
        Rect row = {0, 0, kRowHeight, kWidth};
        LabelPane *const label = LabelPane::NewLabelPane(
            glog, 0, &row, false, UString(TextOf(number).c_str(), UString::kByteEncoding1));
        label->SetBox(&row);
        return label;
    }

    Desktop desktop;
    glogRec *glog = nullptr;
    ScrollGrid *grid = nullptr; // the glog's
};

} // namespace

PeerList *NewPeerList(int &, char **) { return new GlogList; }
