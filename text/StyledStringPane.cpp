#include "text/StyledStringPane.h"
#include "frame/ResourceReading.h"
#include "host/GlogStyleSheet.h"
#include "host/NamedColors.h"
#include "host/PortSavers.h"
#include "host/VelaDrawing.h"
#include "host/glogRec.h"
#include "scrolling/Truncation.h"
#include "text/ItemSize.h"

StyledStringPane::StyledStringPane(glogRec *owner, short id, bool keepRightDistance_)
    : styledString(nullptr)
    , alignment(kLeft)
    , keepRightDistance(keepRightDistance_ && owner)
    , eraseBackground(false)
    , rightDistance(0)
    , lineSpacing(0)
    , topBorder(0) {
    if (!GlogPaneInit(owner, id))
        return;
    if (GlogStyleSheet *const sheet = owner->GetStyleSheet()) {
        lineSpacing = sheet->GetSInt32ItemValue(ResourceKey("GStyledString_LineSpacing"));
        topBorder = sheet->GetSInt32ItemValue(ResourceKey("GStyledString_TopBorder"));
    }
    if (keepRightDistance)
        rightDistance = DistanceOf(GetBounds().right);
}

StyledStringPane::~StyledStringPane() { delete styledString; }

short StyledStringPane::DistanceOf(short right) const { return Pixel16(GetGlogWidth(glog) - right); }

void StyledStringPane::AdoptStyledString(AutoPtr<StyledString> newString) {
    StyledString *const former = styledString;
    styledString = newString.release();
    if (former != styledString)
        delete former;
    Inval();
    CalcBox();
}

void StyledStringPane::AdoptStyledStringItem(AutoPtr<StyledStringItem> item) {
    AutoPtr<StyledString> whole(new StyledString);
    whole->Add(item);
    AdoptStyledString(whole);
}

// Geometry

void StyledStringPane::CalcBox() {
    if (keepRightDistance) {
        Rect box;
        GetBox(&box);
        box.right = Pixel16(GetGlogWidth(glog) - rightDistance);
        SetBox(&box);
    }
    if (!styledString)
        return;
    ItemSize::SetWidth(*this, styledString->GetWidth());
    ItemSize::SetHeight(*this, lineSpacing); // also when it is 0
}

void StyledStringPane::SetBox(Rect *box) {
    GlogPane::SetBox(box);
    if (keepRightDistance)
        rightDistance = DistanceOf(box->right);
}

// Drawing

short StyledStringPane::TextLeft(Rect const &box) const {
    long long const width = styledString->GetWidth();
    switch (alignment) {
    case kRight:
        return Pixel16(box.right - width);
    case kCentre:
        return Pixel16((box.right + box.left - width) / 2);
    default:
        return box.left;
    }
}

void StyledStringPane::DrawGuts(OSRgn *) {
    SaveColors const colors;
    ClearColors();
    Rect box;
    GetBox(&box);
    if (eraseBackground)
        VelaDrawing::EraseRect(&box);
    if (!styledString)
        return;
    VelaDrawing::RGBForeColor(kDialogActiveTextColor);
    VelaDrawing::MoveTo(TextLeft(box), Pixel16(0LL + box.top + topBorder + styledString->GetAscent()));
    styledString->Draw();
}
