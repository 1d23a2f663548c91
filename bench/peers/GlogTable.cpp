// The list in our panes: a GListPane with the drawer of texts.
#include "bench/peers/GlogToolkit.h"
#include "bench/peers/PeerTable.h"
#include "desktop/Desktop.h"
#include "frame/GListPane_SelectionListener.h"
#include "host/VelaDrawing.h"
#include "host/glogRec.h"
#include "lists/GListPane.h"
#include "lists/ListTextDrawer.h"
#include "scrolling/ScrollBarPane.h"
#include <boost/make_shared.hpp>

namespace {

int const kMargin = 4;    // pixels
double const kWait = 0.2; // seconds
int const kMostWaits = 25;

class GlogTable : public PeerTable, private GListPane_SelectionListener {
public:
    GlogTable()
        : desktop(DesktopOptions().Scale(1)) {}
    ~GlogTable() override { list->SetSelectionListener(nullptr); }

    void Show() override {
        glog = desktop.NewGlog(GlogOptions().Title("List").Size(kWidth, kHeight));
        glistResRec record = glistResRec();
        record.type = glistResRec::kType;
        record.bounds = {0, 0, kHeight, kWidth - kBarWidth};
        record.selMode = kListSelectOne;
        record.lineHeight = kRowHeight;
        list = GListPane::NewGListPane(glog, &record);
        list->SetColumnList(NewColumns());
        list->SetLineDrawer(new ListTextDrawer(list, FillCell), true);
        list->SetSelColumn(1);
        ScrollBarPane *const bar = new ScrollBarPane(glog, 0, 0, 0);
        Rect upright = {0, kWidth - kBarWidth, kHeight, kWidth};
        bar->SetBox(&upright);
        list->SetScrollBar(bar);
        list->SetNumItems(kRows);
        list->SetSelectionListener(this);
        Rect place = {0, 0, kHeight, kWidth};
        PositionGlog(glog, &place, false);
        desktop.FinishGlog(glog);
        ShowGlog(glog, kShowGlog);
        Settle();
    }
    void Repaint() override {
        Rect const all = {0, 0, kHeight, kWidth};
        SetPortToGlog(glog);
        VelaDrawing::InvalRect(&all);
        FinishDrawing(glog);
    }
    void ScrollTo(int row) override {
        list->SetScrollPosition(row);
        FinishDrawing(glog);
    }
    void Settle() override { desktop.ProcessEvents(0); }
    void WaitUntilHeard() override {
        heard = false;
        for (int i = 0; i < kMostWaits && !heard; ++i)
            desktop.ProcessEvents(kWait);
    }

private:
    static boost::shared_ptr<ColumnList> NewColumns() {
        boost::shared_ptr<ColumnList> const made = boost::make_shared<ColumnList>(short(kColumns));
        for (int column = 0; column < kColumns; ++column) {
            made->SetBothEdges(column, column * kColumnWidth, (column + 1) * kColumnWidth);
            made->SetColumnMargin(column, kMargin);
        }
        return made;
    }

    static void FillCell(int line, int column, ListCell &cell) {
        cell.text = UString(TextOf(line, column).c_str(), UString::kByteEncoding1);
    }

    // Told also when the row before is given up; what counts is the new one.
    void SelectionDone(GListPane *) override {
        if (list->NumSelected() == 0)
            return;
        Heard();
        heard = true;
    }
    void ClickOccured(GListPane *, int, int, bool) override {}

    Desktop desktop;
    glogRec *glog = nullptr;
    GListPane *list = nullptr; // the glog's
    bool heard = false;
};

} // namespace

PeerTable *NewPeerTable(int &, char **) { return new GlogTable; }
