#include "desktop/editing/EditHistory.h"
#include <algorithm>
#include <utility>

namespace {

// Together with the text itself this stays within what texts are allowed to take.
std::size_t const kMostUnits = 8u << 20;
std::size_t const kMostSteps = 10000;

// Puts one piece behind the other.
TextFragment Joined(TextFragment first, TextFragment const &second) {
    for (StyleRuns::Run const &run : second.looks)
        if (run.start < second.units.size() && (first.looks.back().style != run.style))
            first.looks.push_back({first.units.size() + run.start, run.style});
    first.units += second.units;
    return first;
}

} // namespace

// Whether the step goes on with the last one, which then has taken it in.
bool EditHistory::Joins(EditStep const &step, Kind kind) {
    if (!open || done.empty() || kind != openKind || kind == kOther)
        return false;
    EditStep &last = done.back();
    if (kind == kTyping) {
        if (!step.before.units.empty() || step.start != last.start + last.length)
            return false;
        last.length += step.length;
    } else {
        std::size_t const removed = step.before.units.size();
        if (step.length != 0 || last.length != 0)
            return false;
        if (step.start + removed == last.start)
            last.before = Joined(step.before, last.before);
        else if (step.start == last.start)
            last.before = Joined(std::move(last.before), step.before);
        else
            return false;
        last.start = step.start;
        weight += removed;
    }
    last.selectionAfter = step.selectionAfter;
    return true;
}

void EditHistory::Add(EditStep step, Kind kind) {
    undone.clear();
    bool const joined = Joins(step, kind);
    if (!joined) {
        weight += step.before.units.size();
        done.push_back(std::move(step));
    }
    open = true;
    openKind = kind;
    Limit();
}

// The oldest steps go first; the newest one stays, however large it is.
void EditHistory::Limit() {
    std::size_t count = 0;
    while (count + 1 < done.size() && (weight > kMostUnits || done.size() - count > kMostSteps))
        weight -= done[count++].before.units.size();
    done.erase(done.begin(), done.begin() + static_cast<std::ptrdiff_t>(count));
}

void EditHistory::Clear() {
    done.clear();
    undone.clear();
    weight = 0;
    Seal();
}

EditStep EditHistory::TakeDone() {
    EditStep step = std::move(done.back());
    done.pop_back();
    weight -= step.before.units.size();
    Seal();
    return step;
}

EditStep EditHistory::TakeUndone() {
    EditStep step = std::move(undone.back());
    undone.pop_back();
    Seal();
    return step;
}

void EditHistory::AddRedone(EditStep step) {
    weight += step.before.units.size();
    done.push_back(std::move(step));
    Seal();
}
