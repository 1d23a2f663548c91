#include "text/SearchFieldPane.h"
#include "host/EventRecordAdapter.h"
#include "host/GlogStyleSheet.h"
#include "host/Icons.h"
#include "host/PaneWatch.h"
#include "host/Services.h"
#include "host/TextLayout.h"
#include "host/VelaDrawing.h"
#include "host/glogRec.h"
#include "scrolling/Truncation.h"
#include "text/SearchTextPane.h"
#include "text/SearchedForm.h"
#include <algorithm>
#include <memory>
#include <new>

namespace {

short const kNoNumber = -1;
int const kHandled = -1; // what HandleClick answers

short const kFieldFamily = 1728;
short const kLeftCap = 0, kMiddle = 1, kRightCap = 2, kMark = 3, kCancel = 4, kCancelPressed = 5;

// Pixels.
short const kCapWidth = 20; // of the button too
short const kTextTop = 3, kTextLeft = 20, kTextBottom = 19;
int const kWidestForText = 250; // of the field; beyond, the text does not grow along
int const kNarrowest = 61;
short const kHiliteInset = 2; // of a match, above and below

short const kTextFrameOffset = -2, kTextFirstLineOffset = 1;

Rect TextBox(int fieldWidth) { return {kTextTop, kTextLeft, kTextBottom, Pixel16(fieldWidth - kCapWidth)}; }

} // namespace

// The flag is put back when the pane is still there, also when something throws.
class SearchFieldPane::WhilePressed {
public:
    explicit WhilePressed(SearchFieldPane &field_)
        : field(field_)
        , watch(&field_) {
        field.cancelPressed = true;
    }
    ~WhilePressed() {
        if (watch.PaneExists())
            field.cancelPressed = false;
    }
    WhilePressed(WhilePressed const &) = delete;
    WhilePressed &operator=(WhilePressed const &) = delete;

private:
    SearchFieldPane &field;
    PaneWatch const watch;
};

SearchFieldPane::SearchFieldPane()
    : cancelPressed(false)
    , selecting(false) {}

SearchFieldPane::~SearchFieldPane() {}

void SearchFieldPane::Init(glogRec *owner) {
    if (!CompoundPaneInit(owner, kNoNumber))
        return;
    SetNoErase(1); // the icons cover all of the box
    std::unique_ptr<SearchTextPane> text(new (std::nothrow) SearchTextPane(this));
    if (!text)
        return;
    gtextResRec record;
    record.flags = gtextResRec::kBoxIt | gtextResRec::kAutoScroll;
    record.textWell = 1;
    record.frameOffset = kTextFrameOffset;
    record.firstLineOffset = kTextFirstLineOffset;
    GlogStyleSheet own;
    GlogStyleSheet *const sheet = owner->GetStyleSheet() ? owner->GetStyleSheet() : &own;
    sheet->SetItemRes(GTextPane::XMLResFrom_GTextResRec(record));
    text->InitGTextPane(owner, sheet, nullptr, nullptr);
    searchText = text.get();
    Add(text.get(), -1);
    Rect box = TextBox(kWidestForText);
    text.release()->SetBox(&box); // the container's from now on
}

// The search

UString SearchFieldPane::GetText() { return searchText ? searchText->GetText() : UString(); }

void SearchFieldPane::CancelSearch() {
    PaneWatch const self(this);
    if (searchText)
        searchText->SetText(UString());
    typedef Provider<SearchFieldPane_Listener> SearchProvider;
    if (SearchProvider::HasDependents())
        SearchProvider::BroadcastChange(
            Message0<SearchFieldPane_Listener>(&SearchFieldPane_Listener::SearchIsCanceled), nullptr);
    if (self.PaneExists())
        Inval();
}

void SearchFieldPane::SearchTextChanged(UString const &text) {
    typedef Provider<SearchFieldPane_Listener> SearchProvider;
    PaneWatch const self(this);
    if (SearchProvider::HasDependents())
        SearchProvider::BroadcastChange(Message1<SearchFieldPane_Listener, UString const &, UString>(
                                            &SearchFieldPane_Listener::TextChanged, &text),
                                        nullptr);
    if (!self.PaneExists() || !GetVisibility())
        return;
    Rect const button = CancelBox();
    Prepare();
    VelaDrawing::InvalRect(&button);
}

