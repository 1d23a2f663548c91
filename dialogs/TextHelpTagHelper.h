// The help of a pane whose text stands in the dialog itself.
#pragma once
#include "host/HelpTagHelper.h"
#include "host/UString.h"
#include <memory>

// One tag for the whole pane, which this object owns.
class TextHelpTagHelper : public HelpTagHelper {
public:
    explicit TextHelpTagHelper(UString const &text);
    ~TextHelpTagHelper() override;

    bool IsDefaultHelper() const override { return true; }
    // Finds the tag at any point. Rectangle, placement and delay stay as the caller has them.
    bool GetHelpTag(Point, LocalizedStrings::HelpTag const *&, Rect &, OS::Help::Placement &,
                    double &) override;

private:
    std::unique_ptr<LocalizedStrings::HelpTag const> tag;
};
