#include "tools/gallery/TrackListPane.h"
#include "buttons/ButtonGroupPane.h"
#include "buttons/GlogButtonPane.h"
#include "frame/ResourceReading.h"
#include "host/GlogStyleSheet.h"
#include "host/NamedColors.h"
#include "host/PortSavers.h"
#include "host/TextLayout.h"
#include "host/VelaDrawing.h"
#include "scrolling/ScrollGridPlus.h"
#include "tools/gallery/LabelText.h"
#include "tools/gallery/Phrases.h"
#include "tools/gallery/TrackRowPane.h"
#include "tools/gallery/WellPane.h"
#include <algorithm>
#include <initializer_list>
#include <memory>
#include <new>

namespace {

short const kNumbersWidth = 44; // pixels
short const kBarThickness = 16; // pixels
short const kNumberInset = 8;   // pixels, at the right
int const kNumberFont = 1;
int const kCentredVertically = 1;

int const kFirstBars = 16, kBarsAtOnce = 4, kFewestBars = 4, kMostBars = 64;
// Numbers of items: of the bars, and of a row's check box less the track's number.
short const kAlongBar = 998, kAcrossBar = 999, kCheckBoxes = 1000;

// The number of a row, from 1.
class RowNumberPane : public GlogPane {
public:
    static RowNumberPane *NewRowNumberPane(glogRec *owner, int number) {
        std::unique_ptr<RowNumberPane> pane(new (std::nothrow) RowNumberPane(number));
        if (!pane || !pane->GlogPaneInit(owner, 0))
            return nullptr;
        Rect box = {0, 0, TrackRowPane::kHeight, kNumbersWidth};
        pane->SetBox(&box);
        return pane.release();
    }

protected:
    int HandleClick(EventRecordAdapter *) override { return 0; }
    void DrawGuts(OSRgn *) override {
        SaveColors const colors;
        Rect box = GetDrawRectangle();
        Rect const under = {static_cast<short>(box.bottom - 1), box.left, box.bottom, box.right};
        VelaDrawing::RGBForeColor(kPanelUnderline);
        VelaDrawing::PaintRect(&under);
        VelaDrawing::RGBForeColor(kDialogListInactiveTextColor);
        box.right = static_cast<short>(box.right - kNumberInset);
        DrawTextLayoutInRect(layout, text, box, kNumberFont, TextSettings::kAlignRight,
                             TextSettings::kTruncateEnd, kCentredVertically, 0, 0, 0, 0.0f, 1.0f, 1.0f);
    }

private:
    explicit RowNumberPane(int number)
        : text(LabelText::OfNumber(number)) {}

    UString text;
    OS::TextLayout layout;
};

void Place(GlogPane &pane, Rect box) { pane.SetBox(&box); }

ScrollBarPane *NewBar(glogRec *owner, short id, short flags) {
    ScrollBarPane *const bar = new (std::nothrow) ScrollBarPane(owner, flags, 0, 0);
    if (bar)
        bar->SetID(id);
    return bar;
}

} // namespace

// What lies within the frame: the grids at its top, because rows are revealed exactly only there, and their
// bars.
class TrackListPane::Table : public CompoundPane {
public:
    explicit Table(glogRec *owner) {
        SetNoErase(1);
        CompoundPaneInit(owner, 0);
    }

protected:
    void DrawBackgroundGuts(OSRgn *) override {
        SaveColors const colors;
        Rect ground = GetDrawRectangle();
        ground.bottom = static_cast<short>(ground.bottom - kBarThickness);
        ground.right = static_cast<short>(ground.right - kBarThickness);
        VelaDrawing::RGBForeColor(kListBackgroundColor);
        VelaDrawing::PaintRect(&ground);
    }
};

// Follows the rows, and leaves the wheel to them.
class TrackListPane::Numbers : public ScrollGrid {
public:
    explicit Numbers(glogRec *owner)
        : ScrollGrid(owner, 0, nullptr) {
        SetNoErase(1);
        SetSlaved();
    }
    CustomEventHandler *CanHandleCustomEvent(UIEvent *) override { return nullptr; }
};

