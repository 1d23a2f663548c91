#include "desktop/menus/MenuAccess.h"
#include "desktop/menus/NoteDuration.h"
#include "host/DurationValue.h"
#include "host/Icons.h"
#include "host/LocalizedStrings.h"
#include "host/OSMenuHandle.h"
#include "host/VelaDrawing.h"
#include <algorithm>
#include <boost/make_shared.hpp>
#include <map>

namespace {

short const kGlyphFamily = 1821;
unsigned int const kDot = 16, kTripletMark = 17;
short const kLitGlyphs = 100; // from a glyph to the same on a highlight
short const kGlyphAdvance = 8;
std::size_t const kMostGlyphs = 2;

short const kNameList = 4400;
short const kKindNames[NoteDuration::kKindCount] = {0, 31, 32}; // of the submenus

// The note in front of its name.
class NoteGlyphs : public MenuItemDecorator {
public:
    explicit NoteGlyphs(DurationValue const &value) { DurationValueToVela12IconIDs(value, glyphs); }

    short GetWidth() const override { return static_cast<short>(kGlyphAdvance * kMostGlyphs); }
    void Draw(Rect const &r, bool highlighted, bool) override {
        Rect const size = GetIconBounds(kGlyphFamily);
        int const top = (r.top + r.bottom - size.bottom) / 2;
        for (std::size_t i = 0; i < glyphs.size(); ++i)
            Draw1Icon(kGlyphFamily, static_cast<short>(glyphs[i] + (highlighted ? kLitGlyphs : 0u)),
                      static_cast<short>(r.left + static_cast<int>(i) * kGlyphAdvance),
                      static_cast<short>(top));
    }

private:
    std::vector<unsigned int> glyphs;
};

bool Same(DurationValue const &a, DurationValue const &b) {
    return a.first == b.first && a.second == b.second;
}

UString NameOf(DurationValue const &value) {
    NoteDuration note;
    if (NoteDuration::Find(value, note))
        return note.Name();
    UString name, below;
    tarn::NumToUString(value.first, tarn::kPlainNumber, name);
    tarn::NumToUString(value.second, tarn::kPlainNumber, below);
    name += UString("/", UString::kByteEncoding1);
    name += below;
    return name;
}

// A menu of durations, and what each item of it and of its submenus stands for.
class DurationMenu {
public:
    explicit DurationMenu(DurationValue const &current_)
        : menu(OSMenuHandle::CreateNewHierarchicalMenu())
        , current(current_) {}
    ~DurationMenu() {
        for (OSMenuHandle &submenu : submenus)
            submenu.RemoveFromMenuList();
    }
    DurationMenu(DurationMenu const &) = delete;
    DurationMenu &operator=(DurationMenu const &) = delete;

    void Add(DurationValue const &value) { Add(menu, value); }
    // The plain notes, and the others in submenus.
    void AddAll() {
        AddKind(menu, NoteDuration::kPlain);
        menu.AppendMenuSeparator();
        AddSubmenu(NoteDuration::kDotted);
        AddSubmenu(NoteDuration::kTriplet);
    }
    DurationValue Run(Point where) {
        Rect place = {where.v, where.h, where.v, where.h};
        unsigned int const choice = static_cast<unsigned int>(RunPopupMenu(menu, currentItem, &place));
        auto const found = values.find(choice);
        return choice == 0 || found == values.end() ? current : found->second;
    }

private:
    void Add(OSMenuHandle &to, DurationValue const &value) {
        to.AppendItem(NameOf(value));
        short const item = to.NumMenuItems();
        unsigned int const id = static_cast<unsigned short>(to.GetMenuID());
        values[id << 16 | static_cast<unsigned int>(item)] = value;
        to.ApplyDecoratorToItem(item, boost::make_shared<NoteGlyphs>(value));
        if (!Same(value, current))
            return;
        to.SetMenuItemCheck(item, true);
        if (to == menu)
            currentItem = item;
    }
    void AddKind(OSMenuHandle &to, NoteDuration::Kind kind) {
        for (int note = 0; note < NoteDuration::kNotes; ++note)
            Add(to, NoteDuration{note, kind}.Value());
    }
    // The item of the submenu that the current duration is in opens over the place, too.
    void AddSubmenu(NoteDuration::Kind kind) {
        OSMenuHandle submenu = OSMenuHandle::CreateNewHierarchicalMenu();
        AddKind(submenu, kind);
        menu.AppendItem(LocalizedStrings::GetString(kNameList, kKindNames[kind]));
        short const item = menu.NumMenuItems();
        menu.SetMenuItemHierarchicalID(item, submenu.GetMenuID());
        submenu.InsertMenuBeforeMenuID(-1);
        submenus.push_back(submenu);
        NoteDuration note;
        if (NoteDuration::Find(current, note) && note.kind == kind && Same(note.Value(), current)) {
            menu.SetMenuItemCheck(item, true);
            currentItem = item;
        }
    }

    OSMenuHandle menu;
    std::vector<OSMenuHandle> submenus;
    std::map<unsigned int, DurationValue> values; // by menu id and item, as the choice has them
    DurationValue const current;
    short currentItem = 0;
};

} // namespace

DurationValue RunDurationMenu(Point const &where, DurationValue current, short count,
                              DurationValue const *entries) {
    DurationMenu menu(current);
    for (short i = 0; entries && i < count; ++i)
        menu.Add(entries[i]);
    if (!entries || count <= 0)
        menu.AddAll();
    return menu.Run(where);
}

void DurationValueToVela12IconIDs(DurationValue const &value, std::vector<unsigned int> &glyphs) {
    glyphs.clear();
    NoteDuration found;
    if (!NoteDuration::Find(value, found))
        return;
    glyphs.push_back(static_cast<unsigned int>(found.note));
    if (found.kind != NoteDuration::kPlain)
        glyphs.push_back(found.kind == NoteDuration::kDotted ? kDot : kTripletMark);
}
