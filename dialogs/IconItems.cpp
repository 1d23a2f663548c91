// Icons, icon buttons and strips of icons in dialogs.
#include "buttons/GIconButton.h"
#include "buttons/SuccessiveIconsPane.h"
#include "buttons/TrackSelectorButtonPane.h"
#include "buttons/TwistDownButton.h"
#include "desktop/observe/MessageTrace.h"
#include "desktop/observe/TreeDump.h"
#include "dialogs/IconFamilyKey.h"
#include "dialogs/ItemRegistry.h"
#include "dialogs/KeyFault.h"
#include "dialogs/MessageReporter.h"
#include "dialogs/PressReporter.h"
#include "dialogs/RecordBytes.h"
#include "dialogs/StockItems.h"
#include "frame/ResourceReading.h"
#include "host/GlogStyleSheet.h"

namespace {

long long const kLargestByte = 255;
short const kTrackSelectorWidth = 15, kTrackSelectorHeight = 16; // pixels

void RequireFamilyUnder(GlogStyleSheet *sheet) {
    RequireIconFamily(sheet->GetUStringItemValue(ResourceKey("FamilyID")), "FamilyID");
}

bool DescribeIcon(GlogPane &pane, JsonLine &line) {
    GIconPane *const icon = dynamic_cast<GIconPane *>(&pane);
    if (!icon)
        return false;
    line.Integer("family", icon->GetFamilyID())
        .Integer("icon", icon->GetIconNum())
        .Integer("state", icon->GetCurState())
        .Flag("enabled", icon->GetEnabled());
    return true;
}

bool DescribeIconButtonPane(GlogPane &pane, JsonLine &line) {
    GIconButtonPane *const button = dynamic_cast<GIconButtonPane *>(&pane);
    if (!button)
        return false;
    line.Integer("state", button->GetState()).Flag("enabled", button->IsEnabled());
    return true;
}

bool DescribeStrip(GlogPane &pane, JsonLine &line) {
    SuccessiveIconsPane *const strip = dynamic_cast<SuccessiveIconsPane *>(&pane);
    if (!strip)
        return false;
    int family = 0, baseIcon = 0, width = 0;
    strip->GetIconData(family, baseIcon, width);
    line.Integer("family", family).Integer("icon", baseIcon).Integer("width", width);
    return true;
}

bool DescribeTwistDown(GlogPane &pane, JsonLine &line) {
    TwistDownButton *const button = dynamic_cast<TwistDownButton *>(&pane);
    if (!button)
        return false;
    line.Flag("open", button->IsOpen());
    return true;
}

class ReleaseReporter : public MessageReporter<TrackSelectorButtonPane_Listener> {
public:
    explicit ReleaseReporter(TrackSelectorButtonPane *source)
        : MessageReporter(source)
        , button(source) {}
    void TrackSelectorButtonReleased() override {
        if (MessageTrace::On())
            MessageTrace::Write(
                MessageTrace::Begin(*button).Text("message", std::string("TrackSelectorButtonReleased")));
    }

private:
    TrackSelectorButtonPane *button; // outlives this object
};

void ReportReleases(GlogPane *pane) {
    if (TrackSelectorButtonPane *button = dynamic_cast<TrackSelectorButtonPane *>(pane))
        new ReleaseReporter(button);
}

void RequireState(GlogStyleSheet *sheet) {
    int const state = sheet->GetSInt32ItemValue(ResourceKey("State"));
    int const last = sheet->GetSInt32ItemValue(ResourceKey("NumStates")) - 1;
    if (state > last)
        throw KeyFault("State", "there is no state " + std::to_string(state) + ": the last one is " +
                                    std::to_string(last));
}

// Creators of their own read neither state nor enabling.
GlogPane *WithLook(GlogStyleSheet *sheet, GIconPane *icon) {
    if (!icon)
        return nullptr;
    gcStateIconSetCurState(icon, sheet->GetSInt32ItemValue(ResourceKey("State")));
    gcStateIconSetEnable(icon, sheet->GetSInt32ItemValue(ResourceKey("Mode")) == 0);
    return icon;
}

GlogPane *MakeIcon(glogRec *glog, GlogStyleSheet *sheet) {
    RequireFamilyUnder(sheet);
    RequireState(sheet);
    return WithLook(sheet, GIconPane::NewGIconPane(glog, sheet->GetItemRes()));
}

GlogPane *MakeIconButton(glogRec *glog, GlogStyleSheet *sheet) {
    RequireFamilyUnder(sheet);
    RequireState(sheet);
    return WithLook(sheet, GIconButton::NewGIconButton(glog, sheet->GetItemRes()));
}

GlogPane *MakeStrip(glogRec *glog, GlogStyleSheet *sheet) {
    RequireFamilyUnder(sheet);
    return SuccessiveIconsPane::NewSuccessiveIconsPane(glog, sheet->GetItemRes());
}

Rect BoxAt(Point origin, short width, short height) {
    return Rect{origin.v, origin.h, static_cast<short>(origin.v + height),
                static_cast<short>(origin.h + width)};
}

GlogPane *MakeTwistDown(glogRec *glog, GlogStyleSheet *sheet) {
    TwistDownButton *const button = TwistDownButton::NewTwistDownButton(glog);
    if (!button)
        return nullptr;
    button->Offset(OptionalPoint(sheet->GetItemRes(), "Origin"));
    gcSetModeBP(button, sheet->GetSInt32ItemValue(ResourceKey("Mode")));
    return button;
}

GlogPane *MakeTrackSelector(glogRec *glog, GlogStyleSheet *sheet) {
    TrackSelectorButtonPane *const button = new TrackSelectorButtonPane(glog);
    Rect box = BoxAt(OptionalPoint(sheet->GetItemRes(), "Origin"), kTrackSelectorWidth, kTrackSelectorHeight);
    button->SetBox(&box);
    return button;
}

void ReadIcon(RecordBytes &bytes, GIconResRec &record) {
    record.kind = bytes.Short();
    record.top = bytes.Short();
    record.left = bytes.Short();
    record.width = bytes.Short();
    record.height = bytes.Short();
    record.family = bytes.Short();
    record.icon = bytes.Short("Num", 0, KeyList::kLargest);
    record.numStates = bytes.Short("NumStates", 1, KeyList::kLargest);
    record.canDisable = bytes.Short();
}

GlogPane *MakeIconFromRecord(glogRec *glog, RecordBytes &bytes) {
    GIconResRec record;
    ReadIcon(bytes, record);
    return GIconPane::NewGIconPane(glog, &record);
}

GlogPane *MakeIconButtonFromRecord(glogRec *glog, RecordBytes &bytes) {
    GIconButtonResRec record;
    ReadIcon(bytes, record);
    record.numDownStates = bytes.Short("NumDownStates", 1, KeyList::kLargest);
    record.canCancel = bytes.Byte();
    record.notifyWindow = bytes.Byte();
    record.cmdClassID = bytes.Short();
    record.optCmdClassID = bytes.Short();
    record.cmdID = bytes.Short();
    record.optCmdID = bytes.Short();
    return GIconButton::NewGIconButton(glog, &record);
}

GlogPane *MakeStripFromRecord(glogRec *glog, RecordBytes &bytes) {
    SuccessiveIconsResRec record;
    record.kind = bytes.Short();
    record.bounds = bytes.ReadRect();
    bytes.Short(); // fills up to a multiple of four bytes
    record.family = bytes.Long();
    record.baseIcon = bytes.Long("BaseIcon", 0, KeyList::kLargest);
    record.width = bytes.Long("Width", 1, KeyList::kLargest);
    return new SuccessiveIconsPane(glog, &record);
}

KeyList IconKeys() {
    return KeyList()
        .Rect("BoundsRect")
        .String("FamilyID")
        .Required()
        .Integer("Num", 0, KeyList::kLargest)
        .Integer("NumStates", 1, KeyList::kLargest)
        .Required()
        .Flag("CanDisable")
        .Integer("State", 0, KeyList::kLargest)
        .Flag("Mode");
}

KeyList IconButtonKeys() {
    return IconKeys()
        .Integer("NumDownStates", 1, KeyList::kLargest)
        .Required()
        .Flag("CanCancel")
        .Flag("NotifyWindow")
        .Integer("CmdClassID")
        .Integer("CmdID")
        .Integer("OptCmdClassID")
        .Integer("OptCmdID");
}

} // namespace

