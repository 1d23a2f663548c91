// The description of a glog or of one pane, as their creators read it.
#pragma once
#include "host/UString.h"
#include "host/XMLLib.h"
#include <boost/shared_ptr.hpp>

// Wraps one container. Without a container everything is absent. A glog has a sheet of its own beside those
// of its panes; its keys "GCheckGroup_LineSpacing", "GStyledString_LineSpacing", "GStyledString_TopBorder"
// and "BaselineOffset" hold for all panes.
class GlogStyleSheet {
public:
    GlogStyleSheet(); // wraps nothing
    explicit GlogStyleSheet(boost::shared_ptr<XMLLib::ContainerItem>);

    // The container; null when nothing is wrapped.
    boost::shared_ptr<XMLLib::ContainerItem> GetItemRes() const;
    // Wraps another container, or null for nothing.
    void SetItemRes(boost::shared_ptr<XMLLib::ContainerItem>);

    // The integer under the key, narrowed to 32 bits; 0 when there is none.
    int GetSInt32ItemValue(UString const &key) const;
    // Whether there is an integer under the key.
    bool HasSInt32ItemValue(UString const &key) const;
    // The string under the key; empty when there is none.
    UString GetUStringItemValue(UString const &key) const;
    // The container under the key; null when there is none.
    boost::shared_ptr<XMLLib::ContainerItem> GetContainerItem(UString const &key) const;

private:
    boost::shared_ptr<XMLLib::ContainerItem> item;
};
