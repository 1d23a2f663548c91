#include "tools/gallery/GalleryItems.h"
#include "buttons/GIconButton.h"
#include "dialogs/ItemRegistry.h"
#include "frame/ResourceReading.h"
#include "host/GlogStyleSheet.h"
#include "host/Icons.h"
#include "menus/PopMPane.h"
#include "tools/gallery/AskButtonPane.h"
#include "tools/gallery/BackdropPane.h"
#include "tools/gallery/ChoiceButtonPane.h"
#include "tools/gallery/ColorMenuPane.h"
#include "tools/gallery/EnvelopePane.h"
#include "tools/gallery/FittedTabsPane.h"
#include "tools/gallery/HoldButtonPane.h"
#include "tools/gallery/LinesPane.h"
#include "tools/gallery/PannerPane.h"
#include "tools/gallery/Phrases.h"
#include "tools/gallery/SoundListPane.h"
#include "tools/gallery/StepperPane.h"
#include "tools/gallery/TakeListPane.h"
#include "tools/gallery/TrackListPane.h"
#include "tools/gallery/WaveViewPane.h"
#include "tools/gallery/WellPane.h"

namespace {

short const kBadgeFamily = 2004;
short const kRestBadge = 0, kPressedBadge = 1, kDisabledBadge = 2;
short const kBadgeSide = 9; // pixels

long long const kMostRows = 1000;
long long const kMostMenuItems = 10000;

// At the upper right corner of the pane, which is a little wider than its icon.
void DrawBadge(glogRec *, Rect box, bool enabled, bool pressed, GIconPane *) {
    short const badge = !enabled ? kDisabledBadge : pressed ? kPressedBadge : kRestBadge;
    Draw1Icon(kBadgeFamily, badge, static_cast<short>(box.right - kBadgeSide), box.top);
}

ItemType BadgeButtonType() {
    ItemType const &plain = *ItemRegistry::Instance().Find("IconButton");
    ItemType::Maker const make = plain.maker;
    return ItemType("BadgeButton").Keys(plain.keys).MadeBy([make](glogRec *glog, GlogStyleSheet *sheet) {
        GlogPane *const pane = make(glog, sheet);
        if (GIconPane *icon = dynamic_cast<GIconPane *>(pane))
            icon->SetDecalProc(DrawBadge);
        return pane;
    });
}

// A pop-up menu of as many bars as the key "Num" says.
GlogPane *MakeBarMenu(glogRec *glog, GlogStyleSheet *sheet) {
    short const kEmptyMenu = 137;
    Rect bounds = OptionalRect(sheet->GetItemRes(), "BoundsRect");
    PopMPane *const pane = PopMPane::NewPopMPane(glog, 0, 0, &bounds, kEmptyMenu);
    int const count = sheet->GetSInt32ItemValue(ResourceKey("Num"));
    for (int bar = 1; pane && bar <= count; ++bar)
        pane->AddItem(Phrases::Fill(Phrase::kBarNumber, {bar}), PopUpMenu::kDashIsText);
    return pane;
}

} // namespace

