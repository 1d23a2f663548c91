#include "bench/GroupPage.h"
#include "buttons/CheckBoxPane.h"
#include "buttons/ckRadItemResRec.h"
#include "host/GlogStyleSheet.h"
#include "host/VelaDrawing.h"
#include "host/XMLLib.h"
#include "host/glogRec.h"
#include <algorithm>

namespace {

int const kBoxesPerColumn = 100;
short const kColumnWidth = 60, kRowHeight = 18; // pixels
int const kLabels = 100;
short const kLineSpacing = 16;        // pixels; the height of a button
short const kButtonWidth = 15;        // pixels, of one with a label
short const kPressH = 5, kPressV = 7; // within a button
short const kDamageMargin = 3;        // pixels round a button

UString Text(char const *ascii) { return UString(ascii, UString::kByteEncoding1); }

UString LabelOf(int box) {
    UString label = Text("Box "), number;
    tarn::NumToUString(box % kLabels + 1, tarn::kPlainNumber, number);
    label += number;
    return label;
}

short LeftOf(int box) { return static_cast<short>(box / kBoxesPerColumn * kColumnWidth); }
short TopOf(int box) { return static_cast<short>(box % kBoxesPerColumn * kRowHeight); }

Rect ButtonOf(int box) {
    short const top = TopOf(box), left = LeftOf(box);
    return {top, left, static_cast<short>(top + kLineSpacing), static_cast<short>(left + kButtonWidth)};
}

short Columns(int boxes) { return static_cast<short>((boxes + kBoxesPerColumn - 1) / kBoxesPerColumn); }

Rect PageOf(int boxes) {
    return {0, 0, static_cast<short>(kBoxesPerColumn * kRowHeight),
            static_cast<short>(Columns(boxes) * kColumnWidth)};
}

std::shared_ptr<GlogStyleSheet> NewSheet() {
    boost::shared_ptr<XMLLib::ContainerItem> const item = XMLLib::CreateContainer(Text("Glog"));
    item->AddSIntItem(Text("GCheckGroup_LineSpacing"), kLineSpacing);
    return std::make_shared<GlogStyleSheet>(item);
}

// An empty group. It has its box before its buttons, which would move along otherwise.
CheckBoxPane *NewPane(glogRec *glog, Rect box) {
    ckRadItemResRec record = {ckRadItemResRec::kCheckKind, 0};
    CheckBoxPane *const pane = CheckBoxPane::NewCheckBoxPane(glog, &record);
    pane->SetBox(&box);
    return pane;
}

Rect CellOf(int box) {
    short const top = TopOf(box), left = LeftOf(box);
    return {top, left, static_cast<short>(top + kRowHeight), static_cast<short>(left + kColumnWidth)};
}

} // namespace

GroupPage::GroupPage(Kind kind_, int boxes)
    : kind(kind_)
    , glog(Build(desktop, kind, boxes, &panes)) {
    ShowGlog(glog, kShowGlog);
    desktop.TakePresented(glog);
}

glogRec *GroupPage::Build(SimulatedDesktop &desktop, Kind kind, int boxes,
                          std::vector<CheckBoxPane *> *panes) {
    Rect const page = PageOf(boxes);
    glogRec *const glog = desktop.NewGlog(GlogOptions().Size(page.right, page.bottom).StyleSheet(NewSheet()));
    CheckBoxPane *pane = nullptr;
    for (int box = 0; box < boxes; ++box) {
        if (!pane || kind == kManyPanes) {
            pane = NewPane(glog, kind == kManyPanes ? CellOf(box) : page);
            if (panes)
                panes->push_back(pane);
        }
        pane->AddButton(LeftOf(box), TopOf(box), LabelOf(box));
    }
    desktop.FinishGlog(glog);
    return glog;
}

CheckBoxPane &GroupPage::PaneOf(int box) const {
    return *panes[kind == kManyPanes ? static_cast<std::size_t>(box) : 0];
}

short GroupPage::IndexOf(int box) const { return static_cast<short>(kind == kManyPanes ? 0 : box); }

std::string GroupPage::ClickOn(int box) {
    return "click " + std::to_string(LeftOf(box) + kPressH) + ' ' + std::to_string(TopOf(box) + kPressV);
}

Rect GroupPage::DamageOf(int box) const {
    Rect damage = ButtonOf(box);
    VelaDrawing::InsetRect(&damage, -kDamageMargin, -kDamageMargin);
    Rect const page = {0, 0, GetGlogHeight(glog), GetGlogWidth(glog)};
    VelaDrawing::SectRect(&damage, &page, &damage);
    return damage;
}
