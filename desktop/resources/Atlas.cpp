#include "desktop/resources/Atlas.h"
#include <algorithm>
#include <cstring>
#include <fcntl.h>
#include <stdexcept>
#include <sys/mman.h>
#include <sys/stat.h>
#include <unistd.h>

using namespace AtlasFormat;

namespace {

constexpr std::uint32_t kLeastScale = 500, kGreatestScale = 4000;
constexpr int kThousand = 1000;

[[noreturn]] void Fail(std::string const &path, std::string const &what) {
    throw std::runtime_error(path + ": " + what);
}

class MappedFile {
public:
    explicit MappedFile(std::string const &path) {
        int const file = open(path.c_str(), O_RDONLY | O_CLOEXEC);
        if (file < 0)
            Fail(path, std::strerror(errno));
        struct stat status;
        if (fstat(file, &status) == 0 && S_ISREG(status.st_mode) && status.st_size > 0) {
            size = static_cast<std::size_t>(status.st_size);
            void *start = mmap(nullptr, size, PROT_READ, MAP_PRIVATE, file, 0);
            bytes = start == MAP_FAILED ? nullptr : static_cast<unsigned char const *>(start);
        }
        close(file);
        if (!bytes)
            Fail(path, "cannot be mapped into memory");
    }
    ~MappedFile() {
        if (bytes)
            munmap(const_cast<unsigned char *>(bytes), size);
    }
    MappedFile(MappedFile const &) = delete;
    MappedFile &operator=(MappedFile const &) = delete;

    unsigned char const *Bytes() const { return bytes; }
    std::size_t Size() const { return size; }
    void Release() { bytes = nullptr; }

private:
    unsigned char const *bytes = nullptr;
    std::size_t size = 0;
};

// Goes through the whole file once.
class AtlasCheck {
public:
    AtlasCheck(std::string const &path_, unsigned char const *bytes_, std::size_t size_)
        : path(path_)
        , bytes(bytes_)
        , size(size_) {}

    void Run() {
        CheckHeader();
        CheckTable("family table", header->familyTable, header->familyCount, sizeof(FamilyRecord),
                   alignof(FamilyRecord));
        CheckTable("icon table", header->iconTable, header->iconCount, sizeof(IconRecord),
                   alignof(IconRecord));
        CheckFamilies();
    }

private:
    void CheckHeader() {
        if (size < sizeof(Header))
            Fail(path, "too short for an icon atlas");
        header = reinterpret_cast<Header const *>(bytes);
        if (!std::equal(std::begin(kMagic), std::end(kMagic), header->magic))
            Fail(path, "not an icon atlas");
        if (header->byteOrder != kByteOrderMark)
            Fail(path, "an icon atlas for a machine of another byte order");
        if (header->version != kVersion)
            Fail(path, "an icon atlas of version " + std::to_string(header->version) + "; this is version " +
                           std::to_string(kVersion));
        if (header->fileSize != size)
            Fail(path,
                 std::to_string(size) + " bytes long; its header says " + std::to_string(header->fileSize));
        if (header->scaleThousandths < kLeastScale || header->scaleThousandths > kGreatestScale)
            Fail(path, "scale " + std::to_string(header->scaleThousandths) + "/1000 is not from 0.5 to 4");
    }

    void CheckTable(char const *name, std::uint32_t offset, std::uint32_t count, std::size_t recordSize,
                    std::size_t alignment) const {
        if (offset % alignment != 0 || offset > size || count > (size - offset) / recordSize)
            Fail(path, std::string(name) + " reaches beyond the file or is not aligned");
    }

    void CheckFamilies() const {
        auto const *families = reinterpret_cast<FamilyRecord const *>(bytes + header->familyTable);
        for (std::uint32_t i = 0; i < header->familyCount; ++i) {
            FamilyRecord const &family = families[i];
            std::string const name = "family " + std::to_string(family.number);
            if (i > 0 && families[i - 1].number >= family.number)
                Fail(path, name + " is out of order");
            CheckSides(name, family.width, family.height);
            if (family.firstIcon > header->iconCount ||
                family.iconCount > header->iconCount - family.firstIcon)
                Fail(path, name + " has icons beyond the icon table");
            CheckIcons(name, family);
        }
    }

