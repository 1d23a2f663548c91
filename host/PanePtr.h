// A pointer to a pane of somebody else's.
#pragma once
#include "host/PaneWatch.h"

// Becomes null when the pane is deleted. `P` is a class of panes.
template <class P> class PanePtr {
public:
    PanePtr() {} // null
    // Points to another pane from now on, or, with null, to none.
    PanePtr &operator=(P *newPane) {
        pane = newPane;
        watch.Watch(newPane);
        return *this;
    }
    PanePtr(PanePtr const &) = delete;
    PanePtr &operator=(PanePtr const &) = delete;

    P *Get() const { return watch.PaneExists() ? pane : nullptr; } // the pane, while it exists
    P *operator->() const { return Get(); }                        // must not be null
    explicit operator bool() const { return Get() != nullptr; }    // whether there is a pane

private:
    P *pane = nullptr;
    PaneWatch watch;
};
