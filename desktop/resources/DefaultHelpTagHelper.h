// The help of a pane that has one tag for all of it.
#pragma once
#include "host/HelpTagHelper.h"

// GetHelpTag finds the tag at any point and leaves the rectangle as it is, which the caller has set to the
// pane's box. A null tag is never found. The tag is not owned.
class DefaultHelpTagHelper : public HelpTagHelper {
public:
    explicit DefaultHelpTagHelper(LocalizedStrings::HelpTag const *tag_)
        : tag(tag_) {}
    virtual bool IsDefaultHelper() const { return true; }
    virtual bool GetHelpTag(Point, LocalizedStrings::HelpTag const *&, Rect &, OS::Help::Placement &,
                            double &);

private:
    LocalizedStrings::HelpTag const *tag;
};
