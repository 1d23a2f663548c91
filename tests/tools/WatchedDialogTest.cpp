// A dialog that follows its file.
#include "tools/glogview/WatchedDialog.h"
#include "desktop/SimulatedDesktop.h"
#include "dialogs/LoadError.h"
#include "dialogs/Utf8.h"
#include "host/glogRec.h"
#include "tests/resources/TemporaryDirectory.h"
#include "tools/glogview/ErrorBanner.h"
#include <gtest/gtest.h>

namespace {

std::string Dialog(std::string const &text) {
    return "<Glog width=\"160\" height=\"100\"><Items><Item type=\"Label\" id=\"1\"><Origin v=\"20\" "
           "h=\"10\"/><Text>" +
           text + "</Text></Item></Items></Glog>";
}

class Watched : public testing::Test {
protected:
    Watched()
        : path(directory.Write("a.xml", Dialog("First")))
        , dialog(path) {}

    bool Shows(std::string const &text) {
        return desktop.DumpTree(dialog.Shown()).find('"' + text + '"') != std::string::npos;
    }
    // The banner's text; empty without one.
    std::string Banner() {
        glogRec *const glog = dialog.Shown();
        for (short i = 1; i <= CountGlogItems(glog); ++i) {
            if (ErrorBanner *banner = dynamic_cast<ErrorBanner *>(GetGlogItem(glog, i)))
                return Utf8::FromUString(banner->GetText());
        }
        return std::string();
    }
    void Save(std::string const &text) {
        directory.Write("a.xml", text);
        dialog.Follow();
    }

    SimulatedDesktop desktop;
    TemporaryDirectory directory;
    std::string path;
    WatchedDialog dialog;
};

TEST_F(Watched, IsShown) {
    EXPECT_TRUE(dialog.Shown()->IsVisible());
    EXPECT_TRUE(Shows("First"));
}

TEST_F(Watched, StaysWhileItsFileStays) {
    glogRec *const before = dialog.Shown();
    dialog.Follow();
    EXPECT_EQ(dialog.Shown(), before);
}

TEST_F(Watched, IsLoadedAgainWhenItsFileChanges) {
    Save(Dialog("The second"));
    EXPECT_TRUE(Shows("The second"));
    EXPECT_TRUE(dialog.Shown()->IsVisible());
}

TEST_F(Watched, KeepsTheLastGoodDialogAndShowsTheError) {
    glogRec *const before = dialog.Shown();
    Save("<Glog width=\"1\"/>");
    EXPECT_EQ(dialog.Shown(), before);
    EXPECT_TRUE(Shows("First"));
    EXPECT_EQ(Banner(), path + ":1:1: <Glog> lacks the attribute \"height\"");
}

TEST_F(Watched, DrawsTheErrorAlongTheBottom) {
    desktop.TakeDrawing();
    Save("<Glog width=\"1\"/>");
    UpdateGlog(dialog.Shown());
    std::string drawn;
    for (std::string const &line : desktop.TakeDrawing())
        drawn += line;
    EXPECT_NE(drawn.find("lacks the attribute"), std::string::npos) << drawn;
}

TEST_F(Watched, ShowsTheLatestError) {
    Save("<Glog width=\"1\"/>");
    Save("<Glog width=\"1\" height=\"0\"/>");
    EXPECT_EQ(Banner(), path + ":1:1: attribute height: expected an integer from 1 to 16000, found 0");
}

TEST_F(Watched, ForgetsTheErrorWhenTheDialogIsGoodAgain) {
    Save("<Glog");
    Save(Dialog("Mended"));
    EXPECT_TRUE(Shows("Mended"));
    EXPECT_EQ(Banner(), "");
}

TEST_F(Watched, OutlivesTheLossOfItsFile) {
    std::filesystem::remove(path);
    dialog.Follow();
    EXPECT_EQ(Banner(), path + ": the file cannot be opened: No such file or directory");
    Save(Dialog("Back"));
    EXPECT_TRUE(Shows("Back"));
}

TEST_F(Watched, KeepsTheErrorAtTheBottomWhenItsWindowGrows) {
    Save("<Glog");
    desktop.Play("resize 200 140");
    glogRec *const glog = dialog.Shown();
    Rect box;
    GetGlogItem(glog, CountGlogItems(glog))->GetBox(&box);
    EXPECT_EQ(box.bottom, 140);
    EXPECT_EQ(box.right, 200);
}

TEST_F(Watched, HasRoomForALongError) {
    auto const height = [&] {
        glogRec *const glog = dialog.Shown();
        Rect box;
        GetGlogItem(glog, CountGlogItems(glog))->GetBox(&box);
        return box.bottom - box.top;
    };
    Save("<Glog");
    int const shortOne = height();
    Save("<Glog width=\"500\" height=\"300\"><Items><Item type=\"Zeppelin\"/></Items></Glog>");
    EXPECT_GT(height(), shortOne);
    EXPECT_LE(height(), 100) << "no higher than the window";
    desktop.Play("resize 900 300");
    EXPECT_GE(height(), shortOne);
    EXPECT_LT(height(), 100) << "wide windows need fewer lines";
}

TEST(WatchedDialog, MustBeGoodAtFirst) {
    SimulatedDesktop desktop;
    TemporaryDirectory directory;
    EXPECT_THROW(WatchedDialog(directory.Write("a.xml", "<Glog")), LoadError);
}

} // namespace