    void CheckIcons(std::string const &familyName, FamilyRecord const &family) const {
        auto const *icons =
            reinterpret_cast<IconRecord const *>(bytes + header->iconTable) + family.firstIcon;
        for (std::uint32_t i = 0; i < family.iconCount; ++i) {
            std::string const name = familyName + ", icon " + std::to_string(icons[i].index);
            if (i > 0 && icons[i - 1].index >= icons[i].index)
                Fail(path, name + " is out of order");
            CheckSides(name, icons[i].width, icons[i].height);
            for (int choice = 0; choice < kImageChoices; ++choice)
                CheckImage(name, icons[i], choice);
        }
    }

    void CheckSides(std::string const &name, int width, int height) const {
        if (width < 1 || height < 1 || width > kMaxIconSide || height > kMaxIconSide)
            Fail(path, name + " is " + std::to_string(width) + " x " + std::to_string(height) +
                           " pixels; each side may have 1 to " + std::to_string(kMaxIconSide));
    }

    void CheckImage(std::string const &name, IconRecord const &icon, int choice) const {
        ImageRecord const &image = icon.images[choice];
        if (!SideFits(icon.width, image.width) || !SideFits(icon.height, image.height))
            Fail(path, name + " has an image of the wrong size");
        if (image.offset % kPixelAlignment != 0 || image.offset < header->pixels)
            Fail(path, name + " has misplaced pixels");
        std::uint64_t const length = std::uint64_t(image.width) * image.height * kBytesPerPixel;
        if (image.offset > size || length > size - image.offset)
            Fail(path, name + " has pixels beyond the file");
    }

    // Rounded either way, and never nothing.
    bool SideFits(int logical, int device) const {
        int const exact = logical * static_cast<int>(header->scaleThousandths);
        int const floor = exact / kThousand, ceiling = (exact + kThousand - 1) / kThousand;
        return device >= 1 && device >= floor && device <= std::max(ceiling, 1);
    }

    std::string const &path;
    unsigned char const *bytes;
    std::size_t size;
    Header const *header = nullptr;
};

} // namespace

Atlas::Atlas(std::string const &path) {
    MappedFile file(path);
    AtlasCheck(path, file.Bytes(), file.Size()).Run();
    bytes = file.Bytes();
    size = file.Size();
    file.Release();
}

Atlas::~Atlas() { munmap(const_cast<unsigned char *>(bytes), size); }

Header const &Atlas::Head() const { return *reinterpret_cast<Header const *>(bytes); }

FamilyRecord const *Atlas::Families() const {
    return reinterpret_cast<FamilyRecord const *>(bytes + Head().familyTable);
}

IconRecord const *Atlas::Icons() const {
    return reinterpret_cast<IconRecord const *>(bytes + Head().iconTable);
}

FamilyRecord const *Atlas::FindFamily(std::int16_t number) const {
    FamilyRecord const *end = Families() + Head().familyCount;
    FamilyRecord const *found =
        std::lower_bound(Families(), end, number,
                         [](FamilyRecord const &family, std::int16_t n) { return family.number < n; });
    return found != end && found->number == number ? found : nullptr;
}

IconRecord const *Atlas::FindIcon(FamilyRecord const &family, std::int16_t index) const {
    IconRecord const *first = Icons() + family.firstIcon, *end = first + family.iconCount;
    // Most families count from their first index on without gaps.
    if (first != end) {
        int const place = index - first->index;
        if (place >= 0 && place < end - first && first[place].index == index)
            return first + place;
    }
    IconRecord const *found = std::lower_bound(
        first, end, index, [](IconRecord const &icon, std::int16_t i) { return icon.index < i; });
    return found != end && found->index == index ? found : nullptr;
}

std::uint32_t const *Atlas::Pixels(ImageRecord const &image) const {
    return reinterpret_cast<std::uint32_t const *>(bytes + image.offset);
}
