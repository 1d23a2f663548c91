#include "host/LocalizedStrings.h"
#include "host/OSFont.h"
#include "host/PageFormat.h"
#include "host/TextLayout.h"
#include "host/VelaDrawing.h"
#include "lists/GListPane.h"
#include "scrolling/Truncation.h"

namespace {

enum Kinds { kBeginAtPage = 2, kPrintPage = 3, kEnd = 4 };

short const kMargin = 4, kHeaderHeight = 35; // pixels
short const kPrintedLineHeight = 12;
short const kFirstLine = 20, kSecondLine = 5; // baselines above the rows
short const kGap = 40;                        // between the texts of the first line
int const kPrintFont = 4;                     // index in the font table
short const kBlack = 0;                       // percent of white
short const kWords = 4325, kPageWord = 22;    // string list, and the word before a page's number

// What printing has replaced, of the one list that prints.
struct Setup {
    GListPane *list;
    int numDisplayed, topLine;
    short lineHeight;
    Rect box;
};
Setup before = {nullptr, 0, 0, 0, {0, 0, 0, 0}};

UString PageLine(int page) {
    UString line = LocalizedStrings::GetString(kWords, kPageWord);
    UString number;
    tarn::NumToUString(page, tarn::kPlainNumber, number);
    line += UString(" ", UString::kByteEncoding1);
    line += number;
    return line;
}

void DrawAt(UString const &text, int h, int v) {
    VelaDrawing::MoveTo(Pixel16(h), Pixel16(v));
    DrawString(text);
}

} // namespace

bool GListPane::Print(PrintMessageRec *message) {
    switch (message->kind) {
    case kBeginAtPage:
        SaveSetup();
        return ScrollToPage(message->page);
    case kPrintPage:
        return PrintPage(message);
    case kEnd:
        RestoreSetup();
        return false;
    default:
        return false;
    }
}

void GListPane::SaveSetup() {
    if (before.list == this)
        return;
    if (before.list)
        before.list->RestoreSetup();
    before = {this, numDisplayed, topLine, res.lineHeight, GetBounds()};
    if (PageFormat *const format = PageFormat::GetCurrentFormat(true)) {
        Rect page = format->GetPageRect();
        VelaDrawing::InsetRect(&page, kMargin, kMargin);
        page.top = Pixel16(page.top + kHeaderHeight);
        res.lineHeight = kPrintedLineHeight;
        SetBox(&page);
        numDisplayed = numFullLines;
    }
    printing = true;
}

void GListPane::RestoreSetup() {
    if (before.list != this)
        return;
    Setup kept = before;
    ForgetSetup();
    res.lineHeight = kept.lineHeight;
    topLine = kept.topLine; // so that the bar shows it again
    SetBox(&kept.box);
    topLine = kept.topLine;
    numDisplayed = kept.numDisplayed;
}

void GListPane::ForgetSetup() {
    if (before.list != this)
        return;
    before.list = nullptr;
    printing = false;
}

bool GListPane::ScrollToPage(int page) {
    topLine = Saturated((page - 1LL) * numDisplayed);
    return topLine < numItems;
}

bool GListPane::ScrolledToEnd() { return topLine >= numItems; }

bool GListPane::PrintPage(PrintMessageRec *message) {
    if (!PageFormat::GetCurrentFormat(true))
        return false;
    SetFontData(GetIndVelaFont(kPrintFont));
    GrayForeColor(kBlack);
    Rect box;
    GetBox(&box);
    DrawAt(message->header[0], box.left, box.top - kFirstLine);
    VelaDrawing::Move(kGap, 0);
    DrawString(message->header[1]);
    DrawAt(message->header[2], box.left, box.top - kSecondLine);
    UString const pageLine = PageLine(message->page);
    DrawAt(pageLine, box.right - LooseStringWidth(pageLine, 0.0f, 1.0f), box.top - kFirstLine);
    DrawVisibleLines(nullptr);
    if (numDisplayed < 1) // a page without room for a row would be followed by others without end
        return false;
    topLine = Saturated(0LL + topLine + numDisplayed);
    return topLine < numItems;
}
