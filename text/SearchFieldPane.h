// The search box of lists and browsers: a rounded field of one line, with a button that empties it.
//
// Every key changes the search at once; listeners filter. The up and down arrows go to listeners too, so that
// a list of results can be walked through without leaving the field. The button shows as soon as there is
// text; a press on it, and the escape key, give the search up. See frame/SearchFieldPane_Listener.h.
// Listeners may change the text or delete the field.
#pragma once
#include "frame/SearchFieldPane_Listener.h"
#include "host/CompoundPane.h"
#include "host/PanePtr.h"
#include "host/UString.h"

class SearchTextPane;

// The order of bases is fixed.
class SearchFieldPane : public Provider<SearchFieldPane_Listener>, public CompoundPane {
public:
    SearchFieldPane(); // not attached; Init comes next
    ~SearchFieldPane() override;

    // Attaches the field to the glog, which owns it from then on, empty and without a box, under the number
    // -1. The item that its text is made from is set into the glog's own sheet. Without a glog nothing
    // happens.
    void Init(glogRec *);

    // A copy of the text; empty before Init.
    UString GetText();
    // Empties the text, tells SearchIsCanceled, and invalidates the field. Told also when it is empty
    // already.
    void CancelSearch();
    // Tells TextChanged with the text, and invalidates the button. For the text inside, after each key and
    // after whatever else the user does to it.
    void SearchTextChanged(UString const &);
    // Tells HandleSpecialKey.
    void HandleSpecialKey(EventRecordAdapter *);

    // Paints behind the search string where it first occurs in a text that is about to be drawn in the
    // rectangle, from its left: in the system's colour for selections, which stays the foreground. The port
    // has to have the text's font. Case does not count; in English only beginnings of words do, and whatever
    // is no ASCII letter or digit counts as a blank. Without a match nothing is painted.
    static void MaybeHiliteSearchString(UString const &search, UString const &text, Rect const &);

    // GlogPane. The text is selected and deselected too.
    void Select(bool) override;
    // The text ends 20 pixels before the right end of the box and never grows beyond 230 pixels; the button
    // stays at that end. A field of less than 61 pixels hides, and one of more shows.
    void SetBox(Rect *) override;

protected:
    // A press on the last 20 pixels gives the search up when the button comes up, wherever that is: -1.
    int HandleClick(EventRecordAdapter *) override;
    void DrawBackgroundGuts(OSRgn *) override;

private:
    class WhilePressed;

    void HandleCancelClick();
    Rect CancelBox();

    PanePtr<SearchTextPane> searchText; // a subpane; null before Init
    bool cancelPressed;                 // during a click anywhere in the field: the button looks pressed
    bool selecting;                     // Select is running
};
