// Finds the help tag for a place in a pane.
#pragma once
#include "host/Geometry.h"
#include "host/LocalizedStrings.h"

// Belongs to one pane, given to it by GlogPane::SetHelpTagHelper.
class HelpTagHelper {
public:
    virtual ~HelpTagHelper() {}

    // Whether GlogPane::SetHelpTag installed this helper, for one tag on the whole pane. Such a helper may be
    // replaced by one that knows parts.
    virtual bool IsDefaultHelper() const = 0;
    // Looks up the tag for the point, in pane coordinates. When there is one, answers true and writes the
    // tag, its placement, the delay in seconds before it appears, and the rectangle for which it holds; a
    // default helper leaves the rectangle alone. Without a tag nothing is written.
    virtual bool GetHelpTag(Point, LocalizedStrings::HelpTag const *&, Rect &, OS::Help::Placement &,
                            double &) = 0;
};

// A tag for each of several rectangles.
class MultiHelpTagHelper : public HelpTagHelper {
public:
    MultiHelpTagHelper(); // without tags
    virtual ~MultiHelpTagHelper();
    virtual bool IsDefaultHelper() const; // false
    virtual bool GetHelpTag(Point, LocalizedStrings::HelpTag const *&, Rect &, OS::Help::Placement &,
                            double &);

    // Adds a rectangle in pane coordinates. Where rectangles overlap, the one added first counts. The tag
    // stays the host's; one that is null is not added.
    void AddHelpTag(LocalizedStrings::HelpTag const *, Rect, OS::Help::Placement, double delaySeconds);
    void ClearHelpTags();

private:
    struct Rep;
    Rep *rep;
};
