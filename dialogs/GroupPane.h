// A container that places its panes one below the other, side by side, or where they say.
//
// It takes no clicks of its own; its panes do.
#pragma once
#include "host/CompoundPane.h"

class GroupPane : public CompoundPane {
public:
    // Downward, to the right, or each at its own place.
    enum Arrangement { kDownward, kRightward, kFree };
    // What is drawn behind the panes: nothing, or a plate with rounded corners.
    enum Style { kPlain, kPanel };

    // Makes a group and attaches it to the glog, which owns it from then on; null when memory or glog is
    // wanting. The box is empty until it is set, or the layout that the group lies in sets it.
    static GroupPane *NewGroupPane(glogRec *, Style);

    // At first kDownward.
    void SetArrangement(Arrangement);
    // Pixels between the panes, and between the edges and the panes; at first 0, and without effect for
    // kFree.
    void SetSpacing(int);
    void SetInsets(int top, int left, int bottom, int right);

protected:
    explicit GroupPane(Style);
    void DrawBackgroundGuts(OSRgn *) override;

private:
    void SetLength(GlogLayoutItem::Attribute, int pixels);

    Style style;
};
