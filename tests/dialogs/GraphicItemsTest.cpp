#include "graphics/GLinePane.h"
#include "graphics/GraphPane.h"
#include "graphics/PictPane.h"
#include "graphics/ProgressBarPane.h"
#include "graphics/ThreeDPane.h"
#include "graphics/ZoomControlPane.h"
#include "graphics/ZoomPopUpPane.h"
#include "tests/dialogs/DialogTest.h"
#include "tests/dialogs/OneRecord.h"

namespace {

std::string const kPlace = "<BoundsRect top=\"10\" left=\"20\" bottom=\"30\" right=\"140\"/>";

std::string const kGraph = "<BoundsRect top=\"0\" left=\"0\" bottom=\"52\" right=\"102\"/>";
std::string const kCube = "<BoundsRect top=\"0\" left=\"0\" bottom=\"238\" right=\"224\"/>";

class GraphicItemsTest : public DialogTest {};

} // namespace

// Progress bars

TEST_F(GraphicItemsTest, AProgressBarStandsWhereItIsTold) {
    EXPECT_EQ(BoxOf(LoadOne<ProgressBarPane>("ProgressBar", kPlace)), (Rect{10, 20, 30, 140}));
    EXPECT_EQ(BoxOf(LoadOne<ProgressBarPane>("ProgressBar", "")), (Rect{0, 0, 0, 0}));
}

TEST_F(GraphicItemsTest, AProgressBarTellsHowFarItIs) {
    ProgressBarPane *const bar =
        LoadOne<ProgressBarPane>("ProgressBar", kPlace + "<Value>1</Value><Maximum>4</Maximum>");
    EXPECT_TRUE(Holds(Dump(bar->GetGlog()), "\"showsProgress\":true,\"percent\":25")) << Dump(bar->GetGlog());
    EXPECT_TRUE(
        Holds(Dump(LoadOne<ProgressBarPane>("ProgressBar", kPlace)->GetGlog()), "\"showsProgress\":false"));
}

TEST_F(GraphicItemsTest, AProgressBarRefusesNumbersBelowZero) {
    EXPECT_NE(ComplaintAboutItem("ProgressBar", "<Value>-1</Value>"), "no complaint");
    EXPECT_NE(ComplaintAboutItem("ProgressBar", "<Maximum>-1</Maximum>"), "no complaint");
}

// Lines

TEST_F(GraphicItemsTest, ALinesEndsMayStandInAnyOrder) {
    EXPECT_EQ(
        BoxOf(LoadOne<GLinePane>("Line", "<BoundsRect top=\"50\" left=\"140\" bottom=\"50\" right=\"20\"/>")),
        (Rect{50, 20, 53, 141}));
    EXPECT_EQ(
        BoxOf(LoadOne<GLinePane>("Line", "<BoundsRect top=\"90\" left=\"20\" bottom=\"50\" right=\"20\"/>")),
        (Rect{50, 20, 91, 23}));
}

TEST_F(GraphicItemsTest, ALineIsNotLongerThanThePlane) {
    EXPECT_TRUE(Holds(
        ComplaintAboutItem("Line", "<BoundsRect top=\"0\" left=\"30000\" bottom=\"0\" right=\"-30000\"/>"),
        "a side is longer than 32767 pixels"));
}

TEST_F(GraphicItemsTest, ARecordMakesALine) {
    GLinePane *const line = dynamic_cast<GLinePane *>(GetGlogItem(LoadOneRecord({11, 10, 20, 10, 140}), 1));
    ASSERT_NE(line, nullptr);
    EXPECT_EQ(BoxOf(line), (Rect{10, 20, 13, 141}));
    EXPECT_NE(Complaint([&] { LoadOneRecord({11, 10, 20, 10}); }), "no complaint");
    EXPECT_NE(Complaint([&] { LoadOneRecord({11, 10, 20, 10, 140, 0}); }), "no complaint");
}

// The point in a cube

