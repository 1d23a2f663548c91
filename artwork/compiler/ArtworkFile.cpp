#include "artwork/compiler/ArtworkFile.h"
#include "artwork/compiler/ArtworkError.h"
#include <algorithm>
#include <charconv>
#include <fstream>
#include <sstream>

namespace {

constexpr std::uintmax_t kMaxFileSize = 4u << 20;

std::string ReadAll(std::filesystem::path const &path) {
    std::error_code error;
    std::uintmax_t const size = std::filesystem::file_size(path, error);
    if (error)
        throw ArtworkError(path.string() + ": " + error.message());
    if (size > kMaxFileSize)
        throw ArtworkError(path.string() + ": larger than " + std::to_string(kMaxFileSize) + " bytes");
    std::ifstream in(path, std::ios::binary);
    std::ostringstream all;
    if (!(all << in.rdbuf()))
        throw ArtworkError(path.string() + ": cannot be read");
    return all.str();
}

// The element as a person finds it in the file: its name with the attribute that tells it from its sisters.
std::string Describe(pugi::xml_node node) {
    std::string result = std::string("<") + node.name();
    for (char const *key : {"id", "name", "number", "index"})
        if (pugi::xml_attribute attribute = node.attribute(key))
            return result + " " + key + "=\"" + attribute.value() + "\">";
    return result + ">";
}

} // namespace

bool ParseInteger(std::string const &text, int &result) {
    int value = 0;
    auto const parsed = std::from_chars(text.data(), text.data() + text.size(), value);
    if (parsed.ec != std::errc() || parsed.ptr != text.data() + text.size())
        return false;
    result = value;
    return true;
}

ArtworkFile::ArtworkFile(std::filesystem::path const &file, char const *rootName)
    : path(file)
    , text(ReadAll(file)) {
    pugi::xml_parse_result const result =
        document.load_buffer(text.data(), text.size(), pugi::parse_default, pugi::encoding_utf8);
    if (!result)
        throw ArtworkError(path.string() + Position(result.offset) + ": " + result.description());
    if (std::string(Root().name()) != rootName)
        Fail(Root(), std::string("the root element must be <") + rootName + ">");
}

void ArtworkFile::Fail(pugi::xml_node node, std::string const &problem) const {
    throw ArtworkError(path.string() + Position(node.offset_debug()), Describe(node), problem);
}

int ArtworkFile::Integer(pugi::xml_node node, char const *attribute, int least, int most) const {
    std::string const value = Text(node, attribute);
    int number = 0;
    if (!ParseInteger(value, number) || number < least || number > most)
        Fail(node, std::string(attribute) + "=\"" + value + "\" must be a whole number from " +
                       std::to_string(least) + " to " + std::to_string(most));
    return number;
}

std::string ArtworkFile::Text(pugi::xml_node node, char const *attribute) const {
    std::string const value = node.attribute(attribute).value();
    if (value.empty())
        Fail(node, std::string("the attribute ") + attribute + " is missing");
    return value;
}

std::string ArtworkFile::Position(std::ptrdiff_t offset) const {
    auto const end =
        text.begin() + std::clamp<std::ptrdiff_t>(offset, 0, static_cast<std::ptrdiff_t>(text.size()));
    auto const line = 1 + std::count(text.begin(), end, '\n');
    auto const lineStart = std::find(std::make_reverse_iterator(end), text.rend(), '\n').base();
    return ":" + std::to_string(line) + ":" + std::to_string(1 + (end - lineStart));
}
