#pragma once
#include <cstddef>
#include <boost/shared_ptr.hpp>
#include "host/Geometry.h"
#include "host/UString.h"

namespace XMLLib {

class Item {
public:
    virtual ~Item() {}
};

class SIntItem : public Item {
public:
    explicit SIntItem(long long v) : value(v) {}
    long long Get() const { return value; }
private:
    long long value;
};

class UStringItem : public Item {
public:
    explicit UStringItem(UString const &s) : value(s) {}
    UString const &Get() const { return value; }
private:
    UString value;
};

class ContainerItem : public Item {
public:
    explicit ContainerItem(UString const &name);
    ~ContainerItem();

    boost::shared_ptr<ContainerItem> GetContainerItem(UString const &key) const;
    std::size_t GetNumItems() const;
    boost::shared_ptr<Item> GetNthItem(std::size_t) const;
    long long GetSIntItemValue(UString const &key) const;
    boost::shared_ptr<SIntItem> GetSInt32Item(UString const &key) const;
    UString GetUStringItemValue(UString const &key) const;
    void AddSIntItem(UString const &key, long long value);
    void AddUStringItem(UString const &key, UString const &value);
    void AddItem(UString const &key, boost::shared_ptr<Item>);
private:
    struct Rep;
    Rep *rep;
};

boost::shared_ptr<ContainerItem> ContainerFromItem(boost::shared_ptr<Item>);
boost::shared_ptr<UStringItem> UStringFromItem(boost::shared_ptr<Item>);

boost::shared_ptr<ContainerItem> CreateContainer(UString const &name);

Rect GetRect(boost::shared_ptr<ContainerItem>, UString const &key);

Point GetPoint(boost::shared_ptr<ContainerItem>, UString const &key);

bool MaybeGetPoint(boost::shared_ptr<ContainerItem>, UString const &key, Point &out);
void AddRect(boost::shared_ptr<ContainerItem>, UString const &key, Rect const &);

unsigned int GetSystemLanguageCode();

}
