#include "host/EnumToStringMap.h"
#include "desktop/resources/ResourceTable.h"
#include "desktop/resources/Utf.h"
#include <limits>
#include <string>
#include <unordered_map>

namespace {

// From a file such as <iconsets><iconset name="kNoteGlyphs" number="1821"/>...</iconsets>.
class NameTable {
public:
    void Read(XmlFile const &file) {
        for (XmlNode const &node : file.Root().children) {
            typedef std::numeric_limits<short> Limits;
            numbers[file.RequireText(node, "name")] =
                static_cast<int>(file.RequireInteger(node, "number", Limits::min(), Limits::max()));
        }
    }
    int Find(std::string const &name) const {
        auto const found = numbers.find(name);
        return found == numbers.end() ? 0 : found->second;
    }

private:
    std::unordered_map<std::string, int> numbers;
};

std::vector<std::string> IconSetFiles() { return {"iconsets.xml"}; }

std::vector<std::string> PictureFiles() { return {"pictures.xml"}; }

} // namespace

struct EnumToStringMap::Names {
    explicit Names(std::vector<std::string> (*files)())
        : table(files) {}
    ResourceTable<NameTable> table;
};

EnumToStringMap::EnumToStringMap(Names *names_)
    : names(names_) {}

EnumToStringMap::~EnumToStringMap() { delete names; }

int EnumToStringMap::GetID(UString const &name) const {
    std::string const utf8 = Utf::ToUtf8(name);
    long long number = 0;
    typedef std::numeric_limits<int> Limits;
    if (XmlFile::ParseInteger(utf8, number))
        return number >= Limits::min() && number <= Limits::max() ? static_cast<int>(number) : 0;
    return names->table.Get().Find(utf8);
}

ISetIDMapper::ISetIDMapper()
    : EnumToStringMap(new Names(&IconSetFiles)) {}

ISetIDMapper &ISetIDMapper::Instance() {
    static ISetIDMapper mapper;
    return mapper;
}

PictIDMapper::PictIDMapper()
    : EnumToStringMap(new Names(&PictureFiles)) {}

PictIDMapper &PictIDMapper::Instance() {
    static PictIDMapper mapper;
    return mapper;
}
