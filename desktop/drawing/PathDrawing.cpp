#include "desktop/drawing/PathDrawing.h"
#include "desktop/drawing/OSPathRep.h"
#include "desktop/drawing/WholePixels.h"
#include "desktop/observe/DrawingTrace.h"
#include <algorithm>
#include <cairo.h>
#include <limits>
#include <string>

namespace {

constexpr double kPi = 3.14159265358979323846;
constexpr double kQuarter = kPi / 2;

// Part of an ellipse, clockwise from one angle to the other; joined to the path so far by a line.
void AppendArc(cairo_t *context, double centreH, double centreV, double radiusH, double radiusV, double from,
               double to) {
    cairo_matrix_t before;
    cairo_get_matrix(context, &before);
    cairo_translate(context, centreH, centreV);
    cairo_scale(context, radiusH, radiusV);
    cairo_arc(context, 0, 0, 1, from, to);
    cairo_set_matrix(context, &before);
}

} // namespace

void PathDrawing::Append(cairo_t *context, OSPath const &path) {
    for (PathAccess::Rep::Step const &step : PathAccess::Of(path).steps) {
        switch (step.verb) {
        case PathAccess::Rep::Verb::kBegin:
            cairo_move_to(context, step.h, step.v);
            break;
        case PathAccess::Rep::Verb::kLine:
            cairo_line_to(context, step.h, step.v);
            break;
        case PathAccess::Rep::Verb::kClose:
            cairo_close_path(context);
            break;
        }
    }
}

void PathDrawing::AppendRoundRect(cairo_t *context, DeviceRect const &r, double radiusH, double radiusV) {
    if (r.Empty())
        return;
    radiusH = std::min(radiusH, r.Width() / 2.0);
    radiusV = std::min(radiusV, r.Height() / 2.0);
    if (!(radiusH > 0) || !(radiusV > 0)) { // Cairo refuses an arc without extent
        cairo_rectangle(context, r.left, r.top, r.Width(), r.Height());
        return;
    }
    cairo_new_sub_path(context);
    AppendArc(context, r.left + radiusH, r.top + radiusV, radiusH, radiusV, -2 * kQuarter, -kQuarter);
    AppendArc(context, r.right - radiusH, r.top + radiusV, radiusH, radiusV, -kQuarter, 0);
    AppendArc(context, r.right - radiusH, r.bottom - radiusV, radiusH, radiusV, 0, kQuarter);
    AppendArc(context, r.left + radiusH, r.bottom - radiusV, radiusH, radiusV, kQuarter, 2 * kQuarter);
    cairo_close_path(context);
}

void PathDrawing::AppendOval(cairo_t *context, double left, double top, double width, double height) {
    if (!(width > 0) || !(height > 0))
        return;
    cairo_new_sub_path(context);
    AppendArc(context, left + width / 2, top + height / 2, width / 2, height / 2, 0, 4 * kQuarter);
    cairo_close_path(context);
}

Rect PathDrawing::Bounds(OSPath const &path, double margin) {
    double left = std::numeric_limits<double>::max(), top = left, right = -left, bottom = -left;
    for (PathAccess::Rep::Step const &step : PathAccess::Of(path).steps) {
        if (step.verb == PathAccess::Rep::Verb::kClose)
            continue;
        left = std::min(left, step.h);
        right = std::max(right, step.h);
        top = std::min(top, step.v);
        bottom = std::max(bottom, step.v);
    }
    if (left > right)
        return {0, 0, 0, 0};
    return WholeRect({left - margin, top - margin, right - left + 2 * margin, bottom - top + 2 * margin});
}

JsonLine PathDrawing::Described(char const *operation, OSPath const &path) {
    std::string json = "[";
    for (PathAccess::Rep::Step const &step : PathAccess::Of(path).steps) {
        bool begins = step.verb == PathAccess::Rep::Verb::kBegin;
        if (begins)
            json += json.size() > 1 ? "],[" : "[";
        else
            json += ',';
        if (step.verb == PathAccess::Rep::Verb::kClose)
            json += "\"close\"";
        else
            json += '[' + JsonLine::Shortest(step.h) + ',' + JsonLine::Shortest(step.v) + ']';
    }
    json += json.size() > 1 ? "]]" : "]";
    return DrawingTrace::Call(operation).Raw("path", json);
}
