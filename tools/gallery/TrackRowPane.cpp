#include "tools/gallery/TrackRowPane.h"
#include "buttons/CheckBoxPane.h"
#include "dialogs/Utf8.h"
#include "frame/ResourceReading.h"
#include "host/GlogStyleSheet.h"
#include "host/Icons.h"
#include "host/NamedColors.h"
#include "host/OSRgn.h"
#include "host/PaneWatch.h"
#include "host/PortSavers.h"
#include "host/VelaDrawing.h"
#include "text/LabelPane.h"
#include "tools/gallery/LabelText.h"
#include "tools/gallery/Phrases.h"
#include <memory>
#include <new>
#include <utility>

namespace {

Phrase const kInstruments[] = {Phrase::kDrums, Phrase::kPercussion, Phrase::kBass, Phrase::kGuitar,
                               Phrase::kPiano, Phrase::kStrings,    Phrase::kVoice};
short const kColours[] = {0, 0, 1, 2, 3, 4, 1}; // icons of kClipFamily
int const kInstrumentCount = sizeof kInstruments / sizeof *kInstruments;

short const kClipFamily = 2005;
short const kClipWidth = 36, kClipHeight = 16; // pixels, as everything below
short const kBarWidth = 40;
int const kBarsPerLine = 4; // a line stands after so many bars
short const kClipTop = (TrackRowPane::kHeight - kClipHeight) / 2, kClipsLeft = 188;
short const kBaseline = 16;
short const kCheckDrop = 1;
short const kCheckLeft = 8, kCheckTop = 5, kCheckTextLeft = 26, kCheckBaseline = 15;
short const kCountLeft = 128;
short const kCountFont = 1;

typedef boost::shared_ptr<XMLLib::ContainerItem> Container;

Container Under(Container const &parent, char const *key) {
    Container const child = XMLLib::CreateContainer(ResourceKey(key));
    parent->AddItem(ResourceKey(key), child);
    return child;
}

void AddOrigin(Container const &item, short h, short v) {
    Container const origin = Under(item, "Origin");
    origin->AddSIntItem(ResourceKey("kV"), v);
    origin->AddSIntItem(ResourceKey("kH"), h);
}

// One check box with a label, as a dialog describes it.
Container CheckBoxItem(UString const &label) {
    Container const item = XMLLib::CreateContainer(ResourceKey("Item"));
    Container const button = Under(Under(item, "RadioCheckButtonItems"), "Button");
    AddOrigin(button, kCheckLeft, kCheckTop);
    button->AddSIntItem(ResourceKey("HitExtension"), kCheckTextLeft - kCheckLeft);
    Container const text = Under(Under(button, "RadioCheckButtonStrings"), "String");
    AddOrigin(text, kCheckTextLeft, kCheckBaseline);
    text->AddUStringItem(ResourceKey("Text"), label);
    return item;
}

// Scatters the tracks' clips, the same way every time.
unsigned Scattered(int number, int bar) {
    unsigned const mixed = static_cast<unsigned>(number) * 2654435761u + static_cast<unsigned>(bar) * 40503u;
    return (mixed ^ (mixed >> 15)) * 2246822519u >> 16;
}

} // namespace

short TrackRowPane::WidthOf(int bars) {
    return static_cast<short>(kClipsLeft + bars * kBarWidth + kBarWidth / 2);
}

TrackRowPane *TrackRowPane::NewTrackRowPane(glogRec *owner, int number, int bars, short checkBoxID,
                                            Listener listener) {
    std::unique_ptr<TrackRowPane> row(new (std::nothrow) TrackRowPane(number, std::move(listener)));
    if (!row || !row->CompoundPaneInit(owner, 0) || !row->AddParts(checkBoxID))
        return nullptr;
    row->SetBars(bars);
    return row.release();
}

TrackRowPane::TrackRowPane(int number_, Listener listener_)
    : name(Phrases::Get(kInstruments[(number_ - 1) % kInstrumentCount]))
    , listener(std::move(listener_))
    , number(number_) {
    SetNoErase(1);
    name += Utf8::ToUString(" ");
    name += LabelText::OfNumber(number);
}

