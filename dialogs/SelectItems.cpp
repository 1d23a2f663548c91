// Panes that are selected by a click, in dialogs.
#include "buttons/NaturalSize.h"
#include "desktop/observe/TreeDump.h"
#include "dialogs/ItemRegistry.h"
#include "dialogs/StockItems.h"
#include "dialogs/Utf8.h"
#include "frame/ResourceReading.h"
#include "host/GlogStyleSheet.h"
#include "host/VelaDrawing.h"
#include "host/XMLLib.h"
#include "lists/SelectStringPane.h"
#include "scrolling/Truncation.h"
#include <memory>
#include <new>

namespace {

short const kNoNumber = 0; // the loader numbers what it makes

// The tree dump tells of every pane whether it is selected.
bool DescribeSelectString(GlogPane &pane, JsonLine &line) {
    SelectStringPane *const selectable = pane.CastToSelectStringPane();
    if (!selectable)
        return false;
    UString text;
    selectable->GetText(text);
    line.Text("text", text);
    return true;
}

void SelectIfTold(SelectPane &pane, GlogStyleSheet *sheet) {
    if (sheet->GetSInt32ItemValue(ResourceKey("Chosen")) != 0)
        pane.Select(true);
}

GlogPane *MakeSelect(glogRec *glog, GlogStyleSheet *sheet) {
    std::unique_ptr<SelectPane> pane(new (std::nothrow) SelectPane);
    if (!pane || !pane->SelectPaneInit(glog, kNoNumber))
        return nullptr;
    Rect box = XMLLib::GetRect(sheet->GetItemRes(), ResourceKey("BoundsRect"));
    SetNaturalSize(*pane, box.right - box.left, box.bottom - box.top);
    pane->SetBox(&box);
    SelectIfTold(*pane, sheet);
    return pane.release();
}

GlogPane *MakeSelectString(glogRec *glog, GlogStyleSheet *sheet) {
    UString const text = sheet->GetUStringItemValue(ResourceKey("Text"));
    Point const origin = OptionalPoint(sheet->GetItemRes(), "Origin");
    std::unique_ptr<SelectStringPane> pane(new (std::nothrow) SelectStringPane(glog, kNoNumber, text));
    if (!pane || !pane->GetGlog())
        return nullptr;
    Rect box = pane->GetBounds();
    VelaDrawing::OffsetRect(&box, Pixel16(origin.h - box.left), Pixel16(origin.v - box.top));
    pane->SetBox(&box);
    SelectIfTold(*pane, sheet);
    return pane.release();
}

} // namespace

void AddSelectItems(ItemRegistry &registry) {
    TreeDump::AddDescriber(DescribeSelectString);
    registry.Add(
        ItemType("Select").Keys(KeyList().Rect("BoundsRect").Required().Flag("Chosen")).MadeBy(MakeSelect));
    registry.Add(ItemType("SelectString")
                     .Keys(KeyList().Point("Origin").String("Text").Required().Flag("Chosen"))
                     .MadeBy(MakeSelectString));
}
