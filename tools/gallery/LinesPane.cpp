#include "tools/gallery/LinesPane.h"
#include "frame/ResourceReading.h"
#include "host/GlogStyleSheet.h"
#include "host/NamedColors.h"
#include "host/PortSavers.h"
#include "host/TextLayout.h"
#include "host/VelaDrawing.h"
#include "lists/ListPane.h"
#include "scrolling/GutterPane.h"
#include "tools/gallery/LabelText.h"
#include "tools/gallery/Phrases.h"
#include "tools/gallery/WellPane.h"
#include <iterator>
#include <memory>
#include <new>

namespace {

short const kBarThickness = 16, kBorder = 1, kMargin = 6, kNumberWidth = 24; // pixels
short const kFirstBar = 904;                                                 // item number
int const kLineHeight = 18, kListWidth = 720;                                // pixels
int const kFont = 0;                                                         // index in the font table
int const kCentredVertically = 1;
Phrase const kSections[] = {Phrase::kFirstSection, Phrase::kSecondSection, Phrase::kThirdSection,
                            Phrase::kFourthSection};

short Pixel(int value) { return static_cast<short>(value); }

} // namespace

// The lines themselves.
class LinesPane::Lines : public ListPane {
public:
    explicit Lines(glogRec *owner)
        : ListPane(owner, kLineHeight) {}

    int GetListWidth() override { return kListWidth; }
    void DrawLine(int line, Rect rowBox) override {
        SaveColors const colors;
        SaveTextState const state;
        VelaDrawing::RGBForeColor(kDialogListBackgroundColor);
        VelaDrawing::PaintRect(&rowBox);
        SetFontData(GetIndVelaFont(kFont));
        Rect number = rowBox, text = rowBox;
        number.right = Pixel(number.left + kMargin + kNumberWidth);
        text.left = Pixel(number.right + kMargin);
        VelaDrawing::RGBForeColor(kDialogListInactiveTextColor);
        Draw(LabelText::OfNumber(line + 1), number, TextSettings::kAlignRight);
        VelaDrawing::RGBForeColor(kDialogListTextColor);
        Draw(Phrases::Get(kSections[line % static_cast<int>(std::size(kSections))]), text,
             TextSettings::kAlignLeft);
    }

private:
    static void Draw(UString const &text, Rect const &box, TextSettings::Alignment alignment) {
        DrawStringInRect(text, box, alignment, TextSettings::kTruncateEnd, kCentredVertically, 0, 0, 0.0f,
                         1.0f, 1.0f, 0.0f);
    }
};

// A strip with a bar. Its frame lies on that of the pane, and it leaves the corner to the other one.
class LinesPane::Gutter : public GutterPane {
public:
    Gutter(glogRec *owner, GutterType type)
        : GutterPane(owner, type) {
        SetNoErase(1);
    }

    // Null when memory is wanting.
    ScrollBarPane *AddBar() {
        sbarResRec record = {sbarResRec::kType, Pixel(GetGutterType() == kBottomGutter), {0, 0, 0, 0}, 0, 0};
        bar = ScrollBarPane::NewScrollBarPane(GetGlog(), &record);
        if (bar)
            Add(bar, -1);
        return bar;
    }

    void FillWithBar() {
        Rect box = {0, 0, Pixel(ItemHeight()), Pixel(ItemWidth())};
        if (bar)
            bar->SetBox(&box);
    }

private:
    void GutterLengthChanged(int) override { FillWithBar(); }
    int GetPaneRightEdgeOffset() override { return EdgeOffset(kRightGutter); }
    int GetPaneBottomEdgeOffset() override { return EdgeOffset(kBottomGutter); }
    // From the edge that the strip lies along, or of the other strip.
    int EdgeOffset(GutterType edge) { return GetGutterType() == edge ? kBorder : kBarThickness - kBorder; }

    ScrollBarPane *bar = nullptr; // a subpane
};

LinesPane *LinesPane::NewLinesPane(glogRec *owner, GlogStyleSheet *sheet) {
    std::unique_ptr<LinesPane> pane(new (std::nothrow)
                                        LinesPane(sheet->GetSInt32ItemValue(ResourceKey("Num"))));
    return pane && pane->Init(owner, OptionalRect(sheet->GetItemRes(), "BoundsRect")) ? pane.release()
                                                                                      : nullptr;
}

LinesPane::LinesPane(int count)
    : numLines(count) {
    SetNoErase(1);
}

bool LinesPane::Init(glogRec *owner, Rect box) {
    if (!CompoundPaneInit(owner, 0))
        return false;
    SetBox(&box);
    lines = new Lines(owner);
    Add(lines, -1);
    lines->SetNumLines(numLines);
    for (GutterPane::GutterType type : {GutterPane::kRightGutter, GutterPane::kBottomGutter}) {
        bool const isRight = type == GutterPane::kRightGutter;
        Gutter *const gutter = new Gutter(owner, type);
        ScrollBarPane *const bar = gutter->AddBar();
        if (!bar) {
            delete gutter;
            return false;
        }
        Add(gutter, -1);
        Rect strip = {0, 0, kBarThickness, kBarThickness};
        gutter->SetBox(&strip);
        gutter->Resize({0, 0}); // to its edge
        gutter->FillWithBar();
        bar->SetID(isRight ? kFirstBar : kFirstBar + 1);
        if (isRight)
            lines->SetVScrollBar(bar);
        else
            lines->SetHScrollBar(bar);
    }
    SetBox(&box);
    lines->SetVScrollPos(0);
    lines->SetHScrollPos(0);
    return true;
}

void LinesPane::SetBox(Rect *box) {
    CompoundPane::SetBox(box);
    if (!lines)
        return;
    Rect inner = {kBorder, kBorder, Pixel(ItemHeight() - kBarThickness), Pixel(ItemWidth() - kBarThickness)};
    lines->SetBox(&inner);
}

void LinesPane::DrawBackgroundGuts(OSRgn *) {
    SaveColors const colors;
    WellPane::DrawWell(GetDrawRectangle());
}
