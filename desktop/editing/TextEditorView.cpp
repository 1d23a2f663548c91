// Where the engine's text lies in its window, and which part of it shows.
#include "desktop/editing/TextEditor.h"
#include "desktop/editing/TextFocus.h"
#include "desktop/panes/Glog.h"
#include <algorithm>
#include <cmath>
#include <limits>

namespace {

int const kSidePadding = 2; // pixels between the bounds' sides and the text
int const kCaretWidth = 1;
// Scrolling to a place lays out what shows there, which may move the place.
int const kMostRounds = 4;
std::size_t const kNeighbours = 16; // paragraphs beyond those that show are kept laid out

class AutoScrolledMsg : public DependentCastMessenger<OS::TextEditListener> {
public:
    void BroadcastChange(OS::TextEditListener *listener) override {
        listener->TextEditListener_AutoScrolled();
    }
};

double Finite(double value) {
    constexpr double kFarthest = 32767;
    return std::isfinite(value) ? std::clamp(value, -kFarthest, kFarthest) : 0;
}

bool IsWithin(Point p, Rect const &r) {
    return p.h >= r.left && p.h < r.right && p.v >= r.top && p.v < r.bottom;
}

int Saturated(long long value) {
    return static_cast<int>(std::min<long long>(value, std::numeric_limits<int>::max()));
}

} // namespace

short TextEditor::Coordinate(long long value) {
    typedef std::numeric_limits<short> Limits;
    return static_cast<short>(std::clamp<long long>(value, Limits::min(), Limits::max()));
}

// Text stands on whole pixels; the bounds may lie between them.
Rect TextEditor::BoundsBox() const {
    double const x = std::min(bounds.origin.x, bounds.origin.x + bounds.size.width);
    double const y = std::min(bounds.origin.y, bounds.origin.y + bounds.size.height);
    auto const edge = [](double place) { return Coordinate(std::llround(place)); };
    return {edge(y), edge(x), edge(y + std::abs(bounds.size.height)), edge(x + std::abs(bounds.size.width))};
}

int TextEditor::TextLeft() const { return BoundsBox().left + kSidePadding - scrollLeft; }

long long TextEditor::TextTop() const { return BoundsBox().top + baselineOffset - ScrollTop(); }

int TextEditor::ViewHeight() const {
    Rect const box = BoundsBox();
    return std::max(box.bottom - box.top - baselineOffset, 1);
}

int TextEditor::RoomWidth() const {
    Rect const box = BoundsBox();
    return std::max(box.right - box.left - 2 * kSidePadding - kCaretWidth, 1);
}

void TextEditor::SetBounds(OS::RectBase<OS::RectTag> const &other) {
    bounds.origin = OS::Point(Finite(other.origin.x), Finite(other.origin.y));
    bounds.size = OS::Size(Finite(other.size.width), Finite(other.size.height));
    LayOut();
    if (active)
        TextFocus::CaretMoved(*this);
}

void TextEditor::LayOut() {
    flow.SetRoom(RoomWidth(), alignment);
    topOffset = std::min(topOffset, Saturated(document.Paragraphs().At(topParagraph).height));
    KeepTextInSight();
}

// A line that has become shorter, or has got more room, does not leave its end for nothing.
void TextEditor::KeepTextInSight() {
    if (scrollLeft == 0)
        return;
    int const left = scrollLeft;
    scrollLeft = 0; // in case that there is no memory to look at the line
    ScrollAcross(left);
}

void TextEditor::ScrollAcross(int left) {
    ParagraphLayout::Range const extent = flow.ExtentOf(0);
    scrollLeft = std::clamp(left, extent.first, std::max(extent.second - RoomWidth(), 0));
}

