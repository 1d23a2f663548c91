#include "host/GlogStyleSheet.h"

GlogStyleSheet::GlogStyleSheet() {}

GlogStyleSheet::GlogStyleSheet(boost::shared_ptr<XMLLib::ContainerItem> wrapped)
    : item(wrapped) {}

boost::shared_ptr<XMLLib::ContainerItem> GlogStyleSheet::GetItemRes() const { return item; }

void GlogStyleSheet::SetItemRes(boost::shared_ptr<XMLLib::ContainerItem> wrapped) { item = wrapped; }

int GlogStyleSheet::GetSInt32ItemValue(UString const &key) const {
    // Values of more than 32 bits keep the low ones, as the record fields did that these keys came from.
    return item ? static_cast<int>(item->GetSIntItemValue(key)) : 0;
}

bool GlogStyleSheet::HasSInt32ItemValue(UString const &key) const {
    return item && item->GetSInt32Item(key) != nullptr;
}

UString GlogStyleSheet::GetUStringItemValue(UString const &key) const {
    return item ? item->GetUStringItemValue(key) : UString();
}

boost::shared_ptr<XMLLib::ContainerItem> GlogStyleSheet::GetContainerItem(UString const &key) const {
    return item ? item->GetContainerItem(key) : boost::shared_ptr<XMLLib::ContainerItem>();
}
