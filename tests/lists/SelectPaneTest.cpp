#include "lists/SelectPane.h"
#include "host/NamedColors.h"
#include "host/OSRgn.h"
#include "host/VelaDrawing.h"
#include "lists/EditBoxPane.h"
#include "tests/PaneTest.h"
#include "tests/VirtualPlace.h"
#include <limits>

namespace {

Rect const kBox = {20, 30, 60, 130};

// A pane whose protected operations can be called.
class OpenSelectPane : public SelectPane {
public:
    using SelectPane::DrawGuts;
    using SelectPane::HandleClick;
};

class SelectPaneTest : public PaneTest {
protected:
    SelectPaneTest() {
        pane->SelectPaneInit(glog, 7);
        Rect box = kBox;
        pane->SetBox(&box);
        Show();
        desktop.Play(""); // the window becomes active
        Repainted();
    }

    Rect Edited(Rect const &box) {
        Rect changed = box;
        pane->SetBox(&changed);
        return pane->GetEditBox();
    }

    OpenSelectPane *pane = new OpenSelectPane;
};

TEST_F(SelectPaneTest, HasItsOperationsInTheirOrder) {
    std::size_t const first = PlaceOf(&SelectPane::EditBoxContains);
    ExpectInOrder(first, &SelectPane::EditBoxContains, &SelectPane::_Draw_, &SelectPane::_SetEditBoxFromRect_,
                  &SelectPane::_ResizeBox_, &SelectPane::SetEditMode);
}

TEST_F(SelectPaneTest, IsAttachedUnderItsNumberAndNotSelected) {
    EXPECT_EQ(pane->GetID(), 7);
    EXPECT_EQ(pane->GetGlog(), glog);
    EXPECT_FALSE(pane->IsSelected());
    EXPECT_EQ(pane->GetEditMode(), kConsoleEditNone);
}

TEST_F(SelectPaneTest, WithoutAGlogItIsNotAttached) {
    OpenSelectPane loose;
    EXPECT_EQ(loose.SelectPaneInit(nullptr, 1), nullptr);
}

TEST_F(SelectPaneTest, InitTakesASelectionAndAnEditModeBack) {
    OpenSelectPane other;
    other.SetSelectedFlag(true);
    other.SetEditMode(ConsoleEditMode(3));
    other.SelectPaneInit(glog, 1);
    EXPECT_FALSE(other.IsSelected());
    EXPECT_EQ(other.GetEditMode(), kConsoleEditNone);
}

TEST_F(SelectPaneTest, SetEditModeAnswersTheModeBefore) {
    EXPECT_EQ(pane->SetEditMode(ConsoleEditMode(2)), kConsoleEditNone);
    EXPECT_EQ(pane->SetEditMode(ConsoleEditMode(5)), ConsoleEditMode(2));
    EXPECT_EQ(pane->GetEditMode(), ConsoleEditMode(5));
}

// The selection

TEST_F(SelectPaneTest, MayBeTheCurrentItem) { EXPECT_TRUE(pane->Selectable()); }

TEST_F(SelectPaneTest, AClickSelectsAndAnotherEndsIt) {
    EXPECT_EQ(ResultOfClick("click 40 30"), -1);
    EXPECT_TRUE(pane->IsSelected());
    EXPECT_EQ(ResultOfClick("click 40 30 shift"), -1);
    EXPECT_FALSE(pane->IsSelected());
}

TEST_F(SelectPaneTest, AChangedSelectionIsRepainted) {
    pane->Select(true);
    EXPECT_EQ(Repainted(), std::vector<Rect>{kBox});
    pane->Select(false);
    EXPECT_EQ(Repainted(), std::vector<Rect>{kBox});
}

TEST_F(SelectPaneTest, AnUnchangedOneIsNot) {
    pane->Select(false);
    EXPECT_TRUE(Repainted().empty());
    pane->Select(true);
    Repainted();
    pane->Select(true);
    EXPECT_TRUE(Repainted().empty());
}

// The window comes to the front and leaves it

TEST_F(SelectPaneTest, LeavingTheFrontRepaintsNothing) {
    pane->Select(true);
    Repainted();
    pane->Deactivate();
    EXPECT_FALSE(pane->IsActive());
    EXPECT_TRUE(Repainted().empty());
}

TEST_F(SelectPaneTest, ComingToTheFrontRepaintsWhatIsSelected) {
    pane->Select(true);
    pane->Deactivate();
    Repainted();
    pane->Activate();
    EXPECT_TRUE(pane->IsActive());
    EXPECT_EQ(Repainted(), std::vector<Rect>{kBox});
}

TEST_F(SelectPaneTest, ComingToTheFrontRepaintsNothingThatIsNotSelected) {
    pane->Deactivate();
    pane->Activate();
    EXPECT_TRUE(Repainted().empty());
}

TEST_F(SelectPaneTest, AnActivePaneIsNotActivatedAgain) {
    pane->Select(true);
    Repainted();
    pane->Activate();
    EXPECT_TRUE(Repainted().empty());
}

// Drawing

TEST_F(SelectPaneTest, IsAFrameOnTheWindowsGround) {
    Lines const expected = Traced(*pane, [] {
        Rect frame = kBox;
        VelaDrawing::RGBForeColor(kDialogActiveTextColor);
        VelaDrawing::RGBBackColor(kWindowBackgroundColor);
        VelaDrawing::PenNormal();
        VelaDrawing::FrameRect(&frame);
        VelaDrawing::InsetRect(&frame, 1, 1);
        VelaDrawing::EraseRect(&frame);
    });
    EXPECT_EQ(DrawingOf(*pane), expected);
}

TEST_F(SelectPaneTest, SelectedItIsFilled) {
    pane->Select(true);
    EXPECT_EQ(Only("PaintRect", DrawingOf(*pane)).size(), 1u);
    EXPECT_TRUE(Only("EraseRect", DrawingOf(*pane)).empty());
}

TEST_F(SelectPaneTest, SelectedInAWindowThatIsNotActiveItIsEmpty) {
    pane->Select(true);
    pane->Deactivate();
    EXPECT_TRUE(Only("PaintRect", DrawingOf(*pane)).empty());
    EXPECT_EQ(Only("EraseRect", DrawingOf(*pane)).size(), 1u);
}

TEST_F(SelectPaneTest, OutsideOfTheRegionNothingIsDrawn) {
    OSRgn beside(Rect{20, 130, 60, 200}), corner(Rect{59, 129, 80, 200});
    EXPECT_TRUE(Only("FrameRect", Traced(*pane, [&] { pane->DrawGuts(&beside); })).empty());
    EXPECT_EQ(Only("FrameRect", Traced(*pane, [&] { pane->DrawGuts(&corner); })).size(), 1u);
}

TEST_F(SelectPaneTest, ThePortKeepsItsColors) { EXPECT_TRUE(KeepsColors(*pane)); }

TEST_F(SelectPaneTest, ADerivedClassIsToldWhetherToHighlight) {
    class Derived : public OpenSelectPane {
    public:
        void _Draw_(OSRgn *region, char hilite) override {
            calls.push_back(std::string(region ? "part " : "all ") + (hilite ? "on" : "off"));
        }
        std::vector<std::string> calls;
    };
    Derived *const derived = new Derived;
    derived->SelectPaneInit(glog, 8);
    Rect box = {100, 0, 120, 20};
    derived->SetBox(&box);
    derived->SetActive();
    OSRgn region(box);
    derived->DrawGuts(nullptr);
    derived->DrawGuts(&region);
    derived->Select(true);
    derived->DrawGuts(nullptr);
    EXPECT_EQ(derived->calls, (std::vector<std::string>{"all off", "part off", "all on"}));
}

// The edit box

TEST_F(SelectPaneTest, TheEditBoxIsAnUpsideDownRectangleOutsideOfTheCorner) {
    EXPECT_EQ(Edited({10, 20, 50, 90}), (Rect{52, 92, 51, 91}));
}

TEST_F(SelectPaneTest, WhichHoldsNoPoint) {
    int held = 0;
    for (short v = 0; v < 100; ++v)
        for (short h = 0; h < 200; ++h)
            held += pane->EditBoxContains({v, h});
    EXPECT_EQ(held, 0);
}

TEST_F(SelectPaneTest, ADerivedClassMayMakeAnEditBoxOfItsOwn) {
    class Derived : public SelectPane {
        void _SetEditBoxFromRect_(Rect &rect) override {
            SelectPane::_SetEditBoxFromRect_(rect = {5, 5, 9, 9});
        }
    };
    Derived derived;
    Rect box = {0, 0, 40, 40};
    derived.SetBox(&box);
    EXPECT_EQ(derived.GetEditBox(), (Rect{11, 11, 10, 10}));
    EXPECT_EQ(derived.GetBounds(), (Rect{0, 0, 40, 40}));
}

TEST_F(SelectPaneTest, AtTheEndOfTheCoordinatesTheEditBoxStaysThere) {
    short const end = std::numeric_limits<short>::max();
    EXPECT_EQ(Edited({0, 0, end, end}), (Rect{end, end, end, end}));
}

// Resizing

struct Resizing {
    Point from, to;
    Rect result;
    bool changed;
};

class SelectPaneResizing : public SelectPaneTest, public testing::WithParamInterface<Resizing> {};

TEST_P(SelectPaneResizing, GrowsFromItsTopLeftCorner) {
    Rect box = kBox;
    EXPECT_EQ(pane->_ResizeBox_(&box, GetParam().from, GetParam().to) != 0, GetParam().changed);
    EXPECT_EQ(box, GetParam().result);
    EXPECT_EQ(BoxOf(*pane), GetParam().result);
}

INSTANTIATE_TEST_SUITE_P(
    Drags, SelectPaneResizing,
    testing::Values(Resizing{{60, 130}, {70, 150}, {20, 30, 70, 150}, true},   // larger
                    Resizing{{60, 130}, {50, 110}, {20, 30, 50, 110}, true},   // smaller
                    Resizing{{0, 0}, {5, 0}, {20, 30, 65, 130}, true},         // in one direction
                    Resizing{{60, 130}, {60, 130}, {20, 30, 60, 130}, false},  // nowhere
                    Resizing{{60, 130}, {10, 20}, {20, 30, 30, 40}, true},     // beyond the corner: it flips
                    Resizing{{60, 130}, {-20, -70}, {20, 30, 60, 130}, false}, // to the same size, flipped
                    Resizing{{60, 130}, {20, 30}, {20, 30, 20, 30}, true},     // to nothing
                    Resizing{{-32768, 0}, {32767, 0}, {20, 30, 32767, 130}, true}));

TEST_F(SelectPaneTest, ResizingMovesTheEditBoxToo) {
    Rect box = kBox;
    pane->_ResizeBox_(&box, {60, 130}, {70, 150});
    EXPECT_EQ(pane->GetEditBox(), (Rect{72, 152, 71, 151}));
}

// EditBoxPane

TEST(EditBoxPaneTest, IsASelectPaneInAllItsOperations) {
    SelectPane const plain;
    EditBoxPane const pane;
    std::size_t const last = PlaceOf(&SelectPane::SetEditMode);
    for (std::size_t place = kAfterDestructor; place <= last; ++place)
        EXPECT_EQ(OperationAt(place, pane), OperationAt(place, plain)) << "operation " << place;
    EXPECT_EQ(sizeof(EditBoxPane), sizeof(SelectPane));
}

} // namespace
