// Finds the panes of a dialog for a program.
#pragma once
#include "dialogs/LoadError.h"
#include "host/GlogPane.h"
#include <typeinfo>

struct glogRec;

// What FindItem needs for any class.
namespace ItemSearch {

// The pane of the number; null when there is none.
GlogPane *PaneOf(glogRec *, int id);
// Throws the LoadError about the number, which the pane, or none for null, has.
[[noreturn]] void Refuse(glogRec *, int id, GlogPane *, std::type_info const &wanted);

} // namespace ItemSearch

// The pane of the item, which is the glog's. Never null: throws LoadError, naming the dialog's file, when no
// item has the number or its pane is none of that class. Goes by numbers only, unlike GetGlogItem.
template <class Pane> Pane *FindItem(glogRec *glog, int id) {
    GlogPane *const item = ItemSearch::PaneOf(glog, id);
    Pane *const pane = dynamic_cast<Pane *>(item);
    if (!pane)
        ItemSearch::Refuse(glog, id, item, typeid(Pane));
    return pane;
}
