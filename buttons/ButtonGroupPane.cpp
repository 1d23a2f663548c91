#include "buttons/ButtonGroupPane.h"
#include "buttons/ButtonTracking.h"
#include "buttons/PartHelpTag.h"
#include "frame/ResourceReading.h"
#include "host/CompoundPane.h"
#include "host/EventRecordAdapter.h"
#include "host/GlogLayout.h"
#include "host/GlogStyleSheet.h"
#include "host/Icons.h"
#include "host/NamedColors.h"
#include "host/OSFont.h"
#include "host/OSRgn.h"
#include "host/PaneWatch.h"
#include "host/PortSavers.h"
#include "host/StringMgr.h"
#include "host/TextLayout.h"
#include "host/VelaDrawing.h"
#include "host/glogRec.h"
#include <algorithm>
#include <cstddef>
#include <iterator>

namespace {

short const kButtonFamily = 1002;
short const kIconWidth = 12;  // pixels
short const kIconHeight = 13; // pixels
short const kIconDrop = 1;    // pixels below the top of the button's rectangle
// The icon's place in a line of text: from 6 above its middle to 7 below.
short const kIconAboveMiddle = 6, kIconBelowMiddle = 7;
int const kButtonInsetTop = 2; // pixels, in a layout

short const kSpecialButtonWidth = 10; // pixels; narrower than the icon
short const kGapBeforeLabel = 5;      // pixels
short const kLabelOffsetH = 15, kLabelOffsetV = 9;

short const kInvalMargin = 3; // pixels
short const kTextDrop = 1;    // pixels below the pen point

short const kNoButton = -1;
short const kNoFont = -1;      // a label with this number takes the font that the port has
short const kEveryButton = -1; // as the exception of SetAllButtons
int const kCodeFont = 0;       // of labels that are made in code
int const kNoPane = -1;        // of a layout item
int const kNoLimit = -1;       // to a text's width
float const kNoExtraSpacing = 0.0f;
float const kNaturalScale = 1.0f;

// What the edges start from when rectangles are united.
short const kBeyondRight = 32767, kBeyondLeft = -32768;

char const kGroupSpacingKey[] = "GCheckGroup_LineSpacing";

short Short(std::ptrdiff_t value) { return static_cast<short>(value); }

TarnQuickDrawText::FontInfo PortFontInfo() {
    TarnQuickDrawText::FontInfo info;
    tarn::GetFontInfo(info);
    return info;
}

short StringWidth(UString const &text) {
    return Short(LooseStringWidth(text, kNoExtraSpacing, kNaturalScale));
}

// By sides: an empty rectangle counts like any other.
void Unite(Rect &sum, Rect const &r) {
    sum.top = std::min(sum.top, r.top);
    sum.left = std::min(sum.left, r.left);
    sum.bottom = std::max(sum.bottom, r.bottom);
    sum.right = std::max(sum.right, r.right);
}

// Which parts an update concerns; without a region all of them. Most parts of a large group lie outside of
// the region's bounds, and are not looked for in the region itself.
class Updated {
public:
    explicit Updated(OSRgn *region_)
        : region(region_)
        , bounds(region ? CarbonUtils::GetRgnBounds(region) : Rect()) {}
    bool operator()(Rect const &r) const {
        return !region || (r.left < bounds.right && bounds.left < r.right && r.top < bounds.bottom &&
                           bounds.top < r.bottom && VelaDrawing::RectInRgn(&r, region));
    }

private:
    OSRgn *region;
    Rect bounds;
};

// The rectangle of a text in the port's font.
Rect TextBounds(UString const &text, Point origin, TarnQuickDrawText::FontInfo const &info) {
    return {Short(origin.v - info.ascent), origin.h, Short(origin.v + info.descent),
            Short(origin.h + StringWidth(text))};
}

// Another folding of former font numbers than that of labels: these are 16 bits wide, and negative ones stay.
short FontOfLabel(short fsrid) {
    short const kLastIndex = 9;
    short const kFormerFont1 = 31;
    if (fsrid <= kLastIndex)
        return fsrid;
    return fsrid == kFormerFont1 ? 1 : 0;
}

void SetEnableOfAll(ButtonGroupPane *group, bool enabled) { group->SetAllEnable(enabled); }

void SetEnableOfOne(ButtonGroupPane *group, int index, bool enabled) {
    group->SetOneEnable(Short(index), enabled);
}

} // namespace