// Where one goes back in the text, some of what stands before shows too.
void TextEditor::ScrollAcrossTo(int h) {
    int const room = RoomWidth(), before = room / 4;
    bool const rightToLeft = flow.IsRightToLeft(0);
    if (h < scrollLeft)
        ScrollAcross(rightToLeft ? h : h - before);
    else if (h > scrollLeft + room)
        ScrollAcross(rightToLeft ? h - room + before : h - room);
    else
        ScrollAcross(scrollLeft);
}

// Scrolling

long long TextEditor::ScrollTop() const { return document.Paragraphs().TopOf(topParagraph) + topOffset; }

void TextEditor::ScrollTo(long long top) {
    long long const lowest = std::max<long long>(flow.Height() - ViewHeight(), 0);
    long long const place = HasSeveralLines() ? std::clamp<long long>(top, 0, lowest) : 0;
    ParagraphIndex const &paragraphs = document.Paragraphs();
    std::size_t const paragraph = paragraphs.AtHeight(place);
    int const offset = static_cast<int>(place - paragraphs.TopOf(paragraph));
    if (paragraph == topParagraph && offset == topOffset)
        return;
    topParagraph = paragraph;
    topOffset = offset;
    DamageAll();
}

bool TextEditor::ScrollIntoView(std::size_t unit) {
    std::size_t const paragraphBefore = topParagraph;
    int const offsetBefore = topOffset, leftBefore = scrollLeft;
    TextFlow::Place place = flow.PlaceOf(unit);
    for (int round = 0; HasSeveralLines() && round < kMostRounds; ++round) {
        place = flow.PlaceOf(unit);
        long long const top = ScrollTop(), bottom = place.top + place.height;
        if (place.top < top)
            ScrollTo(place.top);
        else if (bottom > top + ViewHeight())
            ScrollTo(std::min(bottom - ViewHeight(), place.top));
        else
            break;
        LayOutVisible();
    }
    if (!HasSeveralLines())
        ScrollAcrossTo(place.h);
    if (leftBefore != scrollLeft)
        DamageAll();
    return paragraphBefore != topParagraph || offsetBefore != topOffset || leftBefore != scrollLeft;
}

// Whoever hears of it may delete this.
void TextEditor::FollowCaret() {
    bool scrolled = false;
    Show([&] {
        scrolled = autoScrolls && window && ScrollIntoView(selection.to);
        if (scrolled)
            TextFocus::CaretMoved(*this);
    });
    if (scrolled && HasDependents())
        BroadcastChange(AutoScrolledMsg(), nullptr);
}

void TextEditor::LayOutVisible() {
    ParagraphIndex const &paragraphs = document.Paragraphs();
    std::size_t last = topParagraph;
    topOffset = std::min(topOffset, std::max(flow.LayoutOf(topParagraph).Height() - 1, 0));
    long long const top = ScrollTop();
    while (last + 1 < paragraphs.Count() && paragraphs.TopOf(last + 1) < top + ViewHeight()) {
        ++last;
        flow.LayoutOf(last);
    }
    flow.ForgetAllBut(topParagraph - std::min(topParagraph, kNeighbours), last + kNeighbours);
}

std::size_t TextEditor::LastVisible() const {
    return document.Paragraphs().AtHeight(ScrollTop() + ViewHeight() - 1);
}

int TextEditor::GetScrollDelta() const { return flow.LineHeight(); }

int TextEditor::GetCurrentScrolledOffset() const { return Saturated(ScrollTop()); }

int TextEditor::GetTextHeight() const { return Saturated(flow.Height()); }

void TextEditor::SetVScrollPos(int pixels, int) {
    ScrollTo(pixels);
    LayOutVisible();
    ScrollTo(ScrollTop()); // what shows may be less high than was thought
    if (active)
        TextFocus::CaretMoved(*this);
}

void TextEditor::VScrollToCharacterPosition(unsigned int unit) {
    if (ScrollIntoView(std::min<std::size_t>(unit, document.Size())) && active)
        TextFocus::CaretMoved(*this);
}

bool TextEditor::Contains(Point p) const { return IsWithin(p, BoundsBox()); }

