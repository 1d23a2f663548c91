#include "host/XMLLib.h"
#include "desktop/resources/ContainerIndex.h"
#include "desktop/resources/ItemKeys.h"
#include "desktop/resources/Resources.h"
#include "desktop/resources/Utf.h"
#include <algorithm>
#include <boost/make_shared.hpp>
#include <iterator>
#include <limits>
#include <utility>
#include <vector>

namespace XMLLib {

struct ContainerItem::Rep {
    std::vector<boost::shared_ptr<Item>> items;
    ContainerIndex index;

    void Add(UString const &key, ItemKind kind, boost::shared_ptr<Item> const &item) {
        index.Add(Utf::View(key), kind);
        items.push_back(item);
    }

    // The first child of that key and kind; null when there is none.
    Item *Find(UString const &key, ItemKind kind) const {
        std::size_t const place = index.Find(Utf::View(key), kind);
        return place == ContainerIndex::kNotFound ? nullptr : items[place].get();
    }
    template <class Kind> boost::shared_ptr<Kind> FindShared(UString const &key, ItemKind kind) const {
        std::size_t const place = index.Find(Utf::View(key), kind);
        if (place == ContainerIndex::kNotFound)
            return boost::shared_ptr<Kind>();
        return boost::static_pointer_cast<Kind>(items[place]);
    }
};

namespace {

ItemKind KindOf(Item const *item) {
    if (dynamic_cast<SIntItem const *>(item))
        return ItemKind::kInteger;
    if (dynamic_cast<UStringItem const *>(item))
        return ItemKind::kString;
    return dynamic_cast<ContainerItem const *>(item) ? ItemKind::kContainer : ItemKind::kOther;
}

UString Key(char const *ascii) { return UString(ascii, UString::kByteEncoding1); }

// Places beyond the coordinate plane go to its edge.
short ToCoordinate(long long value) {
    typedef std::numeric_limits<short> Limits;
    return static_cast<short>(std::clamp<long long>(value, Limits::min(), Limits::max()));
}

short GetCoordinate(ContainerItem const &container, char const *key) {
    return ToCoordinate(container.GetSIntItemValue(Key(key)));
}

} // namespace

// The name serves the reader of the code that builds the tree; children are found by the key they were added
// under.
ContainerItem::ContainerItem(UString const &)
    : rep(new Rep) {}

// Takes deep trees apart in a loop: a container within a container ten thousand times over would else use up
// the stack. A destructor must do without memory, so the way back is kept in the tree: while the list of a
// container is being emptied, the container holds the list that it stood in itself, and its place there is
// taken by the container around that.
ContainerItem::~ContainerItem() {
    std::vector<boost::shared_ptr<Item>> list = std::move(rep->items);
    delete rep;
    boost::shared_ptr<Item> around; // the container whose list is being emptied; null for this one
    while (!list.empty() || around) {
        if (list.empty()) {
            list.swap(static_cast<ContainerItem &>(*around).rep->items);
            around = std::move(list.back());
            list.pop_back();
            continue;
        }
        ContainerItem *const inner =
            list.back().use_count() == 1 ? dynamic_cast<ContainerItem *>(list.back().get()) : nullptr;
        if (!inner || inner->rep->items.empty()) {
            list.pop_back();
            continue;
        }
        around.swap(list.back());
        list.swap(inner->rep->items);
    }
}

boost::shared_ptr<ContainerItem> ContainerItem::GetContainerItem(UString const &key) const {
    return rep->FindShared<ContainerItem>(key, ItemKind::kContainer);
}

std::size_t ContainerItem::GetNumItems() const { return rep->items.size(); }

boost::shared_ptr<Item> ContainerItem::GetNthItem(std::size_t place) const {
    return place < rep->items.size() ? rep->items[place] : boost::shared_ptr<Item>();
}

long long ContainerItem::GetSIntItemValue(UString const &key) const {
    Item const *item = rep->Find(key, ItemKind::kInteger);
    return item ? static_cast<SIntItem const *>(item)->Get() : 0;
}

boost::shared_ptr<SIntItem> ContainerItem::GetSInt32Item(UString const &key) const {
    return rep->FindShared<SIntItem>(key, ItemKind::kInteger);
}

UString ContainerItem::GetUStringItemValue(UString const &key) const {
    Item const *item = rep->Find(key, ItemKind::kString);
    return item ? static_cast<UStringItem const *>(item)->Get() : UString();
}

void ContainerItem::AddSIntItem(UString const &key, long long value) {
    rep->Add(key, ItemKind::kInteger, boost::make_shared<SIntItem>(value));
}

void ContainerItem::AddUStringItem(UString const &key, UString const &value) {
    rep->Add(key, ItemKind::kString, boost::make_shared<UStringItem>(value));
}

void ContainerItem::AddItem(UString const &key, boost::shared_ptr<Item> item) {
    if (item)
        rep->Add(key, KindOf(item.get()), item);
}

boost::shared_ptr<ContainerItem> ContainerFromItem(boost::shared_ptr<Item> item) {
    return boost::dynamic_pointer_cast<ContainerItem>(item);
}

boost::shared_ptr<UStringItem> UStringFromItem(boost::shared_ptr<Item> item) {
    return boost::dynamic_pointer_cast<UStringItem>(item);
}

boost::shared_ptr<ContainerItem> CreateContainer(UString const &name) {
    return boost::make_shared<ContainerItem>(name);
}

Rect GetRect(boost::shared_ptr<ContainerItem> container, UString const &key) {
    boost::shared_ptr<ContainerItem> const rect = container->GetContainerItem(key);
    if (!rect)
        return Rect{0, 0, 0, 0};
    return Rect{GetCoordinate(*rect, kRectTopKey), GetCoordinate(*rect, kRectLeftKey),
                GetCoordinate(*rect, kRectBottomKey), GetCoordinate(*rect, kRectRightKey)};
}

Point GetPoint(boost::shared_ptr<ContainerItem> container, UString const &key) {
    Point point = {0, 0};
    MaybeGetPoint(container, key, point);
    return point;
}

bool MaybeGetPoint(boost::shared_ptr<ContainerItem> container, UString const &key, Point &out) {
    boost::shared_ptr<ContainerItem> const point = container->GetContainerItem(key);
    if (!point)
        return false;
    out = Point{GetCoordinate(*point, kPointVKey), GetCoordinate(*point, kPointHKey)};
    return true;
}

void AddRect(boost::shared_ptr<ContainerItem> container, UString const &key, Rect const &rect) {
    boost::shared_ptr<ContainerItem> const item = CreateContainer(key);
    item->AddSIntItem(Key(kRectTopKey), rect.top);
    item->AddSIntItem(Key(kRectLeftKey), rect.left);
    item->AddSIntItem(Key(kRectBottomKey), rect.bottom);
    item->AddSIntItem(Key(kRectRightKey), rect.right);
    container->AddItem(key, item);
}

unsigned int GetSystemLanguageCode() { return Resources::Instance().LanguageCode(); }

} // namespace XMLLib