void (*btnSetAllEnable)(ButtonGroupPane *, bool) = SetEnableOfAll;
void (*btnSetOneEnable)(ButtonGroupPane *, int, bool) = SetEnableOfOne;

ButtonGroupPane::ButtonGroupPane()
    : onIcon(0)
    , offIcon(0)
    , disabledIcon(0)
    , allowClicks(true)
    , forPrinting(true)
    , flags(0)
    , radioValue(0) {
    UseLayoutSubItemMode();
}

ButtonGroupPane::~ButtonGroupPane() {
    for (ButtonTextRec const &text : texts)
        StringMgr::Instance().Free(text.stringKey);
}

ButtonGroupPane *ButtonGroupPane::InitButtonGroupPane(glogRec *owner, ckRadItemResRec *) {
    return GlogPaneInit(owner, 0) ? this : nullptr;
}

ButtonGroupPane *ButtonGroupPane::InitButtonGroupPane(glogRec *owner, GlogStyleSheet *) {
    return GlogPaneInit(owner, 0) ? this : nullptr;
}

// Buttons made in code

void ButtonGroupPane::AddButton(short h, short v, UString const &text) {
    AddSpecialButton(h, v, text.empty() ? 0 : kGapBeforeLabel);
    if (!text.empty())
        AddButtonText(kLabelOffsetH, kLabelOffsetV, text);
}

void ButtonGroupPane::AddSpecialButton(short h, short v, short extraWidth) {
    int const spacing = SpacingOfGlog();
    Rect const bounds = {v, h, Short(v + spacing), Short(h + extraWidth + kSpecialButtonWidth)};
    AppendButton(bounds, MakeButtonItem(spacing, bounds));
}

void ButtonGroupPane::AddButtonText(short dh, short dv, UString const &text) {
    Point origin = {dv, dh};
    if (!buttons.empty()) {
        origin.v = Short(buttons.back().bounds.top + dv);
        origin.h = Short(buttons.back().bounds.left + dh);
    }
    SetFontData(GetIndVelaFont(kCodeFont));
    Rect const bounds = TextBounds(text, origin, PortFontInfo());
    RCPtr<GlogLayoutRectItem> const item = MakeTextItem(SpacingOfGlog(), bounds);
    // An empty table gives kNoButton.
    texts.push_back(
        {bounds, origin, Short(CountButtons() - 1), kCodeFont, StringMgr::Instance().Store(text), item});
}

// Asked twice for each button, so that the key is kept.
int ButtonGroupPane::SpacingOfGlog() const {
    static UString const key = ResourceKey(kGroupSpacingKey);
    GlogStyleSheet *const sheet = glog->GetStyleSheet();
    return sheet ? sheet->GetSInt32ItemValue(key) : 0;
}

RCPtr<GlogLayoutRectItem> ButtonGroupPane::MakeButtonItem(int spacing, Rect const &bounds) {
    Rect const icon = {Short(spacing / 2 - kIconAboveMiddle), 0, Short(spacing / 2 + kIconBelowMiddle),
                       kIconWidth};
    RCPtr<GlogLayoutRectItem> item =
        GlogLayout::MakeRectItem(icon, bounds, kNoPane, NumLayoutSubItems(), GetLayoutRect()->GetName());
    item->SetAttribute(GlogLayoutItem::kInsetTop, kButtonInsetTop, GlogLayoutItem::kPixels, UString());
    AddLayoutSubItem(item);
    return item;
}

// In a layout a text takes a whole line, whatever the height of its font.
RCPtr<GlogLayoutRectItem> ButtonGroupPane::MakeTextItem(int spacing, Rect bounds) {
    bounds.bottom = Short(bounds.top + spacing);
    RCPtr<GlogLayoutRectItem> item =
        GlogLayout::MakeRectItem(bounds, kNoPane, NumLayoutSubItems(), GetLayoutRect()->GetName());
    AddLayoutSubItem(item);
    return item;
}

