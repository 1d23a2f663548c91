// The natural size of a pane's layout item.
#pragma once
#include "host/GlogLayout.h"
#include "host/GlogPane.h"

// Pixels. A pane that is in no glog has no item, and nothing happens.
namespace ItemSize {

inline void Set(GlogPane &pane, GlogLayoutItem::Attribute attribute, int pixels) {
    RCPtr<GlogLayoutRectItem> const item = pane.GetLayoutRect();
    if (item.get())
        item->SetAttribute(attribute, pixels, GlogLayoutItem::kPixels, UString());
}
inline void SetWidth(GlogPane &pane, int pixels) { Set(pane, GlogLayoutItem::kWidth, pixels); }
inline void SetHeight(GlogPane &pane, int pixels) { Set(pane, GlogLayoutItem::kHeight, pixels); }

} // namespace ItemSize
