#include "desktop/type/FontTable.h"
#include "desktop/resources/ResourceTable.h"
#include "desktop/type/FontSpec.h"
#include <filesystem>
#include <sstream>

namespace {

constexpr int kLargestIndex = 255;

struct StyleWord {
    char const *word;
    int bit;
};

constexpr StyleWord kStyleWords[] = {{"plain", 0},
                                     {"bold", FontFace::kBold},
                                     {"italic", FontFace::kItalic},
                                     {"underline", FontFace::kUnderline},
                                     {"condensed", FontFace::kCondensed}};

int FaceOfWord(XmlFile const &file, XmlNode const &node, std::string const &word) {
    for (StyleWord const &known : kStyleWords) {
        if (word == known.word)
            return known.bit;
    }
    throw file.ErrorAt(node,
                       "\"" + word + "\" is no style; plain, bold, italic, underline and condensed are");
}

int FaceOf(XmlFile const &file, XmlNode const &node) {
    std::string const *style = node.Attribute("style");
    std::istringstream words(style ? *style : std::string());
    int face = 0;
    for (std::string word; words >> word;)
        face |= FaceOfWord(file, node, word);
    return face;
}

} // namespace

void FontTable::Read(XmlFile const &file) {
    file.RequireRoot("fonts");
    std::filesystem::path directory = std::filesystem::path(file.Name()).parent_path();
    if (std::string const *named = file.Root().Attribute("directory"))
        directory /= *named;
    for (XmlNode const &node : file.Root().children) {
        if (node.name == "file") {
            files.push_back({(directory / file.RequireText(node, "name")).string(), FaceOf(file, node)});
        } else if (node.name == "font") {
            int const index = static_cast<int>(file.RequireInteger(node, "index", 0, kLargestIndex));
            int const size = static_cast<int>(
                file.RequireInteger(node, "size", FontSpec::kSmallestSize, FontSpec::kLargestSize));
            entries[index] = {file.RequireText(node, "family"), FaceOf(file, node), size};
        } else {
            throw file.ErrorAt(node, "<" + node.name + "> is not known here; <file> and <font> are");
        }
    }
}

FontTable const &TheFontTable() {
    static ResourceTable<FontTable> table([] { return std::vector<std::string>(1, "fonts.xml"); });
    return table.Get();
}
