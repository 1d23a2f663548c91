// The size that a pane wishes for in a layout.
#pragma once
#include "host/GlogLayout.h"
#include "host/GlogPane.h"

// Makes width and height, in pixels, the natural size of the pane's layout item. The pane must be attached.
inline void SetNaturalSize(GlogPane &pane, int width, int height) {
    RCPtr<GlogLayoutRectItem> const item = pane.GetLayoutRect();
    item->SetAttribute(GlogLayoutItem::kWidth, width, GlogLayoutItem::kPixels, UString());
    item->SetAttribute(GlogLayoutItem::kHeight, height, GlogLayoutItem::kPixels, UString());
}
