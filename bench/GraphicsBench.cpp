// A point that is dragged through its cube, a graph of very many points, and a progress bar.
#include "bench/BarePicture.h"
#include "desktop/SimulatedDesktop.h"
#include "desktop/panes/Glog.h"
#include "graphics/GraphPane.h"
#include "graphics/ProgressBarPane.h"
#include "graphics/ThreeDPane.h"
#include "host/glogRec.h"
#include <benchmark/benchmark.h>
#include <cmath>
#include <cstddef>
#include <vector>

namespace {

double const kFullCircle = 6.283185307179586; // radians
int const kScale = 2;
int const kManyPoints = 100000, kFewPoints = 1000;
long long const kGreatest = 1000000000; // of the progress bar: a step is far less than a pixel

// A window at twice the scale.
class Page {
public:
    Page()
        : desktop(DesktopOptions().Scale(kScale))
        , glog(desktop.NewGlog(GlogOptions().Size(640, 400))) {}

    void Show() {
        desktop.FinishGlog(glog);
        ShowGlog(glog, kShowGlog);
        UpdateGlog(glog);
        desktop.TakePresented(glog);
        desktop.Play("wait 1"); // for the activation
    }
    // Draws what is damaged; whether anything was.
    bool Shown() {
        UpdateGlog(glog);
        return !desktop.TakePresented(glog).empty();
    }

    SimulatedDesktop desktop;
    glogRec *glog;
};

// What a step of a drag comes to: another coordinate, and the picture of it.
void DragStep(benchmark::State &state) {
    short const kNumber = 1;
    Page page;
    Glog::From(page.glog).DescribeItem(kNumber, {0, 0, 238, 224});
    ThreeDPane *const cube =
        ThreeDPane::NewThreeDPane(page.glog, kNumber, -20.0, {1.2, 1.8, -5.5}, 0.16, {7, 7, 7, 7});
    page.Show();
    double along = -1.0;
    for (auto _ : state) {
        along = along >= 1.0 ? -1.0 : along + 0.125;
        cube->SetOneCoordinate(kAxisX, along);
        if (!page.Shown())
            state.SkipWithError("nothing has been shown");
    }
}
BENCHMARK(DragStep)->Name("Panner/drag step");

// A room of three walls, which is a picture; on it a shadow, three lines through the point and a ball.
void DragStepBare(benchmark::State &state) {
    double const width = 224.0 * kScale, height = 238.0 * kScale, radius = 9.0 * kScale;
    BarePicture room(static_cast<int>(width), static_cast<int>(height));
    BarePicture picture(static_cast<int>(width), static_cast<int>(height));
    cairo_t *const context = cairo_create(picture.Pixels().surface.CairoSurface());
    cairo_set_line_width(context, kScale);
    double along = -1.0;
    for (auto _ : state) {
        along = along >= 1.0 ? -1.0 : along + 0.125;
        double const h = width * (along + 2.0) / 4.0, v = height / 2;
        cairo_set_source_surface(context, room.Pixels().surface.CairoSurface(), 0, 0);
        cairo_paint(context);
        cairo_set_source_rgba(context, 0, 0, 0, 0.5);
        cairo_arc(context, h, height - 2 * radius, radius, 0, kFullCircle);
        cairo_fill(context);
        for (int axis = -1; axis <= 1; ++axis) {
            cairo_move_to(context, h - 40.0, v + 20.0 * axis);
            cairo_line_to(context, h + 40.0, v - 20.0 * axis);
            cairo_stroke(context);
        }
        cairo_pattern_t *const ball = cairo_pattern_create_radial(h - 3.0, v - 3.0, 0, h, v, radius);
        cairo_pattern_add_color_stop_rgb(ball, 0, 1.0, 0.8, 0.5);
        cairo_pattern_add_color_stop_rgb(ball, 1, 0.8, 0.4, 0);
        cairo_set_source(context, ball);
        cairo_arc(context, h, v, radius, 0, kFullCircle);
        cairo_fill(context);
        cairo_pattern_destroy(ball);
        picture.DrawTexts();
        picture.Show();
    }
    cairo_destroy(context);
    if (picture.IsBlank())
        state.SkipWithError("nothing has been drawn");
}
BENCHMARK(DragStepBare)->Name("Panner/drag step bare");

// Calculated beforehand: what the data costs its program does not count.
class Waves : public GraphData {
public:
    explicit Waves(int count) {
        for (int i = 0; i < count; ++i)
            points.push_back({i, static_cast<int>(1000.0 * std::sin(i * 0.37) * std::cos(i * 0.0011))});
    }
    int CountPoints() override { return static_cast<int>(points.size()); }
    GraphDataPoint GetPoint(int index) override { return points[static_cast<std::size_t>(index)]; }

private:
    std::vector<GraphDataPoint> points;
};

void RepaintGraph(benchmark::State &state) {
    int const points = static_cast<int>(state.range(0));
    Page page;
    GraphPaneResRec record = {GraphPaneResRec::kKind, {0, 0, 300, 600}};
    GraphPane *const graph = new GraphPane(page.glog, 1, &record);
    graph->SetGraphData(new Waves(points));
    graph->SetupHorizontalAxis({0, points, points / 8, 0, 0});
    graph->SetupVerticalAxis({-1100, 1100, 500, 0, 0});
    page.Show();
    for (auto _ : state) {
        graph->Inval();
        if (!page.Shown())
            state.SkipWithError("nothing has been shown");
    }
}
BENCHMARK(RepaintGraph)->Name("Graph/repaint")->Arg(kFewPoints)->Arg(kManyPoints);

// The same line through the same points, stroked by Cairo as it is; of the many points that takes seconds.
void RepaintGraphBare(benchmark::State &state) {
    int const points = static_cast<int>(state.range(0));
    int const width = 600 * kScale, height = 300 * kScale;
    double const kUnits = 2200.0; // from the least to the greatest value
    Waves waves(points);
    BarePicture picture(width, height);
    cairo_t *const context = cairo_create(picture.Pixels().surface.CairoSurface());
    cairo_set_line_width(context, 1.5 * kScale);
    for (auto _ : state) {
        picture.Clear();
        for (int i = 0; i < points; ++i) {
            GraphDataPoint const point = waves.GetPoint(i);
            cairo_line_to(context, 1.0 * point.horizontal / points * width,
                          height / 2 - point.vertical / kUnits * height);
        }
        cairo_stroke(context);
        picture.DrawTexts();
        picture.Show();
    }
    cairo_destroy(context);
    if (picture.IsBlank())
        state.SkipWithError("nothing has been drawn");
}
BENCHMARK(RepaintGraphBare)->Name("Graph/repaint bare")->Arg(kFewPoints);

void UnseenProgress(benchmark::State &state) {
    Page page;
    ProgressBarPane *const bar = new ProgressBarPane(page.glog, 1);
    Rect box = {10, 10, 22, 610};
    bar->SetBox(&box);
    bar->SetProgress(kGreatest / 2, kGreatest);
    page.Show();
    long long step = 0;
    for (auto _ : state) {
        step = (step + 1) % 1000;
        bar->SetProgress(kGreatest / 2 + step, kGreatest);
        if (page.Shown())
            state.SkipWithError("something has been redrawn");
    }
}
BENCHMARK(UnseenProgress)->Name("Progress/unseen step");

} // namespace
