// How the engine's text is drawn.
#include "desktop/drawing/Colors.h"
#include "desktop/drawing/DrawingPort.h"
#include "desktop/drawing/PixelScope.h"
#include "desktop/editing/TextEditor.h"
#include "desktop/observe/DrawingTrace.h"
#include "desktop/resources/Utf.h"
#include <algorithm>

namespace {

// What is selected in a text that is not active, between the ground and the colour of selections.
double const kInactiveShare = 0.45;
int const kMarkThickness = 1;
std::size_t const kMostTraced = 200; // units

OS::RGBAColor Between(OS::RGBAColor const &a, OS::RGBAColor const &b, double share) {
    auto const mix = [=](double from, double to) { return from + (to - from) * share; };
    return {mix(a.r, b.r), mix(a.g, b.g), mix(a.b, b.b), mix(a.a, b.a)};
}

Rect ToLocal(DrawingPort const &port, Rect const &window) { return port.WindowToLocal(window); }

} // namespace

void TextEditor::Draw(OSPort &drawnOn) {
    // The one port there is.
    DrawingPort &port = static_cast<DrawingPort &>(drawnOn);
    if (DrawingTrace::On())
        Trace(port);
    LayOutVisible();
    ScrollTo(ScrollTop()); // what shows may be less high than was thought
    Rect const shown = ShownBox();
    if (shown.right <= shown.left || shown.bottom <= shown.top)
        return;
    drawnSinceBlink = true;
    struct Kept { // clip and colour are the caller's
        explicit Kept(DrawingPort &port_)
            : port(port_)
            , clip(port_.GetClipState())
            , fore(port_.State().fore) {}
        ~Kept() {
            port.SetClipState(clip);
            port.State().fore = fore;
        }
        DrawingPort &port;
        ClipState const clip;
        OS::RGBAColor const fore;
    } const kept(port);
    port.NarrowClipTo(shown);
    DrawGround(port);
    DrawSelection(port);
    port.State().fore = textColor;
    DrawText(port);
    DrawMark(port);
    DrawCaret(port);
}

void TextEditor::Trace(DrawingPort const &port) const {
    std::size_t const end = std::min(document.Size(), kMostTraced);
    DrawingTrace::Write(DrawingTrace::Call("DrawTextEdit")
                            .Box("rect", ToLocal(port, BoundsBox()))
                            .Text("text", Utf::FromUnits(document.Units().Copy(0, end)))
                            .Integer("selectionStart", static_cast<long long>(selection.Start()))
                            .Integer("selectionEnd", static_cast<long long>(selection.End()))
                            .Flag("active", active)
                            .Integer("scrolled", ScrollTop()));
}

void TextEditor::DrawGround(DrawingPort &port) const {
    PixelScope pixels(port);
    if (pixels.CanDraw() && (active || drawsGroundWhenInactive))
        pixels.Fill(pixels.ToDevice(ToLocal(port, BoundsBox())), groundColor);
}

// Letters may stand higher than the bounds; what lies behind and between them ends there.
void TextEditor::FillWithin(PixelScope &pixels, DrawingPort const &port, Rect const &window,
                            OS::RGBAColor const &color) const {
    Rect const box = BoundsBox();
    Rect const part{std::max(window.top, box.top), window.left, std::min(window.bottom, box.bottom),
                    window.right};
    if (part.top < part.bottom)
        pixels.Fill(pixels.ToDevice(ToLocal(port, part)), color);
}

// In each line what the units cover there; as bars below the text instead.
void TextEditor::FillRanges(DrawingPort &port, std::size_t start, std::size_t end, OS::RGBAColor const &color,
                            RangeShape shape) {
    ParagraphIndex const &paragraphs = document.Paragraphs();
    std::size_t const first = std::max(paragraphs.AtUnit(start), topParagraph);
    std::size_t const last = std::min(paragraphs.AtUnit(end), LastVisible());
    PixelScope pixels(port);
    for (std::size_t p = first; pixels.CanDraw() && p <= last; ++p) {
        ParagraphLayout const &layout = flow.LayoutOf(p);
        std::size_t const begin = paragraphs.StartOf(p);
        std::size_t const from = std::max(start, begin) - begin, to = end - begin;
        long long const top = TextTop() + paragraphs.TopOf(p);
        for (std::size_t i = 0; i < layout.Lines().size(); ++i) {
            ParagraphLayout::Line const &line = layout.Lines()[i];
            if (line.start >= to && !(line.start == to && from == to))
                break;
            long long const lineTop = shape == kUnderline ? top + line.baseline + 1 : top + line.top;
            long long const lineBottom =
                shape == kUnderline ? lineTop + kMarkThickness : top + line.top + line.height;
            for (ParagraphLayout::Range const &range :
                 layout.RangesOf(i, std::max(from, line.start), std::min(to, line.end))) {
                FillWithin(pixels, port,
                           {Coordinate(lineTop), Coordinate(TextLeft() + range.first), Coordinate(lineBottom),
                            Coordinate(TextLeft() + range.second)},
                           color);
            }
        }
    }
}

void TextEditor::DrawSelection(DrawingPort &port) {
    // A field of one line that the user has left looks like any other.
    if (selection.Empty() || (!active && !HasSeveralLines()))
        return;
    OS::RGBAColor const color =
        active ? selectionColor : Between(groundColor, selectionColor, kInactiveShare);
    FillRanges(port, selection.Start(), selection.End(), color, kWholeLine);
}

void TextEditor::DrawText(DrawingPort &port) {
    Rect const shown = ToLocal(port, ShownBox());
    CairoScope const scope(port, shown);
    if (!scope.Context())
        return;
    ParagraphIndex const &paragraphs = document.Paragraphs();
    std::size_t const last = LastVisible();
    int const left = TextLeft() - port.OriginH();
    for (std::size_t p = topParagraph; p <= last; ++p) {
        ParagraphLayout const &layout = flow.LayoutOf(p);
        int const top = Coordinate(TextTop() + paragraphs.TopOf(p)) - port.OriginV();
        for (std::size_t i = 0; i < layout.Lines().size(); ++i) {
            ParagraphLayout::Line const &line = layout.Lines()[i];
            if (port.Visible({Coordinate(top + line.inkTop), shown.left, Coordinate(top + line.inkBottom),
                              shown.right}))
                layout.DrawLine(scope.Context(), i, left, top);
        }
    }
}

void TextEditor::DrawMark(DrawingPort &port) {
    if (composing)
        FillRanges(port, markStart, markEnd, textColor, kUnderline);
}

void TextEditor::DrawCaret(DrawingPort &port) const {
    if (!caretLit || !ShowsCaret() || !CaretMayShow())
        return;
    PixelScope pixels(port);
    if (pixels.CanDraw())
        FillWithin(pixels, port, CaretBox(), textColor);
}
