#include "desktop/editing/TextEditor.h"
#include "desktop/drawing/Colors.h"
#include "desktop/editing/KeyEvent.h"
#include "desktop/editing/ParagraphBreaks.h"
#include "desktop/editing/TextFocus.h"
#include "desktop/resources/Utf.h"
#include <algorithm>
#include <limits>
#include <new>

namespace {

unsigned int Number(std::size_t unit) { return static_cast<unsigned int>(unit); }

TarnOSWindow::OSWindow *Pointer(OSTextEdit::Window window) { return window ? &*window : nullptr; }

TextEditor &EditorOf(OSTextEdit &edit) { return static_cast<TextEditor &>(edit); }

} // namespace

OSTextEdit *OSTextEdit::Create(Window window, unsigned int flags) {
    return new (std::nothrow) TextEditor(window, flags);
}

// There is one kind of engine.
void OS::TextEditActions::Cut(OSTextEdit &edit) { EditorOf(edit).Cut(); }

void OS::TextEditActions::Copy(OSTextEdit &edit) { EditorOf(edit).Copy(); }

void OS::TextEditActions::Paste(OSTextEdit &edit) { EditorOf(edit).Paste(); }

void OS::TextEditActions::DeleteBackward(OSTextEdit &edit, Magnitude) {
    EditorOf(edit).Delete(OS::TextEditAction::kCharacter, OS::TextEditAction::kLeft);
}

TextEditor::TextEditor(Window window_, unsigned int flags_)
    : flags(flags_)
    , window(Pointer(window_))
    , document((flags_ & TextEditFlags::kSeveralLines) != 0)
    , flow(document)
    , autoScrolls((flags_ & TextEditFlags::kNoAutoScroll) == 0)
    , groundColor(1.0, 1.0, 1.0, 1.0)
    , blinking([this] { Blink(); }) {
    LayOut();
}

TextEditor::~TextEditor() { TextFocus::Leave(*this); }

void TextEditor::SetWindow(Window other) {
    if (Pointer(other) == window)
        return;
    TextFocus::Leave(*this);
    window = Pointer(other);
    if (window && active)
        TextFocus::Take(*this, *window);
}

// The text

void TextEditor::SetText(UString const &text) {
    std::u16string_view const given = Utf::View(text);
    std::u16string_view const units = given.substr(0, ParagraphBreaks::Fitting(given, MostUnits()));
    TextFragment whole;
    whole.units = units;
    whole.looks = document.Styles().Slice(0, 0);
    TextDocument::Replacement change = document.Prepare(0, document.Size(), whole);
    composing = false;
    hasTypingStyle = false;
    history.Clear();
    ReplaceText(std::move(change));
    selection.from = std::min(selection.from, units.size());
    selection.to = std::min(selection.to, units.size());
    Show([this] { KeepTextInSight(); });
    DamageAll();
    CaretChanged();
}

UString TextEditor::GetText() const { return Utf::FromUnits(document.Units().Copy(0, document.Size())); }

void TextEditor::Activate() {
    if (active)
        return;
    active = true;
    if (window)
        TextFocus::Take(*this, *window);
    DamageAll();
    CaretChanged();
}

// A field of one line shows its beginning when the user is somewhere else.
void TextEditor::Deactivate() {
    if (!active)
        return;
    EndComposing();
    active = false;
    blinking.Cancel();
    TextFocus::Leave(*this);
    if (!HasSeveralLines())
        scrollLeft = 0;
    history.Seal();
    DamageAll();
}

void TextEditor::SetAlignment(TextSettings::Alignment other) {
    if (other == alignment)
        return;
    alignment = other;
    LayOut();
    DamageAll();
}

void TextEditor::SetBaselineOffset(int pixels) {
    if (pixels == baselineOffset)
        return;
    DamageAll();
    baselineOffset =
        std::clamp<int>(pixels, std::numeric_limits<short>::min(), std::numeric_limits<short>::max());
    DamageAll();
}

// Styles

EditStyle TextEditor::InsertionStyle() const {
    if (hasTypingStyle)
        return typingStyle;
    std::size_t const start = selection.Start();
    return document.Styles().At(selection.Empty() && start > 0 ? start - 1 : start);
}

void TextEditor::GetStyle(unsigned int mask, OS::TextStyle &style) const {
    EditStyle const shown = InsertionStyle();
    if (mask & StyleMask::kFamily)
        style.family = shown.style.family;
    if (mask & StyleMask::kFace)
        style.face = shown.style.face;
    if (mask & StyleMask::kSize)
        style.size = shown.style.size;
    if (mask & StyleMask::kColor)
        style.color = shown.colored ? shown.style.color : textColor;
}

