// Scroll bars and grow boxes in dialogs and records.
#include "desktop/panes/Glog.h"
#include "scrolling/GrowBox.h"
#include "scrolling/ScrollBarClient.h"
#include "scrolling/ScrollBarPane.h"
#include "tests/dialogs/DialogTest.h"
#include <limits>
#include <vector>

namespace {

std::string const kUpright = "<BoundsRect top=\"20\" left=\"20\" bottom=\"150\" right=\"36\"/>";
std::string const kNumber = "<Range>100</Range><Position>25</Position><Page>20</Page><Step>3</Step>";

class ScrollItems : public DialogTest {
protected:
    ScrollBarPane *Bar(std::string const &keys) { return LoadOne<ScrollBarPane>("ScrollBar", keys); }
    // Loads a bar, shows it and plays the script; positions that were reported.
    std::vector<std::string> ReportedBy(std::string const &keys, std::string const &script) {
        bar = Bar(keys);
        ShowGlog(bar->GetGlog(), kShowGlog);
        desktop.TakeMessages();
        desktop.Play(script);
        std::vector<std::string> found;
        for (std::string const &line : desktop.TakeMessages()) {
            if (Holds(line, "\"Scrolled\""))
                found.push_back(line.substr(line.find("\"pane\"")));
        }
        return found;
    }
    static std::string Scrolled(int position) {
        return "\"pane\":\"ScrollBarPane\",\"id\":1,\"message\":\"Scrolled\",\"position\":" +
               std::to_string(position) + "}";
    }
    // A glog of one record with these 16-bit numbers.
    glogRec *FromNumbers(std::vector<int> const &numbers) {
        std::string bytes = "GLOGREC1";
        auto const add = [&bytes](int value) {
            bytes += static_cast<char>(value & 0xFF);
            bytes += static_cast<char>(value >> 8 & 0xFF);
        };
        for (int header : {320, 200, 1, static_cast<int>(2 * numbers.size())})
            add(header);
        for (int number : numbers)
            add(number);
        return LoadGlogFromRecords(bytes.data(), bytes.size(), GlogOptions().Growable(true), "old.glog");
    }
    // What a user makes of the window's size.
    static std::string SizeAfter(SimulatedDesktop &desktop, glogRec *glog, int width, int height) {
        ShowGlog(glog, kShowGlog);
        desktop.Play("resize " + std::to_string(width) + " " + std::to_string(height));
        return std::to_string(Glog::From(glog).Width()) + " x " + std::to_string(Glog::From(glog).Height());
    }

    ScrollBarPane *bar = nullptr;
};

typedef std::vector<std::string> Lines;
typedef std::vector<int> Numbers;

} // namespace

TEST_F(ScrollItems, ABarHasItsPlaceOrientationAndNumber) {
    ScrollBarPane *const upright = Bar(kUpright);
    EXPECT_FALSE(upright->IsHorizontal());
    EXPECT_EQ(BoxOf(upright), (Rect{20, 20, 150, 36}));
    EXPECT_EQ(upright->GetID(), 1);
    EXPECT_TRUE(Bar("<Flags>1</Flags>")->IsHorizontal());
}

TEST_F(ScrollItems, ABarFollowsTheEdgesOfTheWindow) {
    EXPECT_EQ(BoxOf(Bar("<Flags>6</Flags><EdgeH>10</EdgeH><EdgeV>-5</EdgeV>")), (Rect{0, 294, 205, 310}));
}

TEST_F(ScrollItems, ABarThatScrollsNothingIsDeadAndHasNoClient) {
    ScrollBarPane *const dead = Bar(kUpright);
    EXPECT_EQ(dead->GetClient(), nullptr);
    EXPECT_EQ(dead->GetRange(), 0);
    EXPECT_EQ(Bar(kUpright + "<Range>0</Range>")->GetClient(), nullptr);
}

