// The way from a handle to what it names.
#pragma once
#include "desktop/menus/Menu.h"
#include "host/OSMenuHandle.h"

struct MenuAccess {
    // Null for an invalid handle. Valid as long as some handle names the menu.
    static Menu *Of(OSMenuHandle const &);
    // A new menu that holds this, with one handle to it.
    static OSMenuHandle Make(Menu const &);
    // The menu that the item opens: the installed one of its id, else the stored one. Invalid when there is
    // none.
    static OSMenuHandle SubmenuOf(MenuItem const &);
};
