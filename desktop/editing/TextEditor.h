// The desktop's engine of editable text.
//
// A click places the insertion point, a drag selects; a double click takes words, a triple click paragraphs,
// and with shift the selection goes on. Keys are those of EditAction.
#pragma once
#include "desktop/editing/BlinkChore.h"
#include "desktop/editing/EditAction.h"
#include "desktop/editing/EditHistory.h"
#include "desktop/editing/TextDocument.h"
#include "desktop/editing/TextFlow.h"
#include "host/OSTextEdit.h"
#include <memory>
#include <new>
#include <string_view>

class DrawingPort;
class Glog;
class KeyEvent;
class PixelScope;

namespace TextEditFlags {
// What OSTextEdit::Create is told.
enum Bit : unsigned int { kStyled = 1, kSeveralLines = 2, kReadOnly = 4, kNoAutoScroll = 8 };
} // namespace TextEditFlags

// Whoever listens, or is asked as client, may delete the engine: nothing is done with it after such calls.
//
// When memory runs out in a change (std::bad_alloc), the text, its looks, the selection and what can be
// undone are as before. Where it runs out in showing a change, the change stays, and all is drawn anew.
class TextEditor : public OSTextEdit, private OS::TextEditLayoutInfo {
public:
    TextEditor(Window, unsigned int flags);
    ~TextEditor() override;
    TextEditor(TextEditor const &) = delete;
    TextEditor &operator=(TextEditor const &) = delete;

    // OSTextEdit
    void SetWindow(Window) override;
    void SetBounds(OS::RectBase<OS::RectTag> const &) override;
    OS::RectBase<OS::RectTag> GetBounds() const override { return bounds; }
    void SetClient(boost::shared_ptr<OS::TextEditClient> client_) override { client = client_; }
    OS::TextEditLayoutInfo const &GetLayoutInfo() const override { return *this; }
    void SetText(UString const &) override;
    UString GetText() const override;
    void Activate() override;
    void Deactivate() override;
    bool IsActive() const override { return active; }
    void SetAlignment(TextSettings::Alignment) override;
    void SetBaselineOffset(int) override;
    void GetStyle(unsigned int mask, OS::TextStyle &) const override;
    void SetStyle(unsigned int mask, OS::TextStyle const &) override;
    unsigned int GetNumberStyleRuns() const override;
    void GetNthStyleRun(unsigned int n, unsigned int &start, unsigned int &end,
                        OS::TextStyle &) const override;
    void SetBackgroundColor(RGBColor const &) override;
    void SetDefaultColors(OS::RGBAColor const &text, OS::RGBAColor const &selection) override;
    void DrawBackgroundWhenNotSelected(bool) override;
    bool HasSelection() const override { return !selection.Empty(); }
    void SelectAll() override;
    void DeselectAll() override;
    void SetSelection(unsigned int start, unsigned int end) override;
    void GetSelection(unsigned int &start, unsigned int &end) const override;
    boost::optional<std::pair<unsigned int, unsigned int>> GetMarkedRange() const override;
    int GetScrollDelta() const override;
    int GetCurrentScrolledOffset() const override;
    int GetTextHeight() const override;
    void SetVScrollPos(int, int) override;
    void VScrollToCharacterPosition(unsigned int) override;
    void SetAutoScroll(bool on) override { autoScrolls = on; }
    bool HandleEvent(EventRecordAdapter *) override;
    void Draw(OSPort &) override;

    // Edit commands. The text may be read-only: then they have no effect, but for Copy.
    void Cut();
    void Copy() const;
    void Paste();
    void Delete(OS::TextEditAction::Reach, OS::TextEditAction::Way);
    bool Undo(); // false when there was nothing
    bool Redo();

    // For the desktop. A key of the window: true when the engine has used it up, false when the pane is to
    // get it, as the client may want.
    bool TakeKey(KeyEvent &);
    // What an input method composes stands in the place of the selection, marked, until it is typed or given
    // up; an empty text gives it up. The caret counts characters from its start.
    void Compose(UString const &, int caret);
    bool Contains(Point window) const;
    Rect CaretBox() const; // in the window
    TarnOSWindow::OSWindow *WindowNow() const { return window; }
    // Of what is shown; how many paragraphs are laid out.
    std::size_t NumLaidOut() const { return flow.NumLaidOut(); }

private:
    typedef OS::TextEditAction Action;
    typedef std::weak_ptr<char> Alive;

    unsigned int GetCharacterIndexForPoint(OS::Point const &) const override;

