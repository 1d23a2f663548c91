#include "graphics/GraphPane.h"
#include "desktop/drawing/Surface.h"
#include "desktop/panes/Glog.h"
#include "graphics/PixelLine.h"
#include "host/NamedColors.h"
#include "host/OSPath.h"
#include "host/OSPort.h"
#include "host/OSRgn.h"
#include "host/VelaDrawing.h"
#include "tests/PaneTest.h"
#include "tests/VirtualPlace.h"
#include <cmath>
#include <limits>
#include <random>

namespace {

int const kLeastInt = std::numeric_limits<int>::min(), kGreatestInt = std::numeric_limits<int>::max();

class Points : public GraphData {
public:
    explicit Points(std::vector<GraphDataPoint> points_, int *deleted_ = nullptr)
        : points(std::move(points_))
        , deleted(deleted_) {}
    ~Points() override {
        if (deleted)
            ++*deleted;
    }
    int CountPoints() override { return static_cast<int>(points.size()); }
    GraphDataPoint GetPoint(int index) override {
        GraphDataPoint const point = points.at(static_cast<std::size_t>(index));
        if (onAsked)
            onAsked();
        return point;
    }
    std::vector<GraphDataPoint> points;
    std::function<void()> onAsked;
    int *deleted;
};

// Notes its marks.
class MarkedGraph : public GraphPane {
public:
    using GraphPane::DrawBackground;
    using GraphPane::DrawData;
    using GraphPane::DrawGridLines;
    using GraphPane::GraphPane;
    void DrawDataPoint(int index, int h, int v) override {
        marks.push_back({index, h, v});
        if (then)
            then();
    }
    std::vector<std::vector<int>> marks;
    std::function<void()> then;
};

class GraphPaneTest : public PaneTest {
protected:
    // The ground is 100 x 200 pixels from (11, 21): h from 21 to 220, v from 110 up to 11.
    static constexpr Rect kBox = {10, 20, 112, 222};
    MarkedGraph *Made(Rect const &box = kBox) {
        GraphPaneResRec record = {GraphPaneResRec::kKind, box};
        return new MarkedGraph(glog, 5, &record);
    }
    Lines GridOf(MarkedGraph &graph) {
        return Traced(graph, [&] { graph.DrawGridLines(); });
    }
    // The calls of upright lines at these columns, and of no level ones.
    Lines UprightLines(GlogPane &pane, std::vector<short> const &columns) {
        return Traced(pane, [&] {
            VelaDrawing::PenNormal();
            bool odd = true;
            for (short h : columns) {
                VelaDrawing::RGBForeColor(odd ? kDialogListInactiveTextColor : kDialogListTextColor);
                VelaDrawing::MoveTo(h, 11);
                VelaDrawing::LineTo(h, 110);
                odd = !odd;
            }
        });
    }
    static std::size_t PointsIn(Lines const &lines) {
        std::size_t count = 0;
        for (std::string const &line : lines)
            for (std::size_t at = line.find("],["); at != std::string::npos; at = line.find("],[", at + 1))
                ++count;
        return count + 1;
    }
};

GraphAxisSetting const kNoGrid = {0, 100, 0, 0, 0};

} // namespace

// Creation and boxes

TEST_F(GraphPaneTest, TakesItsBoxFromTheRecord) {
    MarkedGraph *const graph = Made();
    EXPECT_EQ(BoxOf(*graph), kBox);
    EXPECT_EQ(graph->GetID(), 5);
    EXPECT_EQ(graph->GetGraphData(), nullptr);
}

TEST_F(GraphPaneTest, WithoutARecordItsBoxIsEmpty) {
    EXPECT_EQ(BoxOf(*new GraphPane(glog, 5, static_cast<GraphPaneResRec *>(nullptr))), (Rect{0, 0, 0, 0}));
}

TEST_F(GraphPaneTest, TakesItsBoxFromAnItem) {
    GraphPane *const graph = new GraphPane(glog, 5, TestItem().Box("BoundsRect", kBox).Container());
    EXPECT_EQ(BoxOf(*graph), kBox);
    EXPECT_EQ(graph->CoordsToGraphDataPoint(220, 11).horizontal, 127);
    EXPECT_EQ(BoxOf(*new GraphPane(glog, 5, TestItem().Container())), (Rect{0, 0, 0, 0}));
}

