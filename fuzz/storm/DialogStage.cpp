// A window of random items.
#include "desktop/panes/Glog.h"
#include "dialogs/DialogReader.h"
#include "dialogs/ItemRegistry.h"
#include "dialogs/LoadGlog.h"
#include "dialogs/PaneMaker.h"
#include "dialogs/RecordFile.h"
#include "fuzz/storm/OpenWindow.h"
#include "fuzz/storm/RandomItem.h"
#include "fuzz/storm/RandomRecord.h"
#include "fuzz/storm/Stage.h"
#include "fuzz/storm/StormWindows.h"
#include "fuzz/support/Require.h"
#include "host/CompoundPane.h"
#include "host/TarnError.h"
#include "host/glogRec.h"

namespace {

std::string const kName = "storm";
int const kColumns = 4, kRows = 4;
short const kCellWidth = 90, kCellHeight = 60, kGap = 6; // pixels
int const kFirstBar = 900, kBars = 4;                    // numbers of scroll bars
int const kFirstLoose = 1000;                            // number of the first random item
int const kTries = 8;                                    // keys may contradict each other
int const kBarThickness = 16;
char const kSpacer[] = "<Item type=\"Spacer\"/>\n";

std::string Wrapped(std::string const &items) {
    return "<Glog title=\"storm\" width=\"" + std::to_string(kColumns * kCellWidth) + "\" height=\"" +
           std::to_string(kRows * kCellHeight + kBarThickness) + "\" growable=\"yes\"><Items>\n" + items +
           "</Items></Glog>\n";
}

// In a row at the bottom of the window.
std::string Bar(int index) {
    int const left = index * kCellWidth, top = kRows * kCellHeight;
    return "<Item type=\"ScrollBar\" id=\"" + std::to_string(kFirstBar + index) + "\"><BoundsRect top=\"" +
           std::to_string(top) + "\" left=\"" + std::to_string(left) + "\" bottom=\"" +
           std::to_string(top + kBarThickness) + "\" right=\"" + std::to_string(left + kCellWidth - kGap) +
           "\"/></Item>\n";
}

std::string Bars() {
    std::string bars;
    for (int i = 0; i < kBars; ++i)
        bars += Bar(i);
    return bars;
}

Rect Cell(int index) {
    short const top = static_cast<short>(index / kColumns * kCellHeight);
    short const left = static_cast<short>(index % kColumns * kCellWidth);
    return {top, left, static_cast<short>(top + kCellHeight - kGap),
            static_cast<short>(left + kCellWidth - kGap)};
}

class DialogStage : public Stage {
public:
    DialogStage(StormDesktop &desktop_, Chance &chance)
        : desktop(desktop_) {
        Open(chance);
    }
    ~DialogStage() override { DisposeGlog(Window()); }

    glogRec *Window() const override { return window.Get(); }

    void Change(Chance &chance) override {
        DisposeGlog(Window());
        Open(chance);
    }
    void Reopen(Chance &chance) override { Open(chance); }

    std::vector<GlogPane *> Panes() const override {
        return Window() ? Glog::From(Window()).Items() : std::vector<GlogPane *>();
    }

    std::vector<GlogPane *> Loose() const override {
        std::vector<GlogPane *> loose;
        for (GlogPane *pane : Panes())
            Collect(*pane, loose);
        return loose;
    }

    GlogPane *AddPane(Chance &chance) override {
        if (!Window())
            return nullptr;
        if (chance.OneIn(4))
            return AddFromRecord(chance);
        Dialog const dialog =
            DialogReader::ReadText(Wrapped(OneItem(chance, Cell(chance.Below(kColumns * kRows)))), kName);
        GlogPane *pane = nullptr;
        try {
            pane = PaneMaker(Window()).Make(dialog.items[0]);
            desktop.FinishGlog(Window());
        } catch (LoadError const &) {
            return nullptr; // of a key that has no bar here; what was made stays with the glog
        } catch (std::exception const &) {
            return nullptr;
        }
        return pane;
    }

private:
    static void Collect(GlogPane &pane, std::vector<GlogPane *> &loose) {
        if (pane.GetID() >= kFirstLoose)
            loose.push_back(&pane);
        CompoundPane *const container = dynamic_cast<CompoundPane *>(&pane);
        for (short i = 0; container && i < container->NumSubpanes(); ++i)
            Collect(*container->Get(i), loose);
    }

    GlogPane *AddFromRecord(Chance &chance) {
        std::string const bytes = RandomRecord::Of(chance, Cell(chance.Below(kColumns * kRows)));
        short const before = CountGlogItems(Window());
        try {
            RecordFile(bytes.data(), bytes.size(), kName).MakePanes(Window());
            desktop.FinishGlog(Window());
        } catch (std::exception const &) {
            return nullptr; // as from an item
        }
        if (!Window() || CountGlogItems(Window()) == before)
            return nullptr;
        GlogPane *const pane = Panes().back();
        pane->SetID(nextID);
        Number(nextID + 1);
        return pane;
    }

    // The next random item has this number, or the first one again.
    void Number(int id) { nextID = id > kLastID ? kFirstLoose : id; }

    // That can be loaded.
    std::string OneItem(Chance &chance, Rect const &place, std::vector<int> const &bars = {}) {
        for (int i = 0; i < kTries; ++i) {
            RandomItem item(chance, nextID, bars);
            std::string const written = item.Write(place);
            if (!IsLoadable(written))
                continue;
            Number(item.NextID());
            return written;
        }
        return kSpacer;
    }

    static bool IsLoadable(std::string const &item) {
        try {
            DisposeGlog(LoadGlogFromText(Wrapped(Bars() + item), kName));
            return true;
        } catch (LoadError const &error) {
            Require(!error.Message().empty(), "an error says what is wrong");
            return false;
        }
    }

    void Open(Chance &chance) {
        nextID = kFirstLoose;
        std::string items = Bars();
        int const cells = kColumns * kRows;
        for (int cell = 0; cell < cells; ++cell) {
            // A bar serves one pane.
            std::vector<int> bars;
            if (cell < kBars)
                bars.push_back(kFirstBar + cell);
            if (!chance.OneIn(5))
                items += OneItem(chance, Cell(cell), bars);
        }
        window.Watch(LoadGlogFromText(Wrapped(items), kName));
        ShowGlog(Window(), kShowGlog);
    }

    static int const kLastID = 30000;

    StormDesktop &desktop;
    OpenWindow window;
    int nextID = kFirstLoose;
};

} // namespace

std::unique_ptr<Stage> Stages::RandomDialog(StormDesktop &desktop, Chance &chance) {
    return std::make_unique<DialogStage>(desktop, chance);
}
