#include "desktop/drawing/ClipPath.h"
#include "desktop/drawing/PathDrawing.h"
#include <algorithm>
#include <cairo.h>
#include <cmath>
#include <cstddef>
#include <cstring>
#include <utility>
#include <vector>

namespace {

// One pixel each, to find out what the path covers.
class Mask {
public:
    explicit Mask(DeviceRect const &area_)
        : area(area_)
        , surface(cairo_image_surface_create(CAIRO_FORMAT_A8, area.Width(), area.Height())) {}
    ~Mask() { cairo_surface_destroy(surface); }
    Mask(Mask const &) = delete;
    Mask &operator=(Mask const &) = delete;

    void Fill(cairo_path_t const *path) {
        cairo_t *context = cairo_create(surface);
        cairo_set_antialias(context, CAIRO_ANTIALIAS_NONE);
        cairo_translate(context, -area.left, -area.top);
        cairo_append_path(context, path);
        cairo_fill(context);
        cairo_destroy(context);
        cairo_surface_flush(surface);
    }

    // The runs of filled pixels, as device boxes.
    std::vector<pixman_box32_t> Runs() const {
        std::vector<pixman_box32_t> runs;
        unsigned char const *row = cairo_image_surface_get_data(surface);
        if (!row)
            return runs;
        for (int y = area.top; y < area.bottom; ++y, row += cairo_image_surface_get_stride(surface)) {
            unsigned char const *const end = row + area.Width();
            unsigned char const *x = row;
            while ((x = std::find_if(x, end, [](unsigned char pixel) { return pixel != 0; })) != end) {
                void const *const gap = std::memchr(x, 0, static_cast<std::size_t>(end - x));
                unsigned char const *const runEnd = gap ? static_cast<unsigned char const *>(gap) : end;
                runs.push_back({area.left + static_cast<int>(x - row), y,
                                area.left + static_cast<int>(runEnd - row), y + 1});
                x = runEnd;
            }
        }
        return runs;
    }

private:
    DeviceRect area;
    cairo_surface_t *surface;
};

// A path of nothing but what the context has been given, in device coordinates.
cairo_path_t *DevicePath(OSPath const &path, int originH, int originV, double factor, DeviceRect &bounds) {
    cairo_surface_t *none = cairo_image_surface_create(CAIRO_FORMAT_A8, 1, 1);
    cairo_t *context = cairo_create(none);
    cairo_scale(context, factor, factor);
    cairo_translate(context, originH, originV);
    PathDrawing::Append(context, path);
    cairo_identity_matrix(context);
    double left, top, right, bottom;
    cairo_path_extents(context, &left, &top, &right, &bottom);
    bounds = {static_cast<int>(std::floor(left)), static_cast<int>(std::floor(top)),
              static_cast<int>(std::ceil(right)), static_cast<int>(std::ceil(bottom))};
    cairo_path_t *copy = cairo_copy_path(context);
    cairo_destroy(context);
    cairo_surface_destroy(none);
    return copy;
}

} // namespace

ClipPath::ClipPath(OSPath const &local, int originH, int originV, DeviceScale scale, int deviceWidth,
                   int deviceHeight, std::shared_ptr<ClipPath const> outer_)
    : outer(std::move(outer_)) {
    DeviceRect bounds = {0, 0, 0, 0};
    path.reset(DevicePath(local, originH, originV, scale.Factor(), bounds));
    bounds = bounds.Intersected({0, 0, deviceWidth, deviceHeight});
    if (bounds.Empty()) {
        pixman_region32_init(&pixels);
        return;
    }
    Mask mask(bounds);
    mask.Fill(path.get());
    std::vector<pixman_box32_t> runs = mask.Runs();
    pixman_region32_init_rects(&pixels, runs.data(), static_cast<int>(runs.size()));
    if (outer)
        pixman_region32_intersect(&pixels, &pixels, const_cast<pixman_region32_t *>(outer->Pixels()));
}

ClipPath::~ClipPath() { pixman_region32_fini(&pixels); }

void ClipPath::DestroyPath::operator()(cairo_path *path) const { cairo_path_destroy(path); }

void ClipPath::Narrow(cairo_t *context) const {
    if (outer)
        outer->Narrow(context);
    cairo_new_path(context);
    cairo_append_path(context, path.get());
    cairo_clip(context);
}
