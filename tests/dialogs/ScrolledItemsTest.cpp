#include "desktop/drawing/Surface.h"
#include "scrolling/ScrollGridPlus.h"
#include "scrolling/ScrollPane.h"
#include "tests/dialogs/DialogTest.h"
#include "tests/resources/TemporaryDirectory.h"
#include <cstdint>
#include <vector>

namespace {

std::string const kPlace = "<BoundsRect top=\"10\" left=\"20\" bottom=\"110\" right=\"220\"/>";
std::string const kBox =
    "<Item type=\"Box\"><BoundsRect top=\"300\" left=\"30\" bottom=\"340\" right=\"530\"/></Item>";

// Thirty pixels of its box lie beyond its right edge.
std::string const kStuckGrid =
    "<Item type=\"ScrollGrid\">" + kPlace +
    "<StickToEnd>1</StickToEnd><Items><Item type=\"Box\"><BoundsRect top=\"0\" left=\"0\" bottom=\"40\" "
    "right=\"230\"/></Item></Items></Item>";

class ScrolledItems : public DialogTest {
protected:
    std::vector<std::uint32_t> Pixels(glogRec *glog) {
        DesktopRep::Of(desktop).UpdateAll();
        Surface const &drawn = *Glog::From(glog).Pixels();
        return std::vector<std::uint32_t>(drawn.Pixels(), drawn.Pixels() + drawn.Width() * drawn.Height());
    }
};

} // namespace

TEST_F(ScrolledItems, AScrollPaneIsAsLargeAsItsItemsNeed) {
    ScrollPane *const pane = LoadOne<ScrollPane>("ScrollPane", kPlace + "<Items>" + kBox + "</Items>");
    EXPECT_EQ(BoxOf(pane), (Rect{10, 20, 110, 220}));
    EXPECT_EQ(pane->GetMaxHScrollValue(), 330);
    EXPECT_EQ(pane->GetMaxVScrollValue(), 240);
}

TEST_F(ScrolledItems, AScrollPaneIsAsLargeAsItSays) {
    ScrollPane *const pane = LoadOne<ScrollPane>(
        "ScrollPane", kPlace +
                          "<VirtualWidth>1000</VirtualWidth><VirtualHeight>30000</VirtualHeight><Items>" +
                          kBox + "</Items>");
    EXPECT_EQ(pane->GetMaxHScrollValue(), 800);
    EXPECT_EQ(pane->GetMaxVScrollValue(), 29900);
}

TEST_F(ScrolledItems, TheDumpTellsHowFarAPaneIsScrolled) {
    glogRec *const glog = Load(Dialog(Item("ScrollPane", kPlace + "<Items>" + kBox + "</Items>")));
    dynamic_cast<ScrollPane *>(GetGlogItem(glog, 1))->SetVScrollPos(40);
    EXPECT_TRUE(Holds(Dump(glog), "\"scrolledH\":0,\"scrolledV\":40")) << Dump(glog);
}

TEST_F(ScrolledItems, ABarThatIsNotThereIsAnError) {
    for (std::string const key : {"HScrollBar", "VScrollBar"})
        EXPECT_TRUE(Holds(ComplaintAboutItem("ScrollPane", kPlace + "<" + key + ">9</" + key + ">"),
                          "item 1 (ScrollPane): key " + key + ": there is no item 9"))
            << key;
    for (std::string const key : {"ScrollBar", "LateralScrollBar"})
        EXPECT_TRUE(Holds(ComplaintAboutItem("ScrollGrid", kPlace + "<" + key + ">1</" + key + ">"),
                          "item 1 (ScrollGrid): key " + key + ": item 1 is no scroll bar"))
            << key;
}

TEST_F(ScrolledItems, NeedABox) {
    for (std::string const type : {"ScrollPane", "Grid", "ScrollGrid"})
        EXPECT_TRUE(Holds(ComplaintAboutItem(type, ""),
                          "<BoundsRect top=\"\" left=\"\" bottom=\"\" right=\"\"> is missing"))
            << type;
}

