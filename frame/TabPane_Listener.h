// Hears of changes of the selected tab.
#pragma once
#include "frame/Message.h"

class TabPane;

class TabPane_Listener : public Dependent<TabPane_Listener> {
public:
    TabPane_Listener();
    virtual ~TabPane_Listener();

    // The selection has moved from one item to another; both count from 0. Sent before the redraw is asked
    // for. When another listener selects a further tab in answer, the new item is the one selected by now.
    virtual void TabSelected(TabPane *pane, int newItem, int oldItem) = 0;
};

extern template class Provider<TabPane_Listener>;
extern template class Dependent<TabPane_Listener>;
extern template class DependentCastMessenger<TabPane_Listener>;
extern template class Message3<TabPane_Listener, TabPane *, TabPane *, int, int, int, int>;