TEST_F(ScrollItems, ABarMayScrollANumberOfItsOwn) {
    ScrollBarPane *const own = Bar(kUpright + kNumber);
    EXPECT_EQ(own->GetPosition(), 25);
    EXPECT_EQ(own->GetRange(), 100);
    EXPECT_DOUBLE_EQ(own->GetClient()->GetThumbRatio(own), 20.0 / 120);
    EXPECT_EQ(own->GetClient()->GetMaxScrollValue(own), 100);
}

TEST_F(ScrollItems, APageAndAStepAreOneWhenLeftOut) {
    EXPECT_EQ(ReportedBy(kUpright + "<Range>9</Range>", "click 28 142\nclick 28 110"),
              (Lines{Scrolled(1), Scrolled(2)}));
    EXPECT_DOUBLE_EQ(bar->GetClient()->GetThumbRatio(bar), 0.1);
}

TEST_F(ScrollItems, ABarsOwnNumberIsReportedAsItChanges) {
    EXPECT_EQ(ReportedBy(kUpright + kNumber, "click 28 142\nclick 28 28\nclick 28 120\nwheel 28 80 0 1"),
              (Lines{Scrolled(28), Scrolled(25), Scrolled(45), Scrolled(42)}));
}

TEST_F(ScrollItems, ABarsOwnNumberStaysWithinItsRange) {
    EXPECT_EQ(ReportedBy(kUpright + kNumber, "wheel 28 80 0 500\nwheel 28 80 0 1\nwheel 28 80 0 -500"),
              (Lines{Scrolled(0), Scrolled(100)}));
}

TEST_F(ScrollItems, ABarsOwnNumberFollowsTheThumb) {
    Lines const reported = ReportedBy(kUpright + kNumber, "press 28 60\nmove 28 199\nrelease");
    EXPECT_EQ(reported, Lines{Scrolled(100)});
}

TEST_F(ScrollItems, ABarsOwnNumberCannotLeaveWhatItMayBe) {
    bar = Bar(kUpright + kNumber);
    int const greatest = std::numeric_limits<int>::max(), least = std::numeric_limits<int>::min();
    int const positions[] = {greatest, least, 0}, targets[] = {100, 0, 0};
    for (int i = 0; i < 3; ++i) {
        bar->GetClient()->ScrollTo(bar, positions[i]);
        EXPECT_EQ(bar->GetPosition(), targets[i]);
    }
    int amount = greatest, multiplier = greatest;
    bar->GetClient()->Scroll(bar, amount, multiplier);
    EXPECT_EQ(bar->GetPosition(), 100);
}

TEST_F(ScrollItems, APositionBeyondTheRangeIsRefused) {
    EXPECT_TRUE(Holds(ComplaintAboutItem("ScrollBar", "<Range>10</Range><Position>11</Position>"),
                      "there is no position 11: the last one is 10"));
    EXPECT_TRUE(Holds(ComplaintAboutItem("ScrollBar", "<Position>1</Position>"), "Position"));
}

TEST_F(ScrollItems, NumbersOutsideOfTheirLimitsAreRefused) {
    for (char const *keys :
         {"<Flags>128</Flags>", "<Flags>-1</Flags>", "<Range>-1</Range>", "<Page>0</Page>", "<Step>0</Step>",
          "<EdgeH>40000</EdgeH>", "<ActiveInBackground>2</ActiveInBackground>",
          "<BoundsRect top=\"20\" left=\"0\" bottom=\"10\" right=\"16\"/>"})
        EXPECT_NE(ComplaintAboutItem("ScrollBar", keys), "no complaint") << keys;
}

TEST_F(ScrollItems, EveryValueOfTheFlagsLoads) {
    for (int flags = 0; flags <= 127; ++flags)
        EXPECT_EQ(Bar("<Flags>" + std::to_string(flags) + "</Flags>" + kUpright + kNumber)->IsHorizontal(),
                  flags % 2 == 1);
}

