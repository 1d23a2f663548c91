// What the user has done to a text, to be undone.
#pragma once
#include "desktop/editing/TextDocument.h"
#include <cstddef>
#include <vector>

// From where a selection was begun to where it has come; the insertion point is at `to`.
struct EditSelection {
    std::size_t from = 0, to = 0;
    std::size_t Start() const { return from < to ? from : to; }
    std::size_t End() const { return from < to ? to : from; }
    bool Empty() const { return from == to; }
};

// One change: what stood in the place of what stands there now.
struct EditStep {
    std::size_t start;
    TextFragment before;
    std::size_t length; // of what stands there now
    EditSelection selectionBefore, selectionAfter;
};

// Two stacks of steps. Typing on, and deleting on, become one step with what was before.
class EditHistory {
public:
    enum Kind { kTyping, kDeleting, kOther };

    // The user makes a new step, after which nothing can be done again. When memory runs out, in this and the
    // others, everything stays as it is.
    void Add(EditStep, Kind);
    // What comes next is a step of its own.
    void Seal() { open = false; }
    void Clear();

    bool CanUndo() const { return !done.empty(); }
    bool CanRedo() const { return !undone.empty(); }
    // The step to be taken back or made again.
    EditStep const &Done() const { return done.back(); }
    EditStep const &Undone() const { return undone.back(); }
    // It was, and this step brings back what it has replaced.
    void Undo(EditStep reverse);
    void Redo(EditStep reverse);

private:
    bool Joins(EditStep &, Kind);
    void Limit();

    std::vector<EditStep> done, undone;
    std::size_t weight = 0; // units kept in `done`
    bool open = false;      // the last step may grow
    Kind openKind = kOther;
};
