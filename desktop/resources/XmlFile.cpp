#include "desktop/resources/XmlFile.h"
#include "desktop/resources/XmlMarkup.h"
#include "desktop/resources/XmlText.h"
#include <algorithm>
#include <cerrno>
#include <charconv>
#include <cstdio>
#include <cstring>
#include <memory>
#include <pugixml.hpp>

namespace {

constexpr std::string_view kByteOrderMark = "\xEF\xBB\xBF";
constexpr std::string_view kWhiteSpace = " \t\r\n";

std::string PlaceOf(std::string const &file, int line, int column) {
    return line > 0 ? file + ':' + std::to_string(line) + ':' + std::to_string(column) : file;
}

bool IsText(pugi::xml_node const &node) {
    return node.type() == pugi::node_pcdata || node.type() == pugi::node_cdata;
}

void TrimStart(std::string &text) {
    text.erase(0, std::min(text.find_first_not_of(kWhiteSpace), text.size()));
}

void TrimEnd(std::string &text) { text.erase(text.find_last_not_of(kWhiteSpace) + 1); }

std::string JoinedText(pugi::xml_node const &element) {
    std::string text;
    bool first = true;
    std::size_t keptEnd = 0; // up to here the end stays: it came from a CDATA section
    for (pugi::xml_node const &piece : element.children()) {
        if (!IsText(piece))
            continue;
        text += piece.value();
        if (piece.type() == pugi::node_cdata)
            keptEnd = text.size();
        else if (first)
            TrimStart(text);
        first = first && text.empty();
    }
    std::string tail = text.substr(keptEnd);
    TrimEnd(tail);
    return text.replace(keptEnd, std::string::npos, tail);
}

// Turns pugixml's tree into nodes, in document order, so that places are found in one pass over the text.
class TreeBuilder {
public:
    TreeBuilder(std::string const &file_, std::string_view text)
        : file(file_)
        , place(text) {}

    void Build(pugi::xml_node const &element, XmlNode &node, int depth) {
        place.MoveTo(BracketOffset(element));
        node.line = place.Line();
        node.column = place.Column();
        if (depth > XmlFile::kMaxDepth)
            throw Error(node,
                        "more than " + std::to_string(XmlFile::kMaxDepth) + " elements within each other");
        node.name = element.name();
        CopyAttributes(element, node);
        node.text = JoinedText(element);
        for (pugi::xml_node const &child : element.children()) {
            if (child.type() != pugi::node_element)
                continue;
            node.children.emplace_back();
            Build(child, node.children.back(), depth + 1);
        }
    }

private:
    // pugixml knows where the name starts; the bracket stands before it.
    static std::size_t BracketOffset(pugi::xml_node const &element) {
        std::ptrdiff_t const name = element.offset_debug();
        return name > 0 ? static_cast<std::size_t>(name - 1) : 0;
    }

    void CopyAttributes(pugi::xml_node const &element, XmlNode &node) const {
        for (pugi::xml_attribute const &attribute : element.attributes()) {
            if (node.Attribute(attribute.name()))
                throw Error(node, std::string("attribute \"") + attribute.name() + "\" stands twice in <" +
                                      node.name + ">");
            if (node.attributes.size() == XmlFile::kMaxAttributes)
                throw Error(node, "more than " + std::to_string(XmlFile::kMaxAttributes) +
                                      " attributes in <" + node.name + ">");
            node.attributes.push_back({attribute.name(), attribute.value()});
        }
    }

    XmlError Error(XmlNode const &node, std::string const &message) const {
        return XmlError(file, node.line, node.column, message);
    }

