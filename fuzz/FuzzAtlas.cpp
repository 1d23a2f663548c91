// Icon atlases.
#include "desktop/drawing/IconSet.h"
#include "desktop/resources/Atlas.h"
#include "fuzz/support/Entry.h"
#include "fuzz/support/MemoryFile.h"
#include "fuzz/support/Require.h"
#include "tests/drawing/Canvas.h"
#include <cstring>
#include <stdexcept>

using namespace AtlasFormat;

namespace {

int const kCanvasSide = 64;
int const kOddWidth = 3, kOddHeight = 5; // of an icon that has to be scaled

template <class Record> Record RecordAt(std::uint8_t const *data, std::size_t offset) {
    Record record;
    std::memcpy(&record, data + offset, sizeof record);
    return record;
}

// Reads all of the pixels: those that lay outside of the mapped file would end the process.
void DrawBothWays(PixelScope &pixels, IconSet &set, IconSet::Icon const &icon, DeviceScale scale) {
    int const width = scale.Edge(icon.width), height = scale.Edge(icon.height);
    if (width > 0 && height > 0)
        pixels.DrawImage(set.Image(icon, width, height), 0, 0, {0, 0, width, height}, true);
    pixels.DrawImage(set.Image(icon, kOddWidth, kOddHeight), 0, 0, {0, 0, kOddWidth, kOddHeight}, true);
}

// Every icon that the file's own tables name has to be found and drawn.
void DrawAll(std::string const &path, std::uint8_t const *data) {
    Header const header = RecordAt<Header>(data, 0);
    IconSet set({path});
    Canvas canvas(kCanvasSide, kCanvasSide, header.scaleThousandths / 1000.0);
    PixelScope pixels(canvas.port);
    for (std::uint32_t f = 0; f < header.familyCount; ++f) {
        FamilyRecord const family =
            RecordAt<FamilyRecord>(data, header.familyTable + f * sizeof(FamilyRecord));
        for (std::uint32_t i = 0; i < family.iconCount; ++i) {
            IconRecord const record =
                RecordAt<IconRecord>(data, header.iconTable + (family.firstIcon + i) * sizeof(IconRecord));
            IconSet::Icon const icon = set.Find(family.number, record.index);
            Require(icon.layer == 0 && icon.record && icon.record->index == record.index,
                    "every icon of the file is found");
            DrawBothWays(pixels, set, icon, canvas.scale);
        }
    }
}

bool IsAccepted(std::string const &path) {
    try {
        Atlas const atlas(path);
        return true;
    } catch (std::runtime_error const &error) {
        Require(std::string(error.what()).find(path) == 0, "an error begins with the file's name");
        return false;
    }
}

} // namespace

int LLVMFuzzerTestOneInput(std::uint8_t const *data, std::size_t size) {
    MemoryFile const file(data, size);
    if (IsAccepted(file.Path()))
        DrawAll(file.Path(), data);
    return 0;
}