void SearchFieldPane::HandleSpecialKey(EventRecordAdapter *event) {
    typedef Provider<SearchFieldPane_Listener> SearchProvider;
    if (SearchProvider::HasDependents())
        SearchProvider::BroadcastChange(
            Message1<SearchFieldPane_Listener, EventRecordAdapter *, EventRecordAdapter *>(
                &SearchFieldPane_Listener::HandleSpecialKey, &event),
            nullptr);
}

// The text takes the keyboard from whoever has it, and so from this pane if it was the one to be selected:
// that must not take it from the text again.
void SearchFieldPane::Select(bool on) {
    GlogPane::Select(on);
    if (selecting || !searchText)
        return;
    PaneWatch const self(this);
    selecting = true;
    searchText->Select(on);
    if (self.PaneExists())
        selecting = false;
}

// Geometry

void SearchFieldPane::SetBox(Rect *box) {
    int const width = box->right - box->left;
    if (width < kNarrowest)
        Hide();
    else
        Show();
    if (searchText) {
        Rect text = TextBox(std::min(width, kWidestForText));
        searchText->SetBox(&text);
    }
    GlogPane::SetBox(box);
}

Rect SearchFieldPane::CancelBox() {
    Rect box;
    GetBox(&box);
    box.left = Pixel16(box.right - kCapWidth);
    return box;
}

// Drawing

void SearchFieldPane::DrawBackgroundGuts(OSRgn *) {
    Rect box;
    GetBox(&box);
    short const rightCap = Pixel16(box.right - kCapWidth);
    Rect const middle = {box.top, Pixel16(box.left + kCapWidth), box.bottom, rightCap};
    TileIcon(&middle, kFieldFamily, kMiddle, kCapWidth, kCapWidth);
    Draw1Icon(kFieldFamily, kLeftCap, box.left, box.top);
    Draw1Icon(kFieldFamily, kRightCap, rightCap, box.top);
    Draw1Icon(kFieldFamily, kMark, box.left, box.top);
    if (!GetText().empty())
        Draw1Icon(kFieldFamily, cancelPressed ? kCancelPressed : kCancel, rightCap, box.top);
}

// Clicks

// The flag holds for a click into the text as well.
int SearchFieldPane::HandleClick(EventRecordAdapter *event) {
    WhilePressed const pressed(*this);
    Rect const button = CancelBox();
    if (!VelaDrawing::PtInRect(event->where, &button))
        return CompoundPane::HandleClick(event);
    HandleCancelClick();
    return kHandled;
}

// The button acts wherever the mouse is by then, and also while there is nothing to see of it.
void SearchFieldPane::HandleCancelClick() {
    PaneWatch const self(this);
    Inval();
    while (MouseIsDragging(nullptr, nullptr)) {
    }
    if (self.PaneExists())
        CancelSearch();
}

// Matches

void SearchFieldPane::MaybeHiliteSearchString(UString const &search, UString const &text, Rect const &rect) {
    if (search.empty())
        return;
    std::size_t const found = SearchedForm::OfText(text).find(SearchedForm::OfSearch(search), 0);
    // The sum wraps around when nothing was found: then what is to be painted ends before it begins.
    UString const before = text.substr(0, found), through = text.substr(0, found + search.length());
    Rect match = rect;
    VelaDrawing::InsetRect(&match, 0, kHiliteInset);
    match.left = Pixel16(0LL + TightStringWidth(before, 0.0f, 1.0f) + rect.left);
    match.right = Pixel16(0LL + LooseStringWidth(through, 0.0f, 1.0f) + rect.left);
    // But for a search string that is longer than the text: ink alone is narrower than all of it.
    if (found == UString::npos)
        match.right = std::min(match.left, match.right);
    SetUserHiliteColorAsForeColor();
    VelaDrawing::PaintRect(&match);
}
