// Measures one toolkit, and prints a line with a name and a value for each measurement.
//
//     peer_NAME window SERVER     in a window of the X server with that process number
//     peer_NAME offscreen SERVER  in memory
//     peer_NAME memory BOXES      the resident memory with so many check boxes
//     peer_NAME list SERVER       steps through a list of labels
//     peer_NAME table SERVER      shows, scrolls and clicks a list of 1,000,000 rows
//     peer_NAME tabs SERVER       gives a row of 40 tabs other widths
//     peer_NAME text SERVER       types in the middle of a text of 10,000 lines
//
// Times are nanoseconds of the processor, of the program and the server together: so neither what else runs
// on the machine counts, nor a wait for the next frame or for a press that is shown for a while, and work
// that is left to the server does.
#include "bench/peers/Peer.h"
#include "bench/peers/PeerForm.h"
#include "bench/peers/PeerList.h"
#include "bench/peers/PeerTable.h"
#include "bench/peers/PeerTabs.h"
#include "bench/peers/PeerText.h"
#include <X11/Xlib.h>
#include <X11/extensions/XTest.h>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <ctime>
#include <fstream>
#include <memory>
#include <string>
#include <sys/wait.h>
#include <unistd.h>

namespace {

int const kBuilds = 5, kRepaints = 15, kToggles = 40, kClicks = 8;
int const kScrollSteps = 200, kScrollStep = 10; // pixels
int const kTabWidths = 100;
int const kKeys = 100;
int const kTableSteps = 200, kTableJumps = 100;
int const kStep = 37;                // from box to box; has no factor in common with their number
int const kPressH = 6, kPressV = 11; // within a check box: on its mark in each of the toolkits
int const kPrimaryButton = 1;
int const kSettlingMicroseconds = 20000;
int const kHeldMicroseconds = 80000; // as a hand does
long const kPerSecond = 1000000000;

clockid_t serverClock = CLOCK_PROCESS_CPUTIME_ID;
bool hasServer = false;
long long serverAtStart = 0;

[[noreturn]] void Fail(char const *what) {
    std::fprintf(stderr, "peer: %s\n", what);
    std::exit(EXIT_FAILURE);
}

long long Read(clockid_t clock) {
    timespec now = {};
    if (clock_gettime(clock, &now) != 0)
        Fail("a clock cannot be read");
    return static_cast<long long>(now.tv_sec) * kPerSecond + now.tv_nsec;
}

long long Now() { return Read(CLOCK_PROCESS_CPUTIME_ID) + (hasServer ? Read(serverClock) : 0); }

long long heardAt = 0;

void Report(char const *name, long long value) { std::printf("%s %lld\n", name, value); }

template <class Action> void Time(char const *name, Action action) {
    long long const start = Now();
    action();
    Report(name, Now() - start);
}

template <class Toolkit> void Settle(Toolkit &peer) {
    for (int i = 0; i < 5; ++i) {
        usleep(kSettlingMicroseconds);
        peer.Settle();
    }
}

// The server's pointer, which a process of its own moves and presses, as a hand does: the release comes well
// after the press, when whoever was told of the press has drawn what it does. What this process takes does
// not count.
class Pointer {
public:
    Pointer() {
        int orders[2], answers[2];
        if (pipe(orders) != 0 || pipe(answers) != 0 || (hand = fork()) < 0)
            Fail("there is no process for the pointer");
        if (hand == 0) {
            close(orders[1]);
            Obey(orders[0], answers[1]);
            _exit(EXIT_SUCCESS);
        }
        close(orders[0]);
        close(answers[1]);
        to = orders[1];
        from = answers[0];
    }
    ~Pointer() {
        close(to);
        close(from);
        waitpid(hand, nullptr, 0);
    }
    Pointer(Pointer const &) = delete;
    Pointer &operator=(Pointer const &) = delete;