TEST_F(GraphicItemsTest, ACubeShowsThePointThatItIsTold) {
    ThreeDPane *const cube =
        LoadOne<ThreeDPane>("ThreeD", kCube + "<Location x=\"250\" y=\"-1000\" z=\"0\"/>");
    EXPECT_EQ(cube->GetValue(), (Point3D{0.25, -1.0, 0.0}));
    EXPECT_TRUE(Holds(Dump(cube->GetGlog()), "\"x\":0.25,\"y\":-1,\"z\":0")) << Dump(cube->GetGlog());
    EXPECT_EQ(LoadOne<ThreeDPane>("ThreeD", kCube)->GetValue(), (Point3D{0.0, 0.0, 0.0}));
}

TEST_F(GraphicItemsTest, ACubeIsSeenFromWhereItIsTold) {
    ThreeDPane *const cube = LoadOne<ThreeDPane>(
        "ThreeD", "<BoundsRect top=\"0\" left=\"0\" bottom=\"200\" right=\"200\"/><Angle>0</Angle>"
                  "<Viewpoint x=\"0\" y=\"0\" z=\"-3000\"/><Radius>0</Radius>"
                  "<Margins top=\"0\" left=\"0\" bottom=\"0\" right=\"0\"/>");
    // 100 + 200 * 0.5 / 3 across, 100 + 200 * 0.25 / 3 down
    EXPECT_EQ(cube->Project({0.5, -0.25, 0.0}).h, 133);
    EXPECT_EQ(cube->Project({0.5, -0.25, 0.0}).v, 116);
}

TEST_F(GraphicItemsTest, ACubeFollowsItsBox) {
    ThreeDPane *const cube = LoadOne<ThreeDPane>("ThreeD", kCube);
    Point const before = cube->Project({0.1, 0.2, 0.3});
    cube->Offset({30, 40});
    EXPECT_EQ(cube->Project({0.1, 0.2, 0.3}).h, before.h + 40);
    EXPECT_EQ(cube->Project({0.1, 0.2, 0.3}).v, before.v + 30);
}

TEST_F(GraphicItemsTest, WatchersHearWhereThePointGoes) {
    ThreeDPane *const cube = LoadOne<ThreeDPane>("ThreeD", kCube);
    desktop.TakeMessages();
    cube->SetValue({0.5, 0.0, -0.25});
    std::vector<std::string> const heard = desktop.TakeMessages();
    ASSERT_EQ(heard.size(), 1u);
    EXPECT_TRUE(Holds(heard.front(), "\"message\":\"PointMoved\",\"x\":0.5,\"y\":0,\"z\":-0.25"))
        << heard.front();
}

TEST_F(GraphicItemsTest, ACubeRefusesPlacesOutsideOfIt) {
    for (std::string const key :
         {"<Location x=\"1001\" y=\"0\" z=\"0\"/>", "<Location x=\"0\" y=\"0\"/>", "<Angle>361</Angle>",
          "<Radius>-1</Radius>", "<Radius>1001</Radius>", "<Viewpoint x=\"0\" y=\"0\" z=\"32768\"/>"})
        EXPECT_NE(ComplaintAboutItem("ThreeD", kCube + key), "no complaint") << key;
    EXPECT_NE(ComplaintAboutItem("ThreeD", ""), "no complaint");
}

// Pictures

TEST_F(GraphicItemsTest, APictureIsFoundByItsName) {
    PictPane *const picture =
        LoadOne<PictPane>("Picture", kPlace + "<ResIDName>kKeyboardPicture</ResIDName>");
    EXPECT_EQ(picture->GetPictureID(), 9003);
    EXPECT_EQ(BoxOf(picture), (Rect{10, 20, 30, 140}));
    EXPECT_TRUE(Holds(Dump(picture->GetGlog()), "\"picture\":9003"));
}

TEST_F(GraphicItemsTest, APictureMayHaveItsOwnSize) {
    EXPECT_EQ(BoxOf(LoadOne<PictPane>("Picture", kPlace + "<ResIDName>kKeyboardPicture</ResIDName>"
                                                          "<PicUseImageSize>1</PicUseImageSize>")),
              (Rect{10, 20, 96, 316}));
}

