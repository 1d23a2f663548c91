#include "graphics/GLine.h"
#include "host/NamedColors.h"
#include "host/PortSavers.h"
#include "host/VelaDrawing.h"
#include <algorithm>

void DrawGLine(Point a, Point b) {
    SaveColors const colors;
    VelaDrawing::PenNormal();
    VelaDrawing::RGBForeColor(kPanelUnderline);
    auto const [left, right] = std::minmax(a.h, b.h);
    auto const [top, bottom] = std::minmax(a.v, b.v);
    if (left != right) {
        short const row = static_cast<short>(top + 1);
        VelaDrawing::MoveTo(left, row);
        VelaDrawing::LineTo(right, row);
    } else {
        short const column = static_cast<short>(left + 1);
        VelaDrawing::MoveTo(column, top);
        VelaDrawing::LineTo(column, bottom);
    }
}

void SimpleGLineTo(short h, short v) {
    Point pen;
    VelaDrawing::GetPen(&pen);
    DrawGLine(pen, {v, h});
}
