#include "desktop/layout/LayoutEngine.h"
#include "desktop/panes/Glog.h"
#include "desktop/panes/HostCall.h"
#include "desktop/panes/PaneAccess.h"
#include "host/CompoundPane.h"
#include <algorithm>

namespace {

// A pane that reports another natural size whenever it is placed must not keep the engine busy for ever.
int const kMaxRounds = 4;

short Pixels(int value) { return static_cast<short>(std::clamp(value, -32768, 32767)); }

Rect MakeRect(int left, int top, int width, int height) {
    return {Pixels(top), Pixels(left), Pixels(top + height), Pixels(left + width)};
}

int Width(Rect const &r) { return r.right - r.left; }
int Height(Rect const &r) { return r.bottom - r.top; }

// One dimension of an item, so that rows and columns are laid out by the same code.
struct Along {
    bool vertical;
    int Natural(LayoutEngine::Extent e) const { return vertical ? e.height : e.width; }
    int Before(GlogLayoutItem::Rep const &r) const { return vertical ? r.insetTop : r.insetLeft; }
    int After(GlogLayoutItem::Rep const &r) const { return vertical ? r.insetBottom : r.insetRight; }
    int Grow(GlogLayoutItem::Rep const &r) const {
        return vertical ? r.Rest().growHeight : r.Rest().growWidth;
    }
    int Minimum(GlogLayoutItem::Rep const &r) const {
        return vertical ? r.Rest().minHeight : r.Rest().minWidth;
    }
    int Room(Rect const &r) const { return vertical ? Height(r) : Width(r); }
};

} // namespace

RCPtr<GlogLayoutRectItem> LayoutEngine::MakeForPane(GlogPane *pane) {
    RCPtr<GlogLayoutRectItem> item = GlogLayout::MakeRectItem({0, 0, 0, 0}, -1, 0, "");
    Rep(*item).pane = pane;
    return item;
}

RCPtr<GlogLayoutGroup> LayoutEngine::MakeForContainer(CompoundPane *owner) {
    RCPtr<GlogLayoutGroup> group(new GlogLayoutGroup(true));
    Rep(*group).OwnRest().owner = owner;
    return group;
}

void LayoutEngine::Append(GlogLayoutGroup &group, RCPtr<GlogLayoutItem> const &item, int index) {
    for (GlogLayoutItem *outer = &group; outer; outer = Rep(*outer).Parent())
        if (outer == item.get())
            return; // a group cannot lie in itself
    TakeOut(*item);
    auto &children = Rep(group).OwnRest().children;
    auto position =
        index < 0 || index > static_cast<int>(children.size()) ? children.end() : children.begin() + index;
    children.insert(position, item);
    Rep(*item).SetParent(&group);
    Invalidate(group);
}

void LayoutEngine::TakeOut(GlogLayoutItem &item) {
    GlogLayoutItem *parent = Rep(item).Parent();
    if (!parent)
        return;
    auto &children = Rep(*parent).OwnRest().children;
    auto found = std::find_if(children.begin(), children.end(),
                              [&](RCPtr<GlogLayoutItem> const &child) { return child.get() == &item; });
    RCPtr<GlogLayoutItem> keep(&item);
    if (found != children.end())
        children.erase(found);
    Rep(item).SetParent(nullptr);
    Rep(item).hasPlace = false;
    Invalidate(*parent);
}

void LayoutEngine::PaneGone(GlogLayoutItem &item) {
    TakeOut(item);
    Rep(item).pane = nullptr;
    if (Rep(item).Rest().owner)
        Rep(item).OwnRest().owner = nullptr;
}

void LayoutEngine::Invalidate(GlogLayoutItem &item) {
    GlogLayoutItem *outermost = &item;
    while (Rep(*outermost).Parent())
        outermost = Rep(*outermost).Parent();
    if (CompoundPane *owner = Rep(*outermost).Rest().owner)
        PaneAccess::InvalidateLayout(*owner);
    else if (GlogPane *pane = Rep(*outermost).pane)
        PaneAccess::InvalidateLayout(*pane);
}

