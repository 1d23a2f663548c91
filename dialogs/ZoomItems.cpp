// Zoom sliders and zoom buttons in dialogs.
#include "desktop/observe/MessageTrace.h"
#include "desktop/observe/TreeDump.h"
#include "dialogs/ItemRegistry.h"
#include "dialogs/KeyFault.h"
#include "dialogs/StockItems.h"
#include "frame/ResourceReading.h"
#include "graphics/ZoomControlPane.h"
#include "graphics/ZoomPopUpPane.h"
#include "host/GlogStyleSheet.h"
#include "host/PaneWatch.h"
#include <algorithm>
#include <memory>
#include <new>
#include <string>

namespace {

long long const kLargestLevel = 1000;
int const kUsualLevels = 10;

int Number(GlogStyleSheet *sheet, char const *key) { return sheet->GetSInt32ItemValue(ResourceKey(key)); }

// The level that a dialog's zoom pane has where the program has none: a whole number from 0.
class ZoomLevel {
public:
    explicit ZoomLevel(GlogStyleSheet *sheet)
        : most(sheet->HasSInt32ItemValue(ResourceKey("Levels")) ? Number(sheet, "Levels") : kUsualLevels)
        , level(Number(sheet, "Level")) {
        if (level > most)
            throw KeyFault("Level", "there is no level " + std::to_string(level) + ": the last one is " +
                                        std::to_string(most));
    }

    int Most() const { return most; }
    int Level() const { return level; }
    // Stores the level that lies nearest, and tells watchers of another one.
    void Set(GlogPane &pane, int wanted) {
        int const newLevel = std::clamp(wanted, 0, most);
        if (newLevel == level)
            return;
        level = newLevel;
        if (MessageTrace::On())
            MessageTrace::Write(
                MessageTrace::Begin(pane).Text("message", std::string("Zoomed")).Integer("level", level));
    }

private:
    int most; // the greatest level
    int level;
};

// Sliders

class SliderClient : public ZoomPopUpPaneClient {
public:
    explicit SliderClient(ZoomLevel const &first)
        : level(first) {}
    float GetZoomFraction() override {
        return static_cast<float>(level.Level()) / static_cast<float>(std::max(level.Most(), 1));
    }
    void SetZoomFraction(float fraction) override {
        level.Set(*pane, static_cast<int>(fraction * static_cast<float>(level.Most()) + 0.5f));
    }
    void ZoomStep(bool up) override { level.Set(*pane, level.Level() + (up ? 1 : -1)); }

    ZoomLevel level;
    GlogPane *pane = nullptr; // whose client it is
};

class DialogZoomSlider : public ZoomPopUpPane {
public:
    DialogZoomSlider(glogRec *owner, SliderClient *own)
        : ZoomPopUpPane(owner, own)
        , client(own) {
        client->pane = this;
    }
    ZoomLevel const &Level() const { return client->level; }

private:
    SliderClient *client; // the base's
};

GlogPane *MakeZoomSlider(glogRec *glog, GlogStyleSheet *sheet) {
    std::unique_ptr<SliderClient> client(new SliderClient(ZoomLevel(sheet)));
    std::unique_ptr<DialogZoomSlider> slider(new DialogZoomSlider(glog, client.get()));
    client.release(); // the slider's
    if (!slider->GetGlog())
        return nullptr;
    slider->Offset(OptionalPoint(sheet->GetItemRes(), "Origin"));
    return slider.release();
}

// Buttons

// The client comes first, so that it is there before the buttons and after them.
class DialogZoomButtons : private ZoomControlPane::Client, public ZoomControlPane {
public:
    DialogZoomButtons(glogRec *owner, ZoomLevel const &first, ZoomControlPane::Orientation orientation)
        : ZoomControlPane(owner, this, orientation)
        , level(first) {
        SetNoErase(1); // what the buttons stand on shows at their corners
        UpdateControls();
    }
    ZoomLevel const &Level() const { return level; }

    void Zoom(bool zoomIn, bool) override {
        PaneWatch const self(this);
        level.Set(*this, level.Level() + (zoomIn ? 1 : -1)); // who watches may delete the pane
        if (self.PaneExists())
            UpdateControlPane();
    }
    bool CanZoom(bool zoomIn) override { return zoomIn ? level.Level() < level.Most() : level.Level() > 0; }

private:
    ZoomLevel level;
};

GlogPane *MakeZoomButtons(glogRec *glog, GlogStyleSheet *sheet) {
    bool const isLevel = sheet->GetUStringItemValue(ResourceKey("Direction")) == ResourceKey("horiz");
    std::unique_ptr<DialogZoomButtons> buttons(new DialogZoomButtons(
        glog, ZoomLevel(sheet), isLevel ? ZoomControlPane::kHorizontal : ZoomControlPane::kVertical));
    if (!buttons->GetGlog() ||
        buttons->NumSubpanes() == 0) // which is all that is told of buttons without memory
        return nullptr;
    buttons->Offset(OptionalPoint(sheet->GetItemRes(), "Origin"));
    return buttons.release();
}

bool DescribeZoom(GlogPane &pane, JsonLine &line) {
    DialogZoomSlider *const slider = dynamic_cast<DialogZoomSlider *>(&pane);
    DialogZoomButtons *const buttons = dynamic_cast<DialogZoomButtons *>(&pane);
    if (!slider && !buttons)
        return false;
    ZoomLevel const &level = slider ? slider->Level() : buttons->Level();
    line.Integer("level", level.Level()).Integer("levels", level.Most());
    return true;
}

KeyList ZoomKeys() {
    return KeyList().Point("Origin").Integer("Level", 0, kLargestLevel).Integer("Levels", 1, kLargestLevel);
}

} // namespace

void AddZoomItems(ItemRegistry &registry) {
    TreeDump::AddDescriber(DescribeZoom);
    registry.Add(ItemType("ZoomSlider").Keys(ZoomKeys()).MadeBy(MakeZoomSlider));
    registry.Add(ItemType("ZoomButtons")
                     .Keys(ZoomKeys().Word("Direction", {"vert", "horiz"}))
                     .MadeBy(MakeZoomButtons));
}
