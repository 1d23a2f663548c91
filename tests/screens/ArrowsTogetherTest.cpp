// How scroll bars look where the platform wants both arrows at their end.
#include "desktop/SimulatedDesktop.h"
#include "desktop/panes/Glog.h"
#include "desktop/windows/PlatformConventions.h"
#include "dialogs/LoadGlog.h"
#include "host/glogRec.h"
#include "tests/screens/GalleryPages.h"
#include "tests/screens/GoldenPicture.h"
#include <gtest/gtest.h>

namespace {

class ArrowsTogether : public testing::TestWithParam<char const *> {
protected:
    ArrowsTogether() { PlatformConventions::scrollArrowsTogetherAtEnd = true; }
    ~ArrowsTogether() override { PlatformConventions::scrollArrowsTogetherAtEnd = false; }
};

TEST_P(ArrowsTogether, StandAtTheEndOfEachBar) {
    SimulatedDesktop desktop(DesktopOptions().Theme(GetParam()).Scale(2));
    glogRec *const glog = LoadGlog(TreeDirectory() + "/tests/screens/scroll-bar-states.xml");
    ShowGlog(glog, kShowGlog);
    EXPECT_TRUE(GoldenPicture::Matches(*Glog::From(glog).Pixels(),
                                       std::string("scroll-bar-arrows-together-") + GetParam() + "-2x"));
}

INSTANTIATE_TEST_SUITE_P(InBothThemes, ArrowsTogether, testing::Values("light", "dark"),
                         [](testing::TestParamInfo<char const *> const &info) {
                             return std::string(info.param);
                         });

} // namespace