void LayoutEngine::SettleFor(GlogLayoutItem &item) {
    GlogLayoutItem *outermost = &item;
    while (Rep(*outermost).Parent())
        outermost = Rep(*outermost).Parent();
    GlogPane *pane = Rep(*outermost).pane;
    if (!pane)
        pane = Rep(*outermost).Rest().owner;
    if (pane && pane->GetGlog())
        Settle(pane->GetGlog());
}

LayoutEngine::Extent LayoutEngine::MeasureGroup(GlogLayoutItem::Rep &group) {
    Along along{group.vertical}, across{!group.vertical};
    int length = 0, breadth = 0;
    bool first = true;
    for (RCPtr<GlogLayoutItem> const &child : group.Rest().children) {
        GlogLayoutItem::Rep &rep = Rep(*child);
        if (rep.pane && !PaneAccess::OwnVisibility(*rep.pane))
            continue;
        Extent natural = Measure(*child);
        length += along.Before(rep) + along.Natural(natural) + along.After(rep) +
                  (first ? 0 : group.Rest().spacing);
        breadth = std::max(breadth, across.Before(rep) + across.Natural(natural) + across.After(rep));
        first = false;
    }
    return group.vertical ? Extent{breadth, length} : Extent{length, breadth};
}

LayoutEngine::Extent LayoutEngine::MeasurePane(GlogLayoutItem::Rep &rep) {
    Extent natural{Width(rep.made), Height(rep.made)};
    CompoundPane *compound = rep.isPart ? nullptr : dynamic_cast<CompoundPane *>(rep.pane);
    if (compound && compound->UsesLayout())
        natural = Measure(*compound->GetLayout());
    if (rep.isPart || !rep.pane)
        return natural;
    // Parts that reach beyond the pane as it was made make it larger.
    for (RCPtr<GlogLayoutRectItem> const &item : PaneAccess::Rep(*rep.pane).subItems) {
        Rect const part = PartInPane(Rep(*item), rep);
        natural.width = std::max(natural.width, part.right + Rep(*item).insetRight);
        natural.height = std::max(natural.height, part.bottom + Rep(*item).insetBottom);
    }
    return natural;
}

Rect LayoutEngine::PartInPane(GlogLayoutItem::Rep const &part, GlogLayoutItem::Rep const &pane) {
    return MakeRect(
        part.made.left - pane.made.left + part.insetLeft, part.made.top - pane.made.top + part.insetTop,
        part.width > 0 ? part.width : Width(part.made), part.height > 0 ? part.height : Height(part.made));
}

LayoutEngine::Extent LayoutEngine::Measure(GlogLayoutItem &item) {
    GlogLayoutItem::Rep &rep = Rep(item);
    Extent natural{rep.width, rep.height};
    if (rep.width <= 0 || rep.height <= 0) {
        Extent inside = rep.isGroup ? MeasureGroup(rep) : MeasurePane(rep);
        // A container's own group keeps its insets inside, since nothing lies round it.
        if (rep.isGroup && !rep.Parent()) {
            inside.width += rep.insetLeft + rep.insetRight;
            inside.height += rep.insetTop + rep.insetBottom;
        }
        natural.width = rep.width <= 0 ? inside.width : rep.width;
        natural.height = rep.height <= 0 ? inside.height : rep.height;
    }
    return {std::max<int>(natural.width, rep.Rest().minWidth),
            std::max<int>(natural.height, rep.Rest().minHeight)};
}

void LayoutEngine::Place(GlogLayoutItem &item, Rect const &place) {
    GlogLayoutItem::Rep &rep = Rep(item);
    rep.OwnRest().place = place;
    rep.hasPlace = true;
    if (rep.isGroup)
        PlaceGroup(rep);
    else if (rep.pane && !rep.isPart)
        PaneAccess::PlacedByLayout(*rep.pane);
}

