// A list: a vertical run of rows of equal height, cut into columns.
//
// The list knows how many rows there are, which one is at the top, which are selected, and where each lies;
// what is in a row is the caller's, who draws it by a ListLineDrawer. A scroll bar, which is not the list's,
// may show and move the position. A click selects rows by the mode and modifiers, a drag takes further rows
// along and scrolls when it leaves the list; the wheel scrolls. The list takes no keys.
//
// Rows and columns count from 0. A row that does not exist may be named everywhere: asking answers that it is
// not there, changing does nothing, unless it is said otherwise.
#pragma once
#include "frame/GListPane_SelectionListener.h"
#include "host/CIdleChore.h"
#include "host/GlogPane.h"
#include "host/PageFormat.h"
#include "host/PanePtr.h"
#include "host/PortSavers.h"
#include "host/XMLLib.h"
#include "lists/ColumnList.h"
#include "lists/GLFirstLastRec.h"
#include "lists/GLGetBoxRec.h"
#include "lists/ListLineDrawer.h"
#include "lists/SelectionFlags.h"
#include "lists/glistResRec.h"
#include "scrolling/ScrollBarClient.h"
#include <boost/shared_ptr.hpp>
#include <vector>

class ScrollBarPane;

// Tells its selection listener at once, while it works: the listener may do anything with rows, columns,
// drawer and selection from inside. It should not delete the list; if it does, the list does nothing more.
class GListPane : public Provider<GListPane_SelectionListener>,
                  public GlogPane,
                  public ScrollBarClient,
                  public CIdleChore {
public:
    static constexpr int kAnyColumn = 1000; // for SetSelColumn
    static constexpr int kWholeRow = 20000; // for DrawListLine

    // Make a list without rows and columns under the number 0 and attach it to the glog, which owns it from
    // then on; null when memory or glog is wanting. The record is copied. Keys are those of glistResRec; what
    // is absent is 0.
    static GListPane *NewGListPane(glogRec *, glistResRec *);
    static GListPane *NewGListPane(glogRec *, boost::shared_ptr<XMLLib::ContainerItem>);
    // Writes the record that the keys say, each number cut to what its field holds. A null item fails the
    // assertion of its pointer.
    static void ListResRecFromXMLRes(boost::shared_ptr<XMLLib::ContainerItem>, glistResRec &);

    // Not attached; InitGListPane comes next.
    GListPane();
    // The bar that the record names has no client from then on; one given by SetScrollBar alone keeps the
    // list as its client, which must be taken from it before. Deletes the drawer if it is the list's.
    ~GListPane() override;

    // Rows

    // Sets how many rows there are; below 0 is 0. In modes with several rows nothing is selected afterwards,
    // and the listener hears SelectOccured for every row, the last one first; in the others the selection
    // stays, even beyond the end. Then goes to the nearest scroll position; without a bar nothing is
    // invalidated. When there is no memory for the selection, FailMemFullError is called and nothing changes.
    virtual void SetNumItems(int);
    // A row comes in before this one, or at the nearest end. Rows of the selection move along; in modes with
    // several the listener hears that the new one is not selected. Memory as above.
    virtual void AddItem(int at);
    // The row goes. In modes with several the selection moves along, and nobody is told. In the others it
    // keeps its numbers, which AddItem would not: only a range that ends behind the last row ends there, and
    // one that is this row is no more.
    virtual void DelItem(int at);
    int GetNumItems() const { return numItems; } // how many rows there are
    // Whether the row is selected.
    virtual bool CheckSel(int line);

    // Scrolling

    // Makes the row the first one that shows, or the nearest possible, shows it on the bar and invalidates
    // the list. Does nothing without a bar, unless SetScrollWithNoBar says so.
    virtual void SetScrollPosition(int);

    // For derived lists

    // Whether a click on a cell is not to select, though it would by the other rules; by default false. Must
    // not delete the list.
    virtual bool ClickSelectFilter(EventRecordAdapter *, int line, int column) const;
    // Draws one row; by default by the drawer. See ListLineDrawer::DrawLine.
    virtual void DoDrawListLine(int line, Rect *rowBox, bool hilite);
    // Sets the colours of rows and their ground; black on white for paper.
    virtual void SetupColors();
    // How a selection shows in a pane that is not active, beside the rows that the list shows as selected
    // only while active. By default nothing.
    virtual void InvalInactiveSelectionDisplay();
    virtual void DrawInactiveSelection();
    // Paints the highlight of a row, in the column that selects; nothing when there is no such column.
    virtual void HiliteColumnRect(Rect rowBox);
    // A click below the last row: by default deselects all.
    virtual void ClickBelowLastItem();
    // By default nothing, and nobody calls it.
    virtual void ModifyScrollRect(Rect &);

    // Places

    int GetNumDisplayed() const { return numDisplayed; } // rows that show at least in part
    int GetScrollPos() const { return topLine; }         // the first row that shows
    int GetLineHeight() const { return res.lineHeight; } // pixels
    // Rows that fit into the box as a whole; 0 without a line height.
    int NumFullyDisplayedLines();
    // Write the first and last row that show at least in part; the last is before the first when none does.
    void GetFirstAndLast(int *first, int *last) const;
    // Write the box of a row, or all -1 and answer false when it does not show. Beyond the last row places
    // count on to the bottom of the list. Of a cell the left and right are those of the column as they stand,
    // without the list's own left; also false when there is no such column.
    bool GetRowBox(int line, Rect &) const;
    bool GetCellBox(int line, int column, Rect &) const;
    // GetRowBox of the record's row to its box.
    bool GLGetBox(GLGetBoxRec *);
    // Writes the row at the point, -1 above the first one and -2 below the last or the list, and the column,
    // -1 where there is none. True for a row and column that both exist.
    bool CheckHit(Point, int *line, int *column);
    // The row at the height, as CheckHit writes it.
    int CheckHitV(int v);

    // Drawing

    // Draws a row that shows, at once, also one beyond the last; a negative one is not drawn. Below kWholeRow
    // only this column; a negative column is drawn over what is there, without erasing and highlight. The
    // region narrows it further; null: no limit. Without columns a column fails the assertion of their
    // pointer.
    void DrawListLine(int line, int column, OSRgn *);
    void UpdateListLine(int line); // the whole row, at once
    // Draws what lies in the region: rows, the ground below them and the shadow; null: everything. The clip
    // may be left narrowed. Rows that InvertItemRect has marked show as they are from then on.
    void DrawVisibleLines(OSRgn *);
    // Invalidate the columns of a row, a column in every row that shows, a cell. Without columns they fail
    // the assertion of their pointer.
    void InvalRow(int line);
    void InvalCol(int column);
    void InvalCol(int line, int column);

    // Set up

    // Sets the pixels of a row, 32767 at most, and invalidates the list. Below 1 no row shows.
    void SetLineHeight(int);
    // Takes a bar, or null, in place of the one before, which has no client then, and of that of the record.
    // The bar hears of a position at the next SetScrollPosition.
    void SetScrollBar(ScrollBarPane *);
    // The bar that was taken, else the one that the record names; null when there is none.
    ScrollBarPane *GetScrollBar() const;
    void SetScrollWithNoBar(bool scrolls) { scrollWithNoBar = scrolls; }   // see SetScrollPosition
    void SetInhibitScrolling(bool inhibit) { inhibitScrolling = inhibit; } // the wheel is left to others
    bool GetInhibitScrolling() const { return inhibitScrolling; }          // as it was set
    // Shares the columns, which must not be null and may be changed further. Invalidates the list when they
    // are others than before in number, edges, alignment or name, and answers whether they are; without
    // columns before, also true. The column mapping starts anew.
    bool SetColumnList(boost::shared_ptr<ColumnList>);
    ColumnList const *GetColumnList() const { return columns.get(); } // null without columns
    // Which logical column is shown where, for drawers: at first each is itself, which InitColumnMapping sets
    // again and needs columns for. A place that there is not is not set, and answers itself.
    void InitColumnMapping();
    void SetColumnMapping(int physical, int logical);
    int PhysicalToLogicalColumn(int physical);
    // Sets who draws the rows, or null for nobody, and deletes the one before if it was the list's. With
    // `takeOwnership` the drawer is the list's; otherwise it must be taken from it before it goes. Draws and
    // invalidates nothing.
    void SetLineDrawer(ListLineDrawer *, bool takeOwnership);
    ListLineDrawer *GetLineDrawer() const { return lineDrawer; }
    // A row that the list does not paint any more, only invalidates: whoever protects it paints it. -1: none.
    void Protect(int line) { protectedLine = line; }
    glistResRec GetResInfo() { return res; } // as it stands now
    // The selection shows also while the pane is not active, from now on and for good.
    void DrawSelectionWhenInactive() { drawSelectionInactive = true; }
    // Whether selected rows show as such.
    bool CanDrawSelection() const { return drawSelectionInactive || IsActive(); }

    // Scrolls until the rows show, with one more row as air where there is room; not if they do or fill the
    // view already.
    void PageTillVisible(int line);
    void PageTillVisible(int first, int last);

    // Selection

    // 0 or 1 for one row; in modes with several the rows whose flag is not 0; otherwise 0.
    int NumSelected() const;
    int GetFirstSelectedItem() const { return selFirst; } // of the range, whatever the mode
    // Writes the lowest selected row and answers true; false when there is none. Of one row it is written
    // also then.
    bool GetFirstSelectedItem(int &) const;
    // Writes the range, -1 when there is none. Only modes without flags keep it.
    void GetSelRange(int &first, int &last) const;
    // In modes with several these change what is different, invalidate the row, tell SelectOccured for it,
    // and always SelectionDone. In others only the latter: use SetSelRange.
    void SelectItem(int line);
    void DeselectItem(int line);
    // Stores the row's flag in modes with several and tells SelectOccured; 1 and 0 are selected and not.
    void DoSelect(int line, int value, bool tracking);
    // Tell SelectOccured from the last row to the first, SelectAll for those that were not selected,
    // DeselectAll for every one, and then SelectionDone.
    void SelectAll();
    void DeselectAll();
    // Sets the range, of which one row uses the first, and invalidates. Nobody is told.
    void SetSelRange(int first, int last);
    // Deselects all. Memory as with SetNumItems.
    void SetSelMode(GListSelectionMode);
    // The column in which a click selects, kAnyColumn for all of them: then the list highlights no row by
    // itself. At first 0. Only stores.
    void SetSelColumn(int column) { selColumn = column; }
    // Whether the mode is one for several rows.
    bool SelModeDiscontig();
    // The listener, not owned, or null for none. It must be taken from the list before it goes.
    void SetSelectionListener(GListPane_SelectionListener *listener) { selectionListener = listener; }

    // Despite their names these invert nothing on the screen. The row's mark, by which it shows as selected
    // until the next drawing of the list, is taken away or, where the row is not selected, set; then the row
    // is invalidated, if asked to. InvertItem does so for a row that shows, unless kAnyColumn is set.
    void InvertItem(int line);
    void InvertItemRect(int line, bool invalidate);
    // Invalidates the selected rows.
    void InvertSelection();

    // Mouse

    // Follows the mouse until its button is up; whether it is in the cell then. The row shows as selected
    // meanwhile. For the owner to call after a click that does not select. False for a cell that does not
    // show.
    bool TrackCol(int line, int column);
    // Drags the row at the point to another place; the number that it has there after it was taken out, or -1
    // when it is to stay. The pixels move, nothing else: the caller moves his data. Deselects all.
    int MoveItem(Point);
    // Row and column of the last click, as HandleClick says; the least int when there is none.
    void GetClickParameters(int &line, int &column) const;
    void SetClickParameters(int line, int column);

    // Printing

    // 2: begins at the page, 3: prints the page, 4: ends. Whether there is a further page; otherwise false.
    bool Print(PrintMessageRec *) override;
    // Prints one page, with the header's texts and the page's number above it, and goes on to the next one.
    // Whether there is one; false without a page format.
    bool PrintPage(PrintMessageRec *);
    // Give the list the box, line height and look of a printed page, and take them back. One list at a time
    // prints; without SaveSetup the other does nothing.
    void SaveSetup();
    void RestoreSetup();
    // Goes to the page, from 1, and answers whether it has rows. Draws nothing and does not limit the place.
    bool ScrollToPage(int page);
    bool ScrolledToEnd(); // whether that was behind the last row

    // Overridden operations of panes.
    void Activate() override;
    void Deactivate() override;
    // Follows the edges that the record says.
    void Resize(Point) override;
    // Counts anew what shows, and goes to the nearest scroll position.
    void SetBox(Rect *) override;
    CustomEventHandler *CanHandleCustomEvent(UIEvent *) override;
    void AutoResize(short dh, short dv) override;

    // Overridden operations of the client of a bar.
    int GetMaxScrollValue(ScrollBarPane *) override; // may be below 0
    void ScrollTo(ScrollBarPane *, int position) override;
    // Without rows the bar is dead whatever this says.
    double GetThumbRatio(ScrollBarPane *) override;
    // A row, or the rows that show less 2.
    void StartScrolling(ScrollBarPane *, bool byUnit, int &amount, int &multiplier) override;
    void Scroll(ScrollBarPane *, int &amount, int &multiplier) override; // leaves the multiplier alone
    int GetArrowScrollDelay() override;                                  // 5

protected:
    // Attaches the list to the glog under the number and takes everything from the record; null when the glog
    // is wanting.
    GListPane *InitGListPane(glogRec *, glistResRec *, int id);
    // SelectItem or DeselectItem.
    void SelItemPrim(int line, bool select);

    // Overridden operations of panes.
    // -1 handled; 0 no row was hit; 1 a click that does not select, 2 a double one; 3 the owner is to look at
    // GetClickParameters: a selecting click has ended and the record says selReturn, or a click below the
    // last row.
    int HandleClick(EventRecordAdapter *) override;
    void DrawGuts(OSRgn *updateRegion) override;

    // Overridden operation of chores: takes the bar that the record names, once.
    void DoIdle() override;

private:
    class DragUpdater;
    class SelectionDrag;
    friend class ListTextDrawer; // asks whether it draws on paper

    enum { kAbove = -1, kBelow = -2 }; // what CheckHit writes for no row

    // The bar of the record.
    ScrollBarPane *NamedScrollBar() const;
    void FollowEdges();

    // Places
    bool IsDialogStyle() const { return res.style == glistResRec::kDialogStyle; }
    short Inset() const { return IsDialogStyle() ? 1 : 0; }
    int FreeHeight() const;
    int MaxTop();
    int RowAt(int v, Rect const &box) const;
    bool HasRow(int line) const { return line >= 0 && line < numItems; }
    bool HasColumn(int column) const;
    bool IsMapped(int physical) const;
    bool Shows(int line) const;
    Rect InnerBox();
    Rect CellIn(Rect const &rowBox, int column) const;
    void InvalBox(Rect const &);
    void InvalLine(int line);

    // Drawing
    bool LooksSelected(int line);
    bool NarrowToColumn(int column, Rect &clip) const;
    void DrawGround(int firstFree);
    void DrawInnerShadow();

    // Selection
    bool HasFlags() const;
    bool MakeFlags(int count);
    bool MakeFlag(int row);
    bool ClearFlags();
    void SelectAllAndTell(PaneWatch const &);
    void SelectAllAtOnce();
    void SelectByAll(int row);
    void Unmark(int line);
    void TellSelected(int line, bool selected, bool tracking);
    void TellDone();

    // Mouse
    int ClickOutside(EventRecordAdapter const &, int line);
    bool Selects(EventRecordAdapter *, int line, int column, bool isDouble) const;
    int SelectByClick(EventRecordAdapter const &, int line, int column);
    bool ClearBefore(unsigned short modifiers);
    static bool IsSecondClick(int line, int column);
    bool DragRow(Point, Rect const &row, int &dropV);
    int PlaceOfDrop(Point);
    void MovePixels(int from, int to);
    void InvalShadow();

    // Printing
    void ForgetSetup();

    static int lastClickLine, lastClickColumn; // of the click before this one, in any list
    static bool printing;

    int selColumn;
    glistResRec res;
    SaveColorRec savedColors; // of the port, when a small list was made
    int selFirst, selLast;    // of modes without flags; -1: none
    SelectionFlags selected;  // of modes with flags, for every row; otherwise empty
    int topLine;
    int numDisplayed;
    int numFullLines;
    int numItems;
    int protectedLine; // -1: none
    boost::shared_ptr<ColumnList> columns;
    PanePtr<ScrollBarPane> scrollBar; // not owned
    bool scrollWithNoBar;
    ListLineDrawer *lineDrawer;
    bool ownsLineDrawer;
    bool inhibitScrolling;
    int clickLine, clickColumn;                     // the least int: none
    std::vector<int> columnMapping;                 // logical columns
    std::vector<int> transientHilites;              // rows in order
    GListPane_SelectionListener *selectionListener; // not owned
    bool drawSelectionInactive;
};

