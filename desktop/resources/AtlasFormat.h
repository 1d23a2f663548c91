#pragma once
#include <cstddef>
#include <cstdint>

// The layout of an icon atlas: every icon of one theme at one scale, as premultiplied pixels that are drawn
// straight from the mapped file. The artwork compiler writes it, the resource loader reads it, and both know
// it from here alone. An atlas is in the byte order of the machine that it was built for.
//
//   Header | FamilyRecord[familyCount] | IconRecord[iconCount] | padding | pixel blocks, each 64-byte aligned
//
// Pixels are 32 bits each, 0xAARRGGBB with the colours multiplied by alpha; the rows of a block follow each
// other without a gap, so the stride of a block is its width times four.
namespace AtlasFormat {

constexpr char kMagic[8] = {'G', 'L', 'O', 'G', 'A', 'T', 'L', '1'};
constexpr std::uint32_t kVersion = 1;
// As the writing machine sees it; a reader that sees another value has the wrong byte order.
constexpr std::uint32_t kByteOrderMark = 0x01020304;
constexpr std::size_t kPixelAlignment = 64;
constexpr int kBytesPerPixel = 4;
// Longest side of an icon in logical pixels.
constexpr int kMaxIconSide = 512;
// The family whose one icon, index 0, stands for every icon that has not been drawn.
constexpr std::int16_t kMissingIconFamily = 0;

struct Header {
    char magic[8];
    std::uint32_t version;
    std::uint32_t byteOrder;
    std::uint32_t scaleThousandths; // 1500 for a scale of 1.5
    std::uint32_t familyCount;
    std::uint32_t iconCount;   // all families together
    std::uint32_t familyTable; // byte offset from the start of the file, like the two below
    std::uint32_t iconTable;
    std::uint32_t pixels;      // the first block; a multiple of kPixelAlignment
    std::uint32_t fileSize;    // whole file, to tell a file that was cut short
    std::uint32_t reserved[5]; // zero
};

// Sorted by number, each number once. The icons of a family stand together in the icon table.
struct FamilyRecord {
    std::int16_t number;
    std::uint16_t width;     // logical pixels: the size that GetIconBounds gives. Single icons of
    std::uint16_t height;    // the family may be of another size
    std::uint16_t reserved;  // zero
    std::uint32_t firstIcon; // place in the icon table
    std::uint32_t iconCount;
};

enum ImageFlags : std::uint16_t {
    kImageOpaque = 1, // every pixel has full alpha: a plain copy draws it
    kImageEmpty = 2   // no pixel has any alpha: nothing to draw
};

struct ImageRecord {
    std::uint32_t offset; // bytes from the start of the file; a multiple of kPixelAlignment
    std::uint16_t width;  // device pixels
    std::uint16_t height;
    std::uint16_t flags;
    std::uint16_t reserved; // zero
};

// At a scale with a fraction an icon covers one more or one less device pixel, depending on where it is
// placed, because both of its edges are rounded. So each icon is drawn at both widths and both heights, and
// the one that fits is copied without stretching. At other scales, or where the size comes out whole, the
// four records name fewer blocks, down to one and the same.
enum ImageChoice { kWiderImage = 1, kTallerImage = 2, kImageChoices = 4 };

// Sorted by index within the family, each index once.
struct IconRecord {
    std::int16_t index;
    std::uint16_t width; // logical pixels
    std::uint16_t height;
    std::uint16_t reserved; // zero
    // [0] floor(width * scale) by floor(height * scale); kWiderImage and kTallerImage, added, select the one
    // with that side rounded up instead.
    ImageRecord images[kImageChoices];
};

static_assert(sizeof(Header) == 64, "the header is 64 bytes on every machine");
static_assert(sizeof(FamilyRecord) == 16, "a family is 16 bytes on every machine");
static_assert(sizeof(ImageRecord) == 12, "an image is 12 bytes on every machine");
static_assert(sizeof(IconRecord) == 56, "an icon is 56 bytes on every machine");
static_assert(alignof(Header) <= 8 && alignof(FamilyRecord) <= 8 && alignof(IconRecord) <= 8,
              "the tables can be read where the file is mapped");

} // namespace AtlasFormat
