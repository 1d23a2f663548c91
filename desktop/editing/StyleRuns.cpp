#include "desktop/editing/StyleRuns.h"
#include <algorithm>

namespace {

short const kUsualSize = 12;

bool SameColor(OS::RGBAColor const &a, OS::RGBAColor const &b) {
    return a.r == b.r && a.g == b.g && a.b == b.b && a.a == b.a;
}

} // namespace

bool operator==(EditStyle const &a, EditStyle const &b) {
    return a.style.family.GetOrderedFontID() == b.style.family.GetOrderedFontID() &&
           a.style.face == b.style.face && a.style.size == b.style.size && a.colored == b.colored &&
           (!a.colored || SameColor(a.style.color, b.style.color));
}

void CopyStyle(unsigned int mask, OS::TextStyle const &from, EditStyle &to) {
    if (mask & StyleMask::kFamily)
        to.style.family = from.family;
    if (mask & StyleMask::kFace)
        to.style.face = from.face;
    if (mask & StyleMask::kSize)
        to.style.size = from.size;
    if (mask & StyleMask::kColor) {
        to.style.color = from.color;
        to.colored = true;
    }
}

StyleRuns::StyleRuns()
    : runs(1) {
    runs.front().start = 0;
    runs.front().style.style.size = kUsualSize;
}

std::size_t StyleRuns::IndexAt(std::size_t unit) const {
    auto const next = std::upper_bound(runs.begin(), runs.end(), unit,
                                       [](std::size_t place, Run const &run) { return place < run.start; });
    return static_cast<std::size_t>(next - runs.begin()) - 1;
}

StyleRuns::List StyleRuns::Slice(std::size_t start, std::size_t end) const {
    std::size_t const first = IndexAt(start);
    List slice(1, Run{0, runs[first].style});
    for (std::size_t i = first + 1; i < runs.size() && runs[i].start < end; ++i)
        slice.push_back({runs[i].start - start, runs[i].style});
    return slice;
}

StyleRuns::List StyleRuns::Replaced(std::size_t start, std::size_t removed, std::size_t inserted,
                                    List const &looks, std::size_t size) const {
    List changed;
    if (runs.size() == 1 && (inserted == 0 || (looks.size() == 1 && looks.front().style == runs[0].style)))
        return changed;
    std::size_t const end = start + removed;
    for (Run const &run : runs)
        if (run.start < start)
            changed.push_back(run);
    for (std::size_t i = 0; inserted > 0 && i < looks.size(); ++i)
        changed.push_back({start + looks[i].start, looks[i].style});
    if (end < size) {
        changed.push_back({start + inserted, At(end)});
        for (std::size_t i = IndexAt(end) + 1; i < runs.size(); ++i)
            changed.push_back({runs[i].start - removed + inserted, runs[i].style});
    }
    // What was there last tells how a text looks that begins anew.
    if (changed.empty())
        changed.push_back({0, At(start)});
    auto const same = [](Run const &a, Run const &b) { return a.style == b.style; };
    changed.erase(std::unique(changed.begin(), changed.end(), same), changed.end());
    return changed;
}

StyleRuns::List StyleRuns::Changed(std::size_t start, std::size_t end, unsigned int mask,
                                   OS::TextStyle const &style, std::size_t size) const {
    List slice = Slice(start, end);
    for (Run &run : slice)
        CopyStyle(mask, style, run.style);
    return size == 0 ? List(1, Run{0, slice.front().style})
                     : Replaced(start, end - start, end - start, slice, size);
}

void StyleRuns::Take(List &&changed) noexcept {
    if (!changed.empty())
        runs.swap(changed);
}
