// The global colour calls.
#include "desktop/drawing/Colors.h"
#include "desktop/drawing/DrawingPort.h"
#include "desktop/drawing/ThemeColors.h"
#include "desktop/observe/DrawingTrace.h"
#include "host/PortSavers.h"
#include "host/VelaDrawing.h"

namespace {

// From this gray on, what is drawn counts as disabled, and icons are faded.
constexpr int kFadingGray = 50;
constexpr int kWhitePercent = 100;

void Trace(char const *operation, OS::RGBAColor const &color) {
    if (DrawingTrace::On())
        DrawingTrace::Write(DrawingTrace::Call(operation)
                                .Number("red", color.r)
                                .Number("green", color.g)
                                .Number("blue", color.b)
                                .Number("alpha", color.a));
}

void Trace(char const *operation, RGBColor const &color) {
    if (DrawingTrace::On())
        DrawingTrace::Write(DrawingTrace::Call(operation)
                                .Integer("red", color.red)
                                .Integer("green", color.green)
                                .Integer("blue", color.blue));
}

void TraceGray(char const *operation, short percent) {
    if (DrawingTrace::On())
        DrawingTrace::Write(DrawingTrace::Call(operation).Integer("percent", percent));
}

void SetFore(OS::RGBAColor const &color) {
    if (DrawingPort *port = DrawingPort::CurrentPort())
        port->State().SetFore(color);
}

void SetBack(OS::RGBAColor const &color) {
    if (DrawingPort *port = DrawingPort::CurrentPort())
        port->State().back = color;
}

// Panes choose grays for a light window: 0 for what must be read best, 100 for the paper. On a dark one the
// scale runs the other way round, so that it stays so; a page is white in every theme.
OS::RGBAColor ThemeGray(int percent) {
    DrawingPort const *const port = DrawingPort::CurrentPort();
    bool const isDark = ThemeColors::IsDark() && !(port && port->IsPage());
    return ToRGBA(GrayOf(isDark ? kWhitePercent - percent : percent));
}

} // namespace

void SetForegroundColor(RGBColor const &color) {
    Trace("SetForegroundColor", color);
    SetFore(ToRGBA(color));
}

void SetForegroundColor(OS::RGBAColor const &color) {
    Trace("SetForegroundColor", color);
    SetFore(color);
}

void SetBackgroundColor(RGBColor const &color) {
    Trace("SetBackgroundColor", color);
    SetBack(ToRGBA(color));
}

void SetBackgroundColor(OS::RGBAColor const &color) {
    Trace("SetBackgroundColor", color);
    SetBack(color);
}

void GrayForeColor(short percent) {
    TraceGray("GrayForeColor", percent);
    if (DrawingPort *port = DrawingPort::CurrentPort()) {
        port->State().SetFore(ThemeGray(percent));
        port->State().fadedIcons = percent >= kFadingGray;
    }
}

void GrayBackColor(short percent) {
    TraceGray("GrayBackColor", percent);
    SetBack(ThemeGray(percent));
}

void GetHiliteColor(RGBColor *color) { *color = ThemeColors::kSystemHiliteColor; }

void SetUserHiliteColorAsForeColor() {
    if (DrawingTrace::On())
        DrawingTrace::Write(DrawingTrace::Call("SetUserHiliteColorAsForeColor"));
    SetFore(ToRGBA(ThemeColors::kSystemHiliteColor));
}

void GetColors(SaveColorRec *colors) {
    VelaDrawing::GetForeColor(&colors->fore);
    VelaDrawing::GetBackColor(&colors->back);
}

void SetColors(SaveColorRec const *colors) {
    if (DrawingTrace::On()) {
        auto list = [](RGBColor const &color) {
            return '[' + std::to_string(color.red) + ',' + std::to_string(color.green) + ',' +
                   std::to_string(color.blue) + ']';
        };
        DrawingTrace::Write(
            DrawingTrace::Call("SetColors").Raw("fore", list(colors->fore)).Raw("back", list(colors->back)));
    }
    SetFore(ToRGBA(colors->fore));
    SetBack(ToRGBA(colors->back));
}

void ClearColors() {
    if (DrawingTrace::On())
        DrawingTrace::Write(DrawingTrace::Call("ClearColors"));
    SetFore(GraphicsState().fore);
    SetBack(GraphicsState().back);
}
