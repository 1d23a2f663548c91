#include "host/DragRect.h"
#include "desktop/drawing/WholePixels.h"
#include "desktop/panes/Glog.h"
#include "desktop/panes/HostCall.h"
#include "desktop/panes/PaneAccess.h"
#include "host/CompoundPane.h"
#include "host/Services.h"
#include "host/VelaDrawing.h"
#include <algorithm>

namespace {

Rect Moved(Rect const &r, Point by) {
    return {SaturatedPixel(r.top + by.v), SaturatedPixel(r.left + by.h), SaturatedPixel(r.bottom + by.v),
            SaturatedPixel(r.right + by.h)};
}

// Where everything is, in whole pixels of the pane's coordinates.
struct Bounds {
    Rect outline;
    Point start;
    Rect limit, slop;
    DragRegionTypes::Constraint constraint;

    // How far the outline has been moved when the mouse is at the place.
    Point OffsetAt(Point mouse) const {
        if (!VelaDrawing::PtInRect(mouse, &slop))
            return {0, 0};
        bool const vertical = constraint != DragRegionTypes::kHorizontalOnly;
        bool const horizontal = constraint != DragRegionTypes::kVerticalOnly;
        return {vertical ? Held(mouse.v, start.v, limit.top, limit.bottom) : short(0),
                horizontal ? Held(mouse.h, start.h, limit.left, limit.right) : short(0)};
    }

private:
    // A start beyond the limit can be returned to.
    static short Held(int mouse, int start, int low, int high) {
        return SaturatedPixel(std::clamp(mouse, std::min(low, start), std::max(high - 1, start)) - start);
    }
};

// The outline on its pane's window; goes in whatever way the drag ends.
class DraggedOutline {
public:
    DraggedOutline(GlogPane &pane_, Bounds const &bounds_)
        : pane(pane_)
        , bounds(bounds_)
        , layer(Glog::From(pane_.GetGlog()).OutlineShown()) {}
    ~DraggedOutline() { layer.Hide(); }
    DraggedOutline(DraggedOutline const &) = delete;
    DraggedOutline &operator=(DraggedOutline const &) = delete;

    void MoveTo(Point mouse) {
        Point const origin = PaneAccess::Origin(pane);
        CompoundPane *const container = PaneAccess::Container(pane);
        Rect clip =
            container ? PaneAccess::VisiblePart(*container) : Glog::From(pane.GetGlog()).Port().Extent();
        Rect const limit = Moved(bounds.limit, origin);
        VelaDrawing::SectRect(&clip, &limit, &clip);
        layer.Show({Moved(Moved(bounds.outline, bounds.OffsetAt(mouse)), origin), clip});
    }

private:
    GlogPane &pane;
    Bounds const &bounds;
    OutlineLayer &layer;
};

bool NextPlace(bool passes, Point &mouse) {
    return passes ? MouseIsDraggingWithTimeout(MouseTask::DefaultAutoScrollTime(), &mouse, nullptr, nullptr)
                  : MouseIsDragging(&mouse, nullptr);
}

} // namespace

DragRegionTypes::Result DragRect(GlogPane *pane, OS::RectBase<OS::RectTag> const &rect,
                                 OS::Point const &start, OS::RectBase<OS::RectTag> const &limit,
                                 OS::RectBase<OS::RectTag> const &slop,
                                 DragRegionTypes::Constraint constraint, DragRegionUpdater *updater) {
    DragRegionTypes::Result const notMoved = {false, 0, 0};
    if (!pane || !pane->GetGlog())
        return notMoved;
    HostCall const call; // the window outlives the drag
    PaneWatch const watch(pane);
    Bounds const bounds = {WholeRect(rect),
                           {WholePixel(start.y), WholePixel(start.x)},
                           WholeRect(limit),
                           WholeRect(slop),
                           constraint};
    DraggedOutline outline(*pane, bounds);
    Point mouse = bounds.start;
    for (;;) {
        outline.MoveTo(mouse);
        pane->Prepare();
        bool const down = NextPlace(updater != nullptr, mouse);
        if (!watch.PaneExists() || !pane->GetGlog())
            return notMoved;
        if (!down)
            break;
        if (updater)
            updater->UpdateDragRegion();
        if (!watch.PaneExists() || !pane->GetGlog())
            return notMoved;
    }
    pane->Prepare();
    Point const offset = bounds.OffsetAt(mouse);
    return {offset.h != 0 || offset.v != 0, double(offset.h), double(offset.v)};
}