void ButtonGroupPane::AppendButton(Rect const &bounds, RCPtr<GlogLayoutRectItem> const &item) {
    bool const enabled = true, value = false;
    buttons.push_back({bounds, enabled, value, item});
}

// Buttons of a resource

// Goes through the item of a group. The line spacing, the font that is set and the place of the last text
// hold from one button to the next.
class ButtonGroupPane::ItemReader {
public:
    ItemReader(ButtonGroupPane &pane_, int spacing_)
        : pane(pane_)
        , spacing(spacing_)
        , box{kBeyondRight, kBeyondRight, 0, 0}
        , textOrigin()
        , lastFont(kNoFont)
        , info(PortFontInfo()) {}

    typedef boost::shared_ptr<XMLLib::ContainerItem> Container;

    // A required container is missing: the same as memory that is. A host whose FailMemFullError returns runs
    // into the assertion of the pointer.
    static Container Required(Container const &container) {
        if (!container)
            FailMemFullError();
        return container;
    }

    void ReadButton(Container const &item) {
        Point origin = {0, 0};
        XMLLib::MaybeGetPoint(item, ResourceKey("Origin"), origin);
        int const extension = static_cast<short>(item->GetSIntItemValue(ResourceKey("HitExtension")));
        Rect const bounds = {origin.v, origin.h, Short(origin.v + kIconHeight),
                             Short(origin.h + extension + kIconWidth)};
        RCPtr<GlogLayoutRectItem> const layoutItem = pane.MakeButtonItem(spacing, bounds);
        Container const strings = Required(item->GetContainerItem(ResourceKey("RadioCheckButtonStrings")));
        short const index = Short(pane.CountButtons());
        pane.AppendButton(bounds, layoutItem);
        Unite(box, bounds);
        for (std::size_t i = 0; i < strings->GetNumItems(); ++i)
            ReadText(Required(XMLLib::ContainerFromItem(strings->GetNthItem(i))), index);
    }

    // Round everything that was read; its bottom and right are never above or left of 0.
    Rect const &Box() const { return box; }

private:
    void ReadText(Container const &item, short button) {
        XMLLib::MaybeGetPoint(item, ResourceKey("Origin"), textOrigin);
        short const fsrid = static_cast<short>(item->GetSIntItemValue(ResourceKey("FSRID")));
        short const font = FontOfLabel(fsrid);
        UString const text = item->GetUStringItemValue(ResourceKey("Text"));
        SetFont(font);
        Rect const bounds = TextBounds(text, textOrigin, info);
        RCPtr<GlogLayoutRectItem> const layoutItem = pane.MakeTextItem(spacing, bounds);
        pane.texts.push_back(
            {bounds, textOrigin, button, font, StringMgr::Instance().Store(text), layoutItem});
        Unite(box, bounds);
    }

    void SetFont(short font) {
        if (font == lastFont)
            return;
        lastFont = font;
        SetFontData(GetIndVelaFont(font));
        info = PortFontInfo();
    }

    ButtonGroupPane &pane;
    int spacing;
    Rect box;
    Point textOrigin;
    short lastFont;
    TarnQuickDrawText::FontInfo info; // of lastFont, or of the port's font at first
};

void ButtonGroupPane::GlogItemFromRes(GlogStyleSheet *sheet) {
    ItemReader reader(*this, sheet->GetSInt32ItemValue(ResourceKey("LineSpacing")));
    ItemReader::Container const items =
        ItemReader::Required(sheet->GetItemRes()->GetContainerItem(ResourceKey("RadioCheckButtonItems")));
    for (std::size_t i = 0; i < items->GetNumItems(); ++i)
        reader.ReadButton(ItemReader::Required(XMLLib::ContainerFromItem(items->GetNthItem(i))));
    Rect box = reader.Box();
    GlogPane::SetBox(&box); // not the group's own, which would move what has its place already
}

