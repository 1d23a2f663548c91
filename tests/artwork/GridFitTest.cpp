#include "artwork/compiler/GridFit.h"
#include <cmath>
#include <gtest/gtest.h>
#include <string>

namespace {

// One element in a group of an icon of 20 x 20 logical pixels, fitted to a number of device pixels.
class Fitted {
public:
    Fitted(char const *element, int devicePixels) {
        document.load_string((std::string("<g>") + element + "</g>").c_str());
        GridFit(20, 20, devicePixels, devicePixels, 20).Fit(document.first_child());
        scale = devicePixels / 20.0;
    }
    // In device pixels.
    double operator[](char const *attribute) const {
        return document.first_child().first_child().attribute(attribute).as_double() * scale;
    }
    std::string Name() const { return document.first_child().first_child().name(); }

private:
    pugi::xml_document document;
    double scale;
};

constexpr double kExact = 1e-6;

} // namespace

TEST(GridFit, LeavesEverythingAtAWholeScale) {
    Fitted const rect("<rect x=\"0.3\" y=\"1\" width=\"4.4\" height=\"2\"/>", 40);
    EXPECT_NEAR(0.6, rect["x"], kExact);
    EXPECT_NEAR(8.8, rect["width"], kExact);
}

TEST(GridFit, PutsTheEdgesOfARectangleOnDevicePixels) {
    Fitted const rect("<rect x=\"3\" y=\"3\" width=\"6\" height=\"12\"/>", 25);
    EXPECT_NEAR(4, rect["x"], kExact);
    EXPECT_NEAR(7, rect["width"], kExact);
}

TEST(GridFit, KeepsAnOutlineOfOnePixelOnePixelWide) {
    Fitted const rect("<rect x=\"0.5\" y=\"0.5\" width=\"19\" height=\"19\" class=\"stroke-ink\"/>", 30);
    EXPECT_NEAR(0.5, rect["x"], kExact);
    EXPECT_NEAR(29, rect["width"], kExact);
    EXPECT_NEAR(1, rect["stroke-width"], kExact);
}

TEST(GridFit, PutsAnInnerLineRightBesideTheOutline) {
    Fitted const rect("<rect x=\"1.5\" y=\"1.5\" width=\"17\" height=\"17\" stroke=\"url(#light)\"/>", 30);
    EXPECT_NEAR(1.5, rect["x"], kExact);
    EXPECT_NEAR(27, rect["width"], kExact);
}

TEST(GridFit, GivesThinShapesOneThicknessWhereverTheyStand) {
    for (int x = 0; x < 20; ++x) {
        std::string const element =
            "<rect x=\"" + std::to_string(x) + "\" y=\"0\" width=\"1\" height=\"20\"/>";
        EXPECT_NEAR(1, Fitted(element.c_str(), 30)["width"], kExact) << "at " << x;
    }
}

TEST(GridFit, KeepsMirroredShapesMirrored) {
    for (int x = 0; x < 9; ++x) {
        Fitted const left(("<rect x=\"" + std::to_string(x) + "\" width=\"1\" height=\"20\"/>").c_str(), 25);
        Fitted const right(("<rect x=\"" + std::to_string(19 - x) + "\" width=\"1\" height=\"20\"/>").c_str(),
                           25);
        EXPECT_NEAR(left["x"], 25 - right["x"] - right["width"], kExact) << "at " << x;
    }
}

TEST(GridFit, KeepsTheLastRowOfAnIconCovered) {
    Fitted const line("<rect x=\"0\" y=\"19\" width=\"20\" height=\"1\"/>", 29);
    EXPECT_NEAR(29, line["y"] + line["height"], kExact);
}

TEST(GridFit, PutsAnUprightLineOnDevicePixels) {
    Fitted const line("<line x1=\"3.5\" x2=\"3.5\" y1=\"0\" y2=\"20\" stroke=\"black\"/>", 30);
    EXPECT_NEAR(4.5, line["x1"], kExact);
    EXPECT_NEAR(4.5, line["x2"], kExact);
    EXPECT_NEAR(1, line["stroke-width"], kExact);
}

TEST(GridFit, LeavesASlantedLine) {
    Fitted const line("<line x1=\"3.3\" x2=\"9\" y1=\"0\" y2=\"20\" stroke=\"black\"/>", 30);
    EXPECT_NEAR(4.95, line["x1"], kExact);
}

TEST(GridFit, FitsACircleIntoWholePixels) {
    Fitted const circle("<circle cx=\"10\" cy=\"10\" r=\"4\"/>", 25);
    EXPECT_EQ("ellipse", circle.Name());
    EXPECT_NEAR(12.5, circle["cx"], kExact);
    EXPECT_NEAR(0, std::fmod(circle["cx"] - circle["rx"], 1), kExact);
}

TEST(GridFit, LeavesTurnedElementsAndThoseThatAskForIt) {
    EXPECT_NEAR(4.95, Fitted("<rect x=\"3.3\" width=\"5\" height=\"5\" transform=\"rotate(9)\"/>", 30)["x"],
                kExact);
    EXPECT_NEAR(4.95, Fitted("<rect x=\"3.3\" width=\"5\" height=\"5\" data-fit=\"no\"/>", 30)["x"], kExact);
}

// A pane of twelve pixels at a scale of 1.5 shows eighteen rows, whether the icon has nineteen or twenty.
TEST(GridFit, EndsTheBodyOnOneRowHoweverTheShadowBelowItRounds) {
    for (int const rows : {19, 20}) {
        pugi::xml_document document;
        document.load_string("<g><rect x=\"0.5\" y=\"0.5\" width=\"11\" height=\"11\" stroke=\"black\"/>"
                             "<rect x=\"0\" y=\"1\" width=\"12\" height=\"12\"/></g>");
        GridFit(12, 13, 18, rows, 12).Fit(document.first_child());
        pugi::xml_node const body = document.first_child().first_child(), shadow = body.next_sibling();
        auto const end = [rows](pugi::xml_node rect) {
            return (rect.attribute("y").as_double() + rect.attribute("height").as_double() +
                    rect.attribute("stroke-width").as_double() / 2) *
                   rows / 13;
        };
        EXPECT_NEAR(18, end(body), 0.1) << rows; // the outline's width is that of the other axis
        EXPECT_NEAR(rows, end(shadow), kExact) << rows;
    }
}
