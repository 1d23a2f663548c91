#include "desktop/editing/EditHistory.h"
#include <algorithm>
#include <utility>

namespace {

// Together with the text itself this stays within what texts are allowed to take.
std::size_t const kMostUnits = 8u << 20;
std::size_t const kMostSteps = 10000;

// Puts the second piece behind the first one.
void Append(TextFragment &first, TextFragment const &second) {
    std::size_t const size = first.units.size();
    first.looks.reserve(first.looks.size() + second.looks.size());
    first.units += second.units;
    for (StyleRuns::Run const &run : second.looks)
        if (run.start < second.units.size() && first.looks.back().style != run.style)
            first.looks.push_back({size + run.start, run.style});
}

} // namespace

// Whether the step goes on with the last one, which then has taken it in.
bool EditHistory::Joins(EditStep &step, Kind kind) {
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
        if (step.start + removed == last.start) {
            Append(step.before, last.before);
            last.before = std::move(step.before);
        } else if (step.start == last.start) {
            Append(last.before, step.before);
        } else {
            return false;
        }
        last.start = step.start;
        weight += removed;
    }
    last.selectionAfter = step.selectionAfter;
    return true;
}

void EditHistory::Add(EditStep step, Kind kind) {
    if (!Joins(step, kind)) {
        std::size_t const units = step.before.units.size();
        done.push_back(std::move(step));
        weight += units;
    }
    undone.clear();
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

void EditHistory::Undo(EditStep reverse) {
    undone.push_back(std::move(reverse));
    weight -= done.back().before.units.size();
    done.pop_back();
    Seal();
}

void EditHistory::Redo(EditStep reverse) {
    std::size_t const units = reverse.before.units.size();
    done.push_back(std::move(reverse));
    weight += units;
    undone.pop_back();
    Seal();
}
