#include "text/TextPane.h"
#include "frame/ResourceReading.h"
#include "host/NamedColors.h"
#include "host/PortSavers.h"
#include "host/VelaDrawing.h"
#include "host/glogRec.h"
#include "text/FontIndex.h"
#include "text/ItemSize.h"

namespace {

int const kDefaultFont = 0;
int const kAtTop = 0, kCentred = 1; // in the height of the rectangle

int FontOf(XMLLib::ContainerItem const &item) {
    boost::shared_ptr<XMLLib::SIntItem> const number = item.GetSInt32Item(ResourceKey("FSRID"));
    return number ? FontIndexFromFSRID(static_cast<int>(number->Get())) : kDefaultFont;
}

TextSettings::Alignment AlignmentOf(XMLLib::ContainerItem const &item) {
    switch (static_cast<short>(item.GetSIntItemValue(ResourceKey("Align")))) {
    case 1:
        return TextSettings::kAlignRight;
    case 2:
        return TextSettings::kAlignCenter;
    default:
        return TextSettings::kAlignLeft;
    }
}

TextSettings::TruncateCode TruncationOf(XMLLib::ContainerItem const &item) {
    UString const word = item.GetUStringItemValue(ResourceKey("Truncate"));
    if (word == ResourceKey("Middle"))
        return TextSettings::kTruncateMiddle;
    return word == ResourceKey("End") ? TextSettings::kTruncateEnd : TextSettings::kTruncateNone;
}

} // namespace

TextPane::TextPane(glogRec *owner, const UString &text_, TextSettings::Alignment alignment_,
                   bool forPrinting_)
    : text(text_)
    , enable(true)
    , font(kDefaultFont)
    , wrapText(false)
    , sizeToText(false)
    , alignment(alignment_)
    , truncation(TextSettings::kTruncateNone)
    , inactiveColor(&kDialogInactiveTextColor)
    , activeColor(&kDialogActiveTextColor)
    , forPrinting(forPrinting_) {
    GlogPaneInit(owner, 0);
    SetItemWidth(GetTextWidth());
}

TextPane::TextPane(glogRec *owner, boost::shared_ptr<XMLLib::ContainerItem> item, bool forPrinting_)
    : text(item->GetUStringItemValue(ResourceKey("Text")))
    , enable(true)
    , font(FontOf(*item))
    , wrapText(item->GetSIntItemValue(ResourceKey("WrapText")) != 0)
    , sizeToText(item->GetSIntItemValue(ResourceKey("SizeToText")) != 0)
    , alignment(AlignmentOf(*item))
    , truncation(TruncationOf(*item))
    , inactiveColor(&kDialogInactiveTextColor)
    , activeColor(&kDialogActiveTextColor)
    , forPrinting(forPrinting_) {
    GlogPaneInit(owner, 0);
    UString const boundsKey = ResourceKey("BoundsRect");
    if (!item->GetContainerItem(boundsKey)) {
        SetItemWidth(GetTextWidth());
        return;
    }
    Rect bounds = XMLLib::GetRect(item, boundsKey);
    GlogPane::SetBox(&bounds);
    SetItemWidth(bounds.right - bounds.left);
}

TextPane::~TextPane() {}

void TextPane::SetItemWidth(int pixels) { ItemSize::SetWidth(*this, pixels); }

int TextPane::VerticalAlignment() const { return wrapText ? kAtTop : kCentred; }

int TextPane::GetTextWidth() const {
    UpdateTextLayout(layout, text, font, alignment, truncation, VerticalAlignment(), Wrapping(), 0, 0, 0.0f,
                     1.0f, 1.0f);
    return static_cast<int>(layout.GetWidth());
}

void TextPane::SetText(const UString &newText) {
    if (newText == text)
        return;
    text = newText;
    if (sizeToText) {
        Inval(); // the old place: the width may change it
        SetItemWidth(GetTextWidth());
    }
    Inval();
}

void TextPane::SetEnable(bool enables) {
    if (enables == enable)
        return;
    enable = enables;
    Inval();
}

void TextPane::SetColors(RGBColor &active, RGBColor &inactive) {
    activeColor = &active;
    inactiveColor = &inactive;
}

void TextPane::SetTruncation(TextSettings::TruncateCode code) {
    if (code == truncation)
        return;
    truncation = code;
    Inval();
}

void TextPane::SetupFont() const { VelaDrawing::RGBForeColor(enable ? *activeColor : *inactiveColor); }

void TextPane::DrawGuts(OSRgn *) {
    SaveColors const colors;
    Prepare();
    Rect const place = GetDrawRectangle();
    SetupFont();
    DrawTextLayoutInRect(layout, text, place, font, alignment, truncation, VerticalAlignment(), Wrapping(), 0,
                         0, 0.0f, 1.0f, 1.0f);
}
