#include "graphics/GraphPane.h"
#include "frame/ResourceReading.h"
#include "graphics/PixelLine.h"
#include "graphics/WholeNumber.h"
#include "host/NamedColors.h"
#include "host/OSPort.h"
#include "host/PortSavers.h"
#include "host/VelaDrawing.h"
#include "scrolling/Truncation.h"
#include <cmath>
#include <memory>

namespace {

GraphAxisSetting const kUsualAxis = {0, 127, 32, 0, 0};
short const kFrameDepth = -1, kFrameGray = 80;
double const kLineWidth = 2.0;
// Single precision, widened: 128, 133 and 223 of 255.
OS::RGBAColor const kLineColor(0.501960814, 0.521568656, 0.874509811, 1.0);
// More lines than there are pixels are no grid.
long long const kMostLines = 65536;

// Calls the function with each value of the axis that has a grid line and whether it is the first, the third
// and so on. The ends of the axis have none.
template <class Draw> void ForEachGridLine(GraphAxisSetting const &axis, Draw const &draw) {
    long long const interval = axis.gridInterval;
    if (interval < 1 || (static_cast<long long>(axis.dataMaximum) - axis.dataMinimum) / interval > kMostLines)
        return;
    double const below = std::floor(axis.dataMinimum / static_cast<double>(interval));
    bool odd = true;
    for (long long at = static_cast<long long>(below) * interval + interval; at < axis.dataMaximum;
         at += interval) {
        draw(static_cast<int>(at), odd);
        odd = !odd;
    }
}

void SetGridColor(bool odd) {
    VelaDrawing::RGBForeColor(odd ? kDialogListInactiveTextColor : kDialogListTextColor);
}

} // namespace

GraphPane::GraphPane(glogRec *owner, short id, GraphPaneResRec *record)
    : horizontalAxis(kUsualAxis)
    , verticalAxis(kUsualAxis)
    , graphData(nullptr) {
    if (!GlogPaneInit(owner, id) || !record)
        return;
    Rect box = record->bounds;
    SetBox(&box);
}

// By value, as the interface has it. NOLINTBEGIN(performance-unnecessary-value-param)
GraphPane::GraphPane(glogRec *owner, short id, boost::shared_ptr<XMLLib::ContainerItem> item)
    // NOLINTEND(performance-unnecessary-value-param)
    : horizontalAxis(kUsualAxis)
    , verticalAxis(kUsualAxis)
    , graphData(nullptr) {
    if (!GlogPaneInit(owner, id))
        return;
    Rect box = OptionalRect(item, "BoundsRect");
    GlogPane::SetBox(&box);
    TakeColumns();
    TakeRows();
}

GraphPane::~GraphPane() { delete graphData; }

// Data and axes

void GraphPane::SetGraphData(GraphData *data) {
    if (data == graphData)
        return;
    std::unique_ptr<GraphData> const former(graphData);
    graphData = data;
}

void GraphPane::SetBox(Rect *box) {
    GlogPane::SetBox(box);
    TakeColumns();
    TakeRows();
}

void GraphPane::TakeColumns() {
    Rect const r = GraphBounds();
    horizontalAxis.pixelMinimum = r.left;
    horizontalAxis.pixelMaximum = r.right - 1;
}

void GraphPane::TakeRows() {
    Rect const r = GraphBounds();
    verticalAxis.pixelMinimum = r.bottom - 1;
    verticalAxis.pixelMaximum = r.top;
}

void GraphPane::SetupHorizontalAxis(GraphAxisSetting const &setting) {
    horizontalAxis = setting;
    TakeColumns();
}

void GraphPane::SetupVerticalAxis(GraphAxisSetting const &setting) {
    verticalAxis = setting;
    TakeRows();
}

Rect GraphPane::GraphBounds() {
    Rect box;
    GetBox(&box);
    VelaDrawing::InsetRect(&box, 1, 1);
    return box;
}

int GraphPane::GraphLeft() {
    Rect box;
    GetBox(&box);
    return box.left + 1;
}

