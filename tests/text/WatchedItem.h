// A pane's layout item that writes down what it is told.
#pragma once
#include "desktop/panes/PaneAccess.h"
#include "host/GlogLayout.h"
#include <ostream>
#include <vector>

class WatchedItem : public GlogLayoutRectItem {
public:
    struct Told {
        int attribute, value, type;
        bool emptyText;
        bool operator==(Told const &b) const {
            return attribute == b.attribute && value == b.value && type == b.type && emptyText == b.emptyText;
        }
    };
    typedef std::vector<Told> Tolds;

    // Puts a new one in the place of the pane's own.
    static WatchedItem &PutInto(GlogPane &pane) {
        WatchedItem *const item = new WatchedItem;
        PaneAccess::Rep(pane).layoutItem = RCPtr<GlogLayoutRectItem>(item);
        return *item;
    }
    void SetAttribute(Attribute attribute, int value, CoordinateType type, UString const &text) override {
        told.push_back({attribute, value, type, text.empty()});
        GlogLayoutRectItem::SetAttribute(attribute, value, type, text);
    }
    Tolds told;
};

inline std::ostream &operator<<(std::ostream &out, WatchedItem::Told const &told) {
    return out << "attribute " << told.attribute << " = " << told.value << " of type " << told.type;
}

// What layout items know natural sizes by.
int const kNaturalWidth = 3, kNaturalHeight = 4, kInPixels = 1;
