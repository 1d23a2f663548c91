#pragma once
#include <pugixml.hpp>

// Moves the straight edges of an icon onto whole device pixels, so that it stays sharp at scales such as 1.25
// and 1.5. Rectangles, circles and level or upright lines are fitted, with the width of their outlines;
// curves, slanted lines, turned elements, what stands in inner groups and whatever carries data-fit="no" stay
// as drawn. Distances from the right and bottom edge round as those from the left and top, so that what is
// drawn symmetrical stays so; below its body an icon may have a shadow, and then the bottom edge is the
// body's.
class GridFit {
public:
    // Sizes of the icon in logical and in device pixels, and the height of its body in logical ones.
    GridFit(int width, int height, int deviceWidth, int deviceHeight, int bodyHeight);

    // Changes the geometry attributes of the group's elements; a no-op when the scale is a whole number.
    void Fit(pugi::xml_node group) const;

private:
    // One axis of the icon.
    struct Axis {
        double length;
        double deviceLength;
        double body; // length without the shadow

        double Scale() const { return deviceLength / length; }
        bool IsWhole() const;
        double Snap(double position) const;     // logical to a whole device position
        double Thickness(double logical) const; // whole device pixels of a line, at least 1
        double ToLogical(double device) const { return device / Scale(); }
    };
    // Both edges of something on one axis, logical pixels.
    struct Span {
        double start;
        double end;
    };

    void FitElement(pugi::xml_node) const;
    void FitRectangle(pugi::xml_node) const;
    void FitCircle(pugi::xml_node) const;
    void FitLine(pugi::xml_node) const;
    // The outline's width after fitting, device pixels; 0 without outline.
    double DeviceStroke(double stroke) const;
    // The span within an outline of the given widths whose outer edges lie on device pixels.
    static Span FitSpan(Axis const &, Span, double stroke, double deviceStroke);

    Axis horizontal;
    Axis vertical;
};
