#include "text/GTextPane.h"
#include "frame/ResourceReading.h"
#include "host/Coordinate.h"
#include "host/GlogLayout.h"
#include "host/GlogStyleSheet.h"
#include "host/OSFont.h"
#include "host/PaneWatch.h"
#include "host/TarnError.h"
#include "host/XMLLib.h"
#include "host/glogRec.h"
#include "scrolling/Truncation.h"
#include "text/FontIndex.h"
#include "text/TextFieldFlags.h"
#include <boost/make_shared.hpp>
#include <memory>
#include <new>

namespace {

short const kNoNumber = 0;
int const kLayoutPaneType = 8;
short const kUsualFrameOffset = -2;

TextSettings::Alignment const kAlignments[] = {TextSettings::kAlignLeft, TextSettings::kAlignRight,
                                               TextSettings::kAlignCenter};
std::size_t const kNumAlignments = sizeof kAlignments / sizeof kAlignments[0];

// An index without an alignment of its own counts as the first.
TextSettings::Alignment AlignmentAt(unsigned char index) {
    return kAlignments[index < kNumAlignments ? index : 0];
}

// What all of the text looks like when the selection is put back where it was, also if something throws.
class WithSelectionKept {
public:
    explicit WithSelectionKept(OSTextEdit &edit_)
        : edit(edit_) {
        edit.GetSelection(start, end);
    }
    ~WithSelectionKept() {
        try {
            edit.SetSelection(start, end);
        } catch (...) { // it is selected; only what is to be repainted for it was not found out
        }
    }
    WithSelectionKept(WithSelectionKept const &) = delete;
    WithSelectionKept &operator=(WithSelectionKept const &) = delete;

private:
    OSTextEdit &edit;
    unsigned int start = 0, end = 0;
};

Rect Outset(Rect const &r, int by) {
    return {Pixel16(r.top - by), Pixel16(r.left - by), Pixel16(r.bottom + by), Pixel16(r.right + by)};
}

OSTextEdit::Window WindowOf(glogRec *glog) {
    return glog ? OSTextEdit::Window(static_cast<TarnOSWindow::OSWindow &>(*glog)) : OSTextEdit::Window();
}

void SetFont(GTextPane *pane, int index) { pane->SetFontFSRID(static_cast<short>(index)); }

void SetPaneMode(GTextPane *pane, int mode) { pane->SetMode(static_cast<unsigned char>(mode)); }

} // namespace

void (*gcSetFontFSRID)(GTextPane *, int) = SetFont;
void (*gcSetModeGText)(GTextPane *, int) = SetPaneMode;

// Construction

GTextPane::GTextPane()
    : itemKind(0)
    , bounds()
    , fontIndex(0)
    , alignmentIndex(0)
    , boxIt(false)
    , noTabIn(false)
    , returnOnClick(false)
    , returnOnModify(false)
    , multiLine(false)
    , autoScroll(false)
    , notSelectable(false)
    , useSavedColors(false)
    , readOnly(false)
    , textWell(1)
    , frameOffset(kUsualFrameOffset)
    , firstLineOffset(0)
    , textEdit(nullptr)
    , mode(kEditable)
    , inClick(false)
    , savedBack(nullptr)
    , savedFore(nullptr)
    , selectionColor(nullptr)
    , drawingHelper(nullptr)
    , noDeselect(false)
    , colorsApplied(false)
    , drawsBackground(true)
    , telling(false) {}

GTextPane::~GTextPane() {
    if (client)
        client->pane = nullptr;
    client.reset();
    SetDrawingHelper(AutoPtr<GTextPaneDrawingHelper>());
    delete textEdit;
}

// A helper has no virtual destructor and none of its own, so that deleting it by this type gives back all of
// it.
void GTextPane::SetDrawingHelper(AutoPtr<GTextPaneDrawingHelper> helper) {
    GTextPaneDrawingHelper *const former = drawingHelper;
    drawingHelper = helper.release();
    if (former == drawingHelper)
        return;
#pragma GCC diagnostic push
#pragma GCC diagnostic ignored "-Wdelete-non-virtual-dtor"
#ifdef __clang__
#pragma GCC diagnostic ignored "-Wdelete-abstract-non-virtual-dtor"
#endif
    delete former; // NOLINT
#pragma GCC diagnostic pop
}

