// Whole panes, beside the library calls that a program made for this one purpose would need.
#include "bench/BarePangoText.h"
#include "bench/BenchIcons.h"
#include "buttons/OvalButtonPane.h"
#include "desktop/SimulatedDesktop.h"
#include "desktop/panes/PaneAccess.h"
#include "frame/ResourceReading.h"
#include "host/glogRec.h"
#include "tests/drawing/Canvas.h"
#include "text/LabelPane.h"
#include "text/TextPane.h"
#include <benchmark/benchmark.h>

namespace {

int const kWidth = 320, kHeight = 80;
char const kText[] = "Send level";
char const kLines[] =
    "The project will be opened as a copy, since another program has it open. Changes that are made "
    "here do not come into the original until the copy is saved in its place.";
short const kTextWidth = 280;
int const kFont = 0;
short const kLeft = 20, kTop = 20, kButtonWidth = 120;

// A shown glog for panes to be drawn in.
class Stage {
public:
    Stage()
        : glog(desktop.NewGlog(GlogOptions().Size(kWidth, kHeight))) {}

    void Measure(benchmark::State &state, GlogPane &pane) {
        ShowGlog(glog, kShowGlog);
        for (auto _ : state)
            PaneAccess::Draw(pane, nullptr);
    }

    SimulatedDesktop desktop;
    glogRec *glog;
};

UString Text() { return UString(kText, UString::kByteEncoding1); }

void LabelOurs(benchmark::State &state) {
    Stage stage;
    Rect place = {kTop, kLeft, kTop + 14, kLeft + 120};
    stage.Measure(state, *LabelPane::NewLabelPane(stage.glog, 1, &place, false, Text()));
}
BENCHMARK(LabelOurs)->Name("Label/ours");

void StaticTextOurs(benchmark::State &state) {
    Stage stage;
    boost::shared_ptr<XMLLib::ContainerItem> const item = XMLLib::CreateContainer(ResourceKey("Item"));
    XMLLib::AddRect(item, ResourceKey("BoundsRect"), {kTop, kLeft, kHeight, kLeft + kTextWidth});
    item->AddSIntItem(ResourceKey("WrapText"), 1);
    item->AddUStringItem(ResourceKey("Text"), ResourceKey(kLines));
    stage.Measure(state, *new TextPane(stage.glog, item, false));
}
BENCHMARK(StaticTextOurs)->Name("Static text/ours");

void StaticTextBare(benchmark::State &state) {
    Canvas canvas(kWidth, kHeight);
    BarePangoText text(canvas.surface.CairoSurface(), kLines, kFont, kTextWidth);
    for (auto _ : state)
        text.Draw(kLeft, kTop);
}
BENCHMARK(StaticTextBare)->Name("Static text/bare");

void ButtonOurs(benchmark::State &state) {
    Stage stage;
    gobResRec record = {gobResRec::kKind, kTop, kLeft, kButtonWidth, 0, GlogButtonPane::kEnabled};
    OvalButtonPane *button = OvalButtonPane::NewOvalButtonPane(stage.glog, &record);
    button->SetButtonText(Text());
    stage.Measure(state, *button);
}
BENCHMARK(ButtonOurs)->Name("Button/ours");

void ButtonBare(benchmark::State &state) {
    Canvas canvas(kWidth, kHeight);
    PixelImage const left = BenchIcons::Image(BenchIcons::kLeftCap, canvas.scale);
    PixelImage const middle = BenchIcons::Image(BenchIcons::kMiddle, canvas.scale);
    PixelImage const right = BenchIcons::Image(BenchIcons::kRightCap, canvas.scale);
    BarePangoText text(canvas.surface.CairoSurface(), kText, kFont);
    int const textLeft = kLeft + (kButtonWidth - text.Width()) / 2;
    int const textTop = kTop + (BenchIcons::kHeight - text.Height()) / 2;
    pixman_image_t *const target = canvas.surface.PixmanImage();
    pixman_image_set_repeat(middle.pixels, PIXMAN_REPEAT_NORMAL);
    for (auto _ : state) {
        BenchIcons::Compose(left, target, kLeft, kTop, left.width);
        BenchIcons::Compose(middle, target, kLeft + left.width, kTop,
                            kButtonWidth - left.width - right.width);
        BenchIcons::Compose(right, target, kLeft + kButtonWidth - right.width, kTop, right.width);
        text.Draw(textLeft, textTop);
    }
    pixman_image_set_repeat(middle.pixels, PIXMAN_REPEAT_NONE);
}
BENCHMARK(ButtonBare)->Name("Button/bare");

} // namespace
