// A field of editable text, of one line or several.
//
// A click selects the field and places the insertion point, a drag selects text. Selected by the tab key, all
// of its text is. Keys edit; in a field of one line return and enter end the editing, and so does the cancel
// key in any, after its listeners were asked to put the old value back. Listeners hear when editing begins
// and ends and when the text changes; see frame/TextPaneListener.h. They may change the text, take the
// selection away, or delete the field.
#pragma once
#include "frame/AutoSetActivityListener.h"
#include "frame/TextPaneListener.h"
#include "host/AutoPtr.h"
#include "host/OSTextEdit.h"
#include "host/OSWindow.h"
#include "host/TextSettings.h"
#include "host/TextStyle.h"
#include "host/UString.h"
#include "lists/EditBoxPane.h"
#include "text/EditOpInterface.h"
#include "text/GTextPaneDrawingHelper.h"
#include "text/StyleRunRec.h"
#include "text/gtextResRec.h"
#include <boost/shared_ptr.hpp>
#include <vector>

class GlogStyleSheet;
namespace XMLLib {
class ContainerItem;
}

// The order of bases and of virtual operations is fixed.
class GTextPane : public Provider<TextPaneListener>,
                  public EditBoxPane,
                  public EditOpInterface,
                  public Provider<AutoSetActivityListener>,
                  public TarnOSWindow::OSWindow_PlatformWindowListener,
                  public OS::TextEditListener {
public:
    class Client;

    // What a field does with its text beyond kEditable, where it cannot be selected and takes no keys:
    // kDrawnWithinRegion draws nothing when it lies outside of what is being drawn, kBlank draws the well
    // without text. Other modes merely are not editable.
    enum Mode { kEditable = 0, kDrawnWithinRegion = 2, kBlank = 5 };

    // Without an engine; InitGTextPane makes it.
    GTextPane();

    // Make a field and attach it to a glog, which owns it from then on.
    //
    // From a sheet's keys, as docs/dialog-reference.md tells them; null when memory or glog is wanting. A
    // text takes the place of "InitTextID"; runs, given with it, style parts of it one after the other, and
    // only then may parts of the text look differently. Both may be null, and neither is kept.
    static GTextPane *NewGTextPane(glogRec *, GlogStyleSheet *, const UString *text,
                                   const std::vector<StyleRunRec> *runs);
    // In the rectangle, which becomes the box, framed, in font 0, under the number. What it is made from is
    // set into the glog's own sheet. Calls FailMemFullError when it cannot be made.
    static GTextPane *NewGTextPane(glogRec *, int id, Rect *, const UString &text,
                                   const std::vector<StyleRunRec> *runs);
    // An item with the keys of the record's values.
    static boost::shared_ptr<XMLLib::ContainerItem> XMLResFrom_GTextResRec(const gtextResRec &);

    virtual ~GTextPane(); // deletes the engine and the drawing helper

    // Scrolls so many pixels of text above the top edge; the second number means nothing.
    virtual void SetVScrollPos(int, int);
    // Sets the port's colours, and from them those of the engine.
    virtual void SetupColors();
    // Selects all text, unless a click is selecting the field and places the insertion point.
    virtual void MaybeSelectTextWhenSelected();
    // Puts the insertion point at the start.
    virtual void MaybeDeselectTextWhenDeactivated();
    // What the engine is created with; whether parts may look differently is the argument.
    virtual unsigned int GetTextEditCreationFlags(bool styled);
    // Draws the well, by the helper if there is one.
    virtual void DrawTextWell(Rect &);
    virtual void DoFrameTextWell(Rect &); // the frame itself

    // GlogPane. A window that goes behind others ends the editing.
    void Activate() override;
    void Deactivate() override;
    // With true, BeginEditing goes out, also when the field is selected already; then the insertion point
    // shows. With false, EndEditing goes out if the field is selected, and TextPaneConfirmation in any case.
    // But nobody is told of what a listener selects or deselects in answer to one of the three: the message
    // that is under way says it already, and the two would never come to an end.
    void Select(bool) override;
    // The cancel key sends ResetValue. Every other key sends AutoSetActivityMsg first. 0 when the engine has
    // no use for the key.
    int Key(EventRecordAdapter *) override;
    // Visible, editable, and not told otherwise.
    unsigned char Selectable() override;
    int Tab(char direction) override;
    char CanTabIn() override;
    char CanDeselect() override;
    void PanePositionChanged() override;

protected:
    int HandleClick(EventRecordAdapter *) override; // -1, or 1 with "RetOnClick"; 0 if it cannot be selected
    bool BecomeGopherOnSelect() override;           // yes

public:
    // SelectPane
    void _Draw_(OSRgn *, char) override; // NOLINT(bugprone-reserved-identifier): the name is given

    // One of Mode, or any other number. A new mode ends the editing and repaints.
    virtual void SetMode(unsigned char);
    unsigned char GetMode() const { return mode; }

    // EditOpInterface. The flag is what "RetOnModify" says; Copy and SelectAll change nothing.
    bool CanDoOp(CommandSpecifier const &) override;
    void Cut(bool &commits) override;
    void Copy() override;
    void Paste(bool &commits) override; // sends AutoSetActivityMsg first
    bool Clear(bool &commits) override;
    void SelectAll() override;

    // OSWindow_PlatformWindowListener
    void PlatformWindow_Opened(TarnOSWindow::OSWindow &) override;
    void PlatformWindow_Closing(TarnOSWindow::OSWindow &) override;
    // OS::TextEditListener: sends ValueChanged.
    void TextEditListener_TextChanged() override;

    // The text. One line takes 32,767 units, and what is longer is cut there, as what is typed and pasted is.
    // Setting another one sends nothing; while the mouse button is down it is drawn at once, since
    // nothing is updated then. GetText needs the engine.
    void SetText(const UString &);
    UString GetText();

    // The selection, in units of UTF-16; what lies beyond the text is cut. SelectTextRange has no effect
    // during a click, which places the insertion point itself.
    bool HasSelection();
    void GetSelection(unsigned int &start, unsigned int &end); // both 0 without an engine
    void SetSelection(unsigned int start, unsigned int end);
    void SelectTextRange(int start, int end);
    void DeselectAll(); // leaves an insertion point; needs the engine
    // The character at a point in the pane's coordinates; needs the engine.
    unsigned int GetCharacterIndexForPoint(const OS::Point &);

    // How the text looks. The mask's bits say which parts of a style count: 1 family, 2 face, 4 size, 8
    // colour. SetTextStyle and SetFontFSRID are for all of the text, end the editing, and repaint.
    void GetStyle(unsigned int mask, OS::TextStyle &); // of the selection
    void SetStyle(unsigned int mask, const OS::TextStyle &);
    unsigned int GetNumberStyleRuns();
    void GetNthStyleRun(unsigned int n, unsigned int &start, unsigned int &end, OS::TextStyle &);
    void SetTextStyle(OS::TextStyle &);
    // An index in the application's font table, of which the low byte is kept.
    void SetFontFSRID(short);
    short GetFontFSRID() const { return fontIndex; }
    // Any value reaches the engine; "Align" follows where it has a number for it.
    void SetAlignment(TextSettings::Alignment);
    // How many pixels lower the text stands; in a framed field the frame's offset is added.
    void SetBaselineOffset(int);
    // Both flags of the frame; the baseline offset is taken from the glog's own sheet once more.
    void SetBoxAndFrame(bool boxIt, bool textWell);

    // Colours. Both stay the caller's and must outlive the field; nothing is repainted.
    void SetColors(const RGBColor &fore, const RGBColor &back);
    // The colour of what is selected, the caller's. Null and black mean the system's.
    void SetCustomSelectionColor(RGBColor *);
    // Whether the engine paints its ground while the field is not selected.
    void DrawBackgroundWhenNotSelected(bool);
    // Takes the helper over and deletes the one before, by the type that it has here.
    void SetDrawingHelper(AutoPtr<GTextPaneDrawingHelper>);

    // Scrolling, in pixels. All are 0 without an engine.
    int GetScrollDelta();
    int GetCurrentScrolledOffset();
    int GetTextHeight();
    void SetAutoScroll(bool); // whether the insertion point is followed
    void ScrollToSelectionEnd();

    // Only stores: whether the field keeps the keyboard whatever is clicked.
    void SetUnDeselectable(bool on) { noDeselect = on; }
    // Whether all text input is the platform's, instead of going through Key where it can. Both need the
    // client, which InitGTextPane makes.
    void SetPlatformHandlesTextInputEvents(bool);
    bool PlatformHandlesTextInputEvents();

protected:
    // Attaches the pane, reads the keys, and makes the engine; null when it cannot be attached.
    GTextPane *InitGTextPane(glogRec *, GlogStyleSheet *, const UString *text,
                             const std::vector<StyleRunRec> *runs);
    // Without effect when there is an engine.
    void CreateTextEdit(const UString *text, const std::vector<StyleRunRec> *runs);
    // Draws the text at once.
    void UpdateTextEdit();

private:
    // A field of several lines is scrolled by the wheel.
    CustomEventHandler *CanHandleCustomEvent(UIEvent *) override;

    friend class Client;
    class WithTextColors;

    void ReadKeys(GlogStyleSheet *);
    void StyleParts(const std::vector<StyleRunRec> &);
    void PassColorsOn();
    OS::TextStyle StyleOfFont(int index) const;
    bool ColorsApply() const;
    short Boxed(int baselineOffset) const;
    Rect TextBox();
    void EndEditing();
    int ModifyResult() const;
    void Tell(void (TextPaneListener::*)(GTextPane *));
    void TellOnce(void (TextPaneListener::*)(GTextPane *));
    void TellActivity();
    void BeginEngine();
    void EndEngine();
    void DrawEngine();

    short itemKind;
    Rect bounds;                  // "BoundsRect"
    unsigned char fontIndex;      // "FSRID"
    unsigned char alignmentIndex; // "Align"
    bool boxIt, noTabIn, returnOnClick, returnOnModify, multiLine, autoScroll, notSelectable, useSavedColors;
    bool readOnly;
    signed char textWell;    // not 0: the well is framed also without "BoxIt"
    short frameOffset;       // from the text to the box, inwards: mostly negative
    short firstLineOffset;   // "FirstLineOffset", which nothing here uses
    OS::TextStyle textStyle; // as SetTextStyle was given it last
    OSTextEdit *textEdit;    // owned; null at first
    unsigned char mode;
    bool inClick;                          // HandleClick is running
    RGBColor const *savedBack, *savedFore; // the caller's; null: none
    RGBColor *selectionColor;              // the caller's; null: the system's
    GTextPaneDrawingHelper *drawingHelper; // owned; may be null
    boost::shared_ptr<Client> client;
    bool noDeselect;
    bool colorsApplied;   // the engine has had its colours
    bool drawsBackground; // as the engine was told
    bool telling;         // Select is sending a message
};

// Decides which way the events of a field go: letters and actions through its Key, everything else, and all
// that an input method composes, straight to the engine.
class GTextPane::Client : public OS::TextEditClient {
public:
    explicit Client(GTextPane *); // of the field, which outlives what it is asked
    // OS::TextEditClient
    DispatchPath TextEditClient_HandleTextEntry(OSTextEdit &, EventRecordAdapter *, UString const &) override;
    DispatchPath TextEditClient_HandleTextAction(OSTextEdit &, EventRecordAdapter *,
                                                 OS::TextEditAction const &) override;

private:
    friend class GTextPane;
    DispatchPath WhileEditing() const;

    GTextPane *pane; // null once the field is gone
    bool platformHandlesTextInput;
};

// Procedural access; the variables may be replaced.
extern void (*gcSetFontFSRID)(GTextPane *, int); // GTextPane::SetFontFSRID, of the low 16 bits
extern void (*gcSetModeGText)(GTextPane *, int); // GTextPane::SetMode, of the low byte
