// A row of named tabs, one of which is selected.
//
// While the mouse button is down on a tab the selection follows the mouse, and goes back as long as it is
// outside of the pane; the listeners hear of it at the release. What does not fit stands in one last tab with
// a mark, which opens a menu of it. Clicks give -1, or 0 in the 2 pixels at each end of a tab, which are
// dead.
//
// Item numbers count from 0 and are not checked.
#pragma once
#include "frame/TabPane_Listener.h"
#include "host/GlogPane.h"
#include "host/OSFont.h"
#include "host/TextLayout.h"
#include "host/TextSettings.h"
#include "host/UString.h"
#include <boost/shared_ptr.hpp>
#include <vector>

class GlogStyleSheet;

// The order of bases, of virtual operations and of fields is fixed.
class TabPane : public Provider<TabPane_Listener>, public GlogPane {
public:
    // A tab.
    struct Item {
        // Enabled, with a text layout of its own. With one name, that is also the short one.
        explicit Item(UString const &name = UString());
        Item(UString const &name, UString const &shortName);

        UString name;                                 // the full one
        UString shortName;                            // for rows that are too narrow for full names
        boost::shared_ptr<OS::TextLayout> textLayout; // never null in a pane: an assertion fails then
        bool enabled; // kept for programs: a tab that is not enabled looks and clicks like any other
    };

    // The pieces that a tab is drawn from. Foreign numbers are allowed.
    enum Part : int { kLeftEnd = 0, kRightEnd = 1, kBody = 2 };

    // What SetTextDrawingFlags takes; FitIntoRect sets them itself.
    enum TextDrawingFlag {
        kUseShortNames = 1,
        kUseCondensedText = 2,
        kTextSize10 = 4,
        kTextSize9 = 8, // goes before 10
        kOverflow = 16  // the last items, as many as are hidden, share one tab
    };

    // Makes a pane with a box and the number 0, or with the number and the box that the glog's resource has
    // for it, and attaches it to the glog, which owns it. The last number means nothing. The first item, if
    // there is one, is selected. With a null glog the pane stays unattached, which goes unreported.
    TabPane(glogRec *, Rect const &, std::vector<Item> const &, int);
    TabPane(glogRec *, int id, std::vector<Item> const &, int);
    // The same from a sheet, with the number -1: "BoundsRect", and the container "Items" with one string for
    // each tab, which becomes both of its names; what is no string is left out. Without the container
    // FailMemFullError is called. Unlike the others it lays out its row at once.
    TabPane(glogRec *, GlogStyleSheet *);
    ~TabPane() override;

    // How tabs look and behave; subclasses override what they have otherwise. Pixels.
    virtual int GetTabHeight() const;              // 17
    virtual int GetMinTabWidth() const;            // 0; read by FitIntoRect
    virtual int GetNameExtraWidth(int item) const; // room beside the name, beside the padding: 0
    // Asked at the release after a drag over tabs: whether they are told. False leaves the selection where
    // the mouse left it, and a subclass that refuses has to put it back itself. By default whether the two
    // differ.
    virtual bool ShouldAllowTabSwitch(int from, int to) const;
    virtual bool WindowIsActive() const; // handed to GetIcon: true
    virtual int GetTabEndWidth() const;  // where the right end is drawn, from the right edge: 6
    virtual int GetTabBodyWidth() const; // of the tile between the ends: 18
    virtual int GetIconSet() const;      // the icon family: 1000
    // Where the name is drawn: in the box, which is the tab's.
    virtual Rect AdjustNameBox(Rect box, int item) const;
    // Draws what a tab has beside its name, at last; by default nothing. Not called for the tab of hidden
    // items.
    virtual void DecorateTab(Rect tab, Rect nameBox, int item, int nameWidth);
    // Sets the colour of a name; by default it stays a dark gray, or what that is in the theme.
    virtual void SetTextColor(bool selected);
    // Settles family, style and size of the names from the flags.
    virtual void SetupFont();
    virtual int DefaultTextStyle() const; // of names that are not condensed: 1
    // The icon of a piece. `active` makes no difference.
    virtual int GetIcon(Part, int item, bool active);

    // Items

