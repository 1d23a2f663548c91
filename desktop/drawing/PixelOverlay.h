// Pictures over what a window shows.
#pragma once
#include <cstdint>
#include <vector>

class Surface;

// A picture, and where its top left corner lies on a surface, in device pixels.
struct PixelOverlay {
    Surface const *picture; // not owned
    int left, top;
};

// Lays the pictures over a surface, the last one topmost, and takes them off again exactly.
class WithOverlays {
public:
    WithOverlays(Surface &, std::vector<PixelOverlay> const &);
    ~WithOverlays();
    WithOverlays(WithOverlays const &) = delete;
    WithOverlays &operator=(WithOverlays const &) = delete;

private:
    // One row of a picture on the surface, and what lies beneath it.
    struct Row {
        std::uint32_t *at;
        std::vector<std::uint32_t> beneath;
    };
    void Cover(Surface &, PixelOverlay const &);
    std::vector<Row> rows;
};
