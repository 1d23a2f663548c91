// The natural size of a pane's layout item.
#pragma once
#include "host/GlogLayout.h"
#include "host/GlogPane.h"

// Pixels. A pane that is in no glog has no item, and nothing happens.
namespace ItemSize {

// Sets one attribute of the item.
inline void Set(GlogPane &pane, GlogLayoutItem::Attribute attribute, int pixels) {
    RCPtr<GlogLayoutRectItem> const item = pane.GetLayoutRect();
    if (item.get())
        item->SetAttribute(attribute, pixels, GlogLayoutItem::kPixels, UString());
}

// The natural width.
inline void SetWidth(GlogPane &pane, int pixels) { Set(pane, GlogLayoutItem::kWidth, pixels); }
// The natural height.
inline void SetHeight(GlogPane &pane, int pixels) { Set(pane, GlogLayoutItem::kHeight, pixels); }

} // namespace ItemSize