TEST_F(ScrollItems, ABarMayWorkInTheBackground) {
    std::string const keys = kUpright + kNumber;
    auto const troughs = [this] {
        desktop.TakeDrawing();
        desktop.Play("activate off");
        std::string all;
        for (std::string const &line : desktop.TakeDrawing())
            all += line;
        return all;
    };
    ShowGlog(Bar(keys)->GetGlog(), kShowGlog);
    EXPECT_TRUE(Holds(troughs(), "\"icon\":43"));
    ShowGlog(Bar(keys + "<ActiveInBackground>1</ActiveInBackground>")->GetGlog(), kShowGlog);
    EXPECT_FALSE(Holds(troughs(), "\"icon\":43"));
}

TEST_F(ScrollItems, TheDumpTellsWhereABarIs) {
    EXPECT_TRUE(Holds(Dump(Bar(kUpright + kNumber)->GetGlog()), "\"position\":25,\"range\":100"));
}

TEST_F(ScrollItems, AProgramMayTakeABarAndItsOwnNumberIsForgotten) {
    bar = Bar(kUpright + kNumber);
    bar->SetClient(nullptr);
    DisposeGlog(bar->GetGlog()); // what stood in for a client goes with the bar
}

TEST_F(ScrollItems, ABarInALayoutFillsIt) {
    glogRec *const glog = Load(
        Dialog("<Item type=\"Group\"><BoundsRect top=\"0\" left=\"0\" bottom=\"100\" right=\"100\"/><Items>"
               "<Item type=\"ScrollBar\" "
               "id=\"1\"><Layout><GrowHeight>1</GrowHeight></Layout></Item></Items></Item>"));
    ShowGlog(glog, kShowGlog);
    EXPECT_EQ(BoxOf(GetGlogItem(glog, 1)), (Rect{0, 0, 100, 16}));
}

TEST_F(ScrollItems, ABarInALayoutKeepsTheLengthOfItsBox) {
    glogRec *const glog = Load(
        Dialog("<Item type=\"Group\"><BoundsRect top=\"0\" left=\"0\" bottom=\"200\" right=\"300\"/><Items>"
               "<Item type=\"ScrollBar\" id=\"1\">" +
               kUpright +
               "</Item><Item type=\"ScrollBar\" id=\"2\"><Flags>1</Flags>"
               "<BoundsRect top=\"0\" left=\"0\" bottom=\"16\" right=\"120\"/></Item></Items></Item>"));
    ShowGlog(glog, kShowGlog);
    desktop.Play("resize 330 210\nresize 320 200");
    EXPECT_EQ(BoxOf(GetGlogItem(glog, 1)), (Rect{0, 0, 130, 16}));
    EXPECT_EQ(BoxOf(GetGlogItem(glog, 2)), (Rect{130, 0, 146, 120}));
}

TEST_F(ScrollItems, ARecordMakesABar) {
    glogRec *const glog = FromNumbers({2, 1, 10, 20, 26, 120, 0, 0});
    ScrollBarPane *const made = dynamic_cast<ScrollBarPane *>(GetGlogItem(glog, 1));
    ASSERT_NE(made, nullptr);
    EXPECT_TRUE(made->IsHorizontal());
    EXPECT_EQ(BoxOf(made), (Rect{10, 20, 26, 120}));
}

TEST_F(ScrollItems, ARecordsBarFollowsTheEdges) {
    glogRec *const glog = FromNumbers({2, 6, 0, 0, 0, 0, 10, 15});
    EXPECT_EQ(BoxOf(GetGlogItem(glog, 1)), (Rect{0, 294, 185, 310}));
}

TEST_F(ScrollItems, RecordsOfAllExtremesMakeBars) {
    for (int flags : {0, 1, 7, 96, -1, 32767, -32768})
        for (int start : {-32768, 0, 32767})
            for (int end : {-32768, 0, 32767}) {
                glogRec *const glog = FromNumbers({2, flags, start, start, end, end, start, end});
                ShowGlog(glog, kShowGlog);
                desktop.Play("resize 200 300\nclick 5 5\nwheel 5 5 0 1");
                DisposeGlog(glog);
            }
}