int GraphPane::GraphRight() {
    Rect box;
    GetBox(&box);
    return box.right - 2;
}

// The division comes first in both.

int GraphPane::DataToCoord(GraphAxisSetting const &axis, int value) {
    double const pixels = static_cast<double>(axis.pixelMaximum) - axis.pixelMinimum;
    double const range = static_cast<double>(axis.dataMaximum) - axis.dataMinimum;
    return WholeNumber(pixels / range * (static_cast<double>(value) - axis.dataMinimum) + axis.pixelMinimum);
}

int GraphPane::CoordToData(GraphAxisSetting const &axis, int pixel) {
    double const pixels = static_cast<double>(axis.pixelMaximum) - axis.pixelMinimum;
    double const range = static_cast<double>(axis.dataMaximum) - axis.dataMinimum;
    return WholeNumber(range / pixels * (static_cast<double>(pixel) - axis.pixelMinimum) + axis.dataMinimum);
}

void GraphPane::GraphDataPointToCoords(GraphDataPoint const &point, int &h, int &v) const {
    h = DataToCoord(horizontalAxis, point.horizontal);
    v = DataToCoord(verticalAxis, point.vertical);
}

GraphDataPoint GraphPane::CoordsToGraphDataPoint(int h, int v) const {
    return {CoordToData(horizontalAxis, h), CoordToData(verticalAxis, v)};
}

// Drawing

void GraphPane::DrawGuts(OSRgn *region) {
    Rect box;
    GetBox(&box);
    VelaDrawing::PenNormal();
    Frame3DRect(&box, kFrameDepth, kFrameGray);
    DrawBackground();
    DrawGridLines();
    DrawData(region);
    ClearColors();
}

void GraphPane::DrawBackground() {
    Rect const ground = GraphBounds();
    VelaDrawing::RGBForeColor(kDialogListBackgroundColor);
    VelaDrawing::PaintRect(&ground);
}

void GraphPane::DrawGridLines() {
    Rect const r = GraphBounds();
    VelaDrawing::PenNormal();
    ForEachGridLine(horizontalAxis, [&](int value, bool odd) {
        short const h = Pixel16(DataToCoord(horizontalAxis, value));
        SetGridColor(odd);
        VelaDrawing::MoveTo(h, r.top);
        VelaDrawing::LineTo(h, static_cast<short>(r.bottom - 1));
    });
    ForEachGridLine(verticalAxis, [&](int value, bool odd) {
        short const v = Pixel16(DataToCoord(verticalAxis, value));
        SetGridColor(odd);
        VelaDrawing::MoveTo(r.left, v);
        VelaDrawing::LineTo(static_cast<short>(r.right - 1), v);
    });
}

// Whoever is asked for a point, and a mark, may change the data.
template <class Action> void GraphPane::ForEachPoint(Action const &action) {
    for (int i = 0; graphData && i < graphData->CountPoints(); ++i) {
        int h = 0, v = 0;
        GraphDataPointToCoords(graphData->GetPoint(i), h, v);
        action(i, h, v);
    }
}

void GraphPane::DrawData(OSRgn *) {
    if (!graphData)
        return;
    Rect const ground = GraphBounds();
    VelaDrawing::ClipRect(&ground);
    VelaDrawing::PenNormal();
    if (graphData->CountPoints() < 1)
        return;
    DrawLineThroughPoints();
    VelaDrawing::RGBForeColor(kDialogListTextColor);
    ForEachPoint([this](int index, int h, int v) { DrawDataPoint(index, h, v); });
}

void GraphPane::DrawLineThroughPoints() {
    OSPort *const port = OSPort::GetCurrent();
    port->SetLineWidth(kLineWidth);
    port->SetForeColor(kLineColor);
    PixelLine line;
    ForEachPoint([&line](int, int h, int v) { line.Add(h, v); });
    line.Stroke(*port);
}

void GraphPane::DrawDataPoint(int, int, int) {}
