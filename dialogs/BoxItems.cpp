// Boxes and box selections in dialogs.
#include "buttons/BoxPane.h"
#include "buttons/BoxSelectPane.h"
#include "desktop/observe/MessageTrace.h"
#include "desktop/observe/TreeDump.h"
#include "dialogs/ItemRegistry.h"
#include "dialogs/KeyFault.h"
#include "dialogs/MessageReporter.h"
#include "dialogs/RecordBytes.h"
#include "dialogs/StockItems.h"
#include "frame/ResourceReading.h"
#include "host/GlogStyleSheet.h"
#include <limits>

namespace {

long long const kLargestByte = 255;
long long const kMostBoxes = std::numeric_limits<short>::max();

void RequireBoxCount(long long count) {
    if (count < 1 || count > kMostBoxes)
        throw KeyFault("RectList", "expected 1 to " + std::to_string(kMostBoxes) + " boxes, found " +
                                       std::to_string(count));
}

class BoxReporter : public MessageReporter<BoxSelectPaneListener> {
public:
    using MessageReporter::MessageReporter;
    void BoxValueChanged(BoxSelectPane *pane, short index, bool value) override {
        if (MessageTrace::On())
            MessageTrace::Write(MessageTrace::Begin(*pane)
                                    .Text("message", std::string("BoxValueChanged"))
                                    .Integer("index", index)
                                    .Flag("value", value));
    }
};

void ReportBoxes(GlogPane *pane) {
    if (BoxSelectPane *selection = dynamic_cast<BoxSelectPane *>(pane))
        new BoxReporter(selection);
}

bool DescribeSelection(GlogPane &pane, JsonLine &line) {
    BoxSelectPane *const selection = dynamic_cast<BoxSelectPane *>(&pane);
    if (!selection)
        return false;
    std::string values;
    for (short i = 0; i < selection->GetNumBoxes(); ++i)
        values += (i ? "," : "") + std::string(selection->ReadOne(i) ? "true" : "false");
    line.Raw("values", '[' + values + ']').Integer("current", selection->RadGet());
    return true;
}

GlogPane *MakeBox(glogRec *glog, GlogStyleSheet *sheet) { return new BoxPane(glog, sheet); }

GlogPane *MakeSelection(glogRec *glog, GlogStyleSheet *sheet) {
    RequireBoxCount(static_cast<long long>(sheet->GetContainerItem(ResourceKey("RectList"))->GetNumItems()));
    return BoxSelectPane::NewBoxSelectPane(glog, sheet->GetItemRes());
}

GlogPane *MakeSelectionFromRecord(glogRec *glog, RecordBytes &bytes) {
    boxSelResRec record;
    record.kind = bytes.Short();
    record.numBoxes = bytes.Short();
    record.style = bytes.Byte();
    record.multiple = bytes.Byte();
    RequireBoxCount(record.numBoxes);
    return BoxSelectPane::NewBoxSelectPane(glog, &record);
}

} // namespace

void AddBoxItems(ItemRegistry &registry) {
    TreeDump::AddDescriber(DescribeSelection);
    registry.Add(ItemType("Box").Keys(KeyList().Rect("BoundsRect")).MadeBy(MakeBox));
    registry.Add(ItemType("BoxSelect")
                     .Keys(KeyList()
                               .Integer("Style", 0, kLargestByte)
                               .Integer("Mode", 0, kLargestByte)
                               .Container("RectList", KeyList().Rect("Box").Required().Repeated())
                               .Required())
                     .MadeBy(MakeSelection)
                     .FromRecord(boxSelResRec::kKind, ItemType::kWholeKind, MakeSelectionFromRecord)
                     .ReportedBy(ReportBoxes));
}
