#include "host/GlogLayout.h"
#include "desktop/layout/LayoutEngine.h"
#include "desktop/panes/Glog.h"
#include "desktop/panes/PaneAccess.h"
#include "desktop/resources/Utf.h"
#include "host/GlogPane.h"
#include "host/GlogStyleSheet.h"
#include <algorithm>
#include <boost/pool/pool.hpp>
#include <cstddef>
#include <new>

namespace {

// The keys of an item's "Layout" container, and the attribute that each sets.
struct LayoutKey {
    char const *key;
    GlogLayoutItem::Attribute attribute;
};
LayoutKey const kLayoutKeys[] = {
    {"InsetTop", GlogLayoutItem::kInsetTop},
    {"InsetLeft", GlogLayoutItem::kInsetLeft},
    {"InsetBottom", GlogLayoutItem::kInsetBottom},
    {"InsetRight", GlogLayoutItem::kInsetRight},
    {"Width", GlogLayoutItem::kWidth},
    {"Height", GlogLayoutItem::kHeight},
    {"GrowWidth", GlogLayoutItem::kGrowWidth},
    {"GrowHeight", GlogLayoutItem::kGrowHeight},
    {"Alignment", GlogLayoutItem::kAlignment},
    {"MinWidth", GlogLayoutItem::kMinWidth},
    {"MinHeight", GlogLayoutItem::kMinHeight},
};

// Parts beyond it share its number.
int const kLastIndex = (1 << 26) - 1;

UString Key(char const *ascii) { return UString(ascii, UString::ByteEncoding(1)); }

// From the top left of the outer rectangle to its coordinates.
Rect MovedTo(Rect const &inner, Rect const &outer) {
    return {static_cast<short>(outer.top + inner.top), static_cast<short>(outer.left + inner.left),
            static_cast<short>(outer.top + inner.bottom), static_cast<short>(outer.left + inner.right)};
}

Rect SettledPlace(GlogLayoutItem::Rep const &item) { return item.hasPlace ? item.Rest().place : item.made; }

// A pane with thousands of parts asks all of them when it looks for the one that was clicked. So whatever is
// known here is read without a call.
Rect PlaceOfPart(GlogLayoutItem::Rep const &part) {
    glogRec *const glog = PaneAccess::GlogOf(*part.pane);
    if (glog && Glog::From(glog).layoutInvalid)
        LayoutEngine::Settle(glog);
    CompoundPane const *const container = PaneAccess::Container(*part.pane);
    if (!container || !container->UsesLayout())
        return SettledPlace(part);
    GlogLayoutItem::Rep const &pane = LayoutEngine::Rep(*PaneAccess::Rep(*part.pane).layoutItem);
    return MovedTo(LayoutEngine::PartInPane(part, pane), SettledPlace(pane)); // it moves with its pane
}

short *FieldOf(GlogLayoutItem::Attribute attribute, GlogLayoutItem::Rep &rep) {
    switch (attribute) {
    case GlogLayoutItem::kInsetTop:
        return &rep.insetTop;
    case GlogLayoutItem::kInsetLeft:
        return &rep.insetLeft;
    case GlogLayoutItem::kInsetBottom:
        return &rep.insetBottom;
    case GlogLayoutItem::kInsetRight:
        return &rep.insetRight;
    case GlogLayoutItem::kWidth:
        return &rep.width;
    case GlogLayoutItem::kHeight:
        return &rep.height;
    case GlogLayoutItem::kGrowWidth:
        return &rep.OwnRest().growWidth;
    case GlogLayoutItem::kGrowHeight:
        return &rep.OwnRest().growHeight;
    case GlogLayoutItem::kAlignment:
        return &rep.OwnRest().alignment;
    case GlogLayoutItem::kMinWidth:
        return &rep.OwnRest().minWidth;
    case GlogLayoutItem::kMinHeight:
        return &rep.OwnRest().minHeight;
    case GlogLayoutItem::kSpacing:
        return &rep.OwnRest().spacing;
    case GlogLayoutItem::kDirection:
        break; // a word, see SetAttributeFromString
    }
    return nullptr;
}

// A pane may have thousands of parts, which are made one after the other and lie close together.
class RectItem final : public GlogLayoutRectItem {
public:
    static void *operator new(std::size_t) {
        if (void *const block = Blocks().malloc())
            return block;
        throw std::bad_alloc();
    }
    static void operator delete(void *block) { Blocks().free(block); }

private:
    // At a time; a pool would otherwise make twice as many each time, and touches all of them.
    static std::size_t const kFirstBlocks = 32, kMostBlocks = 256;

