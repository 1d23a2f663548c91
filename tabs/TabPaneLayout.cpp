// Where the tabs are, and how their row is made to fit.
#include "buttons/NaturalSize.h"
#include "host/VelaDrawing.h"
#include "tabs/TabMeasures.h"
#include "tabs/TabNameWidths.h"
#include "tabs/TabPane.h"
#include <algorithm>
#include <cmath>
#include <cstdlib>
#include <limits>

namespace {

int const kNameFont = 3;
short const kBold = 1, kCondensed = 32;
short const kPlainSize = 11, kSmallSize = 10, kSmallestSize = 9;

// Tabs that may be narrower are not made narrower than this by taking from their least width.
int const kNarrowestTab = 30;
// What a tab can save by going from the plain padding to the least one.
int const kMostSaving = 2 * (TabMeasures::kPlainPadding - TabMeasures::kLeastPadding);

// A row that is wider than coordinates reach ends where they do.
short Coordinate16(int value) {
    int const least = std::numeric_limits<short>::min(), greatest = std::numeric_limits<short>::max();
    return static_cast<short>(std::clamp(value, least, greatest));
}

} // namespace

// Names

int TabPane::DefaultTextStyle() const { return kBold; }

void TabPane::SetupFont() {
    fontSaveRec const &record = *GetIndVelaFont(kNameFont);
    font = record.family;
    textSize = textDrawingFlags & kTextSize9    ? kSmallestSize
               : textDrawingFlags & kTextSize10 ? kSmallSize
                                                : kPlainSize;
    // Condensed takes the place of the usual style.
    textStyle = textDrawingFlags & kUseCondensedText ? kCondensed : static_cast<short>(DefaultTextStyle());
}

UString const &TabPane::ShownName(Item const &item) const {
    return textDrawingFlags & kUseShortNames ? item.shortName : item.name;
}

int TabPane::CachedStringWidth(UString const &text, OS::TextLayout &layout) {
    return TabNameWidths::Instance().WidthOf(text, layout, font, textStyle, textSize);
}

int TabPane::GetItemNameWidth(int number) {
    Item const &item = GetItem(number);
    return CachedStringWidth(ShownName(item), *item.textLayout);
}

// The row

int TabPane::NumVisible() const {
    return textDrawingFlags & kOverflow ? CountItems() - hiddenCount : CountItems();
}

bool TabPane::TabIsVisible(int item) const { return !(textDrawingFlags & kOverflow) || item < NumVisible(); }

void TabPane::DemandItemRects() {
    if (itemRects.size() == items.size())
        return;
    itemRects.clear();
    Rect r = GetDrawRectangle();
    r.bottom = Coordinate16(r.top + GetTabHeight());
    r.right = r.left;
    SetupFont();
    int const visible = NumVisible();
    for (int i = 0; i < visible; ++i) {
        int const width = GetItemNameWidth(i) + GetNameExtraWidth(i) + 2 * tabPadding;
        r.left = r.right;
        r.right = Coordinate16(r.left + std::max(width, minTabWidth));
        itemRects.push_back(r);
    }
    r.left = r.right;
    r.right = Coordinate16(r.left + TabMeasures::kOverflowWidth);
    itemRects.resize(items.size(), r); // hidden items lie on one another
}

void TabPane::InvalItemRects() {
    itemRects.clear();
    UpdateLayout();
}

void TabPane::SetBox(Rect *box) {
    GlogPane::SetBox(box);
    itemRects.clear();
}

Rect TabPane::GetItemBox(int item) {
    DemandItemRects();
    return itemRects[Index(item)];
}

Rect TabPane::GetOptimalRect() {
    if (items.empty())
        return {0, 0, 0, 0};
    Rect row = GetItemBox(0);
    row.right = GetItemBox(CountItems() - 1).right;
    return row;
}

// The width is one more than the row's; the height is not.
void TabPane::UpdateLayout() {
    if (items.empty() || !GetGlog())
        return;
    WithPerformLayoutRectUpdate const update(this);
    Rect const row = GetOptimalRect();
    SetNaturalSize(*this, row.right - row.left + 1, row.bottom - row.top);
}

