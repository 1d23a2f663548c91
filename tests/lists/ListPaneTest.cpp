#include "lists/ListPane.h"
#include "host/OSRgn.h"
#include "host/VelaDrawing.h"
#include "tests/PaneTest.h"
#include "tests/VirtualPlace.h"
#include <functional>
#include <limits>

namespace {

int const kMost = std::numeric_limits<int>::max();
Rect const kView = {20, 30, 120, 230}; // 200 x 100
Rect const kUpright = {20, 230, 120, 246};

// Notes the lines that it draws.
class NotingList : public ListPane {
public:
    NotingList(glogRec *glog_, int lineHeight)
        : ListPane(glog_, lineHeight) {}
    void DrawLine(int line, Rect rowBox) override {
        lines.push_back(line);
        boxes.push_back(rowBox);
        if (onDraw)
            onDraw(line);
    }
    int GetListWidth() override { return width; }
    using ListPane::InvalListDimensions;

    std::vector<int> Take() {
        std::vector<int> taken;
        taken.swap(lines);
        boxes.clear();
        return taken;
    }

    int width = 150;
    std::vector<int> lines;
    std::vector<Rect> boxes;
    std::function<void(int)> onDraw;
};

class ListPaneTest : public PaneTest {
protected:
    typedef std::vector<int> Numbers;

    NotingList *NewList(int lineHeight, int lines) {
        NotingList *const list = new NotingList(glog, lineHeight);
        bar = new ScrollBarPane(glog, 0, 0, 0);
        Rect view = kView, upright = kUpright;
        list->SetBox(&view);
        bar->SetBox(&upright);
        list->SetVScrollBar(bar);
        list->SetNumLines(lines);
        return list;
    }
    // How far the area is scrolled.
    static Point Scrolled(NotingList &list) {
        Point place = {kView.top, kView.left};
        list.LocalOffset(&place);
        return place;
    }
    static Rect AreaOf(NotingList &list) { return list.Get(0)->GetBounds(); }
    Numbers DrawnBy(NotingList &list, std::function<void()> const &action) {
        Repainted();
        list.Take();
        action();
        UpdateGlog(glog);
        return list.Take();
    }

    ScrollBarPane *bar = nullptr;
};

} // namespace

TEST_F(ListPaneTest, ItsLinesAreDrawnByAPaneOfNumberZeroInItsOwnPort) {
    NotingList *const list = NewList(20, 3);
    GlogPane *const helper = list->Get(0);
    EXPECT_EQ(helper->GetID(), 0);
    Show();
    LeaveForAnotherPort();
    (helper->*&Opened<GlogPane>::DrawGuts)(nullptr);
    EXPECT_TRUE(IsInItsPort());
}

TEST_F(ListPaneTest, AddsItsOperationsAfterThoseOfAScrolledPane) {
    class Added : public ScrollPane {
    public:
        virtual void First() {}
    };
    ExpectInOrder(PlaceOf(&Added::First), &ListPane::DrawLine, &ListPane::GetListWidth);
}

TEST_F(ListPaneTest, IsEmptyAtFirst) {
    NotingList *const list = new NotingList(glog, 16);
    EXPECT_EQ(list->GetNumLines(), 0);
    EXPECT_EQ(list->GetLineHeight(), 16);
    EXPECT_EQ(list->NumSubpanes(), 1);
    EXPECT_EQ(list->GetID(), 0);
}

TEST_F(ListPaneTest, WithoutLinesItsAreaFillsTheViewAndTheBarIsDead) {
    NotingList *const list = NewList(16, 20);
    ScrollBarPane *const across = new ScrollBarPane(glog, ScrollBarPane::kHorizontalBar, 0, 0);
    Rect flat = {120, 30, 136, 230};
    across->SetBox(&flat);
    list->SetHScrollBar(across);
    list->width = 500;
    list->InvalListDimensions();
    Show();
    desktop.Play("wait 1\nclick 238 112\nclick 222 128");
    ASSERT_EQ(Scrolled(*list), (Point{16, 16})) << "by an arrow of each bar";
    list->width = 0;
    list->SetNumLines(0);
    EXPECT_EQ(AreaOf(*list), (Rect{0, 0, 100, 200}));
    EXPECT_EQ(bar->GetRange(), 0);
    EXPECT_EQ(across->GetRange(), 0);
    EXPECT_EQ(Scrolled(*list), (Point{0, 0}));
    EXPECT_EQ(DrawnBy(*list, [&] { list->Inval(); }), Numbers());
    desktop.Play("wait 1\nclick 238 112\nclick 222 128");
    EXPECT_EQ(Scrolled(*list), (Point{0, 0}));
}

TEST_F(ListPaneTest, ItsAreaHasRoomForAllLinesAndTheirWidth) {
    NotingList *const list = NewList(16, 20);
    EXPECT_EQ(AreaOf(*list), (Rect{0, 0, 320, 200}));
    EXPECT_EQ(bar->GetRange(), 220);
    list->width = 500;
    list->InvalListDimensions();
    EXPECT_EQ(AreaOf(*list).right, 500);
    EXPECT_EQ(list->GetMaxHScrollValue(), 300);
}

TEST_F(ListPaneTest, DrawsTheLinesThatShow) {
    NotingList *const list = NewList(16, 20);
    Show();
    Numbers const drawn = DrawnBy(*list, [&] { list->SetVScrollPos(40); });
    EXPECT_EQ(drawn, (Numbers{2, 3, 4, 5, 6, 7, 8}));
}

