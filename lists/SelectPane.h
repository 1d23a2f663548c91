// A pane that can be selected and, in an editor that arranges panes, resized.
//
// A click selects it, or ends the selection. It draws itself as a frame, filled while it is selected and its
// window active. Selecting is shown by repainting alone: no message goes out.
#pragma once
#include "host/GlogPane.h"
#include "lists/ConsoleEditMode.h"

// The order of virtual operations is fixed, and so are the names with underscores.
class SelectPane : public GlogPane {
public:
    SelectPane();

    // Attaches the pane to the glog under the number, not selected and in the default edit mode; null when it
    // cannot be attached.
    SelectPane *SelectPaneInit(glogRec *, short id);

    // Whether the point is where the pane is taken to be resized. With the edit box as SetBox makes it, no
    // point is.
    virtual bool EditBoxContains(Point);
    // Draws the pane in the port's colours: a frame one pixel wide, and within it the foreground if
    // highlighted, the background if not.
    virtual void _Draw_(OSRgn *region, char hilite); // NOLINT(bugprone-reserved-identifier)
    // Derives the edit box from the rectangle.
    virtual void _SetEditBoxFromRect_(Rect &); // NOLINT(bugprone-reserved-identifier)
    // A drag from one point to another resizes the box, whose top left corner stays: `box` becomes the new
    // one, and the pane takes it. Pulled beyond that corner, the size flips back and counts positive. True if
    // the size has changed.
    virtual char _ResizeBox_(Rect *box, Point from, Point to); // NOLINT(bugprone-reserved-identifier)
    // Only stores; answers the mode before.
    virtual ConsoleEditMode SetEditMode(ConsoleEditMode);

    ConsoleEditMode GetEditMode() const { return editMode; } // as SetEditMode stored it
    Rect GetEditBox() const { return editBox; }              // as SetBox derived it

    // GlogPane. Repaints what is selected when the window comes to the front. A window that leaves it
    // repaints nothing: what is selected looks so until something else repaints it.
    void Activate() override;
    void Deactivate() override;
    // Also derives the edit box.
    void SetBox(Rect *) override;
    // Repaints the pane if the state changes.
    void Select(bool) override;
    unsigned char Selectable() override; // yes

protected:
    int HandleClick(EventRecordAdapter *) override; // -1
    void DrawGuts(OSRgn *) override;

private:
    ConsoleEditMode editMode;
    Rect editBox; // upside down, since top and left lie beyond bottom and right
};
