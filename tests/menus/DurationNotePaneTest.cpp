#include "menus/DurationNotePane.h"
#include "host/Icons.h"
#include "host/PaneWatch.h"
#include "host/VelaDrawing.h"
#include "tests/menus/MenuTest.h"

static bool operator==(DurationValue const &a, DurationValue const &b) {
    return a.first == b.first && a.second == b.second;
}
static std::ostream &operator<<(std::ostream &out, DurationValue const &value) {
    return out << value.first << '/' << value.second;
}

namespace {

class DurationNote : public MenuTest {
protected:
    DurationNote()
        : pane(new DurationNotePane(glog)) {
        Rect box{20, 30, 36, 70};
        pane->SetBox(&box);
    }

    // What a click on the pane with this script leads to.
    DurationValue Chosen(std::string const &script) {
        desktop.Play("click 40 25\n" + script);
        return pane->GetDurationValue();
    }
    std::vector<unsigned> Glyphs(DurationValue const &value) {
        std::vector<unsigned> glyphs = {99};
        DurationValueToVela12IconIDs(value, glyphs);
        return glyphs;
    }

    DurationNotePane *pane;
};

class DurationEar : public DurationNotePane_Listener {
public:
    explicit DurationEar(DurationNotePane *pane) { Dependent<DurationNotePane_Listener>::DependUpon(pane); }
    void DurationValueChanged(DurationNotePane *sender) override {
        ++count;
        heard = sender->GetDurationValue();
        if (then)
            then();
    }
    int count = 0;
    DurationValue heard;
    std::function<void()> then;
};

} // namespace

// Durations

TEST_F(DurationNote, NotesHaveAGlyphAndDotsAndTripletsASecond) {
    EXPECT_EQ(Glyphs({1, 1}), (std::vector<unsigned>{0}));
    EXPECT_EQ(Glyphs({1, 4}), (std::vector<unsigned>{2}));
    EXPECT_EQ(Glyphs({1, 128}), (std::vector<unsigned>{7}));
    EXPECT_EQ(Glyphs({3, 8}), (std::vector<unsigned>{2, 16}));
    EXPECT_EQ(Glyphs({1, 6}), (std::vector<unsigned>{2, 17}));
    EXPECT_EQ(Glyphs({2, 3}), (std::vector<unsigned>{0, 17}));
    EXPECT_TRUE(Glyphs({}).empty());
    EXPECT_TRUE(Glyphs({5, 7}).empty());
}

TEST_F(DurationNote, TheMenuOffersAllNotes) {
    ShowWindow();
    desktop.Script("menu 3");
    EXPECT_EQ(RunDurationMenu({50, 50}, {1, 1}, 0, nullptr), DurationValue(1, 4));
    desktop.Script("menu 10/8");
    EXPECT_EQ(RunDurationMenu({50, 50}, {1, 1}, 0, nullptr), DurationValue(3, 256));
    desktop.Script("menu 11/1");
    EXPECT_EQ(RunDurationMenu({50, 50}, {1, 1}, -5, nullptr), DurationValue(2, 3));
}

TEST_F(DurationNote, TheMenuOffersWhatItIsGiven) {
    ShowWindow();
    DurationValue const entries[] = {{1, 4}, {5, 7}, {3, 8}};
    desktop.Script("menu 2");
    EXPECT_EQ(RunDurationMenu({50, 50}, {1, 1}, 3, entries), DurationValue(5, 7));
    desktop.Script("menu 4");
    EXPECT_THROW(RunDurationMenu({50, 50}, {1, 1}, 3, entries), ScriptError);
}

TEST_F(DurationNote, ADismissedMenuGivesTheCurrentDuration) {
    ShowWindow();
    desktop.Script("menu 0");
    EXPECT_EQ(RunDurationMenu({50, 50}, {5, 7}, 0, nullptr), DurationValue(5, 7));
}

TEST_F(DurationNote, TheCurrentDurationLiesUnderTheMouseAndIsMarked) {
    ShowWindow();
    struct Case {
        DurationValue current;
        int item;
    };
    for (Case c : {Case{{1, 4}, 3}, Case{{3, 8}, 10}, Case{{1, 192}, 11}}) {
        int middle = 0;
        bool marked = false;
        Later const look(0.1, [&] {
            MenuPanel const &panel = *MenuTracker::Open()->Panels()[0];
            middle = panel.ItemTop(c.item) + MenuRows::kItemHeight / 2;
            marked = panel.Items().Find(c.item)->checked;
        });
        desktop.Script("wait 0.5\nmenu 0");
        SetPortToGlog(glog);
        RunDurationMenu({400, 50}, c.current, 0, nullptr);
        EXPECT_EQ(middle, 80 + 400) << c.current;
        EXPECT_TRUE(marked) << c.current;
    }
}

TEST_F(DurationNote, ItsSubmenusAreGoneAfterwards) {
    ShowWindow();
    short id = 0;
    Later const look(0.1, [&] { id = MenuTracker::Open()->Panels()[0]->Items().Find(10)->submenu; });
    desktop.Script("wait 0.5\nmenu 0");
    RunDurationMenu({50, 50}, {1, 4}, 0, nullptr);
    OSMenuHandle found;
    ASSERT_NE(id, 0);
    EXPECT_FALSE(OSMenuHandle::FindInMenuList(id, found));
}

// The pane

TEST_F(DurationNote, BeginsWithoutADuration) {
    EXPECT_EQ(pane->GetDurationValue(), DurationValue());
    EXPECT_EQ(pane->GetID(), 0);
    Show();
    EXPECT_TRUE(Only("Draw1Icon", DrawingOf(*pane)).empty());
}

