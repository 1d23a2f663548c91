// Listeners and drawers that change the list, or delete it, from inside.
#include "host/TarnError.h"
#include "tests/lists/ListTest.h"
#include <algorithm>
#include <limits>
#include <stdexcept>

namespace {

int const kMost = std::numeric_limits<int>::max(), kLeast = std::numeric_limits<int>::min();

class GListPaneReentrancyTest : public ListTest {
protected:
    typedef std::vector<int> Rows;
    typedef std::function<void(GListPane *)> Change;

    GListPane *Shown(int rows, GListSelectionMode mode) {
        list = Filled(rows, mode);
        Show();
        return list;
    }
    // Does the change at the first call of this kind.
    void At1(std::string const &call, Change const &change) {
        listener.onCall = [this, call, change](std::string const &made) {
            if (made != call)
                return;
            listener.onCall = nullptr;
            change(list);
        };
    }
    std::string const press = "press " + At(1) + "\n";
    std::string const drag = press + "move " + At(3) + "\nmove 40 140\nwait 0.2\nmove " + At(2) + "\nrelease";

    GListPane *list = nullptr;
};

// Everything that a listener might call, with rows and columns that are not there.
void CallEverythingWith(GListPane &list, int number) {
    int line = 0, column = 0;
    Rect box = {0, 0, 0, 0};
    GLGetBoxRec record = {number, box};
    list.CheckSel(number);
    list.GetRowBox(number, box);
    list.GetCellBox(number, number, box);
    list.GetCellBox(0, number, box);
    list.GLGetBox(&record);
    list.CheckHitV(number);
    list.GetFirstAndLast(&line, &column);
    list.DrawListLine(number, GListPane::kWholeRow, nullptr);
    list.UpdateListLine(number);
    list.InvalRow(number);
    list.InvalCol(number);
    list.InvalCol(number, number);
    list.InvalCol(0, number);
    list.PhysicalToLogicalColumn(number);
    list.SetColumnMapping(number, number);
    list.PageTillVisible(number);
    list.PageTillVisible(number, number);
    list.PageTillVisible(0, number);
    list.PageTillVisible(number, 0);
    list.SetScrollPosition(number);
    list.SelectItem(number);
    list.DeselectItem(number);
    list.DoSelect(number, 1, false);
    list.InvertItem(number);
    list.InvertItemRect(number, true);
    list.InvertItemRect(number, true);
    list.Protect(number);
    list.SetSelRange(number, number);
    list.NumSelected();
    list.GetFirstSelectedItem(line);
    list.SetSelColumn(number);
    list.HiliteColumnRect({0, 0, 10, 10});
    list.TrackCol(number, 0);
    list.TrackCol(0, number);
    list.DelItem(number);
    list.AddItem(number);
    list.ScrollToPage(number);
    list.ScrolledToEnd();
    list.NumFullyDisplayedLines();
    list.SetClickParameters(number, number);
    int amount = number, multiplier = number;
    list.Scroll(nullptr, amount, multiplier);
    list.ScrollTo(nullptr, number);
    list.StartScrolling(nullptr, false, amount, multiplier);
    list.MoveItem({static_cast<short>(number), static_cast<short>(number)});
    list.Protect(-1);
    list.SetSelColumn(0);
}

// The same for what takes all rows, with the list at a page that there may not be.
void ChangeEverythingAt(GListPane &list, int number) {
    GListSelectionMode const mode = list.GetResInfo().selMode;
    int const rows = list.GetNumItems();
    auto const onThePage = [&list, number](std::function<void()> const &action) {
        list.SetScrollWithNoBar(false); // the list stays where it is
        list.ScrollToPage(number);
        action();
        list.SetScrollWithNoBar(true);
    };
    onThePage([&] { list.SelectAll(); });
    onThePage([&] { list.InvertSelection(); });
    onThePage([&] { list.DrawVisibleLines(nullptr); });
    onThePage([&] { list.InvalCol(0); });
    onThePage([&] { list.MoveItem({60, 100}); });
    onThePage([&] { list.DeselectAll(); });
    onThePage([&] { list.SetNumItems(std::min(number, rows)); });
    onThePage([&] { list.SetNumItems(rows); });
    onThePage([&] { list.AddItem(number); });
    onThePage([&] { list.DelItem(number); });
    onThePage([&] { list.SetSelMode(static_cast<GListSelectionMode>(number)); });
    onThePage([&] { list.SetSelMode(mode); });
    onThePage([&] { list.SetLineHeight(number); });
    onThePage([&] { list.SetLineHeight(16); });
    onThePage([&] {
        list.SaveSetup();
        list.ScrollToPage(number);
        list.DrawVisibleLines(nullptr);
        list.RestoreSetup();
    });
    list.MoveItem({60, 100});
    list.SetScrollPosition(0);
}

} // namespace

