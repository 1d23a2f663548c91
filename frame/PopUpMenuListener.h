// Hears of choices and changes of the current item of a pop-up menu.
#pragma once
#include "frame/Provider.h"
#include "host/OSMenuHandle.h"
#include "host/UString.h"

class PopUpMenu;

class PopUpMenuListener : public Dependent<PopUpMenuListener> {
public:
    PopUpMenuListener();
    virtual ~PopUpMenuListener();

    // Another item has become the current one, by choice or by the program. Items count from 1; 0: none is
    // current.
    virtual void ListenToMenuChange(PopUpMenu *menu, short item) = 0;
    // An item was chosen, also when it was the current one before; comes after ListenToMenuChange if there
    // was a change. For a choice from a submenu, `submenu` is that submenu, `item` one of its items, and
    // `name` its title (empty for a submenu that the pop-up did not make itself). For a choice from the menu
    // itself, `submenu` is invalid and `name` empty. Both belong to the message: valid during the call only.
    virtual void ListenToItemSelected(PopUpMenu * /*menu*/, OSMenuHandle & /*submenu*/,
                                      UString const & /*name*/, short /*item*/) {}
};

// Tells the listeners which item is current now.
class PopUpMenuChangeMsg : public DependentCastMessenger<PopUpMenuListener> {
public:
    PopUpMenuChangeMsg(PopUpMenu *sender, short newItem)
        : menu(sender)
        , item(newItem) {}
    void BroadcastChange(PopUpMenuListener *listener) override;

private:
    PopUpMenu *menu;
    short item;
};

// Tells the listeners what was chosen. Holds copies of the name and the handle: a listener may rebuild the
// menu.
class ItemSelectedMsg : public DependentCastMessenger<PopUpMenuListener> {
public:
    ItemSelectedMsg(PopUpMenu *sender, short chosenItem, UString const &submenuName,
                    OSMenuHandle const &chosenSubmenu)
        : menu(sender)
        , item(chosenItem)
        , name(submenuName)
        , submenu(chosenSubmenu) {}
    void BroadcastChange(PopUpMenuListener *listener) override {
        listener->ListenToItemSelected(menu, submenu, name, item);
    }

private:
    PopUpMenu *menu;
    short item;
    UString name;
    OSMenuHandle submenu;
};

extern template class Provider<PopUpMenuListener>;
extern template class Dependent<PopUpMenuListener>;
extern template class DependentCastMessenger<PopUpMenuListener>;
