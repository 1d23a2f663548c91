#include "tools/gallery/FittedTabsPane.h"
#include "frame/ResourceReading.h"
#include "host/GlogStyleSheet.h"
#include "host/glogRec.h"
#include "scrolling/ScrollBarPane.h"
#include "tools/gallery/LabelText.h"
#include "tools/gallery/Phrases.h"
#include <algorithm>
#include <memory>
#include <new>

namespace {

int const kLeastWidth = 20; // pixels
int const kUnit = 4, kPage = 32;
double const kThumbRatio = 0.12;

std::vector<TabPane::Item> Pages() {
    std::vector<TabPane::Item> pages;
    Phrase const names[][2] = {{Phrase::kNotes, Phrase::kNotesShort},
                               {Phrase::kModulation, Phrase::kModulationShort},
                               {Phrase::kAutomation, Phrase::kAutomationShort},
                               {Phrase::kEffects, Phrase::kEffectsShort}};
    for (Phrase const *name : names)
        pages.push_back(TabPane::Item(Phrases::Get(name[0]), Phrases::Get(name[1])));
    return pages;
}

} // namespace

FittedTabsPane *FittedTabsPane::NewFittedTabsPane(glogRec *owner, GlogStyleSheet *sheet) {
    Rect const widest = OptionalRect(sheet->GetItemRes(), "BoundsRect");
    short const bar = static_cast<short>(sheet->GetSInt32ItemValue(ResourceKey("Num")));
    short const label = static_cast<short>(sheet->GetSInt32ItemValue(ResourceKey("TextID")));
    std::unique_ptr<FittedTabsPane> pane(new (std::nothrow) FittedTabsPane(owner, widest, bar, label));
    return pane && pane->GetGlog() ? pane.release() : nullptr;
}

FittedTabsPane::FittedTabsPane(glogRec *owner, Rect const &widest_, short barID_, short labelID_)
    : TabPane(owner, widest_, Pages(), 0)
    , widest(widest_)
    , barID(barID_)
    , labelID(labelID_)
    , bar(nullptr)
    , width(widest_.right - widest_.left) {}

FittedTabsPane::~FittedTabsPane() {
    if (barWatch.PaneExists() && bar->GetClient() == this)
        bar->SetClient(nullptr);
}

void FittedTabsPane::GlogItemInit() {
    TabPane::GlogItemInit();
    bar = dynamic_cast<ScrollBarPane *>(GetGlogItem(GetGlog(), barID));
    barWatch.Watch(bar);
    if (bar)
        bar->SetClient(this);
    Fit(width);
}

void FittedTabsPane::Fit(int newWidth) {
    width = std::clamp(newWidth, kLeastWidth, kLeastWidth + GetMaxScrollValue(bar));
    Rect target = widest;
    target.right = static_cast<short>(widest.left + width);
    FitIntoRect(target);
    if (barWatch.PaneExists())
        bar->Set(width - kLeastWidth, GetMaxScrollValue(bar));
    LabelText::Show(GetGlog(), labelID, Phrases::Fill(Phrase::kPixels, {width}));
}

int FittedTabsPane::GetMaxScrollValue(ScrollBarPane *) { return widest.right - widest.left - kLeastWidth; }

void FittedTabsPane::ScrollTo(ScrollBarPane *, int position) { Fit(kLeastWidth + position); }

double FittedTabsPane::GetThumbRatio(ScrollBarPane *) { return kThumbRatio; }

void FittedTabsPane::StartScrolling(ScrollBarPane *, bool byUnit, int &amount, int &multiplier) {
    amount = byUnit ? kUnit : kPage;
    multiplier = 1;
}

void FittedTabsPane::Scroll(ScrollBarPane *, int &amount, int &multiplier) {
    Fit(width + amount * multiplier);
}
