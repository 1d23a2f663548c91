// Push buttons in dialogs.
#include "buttons/FrameButtonPane.h"
#include "buttons/OvalButtonPane.h"
#include "buttons/StudButtonPane.h"
#include "desktop/observe/TreeDump.h"
#include "dialogs/IconFamilyKey.h"
#include "dialogs/ItemRegistry.h"
#include "dialogs/KeyFault.h"
#include "dialogs/PressReporter.h"
#include "dialogs/RecordBytes.h"
#include "dialogs/StockItems.h"
#include "frame/ResourceReading.h"
#include "host/GlogStyleSheet.h"
#include <string>

namespace {

long long const kLargestMode = 255; // a mode is a byte
int const kOvalLayoutType = 18;

UString TextUnder(GlogStyleSheet *sheet, char const *key) {
    return sheet->GetUStringItemValue(ResourceKey(key));
}

int NumberUnder(GlogStyleSheet *sheet, char const *key) {
    return sheet->GetSInt32ItemValue(ResourceKey(key));
}

bool DescribeButton(GlogPane &pane, JsonLine &line) {
    GlogButtonPane *const button = dynamic_cast<GlogButtonPane *>(&pane);
    if (!button)
        return false;
    if (FrameButtonPane *framed = dynamic_cast<FrameButtonPane *>(button)) {
        line.Integer("state", framed->GetState());
        return true;
    }
    UString label;
    button->GetButtonText(label);
    line.Text("text", label);
    return true;
}

// Creators of their own read no mode.
void SetModeFrom(GlogStyleSheet *sheet, GlogButtonPane *button) {
    gcSetModeBP(button, NumberUnder(sheet, "Mode"));
}

// A number that no label has would leave the button without one.
void RequireLabel(GlogButtonPane *button, GlogStyleSheet *sheet, char const *key) {
    UString label;
    button->GetButtonText(label);
    if (label.empty() && NumberUnder(sheet, key) != 0)
        throw KeyFault(key, "there is no label of the number " + std::to_string(NumberUnder(sheet, key)));
}

GlogPane *MakeOval(glogRec *glog, GlogStyleSheet *sheet) {
    UString const text = TextUnder(sheet, "ButtonText");
    OvalButtonPane *const button = OvalButtonPane::NewOvalButtonPane(glog, sheet);
    if (!button)
        return nullptr;
    if (!text.empty())
        button->SetButtonText(text);
    RequireLabel(button, sheet, "TextNum");
    return button;
}

GlogPane *MakeStud(glogRec *glog, GlogStyleSheet *sheet) {
    UString const text = TextUnder(sheet, "ButtonText");
    StudButtonPane *const button = StudButtonPane::NewStudButtonPane(glog, sheet);
    if (!button)
        return nullptr;
    if (!text.empty())
        button->SetLabel(text);
    RequireLabel(button, sheet, "TextID");
    SetModeFrom(sheet, button);
    return button;
}

GlogPane *MakeFrame(glogRec *glog, GlogStyleSheet *sheet) {
    RequireIconFamily(TextUnder(sheet, "ISetID"), "ISetID");
    FrameButtonPane *const button = FrameButtonPane::NewFrameButtonPane(glog, sheet->GetItemRes());
    if (!button)
        return nullptr;
    SetModeFrom(sheet, button);
    gfbSetState(button, NumberUnder(sheet, "State") != 0);
    return button;
}

GlogPane *MakeOvalFromRecord(glogRec *glog, RecordBytes &bytes) {
    gobResRec record;
    record.kind = bytes.Short();
    record.top = bytes.Short();
    record.left = bytes.Short();
    record.width = bytes.Short();
    record.text = bytes.Short();
    record.mode = bytes.Short();
    return OvalButtonPane::NewOvalButtonPane(glog, &record);
}

GlogPane *MakeStudFromRecord(glogRec *glog, RecordBytes &bytes) {
    studResRec record;
    record.kind = bytes.Short();
    record.top = bytes.Short();
    record.left = bytes.Short();
    record.text = bytes.Short();
    record.width = bytes.Short();
    return StudButtonPane::NewStudButtonPane(glog, &record);
}

GlogPane *MakeFrameFromRecord(glogRec *glog, RecordBytes &bytes) {
    gfbResRec record;
    record.kind = bytes.Short();
    record.origin = bytes.ReadPoint();
    record.family = bytes.Short();
    record.icon = bytes.Short();
    record.gutsOrigin = bytes.ReadPoint();
    record.downOffset = bytes.Short();
    record.hiliteWhenDown = bytes.Short();
    return FrameButtonPane::NewFrameButtonPane(glog, &record);
}

} // namespace

void AddButtonItems(ItemRegistry &registry) {
    TreeDump::AddDescriber(DescribeButton);
    registry.Add(ItemType("OvalButton")
                     .Keys(KeyList()
                               .Rect("BoundsRect")
                               .Integer("TextNum", 0)
                               .String("ButtonText")
                               .Integer("Mode", 0, kLargestMode))
                     .MadeBy(MakeOval)
                     .FromRecord(gobResRec::kKind, ItemType::kLowByte, MakeOvalFromRecord)
                     .ReportedBy(ReportPresses)
                     .LayoutType(kOvalLayoutType));
    registry.Add(ItemType("StudButton")
                     .Keys(KeyList()
                               .Rect("BoundsRect")
                               .Integer("TextID", 0)
                               .String("ButtonText")
                               .Integer("Mode", 0, kLargestMode))
                     .MadeBy(MakeStud)
                     .FromRecord(studResRec::kKind, ItemType::kWholeKind, MakeStudFromRecord)
                     .ReportedBy(ReportPresses));
    registry.Add(ItemType("FrameButton")
                     .Keys(KeyList()
                               .Point("Origin")
                               .String("ISetID")
                               .Integer("IconID")
                               .Point("GutsOrigin")
                               .Integer("DownOffset")
                               .Integer("HiliteWhenDown")
                               .Integer("Mode", 0, kLargestMode)
                               .Flag("State"))
                     .MadeBy(MakeFrame)
                     .FromRecord(gfbResRec::kKind, ItemType::kWholeKind, MakeFrameFromRecord)
                     .ReportedBy(ReportPresses));
}