TEST_F(ScrollItems, ARecordThatIsCutIsRefused) {
    EXPECT_NE(Complaint([&] { FromNumbers({2, 0, 10, 20, 30}); }), "no complaint");
    EXPECT_NE(Complaint([&] { FromNumbers({3, 0, 10, 20, 30}); }), "no complaint");
}

TEST_F(ScrollItems, AGrowBoxLiesInTheCorner) {
    EXPECT_EQ(BoxOf(LoadOne<GrowBox>("GrowBox", "")), (Rect{185, 305, 200, 320}));
}

namespace {

std::string const kLimits = "<LimitsRect top=\"100\" left=\"150\" bottom=\"300\" right=\"400\"/>";

std::string Growable(std::string const &attributes, std::string const &keys) {
    return "<Glog width=\"320\" height=\"200\" growable=\"yes\" " + attributes +
           "><Items><Item type=\"GrowBox\" id=\"1\">" + keys + "</Item></Items></Glog>";
}

} // namespace

TEST_F(ScrollItems, AGrowBoxLimitsTheWindow) {
    glogRec *const glog = Load(Growable("", kLimits));
    EXPECT_EQ(SizeAfter(desktop, glog, 10, 10), "150 x 100");
    EXPECT_EQ(SizeAfter(desktop, glog, 900, 900), "400 x 300");
}

TEST_F(ScrollItems, LimitsOfTheDialogGoBeforeThoseOfItsGrowBox) {
    glogRec *const glog = Load(Growable("minWidth=\"200\" minHeight=\"120\"", kLimits));
    EXPECT_EQ(SizeAfter(desktop, glog, 10, 10), "200 x 120");
    EXPECT_EQ(SizeAfter(desktop, glog, 900, 900), "400 x 300");
}

TEST_F(ScrollItems, AGrowBoxWithoutLimitsLeavesThoseOfTheDialog) {
    glogRec *const glog = Load(Growable("minWidth=\"200\" minHeight=\"120\"", ""));
    EXPECT_EQ(SizeAfter(desktop, glog, 10, 10), "200 x 120");
}

TEST_F(ScrollItems, AGrowBoxShowsTheLinesAndGroundThatItWasTold) {
    struct {
        char const *keys;
        char const *icon;
    } const looks[] = {{"", "24"},
                       {"<BorderLeft>1</BorderLeft>", "20"},
                       {"<BorderTop>1</BorderTop>", "21"},
                       {"<BorderLeft>1</BorderLeft><BorderTop>1</BorderTop>", "22"},
                       {"<Color>1</Color>", "23"},
                       {"<BorderTop>1</BorderTop><Color>2</Color>", "25"}};
    for (auto const &look : looks) {
        desktop.TakeDrawing();
        ShowGlog(Load(Growable("", look.keys)), kShowGlog);
        std::string drawn;
        for (std::string const &line : desktop.TakeDrawing())
            drawn += line;
        EXPECT_TRUE(Holds(drawn, std::string("\"icon\":") + look.icon + ",")) << look.keys;
    }
}

TEST_F(ScrollItems, ARecordMakesAGrowBox) {
    glogRec *const glog = FromNumbers({3, 100, 150, 300, 400, 0x0101, 0, 0});
    ASSERT_NE(dynamic_cast<GrowBox *>(GetGlogItem(glog, 1)), nullptr);
    EXPECT_EQ(SizeAfter(desktop, glog, 10, 10), "150 x 100");
}

TEST_F(ScrollItems, RecordsOfAllExtremesMakeGrowBoxes) {
    for (int first : {-32768, -1, 0, 1, 600})
        for (int second : {-32768, -1, 0, 1, 32767}) {
            glogRec *const glog = FromNumbers({3, first, first, second, second, second, second, first});
            ShowGlog(glog, kShowGlog);
            desktop.Play("resize 1 1\nresize 900 900");
            DisposeGlog(glog);
        }
}
