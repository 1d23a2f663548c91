// How the open slider of a zoom button looks, in both themes and at two scales.
#include "desktop/SimulatedDesktop.h"
#include "desktop/drawing/Surface.h"
#include "desktop/panes/DesktopRep.h"
#include "desktop/panes/Glog.h"
#include "graphics/ZoomPopUpPane.h"
#include "host/glogRec.h"
#include "tests/screens/GalleryPages.h"
#include "tests/screens/GoldenPicture.h"
#include <gtest/gtest.h>
#include <tuple>

namespace {

struct Look {
    char const *theme;
    int scale;
    std::string Name() const { return theme + ('-' + std::to_string(scale)) + 'x'; }
};
Look const kLooks[] = {{"light", 1}, {"light", 2}, {"dark", 1}, {"dark", 2}};

// Where the slider's thumb is when the picture is taken.
struct Level {
    char const *name;
    float fraction;
};
Level const kLevels[] = {{"least", 0.0f}, {"middle", 0.5f}, {"greatest", 1.0f}};

void PrintTo(Level const &level, std::ostream *out) { *out << level.name; }
void PrintTo(Look const &look, std::ostream *out) { *out << look.Name(); }

// Compares the slider's window with a picture while it is up.
class Photographer : public ZoomPopUpPaneClient {
public:
    Photographer(SimulatedDesktop &desktop_, glogRec *below_, std::string const &picture_, float fraction_)
        : desktop(desktop_)
        , below(below_)
        , picture(picture_)
        , fraction(fraction_) {}
    float GetZoomFraction() override { return fraction; }
    void SetZoomFraction(float) override {}
    void ZoomStep(bool) override {}
    void ZoomIdle() override {
        for (Glog *glog : DesktopRep::Of(desktop).Glogs()) {
            if (glog == below || !glog->IsVisible())
                continue;
            EXPECT_TRUE(GoldenPicture::Matches(*glog->Pixels(), picture));
            ++taken;
        }
    }
    static int taken; // pictures

private:
    SimulatedDesktop &desktop;
    glogRec *const below;
    std::string const picture;
    float const fraction;
};
int Photographer::taken = 0;

typedef std::tuple<Level, Look> LevelLook;

class GoldenZoomSlider : public testing::TestWithParam<LevelLook> {};

} // namespace

TEST_P(GoldenZoomSlider, LooksAsItDid) {
    auto const &[level, look] = GetParam();
    SimulatedDesktop desktop(DesktopOptions().Theme(look.theme).Scale(look.scale));
    glogRec *const glog = desktop.NewGlog(GlogOptions().Size(200, 100));
    std::string const picture = std::string("zoom-slider-") + level.name + '-' + look.Name();
    new ZoomPopUpPane(glog, new Photographer(desktop, glog, picture, level.fraction));
    ShowGlog(glog, kShowGlog);
    Photographer::taken = 0;
    desktop.Play("press 6 6\nwait 0.06\nrelease\n");
    EXPECT_EQ(Photographer::taken, 1);
}

INSTANTIATE_TEST_SUITE_P(Sliders, GoldenZoomSlider,
                         testing::Combine(testing::ValuesIn(kLevels), testing::ValuesIn(kLooks)),
                         [](testing::TestParamInfo<LevelLook> const &info) {
                             return AsTestName(std::string(std::get<0>(info.param).name) + '-' +
                                               std::get<1>(info.param).Name());
                         });
