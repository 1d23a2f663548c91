#include "menus/PopMPane.h"
#include "frame/ResourceReading.h"
#include "host/GlogStyleSheet.h"
#include "host/OSFont.h"
#include "host/PaneWatch.h"
#include "host/PortSavers.h"
#include "host/VelaDrawing.h"
#include "host/glogRec.h"
#include <algorithm>
#include <limits>
#include <memory>
#include <new>

namespace {

// How style sheets tell the layout properties of pop-up menus from those of other panes.
int const kLayoutPaneType = 43;

short const kNoNumber = 0;
short const kLeastNormalWidth = 25; // pixels; in less than these there is only room for a narrow arrow
short const kBackGray = 100;        // percent
int const kRoomBesideName = 32;     // pixels
int const kNameFont = 0;            // of the font table
short const kPlainFace = 0;

// The last three arguments of the drawing of closed pop-ups.
int const kOneLine = 0, kUpright = 0, kUsualLook = 2;

} // namespace

PopMPane *CheckedStaticCastToPopMPane(GlogPane *pane) { return static_cast<PopMPane *>(pane); }

// Procedures

static void SelectMenuItem(PopMPane *pane, int item) { pane->SelectItem(static_cast<short>(item)); }
static short GetSelectedMenuItem(PopMPane *pane) { return pane->GetSelectedItem(); }
static short CountMenuItems(PopMPane *pane) { return pane->CountItems(); }
static bool MenuItemIsEnabled(PopMPane *pane, int item) {
    return pane->ItemIsEnabled(static_cast<short>(item));
}
static void EnableWholeMenu(PopMPane *pane, bool on) { pane->EnableMenu(on); }
static void DeleteMenuItem(PopMPane *pane, int item) { pane->DeleteItem(static_cast<short>(item)); }
static void DeleteAllMenuItems(PopMPane *pane) { pane->DeleteAllItems(); }

void (*PMSelectItem)(PopMPane *, int) = SelectMenuItem;
short (*PMGetSelItem)(PopMPane *) = GetSelectedMenuItem;
short (*PMCountMItems)(PopMPane *) = CountMenuItems;
bool (*PMItemIsEnabled)(PopMPane *, int) = MenuItemIsEnabled;
void (*PMMenuEnable)(PopMPane *, bool) = EnableWholeMenu;
void (*PMDeleteMenuItem)(PopMPane *, int) = DeleteMenuItem;
void (*PMDeleteAllItems)(PopMPane *) = DeleteAllMenuItems;

// Agents

void PopMPane::Agent::DrawGuts(PopMPane *, OSRgn *, bool &handled) { handled = false; }

int PopMPane::Agent::HandleClick(PopMPane *, EventRecordAdapter *, bool &handled) {
    handled = false;
    return 0;
}

void PopMPane::Agent::GetCurItemName(PopMPane *, bool &handled, UString &name) {
    handled = false;
    name.clear();
}

void PopMPane::Agent::GetCurItemMenuInfo(PopMPane *, bool &, short &, bool &handled) { handled = false; }

// Construction

PopMPane::PopMPane(bool itemInfo)
    : PopUpMenu(true, true)
    , okToGetItemInfo(itemInfo)
    , textFace(kPlainFace)
    , agent(nullptr)
    , displayIconOnly(false)
    , pulldownLocation(kPulldownNormal)
    , truncation(TextSettings::kTruncateMiddle)
    , backgroundColor(kPopupBackDefault) {}

PopMPane::PopMPane(glogRec *owner, short id, short flags, short menuID, bool itemInfo)
    : PopMPane(itemInfo) {
    if (!GlogPaneInit(owner, id))
        return;
    GetLayoutRect()->ReadLayoutProperties(kLayoutPaneType, owner->GetStyleSheet());
    InitializeMenu(flags, menuID);
}

PopMPane::~PopMPane() {}

PopMPane *PopMPane::NewPopMPane(glogRec *owner, short id, short flags, Rect *bounds, short menuID) {
    std::unique_ptr<PopMPane> pane(new (std::nothrow) PopMPane(true));
    if (!pane || !pane->PopMPaneInit(owner, id, flags, bounds, menuID))
        return nullptr;
    return pane.release();
}

PopMPane *PopMPane::NewResPopMPane(glogRec *owner, popMMResRec *resource) {
    return NewPopMPane(owner, kNoNumber, resource->flags, &resource->bounds, resource->menuID);
}

PopMPane *PopMPane::NewResPopMPane(glogRec *owner, GlogStyleSheet *sheet) {
    Rect bounds = OptionalRect(sheet->GetItemRes(), "BoundsRect");
    short const flags = static_cast<short>(sheet->GetSInt32ItemValue(ResourceKey("Flags")));
    short const menuID = static_cast<short>(sheet->GetSInt32ItemValue(ResourceKey("MenuID")));
    return NewPopMPane(owner, kNoNumber, flags, &bounds, menuID);
}

