// A list of three columns: what is seen of it, and what is worked out for all of its rows.
#include "bench/BarePicture.h"
#include "bench/ProcessorClock.h"
#include "desktop/SimulatedDesktop.h"
#include "host/glogRec.h"
#include "lists/GListPane.h"
#include "lists/ListTextDrawer.h"
#include "scrolling/ScrollBarPane.h"
#include <benchmark/benchmark.h>
#include <boost/make_shared.hpp>
#include <malloc.h>
#include <memory>
#include <random>
#include <string>

namespace {

short const kWidth = 600, kHeight = 400, kBarWidth = 16, kRowHeight = 16; // pixels
short const kNameWidth = 280, kTimeWidth = 200;                           // of columns; the last has the rest
int const kFew = 1000, kMany = 1000000;                                   // rows
int const kShown = 25;                                                    // of the list
int const kColumns = 3;
int const kFirstNumber = 1000000; // of the rows: texts of all lists are of one length

UString Numbered(char const *word, int number) {
    UString text(word, UString::kByteEncoding1), digits;
    tarn::NumToUString(number, tarn::kPlainNumber, digits);
    text += digits;
    return text;
}

void FillCell(int line, int column, ListCell &cell) {
    static char const *const kWords[kColumns] = {"Take of the song no. ", "starts at ", "-"};
    cell.text = Numbered(kWords[column], kFirstNumber + line);
}

boost::shared_ptr<ColumnList> Columns() {
    ColumnList::Data columns[kColumns];
    columns[0].rightEdge = columns[1].leftEdge = kNameWidth;
    columns[1].rightEdge = columns[2].leftEdge = kNameWidth + kTimeWidth;
    columns[2].rightEdge = kWidth;
    columns[2].alignment = TextSettings::kAlignRight;
    return boost::make_shared<ColumnList>(static_cast<short>(kColumns), columns);
}

// A window with a list and its bar.
class ListPage {
public:
    explicit ListPage(int rows, GListSelectionMode mode = kListSelectOne)
        : glog(Build(desktop, rows, mode, list)) {
        Show();
    }

    // Not shown.
    static glogRec *Build(SimulatedDesktop &desktop, int rows, GListSelectionMode mode, GListPane *&list) {
        glogRec *const glog = desktop.NewGlog(GlogOptions().Size(kWidth + kBarWidth, kHeight));
        glistResRec record = {
            glistResRec::kType,   {0, 0, kHeight, kWidth},  0, mode, kRowHeight, 0, 0, 0, 0, false,
            glistResRec::kNoEdge, glistResRec::kDialogStyle};
        list = GListPane::NewGListPane(glog, &record);
        ScrollBarPane *const bar = new ScrollBarPane(glog, 0, 0, 0);
        Rect box = {0, kWidth, kHeight, kWidth + kBarWidth};
        bar->SetBox(&box);
        list->SetScrollBar(bar);
        list->SetColumnList(Columns());
        list->SetLineDrawer(new ListTextDrawer(list, FillCell), true);
        list->SetNumItems(rows);
        return glog;
    }
    void Show() {
        desktop.FinishGlog(glog);
        ShowGlog(glog, kShowGlog);
        UpdateGlog(glog);
        desktop.TakePresented(glog);
        desktop.Play("wait 1"); // for the activation
    }
    // Draws what is damaged; whether anything was.
    bool Shown() {
        UpdateGlog(glog);
        return !desktop.TakePresented(glog).empty();
    }

