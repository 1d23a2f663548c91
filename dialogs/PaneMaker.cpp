#include "dialogs/PaneMaker.h"
#include "dialogs/CommonKeys.h"
#include "dialogs/Dialog.h"
#include "dialogs/GrowingPanes.h"
#include "dialogs/ItemType.h"
#include "dialogs/KeyFault.h"
#include "host/CompoundPane.h"
#include "host/GlogStyleSheet.h"
#include "host/TarnError.h"
#include <new>

namespace {} // namespace

void PaneMaker::Guard(PlaceOfKey const &placeOf, std::function<void()> const &make) {
    try {
        make();
    } catch (LoadError const &) {
        throw;
    } catch (KeyFault const &fault) {
        throw LoadError(placeOf(fault.Key(), fault.Pane()), fault.what());
    } catch (TarnError const &) {
        throw LoadError(placeOf("", nullptr), "a part that the pane needs is missing, or memory has run out");
    } catch (std::bad_alloc const &) {
        throw LoadError(placeOf("", nullptr), "memory has run out");
    } catch (std::exception const &error) {
        throw LoadError(placeOf("", nullptr), error.what());
    }
}

LoadError::Place PaneMaker::PlaceOf(GlogPane const *pane, std::string const &key,
                                    LoadError::Place const &other) const {
    auto const found = made.find(pane);
    return found == made.end() ? other : found->second->PlaceOf(key);
}

GlogPane *PaneMaker::Make(DialogItem const &item) {
    GrowingPanes growing(glog);
    GlogPane *pane = nullptr;
    Guard([&](std::string const &key, GlogPane const *) { return item.PlaceOf(key); },
          [&] { made[pane = MakeAlone(item)] = &item; });
    MakeInside(pane, item);
    if (item.type->reporter)
        Guard([&](std::string const &, GlogPane const *) { return item.place; },
              [&] { item.type->reporter(pane); });
    growing.Keep();
    return pane;
}

GlogPane *PaneMaker::MakeAlone(DialogItem const &item) {
    GlogStyleSheet sheet(item.keys);
    GlogPane *const pane = item.type->maker(glog, &sheet);
    if (!pane)
        throw LoadError(item.place, "the pane cannot be made");
    if (item.id)
        pane->SetID(item.id);
    CommonKeys::Apply(pane, *item.type, &sheet);
    return pane;
}

void PaneMaker::MakeInside(GlogPane *pane, DialogItem const &item) {
    if (item.items.empty())
        return;
    CompoundPane *const container = dynamic_cast<CompoundPane *>(pane);
    if (!container)
        throw LoadError(item.place, "panes of this type hold no items");
    for (DialogItem const &inner : item.items)
        GrowingPanes::MoveInto(*container, Make(inner));
}