void AddIconItems(ItemRegistry &registry) {
    TreeDump::AddDescriber(DescribeIcon);
    TreeDump::AddDescriber(DescribeIconButtonPane);
    TreeDump::AddDescriber(DescribeStrip);
    TreeDump::AddDescriber(DescribeTwistDown);
    registry.Add(ItemType("Icon")
                     .Keys(IconKeys())
                     .MadeBy(MakeIcon)
                     .FromRecord(GIconResRec::kKind, ItemType::kWholeKind, MakeIconFromRecord));
    registry.Add(ItemType("IconButton")
                     .Keys(IconButtonKeys())
                     .MadeBy(MakeIconButton)
                     .FromRecord(GIconButtonResRec::kKind, ItemType::kWholeKind, MakeIconButtonFromRecord));
    registry.Add(ItemType("SuccessiveIcons")
                     .Keys(KeyList()
                               .Rect("BoundsRect")
                               .String("FamilyID")
                               .Required()
                               .Integer("BaseIcon", 0, KeyList::kLargest)
                               .Integer("Width", 1, KeyList::kLargest)
                               .Required())
                     .MadeBy(MakeStrip)
                     .FromRecord(SuccessiveIconsResRec::kKind, ItemType::kWholeKind, MakeStripFromRecord));
    registry.Add(ItemType("TwistDown")
                     .Keys(KeyList().Point("Origin").Integer("Mode", 0, kLargestByte))
                     .MadeBy(MakeTwistDown)
                     .ReportedBy(ReportPresses));
    registry.Add(ItemType("TrackSelector")
                     .Keys(KeyList().Point("Origin"))
                     .MadeBy(MakeTrackSelector)
                     .ReportedBy(ReportReleases));
}
