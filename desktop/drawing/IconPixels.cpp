#include "desktop/drawing/IconPixels.h"
#include "desktop/drawing/IconStore.h"
#include <cstddef>
#include <pixman.h>

IconPixels CopyIconPixels(short family, short index, DeviceScale scale) {
    IconPixels copy;
    IconSet &set = IconStore::Instance().ForScale(scale);
    IconSet::Icon const icon = set.Find(family, index);
    if (icon.layer < 0)
        return copy;
    PixelImage const image = set.Image(icon, scale.Edge(icon.width), scale.Edge(icon.height));
    if (image.empty)
        return copy;
    copy.width = image.width;
    copy.height = image.height;
    std::size_t const count = static_cast<std::size_t>(image.width) * static_cast<std::size_t>(image.height);
    // Icons have no gaps between their rows.
    copy.pixels.assign(pixman_image_get_data(image.pixels), pixman_image_get_data(image.pixels) + count);
    return copy;
}