TEST_F(GraphPaneTest, WithoutAGlogItIsNotAttached) {
    GraphPaneResRec record = {GraphPaneResRec::kKind, kBox};
    GraphPane const loose(nullptr, 5, &record);
    EXPECT_EQ(loose.GetGraphData(), nullptr);
}

TEST_F(GraphPaneTest, ItsGroundIsTheBoxWithoutTheFrame) {
    MarkedGraph *const graph = Made();
    EXPECT_EQ(graph->GraphBounds(), (Rect{11, 21, 111, 221}));
    EXPECT_EQ(graph->GraphLeft(), 21);
    EXPECT_EQ(graph->GraphRight(), 220);
}

TEST_F(GraphPaneTest, MarksComeFirstInItsOwnTable) {
    MarkedGraph *const graph = Made();
    EXPECT_EQ(PlaceOf(&GraphPane::DrawDataPoint),
              PlaceOf(static_cast<void (MarkedGraph::*)(int, int, int)>(&MarkedGraph::DrawDataPoint)));
    ExpectInOrder(kAfterDestructor, &GraphData::CountPoints, &GraphData::GetPoint);
    EXPECT_NE(graph, nullptr);
}

// Mapping

TEST_F(GraphPaneTest, ValuesRunFromLeftToRightAndFromBottomToTop) {
    MarkedGraph *const graph = Made();
    int h = 0, v = 0;
    graph->GraphDataPointToCoords({0, 0}, h, v);
    EXPECT_EQ(h, 21);
    EXPECT_EQ(v, 110);
    graph->GraphDataPointToCoords({127, 127}, h, v);
    EXPECT_EQ(h, 220);
    EXPECT_EQ(v, 11);
    graph->GraphDataPointToCoords({64, 32}, h, v);
    EXPECT_EQ(h, 121); // 21 + 199 / 127 * 64 = 121.3
    EXPECT_EQ(v, 85);  // 110 - 99 / 127 * 32 = 85.06
}

TEST_F(GraphPaneTest, PixelsLeadToValues) {
    MarkedGraph *const graph = Made();
    EXPECT_EQ(graph->CoordsToGraphDataPoint(21, 110).horizontal, 0);
    EXPECT_EQ(graph->CoordsToGraphDataPoint(21, 110).vertical, 0);
    EXPECT_EQ(graph->CoordsToGraphDataPoint(121, 60).horizontal, 63); // 100 * 127 / 199 = 63.8
    EXPECT_EQ(graph->CoordsToGraphDataPoint(121, 60).vertical, 64);   // 50 * 127 / 99 = 64.1
    EXPECT_EQ(graph->CoordsToGraphDataPoint(20, 110).horizontal, 0) << "fractions go towards 0";
}

TEST_F(GraphPaneTest, FractionsAreLeftOutAfterTheOffsetIsAdded) {
    GraphAxisSetting const axis = {-10, 10, 1, -100, 100};
    EXPECT_EQ(GraphPane::DataToCoord(axis, 3), 30);
    EXPECT_EQ(GraphPane::CoordToData(axis, 35), 3);
    EXPECT_EQ(GraphPane::CoordToData(axis, -35), -3);
}

TEST_F(GraphPaneTest, AnAxisOfItsOwnKeepsThePixelsOfTheBox) {
    MarkedGraph *const graph = Made();
    graph->SetupHorizontalAxis({-100, 100, 50, 7000, 8000});
    graph->SetupVerticalAxis({0, 10, 5, 7000, 8000});
    int h = 0, v = 0;
    graph->GraphDataPointToCoords({-100, 0}, h, v);
    EXPECT_EQ(h, 21);
    EXPECT_EQ(v, 110);
    graph->GraphDataPointToCoords({100, 10}, h, v);
    EXPECT_EQ(h, 220);
    EXPECT_EQ(v, 11);
}

