#include "host/OSMenuHandle.h"
#include "desktop/menus/MenuAccess.h"
#include "desktop/menus/MenuIds.h"
#include "desktop/menus/StoredMenus.h"
#include "desktop/resources/Resources.h"
#include <algorithm>
#include <map>
#include <vector>

// A menu with those who name it.
struct OSMenuHandle::Rep {
    explicit Rep(Menu const &menu_)
        : menu(menu_) {
        MenuIds::Instance().Add(menu.id);
    }
    // A menu that goes leaves the list of installed menus, which holds no reference.
    ~Rep() {
        auto const installed = FindInstalled([this](Installed const &one) { return one.rep == this; });
        if (installed != List().end())
            List().erase(installed);
        MenuIds::Instance().Remove(menu.id);
    }
    Rep(Rep const &) = delete;
    Rep &operator=(Rep const &) = delete;

    // An installed menu, and how often it was installed: pop-ups may share submenus and be open within each
    // other.
    struct Installed {
        Rep *rep;
        int times;
    };
    // Never destroyed: handles of a program's own may live until its very end.
    static std::vector<Installed> &List() {
        static std::vector<Installed> &list = *new std::vector<Installed>;
        return list;
    }
    template <class Test> static std::vector<Installed>::iterator FindInstalled(Test test) {
        return std::find_if(List().begin(), List().end(), test);
    }

    int references = 1;
    Menu menu;
};

namespace {

// The stored menus that somebody has asked for; made anew when the resources change.
std::map<short, OSMenuHandle> &PresentSingletons() {
    static std::map<short, OSMenuHandle> menus;
    static unsigned int generation = 0;
    if (generation != Resources::Instance().Generation()) {
        menus.clear();
        generation = Resources::Instance().Generation();
    }
    return menus;
}

} // namespace

Menu *MenuAccess::Of(OSMenuHandle const &handle) { return handle.rep ? &handle.rep->menu : nullptr; }

OSMenuHandle MenuAccess::Make(Menu const &menu) {
    OSMenuHandle made;
    made.rep = new OSMenuHandle::Rep(menu);
    return made;
}

OSMenuHandle MenuAccess::SubmenuOf(MenuItem const &item) {
    OSMenuHandle found;
    if (item.submenu != 0 && !OSMenuHandle::FindInMenuList(item.submenu, found))
        found = OSMenuHandle::GetSingletonMenu(item.submenu);
    return found;
}

OSMenuHandle::OSMenuHandle()
    : rep(nullptr) {}

OSMenuHandle::OSMenuHandle(OSMenuHandle const &other)
    : rep(other.rep) {
    if (rep)
        ++rep->references;
}

OSMenuHandle::~OSMenuHandle() { clear(); }

OSMenuHandle &OSMenuHandle::operator=(OSMenuHandle const &other) {
    if (rep == other.rep)
        return *this;
    if (other.rep)
        ++other.rep->references;
    Rep *const taken = other.rep; // which the other may be part of what goes
    clear();
    rep = taken;
    return *this;
}

bool OSMenuHandle::operator==(OSMenuHandle const &other) const { return rep == other.rep; }

// Where menus come from

OSMenuHandle OSMenuHandle::CreateNewHierarchicalMenu() {
    Menu menu;
    menu.id = MenuIds::Instance().New();
    return MenuAccess::Make(menu);
}

OSMenuHandle OSMenuHandle::CopyPrototypeMenu(short id) {
    Menu const *const stored = StoredMenus::Present().Find(id);
    return stored ? MenuAccess::Make(*stored) : OSMenuHandle();
}

OSMenuHandle OSMenuHandle::GetSingletonMenu(short id) {
    std::map<short, OSMenuHandle> &singletons = PresentSingletons();
    auto const found = singletons.find(id);
    if (found != singletons.end())
        return found->second;
    OSMenuHandle const made = CopyPrototypeMenu(id);
    if (made.IsValid())
        singletons[id] = made;
    return made;
}

bool OSMenuHandle::IsSingletonMenu(short id) { return StoredMenus::Present().Find(id) != nullptr; }

// The list of installed menus

bool OSMenuHandle::FindInMenuList(short id, OSMenuHandle &out) {
    auto const found = Rep::FindInstalled([=](Rep::Installed const &one) { return one.rep->menu.id == id; });
    if (found == Rep::List().end())
        return false;
    OSMenuHandle handle;
    handle.rep = found->rep;
    ++handle.rep->references;
    out = handle;
    return true;
}

void OSMenuHandle::InsertMenuBeforeMenuID(short id) {
    if (!rep)
        return;
    auto const own = Rep::FindInstalled([this](Rep::Installed const &one) { return one.rep == rep; });
    if (own != Rep::List().end()) {
        ++own->times;
        return;
    }
    // Submenus, which -1 asks for, stand behind all others: no menu has that number.
    auto const before = Rep::FindInstalled([=](Rep::Installed const &one) { return one.rep->menu.id == id; });
    Rep::List().insert(before, {rep, 1});
}

