#include "host/HelpTagHelper.h"
#include "desktop/resources/DefaultHelpTagHelper.h"
#include <vector>

namespace {

struct TaggedRect {
    LocalizedStrings::HelpTag const *tag;
    Rect rect;
    OS::Help::Placement placement;
    double delay;

    bool Holds(Point p) const {
        return p.v >= rect.top && p.v < rect.bottom && p.h >= rect.left && p.h < rect.right;
    }
};

// From pointing at a part to its tag, in seconds.
constexpr double kDefaultDelay = 0.5;

} // namespace

struct MultiHelpTagHelper::Rep {
    std::vector<TaggedRect> parts;
};

MultiHelpTagHelper::MultiHelpTagHelper()
    : rep(new Rep) {}

MultiHelpTagHelper::~MultiHelpTagHelper() { delete rep; }

bool MultiHelpTagHelper::IsDefaultHelper() const { return false; }

bool MultiHelpTagHelper::GetHelpTag(Point where, LocalizedStrings::HelpTag const *&tag, Rect &rect,
                                    OS::Help::Placement &placement, double &delay) {
    for (TaggedRect const &part : rep->parts) {
        if (!part.Holds(where))
            continue;
        tag = part.tag;
        rect = part.rect;
        placement = part.placement;
        delay = part.delay;
        return true;
    }
    return false;
}

void MultiHelpTagHelper::AddHelpTag(LocalizedStrings::HelpTag const *tag, Rect rect,
                                    OS::Help::Placement placement, double delaySeconds) {
    if (tag)
        rep->parts.push_back({tag, rect, placement, delaySeconds});
}

void MultiHelpTagHelper::ClearHelpTags() { rep->parts.clear(); }

bool DefaultHelpTagHelper::GetHelpTag(Point, LocalizedStrings::HelpTag const *&found, Rect &,
                                      OS::Help::Placement &placement, double &delay) {
    if (!tag)
        return false;
    found = tag;
    placement = OS::Help::kPlacementForParts;
    delay = kDefaultDelay;
    return true;
}