TEST_F(GraphPaneTest, AnAxisTakesItsOwnPixelsOnly) {
    // As a container does that moves what is in it.
    class Moved : public MarkedGraph {
    public:
        using MarkedGraph::MarkedGraph;
        void MoveTo(Rect box) { GlogPane::SetBox(&box); }
    };
    GraphPaneResRec record = {GraphPaneResRec::kKind, kBox};
    Moved *const graph = new Moved(glog, 5, &record);
    graph->MoveTo({10, 120, 112, 322});
    graph->SetupHorizontalAxis({0, 127, 32, 0, 0});
    int h = 0, v = 0;
    graph->GraphDataPointToCoords({0, 127}, h, v);
    EXPECT_EQ(h, 121);
    graph->MoveTo({60, 20, 162, 222});
    graph->SetupVerticalAxis({0, 127, 32, 0, 0});
    graph->GraphDataPointToCoords({0, 127}, h, v);
    EXPECT_EQ(h, 121) << "of the box before";
    EXPECT_EQ(v, 61);
}

TEST_F(GraphPaneTest, BeforeThereIsABoxAxesHaveThePixelsOfTheEmptyOne) {
    GraphPane *const graph = new GraphPane(glog, 5, static_cast<GraphPaneResRec *>(nullptr));
    int h = 0, v = 0;
    graph->GraphDataPointToCoords({127, 127}, h, v);
    EXPECT_EQ(h, 0) << "not set up, they have none";
    EXPECT_EQ(v, 0);
    graph->SetupHorizontalAxis({0, 100, 10, 0, 0});
    graph->SetupVerticalAxis({0, 100, 10, 0, 0});
    for (int value : {0, 100}) {
        graph->GraphDataPointToCoords({value, value}, h, v);
        EXPECT_EQ(h, value == 0 ? 1 : -2); // from 1 to -1, without the last
        EXPECT_EQ(v, value == 0 ? -2 : 1);
    }
}

TEST_F(GraphPaneTest, AnotherBoxMovesTheAxes) {
    MarkedGraph *const graph = Made();
    Rect box{0, 0, 52, 102};
    graph->SetBox(&box);
    int h = 0, v = 0;
    graph->GraphDataPointToCoords({127, 127}, h, v);
    EXPECT_EQ(h, 100);
    EXPECT_EQ(v, 1);
}

TEST_F(GraphPaneTest, AxesWithoutLengthGiveTheSmallestInt) {
    GraphAxisSetting const noData = {5, 5, 1, 0, 100}, noPixels = {0, 100, 1, 7, 7};
    EXPECT_EQ(GraphPane::DataToCoord(noData, 5), kLeastInt);
    EXPECT_EQ(GraphPane::DataToCoord(noData, 6), kLeastInt);
    EXPECT_EQ(GraphPane::CoordToData(noPixels, 7), kLeastInt);
    EXPECT_EQ(GraphPane::CoordToData(noPixels, 8), kLeastInt);
    EXPECT_EQ(GraphPane::DataToCoord(noPixels, 50), 7);
    EXPECT_EQ(GraphPane::CoordToData(noData, 50), 5);
    GraphAxisSetting const whole = {kLeastInt, kGreatestInt, 1, 0, 100};
    EXPECT_EQ(GraphPane::DataToCoord(whole, kGreatestInt), 100);
    EXPECT_EQ(GraphPane::CoordToData(whole, kGreatestInt), kLeastInt);
}

// Grid

TEST_F(GraphPaneTest, GridLinesStandAtMultiplesButNotAtTheEnds) {
    MarkedGraph *const graph = Made();
    graph->SetupHorizontalAxis({0, 199, 50, 0, 0}); // a pixel each
    graph->SetupVerticalAxis(kNoGrid);
    Show();
    EXPECT_EQ(GridOf(*graph), UprightLines(*graph, {71, 121, 171}));
    graph->SetupHorizontalAxis({50, 249, 50, 0, 0});
    EXPECT_EQ(GridOf(*graph), UprightLines(*graph, {71, 121, 171})) << "the least value has none";
    graph->SetupHorizontalAxis({1, 200, 50, 0, 0});
    EXPECT_EQ(GridOf(*graph), UprightLines(*graph, {70, 120, 170})) << "nor has the greatest";
}

TEST_F(GraphPaneTest, GridLinesBelowZeroStandAtMultiplesToo) {
    MarkedGraph *const graph = Made();
    graph->SetupHorizontalAxis({-120, 79, 50, 0, 0});
    graph->SetupVerticalAxis(kNoGrid);
    Show();
    EXPECT_EQ(GridOf(*graph), UprightLines(*graph, {41, 91, 141, 191})); // -100, -50, 0, 50
}

