// How the engine's insertion point moves.
#include "desktop/editing/TextEditor.h"
#include <algorithm>

bool TextEditor::Perform(Action const &action) {
    if (action.Edits() && IsReadOnly())
        return false;
    switch (action.kind) {
    case Action::kMove: {
        bool const vertical = action.way == Action::kUp || action.way == Action::kDown;
        if (vertical && !HasSeveralLines())
            return false;
        Move(action);
        return true;
    }
    case Action::kDelete:
        Delete(action.reach, action.way);
        return true;
    case Action::kNewLine:
    case Action::kTab:
        if (!HasSeveralLines())
            return false;
        Type(action.kind == Action::kTab ? u"\t" : u"\n");
        return true;
    case Action::kCut:
        Cut();
        return true;
    case Action::kCopy:
        Copy();
        return true;
    case Action::kPaste:
        Paste();
        return true;
    case Action::kSelectAll:
        SelectAll();
        return true;
    case Action::kUndo:
        Undo();
        return true;
    case Action::kRedo:
        Redo();
        return true;
    default:
        return false;
    }
}

void TextEditor::MoveTo(std::size_t unit, bool extends) {
    Select({extends ? selection.from : unit, unit});
    FollowCaret();
}

void TextEditor::Move(Action const &action) {
    EndComposing();
    history.Seal();
    bool const vertical = action.way == Action::kUp || action.way == Action::kDown;
    if (!vertical)
        keepsWantedH = false;
    MoveTo(vertical ? VerticalDestination(action) : Destination(action), action.extends);
}

std::size_t TextEditor::Destination(Action const &action) {
    std::size_t const here = selection.to;
    switch (action.way) {
    case Action::kStart:
    case Action::kEnd: {
        bool const toStart = action.way == Action::kStart;
        if (action.reach == Action::kDocument)
            return toStart ? 0 : document.Size();
        if (action.reach == Action::kLine)
            return toStart ? flow.LineStart(here) : flow.LineEnd(here);
        std::size_t start = 0, end = 0;
        flow.ParagraphAround(here, start, end);
        // From its start on to the one before.
        if (toStart && start == here && here > 0)
            flow.ParagraphAround(here - 1, start, end);
        return toStart ? start : end;
    }
    default:
        break;
    }
    bool const toTheRight = action.way == Action::kRight;
    bool const onward = toTheRight != flow.IsRightToLeft(here);
    if (action.reach == Action::kWord)
        return onward ? flow.WordAfter(here) : flow.WordBefore(here);
    // A selection that is given up leaves the insertion point on that side.
    if (!action.extends && !selection.Empty())
        return onward ? selection.End() : selection.Start();
    return flow.Step(here, toTheRight);
}

// Up and down keep to one place in the line, also across shorter lines.
std::size_t TextEditor::VerticalDestination(Action const &action) {
    bool const down = action.way == Action::kDown;
    TextFlow::Place const place = flow.PlaceOf(selection.to);
    if (!keepsWantedH)
        wantedH = place.h;
    keepsWantedH = true;
    long long const page = std::max(ViewHeight() - place.height, place.height);
    long long const step = action.reach == Action::kPage ? page : place.height;
    long long v = down ? place.top + place.height - 1 + step : place.top - step;
    if (action.reach == Action::kLine)
        v = down ? place.top + place.height : place.top - 1;
    if (v < 0)
        return 0;
    return v >= flow.Height() ? document.Size() : flow.UnitAt(wantedH, v);
}

std::size_t TextEditor::DeletionEnd(Action::Reach reach, Action::Way way) {
    std::size_t const here = selection.to;
    bool const backward = way == Action::kLeft;
    switch (reach) {
    case Action::kWord:
        return backward ? flow.WordBefore(here) : flow.WordAfter(here);
    case Action::kLine: {
        // At the line's edge the break goes, or what else stands beyond.
        std::size_t const edge = backward ? flow.LineStart(here) : flow.LineEnd(here);
        return edge != here ? edge : backward ? flow.Before(here) : flow.After(here);
    }
    default:
        return backward ? flow.DeletionStart(here) : flow.After(here);
    }
}
