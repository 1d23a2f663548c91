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

// Changes the text, which all memory is there for, and damages what looks different now; selection and
// history are the caller's.
void TextEditor::ReplaceText(TextDocument::Replacement replacement) {
    Show([this] { DamageCaret(); });
    long long const heightBefore = flow.Height();
    ParagraphChange const change = document.Replace(std::move(replacement));
    flow.TextChanged(change);
    keepsWantedH = false;
    KeepTop(change);
    if (window)
        Show([&] { DamageChange(change, heightBefore); });
}

void TextEditor::DamageChange(ParagraphChange const &change, long long heightBefore) {
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

// Of what is typed: in the place of what is composed, as that would look.
EditStyle TextEditor::TypedStyle() const {
    if (!composing || hasTypingStyle)
        return InsertionStyle();
    return IsStyled() ? composedStyle : document.Styles().At(0);
}

// Without a word to anybody. What is composed counts as what it stands over. Everything that takes memory
// comes before anything is changed.
void TextEditor::Record(std::size_t start, std::size_t end, std::u16string_view units,
                        EditHistory::Kind kind) {
    TextFragment const fragment = LookingAs(units, TypedStyle());
    EditSelection const caret{start + units.size(), start + units.size()};
    EditStep step{start, composing ? composedOver : document.FragmentOf(start, end), units.size(),
                  composing ? composedFrom : selection, caret};
    TextDocument::Replacement replacement = document.Prepare(start, end - start, fragment);
    history.Add(std::move(step), kind);
    composing = false;
    ReplaceText(std::move(replacement));
    selection = caret;
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
    std::size_t const start = composed ? markStart : selection.Start();
    std::size_t const end = composed ? markEnd : selection.End();
    std::u16string const typed = Fitted(units, end - start);
    if (!typed.empty()) {
        ReplaceByUser(start, end, typed, EditHistory::kTyping);
    } else if (composed) {
        RestoreComposed();
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

// What takes the step back that is to be carried out.
EditStep TextEditor::Reverse(EditStep const &step) const {
    return {step.start, document.FragmentOf(step.start, step.start + step.length), step.before.units.size(),
            step.selectionBefore, step.selectionAfter};
}

bool TextEditor::Undo() {
    EndComposing();
    if (IsReadOnly() || !history.CanUndo())
        return false;
    EditStep const &step = history.Done();
    TextFragment const former = AsItMayLook(step.before);
    EditSelection const selected = step.selectionBefore;
    TextDocument::Replacement replacement = document.Prepare(step.start, step.length, former);
    history.Undo(Reverse(step));
    TakeStep(std::move(replacement), selected);
    return true;
}

bool TextEditor::Redo() {
    EndComposing();
    if (IsReadOnly() || !history.CanRedo())
        return false;
    EditStep const &step = history.Undone();
    TextFragment const later = AsItMayLook(step.before);
    EditSelection const selected = step.selectionAfter;
    TextDocument::Replacement replacement = document.Prepare(step.start, step.length, later);
    history.Redo(Reverse(step));
    TakeStep(std::move(replacement), selected);
    return true;
}

// A step of the history. Whoever is told may delete this.
void TextEditor::TakeStep(TextDocument::Replacement replacement, EditSelection const &selected) {
    Alive const self = alive;
    ReplaceText(std::move(replacement));
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
    bool const begins = !composing;
    std::size_t const start = begins ? selection.Start() : markStart;
    std::size_t const end = begins ? selection.End() : markEnd;
    EditStyle const style = begins ? InsertionStyle() : composedStyle;
    TextFragment over = begins ? document.FragmentOf(start, end) : TextFragment();
    std::u16string const units = Fitted(Utf::View(text), end - start);
    TextFragment const shown = AsItMayLook(LookingAs(units, style));
    TextDocument::Replacement replacement = document.Prepare(start, end - start, shown);
    if (begins) {
        composedFrom = selection;
        composedStyle = style;
        composedOver = std::move(over);
        markStart = start;
        composing = true;
    }
    ReplaceText(std::move(replacement));
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
    TextFragment const former = AsItMayLook(composedOver);
    TextDocument::Replacement replacement = document.Prepare(markStart, markEnd - markStart, former);
    composing = false;
    ReplaceText(std::move(replacement));
    selection = composedFrom;
}

// What has been composed so far is taken as typed. Nobody is told: the text stays as it is.
void TextEditor::EndComposing() {
    if (!composing)
        return;
    std::u16string const units = document.Units().Copy(markStart, markEnd);
    std::size_t const caret = selection.to;
    Record(markStart, markEnd, units, EditHistory::kTyping);
    selection = {caret, caret};
}