void GalleryItems::Add() {
    ItemRegistry &registry = ItemRegistry::Instance();
    registry.Add(
        ItemType("Choice")
            .Keys(KeyList().Rect("BoundsRect").String("ButtonText").Required().Integer("Align", 0, 2))
            .MadeBy([](glogRec *glog, GlogStyleSheet *sheet) -> GlogPane * {
                return ChoiceButtonPane::NewChoiceButtonPane(glog, sheet);
            }));
    registry.Add(ItemType("Backdrop")
                     .Keys(KeyList().Rect("BoundsRect").Integer("Num").Required())
                     .MadeBy([](glogRec *glog, GlogStyleSheet *sheet) -> GlogPane * {
                         return BackdropPane::NewBackdropPane(glog, sheet);
                     }));
    registry.Add(ItemType("Stepper")
                     .Keys(KeyList()
                               .Point("Origin")
                               .Integer("TextID")
                               .Required()
                               .Integer("Num")
                               .Integer("CmdClassID")
                               .Integer("CmdID"))
                     .MadeBy([](glogRec *glog, GlogStyleSheet *sheet) -> GlogPane * {
                         return StepperPane::NewStepperPane(glog, sheet);
                     }));
    registry.Add(ItemType("HoldButton")
                     .Keys(KeyList()
                               .Rect("BoundsRect")
                               .String("FamilyID")
                               .Required()
                               .Integer("Num")
                               .Integer("TextID")
                               .Required()
                               .Flag("Mode"))
                     .MadeBy([](glogRec *glog, GlogStyleSheet *sheet) -> GlogPane * {
                         return HoldButtonPane::NewHoldButtonPane(glog, sheet);
                     }));
    registry.Add(ItemType("TrackList")
                     .Keys(KeyList()
                               .Rect("BoundsRect")
                               .Required()
                               .Integer("Num", 0, kMostRows)
                               .Integer("TextID")
                               .Required()
                               .Integer("CmdID")
                               .Required())
                     .MadeBy([](glogRec *glog, GlogStyleSheet *sheet) -> GlogPane * {
                         return TrackListPane::NewTrackListPane(glog, sheet);
                     }));
    registry.Add(ItemType("TakeList")
                     .Keys(KeyList()
                               .Rect("BoundsRect")
                               .Required()
                               .Integer("Num", 0, kMostRows)
                               .Integer("Step", 1, kMostRows)
                               .Integer("Style", 0, 1)
                               .Integer("TextID")
                               .Required()
                               .Integer("CmdID")
                               .Integer("CmdClassID"))
                     .MadeBy([](glogRec *glog, GlogStyleSheet *sheet) -> GlogPane * {
                         return TakeListPane::NewTakeListPane(glog, sheet);
                     }));
    registry.Add(ItemType("SoundList")
                     .Keys(KeyList()
                               .Rect("BoundsRect")
                               .Required()
                               .Integer("CmdID")
                               .Required()
                               .Integer("TextID")
                               .Required()
                               .Integer("CmdClassID")
                               .Required())
                     .MadeBy([](glogRec *glog, GlogStyleSheet *sheet) -> GlogPane * {
                         return SoundListPane::NewSoundListPane(glog, sheet);
                     }));
    registry.Add(ItemType("Well")
                     .Keys(KeyList().Rect("BoundsRect").Required())
                     .MadeBy([](glogRec *glog, GlogStyleSheet *sheet) -> GlogPane * {
                         return WellPane::NewWellPane(glog, sheet);
                     })
                     .HoldsItems());
    registry.Add(ItemType("FittedTabs")
                     .Keys(KeyList()
                               .Rect("BoundsRect")
                               .Required()
                               .Integer("Num")
                               .Required()
                               .Integer("TextID")
                               .Required())
                     .MadeBy([](glogRec *glog, GlogStyleSheet *sheet) -> GlogPane * {
                         return FittedTabsPane::NewFittedTabsPane(glog, sheet);
                     })
                     .ReportedBy(registry.Find("Tabs")->reporter));
    registry.Add(ItemType("AskButton")
                     .Keys(KeyList()
                               .Rect("BoundsRect")
                               .Required()
                               .String("ButtonText")
                               .Required()
                               .Integer("TextID")
                               .Required())
                     .MadeBy([](glogRec *glog, GlogStyleSheet *sheet) -> GlogPane * {
                         return AskButtonPane::NewAskButtonPane(glog, sheet);
                     }));
    registry.Add(ItemType("Lines")
                     .Keys(KeyList().Rect("BoundsRect").Required().Integer("Num", 0, kMostRows).Required())
                     .MadeBy([](glogRec *glog, GlogStyleSheet *sheet) -> GlogPane * {
                         return LinesPane::NewLinesPane(glog, sheet);
                     }));
    registry.Add(BadgeButtonType());
    registry.Add(PannerPane::Type());
    registry.Add(ItemType("Envelope")
                     .Keys(KeyList().Rect("BoundsRect").Required().Integer("TextID").Required())
                     .MadeBy([](glogRec *glog, GlogStyleSheet *sheet) -> GlogPane * {
                         return EnvelopePane::NewEnvelopePane(glog, sheet);
                     }));
    registry.Add(
        ItemType("WaveView")
            .Keys(KeyList().Rect("BoundsRect").Required().Integer("TextID").Required().Integer("CmdID"))
            .MadeBy([](glogRec *glog, GlogStyleSheet *sheet) -> GlogPane * {
                return WaveViewPane::NewWaveViewPane(glog, sheet);
            }));
    registry.Add(
        ItemType("BarMenu")
            .Keys(KeyList().Rect("BoundsRect").Required().Integer("Num", 1, kMostMenuItems).Required())
            .MadeBy(MakeBarMenu));
    registry.Add(ItemType("ColorMenu")
                     .Keys(KeyList().Rect("BoundsRect").Required())
                     .MadeBy([](glogRec *glog, GlogStyleSheet *sheet) -> GlogPane * {
                         return ColorMenuPane::NewColorMenuPane(glog, sheet);
                     }));
}
