// A row that is dragged to another place.
#include "host/CIdleChore.h"
#include "host/OSPort.h"
#include "host/Services.h"
#include "tests/lists/ListTest.h"

namespace {

class GListPaneMovingTest : public ListTest {
protected:
    static constexpr int kNotAsked = -100;

    // A press on the second column moves its row.
    GListPane *Movable(glistResRec record, int rows) {
        GListPane *const list = Equipped(NewList(record), rows);
        listener.onCall = [this, list](std::string const &call) {
            if (call.find("click") != 0)
                return;
            int line = 0, column = 0;
            list->GetClickParameters(line, column);
            Point const point = pressed;
            listener.onCall = nullptr;
            listener.Take();
            desktop.TakeDrawing();
            result = list->MoveItem(point);
        };
        Show();
        return list;
    }
    GListPane *Movable(int rows) { return Movable(Record(), rows); }

    // What MoveItem answers when the mouse goes down at one height and up at another.
    int Dragged(int from, int to, std::string const &onTheWay = "", int endH = 100) {
        pressed = {static_cast<short>(from), 100};
        result = kNotAsked;
        desktop.Play("wait 1\npress 100 " + std::to_string(from) + "\nmove " + std::to_string(endH) + " " +
                     std::to_string(to) + "\n" + onTheWay + "release");
        return result;
    }

    Point pressed = {0, 0};
    int result = kNotAsked;
};

// Row 2 is from 53 to 69. What counts is where its lower edge comes to.
int const kRow2 = 61;

} // namespace

TEST_F(GListPaneMovingTest, ARowThatIsNotMovedStays) {
    Movable(10);
    EXPECT_EQ(Dragged(kRow2, kRow2), -1);
}

TEST_F(GListPaneMovingTest, ARowThatIsMovedUpWithinItsPlaceStays) {
    Movable(10);
    EXPECT_EQ(Dragged(kRow2, kRow2 - 2), -1);
}

// The row behind is where its lower edge is, and that becomes its own number.
TEST_F(GListPaneMovingTest, ARowThatIsMovedALittleDownKeepsItsNumber) {
    GListPane *const list = Movable(10);
    EXPECT_EQ(Dragged(kRow2, kRow2 + 2), 2);
    Rect const row = {53, 31, 69, 229};
    Lines const drawn = Only("ScrollRect", desktop.TakeDrawing());
    EXPECT_EQ(drawn, Traced(*list, [&] { OSPort::Current().ScrollRect(row, OS::Size(0, 16)); }))
        << "kept: its pixels move by a row all the same";
}

TEST_F(GListPaneMovingTest, ARowMovesDownToTheNumberThatItHasAfterwards) {
    struct {
        int distance, place;
    } const cases[] = {{17, 3}, {32, 4}, {47, 4}, {48, 5}};
    for (auto const &c : cases) {
        GListPane *const list = Movable(10);
        EXPECT_EQ(Dragged(kRow2, kRow2 + c.distance), c.place) << c.distance;
        delete list;
    }
}

TEST_F(GListPaneMovingTest, ARowMovesUp) {
    Movable(10);
    EXPECT_EQ(Dragged(kRow2, kRow2 - 20), 1);
}

TEST_F(GListPaneMovingTest, ARowMovesToTheFirstPlace) {
    Movable(10);
    EXPECT_EQ(Dragged(kRow2, -15), 0);
}

TEST_F(GListPaneMovingTest, AboveTheRowsIsTheFirstOneThatShows) {
    glistResRec record = Record();
    record.firstLineOffset = 30;
    GListPane *const list = Movable(record, 10);
    list->SetScrollPosition(3);
    EXPECT_EQ(Dragged(70, 20), 3) << "its lower edge came to 33, above the rows";
}

TEST_F(GListPaneMovingTest, BelowTheListIsBehindTheRowsThatShow) {
    Movable(100);
    EXPECT_EQ(Dragged(kRow2, 128), 6);
}

TEST_F(GListPaneMovingTest, BelowTheLastRowIsTheEnd) {
    Movable(4);
    EXPECT_EQ(Dragged(kRow2, 110), 3);
}

TEST_F(GListPaneMovingTest, OutsideOfTheSlopARowStays) {
    for (int h : {5, 254}) {
        GListPane *const list = Movable(10);
        EXPECT_EQ(Dragged(kRow2, kRow2 + 48, "", h), -1) << h;
        delete list;
    }
    for (int h : {6, 253}) {
        GListPane *const list = Movable(10);
        EXPECT_EQ(Dragged(kRow2, kRow2 + 48, "", h), 5) << h;
        delete list;
    }
    GListPane *const list = Movable(10);
    EXPECT_EQ(Dragged(kRow2, 160), -1);
    delete list;
    Movable(10);
    EXPECT_EQ(Dragged(kRow2, -21), -1);
}