// Where all text looks the same, it goes on doing so.
void TextEditor::SetStyle(unsigned int mask, OS::TextStyle const &style) {
    bool const all = !IsStyled() || document.Size() == 0;
    if (!all && selection.Empty()) {
        typingStyle = InsertionStyle();
        CopyStyle(mask, style, typingStyle);
        hasTypingStyle = true;
        return;
    }
    std::size_t const start = all ? 0 : selection.Start(), end = all ? document.Size() : selection.End();
    StyleRuns::List runs = document.Styles().Changed(start, end, mask, style, document.Size());
    HeightGuess const guess = flow.GuessFor((runs.empty() ? document.Styles().All() : runs).front().style);
    document.Styles().Take(std::move(runs));
    if (all)
        flow.LooksChanged(guess);
    else
        flow.LooksChanged(start, end);
    hasTypingStyle = false;
    DamageAll();
}

unsigned int TextEditor::GetNumberStyleRuns() const {
    return document.Size() == 0 ? 0 : Number(document.Styles().All().size());
}

void TextEditor::GetNthStyleRun(unsigned int n, unsigned int &start, unsigned int &end,
                                OS::TextStyle &style) const {
    start = end = 0;
    if (n >= GetNumberStyleRuns())
        return;
    StyleRuns::List const &runs = document.Styles().All();
    start = Number(runs[n].start);
    end = Number(n + 1 < runs.size() ? runs[n + 1].start : document.Size());
    style = runs[n].style.style;
    if (!runs[n].style.colored)
        style.color = textColor;
}

void TextEditor::SetBackgroundColor(RGBColor const &color) { groundColor = ToRGBA(color); }

void TextEditor::SetDefaultColors(OS::RGBAColor const &text, OS::RGBAColor const &selected) {
    textColor = text;
    selectionColor = selected;
}

void TextEditor::DrawBackgroundWhenNotSelected(bool on) {
    if (on == drawsGroundWhenInactive)
        return;
    drawsGroundWhenInactive = on;
    DamageAll();
}

// The selection

void TextEditor::SelectAll() { SetSelection(0, std::numeric_limits<unsigned int>::max()); }

void TextEditor::DeselectAll() { SetSelection(Number(selection.to), Number(selection.to)); }

void TextEditor::SetSelection(unsigned int start, unsigned int end) {
    EndComposing();
    history.Seal();
    keepsWantedH = false;
    hasTypingStyle = false;
    std::size_t const size = document.Size();
    Select({std::min<std::size_t>(start, size), std::min<std::size_t>(std::max(start, end), size)});
}

void TextEditor::GetSelection(unsigned int &start, unsigned int &end) const {
    start = Number(selection.Start());
    end = Number(selection.End());
}

boost::optional<std::pair<unsigned int, unsigned int>> TextEditor::GetMarkedRange() const {
    if (!composing)
        return boost::none;
    return std::make_pair(Number(markStart), Number(markEnd));
}

void TextEditor::Select(EditSelection next) {
    EditSelection const old = selection;
    if (old.from == next.from && old.to == next.to)
        return;
    hasTypingStyle = false;
    Show([this] { DamageCaret(); });
    selection = next;
    Show([&] {
        // What both cover looks as before.
        if (old.Empty() || next.Empty() || old.End() <= next.Start() || next.End() <= old.Start()) {
            DamageUnits(old.Start(), old.End());
            DamageUnits(next.Start(), next.End());
        } else {
            DamageUnits(std::min(old.Start(), next.Start()), std::max(old.Start(), next.Start()));
            DamageUnits(std::min(old.End(), next.End()), std::max(old.End(), next.End()));
        }
    });
    CaretChanged();
}

// Events

bool TextEditor::HandleEvent(EventRecordAdapter *event) {
    if (!event)
        return false;
    switch (event->what) {
    case EventKinds::kMouseDown:
        return Click(*event);
    case EventKinds::kKeyDown:
    case EventKinds::kAutoKey:
        break;
    default:
        return false;
    }
    Action const action = Action::OfKey(KeyReading::CodeOf(*event), event->modifiers);
    if (action.kind != Action::kNone)
        return Perform(action);
    UString const text = KeyReading::TextOf(*event);
    if (text.empty() || IsReadOnly())
        return false;
    Type(Utf::View(text));
    return true;
}

bool TextEditor::TakeKey(KeyEvent &event) {
    Alive const self = alive;
    boost::shared_ptr<OS::TextEditClient> const asked = client;
    Action const action = Action::OfKey(KeyReading::CodeOf(event), event.modifiers);
    UString const text = KeyReading::TextOf(event);
    bool const wasComposing = composing; // then all keys are the input method's
    if (action.kind == Action::kNone && text.empty())
        return wasComposing;
    if (asked) {
        OS::TextEditClient::DispatchPath path = asked->TextEditClient_HandleEvent(*this, &event);
        if (path == OS::TextEditClient::kPlatformPath && !self.expired())
            path = action.kind != Action::kNone
                       ? asked->TextEditClient_HandleTextAction(*this, &event, action)
                       : asked->TextEditClient_HandleTextEntry(*this, &event, text);
        if (self.expired())
            return true;
        if (path != OS::TextEditClient::kPlatformPath)
            return false;
    }
    return HandleEvent(&event) || wasComposing;
}
