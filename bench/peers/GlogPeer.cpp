// The form in our panes: one group of all check boxes, or with PEER_PANE_EACH a pane for each of them.
#include "bench/peers/GlogToolkit.h"
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

#ifdef PEER_PANE_EACH
bool const kPaneEach = true;
#else
bool const kPaneEach = false;
#endif

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

// `place`: in the glog.
void AddButton(ButtonGroupPane &pane, PeerForm::Place place, std::string const &text) {
    pane.AddButton(static_cast<short>(place.h), static_cast<short>(place.v + kInsetTop), Text(text));
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
        if (kPaneEach)
            for (int box = 0; box < count; ++box)
                AddCheckBoxes(box, 1,
                              RectAt(PeerForm::OfBox(box), PeerForm::kColumnWidth, PeerForm::kRowHeight));
        else
            AddCheckBoxes(0, count,
                          RectAt(PeerForm::OfBox(0), PeerForm::kWidth, height - PeerForm::kGroupHeight));
        Rect place = RectAt({0, 0}, PeerForm::kWidth, height);
        PositionGlog(glog, &place, false);
    }
    void Destroy() override {
        panes.clear();
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
        FinishDrawing(glog);
    }
    void Toggle(int box) override {
        if (kPaneEach)
            panes[static_cast<std::size_t>(box)]->ToggleOne(0);
        else
            panes.front()->ToggleOne(static_cast<short>(box));
        FinishDrawing(glog);
    }
    void RepaintOffscreen() override { Repaint(); }

    void Settle() override { desktop->ProcessEvents(0); }
    void WaitUntilHeard() override {
        heard = false;
        for (int i = 0; i < kMostWaits && !heard; ++i)
            desktop->ProcessEvents(kWait);
    }

private:
    void AddCheckBoxes(int first, int count, Rect bounds) {
        ckRadItemResRec record = {ckRadItemResRec::kCheckKind, 0};
        CheckBoxPane *const pane = CheckBoxPane::NewCheckBoxPane(glog, &record);
        pane->SetBox(&bounds); // before it has buttons, which would move along
        for (int box = first; box < first + count; ++box)
            AddButton(*pane, PeerForm::OfBox(box), PeerForm::TextOfBox(box));
        DependUpon(pane);
        panes.push_back(pane);
    }
    void AddGroup(PeerForm::Place corner) {
        ckRadItemResRec record = {ckRadItemResRec::kRadioKind, 0};
        RadioButtonPane *const pane = RadioButtonPane::NewRadioButtonPane(glog, &record);
        Rect box = RectAt(corner, PeerForm::kGroupWidth, PeerForm::kGroupHeight);
        pane->SetBox(&box);
        for (int radio = 0; radio < PeerForm::kRadiosPerGroup; ++radio) {
            PeerForm::Place const place = PeerForm::OfRadio(radio);
            AddButton(*pane, {corner.h + place.h, corner.v + place.v}, PeerForm::TextOfRadio(radio));
        }
    }
    void ButtonValueChanged(ButtonGroupPane *, short, bool) override {
        Heard();
        heard = true;
    }

    std::unique_ptr<Desktop> desktop;
    glogRec *glog = nullptr;
    std::vector<CheckBoxPane *> panes; // of check boxes; the glog's
    bool heard = false;
};

} // namespace

Peer *NewPeer(bool offscreen, int &, char **) { return new GlogPeer(offscreen); }
