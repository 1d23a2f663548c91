// The tree of items that describes a pane.
//
// An item is an integer, a string, or a container of items under keys. Keys are ASCII. A rectangle is a
// container with the integers "kTop", "kLeft", "kBottom" and "kRight". Containers with many items find a key
// without walking them.
#pragma once
#include "host/Geometry.h"
#include "host/UString.h"
#include <boost/shared_ptr.hpp>
#include <cstddef>

namespace XMLLib {

class Item { // what may stand under a key
public:
    virtual ~Item() {}
};

// An integer of 64 bits; panes narrow it to what their field holds.
class SIntItem : public Item {
public:
    explicit SIntItem(long long v)
        : value(v) {}
    long long Get() const { return value; } // all 64 bits

private:
    long long value;
};

class UStringItem : public Item { // a text
public:
    explicit UStringItem(UString const &s)
        : value(s) {}
    UString const &Get() const { return value; } // stays the item's

private:
    UString value;
};

// Items under keys, in the order in which they were added. Several may have the same key: looking it up gives
// the first of the kind that is asked for.
class ContainerItem : public Item {
public:
    explicit ContainerItem(UString const &name);
    ~ContainerItem();

    // The container under the key; null when there is none.
    boost::shared_ptr<ContainerItem> GetContainerItem(UString const &key) const;
    std::size_t GetNumItems() const;
    // The item at the index, from 0 in document order; null beyond the last.
    boost::shared_ptr<Item> GetNthItem(std::size_t) const;
    // The integer under the key; 0 when there is none.
    long long GetSIntItemValue(UString const &key) const;
    // The integer's item under the key; null when there is none.
    boost::shared_ptr<SIntItem> GetSInt32Item(UString const &key) const;
    // The string under the key; empty when there is none.
    UString GetUStringItemValue(UString const &key) const;

    void AddSIntItem(UString const &key, long long value);         // appends an integer
    void AddUStringItem(UString const &key, UString const &value); // appends a string
    // Appends an item of any kind, which is shared from now on; null has no effect.
    void AddItem(UString const &key, boost::shared_ptr<Item>);

private:
    struct Rep;
    Rep *rep;
};

// The item as what it is; null when it is of another kind, or null itself.
boost::shared_ptr<ContainerItem> ContainerFromItem(boost::shared_ptr<Item>);
boost::shared_ptr<UStringItem> UStringFromItem(boost::shared_ptr<Item>);

// A container without items.
boost::shared_ptr<ContainerItem> CreateContainer(UString const &name);

// The rectangle under the key; all zero when there is none, and 0 for an edge that is missing. Values beyond
// 16 bits become the nearest that fits. Here and below the container must not be null.
Rect GetRect(boost::shared_ptr<ContainerItem>, UString const &key);
// The point under the key; (0, 0) when there is none.
Point GetPoint(boost::shared_ptr<ContainerItem>, UString const &key);
// Writes the point under the key and answers true; false, and `out` untouched, when there is none.
bool MaybeGetPoint(boost::shared_ptr<ContainerItem>, UString const &key, Point &out);
// Appends a rectangle.
void AddRect(boost::shared_ptr<ContainerItem>, UString const &key, Rect const &);

// The user's language as a code of four characters, the first in the highest byte: 1701737843 is "enus".
unsigned int GetSystemLanguageCode();

} // namespace XMLLib