// Places

std::size_t TextEditor::UnitAtPoint(Point p) { return flow.UnitAt(p.h - TextLeft(), p.v - TextTop()); }

std::size_t TextEditor::CharacterAtPoint(Point p) {
    return flow.CharacterAt(p.h - TextLeft(), p.v - TextTop());
}

unsigned int TextEditor::GetCharacterIndexForPoint(OS::Point const &p) const {
    Rect const box = BoundsBox();
    int const h = static_cast<int>(std::floor(Finite(p.x))) + box.left - TextLeft();
    long long const v = static_cast<long long>(std::floor(Finite(p.y))) + box.top - TextTop();
    return static_cast<unsigned int>(flow.CharacterAt(h, v));
}

Rect TextEditor::CaretBox() const {
    TextFlow::Place const place = flow.PlaceOf(selection.to);
    long long const top = TextTop() + place.top;
    int const left = TextLeft() + place.h;
    return {Coordinate(top), Coordinate(left), Coordinate(top + place.height),
            Coordinate(left + kCaretWidth)};
}

// Damage

// A text that stands higher than its bounds may show above them, and a line's tails below them by as much:
// then its place is a frame's, and bounds are what the frame leaves.
Rect TextEditor::ShownBox() const {
    Rect box = BoundsBox();
    int const higher = -std::min(baselineOffset, 0);
    box.top = Coordinate(box.top - higher);
    if (!HasSeveralLines())
        box.bottom = Coordinate(box.bottom + higher);
    return box;
}

void TextEditor::Damage(Rect const &r) const {
    Glog *const glog = dynamic_cast<Glog *>(window);
    Rect const box = ShownBox();
    Rect const shown{std::max(r.top, box.top), std::max(r.left, box.left), std::min(r.bottom, box.bottom),
                     std::min(r.right, box.right)};
    if (glog && shown.top < shown.bottom && shown.left < shown.right)
        glog->DamageWindowRect(shown);
}

void TextEditor::DamageAll() const { Damage(ShownBox()); }

// The lines that the units lie in, as far as they show.
void TextEditor::DamageUnits(std::size_t start, std::size_t end) {
    if (!window || start >= end)
        return;
    ParagraphIndex const &paragraphs = document.Paragraphs();
    std::size_t const first = paragraphs.AtUnit(start), last = paragraphs.AtUnit(end);
    Rect changed = ShownBox();
    if (last < topParagraph || first > LastVisible())
        return;
    if (first >= topParagraph)
        changed.top = Coordinate(TextTop() + flow.PlaceOf(start).top);
    if (last <= LastVisible()) {
        TextFlow::Place const place = flow.PlaceOf(end);
        changed.bottom = std::min(changed.bottom, Coordinate(TextTop() + place.top + place.height));
    }
    Damage(changed);
}

// The insertion point

bool TextEditor::ShowsCaret() const { return active && selection.Empty() && !IsReadOnly(); }

void TextEditor::DamageCaret() {
    if (window && ShowsCaret() && CaretMayShow())
        Damage(CaretBox());
}

// Without laying anything out.
bool TextEditor::CaretMayShow() const {
    std::size_t const paragraph = document.Paragraphs().AtUnit(selection.to);
    return paragraph >= topParagraph && paragraph <= LastVisible();
}

void TextEditor::CaretChanged() {
    caretLit = true;
    if (!active)
        return;
    Show([this] {
        if (!IsReadOnly())
            blinking.Restart();
        DamageCaret();
        TextFocus::CaretMoved(*this);
    });
}

// While the last change of the insertion point has not been drawn, the pane is hidden, and nothing that lies
// there instead has to be drawn for it.
void TextEditor::Blink() {
    if (!drawnSinceBlink)
        return;
    caretLit = !caretLit;
    drawnSinceBlink = !window || !ShowsCaret() || !CaretMayShow();
    DamageCaret();
}
