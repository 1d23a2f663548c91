// Whether a pane still exists.
#pragma once

class GlogPane;

// For code that calls what may delete the pane, and works with it afterwards. May outlive the pane.
class PaneWatch {
public:
    // Null is no pane.
    explicit PaneWatch(GlogPane *watched = nullptr);
    ~PaneWatch();
    PaneWatch(PaneWatch const &) = delete;
    PaneWatch &operator=(PaneWatch const &) = delete;

    // Watches another pane from now on, or, with null, none.
    void Watch(GlogPane *);
    // False without a pane, and once the destructor of its class GlogPane has begun.
    bool PaneExists() const { return pane != nullptr; }

private:
    friend class GlogPane;
    GlogPane *pane;
    PaneWatch *next; // of the same pane
};
