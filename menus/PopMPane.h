// A closed pop-up menu that shows its current item.
//
// A click opens the menu over the pane. There the mouse chooses by one press that is held, or by clicks; the
// arrow keys move, Return or the space bar choose, Escape dismisses (RunPopupMenu tells it all). A choice
// gives the number of the item that is current then, anything else -1.
#pragma once
#include "frame/AutoSetActivityListener.h"
#include "host/GlogPane.h"
#include "host/PopupMenuDrawing.h"
#include "host/TextLayout.h"
#include "host/TextSettings.h"
#include "menus/PopUpMenu.h"
#include "menus/popMMResRec.h"

class GlogStyleSheet;
class PopMPane;

// The pane as a PopMPane, which it must be; null for null.
PopMPane *CheckedStaticCastToPopMPane(GlogPane *);

// For code that knows a pane by its address alone. Each is a variable, so that a program may put another
// function in its place. Numbers are narrowed to 16 bits.
extern void (*PMSelectItem)(PopMPane *, int item);     // SelectItem
extern short (*PMGetSelItem)(PopMPane *);              // GetSelectedItem
extern short (*PMCountMItems)(PopMPane *);             // CountItems
extern bool (*PMItemIsEnabled)(PopMPane *, int item);  // ItemIsEnabled
extern void (*PMMenuEnable)(PopMPane *, bool on);      // EnableMenu
extern void (*PMDeleteMenuItem)(PopMPane *, int item); // DeleteItem
extern void (*PMDeleteAllItems)(PopMPane *);           // DeleteAllItems

// The order of bases and of virtual operations is fixed. The menu is a copy of the pane's own, and a menu
// with items always has a current one.
class PopMPane : public Provider<PopUpMenuListener>,
                 public Provider<AutoSetActivityListener>,
                 public GlogPane,
                 public PopUpMenu {
public:
    // Draws and clicks in the pane's place where it sets `handled`, which every operation finds false. Those
    // that are not overridden leave everything to the pane.
    class Agent {
    protected:
        ~Agent() {} // nobody deletes an agent as one

    private:
        friend class PopMPane;
        virtual void DrawGuts(PopMPane *, OSRgn *, bool &handled);
        virtual int HandleClick(PopMPane *, EventRecordAdapter *, bool &handled); // the pane's answer
        virtual void GetCurItemName(PopMPane *, bool &handled, UString &);        // starts with an empty name
        virtual void GetCurItemMenuInfo(PopMPane *, bool &enabled, short &icon, bool &handled);
    };

    // Make a pane with a copy of the stored menu and attach it to the glog, which owns it. Null when memory
    // or glog is wanting, or there is no menu of the id. From the fields of the record, or the keys of the
    // same names; a sheet without an item fails the assertion of its pointer. These two give the number 0.
    static PopMPane *NewPopMPane(glogRec *, short id, short flags, Rect *, short menuID);
    static PopMPane *NewResPopMPane(glogRec *, popMMResRec *);
    static PopMPane *NewResPopMPane(glogRec *, GlogStyleSheet *);
    // Attaches the pane without giving it a box. Whether there is such a menu is not told. `itemInfo`: the
    // current item decides on icon and enabled look; otherwise the whole menu does.
    PopMPane(glogRec *, short id, short flags, short menuID, bool itemInfo);
    ~PopMPane() override;

    // Makes the pane as wide as the current item's name needs, in dialog text whatever its own face is, and
    // repaints it. Of the places of the arrow other than 0 it chooses the one for a menu with or without
    // text.
    virtual void ResizeToCurSel();
    virtual PopupMenuBackColor GetMenuBackgroundColor(); // as it was set

    // Only store: they show at the next drawing.
    void SetMenuBackgroundColor(PopupMenuBackColor color) { backgroundColor = color; }
    void DisplayIconOnly(bool on) { displayIconOnly = on; } // no name
    void SetPulldownLocation(PopupMenuPulldown location) { pulldownLocation = location; }
    void SetTruncation(TextSettings::TruncateCode code) { truncation = code; }
    void SetTextFace(short face) { textFace = face; } // bits as in fontSaveRec
    // The agent stays the caller's, who takes it back, with null, before it goes.
    void SetAgent(Agent *newAgent) { agent = newAgent; }
    Agent *GetAgent() const { return agent; }

    // Overridden operations of menus.
    void GetCurItemName(UString &) override;

protected:
    explicit PopMPane(bool itemInfo); // not attached
    // Attaches the pane under the number and reads its layout properties; sets the box unless the layout
    // does. The pane, or null when glog or menu is wanting.
    PopMPane *PopMPaneInit(glogRec *, short id, short flags, Rect *, short menuID);

    // Overridden operations of panes.
    int HandleClick(EventRecordAdapter *) override;
    void DrawGuts(OSRgn *updateRegion) override;

    // Overridden operations of menus.
    void InvalPane() override;
    bool OKToGetCuritemInfo() const override;
    void GetCurItemMenuInfo(bool &enabled, short &icon) override;
    Rect GetMenuRect() override;
    void AutoSetActivity() override;
    void ItemSelected(OSMenuHandle &, UString const &, short item) override;
    void MenuChanged(short item) override;

private:
    bool okToGetItemInfo;
    short textFace;
    Agent *agent;
    bool displayIconOnly;
    PopupMenuPulldown pulldownLocation;
    TextSettings::TruncateCode truncation;
    PopupMenuBackColor backgroundColor;
    OS::TextLayout textLayout; // of the name, as it was last drawn
};
