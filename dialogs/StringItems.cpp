// Text that is only read, in dialogs: plain, styled, in groups, and one string out of several.
#include "desktop/observe/TreeDump.h"
#include "dialogs/ItemRegistry.h"
#include "dialogs/KeyFault.h"
#include "dialogs/StockItems.h"
#include "frame/ResourceReading.h"
#include "host/GlogStyleSheet.h"
#include "host/PortSavers.h"
#include "host/RGBColor.h"
#include "host/glogRec.h"
#include "text/FontIndex.h"
#include "text/ItemSize.h"
#include "text/MultiStringPane.h"
#include "text/StringGroupPane.h"
#include "text/StyledStringPane.h"
#include "text/TextPane.h"
#include <algorithm>
#include <memory>
#include <string>

namespace {

typedef boost::shared_ptr<XMLLib::ContainerItem> Container;

short const kNoNumber = 0; // the loader numbers what it makes
long long const kLargestByte = 255;
long long const kLargestSpacing = 1000; // pixels
long long const kLargestIndex = 32767;
long long const kLastAlignment = 2;
long long const kLargestFace = 63, kSmallestSize = 1, kLargestSize = 512;
long long const kLargestComponent = 65535;
UString const &BoundsKey() {
    static UString const key = ResourceKey("BoundsRect");
    return key;
}

int Number(Container const &item, char const *key) {
    return static_cast<int>(item->GetSIntItemValue(ResourceKey(key)));
}

int LineHeight(fontSaveRec const &font) {
    SaveTextState const state;
    SetFontData(&font);
    TarnQuickDrawText::FontInfo info;
    tarn::GetFontInfo(info);
    return info.ascent + info.descent;
}

void TakeBounds(GlogPane &pane, Container const &item) {
    if (!item->GetContainerItem(BoundsKey()))
        return;
    Rect bounds = XMLLib::GetRect(item, BoundsKey());
    pane.SetBox(&bounds);
}

// Plain text. The pane leaves the height to the layout, where a line of no height would be laid out as none.

GlogPane *MakeText(glogRec *glog, GlogStyleSheet *sheet) {
    Container const item = sheet->GetItemRes();
    TextPane *const pane = new TextPane(glog, item, false);
    Rect const bounds = XMLLib::GetRect(item, BoundsKey());
    int const line = LineHeight(*GetIndVelaFont(FontIndexFromFSRID(Number(item, "FSRID"))));
    ItemSize::SetHeight(*pane, std::max(bounds.bottom - bounds.top, line));
    pane->SetEnable(Number(item, "GrayText") == 0);
    return pane;
}

bool DescribeText(GlogPane &pane, JsonLine &line) {
    TextPane *const text = dynamic_cast<TextPane *>(&pane);
    if (!text)
        return false;
    line.Text("text", text->GetText()).Flag("enabled", text->GetEnable());
    return true;
}

// Styled text

fontSaveRec FontOf(Container const &part) {
    fontSaveRec font = *GetIndVelaFont(FontIndexFromFSRID(Number(part, "FSRID")));
    if (part->GetSInt32Item(ResourceKey("Face")))
        font.face = static_cast<short>(Number(part, "Face"));
    if (part->GetSInt32Item(ResourceKey("Size")))
        font.size = static_cast<short>(Number(part, "Size"));
    return font;
}

AutoPtr<StyledStringItem> PartOf(Container const &part) {
    UString const text = part->GetUStringItemValue(ResourceKey("Text"));
    Container const described = part->GetContainerItem(ResourceKey("Color"));
    if (!described)
        return NewStyledText(text, FontOf(part), nullptr);
    RGBColor const color = {static_cast<unsigned short>(Number(described, "Red")),
                            static_cast<unsigned short>(Number(described, "Green")),
                            static_cast<unsigned short>(Number(described, "Blue"))};
    return NewStyledText(text, FontOf(part), &color);
}

GlogPane *MakeStyledText(glogRec *glog, GlogStyleSheet *sheet) {
    Container const item = sheet->GetItemRes();
    StyledStringPane *const pane = new StyledStringPane(glog, kNoNumber, Number(item, "KeepRight") != 0);
    TakeBounds(*pane, item);
    pane->SetAlignment(Number(item, "Align"));
    pane->SetEraseBackground(Number(item, "Erase") != 0);
    AutoPtr<StyledString> whole(new StyledString);
    Container const parts = item->GetContainerItem(ResourceKey("Parts"));
    int height = 0;
    for (std::size_t i = 0; i < parts->GetNumItems(); ++i) {
        Container const part = XMLLib::ContainerFromItem(parts->GetNthItem(i));
        whole->Add(PartOf(part));
        height = std::max(height, LineHeight(FontOf(part)));
    }
    pane->AdoptStyledString(whole);
    GlogStyleSheet *const common = glog->GetStyleSheet();
    if (!common || common->GetSInt32ItemValue(ResourceKey("GStyledString_LineSpacing")) == 0)
        ItemSize::SetHeight(*pane, height);
    return pane;
}

// Groups of strings

GlogPane *MakeStringGroup(glogRec *glog, GlogStyleSheet *sheet) {
    SavePortAndClip const port;
    SaveTextState const state; // the pane leaves its font in the port
    return StringGroupPane::NewStringGroupPane(glog, kNoNumber, sheet);
}

bool DescribeStringGroup(GlogPane &pane, JsonLine &line) {
    StringGroupPane *const group = dynamic_cast<StringGroupPane *>(&pane);
    if (!group)
        return false;
    line.Integer("strings", static_cast<long long>(group->CountStrings()));
    for (std::size_t i = 0; i < group->CountStrings(); ++i)
        line.Text(("text" + std::to_string(i)).c_str(), group->StringAt(i));
    return true;
}

// One string out of several. A pane without a chosen string must not be drawn, so one is chosen here.

GlogPane *MakeMultiString(glogRec *glog, GlogStyleSheet *sheet) {
    Container const item = sheet->GetItemRes();
    std::size_t const count = item->GetContainerItem(ResourceKey("TextList"))->GetNumItems();
    std::size_t const current = static_cast<std::size_t>(Number(item, "Current"));
    if (count < 1)
        throw KeyFault("TextList", "expected at least one string");
    if (current >= count)
        throw KeyFault("Current", "there is no string " + std::to_string(current) + ": the list has " +
                                      std::to_string(count) + ", counted from 0");
    MultiStringPane *const pane = MultiStringPane::NewMultiStringPane(glog, kNoNumber, sheet);
    TakeBounds(*pane, item);
    if (!sheet->HasSInt32ItemValue(ResourceKey("LineSpacing")))
        ItemSize::SetHeight(*pane, LineHeight(*GetIndVelaFont(FontIndexFromFSRID(Number(item, "FSRID")))));
    pane->SelectString(static_cast<int>(current));
    return pane;
}

bool DescribeMultiString(GlogPane &pane, JsonLine &line) {
    MultiStringPane *const strings = dynamic_cast<MultiStringPane *>(&pane);
    if (!strings || strings->CurrentIndex() < 0)
        return false;
    UString text;
    strings->GetCurrentString(text);
    line.Text("text", text).Integer("current", strings->CurrentIndex());
    return true;
}

KeyList PartKeys() {
    return KeyList()
        .String("Text")
        .Required()
        .Integer("FSRID", 0, kLargestByte)
        .Integer("Face", 0, kLargestFace)
        .Integer("Size", kSmallestSize, kLargestSize)
        .Attributes("Color", KeyList()
                                 .Integer("red", 0, kLargestComponent)
                                 .As("Red")
                                 .Integer("green", 0, kLargestComponent)
                                 .As("Green")
                                 .Integer("blue", 0, kLargestComponent)
                                 .As("Blue"));
}

} // namespace