TEST_F(GraphicItemsTest, APictureThatIsNotThereIsAnError) {
    EXPECT_TRUE(Holds(ComplaintAboutItem("Picture", "<ResIDName>kNoPicture</ResIDName>"),
                      "key ResIDName: there is no picture \"kNoPicture\""));
    EXPECT_NE(ComplaintAboutItem("Picture", kPlace), "no complaint");
}

TEST_F(GraphicItemsTest, WatchersHearOfClicksOnAPicture) {
    PictPane *const picture =
        LoadOne<PictPane>("Picture", kPlace + "<ResIDName>kKeyboardPicture</ResIDName>");
    ShowGlog(picture->GetGlog(), kShowGlog);
    desktop.TakeMessages();
    desktop.Play("click 30 20");
    std::string heard;
    for (std::string const &line : desktop.TakeMessages())
        heard += line;
    EXPECT_TRUE(Holds(heard, "\"message\":\"PictClicked\",\"where\":[20,30]")) << heard;
}

TEST_F(GraphicItemsTest, ARecordMakesAPicture) {
    PictPane *const picture =
        dynamic_cast<PictPane *>(GetGlogItem(LoadOneRecord({10, 10, 20, 30, 140, 1, 9003}), 1));
    ASSERT_NE(picture, nullptr);
    EXPECT_EQ(picture->GetPictureID(), 9003);
    EXPECT_EQ(BoxOf(picture), (Rect{10, 20, 96, 316}));
    EXPECT_NE(Complaint([&] { LoadOneRecord({10, 10, 20, 30, 140, 1}); }), "no complaint");
    EXPECT_NE(Complaint([&] { LoadOneRecord({10, 10, 20, 30, 140, 1, 9003, 0}); }), "no complaint");
}

// Graphs

TEST_F(GraphicItemsTest, AGraphHasItsAxesAndPoints) {
    GraphPane *const graph = LoadOne<GraphPane>(
        "Graph", kGraph + "<HorizontalAxis min=\"-10\" max=\"10\" interval=\"5\"/>"
                          "<VerticalAxis min=\"0\" max=\"1000\"/>"
                          "<Points><DataPoint h=\"-10\" v=\"0\"/><DataPoint h=\"3\" v=\"500\"/></Points>");
    EXPECT_EQ(graph->CoordsToGraphDataPoint(100, 1).horizontal, 10);
    EXPECT_EQ(graph->CoordsToGraphDataPoint(100, 1).vertical, 1000);
    ASSERT_NE(graph->GetGraphData(), nullptr);
    ASSERT_EQ(graph->GetGraphData()->CountPoints(), 2);
    EXPECT_EQ(graph->GetGraphData()->GetPoint(1).horizontal, 3);
    EXPECT_EQ(graph->GetGraphData()->GetPoint(1).vertical, 500);
    EXPECT_TRUE(Holds(Dump(graph->GetGlog()), "\"points\":2"));
}

TEST_F(GraphicItemsTest, AGraphWithoutKeysHasTheUsualAxes) {
    GraphPane *const graph = LoadOne<GraphPane>("Graph", kGraph);
    EXPECT_EQ(graph->CoordsToGraphDataPoint(100, 1).horizontal, 127);
    EXPECT_EQ(graph->GetGraphData(), nullptr);
}

TEST_F(GraphicItemsTest, AGraphRefusesAxesWithoutLength) {
    for (std::string const key :
         {"<HorizontalAxis min=\"5\" max=\"5\"/>", "<VerticalAxis min=\"6\" max=\"5\"/>",
          "<HorizontalAxis min=\"0\"/>", "<HorizontalAxis min=\"0\" max=\"9\" interval=\"-1\"/>",
          "<Points><DataPoint h=\"1\"/></Points>"})
        EXPECT_NE(ComplaintAboutItem("Graph", kGraph + key), "no complaint") << key;
}