    // Changing the text (TextEditorEditing.cpp)
    bool IsStyled() const { return (flags & TextEditFlags::kStyled) != 0; }
    bool HasSeveralLines() const { return document.HasSeveralLines(); }
    bool IsReadOnly() const { return (flags & TextEditFlags::kReadOnly) != 0; }
    void ReplaceText(TextDocument::Replacement);
    void ReplaceByUser(std::size_t start, std::size_t end, std::u16string_view, EditHistory::Kind);
    void Type(std::u16string_view);
    std::size_t MostUnits() const;
    std::u16string Fitted(std::u16string_view, std::size_t replaced) const;
    EditStyle InsertionStyle() const;
    TextFragment LookingAs(std::u16string_view, EditStyle const &) const;
    TextFragment AsItMayLook(TextFragment const &) const;
    EditStyle TypedStyle() const;
    void Record(std::size_t start, std::size_t end, std::u16string_view, EditHistory::Kind);
    EditStep Reverse(EditStep const &) const;
    void TakeStep(TextDocument::Replacement, EditSelection const &);
    void EndComposing();
    void RestoreComposed();
    void BroadcastTextChanged();

    // Moving (TextEditorMoving.cpp)
    bool Perform(Action const &);
    void Move(Action const &);
    std::size_t Destination(Action const &);
    std::size_t VerticalDestination(Action const &);
    std::size_t DeletionEnd(Action::Reach, Action::Way);
    void Select(EditSelection);
    void MoveTo(std::size_t unit, bool extends);

    // The mouse (TextEditorMouse.cpp)
    bool Click(EventRecordAdapter const &);
    class MouseSelection;

    // Where things are in the window, and what is shown (TextEditorView.cpp)
    static short Coordinate(long long);
    int TextLeft() const;
    long long TextTop() const;
    int ViewHeight() const;
    int RoomWidth() const;
    Rect BoundsBox() const;
    Rect ShownBox() const;
    long long ScrollTop() const;
    void ScrollTo(long long top);
    bool ScrollIntoView(std::size_t unit);
    void FollowCaret();
    void LayOut();
    void KeepTextInSight();
    void ScrollAcross(int left);
    void ScrollAcrossTo(int h);
    void LayOutVisible();
    void KeepTop(ParagraphChange const &);
    template <class Drawing> void Show(Drawing const &);
    void DamageChange(ParagraphChange const &, long long heightBefore);
    std::size_t LastVisible() const;
    std::size_t UnitAtPoint(Point window);
    std::size_t CharacterAtPoint(Point window);
    void Damage(Rect const &) const;
    void DamageAll() const;
    void DamageUnits(std::size_t start, std::size_t end);
    void DamageCaret();
    bool CaretMayShow() const;
    void CaretChanged();
    void Blink();

    // Drawing (TextEditorDrawing.cpp)
    void DrawGround(DrawingPort &) const;
    void DrawSelection(DrawingPort &);
    void DrawText(DrawingPort &);
    void DrawMark(DrawingPort &);
    void DrawCaret(DrawingPort &) const;
    void FillWithin(PixelScope &, DrawingPort const &, Rect const &window, OS::RGBAColor const &) const;
    enum RangeShape { kWholeLine, kUnderline };
    void FillRanges(DrawingPort &, std::size_t start, std::size_t end, OS::RGBAColor const &, RangeShape);
    void Trace(DrawingPort const &) const;
    bool ShowsCaret() const;

    std::shared_ptr<char> alive = std::make_shared<char>();
    unsigned int flags;
    TarnOSWindow::OSWindow *window = nullptr;
    OS::RectBase<OS::RectTag> bounds;
    boost::shared_ptr<OS::TextEditClient> client;
    TextDocument document;
    mutable TextFlow flow; // questions lay out
    EditHistory history;
    EditSelection selection;
    EditStyle typingStyle;       // of what is typed next, if the selection says nothing else
    bool hasTypingStyle = false; // set while nothing was selected
    int wantedH = 0;             // where moving up and down tends to, in the text
    bool keepsWantedH = false;
    bool active = false;
    bool autoScrolls;
    bool drawsGroundWhenInactive = true;
    TextSettings::Alignment alignment = TextSettings::kAlignDefault;
    int baselineOffset = 0;
    OS::RGBAColor textColor, selectionColor, groundColor;

    // What is composed stands from markStart up to markEnd, in the place of `composed`.
    bool composing = false;
    std::size_t markStart = 0, markEnd = 0;
    TextFragment composedOver;
    EditStyle composedStyle;
    EditSelection composedFrom;

    // What is shown begins so many pixels below the top of a paragraph, and right of the box's left: left of
    // it where a text is read from the right.
    std::size_t topParagraph = 0;
    int topOffset = 0;
    int scrollLeft = 0;
    BlinkChore blinking;
    bool caretLit = true;
    mutable bool drawnSinceBlink = false; // otherwise nobody sees it
};

// For what only shows something: where there is no memory for it, all is drawn anew.
template <class Drawing> void TextEditor::Show(Drawing const &show) {
    try {
        show();
    } catch (std::bad_alloc const &) {
        DamageAll();
    }
}