// Creators

GTextPane *GTextPane::NewGTextPane(glogRec *owner, GlogStyleSheet *sheet, const UString *text,
                                   const std::vector<StyleRunRec> *runs) {
    std::unique_ptr<GTextPane> pane(new (std::nothrow) GTextPane);
    if (!pane || !pane->InitGTextPane(owner, sheet, text, runs))
        return nullptr;
    return pane.release();
}

GTextPane *GTextPane::NewGTextPane(glogRec *owner, int id, Rect *rect, const UString &text,
                                   const std::vector<StyleRunRec> *runs) {
    gtextResRec record;
    record.bounds = *rect;
    record.flags = gtextResRec::kBoxIt;
    record.textWell = 1;
    record.frameOffset = kUsualFrameOffset;
    record.firstLineOffset = -1;
    GlogStyleSheet own;
    GlogStyleSheet *const sheet = owner && owner->GetStyleSheet() ? owner->GetStyleSheet() : &own;
    sheet->SetItemRes(XMLResFrom_GTextResRec(record));
    GTextPane *const pane = NewGTextPane(owner, sheet, &text, runs);
    if (!pane)
        FailMemFullError();
    pane->GlogItemInit();
    pane->SetID(id);
    pane->SetBox(rect);
    return pane;
}

boost::shared_ptr<XMLLib::ContainerItem> GTextPane::XMLResFrom_GTextResRec(const gtextResRec &record) {
    boost::shared_ptr<XMLLib::ContainerItem> const item = XMLLib::CreateContainer(ResourceKey("GlogItem"));
    auto const add = [&](char const *key, long long value) { item->AddSIntItem(ResourceKey(key), value); };
    auto const flag = [&](char const *key, int bit) { add(key, (record.flags & bit) != 0); };
    item->AddUStringItem(ResourceKey("GlogItemType"), ResourceKey("GText"));
    XMLLib::AddRect(item, ResourceKey("BoundsRect"), record.bounds);
    add("FSRID", record.font);
    add("Align", record.alignment);
    add("FirstLineOffset", record.firstLineOffset);
    flag("BoxIt", gtextResRec::kBoxIt);
    flag("NoTabIn", gtextResRec::kNoTabIn);
    flag("RetOnClick", gtextResRec::kRetOnClick);
    flag("RetOnModify", gtextResRec::kRetOnModify);
    flag("MultiLine", gtextResRec::kMultiLine);
    add("ReadOnly", (record.moreFlags & gtextResRec::kReadOnly) != 0);
    flag("AutoScroll", gtextResRec::kAutoScroll);
    flag("NotSelectable", gtextResRec::kNotSelectable);
    flag("UseSavedColors", gtextResRec::kUseSavedColors);
    add("TextWell", record.textWell);
    add("FrameOffset", record.frameOffset);
    item->AddUStringItem(ResourceKey("InitTextID"), record.initialText);
    return item;
}

void GTextPane::ReadKeys(GlogStyleSheet *sheet) {
    auto const number = [&](char const *key) { return sheet->GetSInt32ItemValue(ResourceKey(key)); };
    auto const flag = [&](char const *key) { return (number(key) & 1) != 0; };
    bounds = OptionalRect(sheet->GetItemRes(), "BoundsRect");
    fontIndex = static_cast<unsigned char>(FontIndexFromFSRID(number("FSRID")));
    alignmentIndex = static_cast<unsigned char>(number("Align"));
    firstLineOffset = static_cast<short>(number("FirstLineOffset"));
    boxIt = flag("BoxIt");
    noTabIn = flag("NoTabIn");
    returnOnClick = flag("RetOnClick");
    returnOnModify = flag("RetOnModify");
    multiLine = flag("MultiLine");
    readOnly = flag("ReadOnly");
    autoScroll = flag("AutoScroll");
    notSelectable = flag("NotSelectable");
    useSavedColors = flag("UseSavedColors");
    textWell = static_cast<signed char>(number("TextWell"));
    frameOffset = static_cast<short>(number("FrameOffset"));
    selectionColor = nullptr;
    // A frame has its own distance, whatever is said.
    if (frameOffset < 0 || boxIt)
        frameOffset = kUsualFrameOffset;
    itemKind = gtextResRec::kKind;
    mode = kEditable;
}