void LayoutEngine::PlaceGroup(GlogLayoutItem::Rep &group) {
    Along along{group.vertical}, across{!group.vertical};
    Rect inside = group.Rest().place;
    if (!group.Parent())
        inside = {Pixels(inside.top + group.insetTop), Pixels(inside.left + group.insetLeft),
                  Pixels(inside.bottom - group.insetBottom), Pixels(inside.right - group.insetRight)};

    // Children keep themselves alive: placing one may take another out.
    std::vector<RCPtr<GlogLayoutItem>> shown;
    int shares = 0;
    Extent natural = MeasureGroup(group);
    for (RCPtr<GlogLayoutItem> const &child : group.Rest().children) {
        GlogLayoutItem::Rep &rep = Rep(*child);
        if (rep.pane && !PaneAccess::OwnVisibility(*rep.pane))
            continue;
        shown.push_back(child);
        shares += along.Grow(rep);
    }

    int left = along.Room(inside) - along.Natural(natural);
    int position = group.vertical ? inside.top : inside.left;
    int start = group.vertical ? inside.left : inside.top;
    int breadth = across.Room(inside);
    for (RCPtr<GlogLayoutItem> const &child : shown) {
        GlogLayoutItem::Rep &rep = Rep(*child);
        Extent extent = Measure(*child);
        int length = along.Natural(extent);
        if (int share = along.Grow(rep)) {
            // What is left over is dealt out item by item, so that no pixel is lost to rounding.
            int extra = left * share / shares;
            int grown = std::max({length + extra, along.Minimum(rep), 0});
            left -= grown - length;
            shares -= share;
            length = grown;
        }
        int room = breadth - across.Before(rep) - across.After(rep);
        int width = across.Natural(extent);
        if (across.Grow(rep) || rep.Rest().alignment == 3)
            width = std::max({room, across.Minimum(rep), 0});
        int side = start + across.Before(rep);
        if (rep.Rest().alignment == 1)
            side += (room - width) / 2;
        else if (rep.Rest().alignment == 2)
            side += room - width;
        position += along.Before(rep);
        Place(*child, group.vertical ? MakeRect(side, position, width, length)
                                     : MakeRect(position, side, length, width));
        position += length + along.After(rep) + group.Rest().spacing;
    }
}

void LayoutEngine::SettleContainer(CompoundPane &container) {
    RCPtr<GlogLayoutGroup> group = container.GetLayout();
    if (!container.IsInLayout() && PaneAccess::SizesToLayout(container)) {
        Extent natural = Measure(*group);
        Rect box = container.GetBounds();
        Rect sized = MakeRect(box.left, box.top, natural.width, natural.height);
        if (Width(sized) != Width(box) || Height(sized) != Height(box))
            PaneAccess::MoveTo(container, sized);
    }
    Rect box = container.GetBounds();
    Place(*group, MakeRect(0, 0, Width(box), Height(box)));
}

void LayoutEngine::SettleInside(GlogPane &pane) {
    CompoundPane *container = dynamic_cast<CompoundPane *>(&pane);
    if (!container)
        return;
    if (container->UsesLayout())
        SettleContainer(*container);
    for (short i = 0; i < container->NumSubpanes(); ++i)
        SettleInside(*container->Get(i));
}

void LayoutEngine::Settle(glogRec *record) {
    Glog &glog = Glog::From(record);
    if (!glog.layoutInvalid || glog.settlingLayout)
        return;
    // Also when a pane throws while it is placed, the next change is settled again.
    struct Settling {
        explicit Settling(Glog &glog_)
            : glog(glog_) {
            glog.settlingLayout = true;
        }
        ~Settling() { glog.settlingLayout = false; }
        Glog &glog;
    } settling(glog);
    HostCall const call;
    for (int round = 0; round < kMaxRounds && glog.layoutInvalid; ++round) {
        glog.layoutInvalid = false;
        for (std::size_t i = 0; i < glog.Items().size(); ++i)
            SettleInside(*glog.Items()[i]);
    }
    glog.layoutInvalid = false;
}
