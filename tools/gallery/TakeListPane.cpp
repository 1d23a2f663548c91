#include "tools/gallery/TakeListPane.h"
#include "buttons/ButtonGroupPane.h"
#include "buttons/GlogButtonPane.h"
#include "desktop/Desktop.h"
#include "dialogs/Utf8.h"
#include "frame/ResourceReading.h"
#include "host/EventRecordAdapter.h"
#include "host/GlogStyleSheet.h"
#include "host/Icons.h"
#include "host/NamedColors.h"
#include "host/PaneWatch.h"
#include "host/PortSavers.h"
#include "host/TextLayout.h"
#include "host/VelaDrawing.h"
#include "lists/GListPane.h"
#include "scrolling/ScrollBarPane.h"
#include "tools/gallery/LabelText.h"
#include "tools/gallery/ListHeaderPane.h"
#include "tools/gallery/Phrases.h"
#include <algorithm>
#include <filesystem>
#include <initializer_list>
#include <memory>
#include <new>
#include <stdexcept>

namespace {

short const kBarThickness = 16, kLineHeight = 20; // pixels, as everything here
short const kFirstBar = 997;                      // item number
int const kRowFont = 0, kPrintFont = 4;           // indices in the font table
short const kLeastRowOnScreen = 14;               // lower rows are printed ones
int const kMargin = 8;
int const kCentredVertically = 1;
int const kFirstWidths[] = {48, 120, 56, 48};
short const kCheckFamily = 1002, kCheckOn = 4, kCheckOff = 6, kCheckWidth = 12, kCheckHeight = 13;
char const kPrintedFile[] = "takes.pdf";

// What the radio buttons choose, in their order.
GListSelectionMode const kModes[] = {kListSelectOne, kListSelectSeveral, kListSelectToggle,
                                     kListSelectNothing, kListSelectByCode};
short const kModeCount = sizeof kModes / sizeof *kModes;
GListSelectionMode const kFirstMode = kListSelectSeveral;

short Pixel(int value) { return static_cast<short>(value); }

} // namespace

// A click that does not select acts on the row.
class TakeListPane::List : public GListPane {
public:
    explicit List(TakeListPane &owner_)
        : owner(owner_) {}

    bool Init(glogRec *glog, int style) {
        glistResRec record = glistResRec();
        record.type = glistResRec::kType;
        record.selMode = kFirstMode;
        record.lineHeight = kLineHeight;
        record.style = style;
        if (!InitGListPane(glog, &record, 0))
            return false;
        SetSelColumn(kName);
        return true;
    }

protected:
    int HandleClick(EventRecordAdapter *event) override {
        PaneWatch const watch(this);
        int const result = GListPane::HandleClick(event);
        if (!watch.PaneExists())
            return result;
        int line = 0, column = 0;
        GetClickParameters(line, column);
        if (result > 0 && line >= 0 && column >= 0) {
            owner.ActOn(line, column, event->where);
            return -1;
        }
        return result;
    }

private:
    TakeListPane &owner;
};

TakeListPane *TakeListPane::NewTakeListPane(glogRec *owner, GlogStyleSheet *sheet) {
    int const step = std::max(sheet->GetSInt32ItemValue(ResourceKey("Step")), 1);
    int const count = sheet->GetSInt32ItemValue(ResourceKey("Num")) * step;
    std::unique_ptr<TakeListPane> pane(new (std::nothrow) TakeListPane(sheet, count));
    if (!pane || !pane->CompoundPaneInit(owner, 0) || !pane->AddParts())
        return nullptr;
    Rect box = OptionalRect(sheet->GetItemRes(), "BoundsRect");
    pane->SetBox(&box);
    return pane.release();
}

TakeListPane::TakeListPane(GlogStyleSheet *sheet, int count)
    : style(sheet->GetSInt32ItemValue(ResourceKey("Style")))
    , labelID(sheet->GetSInt32ItemValue(ResourceKey("TextID")))
    , modesID(sheet->GetSInt32ItemValue(ResourceKey("CmdID")))
    , printID(sheet->GetSInt32ItemValue(ResourceKey("CmdClassID")))
    , takes(count)
    , columns(new ColumnList(kColumns)) {
    SetNoErase(1);
    Phrase const names[] = {Phrase::kNumberHeading, Phrase::kTakeHeading, Phrase::kLengthHeading,
                            Phrase::kKeepHeading};
    int left = 0;
    for (int column = 0; column < kColumns; ++column) {
        columns->SetName(column, Phrases::Get(names[column]));
        columns->SetColumnMargin(column, kMargin);
        columns->SetBothEdges(column, left, left + kFirstWidths[column]);
        left = columns->GetRightEdge(column);
    }
    columns->SetAlignment(kNumber, TextSettings::kAlignRight);
    columns->SetAlignment(kName, TextSettings::kAlignLeft);
    columns->SetAlignment(kLength, TextSettings::kAlignRight);
    columns->SetAlignment(kKept, TextSettings::kAlignCenter);
}

bool TakeListPane::AddParts() {
    header = ListHeaderPane::NewListHeaderPane(GetGlog(), columns, [this] { list->Inval(); });
    bar = new (std::nothrow) ScrollBarPane(GetGlog(), 0, 0, 0);
    std::unique_ptr<List> made(new (std::nothrow) List(*this));
    if (!header || !bar || !made || !made->Init(GetGlog(), style))
        return false;
    list = made.release();
    bar->SetID(kFirstBar + style);
    for (GlogPane *part : std::initializer_list<GlogPane *>{header, list, bar})
        Add(part, -1);
    list->SetScrollBar(bar);
    list->SetColumnList(columns);
    list->SetLineDrawer(this, false);
    list->SetNumItems(takes.Count());
    list->SetSelectionListener(this);
    return true;
}

