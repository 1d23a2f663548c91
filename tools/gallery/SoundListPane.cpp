#include "tools/gallery/SoundListPane.h"
#include "frame/ResourceReading.h"
#include "host/EventRecordAdapter.h"
#include "host/GlogStyleSheet.h"
#include "host/NamedColors.h"
#include "host/OSFont.h"
#include "host/PortSavers.h"
#include "host/TextLayout.h"
#include "host/VelaDrawing.h"
#include "lists/GListPane.h"
#include "scrolling/ScrollBarPane.h"
#include "text/SearchFieldPane.h"
#include "tools/gallery/LabelText.h"
#include "tools/gallery/Phrases.h"
#include <algorithm>
#include <boost/make_shared.hpp>
#include <memory>
#include <new>

namespace {

short const kBarThickness = 16, kLineHeight = 20; // pixels, as everything here
int const kMargin = 10, kLengthWidth = 48;
short const kListID = 995, kBarID = 996;
int const kRowFont = 0; // index in the font table
int const kCentredVertically = 1;
int const kNoRow = -1;

short Pixel(int value) { return static_cast<short>(value); }

void DrawText(UString const &text, Rect const &box, TextSettings::Alignment alignment) {
    DrawStringInRect(text, box, alignment, TextSettings::kTruncateEnd, kCentredVertically, 0, 0, 0.0f, 1.0f,
                     1.0f, 0.0f);
}

} // namespace

SoundListPane *SoundListPane::NewSoundListPane(glogRec *owner, GlogStyleSheet *sheet) {
    Rect box = OptionalRect(sheet->GetItemRes(), "BoundsRect");
    std::unique_ptr<SoundListPane> pane(new (std::nothrow) SoundListPane(sheet));
    if (!pane || !pane->CompoundPaneInit(owner, 0) || !pane->AddParts())
        return nullptr;
    pane->SetBox(&box);
    return pane.release();
}

SoundListPane::SoundListPane(GlogStyleSheet *sheet)
    : fieldID(sheet->GetSInt32ItemValue(ResourceKey("CmdID")))
    , foundID(sheet->GetSInt32ItemValue(ResourceKey("TextID")))
    , chosenID(sheet->GetSInt32ItemValue(ResourceKey("CmdClassID"))) {
    SetNoErase(1);
}

bool SoundListPane::AddParts() {
    glistResRec record = glistResRec();
    record.type = glistResRec::kType;
    record.selMode = kListSelectOne;
    record.lineHeight = kLineHeight;
    list = GListPane::NewGListPane(GetGlog(), &record);
    bar = new (std::nothrow) ScrollBarPane(GetGlog(), 0, 0, 0);
    if (!list || !bar)
        return false;
    list->SetID(kListID);
    bar->SetID(kBarID);
    Add(list, -1);
    Add(bar, -1);
    list->SetScrollBar(bar);
    list->SetColumnList(boost::make_shared<ColumnList>(short(1)));
    list->SetLineDrawer(this, false);
    list->SetNumItems(sounds.CountFound());
    list->SetSelectionListener(this);
    return true;
}

// The frames of list and bar lie on each other.
void SoundListPane::SetBox(Rect *box) {
    CompoundPane::SetBox(box);
    if (!list)
        return;
    short const width = Pixel(box->right - box->left), height = Pixel(box->bottom - box->top);
    short const right = Pixel(width - kBarThickness + 1);
    Rect rows = {0, 0, height, right}, beside = {0, Pixel(right - 1), height, width};
    list->SetBox(&rows);
    bar->SetBox(&beside);
    boost::shared_ptr<ColumnList> const column = boost::make_shared<ColumnList>(short(1));
    column->SetBothEdges(0, 0, std::max<int>(right, 0));
    list->SetColumnList(column);
}

void SoundListPane::GlogItemInit() {
    CompoundPane::GlogItemInit();
    if (!container)
        return;
    if (SearchFieldPane *const field = dynamic_cast<SearchFieldPane *>(container->FindByID(fieldID)))
        SearchFieldPane_Listener::DependUpon(field);
    TellFound();
    TellChosen();
}

// What the field tells

// A key that changes nothing leaves the list as it is.
void SoundListPane::TextChanged(UString const &text) {
    if (!(text == search))
        Narrow(text);
}

void SoundListPane::SearchIsCanceled() { TextChanged(UString()); }

void SoundListPane::Narrow(UString const &text) {
    search = text;
    sounds.Search(text);
    list->SetSelRange(kNoRow, kNoRow);
    list->SetNumItems(sounds.CountFound());
    list->SetScrollPosition(0);
    list->Inval();
    TellFound();
    TellChosen();
}

void SoundListPane::HandleSpecialKey(EventRecordAdapter *event) {
    int const last = sounds.CountFound() - 1, current = list->GetFirstSelectedItem();
    if (last >= 0)
        Choose(UpArrowKey(event) ? std::max(current - 1, 0) : std::min(current + 1, last));
}

void SoundListPane::Choose(int row) {
    list->SetSelRange(row, row);
    int const first = list->GetScrollPos(), full = list->NumFullyDisplayedLines();
    if (row < first)
        list->SetScrollPosition(row);
    else if (row >= first + full)
        list->SetScrollPosition(row - full + 1);
    TellChosen();
}

void SoundListPane::SelectionDone(GListPane *) { TellChosen(); }

void SoundListPane::TellFound() {
    LabelText::Show(container->FindByID(foundID),
                    Phrases::Fill(Phrase::kSoundsFound, {LabelText::OfThousands(sounds.CountFound()),
                                                         LabelText::OfThousands(SoundNames::kCount)}));
}

void SoundListPane::TellChosen() {
    int row = 0;
    bool const isChosen =
        list->NumSelected() > 0 && list->GetFirstSelectedItem(row) && row < sounds.CountFound();
    LabelText::Show(container->FindByID(chosenID),
                    isChosen ? sounds.Name(row) : Phrases::Get(Phrase::kNothingChosen));
}

// Drawing

void SoundListPane::DrawBackgroundGuts(OSRgn *) {
    SaveColors const colors;
    Rect const box = GetDrawRectangle();
    VelaDrawing::RGBForeColor(kScrollBarBorderColor);
    VelaDrawing::FrameRect(&box);
}

// In the chosen row the match would have the colour that the list has painted.
void SoundListPane::DrawLine(int line, Rect *rowBox, bool hilite) {
    if (line >= sounds.CountFound())
        return;
    SaveColors const colors;
    SaveTextState const state;
    SetFontData(GetIndVelaFont(kRowFont));
    Rect name = *rowBox, length = *rowBox;
    name.left = Pixel(name.left + kMargin);
    length.right = Pixel(length.right - kMargin);
    length.left = name.right = Pixel(length.right - kLengthWidth);
    if (!hilite)
        SearchFieldPane::MaybeHiliteSearchString(search, sounds.Name(line), name);
    list->SetupColors();
    DrawText(sounds.Name(line), name, TextSettings::kAlignLeft);
    if (!hilite)
        VelaDrawing::RGBForeColor(kDialogListInactiveTextColor);
    DrawText(sounds.Length(line), length, TextSettings::kAlignRight);
}
