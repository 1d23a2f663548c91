// How the engine's text changes.
#include "desktop/editing/Clipboard.h"
#include "desktop/editing/ParagraphBreaks.h"
#include "desktop/editing/TextEditor.h"
#include "desktop/resources/Utf.h"
#include <algorithm>
#include <limits>

namespace {

// Positions are told in 32 bits. A line that does not break is laid out as a whole for each key, and the
// fields that it stands in select no more than this when they select all.
std::size_t const kMostUnits = std::numeric_limits<int>::max(), kMostUnitsOfLine = 32767;
// So many changed paragraphs are laid out at once, to see whether the others have to move.
std::size_t const kMostMeasured = 4;

class TextChangedMsg : public DependentCastMessenger<OS::TextEditListener> {
public:
    void BroadcastChange(OS::TextEditListener *listener) override {
        listener->TextEditListener_TextChanged();
    }
};

} // namespace

void TextEditor::BroadcastTextChanged() {
    if (HasDependents())
        BroadcastChange(TextChangedMsg(), nullptr);
}

std::size_t TextEditor::MostUnits() const { return HasSeveralLines() ? kMostUnits : kMostUnitsOfLine; }

// As it goes into this text in the place of so many units: line breaks of every kind as line feeds, or as
// spaces where there is one line; and as much as there is room for.
std::u16string TextEditor::Fitted(std::u16string_view text, std::size_t replaced) const {
    std::u16string fitted;
    std::size_t const room = MostUnits() - std::min(document.Size() - replaced, MostUnits());
    fitted.reserve(std::min(text.size(), room));
    for (std::size_t i = 0; i < text.size() && fitted.size() <= room; ++i) {
        bool const breaks = ParagraphBreaks::IsBreak(text[i]);
        if (breaks && text[i] == '\r' && i + 1 < text.size() && text[i + 1] == '\n')
            continue;
        fitted += !breaks ? text[i] : HasSeveralLines() ? u'\n' : u' ';
    }
    fitted.resize(ParagraphBreaks::Fitting(fitted, room));
    return fitted;
}

TextFragment TextEditor::LookingAs(std::u16string_view units, EditStyle const &style) const {
    return {std::u16string(units), StyleRuns::List(1, StyleRuns::Run{0, style})};
}

// What was there before, or has been begun, may have another look than all text has now.
TextFragment TextEditor::AsItMayLook(TextFragment const &fragment) const {
    return IsStyled() ? fragment : LookingAs(fragment.units, document.Styles().At(0));
}

// Changes the text and damages what looks different now; selection and history are the caller's.
void TextEditor::ReplaceText(std::size_t start, std::size_t end, TextFragment const &fragment) {
    DamageCaret();
    long long const heightBefore = flow.Height();
    ParagraphChange const change = document.Replace(start, end - start, fragment);
    flow.TextChanged(change);
    keepsWantedH = false;
    KeepTop(change);
    if (!window)
        return;
    bool const sameCount = change.removed == change.added;
    for (std::size_t i = 0; sameCount && change.added <= kMostMeasured && i < change.added; ++i)
        flow.LayoutOf(change.first + i);
    if (change.first < topParagraph || (change.first == topParagraph && topOffset > 0)) {
        DamageAll();
        return;
    }
    ParagraphIndex const &paragraphs = document.Paragraphs();
    Rect changed = ShownBox();
    long long const top = TextTop() + paragraphs.TopOf(change.first);
    changed.top = Coordinate(top);
    if (sameCount && heightBefore == flow.Height())
        changed.bottom =
            std::min(changed.bottom, Coordinate(TextTop() + paragraphs.TopOf(change.first + change.added)));
    Damage(changed);
}

// The paragraph at the top stays where it is, as far as there still is one.
void TextEditor::KeepTop(ParagraphChange const &change) {
    if (change.first + change.removed <= topParagraph)
        topParagraph = topParagraph - change.removed + change.added;
    else if (change.first <= topParagraph)
        topParagraph = std::min(topParagraph, change.first + change.added - 1);
    topParagraph = std::min(topParagraph, document.Paragraphs().Count() - 1);
}

// Without a word to anybody.
void TextEditor::Record(std::size_t start, std::size_t end, std::u16string_view units,
                        EditHistory::Kind kind) {
    TextFragment const fragment = LookingAs(units, InsertionStyle());
    EditStep step{start, document.FragmentOf(start, end), units.size(), selection, {}};
    ReplaceText(start, end, fragment);
    selection = {start + units.size(), start + units.size()};
    step.selectionAfter = selection;
    history.Add(std::move(step), kind);
    hasTypingStyle = false;
    CaretChanged();
}

void TextEditor::ReplaceByUser(std::size_t start, std::size_t end, std::u16string_view units,
                               EditHistory::Kind kind) {
    Alive const self = alive;
    Record(start, end, units, kind);
    FollowCaret();
    if (!self.expired())
        BroadcastTextChanged();
}