GTextPane *GTextPane::InitGTextPane(glogRec *owner, GlogStyleSheet *sheet, const UString *text,
                                    const std::vector<StyleRunRec> *runs) {
    typedef TarnOSWindow::OSWindow_PlatformWindowListener Listener;
    if (owner)
        Listener::DependUpon(owner);
    if (!GlogPaneInit(owner, kNoNumber))
        return nullptr;
    GetLayoutRect()->ReadLayoutProperties(kLayoutPaneType, sheet);
    ReadKeys(sheet);
    Rect box = bounds;
    if (boxIt)
        box = Outset(bounds, -frameOffset);
    SetBox(&box);
    noDeselect = false;
    drawsBackground = true;
    UString const initial = sheet->GetUStringItemValue(ResourceKey("InitTextID"));
    CreateTextEdit(text ? text : &initial, runs);
    colorsApplied = false;
    if (textEdit)
        textEdit->SetBaselineOffset(Boxed(sheet->GetSInt32ItemValue(ResourceKey("BaselineOffset"))));
    client = boost::make_shared<Client>(this);
    UString const platformKey = ResourceKey("PlatformHandlesTextInputEvents");
    if (sheet->HasSInt32ItemValue(platformKey))
        SetPlatformHandlesTextInputEvents(sheet->GetSInt32ItemValue(platformKey) != 0);
    if (textEdit)
        textEdit->SetClient(client);
    return this;
}

unsigned int GTextPane::GetTextEditCreationFlags(bool styled) {
    return TextFieldFlags::Of(styled, multiLine, readOnly, autoScroll);
}

OS::TextStyle GTextPane::StyleOfFont(int index) const {
    fontSaveRec const *const font = GetIndVelaFont(index);
    OS::TextStyle style;
    style.family = font->family;
    style.face = font->face;
    style.size = font->size;
    return style;
}

void GTextPane::CreateTextEdit(const UString *text, const std::vector<StyleRunRec> *runs) {
    if (textEdit)
        return;
    textEdit = OSTextEdit::Create(WindowOf(GetGlog()), GetTextEditCreationFlags(runs != nullptr));
    if (!textEdit)
        return;
    OS::TextEditListener::DependUpon(textEdit);
    textEdit->SetStyle(TextStyleMask::kFont, StyleOfFont(fontIndex));
    textEdit->SetAlignment(AlignmentAt(alignmentIndex));
    textEdit->DrawBackgroundWhenNotSelected(drawsBackground);
    if (text)
        textEdit->SetText(*text);
    if (runs)
        StyleParts(*runs);
}

void GTextPane::StyleParts(const std::vector<StyleRunRec> &runs) {
    WithSelectionKept const kept(*textEdit);
    for (StyleRunRec const &run : runs) {
        textEdit->SetSelection(run.start, run.end);
        textEdit->SetStyle(TextStyleMask::kAll, run.style);
    }
}

// The engine's place

Rect GTextPane::TextBox() {
    Rect box = GetDrawRectangle();
    return boxIt ? Outset(box, frameOffset) : box;
}

short GTextPane::Boxed(int baselineOffset) const {
    return Pixel16(boxIt ? 0LL + baselineOffset + frameOffset : baselineOffset);
}

void GTextPane::PanePositionChanged() {
    EditBoxPane::PanePositionChanged();
    if (!textEdit || !GetGlog())
        return;
    Rect const drawn = GetDrawRectangle();
    double const inset = boxIt ? -frameOffset : 0;
    OS::RectBase<OS::RectTag> const place(drawn.left + inset, drawn.top + inset,
                                          drawn.right - drawn.left - 2 * inset,
                                          drawn.bottom - drawn.top - 2 * inset);
    textEdit->SetBounds(Coordinate::PaneToWindow(*this, place));
}