    int CountItems() const { return static_cast<int>(items.size()); } // how many there are
    // The item, and what it says.
    Item const &GetItem(int item) const { return items[Index(item)]; }
    Item &GetItem(int item) { return items[Index(item)]; } // changes show after InvalItemRects and Inval
    UString const &GetItemName(int item) const { return GetItem(item).name; }
    UString const &GetItemShortName(int item) const { return GetItem(item).shortName; }
    bool GetEnableItem(int item) const { return GetItem(item).enabled; }
    void SetEnableItem(int item, bool); // stores it and repaints
    // Change the list, lay the row out anew and repaint. Selection, flags and the number of hidden items
    // stay, so that after a deletion the selected item may be one that is not there. An item is inserted in
    // front of the one that has its number.
    void InsertItem(int item, Item const &);
    void DeleteItem(int item);
    void DeleteAllItems();
    void SetItemName(int item, UString const &);
    void SetItemShortName(int item, UString const &);

    // Selection

    int GetSelectedItem() const { return selectedItem; } // -1: none
    // Stores the item, also the one that it is already, tells the listeners, then repaints.
    void SetSelectedItem(int item);
    void SetSelectedItem_NoBroadcast(int item) { selectedItem = item; } // only stores it

    // The row

    // The tab in the pane's coordinates. All hidden items have the same.
    Rect GetItemBox(int item);
    // Width of the name that is shown, in the font of the last layout or drawing.
    int GetItemNameWidth(int item);
    bool TabIsVisible(int item) const; // it is not a hidden one
    // Stores the lower 16 bits and lays the row out anew; the caller repaints.
    void SetTextDrawingFlags(int flags);
    void InvalItemRects(); // lays the row out anew
    // From the first tab to the last, as high as a tab; all zero without items.
    Rect GetOptimalRect();
    // Makes the row fit the target and the pane as wide as the row. Of the target left and right count; the
    // pane keeps to the edge that has moved less, by preference the left one. Each step is only taken if
    // those before it do not suffice: less padding, condensed and smaller text, short names, and at last
    // plain text with one hidden item after the other. If even that is too wide the pane is wider than the
    // target. Repaints.
    void FitIntoRect(Rect const &target);
    // Shows a help tag for the tab, less 2 pixels at each end, where it lies now: later layouts do not move
    // it. The tag stays the host's.
    void AttachHelpTag(int item, LocalizedStrings::HelpTag const *);

    // Lays the row out anew, when that is asked for.
    void SetBox(Rect *) override;

protected:
    int HandleClick(EventRecordAdapter *) override;
    void DrawGuts(OSRgn *updateRegion) override;

    // Lays the row out unless that is done already.
    void DemandItemRects();
    // Makes the row's size the natural one in a layout; nothing without items.
    void UpdateLayout();
    // Width of the text in the font that SetupFont has settled. Widths are kept for the whole program.
    int CachedStringWidth(UString const &, OS::TextLayout &);
    // The tab at the point, without its dead ends, and what is left of it. Of hidden items the first answers.
    // False, and nothing is written, where there is none.
    bool FindItem(Point, int &item, Rect &box);

private:
    friend class TabPaneMouseTask;
    typedef std::vector<Item>::size_type Size;
    static Size Index(int item) { return static_cast<Size>(item); }

    explicit TabPane(std::vector<Item> const &); // not attached
    void InstallHelp();
    void GetFromXML(GlogStyleSheet *);
    void ListChanged();

    // The row
    int NumVisible() const; // items with tabs of their own
    UString const &ShownName(Item const &) const;

    // Fitting
    int Measure(Rect const &target, bool alignRight, Rect &candidate);
    void Finish(Rect const &candidate);
    bool TryToFit(Rect const &target, bool alignRight, int &overflow, bool force);
    void NarrowTabs(Rect const &target, bool alignRight);
    bool FitsNarrower(Rect const &target, bool alignRight);
    bool FitsWithSmallerText(Rect const &target, bool alignRight);
    void HideUntilItFits(Rect const &target, bool alignRight);

    // Drawing
    void DrawPieces(Rect const &tab, int item);
    void DrawLeftEnd(Rect const &tab, int item);
    void DrawTab(int item);
    void DrawOverflowTab(int place);
    void DrawName(Item const &, UString const &, Rect const &, TextSettings::TruncateCode);

    // Clicks
    bool IsOverflowClick(int item) const;
    void ChooseFromOverflow(int item);

    std::vector<Item> items;
    std::vector<Rect> itemRects; // as many as there are items once they hold
    int tabPadding;              // on each side of a name, pixels
    int minTabWidth;
    int hiddenCount; // items at the end
    int selectedItem;
    unsigned short textDrawingFlags;
    OS::Font::FamilyID font;
    short textStyle;
    short textSize;
};
