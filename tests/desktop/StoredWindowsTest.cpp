// Windows by number, in a program without the library of dialogs.
#include "desktop/panes/StoredWindows.h"
#include "desktop/panes/Glog.h"
#include "desktop/resources/Resources.h"
#include "tests/PaneTest.h"
#include "tests/resources/TemporaryDirectory.h"

namespace {

short const kZoomSlider = 3510, kOwn = 4001;

class StoredWindowsTest : public PaneTest {
protected:
    StoredWindowsTest() { Resources::Instance().AddDirectory(directory.Path()); }
    ~StoredWindowsTest() override { Resources::Instance().Open(Resources::FindDirectory()); }

    static glogRec *Opened(short number) {
        using TarnOSWindow::OSWindow;
        return LowLevelGlogOpening::NewGlog(number, OSWindow::SendBehindArg(OSWindow::PositionOnTop), false,
                                            nullptr);
    }
    glogRec *OpenedOf(std::string const &xml) {
        directory.Write("windows/4001.xml", xml);
        return Opened(kOwn);
    }

    TemporaryDirectory directory;
};

} // namespace

TEST_F(StoredWindowsTest, AWindowWithoutPanesIsOpenedHidden) {
    glogRec *const slider = Opened(kZoomSlider);
    ASSERT_NE(slider, nullptr);
    EXPECT_EQ(GetGlogWidth(slider), 55);
    EXPECT_EQ(GetGlogHeight(slider), 34);
    EXPECT_FALSE(slider->IsVisible());
    EXPECT_TRUE(Glog::From(slider).Items().empty());
}

TEST_F(StoredWindowsTest, AWindowMayHaveATitleAndNoList) {
    glogRec *const window = OpenedOf("<Glog title='Empty' width='90' height='40' growable='yes'/>");
    ASSERT_NE(window, nullptr);
    EXPECT_EQ(GetGlogWidth(window), 90);
}

TEST_F(StoredWindowsTest, WhatNobodyCanMakeIsNotOpened) {
    for (char const *xml :
         {"<Glog width='90' height='40'><Items><Item type='OvalButton'/></Items></Glog>",
          "<Glog width='90' height='40'><StyleSheet/><Items/></Glog>", "<Glog width='90'><Items/></Glog>",
          "<Glog width='0' height='40'><Items/></Glog>", "<Glog width='16001' height='40'><Items/></Glog>",
          "<Window width='90' height='40'/>", "no window", ""})
        EXPECT_EQ(OpenedOf(xml), nullptr) << xml;
    EXPECT_EQ(Opened(4002), nullptr);
    EXPECT_EQ(Opened(-1), nullptr);
}

TEST_F(StoredWindowsTest, WhoReadsDialogsOpensAll) {
    StoredWindows::SetMaker([](std::string const &) -> glogRec * { throw std::runtime_error("broken"); });
    EXPECT_EQ(Opened(kZoomSlider), nullptr);
    StoredWindows::SetMaker(nullptr);
    EXPECT_NE(Opened(kZoomSlider), nullptr);
}