void GTextPane::PlatformWindow_Opened(TarnOSWindow::OSWindow &) {
    if (textEdit)
        textEdit->SetWindow(WindowOf(GetGlog()));
}

void GTextPane::PlatformWindow_Closing(TarnOSWindow::OSWindow &) {
    if (textEdit)
        textEdit->SetWindow(OSTextEdit::Window());
}

void GTextPane::SetBoxAndFrame(bool box, bool well) {
    boxIt = box;
    textWell = well;
    if (GetGlog() && textEdit) {
        GlogStyleSheet const *const sheet = GetGlog()->GetStyleSheet();
        textEdit->SetBaselineOffset(
            Boxed(sheet ? sheet->GetSInt32ItemValue(ResourceKey("BaselineOffset")) : 0));
    }
    PanePositionChanged();
}

void GTextPane::SetBaselineOffset(int pixels) {
    if (textEdit)
        textEdit->SetBaselineOffset(Boxed(pixels));
}

// Styles

void GTextPane::SetAlignment(TextSettings::Alignment alignment) {
    if (!textEdit)
        return;
    textEdit->SetAlignment(alignment);
    for (std::size_t i = 0; i < kNumAlignments; ++i)
        if (kAlignments[i] == alignment)
            alignmentIndex = static_cast<unsigned char>(i);
}

void GTextPane::SetFontFSRID(short id) {
    unsigned char const index = static_cast<unsigned char>(id);
    PaneWatch const self(this);
    if (textEdit) {
        OS::TextStyle style = StyleOfFont(index);
        SetTextStyle(style);
    }
    if (self.PaneExists())
        fontIndex = index;
}

void GTextPane::SetTextStyle(OS::TextStyle &style) {
    textStyle = style;
    if (textEdit) {
        {
            WithSelectionKept const kept(*textEdit);
            textEdit->SelectAll();
            textEdit->SetStyle(TextStyleMask::kFont, style);
        }
        PaneWatch const self(this);
        EndEditing();
        if (!self.PaneExists())
            return;
    }
    Inval();
}

void GTextPane::SetStyle(unsigned int mask, const OS::TextStyle &style) {
    if (textEdit)
        textEdit->SetStyle(mask, style);
}

void GTextPane::GetStyle(unsigned int mask, OS::TextStyle &style) {
    if (textEdit)
        textEdit->GetStyle(mask, style);
}

unsigned int GTextPane::GetNumberStyleRuns() { return textEdit ? textEdit->GetNumberStyleRuns() : 0; }

void GTextPane::GetNthStyleRun(unsigned int n, unsigned int &start, unsigned int &end, OS::TextStyle &style) {
    if (textEdit)
        textEdit->GetNthStyleRun(n, start, end, style);
}

void GTextPane::SetMode(unsigned char other) {
    if (other == mode)
        return;
    PaneWatch const self(this);
    EndEditing();
    if (!self.PaneExists())
        return;
    mode = other;
    Inval();
}

// The client

GTextPane::Client::Client(GTextPane *pane_)
    : pane(pane_)
    , platformHandlesTextInput(false) {}

// What is being composed stays with the platform.
GTextPane::Client::DispatchPath GTextPane::Client::WhileEditing() const {
    return pane && pane->textEdit && pane->textEdit->GetMarkedRange() ? kPlatformPath : kOwnPath;
}

GTextPane::Client::DispatchPath
GTextPane::Client::TextEditClient_HandleTextEntry(OSTextEdit &, EventRecordAdapter *, UString const &text) {
    if (platformHandlesTextInput || text.length() != 1 || !tarn::IsASCII(text[0]))
        return kPlatformPath;
    return WhileEditing();
}

GTextPane::Client::DispatchPath
GTextPane::Client::TextEditClient_HandleTextAction(OSTextEdit &, EventRecordAdapter *,
                                                   OS::TextEditAction const &) {
    return platformHandlesTextInput ? kPlatformPath : WhileEditing();
}

void GTextPane::SetPlatformHandlesTextInputEvents(bool on) { client->platformHandlesTextInput = on; }

bool GTextPane::PlatformHandlesTextInputEvents() { return client->platformHandlesTextInput; }
