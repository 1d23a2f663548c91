// The common part of check boxes and radio buttons: one pane with any number of small buttons and their
// labels.
//
// The buttons are no panes: the group draws them, finds the one that was clicked and tracks it. A label
// belongs to a button and takes clicks for it. What a click does to a button's value is up to the subclass.
// Buttons count from 0 in the order in which they were added. Coordinates are 16 bits wide and wrap.
#pragma once
#include "frame/AutoSetActivityListener.h"
#include "frame/ButtonGroupPaneListener.h"
#include "frame/ButtonGroupPane_Listener.h"
#include "frame/Provider.h"
#include "host/GlogPane.h"
#include "host/UString.h"
#include <vector>

class ButtonGroupPane;
class EventRecordAdapter;
class GlogStyleSheet;
class OSRgn;
struct ckRadItemResRec;
struct glogRec;

// The group's operations for code that holds no more than a pointer. They are plain variables: a program may
// put a function of its own into each.
extern void (*btnSetAllEnable)(ButtonGroupPane *, bool);            // SetAllEnable
extern void (*btnSetOneEnable)(ButtonGroupPane *, int index, bool); // SetOneEnable with the low 16 bits

// The order of bases and of virtual operations is fixed.
class ButtonGroupPane : public Provider<ButtonGroupPane_Listener>,
                        public Provider<ButtonGroupPaneListener>,
                        public GlogPane,
                        public AutoSetActivityListener {
public:
    // Frees the labels.
    ~ButtonGroupPane() override;
    // A new region of all buttons and labels; the caller frees it with VelaDrawing::DisposeRgn.
    virtual OSRgn *GetRgn();
    // Adds a button, enabled and off, with its top left corner at the place. The height is the line spacing
    // of check groups in the glog's style sheet ("GCheckGroup_LineSpacing", 0 when absent), the width 10
    // pixels and the extra ones. Neither the box nor the screen changes.
    virtual void AddSpecialButton(short h, short v, short extraWidth);

protected:
    // Tracks a press on an enabled button, drawing it pressed while the mouse is over it or its last label.
    // True when it was released there; false at once for a disabled one. Here the value stays: overrides
    // change it.
    virtual bool TrackButton(short index, short modifiers);
    // The icon of a button with that value for the moment between its release and its redraw.
    virtual short GetReleaseIcon(bool value) = 0;
    // The pane that the button stands for is being used.
    virtual void AutoSetButton(int index) = 0;

public:
    // Adds a button and, unless the text is empty, its label 15 pixels to the right and with the baseline 9
    // pixels below its top.
    void AddButton(short h, short v, UString const &text);
    // Adds a label to the last button, in font 0, with its pen start that far right of and below the button's
    // top left corner. A label that comes before all buttons belongs to none: it counts from (0, 0), looks
    // enabled, and takes no clicks. The current port keeps that font.
    void AddButtonText(short dh, short dv, UString const &text);
    // How many buttons there are.
    int CountButtons() const { return static_cast<int>(buttons.size()); }
    // How many labels there are.
    int CountButtonTexts() const { return static_cast<int>(texts.size()); }
    // Whether the button is enabled; false for an index that does not exist.
    bool IsEnabled(short index) const;
    // Writes the rectangle of the button and of the last of its labels. The index must exist.
    void GetButtonBounds(short index, Rect *out);
    // Writes a label's text. Here and below `n` counts labels, not buttons, and must exist.
    void GetNthButtonName(int n, UString &out);
    // Replaces a label's text and takes its width in the font that the current port happens to have. Neither
    // the box nor the screen changes; in a layout the label's item gets the width.
    void SetNthButtonName(int n, UString const &text);
    // Enable or disable one button or all. A change invalidates the pane and sends ButtonGroupPaneChanged; an
    // index that does not exist, and what a button is already, does nothing.
    void SetOneEnable(short index, bool enabled);
    void SetAllEnable(bool enabled);
    // Whether clicks on the group have any effect; at first they do. Stored only.
    void SetAllowClicks(bool);
    // Stored only, and without effect.
    void SetForPrinting(bool);
    // Adds a help tag, which stays the host's, for a button and its last label as they lie now. The index
    // must exist. A helper that knows one tag only gives way; one that a program has made itself stays,
    // without the tag.
    void AttachHelpTag(short index, LocalizedStrings::HelpTag const *);
    // Whenever the pane of the provider is used from now on, the button is set: a check box is turned on, a
    // radio button becomes the current one. Several may be bound to one button; of several buttons bound to
    // one provider only the first is set.
    void SetAutoBinding(Provider<AutoSetActivityListener> *, int button);

    // From GlogPane. Outside a layout the buttons move with the box's top left corner.
    void SetBox(Rect *) override;
    // Outside a layout sets the box to what encloses all buttons and labels; without any, to the inverted
    // rectangle from 32767 to -32768. It goes through SetBox, so that it moves the buttons by as much as it
    // moves the box's corner: a group that is placed button by button gets its box first.
    void CalcBox() override;

    // From AutoSetActivityListener.
    void ListenToActivity(Provider<AutoSetActivityListener> *) override;

protected:
    ButtonGroupPane();
    // Attach the pane to the glog under the number 0; null when it cannot be attached. The second argument is
    // not read.
    ButtonGroupPane *InitButtonGroupPane(glogRec *, ckRadItemResRec *);
    ButtonGroupPane *InitButtonGroupPane(glogRec *, GlogStyleSheet *);
    // Adds the buttons and labels of the sheet's item, and sets the box round them without moving them:
    // "LineSpacing" is the height of labels in a layout, "RadioCheckButtonItems" holds a container for each
    // button: "Origin" (top left, (0, 0) when absent), "HitExtension" (pixels of hit area right of the icon),
    // and "RadioCheckButtonStrings", which holds a container for each of its labels: "Origin" (pen start;
    // when absent that of the label before), "FSRID" (font) and "Text". A missing container calls
    // FailMemFullError, and what was added by then stays.
    void GlogItemFromRes(GlogStyleSheet *);

    // The button's value; false for an index that does not exist.
    bool IsOn(short index) const;
    // Turns the button on without telling anybody or redrawing; an index that does not exist has no effect.
    void TurnOnQuietly(short index);
    // Sets the button's enabling, or else its value. What it is already, and an index that does not exist,
    // does nothing. A new value sends ButtonValueChanged, then the redraw is asked for if the pane is
    // visible, then ButtonGroupPaneChanged is sent for either. A listener may delete the pane.
    void SetButton(short index, bool value, bool isEnable);
    // SetButton for all but one, in order; -1: for all. Buttons that a listener adds meanwhile stay as they
    // are.
    void SetAllButtons(bool value, bool isEnable, short except);
    // Invalidates the button and a margin of 3 pixels, if the pane is visible. The pane must be prepared.
    void InvalButton(short index);
    // Draws the button, if the pane is visible. The pane must be prepared.
    void RedrawButton(short index);

    // 0: nothing was hit; -1: clicks are not allowed, the button is disabled, or the mouse slid off;
    // otherwise the button's index plus 1. Where label and button overlap the label counts.
    int HandleClick(EventRecordAdapter *) override;
    void DrawGuts(OSRgn *updateRegion) override;

private:
    struct ButtonRec {
        Rect bounds; // outside a layout
        bool enabled;
        bool value;
        RCPtr<GlogLayoutRectItem> layoutItem;
    };
    struct ButtonTextRec {
        Rect bounds;     // outside a layout
        Point origin;    // pen start, outside a layout
        short button;    // that it belongs to; -1: none
        short font;      // index in the application's font table
        short stringKey; // in StringMgr; freed by the pane
        RCPtr<GlogLayoutRectItem> layoutItem;
    };
    struct AutoSetBinding {
        Provider<AutoSetActivityListener> *source;
        int button;
    };
    class ItemReader;

    void ProviderDying(Provider<AutoSetActivityListener> *) override;
    int FindAutoSetSource(Provider<AutoSetActivityListener> *) const;

    template <class Part> Rect RectOf(Part const &part) const;
    // The first part whose rectangle holds the point; the end when there is none.
    template <class Part>
    typename std::vector<Part>::const_iterator FirstAt(Point, std::vector<Part> const &) const;
    template <class Visit> void VisitRectsFromLast(Visit const &visit) const;
    int SpacingOfGlog() const;
    RCPtr<GlogLayoutRectItem> MakeButtonItem(int spacing, Rect const &bounds);
    RCPtr<GlogLayoutRectItem> MakeTextItem(int spacing, Rect bounds);
    void AppendButton(Rect const &bounds, RCPtr<GlogLayoutRectItem> const &);
    void OffsetButtons(short dh, short dv);
    short IconOf(ButtonRec const &) const;
    bool IsTextEnabled(ButtonTextRec const &) const;
    void DrawTexts(OSRgn *);
    int ResultOfClick(short index, short modifiers);

    std::vector<ButtonRec> buttons;
    std::vector<ButtonTextRec> texts;

protected:
    // Icons of the family 1002; the one after onIcon or offIcon shows the button pressed. A disabled button
    // shows disabledIcon whatever its value.
    signed char onIcon, offIcon, disabledIcon;

private:
    std::vector<AutoSetBinding> autoSetBindings;
    bool allowClicks;
    bool forPrinting;

protected:
    unsigned short flags; // the subclass's
    short radioValue;     // of RadioButtonPane: index of the current button
};