TEST_F(GraphicItemsTest, ARecordMakesAGraph) {
    GraphPane *const graph = dynamic_cast<GraphPane *>(GetGlogItem(LoadOneRecord({12, 10, 20, 60, 140}), 1));
    ASSERT_NE(graph, nullptr);
    EXPECT_EQ(BoxOf(graph), (Rect{10, 20, 60, 140}));
}

// Zooming

TEST_F(GraphicItemsTest, AZoomSliderHasItsLevels) {
    ZoomPopUpPane *const slider =
        LoadOne<ZoomPopUpPane>("ZoomSlider", "<Origin v=\"20\" h=\"30\"/><Level>3</Level><Levels>4</Levels>");
    EXPECT_EQ(BoxOf(slider), (Rect{20, 30, 32, 42}));
    EXPECT_TRUE(Holds(Dump(slider->GetGlog()), "\"level\":3,\"levels\":4"));
    ShowGlog(slider->GetGlog(), kShowGlog);
    desktop.TakeMessages();
    desktop.Play("wheel 35 25 0 1\nwheel 35 25 0 1\npress 35 25\nmove 10 25");
    std::string heard;
    for (std::string const &line : desktop.TakeMessages())
        heard += line;
    EXPECT_TRUE(Holds(heard, "\"message\":\"Zoomed\",\"level\":4")) << heard;
    EXPECT_TRUE(Holds(Dump(slider->GetGlog()), "\"level\":2,\"levels\":4")) << "20 pixels to the left";
}

TEST_F(GraphicItemsTest, ZoomButtonsMayGoWhenTheyTellOfALevel) {
    ZoomControlPane *const buttons =
        LoadOne<ZoomControlPane>("ZoomButtons", "<Origin v=\"20\" h=\"30\"/><Levels>4</Levels>");
    glogRec *const glog = buttons->GetGlog();
    ShowGlog(glog, kShowGlog);
    desktop.WatchMessages([glog](std::string const &line) {
        if (Holds(line, "Zoomed"))
            delete GetGlogItem(glog, 1);
    });
    desktop.Play("click 37 27"); // zooms in
    EXPECT_EQ(CountGlogItems(glog), 0);
}

TEST_F(GraphicItemsTest, ZoomButtonsHaveTheirLevels) {
    ZoomControlPane *const buttons = LoadOne<ZoomControlPane>(
        "ZoomButtons", "<Origin v=\"20\" h=\"30\"/><Levels>1</Levels><Direction>horiz</Direction>");
    EXPECT_EQ(BoxOf(buttons), (Rect{20, 30, 35, 60}));
    ShowGlog(buttons->GetGlog(), kShowGlog);
    desktop.TakeMessages();
    desktop.Play("click 52 25\nclick 52 25\nclick 35 25");
    std::string heard;
    for (std::string const &line : desktop.TakeMessages())
        if (Holds(line, "Zoomed"))
            heard += line.substr(line.find("\"level\""));
    EXPECT_EQ(heard, "\"level\":1}\"level\":0}") << "the second click meets a disabled button";
}

TEST_F(GraphicItemsTest, ZoomButtonsStandAboveEachOtherUnlessTheDialogSaysOtherwise) {
    EXPECT_EQ(BoxOf(LoadOne<ZoomControlPane>("ZoomButtons", "")), (Rect{0, 0, 30, 15}));
}

TEST_F(GraphicItemsTest, ZoomingRefusesLevelsThatAreNotThere) {
    for (std::string const type : {"ZoomSlider", "ZoomButtons"}) {
        EXPECT_TRUE(
            Holds(ComplaintAboutItem(type, "<Level>11</Level>"), "there is no level 11: the last one is 10"));
        for (std::string const key : {"<Level>-1</Level>", "<Levels>0</Levels>", "<Levels>1001</Levels>"})
            EXPECT_NE(ComplaintAboutItem(type, key), "no complaint") << key;
    }
}
