#pragma once
#include <cairo.h>
#include <cstdint>
#include <filesystem>
#include <memory>
#include <vector>

// A drawn picture: premultiplied 0xAARRGGBB, row after row without gaps.
class RenderedImage {
public:
    using Surface = std::unique_ptr<cairo_surface_t, void (*)(cairo_surface_t *)>;

    // Transparent; sizes in device pixels.
    RenderedImage(int width, int height);

    int Width() const { return width; }
    int Height() const { return height; }
    std::vector<std::uint32_t> const &Pixels() const { return pixels; }
    bool IsOpaque() const; // every pixel has full alpha
    bool IsEmpty() const;  // no pixel has any alpha

    // The image for drawing to and from. It draws into the image's own memory, so the image must outlive it.
    Surface MakeSurface();
    // Throws ArtworkError when the file cannot be written.
    void WritePng(std::filesystem::path const &);

private:
    int width;
    int height;
    std::vector<std::uint32_t> pixels;
};
