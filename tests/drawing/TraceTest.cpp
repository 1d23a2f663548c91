#include "Canvas.h"
#include "desktop/observe/DrawingTrace.h"
#include "host/Icons.h"
#include "host/OSPath.h"
#include "host/TarnImage.h"

namespace {

// The lines that come while it lives.
class Recording {
public:
    Recording() {
        DrawingTrace::SetSink([this](std::string const &line) { lines.push_back(line); });
    }
    ~Recording() { DrawingTrace::SetSink(nullptr); }
    Rows lines;
};

Rect const kRect = {1, 2, 3, 4};

} // namespace

TEST(DrawingTrace, EachCallIsOneLineWithItsArguments) {
    Canvas canvas(20, 20);
    Recording recording;
    VelaDrawing::MoveTo(3, 4);
    VelaDrawing::Move(-1, 2);
    VelaDrawing::LineTo(9, 8);
    VelaDrawing::FrameRect(&kRect);
    VelaDrawing::PaintRect(&kRect);
    VelaDrawing::EraseRect(&kRect);
    VelaDrawing::PenNormal();
    VelaDrawing::InvalRect(&kRect);
    EXPECT_EQ(recording.lines,
              (Rows{R"({"op":"MoveTo","h":3,"v":4})", R"({"op":"Move","dh":-1,"dv":2})",
                    R"({"op":"LineTo","h":9,"v":8})", R"({"op":"FrameRect","rect":[1,2,3,4]})",
                    R"({"op":"PaintRect","rect":[1,2,3,4]})", R"({"op":"EraseRect","rect":[1,2,3,4]})",
                    R"({"op":"PenNormal"})", R"({"op":"InvalRect","rect":[1,2,3,4]})"}));
}

TEST(DrawingTrace, ClipsAndColours) {
    Canvas canvas(20, 20);
    Recording recording;
    VelaDrawing::ClipRect(&kRect);
    VelaDrawing::NarrowClip(nullptr);
    TempRgn region;
    VelaDrawing::RectRgn(region, &kRect);
    VelaDrawing::SetClip(region);
    VelaDrawing::NarrowClipToRect(&kRect);
    VelaDrawing::RGBForeColor({1, 2, 65535});
    SetForegroundColor(OS::RGBAColor(0.5, 0.25, 0, 1));
    GrayForeColor(50);
    ClearColors();
    VelaDrawing::TextSize(9);
    VelaDrawing::TextFace(1);
    EXPECT_EQ(recording.lines,
              (Rows{R"({"op":"ClipRect","rect":[1,2,3,4]})", R"({"op":"NarrowClip","bounds":null})",
                    R"({"op":"SetClip","bounds":[1,2,3,4],"area":4})",
                    R"({"op":"NarrowClipToRect","rect":[1,2,3,4]})",
                    R"({"op":"RGBForeColor","red":1,"green":2,"blue":65535})",
                    R"({"op":"SetForegroundColor","red":0.5,"green":0.25,"blue":0,"alpha":1})",
                    R"({"op":"GrayForeColor","percent":50})", R"({"op":"ClearColors"})",
                    R"({"op":"TextSize","size":9})", R"({"op":"TextFace","face":1})"}));
}

TEST(DrawingTrace, IconsPicturesAndDecorations) {
    Canvas canvas(20, 20);
    Recording recording;
    Draw1Icon(1002, 4, 10, 21);
    Draw1Icon(1002, 4, kRect);
    TileIcon(&kRect, 1000, 40, 16, 14);
    TileIconInRectWithEndCaps(OS::RectBase<OS::RectTag>(kRect), 1004, 3);
    PngImage(7).Draw(kRect);
    Frame3DRect(&kRect, -1, 80);
    DrawShadowLine({1, 2}, {1, 9});
    FrameTextWell(kRect);
    EXPECT_EQ(
        recording.lines,
        (Rows{R"({"op":"Draw1Icon","family":1002,"icon":4,"h":10,"v":21})",
              R"({"op":"Draw1Icon","family":1002,"icon":4,"rect":[1,2,3,4]})",
              R"({"op":"TileIcon","family":1000,"icon":40,"rect":[1,2,3,4],"tileWidth":16,"tileHeight":14})",
              R"({"op":"TileIconInRectWithEndCaps","family":1004,"icon":3,"rect":[1,2,3,4]})",
              R"({"op":"PngImage::Draw","picture":7,"rect":[1,2,3,4]})",
              R"({"op":"Frame3DRect","rect":[1,2,3,4],"depth":-1,"gray":80})",
              R"({"op":"DrawShadowLine","from":[1,2],"to":[1,9]})",
              R"({"op":"FrameTextWell","rect":[1,2,3,4]})"}));
}

TEST(DrawingTrace, ThePortsOwnCalls) {
    Canvas canvas(20, 20);
    Recording recording;
    OSPort &port = OSPort::Current();
    port.FrameRect({1, 2, 3.5, 4});
    port.PaintRoundRect({1, 2, 3, 4}, {8, 8});
    port.SetForeColor(OS::RGBAColor(0, 0, 0, 0.5));
    port.SetLineWidth(0.5);
    OSPath path;
    path.CreateSubpath(1, 2);
    path.AddLine(3, 4.5);
    path.CloseSubpath();
    path.CreateSubpath(5, 6);
    port.StrokePath(path);
    port.ScrollRect({0, 0, 5, 5}, {1, -2});
    EXPECT_EQ(
        recording.lines,
        (Rows{R"({"op":"FrameRect","h":1,"v":2,"width":3.5,"height":4})",
              R"({"op":"PaintRoundRect","h":1,"v":2,"width":3,"height":4,"cornerWidth":8,"cornerHeight":8})",
              R"({"op":"SetForeColor","red":0,"green":0,"blue":0,"alpha":0.5})",
              R"({"op":"SetLineWidth","width":0.5})",
              R"({"op":"StrokePath","path":[[[1,2],[3,4.5],"close"],[[5,6]]]})",
              R"({"op":"ScrollRect","h":0,"v":0,"width":5,"height":5,"dh":1,"dv":-2})"}));
}

TEST(DrawingTrace, WhatSaversPutBackIsNotACall) {
    Canvas canvas(20, 20);
    Recording recording;
    {
        SaveColors colors;
        SaveTextState text;
        SavePortAndClip clip;
        WithPort port;
        WithSaveGraphicsState state(canvas.port, 8);
    }
    EXPECT_EQ(recording.lines, Rows());
    {
        WithClipRect clip{OS::RectBase<OS::RectTag>(kRect)};
        WithDarkenDrawMode darken(70, nullptr, WithDarkenDrawMode::kMode1);
    }
    EXPECT_EQ(recording.lines, (Rows{R"({"op":"WithClipRect","rect":[1,2,3,4]})",
                                     R"({"op":"WithDarkenDrawMode","strength":70,"mode":1})"}));
}

TEST(DrawingTrace, EndsWithAnEmptySink) {
    Canvas canvas(20, 20);
    {
        Recording recording;
        EXPECT_TRUE(DrawingTrace::On());
    }
    EXPECT_FALSE(DrawingTrace::On());
    VelaDrawing::PaintRect(&kRect);
}