PopMPane *PopMPane::PopMPaneInit(glogRec *owner, short id, short flags, Rect *bounds, short menuID) {
    if (!GlogPaneInit(owner, id))
        return nullptr;
    GetLayoutRect()->ReadLayoutProperties(kLayoutPaneType, owner->GetStyleSheet());
    if (!IsInLayout())
        SetBox(bounds);
    InitializeMenu(flags, menuID);
    return GetMenuHandle().IsValid() ? this : nullptr;
}

// Size

void PopMPane::ResizeToCurSel() {
    UString name;
    GetCurItemName(name);
    InvalPane(); // where the pane has been
    int width = 0;
    {
        SaveTextState const text;
        SetFontData(GetIndVelaFont(kNameFont));
        VelaDrawing::TextFace(kPlainFace);
        width = LooseStringWidth(name, 0.0f, 1.0f) + kRoomBesideName;
    }
    Rect box;
    GetBox(&box);
    box.right = static_cast<short>(std::min<int>(box.left + width, std::numeric_limits<short>::max()));
    if (!IsInLayout())
        SetBox(&box);
    if (GetGlog())
        GetLayoutRect()->SetAttribute(GlogLayoutItem::kWidth, width, GlogLayoutItem::kPixels, UString());
    if (pulldownLocation != kPulldown0)
        pulldownLocation = name.empty() ? kPulldownNoText : kPulldownNormal;
    InvalPane();
}

PopupMenuBackColor PopMPane::GetMenuBackgroundColor() { return backgroundColor; }

// Drawing

void PopMPane::DrawGuts(OSRgn *updateRegion) {
    if (agent) {
        bool handled = false;
        agent->DrawGuts(this, updateRegion, handled);
        if (handled)
            return;
    }
    if (!GetMenuHandle().IsValid())
        return;
    SaveColors const colors;
    GrayBackColor(kBackGray);
    UString name;
    if (!displayIconOnly)
        GetCurItemName(name);
    bool enabled = false;
    short icon = 0;
    GetCurItemMenuInfo(enabled, icon);
    Rect const r = GetDrawRectangle();
    PopupMenuPulldown pulldown = pulldownLocation;
    if (pulldown == kPulldownNormal && r.right - r.left < kLeastNormalWidth)
        pulldown = kPulldownNarrow;
    DrawPopupMenuWithTextLayout(textLayout, r, name, icon, enabled, textFace, nullptr,
                                GetMenuBackgroundColor(), pulldown, truncation, TextSettings::kAlignLeft,
                                kOneLine, kUpright, kUsualLook);
}

// Clicks

int PopMPane::HandleClick(EventRecordAdapter *event) {
    if (agent) {
        bool handled = false;
        PaneWatch const watch(this);
        int const result = agent->HandleClick(this, event, handled);
        if (handled || !watch.PaneExists())
            return result;
    }
    Prepare();
    return DoMenu();
}

// The menu

void PopMPane::GetCurItemName(UString &name) {
    if (agent) {
        bool handled = false;
        agent->GetCurItemName(this, handled, name);
        if (handled)
            return;
    }
    PopUpMenu::GetCurItemName(name);
}

void PopMPane::GetCurItemMenuInfo(bool &enabled, short &icon) {
    if (agent) {
        bool handled = false;
        agent->GetCurItemMenuInfo(this, enabled, icon, handled);
        if (handled)
            return;
    }
    PopUpMenu::GetCurItemMenuInfo(enabled, icon);
}

void PopMPane::InvalPane() { Inval(); }

bool PopMPane::OKToGetCuritemInfo() const { return okToGetItemInfo; }

// The menu opens a pixel inwards of the upper left corner; the other corner stays.
Rect PopMPane::GetMenuRect() {
    Rect r = GetDrawRectangle();
    r.top = static_cast<short>(r.top + 1);
    r.left = static_cast<short>(r.left + 1);
    return r;
}

void PopMPane::AutoSetActivity() {
    if (!Provider<AutoSetActivityListener>::HasDependents())
        return;
    AutoSetActivityMsg message(this);
    Provider<AutoSetActivityListener>::BroadcastChange(message, nullptr);
}

void PopMPane::ItemSelected(OSMenuHandle &submenu, UString const &name, short item) {
    if (!Provider<PopUpMenuListener>::HasDependents())
        return;
    ItemSelectedMsg message(this, item, name, submenu);
    Provider<PopUpMenuListener>::BroadcastChange(message, nullptr);
}

void PopMPane::MenuChanged(short item) {
    if (!Provider<PopUpMenuListener>::HasDependents())
        return;
    PopUpMenuChangeMsg message(this, item);
    Provider<PopUpMenuListener>::BroadcastChange(message, nullptr);
}
