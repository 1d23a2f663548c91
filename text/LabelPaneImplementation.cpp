#include "text/LabelPaneImplementation.h"
#include "host/NamedColors.h"
#include "host/PortSavers.h"
#include "host/TextLayout.h"
#include "host/VelaDrawing.h"

namespace {

short const kDefaultSize = 12;  // pixels
short const kMeasureWidth = -1; // a forced string width that forces nothing

float const kNoExtraSpacing = 0.0f;
float const kNaturalScale = 1.0f;

} // namespace

LabelPaneImplementation::LabelPaneImplementation()
    : textOrigin()
    , family(OS::Font::kFixedFontFamily0)
    , face(0)
    , size(kDefaultSize)
    , forcedStringWidth(kMeasureWidth)
    , forcedFontInfo()
    , foregroundColor(nullptr)
    , backgroundColor(nullptr)
    , useForeground(false)
    , useBackground(false)
    , eraseUnderneath(false)
    , grayTextMode(false)
    , extraWidth(0)
    , extraHeight(0)
    , truncation(TextSettings::kTruncateNone) {}

LabelPaneImplementation *LabelPaneImplementation::LabelPaneImplementationInit(glogRec *owner, short id,
                                                                              const UString &newText) {
    if (!GlogPaneInit(owner, id))
        return nullptr;
    SetText(newText);
    return this;
}

void LabelPaneImplementation::SetText(const UString &newText) {
    text = newText;
    CalcBox();
}

void LabelPaneImplementation::SetTextWithInval(const UString &newText) {
    if (newText == text)
        return;
    if (!text.empty())
        Inval();
    SetText(newText);
    Inval();
}

void LabelPaneImplementation::SetFace(short newFace) {
    face = newFace;
    CalcBox();
}

void LabelPaneImplementation::SetSize(short newSize) {
    size = newSize;
    CalcBox();
}

// By value, as the interface has it. NOLINTNEXTLINE(performance-unnecessary-value-param)
void LabelPaneImplementation::SetFont(fontSaveRec font) {
    bool const changes =
        font.family.GetOrderedFontID() != family.GetOrderedFontID() || font.face != face || font.size != size;
    family = font.family;
    face = font.face;
    size = font.size;
    if (changes)
        CalcBox();
}

void LabelPaneImplementation::SetTruncation(TextSettings::TruncateCode code) { truncation = code; }

void LabelPaneImplementation::SetExtraWidth(short pixels) { extraWidth = pixels; }

void LabelPaneImplementation::SetExtraHeight(short pixels) { extraHeight = pixels; }

void LabelPaneImplementation::SetPaneForegroundColor(const RGBColor *color) {
    foregroundColor = color;
    useForeground = true;
}

void LabelPaneImplementation::SetPaneBackgroundColor(const RGBColor *color) {
    backgroundColor = color;
    useBackground = true;
}

void LabelPaneImplementation::SetNoForegroundColor() { useForeground = false; }

void LabelPaneImplementation::SetNoBackgroundColor() { useBackground = false; }

void LabelPaneImplementation::SetGrayTextMode(bool on) {
    if (on == grayTextMode)
        return;
    grayTextMode = on;
    Inval();
}

void LabelPaneImplementation::EraseUnderneath(bool on) { eraseUnderneath = on; }

void LabelPaneImplementation::ForceStringWidth(short pixels) { forcedStringWidth = pixels; }

void LabelPaneImplementation::ForgetForcedStringWidth() { forcedStringWidth = kMeasureWidth; }

void LabelPaneImplementation::ForceFontInfo(TarnQuickDrawText::FontInfo info) { forcedFontInfo = info; }

void LabelPaneImplementation::ForgetForcedFontInfo() { forcedFontInfo.widMax = 0; }

void LabelPaneImplementation::SetTextOrigin(Point origin) { textOrigin = origin; }

void LabelPaneImplementation::SetBox(Rect *box) {
    GlogPane::SetBox(box);
    CalcBox();
}

void LabelPaneImplementation::CalcBox() {
    TarnQuickDrawText::FontInfo info;
    _GetFontInfoMethod(&info);
    Rect box;
    GetBox(&box);
    int const textLeft = box.left + (extraWidth >> 1);
    SetTextOrigin(
        Point{static_cast<short>(box.top + info.ascent + (extraHeight >> 1)), static_cast<short>(textLeft)});
    // The sum wraps before it is halved, as all coordinates do.
    int const rightExtra = static_cast<short>(extraWidth + 1) >> 1;
    box.right = static_cast<short>(textLeft + _StringWidthMethod() + rightExtra);
    box.bottom = static_cast<short>(box.top + extraHeight + info.ascent + info.descent);
    GlogPane::SetBox(&box);
}

void LabelPaneImplementation::_GetFontInfoMethod(TarnQuickDrawText::FontInfo *info) {
    if (forcedFontInfo.widMax != 0) {
        *info = forcedFontInfo;
        return;
    }
    SetPortStyle();
    tarn::GetFontInfo(*info);
}

short LabelPaneImplementation::_StringWidthMethod() {
    if (forcedStringWidth >= 0)
        return forcedStringWidth;
    SetPortStyle();
    return static_cast<short>(LooseStringWidth(text, kNoExtraSpacing, kNaturalScale));
}

// Labels are many and mostly alike: what the port has already is not set again, so that its caches stay.
void LabelPaneImplementation::SetPortStyle() {
    OSPort *port = nullptr;
    VelaDrawing::GetPort(&port);
    if (VelaDrawing::GetPortTextFont(port).GetOrderedFontID() != family.GetOrderedFontID())
        VelaDrawing::TextFont(family);
    if (static_cast<short>(VelaDrawing::GetPortTextFace(port)) != face)
        VelaDrawing::TextFace(face);
    if (VelaDrawing::GetPortTextSize(port) != size)
        VelaDrawing::TextSize(size);
}

void LabelPaneImplementation::SetPortColors() {
    if (useForeground)
        SetForegroundColor(*foregroundColor);
    if (useBackground)
        SetBackgroundColor(*backgroundColor);
}

void LabelPaneImplementation::DrawGuts(OSRgn *) {
    Prepare();
    SaveTextState const textState;
    SaveColors const colors;
    SetPortStyle();
    SetPortColors();
    if (eraseUnderneath)
        EraseBox();
    Point const origin = DrawingOrigin();
    if (!useForeground)
        SetForegroundColor(grayTextMode ? kDialogInactiveTextColor : kDialogActiveTextColor);
    short const width = _StringWidthMethod();
    DrawStringAtPoint(text, origin, width, truncation);
}

void LabelPaneImplementation::EraseBox() {
    Rect box;
    GetBox(&box);
    VelaDrawing::EraseRect(&box);
}

// In a layout the text is centred in the item's height. A line higher than the item starts at the item's top,
// so that rather its descenders are cut than its capitals.
Point LabelPaneImplementation::DrawingOrigin() {
    if (!IsInLayout())
        return textOrigin;
    TarnQuickDrawText::FontInfo info;
    _GetFontInfoMethod(&info);
    Rect const item = GetLayoutRect()->GetItemRect();
    short const height = static_cast<short>(item.bottom - item.top);
    int const baseline = height > info.ascent + info.descent ? info.ascent / 2 + height / 2 : info.ascent;
    return Point{static_cast<short>(item.top + baseline), item.left};
}

int LabelPaneImplementation::HandleClick(EventRecordAdapter *) { return 0; }
