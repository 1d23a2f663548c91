#include "lists/ListPane.h"
#include "host/OSRgn.h"
#include "host/PortSavers.h"
#include "host/VelaDrawing.h"
#include "scrolling/Truncation.h"
#include <algorithm>

namespace {
short const kNoNumber = 0;
short const kAtEnd = -1;
} // namespace

// Draws the lines that lie in what is to be drawn.
class ListPane::HelperPane : public GlogPane {
public:
    HelperPane(glogRec *glog_, ListPane *list)
        : owner(list) {
        GlogPaneInit(glog_, kNoNumber);
    }

protected:
    // All lines are looked at: coordinates are cut to 16 bits, so a line far down lies anywhere.
    void DrawGuts(OSRgn *region) override {
        Prepare();
        Rect row;
        GetBox(&row);
        Rect const clip = CarbonUtils::GetRgnBounds(region);
        for (int line = 0; line < owner->numLines; ++line) {
            row.top = Edge(line);
            row.bottom = Edge(line + 1LL);
            Rect visible;
            if (!VelaDrawing::SectRect(&row, &clip, &visible))
                continue;
            WithClipRect const narrowed((OS::RectBase<OS::RectTag>(visible)));
            owner->DrawLine(line, row);
        }
    }

private:
    short Edge(long long line) const { return static_cast<short>(owner->lineHeight * line); }

    ListPane *owner;
};

ListPane::ListPane(glogRec *owner, int lineHeight_)
    : ScrollPane(owner)
    , helperPane(new HelperPane(owner, this))
    , lineHeight(lineHeight_)
    , numLines(0) {
    Add(helperPane, kAtEnd);
}

void ListPane::SetNumLines(int count) {
    if (count == numLines)
        return;
    numLines = count;
    InvalListDimensions();
}

int ListPane::GetScrollDelta() const { return lineHeight; }

void ListPane::SetBox(Rect *box) {
    ScrollPane::SetBox(box);
    InvalListDimensions();
}

void ListPane::InvalListDimensions() {
    Rect box;
    GetBox(&box);
    VelaDrawing::OffsetRect(&box, static_cast<short>(-box.left), static_cast<short>(-box.top));
    box.right = std::max(box.right, Pixel16(GetListWidth()));
    box.bottom = std::max(box.bottom, Pixel16(static_cast<long long>(lineHeight) * numLines));
    helperPane->SetBox(&box);
    SetVirtualWidth(box.right);
    SetVirtualHeight(box.bottom);
}