TEST_F(GraphPaneTest, LevelLinesBeginWithTheLighterColorAgain) {
    MarkedGraph *const graph = Made();
    graph->SetupHorizontalAxis({0, 199, 150, 0, 0});
    graph->SetupVerticalAxis({0, 99, 40, 0, 0});
    Show();
    EXPECT_EQ(GridOf(*graph), Traced(*graph, [] {
                  VelaDrawing::PenNormal();
                  VelaDrawing::RGBForeColor(kDialogListInactiveTextColor);
                  VelaDrawing::MoveTo(171, 11);
                  VelaDrawing::LineTo(171, 110);
                  VelaDrawing::RGBForeColor(kDialogListInactiveTextColor);
                  VelaDrawing::MoveTo(21, 70);
                  VelaDrawing::LineTo(220, 70);
                  VelaDrawing::RGBForeColor(kDialogListTextColor);
                  VelaDrawing::MoveTo(21, 30);
                  VelaDrawing::LineTo(220, 30);
              }));
}

TEST_F(GraphPaneTest, IntervalsThatAreNoneDrawNoLines) {
    MarkedGraph *const graph = Made();
    graph->SetupVerticalAxis(kNoGrid);
    Show();
    for (GraphAxisSetting const &axis :
         {GraphAxisSetting{0, 100, 0, 0, 0}, GraphAxisSetting{0, 100, -5, 0, 0},
          GraphAxisSetting{100, 0, 10, 0, 0}, GraphAxisSetting{5, 5, 1, 0, 0},
          GraphAxisSetting{kLeastInt, kGreatestInt, 1, 0, 0}}) {
        graph->SetupHorizontalAxis(axis);
        EXPECT_TRUE(Only("LineTo", GridOf(*graph)).empty());
    }
    graph->SetupHorizontalAxis({kGreatestInt - 10, kGreatestInt, 7, 0, 0});
    EXPECT_EQ(Only("LineTo", GridOf(*graph)).size(), 2u) << "up to the end of all numbers";
}

// Drawing

TEST_F(GraphPaneTest, IsDrawnFromTheGroundUp) {
    MarkedGraph *const graph = Made();
    Show();
    EXPECT_EQ(DrawingOf<GraphPane>(*graph), Traced(*graph, [&] {
                  Rect const ground = {11, 21, 111, 221};
                  VelaDrawing::PenNormal();
                  Frame3DRect(&kBox, -1, 80);
                  VelaDrawing::RGBForeColor(kDialogListBackgroundColor);
                  VelaDrawing::PaintRect(&ground);
                  graph->DrawGridLines();
                  ClearColors();
              }));
}

TEST_F(GraphPaneTest, ALineJoinsThePoints) {
    MarkedGraph *const graph = Made();
    graph->SetGraphData(new Points({{0, 0}, {127, 127}, {64, 32}}));
    Show();
    graph->marks.clear();
    EXPECT_EQ(Traced(*graph, [&] { graph->DrawData(nullptr); }), Traced(*graph, [] {
                  Rect const ground = {11, 21, 111, 221};
                  VelaDrawing::ClipRect(&ground);
                  VelaDrawing::PenNormal();
                  OSPort::Current().SetLineWidth(2.0);
                  OSPort::Current().SetForeColor(OS::RGBAColor(0.501960814, 0.521568656, 0.874509811, 1.0));
                  OSPath path;
                  path.CreateSubpath(21, 110);
                  path.AddLine(220, 11);
                  path.AddLine(121, 85);
                  OSPort::Current().StrokePath(path);
                  VelaDrawing::RGBForeColor(kDialogListTextColor);
              }));
    EXPECT_EQ(graph->marks, (std::vector<std::vector<int>>{{0, 21, 110}, {1, 220, 11}, {2, 121, 85}}));
}

TEST_F(GraphPaneTest, OnePointIsAMarkAndNoLine) {
    MarkedGraph *const graph = Made();
    graph->SetGraphData(new Points({{64, 32}}));
    Show();
    graph->marks.clear();
    EXPECT_EQ(Only("StrokePath", Traced(*graph, [&] { graph->DrawData(nullptr); })), Traced(*graph, [] {
                  OSPath path;
                  path.CreateSubpath(121, 85);
                  OSPort::Current().StrokePath(path);
              }));
    EXPECT_EQ(graph->marks.size(), 1u);
}

