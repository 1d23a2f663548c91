// Panes that note what the host does to them.
#pragma once
#include "host/CompoundPane.h"
#include "host/EventRecordAdapter.h"
#include "host/VelaDrawing.h"
#include <functional>
#include <string>
#include <vector>

typedef std::vector<std::string> Calls;

// The list of a test's calls, empty at first; it outlives the fixture, whose panes die last of all.
inline Calls &FreshCalls() {
    static Calls calls;
    calls.clear();
    return calls;
}

// Notes each call in a list that outlives it, and fills its rectangle with one gray.
class ProbePane : public GlogPane {
public:
    ProbePane(glogRec *glog_, Rect box, Calls &calls_, std::string name_ = "pane")
        : calls(calls_)
        , name(name_) {
        GlogPaneInit(glog_, 0);
        GlogPane::SetBox(&box);
    }
    ~ProbePane() override { Note("gone"); }

    void Activate() override {
        GlogPane::Activate();
        Note("Activate");
    }
    void Deactivate() override {
        GlogPane::Deactivate();
        Note("Deactivate");
    }
    void Select(bool on) override {
        Note(on ? "Select" : "Unselect");
        GlogPane::Select(on);
    }
    void GlogItemInit() override { Note("GlogItemInit"); }
    void PanePositionChanged() override { Note("PanePositionChanged"); }
    void ContainmentChanged() override { Note("ContainmentChanged"); }
    void ContainerChangedVisibility() override { Note("ContainerChangedVisibility"); }
    int Key(EventRecordAdapter *event) override {
        Note("Key " + std::to_string(event->message & 0xFF));
        return keyResult;
    }
    int Tab(char direction) override {
        Note("Tab " + std::to_string(direction));
        if (!takesTab)
            return 3;
        if (IsSelected()) {
            Select(false);
            return 1;
        }
        Select(true);
        return 0;
    }
    void Resize(Point delta) override {
        Note("Resize " + std::to_string(delta.h) + " " + std::to_string(delta.v));
        GlogPane::Resize(delta);
    }
    unsigned char TryMouseControl(Point) override {
        Note("TryMouseControl");
        return 1;
    }

    void Idle() override { ++idles; }

    using GlogPane::AddLayoutSubItem;
    using GlogPane::UseLayoutSubItemMode;

    Calls &calls;
    std::string name;
    int idles = 0;
    int clickResult = 0;
    int keyResult = 0;
    bool takesTab = false;
    bool becomesGopher = false;
    std::function<void(EventRecordAdapter *)> onClick;
    std::function<void(OSRgn *)> onDraw;

protected:
    int HandleClick(EventRecordAdapter *event) override {
        Note("click " + std::to_string(event->where.h) + " " + std::to_string(event->where.v));
        int const result = clickResult;
        if (onClick)
            onClick(event);
        return result;
    }
    int HandleSecondaryButtonClick(EventRecordAdapter *) override {
        Note("secondary click");
        return clickResult;
    }
    bool BecomeGopherOnSelect() override { return becomesGopher; }
    void ConfirmChangesOnClickAway() override { Note("ConfirmChangesOnClickAway"); }
    void DrawGuts(OSRgn *region) override {
        Note("draw");
        GrayForeColor(50);
        Rect const r = GetDrawRectangle();
        VelaDrawing::PaintRect(&r);
        if (onDraw)
            onDraw(region);
    }

private:
    void Note(std::string const &what) { calls.push_back(name + ": " + what); }
};

// A container whose content can be scrolled.
class ProbeContainer : public CompoundPane {
public:
    ProbeContainer(glogRec *glog_, Rect box) {
        CompoundPaneInit(glog_, 0);
        CompoundPane::SetBox(&box);
    }
    void LocalOffset(Point *p) override {
        GlogPane::LocalOffset(p);
        p->h = static_cast<short>(p->h + scroll.h);
        p->v = static_cast<short>(p->v + scroll.v);
    }
    using CompoundPane::SetNoErase;
    Point scroll{0, 0};
};

inline int Count(Calls const &calls, std::string const &call) {
    int count = 0;
    for (std::string const &made : calls)
        count += made == call;
    return count;
}
