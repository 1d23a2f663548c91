// The form in our panes, each check box in a pane of its own, as the others have a widget for each.
#include "bench/peers/Peer.h"
#include "bench/peers/PeerForm.h"
#include "buttons/CheckBoxPane.h"
#include "buttons/RadioButtonPane.h"
#include "buttons/ckRadItemResRec.h"
#include "desktop/SimulatedDesktop.h"
#include "frame/ButtonGroupPaneListener.h"
#include "host/GlogStyleSheet.h"
#include "host/VelaDrawing.h"
#include "host/XMLLib.h"
#include "host/glogRec.h"
#include <memory>
#include <vector>

namespace {

short const kLineSpacing = 16, kInsetTop = 3; // pixels: a button in its row
double const kWait = 0.2;                     // seconds; a press is shown for half of it
int const kMostWaits = 25;

UString Text(std::string const &ascii) { return UString(ascii.c_str(), UString::kByteEncoding1); }

std::shared_ptr<GlogStyleSheet> NewSheet() {
    boost::shared_ptr<XMLLib::ContainerItem> const item = XMLLib::CreateContainer(Text("Glog"));
    item->AddSIntItem(Text("GCheckGroup_LineSpacing"), kLineSpacing);
    return std::make_shared<GlogStyleSheet>(item);
}

Rect RectAt(PeerForm::Place corner, int width, int height) {
    return {static_cast<short>(corner.v), static_cast<short>(corner.h), static_cast<short>(corner.v + height),
            static_cast<short>(corner.h + width)};
}

void AddButton(ButtonGroupPane &pane, Rect const &box, PeerForm::Place place, std::string const &text) {
    pane.AddButton(static_cast<short>(box.left + place.h), static_cast<short>(box.top + place.v + kInsetTop),
                   Text(text));
}

class GlogPeer : public Peer, private ButtonGroupPaneListener {
public:
    explicit GlogPeer(bool offscreen)
        : desktop(offscreen ? new SimulatedDesktop : new Desktop(DesktopOptions().Scale(1))) {}

    void Build(int count, int height) override {
        glog = desktop->NewGlog(
            GlogOptions().Title(PeerForm::kTitle).Size(PeerForm::kWidth, height).StyleSheet(NewSheet()));
        for (int group = 0; group < PeerForm::kGroups; ++group)
            AddGroup(PeerForm::OfGroup(group));
        for (int box = 0; box < count; ++box) {
            ckRadItemResRec record = {ckRadItemResRec::kCheckKind, 0};
            CheckBoxPane *const pane = CheckBoxPane::NewCheckBoxPane(glog, &record);
            Rect cell = RectAt(PeerForm::OfBox(box), PeerForm::kColumnWidth, PeerForm::kRowHeight);
            pane->SetBox(&cell); // before it has buttons, which would move along
            AddButton(*pane, cell, {0, 0}, PeerForm::TextOfBox(box));
            DependUpon(pane);
            boxes.push_back(pane);
        }
        Rect place = RectAt({0, 0}, PeerForm::kWidth, height);
        PositionGlog(glog, &place, false);
    }
    void Destroy() override {
        boxes.clear();
        DisposeGlog(glog);
    }
    void Show() override {
        ShowGlog(glog, kShowGlog);
        Settle();
    }

    void Repaint() override {
        Rect const all = {0, 0, GetGlogHeight(glog), GetGlogWidth(glog)};
        SetPortToGlog(glog);
        VelaDrawing::InvalRect(&all);
        UpdateGlog(glog); // returns when the server has the pixels
    }
    void Toggle(int box) override {
        boxes[static_cast<std::size_t>(box)]->ToggleOne(0);
        UpdateGlog(glog);
    }
    void RepaintOffscreen() override { Repaint(); }

    void Settle() override { desktop->ProcessEvents(0); }
    void WaitUntilHeard() override {
        heard = false;
        for (int i = 0; i < kMostWaits && !heard; ++i)
            desktop->ProcessEvents(kWait);
    }

private:
    void AddGroup(PeerForm::Place corner) {
        ckRadItemResRec record = {ckRadItemResRec::kRadioKind, 0};
        RadioButtonPane *const pane = RadioButtonPane::NewRadioButtonPane(glog, &record);
        Rect box = RectAt(corner, PeerForm::kGroupWidth, PeerForm::kGroupHeight);
        pane->SetBox(&box);
        for (int radio = 0; radio < PeerForm::kRadiosPerGroup; ++radio)
            AddButton(*pane, box, PeerForm::OfRadio(radio), PeerForm::TextOfRadio(radio));
    }
    void ButtonValueChanged(ButtonGroupPane *, short, bool) override {
        Heard();
        heard = true;
    }

    std::unique_ptr<Desktop> desktop;
    glogRec *glog = nullptr;
    std::vector<CheckBoxPane *> boxes; // the glog's
    bool heard = false;
};

} // namespace

Peer *NewPeer(bool offscreen, int &, char **) { return new GlogPeer(offscreen); }
