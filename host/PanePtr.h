// A pointer to a pane of somebody else's.
#pragma once
#include "host/PaneWatch.h"

// Becomes null when the pane is deleted. `P` is a class of panes.
template <class P> class PanePtr {
public:
    PanePtr() {}
    PanePtr &operator=(P *newPane) {
        pane = newPane;
        watch.Watch(newPane);
        return *this;
    }
    PanePtr(PanePtr const &) = delete;
    PanePtr &operator=(PanePtr const &) = delete;

    P *Get() const { return watch.PaneExists() ? pane : nullptr; }
    P *operator->() const { return Get(); }
    explicit operator bool() const { return Get() != nullptr; }

private:
    P *pane = nullptr;
    PaneWatch watch;
};
