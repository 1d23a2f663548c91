#include "dialogs/SpacerPane.h"
#include <memory>
#include <new>

SpacerPane *SpacerPane::NewSpacerPane(glogRec *owner) {
    std::unique_ptr<SpacerPane> pane(new (std::nothrow) SpacerPane);
    if (!pane || !pane->GlogPaneInit(owner, 0))
        return nullptr;
    return pane.release();
}
