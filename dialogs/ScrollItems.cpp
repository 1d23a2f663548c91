// Scroll bars and grow boxes in dialogs.
#include "desktop/observe/MessageTrace.h"
#include "desktop/observe/TreeDump.h"
#include "dialogs/ItemRegistry.h"
#include "dialogs/KeyFault.h"
#include "dialogs/MessageReporter.h"
#include "dialogs/RecordBytes.h"
#include "dialogs/StockItems.h"
#include "frame/ResourceReading.h"
#include "host/GlogStyleSheet.h"
#include "scrolling/GrowBox.h"
#include "scrolling/ScrollBarClient.h"
#include "scrolling/ScrollBarPane.h"
#include "scrolling/Truncation.h"
#include <algorithm>

namespace {

short const kNoNumber = 0;           // the loader numbers what it makes
long long const kLargestFlags = 127; // all flags, and bits between them, which mean nothing
long long const kLargestColor = 2;

// What a bar scrolls that nothing else takes: a number of its own. Goes with the bar.
class ScrolledNumber : public ScrollBarClient, public MessageReporter<ScrollBarPane_Listener> {
public:
    ScrolledNumber(ScrollBarPane *bar, int page_, int step_)
        : MessageReporter(bar)
        , page(std::max(page_, 1))
        , step(std::max(step_, 1)) {}

    int GetMaxScrollValue(ScrollBarPane *bar) override { return bar->GetRange(); }
    double GetThumbRatio(ScrollBarPane *bar) override {
        return page / (static_cast<double>(std::max(bar->GetRange(), 0)) + page);
    }
    void StartScrolling(ScrollBarPane *, bool byUnit, int &amount, int &multiplier) override {
        amount = byUnit ? step : page;
        multiplier = 1;
    }
    void Scroll(ScrollBarPane *bar, int &amount, int &multiplier) override {
        ScrollTo(bar, Saturated(bar->GetPosition() + static_cast<long long>(amount) * multiplier));
    }
    void ScrollTo(ScrollBarPane *bar, int target) override {
        int const position = std::max(std::min(target, bar->GetRange()), 0);
        if (position == bar->GetPosition())
            return;
        bar->Set(position, bar->GetRange());
        if (MessageTrace::On())
            MessageTrace::Write(MessageTrace::Begin(*bar)
                                    .Text("message", std::string("Scrolled"))
                                    .Integer("position", position));
    }

private:
    int page, step;
};

bool DescribeScrollBar(GlogPane &pane, JsonLine &line) {
    ScrollBarPane *const bar = dynamic_cast<ScrollBarPane *>(&pane);
    if (!bar)
        return false;
    line.Integer("position", bar->GetPosition()).Integer("range", bar->GetRange());
    return true;
}

void RequirePosition(int position, int range) {
    if (position > range)
        throw KeyFault("Position", "there is no position " + std::to_string(position) + ": the last one is " +
                                       std::to_string(range));
}

// In a group a bar is as long as its box says; its parts alone would not tell, since they follow its length.
void GiveNaturalLength(ScrollBarPane *bar) {
    Rect const box = bar->GetBounds();
    int const length = bar->IsHorizontal() ? box.right - box.left : box.bottom - box.top;
    if (length > 0)
        bar->GetLayoutRect()->SetAttribute(bar->IsHorizontal() ? GlogLayoutItem::kWidth
                                                               : GlogLayoutItem::kHeight,
                                           length, GlogLayoutItem::kPixels, UString());
}

GlogPane *MakeScrollBar(glogRec *glog, GlogStyleSheet *sheet) {
    auto const number = [sheet](char const *key) { return sheet->GetSInt32ItemValue(ResourceKey(key)); };
    int const range = number("Range"), position = number("Position");
    RequirePosition(position, range);
    ScrollBarPane *const bar = ScrollBarPane::NewScrollBarPane(glog, sheet);
    if (!bar)
        return nullptr;
    GiveNaturalLength(bar);
    if (number("ActiveInBackground") != 0)
        bar->SetActiveInBackground();
    if (range > 0) {
        bar->SetClient(new ScrolledNumber(bar, number("Page"), number("Step")));
        bar->Set(position, range);
    }
    return bar;
}

GlogPane *MakeScrollBarFromRecord(glogRec *glog, RecordBytes &bytes) {
    sbarResRec record;
    record.type = bytes.Short();
    record.flags = bytes.Short();
    record.bounds = bytes.ReadRect();
    record.edgeH = bytes.Short();
    record.edgeV = bytes.Short();
    return ScrollBarPane::NewScrollBarPane(glog, &record);
}

GlogPane *MakeGrowBox(glogRec *glog, GlogStyleSheet *sheet) {
    return GrowBox::InitGrowBox(glog, kNoNumber, sheet->GetItemRes());
}

GlogPane *MakeGrowBoxFromRecord(glogRec *glog, RecordBytes &bytes) {
    growResRec record;
    record.kind = bytes.Short();
    record.limits = bytes.ReadRect();
    record.borderLeft = bytes.Byte();
    record.borderTop = bytes.Byte();
    record.color = bytes.Long();
    return GrowBox::InitGrowBox(glog, kNoNumber, &record);
}

} // namespace

void AddScrollItems(ItemRegistry &registry) {
    TreeDump::AddDescriber(DescribeScrollBar);
    registry.Add(ItemType("ScrollBar")
                     .Keys(KeyList()
                               .Integer("Flags", 0, kLargestFlags)
                               .Rect("BoundsRect")
                               .Integer("EdgeH")
                               .Integer("EdgeV")
                               .Flag("ActiveInBackground")
                               .Integer("Range", 0, KeyList::kLargest)
                               .Integer("Position", 0, KeyList::kLargest)
                               .Integer("Page", 1, KeyList::kLargest)
                               .Integer("Step", 1, KeyList::kLargest))
                     .MadeBy(MakeScrollBar)
                     .FromRecord(sbarResRec::kType, ItemType::kWholeKind, MakeScrollBarFromRecord));
    registry.Add(ItemType("GrowBox")
                     .Keys(KeyList()
                               .Rect("LimitsRect")
                               .Flag("BorderLeft")
                               .Flag("BorderTop")
                               .Integer("Color", 0, kLargestColor))
                     .MadeBy(MakeGrowBox)
                     .FromRecord(growResRec::kKind, ItemType::kWholeKind, MakeGrowBoxFromRecord));
}