TEST_F(ScrolledItems, AGridStacksItsItems) {
    std::string const items = "<Items>" + kBox + kBox + "</Items>";
    Grid *const column = LoadOne<Grid>("Grid", kPlace + items);
    EXPECT_EQ(BoxOf(column->Get(1)), (Rect{40, 0, 80, 500}));
    Grid *const row = LoadOne<Grid>("Grid", kPlace + "<Direction>horiz</Direction>" + items);
    EXPECT_EQ(BoxOf(row->Get(1)), (Rect{0, 500, 40, 1000}));
    EXPECT_FALSE(row->GetMayHaveDifferentSizes());
}

TEST_F(ScrolledItems, AScrollGridScrollsAlongItsDirectionAndAcross) {
    std::string items = "<DifferentSizes>1</DifferentSizes><Items>";
    for (int i = 0; i < 5; ++i)
        items += kBox;
    ScrollGridPlus *const grid = LoadOne<ScrollGridPlus>("ScrollGrid", kPlace + items + "</Items>");
    EXPECT_TRUE(grid->GetMayHaveDifferentSizes());
    EXPECT_EQ(grid->GetMaxScroll(), 100);
    EXPECT_EQ(grid->GetMaxLateralScroll(), 300);
}

TEST_F(ScrolledItems, AreScrolledByTheBarsThatCameWithThem) {
    TemporaryDirectory directory;
    std::string const bar = "<Item type=\"ScrollBar\" id=\"5\"/>",
                      view = Item("ScrollPane", kPlace + "<VScrollBar>5</VScrollBar>");
    for (std::string const &items :
         {bar + view, view + bar, "<Item type=\"Group\"><Items>" + bar + view + "</Items></Item>"}) {
        std::string const path = directory.Write("page.xml", Dialog(items));
        glogRec *const glog = Load(Dialog("<Item type=\"Group\" id=\"9\"/>"));
        CompoundPane *const place = dynamic_cast<CompoundPane *>(GetGlogItem(glog, 9));
        LoadItems(path, place);
        short const before = place->NumSubpanes();
        LoadItems(path, place);
        ScrollBarPane *const former = dynamic_cast<ScrollBarPane *>(place->FindByID(5));
        ScrollPane *const formerView = dynamic_cast<ScrollPane *>(place->FindByID(1));
        EXPECT_EQ(former->GetClient(), formerView);
        for (short i = 0; i < before; ++i)
            place->Del(0);
        ScrollBarPane *const fresh = dynamic_cast<ScrollBarPane *>(place->FindByID(5));
        EXPECT_EQ(fresh->GetClient(), dynamic_cast<ScrollPane *>(place->FindByID(1)));
    }
}

// A grid that sticks to its end moves pixels, and updates its window, as soon as it holds a box that is
// wider.
TEST_F(ScrolledItems, AreNotDrawnBeforeTheyLieWhereTheyWill) {
    TemporaryDirectory directory;
    std::string const path =
        directory.Write("page.xml", Dialog("<Item type=\"Group\"><Items>" + kStuckGrid + "</Items></Item>"));
    glogRec *const glog = Load(Dialog("<Item type=\"Group\" id=\"9\"/>" + Item("OvalButton", kPlace)));
    CompoundPane *const place = dynamic_cast<CompoundPane *>(GetGlogItem(glog, 9));
    ShowGlog(glog, kShowGlog);
    place->Hide();
    std::vector<std::uint32_t> const before = Pixels(glog);
    desktop.TakeDrawing();
    LoadItems(path, place);
    for (std::string const &line : desktop.TakeDrawing())
        EXPECT_TRUE(Holds(line, "ScrollRect") || Holds(line, "InvalRgn")) << line;
    EXPECT_EQ(Pixels(glog), before);
}

TEST_F(ScrolledItems, LeaveNothingOfThemselvesWhenTheyCannotBeMade) {
    TemporaryDirectory directory;
    std::string const path = directory.Write(
        "page.xml", Dialog(kStuckGrid + Item("ScrollGrid", kPlace + "<ScrollBar>99</ScrollBar>")));
    glogRec *const glog = Load(Dialog("<Item type=\"Group\" id=\"9\"/>" + Item("OvalButton", kPlace)));
    CompoundPane *const place = dynamic_cast<CompoundPane *>(GetGlogItem(glog, 9));
    ShowGlog(glog, kShowGlog);
    std::vector<std::uint32_t> const before = Pixels(glog);
    EXPECT_THROW(LoadItems(path, place), LoadError);
    EXPECT_EQ(Pixels(glog), before);
}
