#include "buttons/GlogButtonPane.h"
#include "host/PaneWatch.h"
#include "host/Services.h"
#include "host/VelaDrawing.h"
#include "host/glogRec.h"

namespace {

double const kShortestPress = 0.125; // seconds
short const kNoKey = 0;

void DepressButton(GlogButtonPane *button) { button->Depress(); }
void ReleaseButton(GlogButtonPane *button) { button->Release(); }
void EnableButton(GlogButtonPane *button) { button->Enable(); }
void DisableButton(GlogButtonPane *button) { button->Disable(); }
void FlashButton(GlogButtonPane *button, short key) { button->Flash(key); }
void SetButtonMode(GlogButtonPane *button, int mode) { button->SetMode(static_cast<unsigned char>(mode)); }

// Key codes are unsigned, though a short carries them: those of function keys have the high bit set.
void WaitForKeyUp(short key) {
    unsigned short const code = static_cast<unsigned short>(key);
    if (KeybdMgr::Instance().IsKeyPressed(code))
        YieldUntilKeyUp(code);
}

} // namespace

void (*btnDepress)(GlogButtonPane *) = DepressButton;
void (*btnRelease)(GlogButtonPane *) = ReleaseButton;
void (*btnEnable)(GlogButtonPane *) = EnableButton;
void (*btnDisable)(GlogButtonPane *) = DisableButton;
void (*btnFlash)(GlogButtonPane *, short) = FlashButton;
void (*gcSetModeBP)(GlogButtonPane *, int) = SetButtonMode;

GlogButtonPane::GlogButtonPane()
    : buttonIsDown(false)
    , stillTracking(false)
    , mode(kEnabled) {}

GlogButtonPane::~GlogButtonPane() {}

GlogButtonPane *GlogButtonPane::InitGlogButtonPane(glogRec *owner, unsigned char initialMode) {
    if (!GlogPaneInit(owner, 0))
        return nullptr;
    buttonIsDown = false;
    stillTracking = false;
    mode = initialMode;
    return this;
}

void GlogButtonPane::Depress() { buttonIsDown = true; }

void GlogButtonPane::Release() { buttonIsDown = false; }

void GlogButtonPane::GetButtonText(UString &) const {}

void GlogButtonPane::Enable() { SetMode(kEnabled); }

void GlogButtonPane::Disable() { SetMode(kDisabled); }

void GlogButtonPane::SetMode(unsigned char newMode) {
    if (newMode == mode)
        return;
    mode = newMode;
    Inval();
}

int GlogButtonPane::Flash(short key) {
    if (mode != kEnabled)
        return -1;
    return Track(key) ? 1 : -1;
}

bool GlogButtonPane::Track(short key) {
    Rect box;
    GetBox(&box);

    PaneWatch const self(this);
    stillTracking = true;
    ChangeState(btnDepress);
    Yield(kShortestPress);
    if (!self.PaneExists())
        return false;
    Prepare();
    if (key != kNoKey)
        WaitForKeyUp(key);
    else
        FollowMouse(box);
    if (!self.PaneExists())
        return false;
    stillTracking = false;

    if (!buttonIsDown)
        return false;
    ChangeState(btnRelease);
    // Nothing of this pane is touched after the broadcast: a listener may have deleted it.
    if (Provider<GlogButtonPaneListener>::HasDependents())
        Provider<GlogButtonPaneListener>::BroadcastChange(GlogButtonPanePressedMsg(this), nullptr);
    return true;
}

void GlogButtonPane::FollowMouse(Rect const &box) {
    Point where = {box.top, box.left};
    PaneWatch const self(this);
    while (MouseIsDragging(&where, nullptr) && self.PaneExists()) {
        if (buttonIsDown != VelaDrawing::PtInRect(where, &box))
            ChangeState(buttonIsDown ? btnRelease : btnDepress);
        Prepare(); // whatever ran during the wait may have left another port
    }
}

void GlogButtonPane::ChangeState(void (*change)(GlogButtonPane *)) {
    change(this);
    Inval();
    UpdateGlog(glog);
}

int GlogButtonPane::HandleClick(EventRecordAdapter *) {
    if (mode != kEnabled)
        return 0;
    return Track(kNoKey) ? 1 : -1;
}
