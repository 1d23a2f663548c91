// The host's own fields of a pane.
#pragma once
#include "host/CompoundPane.h"
#include "host/GlogPane.h"
#include "host/PaneWatch.h"
#include <memory>
#include <vector>

struct GlogPane::Rep {
    int id = 0;
    Rect box{0, 0, 0, 0};
    bool visible = true; // the pane's own flag
    bool active = false;
    bool selected = false;
    bool started = false; // GlogItemInit was called
    // The pane itself when it holds others. Asked for every pane between any two events, where a cast would
    // be most of the work.
    CompoundPane *asContainer = nullptr;
    RCPtr<GlogLayoutRectItem> layoutItem;
    bool subItemMode = false;
    std::vector<RCPtr<GlogLayoutRectItem>> subItems;
    std::unique_ptr<HelpTagHelper> help;
    PaneWatch *watches = nullptr; // those who want to know when the pane goes away
};

struct CompoundPane::CompoundRep {
    typedef std::vector<GlogPane *> Panes; // from the bottom to the top

    Panes const &Subpanes() const { return *list; }
    // The subpanes as they are now, whatever becomes of the list.
    std::shared_ptr<Panes const> Snapshot() const { return list; }
    void Insert(short index, GlogPane *);
    // From the end: a container that goes away deletes its subpanes from there.
    void Remove(GlogPane *);
    // Calls an operation on every subpane, from the bottom to the top. The list may change meanwhile, and the
    // container may go away: what was removed is not called, what was added may be.
    template <class Operation> void ForEach(CompoundPane &container, Operation operation) const {
        ForEachOf(container, *Snapshot(), operation);
    }
    // The same for those of some subpanes that are left.
    template <class Operation>
    void ForEachOf(CompoundPane &container, Panes const &some, Operation operation) const {
        PaneWatch const watch(&container);
        unsigned long const before = changes;
        for (std::size_t i = 0; i < some.size(); ++i) {
            // Of thousands of panes most are in slow memory; to wait for each would be most of the work.
            if (i + kPanesAhead < some.size())
                __builtin_prefetch(some[i + kPanesAhead]);
            if (Has(some[i], before))
                operation(*some[i]);
            if (!watch.PaneExists())
                return;
        }
    }
    // Whether a subpane of then is still one. Looking it up takes longer than most operations.
    bool Has(GlogPane *pane, unsigned long changesThen) const {
        return changes == changesThen || IsAmong(pane);
    }

    // The subpanes that are shown and draw somewhere in the rectangle. Whoever scrolls through thousands asks
    // none of those that are out of sight.
    Panes Within(Rect const &);
    // A subpane has come or gone, or draws elsewhere, or has been shown or hidden, or may have.
    void ForgetReaches() { reachesKnown = false; }

    unsigned long changes = 0; // how often a subpane has come or gone
    RCPtr<GlogLayoutGroup> layout;
    bool sizesToLayout = false;
    bool noErase = false;
    bool hasFrame = false;

private:
    static std::size_t const kPanesAhead = 8;

    bool IsAmong(GlogPane *) const;
    Panes &OwnList();
    void LearnReaches();

    // Owned panes. A list that others look at is copied before it changes.
    std::shared_ptr<Panes> list = std::make_shared<Panes>();
    std::vector<Rect> reaches; // where each subpane draws; empty for one that is hidden
    bool reachesKnown = false;
    bool reachesDescend = false; // each begins and ends no higher than the one before it
};