// Names and help tags

void ButtonGroupPane::GetNthButtonName(int n, UString &out) {
    out = StringMgr::Instance().Lookup(texts[static_cast<std::size_t>(n)].stringKey);
}

void ButtonGroupPane::SetNthButtonName(int n, UString const &text) {
    ButtonTextRec &label = texts[static_cast<std::size_t>(n)];
    // The caller's may be the very string that is freed.
    UString const copy = text; // NOLINT(performance-unnecessary-copy-initialization)
    StringMgr::Instance().Free(label.stringKey);
    label.stringKey = StringMgr::Instance().Store(copy);
    // In whatever font the port has: setting the label's would be one more change to the port.
    label.bounds.right = Short(label.origin.h + StringWidth(copy));
    label.layoutItem->SetAttribute(GlogLayoutItem::kWidth, label.bounds.right - label.bounds.left,
                                   GlogLayoutItem::kPixels, UString());
}

void ButtonGroupPane::AttachHelpTag(short index, LocalizedStrings::HelpTag const *tag) {
    Rect rect;
    GetButtonBounds(index, &rect);
    AttachPartHelpTag(*this, tag, rect);
}

// Auto-set

void ButtonGroupPane::SetAutoBinding(Provider<AutoSetActivityListener> *source, int button) {
    autoSetBindings.push_back({source, button});
    source->AddDependent(this);
}

int ButtonGroupPane::FindAutoSetSource(Provider<AutoSetActivityListener> *source) const {
    auto const row =
        std::find_if(autoSetBindings.begin(), autoSetBindings.end(),
                     [source](AutoSetBinding const &binding) { return binding.source == source; });
    return row == autoSetBindings.end() ? -1 : static_cast<int>(row - autoSetBindings.begin());
}

void ButtonGroupPane::ListenToActivity(Provider<AutoSetActivityListener> *source) {
    int const row = FindAutoSetSource(source);
    if (row >= 0)
        AutoSetButton(autoSetBindings[static_cast<std::size_t>(row)].button);
}

// Only the first row goes: further ones of the provider stay, and are compared with but never followed.
void ButtonGroupPane::ProviderDying(Provider<AutoSetActivityListener> *source) {
    int const row = FindAutoSetSource(source);
    if (row >= 0)
        autoSetBindings.erase(autoSetBindings.begin() + row);
}

// Values

bool ButtonGroupPane::IsOn(short index) const {
    return index >= 0 && index < CountButtons() && buttons[static_cast<std::size_t>(index)].value;
}

bool ButtonGroupPane::IsEnabled(short index) const {
    return index >= 0 && index < CountButtons() && buttons[static_cast<std::size_t>(index)].enabled;
}

void ButtonGroupPane::TurnOnQuietly(short index) {
    if (index >= 0 && index < CountButtons())
        buttons[static_cast<std::size_t>(index)].value = true;
}

void ButtonGroupPane::SetOneEnable(short index, bool enabled) { SetButton(index, enabled, true); }

void ButtonGroupPane::SetAllEnable(bool enabled) { SetAllButtons(enabled, true, kEveryButton); }

void ButtonGroupPane::SetAllButtons(bool value, bool isEnable, short except) {
    // Not those that a listener adds on the way.
    int const count = CountButtons();
    PaneWatch const self(this);
    for (int i = 0; i < count && self.PaneExists(); ++i)
        if (i != except)
            SetButton(Short(i), value, isEnable);
}