TEST_F(GraphPaneTest, WithoutPointsNothingIsStroked) {
    MarkedGraph *const graph = Made();
    Show();
    EXPECT_TRUE(Traced(*graph, [&] { graph->DrawData(nullptr); }).empty()) << "no data";
    graph->SetGraphData(new Points({}));
    Lines const drawn = Traced(*graph, [&] { graph->DrawData(nullptr); });
    EXPECT_TRUE(Only("StrokePath", drawn).empty());
    EXPECT_EQ(Only("ClipRect", drawn).size(), 1u) << "the clip is narrowed all the same";
}

TEST_F(GraphPaneTest, AMarkMayTakeTheDataAway) {
    MarkedGraph *const graph = Made();
    graph->SetGraphData(new Points({{0, 0}, {127, 127}}));
    graph->then = [&] { graph->SetGraphData(nullptr); };
    Show();
    EXPECT_EQ(graph->marks.size(), 1u);
}

TEST_F(GraphPaneTest, PointsMayBecomeFewerWhileTheyAreAskedFor) {
    MarkedGraph *const graph = Made();
    Points *const points = new Points({{0, 0}, {64, 64}, {127, 127}});
    graph->SetGraphData(points);
    points->onAsked = [&] { points->points.resize(1); };
    Show();
    EXPECT_EQ(graph->marks, (std::vector<std::vector<int>>{{0, 21, 110}}));
}

TEST_F(GraphPaneTest, PointsThatCannotBeShownHarmNothing) {
    for (Rect const &box : {kBox, Rect{0, 0, 0, 0}, Rect{5, 5, 6, 6}, Rect{-32768, -32768, 32767, 32767}}) {
        MarkedGraph *const graph = Made(box);
        graph->SetGraphData(new Points(
            {{kLeastInt, kGreatestInt}, {kGreatestInt, kLeastInt}, {0, 0}, {kGreatestInt, kGreatestInt}}));
        graph->SetupHorizontalAxis({3, 3, 1, 0, 0});
        graph->SetupVerticalAxis({0, 1, 1, 0, 0});
        Show();
        DrawingOf<GraphPane>(*graph);
        EXPECT_EQ(graph->marks.back()[0], 3);
    }
}

// Data

TEST_F(GraphPaneTest, OwnsItsData) {
    int deleted = 0;
    MarkedGraph *const graph = Made();
    Points *const first = new Points({}, &deleted);
    graph->SetGraphData(first);
    EXPECT_EQ(graph->GetGraphData(), first);
    graph->SetGraphData(first);
    EXPECT_EQ(deleted, 0);
    graph->SetGraphData(new Points({}, &deleted));
    EXPECT_EQ(deleted, 1);
    delete graph;
    EXPECT_EQ(deleted, 2);
}

TEST_F(GraphPaneTest, OtherDataAndAxesOnlyStore) {
    MarkedGraph *const graph = Made();
    Show();
    graph->SetGraphData(new Points({{0, 0}, {5, 5}}));
    graph->SetupHorizontalAxis({0, 10, 1, 0, 0});
    graph->SetupVerticalAxis({0, 10, 1, 0, 0});
    EXPECT_TRUE(Repainted().empty());
}

// Very many points

namespace {

class PixelLineTest : public GraphPaneTest {
protected:
    typedef std::vector<std::uint32_t> Pixels;