class TrackListPane::Rows : public ScrollGridPlus {
public:
    Rows(glogRec *owner, ScrollBarPane *along, ScrollBarPane *across, Numbers *follower_)
        : ScrollGridPlus(owner, 0, along, across)
        , follower(follower_) {
        SetNoErase(1);
    }

    // The numbers go first: then the update that scrolling ends with draws both.
    int ScrollGuts(int position) override {
        follower->ScrollTo(std::max(std::min(position, GetMaxScroll()), 0));
        return ScrollGridPlus::ScrollGuts(position);
    }

private:
    Numbers *follower;
};

TrackListPane *TrackListPane::NewTrackListPane(glogRec *owner, GlogStyleSheet *sheet) {
    std::unique_ptr<TrackListPane> list(new (std::nothrow) TrackListPane(sheet));
    if (!list || !list->CompoundPaneInit(owner, 0))
        return nullptr;
    if (!list->AddParts())
        return nullptr;
    Rect box = OptionalRect(sheet->GetItemRes(), "BoundsRect");
    list->SetBox(&box);
    int const wanted = sheet->GetSInt32ItemValue(ResourceKey("Num"));
    for (int i = 0; i < wanted; ++i)
        list->AddRow(static_cast<short>(i));
    list->chosen = dynamic_cast<TrackRowPane *>(list->rows->Get(0));
    if (list->chosen)
        list->chosen->SetChosen(true);
    return list.release();
}

TrackListPane::TrackListPane(GlogStyleSheet *sheet)
    : labelID(sheet->GetSInt32ItemValue(ResourceKey("TextID")))
    , firstButton(sheet->GetSInt32ItemValue(ResourceKey("CmdID")))
    , bars(kFirstBars) {
    SetNoErase(1);
}

bool TrackListPane::AddParts() {
    table = new (std::nothrow) Table(GetGlog());
    along = NewBar(GetGlog(), kAlongBar, 0);
    across = NewBar(GetGlog(), kAcrossBar, ScrollBarPane::kHorizontalBar);
    numbers = new (std::nothrow) Numbers(GetGlog());
    if (!table || !along || !across || !numbers)
        return false;
    rows = new (std::nothrow) Rows(GetGlog(), along, across, numbers);
    if (!rows)
        return false;
    for (GlogPane *part : std::initializer_list<GlogPane *>{numbers, rows, along, across})
        table->Add(part, -1);
    Add(table, -1);
    return true;
}

void TrackListPane::SetBox(Rect *box) {
    CompoundPane::SetBox(box);
    if (rows)
        ArrangeParts(*box);
}

// The bars' frames lie on the frame of the list.
void TrackListPane::ArrangeParts(Rect const &box) {
    short const width = static_cast<short>(box.right - box.left - 1);
    short const height = static_cast<short>(box.bottom - box.top - 1);
    short const right = static_cast<short>(width - kBarThickness);
    short const bottom = static_cast<short>(height - kBarThickness);
    Place(*table, {1, 1, static_cast<short>(height + 1), static_cast<short>(width + 1)});
    Place(*along, {-1, right, static_cast<short>(bottom + 1), width});
    Place(*across, {bottom, -1, height, static_cast<short>(right + 1)});
    Place(*numbers, {0, 0, bottom, kNumbersWidth});
    Place(*rows, {0, kNumbersWidth, bottom, right});
    // A larger view may reach beyond the end. Nothing may be drawn here, where the layout is being settled.
    rows->SetScrollOffset(std::min(rows->GetScrollOffset(), rows->GetMaxScroll()));
    numbers->SetScrollOffset(rows->GetScrollOffset());
    rows->SetLateralScrollOffset(std::min(rows->GetLateralScrollOffset(), rows->GetMaxLateralScroll()));
    rows->UpdateScrollInfo();
}

// False when there is no room for another row.
bool TrackListPane::AddRow(short index) {
    if (rows->ListHeight() + TrackRowPane::kHeight > Grid::MaxListHeight())
        return false;
    int const number = lastNumber + 1;
    TrackRowPane *const row =
        TrackRowPane::NewTrackRowPane(GetGlog(), number, bars, static_cast<short>(kCheckBoxes + number),
                                      [this](TrackRowPane &clicked) { Choose(&clicked); });
    RowNumberPane *const rowNumber = RowNumberPane::NewRowNumberPane(GetGlog(), numbers->NumSubpanes() + 1);
    if (!row || !rowNumber)
        return false;
    lastNumber = number;
    numbers->Add(rowNumber, -1);
    rows->Add(row, index);
    return true;
}

