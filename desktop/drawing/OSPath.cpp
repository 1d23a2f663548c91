#include "host/OSPath.h"
#include "desktop/drawing/OSPathRep.h"
#include "desktop/drawing/WholePixels.h"
#include <cstddef>

OSPath::OSPath()
    : rep(new Rep) {}

OSPath::~OSPath() { delete rep; }

void OSPath::CreateSubpath(double h, double v) {
    rep->steps.push_back({Rep::Verb::kBegin, FiniteCoordinate(h), FiniteCoordinate(v)});
}

void OSPath::AddLine(double h, double v) {
    Rep::Verb verb = rep->steps.empty() ? Rep::Verb::kBegin : Rep::Verb::kLine;
    rep->steps.push_back({verb, FiniteCoordinate(h), FiniteCoordinate(v)});
}

void OSPath::AddPath(OSPath const &other, double dh, double dv) {
    std::size_t count = other.rep->steps.size(); // taken once: the other path may be this one, and grows then
    rep->steps.reserve(rep->steps.size() + count);
    for (std::size_t i = 0; i < count; ++i) {
        Rep::Step step = other.rep->steps[i];
        if (step.verb != Rep::Verb::kClose) {
            step.h = FiniteCoordinate(step.h + dh);
            step.v = FiniteCoordinate(step.v + dv);
        }
        rep->steps.push_back(step);
    }
}

void OSPath::Clear() { rep->steps.clear(); }

void OSPath::CloseSubpath() {
    if (!rep->steps.empty())
        rep->steps.push_back({Rep::Verb::kClose, 0, 0});
}
