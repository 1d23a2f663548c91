// Scrolled panes and grids in dialogs.
#include "desktop/observe/TreeDump.h"
#include "dialogs/BarName.h"
#include "dialogs/ItemRegistry.h"
#include "dialogs/StockItems.h"
#include "frame/ResourceReading.h"
#include "host/GlogStyleSheet.h"
#include "scrolling/ScrollGridPlus.h"
#include "scrolling/ScrollPane.h"
#include <algorithm>
#include <limits>
#include <new>

namespace {

long long const kLargest = std::numeric_limits<short>::max();

// Takes its bars, and as much room as its panes need, once the dialog stands.
class DialogScrollPane : public ScrollPane {
public:
    DialogScrollPane(glogRec *owner, GlogStyleSheet *sheet)
        : ScrollPane(owner)
        , h(sheet, "HScrollBar")
        , v(sheet, "VScrollBar")
        , width(sheet->GetSInt32ItemValue(ResourceKey("VirtualWidth")))
        , height(sheet->GetSInt32ItemValue(ResourceKey("VirtualHeight"))) {}

    void GlogItemInit() override {
        ScrollPane::GlogItemInit();
        SetHScrollBar(h.FindFor(*this));
        SetVScrollBar(v.FindFor(*this));
        Rect const extent = Extent();
        SetVirtualWidth(width ? width : extent.right);
        SetVirtualHeight(height ? height : extent.bottom);
        SetHScrollPos(0);
        SetVScrollPos(0);
    }

private:
    Rect Extent() const {
        Rect extent = {0, 0, 0, 0};
        for (short i = 0; i < NumSubpanes(); ++i) {
            Rect box;
            Get(i)->GetBox(&box);
            extent.right = std::max(extent.right, box.right);
            extent.bottom = std::max(extent.bottom, box.bottom);
        }
        return extent;
    }

    BarName h, v;
    int width, height; // 0: as its panes need
};

bool IsVertical(GlogStyleSheet *sheet) {
    return !(sheet->GetUStringItemValue(ResourceKey("Direction")) == ResourceKey("horiz"));
}

bool HasDifferentSizes(GlogStyleSheet *sheet) {
    return sheet->GetSInt32ItemValue(ResourceKey("DifferentSizes")) != 0;
}

class DialogScrollGrid : public ScrollGridPlus {
public:
    DialogScrollGrid(glogRec *owner, GlogStyleSheet *sheet)
        : ScrollGridPlus(owner, 0, nullptr, nullptr)
        , along(sheet, "ScrollBar")
        , across(sheet, "LateralScrollBar") {
        SetVerticalGrid(IsVertical(sheet));
        SetMayHaveDifferentSizes(HasDifferentSizes(sheet));
        SetStickToEnd(sheet->GetSInt32ItemValue(ResourceKey("StickToEnd")) != 0);
    }

    void GlogItemInit() override {
        ScrollGridPlus::GlogItemInit();
        SetLateralScrollbar(across.FindFor(*this));
        SetScrollbar(along.FindFor(*this));
    }

private:
    BarName along, across;
};

// Null when the pane could not be made.
template <class Pane> Pane *Placed(Pane *pane, GlogStyleSheet *sheet) {
    if (pane) {
        Rect box = OptionalRect(sheet->GetItemRes(), "BoundsRect");
        pane->SetBox(&box);
    }
    return pane;
}

GlogPane *MakeScrollPane(glogRec *glog, GlogStyleSheet *sheet) {
    return Placed(new (std::nothrow) DialogScrollPane(glog, sheet), sheet);
}

GlogPane *MakeGrid(glogRec *glog, GlogStyleSheet *sheet) {
    Grid *const grid = new (std::nothrow) Grid;
    if (!grid || !grid->GridInit(glog, 0))
        return nullptr;
    grid->SetVerticalGrid(IsVertical(sheet));
    grid->SetMayHaveDifferentSizes(HasDifferentSizes(sheet));
    return Placed(grid, sheet);
}

GlogPane *MakeScrollGrid(glogRec *glog, GlogStyleSheet *sheet) {
    return Placed(new (std::nothrow) DialogScrollGrid(glog, sheet), sheet);
}

// How far the content is scrolled.
bool DescribeScrolled(GlogPane &pane, JsonLine &line) {
    if (!dynamic_cast<ScrollPane *>(&pane) && !dynamic_cast<ScrollGrid *>(&pane))
        return false;
    Rect box;
    pane.GetBox(&box);
    Point offset = {box.top, box.left};
    pane.LocalOffset(&offset);
    line.Integer("scrolledH", offset.h).Integer("scrolledV", offset.v);
    return true;
}

KeyList GridKeys() {
    return KeyList()
        .Rect("BoundsRect")
        .Required()
        .Word("Direction", {"vert", "horiz"})
        .Flag("DifferentSizes");
}

} // namespace

void AddScrolledItems(ItemRegistry &registry) {
    TreeDump::AddDescriber(DescribeScrolled);
    registry.Add(ItemType("ScrollPane")
                     .Keys(KeyList()
                               .Rect("BoundsRect")
                               .Required()
                               .Integer("VirtualWidth", 1, kLargest)
                               .Integer("VirtualHeight", 1, kLargest)
                               .Integer("HScrollBar", 1, kLargest)
                               .Integer("VScrollBar", 1, kLargest))
                     .MadeBy(MakeScrollPane)
                     .HoldsItems());
    registry.Add(ItemType("Grid").Keys(GridKeys()).MadeBy(MakeGrid).HoldsItems());
    registry.Add(ItemType("ScrollGrid")
                     .Keys(GridKeys()
                               .Integer("ScrollBar", 1, kLargest)
                               .Integer("LateralScrollBar", 1, kLargest)
                               .Flag("StickToEnd"))
                     .MadeBy(MakeScrollGrid)
                     .HoldsItems());
}