    void MoveTo(int h, int v) {
        Give({kMove, h, v});
        char done;
        if (read(from, &done, 1) != 1)
            Fail("the pointer cannot be moved");
    }
    // Returns at once.
    void Click() { Give({kClick, 0, 0}); }

private:
    enum Kind { kMove, kClick };
    struct Order {
        Kind kind;
        int h, v;
    };
    void Give(Order const &order) {
        if (write(to, &order, sizeof order) != sizeof order)
            Fail("the pointer does not answer");
    }
    static void Obey(int orders, int answers) {
        Display *const display = XOpenDisplay(nullptr);
        Order order;
        while (display && read(orders, &order, sizeof order) == sizeof order)
            if (order.kind == kMove) {
                XTestFakeMotionEvent(display, -1, order.h, order.v, CurrentTime);
                XSync(display, False);
                if (write(answers, "", 1) != 1)
                    return;
            } else {
                Press(display, True);
                usleep(kHeldMicroseconds);
                Press(display, False);
            }
    }
    static void Press(Display *display, Bool down) {
        XTestFakeButtonEvent(display, kPrimaryButton, down, CurrentTime);
        XSync(display, False);
    }

    pid_t hand = 0;
    int to = -1, from = -1;
};

template <class Toolkit> void TimeClick(char const *name, Pointer &pointer, Toolkit &peer) {
    heardAt = 0;
    long long const start = Now();
    pointer.Click();
    peer.WaitUntilHeard();
    if (heardAt == 0)
        Fail("a click has not been heard");
    Report(name, heardAt - start);
}

void TimeClicks(Peer &peer) {
    Pointer pointer;
    for (int i = 0; i < kClicks; ++i) {
        PeerForm::Place const place = PeerForm::OfBox(i * kStep % PeerForm::kBoxes);
        pointer.MoveTo(place.h + kPressH, place.v + kPressV);
        Settle(peer);
        TimeClick("click", pointer, peer);
        Settle(peer);
    }
}

void Build(Peer &peer) { peer.Build(PeerForm::kBoxes, PeerForm::HeightFor(PeerForm::kBoxes)); }

void TimeToggles(Peer &peer, char const *name) {
    for (int i = 0; i < kToggles; ++i)
        Time(name, [&] { peer.Toggle(i * kStep % PeerForm::kBoxes); });
}

void MeasureWindow(Peer &peer) {
    long long const start = Now();
    Build(peer);
    Report("first-build", Now() - start);
    peer.Show();
    Report("first-frame", Now() - start);
    // The process's own clock has run since before its libraries were linked.
    Report("start", Now() - serverAtStart);
    Settle(peer);
    for (int i = 0; i < kRepaints; ++i)
        Time("repaint", [&] { peer.Repaint(); });
    TimeToggles(peer, "toggle");
    TimeClicks(peer);
    for (int i = 0; i < kBuilds; ++i) {
        peer.Destroy();
        Settle(peer);
        Time("build", [&] { Build(peer); });
    }
    peer.Destroy();
}

void MeasureOffscreen(Peer &peer) {
    Build(peer);
    peer.Show();
    for (int i = 0; i < kRepaints; ++i)
        Time("repaint-offscreen", [&] { peer.RepaintOffscreen(); });
    peer.Destroy();
}

// Without what is mapped from files, of which the system has now more pages in memory and now fewer.
long long ResidentBytes() {
    long long const kilobyte = 1024;
    long long bytes = 0;
    std::ifstream status("/proc/self/status");
    for (std::string line; std::getline(status, line);)
        if (line.rfind("RssAnon:", 0) == 0 || line.rfind("RssShmem:", 0) == 0)
            bytes += std::atoll(line.c_str() + line.find(':') + 1) * kilobyte;
    return bytes;
}

// The window is as large for few check boxes as for many, so that its pixels do not count.
void MeasureMemory(Peer &peer, int boxes) {
    peer.Build(boxes, PeerForm::HeightFor(PeerForm::kManyBoxes));
    peer.Show();
    Settle(peer);
    peer.Repaint();
    Report(("resident-" + std::to_string(boxes)).c_str(), ResidentBytes());
    peer.Destroy();
}

// Every step shows rows that have not been seen.
void MeasureList(PeerList &list) {
    list.Show();
    Settle(list);
    for (int i = 1; i <= kScrollSteps; ++i)
        Time("scroll-step", [&] { list.ScrollTo(i * kScrollStep); });
}

// Wide and narrow in turn, so that each width asks for other tabs than the one before.
int TabWidth(int i) {
    int const range = PeerTabs::kWidest - PeerTabs::kNarrowest;
    return PeerTabs::kNarrowest + i * 617 % range;
}

void MeasureTabs(PeerTabs &tabs) {
    tabs.Show();
    Settle(tabs);
    for (int i = 1; i <= kTabWidths; ++i)
        Time("tabs-width", [&] { tabs.SetWidth(TabWidth(i)); });
}

void MeasureText(PeerText &text) {
    text.Show();
    Settle(text);
    for (int i = 0; i < kKeys; ++i) {
        Time("text-type", [&] { text.Type(); });
        text.Delete(); // lines of one length throughout
    }
}

// Rows far apart, and none twice.
int RandomRow(int i) { return static_cast<int>(i * 382467LL % (PeerTable::kRows - PeerTable::kHeight)); }

void MeasureTable(PeerTable &table) {
    Time("table-first-frame", [&] { table.Show(); });
    Settle(table);
    for (int i = 0; i < kRepaints; ++i)
        Time("table-repaint", [&] { table.Repaint(); });
    for (int i = 1; i <= kTableSteps; ++i)
        Time("table-step", [&] { table.ScrollTo(i); });
    for (int i = 1; i <= kTableJumps; ++i)
        Time("table-jump", [&] { table.ScrollTo(RandomRow(i)); });
    Pointer pointer;
    for (int i = 0; i < kClicks; ++i) {
        // To and fro, so that each selects another row, however high rows are.
        int const row = i % 2 == 0 ? 2 : PeerTable::kHeight / PeerTable::kRowHeight / 2;
        pointer.MoveTo(PeerTable::kColumnWidth + kPressH, row * PeerTable::kRowHeight + kPressV);
        Settle(table);
        TimeClick("table-click", pointer, table);
        Settle(table);
    }
}

} // namespace