void AddStringItems(ItemRegistry &registry) {
    TreeDump::AddDescriber(DescribeText);
    TreeDump::AddDescriber(DescribeStringGroup);
    TreeDump::AddDescriber(DescribeMultiString);
    registry.Add(ItemType("Text")
                     .Keys(KeyList()
                               .Integer("FSRID", 0, kLargestByte)
                               .String("Text")
                               .Required()
                               .Flag("WrapText")
                               .Flag("SizeToText")
                               .Integer("Align", 0, kLastAlignment)
                               .Word("Truncate", {"None", "End", "Middle"})
                               .Rect("BoundsRect")
                               .Flag("GrayText"))
                     .MadeBy(MakeText));
    registry.Add(
        ItemType("StyledText")
            .Keys(KeyList()
                      .Rect("BoundsRect")
                      .Integer("Align", 0, kLastAlignment)
                      .Flag("KeepRight")
                      .Flag("Erase")
                      .Container("Parts", KeyList().Container("Part", PartKeys()).Required().Repeated())
                      .Required())
            .MadeBy(MakeStyledText));
    registry.Add(
        ItemType("StringGroup")
            .Keys(
                KeyList()
                    .Integer("FSRID", 0, kLargestByte)
                    .Integer("LineSpacing", 0, kLargestSpacing)
                    .Container("TextList",
                               KeyList()
                                   .Container("Line", KeyList().Point("TextOrigin").String("Text").Required())
                                   .Repeated())
                    .Required())
            .MadeBy(MakeStringGroup));
    registry.Add(ItemType("MultiString")
                     .Keys(KeyList()
                               .Point("Origin")
                               .Integer("FSRID", 0, kLargestByte)
                               .Integer("Align", 0, kLastAlignment)
                               .Container("TextList", KeyList().String("String").Required().Repeated())
                               .Required()
                               .Integer("LineSpacing", 0, kLargestSpacing)
                               .Integer("Current", 0, kLargestIndex)
                               .Rect("BoundsRect"))
                     .MadeBy(MakeMultiString));
}
