// Points joined by a line, on a ground with frame and grid.
//
// It takes no clicks; a subclass that lets points be dragged finds its way between mouse and data by
// GraphDataPointToCoords and CoordsToGraphDataPoint, and may mark points by DrawDataPoint.
#pragma once
#include "graphics/GraphAxisSetting.h"
#include "graphics/GraphData.h"
#include "graphics/GraphPaneResRec.h"
#include "host/GlogPane.h"
#include "host/XMLLib.h"
#include <boost/shared_ptr.hpp>

class GraphPane : public GlogPane {
public:
    // Attach the pane to the glog under the number; the glog owns it. The record may be null: the box is
    // empty then. The item has it under "BoundsRect", all zero when absent. Both axes run from 0 to 127 with
    // a line every 32.
    GraphPane(glogRec *, short id, GraphPaneResRec *);
    GraphPane(glogRec *, short id, boost::shared_ptr<XMLLib::ContainerItem>);
    GraphPane(GraphPane const &) = delete;
    GraphPane &operator=(GraphPane const &) = delete;
    ~GraphPane() override;

    // The points; owned from now on, and those before are deleted unless they are the same. Null: none. Only
    // stores.
    void SetGraphData(GraphData *);
    GraphData *GetGraphData() const { return graphData; } // or null

    // The ends of an axis in the data, and its grid. The pixels of the argument do not count: they are always
    // those of the box. Only store.
    void SetupHorizontalAxis(GraphAxisSetting const &);
    void SetupVerticalAxis(GraphAxisSetting const &); // its lower end is at the bottom

    Rect GraphBounds(); // the box without its frame
    int GraphLeft();    // the first column within the frame
    int GraphRight();   // the last

    // Where a value lies along the axis, and what value lies at the pixel; whole numbers, fractions left out.
    // What cannot be told, as on an axis without length, gives the smallest int.
    static int DataToCoord(GraphAxisSetting const &, int value);
    static int CoordToData(GraphAxisSetting const &, int pixel); // the other way round
    // Both for a point, in the pane's coordinates.
    void GraphDataPointToCoords(GraphDataPoint const &, int &h, int &v) const;
    GraphDataPoint CoordsToGraphDataPoint(int h, int v) const; // the other way round

    // Overridden operations of panes.
    void SetBox(Rect *) override; // with the axes

    // Draws a mark at a point, over the line, in the colour kDialogListTextColor; here nothing. The index
    // counts from 0.
    virtual void DrawDataPoint(int index, int h, int v);

protected:
    // Leaves the clip narrowed to the ground.
    void DrawGuts(OSRgn *updateRegion) override;
    void DrawBackground();  // the ground
    void DrawGridLines();   // of both axes, without the ends
    void DrawData(OSRgn *); // the line and the marks

private:
    void TakeColumns();
    void TakeRows();
    void DrawLineThroughPoints();
    // Calls the action with the index of each point and where it lies.
    template <class Action> void ForEachPoint(Action const &);

    GraphAxisSetting horizontalAxis, verticalAxis;
    GraphData *graphData; // owned, or null
};
