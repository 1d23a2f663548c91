// Progress bars, dividing lines and pictures in dialogs.
#include "desktop/observe/MessageTrace.h"
#include "desktop/observe/TreeDump.h"
#include "dialogs/ItemRegistry.h"
#include "dialogs/KeyFault.h"
#include "dialogs/MessageReporter.h"
#include "dialogs/RecordBytes.h"
#include "dialogs/StockItems.h"
#include "dialogs/Utf8.h"
#include "frame/ResourceReading.h"
#include "graphics/GLinePane.h"
#include "graphics/PictPane.h"
#include "graphics/ProgressBarPane.h"
#include "host/EnumToStringMap.h"
#include "host/EventRecordAdapter.h"
#include "host/GlogStyleSheet.h"
#include <cmath>
#include <memory>
#include <new>

namespace {

short const kNoNumber = 0; // the loader numbers what it makes
double const kWhole = 100; // percent

// Progress bars

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

// Lines

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

// Pictures

class ClickReporter : public MessageReporter<PictPane_Listener> {
public:
    explicit ClickReporter(PictPane *picture)
        : MessageReporter(picture)
        , pane(*picture) {}
    void PictClicked(EventRecordAdapter *event) override {
        if (MessageTrace::On())
            MessageTrace::Write(MessageTrace::Begin(pane)
                                    .Text("message", std::string("PictClicked"))
                                    .Spot("where", event->where));
    }

private:
    PictPane &pane; // which the reporter goes with
};

void ReportClicks(GlogPane *pane) {
    if (PictPane *const picture = dynamic_cast<PictPane *>(pane))
        new ClickReporter(picture);
}

bool DescribePicture(GlogPane &pane, JsonLine &line) {
    PictPane *const picture = dynamic_cast<PictPane *>(&pane);
    if (!picture)
        return false;
    line.Integer("picture", picture->GetPictureID());
    return true;
}

void RequirePicture(UString const &name) {
    if (PictIDMapper::Instance().GetID(name) == 0)
        throw KeyFault("ResIDName", "there is no picture \"" + Utf8::FromUString(name) + "\"");
}

GlogPane *MakePicture(glogRec *glog, GlogStyleSheet *sheet) {
    RequirePicture(sheet->GetUStringItemValue(ResourceKey("ResIDName")));
    return PictPane::NewPictPane(glog, sheet);
}

GlogPane *MakePictureFromRecord(glogRec *glog, RecordBytes &bytes) {
    gpicResRec record;
    record.kind = bytes.Short();
    record.bounds = bytes.ReadRect();
    record.useImageSize = bytes.Byte();
    bytes.Byte(); // the record's numbers lie at even places
    record.pictureID = bytes.Short();
    std::unique_ptr<PictPane> pane(new (std::nothrow) PictPane(glog, kNoNumber, &record));
    return pane && pane->GetGlog() ? pane.release() : nullptr;
}

} // namespace

void AddGraphicItems(ItemRegistry &registry) {
    TreeDump::AddDescriber(DescribeProgressBar);
    TreeDump::AddDescriber(DescribePicture);
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
    registry.Add(ItemType("Picture")
                     .Keys(KeyList()
                               .Rect("BoundsRect")
                               .Flag("PicUseImageSize")
                               .String("ResIDName")
                               .Required()
                               .Flag("PicAllowClickThrough"))
                     .MadeBy(MakePicture)
                     .ReportedBy(ReportClicks)
                     .FromRecord(gpicResRec::kKind, ItemType::kWholeKind, MakePictureFromRecord));
}