TEST_F(GListPaneReentrancyTest, NumbersOutOfRangeAreTakenEverywhere) {
    for (GListSelectionMode mode :
         {kListSelectOne, kListSelectNothing, kListSelectSeveral, kListSelectToggle, kListSelectByCode}) {
        for (int rows : {0, 5, 100}) {
            GListPane *const made = Filled(rows, mode);
            made->SetSelMode(mode); // also the one that no record makes
            Show();
            for (int number :
                 {-1, -2, rows, rows + 1, 1000, 20000, 65536, kMost, kMost - 1, kLeast, kLeast + 1})
                CallEverythingWith(*made, number);
            UpdateGlog(glog);
            EXPECT_LE(made->GetNumItems(), 120) << "rows were added, but not lost";
            for (int number : {-1, 0, 1, 2, rows, 65536, kMost, kMost - 1, kLeast, kLeast + 1})
                ChangeEverythingAt(*made, number);
            UpdateGlog(glog);
            EXPECT_EQ(made->GetResInfo().selMode, mode);
            EXPECT_EQ(made->GetNumDisplayed(), 7);
            EXPECT_EQ(made->GetScrollPos(), 0);
            delete made;
        }
    }
}

TEST_F(GListPaneReentrancyTest, NumbersOutOfRangeAreTakenFromInsideANotification) {
    for (GListSelectionMode mode : {kListSelectOne, kListSelectSeveral, kListSelectToggle}) {
        for (char const *call : {"done", "select 1", "select 2 tracking", "click column 1 line 1"}) {
            Shown(10, mode);
            At1(call, [](GListPane *changed) {
                for (int number : {-1, 10, 1000, kMost, kLeast})
                    CallEverythingWith(*changed, number);
                for (int number : {-1, 1, kMost, kLeast})
                    ChangeEverythingAt(*changed, number);
            });
            desktop.Play("wait 1\n" + drag);
            desktop.Play("wait 1\nclick " + At(1, 1));
            listener.onCall = nullptr;
            UpdateGlog(glog);
            EXPECT_GE(list->GetNumItems(), 10);
            delete list;
        }
    }
}

// Rows that go while the list tells of rows

TEST_F(GListPaneReentrancyTest, RowsMayGoWhileAllAreDeselected) {
    Shown(6, kListSelectSeveral);
    At1("deselect 5", [](GListPane *changed) { changed->SetNumItems(2); });
    list->DeselectAll();
    EXPECT_EQ(listener.Take(),
              (Log{"deselect 5", "deselect 1", "deselect 0", "deselect 1", "deselect 0", "done"}));
}

TEST_F(GListPaneReentrancyTest, RowsMayGoWhileAllAreSelected) {
    Shown(6, kListSelectSeveral);
    At1("select 4", [](GListPane *changed) {
        changed->DelItem(0);
        changed->DelItem(0);
        changed->DelItem(0);
    });
    list->SelectAll();
    EXPECT_EQ(list->GetNumItems(), 3);
    EXPECT_EQ(SelectedRows(*list), (Rows{0, 1, 2}));
    EXPECT_EQ(listener.Take(), (Log{"select 5", "select 4", "select 0", "done"}));
}

TEST_F(GListPaneReentrancyTest, TheModeMayChangeWhileAllAreSelected) {
    Shown(6, kListSelectSeveral);
    At1("select 4", [](GListPane *changed) { changed->SetSelMode(kListSelectOne); });
    list->SelectAll();
    EXPECT_EQ(list->NumSelected(), 0);
    EXPECT_EQ(listener.Take().back(), "done");
}

TEST_F(GListPaneReentrancyTest, RowsMayGoWhileANewCountIsTold) {
    Shown(6, kListSelectSeveral);
    At1("deselect 3", [](GListPane *changed) { changed->SetNumItems(0); });
    list->SetNumItems(5);
    EXPECT_EQ(list->GetNumItems(), 0);
    EXPECT_EQ(listener.Take(), (Log{"deselect 4", "deselect 3"}));
}

// In a drag

