// How tabs look.
#include "host/Icons.h"
#include "host/PortSavers.h"
#include "host/VelaDrawing.h"
#include "tabs/TabMeasures.h"
#include "tabs/TabPane.h"

namespace {

short const kNameGray = 20, kGroundGray = 100; // percent
// Where the tile between the ends lies, whatever width the ends of a subclass have.
short const kBodyInset = 6;
short const kMarkSize = 20;
char const kOverflowMark[] = "\xC8";

int const kCentredVertically = 1;
int const kOneLine = 0, kUpright = 0;

int const kIconFamily = 1000;
enum TabIcon {
    kFirstLeft = 70,
    kLastRight = 71,
    kOtherRight = 72,
    kPlainBody = 73, // and the left end of all but the first
    kSelectedFirstLeft = 74,
    kSelectedLastRight = 75,
    kSelectedOtherRight = 76,
    kSelectedBody = 77 // and the left end of all but the first
};

} // namespace

int TabPane::GetIconSet() const { return kIconFamily; }

Rect TabPane::AdjustNameBox(Rect box, int) const { return box; }

void TabPane::DecorateTab(Rect, Rect, int, int) {}

void TabPane::SetTextColor(bool) {}

int TabPane::GetIcon(Part part, int item, bool) {
    bool const selected = item == selectedItem;
    switch (part) {
    case kLeftEnd:
        if (item == 0)
            return selected ? kSelectedFirstLeft : kFirstLeft;
        return selected ? kSelectedBody : kPlainBody;
    case kRightEnd:
        if (item == CountItems() - 1)
            return selected ? kSelectedLastRight : kLastRight;
        return selected ? kSelectedOtherRight : kOtherRight;
    case kBody:
        return selected ? kSelectedBody : kPlainBody;
    }
    return kPlainBody;
}

void TabPane::DrawGuts(OSRgn *) {
    Prepare();
    DemandItemRects();
    SaveColors const colors;
    GrayForeColor(kNameGray);
    GrayBackColor(kGroundGray);
    SetupFont();
    // What subclasses do meanwhile may change the row.
    for (int i = 0; i < NumVisible(); ++i)
        DrawTab(i);
    // More may be hidden than there are items, after deletions: then there is no tab for them either.
    int const place = NumVisible();
    if (place >= 0 && place < CountItems())
        DrawOverflowTab(place);
}

void TabPane::DrawPieces(Rect const &tab, int item) {
    short const family = static_cast<short>(GetIconSet());
    Rect body = tab;
    VelaDrawing::InsetRect(&body, kBodyInset, 0);
    DrawLeftEnd(tab, item);
    TileIcon(&body, family, static_cast<short>(GetIcon(kBody, item, WindowIsActive())),
             static_cast<short>(GetTabBodyWidth()), static_cast<short>(GetTabHeight()));
    Draw1Icon(family, static_cast<short>(GetIcon(kRightEnd, item, WindowIsActive())),
              static_cast<short>(tab.right - GetTabEndWidth()), tab.top);
}

// All but the first have a whole body there. In a narrow tab that must not show behind a right end with round
// corners.
void TabPane::DrawLeftEnd(Rect const &tab, int item) {
    auto const draw = [&] {
        Draw1Icon(static_cast<short>(GetIconSet()),
                  static_cast<short>(GetIcon(kLeftEnd, item, WindowIsActive())), tab.left, tab.top);
    };
    if (tab.right - tab.left >= GetTabBodyWidth() + GetTabEndWidth()) {
        draw();
        return;
    }
    Rect room = tab;
    room.right = static_cast<short>(tab.right - GetTabEndWidth());
    WithClipRect const narrowed((OS::RectBase<OS::RectTag>(room)));
    draw();
}

void TabPane::DrawName(Item const &item, UString const &text, Rect const &box,
                       TextSettings::TruncateCode truncation) {
    DrawTextLayoutInRect(*item.textLayout, text, box, font, textStyle, textSize, TextSettings::kAlignCenter,
                         truncation, kCentredVertically, kOneLine, kUpright, 0, 0.0f, 1.0f, 1.0f);
}

void TabPane::DrawTab(int number) {
    Rect const tab = GetItemBox(number);
    DrawPieces(tab, number);
    SetTextColor(number == selectedItem);
    Rect const nameBox = AdjustNameBox(tab, number);
    Item const &item = GetItem(number);
    UString const &name = ShownName(item);
    DrawName(item, name, nameBox, TextSettings::kTruncateNone);
    DecorateTab(tab, nameBox, number, CachedStringWidth(name, *item.textLayout));
}

// Looks like a last tab that is selected, whichever is.
void TabPane::DrawOverflowTab(int place) {
    Rect const tab = GetItemBox(place);
    int const selected = selectedItem;
    selectedItem = CountItems() - 1;
    DrawPieces(tab, selectedItem);
    selectedItem = selected;
    SetTextColor(true);
    Item const &item = GetItem(place);
    if (CountItems() == 1) {
        DrawName(item, item.name, tab, TextSettings::kTruncateEnd);
        return;
    }
    VelaDrawing::TextSize(kMarkSize);
    DrawName(item, UString(kOverflowMark, UString::kByteEncoding1), tab, TextSettings::kTruncateEnd);
}
