#include "bench/BenchIcons.h"
#include "desktop/drawing/IconStore.h"
#include <stdexcept>

PixelImage BenchIcons::Image(short index, DeviceScale scale) {
    IconSet &set = IconStore::Instance().ForScale(scale);
    IconSet::Icon const icon = set.Find(kFamily, index);
    if (!icon.record || icon.record == set.Find(AtlasFormat::kMissingIconFamily, 0).record)
        throw std::runtime_error("the artwork lacks the icons of oval buttons. " +
                                 IconStore::Instance().Error());
    return set.Image(icon, scale.Edge(kWidth), scale.Edge(kHeight));
}

void BenchIcons::Compose(PixelImage const &image, pixman_image_t *target, int left, int top, int width) {
    pixman_image_composite32(image.opaque ? PIXMAN_OP_SRC : PIXMAN_OP_OVER, image.pixels, nullptr, target, 0,
                             0, 0, 0, left, top, width, image.height);
}
