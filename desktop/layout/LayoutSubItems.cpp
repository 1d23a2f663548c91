// The layout items of a pane's parts.
#include "desktop/layout/LayoutEngine.h"
#include "desktop/panes/PaneRep.h"
#include "host/GlogPane.h"
#include "host/VelaDrawing.h"

void GlogPane::OffsetLayoutSubItems(Point delta) {
    for (RCPtr<GlogLayoutRectItem> const &part : rep->subItems)
        VelaDrawing::OffsetRect(&LayoutEngine::Rep(*part).made, delta.h, delta.v);
}
