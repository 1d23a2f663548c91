#pragma once
#include <boost/shared_ptr.hpp>
#include "host/UString.h"
#include "host/XMLLib.h"

class GlogStyleSheet {
public:
    GlogStyleSheet();
    explicit GlogStyleSheet(boost::shared_ptr<XMLLib::ContainerItem>);
    boost::shared_ptr<XMLLib::ContainerItem> GetItemRes() const;
    void SetItemRes(boost::shared_ptr<XMLLib::ContainerItem>);
    int GetSInt32ItemValue(UString const &key) const;
    bool HasSInt32ItemValue(UString const &key) const;
    UString GetUStringItemValue(UString const &key) const;
    boost::shared_ptr<XMLLib::ContainerItem> GetContainerItem(UString const &key) const;
private:
    boost::shared_ptr<XMLLib::ContainerItem> item;
};
