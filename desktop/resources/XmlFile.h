// XML files as a tree of plain nodes.
#pragma once
#include "desktop/resources/ResourceError.h"
#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

// An XML file that is broken, or does not hold what it should. what() is "file:line:column: message".
class XmlError : public ResourceError {
public:
    // Lines and columns count from 1, columns in characters; a line of 0 is none.
    XmlError(std::string const &file, int line, int column, std::string const &message);
    int Column() const { return column; }

private:
    int column;
};

struct XmlAttribute {
    std::string name, value; // UTF-8, entities resolved
};

// An element. Comments and processing instructions are left out.
struct XmlNode {
    std::string name;
    std::vector<XmlAttribute> attributes; // in document order; no name occurs twice
    // All text directly in the element, joined. White space at both ends is cut off, unless it stands in a
    // CDATA section.
    std::string text;
    std::vector<XmlNode> children; // in document order
    int line = 0, column = 0;      // of the element's opening angle bracket, from 1; the column in characters

    std::string const *Attribute(std::string_view attribute) const; // its value; null when absent
};

// A whole file. UTF-8 only, with or without a byte order mark. Document types are skipped; their entities are
// not known, and a reference to one is an error.
class XmlFile {
public:
    static constexpr std::size_t kMaxBytes = std::size_t(64) << 20;
    static constexpr int kMaxDepth = 512; // elements within each other, the root among them
    static constexpr std::size_t kMaxElements = 1000000;
    static constexpr std::size_t kMaxAttributes = 256; // of one element

    // Both throw XmlError, naming the file by its path, or by `name`.
    static XmlFile Read(std::string const &path);
    static XmlFile Parse(std::string_view bytes, std::string const &name);

    std::string const &Name() const { return name; }
    XmlNode const &Root() const { return root; }

    // The error to throw about the node.
    XmlError ErrorAt(XmlNode const &, std::string const &message) const;

    // The root must have this name.
    void RequireRoot(char const *rootName) const;
    // The attribute's value. An attribute that is missing, no whole number or out of range is an error.
    std::string const &RequireText(XmlNode const &, char const *attribute) const;
    long long RequireInteger(XmlNode const &, char const *attribute, long long smallest,
                             long long largest) const;

    // Whether all of the text is one whole number of 64 bits, with or without a sign; `out` changes only if
    // it is.
    static bool ParseInteger(std::string_view text, long long &out);

private:
    XmlFile(std::string const &name_)
        : name(name_) {}
    std::string name;
    XmlNode root;
};