TEST_F(GListPaneReentrancyTest, RowsMayGoInEveryMomentOfADrag) {
    for (GListSelectionMode mode : {kListSelectOne, kListSelectSeveral, kListSelectToggle}) {
        for (char const *call :
             {"done", "deselect 0", "select 1", "select 2 tracking", "select 7 tracking"}) {
            for (int rows : {0, 1, 3}) {
                Shown(10, mode);
                At1(call, [rows](GListPane *changed) { changed->SetNumItems(rows); });
                desktop.Play("wait 1\n" + drag);
                for (int row : SelectedRows(*list))
                    EXPECT_LT(row, list->GetNumItems());
                UpdateGlog(glog);
                delete list;
            }
        }
    }
}

TEST_F(GListPaneReentrancyTest, WithoutRowsADragSelectsNothing) {
    Shown(10, kListSelectSeveral);
    At1("select 2 tracking", [](GListPane *changed) { changed->SetNumItems(0); });
    desktop.Play(drag);
    EXPECT_EQ(list->NumSelected(), 0);
    EXPECT_EQ(listener.Take().back(), "done");
}

TEST_F(GListPaneReentrancyTest, ColumnsMayGoInADrag) {
    Shown(10, kListSelectSeveral);
    At1("select 2 tracking", [](GListPane *changed) {
        changed->SetColumnList(boost::make_shared<ColumnList>(static_cast<short>(0)));
    });
    desktop.Play(drag);
    EXPECT_EQ(SelectedRows(*list), (Rows{1, 2, 3})) << "outside of all columns nothing more happens";
}

TEST_F(GListPaneReentrancyTest, TheDrawerMayGoInADrag) {
    Shown(10, kListSelectSeveral);
    bool gone = false;
    list->SetLineDrawer(new NotingDrawer(&gone), true);
    At1("select 2 tracking", [](GListPane *changed) { changed->SetLineDrawer(nullptr, false); });
    desktop.Play(drag);
    EXPECT_TRUE(gone);
    EXPECT_EQ(SelectedRows(*list).front(), 1);
}

TEST_F(GListPaneReentrancyTest, TheModeMayChangeInADrag) {
    for (GListSelectionMode from : {kListSelectOne, kListSelectSeveral}) {
        for (int to = 0; to <= 4; ++to) {
            Shown(10, from);
            ListHooks hooks;
            int steps = 0;
            hooks.onStep = [&] {
                if (++steps == 2)
                    list->SetSelMode(static_cast<GListSelectionMode>(to));
            };
            At1("select 2 tracking",
                [to](GListPane *changed) { changed->SetSelMode(static_cast<GListSelectionMode>(to)); });
            desktop.Play("wait 1\n" + drag);
            EXPECT_EQ(list->GetResInfo().selMode, to);
            list->SetNumItems(3);
            UpdateGlog(glog);
            delete list;
        }
    }
}

TEST_F(GListPaneReentrancyTest, ALineHeightOfZeroInADragLeavesNothingToHit) {
    Shown(10, kListSelectSeveral);
    At1("select 2 tracking", [](GListPane *changed) { changed->SetLineHeight(0); });
    desktop.Play(drag);
    EXPECT_EQ(list->GetNumDisplayed(), 0);
    EXPECT_EQ(listener.Take().back(), "done");
}

TEST_F(GListPaneReentrancyTest, TheListenerMayBeTakenAwayInADrag) {
    Shown(10, kListSelectSeveral);
    At1("select 2 tracking", [](GListPane *changed) { changed->SetSelectionListener(nullptr); });
    desktop.Play(press + "move " + At(4) + "\nrelease");
    EXPECT_EQ(SelectedRows(*list), (Rows{1, 2, 3, 4}));
    EXPECT_EQ(listener.Take().back(), "select 2 tracking");
}

// A flag of the gesture would tell the next one another state than the row has.
TEST_F(GListPaneReentrancyTest, AListenerThatThrowsLeavesTheFlagsAtRest) {
    Shown(10, kListSelectSeveral);
    At1("select 1", [](GListPane *) { throw std::runtime_error("no"); });
    EventRecordAdapter event;
    event.where = {45, 40};
    event.modifiers = 0x0100;
    EXPECT_THROW((list->*&Opened<GListPane>::HandleClick)(&event), std::runtime_error);
    EXPECT_EQ(SelectedRows(*list), Rows{1});
    desktop.Play("press " + At(3) + " command\nmove " + At(1) + "\nmove " + At(3) + "\nrelease");
    EXPECT_EQ(SelectedRows(*list), (Rows{1, 3}));
}

// A list that goes

