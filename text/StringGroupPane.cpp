#include "text/StringGroupPane.h"
#include "frame/ResourceReading.h"
#include "host/GlogStyleSheet.h"
#include "host/NamedColors.h"
#include "host/PortSavers.h"
#include "host/TextLayout.h"
#include "host/VelaDrawing.h"
#include "scrolling/Truncation.h"
#include "text/FontIndex.h"
#include <algorithm>

namespace {

// What uniting begins with: it contains nothing.
Rect const kNothing = {10000, 10000, -10000, -10000};
int const kNoPane = -1;  // of a layout item
int const kNoLimit = -1; // to a text's width

} // namespace

StringGroupPane::StringGroupPane()
    : font(0)
    , lineSpacing(0) {
    UseLayoutSubItemMode();
}

StringGroupPane::~StringGroupPane() {}

StringGroupPane *StringGroupPane::NewStringGroupPane(glogRec *owner, int id, GlogStyleSheet *sheet) {
    StringGroupPane *const pane = new StringGroupPane;
    pane->GlogPaneInit(owner, static_cast<short>(id));
    pane->GetFromXML(sheet);
    return pane;
}

void StringGroupPane::GetFromXML(GlogStyleSheet *sheet) {
    font = FontIndexFromFSRID(sheet->GetSInt32ItemValue(ResourceKey("FSRID")));
    boost::shared_ptr<XMLLib::ContainerItem> const list = sheet->GetContainerItem(ResourceKey("TextList"));
    int const count = static_cast<int>(list->GetNumItems());
    if (count < 1)
        return;
    lineSpacing = sheet->GetSInt32ItemValue(ResourceKey("LineSpacing"));
    TarnQuickDrawText::FontInfo const info = UseFont();
    for (int i = 0; i < count; ++i) {
        boost::shared_ptr<XMLLib::ContainerItem> const item =
            XMLLib::ContainerFromItem(list->GetNthItem(static_cast<std::size_t>(i)));
        Point origin = {0, 0};
        XMLLib::MaybeGetPoint(item, ResourceKey("TextOrigin"), origin);
        StringInfo string;
        string.text = item->GetUStringItemValue(ResourceKey("Text"));
        SetTextBox(string, i, origin, info);
        strings.push_back(string);
    }
}

// Makes the font the port's.
TarnQuickDrawText::FontInfo StringGroupPane::UseFont() const {
    SetFontData(GetIndVelaFont(font));
    TarnQuickDrawText::FontInfo info;
    tarn::GetFontInfo(info);
    return info;
}

// The origin is the start of the baseline, though DrawGuts only uses the box that follows from it.
void StringGroupPane::SetTextBox(StringInfo &string, int index, Point origin,
                                 TarnQuickDrawText::FontInfo const &info) {
    short const top = Pixel16(origin.v - info.ascent);
    string.box = {top, origin.h, Pixel16(0LL + top + lineSpacing),
                  Pixel16(0LL + origin.h + LooseStringWidth(string.text, 0.0f, 1.0f))};
    string.item = GlogLayout::MakeRectItem(string.box, kNoPane, index, GetLayoutRect()->GetName());
    AddLayoutSubItem(string.item);
}

// Geometry

void StringGroupPane::GetBox(Rect *out) {
    if (IsInLayout()) {
        GlogPane::GetBox(out);
        return;
    }
    *out = kNothing;
    for (StringInfo const &string : strings) {
        out->top = std::min(out->top, string.box.top);
        out->left = std::min(out->left, string.box.left);
        out->bottom = std::max(out->bottom, string.box.bottom);
        out->right = std::max(out->right, string.box.right);
    }
}

void StringGroupPane::SetBox(Rect *box) {
    if (IsInLayout()) {
        GlogPane::SetBox(box);
        return;
    }
    Rect former;
    GetBox(&former);
    GlogPane::SetBox(box);
    int const dv = box->top - former.top, dh = box->left - former.left;
    for (StringInfo &string : strings) {
        Rect const &old = string.box;
        string.box = {Pixel16(old.top + dv), Pixel16(old.left + dh), Pixel16(old.bottom + dv),
                      Pixel16(old.right + dh)};
    }
}

int StringGroupPane::HandleClick(EventRecordAdapter *) { return 0; }

// Half of the ascent above the middle of the box, whatever the origin was, in a layout and outside of one.
void StringGroupPane::DrawGuts(OSRgn *) {
    SaveTextState const textState;
    SaveColors const colors;
    short const ascent = UseFont().ascent;
    VelaDrawing::RGBForeColor(kDialogActiveTextColor);
    for (StringInfo const &string : strings) {
        Rect const r = IsInLayout() ? string.item->GetBorderRect() : string.box;
        Point const start = {Pixel16(r.top + ascent / 2 + (r.bottom - r.top) / 2), r.left};
        DrawStringAtPoint(string.text, start, kNoLimit, TextSettings::kTruncateNone);
    }
}