void TextEditor::Type(std::u16string_view units) {
    if (IsReadOnly())
        return;
    bool const composed = composing;
    RestoreComposed();
    std::u16string const typed = Fitted(units, selection.End() - selection.Start());
    if (!typed.empty()) {
        ReplaceByUser(selection.Start(), selection.End(), typed, EditHistory::kTyping);
    } else if (composed) {
        CaretChanged();
        BroadcastTextChanged();
    }
}

// Commands

void TextEditor::Copy() const {
    if (!selection.Empty())
        Clipboard::SetText(Utf::FromUnits(document.Units().Copy(selection.Start(), selection.End())));
}

void TextEditor::Cut() {
    if (IsReadOnly() || selection.Empty())
        return;
    EndComposing();
    Copy();
    ReplaceByUser(selection.Start(), selection.End(), {}, EditHistory::kOther);
}

void TextEditor::Paste() {
    if (IsReadOnly())
        return;
    EndComposing();
    UString const text = Clipboard::Text();
    std::u16string const pasted = Fitted(Utf::View(text), selection.End() - selection.Start());
    if (!pasted.empty())
        ReplaceByUser(selection.Start(), selection.End(), pasted, EditHistory::kOther);
}

void TextEditor::Delete(Action::Reach reach, Action::Way way) {
    if (IsReadOnly())
        return;
    EndComposing();
    if (!selection.Empty()) {
        ReplaceByUser(selection.Start(), selection.End(), {}, EditHistory::kOther);
        return;
    }
    std::size_t const other = DeletionEnd(reach, way);
    if (other != selection.to)
        ReplaceByUser(std::min(other, selection.to), std::max(other, selection.to), {},
                      EditHistory::kDeleting);
}

// Carries out what the step says; the result takes that back.
EditStep TextEditor::TakeBack(EditStep const &step) {
    std::size_t const end = step.start + step.length;
    EditStep reverse{step.start, document.FragmentOf(step.start, end), step.before.units.size(),
                     step.selectionBefore, step.selectionAfter};
    ReplaceText(step.start, end, AsItMayLook(step.before));
    return reverse;
}

bool TextEditor::Undo() {
    EndComposing();
    if (IsReadOnly() || !history.CanUndo())
        return false;
    EditStep const step = history.TakeDone();
    history.AddUndone(TakeBack(step));
    ShowStep(step.selectionBefore);
    return true;
}

bool TextEditor::Redo() {
    EndComposing();
    if (IsReadOnly() || !history.CanRedo())
        return false;
    EditStep const step = history.TakeUndone();
    history.AddRedone(TakeBack(step));
    ShowStep(step.selectionAfter);
    return true;
}

// After a step of the history. Whoever is told may delete this.
void TextEditor::ShowStep(EditSelection const &selected) {
    Alive const self = alive;
    selection = selected;
    DamageAll();
    CaretChanged();
    FollowCaret();
    if (!self.expired())
        BroadcastTextChanged();
}

// Input methods

void TextEditor::Compose(UString const &text, int caret) {
    if (IsReadOnly() || (text.empty() && !composing))
        return;
    Alive const self = alive;
    if (text.empty()) {
        RestoreComposed();
        CaretChanged();
        BroadcastTextChanged();
        return;
    }
    if (!composing) {
        composedFrom = selection;
        composedStyle = InsertionStyle();
        composedOver = document.FragmentOf(selection.Start(), selection.End());
        markStart = selection.Start();
        markEnd = selection.End();
        composing = true;
    }
    std::u16string const units = Fitted(Utf::View(text), markEnd - markStart);
    ReplaceText(markStart, markEnd, AsItMayLook(LookingAs(units, composedStyle)));
    markEnd = markStart + units.size();
    std::size_t at = 0;
    for (int i = 0; i < caret && at < units.size(); ++i)
        at += (units[at] & 0xFC00) == 0xD800 && at + 1 < units.size() ? 2 : 1;
    selection = {markStart + at, markStart + at};
    CaretChanged();
    FollowCaret();
    if (!self.expired())
        BroadcastTextChanged();
}

// As if nothing had been composed.
void TextEditor::RestoreComposed() {
    if (!composing)
        return;
    composing = false;
    ReplaceText(markStart, markEnd, AsItMayLook(composedOver));
    selection = composedFrom;
}

// What has been composed so far is taken as typed. Nobody is told: the text stays as it is.
void TextEditor::EndComposing() {
    if (!composing)
        return;
    std::u16string const units = document.Units().Copy(markStart, markEnd);
    std::size_t const caret = selection.to;
    RestoreComposed();
    Record(selection.Start(), selection.End(), units, EditHistory::kTyping);
    selection = {caret, caret};
}