    std::string const &file;
    XmlPlace place;
};

XmlError ErrorAtOffset(std::string const &file, std::string_view text, std::size_t offset,
                       std::string const &message) {
    XmlPlace place(text);
    place.MoveTo(offset);
    return XmlError(file, place.Line(), place.Column(), message);
}

char const *Describe(pugi::xml_parse_status status) {
    switch (status) {
    case pugi::status_bad_pi:
        return "a processing instruction or declaration is not closed or misspelt";
    case pugi::status_bad_comment:
        return "a comment is not closed";
    case pugi::status_bad_cdata:
        return "a CDATA section is not closed";
    case pugi::status_bad_doctype:
        return "the document type is not closed";
    case pugi::status_bad_pcdata:
        return "text stands outside the root element";
    case pugi::status_bad_start_element:
        return "a start tag is not closed or misspelt";
    case pugi::status_bad_attribute:
        return "an attribute is misspelt; it must read name=\"value\"";
    case pugi::status_bad_end_element:
        return "an end tag is misspelt";
    case pugi::status_end_element_mismatch:
        return "a tag has no partner: start and end tags do not match";
    case pugi::status_no_document_element:
        return "there is no element";
    case pugi::status_out_of_memory:
        return "out of memory";
    default:
        return "this is not XML";
    }
}

// Counted before parsing: the parser's own nodes would already fill the memory.
void CheckElementCount(std::string const &name, std::string_view text) {
    std::size_t elements = 0;
    for (std::size_t at = text.find('<'); at != std::string_view::npos; at = text.find('<', at + 1)) {
        char const next = at + 1 < text.size() ? text[at + 1] : '\0';
        if (next != '/' && next != '!' && next != '?' && ++elements > XmlFile::kMaxElements)
            throw ErrorAtOffset(name, text, at,
                                "more than " + std::to_string(XmlFile::kMaxElements) + " elements");
    }
}

// Throws what is wrong, if anything is.
void Require(XmlTextFault const &fault, std::string const &name, std::string_view text) {
    if (!fault.message.empty())
        throw ErrorAtOffset(name, text, fault.offset, fault.message);
}

void CheckText(std::string const &name, std::string_view text) {
    if (text.size() > XmlFile::kMaxBytes)
        throw XmlError(name, 0, 0,
                       "the file is larger than " + std::to_string(XmlFile::kMaxBytes >> 20) + " MiB");
    Require(FindXmlTextFault(text), name, text);
    CheckElementCount(name, text);
}

[[noreturn]] void Refuse(pugi::xml_parse_result const &result, std::string const &name,
                         std::string_view text) {
    if (result.status == pugi::status_end_element_mismatch)
        Require(FindXmlTagFault(text), name, text);
    throw ErrorAtOffset(name, text, static_cast<std::size_t>(std::max<std::ptrdiff_t>(result.offset, 0)),
                        Describe(result.status));
}

pugi::xml_node OnlyRoot(pugi::xml_document const &document, std::string const &name, std::string_view text) {
    pugi::xml_node root;
    for (pugi::xml_node const &node : document.children()) {
        if (node.type() != pugi::node_element)
            continue;
        if (root)
            throw ErrorAtOffset(
                name, text, static_cast<std::size_t>(std::max<std::ptrdiff_t>(node.offset_debug() - 1, 0)),
                std::string("a second root element <") + node.name() + ">");
        root = node;
    }
    return root;
}

struct CloseFile {
    void operator()(std::FILE *file) const { std::fclose(file); }
};

std::string ReadBytes(std::string const &path) {
    std::unique_ptr<std::FILE, CloseFile> const file(std::fopen(path.c_str(), "rb"));
    if (!file)
        throw XmlError(path, 0, 0, std::string("the file cannot be opened: ") + std::strerror(errno));
    std::string bytes;
    char block[1 << 16];
    while (std::size_t const count = std::fread(block, 1, sizeof block, file.get())) {
        bytes.append(block, count);
        if (bytes.size() > XmlFile::kMaxBytes)
            break; // the parser says so
    }
    if (std::ferror(file.get()))
        throw XmlError(path, 0, 0, std::string("the file cannot be read: ") + std::strerror(errno));
    return bytes;
}

} // namespace

XmlError::XmlError(std::string const &file, int line, int column_, std::string const &message)
    : ResourceError(PlaceOf(file, line, column_) + ": " + message, file, line, message)
    , column(column_) {}

std::string const *XmlNode::Attribute(std::string_view attribute) const {
    for (XmlAttribute const &candidate : attributes) {
        if (candidate.name == attribute)
            return &candidate.value;
    }
    return nullptr;
}

XmlFile XmlFile::Read(std::string const &path) { return Parse(ReadBytes(path), path); }

XmlFile XmlFile::Parse(std::string_view bytes, std::string const &name) {
    if (bytes.substr(0, kByteOrderMark.size()) == kByteOrderMark)
        bytes.remove_prefix(kByteOrderMark.size());
    CheckText(name, bytes);
    pugi::xml_document document;
    // White space between pieces of text counts; what surrounds the whole is cut off afterwards.
    unsigned const options = pugi::parse_default | pugi::parse_ws_pcdata;
    pugi::xml_parse_result const result =
        document.load_buffer(bytes.data(), bytes.size(), options, pugi::encoding_utf8);
    if (!result)
        Refuse(result, name, bytes);
    Require(FindXmlReferenceFault(bytes), name, bytes);
    XmlFile file(name);
    TreeBuilder(name, bytes).Build(OnlyRoot(document, name, bytes), file.root, 1);
    return file;
}

XmlError XmlFile::ErrorAt(XmlNode const &node, std::string const &message) const {
    return XmlError(name, node.line, node.column, message);
}

void XmlFile::RequireRoot(char const *rootName) const {
    if (root.name != rootName)
        throw ErrorAt(root, "the root element is <" + root.name + ">, not <" + rootName + ">");
}

std::string const &XmlFile::RequireText(XmlNode const &node, char const *attribute) const {
    std::string const *value = node.Attribute(attribute);
    if (!value)
        throw ErrorAt(node, "<" + node.name + "> lacks the attribute \"" + attribute + "\"");
    return *value;
}

long long XmlFile::RequireInteger(XmlNode const &node, char const *attribute, long long smallest,
                                  long long largest) const {
    std::string const &value = RequireText(node, attribute);
    long long number = 0;
    if (!ParseInteger(value, number) || number < smallest || number > largest)
        throw ErrorAt(node, "attribute \"" + std::string(attribute) + "\" of <" + node.name + "> is \"" +
                                value + "\", not a whole number from " + std::to_string(smallest) + " to " +
                                std::to_string(largest));
    return number;
}

bool XmlFile::ParseInteger(std::string_view text, long long &out) {
    // from_chars takes a minus sign alone.
    if (text.size() > 1 && text[0] == '+' && text[1] != '-')
        text.remove_prefix(1);
    long long number = 0;
    std::from_chars_result const result = std::from_chars(text.data(), text.data() + text.size(), number);
    if (result.ec != std::errc() || result.ptr != text.data() + text.size())
        return false;
    out = number;
    return true;
}
