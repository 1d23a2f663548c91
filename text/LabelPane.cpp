#include "text/LabelPane.h"
#include "frame/ResourceReading.h"
#include "host/GlogLayout.h"
#include "host/GlogStyleSheet.h"
#include "host/PortSavers.h"
#include "host/TarnError.h"
#include "host/glogRec.h"
#include "text/FontIndex.h"
#include <memory>
#include <new>

namespace {

short const kNoFont = -1;

short Width(Rect const &r) { return static_cast<short>(r.right - r.left); }

short Height(Rect const &r) { return static_cast<short>(r.bottom - r.top); }

Point Moved(Point p, int dv, int dh) {
    return Point{static_cast<short>(p.v + dv), static_cast<short>(p.h + dh)};
}

void SetPixels(GlogLayoutRectItem &item, GlogLayoutItem::Attribute attribute, int value) {
    item.SetAttribute(attribute, value, GlogLayoutItem::kPixels, UString());
}

} // namespace

LabelPane::LabelPane()
    : lineSpacing(0)
    , hOption(kTextStartsAtAnchor)
    , vOption(kTopAtAnchor)
    , origin()
    , fontFSRID(kNoFont) {}

LabelPane *LabelPane::NewLabelPane(glogRec *owner, gStringResRec *resource) {
    std::unique_ptr<LabelPane> pane(new (std::nothrow) LabelPane);
    if (!pane || !pane->LabelPaneResInit(owner, resource))
        return nullptr;
    return pane.release();
}

LabelPane *LabelPane::NewLabelPane(glogRec *owner, int id, Rect *rect, bool rightAligned,
                                   const UString &text) {
    gStringResRec resource;
    resource.kind = gStringResRec::kKind;
    resource.anchor = Point{rect->bottom, rightAligned ? rect->right : rect->left};
    resource.font = 0;
    resource.alignment = rightAligned ? gStringResRec::kAlignRight : gStringResRec::kAlignLeft;
    resource.reserved = 0;
    std::unique_ptr<LabelPane> pane(NewLabelPane(owner, &resource));
    if (!pane)
        FailMemFullError();
    pane->SetText(text);
    pane->SetID(id);
    return pane.release();
}

LabelPane *LabelPane::NewLabelPane(glogRec *owner, GlogStyleSheet *sheet) {
    gStringResRec resource;
    resource.kind = gStringResRec::kKind;
    resource.anchor = OptionalPoint(sheet->GetItemRes(), "Origin");
    short const font = FontIndexFromFSRID(sheet->GetSInt32ItemValue(ResourceKey("FSRID")));
    resource.font = static_cast<unsigned char>(font);
    resource.alignment = static_cast<unsigned char>(sheet->GetSInt32ItemValue(ResourceKey("Align")));
    resource.reserved = 0;
    UString const text = sheet->GetUStringItemValue(ResourceKey("Text"));
    int const spacing = sheet->GetSInt32ItemValue(ResourceKey("LineSpacing"));

    std::unique_ptr<LabelPane> pane(NewLabelPane(owner, &resource));
    if (!pane)
        return nullptr;
    pane->SetText(text);
    pane->SetLineSpacing(spacing);
    return pane.release();
}

LabelPane *LabelPane::LabelPaneInit(glogRec *owner, short id, const UString &text) {
    return LabelPaneImplementationInit(owner, id, text) ? this : nullptr;
}

LabelPane *LabelPane::LabelPaneResInit(glogRec *owner, gStringResRec *resource) {
    if (!LabelPaneImplementationInit(owner, 0, UString()))
        return nullptr;
    origin = resource->anchor;
    switch (resource->alignment) {
    case gStringResRec::kAlignLeft:
        hOption = kTextStartsAtAnchor;
        break;
    case gStringResRec::kAlignRight:
        hOption = kTextEndsAtAnchor;
        break;
    case gStringResRec::kAlignCenter:
        hOption = kTextCentredOnAnchor;
        break;
    default:
        break;
    }
    vOption = kBaselineAtAnchor;
    SetFontFSRID(resource->font);
    return this;
}

