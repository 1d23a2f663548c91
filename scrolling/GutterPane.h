// A strip along the right or the bottom of its container.
//
// It holds what lies there, such as a scroll bar, and takes neither clicks nor keys itself.
#pragma once
#include "host/CompoundPane.h"

// Moves along with its container's edge and is as long as that.
class GutterPane : public CompoundPane {
public:
    // Along the bottom, growing in width, or along the right side, growing in height.
    enum GutterType { kBottomGutter = 0, kRightGutter = 1 };

    // An empty box under the number 0. A null glog leaves the pane unattached.
    GutterPane(glogRec *, GutterType);

    // Takes the size that the layout of its parts has, and the place that it belongs to.
    void InitializeBounds();
    GutterType GetGutterType() const { return gutterType; } // as it was made
    // The size of the container's box in pixels; 0 without a container.
    int GetContainerHeight();
    int GetContainerWidth();

    // Overridden operations of panes. SetBox keeps the strip as long as its container, whatever the rectangle
    // says.
    void ContainmentChanged() override;
    void Resize(Point delta) override;
    void SetBox(Rect *) override;

private:
    // The strip has another length, and its box already has it.
    virtual void GutterLengthChanged(int gutterType) = 0;
    // How many pixels to keep from the container's right or bottom edge: 0.
    virtual int GetPaneRightEdgeOffset();
    virtual int GetPaneBottomEdgeOffset();

    GutterType gutterType;
};
