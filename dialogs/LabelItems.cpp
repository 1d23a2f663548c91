// Labels in dialogs.
#include "desktop/observe/TreeDump.h"
#include "dialogs/ItemRegistry.h"
#include "dialogs/RecordBytes.h"
#include "dialogs/StockItems.h"
#include "dialogs/Utf8.h"
#include "frame/ResourceReading.h"
#include "host/GlogStyleSheet.h"
#include "text/LabelPane.h"

namespace {

long long const kLargestByte = 255;
long long const kLargestSpacing = 1000; // pixels

bool DescribeLabel(GlogPane &pane, JsonLine &line) {
    LabelPane *const label = dynamic_cast<LabelPane *>(&pane);
    if (!label)
        return false;
    line.Text("text", label->GetText())
        .Spot("origin", label->GetOrigin())
        .Integer("font", label->GetFontFSRID());
    return true;
}

// The creator sets the item's height also when it is not told one; a line of no height would be laid out as
// none.
void GiveNaturalHeight(LabelPane *label) {
    label->GetLayoutRect()->SetAttribute(GlogLayoutItem::kHeight, label->ItemHeight(),
                                         GlogLayoutItem::kPixels, UString());
}

GlogPane *MakeLabel(glogRec *glog, GlogStyleSheet *sheet) {
    LabelPane *const label = LabelPane::NewLabelPane(glog, sheet);
    if (!label)
        return nullptr;
    if (!sheet->HasSInt32ItemValue(ResourceKey("LineSpacing")))
        GiveNaturalHeight(label);
    label->SetGrayTextMode(sheet->GetSInt32ItemValue(ResourceKey("GrayText")) != 0);
    return label;
}

GlogPane *MakeLabelFromRecord(glogRec *glog, RecordBytes &bytes) {
    gStringResRec record;
    record.kind = bytes.Short();
    record.anchor = bytes.ReadPoint();
    record.font = bytes.Byte();
    record.alignment = bytes.Byte();
    record.reserved = bytes.Short();
    UString const text = Utf8::ToUString(bytes.Rest());
    LabelPane *const label = LabelPane::NewLabelPane(glog, &record);
    if (label)
        label->SetText(text);
    return label;
}

} // namespace

void AddLabelItems(ItemRegistry &registry) {
    TreeDump::AddDescriber(DescribeLabel);
    registry.Add(ItemType("Label")
                     .Keys(KeyList()
                               .Point("Origin")
                               .Integer("FSRID", 0, kLargestByte)
                               .Integer("Align", 0, kLargestByte)
                               .String("Text")
                               .Required()
                               .Integer("LineSpacing", 0, kLargestSpacing)
                               .Flag("GrayText"))
                     .MadeBy(MakeLabel)
                     .FromRecord(gStringResRec::kKind, ItemType::kWholeKind, MakeLabelFromRecord));
}