void ButtonGroupPane::SetButton(short index, bool value, bool isEnable) {
    if (index < 0 || index >= CountButtons())
        return;
    ButtonRec &button = buttons[static_cast<std::size_t>(index)];
    bool &field = isEnable ? button.enabled : button.value;
    if (value == field)
        return;
    field = value;
    PaneWatch const self(this);
    if (isEnable)
        Inval(); // the label changes its colour too
    else if (Provider<ButtonGroupPaneListener>::HasDependents())
        Provider<ButtonGroupPaneListener>::BroadcastChange(ButtonValueChangeMsg(this, index, value), nullptr);
    if (!self.PaneExists())
        return;
    if (GetVisibility()) {
        WithPerformLayoutRectUpdate const update(this);
        Prepare();
        InvalButton(index);
    }
    if (Provider<ButtonGroupPane_Listener>::HasDependents()) {
        ButtonGroupPane *const source = this;
        Message2<ButtonGroupPane_Listener, ButtonGroupPane *, ButtonGroupPane *, short, short> const message(
            &ButtonGroupPane_Listener::ButtonGroupPaneChanged, &source, &index);
        Provider<ButtonGroupPane_Listener>::BroadcastChange(message, nullptr);
    }
}

void ButtonGroupPane::SetAllowClicks(bool allow) { allowClicks = allow; }

void ButtonGroupPane::SetForPrinting(bool on) { forPrinting = on; }

// Geometry

template <class Part> Rect ButtonGroupPane::RectOf(Part const &part) const {
    return IsInLayout() ? part.layoutItem->GetBorderRect() : part.bounds;
}

template <class Part>
typename std::vector<Part>::const_iterator ButtonGroupPane::FirstAt(Point where,
                                                                    std::vector<Part> const &parts) const {
    // Asked once: groups may have thousands of parts.
    bool const inLayout = IsInLayout();
    return std::find_if(parts.begin(), parts.end(), [inLayout, where](Part const &part) {
        Rect const rect = inLayout ? part.layoutItem->GetBorderRect() : part.bounds;
        return VelaDrawing::PtInRect(where, &rect);
    });
}

template <class Visit> void ButtonGroupPane::VisitRectsFromLast(Visit const &visit) const {
    for (auto button = buttons.rbegin(); button != buttons.rend(); ++button)
        visit(RectOf(*button));
    for (auto text = texts.rbegin(); text != texts.rend(); ++text)
        visit(RectOf(*text));
}

void ButtonGroupPane::GetButtonBounds(short index, Rect *out) {
    *out = RectOf(buttons[static_cast<std::size_t>(index)]);
    // The last of the button's labels. A label is added for the last button, so that they are in its order.
    auto const behind =
        std::upper_bound(texts.begin(), texts.end(), index,
                         [](short button, ButtonTextRec const &label) { return button < label.button; });
    if (behind != texts.begin() && std::prev(behind)->button == index)
        Unite(*out, RectOf(*std::prev(behind)));
}

OSRgn *ButtonGroupPane::GetRgn() {
    OSRgn *const region = VelaDrawing::NewRgn();
    TempRgn const part;
    VisitRectsFromLast([&](Rect const &rect) {
        VelaDrawing::RectRgn(part, &rect);
        VelaDrawing::UnionRgn(region, part, region);
    });
    return region;
}

void ButtonGroupPane::CalcBox() {
    if (IsInLayout())
        return;
    Rect box = {kBeyondRight, kBeyondRight, kBeyondLeft, kBeyondLeft};
    VisitRectsFromLast([&box](Rect const &rect) { Unite(box, rect); });
    SetBox(&box);
}

void ButtonGroupPane::SetBox(Rect *rect) {
    if (!IsInLayout()) {
        Rect box;
        GetBox(&box);
        OffsetButtons(Short(rect->left - box.left), Short(rect->top - box.top));
    }
    GlogPane::SetBox(rect);
}

void ButtonGroupPane::OffsetButtons(short dh, short dv) {
    Point const delta = {dv, dh};
    for (ButtonRec &button : buttons)
        VelaDrawing::OffsetRect(&button.bounds, dh, dv);
    for (ButtonTextRec &text : texts) {
        VelaDrawing::OffsetRect(&text.bounds, dh, dv);
        VelaDrawing::AddPt(delta, &text.origin);
    }
    OffsetLayoutSubItems(delta);
}

// Drawing

void ButtonGroupPane::DrawGuts(OSRgn *region) {
    Rect box;
    GetBox(&box);
    Updated const updated(region);
    if (!updated(box))
        return;
    SaveColors const colors;
    ClearColors();
    SetBackgroundColor(glog->GetContentColor());
    DrawTexts(region);
    ClearColors();
    for (int i = 0; i < CountButtons(); ++i) {
        if (updated(RectOf(buttons[static_cast<std::size_t>(i)])))
            RedrawButton(Short(i));
    }
}