bool TrackRowPane::AddParts(short checkBoxID) {
    GlogStyleSheet sheet(CheckBoxItem(name));
    CheckBoxPane *const check = CheckBoxPane::NewCheckBoxPane(GetGlog(), &sheet);
    if (!check)
        return false;
    check->SetID(checkBoxID);
    // A hidden box takes its value without asking to be drawn, which would settle the layout for each row.
    check->SetVisibility(0);
    check->SetOne(0, number % 3 != 0);
    check->SetVisibility(1);
    // Its label is drawn a pixel lower than its box counts on, and the box would cut the tail of a g off.
    Rect box;
    check->GetBox(&box);
    ++box.bottom;
    check->SetBox(&box);
    Add(check, -1);
    Rect place = {0, kCountLeft, kBaseline, kCountLeft};
    count = LabelPane::NewLabelPane(GetGlog(), 0, &place, false, UString());
    if (!count)
        return false;
    count->SetFontFSRID(kCountFont);
    count->SetGrayTextMode(true);
    Add(count, -1);
    return true;
}

void TrackRowPane::SetBars(int to) {
    bars = to;
    int clips = 0;
    for (int bar = 0; bar < bars; ++bar)
        clips += HasClip(bar);
    count->SetText(Phrases::Fill(clips == 1 ? Phrase::kClip : Phrase::kClips, {clips}));
    Rect box;
    GetBox(&box);
    box.right = static_cast<short>(box.left + WidthOf(bars));
    box.bottom = static_cast<short>(box.top + kHeight);
    SetBox(&box);
}

void TrackRowPane::SetChosen(bool on) {
    if (on == chosen)
        return;
    chosen = on;
    count->SetGrayTextMode(!on); // gray is not read well on the colour of what is chosen
    Inval();
}

// Three bars in five have one.
bool TrackRowPane::HasClip(int bar) const { return Scattered(number, bar) % 5 < 3; }

// The check box and its label are drawn a pixel lower than where they count on being drawn: those that lie
// just above of what is redrawn, reach into it.
void TrackRowPane::DrawGuts(OSRgn *updateRegion) {
    if (!updateRegion) {
        CompoundPane::DrawGuts(updateRegion);
        return;
    }
    OSRgn above(*updateRegion);
    above.Offset(0, -kCheckDrop);
    TempRgn const reached;
    VelaDrawing::UnionRgn(updateRegion, &above, reached);
    CompoundPane::DrawGuts(reached);
}

void TrackRowPane::DrawBackgroundGuts(OSRgn *updateRegion) {
    SaveColors const colors;
    Rect const box = GetDrawRectangle();
    VelaDrawing::RGBForeColor(kListItemColor);
    VelaDrawing::PaintRect(&box);
    if (chosen) {
        SetUserHiliteColorAsForeColor();
        Rect const head = {box.top, box.left, box.bottom, static_cast<short>(box.left + kClipsLeft)};
        VelaDrawing::PaintRect(&head);
    }
    DrawClips(updateRegion, box);
    DrawEdges(box);
}

// A line under each row; round the chosen one they stand out, wherever it has been scrolled to.
void TrackRowPane::DrawEdges(Rect const &box) const {
    VelaDrawing::RGBForeColor(chosen ? kHiliteColor : kPanelUnderline);
    Rect const under = {static_cast<short>(box.bottom - 1), box.left, box.bottom, box.right};
    VelaDrawing::PaintRect(&under);
    Rect const above = {box.top, box.left, static_cast<short>(box.top + 1), box.right};
    if (chosen)
        VelaDrawing::PaintRect(&above);
}

void TrackRowPane::DrawClips(OSRgn *updateRegion, Rect const &box) const {
    short const top = static_cast<short>(box.top + kClipTop);
    for (int bar = 0; bar < bars; ++bar) {
        short const left = static_cast<short>(box.left + kClipsLeft + bar * kBarWidth);
        Rect const cell = {box.top, left, box.bottom, static_cast<short>(left + kBarWidth)};
        if (!VelaDrawing::RectInRgn(&cell, updateRegion))
            continue;
        if (bar % kBarsPerLine == 0) {
            VelaDrawing::RGBForeColor(kPanelUnderline);
            Rect const line = {box.top, left, box.bottom, static_cast<short>(left + 1)};
            VelaDrawing::PaintRect(&line);
        }
        ClearColors();
        if (HasClip(bar))
            Draw1Icon(kClipFamily, kColours[(number - 1) % kInstrumentCount],
                      static_cast<short>(left + (kBarWidth - kClipWidth) / 2 + 1), top);
    }
}

int TrackRowPane::HandleClick(EventRecordAdapter *event) {
    PaneWatch const watch(this);
    int const answer = CompoundPane::HandleClick(event);
    if (watch.PaneExists())
        listener(*this);
    return answer ? answer : -1;
}