void TabPane::SetTextDrawingFlags(int flags) {
    textDrawingFlags = static_cast<unsigned short>(flags);
    itemRects.clear();
    DemandItemRects();
    UpdateLayout();
}

// Fitting

// How much wider than the target the row is; writes the box that the pane takes then.
int TabPane::Measure(Rect const &target, bool alignRight, Rect &candidate) {
    InvalItemRects();
    Rect const row = GetOptimalRect();
    candidate = GetBounds();
    if (alignRight) {
        candidate.right = target.right;
        candidate.left = Coordinate16(target.right - row.right + row.left);
    } else {
        candidate.left = target.left;
        candidate.right = Coordinate16(target.left - row.left + row.right);
    }
    return target.left - candidate.left - target.right + candidate.right;
}

void TabPane::Finish(Rect const &candidate) {
    Inval(); // where the pane has been
    Rect box = candidate;
    SetBox(&box);
    Inval();
}

bool TabPane::TryToFit(Rect const &target, bool alignRight, int &overflow, bool force) {
    Rect candidate;
    overflow = Measure(target, alignRight, candidate);
    if (overflow < 1 || force)
        Finish(candidate);
    return overflow < 1;
}

void TabPane::FitIntoRect(Rect const &target) {
    Rect const bounds = GetBounds();
    bool const alignRight = std::abs(target.left - bounds.left) > std::abs(target.right - bounds.right);
    minTabWidth = GetMinTabWidth();
    tabPadding = TabMeasures::kPlainPadding;
    textDrawingFlags = 0;
    hiddenCount = 0;
    if (!FitsNarrower(target, alignRight) && !FitsWithSmallerText(target, alignRight))
        HideUntilItFits(target, alignRight);
}

// Takes from the least width as long as that is not too little and the row not yet narrow enough.
void TabPane::NarrowTabs(Rect const &target, bool alignRight) {
    Rect candidate;
    while (Measure(target, alignRight, candidate) >= 1 && minTabWidth > kNarrowestTab)
        --minTabWidth;
}

// As it is; with less and less of a least width; with less padding.
bool TabPane::FitsNarrower(Rect const &target, bool alignRight) {
    int overflow = 0;
    if (TryToFit(target, alignRight, overflow, false))
        return true;
    NarrowTabs(target, alignRight);
    if (TryToFit(target, alignRight, overflow, false))
        return true;
    int const count = CountItems();
    if (count * kMostSaving <= overflow)
        return false;
    float const saving = std::ceil(static_cast<float>(overflow) / static_cast<float>(2 * count));
    tabPadding = static_cast<int>(static_cast<float>(TabMeasures::kPlainPadding) - saving);
    return TryToFit(target, alignRight, overflow, false);
}

// The last flags of the list are set and laid out, but never tried: what follows begins with others.
bool TabPane::FitsWithSmallerText(Rect const &target, bool alignRight) {
    static unsigned short const kSteps[] = {kUseCondensedText,
                                            kTextSize10,
                                            kUseCondensedText | kTextSize10,
                                            kTextSize9,
                                            kUseCondensedText | kTextSize9,
                                            kUseShortNames,
                                            kUseShortNames | kUseCondensedText};
    tabPadding = TabMeasures::kLeastPadding;
    for (unsigned short flags : kSteps) {
        int overflow = 0;
        if (TryToFit(target, alignRight, overflow, false))
            return true;
        SetTextDrawingFlags(flags);
    }
    return false;
}

// Names are full and of plain size again. Each step lays the row out, since a subclass may give its tabs
// other widths when fewer of them show. The box is taken even if nothing could be hidden any more.
void TabPane::HideUntilItFits(Rect const &target, bool alignRight) {
    SetTextDrawingFlags(kOverflow); // while nothing is hidden yet
    hiddenCount = 1;
    int overflow = 0;
    while (!TryToFit(target, alignRight, overflow, false) && hiddenCount < CountItems())
        ++hiddenCount;
    TryToFit(target, alignRight, overflow, true);
}
