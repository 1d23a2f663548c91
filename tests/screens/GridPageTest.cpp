// What scrolling the gallery's thousand rows draws.
#include "desktop/SimulatedDesktop.h"
#include "desktop/drawing/Surface.h"
#include "desktop/panes/Glog.h"
#include "desktop/panes/PaneAccess.h"
#include "host/glogRec.h"
#include "scrolling/ScrollBarPane.h"
#include "tests/screens/GalleryPages.h"
#include "tools/gallery/Gallery.h"
#include <algorithm>
#include <cstdint>
#include <gtest/gtest.h>
#include <string>
#include <vector>

namespace {

typedef std::vector<std::string> Lines;

// What stands under the key in a line of the record, without quotes; empty when the line has no such key.
std::string ValueIn(std::string const &line, std::string const &key) {
    std::string const start = '"' + key + "\":";
    std::size_t const at = line.find(start);
    if (at == std::string::npos)
        return std::string();
    std::size_t const from = at + start.size();
    if (line[from] == '"')
        return line.substr(from + 1, line.find('"', from + 1) - from - 1);
    return line.substr(from, line.find_first_of(",}", from) - from);
}

class GridPage : public testing::Test {
protected:
    GridPage()
        : desktop(DesktopOptions().Scale(1))
        , gallery(desktop, GalleryFiles(), 1) {
        gallery.ShowPage(GalleryFiles().Find("grid"));
        desktop.Play("wait 1\n");
        desktop.TakeDrawing();
    }

    // Of the rows.
    ScrollBarPane &Bar() const { return dynamic_cast<ScrollBarPane &>(*GetGlogItem(gallery.Window(), 998)); }

    // The drawing calls that the steps lead to.
    Lines DrawingOf(std::string const &steps) {
        desktop.Play(steps + "wait 1\n");
        return desktop.TakeDrawing();
    }

    // The texts among the calls, in their order.
    static Lines TextsIn(Lines const &drawing) {
        Lines texts;
        for (std::string const &line : drawing) {
            std::string const text = ValueIn(line, "text");
            if (!text.empty())
                texts.push_back(text);
        }
        return texts;
    }

    // How far and which way pixels were moved, move by move.
    static Lines MovesIn(Lines const &drawing, std::string const &direction) {
        Lines moves;
        for (std::string const &line : drawing) {
            if (ValueIn(line, "op") == "ScrollRect")
                moves.push_back(ValueIn(line, direction));
        }
        return moves;
    }

    SimulatedDesktop desktop;
    Gallery gallery;
};

TEST_F(GridPage, AStepDownDrawsOnlyTheRowThatComesIntoView) {
    EXPECT_EQ(TextsIn(DrawingOf("wheel 500 300 0 -1\n")), (Lines{"18", "Guitar 18"}));
}

TEST_F(GridPage, AStepDownMovesTheNumbersAndTheRowsAlike) {
    EXPECT_EQ(MovesIn(DrawingOf("wheel 500 300 0 -1\n"), "dv"), (Lines{"-2", "-2"}));
}

TEST_F(GridPage, AStepAtTheEndDrawsNoRow) {
    DrawingOf("wheel 500 300 0 1000\n");
    Lines const drawing = DrawingOf("wheel 500 300 0 1\n");
    EXPECT_EQ(TextsIn(drawing), Lines());
    EXPECT_EQ(MovesIn(drawing, "dv"), Lines());
}

TEST_F(GridPage, AStepAcrossMovesTheRowsAloneAndDrawsNoText) {
    Lines const drawing = DrawingOf("wheel 500 300 -1 0\n");
    EXPECT_EQ(MovesIn(drawing, "dh"), Lines{"-2"});
    EXPECT_EQ(TextsIn(drawing), Lines());
}

TEST_F(GridPage, AJumpDrawsEachRowInViewOnce) {
    Lines texts = TextsIn(DrawingOf("wheel 500 300 0 -600\n")); // 1200 pixels, 50 rows
    EXPECT_EQ(std::count(texts.begin(), texts.end(), "50"), 0);
    EXPECT_EQ(std::count(texts.begin(), texts.end(), "51"), 1);
    EXPECT_EQ(std::count(texts.begin(), texts.end(), "Drums 57"), 1);
    EXPECT_EQ(std::count(texts.begin(), texts.end(), "68"), 1);
    EXPECT_EQ(std::count(texts.begin(), texts.end(), "69"), 0);
    EXPECT_EQ(std::count(texts.begin(), texts.end(), "Guitar 67"), 1);
}

TEST_F(GridPage, AClickOnARowDrawsItAndTheOneThatWasChosenBefore) {
    Lines const texts = TextsIn(DrawingOf("click 600 333\n"));
    EXPECT_EQ(std::count(texts.begin(), texts.end(), "Drums 1"), 1);
    EXPECT_EQ(std::count(texts.begin(), texts.end(), "Percussion 9"), 1);
    EXPECT_EQ(std::count(texts.begin(), texts.end(), "Percussion 9, row 9 of 1,000"), 1);
    EXPECT_EQ(std::count(texts.begin(), texts.end(), "Percussion 2"), 0);
}

TEST_F(GridPage, EveryLineOfItsRowsIsRedrawnAsTheWholeIs) {
    desktop.Play("wheel 500 300 -5 -7\nwait 1\n");
    Rect const list = PaneAccess::VisiblePart(*GetGlogItem(gallery.Window(), 10));
    Glog &glog = Glog::From(gallery.Window());
    for (short v = list.top; v < list.bottom; ++v) {
        std::uint32_t *const line = glog.Pixels()->Row(v);
        std::vector<std::uint32_t> const before(line + list.left, line + list.right);
        std::fill(line + list.left, line + list.right, 0xFFFF00FFu); // a colour that nothing has
        glog.DamageWindowRect({v, list.left, static_cast<short>(v + 1), list.right});
        glog.Update();
        auto const fault = std::mismatch(before.begin(), before.end(), line + list.left);
        ASSERT_TRUE(fault.first == before.end())
            << "at " << fault.first - before.begin() + list.left << ", " << v;
    }
}

TEST_F(GridPage, AWindowThatGrowsShowsMoreRows) {
    int const before = Bar().GetRange();
    desktop.Play("press 890 650\nmove 890 746\nrelease\nwait 1\n");
    EXPECT_EQ(Bar().GetRange(), before - 96);
    EXPECT_EQ(Bar().GetPosition(), 0);
}

TEST_F(GridPage, AWindowThatGrowsAtTheEndStaysThere) {
    desktop.Play("press 848 150\nmove 848 640\nrelease\nwait 1\n");
    int const before = Bar().GetPosition();
    desktop.Play("press 890 650\nmove 890 746\nrelease\nwait 1\n");
    EXPECT_EQ(Bar().GetPosition(), before - 96);
    EXPECT_EQ(Bar().GetPosition(), Bar().GetRange());
}

} // namespace
