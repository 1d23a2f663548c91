// What the tests of lists share: a list of three columns, who notes what it draws and what it tells.
#pragma once
#include "host/CallbackAPI.h"
#include "host/VelaDrawing.h"
#include "lists/GListPane.h"
#include "scrolling/ScrollBarPane.h"
#include "tests/PaneTest.h"
#include <boost/make_shared.hpp>
#include <functional>

typedef std::vector<std::string> Log;

// Notes the rows that it draws, with a star behind those that show as selected.
class NotingDrawer : public ListLineDrawer {
public:
    explicit NotingDrawer(bool *gone_ = nullptr)
        : gone(gone_) {}
    ~NotingDrawer() override {
        if (gone)
            *gone = true;
    }
    void DrawLine(int line, Rect *rowBox, bool hilite) override {
        rows.push_back(std::to_string(line) + (hilite ? "*" : ""));
        boxes.push_back(*rowBox);
        if (onDraw)
            onDraw(line, *rowBox);
    }
    Log TakeRows() {
        Log taken;
        taken.swap(rows);
        boxes.clear();
        return taken;
    }

    Log rows;
    std::vector<Rect> boxes;
    std::function<void(int, Rect const &)> onDraw;

private:
    bool *gone;
};

// Notes what a list tells it.
class NotingListener : public GListPane_SelectionListener {
public:
    void SelectionDone(GListPane *list) override { Note(list, "done"); }
    void ClickOccured(GListPane *list, int column, int line, bool doubleClick) override {
        Note(list, std::string(doubleClick ? "double " : "") + "click column " + std::to_string(column) +
                       " line " + std::to_string(line));
    }
    void SelectOccured(GListPane *list, int line, bool selected, bool tracking) override {
        Note(list, std::string(selected ? "select " : "deselect ") + std::to_string(line) +
                       (tracking ? " tracking" : ""));
    }

    Log Take() {
        Log taken;
        taken.swap(log);
        return taken;
    }

    Log log;
    std::function<void(std::string const &)> onCall; // after the note

private:
    void Note(GListPane *, std::string const &line) {
        log.push_back(line);
        if (std::function<void(std::string const &)> const action = onCall)
            action(line);
    }
};

// In the place of the desktop's hooks, for a while: says whether a press is the second of a double click, and
// counts the steps of tracking.
class ListHooks : public VelaFoundationCallbackAPI {
public:
    ListHooks()
        : former(gInstance) {
        gInstance = this;
    }
    ~ListHooks() override { gInstance = former; }
    void TrackingStep() override { ++otherSteps; }
    void ListTrackingStep() override {
        ++steps;
        if (onStep)
            onStep();
    }
    bool IsCancelKey(EventRecordAdapter *, bool) override { return false; }
    bool IsDoubleClick() override {
        ++asked;
        return isDouble;
    }

    bool isDouble = false;
    int asked = 0, steps = 0, otherSteps = 0;
    std::function<void()> onStep;

private:
    VelaFoundationCallbackAPI *former;
};

class ListTest : public PaneTest {
protected:
    static short const kTop = 20, kLeft = 30, kRowHeight = 16;
    // 200 x 100: six rows and a part of the seventh. The first begins at 21, inside the frame.
    static Rect ListBox() { return {kTop, kLeft, 120, 230}; }
    static glistResRec Record(GListSelectionMode mode = kListSelectOne) {
        return {glistResRec::kType, ListBox(), 0, mode, kRowHeight, 0, 0, 0, 0, false, 0, 0};
    }

    // Columns of 60, 60 and 70 pixels from the list's left.
    static boost::shared_ptr<ColumnList> ThreeColumns() {
        ColumnList::Data data[3];
        data[0].rightEdge = data[1].leftEdge = 60;
        data[1].rightEdge = data[2].leftEdge = 120;
        data[2].rightEdge = 190;
        return boost::make_shared<ColumnList>(static_cast<short>(3), data);
    }

    GListPane *NewList(glistResRec record) { return GListPane::NewGListPane(glog, &record); }
    // Scrolls without a bar, and has columns, drawer and listener.
    GListPane *Equipped(GListPane *made, int rows) {
        made->SetColumnList(ThreeColumns());
        made->SetScrollWithNoBar(true);
        made->SetLineDrawer(&drawer, false);
        made->SetNumItems(rows);
        made->SetSelectionListener(&listener);
        listener.Take();
        return made;
    }
    GListPane *Filled(int rows, GListSelectionMode mode = kListSelectOne) {
        return Equipped(NewList(Record(mode)), rows);
    }

    static Rect RowBox(GListPane &list, int row) {
        Rect box;
        EXPECT_TRUE(list.GetRowBox(row, box)) << row;
        return box;
    }
    // The middle of a place of the list, for scripts: the place from 0 down, the column.
    static std::string At(int place, int column = 0) {
        return std::to_string(kLeft + 10 + 60 * column) + " " +
               std::to_string(kTop + 1 + kRowHeight * place + kRowHeight / 2);
    }

    // In the active window, drawn; chores have run, and no click that comes is part of the activation.
    void Show() {
        PaneTest::Show();
        desktop.Play("wait 1");
        Repainted();
        desktop.TakeDrawing();
        desktop.TakeMessages();
        drawer.TakeRows();
        listener.Take();
    }

    static std::vector<int> SelectedRows(GListPane &list) {
        std::vector<int> rows;
        for (int row = 0; row < list.GetNumItems(); ++row)
            if (list.CheckSel(row))
                rows.push_back(row);
        return rows;
    }
    std::vector<Rect> InvalidatedBy(std::function<void()> const &action) {
        Repainted();
        drawer.TakeRows();
        action();
        return Repainted();
    }
    // The rows that are drawn because of the action.
    Log RowsDrawnBy(std::function<void()> const &action) {
        InvalidatedBy(action);
        return drawer.TakeRows();
    }

    NotingDrawer drawer;
    NotingListener listener;
};