    // Never destroyed: panes of static lifetime go after everything else.
    static boost::pool<> &Blocks() {
        static auto *const blocks = new boost::pool<>(sizeof(RectItem), kFirstBlocks, kMostBlocks);
        return *blocks;
    }
};

} // namespace

GlogLayoutItem::Rep::Further const &GlogLayoutItem::Rep::Unsaid() {
    static Further const unsaid;
    return unsaid;
}

GlogLayoutItem::GlogLayoutItem() {
    static_assert(sizeof(rep) == sizeof(Rep) && alignof(Rep) <= alignof(void *), "the room is a Rep's");
    new (rep) Rep;
}

GlogLayoutItem::~GlogLayoutItem() {
    Rep &own = LayoutEngine::Rep(*this);
    for (RCPtr<GlogLayoutItem> const &child : own.Rest().children)
        LayoutEngine::Rep(*child).SetParent(nullptr);
    own.~Rep();
}

void GlogLayoutItem::SetAttribute(Attribute attribute, int value, CoordinateType, UString const &) {
    short *field = FieldOf(attribute, LayoutEngine::Rep(*this));
    short bounded = static_cast<short>(std::clamp(value, -32768, 32767));
    if (!field || *field == bounded)
        return;
    if ((attribute == kGrowWidth || attribute == kGrowHeight) && bounded < 0)
        bounded = 0;
    *field = bounded;
    LayoutEngine::Invalidate(*this);
}

void GlogLayoutItem::SetAttributeFromString(Attribute attribute, UString const &word) {
    if (attribute != kDirection)
        return;
    bool vertical = !(word == Key("horiz"));
    Rep &own = LayoutEngine::Rep(*this);
    if (vertical == own.vertical)
        return;
    own.vertical = vertical;
    LayoutEngine::Invalidate(*this);
}

Rect GlogLayoutItem::GetBorderRect() {
    Rep const &own = LayoutEngine::Rep(*this);
    if (own.isPart && own.pane)
        return PlaceOfPart(own);
    LayoutEngine::SettleFor(*this);
    return SettledPlace(own);
}

char const *GlogLayoutItem::GetName() const { return LayoutEngine::Rep(*this).Rest().name.c_str(); }

Rect GlogLayoutRectItem::GetItemRect() {
    Rect border = GetBorderRect();
    GlogLayoutItem::Rep const &own = LayoutEngine::Rep(*this);
    return own.hasInner ? MovedTo(own.Inner(), border) : border;
}

void GlogLayoutRectItem::ReadLayoutProperties(int, GlogStyleSheet *sheet) {
    if (!sheet || !sheet->GetItemRes())
        return;
    static UString const layoutKey = Key("Layout"); // asked for every pane
    boost::shared_ptr<XMLLib::ContainerItem> layout = sheet->GetContainerItem(layoutKey);
    if (!layout)
        return;
    for (LayoutKey const &known : kLayoutKeys)
        if (layout->GetSInt32Item(Key(known.key)))
            SetAttribute(
                known.attribute,
                static_cast<int>(std::clamp(layout->GetSIntItemValue(Key(known.key)), -32768LL, 32767LL)),
                kPixels, UString());
}

GlogLayoutGroup::GlogLayoutGroup(bool vertical) {
    LayoutEngine::Rep(*this).isGroup = true;
    LayoutEngine::Rep(*this).vertical = vertical;
}

