#include "Canvas.h"
#include "desktop/AssertionHandler.h"
#include "host/OSPath.h"
#include "host/PortSavers.h"
#include <memory>
#include <stdexcept>

namespace {

std::uint32_t Gray(int level) { return 0xFF000000u | static_cast<std::uint32_t>(level) * 0x010101u; }

void PaintAll() {
    Rect const everything = {-100, -100, 100, 100};
    VelaDrawing::PaintRect(&everything);
}

} // namespace

TEST(WithPort, MakesThePortCurrentAndTheFormerOneAgain) {
    Canvas canvas(4, 4);
    DrawingPort other;
    {
        WithPort with(other);
        EXPECT_EQ(OSPort::GetCurrent(), &other);
        {
            WithPort same;
            DrawingPort::MakeCurrent(nullptr);
        }
        EXPECT_EQ(&OSPort::Current(), &other);
    }
    EXPECT_EQ(OSPort::GetCurrent(), &canvas.port);
}

TEST(WithPort, NoPortIsCurrentWhenTheFormerOneHasDied) {
    std::unique_ptr<DrawingPort> dying(new DrawingPort);
    DrawingPort::MakeCurrent(dying.get());
    {
        Canvas canvas(4, 4);
        DrawingPort::MakeCurrent(dying.get());
        WithPort with(canvas.port);
        dying.reset();
    }
    EXPECT_EQ(OSPort::GetCurrent(), nullptr);
}

TEST(OSPort, CurrentAssertsWithoutAPort) {
    DrawingPort::MakeCurrent(nullptr);
    SetAssertionHandler([](char const *text) { throw std::runtime_error(text); });
    std::string report;
    try {
        OSPort::Current();
    } catch (std::runtime_error const &error) {
        report = error.what();
    }
    SetAssertionHandler(nullptr);
    EXPECT_EQ(report.find("port != 0"), 0u) << report;
}

TEST(SavePortAndClip, PutsBackPortOriginBoundaryAndClip) {
    Canvas canvas(20, 20);
    canvas.port.SetOrigin(3, 4);
    canvas.port.SetBoundary(OSRgn(Rect{0, 0, 15, 15}));
    Rect const clip = {0, 0, 5, 5};
    VelaDrawing::ClipRect(&clip);
    DrawingPort other;
    {
        SavePortAndClip saver;
        canvas.port.SetOrigin(0, 0);
        canvas.port.SetBoundary(OSRgn(Rect{10, 10, 20, 20}));
        DrawingPort::MakeCurrent(&other);
    }
    EXPECT_EQ(OSPort::GetCurrent(), &canvas.port);
    EXPECT_EQ(canvas.port.OriginH(), 3);
    EXPECT_EQ(canvas.port.OriginV(), 4);
    EXPECT_EQ(Region::Bounds(canvas.port.Boundary()), (Rect{0, 0, 15, 15}));
    EXPECT_EQ(Region::Bounds(canvas.port.Clip()), (Rect{4, 3, 9, 8}));
}

TEST(SavePortAndClip, KeepsThePathOfAClip) {
    Canvas canvas(8, 8);
    OSPath half;
    half.CreateSubpath(0, 0);
    half.AddLine(4, 0);
    half.AddLine(4, 8);
    half.AddLine(0, 8);
    OSPort::Current().NarrowClipPath(half);
    {
        SavePortAndClip saver;
        canvas.port.SetClip(OSRgn(Rect{0, 0, 8, 8}));
    }
    PaintAll();
    EXPECT_EQ(canvas.Count(Canvas::kBlack), 32);
}

TEST(SavePortAndClip, SurvivesTheDeathOfItsPort) {
    std::unique_ptr<Canvas> canvas(new Canvas(4, 4));
    {
        SavePortAndClip clip;
        SaveTextState text;
        WithSaveGraphicsState state(canvas->port, 8);
        WithClipRect rect(OS::RectBase<OS::RectTag>(0, 0, 1, 1));
        WithDarkenDrawMode darken(50, nullptr, WithDarkenDrawMode::kMode1);
        SaveColors colors;
        canvas.reset();
    }
    EXPECT_EQ(OSPort::GetCurrent(), nullptr);
}

TEST(SaveColors, PutsBackBothColours) {
    Canvas canvas(4, 4);
    VelaDrawing::RGBForeColor({1, 2, 3});
    VelaDrawing::RGBBackColor({4, 5, 6});
    {
        SaveColors saver;
        ClearColors();
    }
    SaveColorRec colors;
    GetColors(&colors);
    EXPECT_EQ(colors.fore.blue, 3);
    EXPECT_EQ(colors.back.red, 4);
}