TEST_F(GListPaneReentrancyTest, TheListMayBeDeletedInEveryMomentOfAGesture) {
    for (GListSelectionMode mode : {kListSelectOne, kListSelectSeveral, kListSelectToggle}) {
        for (char const *call : {"done", "deselect 9", "deselect 0", "select 1", "select 2 tracking",
                                 "select 7 tracking", "select 9", "click column 1 line 1"}) {
            Shown(10, mode);
            At1(call, [this](GListPane *gone) {
                list = nullptr;
                delete gone;
            });
            desktop.Play("wait 1\n" + drag);
            if (list)
                desktop.Play("wait 1\nclick " + At(1, 1));
            if (list)
                desktop.Play("wait 1\nclick " + At(1) + " command");
            if (list)
                desktop.Play("wait 1\nclick 40 118");
            listener.onCall = nullptr;
            delete list;
            list = nullptr;
        }
    }
    EXPECT_EQ(CountGlogItems(glog), 0);
}

TEST_F(GListPaneReentrancyTest, TheListMayBeDeletedByACommand) {
    typedef std::pair<char const *, std::function<void(GListPane &)>> Command;
    Command const commands[] = {
        {"done", [](GListPane &l) { l.SelectItem(2); }},
        {"select 2", [](GListPane &l) { l.SelectItem(2); }},
        {"deselect 1", [](GListPane &l) { l.DeselectItem(1); }},
        {"select 3", [](GListPane &l) { l.SelectAll(); }},
        {"deselect 3", [](GListPane &l) { l.DeselectAll(); }},
        {"deselect 3", [](GListPane &l) { l.SetSelMode(kListSelectOne); }},
        {"done", [](GListPane &l) { l.SetSelMode(kListSelectToggle); }},
        {"deselect 1", [](GListPane &l) { l.SetNumItems(3); }},
        {"deselect 2", [](GListPane &l) { l.AddItem(2); }},
        {"deselect 3",
         [](GListPane &l) {
             l.MoveItem({45, 40});
         }},
        {"deselect 3", [](GListPane &l) { l.ClickBelowLastItem(); }},
    };
    for (Command const &command : commands) {
        Shown(5, kListSelectSeveral);
        list->SelectItem(1);
        At1(command.first, [this](GListPane *gone) {
            list = nullptr;
            delete gone;
        });
        GListPane &doomed = *list;
        command.second(doomed);
        EXPECT_EQ(list, nullptr) << command.first;
    }
}

TEST_F(GListPaneReentrancyTest, TheListMayBeDeletedWhileTheMouseIsAwaited) {
    for (GListSelectionMode mode : {kListSelectOne, kListSelectSeveral}) {
        for (int step : {1, 2, 3}) {
            Shown(10, mode);
            class Deleting : public CIdleChore {
            public:
                Deleting(GListPane *&list_, int runs_)
                    : CIdleChore(2, kInitialDelay)
                    , list(list_)
                    , runs(runs_) {
                    Assign();
                }
                void DoIdle() override {
                    if (--runs > 0)
                        return;
                    Cancel();
                    delete list;
                    list = nullptr;
                }

            private:
                GListPane *&list;
                int runs;
            } const deleting(list, step);
            desktop.Play(press + "wait 0.02\nmove " + At(3) + "\nwait 0.5\nrelease");
            EXPECT_EQ(list, nullptr);
        }
    }
}

TEST_F(GListPaneReentrancyTest, TheListMayBeDeletedByAStepOfTracking) {
    for (bool inCell : {false, true}) {
        Shown(10, kListSelectOne);
        ListHooks hooks;
        hooks.onStep = [this] {
            delete list;
            list = nullptr;
        };
        bool answer = true;
        listener.onCall = [&](std::string const &call) {
            if (call.find("click") == 0)
                answer = list->TrackCol(1, 1);
        };
        desktop.Play("wait 1\npress " + At(1, inCell ? 1 : 0) + "\nmove " + At(2) + "\nrelease");
        listener.onCall = nullptr;
        EXPECT_EQ(list, nullptr);
        EXPECT_EQ(answer, !inCell);
    }
}

TEST_F(GListPaneReentrancyTest, TheWindowMayCloseInADrag) {
    glogRec *const other = desktop.NewGlog(GlogOptions().Size(320, 200));
    glistResRec record = Record(kListSelectSeveral);
    list = Equipped(GListPane::NewGListPane(other, &record), 10);
    desktop.FinishGlog(other);
    ShowGlog(other, kShowGlog);
    desktop.Play("wait 1");
    At1("select 2 tracking", [other](GListPane *) { DisposeGlog(other); });
    desktop.Play(drag);
    desktop.Play("wait 1");
    EXPECT_EQ(listener.Take().front(), "deselect 9");
}

