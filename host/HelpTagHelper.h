#pragma once
#include "host/Geometry.h"
#include "host/LocalizedStrings.h"

class HelpTagHelper {
public:
    virtual ~HelpTagHelper() {}
    virtual bool IsDefaultHelper() const = 0;

    virtual bool GetHelpTag(Point, LocalizedStrings::HelpTag const *&, Rect &, OS::Help::Placement &, double &) = 0;
};

class MultiHelpTagHelper : public HelpTagHelper {
public:
    MultiHelpTagHelper();
    virtual ~MultiHelpTagHelper();
    virtual bool IsDefaultHelper() const;
    virtual bool GetHelpTag(Point, LocalizedStrings::HelpTag const *&, Rect &, OS::Help::Placement &, double &);

    void AddHelpTag(LocalizedStrings::HelpTag const *, Rect, OS::Help::Placement, double delaySeconds);
    void ClearHelpTags();
private:
    struct Rep;
    Rep *rep;
};