TEST_F(ListPaneTest, ALineHasItsBoxInTheAreaAndTheClipIsWhatShowsOfIt) {
    NotingList *const list = NewList(16, 20);
    std::vector<Rect> clips;
    list->onDraw = [&clips](int) {
        TempRgn const clip;
        VelaDrawing::GetClip(clip);
        clips.push_back(CarbonUtils::GetRgnBounds(clip));
    };
    Show();
    clips.clear();
    DrawnBy(*list, [&] {
        list->SetVScrollPos(40);
        UpdateGlog(glog);
        EXPECT_EQ(list->boxes.front(), (Rect{32, 0, 48, 200}));
    });
    EXPECT_EQ(clips.front(), (Rect{40, 0, 48, 200}));
}

TEST_F(ListPaneTest, OnlyLinesInTheDamageAreDrawn) {
    NotingList *const list = NewList(16, 20);
    Show();
    EXPECT_EQ(DrawnBy(*list,
                      [&] {
                          SetPortToGlog(glog);
                          Rect const part = {40, 40, 50, 60}; // 20 to 30 of the area
                          VelaDrawing::InvalRect(&part);
                      }),
              Numbers{1});
}

TEST_F(ListPaneTest, WithoutARegionAllLinesAreDrawn) {
    NotingList *const list = NewList(16, 3);
    Show();
    list->Take();
    (list->Get(0)->*&Opened<GlogPane>::DrawGuts)(nullptr);
    EXPECT_EQ(list->Take(), (Numbers{0, 1, 2}));
}

TEST_F(ListPaneTest, AnArrowMovesALine) {
    NotingList *const list = NewList(24, 20);
    EXPECT_EQ(list->GetScrollDelta(), 24);
    bar->ScrollOneUnit(true);
    EXPECT_EQ(Scrolled(*list).v, 24);
    bar->ScrollPage(true);
    EXPECT_EQ(Scrolled(*list).v, 114);
}

TEST_F(ListPaneTest, AWheelNotchIsFivePixels) {
    NotingList *const list = NewList(16, 20);
    Show();
    desktop.Play("wheel 100 60 0 -3");
    EXPECT_EQ(Scrolled(*list).v, 15);
}

TEST_F(ListPaneTest, AtTheBottomMoreOrFewerLinesKeepItThere) {
    NotingList *const list = NewList(16, 20);
    list->SetVScrollPos(220);
    list->SetNumLines(30);
    EXPECT_EQ(Scrolled(*list).v, 380);
    list->SetNumLines(10);
    EXPECT_EQ(Scrolled(*list).v, 60);
    list->SetNumLines(2);
    EXPECT_EQ(Scrolled(*list).v, 0);
}

TEST_F(ListPaneTest, TheSameNumberIsNoChange) {
    NotingList *const list = NewList(16, 20);
    Show();
    EXPECT_EQ(DrawnBy(*list, [&] { list->SetNumLines(20); }), Numbers());
}

TEST_F(ListPaneTest, AnotherBoxTakesTheAreaAlong) {
    NotingList *const list = NewList(16, 20);
    Rect larger = {20, 30, 420, 330};
    list->SetBox(&larger);
    EXPECT_EQ(AreaOf(*list), (Rect{0, 0, 400, 300}));
    Rect smaller = kView;
    list->SetBox(&smaller);
    EXPECT_EQ(AreaOf(*list), (Rect{0, 0, 320, 200}));
}

TEST_F(ListPaneTest, AnotherNumberFromInsideADrawingEndsIt) {
    NotingList *const list = NewList(16, 20);
    Show();
    list->onDraw = [list](int line) {
        if (line == 2)
            list->SetNumLines(3);
    };
    EXPECT_EQ(DrawnBy(*list, [&] { list->Inval(); }).size(), 3u);
}

// Kept: coordinates are 16 bits wide, so lines far down lie anywhere.
TEST_F(ListPaneTest, LinesBeyondTheCoordinatesWrapAround) {
    NotingList *const list = NewList(16, 5000);
    EXPECT_EQ(AreaOf(*list).bottom, 32767);
    Show();
    EXPECT_EQ(DrawnBy(*list, [&] { list->Inval(); }),
              (Numbers{0, 1, 2, 3, 4, 5, 6, 4096, 4097, 4098, 4099, 4100, 4101, 4102}));
}

TEST_F(ListPaneTest, HeightsAndNumbersOutOfRangeDoNoHarm) {
    struct {
        int height, lines;
    } const cases[] = {{kMost, 3}, {0, 1000}, {-16, 20}, {16, -5}, {65536, 100}, {kMost, 1000}};
    for (auto const &c : cases) {
        NotingList *const list = NewList(c.height, c.lines);
        list->width = kMost;
        list->InvalListDimensions();
        Show();
        list->Inval();
        UpdateGlog(glog);
        EXPECT_GE(AreaOf(*list).bottom, 100);
        EXPECT_EQ(AreaOf(*list).right, 32767);
        bar->ScrollOneUnit(true);
        delete list;
    }
}

TEST_F(ListPaneTest, WithoutAGlogItStaysUnattached) {
    NotingList list(nullptr, 16);
    list.SetNumLines(3);
    EXPECT_EQ(list.GetGlog(), nullptr);
}
