#include "desktop/drawing/Surface.h"
#include "desktop/drawing/FreshMemory.h"
#include <algorithm>
#include <array>
#include <cairo.h>
#include <cerrno>
#include <cstring>
#include <cwchar>
#include <fstream>
#include <pixman.h>

namespace {

constexpr std::uint32_t kOpaqueBlack = 0xFF000000u;
constexpr std::uint32_t kAlphaMask = 0xFF000000u;
constexpr std::uint32_t kLongestPngSide = 8192;

// The beginning of every PNG file: signature, length and name of the first chunk, then width and height.
constexpr std::array<unsigned char, 16> kPngStart = {0x89, 'P', 'N', 'G', '\r', '\n', 0x1A, '\n',
                                                     0,    0,   0,   13,  'I',  'H',  'D',  'R'};
constexpr std::size_t kPngSizeBytes = 8;

std::size_t PixelCount(int width, int height) {
    return static_cast<std::size_t>(width) * static_cast<std::size_t>(height);
}

std::vector<std::uint32_t> NewPixels(int width, int height) {
    std::size_t const count = PixelCount(width, height);
    std::vector<std::uint32_t> pixels;
    pixels.reserve(count);
    FreshMemory::GetPages(pixels.data(), count * sizeof(std::uint32_t));
    pixels.assign(count, kOpaqueBlack);
    return pixels;
}

pixman_image_t *NewImage(std::uint32_t *pixels, int width, int height) {
    pixman_image_t *image = pixman_image_create_bits_no_clear(
        PIXMAN_a8r8g8b8, width, height, pixels, width * static_cast<int>(sizeof(std::uint32_t)));
    if (!image)
        throw std::bad_alloc();
    return image;
}

// Of so few pixels a row is done before a function of the C library has begun: frames, scroll bars, carets.
constexpr int kNarrow = 16;

// The C library fills wide characters as fast as the machine can, and a pixel is as large as one.
static_assert(sizeof(wchar_t) == sizeof(std::uint32_t), "a pixel and a wide character have the same size");
void FillRow(std::uint32_t *row, int width, std::uint32_t pixel) {
    std::wmemset(reinterpret_cast<wchar_t *>(row), static_cast<wchar_t>(pixel),
                 static_cast<std::size_t>(width));
}

// Each row by two blocks of as many pixels, which may overlap.
template <int kBlock>
void FillByBlocks(std::uint32_t *row, int stride, DeviceRect const &r, std::uint32_t pixel) {
    std::array<std::uint32_t, kBlock> block;
    block.fill(pixel);
    int const second = r.Width() - kBlock;
    for (int y = r.top; y < r.bottom; ++y, row += stride) {
        std::memcpy(row, block.data(), sizeof block);
        std::memcpy(row + second, block.data(), sizeof block);
    }
}

struct CairoSurfaceFree {
    void operator()(cairo_surface_t *surface) const { cairo_surface_destroy(surface); }
};
typedef std::unique_ptr<cairo_surface_t, CairoSurfaceFree> CairoSurfaceHolder;

std::uint32_t BigEndian(unsigned char const *bytes) {
    return static_cast<std::uint32_t>(bytes[0]) << 24 | static_cast<std::uint32_t>(bytes[1]) << 16 |
           static_cast<std::uint32_t>(bytes[2]) << 8 | bytes[3];
}

// Looks at the file's first bytes alone: a small file may claim a size that would take gigabytes to decode.
bool PngSizeIsSane(std::string const &path, std::string &error) {
    std::ifstream file(path, std::ios::binary);
    if (!file) {
        error = path + ": cannot be opened";
        return false;
    }
    std::array<unsigned char, kPngStart.size() + kPngSizeBytes> start = {};
    file.read(reinterpret_cast<char *>(start.data()), static_cast<std::streamsize>(start.size()));
    if (!file || !std::equal(kPngStart.begin(), kPngStart.end(), start.begin())) {
        error = path + ": not a PNG file";
        return false;
    }
    std::uint32_t width = BigEndian(start.data() + kPngStart.size());
    std::uint32_t height = BigEndian(start.data() + kPngStart.size() + 4);
    if (width == 0 || height == 0 || width > kLongestPngSide || height > kLongestPngSide) {
        error = path + ": a picture of " + std::to_string(width) + " x " + std::to_string(height) +
                " pixels; each side may have 1 to " + std::to_string(kLongestPngSide);
        return false;
    }
    return true;
}

} // namespace

