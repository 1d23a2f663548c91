// The mouse in the engine's text.
#include "desktop/drawing/DrawingPort.h"
#include "desktop/editing/TextEditor.h"
#include "desktop/windows/EventLoop.h"
#include "desktop/windows/KeyCodes.h"
#include "host/EventRecordAdapter.h"
#include "host/Services.h"
#include <algorithm>

namespace {

double const kScrollInterval = 0.05; // seconds between steps while the mouse is held beside the text

// What a press takes: insertion points, words or paragraphs.
int const kWordClicks = 2, kParagraphClicks = 3;

// From the coordinates of the current port.
Point InWindow(Point local) {
    DrawingPort const *const port = DrawingPort::CurrentPort();
    if (!port)
        return local;
    return {static_cast<short>(local.v + port->OriginV()), static_cast<short>(local.h + port->OriginH())};
}

} // namespace

// A selection that follows the mouse, from the press on.
class TextEditor::MouseSelection {
public:
    MouseSelection(TextEditor &editor_, int clicks_)
        : editor(editor_)
        , clicks(clicks_) {}

    void Begin(Point where, bool extends) {
        first = RangeAt(where);
        if (extends)
            first = {editor.selection.from, editor.selection.from};
        Follow(where);
    }

    // In whole units of what was taken first, as far as the text has not been replaced by a shorter one
    // meanwhile.
    void Follow(Point where) {
        first.from = std::min(first.from, editor.document.Size());
        first.to = std::min(first.to, editor.document.Size());
        EditSelection const here = RangeAt(where);
        if (here.Start() < first.Start())
            editor.Select({first.End(), here.Start()});
        else
            editor.Select({first.Start(), std::max(here.End(), first.End())});
    }

private:
    EditSelection RangeAt(Point where) const {
        EditSelection range;
        if (clicks >= kParagraphClicks) {
            editor.flow.ParagraphAround(editor.CharacterAtPoint(where), range.from, range.to);
        } else if (clicks == kWordClicks) {
            editor.flow.WordAround(editor.CharacterAtPoint(where), range.from, range.to);
        } else {
            range.from = range.to = editor.UnitAtPoint(where);
        }
        return range;
    }

    TextEditor &editor;
    int clicks;
    EditSelection first;
};

// Others may do what they like while the mouse is being followed.
bool TextEditor::Click(EventRecordAdapter const &event) {
    Alive const self = alive;
    EndComposing();
    history.Seal();
    keepsWantedH = false;
    EventLoop *const loop = EventLoop::Open();
    MouseSelection mouse(*this, loop ? loop->LastPressClicks() : 1);
    Point where = InWindow(event.where);
    mouse.Begin(where, (event.modifiers & Modifiers::kShift) != 0);
    if (!loop || !loop->IsTracking())
        return true;
    for (;;) {
        bool const beside = autoScrolls && !Contains(where);
        double when = 0;
        Point place = event.where;
        MouseTracking::Result result = MouseTracking::Result(0);
        bool const down = beside ? MouseIsDraggingWithTimeout(kScrollInterval, &place, &when, &result)
                                 : MouseIsDragging(&place, &when);
        if (self.expired() || !down)
            return true;
        if (result != MouseTracking::kTimedOut)
            where = InWindow(place);
        mouse.Follow(where);
        FollowCaret();
        if (self.expired())
            return true;
    }
}
