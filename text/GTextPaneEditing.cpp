// How a text field takes the keyboard, keys, clicks and commands.
#include "frame/Message.h"
#include "host/CallbackAPI.h"
#include "host/Coordinate.h"
#include "host/CustomEventHandler.h"
#include "host/EventRecordAdapter.h"
#include "host/PaneWatch.h"
#include "host/PortSavers.h"
#include "host/Services.h"
#include "host/UIEvent.h"
#include "host/glogRec.h"
#include "scrolling/Truncation.h"
#include "scrolling/WheelAxis.h"
#include "text/GTextPane.h"
#include "text/WithTextColors.h"
#include <new>

namespace {

int const kSelectEverything = 32767;
unsigned char const kReturn = 13, kEnter = 3;

// What HandleClick, Key and Tab answer.
int const kNotTaken = 0, kHandled = -1, kClicked = 1, kModified = 2;
int const kTabTaken = 0, kTabGivenUp = 1, kTabRefused = 3;

} // namespace

// Messages

void GTextPane::Tell(void (TextPaneListener::*what)(GTextPane *)) {
    if (!Provider<TextPaneListener>::HasDependents())
        return;
    GTextPane *const self = this;
    Message1<TextPaneListener, GTextPane *, GTextPane *> const message(what, &self);
    Provider<TextPaneListener>::BroadcastChange(message, nullptr);
}

void GTextPane::TellActivity() {
    typedef Provider<AutoSetActivityListener> ActivityProvider;
    if (!ActivityProvider::HasDependents())
        return;
    AutoSetActivityMsg const message(this);
    ActivityProvider::BroadcastChange(message, nullptr);
}

void GTextPane::TextEditListener_TextChanged() { Tell(&TextPaneListener::ValueChanged); }

// A listener that selects or deselects the field in answer to a message of Select is not told of that again:
// it would never come to an end.
void GTextPane::TellOnce(void (TextPaneListener::*what)(GTextPane *)) {
    if (telling)
        return;
    PaneWatch const self(this);
    telling = true;
    Tell(what);
    if (self.PaneExists())
        telling = false;
}

// Having the keyboard

void GTextPane::Activate() {
    if (IsSelected() && textEdit)
        textEdit->Activate();
    EditBoxPane::Activate();
}

void GTextPane::Deactivate() {
    PaneWatch const self(this);
    Select(false);
    if (!self.PaneExists())
        return;
    if (textEdit && textEdit->IsActive()) {
        textEdit->Deactivate();
        MaybeDeselectTextWhenDeactivated();
    }
    EditBoxPane::Deactivate();
}

void GTextPane::BeginEngine() {
    PaneWatch const self(this);
    WithTextColors const colors(*this);
    TellOnce(&TextPaneListener::BeginEditing);
    if (!self.PaneExists())
        return;
    textEdit->Activate();
    Inval();
}

void GTextPane::EndEngine() {
    PaneWatch const self(this);
    WithTextColors const colors(*this);
    textEdit->Deactivate();
    if (IsSelected())
        TellOnce(&TextPaneListener::EndEditing);
    if (self.PaneExists())
        Inval();
}

void GTextPane::Select(bool on) {
    PaneWatch const self(this);
    if (on) {
        if (textEdit)
            BeginEngine();
        if (self.PaneExists())
            MaybeSelectTextWhenSelected();
    } else if (textEdit) {
        EndEngine();
    }
    if (!self.PaneExists())
        return;
    Inval();
    // Also when the field was not selected.
    if (!on)
        TellOnce(&TextPaneListener::TextPaneConfirmation);
    if (!self.PaneExists())
        return;
    EditBoxPane::Select(on);
    // A listener that selected it meanwhile found it selected still: its caret must not go on blinking.
    if (self.PaneExists() && !on && !IsSelected() && textEdit)
        textEdit->Deactivate();
}

// Leaves no pane with the keyboard if this one has it.
void GTextPane::EndEditing() {
    PaneWatch const self(this);
    Select(false);
    if (self.PaneExists() && GetGlog() && GetGlog()->GetCurItem() == this)
        GetGlog()->SetCurItem(nullptr);
}

unsigned char GTextPane::Selectable() { return GetVisibility() && mode == kEditable && !notSelectable; }

char GTextPane::CanTabIn() { return Selectable() && !noTabIn; }

char GTextPane::CanDeselect() { return EditBoxPane::CanDeselect() && !noDeselect; }

bool GTextPane::BecomeGopherOnSelect() { return true; }

int GTextPane::Tab(char) {
    if (IsSelected()) {
        Select(false);
        return kTabGivenUp;
    }
    if (!CanTabIn())
        return kTabRefused;
    Select(true);
    return kTabTaken;
}

// Events

int GTextPane::ModifyResult() const { return returnOnModify ? kModified : kHandled; }

int GTextPane::Key(EventRecordAdapter *event) {
    if (mode != kEditable)
        return kNotTaken;
    PaneWatch const self(this);
    int const result = ModifyResult();
    if (VelaFoundationCallbackAPI::gInstance->IsCancelKey(event, true)) {
        Tell(&TextPaneListener::ResetValue);
        if (self.PaneExists() && CanDeselect())
            Select(false);
        return result;
    }
    TellActivity();
    if (!self.PaneExists())
        return result;
    WithTextColors const colors(*this);
    unsigned char const character = static_cast<unsigned char>(event->message);
    if ((character == kReturn || character == kEnter) && !multiLine) {
        if (CanDeselect())
            Select(false);
        return result;
    }
    return textEdit && !textEdit->HandleEvent(event) ? kNotTaken : result;
}

