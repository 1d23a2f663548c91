// The engine behind editable text.
#pragma once
#include "frame/Provider.h"
#include "host/Geometry.h"
#include "host/OSWindow.h"
#include "host/RGBColor.h"
#include "host/TextSettings.h"
#include "host/TextStyle.h"
#include "host/UString.h"
#include <boost/optional.hpp>
#include <boost/shared_ptr.hpp>
#include <utility>

class EventRecordAdapter;
class OSPort;
class OSTextEdit;

namespace OS {

// Hears what an engine does.
class TextEditListener : public Dependent<TextEditListener> {
public:
    virtual void TextEditListener_TextChanged() {}  // by the user, an edit command or an input method
    virtual void TextEditListener_AutoScrolled() {} // to keep the insertion point in view
};

// An editing action that a key stands for; only the host looks inside.
class TextEditAction;

// Is asked about each event before the engine handles it.
class TextEditClient {
public:
    // Where an event goes: to the engine, or down the pane's own path.
    enum DispatchPath { kPlatformPath = 0, kOwnPath = 2 };

    virtual ~TextEditClient() {}
    // For each event. The event is valid during the call only.
    virtual DispatchPath TextEditClient_HandleEvent(OSTextEdit &, EventRecordAdapter *) {
        return kPlatformPath;
    }
    // For text that is about to be entered.
    virtual DispatchPath TextEditClient_HandleTextEntry(OSTextEdit &, EventRecordAdapter *, UString const &) {
        return kPlatformPath;
    }
    // For an editing action that is about to be carried out.
    virtual DispatchPath TextEditClient_HandleTextAction(OSTextEdit &, EventRecordAdapter *,
                                                         TextEditAction const &) {
        return kPlatformPath;
    }
};

// Where the characters stand.
class TextEditLayoutInfo {
public:
    virtual ~TextEditLayoutInfo() {}
    // The character nearest to the point, which counts from the engine's top left corner.
    virtual unsigned int GetCharacterIndexForPoint(Point const &) const = 0;
};

// Edit commands, on the engine's selection.
namespace TextEditActions {

enum Magnitude { kCharacter = 0 }; // how much to delete

void Cut(OSTextEdit &);   // to the clipboard
void Copy(OSTextEdit &);  // to the clipboard
void Paste(OSTextEdit &); // in the place of the selection
// Deletes the selection; without one, as much as the magnitude says before the insertion point.
void DeleteBackward(OSTextEdit &, Magnitude);

} // namespace TextEditActions

} // namespace OS

// Edits, lays out, scrolls and draws one text. Positions count UTF-16 units from 0. It invalidates its own
// area in its window when its text or selection changes.
class OSTextEdit : public Provider<OS::TextEditListener> {
public:
    typedef boost::optional<TarnOSWindow::OSWindow &> Window; // none: not shown yet

    // A new engine, owned by the caller; null when there could be none. Flags: 1 styled, 2 several lines, 4
    // read-only, 8 without scrolling by itself.
    static OSTextEdit *Create(Window, unsigned int flags);
    virtual ~OSTextEdit() {}

    // The window that it is shown in, or none; not owned.
    virtual void SetWindow(Window) = 0;
    // Its place, in window coordinates.
    virtual void SetBounds(OS::RectBase<OS::RectTag> const &) = 0;
    virtual OS::RectBase<OS::RectTag> GetBounds() const = 0;
    // The client may be null. Shared from now on.
    virtual void SetClient(boost::shared_ptr<OS::TextEditClient>) = 0;
    // Belongs to the engine; answers for the text as it is at each call.
    virtual OS::TextEditLayoutInfo const &GetLayoutInfo() const = 0;

    // Replaces the whole text. One line takes 32,767 units, as much as the user may enter too; what is longer
    // is cut between two characters. Not by the user, so TextEditListener_TextChanged is not sent.
    virtual void SetText(UString const &) = 0;
    virtual UString GetText() const = 0;
    // An active engine shows its insertion point and takes keys.
    virtual void Activate() = 0;
    virtual void Deactivate() = 0;
    virtual bool IsActive() const = 0;
    virtual void SetAlignment(TextSettings::Alignment) = 0;
    virtual void SetBaselineOffset(int) = 0; // pixels by which text stands lower

    // Style of the selection. The mask says which fields count: 7 family, face and size; 15 those and the
    // colour. Without a selection, of what is typed next; in an engine that was not created as styled, and in
    // an empty text, of all text.
    virtual void GetStyle(unsigned int mask, OS::TextStyle &) const = 0;
    virtual void SetStyle(unsigned int mask, OS::TextStyle const &) = 0;
    // Runs of equal style, from 0; each goes up to its end, exclusive.
    virtual unsigned int GetNumberStyleRuns() const = 0;
    virtual void GetNthStyleRun(unsigned int n, unsigned int &start, unsigned int &end,
                                OS::TextStyle &) const = 0;
    virtual void SetBackgroundColor(RGBColor const &) = 0;
    virtual void SetDefaultColors(OS::RGBAColor const &text, OS::RGBAColor const &selection) = 0;
    virtual void DrawBackgroundWhenNotSelected(bool) = 0;

    virtual bool HasSelection() const = 0; // of at least one unit
    virtual void SelectAll() = 0;          // the whole text
    virtual void DeselectAll() = 0;        // leaves an insertion point
    // Selects up to the end, exclusive; both are cut to the text.
    virtual void SetSelection(unsigned int start, unsigned int end) = 0;
    virtual void GetSelection(unsigned int &start, unsigned int &end) const = 0;
    // What an input method is composing, as start and end; none when it is not.
    virtual boost::optional<std::pair<unsigned int, unsigned int>> GetMarkedRange() const = 0;

    virtual int GetScrollDelta() const = 0;                    // pixels of one step of scrolling
    virtual int GetCurrentScrolledOffset() const = 0;          // pixels of text above the top edge
    virtual int GetTextHeight() const = 0;                     // pixels
    virtual void SetVScrollPos(int, int) = 0;                  // scrolls to the first, in pixels
    virtual void VScrollToCharacterPosition(unsigned int) = 0; // until it can be seen
    virtual void SetAutoScroll(bool) = 0; // whether it follows the insertion point by itself

    // Handles a key or click; false when it was of no use.
    virtual bool HandleEvent(EventRecordAdapter *) = 0;
    virtual void Draw(OSPort &) = 0;
};
