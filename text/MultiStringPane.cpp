#include "text/MultiStringPane.h"
#include "frame/ResourceReading.h"
#include "host/GlogStyleSheet.h"
#include "host/NamedColors.h"
#include "host/PortSavers.h"
#include "host/TextLayout.h"
#include "host/VelaDrawing.h"
#include "text/FontIndex.h"
#include "text/ItemSize.h"

namespace {

int const kNone = -1;
int const kNoLimit = -1; // to a text's width
int const kCentredInHeight = 1, kOneLine = 0, kUpright = 0;

void SelectStringOf(MultiStringPane *pane, int index) { pane->SelectString(index); }

} // namespace

void (*gstrSetIndStr)(MultiStringPane *, int) = SelectStringOf;

MultiStringPane::MultiStringPane()
    : lineSpacing(0)
    , origin()
    , current(kNone)
    , font(0)
    , alignment(0) {}

MultiStringPane::~MultiStringPane() {}

MultiStringPane *MultiStringPane::NewMultiStringPane(glogRec *owner, int id, GlogStyleSheet *sheet) {
    MultiStringPane *const pane = new MultiStringPane;
    pane->GlogPaneInit(owner, static_cast<short>(id));
    pane->GetFromXML(sheet);
    return pane;
}

void MultiStringPane::GetFromXML(GlogStyleSheet *sheet) {
    origin = XMLLib::GetPoint(sheet->GetItemRes(), ResourceKey("Origin"));
    font = FontIndexFromFSRID(sheet->GetSInt32ItemValue(ResourceKey("FSRID")));
    alignment = sheet->GetSInt32ItemValue(ResourceKey("Align"));
    boost::shared_ptr<XMLLib::ContainerItem> const list = sheet->GetContainerItem(ResourceKey("TextList"));
    std::size_t const count = list->GetNumItems();
    lineSpacing = sheet->GetSInt32ItemValue(ResourceKey("LineSpacing"));
    ItemSize::SetHeight(*this, lineSpacing);
    for (std::size_t i = 0; i < count; ++i)
        strings.push_back(XMLLib::UStringFromItem(list->GetNthItem(i))->Get());
}

void MultiStringPane::SelectString(int index) {
    if (index == current)
        return;
    SaveTextState const textState;
    SetFontData(GetIndVelaFont(font));
    current = index;
    Inval(); // the old area
    ItemSize::SetWidth(*this, LooseStringWidth(Current(), 0.0f, 1.0f));
    Inval(); // the new one
}

void MultiStringPane::GetCurrentString(UString &out) const { out = Current(); }

// In a layout always at the left, whatever the alignment is.
void MultiStringPane::DrawGuts(OSRgn *) {
    SaveTextState const textState;
    SaveColors const colors;
    VelaDrawing::RGBForeColor(kDialogActiveTextColor);
    SetFontData(GetIndVelaFont(font));
    if (IsInLayout())
        DrawStringInRect(Current(), GetDrawRectangle(), TextSettings::kAlignLeft, TextSettings::kTruncateNone,
                         kCentredInHeight, kOneLine, kUpright, 0.0f, 1.0f, 1.0f, 0.0f);
    else
        DrawStringAtPoint(Current(), origin, kNoLimit, TextSettings::kTruncateNone);
}