TEST(SaveTextState, PutsBackFontSizeAndFace) {
    Canvas canvas(4, 4);
    OS::Font::FamilyID const family = VelaDrawing::GetPortTextFont(&canvas.port);
    VelaDrawing::TextSize(17);
    VelaDrawing::TextFace(33);
    {
        SaveTextState saver;
        VelaDrawing::TextSize(9);
        VelaDrawing::TextFace(0);
    }
    EXPECT_EQ(VelaDrawing::GetPortTextSize(&canvas.port), 17);
    EXPECT_EQ(VelaDrawing::GetPortTextFace(&canvas.port), 33);
    EXPECT_EQ(VelaDrawing::GetPortTextFont(&canvas.port).GetOrderedFontID(), family.GetOrderedFontID());
}

TEST(WithClipRect, NarrowsAndPutsBack) {
    Canvas canvas(10, 10);
    {
        WithClipRect outer(OS::RectBase<OS::RectTag>(Rect{0, 0, 6, 6}));
        {
            WithClipRect inner(OS::RectBase<OS::RectTag>(4, 4, 6, 6));
            PaintAll();
        }
        EXPECT_EQ(canvas.Count(Canvas::kBlack), 4);
        PaintAll();
    }
    EXPECT_EQ(canvas.Count(Canvas::kBlack), 36);
    PaintAll();
    EXPECT_EQ(canvas.Count(Canvas::kBlack), 100);
}

TEST(WithSaveGraphicsState, PutsBackClipPenLineColoursTextAndDarkening) {
    Canvas canvas(10, 10);
    VelaDrawing::MoveTo(3, 4);
    VelaDrawing::RGBForeColor({7, 7, 7});
    {
        WithSaveGraphicsState saver(canvas.port, 8);
        VelaDrawing::MoveTo(0, 0);
        canvas.port.SetLineWidth(5);
        canvas.port.NarrowClip({0, 0, 1, 1});
        canvas.port.SetForeColor(OS::RGBAColor(1, 1, 1, 0.5));
        VelaDrawing::TextSize(40);
        canvas.port.State().darken = 10;
    }
    GraphicsState const &state = canvas.port.State();
    EXPECT_EQ(state.pen.location.h, 3);
    EXPECT_EQ(state.lineWidth, 1.0);
    EXPECT_EQ(Region::Area(canvas.port.Clip()), 100);
    EXPECT_EQ(ToRGB(state.fore).red, 7);
    EXPECT_EQ(state.textSize, 12);
    EXPECT_EQ(state.darken, 0);
}

TEST(WithDarkenDrawMode, MultipliesWhatIsBeneathWhateverTheColour) {
    Canvas canvas(3, 1);
    canvas.surface.Row(0)[1] = Gray(100);
    canvas.surface.Row(0)[2] = 0xFF804020u;
    VelaDrawing::RGBForeColor({0xFFFF, 0, 0});
    {
        WithDarkenDrawMode darken(70, nullptr, WithDarkenDrawMode::kMode1);
        PaintAll();
    }
    EXPECT_NEAR(canvas.At(0, 0) & 0xFF, 0.3 * 255, 1);
    EXPECT_NEAR(canvas.At(1, 0) & 0xFF, 0.3 * 100, 1);
    EXPECT_NEAR(canvas.At(2, 0) >> 16 & 0xFF, 0.3 * 128, 1);
    EXPECT_NEAR(canvas.At(2, 0) & 0xFF, 0.3 * 32, 1);
    EXPECT_EQ(canvas.At(2, 0) >> 24, 0xFFu);
    PaintAll();
    EXPECT_EQ(canvas.Count(Canvas::kRed), 3);
}

TEST(WithDarkenDrawMode, DarkensCurvesToo) {
    Canvas canvas(20, 20);
    {
        WithDarkenDrawMode darken(50, nullptr, WithDarkenDrawMode::kMode1);
        OSPort::Current().PaintOval({0, 0, 20, 20});
    }
    EXPECT_NEAR(canvas.At(10, 10) & 0xFF, 128, 1);
    EXPECT_EQ(canvas.At(0, 0), Canvas::kWhite);
}

TEST(WithDarkenDrawMode, ZeroLeavesDrawingAsItIsAndTooMuchIsCut) {
    Canvas canvas(2, 2);
    {
        WithDarkenDrawMode darken(900, nullptr, WithDarkenDrawMode::kMode1);
        VelaDrawing::RGBForeColor({0xFFFF, 0, 0});
        PaintAll();
    }
    EXPECT_EQ(canvas.Count(Canvas::kBlack), 4);
    WithDarkenDrawMode none(-4, nullptr, WithDarkenDrawMode::kMode1);
    PaintAll();
    EXPECT_EQ(canvas.Count(Canvas::kRed), 4);
}

TEST(WithCursorDispatchingDisabled, CountsHowManyLive) {
    int const before = WithCursorDispatchingDisabled::fgCount;
    {
        WithCursorDispatchingDisabled a, b;
        EXPECT_EQ(WithCursorDispatchingDisabled::fgCount, before + 2);
    }
    EXPECT_EQ(WithCursorDispatchingDisabled::fgCount, before);
}
