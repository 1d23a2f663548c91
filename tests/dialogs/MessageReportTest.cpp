// What loaded panes report, and what the tree dump says about them.
#include "buttons/OvalButtonPane.h"
#include "tests/dialogs/DialogTest.h"

namespace {

std::string const kTwoButtons =
    "<Item type=\"OvalButton\" id=\"3\"><BoundsRect top=\"20\" left=\"20\" bottom=\"39\" "
    "right=\"120\"/></Item>"
    "<Item type=\"Group\" id=\"9\"><BoundsRect top=\"50\" left=\"20\" bottom=\"120\" right=\"200\"/><Items>"
    "<Item type=\"StudButton\" id=\"4\"><BoundsRect top=\"0\" left=\"0\" bottom=\"20\" right=\"100\"/></Item>"
    "</Items></Item>";

class ReportedMessages : public DialogTest {
protected:
    // The messages of listeners.
    std::vector<std::string> After(std::string const &script) {
        desktop.TakeMessages();
        desktop.Play(script);
        std::vector<std::string> found;
        for (std::string const &line : desktop.TakeMessages()) {
            if (Holds(line, "GlogButtonPressed"))
                found.push_back(line.substr(line.find("\"pane\"")));
        }
        return found;
    }
};

TEST_F(ReportedMessages, TellOfPressedButtonsInsideAndOutsideOfGroups) {
    ShowGlog(Load(Dialog(kTwoButtons)), kShowGlog);
    EXPECT_EQ(After("click 40 30\nclick 40 60"),
              (std::vector<std::string>{
                  "\"pane\":\"OvalButtonPane\",\"id\":3,\"message\":\"GlogButtonPressed\"}",
                  "\"pane\":\"StudButtonPane\",\"id\":4,\"message\":\"GlogButtonPressed\"}"}));
}

TEST_F(ReportedMessages, AreSilentAboutPressesThatSlideOff) {
    ShowGlog(Load(Dialog(kTwoButtons)), kShowGlog);
    EXPECT_TRUE(After("press 40 30\nmove 300 190\nrelease").empty());
}

TEST_F(ReportedMessages, EndWithTheirPanes) {
    glogRec *const glog = Load(Dialog(kTwoButtons));
    ShowGlog(glog, kShowGlog);
    delete GetGlogItem(glog, 3);
    EXPECT_TRUE(After("click 40 30").empty());
    DisposeGlog(glog);
    EXPECT_EQ(Glogs(), 0u);
}

TEST_F(ReportedMessages, MayLeadToTheEndOfTheGlog) {
    glogRec *const glog = Load(Dialog(kTwoButtons));
    ShowGlog(glog, kShowGlog);
    int presses = 0;
    desktop.WatchMessages([&](std::string const &line) {
        if (!Holds(line, "GlogButtonPressed"))
            return;
        ++presses;
        DisposeGlog(glog);
    });
    desktop.Play("click 40 30");
    EXPECT_EQ(presses, 1);
    EXPECT_EQ(Glogs(), 0u);
}

TEST_F(ReportedMessages, CostNothingWhileNobodyWatches) {
    ShowGlog(Load(Dialog(kTwoButtons)), kShowGlog);
    desktop.Play("click 40 30");
    EXPECT_TRUE(desktop.TakeMessages().empty());
}

class TreeDumpOfADialog : public DialogTest {};

TEST_F(TreeDumpOfADialog, TellsLabelsTextsAndStates) {
    std::string const dump = Dump(Load(Dialog("<Item type=\"OvalButton\"><TextNum>1</TextNum></Item>"
                                              "<Item type=\"StudButton\"><ButtonText>Go</ButtonText></Item>"
                                              "<Item type=\"FrameButton\"><State>1</State></Item>"
                                              "<Item type=\"Label\"><Origin v=\"9\" h=\"8\"/><FSRID>6</FSRID>"
                                              "<Text>Tempo</Text></Item>")));
    EXPECT_TRUE(Holds(dump, "\"class\":\"OvalButtonPane\"") && Holds(dump, "\"text\":\"OK\"")) << dump;
    EXPECT_TRUE(Holds(dump, "\"class\":\"StudButtonPane\"") && Holds(dump, "\"text\":\"Go\"")) << dump;
    EXPECT_TRUE(Holds(dump, "\"class\":\"FrameButtonPane\"") && Holds(dump, "\"state\":1")) << dump;
    EXPECT_TRUE(Holds(dump, "\"text\":\"Tempo\",\"origin\":[9,8],\"font\":6")) << dump;
}

TEST_F(TreeDumpOfADialog, ShowsWhatIsInGroups) {
    std::string const dump = Dump(Load(Dialog(kTwoButtons)));
    std::size_t const group = dump.find("GroupPane");
    ASSERT_NE(group, std::string::npos);
    EXPECT_NE(dump.find("StudButtonPane", group), std::string::npos);
}

} // namespace