int GTextPane::HandleClick(EventRecordAdapter *event) {
    if (!Selectable())
        return kNotTaken;
    PaneWatch const self(this);
    int const result = returnOnClick ? kClicked : kHandled;
    TellActivity();
    if (!self.PaneExists())
        return result;
    inClick = true;
    Select(true);
    if (!self.PaneExists())
        return result;
    Prepare(); // the engine takes the event's place from the port
    WithTextColors const colors(*this);
    if (textEdit)
        textEdit->HandleEvent(event);
    if (self.PaneExists())
        inClick = false;
    return result;
}

// The selection

void GTextPane::MaybeSelectTextWhenSelected() { SelectTextRange(0, kSelectEverything); }

void GTextPane::MaybeDeselectTextWhenDeactivated() { textEdit->SetSelection(0, 0); }

void GTextPane::SelectTextRange(int start, int end) {
    if (inClick || !textEdit)
        return;
    auto const unit = [](int place) { return static_cast<unsigned int>(place > 0 ? place : 0); };
    WithTextColors const colors(*this);
    textEdit->SetSelection(unit(start), unit(end));
}

bool GTextPane::HasSelection() { return textEdit && textEdit->HasSelection(); }

void GTextPane::GetSelection(unsigned int &start, unsigned int &end) {
    start = end = 0;
    if (textEdit)
        textEdit->GetSelection(start, end);
}

void GTextPane::SetSelection(unsigned int start, unsigned int end) {
    if (textEdit)
        textEdit->SetSelection(start, end);
}

void GTextPane::DeselectAll() { textEdit->DeselectAll(); }

unsigned int GTextPane::GetCharacterIndexForPoint(const OS::Point &point) {
    OS::Point const inWindow = Coordinate::PaneToWindow(*this, point);
    OS::Point const origin = textEdit->GetBounds().origin;
    return textEdit->GetLayoutInfo().GetCharacterIndexForPoint(
        OS::Point(inWindow.x - origin.x, inWindow.y - origin.y));
}

// Commands

bool GTextPane::CanDoOp(CommandSpecifier const &command) { return KnowsCommand(command); }

void GTextPane::Cut(bool &commits) {
    if (!textEdit)
        return;
    commits = returnOnModify;
    WithTextColors const colors(*this);
    OS::TextEditActions::Cut(*textEdit);
}

void GTextPane::Copy() {
    if (!textEdit)
        return;
    WithTextColors const colors(*this);
    OS::TextEditActions::Copy(*textEdit);
}

void GTextPane::Paste(bool &commits) {
    if (!textEdit)
        return;
    commits = returnOnModify;
    PaneWatch const self(this);
    TellActivity();
    if (!self.PaneExists())
        return;
    WithTextColors const colors(*this);
    OS::TextEditActions::Paste(*textEdit);
}

bool GTextPane::Clear(bool &commits) {
    if (!HasSelection())
        return false;
    commits = returnOnModify;
    WithTextColors const colors(*this);
    OS::TextEditActions::DeleteBackward(*textEdit, OS::TextEditActions::kCharacter);
    return true;
}

void GTextPane::SelectAll() {
    WithTextColors const colors(*this);
    if (textEdit)
        textEdit->SelectAll();
}

// The text

UString GTextPane::GetText() { return textEdit->GetText(); }

void GTextPane::SetText(const UString &text) {
    if (!textEdit || textEdit->GetText() == text)
        return;
    textEdit->SetText(text);
    if (!drawsBackground && !IsSelected())
        return;
    if (OS::Services::StillDown()) {
        Inval();
        UpdateTextEdit();
    }
}

// Scrolling

// Scrolls by three lines a notch.
struct GTextMouseWheelHandler : CustomEventHandler {
    explicit GTextMouseWheelHandler(GTextPane *scrolled)
        : pane(scrolled) {}

    // A wheel across the text, and one that has nothing to scroll, is left to others.
    bool HandleEvent(UIEvent *event) override {
        int const kLinesOfNotch = 3;
        boost::shared_ptr<UIEvent::MouseWheelParams> const wheel = event->GetMouseWheelParams();
        int const before = pane->GetCurrentScrolledOffset();
        if (wheel->axis != kWheelVertical)
            return false;
        double const pixels = static_cast<double>(wheel->delta) * kLinesOfNotch * pane->GetScrollDelta();
        pane->SetVScrollPos(Truncated(before - pixels), 0);
        return pane->GetCurrentScrolledOffset() != before;
    }

    CustomEventHandler *Clone() override { return new (std::nothrow) GTextMouseWheelHandler(pane); }

private:
    GTextPane *pane;
};

CustomEventHandler *GTextPane::CanHandleCustomEvent(UIEvent *event) {
    if (!multiLine || !IsMouseWheelEvent(*event))
        return nullptr;
    return new (std::nothrow) GTextMouseWheelHandler(this);
}

void GTextPane::SetVScrollPos(int first, int second) {
    if (textEdit)
        textEdit->SetVScrollPos(first, second);
}

int GTextPane::GetScrollDelta() { return textEdit ? textEdit->GetScrollDelta() : 0; }

int GTextPane::GetCurrentScrolledOffset() { return textEdit ? textEdit->GetCurrentScrolledOffset() : 0; }

int GTextPane::GetTextHeight() { return textEdit ? textEdit->GetTextHeight() : 0; }

void GTextPane::SetAutoScroll(bool on) {
    if (textEdit)
        textEdit->SetAutoScroll(on);
}

void GTextPane::ScrollToSelectionEnd() {
    if (!textEdit)
        return;
    unsigned int start = 0, end = 0;
    textEdit->GetSelection(start, end);
    textEdit->VScrollToCharacterPosition(end);
}
