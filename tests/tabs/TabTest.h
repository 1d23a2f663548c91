// What the tests of tabs share: rows of tabs, and listeners that write down what they hear.
#pragma once
#include "host/CallbackAPI.h"
#include "host/PaneWatch.h"
#include "tabs/TabPane.h"
#include "tests/PaneTest.h"

// A row whose protected operations tests may call.
class OpenTabs : public TabPane {
public:
    using TabPane::CachedStringWidth;
    using TabPane::FindItem;
    using TabPane::TabPane;
};

class TabEar : public TabPane_Listener {
public:
    explicit TabEar(TabPane *pane) { Dependent<TabPane_Listener>::DependUpon(pane); }
    void TabSelected(TabPane *pane, int newItem, int oldItem) override {
        heard += std::to_string(oldItem) + " to " + std::to_string(newItem) + "; ";
        sender = pane;
        if (then)
            then();
    }
    std::string heard;
    TabPane *sender = nullptr;
    std::function<void()> then;
};

class TabTest : public PaneTest {
protected:
    static std::vector<TabPane::Item> Items(std::initializer_list<char const *> names) {
        std::vector<TabPane::Item> items;
        for (char const *name : names)
            items.push_back(TabPane::Item(Text(name)));
        return items;
    }
    // At (10, 20), with room to spare.
    OpenTabs *Make(std::initializer_list<char const *> names = {"Notes", "Chords", "Lyrics"}) {
        return new OpenTabs(glog, Rect{20, 10, 37, 310}, Items(names), 0);
    }
    static int Width(Rect const &r) { return r.right - r.left; }
    // In the middle of the tab, as a script writes it.
    static std::string Middle(TabPane &pane, int item) {
        Rect const r = pane.GetItemBox(item);
        return Place((r.left + r.right) / 2, (r.top + r.bottom) / 2);
    }
    static std::string Place(int h, int v) { return ' ' + std::to_string(h) + ' ' + std::to_string(v); }
};