// Leaves the last font in the port, where SetNthButtonName finds it.
void ButtonGroupPane::DrawTexts(OSRgn *region) {
    bool const inLayout = IsInLayout();
    Updated const updated(region);
    short lastFont = kNoFont;
    TarnQuickDrawText::FontInfo info = PortFontInfo();
    for (ButtonTextRec const &text : texts) {
        Rect const rect = RectOf(text);
        if (!updated(rect))
            continue;
        if (text.font != lastFont) {
            lastFont = text.font;
            SetFontData(GetIndVelaFont(text.font));
            info = PortFontInfo();
        }
        Point pen = text.origin;
        if (inLayout)
            // Each half is rounded by itself, so that the baseline stays put when the font changes by a
            // pixel.
            pen = {Short(info.ascent / 2 + (rect.bottom - rect.top) / 2 + rect.top), rect.left};
        pen.v = Short(pen.v + kTextDrop);
        SetForegroundColor(IsTextEnabled(text) ? kDialogActiveTextColor : kDialogInactiveTextColor);
        DrawStringAtPoint(StringMgr::Instance().Lookup(text.stringKey), pen, kNoLimit,
                          TextSettings::kTruncateNone);
    }
}

bool ButtonGroupPane::IsTextEnabled(ButtonTextRec const &text) const {
    return text.button == kNoButton || buttons[static_cast<std::size_t>(text.button)].enabled;
}

short ButtonGroupPane::IconOf(ButtonRec const &button) const {
    if (!button.enabled)
        return disabledIcon;
    return button.value ? onIcon : offIcon;
}

void ButtonGroupPane::RedrawButton(short index) {
    if (!GetVisibility())
        return;
    ButtonRec const &button = buttons[static_cast<std::size_t>(index)];
    Rect const rect = RectOf(button);
    Draw1Icon(kButtonFamily, IconOf(button), rect.left, Short(rect.top + kIconDrop));
}

void ButtonGroupPane::InvalButton(short index) {
    if (!GetVisibility())
        return;
    Rect rect = RectOf(buttons[static_cast<std::size_t>(index)]);
    VelaDrawing::InsetRect(&rect, -kInvalMargin, -kInvalMargin);
    VelaDrawing::InvalRect(&rect);
}

// Clicks

int ButtonGroupPane::HandleClick(EventRecordAdapter *event) {
    if (!allowClicks)
        return -1;
    short const modifiers = static_cast<short>(event->modifiers);
    auto const text = FirstAt(event->where, texts);
    // A label of no button hides the labels that it covers, but no button.
    if (text != texts.end() && text->button != kNoButton)
        return ResultOfClick(text->button, modifiers);
    auto const button = FirstAt(event->where, buttons);
    return button == buttons.end() ? 0 : ResultOfClick(Short(button - buttons.begin()), modifiers);
}

int ButtonGroupPane::ResultOfClick(short index, short modifiers) {
    return TrackButton(index, modifiers) ? index + 1 : -1;
}

bool ButtonGroupPane::TrackButton(short index, short) {
    ButtonRec const &button = buttons[static_cast<std::size_t>(index)];
    if (!button.enabled)
        return false;
    Prepare();
    Rect const icon = RectOf(button);
    IconTrackingRec rec;
    rec.v = Short(icon.top + kIconDrop);
    rec.h = icon.left;
    rec.family = kButtonFamily;
    rec.idleIcon = IconOf(button);
    rec.pressedIcon = Short(rec.idleIcon + 1);
    rec.releaseIcon = GetReleaseIcon(button.value);
    // Over the label the button stays pressed too.
    Rect rect;
    GetButtonBounds(index, &rect);
    PaneWatch const self(this);
    return TrackSpecialIconButton(true, &rect, &rec, IconButtonTransitionProc) && self.PaneExists();
}