TEST_F(GListPaneReentrancyTest, TheListMayBeDeletedByTheSecondaryButton) {
    class List : public GListPane {
    public:
        List(glogRec *owner, glistResRec record, int answer_)
            : answer(answer_) {
            InitGListPane(owner, &record, 0);
        }
        int HandleSecondaryButtonClick(EventRecordAdapter *) override {
            int const kept = answer;
            delete this;
            return kept;
        }

    private:
        int answer;
    };
    for (int answer : {0, 1}) {
        Equipped(new List(glog, Record(), answer), 5);
        Show();
        EXPECT_EQ(ResultOfClick("click " + At(1) + " control"), answer);
    }
    EXPECT_EQ(CountGlogItems(glog), 0);
}

TEST_F(GListPaneReentrancyTest, PagesFarOutOfRangeDoNotHangTheSelection) {
    for (int page : {kLeast, kMost})
        for (GListSelectionMode mode : {kListSelectSeveral, kListSelectToggle})
            for (short offset : {short(0), short(30000)}) // which leaves no room for rows
                for (bool isHeard : {true, false}) {
                    glistResRec record = Record(mode);
                    record.firstLineOffset = offset;
                    list = Equipped(NewList(record), 10);
                    if (!isHeard)
                        list->SetSelectionListener(nullptr);
                    Show();
                    list->SetScrollWithNoBar(false);
                    list->SelectAll();
                    list->ScrollToPage(page);
                    list->InvertSelection();
                    list->SelectAll();
                    EXPECT_EQ(list->NumSelected(), 10);
                    desktop.Play("activate off\nactivate on\nwait 1\nclick " + At(2));
                    list->DeselectAll();
                    EXPECT_EQ(list->NumSelected(), 0);
                    list->SetSelMode(kListSelectOne);
                    EXPECT_EQ(list->GetResInfo().selMode, kListSelectOne);
                    delete list;
                }
}

TEST_F(GListPaneReentrancyTest, ACellOfAListThatGoesWhileTheWindowIsDrawnDoesNotCount) {
    class Deleting : public GlogPane {
    public:
        Deleting(glogRec *owner, GListPane *&list_)
            : list(list_) {
            GlogPaneInit(owner, 0);
            Rect box = {140, 10, 160, 30};
            SetBox(&box);
        }
        bool deletes = false;

    private:
        void DrawGuts(OSRgn *) override {
            if (!deletes)
                return;
            delete list;
            list = nullptr;
        }
        GListPane *&list;
    };
    for (bool atFirst : {true, false}) {
        Shown(10, kListSelectOne);
        Deleting deleting(glog, list);
        UpdateGlog(glog);
        ListHooks hooks;
        auto const drawItNow = [&] {
            deleting.deletes = true;
            deleting.Inval();
        };
        if (!atFirst)
            hooks.onStep = drawItNow;
        bool answer = true;
        listener.onCall = [&](std::string const &) {
            listener.onCall = nullptr;
            if (atFirst)
                drawItNow();
            answer = list->TrackCol(1, 1);
        };
        desktop.Play("wait 1\npress " + At(1, 1) + "\nmove 110 45\nwait 0.5\nrelease");
        EXPECT_EQ(list, nullptr) << atFirst;
        EXPECT_FALSE(answer) << atFirst;
    }
}

TEST_F(GListPaneReentrancyTest, ACellOfAListThatGoesInTheWaitDoesNotCount) {
    Shown(10, kListSelectOne);
    class Deleting : public CIdleChore {
    public:
        explicit Deleting(GListPane *&list_)
            : CIdleChore(2, kInitialDelay)
            , list(list_) {
            Assign();
        }
        void DoIdle() override {
            Cancel();
            delete list;
            list = nullptr;
        }

    private:
        GListPane *&list;
    };
    bool answer = true;
    std::unique_ptr<Deleting> deleting;
    listener.onCall = [&](std::string const &) {
        listener.onCall = nullptr;
        deleting = std::make_unique<Deleting>(list);
        answer = list->TrackCol(1, 0);
    };
    desktop.Play("press " + At(1) + "\nwait 0.5\nrelease");
    EXPECT_EQ(list, nullptr);
    EXPECT_FALSE(answer);
}
