#include "bench/BenchPage.h"
#include "buttons/FrameButtonPane.h"
#include "buttons/OvalButtonPane.h"
#include "buttons/StudButtonPane.h"
#include "host/VelaDrawing.h"
#include "host/glogRec.h"
#include "text/LabelPane.h"

namespace {

enum Kind { kOval, kStud, kFrame, kLabel, kKinds };

short const kPaneWidth = 80;
short const kStockFrame = 1608, kFrameFace = 69;
int const kButtonPlace = 88; // of the one that is asked for; its kind has to be kOval
static_assert(kButtonPlace % kKinds == kOval, "the button stands where buttons do");

short LeftOf(int place) { return static_cast<short>(place % BenchPage::kColumns * BenchPage::kColumnWidth); }
short TopOf(int place) { return static_cast<short>(place / BenchPage::kColumns * BenchPage::kRowHeight); }

UString NameOf(int place) {
    UString name("Channel ", UString::kByteEncoding1), number;
    tarn::NumToUString(place + 1, tarn::kPlainNumber, number);
    name += number;
    return name;
}

} // namespace

BenchPage::BenchPage()
    : glog(desktop.NewGlog(GlogOptions().Size(kWidth, kHeight))) {
    for (int place = 0; place < kColumns * kRows; ++place)
        AddPane(place);
    ShowGlog(glog, kShowGlog);
    desktop.TakePresented(glog);
}

void BenchPage::AddPane(int place) {
    short const left = LeftOf(place), top = TopOf(place);
    switch (place % kKinds) {
    case kOval: {
        gobResRec record = {gobResRec::kKind, top, left, kPaneWidth, 0, GlogButtonPane::kEnabled};
        OvalButtonPane *oval = OvalButtonPane::NewOvalButtonPane(glog, &record);
        oval->SetButtonText(NameOf(place));
        if (place == kButtonPlace)
            button = oval;
        break;
    }
    case kStud: {
        studResRec record = {studResRec::kKind, top, left, 0, kPaneWidth};
        StudButtonPane::NewStudButtonPane(glog, &record)->SetLabel(NameOf(place));
        break;
    }
    case kFrame: {
        gfbResRec record = {gfbResRec::kKind, {top, left}, kStockFrame, kFrameFace, {0, 0}, 0, 0};
        FrameButtonPane::NewFrameButtonPane(glog, &record);
        break;
    }
    default: {
        Rect box = {top, left, static_cast<short>(top + 15), static_cast<short>(left + kPaneWidth)};
        LabelPane::NewLabelPane(glog, static_cast<short>(place + 1), &box, false, NameOf(place));
    }
    }
}

Point BenchPage::PlaceOfButton() {
    short const inside = 10;
    return {static_cast<short>(TopOf(kButtonPlace) + inside),
            static_cast<short>(LeftOf(kButtonPlace) + inside)};
}

void BenchPage::Redraw(Rect const &r) {
    SetPortToGlog(glog);
    VelaDrawing::InvalRect(&r);
    UpdateGlog(glog);
}