TEST_F(GListPaneMovingTest, WhereNoCellIsNothingMoves) {
    GListPane *const list = Movable(3);
    EXPECT_EQ(list->MoveItem({20, 100}), -1);
    EXPECT_EQ(list->MoveItem({110, 100}), -1);
    EXPECT_EQ(list->MoveItem({40, 225}), -1);
    EXPECT_EQ(NewList(Record())->MoveItem({40, 40}), -1);
}

TEST_F(GListPaneMovingTest, DeselectsAllFirst) {
    GListPane *const list = Movable(10);
    list->SetSelRange(4, 4);
    Dragged(kRow2, kRow2);
    EXPECT_EQ(list->GetFirstSelectedItem(), -1);
    EXPECT_EQ(listener.Take(), (Log{"done"}));
}

TEST_F(GListPaneMovingTest, ThePixelsBetweenMoveTheOtherWay) {
    GListPane *const list = Movable(10);
    ASSERT_EQ(Dragged(kRow2, kRow2 + 32), 4);
    Lines const drawn = Only("ScrollRect", desktop.TakeDrawing());
    Rect const rows = {53, 31, 101, 229}; // rows 2 to 4
    EXPECT_EQ(drawn, Traced(*list, [&] { OSPort::Current().ScrollRect(rows, OS::Size(0, -16)); }));
    delete list;
    GListPane *const other = Movable(10);
    ASSERT_EQ(Dragged(kRow2, kRow2 - 20), 1);
    Lines const upward = Only("ScrollRect", desktop.TakeDrawing());
    Rect const both = {37, 31, 69, 229};
    EXPECT_EQ(upward, Traced(*other, [&] { OSPort::Current().ScrollRect(both, OS::Size(0, 16)); }));
}

TEST_F(GListPaneMovingTest, TheShadowThatMovedAlongIsDrawnAnew) {
    GListPane *const list = Movable(10);
    Dragged(kRow2, kRow2 + 32);
    Lines const invalidated = Only("InvalRect", desktop.TakeDrawing());
    Rect const left = {31, 31, 119, 41}, top = {21, 31, 31, 229};
    EXPECT_EQ(invalidated, Traced(*list, [&] {
                  VelaDrawing::InvalRect(&left);
                  VelaDrawing::InvalRect(&top);
              }));
}

TEST_F(GListPaneMovingTest, ASmallListHasNoShadow) {
    glistResRec record = Record();
    record.style = glistResRec::kSmallStyle;
    Movable(record, 10);
    ASSERT_EQ(Dragged(60, 92), 4);
    EXPECT_TRUE(Only("InvalRect", desktop.TakeDrawing()).empty());
}

// A row that has been scrolled away: everything on its side of the list moves.
TEST_F(GListPaneMovingTest, FromARowOutOfSightThePixelsUpToTheEdgeMove) {
    GListPane *const list = Movable(100);
    ASSERT_EQ(Dragged(kRow2, 130, "wait 0.52\nmove 100 80\n"), 14);
    EXPECT_EQ(list->GetScrollPos(), 11);
    Lines const drawn = Only("ScrollRect", desktop.TakeDrawing());
    Rect const rows = {31, 31, 85, 229}; // from below the shadow to row 14
    ASSERT_FALSE(drawn.empty());
    EXPECT_EQ(drawn.back(),
              Traced(*list, [&] { OSPort::Current().ScrollRect(rows, OS::Size(0, -16)); }).back());
}

TEST_F(GListPaneMovingTest, AnOffsetOfTheFirstRowDoesNotMove) {
    glistResRec record = Record();
    record.firstLineOffset = 7;
    GListPane *const list = Movable(record, 100);
    ASSERT_GT(Dragged(68, 140, "wait 0.52\nmove 100 80\n"), 10);
    Lines const drawn = Only("ScrollRect", desktop.TakeDrawing());
    Rect const rows = {38, 31, RowBox(*list, result).bottom, 229};
    ASSERT_FALSE(drawn.empty());
    EXPECT_EQ(drawn.back(),
              Traced(*list, [&] { OSPort::Current().ScrollRect(rows, OS::Size(0, -16)); }).back());
}

// Scrolling

