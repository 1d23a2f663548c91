#include "dialogs/FindItem.h"
#include "desktop/observe/MessageTrace.h"
#include "desktop/panes/Glog.h"

GlogPane *ItemSearch::PaneOf(glogRec *glog, int id) {
    GlogPane *const pane = GetGlogItem(glog, static_cast<short>(id));
    return pane && pane->GetID() == id ? pane : nullptr;
}

void ItemSearch::Refuse(glogRec *glog, int id, GlogPane *pane, std::type_info const &wanted) {
    std::string const name = MessageTrace::ClassName(wanted);
    LoadError::Place place;
    place.file = Glog::From(glog).Source();
    place.item = "item " + std::to_string(id);
    if (!pane)
        throw LoadError(place, "the program looks for this " + name + ", and there is no such item");
    place.item += " (" + MessageTrace::ClassName(*pane) + ')';
    throw LoadError(place, "the program looks for a " + name + " here");
}