    SimulatedDesktop desktop;
    GListPane *list = nullptr;
    glogRec *glog;
};

void FirstFrame(benchmark::State &state) {
    SimulatedDesktop desktop;
    int const rows = static_cast<int>(state.range(0));
    for (auto _ : state) {
        double const start = ProcessorClock::Seconds();
        GListPane *list = nullptr;
        glogRec *const glog = ListPage::Build(desktop, rows, kListSelectOne, list);
        desktop.FinishGlog(glog);
        ShowGlog(glog, kShowGlog);
        UpdateGlog(glog);
        state.SetIterationTime(ProcessorClock::Seconds() - start);
        if (desktop.TakePresented(glog).empty())
            state.SkipWithError("nothing has been shown");
        DisposeGlog(glog);
        desktop.ProcessEvents(0);
    }
}
BENCHMARK(FirstFrame)->Name("List/first frame")->Arg(kFew)->Arg(kMany)->UseManualTime();

void Repaint(benchmark::State &state) {
    ListPage page(static_cast<int>(state.range(0)));
    for (auto _ : state) {
        page.list->Inval();
        if (!page.Shown())
            state.SkipWithError("nothing has been shown");
    }
}
BENCHMARK(Repaint)->Name("List/repaint")->Arg(kFew)->Arg(kMany);

// The same texts at the same places, each laid out beforehand, on a ground that is filled before and shown by
// a copy afterwards.
void RepaintBare(benchmark::State &state) {
    int const lefts[kColumns] = {0, kNameWidth, kNameWidth + kTimeWidth};
    BarePicture picture(kWidth, kHeight);
    for (int row = 0; row < kShown; ++row) {
        for (int column = 0; column < kColumns; ++column) {
            ListCell cell;
            FillCell(row, column, cell);
            std::string ascii;
            for (std::size_t i = 0; i < cell.text.length(); ++i)
                ascii += static_cast<char>(cell.text[i]);
            picture.Add(ascii, 0, lefts[column], row * kRowHeight);
        }
    }
    for (auto _ : state)
        picture.Repaint();
    if (picture.IsBlank())
        state.SkipWithError("nothing has been drawn");
}
BENCHMARK(RepaintBare)->Name("List/repaint bare");

// Down a row and up again, in turn, so that the row that comes in is known but for the first time; and on and
// on, so that it never is.
void ScrollByLine(benchmark::State &state, bool onAndOn) {
    int const rows = static_cast<int>(state.range(0));
    ListPage page(rows);
    int top = 0;
    for (auto _ : state) {
        top = onAndOn ? (top + 1) % (rows - kShown) : 1 - top;
        page.list->SetScrollPosition(top);
        if (!page.Shown() || page.list->GetScrollPos() != top)
            state.SkipWithError("a step has not been shown");
    }
}
BENCHMARK_CAPTURE(ScrollByLine, on, true)->Name("List/scroll on")->Arg(kFew)->Arg(kMany);
BENCHMARK_CAPTURE(ScrollByLine, to and fro, false)->Name("List/scroll to and fro")->Arg(kFew)->Arg(kMany);

void Jump(benchmark::State &state) {
    int const rows = static_cast<int>(state.range(0));
    ListPage page(rows);
    std::mt19937 random(1);
    for (auto _ : state) {
        page.list->SetScrollPosition(static_cast<int>(random() % static_cast<unsigned int>(rows - kShown)));
        if (!page.Shown())
            state.SkipWithError("a jump has not been shown");
    }
}
BENCHMARK(Jump)->Name("List/jump")->Arg(kFew)->Arg(kMany);

class TimedListener : public GListPane_SelectionListener {
public:
    void SelectionDone(GListPane *) override { heardAt = ProcessorClock::Seconds(); }
    void ClickOccured(GListPane *, int, int, bool) override {}
    double heardAt = 0;
};

// From the click in the window system's queue until the list has told of its end, with the drawing of the two
// rows that change.
void Click(benchmark::State &state) {
    ListPage page(static_cast<int>(state.range(0)));
    TimedListener listener;
    page.list->SetScrollPosition(static_cast<int>(state.range(0)) / 2);
    page.list->SetSelectionListener(&listener);
    page.Shown();
    bool high = false;
    for (auto _ : state) {
        high = !high;
        page.desktop.Script(high ? "click 40 40" : "click 40 340");
        listener.heardAt = 0;
        double const start = ProcessorClock::Seconds();
        page.desktop.Run();
        state.SetIterationTime(listener.heardAt - start);
        if (listener.heardAt == 0) {
            state.SkipWithError("the listener has not heard of the click");
            break;
        }
        page.desktop.TakePresented(page.glog);
    }
}
BENCHMARK(Click)->Name("List/click")->Arg(kFew)->Arg(kMany)->UseManualTime();

// A command on a single row among many, and the drawing of it.
void SelectOne(benchmark::State &state) {
    ListPage page(static_cast<int>(state.range(0)), kListSelectSeveral);
    bool select = false;
    for (auto _ : state) {
        select = !select;
        select ? page.list->SelectItem(3) : page.list->DeselectItem(3);
        if (!page.Shown())
            state.SkipWithError("a change has not been shown");
    }
}
BENCHMARK(SelectOne)->Name("List/select one")->Arg(kFew)->Arg(kMany);

// What may walk over all rows, in nanoseconds a row.
template <class Action> void EachRow(benchmark::State &state, Action const &action) {
    ListPage page(kMany, kListSelectSeveral);
    double seconds = 0;
    for (auto _ : state) {
        page.list->SelectItem(kMany - 1);
        double const start = ProcessorClock::Seconds();
        action(*page.list);
        double const taken = ProcessorClock::Seconds() - start;
        state.SetIterationTime(taken);
        seconds += taken;
        page.list->DeselectAll();
    }
    state.counters["perRow"] = seconds * 1e9 / kMany / static_cast<double>(state.iterations());
}

void SetCount(benchmark::State &state) {
    EachRow(state, [](GListPane &list) {
        list.SetNumItems(0);
        list.SetNumItems(kMany);
    });
}
BENCHMARK(SetCount)->Name("List/set count")->UseManualTime();

void SelectAll(benchmark::State &state) {
    EachRow(state, [](GListPane &list) { list.SelectAll(); });
}
BENCHMARK(SelectAll)->Name("List/select all")->UseManualTime();

void DeselectAll(benchmark::State &state) {
    ListPage page(kMany, kListSelectSeveral);
    double seconds = 0;
    for (auto _ : state) {
        page.list->SelectAll();
        double const start = ProcessorClock::Seconds();
        page.list->DeselectAll();
        double const taken = ProcessorClock::Seconds() - start;
        state.SetIterationTime(taken);
        seconds += taken;
    }
    state.counters["perRow"] = seconds * 1e9 / kMany / static_cast<double>(state.iterations());
}
BENCHMARK(DeselectAll)->Name("List/deselect all")->UseManualTime();

// What the program has from the heap, in bytes.
double HeapBytes() {
    struct mallinfo2 const info = mallinfo2();
    return static_cast<double>(info.uordblks) + static_cast<double>(info.hblkhd);
}

// What rows cost that are all selected, in bytes a row.
void Memory(benchmark::State &state, GListSelectionMode mode) {
    double bytes = 0;
    for (auto _ : state) {
        ListPage page(kFew, mode);
        double const before = HeapBytes();
        page.list->SetNumItems(kMany);
        page.list->SelectAll();
        bytes += HeapBytes() - before;
    }
    state.counters["perRow"] = bytes / kMany / static_cast<double>(state.iterations());
}
BENCHMARK_CAPTURE(Memory, one, kListSelectOne)->Name("List/bytes of one")->Iterations(3);
BENCHMARK_CAPTURE(Memory, several, kListSelectSeveral)->Name("List/bytes of several")->Iterations(3);

} // namespace
