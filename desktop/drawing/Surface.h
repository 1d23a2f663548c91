// A window's pixels, on which integer drawing and curves both work.
#pragma once
#include "desktop/drawing/DeviceScale.h"
#include <cstddef>
#include <cstdint>
#include <memory>
#include <string>
#include <vector>

typedef union pixman_image pixman_image_t;
typedef struct _cairo_surface cairo_surface_t; // NOLINT(bugprone-reserved-identifier): Cairo's own name

// Device pixels, 0xAARRGGBB premultiplied, rows from top to bottom without gaps. One block of memory that
// pixman and Cairo share.
class Surface {
public:
    // Sizes below 1 are taken as 1. The pixels start opaque black.
    Surface(int width, int height);
    ~Surface();
    Surface(Surface const &) = delete;
    Surface &operator=(Surface const &) = delete;

    int Width() const { return width; }
    int Height() const { return height; }
    std::uint32_t *Pixels() { return pixels.data(); }
    std::uint32_t const *Pixels() const { return pixels.data(); }
    std::uint32_t *Row(int y) {
        return pixels.data() + static_cast<std::size_t>(y) * static_cast<std::size_t>(width);
    }
    std::uint32_t const *Row(int y) const {
        return pixels.data() + static_cast<std::size_t>(y) * static_cast<std::size_t>(width);
    }

    // The rectangle must lie within.
    void Fill(DeviceRect const &, std::uint32_t pixel);

    pixman_image_t *PixmanImage() const { return image; }
    // Made at the first call: a window without text or curves needs none.
    cairo_surface_t *CairoSurface();

    // Whether every pixel has full alpha; looks at all of them.
    bool IsOpaque() const;
    // The rectangle of opaque pixels that has nothing but clear ones round it; empty when the pixels are
    // otherwise.
    DeviceRect OpaquePart() const;

    // Writes a PNG file; false, with the reason in `error`, when it cannot be written.
    bool WritePng(std::string const &path, std::string &error) const;
    // Reads a PNG file; null, with the reason in `error`, for a broken file or one of more than 8192 pixels a
    // side. The size is checked before anything is decoded.
    static std::unique_ptr<Surface> ReadPng(std::string const &path, std::string &error);

private:
    int width, height;
    std::vector<std::uint32_t> pixels;
    pixman_image_t *image;
    cairo_surface_t *cairo;
};