// The same for code that knows no class, as data that may be replaced. Numbers are rows unless said
// otherwise.
extern int (*LSTGetNumItems)(GListPane *);                        // GetNumItems
extern int (*LSTGetNumSel)(GListPane *);                          // NumSelected
extern int (*LSTGetNumDisp)(GListPane *);                         // GetNumDisplayed
extern int (*LSTGetScrollPos)(GListPane *);                       // GetScrollPos
extern bool (*LSTGetBox)(GListPane *, GLGetBoxRec *);             // GLGetBox
extern void (*LSTGetFirstAndLast)(GListPane *, GLFirstLastRec *); // GetFirstAndLast
extern int (*LSTCheckHitV)(GListPane *, int v);                   // CheckHitV
extern bool (*LSTCheckSel)(GListPane *, int line);                // CheckSel
extern void (*LSTSelAll)(GListPane *);                            // SelectAll
extern void (*LSTDeselAll)(GListPane *);                          // DeselectAll
extern void (*LSTSelItem)(GListPane *, int line);                 // SelectItem
extern void (*LSTDeselItem)(GListPane *, int line);               // DeselectItem
extern void (*LSTSetSelMode)(GListPane *, int mode);              // SetSelMode
extern void (*LSTSetNumItems)(GListPane *, int count);            // SetNumItems
extern void (*LSTAddItem)(GListPane *, int at);                   // AddItem
extern void (*LSTDelItem)(GListPane *, int at);                   // DelItem
extern void (*LSTDrawLine)(GListPane *, int line);                // DrawListLine of the whole row
extern void (*LSTScrollTo)(GListPane *, int position);            // SetScrollPosition
extern void (*LSTPageTillVisible)(GListPane *, int line);         // PageTillVisible
extern void (*LSTProtect)(GListPane *, int line);                 // Protect