void LabelPane::SetFontFSRID(short index) {
    fontFSRID = index;
    SetFont(*GetIndVelaFont(index));
}

void LabelPane::SetHOption(short option) {
    hOption = option;
    CalcBox();
}

void LabelPane::SetVOption(short option) {
    vOption = option;
    CalcBox();
}

void LabelPane::SetOrigin(Point anchor) {
    origin = anchor;
    CalcBox();
}

void LabelPane::SetLineSpacing(int pixels) {
    lineSpacing = pixels;
    SetPixels(*GetLayoutRect(), GlogLayoutItem::kHeight, pixels);
}

void LabelPane::SetBox(Rect *box) {
    if (!IsInLayout()) {
        Rect oldBox;
        GetBox(&oldBox);
        origin = Moved(origin, box->top - oldBox.top, box->left - oldBox.left);
        CalcBox();
        return;
    }
    // Not the base's, which would size the box to the text. NOLINTNEXTLINE(bugprone-parent-virtual-call)
    GlogPane::SetBox(box);
    TarnQuickDrawText::FontInfo info;
    _GetFontInfoMethod(&info);
    SetTextOrigin(Point{static_cast<short>(Height(*box) / 2 + info.ascent / 2 + box->top), box->left});
}

void LabelPane::Offset(Point delta) {
    GlogPane::Offset(delta);
    // Only box and anchor: the pen start of the text follows at the next CalcBox, as after every plain store.
    origin = Moved(origin, delta.v, delta.h);
}

void LabelPane::CalcBox() {
    Rect oldBox;
    GetBox(&oldBox);
    short const width = MeasureTextInGlog();
    short const extraWidth = GetExtraWidth();
    short const extraHeight = GetExtraHeight();
    TarnQuickDrawText::FontInfo info;
    _GetFontInfoMethod(&info);

    short const baseline = Baseline(info);
    short const left = TextLeft(width);
    Rect box;
    box.left = static_cast<short>(left - (extraWidth >> 1));
    box.top = static_cast<short>(baseline - info.ascent - (extraHeight >> 1));
    // The sums wrap before they are halved, as all coordinates do.
    box.right = static_cast<short>(left + width + (static_cast<short>(extraWidth + 1) >> 1));
    box.bottom = static_cast<short>(baseline + info.descent + (static_cast<short>(extraHeight + 1) >> 1));

    if (!IsInLayout()) {
        SetTextOrigin(Point{baseline, left});
        GlogPane::SetBox(&box); // the box is measured already. NOLINT(bugprone-parent-virtual-call)
    }
    ReportNaturalSize(oldBox, box);
}

short LabelPane::MeasureTextInGlog() {
    WithPort const port;
    SetPortToGlog(glog);
    return _StringWidthMethod();
}

short LabelPane::Baseline(TarnQuickDrawText::FontInfo const &info) const {
    switch (vOption) {
    case kTopAtAnchor:
        return static_cast<short>(origin.v + info.ascent);
    case kBottomAtAnchor:
        return static_cast<short>(origin.v - info.descent);
    default:
        return origin.v;
    }
}

short LabelPane::TextLeft(short width) const {
    switch (hOption) {
    case kTextEndsAtAnchor:
        return static_cast<short>(origin.h - width);
    case kTextCentredOnAnchor:
        return static_cast<short>(origin.h - width / 2);
    default:
        return origin.h;
    }
}

void LabelPane::ReportNaturalSize(Rect const &oldBox, Rect const &newBox) {
    if (Width(newBox) != Width(oldBox))
        SetPixels(*GetLayoutRect(), GlogLayoutItem::kWidth, Width(newBox));
    if (Height(newBox) != Height(oldBox) && lineSpacing == 0)
        SetPixels(*GetLayoutRect(), GlogLayoutItem::kHeight, Height(newBox));
}

void LabelPane::DontMakeConcrete() {}
