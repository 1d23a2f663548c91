// A graph whose points are dragged with the mouse: the volume of a note over its time.
#pragma once
#include "graphics/GraphPane.h"

class GlogStyleSheet;

class EnvelopePane : public GraphPane {
public:
    // From "BoundsRect" and "TextID", the number of a label that shows the point that is dragged. Null when
    // memory or glog is wanting.
    static EnvelopePane *NewEnvelopePane(glogRec *, GlogStyleSheet *);

    // Overridden operations of graphs.
    void DrawDataPoint(int index, int h, int v) override;

protected:
    int HandleClick(EventRecordAdapter *) override; // -1 after a drag, else 0

private:
    class Envelope;
    EnvelopePane(glogRec *, GlogStyleSheet *);
    int PointAt(Point) const; // its index, or -1
    void Drag(int index);
    void MoveTo(int index, GraphDataPoint);
    void ShowPoint(int index);

    Envelope *envelope; // the graph's data
    int labelID;
    int dragged = -1; // the point under the mouse, or -1
};