void OSMenuHandle::RemoveFromMenuList() {
    auto const own = Rep::FindInstalled([this](Rep::Installed const &one) { return one.rep == rep; });
    if (own != Rep::List().end() && --own->times == 0)
        Rep::List().erase(own);
}

// The menu

bool OSMenuHandle::IsValid() const { return rep != nullptr; }

void OSMenuHandle::clear() {
    Rep *const dropped = rep;
    rep = nullptr;
    if (dropped && --dropped->references == 0)
        delete dropped;
}

short OSMenuHandle::GetMenuID() const { return static_cast<short>(rep ? rep->menu.id : 0); }

void OSMenuHandle::CloneMenu(OSMenuHandle const &other) {
    OSMenuHandle const copy = other.rep ? MenuAccess::Make(other.rep->menu) : OSMenuHandle();
    *this = copy;
}

void OSMenuHandle::SetEnabled(bool on) {
    if (rep)
        rep->menu.enabled = on;
}

bool OSMenuHandle::IsEnabled() const { return rep && rep->menu.enabled; }

void OSMenuHandle::SetMenuTitle(UString const &title) {
    if (rep)
        rep->menu.title = title;
}

short OSMenuHandle::NumMenuItems() const { return static_cast<short>(rep ? rep->menu.Count() : 0); }

// Its items. Writing what an item has already changes nothing, so that a menu that is open need not be
// copied.

void OSMenuHandle::DisableItem(short item) { SetItemEnabled(item, false); }

void OSMenuHandle::SetItemEnabled(short item, bool on) {
    MenuItem const *const found = rep ? rep->menu.Find(item) : nullptr;
    if (found && found->enabled != on)
        rep->menu.Change(item)->enabled = on;
}

bool OSMenuHandle::IsItemEnabled(short item) const {
    MenuItem const *const found = rep ? rep->menu.Find(item) : nullptr;
    return found && found->enabled;
}

void OSMenuHandle::SetMenuItemText(short item, UString const &text) {
    if (MenuItem *const found = rep ? rep->menu.Change(item) : nullptr)
        found->text = text;
}

void OSMenuHandle::GetMenuItemText(short item, UString &text) const {
    MenuItem const *const found = rep ? rep->menu.Find(item) : nullptr;
    text = found ? found->text : UString();
}

void OSMenuHandle::SetMenuItemIcon(short item, short icon) {
    MenuItem const *const found = rep ? rep->menu.Find(item) : nullptr;
    if (found && found->icon != icon)
        rep->menu.Change(item)->icon = icon;
}

short OSMenuHandle::GetMenuItemIcon(short item) const {
    MenuItem const *const found = rep ? rep->menu.Find(item) : nullptr;
    return static_cast<short>(found ? found->icon : 0);
}

bool OSMenuHandle::IsMenuItemHierarchical(short item) const { return GetMenuItemHierarchicalID(item) != 0; }

void OSMenuHandle::SetMenuItemHierarchicalID(short item, short menuID) {
    MenuItem const *const found = rep ? rep->menu.Find(item) : nullptr;
    if (found && found->submenu != menuID)
        rep->menu.Change(item)->submenu = menuID;
}

short OSMenuHandle::GetMenuItemHierarchicalID(short item) const {
    MenuItem const *const found = rep ? rep->menu.Find(item) : nullptr;
    return static_cast<short>(found ? found->submenu : 0);
}

void OSMenuHandle::ApplyDecoratorToItem(short item, boost::shared_ptr<MenuItemDecorator> const &decorator) {
    if (MenuItem *const found = rep ? rep->menu.Change(item) : nullptr)
        found->decorator = decorator;
}

void OSMenuHandle::SetMenuItemCheck(short item, bool on) {
    MenuItem const *const found = rep ? rep->menu.Find(item) : nullptr;
    if (found && found->checked != on)
        rep->menu.Change(item)->checked = on;
}

void OSMenuHandle::InsertItem(short afterItem, UString const &text) {
    MenuItem item;
    item.text = text;
    if (rep)
        rep->menu.Insert(afterItem, item);
}

void OSMenuHandle::AppendItem(UString const &text, int attributes) {
    MenuItem item;
    item.text = text;
    item.attributes = attributes;
    if (rep)
        rep->menu.Append(item);
}

void OSMenuHandle::AppendItem(UString const &text) { AppendItem(text, 0); }

void OSMenuHandle::DeleteItem(short item) {
    if (rep)
        rep->menu.Delete(item);
}

void OSMenuHandle::ChangeItemAttributes(short item, int set, int clear_) {
    if (MenuItem *const found = rep ? rep->menu.Change(item) : nullptr)
        found->attributes = (found->attributes & ~clear_) | set;
}

void OSMenuHandle::InsertMenuSeparator(short afterItem) {
    if (rep)
        rep->menu.Insert(afterItem, MenuItem::Separator());
}

void OSMenuHandle::AppendMenuSeparator() {
    if (rep)
        rep->menu.Append(MenuItem::Separator());
}