void GlogLayoutGroup::MoveItem(RCPtr<GlogLayoutItem> const &item, int index) {
    if (item.get() && item.get() != this)
        LayoutEngine::Append(*this, item, index);
}

void GlogLayoutGroup::ReplaceItem(RCPtr<GlogLayoutItem> const &old, RCPtr<GlogLayoutItem> const &item) {
    RCPtr<GlogLayoutItem> const replaced = old, added = item; // the parameters may be the very entries
    if (!replaced.get() || LayoutEngine::Rep(*replaced).Parent() != this || added.get() == replaced.get())
        return;
    if (added.get())
        LayoutEngine::TakeOut(*added);
    auto const &children = LayoutEngine::Rep(*this).Rest().children;
    std::size_t index = 0;
    while (children[index].get() != replaced.get())
        ++index;
    LayoutEngine::TakeOut(*replaced);
    if (added.get())
        LayoutEngine::Append(*this, added, static_cast<int>(index));
}

RCPtr<GlogLayoutItem> GlogLayoutGroup::FindItemByID(int id) {
    for (RCPtr<GlogLayoutItem> const &child : LayoutEngine::Rep(*this).Rest().children) {
        GlogLayoutItem::Rep const &rep = LayoutEngine::Rep(*child);
        if (rep.Rest().id == id || (rep.pane && !rep.isPart && rep.pane->GetID() == id))
            return child;
        if (GlogLayoutGroup *group = dynamic_cast<GlogLayoutGroup *>(child.get())) {
            RCPtr<GlogLayoutItem> found = group->FindItemByID(id);
            if (found.get())
                return found;
        }
    }
    return RCPtr<GlogLayoutItem>();
}

RCPtr<GlogLayoutItem> GlogLayoutGroup::FindItemByName(char const *name) {
    for (RCPtr<GlogLayoutItem> const &child : LayoutEngine::Rep(*this).Rest().children) {
        if (LayoutEngine::Rep(*child).Rest().name == name)
            return child;
        if (GlogLayoutGroup *group = dynamic_cast<GlogLayoutGroup *>(child.get())) {
            RCPtr<GlogLayoutItem> found = group->FindItemByName(name);
            if (found.get())
                return found;
        }
    }
    return RCPtr<GlogLayoutItem>();
}

GlogStyleSheet *GlogLayoutGroup::GetStyleSheet() const { return LayoutEngine::Rep(*this).Rest().styleSheet; }

void GlogLayoutGroup::SetStyleSheet(GlogStyleSheet *sheet) {
    LayoutEngine::Rep(*this).OwnRest().styleSheet = sheet;
}

RCPtr<GlogLayoutRectItem> GlogLayout::MakeRectItem(Rect place, int id, int index, char const *name) {
    RCPtr<GlogLayoutRectItem> item(new RectItem);
    GlogLayoutItem::Rep &rep = LayoutEngine::Rep(*item);
    rep.made = place;
    rep.index = std::clamp(index, 0, kLastIndex);
    if (id != rep.Rest().id)
        rep.OwnRest().id = id;
    if (name && *name)
        rep.OwnRest().name = name;
    return item;
}

RCPtr<GlogLayoutRectItem> GlogLayout::MakeRectItem(Rect inner, Rect outer, int id, int index,
                                                   char const *name) {
    RCPtr<GlogLayoutRectItem> item = MakeRectItem(outer, id, index, name);
    LayoutEngine::Rep(*item).SetInner(inner);
    return item;
}

WithPerformLayoutRectUpdate::WithPerformLayoutRectUpdate(GlogPane *pane_)
    : pane(pane_) {
    if (pane->GetGlog())
        LayoutEngine::Settle(pane->GetGlog());
}

WithPerformLayoutRectUpdate::~WithPerformLayoutRectUpdate() {
    if (pane->GetGlog())
        LayoutEngine::Settle(pane->GetGlog());
}
