// Does what people do all the time, over and over, for its instructions to be counted from outside: those of
// Measured alone.
//
//     limits click|scroll-step|keystroke|redraw TIMES
#include "buttons/OvalButtonPane.h"
#include "desktop/SimulatedDesktop.h"
#include "host/UString.h"
#include "host/VelaDrawing.h"
#include "host/glogRec.h"
#include "scrolling/ScrollGrid.h"
#include "text/GTextPane.h"
#include "text/LabelPane.h"
#include <cstdio>
#include <cstdlib>
#include <functional>
#include <stdexcept>
#include <string>

namespace {

short const kWidth = 800, kHeight = 600, kColumnWidth = 80, kRowHeight = 30, kBarWidth = 16; // pixels
int const kLabels = 1000;

UString Numbered(char const *what, int number) {
    return UString((what + std::to_string(number)).c_str(), UString::kByteEncoding1);
}

OvalButtonPane *NewButton(glogRec *glog, Rect const &box, int number) {
    gobResRec record = {
        gobResRec::kKind,        box.top, box.left, static_cast<short>(box.right - box.left), 0,
        GlogButtonPane::kEnabled};
    OvalButtonPane *const button = OvalButtonPane::NewOvalButtonPane(glog, &record);
    button->SetButtonText(Numbered("Take ", number));
    return button;
}

// A window of 200 panes in rows and columns.
class Page {
public:
    Page()
        : glog(desktop.NewGlog(GlogOptions().Size(kWidth, kHeight))) {}

    template <class Add> void Fill(Add add) {
        int number = 0;
        for (short top = 0; top < kHeight; top = static_cast<short>(top + kRowHeight))
            for (short left = 0; left < kWidth; left = static_cast<short>(left + kColumnWidth)) {
                Rect box = {top, left, static_cast<short>(top + kRowHeight - 8),
                            static_cast<short>(left + kColumnWidth - 10)};
                add(box, ++number);
            }
    }
    void Show() {
        desktop.FinishGlog(glog);
        ShowGlog(glog, kShowGlog);
        UpdateGlog(glog);
        desktop.TakePresented(glog);
    }
    void Run(char const *script) {
        desktop.Script(script);
        desktop.Run();
    }
    // What must have been drawn by now.
    void ExpectShown() {
        if (desktop.TakePresented(glog).empty())
            throw std::runtime_error("nothing has been drawn");
    }

    SimulatedDesktop desktop;
    glogRec *glog;
};

class Clicks : public GlogButtonPaneListener {
public:
    void GlogButtonPressed(GlogButtonPane *) override { ++heard; }
    int heard = 0;
};

typedef std::function<void()> Operation;

} // namespace

// Named to whoever counts.
__attribute__((noinline)) void Measured(Operation const &operation) { operation(); }

namespace {

void Repeat(int times, Page &page, Operation const &operation) {
    operation(); // what is made once is made now
    page.ExpectShown();
    for (int i = 0; i < times; ++i) {
        Measured(operation);
        page.ExpectShown();
    }
}

void Click(int times) {
    Page page;
    Clicks clicks;
    page.Fill([&](Rect box, int number) { clicks.DependUpon(NewButton(page.glog, box, number)); });
    page.Show();
    Repeat(times, page, [&] { page.Run("click 410 310"); });
    if (clicks.heard != times + 1)
        throw std::runtime_error("a click has not been heard");
}

void ScrollStep(int times) {
    Page page;
    ScrollBarPane *const bar = new ScrollBarPane(page.glog, 0, 0, 0);
    Rect upright = {0, kWidth - kBarWidth, kHeight, kWidth};
    bar->SetBox(&upright);
    ScrollGrid *const grid = new ScrollGrid(page.glog, 0, bar);
    Rect view = {0, 0, kHeight, kWidth - kBarWidth};
    grid->SetBox(&view);
    for (int i = 0; i < kLabels; ++i) {
        Rect row = {0, 0, 20, kWidth - kBarWidth};
        LabelPane *const label = LabelPane::NewLabelPane(page.glog, 0, &row, false, Numbered("Region ", i));
        label->SetBox(&row);
        grid->Add(label, -1);
    }
    page.Show();
    Repeat(times, page, [&] {
        grid->Scroll(10);
        UpdateGlog(page.glog);
    });
    if (grid->GetScrollOffset() != 10 * (times + 1))
        throw std::runtime_error("the grid has not scrolled");
}

void Keystroke(int times) {
    Page page;
    GTextPane *last = nullptr;
    page.Fill([&](Rect box, int number) {
        last = GTextPane::NewGTextPane(page.glog, static_cast<short>(number), &box, UString(), nullptr);
    });
    page.Show();
    last->Select(true);
    int const before = static_cast<int>(last->GetText().length());
    Repeat(times, page, [&] { page.Run("key x"); });
    if (static_cast<int>(last->GetText().length()) != before + times + 1)
        throw std::runtime_error("a key has not typed");
}

void Redraw(int times) {
    Page page;
    page.Fill([&](Rect box, int number) { NewButton(page.glog, box, number); });
    page.Show();
    Repeat(times, page, [&] {
        Rect const spot = {310, 410, 326, 426};
        SetPortToGlog(page.glog);
        VelaDrawing::InvalRect(&spot);
        UpdateGlog(page.glog);
    });
}

void Run(std::string const &what, int times) {
    if (what == "click")
        Click(times);
    else if (what == "scroll-step")
        ScrollStep(times);
    else if (what == "keystroke")
        Keystroke(times);
    else if (what == "redraw")
        Redraw(times);
    else
        throw std::invalid_argument("nothing is called " + what);
}

} // namespace

int main(int argc, char **argv) {
    if (argc != 3) {
        std::fputs("usage: limits click|scroll-step|keystroke|redraw TIMES\n", stderr);
        return 2;
    }
    try {
        Run(argv[1], std::atoi(argv[2]));
    } catch (std::exception const &error) {
        std::fprintf(stderr, "limits: %s\n", error.what());
        return EXIT_FAILURE;
    }
    return EXIT_SUCCESS;
}
