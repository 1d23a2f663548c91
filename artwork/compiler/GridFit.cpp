#include "artwork/compiler/GridFit.h"
#include <algorithm>
#include <cmath>
#include <string>

namespace {

// A shape no thicker than this is a line to the eye: its thickness must not depend on where it stands.
constexpr double kThinShape = 2.0;
// Edges round up late, at three quarters of a device pixel: a thin border reads better than a heavy one, and
// the lines within it follow without a gap.
constexpr double kRounding = 0.25;

bool HasStroke(pugi::xml_node node) {
    std::string const classes = std::string(" ") + node.attribute("class").value();
    std::string const stroke = node.attribute("stroke").value();
    return classes.find(" stroke-") != std::string::npos || (!stroke.empty() && stroke != "none");
}

double StrokeWidth(pugi::xml_node node) {
    return HasStroke(node) ? node.attribute("stroke-width").as_double(1) : 0;
}

void Set(pugi::xml_node node, char const *name, double value) {
    pugi::xml_attribute attribute = node.attribute(name);
    if (!attribute)
        attribute = node.append_attribute(name);
    attribute.set_value(value);
}

double Get(pugi::xml_node node, char const *name) { return node.attribute(name).as_double(); }

} // namespace

GridFit::GridFit(int width, int height, int deviceWidth, int deviceHeight, int bodyHeight)
    : horizontal{double(width), double(deviceWidth), double(width)}
    , vertical{double(height), double(deviceHeight), double(bodyHeight)} {}

bool GridFit::Axis::IsWhole() const { return std::fmod(deviceLength, length) == 0; }

double GridFit::Axis::Snap(double position) const {
    double const device = position * Scale(), deviceBody = std::round(body * Scale());
    if (position > body)
        return std::round(device);
    return position > body / 2 ? deviceBody - std::floor((body - position) * Scale() + kRounding)
                               : std::floor(device + kRounding);
}

double GridFit::Axis::Thickness(double logical) const {
    return std::max(1.0, std::floor(logical * Scale() + kRounding));
}

void GridFit::Fit(pugi::xml_node group) const {
    if (horizontal.IsWhole() && vertical.IsWhole())
        return;
    for (pugi::xml_node node = group.first_child(); node; node = node.next_sibling())
        if (!node.attribute("transform") && std::string(node.attribute("data-fit").value()) != "no")
            FitElement(node);
}

void GridFit::FitElement(pugi::xml_node node) const {
    std::string const name = node.name();
    if (name == "rect")
        FitRectangle(node);
    else if (name == "circle")
        FitCircle(node);
    else if (name == "line")
        FitLine(node);
}

void GridFit::FitRectangle(pugi::xml_node node) const {
    double const stroke = StrokeWidth(node);
    double const deviceStroke = DeviceStroke(stroke);
    Span const across =
        FitSpan(horizontal, {Get(node, "x"), Get(node, "x") + Get(node, "width")}, stroke, deviceStroke);
    Span const down =
        FitSpan(vertical, {Get(node, "y"), Get(node, "y") + Get(node, "height")}, stroke, deviceStroke);
    Set(node, "x", across.start);
    Set(node, "width", across.end - across.start);
    Set(node, "y", down.start);
    Set(node, "height", down.end - down.start);
    if (stroke > 0)
        Set(node, "stroke-width", deviceStroke / std::min(horizontal.Scale(), vertical.Scale()));
}

void GridFit::FitCircle(pugi::xml_node node) const {
    double const stroke = StrokeWidth(node);
    double const deviceStroke = DeviceStroke(stroke);
    double const r = Get(node, "r");
    Span const across = FitSpan(horizontal, {Get(node, "cx") - r, Get(node, "cx") + r}, stroke, deviceStroke);
    Span const down = FitSpan(vertical, {Get(node, "cy") - r, Get(node, "cy") + r}, stroke, deviceStroke);
    node.set_name("ellipse");
    node.remove_attribute("r");
    Set(node, "cx", (across.start + across.end) / 2);
    Set(node, "cy", (down.start + down.end) / 2);
    Set(node, "rx", (across.end - across.start) / 2);
    Set(node, "ry", (down.end - down.start) / 2);
    if (stroke > 0)
        Set(node, "stroke-width", deviceStroke / std::min(horizontal.Scale(), vertical.Scale()));
}

void GridFit::FitLine(pugi::xml_node node) const {
    double const stroke = StrokeWidth(node);
    bool const level = Get(node, "y1") == Get(node, "y2");
    bool const upright = Get(node, "x1") == Get(node, "x2");
    if (level == upright || stroke <= 0)
        return;
    Axis const &along = level ? horizontal : vertical;
    Axis const &across = level ? vertical : horizontal;
    char const *const start = level ? "x1" : "y1";
    char const *const end = level ? "x2" : "y2";
    char const *const first = level ? "y1" : "x1";
    char const *const second = level ? "y2" : "x2";
    double const middle = Get(node, first);
    Span const band = FitSpan(across, {middle - stroke / 2, middle + stroke / 2}, 0, 0);
    Set(node, first, (band.start + band.end) / 2);
    Set(node, second, (band.start + band.end) / 2);
    Set(node, start, along.ToLogical(along.Snap(Get(node, start))));
    Set(node, end, along.ToLogical(along.Snap(Get(node, end))));
    Set(node, "stroke-width", band.end - band.start);
}

double GridFit::DeviceStroke(double stroke) const {
    return stroke > 0 ? std::min(horizontal.Thickness(stroke), vertical.Thickness(stroke)) : 0;
}

GridFit::Span GridFit::FitSpan(Axis const &axis, Span span, double stroke, double deviceStroke) {
    double const outerStart = span.start - stroke / 2;
    double const outerEnd = span.end + stroke / 2;
    double start = axis.Snap(outerStart);
    double end = axis.Snap(outerEnd);
    if (stroke == 0 && outerEnd - outerStart <= kThinShape) {
        // Keep the edge that is nearer to the icon's border, where a gap would show.
        double const thickness = axis.Thickness(outerEnd - outerStart);
        if (outerStart + outerEnd > axis.length)
            start = end - thickness;
        else
            end = start + thickness;
    }
    return {axis.ToLogical(start + deviceStroke / 2), axis.ToLogical(end - deviceStroke / 2)};
}