TEST_F(DurationNote, WithoutAGlogIsNotAttached) {
    std::unique_ptr<DurationNotePane> const loose(new DurationNotePane(nullptr));
    EXPECT_EQ(loose->GetGlog(), nullptr);
}

TEST_F(DurationNote, OneGlyphStandsIndented) {
    pane->SetDurationValue({1, 8});
    Show();
    EXPECT_EQ(DrawingOf(*pane), Traced(*pane, [] {
                  Rect place = GetIconBounds(1821);
                  VelaDrawing::OffsetRect(&place, 34, 20);
                  Draw1Icon(1821, 3, place);
              }));
}

TEST_F(DurationNote, TwoGlyphsStartAtTheEdge) {
    pane->SetDurationValue({1, 12});
    Show();
    EXPECT_EQ(DrawingOf(*pane), Traced(*pane, [] {
                  Rect place = GetIconBounds(1821);
                  VelaDrawing::OffsetRect(&place, 30, 20);
                  Draw1Icon(1821, 3, place);
                  VelaDrawing::OffsetRect(&place, 8, 0);
                  Draw1Icon(1821, 17, place);
              }));
}

TEST_F(DurationNote, AnotherDurationIsToldAndRepainted) {
    Show();
    DurationEar ear(pane);
    bool repaintedBefore = true;
    ear.then = [&] { repaintedBefore = !Repainted().empty(); };
    pane->SetDurationValue({1, 4});
    EXPECT_EQ(ear.count, 1);
    EXPECT_EQ(ear.heard, DurationValue(1, 4));
    EXPECT_FALSE(repaintedBefore) << "listeners come first";
    EXPECT_EQ(Repainted(), (std::vector<Rect>{{20, 30, 36, 70}}));
}

TEST_F(DurationNote, TheSameDurationIsNotTold) {
    pane->SetDurationValue({1, 4});
    Show();
    DurationEar ear(pane);
    pane->SetDurationValue({1, 4});
    EXPECT_EQ(ear.count, 0);
    EXPECT_TRUE(Repainted().empty());
    pane->SetDurationValue({2, 8});
    EXPECT_EQ(ear.count, 1) << "durations are compared field by field";
}

TEST_F(DurationNote, AClickChoosesAndGivesMinusOne) {
    pane->SetDurationValue({1, 4});
    Show();
    DurationEar ear(pane);
    EXPECT_EQ(ResultOfClick("click 40 25\nmenu 5"), -1);
    EXPECT_EQ(pane->GetDurationValue(), DurationValue(1, 16));
    EXPECT_EQ(ear.count, 1);
}

TEST_F(DurationNote, ItsMenuComesUpInItsOwnPort) {
    Show();
    EventRecordAdapter event;
    event.where = {25, 40};
    desktop.Script("menu 5");
    LeaveForAnotherPort();
    EXPECT_EQ((pane->*&Opened<DurationNotePane>::HandleClick)(&event), -1);
    EXPECT_EQ(pane->GetDurationValue(), DurationValue(1, 16));
    EXPECT_TRUE(IsInItsPort());
    pane->SetEnable(false);
    LeaveForAnotherPort();
    EXPECT_EQ((pane->*&Opened<DurationNotePane>::HandleClick)(&event), -1);
    EXPECT_FALSE(IsInItsPort()) << "nothing comes up";
}

TEST_F(DurationNote, OffersTheDurationsThatItWasGiven) {
    pane->SetMenuDurations({{1, 2}, {3, 4}});
    Show();
    EXPECT_EQ(Chosen("menu 2"), DurationValue(3, 4));
    pane->SetMenuDurations({});
    EXPECT_EQ(Chosen("menu 8"), DurationValue(1, 128));
}

TEST_F(DurationNote, DisabledIgnoresClicks) {
    pane->SetDurationValue({1, 4});
    pane->SetEnable(false);
    Show();
    EXPECT_EQ(ResultOfClick("click 40 25"), -1);
    EXPECT_THROW(desktop.Play("menu 1"), ScriptError) << "its menu is open";
}

TEST_F(DurationNote, DisablingItOnlyStores) {
    pane->SetDurationValue({1, 4});
    Show();
    Lines const before = DrawingOf(*pane);
    Repainted();
    pane->SetEnable(false);
    EXPECT_TRUE(Repainted().empty());
    EXPECT_EQ(DrawingOf(*pane), before);
}

TEST_F(DurationNote, OffersAsManyDurationsAsAMenuHas) {
    pane->SetMenuDurations(std::vector<DurationValue>(40000, DurationValue(1, 8)));
    Show();
    EXPECT_EQ(Chosen("menu 32767"), DurationValue(1, 8));
    EXPECT_THROW(Chosen("menu 32768"), ScriptError);
}

TEST_F(DurationNote, MayBeDeletedByWhoHearsOfIt) {
    Show();
    PaneWatch const watch(pane);
    DurationEar ear(pane);
    ear.then = [&] { delete pane; };
    EXPECT_EQ(ResultOfClick("click 40 25\nmenu 1"), -1);
    EXPECT_FALSE(watch.PaneExists());
}

TEST_F(DurationNote, MayBeDeletedWhileItsMenuIsOpen) {
    Show();
    PaneWatch const watch(pane);
    Later const end(0.2, [&] { delete pane; });
    EXPECT_EQ(ResultOfClick("click 40 25\nwait 0.5\nmenu 1"), -1);
    EXPECT_FALSE(watch.PaneExists());
}
