#include "graphics/ZoomControlPane.h"
#include "buttons/GIconButtonPane.h"
#include "buttons/NaturalSize.h"
#include "frame/ResourceReading.h"
#include "host/EventRecordAdapter.h"
#include "host/GlogLayout.h"
#include "host/LocalizedStrings.h"
#include "host/PaneWatch.h"
#include "host/Services.h"
#include <memory>
#include <new>

namespace {

short const kNoNumber = 0;
int const kHandled = -1;
short const kAtEnd = -1;
short const kFamily = 1000;
short const kSide = 15;                         // pixels
double const kRepeatDelay = 0.3333333333333333; // seconds
int const kCommand = 0x0100, kOption = 0x0800;  // modifiers

struct ButtonLook {
    short icon;          // at rest; disabled and pressed follow
    char const *helpTag; // in the group kZoom
};

ButtonLook LookOf(bool zoomIn, ZoomControlPane::Orientation orientation) {
    if (orientation == ZoomControlPane::kHorizontal)
        return zoomIn ? ButtonLook{58, "kHZoomIn"} : ButtonLook{55, "kHZoomOut"};
    return zoomIn ? ButtonLook{4, "kVZoomIn"} : ButtonLook{1, "kVZoomOut"};
}

} // namespace

// One of the two.
class ZoomControlPane::ButtonPane : public GIconButtonPane {
public:
    ButtonPane(Client *zoomed, bool zoomIn)
        : zoomOut(zoomIn ? 0 : 1)
        , client(zoomed)
        , clickTime(0.0)
        , repeating(false)
        , zoomStateSaved(false)
        , modifiers(0) {}

    bool Init(glogRec *owner, ButtonLook const &look) {
        if (!GIconButtonPaneInit(owner, kNoNumber, kFamily, look.icon, 1, 1, 1))
            return false;
        SetCanDisable(true);
        SetNaturalSize(*this, kSide, kSide);
        SetHelpTag(LocalizedStrings::HelpTagMgr::Instance().DemandHelpTag("kZoom", look.helpTag));
        Update();
        return true;
    }

    Client *GetClient() const { return client; }
    void ForgetClient() { client = nullptr; }
    // The client may delete the pane.
    void Update() {
        PaneWatch const watch(this);
        bool const canZoom = client && client->CanZoom(ZoomsIn());
        if (watch.PaneExists())
            SetEnable(canZoom);
    }

    short ClickAction(int pressModifiers) override {
        repeating = zoomStateSaved = false;
        modifiers = pressModifiers;
        clickTime = TarnSystemTime::GetCurrentEventTime();
        return GIconButtonPane::ClickAction(pressModifiers);
    }

    void DoButtonPress(int) override {
        if (modifiers & (kCommand | kOption))
            return;
        if (!repeating && TarnSystemTime::GetCurrentEventTime() - clickTime > kRepeatDelay)
            repeating = true;
        if (repeating)
            ZoomOnce(false);
    }

    int ReleaseAction() override {
        PaneWatch const watch(this);
        if (!repeating)
            ZoomOnce((modifiers & kOption) != 0);
        if (watch.PaneExists())
            SetState(0);
        return kHandled;
    }

private:
    bool ZoomsIn() const { return zoomOut == 0; }

    // The client may delete the pane, and go itself.
    void ZoomOnce(bool optionKey) {
        PaneWatch const watch(this);
        if (!zoomStateSaved && client) {
            zoomStateSaved = true;
            client->SaveZoomStateHook();
        }
        if (watch.PaneExists() && client)
            client->Zoom(ZoomsIn(), optionKey);
    }

    int zoomOut;         // 1 for the button that zooms out
    Client *client;      // null once it is gone
    double clickTime;    // of the press, in seconds
    bool repeating;      // held long enough
    bool zoomStateSaved; // in this press
    int modifiers;       // of the press
};

// Client

ZoomControlPane::Client::Client()
    : controlPane(nullptr) {}

ZoomControlPane::Client::~Client() {
    if (controlPane)
        controlPane->ClientGone();
}

bool ZoomControlPane::Client::CanZoom(bool) { return true; }

void ZoomControlPane::Client::SaveZoomStateHook() {}

void ZoomControlPane::Client::UpdateControlPane() {
    if (controlPane)
        controlPane->UpdateControls();
}

void ZoomControlPane::Client::SetControlPane(ZoomControlPane *pane) {
    if (controlPane && pane && controlPane != pane)
        controlPane->ClientGone();
    controlPane = pane;
}

// Pane

ZoomControlPane::ZoomControlPane(glogRec *owner, Client *client, Orientation orientation) {
    if (!CompoundPaneInit(owner, kNoNumber))
        return;
    std::unique_ptr<ButtonPane> out(NewButton(client, false, orientation)),
        in(NewButton(client, true, orientation));
    if (!out || !in)
        return;
    zoomOutButton = out.get();
    zoomInButton = in.get();
    if (orientation == kHorizontal) {
        GetLayout()->SetAttributeFromString(GlogLayoutItem::kDirection, ResourceKey("horiz"));
        Add(out.get(), kAtEnd);
        Add(in.get(), kAtEnd);
    } else {
        Add(in.get(), kAtEnd);
        Add(out.get(), kAtEnd);
    }
    out.release();
    in.release();
    SetUseLayout(true);
    SetSizeToLayout(true);
    client->SetControlPane(this);
    UpdateControls();
}

ZoomControlPane::~ZoomControlPane() {
    for (ButtonPane *button : {zoomInButton.Get(), zoomOutButton.Get()}) {
        if (button && button->GetClient() && button->GetClient()->controlPane == this)
            button->GetClient()->SetControlPane(nullptr);
    }
}

ZoomControlPane::ButtonPane *ZoomControlPane::NewButton(Client *client, bool zoomIn,
                                                        Orientation orientation) {
    std::unique_ptr<ButtonPane> button(new (std::nothrow) ButtonPane(client, zoomIn));
    if (button && button->Init(GetGlog(), LookOf(zoomIn, orientation)))
        return button.release();
    return nullptr;
}

void ZoomControlPane::UpdateControls() {
    PaneWatch const watch(this);
    for (PanePtr<ButtonPane> *button : {&zoomInButton, &zoomOutButton}) {
        if (watch.PaneExists() && *button)
            (*button)->Update();
    }
}

void ZoomControlPane::ClientGone() {
    for (ButtonPane *button : {zoomInButton.Get(), zoomOutButton.Get()}) {
        if (button)
            button->ForgetClient();
    }
    UpdateControls();
}
