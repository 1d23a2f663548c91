// A window's pixels, on which integer drawing and curves both work.
#pragma once
#include "desktop/drawing/DeviceScale.h"
#include "desktop/drawing/RowRing.h"
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
    std::uint32_t *Pixels() { return Row(0); }
    std::uint32_t const *Pixels() const { return Row(0); }
    std::uint32_t *Row(int y) {
        Settle();
        return memory.Row(y);
    }
    std::uint32_t const *Row(int y) const {
        Settle();
        return memory.Row(y);
    }

    // Whether Scroll may be used: whoever shows the pixels then should look at them by RowsOf.
    bool Scrolls() const { return scrolls; }
    void AllowScrolling(bool allow) { scrolls = allow; }
    // Moves what the box shows by less than half its height, down if the distance is positive. The rows that
    // nothing moves into keep their pixels. The pixels stay where they are until one of the other operations
    // asks for them.
    void Scroll(DeviceRect const &box, int distance) { ring.Turn(memory, box, distance); }
    // The rows of a part, of which only the part's columns may be looked at: without what has scrolled being
    // moved. Until somebody changes the pixels.
    class Rows {
    public:
        std::uint32_t const *operator[](int y) const { return memory.Row(ring ? ring->Place(y) : y); }

    private:
        friend class Surface;
        Rows(RowRing::Memory const &memory_, RowRing const *ring_)
            : memory(memory_)
            , ring(ring_) {}
        RowRing::Memory memory;
        RowRing const *ring; // null where rows stand as they are shown
    };
    Rows RowsOf(DeviceRect const &part) const {
        if (!ring.HasWholeRows(part))
            Settle();
        return Rows(memory, ring.IsTurned() && !part.Intersected(ring.Box()).Empty() ? &ring : nullptr);
    }
    // The same pixels, to draw on the part alone: without what has scrolled being moved. Null where this
    // surface does as well. Must not be used any more when this one's pixels have been asked for.
    std::unique_ptr<Surface> PartOf(DeviceRect const &part);

    // The rectangle must lie within.
    void Fill(DeviceRect const &, std::uint32_t pixel);
    // The same with a premultiplied colour that lets through what is beneath. Meant for narrow rectangles.
    void Blend(DeviceRect const &, std::uint32_t pixel);

    pixman_image_t *PixmanImage() const {
        Settle();
        return image;
    }
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
    Surface(Surface const &, std::uint32_t *pixels); // somebody else's
    void Settle() const {
        if (ring.IsTurned())
            ring.Settle(memory);
    }

    int width, height;
    std::vector<std::uint32_t> pixels;
    RowRing::Memory memory;
    mutable RowRing ring; // where a row stands is nobody's business
    bool scrolls = false;
    pixman_image_t *image;
    cairo_surface_t *cairo;
};