Surface::Surface(int width_, int height_)
    : width(std::max(width_, 1))
    , height(std::max(height_, 1))
    , pixels(NewPixels(width, height))
    , memory{pixels.data(), width}
    , image(NewImage(pixels.data(), width, height))
    , cairo(nullptr) {}

Surface::Surface(Surface const &whole, std::uint32_t *pixels_)
    : width(whole.width)
    , height(whole.height)
    , memory{pixels_, width}
    , image(NewImage(pixels_, width, height))
    , cairo(nullptr) {}

// Of the rows that the place of the first one tells, only those of the part are in the memory.
std::unique_ptr<Surface> Surface::PartOf(DeviceRect const &part) {
    if (!ring.IsTurned())
        return nullptr;
    std::optional<int> const shift = ring.Shift(part);
    if (!shift) {
        Settle();
        return nullptr;
    }
    std::uintptr_t const first = reinterpret_cast<std::uintptr_t>(pixels.data());
    std::ptrdiff_t const bytes =
        static_cast<std::ptrdiff_t>(*shift) * width * static_cast<std::ptrdiff_t>(sizeof(std::uint32_t));
    return std::unique_ptr<Surface>(
        new Surface(*this, reinterpret_cast<std::uint32_t *>(first + static_cast<std::uintptr_t>(bytes))));
}

Surface::~Surface() {
    if (cairo) {
        cairo_surface_finish(cairo); // a context that outlives this object must not reach the pixels any more
        cairo_surface_destroy(cairo);
    }
    pixman_image_unref(image);
}

cairo_surface_t *Surface::CairoSurface() {
    Settle();
    if (!cairo)
        cairo = cairo_image_surface_create_for_data(reinterpret_cast<unsigned char *>(memory.pixels),
                                                    CAIRO_FORMAT_ARGB32, width, height,
                                                    width * static_cast<int>(sizeof(std::uint32_t)));
    return cairo;
}

void Surface::Fill(DeviceRect const &r, std::uint32_t pixel) {
    int const kBlock = kNarrow / 2;
    std::uint32_t *row = Row(r.top) + r.left;
    if (r.Width() > kNarrow)
        for (int y = r.top; y < r.bottom; ++y, row += width)
            FillRow(row, r.Width(), pixel);
    else if (r.Width() >= kBlock)
        FillByBlocks<kBlock>(row, width, r, pixel);
    else if (r.Width() >= kBlock / 2)
        FillByBlocks<kBlock / 2>(row, width, r, pixel);
    else if (r.Width() == 1) // the sides of every frame
        for (int y = r.top; y < r.bottom; ++y, row += width)
            *row = pixel;
    else
        for (int y = r.top; y < r.bottom; ++y, row += width)
            for (int i = 0; i < r.Width(); ++i)
                row[i] = pixel;
}

// What a cover of that much lets through of two components, which stand in the lower halves of the word's
// halves; rounded as pixman does it. The result stands in the upper ones.
static std::uint32_t LetThrough(std::uint32_t components, std::uint32_t through) {
    std::uint32_t const kLower = 0x00FF00FF, kHalves = 0x00800080;
    std::uint32_t const products = components * through + kHalves;
    return (products + (products >> 8 & kLower)) & ~kLower;
}

