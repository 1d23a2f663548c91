// Progress bars and dividing lines in dialogs.
#include "desktop/observe/TreeDump.h"
#include "dialogs/ItemRegistry.h"
#include "dialogs/RecordBytes.h"
#include "dialogs/StockItems.h"
#include "frame/ResourceReading.h"
#include "graphics/GLinePane.h"
#include "graphics/ProgressBarPane.h"
#include "host/GlogStyleSheet.h"
#include <cmath>
#include <memory>
#include <new>

namespace {

short const kNoNumber = 0; // the loader numbers what it makes
double const kWhole = 100; // percent

bool DescribeProgressBar(GlogPane &pane, JsonLine &line) {
    ProgressBarPane *const bar = dynamic_cast<ProgressBarPane *>(&pane);
    if (!bar)
        return false;
    line.Flag("showsProgress", bar->ShowsProgress())
        .Integer("percent", std::lround(bar->GetFraction() * kWhole));
    return true;
}

GlogPane *MakeProgressBar(glogRec *glog, GlogStyleSheet *sheet) {
    std::unique_ptr<ProgressBarPane> pane(new (std::nothrow) ProgressBarPane(glog, kNoNumber));
    if (!pane || !pane->GetGlog())
        return nullptr;
    Rect bounds = OptionalRect(sheet->GetItemRes(), "BoundsRect");
    pane->SetBox(&bounds);
    pane->SetProgress(sheet->GetSInt32ItemValue(ResourceKey("Value")),
                      sheet->GetSInt32ItemValue(ResourceKey("Maximum")));
    return pane.release();
}

GlogPane *MakeLine(glogRec *glog, GlogStyleSheet *sheet) { return GLinePane::NewGLinePane(glog, sheet); }

GlogPane *MakeLineFromRecord(glogRec *glog, RecordBytes &bytes) {
    GLineResRec record;
    record.kind = bytes.Short();
    record.top = bytes.Short();
    record.left = bytes.Short();
    record.bottom = bytes.Short();
    record.right = bytes.Short();
    return GLinePane::NewGLinePane(glog, &record);
}

} // namespace

void AddGraphicItems(ItemRegistry &registry) {
    TreeDump::AddDescriber(DescribeProgressBar);
    registry.Add(ItemType("ProgressBar")
                     .Keys(KeyList()
                               .Rect("BoundsRect")
                               .Integer("Value", 0, KeyList::kLargest)
                               .Integer("Maximum", 0, KeyList::kLargest))
                     .MadeBy(MakeProgressBar));
    registry.Add(ItemType("Line")
                     .Keys(KeyList().Rect("BoundsRect").AnyCorners())
                     .MadeBy(MakeLine)
                     .FromRecord(GLineResRec::kKind, ItemType::kWholeKind, MakeLineFromRecord));
}