    // What the window shows when the action draws as graphs do.
    template <class Action> Pixels Drawn(Action const &stroke) {
        Surface &surface = *Glog::From(glog).Pixels();
        Glog::From(glog).DamageAll();
        UpdateGlog(glog);
        SetPortToGlog(glog);
        OSPort::Current().SetLineWidth(2.0);
        OSPort::Current().SetForeColor(OS::RGBAColor(0.5, 0.5, 0.9, 1.0));
        stroke();
        return Pixels(surface.Pixels(), surface.Pixels() + surface.Width() * surface.Height());
    }
    Pixels DrawnWhole(std::vector<Point> const &points) {
        return Drawn([&] {
            OSPath path;
            AddAll(path, points);
            OSPort::Current().StrokePath(path);
        });
    }
    Pixels DrawnReduced(std::vector<Point> const &points) {
        return Drawn([&] { Stroke(points); });
    }
    // Where two pieces meet, and at scales at which columns end within pixels, a pixel that is covered in
    // part may be a little denser.
    static constexpr int kUnseen = 16; // of 255
    // The largest one of any component of any pixel, of 255.
    static int Difference(Pixels const &a, Pixels const &b) {
        int largest = 0;
        for (std::size_t i = 0; i < a.size(); ++i)
            for (int shift : {0, 8, 16})
                largest = std::max(largest, std::abs(static_cast<int>(a[i] >> shift & 0xFF) -
                                                     static_cast<int>(b[i] >> shift & 0xFF)));
        return largest;
    }
    static void AddAll(OSPath &path, std::vector<Point> const &points) {
        path.CreateSubpath(points[0].h, points[0].v);
        for (std::size_t i = 1; i < points.size(); ++i)
            path.AddLine(points[i].h, points[i].v);
    }
    static void Stroke(std::vector<Point> const &points) {
        PixelLine line;
        for (Point p : points)
            line.Add(p.h, p.v);
        line.Stroke(OSPort::Current());
    }
};

} // namespace

TEST_F(PixelLineTest, LooksAsIfItWentThroughAllPoints) {
    for (double scale : {1.0, 1.5, 2.0}) {
        desktop.SetScale(scale);
        Show();
        std::mt19937 random{11};
        for (int trial = 0; trial < 20; ++trial) {
            std::vector<Point> points;
            int const perColumn = 1 + trial;
            for (int i = 0; i < 40 * perColumn; ++i)
                points.push_back({static_cast<short>(20 + random() % (trial % 2 ? 150 : 12)),
                                  static_cast<short>(10 + 5 * (i / perColumn))});
            ASSERT_LE(Difference(DrawnWhole(points), DrawnReduced(points)), scale == 1.5 ? kUnseen : 1)
                << "scale " << scale << ", trial " << trial;
        }
    }
}

TEST_F(PixelLineTest, InPiecesLooksAsItDoesWhole) {
    for (double scale : {1.0, 2.0}) {
        desktop.SetScale(scale);
        Show();
        std::vector<Point> points;
        for (int i = 0; i < 6000; ++i)
            points.push_back({static_cast<short>(100 + 80 * std::sin(i * 0.37) * std::cos(i * 0.011)),
                              static_cast<short>(10 + i / 20)});
        Pixels const whole = DrawnWhole(points), pieces = DrawnReduced(points);
        int different = 0;
        for (std::size_t i = 0; i < whole.size(); ++i)
            different += Difference({whole[i]}, {pieces[i]}) > 1;
        EXPECT_LE(Difference(whole, pieces), kUnseen) << scale;
        EXPECT_LE(different, 20) << "of " << whole.size() << " pixels, where pieces meet";
    }
}

TEST_F(PixelLineTest, KeepsSixPointsOfAColumn) {
    MarkedGraph *const graph = Made();
    std::vector<GraphDataPoint> points;
    for (int i = 0; i < 100000; ++i)
        points.push_back({i, static_cast<int>(50 + 50 * std::sin(i * 0.1))});
    graph->SetGraphData(new Points(points));
    graph->SetupHorizontalAxis({0, 99999, 0, 0, 0});
    graph->SetupVerticalAxis(kNoGrid);
    Show();
    graph->marks.clear();
    Lines const drawn = Only("StrokePath", Traced(*graph, [&] { graph->DrawData(nullptr); }));
    EXPECT_LE(PointsIn(drawn), 2000u) << "with those in which pieces overlap";
    EXPECT_GE(PointsIn(drawn), 400u);
    EXPECT_EQ(graph->marks.size(), 100000u) << "every point may have a mark";
}

TEST_F(PixelLineTest, LeavesOutPointsThatFollowEachOtherOnOnePixel) {
    Show();
    EXPECT_EQ(Traced(*Made(),
                     [] {
                         Stroke({{5, 5}, {5, 5}, {6, 5}, {6, 5}, {6, 7}});
                     }),
              Traced(*Made(), [] {
                  OSPath path;
                  AddAll(path, {{5, 5}, {6, 5}, {6, 7}});
                  OSPort::Current().StrokePath(path);
              }));
}