void Surface::Blend(DeviceRect const &r, std::uint32_t pixel) {
    std::uint32_t const kOdd = 0x00FF00FF;
    std::uint32_t const through = 0xFF - (pixel >> 24);
    std::uint32_t *row = Row(r.top) + r.left;
    for (int y = r.top; y < r.bottom; ++y, row += width)
        for (int x = 0; x < r.Width(); ++x)
            row[x] =
                pixel + (LetThrough(row[x] & kOdd, through) >> 8 | LetThrough(row[x] >> 8 & kOdd, through));
}

bool Surface::IsOpaque() const {
    return std::all_of(pixels.begin(), pixels.end(),
                       [](std::uint32_t pixel) { return (pixel & kAlphaMask) == kAlphaMask; });
}

DeviceRect Surface::OpaquePart() const {
    auto const isOpaque = [this](int x, int y) { return (Row(y)[x] & kAlphaMask) == kAlphaMask; };
    DeviceRect part = {width, height, 0, 0};
    for (int y = 0; y < height; ++y)
        for (int x = 0; x < width; ++x)
            if (isOpaque(x, y))
                part = {std::min(part.left, x), std::min(part.top, y), std::max(part.right, x + 1),
                        std::max(part.bottom, y + 1)};
    for (int y = 0; y < height; ++y)
        for (int x = 0; x < width; ++x) {
            bool const inside = x >= part.left && x < part.right && y >= part.top && y < part.bottom;
            if (inside ? !isOpaque(x, y) : Row(y)[x] != 0)
                return {0, 0, 0, 0};
        }
    return part;
}

bool Surface::WritePng(std::string const &path, std::string &error) const {
    // Cairo only reads from the surface while it writes the file.
    unsigned char *data = reinterpret_cast<unsigned char *>(const_cast<std::uint32_t *>(Pixels()));
    CairoSurfaceHolder view(
        cairo_image_surface_create_for_data(data, IsOpaque() ? CAIRO_FORMAT_RGB24 : CAIRO_FORMAT_ARGB32,
                                            width, height, width * static_cast<int>(sizeof(std::uint32_t))));
    errno = 0;
    cairo_status_t status = cairo_surface_write_to_png(view.get(), path.c_str());
    if (status != CAIRO_STATUS_SUCCESS)
        error = path + ": " + (errno ? std::strerror(errno) : cairo_status_to_string(status));
    return status == CAIRO_STATUS_SUCCESS;
}

std::unique_ptr<Surface> Surface::ReadPng(std::string const &path, std::string &error) {
    if (!PngSizeIsSane(path, error))
        return nullptr;
    CairoSurfaceHolder read(cairo_image_surface_create_from_png(path.c_str()));
    cairo_status_t status = cairo_surface_status(read.get());
    if (status != CAIRO_STATUS_SUCCESS) {
        error = path + ": " + cairo_status_to_string(status);
        return nullptr;
    }
    cairo_format_t format = cairo_image_surface_get_format(read.get());
    if (format != CAIRO_FORMAT_ARGB32 && format != CAIRO_FORMAT_RGB24) {
        error = path + ": a kind of PNG file that is not supported";
        return nullptr;
    }
    cairo_surface_flush(read.get());
    std::unique_ptr<Surface> surface(
        new Surface(cairo_image_surface_get_width(read.get()), cairo_image_surface_get_height(read.get())));
    unsigned char const *from = cairo_image_surface_get_data(read.get());
    std::uint32_t const missingAlpha = format == CAIRO_FORMAT_RGB24 ? kAlphaMask : 0;
    for (int y = 0; y < surface->Height(); ++y, from += cairo_image_surface_get_stride(read.get())) {
        std::uint32_t *row = surface->Row(y);
        std::memcpy(row, from, static_cast<std::size_t>(surface->Width()) * sizeof *row);
        for (int x = 0; x < surface->Width(); ++x)
            row[x] |= missingAlpha;
    }
    return surface;
}
