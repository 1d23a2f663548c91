#include "dialogs/ItemType.h"
#include <utility>

ItemType &ItemType::Keys(KeyList const &keys_) {
    keys = keys_;
    return *this;
}

ItemType &ItemType::MadeBy(Maker maker_) {
    maker = std::move(maker_);
    return *this;
}

ItemType &ItemType::FromRecord(int kind, int kindMask, RecordMaker maker_) {
    recordKind = kind;
    recordKindMask = kindMask;
    recordMaker = std::move(maker_);
    return *this;
}

ItemType &ItemType::ReportedBy(Reporter reporter_) {
    reporter = std::move(reporter_);
    return *this;
}

ItemType &ItemType::LayoutType(int paneType) {
    layoutType = paneType;
    return *this;
}

ItemType &ItemType::HoldsItems() {
    holdsItems = true;
    return *this;
}