void TrackListPane::GlogItemInit() {
    CompoundPane::GlogItemInit();
    if (!container)
        return;
    for (int command = kAdd; command <= kStickToEnd; ++command) {
        GlogPane *const pane = container->FindByID(firstButton + command);
        if (GlogButtonPane *button = dynamic_cast<GlogButtonPane *>(pane))
            GlogButtonPaneListener::DependUpon(button);
        else if (ButtonGroupPane *group = dynamic_cast<ButtonGroupPane *>(pane))
            ButtonGroupPaneListener::DependUpon(group);
    }
    TellChosen();
}

void TrackListPane::DrawBackgroundGuts(OSRgn *) {
    SaveColors const colors;
    WellPane::DrawWell(GetDrawRectangle());
}

// Commands

void TrackListPane::GlogButtonPressed(GlogButtonPane *button) {
    Carry(static_cast<Command>(button->GetID() - firstButton));
}

void TrackListPane::ButtonValueChanged(ButtonGroupPane *, short, bool value) { rows->SetStickToEnd(value); }

void TrackListPane::Carry(Command command) {
    switch (command) {
    case kAdd:
        return AddAfterChosen();
    case kDelete:
        return DeleteChosen();
    case kMoveUp:
        return MoveChosen(-1);
    case kMoveDown:
        return MoveChosen(1);
    case kReveal:
        return Reveal();
    case kMoreBars:
        return AddBars(kBarsAtOnce);
    case kFewerBars:
        return AddBars(-kBarsAtOnce);
    case kStickToEnd:
        break; // heard of as a value
    }
}

void TrackListPane::AddAfterChosen() {
    short const index = static_cast<short>(ChosenIndex() + 1);
    if (!AddRow(index))
        return;
    Choose(dynamic_cast<TrackRowPane *>(rows->Get(index)));
    Reveal();
}

// The rows behind it move up, which the grid leaves to others to draw.
void TrackListPane::DeleteChosen() {
    short const index = ChosenIndex();
    if (index < 0)
        return;
    chosen = nullptr;
    numbers->Del(static_cast<short>(numbers->NumSubpanes() - 1));
    rows->Inval();
    rows->Del(index);
    short const last = static_cast<short>(rows->NumSubpanes() - 1);
    Choose(dynamic_cast<TrackRowPane *>(rows->Get(std::min(index, last))));
}

void TrackListPane::MoveChosen(int by) {
    short const index = ChosenIndex();
    if (index < 0)
        return;
    rows->Move(index, static_cast<short>(index + by));
    Reveal();
    TellChosen();
}

void TrackListPane::Reveal() {
    if (chosen)
        rows->ScrollTillVisible(chosen);
}

void TrackListPane::AddBars(int more) {
    int const wanted = std::clamp(bars + more, kFewestBars, kMostBars);
    if (wanted == bars)
        return;
    bars = wanted;
    for (short i = 0; i < rows->NumSubpanes(); ++i) {
        if (TrackRowPane *row = dynamic_cast<TrackRowPane *>(rows->Get(i)))
            row->SetBars(bars);
    }
    rows->Inval();
    rows->UpdateScrollInfo();
}

void TrackListPane::Choose(TrackRowPane *row) {
    if (row != chosen) {
        if (chosen)
            chosen->SetChosen(false);
        chosen = row;
        if (chosen)
            chosen->SetChosen(true);
    }
    TellChosen();
}

short TrackListPane::ChosenIndex() const { return chosen ? rows->Find(chosen) : short(-1); }

void TrackListPane::TellChosen() {
    if (!container)
        return;
    UString const count = LabelText::OfThousands(rows->NumSubpanes());
    LabelText::Show(container->FindByID(labelID),
                    chosen ? Phrases::Fill(Phrase::kTrackRow,
                                           {chosen->Name(), LabelText::OfThousands(ChosenIndex() + 1), count})
                           : Phrases::Fill(Phrase::kNoTrack, {count}));
}