void TakeListPane::SetBox(Rect *box) {
    CompoundPane::SetBox(box);
    if (list)
        ArrangeParts(*box);
}

// The frames of headings, list and bar lie on each other.
void TakeListPane::ArrangeParts(Rect const &box) {
    short const width = Pixel(box.right - box.left), height = Pixel(box.bottom - box.top);
    short const right = Pixel(width - kBarThickness + 1), top = ListHeaderPane::kHeight - 1;
    Rect headings = {0, 0, ListHeaderPane::kHeight, width}, rows = {top, 0, height, right};
    Rect beside = {top, Pixel(right - 1), height, width};
    if (style == glistResRec::kSmallStyle) // without a frame of its own
        VelaDrawing::InsetRect(&rows, 1, 1);
    header->SetBox(&headings);
    list->SetBox(&rows);
    bar->SetBox(&beside);
    int const last = kColumns - 1, others = columns->GetLeftEdge(last);
    columns->SetBothEdges(last, others, std::max<int>(right, others));
}

void TakeListPane::GlogItemInit() {
    CompoundPane::GlogItemInit();
    if (!container)
        return;
    if (ButtonGroupPane *modes = dynamic_cast<ButtonGroupPane *>(container->FindByID(modesID)))
        ButtonGroupPaneListener::DependUpon(modes);
    if (GlogButtonPane *button = dynamic_cast<GlogButtonPane *>(container->FindByID(printID)))
        GlogButtonPaneListener::DependUpon(button);
    TellSelected();
}

void TakeListPane::ButtonValueChanged(ButtonGroupPane *, short index, bool value) {
    if (value && index >= 0 && index < kModeCount)
        list->SetSelMode(kModes[index]);
    TellSelected();
}

void TakeListPane::GlogButtonPressed(GlogButtonPane *) { PrintToFile(); }

void TakeListPane::SelectionDone(GListPane *) { TellSelected(); }

void TakeListPane::ActOn(int line, int column, Point where) {
    if (column == kNumber) {
        int const to = list->MoveItem(where);
        if (to < 0)
            return;
        takes.Move(line, to);
        list->Inval(); // also of what scrolled
        Tell(Phrases::Get(Phrase::kRowMoved));
    } else if (column == kKept && list->TrackCol(line, column)) {
        takes.SetKept(line, !takes.IsKept(line));
        list->InvalRow(line);
        Tell(Phrases::Get(takes.IsKept(line) ? Phrase::kTakeIsKept : Phrase::kTakeMayGo));
    }
}

void TakeListPane::PrintToFile() {
    try {
        std::string const path = (std::filesystem::temp_directory_path() / kPrintedFile).string();
        std::string const heading = Utf8::FromUString(Phrases::Get(Phrase::kTakes));
        int const pages = Desktop::Current()->Print(list, path, PrintOptions().Header(heading, "", ""));
        Tell(Phrases::Fill(pages == 1 ? Phrase::kPageIn : Phrase::kPagesIn,
                           {LabelText::OfNumber(pages), Utf8::ToUString(kPrintedFile)}));
    } catch (std::runtime_error const &error) {
        Tell(Utf8::ToUString(error.what()));
    }
}

void TakeListPane::Tell(UString const &text) {
    if (container)
        LabelText::Show(container->FindByID(labelID), text);
}

void TakeListPane::TellSelected() {
    Tell(Phrases::Fill(Phrase::kSelected, {list->NumSelected(), takes.Count()}));
}

// Drawing

void TakeListPane::DrawBackgroundGuts(OSRgn *) {
    SaveColors const colors;
    Rect const box = GetDrawRectangle();
    VelaDrawing::RGBForeColor(kScrollBarBorderColor);
    VelaDrawing::FrameRect(&box);
}

Rect TakeListPane::CellIn(Rect const &rowBox, Column column) const {
    int const margin = columns->GetColumnMargin(column);
    return {rowBox.top, Pixel(rowBox.left + columns->GetLeftEdge(column) + margin), rowBox.bottom,
            Pixel(rowBox.left + columns->GetRightEdge(column) - margin)};
}

void TakeListPane::DrawText(UString const &text, Rect const &rowBox, Column column) const {
    DrawStringInRect(text, CellIn(rowBox, column), columns->GetAlignment(column), TextSettings::kTruncateEnd,
                     kCentredVertically, 0, 0, 0.0f, 1.0f, 1.0f, 0.0f);
}

// A list of the dialog style has painted the highlight.
void TakeListPane::DrawLine(int line, Rect *rowBox, bool hilite) {
    SaveColors const colors;
    SaveTextState const state;
    bool const printed = rowBox->bottom - rowBox->top < kLeastRowOnScreen;
    if (hilite && style == glistResRec::kSmallStyle && !printed)
        list->HiliteColumnRect(*rowBox);
    list->SetupColors();
    SetFontData(GetIndVelaFont(printed ? kPrintFont : kRowFont));
    DrawText(takes.Name(line), *rowBox, kName);
    DrawText(takes.Length(line), *rowBox, kLength);
    if (!printed)
        VelaDrawing::RGBForeColor(kDialogListInactiveTextColor);
    DrawText(takes.Number(line), *rowBox, kNumber);
    Rect const cell = CellIn(*rowBox, kKept);
    if (printed) {
        if (takes.IsKept(line))
            DrawText(Phrases::Get(Phrase::kKept), *rowBox, kKept);
        return;
    }
    Draw1Icon(kCheckFamily, takes.IsKept(line) ? kCheckOn : kCheckOff,
              Pixel((cell.left + cell.right - kCheckWidth) / 2),
              Pixel((cell.top + cell.bottom - kCheckHeight) / 2));
}