TEST_F(GListPaneMovingTest, WhileTheRowWouldLeaveTheListItScrollsEveryThreeTicks) {
    GListPane *const list = Movable(100);
    // Below 120 - 53 + 61: row 2 would be below the list.
    EXPECT_EQ(Dragged(kRow2, 129, "wait 0.52\n"), 17);
    EXPECT_EQ(list->GetScrollPos(), 11);
    delete list;
    GListPane *const other = Movable(100);
    other->SetScrollPosition(11);
    // Above 61 - 69 + 20: it would be above the list.
    EXPECT_EQ(Dragged(kRow2, 11, "wait 0.22\n"), 6);
    EXPECT_EQ(other->GetScrollPos(), 6);
}

TEST_F(GListPaneMovingTest, NearerTheListDoesNotScroll) {
    GListPane *const list = Movable(100);
    list->SetScrollPosition(20);
    EXPECT_EQ(Dragged(kRow2, 128, "wait 0.5\nmove 100 12\nwait 0.5\n"), 20);
    EXPECT_EQ(list->GetScrollPos(), 20);
}

TEST_F(GListPaneMovingTest, ScrollingDrawsTheListAndKeepsThePen) {
    GListPane *const list = Movable(100);
    drawer.onDraw = [](int, Rect const &) { VelaDrawing::MoveTo(1, 2); };
    list->Prepare();
    VelaDrawing::MoveTo(77, 88);
    Dragged(kRow2, 130, "wait 0.12\n");
    EXPECT_EQ(Only("SetPenState", desktop.TakeDrawing()).size(), 3u) << "once for each row";
    ASSERT_EQ(list->GetScrollPos(), 3);
    list->Prepare();
    Point pen = {0, 0};
    VelaDrawing::GetPen(&pen);
    EXPECT_EQ(pen, (Point{88, 77}));
    Log const drawn = drawer.TakeRows();
    EXPECT_EQ(drawn.back(), "9") << "the last row that came into view";
}

TEST_F(GListPaneMovingTest, AListThatGoesWhileItsRowIsDraggedAnswersThatNothingMoved) {
    class Deleting : public CIdleChore {
    public:
        explicit Deleting(GListPane *list_)
            : CIdleChore(66, kInitialDelay) // 1.1 seconds: the press is after one
            , list(list_) {
            Assign();
        }
        void DoIdle() override {
            Cancel();
            delete list;
        }

    private:
        GListPane *list;
    } const deleting(Movable(100));
    EXPECT_EQ(Dragged(kRow2, 100, "wait 0.5\n"), -1);
    EXPECT_EQ(CountGlogItems(glog), 0);
}

TEST_F(GListPaneMovingTest, ARowThatGoesBeforeItIsDraggedStays) {
    GListPane *const list = Movable(6);
    double before = 0, after = 0;
    listener.onCall = [&](std::string const &call) {
        if (call.find("click") != 0)
            return;
        listener.onCall = [&](std::string const &) { // when it has deselected
            listener.onCall = nullptr;
            list->SetNumItems(2);
        };
        before = TarnSystemTime::GetCurrentEventTime();
        result = list->MoveItem(pressed);
        after = TarnSystemTime::GetCurrentEventTime();
    };
    EXPECT_EQ(Dragged(kRow2, 110, "wait 3\n"), -1);
    EXPECT_EQ(list->GetNumItems(), 2);
    EXPECT_EQ(after, before) << "nor is it dragged at all";
}

// Its place has a number below 0 then, which no row has.
TEST_F(GListPaneMovingTest, AboveTheFirstRowOfAListThatBeginsBeforeItIsTheFirstPlace) {
    for (int to : {120, 70}) { // to the places of rows -1 and -4
        GListPane *const list = Movable(10);
        list->SetScrollWithNoBar(false);
        list->ScrollToPage(0); // seven rows before the first one
        Rect box = {20, 30, 199, 230};
        list->SetBox(&box); // in which twelve rows show
        ASSERT_EQ(list->CheckHitV(160), 1);
        EXPECT_EQ(Dragged(160, to), 0);
        delete list;
    }
}

TEST_F(GListPaneMovingTest, ARowThatGoesWhileItIsDraggedStays) {
    GListPane *const list = Movable(6);
    class Emptying : public CIdleChore {
    public:
        explicit Emptying(GListPane &list_)
            : CIdleChore(66, kInitialDelay) // 1.1 seconds: the press is after one
            , list(list_) {
            Assign();
        }
        void DoIdle() override {
            Cancel();
            list.SetNumItems(0);
        }

    private:
        GListPane &list;
    } const emptying(*list);
    EXPECT_EQ(Dragged(kRow2, 300, "wait 0.5\nmove 100 20\n"), -1);
}