void Peer::Heard() { heardAt = Now(); }

void PeerTable::Heard() { heardAt = Now(); }

int main(int argc, char **argv) {
    if (argc != 3)
        Fail("expected what to measure and a number");
    std::string const what = argv[1];
    int const number = std::atoi(argv[2]);
    if (what != "memory") {
        hasServer = clock_getcpuclockid(number, &serverClock) == 0;
        if (!hasServer)
            Fail("there is no such server");
        serverAtStart = Read(serverClock);
    }
    argc = 1; // toolkits take no arguments of ours
    argv[1] = nullptr;
    if (what == "list") {
        MeasureList(*std::unique_ptr<PeerList>(NewPeerList(argc, argv)));
        return EXIT_SUCCESS;
    }
    if (what == "tabs") {
        MeasureTabs(*std::unique_ptr<PeerTabs>(NewPeerTabs(argc, argv)));
        return EXIT_SUCCESS;
    }
    if (what == "text") {
        MeasureText(*std::unique_ptr<PeerText>(NewPeerText(argc, argv)));
        return EXIT_SUCCESS;
    }
    if (what == "table") {
        MeasureTable(*std::unique_ptr<PeerTable>(NewPeerTable(argc, argv)));
        return EXIT_SUCCESS;
    }
    std::unique_ptr<Peer> const peer(NewPeer(what == "offscreen", argc, argv));
    if (what == "window")
        MeasureWindow(*peer);
    else if (what == "offscreen")
        MeasureOffscreen(*peer);
    else
        MeasureMemory(*peer, number);
}
